#include "0Platform/CoreFoundation/_Imp/CFCreate.h"
#include "0Platform/CoreFoundation/_Imp/CFDateObject.h"
#include "0Platform/CoreFoundation/_Imp/CFDefaultZone.h"
#include "0Platform/CoreFoundation/_Imp/CFGregorianDays.h"
#include "0Platform/CoreFoundation/_Imp/CFStringConstant.h"

#include <CoreFoundation/CFCalendar.h>

#include <algorithm>
#include <cmath>
#include <cstdarg>
#include <cstdint>
#include <iterator>
#include <utility>

using namespace CFPlatform;

struct __CFCalendar : Object {
    __CFCalendar(TFinalize finalizer, ZoneOwner owner) noexcept
        : Object(finalizer), zone(std::move(owner)) {}

    ZoneOwner const zone;
};

namespace {

StringConstant gregorian(u"gregorian");

struct Components {
    int year = 1;
    int month = 1;
    int day = 1;
    int hour = 0;
    int minute = 0;
    int second = 0;
};

struct Letter {
    char letter;
    int Components::*component;
};

constexpr Letter letters[] = {{'y', &Components::year},   {'M', &Components::month},
                              {'d', &Components::day},    {'H', &Components::hour},
                              {'m', &Components::minute}, {'s', &Components::second}};

bool readComponents(Components& components, char const* description, va_list values) {
    for (char const* next = description; *next != '\0'; ++next) {
        Letter const* const known =
            std::find_if(std::begin(letters), std::end(letters),
                         [=](Letter const& letter) { return letter.letter == *next; });
        if (known == std::end(letters))
            return false;
        components.*known->component = va_arg(values, int);
    }
    return true;
}

// Seconds since 1970 on the clock of the zone. Never wraps: all is far below 64 bits.
std::int64_t localSeconds(Components const& components) {
    std::int64_t const days =
        daysBeforeMonth(components.year, components.month) + std::int64_t{components.day} - 1;
    return ((days * 24 + components.hour) * 60 + components.minute) * 60 + components.second;
}

} // namespace

CFCalendarIdentifier const kCFGregorianCalendar = &gregorian;

extern "C" CFCalendarRef CFCalendarCreateWithIdentifier(CFAllocatorRef,
                                                        CFCalendarIdentifier identifier) {
    if (!std::equal(identifier->units, identifier->units + identifier->length, gregorian.units,
                    gregorian.units + gregorian.length))
        return nullptr;
    ZoneOwner zone = createDefaultZone();
    return zone != nullptr ? createObject<__CFCalendar>(std::move(zone)) : nullptr;
}

extern "C" Boolean CFCalendarComposeAbsoluteTime(CFCalendarRef calendar, CFAbsoluteTime* at,
                                                 char const* componentDesc, ...) {
    Components components;
    va_list values;
    va_start(values, componentDesc);
    bool const isRead = readComponents(components, componentDesc, values);
    va_end(values);
    if (!isRead)
        return false;
    auto const seconds = static_cast<double>(localSeconds(components));
    double const local = seconds * millisecondsPerSecond;
    if (std::abs(local) > -earliestInstant)
        return false;
    int32_t raw = 0;
    int32_t saving = 0;
    UErrorCode status = U_ZERO_ERROR;
    calendar->zone->getOffset(local, true, raw, saving, status);
    if (U_FAILURE(status))
        return false;
    *at = seconds - (raw + saving) / millisecondsPerSecond - kCFAbsoluteTimeIntervalSince1970;
    return true;
}
