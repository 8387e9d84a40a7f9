/// Locales, as far as case conversion, the texts of dates and measures ask for them, and the
/// identifiers of calendars.
#ifndef QORN_0PLATFORM_CFLOCALE_H
#define QORN_0PLATFORM_CFLOCALE_H

#include <CoreFoundation/CFBase.h>

typedef struct __CFLocale const* CFLocaleRef;
typedef CFStringRef CFCalendarIdentifier;
typedef CFStringRef CFLocaleKey;

extern "C" {

/// The process's locale at this moment, as the environment names it. As everywhere in POSIX, each
/// use has its category: case conversion goes by the first of LC_ALL, LC_CTYPE and LANG that is set
/// and not empty, dates by the first of LC_ALL, LC_TIME and LANG, measures by the first of LC_ALL,
/// LC_MEASUREMENT and LANG; the locale holds them all.
///
/// Codeset and modifier don't count ("tr_TR.UTF-8@x" is "tr_TR"); only in dates the modifiers
/// "latin", "cyrillic" and "devanagari" choose the script ("sr_RS@latin"). Without any variable it
/// is the root locale. So are "C", "POSIX" and what is no locale's name in case conversion; dates
/// are English then, with a clock of 24 hours, and English too where ICU lacks the language.
///
/// Owned by the caller; null where memory is short. Another thread must not change the environment
/// meanwhile.
CFLocaleRef CFLocaleCopyCurrent(void);

/// The value that the locale has for a key; null for a key that is not served. It belongs to the
/// locale.
CFTypeRef CFLocaleGetValue(CFLocaleRef locale, CFLocaleKey key);

/// The key of a CFBoolean, which is false where the territory has the measures of the US. A
/// language alone stands for its main territory; what is no locale's name is metric.
extern CFLocaleKey const kCFLocaleUsesMetricSystem;

/// "gregorian". A constant: neither retained nor released.
extern CFCalendarIdentifier const kCFGregorianCalendar;
}

#endif
