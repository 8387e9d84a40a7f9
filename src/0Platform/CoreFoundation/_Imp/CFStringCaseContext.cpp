#include "0Platform/CoreFoundation/_Imp/CFStringCaseContext.h"
#include "0Platform/CoreFoundation/_Imp/CFStringObject.h"
#include "0Platform/CoreFoundation/_Imp/CFUnicode.h"

#include <unicode/uchar.h>
#include <unicode/unorm2.h>
#include <unicode/utf16.h>

#include <algorithm>

namespace CFPlatform {
namespace {

constexpr UniChar capitalSigma = 0x03A3;
constexpr UniChar smallSigma = 0x03C3;
constexpr UniChar finalSigma = 0x03C2;
constexpr UniChar dotAbove = 0x0307;
constexpr UniChar dialytika = 0x0308;
constexpr UniChar tonos = 0x0301;
constexpr UniChar dotlessI = 0x0131;

// What stands within a word without being a letter, as Unicode 5.0 defined it. Later versions
// added the full stop, the colon and their like, which the framework does not have.
bool isCaseIgnorable(UChar32 c) {
    constexpr UInt32 categories =
        U_GC_MN_MASK | U_GC_ME_MASK | U_GC_CF_MASK | U_GC_LM_MASK | U_GC_SK_MASK;
    return c == 0x27 || c == 0x2019 || (U_MASK(u_charType(c)) & categories) != 0;
}

bool isCased(UChar32 c) {
    return u_hasBinaryProperty(c, UCHAR_CASED) != 0;
}

bool isLetterBefore(UniChar const* units, CFIndex index) {
    UChar32 c = 0;
    do {
        if (index == 0)
            return false;
        U16_PREV(units, 0, index, c);
    } while (isCaseIgnorable(c));
    return isCased(c);
}

bool isLetterAt(UniChar const* units, CFIndex length, CFIndex index) {
    UChar32 c = 0;
    do {
        if (index == length)
            return false;
        U16_NEXT(units, index, length, c);
    } while (isCaseIgnorable(c));
    return isCased(c);
}

bool isGreekLetter(UniChar unit) {
    return unit >= 0x0391 && unit <= 0x03C9;
}

// Writes a letter without its tonos and returns the number of units; 0 where it has none, or other
// accents beside it.
CFIndex putWithoutTonos(UNormalizer2 const* normalizer, UniChar letter, UniChar* target) {
    if (letter < 0x0386 || letter > 0x1FFF)
        return 0;
    UChar units[8];
    UErrorCode status = U_ZERO_ERROR;
    int32_t const length = unorm2_getDecomposition(normalizer, letter, units, 8, &status);
    bool const isVowel = U_SUCCESS(status) && length >= 2 && isGreekLetter(units[0]) &&
                         units[length - 1] == tonos &&
                         (length == 2 || (length == 3 && units[1] == dialytika));
    if (!isVowel)
        return 0;
    std::copy(units, units + length - 1, target);
    return length - 1;
}

} // namespace

void resolveSigmas(UniChar* units, CFIndex length) noexcept {
    for (CFIndex i = 0; i < length; ++i)
        if (units[i] == capitalSigma)
            units[i] = isLetterBefore(units, i) && !isLetterAt(units, length, i + 1) ? finalSigma
                                                                                     : smallSigma;
}

void resolveDotlessI(UniChar* units, CFIndex length) noexcept {
    for (CFIndex i = 0; i < length; ++i)
        if (units[i] == 'I' && (i + 1 == length || units[i + 1] != dotAbove))
            units[i] = dotlessI;
}

void removeTonos(CFMutableStringRef string) noexcept {
    UErrorCode status = U_ZERO_ERROR;
    UNormalizer2 const* const normalizer = unorm2_getNFDInstance(&status);
    if (U_FAILURE(status))
        return;
    // A letter gives two units at the most: itself and a dialytika.
    UniChar* const units = allocateUnits(2 * string->length);
    CFIndex count = 0;
    for (CFIndex i = 0; i < string->length; ++i) {
        CFIndex const put = putWithoutTonos(normalizer, string->units[i], units + count);
        if (put == 0)
            units[count] = string->units[i];
        count += std::max<CFIndex>(put, 1);
    }
    replaceUnits(*string, units, count);
}

} // namespace CFPlatform
