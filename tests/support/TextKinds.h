/// One text in each string kind, made by the slow reference.
///
///     TestSupport::utf16Of(U"\U0001F600");   // two units
#ifndef QORN_TESTS_TEXTKINDS_H
#define QORN_TESTS_TEXTKINDS_H

#include "1Base/Strings/StringsKinds.h"

#include "support/NaiveUnicode.h"

#include <string>

namespace TestSupport {

inline Strings::string wideOf(std::u32string const& text) {
    return Strings::string(text.begin(), text.end());
}

inline std::string utf8Of(std::u32string const& text) {
    return naiveUTF8(text);
}

inline Strings::stringUTF16 utf16Of(std::u16string const& units) {
    return Strings::stringUTF16(units.begin(), units.end());
}

inline Strings::stringUTF16 utf16Of(std::u32string const& text) {
    return utf16Of(naiveUTF16(text));
}

inline std::basic_string<unsigned char> bytesOf(std::string const& text) {
    return std::basic_string<unsigned char>(text.begin(), text.end());
}

} // namespace TestSupport

#endif
