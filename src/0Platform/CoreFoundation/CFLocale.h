/// Locales, as far as case conversion asks for them.
#ifndef QORN_0PLATFORM_CFLOCALE_H
#define QORN_0PLATFORM_CFLOCALE_H

#include <CoreFoundation/CFBase.h>

typedef struct __CFLocale const* CFLocaleRef;

extern "C" {

/// The process's locale at this moment, as the environment names it: the first of LC_ALL, LC_CTYPE
/// and LANG that is set and not empty, without codeset and modifier ("tr_TR.UTF-8@x" is "tr_TR").
/// "C", "POSIX" and what is no locale's name are the root locale. Owned by the caller; null where
/// memory is short. Another thread must not change the environment meanwhile.
CFLocaleRef CFLocaleCopyCurrent(void);
}

#endif
