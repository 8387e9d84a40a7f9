/// Points in time.
#ifndef QORN_0PLATFORM_CFDATE_H
#define QORN_0PLATFORM_CFDATE_H

#include <CoreFoundation/CFBase.h>

typedef double CFTimeInterval;         // seconds
typedef CFTimeInterval CFAbsoluteTime; // seconds since 1 January 2001, 00:00:00 GMT
typedef struct __CFDate const* CFDateRef;

extern "C" {

/// What an absolute time lacks to count from 1 January 1970, as the C library does.
extern CFTimeInterval const kCFAbsoluteTimeIntervalSince1970;

/// A date object of a point in time; null where memory is short. It never changes, so several
/// threads may use it at once.
CFDateRef CFDateCreate(CFAllocatorRef allocator, CFAbsoluteTime at);

CFAbsoluteTime CFDateGetAbsoluteTime(CFDateRef date);
}

#endif
