/// Lengths of months, as the arithmetic of dates counts them.
///
///     Time::Detail::maxDaysInMonth(Time::CDate::emFeb, 2020);   // 29
///     Time::Detail::maxDaysInMonth(Time::CDate::emFeb, 1404);   // 28
#ifndef QORN_2SYSTEM_TIMEMONTHS_H
#define QORN_2SYSTEM_TIMEMONTHS_H

#include "1Base/Error/ErrorMacros.h"
#include "2System/Time/TimeDate.h"

namespace Time {
namespace Detail {

/// The first year of the Gregorian rule. There is no Julian one: earlier years have no leap day.
inline constexpr CDate::TYear firstGregorianYear = 1582;

inline constexpr bool isLeapYear(CDate::TYear year) {
    return year >= firstGregorianYear && ((year % 4 == 0 && year % 100 != 0) || year % 400 == 0);
}

inline constexpr bool checkMonth(Config::Int32 month) {
    return static_cast<Config::UInt32>(month) - 1 < 12;
}

/// The length of a month; one outside the list fails an assertion.
inline CDate::TDay maxDaysInMonth(CDate::EMonth month, CDate::TYear year) {
    constexpr CDate::TDay lengths[] = {31, 28, 31, 30, 31, 30, 31, 31, 30, 31, 30, 31};
    if (!checkMonth(month)) {
        ERROR_ASSERT_P(ERROR_PARAM(month), false);
        return 0;
    }
    return lengths[month - 1] + (month == CDate::emFeb && isLeapYear(year) ? 1 : 0);
}

/// The same for a month that is counted with: 0 stands for December.
inline CDate::TDay maxDaysInMonth(Config::Int32 month, CDate::TYear year) {
    if (month == 0)
        month = CDate::emDec;
    ERROR_ASSERT_TEXT(checkMonth(month), "1<=month && 12>=month");
    return maxDaysInMonth(static_cast<CDate::EMonth>(month), year);
}

} // namespace Detail
} // namespace Time

#endif
