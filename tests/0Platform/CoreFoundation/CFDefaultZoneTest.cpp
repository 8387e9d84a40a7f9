// Which zone the environment means, and the zone that asks the C library, each held against ICU's
// own zones.

#include "0Platform/CoreFoundation/_Imp/CFDefaultZone.h"
#include "0Platform/CoreFoundation/CFDateSupport.h"
#include "0Platform/CoreFoundation/_Imp/CFLocaltimeZone.h"

#include <unicode/gregocal.h>
#include <unicode/simpletz.h>

#include <cerrno>
#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <memory>
#include <random>
#include <string>

namespace {

using namespace TestSupport;
using CFPlatform::LocaltimeZone;

constexpr double hour = 3600000;
constexpr double day = 24 * hour;
constexpr double year2008 = 1199145600000;
constexpr double year2020 = 1577836800000;

bool isSystemsZoneMissing = false;

} // namespace

extern "C" {
char* __real_realpath(char const* path, char* resolved);
char* __wrap_realpath(char const* path, char* resolved);

char* __wrap_realpath(char const* path, char* resolved) {
    if (!isSystemsZoneMissing)
        return __real_realpath(path, resolved);
    errno = ENOENT;
    return nullptr;
}
}

namespace {

int32_t offsetOf(icu::TimeZone const& zone, double instant, bool isLocal = false) {
    int32_t raw = 0;
    int32_t saving = 0;
    UErrorCode status = U_ZERO_ERROR;
    zone.getOffset(instant, isLocal, raw, saving, status);
    EXPECT_TRUE(U_SUCCESS(status));
    return raw + saving;
}

std::string idOf(icu::TimeZone const& zone) {
    icu::UnicodeString id;
    std::string bytes;
    return zone.getID(id).toUTF8String(bytes);
}

class CFDefaultZoneTest : public CDateTest {
  protected:
    static CFPlatform::ZoneOwner zoneUnder(std::optional<std::string> const& variable) {
        setZone(variable);
        CFPlatform::ZoneOwner zone = CFPlatform::createDefaultZone();
        EXPECT_NE(zone, nullptr);
        return zone;
    }

    static void expectSystemsZone(icu::TimeZone const& zone) {
        for (double instant = year2008; instant < year2020; instant += 30 * day) {
            auto const seconds = static_cast<std::time_t>(instant / 1000);
            std::tm const local = *std::localtime(&seconds);
            EXPECT_EQ(offsetOf(zone, instant), local.tm_gmtoff * 1000) << instant;
        }
    }
};

TEST_F(CFDefaultZoneTest, AZonesNameIsIcusZone) {
    for (char const* const name : {"UTC", "GMT", "Europe/Dublin", "America/New_York",
                                   "Asia/Kolkata", "Pacific/Apia", "Etc/GMT+5", "EST5EDT"}) {
        EXPECT_EQ(idOf(*zoneUnder(name)), name);
        EXPECT_EQ(idOf(*zoneUnder(std::string(":") + name)), name);
        EXPECT_EQ(idOf(*zoneUnder(std::string("/usr/share/zoneinfo/") + name)), name);
    }
}

TEST_F(CFDefaultZoneTest, AnEmptyVariableIsUTC) {
    EXPECT_EQ(idOf(*zoneUnder("")), "UTC");
    EXPECT_EQ(idOf(*zoneUnder(":")), "UTC");
}

TEST_F(CFDefaultZoneTest, WithoutTheVariableItIsTheSystemsZone) {
    expectSystemsZone(*zoneUnder(std::nullopt));
}

// It is UTC as a rule. Where the C library has another one from elsewhere, that counts.
TEST_F(CFDefaultZoneTest, ASystemThatNamesNoZoneHasTheCLibrarys) {
    isSystemsZoneMissing = true;
    CFPlatform::ZoneOwner const zone = zoneUnder(std::nullopt);
    isSystemsZoneMissing = false;
    expectSystemsZone(*zone);
}

TEST_F(CFDefaultZoneTest, WhatOnlyTheCLibraryKnowsIsAskedOfIt) {
    EXPECT_EQ(offsetOf(*zoneUnder("XYZ-5:45"), year2008), 5.75 * hour);
    EXPECT_EQ(offsetOf(*zoneUnder("<-03>3"), year2008), -3 * hour);
    // ICU counts this one eastward.
    EXPECT_EQ(offsetOf(*zoneUnder("GMT+5"), year2008), -5 * hour);
}

TEST_F(CFDefaultZoneTest, WhatOnlyIcuKnowsIsUTCAsForTheCLibrary) {
    for (char const* const name : {"PST", "BST", "IST"})
        EXPECT_EQ(offsetOf(*zoneUnder(name), year2008), 0) << name;
}

TEST_F(CFDefaultZoneTest, WhatNobodyKnowsIsUTC) {
    for (char const* const name :
         {"Foo/Bar", "no zone", "\xFF\xFE", "/", "/zoneinfo/", "::UTC", "../etc/passwd"})
        EXPECT_EQ(offsetOf(*zoneUnder(name), year2008), 0) << name;
    EXPECT_EQ(offsetOf(*zoneUnder(std::string(100000, 'x')), year2008), 0);
}

TEST_F(CFDefaultZoneTest, EachCallReadsTheEnvironmentAnew) {
    EXPECT_EQ(idOf(*zoneUnder("Asia/Kolkata")), "Asia/Kolkata");
    EXPECT_EQ(idOf(*zoneUnder("Europe/Dublin")), "Europe/Dublin");
}

class CFLocaltimeZoneTest : public CDateTest {
  protected:
    // In both directions, at random and around each full hour of the shifts.
    static void expectSame(icu::TimeZone const& expected, double first, double last) {
        constexpr unsigned seed = 20111230;
        std::printf("seed %u\n", seed);
        std::mt19937 random(seed);
        std::uniform_real_distribution<double> instants(first, last);
        LocaltimeZone const zone;
        for (int i = 0; i < 50000; ++i) {
            double const instant = std::floor(instants(random));
            ASSERT_EQ(offsetOf(zone, instant), offsetOf(expected, instant)) << instant;
            ASSERT_EQ(offsetOf(zone, instant, true), offsetOf(expected, instant, true)) << instant;
        }
        for (double instant = first; instant < last; instant += hour / 2)
            ASSERT_EQ(offsetOf(zone, instant, true), offsetOf(expected, instant, true)) << instant;
    }

