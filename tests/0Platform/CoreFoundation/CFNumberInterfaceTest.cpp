// Names, values and types of CFNumber.h: this unit has only to compile.

#include "0Platform/CoreFoundation/CFInterface.h"

namespace {

using namespace TestSupport;

static_assert(isType<CFBooleanRef, __CFBoolean const*>);
static_assert(isType<decltype(kCFBooleanTrue), CFBooleanRef const>);
static_assert(isType<decltype(kCFBooleanFalse), CFBooleanRef const>);
static_assert(isType<decltype(CFBooleanGetValue), Boolean(CFBooleanRef)>);

} // namespace
