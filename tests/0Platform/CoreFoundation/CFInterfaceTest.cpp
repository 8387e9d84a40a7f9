// Names, values and signatures of the platform's interface: this unit has only to compile.

#include <CoreFoundation/CoreFoundation.h>

#include <type_traits>

namespace {

template <class TExpected, class TActual>
constexpr bool isType = std::is_same_v<TExpected, TActual>;

static_assert(isType<Boolean, unsigned char> && isType<UInt8, unsigned char>);
static_assert(isType<UniChar, unsigned short> && isType<UInt16, unsigned short>);
static_assert(isType<UInt32, unsigned int> && isType<SInt32, signed int>);
static_assert(isType<SInt8, signed char> && isType<SInt16, signed short>);
static_assert(isType<CFIndex, long> && isType<CFOptionFlags, unsigned long>);
static_assert(isType<CFTypeRef, void const*>);
static_assert(isType<CFStringRef, __CFString const*> && isType<CFMutableStringRef, __CFString*>);
static_assert(isType<CFAllocatorRef, __CFAllocator const*>);
static_assert(isType<ConstStr255Param, unsigned char const*> && isType<Str255, unsigned char[256]>);
static_assert(isType<CFStringEncoding, UInt32>);
static_assert(isType<CFTimeInterval, double> && isType<CFAbsoluteTime, double>);
static_assert(isType<CFDateRef, __CFDate const*> && isType<CFLocaleRef, __CFLocale const*>);
static_assert(isType<CFCalendarRef, __CFCalendar*> &&
              isType<CFDateFormatterRef, __CFDateFormatter*>);
static_assert(isType<CFCalendarIdentifier, CFStringRef> && isType<CFLocaleKey, CFStringRef>);
static_assert(isType<CFBooleanRef, __CFBoolean const*>);
static_assert(isType<std::underlying_type_t<CFDateFormatterStyle>, CFIndex>);
static_assert(isType<decltype(CFRange::location), CFIndex> &&
              isType<decltype(CFRange::length), CFIndex>);
static_assert(isType<decltype(kCFAllocatorDefault), CFAllocatorRef const>);
static_assert(isType<decltype(kCFGregorianCalendar), CFCalendarIdentifier const>);
static_assert(isType<decltype(kCFLocaleUsesMetricSystem), CFLocaleKey const>);
static_assert(isType<decltype(kCFBooleanTrue), CFBooleanRef const> &&
              isType<decltype(kCFBooleanFalse), CFBooleanRef const>);
static_assert(isType<decltype(kCFAbsoluteTimeIntervalSince1970), CFTimeInterval const>);

static_assert(kCFStringEncodingMacRoman == 0);
static_assert(kCFStringEncodingWindowsLatin1 == 1280);
static_assert(kCFStringEncodingISOLatin1 == 513);
static_assert(kCFStringEncodingUnicode == 256);
static_assert(kCFStringEncodingUTF8 == 134217984);
static_assert(kCFStringEncodingUTF16LE == 335544576);
static_assert(kCFStringEncodingUTF32LE == 469762304);

static_assert(kCFStringNormalizationFormD == 0 && kCFStringNormalizationFormKD == 1);
static_assert(kCFStringNormalizationFormC == 2 && kCFStringNormalizationFormKC == 3);

static_assert(kCFCompareLessThan == -1 && kCFCompareEqualTo == 0 && kCFCompareGreaterThan == 1);
static_assert((kCFCompareCaseInsensitive | kCFCompareNumerically |
               kCFCompareDiacriticInsensitive) == 193);

static_assert(kCFDateFormatterNoStyle == 0 && kCFDateFormatterShortStyle == 1 &&
              kCFDateFormatterMediumStyle == 2 && kCFDateFormatterLongStyle == 3 &&
              kCFDateFormatterFullStyle == 4);

static_assert(isType<decltype(CFRangeMake), CFRange(CFIndex, CFIndex)>);
static_assert(isType<decltype(CFRetain), CFTypeRef(CFTypeRef)>);
static_assert(isType<decltype(CFRelease), void(CFTypeRef)>);
static_assert(isType<decltype(CFGetRetainCount), CFIndex(CFTypeRef)>);
static_assert(isType<decltype(CFLocaleGetValue), CFTypeRef(CFLocaleRef, CFLocaleKey)>);
static_assert(isType<decltype(CFBooleanGetValue), Boolean(CFBooleanRef)>);
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
static_assert(
    isType<decltype(CFStringNormalize), void(CFMutableStringRef, CFStringNormalizationForm)>);
static_assert(isType<decltype(CFStringGetSystemEncoding), CFStringEncoding()>);
static_assert(isType<decltype(CFLocaleCopyCurrent), CFLocaleRef()>);
static_assert(isType<decltype(CFDateCreate), CFDateRef(CFAllocatorRef, CFAbsoluteTime)>);
static_assert(isType<decltype(CFDateGetAbsoluteTime), CFAbsoluteTime(CFDateRef)>);
static_assert(isType<decltype(CFCalendarCreateWithIdentifier),
                     CFCalendarRef(CFAllocatorRef, CFCalendarIdentifier)>);
static_assert(isType<decltype(CFCalendarComposeAbsoluteTime),
                     Boolean(CFCalendarRef, CFAbsoluteTime*, char const*, ...)>);
static_assert(isType<decltype(CFDateFormatterCreate),
                     CFDateFormatterRef(CFAllocatorRef, CFLocaleRef, CFDateFormatterStyle,
                                        CFDateFormatterStyle)>);
static_assert(isType<decltype(CFDateFormatterCreateStringWithDate),
                     CFStringRef(CFAllocatorRef, CFDateFormatterRef, CFDateRef)>);

} // namespace