    static void beginZone(std::string const& variable) {
        setZone(variable);
        tzset();
    }
};

TEST_F(CFLocaltimeZoneTest, ARuleIsIcusZoneOfTheSameRule) {
    beginZone(zoneRule);
    icu::SimpleTimeZone zone(static_cast<int32_t>(-5 * hour), u"rule");
    UErrorCode status = U_ZERO_ERROR;
    zone.setStartRule(UCAL_MARCH, 2, UCAL_SUNDAY, static_cast<int32_t>(2 * hour), status);
    zone.setEndRule(UCAL_NOVEMBER, 1, UCAL_SUNDAY, static_cast<int32_t>(2 * hour), status);
    ASSERT_TRUE(U_SUCCESS(status));
    expectSame(zone, year2008, year2020);
}

TEST_F(CFLocaltimeZoneTest, ARuleWithNegativeSummerTimeIsTheSameZone) {
    beginZone("IST-1GMT0,M10.5.0,M3.5.0/1");
    std::unique_ptr<icu::TimeZone> const zone(icu::TimeZone::createTimeZone("Europe/Dublin"));
    expectSame(*zone, year2008, year2020);
}

TEST_F(CFLocaltimeZoneTest, NamedZonesAreTheSame) {
    for (char const* const name : {"Europe/Dublin", "America/New_York", "Asia/Kolkata",
                                   "Pacific/Apia", "Australia/Lord_Howe"}) {
        SCOPED_TRACE(name);
        beginZone(name);
        std::unique_ptr<icu::TimeZone> const zone(icu::TimeZone::createTimeZone(name));
        expectSame(*zone, year2008, year2020);
    }
}

TEST_F(CFLocaltimeZoneTest, FieldsCountWithoutSummerTime) {
    beginZone(zoneRule);
    LocaltimeZone const zone;
    UErrorCode status = U_ZERO_ERROR;
    constexpr auto millis = static_cast<int32_t>(3 * hour);
    auto const era = static_cast<uint8_t>(icu::GregorianCalendar::AD);
    EXPECT_EQ(zone.getOffset(era, 2021, UCAL_MARCH, 14, UCAL_SUNDAY, 0, status), -5 * hour);
    EXPECT_EQ(zone.getOffset(era, 2021, UCAL_MARCH, 14, UCAL_SUNDAY, millis, status), -4 * hour);
    EXPECT_EQ(zone.getOffset(era, 2021, UCAL_MARCH, 14, UCAL_SUNDAY, millis, 31, status),
              -4 * hour);
    EXPECT_EQ(zone.getOffset(static_cast<uint8_t>(icu::GregorianCalendar::BC), 45, UCAL_JULY, 1,
                             UCAL_SUNDAY, millis, status),
              offsetOf(zone, -63587030400000 - 5 * hour));
    EXPECT_TRUE(U_SUCCESS(status));
}

TEST_F(CFLocaltimeZoneTest, SummerTimeIsTold) {
    beginZone(zoneRule);
    LocaltimeZone const zone;
    UErrorCode status = U_ZERO_ERROR;
    EXPECT_EQ(zone.getRawOffset(), -5 * hour);
    EXPECT_TRUE(zone.useDaylightTime());
    EXPECT_FALSE(zone.inDaylightTime(year2020, status));
    EXPECT_TRUE(zone.inDaylightTime(year2020 + 180 * day, status));
    beginZone("Asia/Kolkata");
    EXPECT_EQ(LocaltimeZone().getRawOffset(), 5.5 * hour);
}

TEST_F(CFLocaltimeZoneTest, ACloneIsEqual) {
    beginZone("XYZ-5:45");
    LocaltimeZone zone;
    std::unique_ptr<icu::TimeZone> const clone(zone.clone());
    EXPECT_TRUE(*clone == zone);
    EXPECT_EQ(clone->getDynamicClassID(), zone.getDynamicClassID());
    zone.setRawOffset(0);
    EXPECT_EQ(zone.getRawOffset(), 0);
    EXPECT_EQ(clone->getRawOffset(), 5.75 * hour);
}

TEST_F(CFLocaltimeZoneTest, AFailureBeforeTheCallStays) {
    beginZone("XYZ-5:45");
    int32_t raw = 1;
    int32_t saving = 2;
    UErrorCode status = U_ILLEGAL_ARGUMENT_ERROR;
    LocaltimeZone().getOffset(year2008, false, raw, saving, status);
    EXPECT_EQ(status, U_ILLEGAL_ARGUMENT_ERROR);
    EXPECT_EQ(raw, 1);
    EXPECT_EQ(saving, 2);
}

TEST_F(CFLocaltimeZoneTest, AnInstantBeyondTheCLibrarysYearsHasNoOffset) {
    beginZone("XYZ-5:45");
    EXPECT_EQ(CFPlatform::localtimeOffset(1e21), 0);
}

} // namespace
