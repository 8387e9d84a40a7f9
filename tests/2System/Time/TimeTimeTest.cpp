// Times of day as values, what is reckoned with them, and offsets from UTC.

#include "2System/Time/TimeTime.h"
#include "2System/Time/TimeDateTime.h"

#include "2System/Time/TimeWritten.h"
#include "support/Registry.h"

#include <gtest/gtest.h>

#include <array>
#include <climits>
#include <cstdint>
#include <cstdio>
#include <cstring>
#include <ctime>
#include <iomanip>
#include <iterator>
#include <random>
#include <sstream>
#include <string>

namespace {

using Strings::string;
using Time::CTime;
using Time::CTimeZone;
using TimeTest::expectText;

using CTimeTimeTest = TestSupport::CErrorTest;
using CTimeTimeZoneTest = TestSupport::CErrorTest;

/// Hour, minute, second, millisecond.
using TFields = std::array<std::int64_t, 4>;

TFields fieldsOf(CTime const& time) {
    return {time.getHour(), time.getMinute(), time.getSecond(), time.getMilliSecond()};
}

TFields added(CTime time, int milliSeconds, int seconds, int minutes, int hours) {
    time.add_(milliSeconds, seconds, minutes, hours);
    return fieldsOf(time);
}

TFields subtracted(CTime time, int milliSeconds, int seconds, int minutes, int hours) {
    time.sub_(milliSeconds, seconds, minutes, hours);
    return fieldsOf(time);
}

TFields incremented(CTime time) {
    time.inc_();
    return fieldsOf(time);
}

TFields decremented(CTime time) {
    time.dec_();
    return fieldsOf(time);
}

TEST_F(CTimeTimeTest, ATimeKeepsWhateverItIsGiven) {
    EXPECT_EQ(fieldsOf(CTime(8, 5, 9, 123)), (TFields{8, 5, 9, 123}));
    EXPECT_EQ(fieldsOf(CTime(99, -1, INT_MIN, INT_MAX)), (TFields{99, -1, INT_MIN, INT_MAX}));
}

TEST_F(CTimeTimeTest, TheFieldsLieInTheirOrder) {
    CTime const time(8, 5, 9, 123);
    std::array<int, 4> fields = {};
    static_assert(sizeof(fields) == sizeof(time));
    std::memcpy(fields.data(), &time, sizeof(time));
    EXPECT_EQ(fields, (std::array<int, 4>{123, 9, 5, 8}));
}

TEST_F(CTimeTimeTest, AStructOfTheCLibraryHasNoMilliseconds) {
    std::tm time = {};
    time.tm_hour = 25;
    time.tm_min = 5;
    time.tm_sec = 60;
    EXPECT_EQ(fieldsOf(CTime(time)), (TFields{25, 5, 60, 0}));
}

TEST_F(CTimeTimeTest, ADateTimeGivesItsTime) {
    Time::CDateTime const dateTime(5, Time::CDate::emMar, 2021, 8, 5, 9, 123);
    EXPECT_EQ(fieldsOf(CTime(dateTime)), (TFields{8, 5, 9, 123}));
}

TEST_F(CTimeTimeTest, MillisecondsAreSplit) {
    EXPECT_EQ(fieldsOf(CTime::milliSecondsToTimeFormat(3661001)), (TFields{1, 1, 1, 1}));
    EXPECT_EQ(fieldsOf(CTime::milliSecondsToTimeFormat(90000000)), (TFields{25, 0, 0, 0}));
    EXPECT_EQ(fieldsOf(CTime::milliSecondsToTimeFormat(-1500)), (TFields{0, 0, -1, -500}));
    EXPECT_EQ(fieldsOf(CTime::milliSecondsToTimeFormat(0)), (TFields{0, 0, 0, 0}));
    EXPECT_EQ(fieldsOf(CTime::milliSecondsToTimeFormat(INT_MAX)), (TFields{596, 31, 23, 647}));
    EXPECT_EQ(fieldsOf(CTime::milliSecondsToTimeFormat(INT_MIN)), (TFields{-596, -31, -23, -648}));
}

TEST_F(CTimeTimeTest, SecondsAreSplitAndWrap) {
    EXPECT_EQ(fieldsOf(CTime::secondsToTimeFormat(3661)), (TFields{1, 1, 1, 0}));
    EXPECT_EQ(fieldsOf(CTime::secondsToTimeFormat(-61)), (TFields{0, -1, -1, 0}));
    EXPECT_EQ(fieldsOf(CTime::secondsToTimeFormat(2147483)), (TFields{596, 31, 23, 0}));
    // 2147484000 less 2^32.
    EXPECT_EQ(fieldsOf(CTime::secondsToTimeFormat(2147484)), (TFields{-596, -31, -23, -296}));
    EXPECT_EQ(fieldsOf(CTime::secondsToTimeFormat(INT_MIN)), (TFields{0, 0, 0, 0}));
}

TEST_F(CTimeTimeTest, AFieldReplacesAText) {
    CTime const time(8, -5, INT_MIN, INT_MAX);
    string text = L"before";
    time.getHour(text);
    EXPECT_EQ(text, L"8");
    time.getMinute(text);
    EXPECT_EQ(text, L"-5");
    time.getSecond(text);
    EXPECT_EQ(text, L"-2147483648");
    time.getMilliSecond(text);
    EXPECT_EQ(text, L"2147483647");
}

TEST_F(CTimeTimeTest, AddedSecondsAreCarriedUpToTheHour) {
    EXPECT_EQ(fieldsOf(CTime(10, 0, 59, 0).addSeconds(1)), (TFields{10, 1, 0, 0}));
    EXPECT_EQ(fieldsOf(CTime(23, 59, 59, 0).addSeconds(1)), (TFields{24, 0, 0, 0}));
    EXPECT_EQ(fieldsOf(CTime(0, 0, 0, 7).addSeconds(2147483647)), (TFields{596523, 14, 7, 7}));
}

TEST_F(CTimeTimeTest, SubtractedSecondsAreBorrowedUpToTheHour) {
    EXPECT_EQ(fieldsOf(CTime(0, 0, 0, 0).subSeconds(1)), (TFields{-1, 59, 59, 0}));
    EXPECT_EQ(fieldsOf(CTime(0, 0, 0, 0).subSeconds(60)), (TFields{-1, 59, 0, 0}));
    EXPECT_EQ(fieldsOf(CTime(0, 0, 0, 0).subSeconds(3600)), (TFields{-1, 0, 0, 0}));
    EXPECT_EQ(fieldsOf(CTime(10, 0, 0, 0).subMinutes(61)), (TFields{8, 59, 0, 0}));
}

TEST_F(CTimeTimeTest, EachFieldIsCarriedByItself) {
    EXPECT_EQ(added(CTime(0, 0, 0, 999), 1, 0, 0, 0), (TFields{0, 0, 1, 0}));
    EXPECT_EQ(added(CTime(0, 59, 59, 999), 1, 0, 0, 0), (TFields{1, 0, 0, 0}));
    EXPECT_EQ(added(CTime(0, 0, 0, 0), 2500, 61, 62, -3), (TFields{-2, 3, 3, 500}));
    // A field that is too large already is mended, one that is negative is not.
    EXPECT_EQ(added(CTime(0, 200, 100, 1999), 0, 0, 0, 0), (TFields{3, 21, 41, 999}));
    EXPECT_EQ(added(CTime(0, -200, -100, -1999), 0, 0, 0, 0), (TFields{0, -200, -100, -1999}));
}

TEST_F(CTimeTimeTest, EachFieldIsBorrowedByItself) {
    EXPECT_EQ(subtracted(CTime(0, 0, 0, 500), 600, 0, 0, 0), (TFields{-1, 59, 59, 900}));
    EXPECT_EQ(subtracted(CTime(0, 0, 0, 0), 2000, 0, 0, 0), (TFields{-1, 59, 58, 0}));
    EXPECT_EQ(subtracted(CTime(0, 0, 0, 0), 2001, 0, 0, 0), (TFields{-1, 59, 57, 999}));
    EXPECT_EQ(subtracted(CTime(5, 0, 0, 0), 0, 120, 0, 3), (TFields{1, 58, 0, 0}));
    EXPECT_EQ(subtracted(CTime(0, 99, 99, 1999), 0, 0, 0, 0), (TFields{0, 99, 99, 1999}));
}

TEST_F(CTimeTimeTest, OneSecondOnGoesThroughSixty) {
    CTime time(10, 0, 59, 5);
    time.inc_();
    EXPECT_EQ(fieldsOf(time), (TFields{10, 0, 60, 5}));
    time.inc_();
    EXPECT_EQ(fieldsOf(time), (TFields{10, 1, 0, 5}));
    EXPECT_EQ(incremented(CTime(10, 59, 60, 0)), (TFields{10, 60, 0, 0}));
    EXPECT_EQ(incremented(CTime(10, 60, 60, 0)), (TFields{11, 0, 0, 0}));
    EXPECT_EQ(incremented(CTime(10, 60, 59, 0)), (TFields{10, 60, 60, 0}));
    EXPECT_EQ(incremented(CTime(23, 99, INT_MAX, 0)), (TFields{24, 0, 0, 0}));
    EXPECT_EQ(incremented(CTime(INT_MAX, 60, 60, 0)), (TFields{INT_MIN, 0, 0, 0}));
    EXPECT_EQ(incremented(CTime(0, 0, INT_MIN, 0)), (TFields{0, 0, INT_MIN + 1, 0}));
}

TEST_F(CTimeTimeTest, OneSecondBackGoesToFiftyNine) {
    EXPECT_EQ(decremented(CTime(10, 1, 0, 5)), (TFields{10, 0, 59, 5}));
    EXPECT_EQ(decremented(CTime(10, 0, 0, 0)), (TFields{9, 59, 59, 0}));
    EXPECT_EQ(decremented(CTime(10, 0, 60, 0)), (TFields{10, 0, 59, 0}));
    EXPECT_EQ(decremented(CTime(0, 0, 0, 0)), (TFields{-1, 59, 59, 0}));
    EXPECT_EQ(decremented(CTime(10, -7, INT_MIN, 0)), (TFields{9, 59, 59, 0}));
    EXPECT_EQ(decremented(CTime(INT_MIN, 0, 0, 0)), (TFields{INT_MAX, 59, 59, 0}));
}

TEST_F(CTimeTimeTest, OperationsGiveTheTimeBack) {
    CTime time(10, 0, 0, 0);
    EXPECT_EQ(&time.addSeconds(1), &time);
    EXPECT_EQ(&time.subSeconds(1), &time);
    EXPECT_EQ(&time.subMinutes(1), &time);
}

// No assertion here: what is above 2^31-1 is a negative number of seconds.
TEST_F(CTimeTimeTest, MoreSecondsThanThereAreWrap) {
    EXPECT_EQ(fieldsOf(CTime(10, 0, 0, 0).addSeconds(0xFFFFFFFFU)), (TFields{10, 0, -1, 0}));
    EXPECT_EQ(fieldsOf(CTime(10, 0, 0, 0).subSeconds(0xFFFFFFFFU)), (TFields{10, 0, 1, 0}));
    EXPECT_EQ(fieldsOf(CTime(10, 0, 0, 0).subMinutes(0xFFFFFFFFU)), (TFields{10, 1, 0, 0}));
}

TEST_F(CTimeTimeTest, MillisecondsAreNotCompared) {
    CTime const early(10, 0, 0, 1);
    CTime const late(10, 0, 0, 999);
    EXPECT_TRUE(early == late);
    EXPECT_FALSE(early < late);
    EXPECT_FALSE(late < early);
    EXPECT_EQ(late - early, 0);
}

TEST_F(CTimeTimeTest, TimesCompareByHourThenMinuteThenSecond) {
    CTime const times[] = {CTime(INT_MIN, 9, 9, 0), CTime(-1, 59, 59, 0), CTime(0, -1, 99, 0),
                           CTime(0, 0, -5, 0),      CTime(0, 0, 60, 0),   CTime(0, 1, 0, 0),
                           CTime(1, 0, 0, 0),       CTime(25, 0, 0, 0)};
    for (std::size_t i = 0; i < std::size(times); ++i)
        for (std::size_t j = 0; j < std::size(times); ++j) {
            EXPECT_EQ(times[i] < times[j], i < j) << i << ' ' << j;
            EXPECT_EQ(times[i] == times[j], i == j) << i << ' ' << j;
        }
}

TEST_F(CTimeTimeTest, DifferencesAreSecondsAndWrap) {
    EXPECT_EQ(CTime(11, 1, 1, 0) - CTime(10, 0, 0, 0), 3661);
    EXPECT_EQ(CTime(10, 0, 0, 0) - CTime(11, 1, 1, 0), -3661);
    EXPECT_EQ(CTime(10, 30, 0, 0) - CTime(9, 45, 10, 0), 2690);
    EXPECT_EQ(CTime(-1, 59, 59, 0) - CTime(0, 0, 0, 0), -1);
    EXPECT_EQ(CTime(0, 0, INT_MAX, 0) - CTime(0, 0, -1, 0), INT_MIN);
    EXPECT_EQ(CTime(INT_MAX, 0, 0, 0) - CTime(0, 0, 0, 0), -3600);
}

TEST_F(CTimeTimeTest, ATimeIsWrittenWithColons) {
    std::pair<CTime, std::string> const texts[] = {{CTime(8, 5, 9, 123), "08:05:09"},
                                                   {CTime(23, 59, 59, 999), "23:59:59"},
                                                   {CTime(100, 60, 60, 0), "100:60:60"},
                                                   {CTime(-1, -10, 0, 0), "-1:-10:00"}};
    for (auto const& [time, text] : texts)
        expectText(time, text);
}

template <class TCh>
void expectFillStaysAndAdjustmentIsTheStreams() {
    std::basic_ostringstream<TCh> stream;
    stream << std::setfill(TCh('*')) << std::left;
    CTime(8, 5, 9, 0).streamTo(stream);
    EXPECT_EQ(stream.fill(), TCh('0'));
    EXPECT_EQ(stream.width(), 0);
    EXPECT_EQ(stream.flags() & std::ios_base::adjustfield, std::ios_base::left);
    std::string const expected = "80:50:90";
    EXPECT_EQ(stream.str(), std::basic_string<TCh>(expected.begin(), expected.end()));
}

TEST_F(CTimeTimeTest, FillStaysAndAdjustmentIsTheStreams) {
    expectFillStaysAndAdjustmentIsTheStreams<char>();
    expectFillStaysAndAdjustmentIsTheStreams<wchar_t>();
}

TEST_F(CTimeTimeTest, InternalAdjustmentFillsBehindASign) {
    expectText(CTime(-1, 5, -9, 0), "-1:05:-9", [](auto& stream) { stream << std::internal; });
}

// Against a count of milliseconds, for times whose fields are in order.
TEST_F(CTimeTimeTest, AddingAndSubtractingCountMilliseconds) {
    constexpr unsigned seed = 20210305;
    std::printf("seed %u\n", seed);
    std::mt19937 random(seed);
    auto const below = [&](unsigned end) { return static_cast<int>(random() % end); };
    auto const count = [](std::int64_t h, std::int64_t m, std::int64_t s, std::int64_t ms) {
        return ((h * 60 + m) * 60 + s) * 1000 + ms;
    };
    auto const split = [](std::int64_t ms) {
        auto const floorMod = [](std::int64_t value, std::int64_t unit) {
            return (value % unit + unit) % unit;
        };
        TFields fields = {};
        fields[3] = floorMod(ms, 1000);
        ms = (ms - fields[3]) / 1000;
        fields[2] = floorMod(ms, 60);
        ms = (ms - fields[2]) / 60;
        fields[1] = floorMod(ms, 60);
        fields[0] = (ms - fields[1]) / 60;
        return fields;
    };
    for (int i = 0; i < 200000; ++i) {
        CTime const time(below(48) - 24, below(60), below(60), below(1000));
        int const ms = below(100000);
        int const s = below(100000);
        int const m = below(100000);
        int const h = below(1000);
        std::int64_t const before =
            count(time.getHour(), time.getMinute(), time.getSecond(), time.getMilliSecond());
        ASSERT_EQ(added(time, ms, s, m, h), split(before + count(h, m, s, ms)));
        ASSERT_EQ(subtracted(time, ms, s, m, h), split(before - count(h, m, s, ms)));
    }
}

// The steps one by one in 64 bits, wrapped where a field is stored.
std::int64_t wrapped(std::int64_t value) {
    return static_cast<std::int32_t>(static_cast<std::uint32_t>(value));
}

TFields naiveSub(TFields fields, TFields const& amounts) {
    std::int64_t const units[] = {0, 60, 60, 1000};
    for (std::size_t i = 4; i-- > 0;) {
        fields[i] = wrapped(fields[i] - amounts[i]);
        if (i == 0 || fields[i] >= 0)
            continue;
        std::int64_t const quotient = -fields[i] / units[i];
        std::int64_t const remainder = -fields[i] % units[i];
        fields[i - 1] = wrapped(fields[i - 1] - quotient);
        if (remainder > 0)
            fields[i - 1] = wrapped(fields[i - 1] - 1);
        fields[i] = remainder > 0 ? units[i] - remainder : 0;
    }
    return fields;
}

TFields naiveAdd(TFields fields, TFields const& amounts) {
    std::int64_t const units[] = {0, 60, 60, 1000};
    for (std::size_t i = 4; i-- > 0;) {
        fields[i] = wrapped(fields[i] + amounts[i]);
        if (i == 0 || fields[i] < units[i])
            continue;
        fields[i - 1] = wrapped(fields[i - 1] + fields[i] / units[i]);
        fields[i] %= units[i];
    }
    return fields;
}

TEST_F(CTimeTimeTest, ExtremesWrap) {
    constexpr unsigned seed = 20380119;
    std::printf("seed %u\n", seed);
    std::mt19937 random(seed);
    int const values[] = {INT_MIN, INT_MIN + 1, -1000, -60, -1,          0,
                          1,       59,          60,    999, INT_MAX - 1, INT_MAX};
    auto const any = [&] { return values[random() % std::size(values)]; };
    for (int i = 0; i < 200000; ++i) {
        CTime const time(any(), any(), any(), any());
        int const ms = any();
        int const s = any();
        int const m = any();
        int const h = any();
        ASSERT_EQ(added(time, ms, s, m, h), naiveAdd(fieldsOf(time), {h, m, s, ms}));
        ASSERT_EQ(subtracted(time, ms, s, m, h), naiveSub(fieldsOf(time), {h, m, s, ms}));
    }
}

TEST_F(CTimeTimeZoneTest, AZoneIsUnknownByItself) {
    CTimeZone const zone;
    EXPECT_EQ(zone.type, CTimeZone::etzNone);
    EXPECT_EQ(zone.hours, 0);
    EXPECT_EQ(zone.minutes, 0);
    EXPECT_EQ(zone.getSeconds(), 0);
}

TEST_F(CTimeTimeZoneTest, TheFieldsLieInTheirOrder) {
    CTimeZone const zone(CTimeZone::etzMinus, 5, 30);
    std::array<int, 3> fields = {};
    static_assert(sizeof(fields) == sizeof(zone));
    std::memcpy(fields.data(), &zone, sizeof(zone));
    EXPECT_EQ(fields, (std::array<int, 3>{-1, 5, 30}));
}

TEST_F(CTimeTimeZoneTest, OnlyTheTypeBehindUTCNegates) {
    EXPECT_EQ(CTimeZone(CTimeZone::etzMinus, 5, 30).getSeconds(), -19800);
    EXPECT_EQ(CTimeZone(CTimeZone::etzMinus, -5, -30).getSeconds(), 19800);
    EXPECT_EQ(CTimeZone(CTimeZone::etzPlus, 5, 30).getSeconds(), 19800);
    EXPECT_EQ(CTimeZone(CTimeZone::etzUTC, 5, 30).getSeconds(), 19800);
    EXPECT_EQ(CTimeZone(CTimeZone::etzNone, 5, 30).getSeconds(), 19800);
    EXPECT_EQ(CTimeZone(static_cast<CTimeZone::EType>(7), 0, 1).getSeconds(), 60);
}

TEST_F(CTimeTimeZoneTest, SecondsWrap) {
    EXPECT_EQ(CTimeZone(CTimeZone::etzPlus, INT_MAX, INT_MAX).getSeconds(), -3660);
    EXPECT_EQ(CTimeZone(CTimeZone::etzMinus, INT_MIN, INT_MIN).getSeconds(), 0);
    // 2^27 hours come out as -2^31 seconds, which have no opposite.
    EXPECT_EQ(CTimeZone(CTimeZone::etzMinus, 1 << 27, 0).getSeconds(), INT_MIN);
}

} // namespace
