#include "1Base/Error/Error.h"
#include "2System/Time/TimeClockInHand.h"
#include "2System/Time/TimeDateTime.h"
#include "2System/Time/TimeFailureLines.h"
#include "2System/Time/TimeLocales.h"
#include "2System/Time/TimeReadOutcome.h"
#include "2System/Time/TimeRoads.h"
#include "support/LogRecorder.h"
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

using CTimeDateTimePDFTest = TestSupport::CObjectCountTest;

CDateTime const sample(5, CDate::emMar, 2021, 8, 5, 9, 123);

// Writing.

void expectWritten(std::string const& expected, CTimeZone const& zone,
                   CDateTime const& value = sample) {
    onBothRoads([&] { EXPECT_EQ(value.getAsPDFdate(zone), expected) << show(zone); });
}

TEST_F(CTimeDateTimePDFTest, ADateIsWrittenWithItsZone) {
    expectWritten("D:20210305080509", CTimeZone());
    expectWritten("D:20210305080509", CTimeZone(CTimeZone::etzNone, 1, 30));
    expectWritten("D:20210305080509Z", CTimeZone(CTimeZone::etzUTC, 1, 30));
    expectWritten("D:20210305080509+01'00'", CTimeZone(CTimeZone::etzPlus, 1, 0));
    expectWritten("D:20210305080509-05'30'", CTimeZone(CTimeZone::etzMinus, 5, 30));
    expectWritten("D:20210305080509-05'30'", CTimeZone(CTimeZone::etzMinus, -5, -30));
    expectWritten("D:20210305080509+100'2147483647'", CTimeZone(CTimeZone::etzPlus, 100, -INT_MAX));
}

TEST_F(CTimeDateTimePDFTest, AnUnknownZoneFailsAnAssertion) {
    CTimeZone const zone(static_cast<CTimeZone::EType>(-3), 0, 0);
    onBothRoads([&] {
        EXPECT_EQ(TestSupport::failedCheckOf([&] { sample.getAsPDFdate(zone); }),
                  "!\"Unknown time zone type\"");
    });
}

TEST_F(CTimeDateTimePDFTest, BlanksFillTheYearAndZerosTheRest) {
    std::tm time = {};
    time.tm_year = 21 - 1900;
    time.tm_mon = -1;
    time.tm_hour = -10;
    time.tm_min = 100;
    expectWritten("D:  210000-1010000", CTimeZone(), CDateTime(time));
}

TEST_F(CTimeDateTimePDFTest, ALocaleThatGroupsDigitsDoesSoHere) {
    TimeTest::CGroupingLocale const global(',', "\3");
    EXPECT_EQ(sample.getAsPDFdate(CTimeZone()), "D:2,0210305080509");
}

TEST_F(CTimeDateTimePDFTest, TheZoneOfThisMomentIsWritten) {
    CClockInHand const clock(march);
    for (auto const& [name, text] :
         {std::pair{"UTC", "D:20210305080509Z"}, std::pair{"Europe/Dublin", "D:20210305080509Z"},
          std::pair{"America/New_York", "D:20210305080509-05'00'"},
          std::pair{"America/St_Johns", "D:20210305080509-03'30'"},
          std::pair{"Asia/Kolkata", "D:20210305080509+05'30'"},
          std::pair{"Pacific/Apia", "D:20210305080509+14'00'"},
          std::pair{"EST5EDT,M3.2.0,M11.1.0", "D:20210305080509-05'00'"}}) {
        CZone const zone(name);
        onBothRoads([&, expected = text] { EXPECT_EQ(sample.getAsPDFdate(), expected); });
    }
}

// Reading.

// Value, zone and parts, or the failure with the parts untouched.
std::string readPDF(std::string const& text, bool toLocal = false) {
    TimeTest::CReadOutcome const read = TimeTest::readPDF(text, toLocal);
    EXPECT_TRUE(read.value || read.parts == TimeTest::untouchedParts);
    return show(read);
}

void expectRead(std::string const& text, std::string const& expected) {
    onBothRoads([&] { EXPECT_EQ(readPDF(text), expected) << text; });
}

std::string invalidFormat(std::string const& text) {
    return "TimeDateTime: " + TimeTest::wrongArgument("PDF date", text, "Invalid format");
}

void expectRefused(std::string const& text) {
    expectRead(text, invalidFormat(text));
}

