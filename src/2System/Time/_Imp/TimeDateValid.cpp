#include "2System/Time/_Imp/TimeDateValid.h"

#include "2System/Time/_Imp/TimeMonths.h"
#include "2System/Time/_Imp/TimeTm.h"

#include <boost/date_time/gregorian/greg_date.hpp>

#include <ctime>

namespace Time {
namespace {

constexpr unsigned short firstYear = 1400;
constexpr unsigned short lastYear = 10000;

// What the calendar would refuse before it looks at the month's end, at the cost of an exception.
constexpr bool isWithinRanges(unsigned short day, unsigned short month, unsigned short year) {
    return day >= 1 && day <= 31 && Detail::checkMonth(month) && year >= firstYear &&
           year <= lastYear;
}

// The calendar ends a year too early; 2000 has the months of 10000.
void makeGregorianDate(unsigned short year, unsigned short month, unsigned short day) {
    unsigned short const likeYear = year == lastYear ? 2000 : year;
    boost::gregorian::date(boost::gregorian::greg_year(likeYear),
                           boost::gregorian::greg_month(month), boost::gregorian::greg_day(day));
}

} // namespace

bool Detail::isKeptByMktime(CDate::TDay day, CDate::EMonth month, CDate::TYear year) {
    ERROR_ASSERT(checkMonth(month));
    if (day < 1 || day > maxDaysInMonth(month, year))
        return false;
    std::tm const asked = toTm(day, month, year);
    std::tm kept = asked;
    std::mktime(&kept);
    return kept.tm_mday == asked.tm_mday && kept.tm_mon == asked.tm_mon &&
           kept.tm_year == asked.tm_year;
}

bool CDate::isValid(TDay day, EMonth month, TYear year) {
    return isWithinRanges(Detail::low16(day), Detail::low16(month), Detail::low16(year)) &&
           Detail::isMadeBy(makeGregorianDate, day, month, year);
}

} // namespace Time
