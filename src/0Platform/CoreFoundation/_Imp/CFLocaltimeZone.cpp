#include "0Platform/CoreFoundation/_Imp/CFLocaltimeZone.h"
#include "0Platform/CoreFoundation/_Imp/CFDateObject.h"
#include "0Platform/CoreFoundation/_Imp/CFGregorianDays.h"

#include <unicode/gregocal.h>

#include <cmath>
#include <ctime>

namespace CFPlatform {
namespace {

constexpr double dayMillis = 86400000.0;

// The offset at an instant that is given on the zone's own clock. Two instants may fit or none: of
// two it is the later one, and in a gap the offset before the gap holds, as in ICU's own zones.
int32_t offsetOnClock(UDate clock) {
    int32_t const before = localtimeOffset(clock - dayMillis);
    int32_t const after = localtimeOffset(clock + dayMillis);
    return localtimeOffset(clock - after) == after ? after : before;
}

} // namespace

int32_t localtimeOffset(UDate instant) noexcept {
    auto const seconds = static_cast<std::time_t>(std::floor(instant / millisecondsPerSecond));
    std::tm local;
    if (localtime_r(&seconds, &local) == nullptr)
        return 0;
    return static_cast<int32_t>(local.tm_gmtoff * 1000);
}

LocaltimeZone::LocaltimeZone()
    : TimeZone(icu::UnicodeString(u"localtime")), raw_(static_cast<int32_t>(-timezone * 1000)) {}

void LocaltimeZone::getOffset(UDate date, UBool isLocal, int32_t& raw, int32_t& saving,
                              UErrorCode& status) const {
    if (U_FAILURE(status))
        return;
    raw = raw_;
    saving = (isLocal ? offsetOnClock(date) : localtimeOffset(date)) - raw_;
}

// The two forms with fields count without summer time.
int32_t LocaltimeZone::getOffset(uint8_t era, int32_t year, int32_t month, int32_t day, uint8_t,
                                 int32_t millis, UErrorCode&) const {
    int32_t const astronomicalYear = era == icu::GregorianCalendar::AD ? year : 1 - year;
    auto const days = static_cast<double>(daysBeforeMonth(astronomicalYear, month + 1) + day - 1);
    return localtimeOffset(days * dayMillis + millis - raw_);
}

int32_t LocaltimeZone::getOffset(uint8_t era, int32_t year, int32_t month, int32_t day,
                                 uint8_t dayOfWeek, int32_t millis, int32_t,
                                 UErrorCode& status) const {
    return getOffset(era, year, month, day, dayOfWeek, millis, status);
}

int32_t LocaltimeZone::getRawOffset() const {
    return raw_;
}

void LocaltimeZone::setRawOffset(int32_t offsetMillis) {
    raw_ = offsetMillis;
}

UBool LocaltimeZone::useDaylightTime() const {
    return daylight != 0;
}

UBool LocaltimeZone::inDaylightTime(UDate date, UErrorCode&) const {
    return localtimeOffset(date) != raw_;
}

LocaltimeZone* LocaltimeZone::clone() const {
    return new LocaltimeZone(*this);
}

UClassID LocaltimeZone::getDynamicClassID() const {
    static char classID = 0;
    return &classID;
}

} // namespace CFPlatform
