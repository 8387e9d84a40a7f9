#include "1Base/Encoding/EncodingFailures.h"

#include "1Base/Encoding/EncodingExc.h"
#include "1Base/Error/ErrorMacros.h"

#include <exception>

namespace Encoding {
namespace Detail {

void reportRecursion() {
    ERROR_ASSERT_P(Error::buildNamedParameter(
                       "reason", "Infinite recursion in 'Encoding::CConverter<T,T>::convert()'!"),
                   false);
    std::terminate();
}

void throwConversionError(char const* function, std::string const& error, ESysEncoding eenc) {
    ERROR_THROW(TExcEncoding, Error::msgOSCall,
                ERROR_PARAMS(ERROR_PARAM(eenc), ERROR_PARAM(function), ERROR_PARAM(error)));
}

} // namespace Detail
} // namespace Encoding
