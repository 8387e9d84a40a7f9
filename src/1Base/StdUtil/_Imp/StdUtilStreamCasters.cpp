#include "1Base/StdUtil/StdUtilStreamCast.h"

#include "1Base/Encoding/EncodingConverter.h"

namespace StdUtil {

Strings::string CStreamCaster<Strings::string, std::string>::cast(std::string const& source) {
    return Encoding::convert<Strings::string>(source);
}

Strings::string CStreamCaster<Strings::string, char const*>::cast(char const* source) {
    return Encoding::convert<Strings::string>(std::string(source));
}

Strings::string CStreamCaster<Strings::string, wchar_t const*>::cast(wchar_t const* source) {
    // Converting the kind into itself would copy the text once more.
    return Strings::string(source);
}

template class CStreamCaster<Strings::string, bool>;
template class CStreamCaster<Strings::string, char>;
template class CStreamCaster<Strings::string, wchar_t>;
template class CStreamCaster<Strings::string, unsigned char>;
template class CStreamCaster<Strings::string, unsigned short>;
template class CStreamCaster<Strings::string, int>;
template class CStreamCaster<Strings::string, unsigned int>;
template class CStreamCaster<Strings::string, long>;
template class CStreamCaster<Strings::string, unsigned long>;
template class CStreamCaster<unsigned short, Strings::string>;
template class CStreamCaster<int, Strings::string>;
template class CStreamCaster<unsigned int, Strings::string>;
template class CStreamCaster<long, Strings::string>;

} // namespace StdUtil
