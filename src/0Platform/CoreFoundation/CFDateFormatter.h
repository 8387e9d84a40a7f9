/// Texts of dates and times in the style of a locale.
///
///     CFLocaleRef locale = CFLocaleCopyCurrent();   // "en_GB"
///     CFDateFormatterRef formatter = CFDateFormatterCreate(
///         kCFAllocatorDefault, locale, kCFDateFormatterLongStyle, kCFDateFormatterNoStyle);
///     CFStringRef text = CFDateFormatterCreateStringWithDate(kCFAllocatorDefault, formatter,
///     date);
///     // "5 March 2021"
///
/// The texts are ICU's (CLDR), so they change with its releases.
#ifndef QORN_0PLATFORM_CFDATEFORMATTER_H
#define QORN_0PLATFORM_CFDATEFORMATTER_H

#include <CoreFoundation/CFBase.h>
#include <CoreFoundation/CFDate.h>
#include <CoreFoundation/CFLocale.h>

typedef struct __CFDateFormatter* CFDateFormatterRef;

// The samples are those of American English.
enum CFDateFormatterStyle : CFIndex {
    kCFDateFormatterNoStyle = 0,     // the half is left out
    kCFDateFormatterShortStyle = 1,  // 3/5/21, 8:05 AM
    kCFDateFormatterMediumStyle = 2, // Mar 5, 2021, 8:05:09 AM
    kCFDateFormatterLongStyle = 3,   // March 5, 2021, 8:05:09 AM EST
    kCFDateFormatterFullStyle = 4    // Friday, March 5, 2021, 8:05:09 AM Eastern Standard Time
};

extern "C" {

/// A formatter in the locale's language, calendar and digits and in the process's zone at this
/// moment, which is chosen as for CFCalendarCreateWithIdentifier. A null locale is the root locale.
/// A Gregorian calendar is Gregorian at all times, also before 1582; the other calendars of ICU
/// keep the change of that year. A value that is no style counts as kCFDateFormatterMediumStyle.
/// Null where memory is short, as far as ICU survives that.
///
/// Takes 20 to 150 microseconds and, at a locale's first use in the process, some milliseconds:
/// keep a formatter to write many dates. No other thread may change the environment meanwhile.
CFDateFormatterRef CFDateFormatterCreate(CFAllocatorRef allocator, CFLocaleRef locale,
                                         CFDateFormatterStyle dateStyle,
                                         CFDateFormatterStyle timeStyle);

/// The date's text; empty when neither half has a style. Null where memory is short, and for a date
/// that is not a number; one too far away for ICU is written as the last or first that it knows. A
/// formatter belongs to one thread at a time.
CFStringRef CFDateFormatterCreateStringWithDate(CFAllocatorRef allocator,
                                                CFDateFormatterRef formatter, CFDateRef date);
}

#endif
