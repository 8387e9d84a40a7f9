// Arithmetic of dates beside other libraries.

#include "2System/Time/TimeDate.h"

#include "2System/Time/TimeMoments.h"

#include <boost/date_time/gregorian/gregorian_types.hpp>

#ifdef QORN_HAVE_ABSL
#    include <absl/time/civil_time.h>
#endif
#ifdef QORN_HAVE_DATE
#    include <date/date.h>
#endif
#ifdef QORN_HAVE_QT
#    include <QDate>
#endif

#include <string>

namespace {

using Benchmarks::CInputs;

struct CDay {
    int year;
    int month;
    int day;

    bool operator==(CDay const& other) const {
        return year == other.year && month == other.month && day == other.day;
    }
};

CDay dayOf(std::time_t moment) {
    std::tm const fields = Benchmarks::fieldsOf(moment);
    return {fields.tm_year + 1900, fields.tm_mon + 1, fields.tm_mday};
}

CDay dayOf(Time::CDate const& date) {
    return {date.getYear(), date.getMonth(), date.getDay()};
}

CDay dayOf(boost::gregorian::date const& date) {
    return {date.year(), date.month(), date.day()};
}

#ifdef QORN_HAVE_ABSL
CDay dayOf(absl::CivilDay const& date) {
    return {static_cast<int>(date.year()), date.month(), date.day()};
}
#endif

#ifdef QORN_HAVE_DATE
CDay dayOf(date::year_month_day const& date) {
    return {static_cast<int>(date.year()), static_cast<int>(static_cast<unsigned>(date.month())),
            static_cast<int>(static_cast<unsigned>(date.day()))};
}
#endif

#ifdef QORN_HAVE_QT
CDay dayOf(QDate const& date) {
    return {date.year(), date.month(), date.day()};
}
#endif

// Adds days to values of the kind that `make` builds from fields.
template <class TMake, class TRun>
void addDays(int days, char const* contender, TMake make, TRun run) {
    auto const moments = Benchmarks::randomMoments();
    auto const expected =
        moments.map([days](std::time_t moment) { return dayOf(moment + days * 86400L); });
    auto const values = moments.map([make](std::time_t moment) { return make(dayOf(moment)); });
    Benchmarks::addChecked("DateAddDays/" + std::to_string(days), contender, values, expected, run,
                           [](auto const& value) { return dayOf(value); });
}

void addBenchmarks() {
    for (int const days : {1, 30, 365}) {
        addDays(
            days, "ours",
            [](CDay const& day) {
                return Time::CDate(day.day, static_cast<Time::CDate::EMonth>(day.month), day.year);
            },
            [days](Time::CDate const& date) {
                return Time::CDate(date).addDays(static_cast<unsigned int>(days));
            });
        addDays(
            days, "boost",
            [](CDay const& day) {
                return boost::gregorian::date(static_cast<unsigned short>(day.year),
                                              static_cast<unsigned short>(day.month),
                                              static_cast<unsigned short>(day.day));
            },
            [days](boost::gregorian::date const& date) {
                boost::gregorian::date const sum = date + boost::gregorian::days(days);
                benchmark::DoNotOptimize(sum.year_month_day());
                return sum;
            });
#ifdef QORN_HAVE_ABSL
        addDays(
            days, "absl",
            [](CDay const& day) { return absl::CivilDay(day.year, day.month, day.day); },
            [days](absl::CivilDay const& date) { return date + days; });
#endif
#ifdef QORN_HAVE_DATE
        addDays(
            days, "date",
            [](CDay const& day) {
                return date::year(day.year) / static_cast<unsigned>(day.month) /
                       static_cast<unsigned>(day.day);
            },
            [days](date::year_month_day const& date) {
                return date::year_month_day(date::sys_days(date) + date::days(days));
            });
#endif
#ifdef QORN_HAVE_QT
        addDays(
            days, "qt", [](CDay const& day) { return QDate(day.year, day.month, day.day); },
            [days](QDate const& date) {
                QDate const sum = date.addDays(days);
                benchmark::DoNotOptimize(sum.day());
                return sum;
            });
#endif
    }
}

Benchmarks::CRegistrar const registrar(addBenchmarks);

} // namespace
