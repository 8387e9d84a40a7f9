// The arithmetic of dates against one that walks from month to month and from day to day.

#include "2System/Time/TimeDate.h"

#include "1Base/Error/ErrorExcChains.h"
#include "2System/Time/TimeDateFields.h"

#include <gtest/gtest.h>

#include <climits>
#include <cstdint>
#include <cstdio>
#include <iterator>
#include <optional>
#include <ostream>
#include <random>

namespace {

using std::int64_t;
using Time::CDate;
using TimeTest::fieldsOf;
using TimeTest::monthOf;
using TimeTest::TFields;
using TimeTest::uncheckedDate;

int64_t wrapped(int64_t value) {
    return static_cast<std::int32_t>(static_cast<std::uint32_t>(value));
}

// Counts leap years as of 1582 without dividing the year twice: the centuries' own numbers decide.
bool naiveIsLeap(int64_t year) {
    if (year < 1582)
        return false;
    return (year % 100 == 0 ? year / 100 : year) % 4 == 0;
}

int64_t naiveLength(int64_t month, int64_t year) {
    switch (month) {
    case 2:
        return naiveIsLeap(year) ? 29 : 28;
    case 4:
    case 6:
    case 9:
    case 11:
        return 30;
    default:
        return 31;
    }
}

// Nothing where a month can't be counted with.
using TResult = std::optional<TFields>;

TResult naiveAdd(TFields const& fields, int64_t days, int64_t months, int64_t years) {
    auto [day, month, year] = fields;
    day = wrapped(day + days);
    month = wrapped(month + months);
    year = wrapped(year + years);
    if (month >= 13) {
        year = wrapped(year + month / 12);
        month = month % 12;
    }
    if (month < 0)
        return std::nullopt;
    while (day > naiveLength(month, year)) {
        day -= naiveLength(month, year);
        if (month >= 12) {
            month = 0;
            year = wrapped(year + 1);
        }
        month += 1;
    }
    return TFields(day, month, year);
}

TResult naiveSub(TFields const& fields, int64_t days, int64_t months, int64_t years) {
    auto [day, month, year] = fields;
    day = wrapped(day - days);
    month = wrapped(month - months);
    year = wrapped(year - years);
    if (month <= 0) {
        year = wrapped(year + month / 12 - 1);
        month = 12 - (-month) % 12;
    }
    while (day <= 0) {
        month -= 1;
        if (month == 0) {
            month = 12;
            year = wrapped(year - 1);
        }
        if (month > 12)
            return std::nullopt;
        day += naiveLength(month, year);
    }
    if (month > 12)
        return std::nullopt;
    if (day > naiveLength(month, year))
        day = naiveLength(month, year);
    return TFields(day, month, year);
}

int64_t naivePastDays(TFields const& fields) {
    auto const [day, month, year] = fields;
    int64_t const since = year - 1900;
    int64_t days = (since < 0 ? -(-since / 4) : since / 4) + since * 365;
    if (naiveIsLeap(year))
        days -= 1;
    for (int64_t m = 1; m < month; ++m)
        days += naiveLength(m, year);
    return days + day;
}

TResult reckoned(CDate date, void (CDate::*operation)(int, int, int), int days, int months,
                 int years) {
    TFields const before = fieldsOf(date);
    try {
        (date.*operation)(days, months, years);
        return fieldsOf(date);
    } catch (Error::TExcErrorAssert const&) {
        EXPECT_EQ(fieldsOf(date), before);
        return std::nullopt;
    }
}

void expectSame(CDate const& date, int days, int months, int years) {
    ASSERT_EQ(reckoned(date, &CDate::add_, days, months, years),
              naiveAdd(fieldsOf(date), days, months, years))
        << date << " + " << days << ' ' << months << ' ' << years;
    ASSERT_EQ(reckoned(date, &CDate::sub_, days, months, years),
              naiveSub(fieldsOf(date), days, months, years))
        << date << " - " << days << ' ' << months << ' ' << years;
}

class CTimeDateArithmeticRandomTest : public testing::Test {
  protected:
    CTimeDateArithmeticRandomTest() { std::printf("seed %u\n", seed_); }

    int between(int first, int last) {
        return std::uniform_int_distribution<int>(first, last)(random_);
    }

    CDate anyDate() { return uncheckedDate(between(1, 31), between(1, 12), between(1400, 10000)); }

