// Weekdays, which are the C library's in the local zone.

#include "2System/Time/TimeDate.h"

#include "2System/Time/TimeDateFields.h"
#include "2System/Time/TimeFailure.h"
#include "support/Registry.h"
#include "support/Zone.h"

#include <gtest/gtest.h>

#include <ctime>
#include <string>

namespace {

using Time::CDate;
using TimeTest::CTimeFailure;
using TimeTest::timeFailureOf;
using TimeTest::uncheckedDate;

class CTimeDateWeekdayInZonesTest : public TestSupport::CErrorTest,
                                    public testing::WithParamInterface<char const*> {};

constexpr int unknown = -1;

int weekdayByMktime(int day, int month, int year) {
    std::tm time = {};
    time.tm_mday = day;
    time.tm_mon = month - 1;
    time.tm_year = year - 1900;
    return std::mktime(&time) == -1 ? unknown : time.tm_wday;
}

int weekdayOf(int day, int month, int year) {
    try {
        return uncheckedDate(day, month, year).getDayOfWeek();
    } catch (Time::TExcTimeDateTime const&) {
        return unknown;
    }
}

// In some zones there was a midnight that their clocks left out; the C library can't tell then.
TEST_P(CTimeDateWeekdayInZonesTest, AWeekdayIsTheOneOfMktimeWithAllElseZero) {
    TestSupport::CZone const zone(GetParam());
    for (int year = 1890; year <= 2060; ++year)
        for (int month = 1; month <= 12; ++month)
            for (int day = 1; day <= 31; day += 3)
                ASSERT_EQ(weekdayOf(day, month, year), weekdayByMktime(day, month, year))
                    << day << '.' << month << '.' << year;
}

TEST_P(CTimeDateWeekdayInZonesTest, WhatIsNoDateHasAWeekdayToo) {
    TestSupport::CZone const zone(GetParam());
    EXPECT_EQ(weekdayOf(31, 2, 2021), weekdayByMktime(31, 2, 2021));
    EXPECT_EQ(weekdayOf(15, 0, 2023), weekdayByMktime(15, 0, 2023));
    EXPECT_EQ(weekdayOf(-1, 65537, 2021), weekdayByMktime(-1, 65537, 2021));
}

INSTANTIATE_TEST_SUITE_P(Zones, CTimeDateWeekdayInZonesTest,
                         testing::ValuesIn(TestSupport::zonesToTry),
                         [](auto const& zone) { return std::to_string(zone.index); });

using CTimeDateWeekdayTest = TestSupport::CErrorTest;

TEST_F(CTimeDateWeekdayTest, WeekdaysAreCountedFromSunday) {
    for (char const* const name : {"UTC", "Asia/Kolkata", "America/New_York", "Pacific/Apia"}) {
        TestSupport::CZone const zone(name);
        EXPECT_EQ(CDate(5, CDate::emMar, 2021).getDayOfWeek(), CDate::ewdFri) << name;
        EXPECT_EQ(CDate(29, CDate::emFeb, 2004).getDayOfWeek(), CDate::ewdSun) << name;
        EXPECT_EQ(CDate(1, CDate::emJan, 2000).getDayOfWeek(), CDate::ewdSat) << name;
    }
}

// Standard time is the one of summer there. Where the zone files say so, midnight without summer
// time is, in winter, an hour of the day before.
TEST_F(CTimeDateWeekdayTest, NegativeSummerTimeShowsInTheWeekday) {
    TestSupport::CZone const zone("IST-1GMT0,M10.5.0,M3.5.0/1");
    EXPECT_EQ(CDate(5, CDate::emMar, 2021).getDayOfWeek(), CDate::ewdThu);
    EXPECT_EQ(CDate(4, CDate::emJun, 2021).getDayOfWeek(), CDate::ewdFri);
}

// A second behind Greenwich, 1 January 1970 began at the moment -1, which means failure.
TEST_F(CTimeDateWeekdayTest, AMomentThatLooksLikeAFailureIsOne) {
    TestSupport::CZone const zone("AAA-0:00:01");
    EXPECT_EQ(timeFailureOf([] { CDate(1, CDate::emJan, 1970).getDayOfWeek(); }),
              (CTimeFailure{L"Error in OS call @(function): @(error)",
                            {{"function", L"mktime"}, {"error", L"unknown error"}},
                            L"Error in OS call mktime: unknown error"}));
    EXPECT_EQ(CDate(2, CDate::emJan, 1970).getDayOfWeek(), CDate::ewdFri);
}

TEST_F(CTimeDateWeekdayTest, WhatTheCLibraryCannotHoldIsAFailure) {
    TestSupport::CZone const zone("UTC");
    EXPECT_EQ(timeFailureOf([] { uncheckedDate(31, 12, INT32_MAX).getDayOfWeek(); }).text, L"");
    EXPECT_EQ(
        timeFailureOf([] { uncheckedDate(INT32_MAX, INT32_MIN, INT32_MIN).getDayOfWeek(); }).text,
        L"Error in OS call @(function): @(error)");
}

} // namespace
