// Names, values and types of CFBase.h: this unit has only to compile.

#include "0Platform/CoreFoundation/CFInterface.h"

namespace {

using namespace TestSupport;

static_assert(isType<Boolean, unsigned char>);
static_assert(isType<UInt8, unsigned char> && isType<SInt8, signed char>);
static_assert(isType<UInt16, unsigned short> && isType<SInt16, signed short>);
static_assert(isType<UInt32, unsigned int> && isType<SInt32, signed int>);
static_assert(isType<UniChar, unsigned short>);
static_assert(isType<StringPtr, unsigned char*> && isType<ConstStringPtr, unsigned char const*>);
static_assert(isType<Str255, unsigned char[256]> && isType<ConstStr255Param, unsigned char const*>);

static_assert(isType<CFIndex, signed long> && isType<CFOptionFlags, unsigned long>);
static_assert(isType<CFTypeRef, void const*>);
static_assert(isType<CFAllocatorRef, __CFAllocator const*>);
static_assert(isType<CFStringRef, __CFString const*> && isType<CFMutableStringRef, __CFString*>);

static_assert(isKeptIn<CFComparisonResult, CFIndex>);
static_assert(kCFCompareLessThan == -1 && kCFCompareEqualTo == 0 && kCFCompareGreaterThan == 1);

static_assert(isType<decltype(CFRange::location), CFIndex> &&
              isType<decltype(CFRange::length), CFIndex> && sizeof(CFRange) == 2 * sizeof(CFIndex));
static_assert(isType<decltype(CFRangeMake), CFRange(CFIndex, CFIndex)>);

static_assert(isType<decltype(kCFAllocatorDefault), CFAllocatorRef const>);
static_assert(isType<decltype(kCFCoreFoundationVersionNumber), double>);

static_assert(isType<decltype(CFRetain), CFTypeRef(CFTypeRef)>);
static_assert(isType<decltype(CFRelease), void(CFTypeRef)>);
static_assert(isType<decltype(CFGetRetainCount), CFIndex(CFTypeRef)>);

} // namespace
