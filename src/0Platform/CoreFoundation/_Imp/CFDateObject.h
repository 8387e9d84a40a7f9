/// The date object, and the instants of ICU.
#ifndef QORN_0PLATFORM_CFDATEOBJECT_H
#define QORN_0PLATFORM_CFDATEOBJECT_H

#include "0Platform/CoreFoundation/_Imp/CFObject.h"

#include <CoreFoundation/CFDate.h>

struct __CFDate : CFPlatform::Object {
    __CFDate(TFinalize finalizer, CFAbsoluteTime at) noexcept : Object(finalizer), time(at) {}

    CFAbsoluteTime time;
};

namespace CFPlatform {

/// The earliest instant of ICU's calendars in milliseconds since 1970 (the day -7F000000 of the
/// Julian count); the latest lies nearly as far ahead.
constexpr double earliestInstant = -184303902528000000.0;

constexpr double millisecondsPerSecond = 1000.0;

} // namespace CFPlatform

#endif
