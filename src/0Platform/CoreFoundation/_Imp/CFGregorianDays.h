/// Day numbers of the proleptic Gregorian calendar.
///
///     CFPlatform::daysBeforeMonth(1970, 1);   // 0
///     CFPlatform::daysBeforeMonth(1970, 13);  // 365
#ifndef QORN_0PLATFORM_CFGREGORIANDAYS_H
#define QORN_0PLATFORM_CFGREGORIANDAYS_H

#include <cstdint>

namespace CFPlatform {

/// The days from 1 January 1970 to the first of a month. Months below 1 and above 12 are those of
/// other years. Right for all 32-bit years and months.
std::int64_t daysBeforeMonth(std::int64_t year, std::int64_t month);

} // namespace CFPlatform

#endif
