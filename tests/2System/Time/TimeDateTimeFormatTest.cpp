#include "1Base/Error/Error.h"
#include "2System/Time/TimeDateTime.h"
#include "2System/Time/TimeExc.h"
#include "2System/Time/TimeLocales.h"
#include "2System/Time/TimeOutcome.h"
#include "2System/Time/TimeRoads.h"
#include "support/ObjectCount.h"

#include <climits>
#include <ctime>
#include <sstream>
#include <string>

namespace {

using Time::CDate;
using Time::CDateTime;
using TimeTest::onBothRoads;
using TimeTest::outcomeOf;
using namespace std::string_literals;

using CTimeDateTimeFormatTest = TestSupport::CObjectCountTest;

CDateTime const sample(5, CDate::emMar, 2021, 8, 5, 9, 123);

std::string formatted(std::wstring const& pattern, CDateTime const& value = sample) {
    return outcomeOf([&] { return value.format(pattern); });
}

void expectFormat(std::wstring const& pattern, std::string const& expected,
                  CDateTime const& value = sample) {
    onBothRoads(
        [&] { EXPECT_EQ(formatted(pattern, value), expected) << TimeTest::narrow(pattern); });
}

void expectRefused(std::wstring const& pattern, std::string const& reason) {
    expectFormat(pattern, "TimeFormatError: " +
                              TimeTest::wrongArgument("string", TimeTest::narrow(pattern), reason));
}

CDateTime unchecked(int year, int day) {
    std::tm time = {};
    time.tm_year = year - 1900;
    time.tm_mday = day;
    return CDateTime(time);
}

// Texts.

TEST_F(CTimeDateTimeFormatTest, APatternIsFilledIn) {
    expectFormat(L"YYYY-MM-DD hh:mm:ss", "2021-03-05 08:05:09");
    expectFormat(L"D.M.YY", "5.3.21");
    expectFormat(L"", "");
}

TEST_F(CTimeDateTimeFormatTest, EverySpecifierHasItsText) {
    expectFormat(L"D DD", "5 05");
    expectFormat(L"M MM", "3 03");
    expectFormat(L"h hh", "8 08");
    expectFormat(L"m mm", "5 05");
    expectFormat(L"s ss", "9 09");
    expectFormat(L"c cc", "12 12");
    expectFormat(L"t tt", "123 123");
    expectFormat(L"YY YYYY", "21 2021");
}

TEST_F(CTimeDateTimeFormatTest, TwoPlacesAreTheLeast) {
    CDateTime const value(31, CDate::emDec, 2005, 100, 7, 77, 5);
    expectFormat(L"t tt c cc", "5 05 0 00", value);
    expectFormat(L"D DD M MM h hh m mm s ss", "31 31 12 12 100 100 7 07 77 77", value);
    expectFormat(L"YY", "05", value);
}

TEST_F(CTimeDateTimeFormatTest, EveryLiteralIsCopied) {
    expectFormat(L".,:;-_#+*%&/()= ", ".,:;-_#+*%&/()= ");
    expectFormat(L"DD D", "05 5");
    expectFormat(L"DDMMYYYYhhmmss", "05032021080509");
    expectFormat(L"hDhMh", "85838");
}

TEST_F(CTimeDateTimeFormatTest, ALongTextIsWhole) {
    std::wstring pattern;
    std::string expected;
    for (int i = 0; i < 1000; ++i) {
        pattern += L"(YYYY)/D";
        expected += "(2021)/5";
    }
    expectFormat(pattern, expected);
}

TEST_F(CTimeDateTimeFormatTest, TheFillStandsBeforeASign) {
    CDateTime const negative(5, CDate::emMar, 2021, -1, -10, -100, -5);
    expectFormat(L"h hh mm ss tt cc c", "-1 -1 -10 -100 -5 00 0", negative);
    expectFormat(L"YYYY YY D DD", "00-5 -5 -7 -7", unchecked(-5, -7));
    expectFormat(L"YYYY YY", "-121 -21", unchecked(-121, 1));
    expectFormat(L"YYYY YY", "0021 21", unchecked(21, 1));
    expectFormat(L"YYYY YY", "12345 45", unchecked(12345, 1));
    CDateTime const lowest(5, CDate::emMar, 2021, INT_MIN, INT_MAX, INT_MIN, INT_MIN);
    expectFormat(L"h hh m s tt c",
                 "-2147483648 -2147483648 2147483647 -2147483648 -2147483648 "
                 "-214748364",
                 lowest);
}

TEST_F(CTimeDateTimeFormatTest, ALocaleThatGroupsDigitsDoesSoHere) {
    TimeTest::CGroupingLocale const global('.', "\3");
    EXPECT_EQ(formatted(L"YYYY-MM-DD"), "2.021-03-05");
    EXPECT_EQ(formatted(L"tt c", CDateTime(5, CDate::emMar, 2021, 0, 0, 0, 1234567)),
              "1.234.567 123.456");
}

// Failures.

TEST_F(CTimeDateTimeFormatTest, OtherCharactersAreRefused) {
    expectRefused(L"YYYY-MM-DDThh", "Invalid format string");
    expectRefused(L"y", "Invalid format string");
    for (wchar_t const character : L"abdefgijklnopqruvwxyzABCEFGHIJKLNOPQRSTUVWXZ0129!\"'$<>?@[\\]^"
                                   L"`{|}~\t\n\u00E9\u20AC"s)
        expectRefused(std::wstring(1, character), "Invalid format string");
}

TEST_F(CTimeDateTimeFormatTest, AZeroIsNoEnd) {
    expectRefused(L"\0"s, "Invalid format string");
    expectRefused(L"DD\0"s, "Invalid format string");
    expectRefused(L"DD\0MM"s, "Invalid format string");
    expectRefused(L"Y\0"s, "Invalid format");
}

TEST_F(CTimeDateTimeFormatTest, AThirdLetterIsRefused) {
    for (wchar_t const letter : L"tcsmhDM"s) {
        expectRefused(std::wstring(3, letter), "Invalid format string");
        expectRefused(std::wstring(4, letter), "Invalid format string");
        expectRefused(L"YYYY " + std::wstring(3, letter) + L" D", "Invalid format string");
    }
}

TEST_F(CTimeDateTimeFormatTest, AYearHasTwoPlacesOrFour) {
    expectRefused(L"Y", "Invalid format");
    expectRefused(L"DD.Y", "Invalid format");
    expectRefused(L"Y-M", "Invalid format");
    expectRefused(L"YYY", "Invalid format string");
    expectRefused(L"YYY-M", "Invalid format string");
    expectRefused(L"YYYYY", "Invalid format string");
    expectRefused(L"YYYYYY", "Invalid format string");
    expectFormat(L"YY YY", "21 21");
}

TEST_F(CTimeDateTimeFormatTest, TheFailureIsCaughtAtEveryLevel) {
    EXPECT_THROW(sample.format(L"x"), Time::TExcTimeFormatError);
    EXPECT_THROW(sample.format(L"x"), Time::TExcTimeDateTime);
    EXPECT_THROW(sample.format(L"x"), Time::TExcTimeDate);
    EXPECT_THROW(sample.format(L"x"), Time::TExcTimeTime);
    EXPECT_THROW(sample.format(L"x"), Error::CException);
}

// One specifier.

TEST_F(CTimeDateTimeFormatTest, OneSpecifierIsWrittenAndPassed) {
    struct CCase {
        wchar_t const* pattern;
        std::size_t pos, last;
        wchar_t const* text;
    };
    for (CCase const& c :
         {CCase{L"D", 0, 0, L"5"}, CCase{L"DD", 0, 1, L"05"}, CCase{L"YYYY", 0, 3, L"2021"},
          CCase{L"YY-", 0, 1, L"21"}, CCase{L"x.hh?", 2, 3, L"08"}, CCase{L"DD", 1, 1, L"5"}}) {
        std::wostringstream out;
        std::wstring::size_type pos = c.pos;
        sample.putFormat(c.pattern, pos, out);
        EXPECT_EQ(out.str(), c.text);
        EXPECT_EQ(pos, c.last);
    }
}

TEST_F(CTimeDateTimeFormatTest, AStreamKeepsItsFill) {
    std::wostringstream out;
    out.fill(L'*');
    std::wstring::size_type pos = 0;
    sample.putFormat(L"DD", pos, out);
    EXPECT_EQ(out.fill(), L'*');
    EXPECT_EQ(out.width(), 0);
    out.width(3);
    pos = 0;
    sample.putFormat(L"D", pos, out);
    EXPECT_EQ(out.str(), L"05**5");
}

std::string putFailure(std::wstring const& pattern, std::wstring::size_type pos,
                       std::wostringstream& out) {
    return outcomeOf([&] {
        sample.putFormat(pattern, pos, out);
        return out.str();
    });
}

TEST_F(CTimeDateTimeFormatTest, WhatIsNoSpecifierIsRefused) {
    std::wostringstream out;
    auto const refusal = [](std::string const& pattern) {
        return "TimeFormatError: " +
               TimeTest::wrongArgument("string", pattern, "Invalid format string");
    };
    EXPECT_EQ(putFailure(L"D.M", 1, out), refusal("D.M"));
    EXPECT_EQ(putFailure(L"", 0, out), refusal(""));
    EXPECT_EQ(putFailure(L"D", 1, out), refusal("D"));
    EXPECT_EQ(putFailure(L"D", std::wstring::npos, out), refusal("D"));
    EXPECT_EQ(out.str(), L"");
}

TEST_F(CTimeDateTimeFormatTest, TheNumberIsWrittenBeforeTheThirdLetterIsSeen) {
    std::wostringstream out;
    EXPECT_EQ(putFailure(L"DDD", 0, out),
              "TimeFormatError: " +
                  TimeTest::wrongArgument("string", "DDD", "Invalid format string"));
    EXPECT_EQ(out.str(), L"05");
}

} // namespace
