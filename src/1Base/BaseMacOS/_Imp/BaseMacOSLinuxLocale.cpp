#include "1Base/BaseMacOS/_Imp/BaseMacOSNative.h"

#include <CoreFoundation/CoreFoundation.h>

namespace MacOS {
namespace Native {

bool usesMetricSystem() {
    CFLocaleRef const locale = CFLocaleCopyCurrent();
    auto const value =
        static_cast<CFBooleanRef>(CFLocaleGetValue(locale, kCFLocaleUsesMetricSystem));
    bool const isMetric = CFBooleanGetValue(value) != 0;
    CFRelease(locale);
    return isMetric;
}

} // namespace Native
} // namespace MacOS
