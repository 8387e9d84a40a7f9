#include "1Base/StdUtil/_Imp/StdUtilDecimal.h"

#include <charconv>
#include <iterator>
#include <limits>

namespace StdUtil {
namespace Detail {
namespace {

template <class TNumber>
Strings::string write(TNumber number) {
    char digits[std::numeric_limits<TNumber>::digits10 + 2];
    char const* const end = std::to_chars(std::begin(digits), std::end(digits), number).ptr;
    return Strings::string(static_cast<char const*>(digits), end);
}

bool isBlank(wchar_t character) {
    return character == L' ' || (character >= L'\t' && character <= L'\r');
}

bool isDigit(wchar_t character) {
    return character >= L'0' && character <= L'9';
}

template <class TNumber>
constexpr unsigned long long magnitudeLimit(bool negative) {
    using TLimits = std::numeric_limits<TNumber>;
    return static_cast<unsigned long long>(TLimits::max()) + (TLimits::is_signed && negative);
}

// The largest magnitude that takes one more digit, whatever that is.
constexpr unsigned long long roomyMagnitude =
    (std::numeric_limits<unsigned long long>::max() - 9) / 10;

} // namespace

Strings::string writeDecimal(long long number) {
    return write(number);
}

Strings::string writeDecimal(unsigned long long number) {
    return write(number);
}

template <class TNumber>
bool readDecimal(Strings::string const& text, TNumber& number) {
    // The zero behind the text is no part of a number: no step needs a test for the end.
    wchar_t const* next = text.c_str();
    while (isBlank(*next))
        ++next;
    bool const negative = *next == L'-';
    if (negative || *next == L'+')
        ++next;

    if (!isDigit(*next))
        return false;
    unsigned long long magnitude = 0;
    for (; isDigit(*next); ++next) {
        if (magnitude > roomyMagnitude)
            return false;
        magnitude = 10 * magnitude + static_cast<unsigned long long>(*next - L'0');
    }
    if (magnitude > magnitudeLimit<TNumber>(negative))
        return false;
    number = static_cast<TNumber>(negative ? 0 - magnitude : magnitude);
    return true;
}

template bool readDecimal(Strings::string const&, short&);
template bool readDecimal(Strings::string const&, unsigned short&);
template bool readDecimal(Strings::string const&, int&);
template bool readDecimal(Strings::string const&, unsigned int&);
template bool readDecimal(Strings::string const&, long&);
template bool readDecimal(Strings::string const&, unsigned long&);
template bool readDecimal(Strings::string const&, long long&);
template bool readDecimal(Strings::string const&, unsigned long long&);

} // namespace Detail
} // namespace StdUtil
