/// Unicode strings: UTF-16 units behind an opaque reference.
#ifndef QORN_0PLATFORM_CFSTRING_H
#define QORN_0PLATFORM_CFSTRING_H

#include <CoreFoundation/CFBase.h>
#include <CoreFoundation/CFLocale.h>

typedef UInt32 CFStringEncoding;

enum CFStringBuiltInEncodings : CFStringEncoding {
    kCFStringEncodingMacRoman = 0,
    kCFStringEncodingWindowsLatin1 = 0x0500,
    kCFStringEncodingISOLatin1 = 0x0201,
    kCFStringEncodingUnicode = 0x0100, // UTF-16 in host order
    kCFStringEncodingUTF8 = 0x08000100,
    kCFStringEncodingUTF16LE = 0x14000100,
    kCFStringEncodingUTF32LE = 0x1c000100
};

typedef CFOptionFlags CFStringCompareFlags;
enum : CFOptionFlags {
    kCFCompareCaseInsensitive = 1,
    kCFCompareNumerically = 64,
    kCFCompareDiacriticInsensitive = 128
};

enum CFStringNormalizationForm : CFIndex {
    kCFStringNormalizationFormD = 0, // canonical decomposition
    kCFStringNormalizationFormKD,    // compatibility decomposition
    kCFStringNormalizationFormC,     // canonical composition
    kCFStringNormalizationFormKC     // compatibility composition
};

extern "C" {

/// A string of `numBytes` bytes in `encoding`; null where the bytes are malformed, the encoding is
/// not served, or memory is short. UTF-8 and UTF-32 are read strictly; one leading UTF-8 byte order
/// mark is removed whatever `isExternalRepresentation` says; UTF-16 units are taken as they are.
/// Bytes behind the last whole unit of UTF-16 or UTF-32 are ignored, but UTF-32 of one to three
/// bytes is malformed.
CFStringRef CFStringCreateWithBytes(CFAllocatorRef allocator, UInt8 const* bytes, CFIndex numBytes,
                                    CFStringEncoding encoding, Boolean isExternalRepresentation);

/// A string that holds a copy of the units, unpaired surrogates included.
CFStringRef CFStringCreateWithCharacters(CFAllocatorRef allocator, UniChar const* characters,
                                         CFIndex numChars);

/// A string of a Pascal string: a length byte, then that many bytes in `encoding`.
CFStringRef CFStringCreateWithPascalString(CFAllocatorRef allocator, ConstStr255Param pascalString,
                                           CFStringEncoding encoding);

/// A mutable copy. `maxLength` 0 sets no limit, and no other value is served.
CFMutableStringRef CFStringCreateMutableCopy(CFAllocatorRef allocator, CFIndex maxLength,
                                             CFStringRef string);

/// The length in UTF-16 units.
CFIndex CFStringGetLength(CFStringRef string);

/// The string's own units, valid while it lives unchanged, or null where it can't show them.
UniChar const* CFStringGetCharactersPtr(CFStringRef string);

/// Copies the units of `range`, which must lie within the string.
void CFStringGetCharacters(CFStringRef string, CFRange range, UniChar* buffer);

/// Converts the units of `range` into `encoding` and returns how many of them were converted. Only
/// whole characters are written, at most `maxBufLen` bytes; with a null buffer nothing is written
/// and no limit holds. `lossByte` stands in for a character that the encoding lacks; 0 stops
/// there, and UTF-8 stops at an unpaired surrogate whatever `lossByte` says. `usedBufLen`, where
/// not null, receives the byte count, a failure included.
CFIndex CFStringGetBytes(CFStringRef string, CFRange range, CFStringEncoding encoding,
                         UInt8 lossByte, Boolean isExternalRepresentation, UInt8* buffer,
                         CFIndex maxBufLen, CFIndex* usedBufLen);

/// Compares the units of `range` in `string1` with the whole of `string2`. Order is by code point,
/// never by collation; no locale takes part. An embedded zero is a character like any other.
///
/// Two sets of options are served, and what any other gives is not defined:
/// kCFCompareCaseInsensitive alone (1), and together with kCFCompareNumerically and
/// kCFCompareDiacriticInsensitive (193). 1 applies the full case folding of Unicode, so a sharp s
/// is "ss"; a composed letter differs from the letter and its mark. 193 also ignores the accents of
/// Latin, Greek and Cyrillic letters and marks at the end, and orders runs of ASCII digits by their
/// numeric value. Neither is promised to be transitive or the same both ways round: with
/// characters that fold to several, the framework's own answers are not.
CFComparisonResult CFStringCompareWithOptions(CFStringRef string1, CFStringRef string2,
                                              CFRange range, CFStringCompareFlags options);

/// Full case mapping in place by the rules of `locale`; null is the root locale. Dots of Turkish,
/// Azeri and Lithuanian letters follow the language. In Greek, capital letters lose the tonos of
/// composed vowels.
void CFStringUppercase(CFMutableStringRef string, CFLocaleRef locale);
void CFStringLowercase(CFMutableStringRef string, CFLocaleRef locale);

/// Brings the text into a normalisation form of Unicode Standard Annex #15, in place.
void CFStringNormalize(CFMutableStringRef string, CFStringNormalizationForm form);

/// The system's legacy encoding at this moment: the one that the locale's codeset names where it
/// is served and not a form of Unicode, otherwise kCFStringEncodingMacRoman.
CFStringEncoding CFStringGetSystemEncoding(void);
}

#endif