// A number that the stream refused, which tells its state.
void expectNoNumber(std::string const& text, std::ios_base::iostate state) {
    expectRead(text, invalidFormat(text) + "|stream_name=iss|is.rdstate()=" +
                         std::to_string(static_cast<int>(state)));
}

constexpr std::ios_base::iostate failed = std::ios_base::failbit;
constexpr std::ios_base::iostate failedAtEnd = std::ios_base::failbit | std::ios_base::eofbit;

std::string const none = " | -2 0:0 | ";

TEST_F(CTimeDateTimePDFTest, ATextMayEndBehindAnyPart) {
    expectRead("D:2021", "2021-1-1 0:0:0.0" + none + "0x0001");
    expectRead("2021", "2021-1-1 0:0:0.0" + none + "0x0001");
    expectRead("D:202103", "2021-3-1 0:0:0.0" + none + "0x0003");
    expectRead("D:20210305", "2021-3-5 0:0:0.0" + none + "0x0007");
    expectRead("D:2021030512", "2021-3-5 12:0:0.0" + none + "0x000F");
    expectRead("D:202103051230", "2021-3-5 12:30:0.0" + none + "0x001F");
    expectRead("D:20210305120000", "2021-3-5 12:0:0.0" + none + "0x003F");
    expectRead("20210305123045", "2021-3-5 12:30:45.0" + none + "0x003F");
}

TEST_F(CTimeDateTimePDFTest, AZoneMayFollow) {
    expectRead("D:20210305120000Z", "2021-3-5 12:0:0.0 | 0 0:0 | 0x00BF");
    expectRead("D:20210305120000+01'30'", "2021-3-5 12:0:0.0 | 1 1:30 | 0x03BF");
    expectRead("D:20210305120000-05'00'", "2021-3-5 12:0:0.0 | -1 5:0 | 0x03BF");
    expectRead("D:20210305120000+01'30", "2021-3-5 12:0:0.0 | 1 1:30 | 0x01BF");
    expectRead("D:20210305120000+01'", "2021-3-5 12:0:0.0 | 1 1:0 | 0x01BF");
    expectRead("D:20210305120000-00'30", "2021-3-5 12:0:0.0 | -1 0:30 | 0x01BF");
}

TEST_F(CTimeDateTimePDFTest, NoOffsetIsNoZone) {
    expectRead("D:20210305120000+00'00'", "2021-3-5 12:0:0.0 | -2 0:0 | 0x03BF");
    expectRead("D:20210305120000-00'00'", "2021-3-5 12:0:0.0 | -2 0:0 | 0x03BF");
    expectRead("D:20210305120000+00'00", "2021-3-5 12:0:0.0 | -2 0:0 | 0x01BF");
    expectRead("D:20210305120000+00'", "2021-3-5 12:0:0.0 | -2 0:0 | 0x01BF");
    expectRead("D:20210305120000+-0'0'", "2021-3-5 12:0:0.0 | -2 0:0 | 0x03BF");
}

TEST_F(CTimeDateTimePDFTest, ANonDigitPassesAllObjectsBehind) {
    expectRead("D:2021+01'00'", "2021-1-1 0:0:0.0 | 1 1:0 | 0x03BF");
    expectRead("D:2021Z", "2021-1-1 0:0:0.0 | 0 0:0 | 0x00BF");
    expectRead("D:202103Z", "2021-3-1 0:0:0.0 | 0 0:0 | 0x00BF");
    expectRead("D:20210305-05'00", "2021-3-5 0:0:0.0 | -1 5:0 | 0x01BF");
    expectRead("D:202103051230 Z", "2021-3-5 12:30:0.0 | 0 0:0 | 0x00BF");
    // The rest of an object's two places is passed with it.
    expectRead("D:20213x05Z", "2021-3-5 0:0:0.0 | 0 0:0 | 0x00BF");
    expectRead("D:20213", "2021-3-1 0:0:0.0" + none + "0x0003");
    expectRead("D:2021030512304", "2021-3-5 12:30:4.0" + none + "0x003F");
}

TEST_F(CTimeDateTimePDFTest, AYearIsAsLongAsItsNumber) {
    expectRead("D:2021", "2021-1-1 0:0:0.0" + none + "0x0001");
    auto const badYear = [](std::string const& year) { return badDate(year + "/1/1"); };
    expectRead("D:202", badYear("202"));
    expectRead("D:  21", badYear("21"));
    expectRead("D:+021", badYear("21"));
    expectRead("D:-021", badYear("-21"));
    expectRead("D:20x1", badYear("20"));
    expectRead("9", badYear("9"));
}

