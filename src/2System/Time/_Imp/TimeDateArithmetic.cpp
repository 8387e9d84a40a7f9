#include "2System/Time/TimeDate.h"

#include "2System/Time/_Imp/TimeMonths.h"

#include <algorithm>
#include <cstdint>
#include <limits>
#include <tuple>

namespace Time {
namespace {

using Config::Int32;
using Config::wrapAdd;
using Config::wrapSub;
using Detail::checkMonth;
using Detail::firstGregorianYear;
using Detail::isLeapYear;
using Detail::maxDaysInMonth;

constexpr CDate::TYear firstYear = std::numeric_limits<CDate::TYear>::min();
constexpr CDate::TYear lastYear = std::numeric_limits<CDate::TYear>::max();

void assertMonth(CDate::EMonth month) {
    // As a value the text would be a pointer that a compiler warns of.
    Error::Detail::CAsserter_<true, true>::do_assert(ERROR_ORIGIN, checkMonth(month),
                                                     "!\"Invalid month!\"", ERROR_PARAM(month));
}

CDate::EMonth& operator++(CDate::EMonth& month) {
    assertMonth(month);
    return month = month == CDate::emDec ? CDate::emJan : static_cast<CDate::EMonth>(month + 1);
}

CDate::EMonth& operator--(CDate::EMonth& month) {
    assertMonth(month);
    return month = month == CDate::emJan ? CDate::emDec : static_cast<CDate::EMonth>(month - 1);
}

// So many years on, leap years come back.
struct CCycle {
    Int32 years;
    Int32 days;
};

CCycle cycleOf(CDate::TYear year) {
    return year < firstGregorianYear ? CCycle{1, 365} : CCycle{400, 146097};
}

// The cycles that both so many years and so many days have room for.
Int32 cyclesWithin(std::int64_t years, std::int64_t days, CCycle const& cycle) {
    return static_cast<Int32>(std::min(years / cycle.years, days / cycle.days));
}

Int32 daysInYear(CDate::TYear year) {
    return isLeapYear(year) ? 366 : 365;
}

// Days counted from a 1 January of `years`: takes the whole years from them that a walk from month
// to month would take, whole cycles at once, which end where the rule changes or the number wraps.
void takeYears(Int32& days, CDate::TYear& years) {
    while (days > daysInYear(years)) {
        CCycle const cycle = cycleOf(years);
        std::int64_t const end = years < firstGregorianYear ? firstGregorianYear : lastYear;
        Int32 const cycles = days > cycle.days ? cyclesWithin(end - years, days - 1, cycle) : 0;
        if (cycles > 0) {
            days -= cycles * cycle.days;
            years += cycles * cycle.years;
        } else {
            days -= daysInYear(years);
            years = wrapAdd(years, 1);
        }
    }
}

// The same backwards, for days that are missing before a 1 January of `years`.
void giveYears(Int32& days, CDate::TYear& years) {
    for (CDate::TYear before = wrapSub(years, 1); days <= -daysInYear(before);
         before = wrapSub(years, 1)) {
        CCycle const cycle = cycleOf(before);
        std::int64_t const begin = before < firstGregorianYear ? firstYear : firstGregorianYear;
        Int32 const cycles =
            days <= -cycle.days ? cyclesWithin(years - begin, -std::int64_t(days), cycle) : 0;
        if (cycles > 0) {
            days += cycles * cycle.days;
            years -= cycles * cycle.years;
        } else {
            days += daysInYear(before);
            years = before;
        }
    }
}

// The days of the months before `month`. There is no thirteenth month: what is behind it fails.
Int32 daysBefore(CDate::EMonth month, CDate::TYear year) {
    constexpr Int32 sums[] = {0, 31, 59, 90, 120, 151, 181, 212, 243, 273, 304, 334, 365};
    Int32 m = std::clamp<Int32>(month, 1, 13);
    Int32 days = sums[m - 1] + (m > CDate::emFeb && isLeapYear(year) ? 1 : 0);
    for (; m < month; ++m)
        days += maxDaysInMonth(m, year);
    return days;
}

// The scale of differences: a leap day every four years whatever the century, although the months
// of the year itself know better.
Int32 pastDays(CDate::TDay day, CDate::EMonth month, CDate::TYear year) {
    Int32 const years = wrapSub(year, 1900);
    Int32 days = wrapAdd(years / 4, Config::wrapMul(years, 365));
    if (isLeapYear(year))
        days = wrapSub(days, 1);
    return wrapAdd(wrapAdd(days, daysBefore(month, year)), day);
}

Int32 pastDays(CDate const& date) {
    return pastDays(date.getDay(), date.getMonth(), date.getYear());
}

auto fieldsOf(CDate const& date) {
    return std::make_tuple(date.getYear(), date.getMonth(), date.getDay());
}

} // namespace

CDate& CDate::addDays(unsigned int days) {
    add_(static_cast<Int32>(days), 0, 0);
    return *this;
}

CDate& CDate::subDays(unsigned int days) {
    sub_(static_cast<Int32>(days), 0, 0);
    return *this;
}

CDate& CDate::operator+=(int days) {
    return addDays(static_cast<unsigned int>(days));
}

CDate& CDate::operator++() {
    inc_();
    return *this;
}

CDate& CDate::operator--() {
    dec_();
    return *this;
}

void CDate::add_(Int32 days, Int32 months, Int32 years) {
    ERROR_ASSERT((days >= 0) && (months >= 0) && (years >= 0));
    days = wrapAdd(day_, days);
    months = wrapAdd(month_, months);
    years = wrapAdd(year_, years);
    if (months >= 13) {
        years = wrapAdd(years, months / kMonthPerYear);
        months %= kMonthPerYear; // 0 stays as it is
    }
    for (Int32 length = maxDaysInMonth(months, years); days > length;
         length = maxDaysInMonth(months, years)) {
        days -= length;
        if (months < kMonthPerYear) {
            ++months;
        } else {
            months = emJan;
            years = wrapAdd(years, 1);
            takeYears(days, years);
        }
    }
    store_(days, months, years);
}

void CDate::sub_(Int32 days, Int32 months, Int32 years) {
    ERROR_ASSERT((days >= 0) && (months >= 0) && (years >= 0));
    days = wrapSub(day_, days);
    months = wrapSub(month_, months);
    years = wrapSub(year_, years);
    if (months <= 0) {
        years = wrapAdd(years, months / kMonthPerYear - 1);
        months = kMonthPerYear + months % kMonthPerYear;
    }
    while (days <= 0) {
        if (months > emJan) {
            --months;
        } else {
            giveYears(days, years);
            months = emDec;
            years = wrapSub(years, 1);
        }
        days += maxDaysInMonth(months, years);
    }
    days = std::min(days, maxDaysInMonth(months, years));
    store_(days, months, years);
}

void CDate::store_(Int32 days, Int32 months, Int32 years) {
    ERROR_ASSERT_TEXT(months <= kMonthPerYear, "months<= kMonthPerYear");
    ERROR_ASSERT_TEXT(days <= maxDaysInMonth(months, years),
                      "days <= maxDaysInMonth(months,years)");
    day_ = days;
    month_ = static_cast<EMonth>(months);
    year_ = years;
}

void CDate::inc_() {
    TDay const oldDay = day_;
    day_ = wrapAdd(oldDay, 1);
    if (oldDay < maxDaysInMonth(month_, year_))
        return;
    day_ = 1;
    if (month_ == emDec)
        year_ = wrapAdd(year_, 1);
    ++month_;
}

void CDate::dec_() {
    if (day_ >= 2) {
        --day_;
        return;
    }
    bool const isJanuary = month_ == emJan;
    --month_;
    if (isJanuary)
        year_ = wrapSub(year_, 1);
    day_ = maxDaysInMonth(month_, year_);
}

bool operator==(CDate const& left, CDate const& right) {
    return fieldsOf(left) == fieldsOf(right);
}

bool operator!=(CDate const& left, CDate const& right) {
    return !(left == right);
}

bool operator<(CDate const& left, CDate const& right) {
    return fieldsOf(left) < fieldsOf(right);
}

bool operator>(CDate const& left, CDate const& right) {
    return right < left;
}

bool operator<=(CDate const& left, CDate const& right) {
    return !(left > right);
}

bool operator>=(CDate const& left, CDate const& right) {
    return !(left < right);
}

CDate operator+(CDate const& date, int days) {
    CDate sum(date);
    sum += days;
    return sum;
}

int operator-(CDate const& left, CDate const& right) {
    return wrapSub(pastDays(left), pastDays(right));
}

} // namespace Time
