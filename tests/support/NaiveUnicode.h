/// Unicode's transformation forms the slow way, by strings of binary digits: the twin that the
/// conversions are tested against. It shares nothing with them.
///
///     TestSupport::naiveUTF8(U"\u00E9");             // "\xC3\xA9"
///     TestSupport::naiveFromUTF8("\xC3");            // nothing
#ifndef QORN_TESTS_NAIVEUNICODE_H
#define QORN_TESTS_NAIVEUNICODE_H

#include <optional>
#include <string>

namespace TestSupport {

/// A number in binary, most significant digit first.
std::string toBits(unsigned long value, unsigned digits);
unsigned long fromBits(std::string const& bits);

/// True for 0 to 10FFFF without the surrogates.
bool isScalarValue(unsigned long value);

/// The form of a text of scalar values. A byte order mark is a character like any other.
std::string naiveUTF8(std::u32string const& text);
std::u16string naiveUTF16(std::u32string const& text);

/// The text behind a form; nothing where it is malformed in any place. A byte order mark stays.
std::optional<std::u32string> naiveFromUTF8(std::string const& bytes);
std::optional<std::u32string> naiveFromUTF16(std::u16string const& units);

} // namespace TestSupport

#endif
