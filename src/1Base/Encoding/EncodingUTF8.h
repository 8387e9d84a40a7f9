/// A lax decoder of UTF-8, for input that `convert` would refuse.
#ifndef QORN_1BASE_ENCODINGUTF8_H
#define QORN_1BASE_ENCODINGUTF8_H

#include "1Base/Strings/StringsKinds.h"

namespace Encoding {

/// Decodes byte by byte and accepts what `convert` does not: five-byte forms (so values above
/// 10FFFF can come out), overlong forms and encoded surrogates. A stray continuation byte and the
/// bytes FC to FF, where a sequence could begin, are dropped. A sequence that the end of the text
/// cuts off leaves its partial value as the last element. A wrong byte inside a sequence fails a
/// check, and nothing is returned.
///
///     Encoding::convertUTF8ToUTF32("caf\xC3\xA9");   // L"caf\u00E9"
Strings::stringUTF32 convertUTF8ToUTF32(Strings::stringUTF8 const& source);

} // namespace Encoding

#endif
