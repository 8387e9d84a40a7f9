/// Locales, as far as case conversion asks for them.
#ifndef QORN_0PLATFORM_CFLOCALE_H
#define QORN_0PLATFORM_CFLOCALE_H

#include <CoreFoundation/CFBase.h>

typedef struct __CFLocale const* CFLocaleRef;

extern "C" {

/// The process's locale at this moment, as the environment names it (LC_ALL, LC_CTYPE, LANG, in
/// this order). Owned by the caller.
CFLocaleRef CFLocaleCopyCurrent(void);
}

#endif