TEST_F(CTimeDateTimePDFTest, AYearThatIsNoneTellsTheStreamsState) {
    expectNoNumber("D:", failedAtEnd);
    expectNoNumber("D:    ", failedAtEnd);
    expectNoNumber("D:-", failedAtEnd);
    expectNoNumber("D:D:20210305", failed);
    expectNoNumber("x", failed);
    expectNoNumber("D:-x21", failed);
    expectNoNumber("d:20210305", failed);
    expectNoNumber(" D:20210305", failed);
    expectNoNumber("\0"s, failed);
}

TEST_F(CTimeDateTimePDFTest, ADHasAColonBehindIt) {
    expectRefused("D2021");
    expectRefused("D");
    expectRefused("DD:2021");
    expectRefused("D 2021");
    expectRefused("D\0"s);
}

TEST_F(CTimeDateTimePDFTest, AZoneHasItsApostrophes) {
    expectRefused("D:20210305120000+01");
    expectRefused("D:20210305120000+01:30");
    expectRefused("D:20210305120000+0130");
    expectRefused("D:20210305120000+01'3x");
    expectRefused("D:20210305120000+01'30x");
    expectRefused("D:20210305120000+01'x");
    expectRefused("D:20210305120000+01'\0"s);
    expectRefused("D:20210305120000+01'30 ");
    expectRefused("D:20210305120000+01'99999999999'");
}

TEST_F(CTimeDateTimePDFTest, AZoneBeginsWithZOrASign) {
    expectRefused("D:20210305120000X");
    expectRefused("D:20210305120000z");
    expectRefused("D:202103051200007");
    expectRefused("D:20210305120000'");
    expectRefused("D:20210305120000 ");
    expectRefused("D:20210305120000\0"s);
    expectRefused("D:20210305120000 \t\n");
    expectRefused("D:2021-03-05"); // hours of a zone
}

TEST_F(CTimeDateTimePDFTest, ZoneHoursThatAreNoneTellTheStreamsState) {
    expectNoNumber("D:20210305120000+", failedAtEnd);
    expectNoNumber("D:20210305120000+ ", failedAtEnd);
    expectNoNumber("D:20210305120000+'", failed);
    expectNoNumber("D:20210305120000-x'", failed);
    expectNoNumber("D:20210305120000+99999999999'00'", failed);
    expectNoNumber("D:20210305120000+99999999999", failedAtEnd);
}

TEST_F(CTimeDateTimePDFTest, TheStreamsNumbersAreTakenInAZone) {
    expectRead("D:20210305120000 + 1 ' 30 '", "2021-3-5 12:0:0.0 | 1 1:30 | 0x03BF");
    expectRead("D:20210305120000--5'00'", "2021-3-5 12:0:0.0 | -1 -5:0 | 0x03BF");
    expectRead("D:20210305120000+001'030'", "2021-3-5 12:0:0.0 | 1 1:30 | 0x03BF");
    expectRead("D:20210305120000+1'5", "2021-3-5 12:0:0.0 | 1 1:5 | 0x01BF");
    // A number that fails at the end of the text is taken as it is left.
    expectRead("D:20210305120000+01'-", "2021-3-5 12:0:0.0 | 1 1:0 | 0x01BF");
    expectRead("D:20210305120000+01'  ", "2021-3-5 12:0:0.0 | 1 1:0 | 0x01BF");
    expectRead("D:20210305120000+01'99999999999", "2021-3-5 12:0:0.0 | 1 1:2147483647 | 0x01BF");
}

TEST_F(CTimeDateTimePDFTest, WhatFollowsTheZoneIsPassedOver) {
    expectRead("D:20210305120000Zebra", "2021-3-5 12:0:0.0 | 0 0:0 | 0x00BF");
    expectRead("D:20210305120000+01'30' and more", "2021-3-5 12:0:0.0 | 1 1:30 | 0x03BF");
    expectRead("D:20210305120000+01'30'\0"s, "2021-3-5 12:0:0.0 | 1 1:30 | 0x03BF");
}

TEST_F(CTimeDateTimePDFTest, AnEmptyTextIsMissing) {
    expectRead("", "TimeDateTime: Argument @(type) is missing|type=PDF date|s=");
}

