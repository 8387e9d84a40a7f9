// Names, values and types of CFDate.h: this unit has only to compile.

#include "0Platform/CoreFoundation/CFInterface.h"

namespace {

using namespace TestSupport;

static_assert(isType<CFTimeInterval, double> && isType<CFAbsoluteTime, double>);
static_assert(isType<CFDateRef, __CFDate const*>);
static_assert(isType<decltype(kCFAbsoluteTimeIntervalSince1970), CFTimeInterval const>);
static_assert(isType<decltype(CFDateCreate), CFDateRef(CFAllocatorRef, CFAbsoluteTime)>);
static_assert(isType<decltype(CFDateGetAbsoluteTime), CFAbsoluteTime(CFDateRef)>);

} // namespace
