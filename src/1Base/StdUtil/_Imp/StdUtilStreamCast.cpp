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
    return Encoding::convert<Strings::string>(Strings::string(source));
}

namespace Detail {

// A plain standard exception, until the error module brings its own family.

XStreamCast::XStreamCast(std::string const& source_, std::string const& target_)
    : std::runtime_error("Could not cast '" + source_ + "' to '" + target_ + "'"),
      source(source_),
      target(target_) {}

void throwStreamCastError(char const* /*file*/, unsigned int /*line*/, char const* /*func*/,
                          char const* /*date*/, char const* /*time*/, char const* source,
                          char const* target) {
    throw XStreamCast(source, target);
}

} // namespace Detail
} // namespace StdUtil
