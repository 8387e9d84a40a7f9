// Reading times of day from streams.

#include "2System/Time/TimeTime.h"

#include "2System/Time/TimeFailure.h"
#include "2System/Time/TimeFailureLines.h"
#include "2System/Time/TimeReading.h"
#include "2System/Time/TimeScanner.h"
#include "support/Registry.h"

#include <gtest/gtest.h>

#include <array>
#include <ios>
#include <sstream>
#include <string>

namespace {

using Time::CTime;
using TimeTest::badStream;
using TimeTest::CTimeFailure;
using TimeTest::timeFailureOf;
using TReading = TimeTest::CReading<4>;
using namespace std::string_literals;

using CTimeTimeInputTest = TestSupport::CErrorTest;

TReading reading(std::string const& text) {
    return TimeTest::readingOfBoth(text, TimeTest::readTimeFields);
}

constexpr int eof = 2;
constexpr int fail = 4;

void expectTime(std::string const& text, std::array<int, 4> const& fields, int state = eof,
                std::string const& rest = "") {
    EXPECT_EQ(reading(text), (TReading{fields, {}, state, rest})) << text;
}

void expectFailure(std::string const& text, CTimeFailure const& failure, int state,
                   std::string const& rest = "") {
    EXPECT_EQ(reading(text), (TReading{{}, failure, state, rest})) << text;
}

CTimeFailure badDelimiter(Strings::string const& key) {
    return TimeTest::wrongArgument(L"delimiter", key, L"':' expected");
}

TEST_F(CTimeTimeInputTest, ATimeMayEndBehindTheMinuteOrTheSecond) {
    expectTime("08:05", {8, 5, 0, 0});
    expectTime("08:05:09", {8, 5, 9, 0});
    expectTime("08:05:09:123", {8, 5, 9, 123});
    expectTime("8:5:9:1", {8, 5, 9, 1});
}

TEST_F(CTimeTimeInputTest, AGraveAccentDoesForTheColon) {
    expectTime("08`05", {8, 5, 0, 0});
    expectTime("08`05`09", {8, 5, 9, 0});
    expectTime("08`05`09`123", {8, 5, 9, 123});
}

TEST_F(CTimeTimeInputTest, TheFirstTwoDelimitersMustBeTheSame) {
    expectFailure("08:05`09", badDelimiter(L"`"), 0, "09");
    expectFailure("08`05:09", badDelimiter(L":"), 0, "09");
    expectFailure("08:05.09", badDelimiter(L"."), 0, "09");
    expectFailure("08:05 x", badDelimiter(L"x"), 0);
}

TEST_F(CTimeTimeInputTest, TheThirdDelimiterMayDiffer) {
    expectTime("08:05:09`123", {8, 5, 9, 123});
    expectTime("08`05`09:123", {8, 5, 9, 123});
}

TEST_F(CTimeTimeInputTest, ADelimiterIsAColonOrAGraveAccent) {
    expectFailure("08.05", badDelimiter(L"."), 0, "05");
    expectFailure("08 05", badDelimiter(L"0"), 0, "5");
    expectFailure("08'05", badDelimiter(L"'"), 0, "05");
}

TEST_F(CTimeTimeInputTest, ACharacterBehindTheSecondIsLost) {
    expectTime("08:05:09 x", {8, 5, 9, 0}, 0);
    expectTime("08:05:09.123", {8, 5, 9, 0}, 0, "123");
    expectTime("08:05:09Z+01", {8, 5, 9, 0}, 0, "+01");
}

TEST_F(CTimeTimeInputTest, ReadingEndsBehindTheMilliseconds) {
    expectTime("08:05:09:123 x", {8, 5, 9, 123}, 0, " x");
    expectTime("08:05:09:123:4", {8, 5, 9, 123}, 0, ":4");
}

TEST_F(CTimeTimeInputTest, WhiteSpaceIsSkippedBeforeEachPart) {
    expectTime(" 08 : 05\t:\n09 : 123", {8, 5, 9, 123});
}

TEST_F(CTimeTimeInputTest, NoFieldIsTested) {
    expectTime("25:99:99", {25, 99, 99, 0});
    expectTime("-8:-5:-9:-1", {-8, -5, -9, -1});
    expectTime("2147483647:-2147483648:0:2147483647", {2147483647, -2147483647 - 1, 0, 2147483647});
}

TEST_F(CTimeTimeInputTest, ATrailingBlankWantsAnotherDelimiter) {
    expectFailure("08:05 ", badStream(L"is", eof | fail), eof | fail);
    expectFailure("08:05:09 ", badStream(L"is", eof | fail), eof | fail);
    expectTime("08:05:09:123 ", {8, 5, 9, 123}, 0, " ");
}

TEST_F(CTimeTimeInputTest, ATextThatEndsTooEarlyIsTheEndOfTheInput) {
    for (char const* const text :
         {"", " ", "08", "08 ", "08:", "08: ", "08:05:", "08:05: ", "08:05:09:", "08:05:09: ", "-"})
        expectFailure(text, badStream(L"is", eof | fail), eof | fail);
}

TEST_F(CTimeTimeInputTest, AFailureNamesTheLineOfItsStep) {
    auto const read = [](std::string const& text) {
        std::istringstream stream(text);
        CTime::readTime(stream);
    };
    TimeTest::expectLinesInOrder(
        {"x", "08", "08x", "08:", "08:05 ", "08:05x", "08:05:", "08:05:09 ", "08:05:09:x"}, read);
}

TEST_F(CTimeTimeInputTest, ATextThatGoesWrongIsABadStream) {
    expectFailure("x", badStream(L"is", fail), fail, "x");
    expectFailure(":05", badStream(L"is", fail), fail, ":05");
    expectFailure("08:x", badStream(L"is", fail), fail, "x");
    expectFailure("08:05:x", badStream(L"is", fail), fail, "x");
    expectFailure("08:05:09:x", badStream(L"is", fail), fail, "x");
    expectFailure("08:05:99999999999 x", badStream(L"is", fail), fail, " x");
}

TEST_F(CTimeTimeInputTest, AStreamThatHasFailedIsRefusedAtOnce) {
    std::wistringstream stream(L"08:05");
    stream.setstate(std::ios_base::failbit);
    EXPECT_EQ(timeFailureOf([&] { CTime::readTime(stream); }), badStream(L"is", 4));
    stream.clear(std::ios_base::badbit | std::ios_base::eofbit);
    EXPECT_EQ(timeFailureOf([&] { CTime::readTime(stream); }), badStream(L"is", 3));
    stream.clear();
    EXPECT_EQ(CTime::readTime(stream).getHour(), 8);
}

TEST_F(CTimeTimeInputTest, AZeroIsACharacterLikeAnother) {
    expectFailure("08\0"
                  "05"s,
                  badDelimiter(L"\0"s), 0, "05");
    expectFailure("08:05\0"
                  "09"s,
                  badDelimiter(L"\0"s), 0, "09");
    expectTime("08:05:09\0"
               "123"s,
               {8, 5, 9, 0}, 0, "123");
    expectTime("08:05:09:123\0"s, {8, 5, 9, 123}, 0, "\0"s);
}

TEST_F(CTimeTimeInputTest, AWideDelimiterIsAKeyAsItIs) {
    std::wistringstream stream(L"08\u02BC05");
    EXPECT_EQ(timeFailureOf([&] { CTime::readTime(stream); }), badDelimiter(L"\u02BC"));
}

} // namespace