  private:
    static constexpr unsigned seed_ = 15821015;
    std::mt19937 random_{seed_};
};

TEST_F(CTimeDateArithmeticRandomTest, DaysNearADateAreReckonedLikeByHand) {
    for (int i = 0; i < 200000; ++i)
        expectSame(anyDate(), between(0, 500), between(0, 40), between(0, 50));
}

TEST_F(CTimeDateArithmeticRandomTest, OddFieldsAreReckonedLikeByHand) {
    for (int i = 0; i < 100000; ++i)
        expectSame(uncheckedDate(between(-100, 100), between(i % 10 == 0 ? -30 : 0, 13),
                                 between(-20, 4000)),
                   between(0, 2000), between(0, 30), between(0, 3));
}

TEST_F(CTimeDateArithmeticRandomTest, DaysFarOffAreReckonedLikeByHand) {
    for (int i = 0; i < 500; ++i)
        expectSame(anyDate(), between(0, 2000000), between(0, 100000), between(0, 10000));
}

TEST_F(CTimeDateArithmeticRandomTest, TheYearOfTheRuleIsCrossedLikeByHand) {
    for (int i = 0; i < 20000; ++i)
        expectSame(uncheckedDate(between(0, 32), between(1, 12), between(1560, 1600)),
                   between(0, 40000), between(0, 400), 0);
    for (int year = 1180; year <= 1584; ++year)
        for (int days = 146095; days <= 146100; ++days)
            expectSame(uncheckedDate(1, 1, year), days, 0, 0);
}

TEST_F(CTimeDateArithmeticRandomTest, WholeCyclesAreReckonedLikeByHand) {
    for (int const year : {1582, 1583, 1600, 1981, 1982, 1983, 2000, 2382})
        for (int const cycles : {1, 2, 5})
            for (int shift = -800; shift <= 800; shift += 7)
                expectSame(uncheckedDate(1, shift % 2 == 0 ? 1 : 12, year), cycles * 146097 + shift,
                           0, 0);
}

TEST_F(CTimeDateArithmeticRandomTest, YearsWrapLikeByHand) {
    for (int i = 0; i < 2000; ++i) {
        CDate const late = uncheckedDate(between(1, 31), between(1, 12), INT_MAX - between(0, 900));
        expectSame(late, between(0, 400000), between(0, 2000), between(0, 1000));
        CDate const early =
            uncheckedDate(between(1, 31), between(1, 12), INT_MIN + between(0, 900));
        expectSame(early, between(0, 400000), between(0, 2000), between(0, 1000));
    }
}

TEST_F(CTimeDateArithmeticRandomTest, TheMostDaysAreReckonedLikeByHand) {
    expectSame(uncheckedDate(-1, 12, 2021), INT_MAX, 0, 0);
}

TEST_F(CTimeDateArithmeticRandomTest, ExtremesAreReckonedInNoTime) {
    int const values[] = {INT_MIN, INT_MIN + 1, -65536, -1,    0,           1,      12,
                          13,      1581,        1582,   65537, INT_MAX - 1, INT_MAX};
    auto const any = [&] { return values[between(0, static_cast<int>(std::size(values)) - 1)]; };
    for (int i = 0; i < 100000; ++i) {
        CDate const date = uncheckedDate(any(), i % 4 == 0 ? any() : between(0, 12), any());
        int const days = any() & INT_MAX;
        int const months = any() & INT_MAX;
        int const years = any() & INT_MAX;
        // By hand this would take minutes; the fields must be ones that it could have left.
        if (TResult const sum = reckoned(date, &CDate::add_, days, months, years)) {
            ASSERT_LE(std::get<1>(*sum), 12);
            ASSERT_GE(std::get<1>(*sum), 0);
            ASSERT_LE(std::get<0>(*sum), naiveLength(std::get<1>(*sum), std::get<2>(*sum)));
        }
        if (TResult const difference = reckoned(date, &CDate::sub_, days, months, years)) {
            ASSERT_LE(std::get<1>(*difference), 12);
            ASSERT_GE(std::get<1>(*difference), 1);
            ASSERT_GE(std::get<0>(*difference), 1);
            ASSERT_LE(std::get<0>(*difference),
                      naiveLength(std::get<1>(*difference), std::get<2>(*difference)));
        }
    }
}

TEST_F(CTimeDateArithmeticRandomTest, StepsOfOneDayGoWhereManyAtOnceGo) {
    CDate walker(1, CDate::emJan, 1582);
    CDate const start = walker;
    for (int days = 1; days <= 700000; ++days) {
        CDate const before = walker;
        walker.inc_();
        if (days % 7 == 0 || walker.getDay() > 27 || walker.getDay() == 1) {
            ASSERT_EQ(fieldsOf(start + days), fieldsOf(walker));
            CDate back = walker;
            back.dec_();
            ASSERT_EQ(fieldsOf(back), fieldsOf(before));
            ASSERT_EQ(fieldsOf(CDate(walker).subDays(static_cast<unsigned>(days))),
                      fieldsOf(start));
        }
    }
}

TEST_F(CTimeDateArithmeticRandomTest, DifferencesAreThoseOfTheScale) {
    for (int i = 0; i < 200000; ++i) {
        CDate const left = uncheckedDate(between(-40, 40), between(-1, 13), between(-5000, 12000));
        CDate const right = anyDate();
        ASSERT_EQ(left - right, naivePastDays(fieldsOf(left)) - naivePastDays(fieldsOf(right)))
            << left << " - " << right;
    }
    for (int i = 0; i < 10000; ++i) {
        CDate const left =
            uncheckedDate(between(INT_MIN, INT_MAX), between(1, 12), between(INT_MIN, INT_MAX));
        // Far-off years differ from the count by what wraps.
        ASSERT_EQ(left - uncheckedDate(1, 1, 1900),
                  wrapped(naivePastDays(TFields(std::get<0>(fieldsOf(left)), left.getMonth(),
                                                left.getYear())) -
                          1))
            << left;
    }
}

} // namespace
