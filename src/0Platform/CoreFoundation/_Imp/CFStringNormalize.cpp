#include "0Platform/CoreFoundation/_Imp/CFStringObject.h"

#include <unicode/unorm2.h>

#include <cstdlib>

using namespace CFPlatform;

namespace {

UNormalizer2 const* normalizerOf(CFStringNormalizationForm form) {
    UErrorCode status = U_ZERO_ERROR;
    UNormalizer2 const* normalizer = nullptr;
    switch (form) {
    case kCFStringNormalizationFormD:
        normalizer = unorm2_getNFDInstance(&status);
        break;
    case kCFStringNormalizationFormKD:
        normalizer = unorm2_getNFKDInstance(&status);
        break;
    case kCFStringNormalizationFormC:
        normalizer = unorm2_getNFCInstance(&status);
        break;
    case kCFStringNormalizationFormKC:
        normalizer = unorm2_getNFKCInstance(&status);
        break;
    }
    return U_SUCCESS(status) ? normalizer : nullptr;
}

UChar const* unitsOf(__CFString const& string) {
    return reinterpret_cast<UChar const*>(string.units);
}

bool isNormalized(UNormalizer2 const* normalizer, __CFString const& string) {
    UErrorCode status = U_ZERO_ERROR;
    int32_t const length = static_cast<int32_t>(string.length);
    return unorm2_spanQuickCheckYes(normalizer, unitsOf(string), length, &status) == length;
}

} // namespace

extern "C" void CFStringNormalize(CFMutableStringRef string, CFStringNormalizationForm form) {
    UNormalizer2 const* const normalizer = normalizerOf(form);
    if (normalizer == nullptr || isNormalized(normalizer, *string))
        return;
    int32_t const length = static_cast<int32_t>(string->length);
    UErrorCode status = U_ZERO_ERROR;
    int32_t const needed =
        unorm2_normalize(normalizer, unitsOf(*string), length, nullptr, 0, &status);
    UniChar* const units = allocateUnits(needed);
    status = U_ZERO_ERROR;
    unorm2_normalize(normalizer, unitsOf(*string), length, reinterpret_cast<UChar*>(units), needed,
                     &status);
    if (U_SUCCESS(status))
        replaceUnits(*string, units, needed);
    else
        std::free(units);
}
