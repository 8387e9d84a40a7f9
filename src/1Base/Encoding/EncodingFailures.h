/// What a failed conversion ends in. Kept out of line, so that the many conversions stay small, and
/// apart from the exceptions, which are written in terms of conversions themselves.
#ifndef QORN_1BASE_ENCODINGFAILURES_H
#define QORN_1BASE_ENCODINGFAILURES_H

#include "1Base/Encoding/EncodingSysEncoding.h"

#include <string>

namespace Encoding {
namespace Detail {

/// Fails as an assertion: a conversion would call itself.
[[noreturn]] void reportRecursion();

/// Raises TExcEncoding: the platform call `function` failed, with `error`, for `eenc`.
[[noreturn]] void throwConversionError(char const* function, std::string const& error,
                                       ESysEncoding eenc);

} // namespace Detail
} // namespace Encoding

#endif
