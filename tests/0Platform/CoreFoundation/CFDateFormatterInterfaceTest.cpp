// Names, values and types of CFDateFormatter.h: this unit has only to compile.

#include "0Platform/CoreFoundation/CFInterface.h"

namespace {

using namespace TestSupport;

static_assert(isType<CFDateFormatterRef, __CFDateFormatter*>);
static_assert(isKeptIn<CFDateFormatterStyle, CFIndex>);
static_assert(kCFDateFormatterNoStyle == 0 && kCFDateFormatterShortStyle == 1 &&
              kCFDateFormatterMediumStyle == 2 && kCFDateFormatterLongStyle == 3 &&
              kCFDateFormatterFullStyle == 4);

static_assert(isType<decltype(CFDateFormatterCreate),
                     CFDateFormatterRef(CFAllocatorRef, CFLocaleRef, CFDateFormatterStyle,
                                        CFDateFormatterStyle)>);
static_assert(isType<decltype(CFDateFormatterCreateStringWithDate),
                     CFStringRef(CFAllocatorRef, CFDateFormatterRef, CFDateRef)>);

} // namespace
