/// Truth values as objects.
#ifndef QORN_0PLATFORM_CFNUMBER_H
#define QORN_0PLATFORM_CFNUMBER_H

#include <CoreFoundation/CFBase.h>

typedef struct __CFBoolean const* CFBooleanRef;

extern "C" {

/// The only two. Constants: neither retained nor released.
extern CFBooleanRef const kCFBooleanTrue;
extern CFBooleanRef const kCFBooleanFalse;

Boolean CFBooleanGetValue(CFBooleanRef boolean);
}

#endif
