/// Dates as the C library takes them.
#ifndef QORN_2SYSTEM_TIMETM_H
#define QORN_2SYSTEM_TIMETM_H

#include "2System/Time/TimeDate.h"

#include <ctime>

namespace Time {
namespace Detail {

/// Midnight of the date, all other fields zero.
inline std::tm toTm(CDate::TDay day, CDate::EMonth month, CDate::TYear year) {
    std::tm time = {};
    time.tm_mday = day;
    time.tm_mon = Config::wrapSub(month, 1);
    time.tm_year = Config::wrapSub(year, 1900);
    return time;
}

} // namespace Detail
} // namespace Time

#endif
