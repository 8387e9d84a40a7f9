// Names, values and types of CFBundle.h: this unit has only to compile.

#include "0Platform/CoreFoundation/CFInterface.h"

namespace {

using namespace TestSupport;

static_assert(isType<CFBundleRef, __CFBundle*>);
static_assert(isType<decltype(kCFBundleNameKey), CFStringRef const>);
static_assert(isType<decltype(kCFBundleVersionKey), CFStringRef const>);

static_assert(isType<decltype(CFBundleCreate), CFBundleRef(CFAllocatorRef, CFURLRef)>);
static_assert(
    isType<decltype(CFBundleGetValueForInfoDictionaryKey), CFTypeRef(CFBundleRef, CFStringRef)>);
static_assert(isType<decltype(CFBundleCopyExecutableURL), CFURLRef(CFBundleRef)>);
static_assert(isType<decltype(CFBundleLoadExecutable), Boolean(CFBundleRef)>);
static_assert(isType<decltype(CFBundleUnloadExecutable), void(CFBundleRef)>);
static_assert(isType<decltype(CFBundleGetFunctionPointerForName), void*(CFBundleRef, CFStringRef)>);

} // namespace
