/// Narrow pieces of text on streams of either width.
#ifndef QORN_1BASE_ERRORTEXT_H
#define QORN_1BASE_ERRORTEXT_H

#include "1Base/Encoding/EncodingConverter.h"

#include <ostream>

namespace Error {
namespace Detail {

inline void writeText(std::ostream& stream, char const* text) {
    stream << text;
}

/// Decodes the text as UTF-8; a wide stream by itself would widen it byte by byte.
inline void writeText(std::wostream& stream, char const* text) {
    stream << Encoding::convert<Strings::string>(text);
}

} // namespace Detail
} // namespace Error

#endif
