#include "2System/Time/TimeDateTime.h"

#include "2System/Time/TimeExc.h"
#include "2System/Time/_Imp/TimeFailures.h"
#include "2System/Time/_Imp/TimeText.h"

namespace Time {
namespace {

using Config::Int32;
using TPosition = Strings::string::size_type;

constexpr char const* invalidString = "Invalid format string";

[[noreturn]] void throwFormatError(Strings::string const& pattern, char const* reason) {
    ERROR_THROW(TExcTimeFormatError, Detail::wrongArgument("string", pattern, reason));
}

// Behind the end there is a zero, which is no letter.
wchar_t characterAt(Strings::string const& pattern, TPosition pos) {
    return pos < pattern.size() ? pattern[pos] : L'\0';
}

bool isLiteral(wchar_t character) {
    switch (character) {
    case L'.':
    case L',':
    case L':':
    case L';':
    case L'-':
    case L'_':
    case L'#':
    case L'+':
    case L'*':
    case L'%':
    case L'&':
    case L'/':
    case L'(':
    case L')':
    case L'=':
    case L' ':
        return true;
    default:
        return false;
    }
}

struct CColumn {
    Int32 number;
    int width; // 0: no padding
};

// "YY" or "YYYY", from the first letter on.
CColumn takeYear(Int32 year, Strings::string const& pattern, TPosition& pos) {
    if (characterAt(pattern, pos + 1) != L'Y')
        throwFormatError(pattern, "Invalid format");
    if (characterAt(pattern, pos + 2) != L'Y') {
        pos += 1;
        return {year % 100, 2};
    }
    if (characterAt(pattern, pos + 3) != L'Y')
        throwFormatError(pattern, invalidString);
    pos += 3;
    return {year, 4};
}

Int32 numberOf(CDateTime const& dateTime, Strings::string const& pattern, TPosition pos) {
    switch (characterAt(pattern, pos)) {
    case L'D':
        return dateTime.getDay();
    case L'M':
        return dateTime.getMonth();
    case L'h':
        return dateTime.getHour();
    case L'm':
        return dateTime.getMinute();
    case L's':
        return dateTime.getSecond();
    case L'c':
        return dateTime.getMilliSecond() / 10;
    case L't':
        return dateTime.getMilliSecond();
    default:
        throwFormatError(pattern, invalidString);
    }
}

// Leaves `pos` on the last letter of the specifier.
CColumn takeSpecifier(CDateTime const& dateTime, Strings::string const& pattern, TPosition& pos) {
    if (characterAt(pattern, pos) == L'Y')
        return takeYear(dateTime.getYear(), pattern, pos);
    Int32 const number = numberOf(dateTime, pattern, pos);
    bool const isDoubled = characterAt(pattern, pos + 1) == pattern[pos];
    if (isDoubled)
        ++pos;
    return {number, isDoubled ? 2 : 0};
}

// The number is written before the test of what follows: an own stream holds it after the failure.
template <class TText>
void putSpecifier(CDateTime const& dateTime, Strings::string const& pattern, TPosition& pos,
                  TText& text) {
    CColumn const column = takeSpecifier(dateTime, pattern, pos);
    text.putNumber(column.number, column.width, '0');
    if (characterAt(pattern, pos + 1) == pattern[pos])
        throwFormatError(pattern, invalidString);
}

} // namespace

Strings::string CDateTime::format(Strings::string const& pattern) const {
    return Detail::makeText<wchar_t>([this, &pattern](auto& text) {
        for (TPosition pos = 0; pos < pattern.size(); ++pos) {
            if (isLiteral(pattern[pos]))
                text.put(static_cast<char>(pattern[pos]));
            else
                putSpecifier(*this, pattern, pos, text);
        }
    });
}

void CDateTime::putFormat(Strings::string const& pattern, Strings::string::size_type& pos,
                          Streams::u_ostream& out) const {
    Detail::CStreamText<wchar_t> text(out);
    putSpecifier(*this, pattern, pos, text);
}

} // namespace Time
