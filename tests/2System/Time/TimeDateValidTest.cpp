// Which dates are valid.

#include "2System/Time/_Imp/TimeDateValid.h"
#include "2System/Time/TimeDate.h"

#include "2System/Time/TimeDateFields.h"
#include "support/Registry.h"
#include "support/TextFailures.h"
#include "support/Zone.h"

#include <gtest/gtest.h>

#include <climits>
#include <cstdint>
#include <cstdio>
#include <ctime>
#include <random>
#include <stdexcept>

namespace {

using TestSupport::failedCheckOf;
using Time::CDate;
using TimeTest::monthOf;

using CTimeDateValidTest = TestSupport::CErrorTest;

// A century has a leap day where the century divides by four. No table of lengths: months alternate
// between 31 and 30 days, and change their mind after July.
bool naiveIsValid(std::int64_t day, std::int64_t month, std::int64_t year) {
    auto const cut = [](std::int64_t value) { return ((value % 65536) + 65536) % 65536; };
    day = cut(day);
    month = cut(month);
    year = cut(year);
    if (year < 1400 || year > 10000 || month < 1 || month > 12)
        return false;
    std::int64_t length = 30 + (month + month / 8) % 2;
    if (month == 2)
        length = (year % 100 == 0 ? year / 100 : year) % 4 == 0 ? 29 : 28;
    return day >= 1 && day <= length;
}

TEST_F(CTimeDateValidTest, LeapDaysFollowTheGregorianRule) {
    EXPECT_TRUE(CDate::isValid(29, CDate::emFeb, 1404));
    EXPECT_TRUE(CDate::isValid(29, CDate::emFeb, 1600));
    EXPECT_TRUE(CDate::isValid(29, CDate::emFeb, 2000));
    EXPECT_TRUE(CDate::isValid(29, CDate::emFeb, 10000));
    EXPECT_FALSE(CDate::isValid(29, CDate::emFeb, 1400));
    EXPECT_FALSE(CDate::isValid(29, CDate::emFeb, 1500));
    EXPECT_FALSE(CDate::isValid(29, CDate::emFeb, 1900));
    EXPECT_FALSE(CDate::isValid(29, CDate::emFeb, 2021));
}

TEST_F(CTimeDateValidTest, BothEndsBelongToTheRange) {
    EXPECT_TRUE(CDate::isValid(1, CDate::emJan, 1400));
    EXPECT_TRUE(CDate::isValid(31, CDate::emDec, 10000));
    EXPECT_FALSE(CDate::isValid(31, CDate::emDec, 1399));
    EXPECT_FALSE(CDate::isValid(1, CDate::emJan, 10001));
}

TEST_F(CTimeDateValidTest, OnlyLow16BitsAreTested) {
    EXPECT_TRUE(CDate::isValid(1, monthOf(65537), 2021));
    EXPECT_TRUE(CDate::isValid(1, monthOf(1 - 65536), 2021));
    EXPECT_TRUE(CDate::isValid(65567, CDate::emMar, 2021));
    EXPECT_TRUE(CDate::isValid(1, CDate::emJan, 67557));
    EXPECT_FALSE(CDate::isValid(65536, CDate::emJan, 2021));
    EXPECT_FALSE(CDate::isValid(1, monthOf(65536), 2021));
    EXPECT_FALSE(CDate::isValid(1, CDate::emJan, 65536));
    EXPECT_FALSE(CDate::isValid(INT_MIN, CDate::emJan, 2021));
    EXPECT_FALSE(CDate::isValid(INT_MAX, monthOf(INT_MAX), INT_MAX));
}

TEST_F(CTimeDateValidTest, EveryDayOfEveryYearIsTestedAsTheRuleSays) {
    for (int year = 1395; year <= 10005; ++year)
        for (int month = 0; month <= 13; ++month)
            for (int const day : {-1, 0, 1, 28, 29, 30, 31, 32})
                ASSERT_EQ(CDate::isValid(day, monthOf(month), year), naiveIsValid(day, month, year))
                    << day << '.' << month << '.' << year;
}

TEST_F(CTimeDateValidTest, AnyFieldsAreTestedAsTheRuleSays) {
    constexpr unsigned seed = 14000229;
    std::printf("seed %u\n", seed);
    std::mt19937 random(seed);
    auto const cut = [&](int last) {
        int const low = static_cast<int>(random() % static_cast<unsigned>(last + 2));
        return static_cast<int>(low + 65536 * static_cast<int>(random() % 5) - 2 * 65536);
    };
    long valid = 0;
    for (int i = 0; i < 300000; ++i) {
        bool const wild = i % 8 == 0;
        int const day = wild ? static_cast<int>(random()) : cut(31);
        int const month = wild ? static_cast<int>(random()) : cut(12);
        int const year = wild ? static_cast<int>(random()) : cut(10001);
        bool const expected = naiveIsValid(day, month, year);
        valid += expected ? 1 : 0;
        ASSERT_EQ(CDate::isValid(day, monthOf(month), year), expected)
            << day << '.' << month << '.' << year;
    }
    EXPECT_GT(valid, 100000);
}

// The second opinion, which no failure of the calendar itself leads to.

struct CStrangeFailure {};

bool isMadeByStrangeCalendar(int day, int month, int year) {
    return Time::Detail::isMadeBy(
        [](unsigned short, unsigned short, unsigned short) { throw CStrangeFailure(); }, day,
        monthOf(month), year);
}

TEST_F(CTimeDateValidTest, TheCalendarSeesYearMonthAndDayCut) {
    EXPECT_TRUE(Time::Detail::isMadeBy(
        [](unsigned short year, unsigned short month, unsigned short day) {
            EXPECT_EQ(year, 2021);
            EXPECT_EQ(month, 3);
            EXPECT_EQ(day, 65535);
        },
        -1, monthOf(65539), 67557));
}

TEST_F(CTimeDateValidTest, WhatTheCalendarRefusesIsNoDate) {
    EXPECT_FALSE(Time::Detail::isMadeBy(
        [](unsigned short, unsigned short, unsigned short) { throw std::out_of_range("day"); }, 1,
        CDate::emJan, 2021));
}

TEST_F(CTimeDateValidTest, WhereTheCalendarFailsTheCLibraryDecides) {
    for (char const* const name : {"UTC", "America/New_York", "EST5EDT,M3.2.0,M11.1.0"}) {
        TestSupport::CZone const zone(name);
        EXPECT_TRUE(isMadeByStrangeCalendar(5, 3, 2021));
        EXPECT_TRUE(isMadeByStrangeCalendar(29, 2, 2020));
        EXPECT_TRUE(isMadeByStrangeCalendar(31, 12, 1399));
        EXPECT_TRUE(isMadeByStrangeCalendar(1, 1, 67557));
    }
}

TEST_F(CTimeDateValidTest, TheSecondOpinionCountsDaysLikeTheArithmetic) {
    EXPECT_FALSE(isMadeByStrangeCalendar(0, 3, 2021));
    EXPECT_FALSE(isMadeByStrangeCalendar(-65535, 3, 2021));
    EXPECT_FALSE(isMadeByStrangeCalendar(32, 3, 2021));
    EXPECT_FALSE(isMadeByStrangeCalendar(29, 2, 2021));
    EXPECT_FALSE(isMadeByStrangeCalendar(29, 2, 1404));
}

// Samoa crossed the date line at the end of 2011 and had no 30 December. Which of the days around
// it the C library moves is its own business.
TEST_F(CTimeDateValidTest, ADayThatTheCLibraryMovesIsNoDateToIt) {
    TestSupport::CZone const zone("Pacific/Apia");
    int moved = 0;
    for (int day = 28; day <= 31; ++day) {
        std::tm time = {};
        time.tm_mday = day;
        time.tm_mon = 11;
        time.tm_year = 111;
        std::mktime(&time);
        bool const isKept = time.tm_mday == day && time.tm_mon == 11 && time.tm_year == 111;
        EXPECT_EQ(isMadeByStrangeCalendar(day, 12, 2011), isKept) << day;
        moved += isKept ? 0 : 1;
    }
    EXPECT_GT(moved, 0);
}

TEST_F(CTimeDateValidTest, TheSecondOpinionAssertsTheMonth) {
    for (int const month : {INT_MIN, -1, 0, 13, 65537}) {
        EXPECT_EQ(failedCheckOf([&] { isMadeByStrangeCalendar(1, month, 2021); }),
                  "checkMonth(month)");
    }
}

} // namespace
