// Names, values and types of CFCalendar.h: this unit has only to compile.

#include "0Platform/CoreFoundation/CFInterface.h"

namespace {

using namespace TestSupport;

static_assert(isType<CFCalendarRef, __CFCalendar*>);
static_assert(isType<decltype(CFCalendarCreateWithIdentifier),
                     CFCalendarRef(CFAllocatorRef, CFCalendarIdentifier)>);
static_assert(isType<decltype(CFCalendarComposeAbsoluteTime),
                     Boolean(CFCalendarRef, CFAbsoluteTime*, char const*, ...)>);

} // namespace
