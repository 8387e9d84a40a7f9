#include "0Platform/CoreFoundation/_Imp/CFCreate.h"
#include "0Platform/CoreFoundation/_Imp/CFDateObject.h"
#include "0Platform/CoreFoundation/_Imp/CFDefaultZone.h"
#include "0Platform/CoreFoundation/_Imp/CFLocaleObject.h"
#include "0Platform/CoreFoundation/_Imp/CFStringObject.h"

#include <CoreFoundation/CFDateFormatter.h>

#include <unicode/datefmt.h>
#include <unicode/gregocal.h>
#include <unicode/ures.h>

#include <cmath>
#include <cstring>
#include <memory>
#include <utility>

using namespace CFPlatform;

namespace {

using FormatOwner = std::unique_ptr<icu::DateFormat>;

} // namespace

struct __CFDateFormatter : Object {
    __CFDateFormatter(TFinalize finalizer, FormatOwner owner) noexcept
        : Object(finalizer), format(std::move(owner)) {}

    FormatOwner const format; // null where neither half has a style
};

namespace {

icu::DateFormat::EStyle styleOf(CFDateFormatterStyle style) {
    switch (style) {
    case kCFDateFormatterNoStyle:
        return icu::DateFormat::kNone;
    case kCFDateFormatterShortStyle:
        return icu::DateFormat::kShort;
    case kCFDateFormatterLongStyle:
        return icu::DateFormat::kLong;
    case kCFDateFormatterFullStyle:
        return icu::DateFormat::kFull;
    default:
        return icu::DateFormat::kMedium;
    }
}

bool isKnownLanguage(char const* language) {
    if (*language == '\0')
        return true;
    UErrorCode status = U_ZERO_ERROR;
    ures_close(ures_openDirect(nullptr, language, &status));
    return status != U_MISSING_RESOURCE_ERROR;
}

// For a language without data ICU would take the process's default locale, whatever that is at the
// moment. Here it is always English, with the clock of the territory or, as in most, of 24 hours.
icu::Locale localeOf(CFLocaleRef locale) {
    icu::Locale named(dateIdentifierOf(locale));
    if (isKnownLanguage(named.getLanguage()))
        return named;
    constexpr char const* unknownTerritory = "ZZ";
    char const* const territory = named.getCountry();
    return icu::Locale("en", *territory != '\0' ? territory : unknownTerritory);
}

// Moves the change from the Julian calendar before all time. Calendars that are built on ICU's
// Gregorian one, like the Buddhist, keep it.
void removeJulianPart(icu::Calendar& calendar, UErrorCode& status) {
    if (std::strcmp(calendar.getType(), "gregorian") == 0)
        static_cast<icu::GregorianCalendar&>(calendar).setGregorianChange(earliestInstant, status);
}

FormatOwner createFormat(icu::Locale const& locale, icu::DateFormat::EStyle dateStyle,
                         icu::DateFormat::EStyle timeStyle) {
    FormatOwner format(icu::DateFormat::createDateTimeInstance(dateStyle, timeStyle, locale));
    ZoneOwner zone = createDefaultZone();
    if (format == nullptr || zone == nullptr)
        return nullptr;
    std::unique_ptr<icu::Calendar> calendar(format->getCalendar()->clone());
    if (calendar == nullptr)
        return nullptr;
    UErrorCode status = U_ZERO_ERROR;
    removeJulianPart(*calendar, status);
    calendar->adoptTimeZone(zone.release());
    format->adoptCalendar(calendar.release());
    return U_SUCCESS(status) ? std::move(format) : nullptr;
}

CFStringRef createStringOf(icu::UnicodeString const& text) {
    int32_t const length = text.length();
    __CFString* const string = createString(length);
    if (string == nullptr)
        return nullptr;
    text.extract(0, length, reinterpret_cast<char16_t*>(string->units));
    string->length = length;
    return string;
}

} // namespace

extern "C" CFDateFormatterRef CFDateFormatterCreate(CFAllocatorRef, CFLocaleRef locale,
                                                    CFDateFormatterStyle dateStyle,
                                                    CFDateFormatterStyle timeStyle) {
    if (dateStyle == kCFDateFormatterNoStyle && timeStyle == kCFDateFormatterNoStyle)
        return createObject<__CFDateFormatter>(nullptr);
    FormatOwner format = createFormat(localeOf(locale), styleOf(dateStyle), styleOf(timeStyle));
    return format != nullptr ? createObject<__CFDateFormatter>(std::move(format)) : nullptr;
}

extern "C" CFStringRef
CFDateFormatterCreateStringWithDate(CFAllocatorRef, CFDateFormatterRef formatter, CFDateRef date) {
    if (std::isnan(date->time))
        return nullptr;
    icu::UnicodeString text;
    if (formatter->format == nullptr)
        return createStringOf(text);
    formatter->format->format(
        (date->time + kCFAbsoluteTimeIntervalSince1970) * millisecondsPerSecond, text);
    // ICU has no other way to say that it lacked memory: each style writes something.
    return text.isEmpty() ? nullptr : createStringOf(text);
}
