#include "0Platform/CoreFoundation/_Imp/CFLocaleObject.h"
#include "0Platform/CoreFoundation/_Imp/CFStringConstant.h"

#include <CoreFoundation/CFNumber.h>

#include <unicode/ulocdata.h>

using namespace CFPlatform;

namespace {

StringConstant usesMetricSystemKey(u"kCFLocaleUsesMetricSystem");

// The British system of ICU is metric but for roads and pints.
bool usesMetricSystem(CFLocaleRef locale) {
    UErrorCode failure = U_ZERO_ERROR;
    UMeasurementSystem const system =
        ulocdata_getMeasurementSystem(measureIdentifierOf(locale), &failure);
    return U_FAILURE(failure) || system != UMS_US;
}

} // namespace

CFLocaleKey const kCFLocaleUsesMetricSystem = &usesMetricSystemKey;

extern "C" CFTypeRef CFLocaleGetValue(CFLocaleRef locale, CFLocaleKey key) {
    if (key != kCFLocaleUsesMetricSystem)
        return nullptr;
    return usesMetricSystem(locale) ? kCFBooleanTrue : kCFBooleanFalse;
}
