// The present moment.

#include "1Base/Error/Error.h"
#include "2System/Time/TimeClockInHand.h"
#include "2System/Time/TimeDateTime.h"
#include "2System/Time/TimeOutcome.h"
#include "support/ObjectCount.h"
#include "support/TextFailures.h"
#include "support/Zone.h"

#include <ctime>
#include <string>

namespace {

using TestSupport::CZone;
using TestSupport::failedCheckOf;
using Time::CDateTime;
using Time::CTimeZone;
using TimeTest::CClockInHand;
using TimeTest::july;
using TimeTest::march;
using TimeTest::show;

using CTimeDateTimeClockTest = TestSupport::CObjectCountTest;

// The local value and the zone.
std::string localAt(std::time_t moment, std::string const& zoneName) {
    CZone const pinned(zoneName);
    CClockInHand const clock(moment);
    EXPECT_EQ(show(CDateTime::getCurrentTimeLocal()), [] {
        CTimeZone dropped;
        return show(CDateTime::getCurrentTimeLocal(dropped));
    }());
    CTimeZone zone(CTimeZone::etzPlus, 7, 7);
    std::string const value = show(CDateTime::getCurrentTimeLocal(zone));
    return value + " " + show(zone);
}

TEST_F(CTimeDateTimeClockTest, TheSystemsClockIsAsked) {
    std::time_t const before = std::time(nullptr);
    CDateTime const utc = CDateTime::getCurrentTimeUTC();
    CDateTime const local = CDateTime::getCurrentTimeLocal();
    std::time_t const after = std::time(nullptr);
    auto const atUTC = [](std::time_t moment) {
        std::tm time = {};
        return CDateTime(*::gmtime_r(&moment, &time));
    };
    auto const atHome = [](std::time_t moment) {
        std::tm time = {};
        return CDateTime(*::localtime_r(&moment, &time));
    };
    EXPECT_TRUE(atUTC(before) <= utc && utc <= atUTC(after));
    EXPECT_TRUE(atHome(before) <= local && local <= atHome(after));
    EXPECT_EQ(utc.getMilliSecond(), 0);
    EXPECT_EQ(local.getMilliSecond(), 0);
}

TEST_F(CTimeDateTimeClockTest, UTCIsTheSameInEveryZone) {
    for (char const* const name : TestSupport::zonesToTry) {
        CZone const zone(name);
        CClockInHand const clock(march);
        EXPECT_EQ(show(CDateTime::getCurrentTimeUTC()), "2021-3-5 12:5:9.0") << name;
    }
}

TEST_F(CTimeDateTimeClockTest, AZoneHasTheOffsetsSignInAllItsFields) {
    EXPECT_EQ(localAt(march, "UTC"), "2021-3-5 12:5:9.0 0 0:0");
    EXPECT_EQ(localAt(march, "Asia/Kolkata"), "2021-3-5 17:35:9.0 1 5:30");
    EXPECT_EQ(localAt(march, "America/New_York"), "2021-3-5 7:5:9.0 -1 -5:0");
    EXPECT_EQ(localAt(march, "America/St_Johns"), "2021-3-5 8:35:9.0 -1 -3:-30");
    EXPECT_EQ(localAt(march, "Pacific/Apia"), "2021-3-6 2:5:9.0 1 14:0");
    EXPECT_EQ(localAt(march, "EST5EDT,M3.2.0,M11.1.0"), "2021-3-5 7:5:9.0 -1 -5:0");
    EXPECT_EQ(localAt(march, "XYZ0:30"), "2021-3-5 11:35:9.0 -1 0:-30");
    // Seconds are in neither field.
    EXPECT_EQ(localAt(march, "XYZ0:00:01"), "2021-3-5 12:5:8.0 -1 0:0");
}

TEST_F(CTimeDateTimeClockTest, TheOffsetIsTheMomentsOwn) {
    EXPECT_EQ(localAt(march, "Europe/Dublin"), "2021-3-5 12:5:9.0 0 0:0");
    EXPECT_EQ(localAt(july, "Europe/Dublin"), "2021-7-1 13:0:0.0 1 1:0");
    EXPECT_EQ(localAt(july, "America/New_York"), "2021-7-1 8:0:0.0 -1 -4:0");
    EXPECT_EQ(localAt(july, "EST5EDT,M3.2.0,M11.1.0"), "2021-7-1 8:0:0.0 -1 -4:0");
    // Samoa left out 30 December 2011.
    EXPECT_EQ(localAt(1325239199, "Pacific/Apia"), "2011-12-29 23:59:59.0 -1 -10:0");
    EXPECT_EQ(localAt(1325239200, "Pacific/Apia"), "2011-12-31 0:0:0.0 1 14:0");
}

TEST_F(CTimeDateTimeClockTest, TheOffsetIsMeasuredOnTheScaleOfDates) {
    // The turn to 2100 is two days wide there.
    EXPECT_EQ(localAt(4102446600, "XYZ5"), "2099-12-31 19:30:0.0 -1 -29:0");
    EXPECT_EQ(localAt(4102430400, "XYZ-5:30"), "2100-1-1 1:30:0.0 1 29:30");
}

TEST_F(CTimeDateTimeClockTest, TheMomentIsAskedForOnce) {
    CClockInHand const clock(march);
    CTimeZone zone;
    CDateTime::getCurrentTimeLocal(zone);
    EXPECT_EQ(CClockInHand::asked(), 1);
}

TEST_F(CTimeDateTimeClockTest, AFailedClockStandsAtAMomentOf2036) {
    {
        CZone const zone("Asia/Kolkata");
        CClockInHand const clock(-1);
        EXPECT_EQ(show(CDateTime::getCurrentTimeUTC()), "2036-1-1 17:19:38.0");
    }
    EXPECT_EQ(localAt(-1, "Asia/Kolkata"), "2036-1-1 22:49:38.0 1 5:30");
    EXPECT_EQ(localAt(-2, "UTC"), "1969-12-31 23:59:58.0 0 0:0");
}

TEST_F(CTimeDateTimeClockTest, AMomentBehindAllDatesHasNoOffset) {
    CZone const pinned("UTC");
    CClockInHand const clock(253433923200);
    EXPECT_EQ(show(CDateTime::getCurrentTimeUTC()), "10001-1-1 0:0:0.0");
    EXPECT_EQ(show(CDateTime::getCurrentTimeLocal()), "10001-1-1 0:0:0.0");
    CTimeZone zone(CTimeZone::etzPlus, 7, 7);
    EXPECT_EQ(TimeTest::outcomeOf([&] { return CDateTime::getCurrentTimeLocal(zone); }),
              TimeTest::badDate("10001/1/1"));
    EXPECT_EQ(show(zone), "1 7:7");
}

TEST_F(CTimeDateTimeClockTest, AMomentThatCannotBeConvertedFailsAnAssertion) {
    CClockInHand const clock(march);
    CTimeZone zone(CTimeZone::etzPlus, 7, 7);
    clock.loseUTC();
    EXPECT_EQ(failedCheckOf([] { CDateTime::getCurrentTimeUTC(); }), "func(&currTime, &buf )");
    EXPECT_EQ(failedCheckOf([&] { CDateTime::getCurrentTimeLocal(zone); }),
              "gmtime_r( &currTime, &tm_utc)");
    EXPECT_EQ(failedCheckOf([] { CDateTime::getCurrentTimeLocal(); }), "");
    clock.loseLocal();
    EXPECT_EQ(failedCheckOf([] { CDateTime::getCurrentTimeLocal(); }), "func(&currTime, &buf )");
    EXPECT_EQ(failedCheckOf([&] { CDateTime::getCurrentTimeLocal(zone); }),
              "localtime_r( &currTime, &tm_local)");
    EXPECT_EQ(failedCheckOf([] { CDateTime::getCurrentTimeUTC(); }), "");
    EXPECT_EQ(show(zone), "1 7:7");
}

} // namespace
