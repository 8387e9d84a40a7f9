/// What a failed conversion ends in.
#ifndef QORN_1BASE_ENCODINGFAILURES_H
#define QORN_1BASE_ENCODINGFAILURES_H

#include "1Base/Encoding/EncodingSysEncoding.h"

#include <stdexcept>
#include <string>

namespace Encoding {
namespace Detail {

/// A conversion that the platform refused.
struct XConversion : std::runtime_error {
    XConversion(std::string const& function, std::string const& error, ESysEncoding encoding);

    std::string function;
    std::string error;
    ESysEncoding eenc;
};

/// A check of the text modules that did not hold.
struct XCheck : std::logic_error {
    using std::logic_error::logic_error;
};

/// Reports that a conversion would call itself.
[[noreturn]] void reportRecursion();

/// Reports that the platform call `function` failed, with `error` and the encoding it was given.
[[noreturn]] void throwConversionError(char const* function, std::string const& error,
                                       ESysEncoding encoding);

/// Reports that the check `expression` failed.
[[noreturn]] void reportFailedCheck(char const* expression);

} // namespace Detail
} // namespace Encoding

#endif
