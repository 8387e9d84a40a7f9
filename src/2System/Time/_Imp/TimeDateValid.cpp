#include "2System/Time/_Imp/TimeDateValid.h"

#include "2System/Time/_Imp/TimeMonths.h"
#include "2System/Time/_Imp/TimeTm.h"

#include <boost/date_time/gregorian/greg_date.hpp>

#include <ctime>

namespace Time {
namespace {

using boost::gregorian::greg_month;
using boost::gregorian::greg_year;
using boost::gregorian::gregorian_calendar;

constexpr unsigned short firstYear = 1400;
constexpr unsigned short lastYear = 10000;

// The calendar ends a year too early; 2000 has the months of 10000.
greg_year likeYear(unsigned short year) {
    return greg_year(year == lastYear ? 2000 : year);
}

// What the calendar would refuse by an exception, which costs hundreds of times the test.
bool isOutside(unsigned short day, unsigned short month, unsigned short year) {
    return year < firstYear || year > lastYear || !Detail::checkMonth(month) || day < 1 ||
           day > gregorian_calendar::end_of_month_day(likeYear(year), greg_month(month));
}

void makeGregorianDate(unsigned short year, unsigned short month, unsigned short day) {
    boost::gregorian::date(likeYear(year), greg_month(month), boost::gregorian::greg_day(day));
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
    return !isOutside(Detail::low16(day), Detail::low16(month), Detail::low16(year)) &&
           Detail::isMadeBy(makeGregorianDate, day, month, year);
}

} // namespace Time
