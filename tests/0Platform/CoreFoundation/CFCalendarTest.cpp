#include "0Platform/CoreFoundation/CFDateSupport.h"
#include "0Platform/CoreFoundation/CFDateTwin.h"

#include "support/PlatformString.h"

#include <initializer_list>
#include <limits>
#include <string>
#include <thread>
#include <vector>

namespace {

using namespace TestSupport;

constexpr int farthest = std::numeric_limits<int>::max();
constexpr int nearest = std::numeric_limits<int>::min();

CFCalendarRef createCalendar() {
    return CFCalendarCreateWithIdentifier(kCFAllocatorDefault, kCFGregorianCalendar);
}

// Runs before or among the static initialisers of the platform's own units.
bool const isServedBeforeMain = [] {
    CFCalendarRef const calendar = createCalendar();
    bool const isServed = calendar != nullptr;
    if (isServed)
        CFRelease(calendar);
    return isServed;
}();

using CFDateTest = CObjectCountTest;

TEST_F(CFDateTest, ADateHoldsItsTime) {
    for (double const at : {0.0, 636624309.0, -63113864008.5, 1e300}) {
        CFDateRef const date = CFDateCreate(kCFAllocatorDefault, at);
        ASSERT_NE(date, nullptr);
        EXPECT_EQ(CFDateGetAbsoluteTime(date), at);
        EXPECT_EQ(CFGetRetainCount(date), 1);
        CFRelease(date);
    }
}

TEST_F(CFDateTest, AbsoluteTimeCountsFromTheYear2001) {
    EXPECT_EQ(kCFAbsoluteTimeIntervalSince1970, 978307200.0);
}

class CFCalendarTest : public CDateTest {
  protected:
    struct CSample {
        char const* zone;
        CLocalTime time;
        CFAbsoluteTime at;
    };

    static void expectComposed(std::initializer_list<CSample> samples) {
        for (CSample const& sample : samples) {
            setZone(sample.zone);
            EXPECT_EQ(composed(sample.time), sample.at) << sample.zone << " " << sample.time;
        }
    }

