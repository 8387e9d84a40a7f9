// Names, values and types of CFString.h: this unit has only to compile.

#include "0Platform/CoreFoundation/CFInterface.h"

namespace {

using namespace TestSupport;

static_assert(isType<CFStringEncoding, UInt32>);
static_assert(isKeptIn<CFStringBuiltInEncodings, CFStringEncoding>);
static_assert(kCFStringEncodingMacRoman == 0);
static_assert(kCFStringEncodingWindowsLatin1 == 1280);
static_assert(kCFStringEncodingISOLatin1 == 513);
static_assert(kCFStringEncodingUnicode == 256);
static_assert(kCFStringEncodingUTF8 == 134217984);
static_assert(kCFStringEncodingUTF16LE == 335544576);
static_assert(kCFStringEncodingUTF32LE == 469762304);

static_assert(isType<CFStringCompareFlags, CFOptionFlags>);
static_assert(isKeptIn<decltype(kCFCompareCaseInsensitive), CFOptionFlags>);
static_assert(kCFCompareCaseInsensitive == 1 && kCFCompareNumerically == 64 &&
              kCFCompareDiacriticInsensitive == 128);

static_assert(isKeptIn<CFStringNormalizationForm, CFIndex>);
static_assert(kCFStringNormalizationFormD == 0 && kCFStringNormalizationFormKD == 1 &&
              kCFStringNormalizationFormC == 2 && kCFStringNormalizationFormKC == 3);

static_assert(
    isType<decltype(CFStringCreateWithBytes),
           CFStringRef(CFAllocatorRef, UInt8 const*, CFIndex, CFStringEncoding, Boolean)>);
static_assert(isType<decltype(CFStringCreateWithCharacters),
                     CFStringRef(CFAllocatorRef, UniChar const*, CFIndex)>);
static_assert(isType<decltype(CFStringCreateWithPascalString),
                     CFStringRef(CFAllocatorRef, ConstStr255Param, CFStringEncoding)>);
static_assert(isType<decltype(CFStringCreateMutableCopy),
                     CFMutableStringRef(CFAllocatorRef, CFIndex, CFStringRef)>);
static_assert(isType<decltype(CFStringGetLength), CFIndex(CFStringRef)>);
static_assert(isType<decltype(CFStringGetCharactersPtr), UniChar const*(CFStringRef)>);
static_assert(isType<decltype(CFStringGetCharacters), void(CFStringRef, CFRange, UniChar*)>);
static_assert(
    isType<decltype(CFStringGetBytes), CFIndex(CFStringRef, CFRange, CFStringEncoding, UInt8,
                                               Boolean, UInt8*, CFIndex, CFIndex*)>);
static_assert(isType<decltype(CFStringCompareWithOptions),
                     CFComparisonResult(CFStringRef, CFStringRef, CFRange, CFStringCompareFlags)>);
static_assert(isType<decltype(CFStringUppercase), void(CFMutableStringRef, CFLocaleRef)>);
static_assert(isType<decltype(CFStringLowercase), void(CFMutableStringRef, CFLocaleRef)>);
static_assert(
    isType<decltype(CFStringNormalize), void(CFMutableStringRef, CFStringNormalizationForm)>);
static_assert(isType<decltype(CFStringGetSystemEncoding), CFStringEncoding()>);

} // namespace