TEST_F(CTimeDateTimePDFTest, MonthAndDateAreTestedBeforeTheZone) {
    expectRead("D:20211305", badMonth("13"));
    expectRead("D:202100", badMonth("0"));
    expectRead("D:20219999996199X", badMonth("99"));
    expectRead("D:20210230", badDate("2021/2/30"));
    expectRead("D:20210230120000X", badDate("2021/2/30"));
    expectRead("D:13991231", badDate("1399/12/31"));
    expectRead("D:14000101", "1400-1-1 0:0:0.0" + none + "0x0007");
}

TEST_F(CTimeDateTimePDFTest, AFailureNamesTheLineOfItsPart) {
    auto const read = [](std::string const& text) {
        CDateTime::readDateTimeFromPDF(text, nullptr);
    };
    TimeTest::expectLinesInOrder(
        {"Dx", "D:x", "D:2021x", "D:2021+x", "D:2021+01x", "D:2021+01'30x", "D:2021+01'x"}, read);
}

TEST_F(CTimeDateTimePDFTest, TimesAreNotTested) {
    expectRead("D:20210305996199", "2021-3-5 99:61:99.0" + none + "0x003F");
    expectRead("D:20210305996199+99'99'", "2021-3-5 99:61:99.0 | 1 99:99 | 0x03BF");
}

TEST_F(CTimeDateTimePDFTest, ALocaleThatReadsNumbersItsOwnWayIsAsked) {
    StdUtilTest::CGlobalLocale const global(new TimeTest::CNumbersAhead);
    EXPECT_EQ(readPDF("D:20210305123045+01'30'"), "2022-4-6 13:31:46.0 | 1 2:31 | 0x03BF");
}

TEST_F(CTimeDateTimePDFTest, AFailureLeavesInTheZoneWhatWasRead) {
    onBothRoads([] {
        auto const zoneAfter = [](std::string const& text) {
            CTimeZone zone(CTimeZone::etzPlus, 7, 7);
            EXPECT_THROW(CDateTime::readDateTimeFromPDF(text, zone, true, nullptr),
                         Time::TExcTimeDateTime);
            return show(zone);
        };
        EXPECT_EQ(zoneAfter(""), "1 7:7");
        EXPECT_EQ(zoneAfter("D2021"), "-2 0:0");
        EXPECT_EQ(zoneAfter("D:20210230120000-05'30'"), "-2 0:0");
        EXPECT_EQ(zoneAfter("D:20210305120000-05"), "-1 5:0");
        EXPECT_EQ(zoneAfter("D:20210305120000+05'30x"), "1 5:30");
    });
}

TEST_F(CTimeDateTimePDFTest, ABadDateIsLogged) {
    TestSupport::CLogRecorder const recorder;
    TestSupport::CInstalledTarget<Error::TTgtLogger, Error::TSevError> const installed(recorder);
    readPDF("D:20210230");
    ASSERT_EQ(recorder.records().size(), 1U);
    EXPECT_EQ(recorder.records()[0].expanded,
              L"'Time::CDate::CDate()': Invalid date \"2021/2/30\"!");
}

TEST_F(CTimeDateTimePDFTest, AFailureThatCannotBeQuotedIsOneOfTheConversion) {
    onBothRoads([] {
        for (char const* const text : {"\xFE\xFF", "D:2021\xFF", "D:20210305+\xC3", "D\xE9"})
            EXPECT_EQ(readPDF(text).find("Encoding: "), 0U) << text;
    });
    expectRead("D:20210305Z\xFF", "2021-3-5 0:0:0.0 | 0 0:0 | 0x00BF");
}

// Into the local zone.

std::string movedPDF(std::string const& text) {
    return TimeTest::valueIn(readPDF(text, true));
}

TEST_F(CTimeDateTimePDFTest, ATextWithoutAZoneIsNotMoved) {
    CZone const zone("Asia/Kolkata");
    CClockInHand const clock(march);
    onBothRoads([] {
        EXPECT_EQ(readPDF("D:20210705123000", true), "2021-7-5 12:30:0.0" + none + "0x003F");
        EXPECT_EQ(CClockInHand::asked(), 0);
        EXPECT_EQ(movedPDF("D:2021"), "2021-1-1 0:0:0.0");
    });
}