    // In the zone of TZ.
    static void expectSame(CLocalTime const& time, CLocalTime const& same) {
        EXPECT_EQ(composed(time), composed(same)) << time << " should be " << same;
    }
};

TEST_F(CFCalendarTest, TheIdentifierIsAText) {
    EXPECT_EQ(CPlatformString::unitsOf(kCFGregorianCalendar), u"gregorian");
    CPlatformString const copy(u"gregorian");
    CFCalendarRef const calendar = CFCalendarCreateWithIdentifier(kCFAllocatorDefault, copy.get());
    ASSERT_NE(calendar, nullptr);
    EXPECT_EQ(CFGetRetainCount(calendar), 1);
    CFRelease(calendar);
}

TEST_F(CFCalendarTest, TheIdentifierOutlivesEachOfItsOwners) {
    for (int i = 0; i < 100; ++i)
        CFRelease(kCFGregorianCalendar);
    EXPECT_EQ(CPlatformString::unitsOf(kCFGregorianCalendar), u"gregorian");
    for (int i = 0; i < 300; ++i)
        CFRetain(kCFGregorianCalendar);
    EXPECT_GT(CFGetRetainCount(kCFGregorianCalendar), 1000000);
}

TEST_F(CFCalendarTest, TheIdentifierIsReadyBeforeMain) {
    EXPECT_TRUE(isServedBeforeMain);
}

TEST_F(CFCalendarTest, NoOtherCalendarIsServed) {
    for (char16_t const* const identifier :
         {u"", u"gregoria", u"gregorian ", u"Gregorian", u"buddhist", u"iso8601"}) {
        CPlatformString const text(identifier);
        EXPECT_EQ(CFCalendarCreateWithIdentifier(kCFAllocatorDefault, text.get()), nullptr);
    }
}

TEST_F(CFCalendarTest, EachZoneReadsItsOwnClock) {
    constexpr CLocalTime march = {2021, 3, 5, 8, 5, 9};
    constexpr CLocalTime july = {2020, 7, 14, 13, 7, 45};
    expectComposed({{"UTC", march, 636624309},
                    {"UTC", july, 616424865},
                    {"Europe/Dublin", march, 636624309},
                    {"Europe/Dublin", july, 616421265},
                    {"America/New_York", march, 636642309},
                    {"America/New_York", july, 616439265},
                    {"Asia/Kolkata", march, 636604509},
                    {"Asia/Kolkata", july, 616405065},
                    {"Pacific/Apia", march, 636573909},
                    {"Pacific/Apia", july, 616378065},
                    {zoneRule, march, 636642309},
                    {zoneRule, july, 616439265}});
}

TEST_F(CFCalendarTest, ATimeInAGapIsReadWithTheOffsetBeforeIt) {
    expectComposed({{"Europe/Berlin", {2021, 3, 28, 2, 30, 0}, 638587800},
                    {"Europe/Berlin", {2021, 3, 28, 3, 30, 0}, 638587800},
                    {"Europe/Dublin", {2021, 3, 28, 1, 30, 0}, 638587800},
                    {"Europe/Dublin", {2021, 3, 28, 2, 30, 0}, 638587800},
                    {"America/New_York", {2021, 3, 14, 2, 30, 0}, 637399800},
                    {"America/New_York", {2021, 3, 14, 3, 30, 0}, 637399800},
                    {zoneRule, {2021, 3, 14, 2, 30, 0}, 637399800},
                    {zoneRule, {2021, 3, 14, 3, 30, 0}, 637399800}});
}

TEST_F(CFCalendarTest, ADoubledTimeIsTheLaterOne) {
    // An hour before it on the clock are two hours.
    expectComposed({{"Europe/Berlin", {2021, 10, 31, 2, 30, 0}, 657336600},
                    {"Europe/Berlin", {2021, 10, 31, 1, 30, 0}, 657329400},
                    {"Europe/Dublin", {2021, 10, 31, 1, 30, 0}, 657336600},
                    {"Europe/Dublin", {2021, 10, 31, 0, 30, 0}, 657329400},
                    {"America/New_York", {2021, 11, 7, 1, 30, 0}, 657959400},
                    {"America/New_York", {2021, 11, 7, 0, 30, 0}, 657952200},
                    {zoneRule, {2021, 11, 7, 1, 30, 0}, 657959400},
                    {zoneRule, {2021, 11, 7, 0, 30, 0}, 657952200}});
}

TEST_F(CFCalendarTest, ADayThatAZoneSkipsIsTheNext) {
    setZone("Pacific/Apia");
    expectSame({2011, 12, 30, 12, 0, 0}, {2011, 12, 31, 12, 0, 0});
    EXPECT_EQ(composed({2011, 12, 31, 0, 0, 0}) - composed({2011, 12, 29, 23, 59, 59}), 1);
}

TEST_F(CFCalendarTest, TheCalendarIsGregorianAtAllTimes) {
    setZone("UTC");
    EXPECT_EQ(composed({1582, 10, 15, 12, 0, 0}), -13197556800);
    EXPECT_EQ(composed({1582, 10, 4, 12, 0, 0}), -13197556800 - 11 * 86400.0);
    EXPECT_EQ(composed({1500, 3, 1, 12, 0, 0}), -15804936000);
    EXPECT_EQ(composed({1400, 3, 1, 0, 0, 0}), -18960652800);
    expectSame({1400, 2, 29, 0, 0, 0}, {1400, 3, 1, 0, 0, 0});
    EXPECT_EQ(composed({1600, 3, 1, 0, 0, 0}) - composed({1600, 2, 28, 0, 0, 0}), 2 * 86400);
    EXPECT_EQ(composed({10000, 1, 1, 0, 0, 0}), 252423993600);
    // The first days of the years 1 AD and 1 BC.
    EXPECT_EQ(composed({1, 1, 1, 0, 0, 0}), -63113904000);
    EXPECT_EQ(composed({0, 1, 1, 0, 0, 0}), -63113904000 - 366 * 86400.0);
}

TEST_F(CFCalendarTest, WhatIsBeyondItsRangeCarriesOver) {
    setZone("UTC");
    expectSame({2021, 0, 0, 0, 0, 0}, {2020, 11, 30, 0, 0, 0});
    expectSame({2021, 13, 1, 0, 0, 0}, {2022, 1, 1, 0, 0, 0});
    expectSame({2021, -11, 1, 0, 0, 0}, {2020, 1, 1, 0, 0, 0});
    expectSame({2021, 2, 30, 25, 61, 61}, {2021, 3, 3, 2, 2, 1});
    expectSame({1999, 12, 31, 24, 0, 0}, {2000, 1, 1, 0, 0, 0});
    expectSame({2000, 1, 1, 0, 0, -1}, {1999, 12, 31, 23, 59, 59});
}

TEST_F(CFCalendarTest, ComponentsComeInAnyOrderAndTheRestHasItsFirstValue) {
    setZone("UTC");
    CFCalendarRef const calendar = createCalendar();
    CFAbsoluteTime at = 0;
    EXPECT_TRUE(CFCalendarComposeAbsoluteTime(calendar, &at, "sHmdyM", 9, 8, 5, 5, 2021, 3));
    EXPECT_EQ(at, 636624309);
    EXPECT_TRUE(CFCalendarComposeAbsoluteTime(calendar, &at, "y", 2001));
    EXPECT_EQ(at, 0);
    EXPECT_TRUE(CFCalendarComposeAbsoluteTime(calendar, &at, ""));
    EXPECT_EQ(at, composed({1, 1, 1, 0, 0, 0}));
    EXPECT_TRUE(CFCalendarComposeAbsoluteTime(calendar, &at, "yy", 1999, 2001));
    EXPECT_EQ(at, 0);
    CFRelease(calendar);
}

TEST_F(CFCalendarTest, AnUnknownComponentFailsAndStoresNothing) {
    setZone("UTC");
    CFCalendarRef const calendar = createCalendar();
    for (char const* const components : {"x", "yMdHmsx", "xyMdHms", "YMd", "yM d", "hms", "S"}) {
        CFAbsoluteTime at = 77;
        EXPECT_FALSE(CFCalendarComposeAbsoluteTime(calendar, &at, components, 1, 1, 1, 1, 1, 1, 1))
            << components;
        EXPECT_EQ(at, 77) << components;
    }
    CFRelease(calendar);
}

TEST_F(CFCalendarTest, AYearTooFarAwayFailsAndStoresNothing) {
    for (char const* const zone : zonesToTry) {
        SCOPED_TRACE(zone);
        setZone(zone);
        CFCalendarRef const calendar = createCalendar();
        for (int const year : {farthest, nearest, 6000000, -6000000}) {
            CFAbsoluteTime at = 77;
            EXPECT_FALSE(CFCalendarComposeAbsoluteTime(calendar, &at, "y", year)) << year;
            EXPECT_EQ(at, 77) << year;
        }
        EXPECT_FALSE(
            composedBy(calendar, {farthest, farthest, farthest, farthest, farthest, farthest}));
        EXPECT_FALSE(composedBy(calendar, {nearest, nearest, nearest, nearest, nearest, nearest}));
        for (int const year : {5000000, -5000000})
            EXPECT_TRUE(composedBy(calendar, {year, 1, 1, 0, 0, 0})) << year;
        CFRelease(calendar);
    }
}

TEST_F(CFCalendarTest, TheExtremesOfEachComponentAreReadOrRefused) {
    setZone("UTC");
    EXPECT_EQ(composed({2001, 1, 1, 0, 0, farthest}), 2147483647.0);
    EXPECT_EQ(composed({2001, 1, 1, 0, 0, nearest}), -2147483648.0);
    EXPECT_EQ(composed({2001, 1, 1, 0, farthest, 0}), 2147483647.0 * 60);
    EXPECT_EQ(composed({2001, 1, 1, nearest, 0, 0}), -2147483648.0 * 3600);
    CFCalendarRef const calendar = createCalendar();
    EXPECT_FALSE(composedBy(calendar, {2001, 1, farthest, 0, 0, 0}));
    EXPECT_FALSE(composedBy(calendar, {2001, nearest, 1, 0, 0, 0}));
    CFRelease(calendar);
}

TEST_F(CFCalendarTest, RandomTimesAreReadAsIcuReadsThem) {
    CRandomNumbers numbers(20210305);
    for (char const* const zone : zonesToTry) {
        // ICU has no zone of the rule, but one that has kept it since 2007.
        bool const isRule = std::string(zone) == zoneRule;
        setZone(zone);
        CFCalendarRef const calendar = createCalendar();
        for (int i = 0; i < 20000; ++i) {
            bool const isRecent = isRule || i % 2 == 0;
            CLocalTime const time = {isRecent ? numbers.between(2008, 2030)
                                              : numbers.between(-5000, 15000),
                                     isRecent ? numbers.between(1, 12) : numbers.between(-30, 30),
                                     numbers.between(-40, 40),
                                     numbers.between(-50, 50),
                                     numbers.between(-100, 100),
                                     numbers.between(-100, 100)};
            ASSERT_EQ(composedBy(calendar, time),
                      twinComposed(isRule ? "America/New_York" : zone, time))
                << zone << " " << time;
        }
        CFRelease(calendar);
    }
}

TEST_F(CFCalendarTest, TheZoneIsReadWhenTheCalendarIsMade) {
    setZone("America/New_York");
    CFCalendarRef const calendar = createCalendar();
    setZone("Asia/Kolkata");
    EXPECT_EQ(composedBy(calendar, {2021, 3, 5, 8, 5, 9}), 636642309);
    EXPECT_EQ(composed({2021, 3, 5, 8, 5, 9}), 636604509);
    CFRelease(calendar);
}

TEST_F(CFCalendarTest, SeveralThreadsUseOneCalendar) {
    for (char const* const zone : {"Europe/Dublin", zoneRule}) {
        setZone(zone);
        CFCalendarRef const calendar = createCalendar();
        double const expected = composed({2021, 3, 5, 8, 5, 9});
        std::vector<std::thread> threads;
        for (int i = 0; i < 4; ++i) {
            threads.emplace_back([&] {
                for (int round = 0; round < 1000; ++round)
                    EXPECT_EQ(composedBy(calendar, {2021, 3, 5, 8, 5, 9}), expected);
            });
        }
        for (std::thread& thread : threads)
            thread.join();
        CFRelease(calendar);
    }
}

} // namespace
