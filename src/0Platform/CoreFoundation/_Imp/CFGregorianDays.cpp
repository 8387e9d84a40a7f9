#include "0Platform/CoreFoundation/_Imp/CFGregorianDays.h"

namespace CFPlatform {
namespace {

std::int64_t divideDown(std::int64_t number, std::int64_t divisor) {
    return number / divisor - (number % divisor < 0 ? 1 : 0);
}

} // namespace

std::int64_t daysBeforeMonth(std::int64_t year, std::int64_t month) {
    // Years that begin in March end with the leap day, so their months start at fixed days: groups
    // of five months have 153 days.
    std::int64_t const months = year * 12 + month - 3;
    std::int64_t const marchYear = divideDown(months, 12);
    std::int64_t const monthOfYear = months - marchYear * 12;
    std::int64_t const leapDays =
        divideDown(marchYear, 4) - divideDown(marchYear, 100) + divideDown(marchYear, 400);
    constexpr std::int64_t daysTo1970 = 719468; // from 1 March of the year 0
    return marchYear * 365 + leapDays + (monthOfYear * 153 + 2) / 5 - daysTo1970;
}

} // namespace CFPlatform
