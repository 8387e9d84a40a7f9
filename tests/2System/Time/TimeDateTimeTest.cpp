#include "2System/Time/TimeDateTime.h"

#include "1Base/Error/Error.h"
#include "2System/Time/TimeDateFields.h"
#include "2System/Time/TimeExc.h"
#include "2System/Time/TimeOutcome.h"
#include "support/LogRecorder.h"
#include "support/ObjectCount.h"
#include "support/TextFailures.h"
#include "support/Zone.h"

#include <array>
#include <cstdio>
#include <cstring>
#include <ctime>
#include <iterator>
#include <limits>
#include <random>
#include <sstream>
#include <string>
#include <type_traits>

namespace {

using Time::CDate;
using Time::CDateTime;
using Time::CTime;
using TimeTest::outcomeOf;
using TimeTest::show;

using CTimeDateTimeTest = TestSupport::CObjectCountTest;

constexpr unsigned int most = std::numeric_limits<unsigned int>::max();
constexpr int highest = std::numeric_limits<int>::max();
constexpr int lowest = std::numeric_limits<int>::min();

CDateTime moment(int year, int month, int day, int hour, int minute, int second,
                 int milliSecond = 0) {
    return CDateTime(day, static_cast<CDate::EMonth>(month), year, hour, minute, second,
                     milliSecond);
}

std::tm brokenDown(int year, int month, int day, int hour, int minute, int second) {
    std::tm time = {};
    time.tm_year = year - 1900;
    time.tm_mon = month - 1;
    time.tm_mday = day;
    time.tm_hour = hour;
    time.tm_min = minute;
    time.tm_sec = second;
    return time;
}

std::string const invalidDate = TimeTest::badDate("2021/13/5");

// Values.

static_assert(std::is_base_of_v<CDate, CDateTime> && std::is_base_of_v<CTime, CDateTime>);
static_assert(!std::is_polymorphic_v<CDateTime>);
static_assert(sizeof(CDateTime) == sizeof(CDate) + sizeof(CTime));

TEST_F(CTimeDateTimeTest, BothHalvesAreThere) {
    CDateTime const value(CTime(8, 5, 9, 123), CDate(5, CDate::emMar, 2021));
    EXPECT_EQ(show(value), "2021-3-5 8:5:9.123");
    EXPECT_EQ(show(moment(2021, 3, 5, 8, 5, 9, 123)), "2021-3-5 8:5:9.123");
    EXPECT_TRUE(CDate(value) == CDate(5, CDate::emMar, 2021));
    EXPECT_EQ(CTime(value).getMilliSecond(), 123);
    TestSupport::CZone const zone("UTC"); // whose weekdays are in order
    EXPECT_EQ(value.getDayOfWeek(), CDate::ewdFri);
}

TEST_F(CTimeDateTimeTest, TheDateIsCheckedAndTheTimeIsNot) {
    EXPECT_EQ(show(moment(2021, 3, 5, 99, -1, 61, 5000)), "2021-3-5 99:-1:61.5000");
    EXPECT_EQ(outcomeOf([] { return moment(2021, 13, 5, 0, 0, 0); }), invalidDate);
}

TEST_F(CTimeDateTimeTest, ABrokenDownTimeIsTakenAsItIs) {
    EXPECT_EQ(show(CDateTime(brokenDown(2021, 3, 5, 8, 5, 9))), "2021-3-5 8:5:9.0");
    EXPECT_EQ(show(CDateTime(brokenDown(1066, 0, 77, 99, 60, 61))), "1066-0-77 99:60:61.0");
}

TEST_F(CTimeDateTimeTest, TheDateLiesBeforeTheTime) {
    CDateTime const value = moment(2021, 3, 5, 8, 5, 9, 123);
    std::array<int, 7> fields = {};
    static_assert(sizeof(fields) == sizeof(value));
    std::memcpy(fields.data(), &value, sizeof(value));
    EXPECT_EQ(fields, (std::array<int, 7>{5, 3, 2021, 123, 9, 5, 8}));
}

// Seconds.

CDateTime plus(CDateTime value, unsigned int seconds) {
    CDateTime& result = value.addSeconds(seconds);
    EXPECT_EQ(&result, &value);
    return value;
}

CDateTime minus(CDateTime value, unsigned int seconds) {
    CDateTime& result = value.subSeconds(seconds);
    EXPECT_EQ(&result, &value);
    return value;
}

TEST_F(CTimeDateTimeTest, SecondsRollTheDays) {
    CDateTime const last = moment(2021, 12, 31, 23, 59, 59, 7);
    EXPECT_EQ(show(plus(last, 0)), "2021-12-31 23:59:59.7");
    EXPECT_EQ(show(plus(last, 1)), "2022-1-1 0:0:0.7");
    EXPECT_EQ(show(plus(last, 86399)), "2022-1-1 23:59:58.7");
    EXPECT_EQ(show(plus(last, 86400)), "2022-1-1 23:59:59.7");
    EXPECT_EQ(show(plus(last, 86401)), "2022-1-2 0:0:0.7");
    CDateTime const first = moment(2022, 1, 1, 0, 0, 0, 7);
    EXPECT_EQ(show(minus(first, 0)), "2022-1-1 0:0:0.7");
    EXPECT_EQ(show(minus(first, 1)), "2021-12-31 23:59:59.7");
    EXPECT_EQ(show(minus(first, 86399)), "2021-12-31 0:0:1.7");
    EXPECT_EQ(show(minus(first, 86400)), "2021-12-31 0:0:0.7");
    EXPECT_EQ(show(minus(first, 86401)), "2021-12-30 23:59:59.7");
}

TEST_F(CTimeDateTimeTest, TheMostSecondsAreHalfACenturyAndMore) {
    CDateTime const value = moment(2021, 1, 1, 0, 0, 0);
    EXPECT_EQ(show(plus(value, most)), "2157-2-7 6:28:15.0");
    EXPECT_EQ(show(minus(value, most)), "1884-11-24 17:31:45.0");
}

TEST_F(CTimeDateTimeTest, AnHourOutOfTheDayRollsOneDayOnly) {
    EXPECT_EQ(show(plus(moment(2021, 3, 5, 99, 0, 0), 0)), "2021-3-6 75:0:0.0");
    EXPECT_EQ(show(minus(moment(2021, 3, 5, -30, 0, 0), 0)), "2021-3-4 -6:0:0.0");
    EXPECT_EQ(show(plus(moment(2021, 3, 5, -30, 0, 0), 0)), "2021-3-5 -30:0:0.0");
    EXPECT_EQ(show(minus(moment(2021, 3, 5, 99, 0, 0), 0)), "2021-3-5 99:0:0.0");
}

TEST_F(CTimeDateTimeTest, ExtremeTimesWrap) {
    // The minute's carry takes the hour over the edge: below 24 it rolls nothing.
    EXPECT_EQ(show(plus(moment(2021, 3, 5, highest, 59, 59), 1)),
              "2021-3-5 " + std::to_string(lowest) + ":0:0.0");
    EXPECT_EQ(show(minus(moment(2021, 3, 5, lowest, 0, 0), 1)),
              "2021-3-5 " + std::to_string(highest) + ":59:59.0");
}

TEST_F(CTimeDateTimeTest, ADateThatIsNotCountedWithKeepsItsTime) {
    CDateTime value(brokenDown(2021, -1, 5, 8, 5, 9));
    char const* const text = "1<=month && 12>=month";
    EXPECT_EQ(TestSupport::failedCheckOf([&] { value.addSeconds(1); }), text);
    EXPECT_EQ(show(value), "2021--1-5 8:5:9.0");
    CDateTime behind(brokenDown(2021, 14, 5, 8, 5, 9));
    EXPECT_EQ(TestSupport::failedCheckOf([&] { behind.subSeconds(1); }), text);
    EXPECT_EQ(show(behind), "2021-14-5 8:5:9.0");
}

// Differences.

TEST_F(CTimeDateTimeTest, ADifferenceIsOneOfSeconds) {
    CDateTime const value = moment(2021, 3, 5, 8, 5, 9);
    EXPECT_EQ(value - value, 0);
    EXPECT_EQ(moment(2021, 3, 6, 8, 5, 10) - value, 86401);
    EXPECT_EQ(value - moment(2021, 3, 6, 8, 5, 10), -86401);
    EXPECT_EQ(moment(2021, 3, 5, 8, 5, 9, 999) - value, 0);
    EXPECT_EQ(moment(2021, 3, 5, 30, 0, 0) - moment(2021, 3, 5, 0, -1, 0), 108060);
}

TEST_F(CTimeDateTimeTest, ADifferenceCountsOnTheScaleOfDates) {
    EXPECT_EQ(moment(2100, 1, 1, 0, 0, 0) - moment(2099, 12, 31, 23, 59, 59), 86401);
    EXPECT_EQ(moment(1896, 1, 1, 0, 0, 0) - moment(1895, 12, 31, 23, 59, 59), -86399);
}

TEST_F(CTimeDateTimeTest, ADifferenceWrapsBeyond68Years) {
    // 36526 days on that scale are 3155846400 seconds.
    EXPECT_EQ(moment(2100, 1, 1, 0, 0, 0) - moment(2000, 1, 1, 0, 0, 0), -1139120896);
    EXPECT_EQ(moment(2021, 3, 5, highest, highest, highest) -
                  moment(2021, 3, 5, lowest, lowest, lowest),
              -(3600 + 60 + 1));
}

TEST_F(CTimeDateTimeTest, ADifferenceOfADateThatIsNoneRaises) {
    CDateTime const bad(brokenDown(2021, 13, 5, 0, 0, 0));
    CDateTime const good = moment(2021, 3, 5, 0, 0, 0);
    auto const difference = [](CDateTime const& left, CDateTime const& right) {
        return outcomeOf([&] { return std::to_string(left - right); });
    };
    EXPECT_EQ(difference(bad, good), invalidDate);
    EXPECT_EQ(difference(good, bad), invalidDate);
}

TEST_F(CTimeDateTimeTest, OfTwoDatesThatAreNoneTheLeftIsNamed) {
    CDateTime const left(brokenDown(2021, 13, 5, 0, 0, 0));
    CDateTime const right(brokenDown(2021, 2, 30, 0, 0, 0));
    EXPECT_EQ(outcomeOf([&] { return std::to_string(left - right); }), invalidDate);
    EXPECT_EQ(outcomeOf([&] { return std::to_string(right - left); }),
              TimeTest::badDate("2021/2/30"));
}

TEST_F(CTimeDateTimeTest, ADifferenceOfADateThatIsNoneIsLogged) {
    TestSupport::CLogRecorder const recorder;
    TestSupport::CInstalledTarget<Error::TTgtLogger, Error::TSevError> const installed(recorder);
    CDateTime const bad(brokenDown(2021, 13, 5, 0, 0, 0));
    EXPECT_EQ(outcomeOf([&] { return std::to_string(bad - bad); }), invalidDate);
    ASSERT_EQ(recorder.records().size(), 1U);
    EXPECT_EQ(recorder.records()[0].expanded,
              L"'Time::CDate::CDate()': Invalid date \"2021/13/5\"!");
}

// Comparison.

TEST_F(CTimeDateTimeTest, TheDateIsComparedBeforeTheTime) {
    CDateTime const early = moment(2021, 3, 5, 23, 0, 0);
    CDateTime const late = moment(2021, 3, 6, 1, 0, 0);
    EXPECT_TRUE(early < late && early <= late && late > early && late >= early && early != late);
    EXPECT_FALSE(late < early || late <= early || early > late || early >= late || early == late);
    CDateTime const later = moment(2021, 3, 6, 1, 0, 1);
    EXPECT_TRUE(late < later && late <= later && later > late && later >= late && late != later);
    EXPECT_FALSE(later < late || later <= late || late > later || late >= later || late == later);
}

TEST_F(CTimeDateTimeTest, MilliSecondsAreNotCompared) {
    CDateTime const left = moment(2021, 3, 5, 8, 5, 9, 1);
    CDateTime const right = moment(2021, 3, 5, 8, 5, 9, 999);
    EXPECT_TRUE(left == right && left <= right && left >= right);
    EXPECT_FALSE(left < right || left > right || left != right);
}

// Extremes.

// All that can be done with a value, as one text; each step may raise.
std::string everythingOf(CDateTime const& value, CDateTime const& other, unsigned int seconds) {
    Time::CTimeZone const zone(Time::CTimeZone::etzMinus, other.getHour(), other.getMinute());
    std::ostringstream stream;
    stream << value;
    return stream.str() + outcomeOf([&] { return plus(value, seconds); }) +
           outcomeOf([&] { return minus(value, seconds); }) +
           outcomeOf([&] { return std::to_string(value - other); }) +
           outcomeOf([&] { return std::to_string(value.getDayOfWeek()); }) +
           TimeTest::narrow(value.getAsISOdate(zone)) + value.getAsPDFdate(zone) +
           std::to_string(zone.getSeconds()) +
           TimeTest::narrow(value.format(L"DD M YYYY YY hh mm ss cc tt"));
}

TEST_F(CTimeDateTimeTest, NothingMindsExtremeFields) {
    constexpr unsigned seed = 20380119;
    std::printf("seed %u\n", seed);
    std::mt19937 random(seed);
    int const fields[] = {lowest, lowest + 1, -1900, -1, 0, 1, 12, 59, 2021, highest - 1, highest};
    unsigned int const seconds[] = {0, 1, 86400, 0x7FFFFFFF, 0x80000000, most};
    auto const any = [&] { return fields[random() % std::size(fields)]; };
    auto const anyMoment = [&] {
        CTime const time(any(), any(), any(), any());
        return CDateTime(time, TimeTest::uncheckedDate(any(), any(), any()));
    };
    for (int i = 0; i < 2000; ++i) {
        CDateTime const left = anyMoment();
        CDateTime const right = anyMoment();
        everythingOf(left, right, seconds[random() % std::size(seconds)]);
        ASSERT_EQ((left < right) + (left > right) + (left == right), 1)
            << show(left) << " and " << show(right);
    }
}

TEST_F(CTimeDateTimeTest, ExtremeFieldsHaveATextOfTheLocale) {
    TestSupport::CZone const zone("America/New_York");
    for (int const year : {lowest, -5000000, 0, 10000, 5000000, highest})
        for (int const rest : {lowest, 0, highest}) {
            CDateTime const value(CTime(rest, rest, rest, rest),
                                  TimeTest::uncheckedDate(rest, rest, year));
            EXPECT_GT(value.format(CDateTime::efFull, CDateTime::efFull, L"").size(), 8U) << year;
        }
}

// Streams.

template <class TStream>
void expectTextOnStream(TStream& stream) {
    stream << moment(2021, 3, 5, 8, 5, 9, 123);
    EXPECT_EQ(stream.fill(), stream.widen('0'));
    EXPECT_EQ(stream.width(), 0);
}

TEST_F(CTimeDateTimeTest, TheTextIsThatOfBothHalvesWithABlank) {
    std::ostringstream narrow;
    expectTextOnStream(narrow);
    EXPECT_EQ(narrow.str(), "05.03.2021 08:05:09");
    std::wostringstream wide;
    expectTextOnStream(wide);
    EXPECT_EQ(wide.str(), L"05.03.2021 08:05:09");
}

template <class TStream, class TText>
std::string read(TText const& text) {
    TStream stream(text);
    return outcomeOf([&] { return CDateTime::readDateTime(stream); });
}

void expectRead(std::string const& text, std::string const& expected) {
    SCOPED_TRACE(text);
    EXPECT_EQ(read<std::istringstream>(text), expected);
    EXPECT_EQ(read<std::wistringstream>(std::wstring(text.begin(), text.end())), expected);
}

TEST_F(CTimeDateTimeTest, ADateAndATimeAreRead) {
    expectRead("05.03.2021 08:05", "2021-3-5 8:5:0.0");
    expectRead("2021-03-05 \n 08:05:09:123", "2021-3-5 8:5:9.123");
    expectRead("  03/05/2021 25:99:99", "2021-3-5 25:99:99.0");
}

TEST_F(CTimeDateTimeTest, ABadDateIsFoundBeforeABadTime) {
    expectRead("31.02.2021 08.05",
               "TimeDateTime: " + TimeTest::wrongArgument("Date", "\"2021/2/31\"", "Invalid date"));
    expectRead("05.03.2021 08.05",
               "TimeDateTime: " + TimeTest::wrongArgument("delimiter", ".", "':' expected"));
}

} // namespace
