#include "0Platform/CoreFoundation/CFDateSupport.h"

#include "support/PlatformString.h"

#include <unicode/unistr.h>

#include <cstdlib>
#include <iostream>
#include <limits>

namespace TestSupport {
namespace {

void setVariable(char const* name, std::optional<std::string> const& value) {
    if (value)
        setenv(name, value->c_str(), 1);
    else
        unsetenv(name);
}

} // namespace

void CDateTest::SetUp() {
    CObjectCountTest::SetUp();
    for (char const* const variable : {"LC_ALL", "LC_CTYPE", "LC_TIME", "LANG", "TZ"})
        unsetenv(variable);
}

void CDateTest::setZone(std::optional<std::string> const& zone) {
    setVariable("TZ", zone);
}

void CDateTest::setLocale(std::optional<std::string> const& locale) {
    setVariable("LC_ALL", locale);
}

CFAbsoluteTime composed(CLocalTime const& time) {
    CFCalendarRef const calendar =
        CFCalendarCreateWithIdentifier(kCFAllocatorDefault, kCFGregorianCalendar);
    std::optional<CFAbsoluteTime> const at = composedBy(calendar, time);
    CFRelease(calendar);
    EXPECT_TRUE(at) << time;
    return at.value_or(std::numeric_limits<double>::quiet_NaN());
}

std::optional<CFAbsoluteTime> composedBy(CFCalendarRef calendar, CLocalTime const& time) {
    CFAbsoluteTime at = 0;
    if (!CFCalendarComposeAbsoluteTime(calendar, &at, "yMdHms", time.year, time.month, time.day,
                                       time.hour, time.minute, time.second))
        return std::nullopt;
    return at;
}

std::u16string textOf(CFAbsoluteTime at, CFDateFormatterStyle dateStyle,
                      CFDateFormatterStyle timeStyle) {
    CFLocaleRef const locale = CFLocaleCopyCurrent();
    CFDateFormatterRef const formatter =
        CFDateFormatterCreate(kCFAllocatorDefault, locale, dateStyle, timeStyle);
    CFDateRef const date = CFDateCreate(kCFAllocatorDefault, at);
    CPlatformString const text(
        CFDateFormatterCreateStringWithDate(kCFAllocatorDefault, formatter, date));
    CFRelease(date);
    CFRelease(formatter);
    CFRelease(locale);
    return text.units();
}

CRandomNumbers::CRandomNumbers(unsigned seed) : engine_(seed) {
    std::cout << "seed " << seed << "\n";
}

int CRandomNumbers::between(int first, int last) {
    return std::uniform_int_distribution<int>(first, last)(engine_);
}

std::string readable(std::u16string const& text) {
    std::string bytes;
    icu::UnicodeString(text.data(), static_cast<int32_t>(text.size())).toUTF8String(bytes);
    return bytes;
}

} // namespace TestSupport
