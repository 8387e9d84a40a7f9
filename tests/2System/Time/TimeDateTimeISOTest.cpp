#include "1Base/Error/Error.h"
#include "2System/Time/TimeClockInHand.h"
#include "2System/Time/TimeDateTime.h"
#include "2System/Time/TimeFailureLines.h"
#include "2System/Time/TimeLocales.h"
#include "2System/Time/TimeReadOutcome.h"
#include "2System/Time/TimeRoads.h"
#include "support/ObjectCount.h"
#include "support/TextFailures.h"
#include "support/Zone.h"

#include <climits>
#include <ctime>
#include <string>

namespace {

using TestSupport::CZone;
using Time::CDate;
using Time::CDateTime;
using Time::CTimeZone;
using TimeTest::badDate;
using TimeTest::badMonth;
using TimeTest::CClockInHand;
using TimeTest::march;
using TimeTest::onBothRoads;
using TimeTest::show;
using namespace std::string_literals;

using CTimeDateTimeISOTest = TestSupport::CObjectCountTest;

CDateTime const sample(5, CDate::emMar, 2021, 8, 5, 9, 123);

// Writing.

void expectWritten(std::string const& expected, CTimeZone const& zone,
                   CDateTime const& value = sample) {
    onBothRoads(
        [&] { EXPECT_EQ(TimeTest::narrow(value.getAsISOdate(zone)), expected) << show(zone); });
}

TEST_F(CTimeDateTimeISOTest, ADateIsWrittenWithItsZone) {
    expectWritten("2021-03-05T08:05:09", CTimeZone());
    expectWritten("2021-03-05T08:05:09", CTimeZone(CTimeZone::etzNone, 1, 30));
    expectWritten("2021-03-05T08:05:09Z", CTimeZone(CTimeZone::etzUTC, 0, 0));
    expectWritten("2021-03-05T08:05:09Z", CTimeZone(CTimeZone::etzUTC, 1, 30));
    expectWritten("2021-03-05T08:05:09+01:00", CTimeZone(CTimeZone::etzPlus, 1, 0));
    expectWritten("2021-03-05T08:05:09-05:30", CTimeZone(CTimeZone::etzMinus, 5, 30));
}

TEST_F(CTimeDateTimeISOTest, TheSignIsNotWrittenTwice) {
    expectWritten("2021-03-05T08:05:09-05:30", CTimeZone(CTimeZone::etzMinus, -5, -30));
    expectWritten("2021-03-05T08:05:09+05:30", CTimeZone(CTimeZone::etzPlus, -5, -30));
    expectWritten("2021-03-05T08:05:09+100:2147483647",
                  CTimeZone(CTimeZone::etzPlus, 100, -INT_MAX));
}

TEST_F(CTimeDateTimeISOTest, AnUnknownZoneFailsAnAssertion) {
    CTimeZone const zone(static_cast<CTimeZone::EType>(2), 0, 0);
    onBothRoads([&] {
        EXPECT_EQ(TestSupport::failedCheckOf([&] { sample.getAsISOdate(zone); }),
                  "!\"Unknown time zone type\"");
    });
}

CDateTime unchecked(int year, int month, int day, int hour) {
    std::tm time = {};
    time.tm_year = year - 1900;
    time.tm_mon = month - 1;
    time.tm_mday = day;
    time.tm_hour = hour;
    return CDateTime(time);
}

TEST_F(CTimeDateTimeISOTest, BlanksFillTheYearAndZerosTheRest) {
    expectWritten(" 999-00-00T00:00:00", CTimeZone(), unchecked(999, 0, 0, 0));
    expectWritten("   5-12-31T-1:00:00", CTimeZone(), unchecked(5, 12, 31, -1));
    expectWritten("  -5-12-31T-10:00:00", CTimeZone(), unchecked(-5, 12, 31, -10));
    expectWritten("10000-12-100T100:00:00", CTimeZone(), unchecked(10000, 12, 100, 100));
    expectWritten("2147483547-12--2147483648T-2147483648:00:00", CTimeZone(),
                  unchecked(INT_MAX - 100, 12, INT_MIN, INT_MIN));
}

TEST_F(CTimeDateTimeISOTest, ALocaleThatGroupsDigitsDoesSoHere) {
    TimeTest::CGroupingLocale const global('.', "\3");
    EXPECT_EQ(TimeTest::narrow(sample.getAsISOdate(CTimeZone())), "2.021-03-05T08:05:09");
}

// Reading.

// Value, zone and parts, or the failure with the parts untouched.
std::string readISO(std::string const& text, bool toLocal = false, char separator = 'T') {
    TimeTest::CReadOutcome const read = TimeTest::readISO(text, toLocal, separator);
    EXPECT_TRUE(read.value || read.parts == TimeTest::untouchedParts);
    return show(read);
}

void expectRead(std::string const& text, std::string const& expected, char separator = 'T') {
    onBothRoads([&] { EXPECT_EQ(readISO(text, false, separator), expected) << text; });
}

void expectRefused(std::string const& text, char separator = 'T') {
    expectRead(text, "TimeDateTime: " + TimeTest::wrongArgument("ISO date", text, "Invalid format"),
               separator);
}

std::string const utc = " | 0 0:0 | ";

TEST_F(CTimeDateTimeISOTest, ATextMayEndBehindAnyPart) {
    expectRead("2021", "2021-1-1 0:0:0.0" + utc + "0x0001");
    expectRead("2021-03", "2021-3-1 0:0:0.0" + utc + "0x0003");
    expectRead("2021-03-05", "2021-3-5 0:0:0.0" + utc + "0x0007");
    expectRead("2021-03-05T12", "2021-3-5 12:0:0.0" + utc + "0x000F");
    expectRead("2021-03-05T12:30", "2021-3-5 12:30:0.0" + utc + "0x001F");
    expectRead("2021-03-05T12:30:45", "2021-3-5 12:30:45.0" + utc + "0x003F");
    expectRead("2021-03-05T12:30:45.25", "2021-3-5 12:30:45.25" + utc + "0x007F");
}

TEST_F(CTimeDateTimeISOTest, AZoneMayFollowTheTime) {
    expectRead("2021-03-05T12:30:45Z", "2021-3-5 12:30:45.0 | 0 0:0 | 0x00BF");
    expectRead("2021-03-05T12:30:45+01", "2021-3-5 12:30:45.0 | 1 1:0 | 0x01BF");
    expectRead("2021-03-05T12:30:45+01:30", "2021-3-5 12:30:45.0 | 1 1:30 | 0x03BF");
    expectRead("2021-03-05T12:30:45-05:00", "2021-3-5 12:30:45.0 | -1 5:0 | 0x03BF");
    expectRead("2021-03-05T12:30Z", "2021-3-5 12:30:0.0 | 0 0:0 | 0x009F");
    expectRead("2021-03-05T12:30+01", "2021-3-5 12:30:0.0 | 1 1:0 | 0x019F");
    expectRead("2021-03-05T12:30-01:30", "2021-3-5 12:30:0.0 | -1 1:30 | 0x039F");
    expectRead("2021-03-05T12:30:45.25Z", "2021-3-5 12:30:45.25 | 0 0:0 | 0x00FF");
    expectRead("2021-03-05T12:30:45.25+01:30", "2021-3-5 12:30:45.25 | 1 1:30 | 0x03FF");
    // No offset is an offset like any other.
    expectRead("2021-03-05T12:30:45+00:00", "2021-3-5 12:30:45.0 | 1 0:0 | 0x03BF");
}

TEST_F(CTimeDateTimeISOTest, PartsHaveTheirNumberOfDigits) {
    for (char const* const text : {"2021-3-05",
                                   "2021-3",
                                   "2021-003-05",
                                   "2021-03-5",
                                   "2021-03-005",
                                   "20210305",
                                   "202",
                                   "20210",
                                   "021-03-05",
                                   "2021-03-05T1:00",
                                   "2021-03-05T012:00",
                                   "2021-03-05T12:3",
                                   "2021-03-05T12:030",
                                   "2021-03-05T12:30:5",
                                   "2021-03-05T12:30:045",
                                   "2021-03-05T12:30:45.5",
                                   "2021-03-05T12:30:45.250",
                                   "2021-03-05T12:30:45.",
                                   "2021-03-05T12:30:",
                                   "2021-03-05T12:30+",
                                   "2021-03-05T12:30+1",
                                   "2021-03-05T12:30+0130",
                                   "2021-03-05T12:30+01:",
                                   "2021-03-05T12:30+01:3",
                                   "2021-03-05T12:30+01:300",
                                   "2021-03-05T",
                                   "2021-03-05T12:",
                                   "2021-",
                                   "2021-03-",
                                   "99999999999",
                                   "2021-99999999999"})
        expectRefused(text);
}

TEST_F(CTimeDateTimeISOTest, DelimitersAreTheOnesOfTheForm) {
    for (char const* const text :
         {"2021.03.05", "2021-03.05", "2021-03-05Z", "2021-03-05 12:30", "2021-03-05t12:30",
          "2021-03-05T12.30", "2021-03-05T12Z", "2021-03-05T12+01", "2021-03-05T12:30+01x",
          "2021-03-05T12:30+01.30", "x", "-", "+", "T", "2021x", "2021-03-05TT12:30", "2021--03"})
        expectRefused(text);
    expectRefused("2021\0-03"s);
    expectRefused("2021-03-05\0"s);
}

TEST_F(CTimeDateTimeISOTest, WhatFollowsIsPassedOver) {
    expectRead("2021-03-05T12:30x", "2021-3-5 12:30:0.0" + utc + "0x001F");
    expectRead("2021-03-05T12:30 ", "2021-3-5 12:30:0.0" + utc + "0x001F");
    expectRead("2021-03-05T12:30\0"s, "2021-3-5 12:30:0.0" + utc + "0x001F");
    expectRead("2021-03-05T12:30.25", "2021-3-5 12:30:0.0" + utc + "0x001F");
    expectRead("2021-03-05T12:30:45,25", "2021-3-5 12:30:45.0" + utc + "0x003F");
    expectRead("2021-03-05T12:30:45Zebra", "2021-3-5 12:30:45.0" + utc + "0x00BF");
    expectRead("2021-03-05T12:30:45z", "2021-3-5 12:30:45.0" + utc + "0x003F");
    expectRead("2021-03-05T12:30:45 +01:00", "2021-3-5 12:30:45.0" + utc + "0x003F");
    expectRead("2021-03-05T12:30:45+01:30 and more", "2021-3-5 12:30:45.0 | 1 1:30 | 0x03BF");
}

TEST_F(CTimeDateTimeISOTest, BlanksAndSignsCountAsCharactersOfAPart) {
    expectRead(" \t\n2021-03-05", "2021-3-5 0:0:0.0" + utc + "0x0007");
    expectRead("2021- 3- 5T 8: 5: 9", "2021-3-5 8:5:9.0" + utc + "0x003F");
    expectRead("2021-+3-+5T+8:-0", "2021-3-5 8:0:0.0" + utc + "0x001F");
    expectRead("2021-03-05T12:30:45. 5+ 1:+2", "2021-3-5 12:30:45.5 | 1 1:2 | 0x03FF");
    expectRefused("2021- 03-05");
    expectRefused("2021-03-05T -8:05");
    expectRefused("2021-03-05T-8:05");
    expectRefused("2021-03-05T12:30--5:00");
    // The end comes before any number does, and at the end only characters are counted.
    expectRead("2021-  ", "2021-1-1 0:0:0.0" + utc + "0x0003");
    expectRead("2021-03-05T  ", "2021-3-5 0:0:0.0" + utc + "0x000F");
    expectRead("2021-03-05T +", "2021-3-5 0:0:0.0" + utc + "0x000F");
    expectRead("2021-03-05T12:30+  ", "2021-3-5 12:30:0.0 | 1 0:0 | 0x019F");
    expectRefused("2021-03-05T ");
    expectRefused("2021-03-05T   ");
    expectRefused("2021-03-05T  :30");
}

TEST_F(CTimeDateTimeISOTest, TheSeparatorIsTheCallers) {
    std::string const value = "2021-3-5 12:30:0.0" + utc + "0x001F";
    expectRead("2021-03-05 12:30", value, ' ');
    expectRead("2021-03-05-12:30", value, '-');
    expectRead("2021-03-05\xFF"
               "12:30",
               value, '\xFF');
    expectRead("2021-03-05", "2021-3-5 0:0:0.0" + utc + "0x0007", ' ');
    expectRefused("2021-03-05T12:30", 't');
    // A digit belongs to the number in front of it.
    expectRefused("2021-03-05012:30", '0');
}

TEST_F(CTimeDateTimeISOTest, NoSeparatorIsTakenForZero) {
    expectRead("2021-03-05 8:30", "2021-3-5 8:30:0.0" + utc + "0x001F", 0);
    expectRead("2021-03-05+8:30", "2021-3-5 8:30:0.0" + utc + "0x001F", 0);
    expectRead("2021-03-05", "2021-3-5 0:0:0.0" + utc + "0x0007", 0);
    expectRefused("2021-03-05 08:30", 0);
    expectRefused("2021-03-0508:30", 0);
    expectRefused("2021-03-05T08:30", 0);
    expectRefused("2021-03-05\0T08:30"s, 0);
    expectRefused("2021-03-05\0"
                  "08:30"s,
                  0);
}

TEST_F(CTimeDateTimeISOTest, AnEmptyTextIsMissing) {
    expectRead("", "TimeDateTime: Argument @(type) is missing|type=ISO date|s=");
}

TEST_F(CTimeDateTimeISOTest, MonthAndDateAreTested) {
    expectRead("2021-13-05", badMonth("13"));
    expectRead("2021-00-05", badMonth("0"));
    expectRead("2021-99-99T12:30", badMonth("99"));
    expectRead("2021-02-30", badDate("2021/2/30"));
    expectRead("2021-02-00", badDate("2021/2/0"));
    expectRead("1399-12-31", badDate("1399/12/31"));
    expectRead("1400-01-01", "1400-1-1 0:0:0.0" + utc + "0x0007");
    expectRead("+021-01-01", badDate("21/1/1"));
    expectRead("-000-01-01", badDate("0/1/1"));
    expectRefused("-021-01-01");
    expectRead("2021- -", badMonth("0"));
    expectRead("2021-03- +", badDate("2021/3/0"));
    // The form is tested before what it says.
    expectRefused("2021-13-05T12:3");
    expectRead("2021-13-05T99:99:99+99:99", badMonth("13"));
}

TEST_F(CTimeDateTimeISOTest, BlanksAloneAreNoDate) {
    // Where the position is not known it counts as one before the first.
    expectRead("   ", badDate("0/1/1"));
    for (char const* const text : {" ", "  ", "    ", "     "})
        expectRefused(text);
}

TEST_F(CTimeDateTimeISOTest, AFailureNamesTheLineOfItsPart) {
    auto const read = [](std::string const& text) {
        CDateTime::readDateTimeFromISO(text, 'T', nullptr);
    };
    TimeTest::expectLinesInOrder(
        {"x", "2021x", "2021-x", "2021-03x", "2021-03-x", "2021-03-05x", "2021-03-05Tx",
         "2021-03-05T12x", "2021-03-05T12:x", "2021-03-05T12:30:x", "2021-03-05T12:30:45.x",
         "2021-03-05T12:30:45+x", "2021-03-05T12:30:45+01x", "2021-03-05T12:30:45+01:x"},
        read);
}

TEST_F(CTimeDateTimeISOTest, TimesAreNotTested) {
    expectRead("2021-03-05T99:61:62.99+99:99", "2021-3-5 99:61:62.99 | 1 99:99 | 0x03FF");
}

TEST_F(CTimeDateTimeISOTest, AFailureLeavesInTheZoneWhatWasRead) {
    onBothRoads([] {
        auto const zoneAfter = [](std::string const& text) {
            CTimeZone zone(CTimeZone::etzPlus, 7, 7);
            EXPECT_THROW(CDateTime::readDateTimeFromISO(text, zone, true, 'T', nullptr),
                         Time::TExcTimeDateTime);
            return show(zone);
        };
        EXPECT_EQ(zoneAfter(""), "1 7:7");
        EXPECT_EQ(zoneAfter("2021-13-05T12:30-05:30"), "-1 5:30");
        EXPECT_EQ(zoneAfter("2021-02-30T12:30+01"), "1 1:0");
        EXPECT_EQ(zoneAfter("2021-02-30T12:30-01:x"), "-1 1:0");
        EXPECT_EQ(zoneAfter("2021-02"
                            "x"),
                  "0 0:0");
    });
}

TEST_F(CTimeDateTimeISOTest, ALocaleThatGroupsDigitsReadsSoHere) {
    TimeTest::CGroupingLocale const global(',', "\2");
    EXPECT_EQ(readISO("2,02-03-05"), badDate("202/3/5"));
    EXPECT_EQ(readISO("2021-03-05"), "2021-3-5 0:0:0.0" + utc + "0x0007");
    EXPECT_EQ(readISO("2021-1,2"),
              "TimeDateTime: " + TimeTest::wrongArgument("ISO date", "2021-1,2", "Invalid format"));
}

TEST_F(CTimeDateTimeISOTest, ALocaleThatReadsNumbersItsOwnWayIsAsked) {
    StdUtilTest::CGlobalLocale const global(new TimeTest::CNumbersAhead);
    EXPECT_EQ(readISO("2021-03-05T12:30:45+01:30"), "2022-4-6 13:31:46.0 | 1 2:31 | 0x03BF");
}

TEST_F(CTimeDateTimeISOTest, TextsBeyondASCIIComeBackInTheFailure) {
    expectRefused("2021-03-05T\xC3\xA9");
}

TEST_F(CTimeDateTimeISOTest, AFailureThatCannotBeQuotedIsOneOfTheConversion) {
    onBothRoads([] {
        for (char const* const text : {"\xFF", "2021\xFF", "2021-03-05T\xC3", "2021-03-05T12\xE9"})
            EXPECT_EQ(readISO(text).find("Encoding: "), 0U) << text;
    });
    expectRead("2021-03-05T12:30\xFF", "2021-3-5 12:30:0.0" + utc + "0x001F");
}

// Into the local zone.

std::string movedISO(std::string const& text) {
    return TimeTest::valueIn(readISO(text, true));
}

TEST_F(CTimeDateTimeISOTest, ATextWithoutAZoneIsMovedAsOneOfUTC) {
    CZone const zone("Asia/Kolkata");
    CClockInHand const clock(march);
    onBothRoads([] {
        EXPECT_EQ(readISO("2021-07-05T12:30", true), "2021-7-5 18:0:0.0" + utc + "0x001F");
        EXPECT_EQ(movedISO("2021-07-05T12:30Z"), "2021-7-5 18:0:0.0");
        EXPECT_EQ(movedISO("2021-12-31T23:59:59.25"), "2022-1-1 5:29:59.25");
        EXPECT_EQ(movedISO("2021"), "2021-1-1 5:30:0.0");
    });
}

TEST_F(CTimeDateTimeISOTest, TheOffsetsAreSubtracted) {
    CZone const zone("Asia/Kolkata");
    CClockInHand const clock(march);
    onBothRoads([] {
        EXPECT_EQ(readISO("2021-07-05T12:30+01:00", true), "2021-7-5 17:0:0.0 | 1 1:0 | 0x039F");
        EXPECT_EQ(movedISO("2021-07-05T12:30+05:30"), "2021-7-5 12:30:0.0");
        EXPECT_EQ(movedISO("2021-07-05T00:30+06"), "2021-7-5 0:0:0.0");
        EXPECT_EQ(movedISO("2021-01-01T00:10+06"), "2020-12-31 23:40:0.0");
        EXPECT_EQ(movedISO("2021-07-05T12:30-01:30"), "2021-7-5 19:30:0.0");
        EXPECT_EQ(movedISO("2021-07-05T12:30+99:99"), "2021-7-1 13:21:0.0");
    });
}

TEST_F(CTimeDateTimeISOTest, AnHourOutOfTheDayIsRolledByAMoveOnly) {
    CClockInHand const clock(march);
    onBothRoads([] {
        CZone const utcZone("UTC");
        EXPECT_EQ(movedISO("2021-03-05T99:00Z"), "2021-3-5 99:0:0.0");
        EXPECT_EQ(movedISO("2021-03-05T99:61:62"), "2021-3-5 99:61:62.0");
        CZone const zone("Asia/Kolkata");
        EXPECT_EQ(movedISO("2021-03-05T99:00+05:30"), "2021-3-5 99:0:0.0");
        EXPECT_EQ(movedISO("2021-03-05T99:00Z"), "2021-3-6 80:30:0.0");
    });
}

TEST_F(CTimeDateTimeISOTest, ALocalZoneBehindUTCCountsAsOneAhead) {
    CZone const zone("America/New_York");
    CClockInHand const clock(march);
    onBothRoads([] {
        EXPECT_EQ(movedISO("2021-07-05T12:30Z"), "2021-7-5 17:30:0.0");
        EXPECT_EQ(movedISO("2021-07-05T12:30-05:00"), "2021-7-5 22:30:0.0");
        EXPECT_EQ(movedISO("2021-07-05T12:30+05:00"), "2021-7-5 12:30:0.0");
    });
}

TEST_F(CTimeDateTimeISOTest, TheOffsetIsThatOfThisMoment) {
    CZone const zone("Europe/Dublin");
    {
        CClockInHand const clock(march);
        EXPECT_EQ(movedISO("2021-07-05T12:30Z"), "2021-7-5 12:30:0.0");
    }
    CClockInHand const clock(TimeTest::july);
    EXPECT_EQ(movedISO("2021-01-05T12:30Z"), "2021-1-5 13:30:0.0");
}

TEST_F(CTimeDateTimeISOTest, TheShortFormMovesAndDropsTheZone) {
    CZone const zone("XYZ-1");
    CClockInHand const clock(march);
    CDateTime::TParts parts = TimeTest::untouchedParts;
    EXPECT_EQ(show(CDateTime::readDateTimeFromISO("2021-03-05T12:30+03", 'T', &parts)),
              "2021-3-5 10:30:0.0");
    EXPECT_EQ(parts, 0x019F);
    EXPECT_EQ(show(CDateTime::readDateTimeFromISO("2021-03-05", 'T', nullptr)), "2021-3-5 1:0:0.0");
}

TEST_F(CTimeDateTimeISOTest, AFailedMoveStoresNoParts) {
    CClockInHand const clock(march);
    clock.loseUTC();
    onBothRoads([] {
        EXPECT_NE(readISO("2021-03-05", true).find("gmtime_r( &currTime, &tm_utc)"),
                  std::string::npos);
    });
}

TEST_F(CTimeDateTimeISOTest, WhatIsWrittenIsRead) {
    CTimeZone const zone(CTimeZone::etzMinus, 5, 30);
    onBothRoads([&] {
        EXPECT_EQ(readISO(TimeTest::narrow(sample.getAsISOdate(zone))),
                  "2021-3-5 8:5:9.0 | -1 5:30 | 0x03BF");
    });
}

} // namespace
