// The normalisation forms of Unicode Standard Annex #15 as the framework gives them.

#include "0Platform/CoreFoundation/_Imp/CFStringObject.h"

#include <unicode/unorm2.h>
#include <unicode/uset.h>

#include <cstdlib>

using namespace CFPlatform;

namespace {

using TGetNormalizer = UNormalizer2 const* (*)(UErrorCode*);

// In the order of the forms' values.
constexpr TGetNormalizer getters[] = {unorm2_getNFDInstance, unorm2_getNFKDInstance,
                                      unorm2_getNFCInstance, unorm2_getNFKCInstance};

// The framework's data is that of Unicode 13. What came later has no decomposition there, however
// new the ICU.
UNormalizer2 const* openNormalizer(TGetNormalizer get) {
    static USet* const repertoire = [] {
        UErrorCode status = U_ZERO_ERROR;
        USet* const set = uset_openPattern(u"[:Age=13.0:]", -1, &status);
        if (U_SUCCESS(status))
            uset_freeze(set);
        return set;
    }();
    UErrorCode status = U_ZERO_ERROR;
    UNormalizer2 const* const whole = get(&status);
    UNormalizer2 const* const filtered = unorm2_openFiltered(whole, repertoire, &status);
    return U_SUCCESS(status) ? filtered : nullptr;
}

UNormalizer2 const* normalizerOf(CFStringNormalizationForm form) {
    static UNormalizer2 const* const normalizers[] = {
        openNormalizer(getters[0]), openNormalizer(getters[1]), openNormalizer(getters[2]),
        openNormalizer(getters[3])};
    return normalizers[form];
}

UChar const* unitsOf(__CFString const& string) {
    return reinterpret_cast<UChar const*>(string.units);
}

// Asks the whole normaliser, which needs no look at the repertoire: a text that is normalised with
// later characters is so without them.
bool isNormalized(CFStringNormalizationForm form, __CFString const& string) {
    UErrorCode status = U_ZERO_ERROR;
    int32_t const length = static_cast<int32_t>(string.length);
    return unorm2_spanQuickCheckYes(getters[form](&status), unitsOf(string), length, &status) ==
           length;
}

bool isSyllableWithoutFinal(UniChar unit) {
    return unit >= 0xAC00 && unit <= 0xD7A3 && (unit - 0xAC00) % 28 == 0;
}

bool isFinalLetter(UniChar unit) {
    return unit >= 0x11A8 && unit <= 0x11C2;
}

// The end of the piece that begins at `start`. The framework composes Hangul letters into a
// syllable, but adds no final letter to a syllable that the text already holds: there a piece ends.
int32_t endOfPiece(__CFString const& string, int32_t start) {
    int32_t const length = static_cast<int32_t>(string.length);
    for (int32_t i = start + 1; i < length; ++i) {
        if (isFinalLetter(string.units[i]) && isSyllableWithoutFinal(string.units[i - 1]))
            return i;
    }
    return length;
}

// Normalises into `target` as far as it has room, and returns the number of units needed; -1 where
// the text can't be normalised.
int32_t normalizeInto(UNormalizer2 const* normalizer, __CFString const& string, UniChar* target,
                      int32_t room) {
    int32_t needed = 0;
    for (int32_t start = 0; start < string.length;) {
        int32_t const end = endOfPiece(string, start);
        bool const fits = needed <= room;
        UErrorCode status = U_ZERO_ERROR;
        needed += unorm2_normalize(normalizer, unitsOf(string) + start, end - start,
                                   fits ? reinterpret_cast<UChar*>(target) + needed : nullptr,
                                   fits ? room - needed : 0, &status);
        if (U_FAILURE(status) && status != U_BUFFER_OVERFLOW_ERROR)
            return -1;
        start = end;
    }
    return needed;
}

} // namespace

extern "C" void CFStringNormalize(CFMutableStringRef string, CFStringNormalizationForm form) {
    if (isNormalized(form, *string))
        return;
    UNormalizer2 const* const normalizer = normalizerOf(form);
    if (normalizer == nullptr)
        return;
    int32_t const needed = normalizeInto(normalizer, *string, nullptr, 0);
    if (needed < 0)
        return;
    UniChar* const units = allocateUnits(needed);
    normalizeInto(normalizer, *string, units, needed);
    replaceUnits(*string, units, needed);
}
