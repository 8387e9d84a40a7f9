#include "0Platform/CoreFoundation/CFDateTwin.h"

#include <unicode/ucal.h>
#include <unicode/udat.h>
#include <unicode/uloc.h>
#include <unicode/uversion.h>

#include <cstring>

namespace TestSupport {
namespace {

constexpr double earliest = -184303902528000000.0;

UDateFormatStyle twinStyle(CFDateFormatterStyle style) {
    constexpr UDateFormatStyle styles[] = {UDAT_NONE, UDAT_SHORT, UDAT_MEDIUM, UDAT_LONG,
                                           UDAT_FULL};
    return styles[style];
}

std::u16string unitsOf(std::string const& ascii) {
    return {ascii.begin(), ascii.end()};
}

void removeJulianPart(UCalendar* calendar, UErrorCode* status) {
    if (std::strcmp(ucal_getType(calendar, status), "gregorian") == 0)
        ucal_setGregorianChange(calendar, earliest, status);
}

} // namespace

bool isRecordedIcu() {
    UVersionInfo version;
    u_getVersion(version);
    return version[0] == 72;
}

CFAbsoluteTime twinComposed(std::string const& zone, CLocalTime const& time) {
    std::u16string const id = unitsOf(zone);
    UErrorCode status = U_ZERO_ERROR;
    UCalendar* const calendar =
        ucal_open(id.data(), static_cast<int32_t>(id.size()), "en_US", UCAL_GREGORIAN, &status);
    removeJulianPart(calendar, &status);
    ucal_clear(calendar);
    ucal_setDateTime(calendar, time.year, time.month - 1, time.day, time.hour, time.minute,
                     time.second, &status);
    double const millis = ucal_getMillis(calendar, &status);
    ucal_close(calendar);
    EXPECT_TRUE(U_SUCCESS(status)) << zone << " " << time;
    return millis / 1000 - 978307200;
}

std::u16string twinText(std::string const& locale, std::string const& zone, CFAbsoluteTime at,
                        CFDateFormatterStyle dateStyle, CFDateFormatterStyle timeStyle) {
    if (dateStyle == kCFDateFormatterNoStyle && timeStyle == kCFDateFormatterNoStyle)
        return {};
    std::u16string const id = unitsOf(zone);
    UErrorCode status = U_ZERO_ERROR;
    uloc_setDefault("en_US", &status);
    UDateFormat* const format =
        udat_open(twinStyle(timeStyle), twinStyle(dateStyle), locale.c_str(), id.data(),
                  static_cast<int32_t>(id.size()), nullptr, 0, &status);
    UCalendar* const calendar = ucal_clone(udat_getCalendar(format), &status);
    removeJulianPart(calendar, &status);
    udat_setCalendar(format, calendar);
    ucal_close(calendar);
    std::u16string text(200, u'\0');
    int32_t const length = udat_format(format, (at + 978307200) * 1000, text.data(),
                                       static_cast<int32_t>(text.size()), nullptr, &status);
    udat_close(format);
    EXPECT_TRUE(U_SUCCESS(status)) << locale << " " << zone << " " << at;
    text.resize(static_cast<std::size_t>(length));
    return text;
}

} // namespace TestSupport
