/// The part of CoreFoundation's C interface that this project calls, for systems that do not bring
/// the framework along. Names, types, constants and observable results are those of the real one,
/// so the code above includes <CoreFoundation/CoreFoundation.h> on every system and is one text.
///
///     CFStringRef text = CFStringCreateWithBytes(kCFAllocatorDefault, bytes, 5,
///                                                kCFStringEncodingUTF8, false);
///     CFIndex units = CFStringGetLength(text);
///     CFRelease(text);
///
/// Ownership follows the usual rule: what a function with Create or Copy in its name returns is
/// released by the caller. No function here throws. An immutable string may be used on several
/// threads at once; a mutable one belongs to one thread at a time.
#ifndef QORN_0PLATFORM_COREFOUNDATION_H
#define QORN_0PLATFORM_COREFOUNDATION_H

#include <CoreFoundation/CFBase.h>
#include <CoreFoundation/CFBundle.h>
#include <CoreFoundation/CFCalendar.h>
#include <CoreFoundation/CFDate.h>
#include <CoreFoundation/CFDateFormatter.h>
#include <CoreFoundation/CFLocale.h>
#include <CoreFoundation/CFNumber.h>
#include <CoreFoundation/CFString.h>
#include <CoreFoundation/CFStringEncodingExt.h>
#include <CoreFoundation/CFURL.h>

#endif