TEST_F(CTimeDateTimePDFTest, TheOffsetsAreSubtracted) {
    CZone const zone("Asia/Kolkata");
    CClockInHand const clock(march);
    onBothRoads([] {
        EXPECT_EQ(movedPDF("D:20210705123000Z"), "2021-7-5 18:0:0.0");
        EXPECT_EQ(readPDF("D:20210705123000+01'00'", true), "2021-7-5 17:0:0.0 | 1 1:0 | 0x03BF");
        EXPECT_EQ(movedPDF("D:20210705123000+05'30'"), "2021-7-5 12:30:0.0");
        EXPECT_EQ(movedPDF("D:20210101001000+06'00'"), "2020-12-31 23:40:0.0");
        EXPECT_EQ(movedPDF("D:20210705123000-01'30"), "2021-7-5 19:30:0.0");
        // No offset is no zone to the caller, but it is moved.
        EXPECT_EQ(readPDF("D:20210705123000+00'00'", true), "2021-7-5 18:0:0.0 | -2 0:0 | 0x03BF");
        EXPECT_EQ(movedPDF("D:2021+01'00'"), "2021-1-1 4:30:0.0");
    });
}

TEST_F(CTimeDateTimePDFTest, AnHourOutOfTheDayIsRolledByAMoveOnly) {
    CClockInHand const clock(march);
    onBothRoads([] {
        CZone const utcZone("UTC");
        EXPECT_EQ(movedPDF("D:20210305990000Z"), "2021-3-5 99:0:0.0");
        CZone const zone("Asia/Kolkata");
        EXPECT_EQ(movedPDF("D:20210305990000+05'30'"), "2021-3-5 99:0:0.0");
        EXPECT_EQ(movedPDF("D:20210305990000"), "2021-3-5 99:0:0.0");
        EXPECT_EQ(movedPDF("D:20210305990000Z"), "2021-3-6 80:30:0.0");
    });
}

TEST_F(CTimeDateTimePDFTest, ALocalZoneBehindUTCCountsAsOneAhead) {
    CZone const zone("America/New_York");
    CClockInHand const clock(march);
    onBothRoads([] {
        EXPECT_EQ(movedPDF("D:20210705123000Z"), "2021-7-5 17:30:0.0");
        EXPECT_EQ(movedPDF("D:20210705123000-05'00'"), "2021-7-5 22:30:0.0");
        EXPECT_EQ(movedPDF("D:20210705123000+05'00'"), "2021-7-5 12:30:0.0");
    });
}

TEST_F(CTimeDateTimePDFTest, AnOffsetOfManyMinutesWraps) {
    CZone const zone("UTC");
    CClockInHand const clock(march);
    // 3600 + 60 * 2147483647 seconds are 3540 in 32 bits.
    EXPECT_EQ(movedPDF("D:20210305120000+01'99999999999"), "2021-3-5 11:1:0.0");
    // 60 * 536870912 seconds are the lowest number there, whose negation is itself.
    std::string const early = "1953-2-15 8:45:52.0";
    EXPECT_EQ(movedPDF("D:20210305120000+00'536870912"), early);
    EXPECT_EQ(movedPDF("D:20210305120000-00'536870912"), early);
}

TEST_F(CTimeDateTimePDFTest, TheShortFormMovesAndDropsTheZone) {
    CZone const zone("XYZ-1");
    CClockInHand const clock(march);
    CDateTime::TParts parts = TimeTest::untouchedParts;
    EXPECT_EQ(show(CDateTime::readDateTimeFromPDF("D:20210305123000+03'00'", &parts)),
              "2021-3-5 10:30:0.0");
    EXPECT_EQ(parts, 0x03BF);
    EXPECT_EQ(show(CDateTime::readDateTimeFromPDF("D:20210305", nullptr)), "2021-3-5 0:0:0.0");
}

TEST_F(CTimeDateTimePDFTest, AFailedMoveStoresNoParts) {
    CClockInHand const clock(march);
    clock.loseLocal();
    onBothRoads([] {
        EXPECT_NE(readPDF("D:20210305120000Z", true).find("localtime_r( &currTime, &tm_local)"),
                  std::string::npos);
    });
}

TEST_F(CTimeDateTimePDFTest, WhatIsWrittenIsRead) {
    CTimeZone const zone(CTimeZone::etzMinus, -5, -30);
    onBothRoads([&] {
        EXPECT_EQ(readPDF(sample.getAsPDFdate(zone)), "2021-3-5 8:5:9.0 | -1 5:30 | 0x03BF");
    });
}

} // namespace
