// Names, values and types of CFLocale.h: this unit has only to compile.

#include "0Platform/CoreFoundation/CFInterface.h"

namespace {

using namespace TestSupport;

static_assert(isType<CFLocaleRef, __CFLocale const*>);
static_assert(isType<CFLocaleKey, CFStringRef> && isType<CFCalendarIdentifier, CFStringRef>);
static_assert(isType<decltype(kCFLocaleUsesMetricSystem), CFLocaleKey const>);
static_assert(isType<decltype(kCFGregorianCalendar), CFCalendarIdentifier const>);
static_assert(isType<decltype(CFLocaleCopyCurrent), CFLocaleRef()>);
static_assert(isType<decltype(CFLocaleGetValue), CFTypeRef(CFLocaleRef, CFLocaleKey)>);

} // namespace
