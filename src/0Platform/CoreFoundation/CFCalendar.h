/// Calendars: points in time of years, months, days, hours, minutes and seconds.
///
///     CFCalendarRef calendar =
///         CFCalendarCreateWithIdentifier(kCFAllocatorDefault, kCFGregorianCalendar);
///     CFAbsoluteTime at = 0;
///     CFCalendarComposeAbsoluteTime(calendar, &at, "yMdHms", 2021, 3, 5, 8, 5, 9);
///     CFRelease(calendar);   // at: 636624309 in Greenwich, 636642309 in New York
#ifndef QORN_0PLATFORM_CFCALENDAR_H
#define QORN_0PLATFORM_CFCALENDAR_H

#include <CoreFoundation/CFBase.h>
#include <CoreFoundation/CFDate.h>
#include <CoreFoundation/CFLocale.h>

typedef struct __CFCalendar* CFCalendarRef;

extern "C" {

/// A calendar in the process's zone at this moment: the one that TZ of the environment names, or a
/// POSIX rule in TZ, or without TZ the system's zone, as `localtime` sees it. Only the Gregorian
/// calendar is served; null for another identifier, and where memory is short. No other thread may
/// change the environment meanwhile.
CFCalendarRef CFCalendarCreateWithIdentifier(CFAllocatorRef allocator,
                                             CFCalendarIdentifier identifier);

/// Stores the point in time that components give, and returns true. `componentDesc` names them in
/// the order of the `int` arguments behind it: "y" year, "M" month from 1, "d" day, "H" hour, "m"
/// minute, "s" second. What is not named is that of midnight on 1 January of the year 1.
///
/// The calendar is Gregorian at all times, also before 1582. The year 0 is 1 BC, -44 is 45 BC.
/// Components beyond their range carry over: 30 February 2021 is 2 March, month 13 the next
/// January. A local time that a zone skips is read with the offset before the gap (2:30 becomes
/// 3:30), one that it has twice is the later of the two.
///
/// False, and `at` as it was, for any other component, and for years that are millions of years
/// away. A calendar may be used on several threads at once.
Boolean CFCalendarComposeAbsoluteTime(CFCalendarRef calendar, CFAbsoluteTime* at,
                                      char const* componentDesc, ...);
}

#endif
