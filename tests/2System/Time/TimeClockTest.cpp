// Where the present moment comes from.

#include "2System/Time/_Imp/TimeClock.h"

#include <gtest/gtest.h>

#include <ctime>

namespace {

using Time::Detail::CClock;
using Time::Detail::getClock;
using Time::Detail::setClock;

TEST(CTimeClockTest, TheSystemsClockIsInPlace) {
    std::time_t const before = std::time(nullptr);
    std::time_t stored = 0;
    std::time_t const now = getClock().time(&stored);
    EXPECT_EQ(now, stored);
    EXPECT_GE(now, before);
    EXPECT_LE(now, std::time(nullptr));

    std::tm utc = {};
    std::tm local = {};
    ASSERT_EQ(getClock().gmtime(&now, &utc), &utc);
    ASSERT_EQ(getClock().localtime(&now, &local), &local);
    EXPECT_EQ(::timegm(&utc), now);
    EXPECT_EQ(std::mktime(&local), now);
}

TEST(CTimeClockTest, AnotherClockTakesItsPlaceAndGivesTheOneBefore) {
    CClock const stopped = {[](std::time_t*) { return std::time_t(-1); }, getClock().gmtime,
                            getClock().localtime};
    CClock const before = setClock(stopped);
    EXPECT_EQ(getClock().time(nullptr), -1);
    EXPECT_EQ(setClock(before).time, stopped.time);
    EXPECT_EQ(getClock().time, before.time);
}

} // namespace
