// What is reckoned with dates: the examples, and what fails.

#include "2System/Time/TimeDate.h"

#include "2System/Time/TimeDateFields.h"
#include "support/Registry.h"
#include "support/TextFailures.h"

#include <gtest/gtest.h>

#include <climits>
#include <string>
#include <utility>
#include <vector>

namespace {

using TestSupport::failedCheckOf;
using Time::CDate;
using TimeTest::fieldsOf;
using TimeTest::TFields;
using TimeTest::uncheckedDate;

using CTimeDateArithmeticTest = TestSupport::CErrorTest;

TFields added(CDate date, int days, int months, int years) {
    date.add_(days, months, years);
    return fieldsOf(date);
}

TFields subtracted(CDate date, int days, int months, int years) {
    date.sub_(days, months, years);
    return fieldsOf(date);
}

TFields incremented(CDate date) {
    date.inc_();
    return fieldsOf(date);
}

TFields decremented(CDate date) {
    date.dec_();
    return fieldsOf(date);
}

CDate at(int day, int month, int year) {
    return uncheckedDate(day, month, year);
}

TEST_F(CTimeDateArithmeticTest, DaysAreCarriedIntoMonthsAndYears) {
    EXPECT_EQ(added(at(31, 12, 2021), 1, 0, 0), TFields(1, 1, 2022));
    EXPECT_EQ(added(at(28, 2, 2020), 1, 0, 0), TFields(29, 2, 2020));
    EXPECT_EQ(added(at(28, 2, 2021), 1, 0, 0), TFields(1, 3, 2021));
    EXPECT_EQ(added(at(1, 1, 2000), 366, 0, 0), TFields(1, 1, 2001));
    EXPECT_EQ(added(at(1, 1, 1600), 146097, 0, 0), TFields(1, 1, 2000));
    EXPECT_EQ(added(at(5, 3, 2021), 0, 0, 0), TFields(5, 3, 2021));
}

TEST_F(CTimeDateArithmeticTest, MonthsAreCarriedFromThirteenOn) {
    EXPECT_EQ(added(at(15, 11, 2021), 0, 1, 0), TFields(15, 12, 2021));
    EXPECT_EQ(added(at(15, 12, 2021), 0, 1, 0), TFields(15, 1, 2022));
    EXPECT_EQ(added(at(15, 3, 2021), 0, 22, 0), TFields(15, 1, 2023));
}

TEST_F(CTimeDateArithmeticTest, WholeYearsOfMonthsLeaveMonthZero) {
    EXPECT_EQ(added(at(15, 12, 2021), 0, 12, 0), TFields(15, 0, 2023));
    EXPECT_EQ(added(at(15, 11, 2021), 0, 13, 0), TFields(15, 0, 2023));
    EXPECT_EQ(added(at(15, 1, 2021), 0, 11, 0), TFields(15, 12, 2021));
    EXPECT_EQ(added(at(15, 1, 2021), 0, 23, 0), TFields(15, 0, 2023));
}

TEST_F(CTimeDateArithmeticTest, DaysAreCarriedOutOfMonthZeroInTheSameYear) {
    EXPECT_EQ(added(at(31, 12, 2021), 0, 12, 0), TFields(31, 0, 2023));
    EXPECT_EQ(added(at(31, 12, 2021), 1, 12, 0), TFields(1, 1, 2023));
    EXPECT_EQ(added(at(31, 0, 2023), 1, 0, 0), TFields(1, 1, 2023));
    EXPECT_EQ(subtracted(at(15, 0, 2023), 0, 0, 0), TFields(15, 12, 2022));
}

TEST_F(CTimeDateArithmeticTest, AddingDoesNotClampTheDay) {
    EXPECT_EQ(added(at(31, 1, 2021), 0, 1, 0), TFields(3, 3, 2021));
    EXPECT_EQ(added(at(31, 1, 2020), 0, 1, 0), TFields(2, 3, 2020));
    EXPECT_EQ(added(at(29, 2, 2020), 0, 0, 1), TFields(1, 3, 2021));
}

TEST_F(CTimeDateArithmeticTest, AddingKeepsADayBeforeTheMonth) {
    EXPECT_EQ(added(at(-5, 3, 2021), 0, 0, 0), TFields(-5, 3, 2021));
    EXPECT_EQ(added(at(-5, 3, 2021), 6, 0, 0), TFields(1, 3, 2021));
}

TEST_F(CTimeDateArithmeticTest, SubtractingClampsTheDay) {
    EXPECT_EQ(subtracted(at(31, 3, 2021), 0, 1, 0), TFields(28, 2, 2021));
    EXPECT_EQ(subtracted(at(31, 3, 2020), 0, 1, 0), TFields(29, 2, 2020));
    EXPECT_EQ(subtracted(at(29, 2, 2020), 0, 0, 1), TFields(28, 2, 2019));
    EXPECT_EQ(subtracted(at(99, 3, 2021), 0, 0, 0), TFields(31, 3, 2021));
}

TEST_F(CTimeDateArithmeticTest, SubtractingMonthsNeverLeavesMonthZero) {
    EXPECT_EQ(subtracted(at(15, 3, 2021), 0, 3, 0), TFields(15, 12, 2020));
    EXPECT_EQ(subtracted(at(15, 3, 2021), 0, 15, 0), TFields(15, 12, 2019));
    EXPECT_EQ(subtracted(at(15, 3, 2021), 0, 14, 0), TFields(15, 1, 2020));
    EXPECT_EQ(subtracted(at(15, 12, 2021), 0, 24, 0), TFields(15, 12, 2019));
}

TEST_F(CTimeDateArithmeticTest, DaysAreBorrowedFromTheMonthBefore) {
    EXPECT_EQ(subtracted(at(1, 1, 2021), 1, 0, 0), TFields(31, 12, 2020));
    EXPECT_EQ(subtracted(at(1, 3, 2020), 1, 0, 0), TFields(29, 2, 2020));
    EXPECT_EQ(subtracted(at(1, 3, 2021), 1, 0, 0), TFields(28, 2, 2021));
    EXPECT_EQ(subtracted(at(1, 1, 2000), 146097, 0, 0), TFields(1, 1, 1600));
}

TEST_F(CTimeDateArithmeticTest, TheArithmeticKnowsNoLeapDayBefore1582) {
    EXPECT_EQ(incremented(at(29, 2, 1404)), TFields(1, 3, 1404));
    EXPECT_EQ(added(at(29, 2, 1404), 1, 0, 0), TFields(2, 3, 1404));
    EXPECT_EQ(incremented(at(28, 2, 1580)), TFields(1, 3, 1580));
    EXPECT_EQ(incremented(at(28, 2, 1584)), TFields(29, 2, 1584));
    EXPECT_EQ(decremented(at(1, 3, 1580)), TFields(28, 2, 1580));
    EXPECT_EQ(decremented(at(1, 3, 1584)), TFields(29, 2, 1584));
    EXPECT_EQ(decremented(at(1, 3, 1600)), TFields(29, 2, 1600));
    EXPECT_EQ(decremented(at(1, 3, 1700)), TFields(28, 2, 1700));
}

TEST_F(CTimeDateArithmeticTest, OneDayOnCrossesTheEndsOfMonths) {
    EXPECT_EQ(incremented(at(5, 3, 2021)), TFields(6, 3, 2021));
    EXPECT_EQ(incremented(at(30, 4, 2021)), TFields(1, 5, 2021));
    EXPECT_EQ(incremented(at(31, 12, 2021)), TFields(1, 1, 2022));
    EXPECT_EQ(incremented(at(99, 4, 2021)), TFields(1, 5, 2021));
    EXPECT_EQ(incremented(at(-7, 4, 2021)), TFields(-6, 4, 2021));
    EXPECT_EQ(incremented(at(31, 12, INT_MAX)), TFields(1, 1, INT_MIN));
}

TEST_F(CTimeDateArithmeticTest, OneDayBackCrossesTheEndsOfMonths) {
    EXPECT_EQ(decremented(at(5, 3, 2021)), TFields(4, 3, 2021));
    EXPECT_EQ(decremented(at(1, 5, 2021)), TFields(30, 4, 2021));
    EXPECT_EQ(decremented(at(1, 1, 2021)), TFields(31, 12, 2020));
    EXPECT_EQ(decremented(at(99, 4, 2021)), TFields(98, 4, 2021));
    EXPECT_EQ(decremented(at(-7, 4, 2021)), TFields(31, 3, 2021));
    EXPECT_EQ(decremented(at(1, 1, INT_MIN)), TFields(31, 12, INT_MAX));
}

TEST_F(CTimeDateArithmeticTest, OperatorsGiveTheDateBack) {
    CDate date = at(31, 12, 2021);
    EXPECT_EQ(&date.addDays(1), &date);
    EXPECT_EQ(&date.subDays(1), &date);
    EXPECT_EQ(&(date += 1), &date);
    EXPECT_EQ(&++date, &date);
    EXPECT_EQ(&--date, &date);
    EXPECT_EQ(fieldsOf(date), TFields(1, 1, 2022));
}

TEST_F(CTimeDateArithmeticTest, ASumLeavesTheDateAsItIs) {
    CDate const date = at(31, 12, 2021);
    EXPECT_EQ(fieldsOf(date + 32), TFields(1, 2, 2022));
    EXPECT_EQ(fieldsOf(date), TFields(31, 12, 2021));
}

TEST_F(CTimeDateArithmeticTest, NegativeArgumentsFailAnAssertionAndChangeNothing) {
    char const* const text = "(days >= 0) && (months >= 0) && (years >= 0)";
    CDate date = at(5, 3, 2021);
    EXPECT_EQ(failedCheckOf([&] { date.add_(-1, 0, 0); }), text);
    EXPECT_EQ(failedCheckOf([&] { date.add_(0, -1, 0); }), text);
    EXPECT_EQ(failedCheckOf([&] { date.add_(0, 0, INT_MIN); }), text);
    EXPECT_EQ(failedCheckOf([&] { date.sub_(INT_MIN, 0, 0); }), text);
    EXPECT_EQ(failedCheckOf([&] { date.sub_(0, -1, 0); }), text);
    EXPECT_EQ(failedCheckOf([&] { date.sub_(0, 0, -1); }), text);
    EXPECT_EQ(failedCheckOf([&] { date += -1; }), text);
    EXPECT_EQ(failedCheckOf([&] { date + -1; }), text);
    EXPECT_EQ(failedCheckOf([&] { date.addDays(0x80000000U); }), text);
    EXPECT_EQ(failedCheckOf([&] { date.subDays(0xFFFFFFFFU); }), text);
    EXPECT_EQ(fieldsOf(date), TFields(5, 3, 2021));
}

TEST_F(CTimeDateArithmeticTest, AMonthThatIsCountedWithMayBeZeroAndNoOther) {
    char const* const text = "1<=month && 12>=month";
    CDate negative = at(5, -1, 2021);
    EXPECT_EQ(failedCheckOf([&] { negative.add_(0, 0, 0); }), text);
    CDate large = at(5, 65537, 2021);
    EXPECT_EQ(failedCheckOf([&] { large.sub_(0, 0, 0); }), text);
    EXPECT_EQ(fieldsOf(negative), TFields(5, -1, 2021));
    EXPECT_EQ(fieldsOf(large), TFields(5, 65537, 2021));
    EXPECT_EQ(added(large, 0, 0, 0), TFields(5, 5, 2021 + 5461));
    EXPECT_EQ(subtracted(negative, 0, 0, 0), TFields(5, 11, 2020));
}

TEST_F(CTimeDateArithmeticTest, OneDayOnFromAMonthOutsideTheTableFailsAnAssertion) {
    for (std::string const month : {"-2147483648", "-1", "0", "13", "65537"}) {
        CDate date = at(5, std::stoi(month), 2021);
        EXPECT_EQ(failedCheckOf([&] { date.inc_(); }), "false") << month;
        EXPECT_EQ(failedCheckOf([&] { date.inc_(); }, "month"), month);
        EXPECT_EQ(date.getDay(), 7) << "the day goes on before the month is looked at";
    }
}

TEST_F(CTimeDateArithmeticTest, OneDayBackFromAMonthOutsideTheTableFailsAnAssertion) {
    for (std::string const month : {"-2147483648", "-1", "0", "13", "65537"}) {
        CDate date = at(1, std::stoi(month), 2021);
        EXPECT_EQ(failedCheckOf([&] { date.dec_(); }), "!\"Invalid month!\"") << month;
        EXPECT_EQ(failedCheckOf([&] { date.dec_(); }, "month"), month);
        EXPECT_EQ(fieldsOf(date), TFields(1, std::stoi(month), 2021));
        EXPECT_EQ(decremented(at(2, std::stoi(month), 2021)), TFields(1, std::stoi(month), 2021));
    }
}

TEST_F(CTimeDateArithmeticTest, DifferencesHaveAScaleOfTheirOwn) {
    std::vector<std::pair<std::pair<CDate, CDate>, int>> const differences = {
        {{at(1, 1, 2100), at(31, 12, 2099)}, 2},    {{at(1, 3, 2100), at(28, 2, 2100)}, 1},
        {{at(1, 1, 1897), at(31, 12, 1896)}, 2},    {{at(1, 1, 1896), at(31, 12, 1895)}, 0},
        {{at(1, 1, 2000), at(1, 1, 1900)}, 36524},  {{at(5, 3, 2021), at(5, 3, 2021)}, 0},
        {{at(1, 1, 2022), at(31, 12, 2021)}, 1},    {{at(1, 3, 2020), at(28, 2, 2020)}, 2},
        {{at(1, 1, 2021), at(31, 12, 2020)}, 1},    {{at(1, 1, 2020), at(31, 12, 2019)}, 1},
        {{at(2, 1, 2021), at(31, 12, 2021)}, -363}, {{at(15, 0, 2021), at(1, 1, 2021)}, 14}};
    for (auto const& [dates, difference] : differences) {
        EXPECT_EQ(dates.first - dates.second, difference);
        EXPECT_EQ(dates.second - dates.first, -difference);
    }
}

TEST_F(CTimeDateArithmeticTest, DifferencesWrap) {
    EXPECT_EQ(at(INT_MAX, 1, 1900) - at(-1, 1, 1900), INT_MIN);
    EXPECT_EQ(at(INT_MIN, 1, 1900) - at(1, 1, 1900), INT_MAX);
}

TEST_F(CTimeDateArithmeticTest, ADifferenceWithAMonthBehindDecemberFailsAnAssertion) {
    for (int const month : {14, 65537, INT_MAX})
        EXPECT_EQ(failedCheckOf([&] { at(1, month, 2021) - at(1, 1, 2021); }),
                  "1<=month && 12>=month")
            << month;
    // Months before the given one are counted, so this is the day behind 31 December.
    EXPECT_EQ(at(1, 13, 2021) - at(31, 12, 2021), 1);
    EXPECT_EQ(at(1, INT_MIN, 2021) - at(1, 1, 2021), 0);
}

} // namespace
