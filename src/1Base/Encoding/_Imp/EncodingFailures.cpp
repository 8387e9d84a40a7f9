// Plain standard exceptions, until the error module brings its own family.

#include "1Base/Encoding/EncodingFailures.h"

namespace Encoding {
namespace Detail {

XConversion::XConversion(std::string const& function_, std::string const& error_,
                         ESysEncoding encoding)
    : std::runtime_error("Error in OS call " + function_ + ": " + error_),
      function(function_),
      error(error_),
      eenc(encoding) {}

void reportRecursion() {
    throw XCheck("Infinite recursion in 'Encoding::CConverter<T,T>::convert()'!");
}

void throwConversionError(char const* function, std::string const& error, ESysEncoding encoding) {
    throw XConversion(function, error, encoding);
}

void reportFailedCheck(char const* expression) {
    throw XCheck(expression);
}

} // namespace Detail
} // namespace Encoding
