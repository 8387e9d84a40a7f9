// Names, values and types of CFURL.h: this unit has only to compile.

#include "0Platform/CoreFoundation/CFInterface.h"

namespace {

using namespace TestSupport;

static_assert(isType<CFURLRef, __CFURL const*>);
static_assert(isKeptIn<CFURLPathStyle, CFIndex> && kCFURLPOSIXPathStyle == 0);
static_assert(isType<decltype(CFURLCreateWithFileSystemPath),
                     CFURLRef(CFAllocatorRef, CFStringRef, CFURLPathStyle, Boolean)>);
static_assert(isType<decltype(CFURLCopyLastPathComponent), CFStringRef(CFURLRef)>);

} // namespace
