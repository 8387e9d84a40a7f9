// Reading dates from streams, and making them of three texts.

#include "2System/Time/TimeDate.h"

#include "1Base/Encoding/EncodingExc.h"
#include "2System/Time/TimeDateFields.h"
#include "2System/Time/TimeFailure.h"
#include "2System/Time/TimeFailureLines.h"
#include "2System/Time/TimeReading.h"
#include "2System/Time/TimeScanner.h"
#include "support/LogRecorder.h"
#include "support/Registry.h"

#include <gtest/gtest.h>

#include <array>
#include <ios>
#include <istream>
#include <sstream>
#include <stdexcept>
#include <streambuf>
#include <string>

namespace {

using TestSupport::TParameters;
using Time::CDate;
using TimeTest::badStream;
using TimeTest::CTimeFailure;
using TimeTest::fieldsOf;
using TimeTest::TFields;
using TimeTest::timeFailureOf;
using TimeTest::wrongArgument;
using TReading = TimeTest::CReading<3>;
using namespace std::string_literals;

using CTimeDateInputTest = TestSupport::CErrorTest;

TReading reading(std::string const& text) {
    return TimeTest::readingOfBoth(text, TimeTest::readDateFields);
}

constexpr int eof = 2;
constexpr int fail = 4;

void expectDate(std::string const& text, int day, int month, int year, int state = eof,
                std::string const& rest = "") {
    EXPECT_EQ(reading(text), (TReading{{{day, month, year}}, {}, state, rest})) << text;
}

void expectFailure(std::string const& text, CTimeFailure const& failure, int state,
                   std::string const& rest = "") {
    EXPECT_EQ(reading(text), (TReading{{}, failure, state, rest})) << text;
}

CTimeFailure badDelimiter(Strings::string const& key) {
    return wrongArgument(L"delimiter", key, L"'.' expected");
}

CTimeFailure badMonthName(Strings::string const& key) {
    return wrongArgument(L"month", key, L"Invalid month name");
}

CTimeFailure badDate(Strings::string const& key) {
    return wrongArgument(L"Date", key, L"Invalid date");
}

TEST_F(CTimeDateInputTest, TheDelimiterDecidesOnTheOrder) {
    expectDate("05.03.2021", 5, 3, 2021);
    expectDate("2021-03-05", 5, 3, 2021);
    expectDate("03/05/2021", 5, 3, 2021);
    expectDate("5.3.2021", 5, 3, 2021);
}

TEST_F(CTimeDateInputTest, ReadingEndsBehindTheThirdNumber) {
    expectDate("05.03.2021 08:05", 5, 3, 2021, 0, " 08:05");
    expectDate("05.03.2021x", 5, 3, 2021, 0, "x");
    expectDate("2021-03-05T08:05", 5, 3, 2021, 0, "T08:05");
    expectDate("05.03.2021.06", 5, 3, 2021, 0, ".06");
}

TEST_F(CTimeDateInputTest, WhiteSpaceIsSkippedBeforeEachPart) {
    expectDate(" \t05 \n. 03 \v. \f2021\r", 5, 3, 2021, 0, "\r");
    expectDate("05.\nJJJ\t2021", 5, 1, 2021);
}

TEST_F(CTimeDateInputTest, NumbersMayHaveSigns) {
    expectDate("+5.+3.+2021", 5, 3, 2021);
    expectDate("2021--65533-+5", 5, -65533, 2021);
    expectFailure("-5.3.2021", badDate(L"\"2021/3/-5\""), eof);
}

TEST_F(CTimeDateInputTest, TheUncutNumbersStand) {
    expectDate("65541.3.67557", 65541, 3, 67557);
}

TEST_F(CTimeDateInputTest, DelimitersMustBeTheSame) {
    expectFailure("05-03.2021", badDelimiter(L"."), 0, "2021");
    expectFailure("05.03/2021", badDelimiter(L"/"), 0, "2021");
    expectFailure("05.03x2021", badDelimiter(L"x"), 0, "2021");
}

TEST_F(CTimeDateInputTest, ADelimiterIsADotADashOrASlash) {
    expectFailure("05 03 2021", badDelimiter(L"0"), 0, "3 2021");
    expectFailure("05:03:2021", badDelimiter(L":"), 0, "03:2021");
    expectFailure("05,03,2021", badDelimiter(L","), 0, "03,2021");
    expectFailure("05x", badDelimiter(L"x"), 0);
}

TEST_F(CTimeDateInputTest, AMonthMayBeAWordOfOneRepeatedLetter) {
    expectDate("05.JJJ 2021", 5, 1, 2021);
    expectDate("05.FFF 2021", 5, 2, 2021);
    expectDate("05.MMM 2021", 5, 3, 2021);
    expectDate("05.AAA 2021", 5, 4, 2021);
    expectDate("05.SSS 2021", 5, 9, 2021);
    expectDate("05.OOO 2021", 5, 10, 2021);
    expectDate("05.NNN 2021", 5, 11, 2021);
    expectDate("2021-JJJ 05", 5, 1, 2021);
}

TEST_F(CTimeDateInputTest, WhatFollowsTheThirdLetterDoesNotMatter) {
    expectDate("05.JJJanuary 2021", 5, 1, 2021);
    expectDate("05.JJJ. 2021", 5, 1, 2021);
    expectDate("05.JJJ123-/ 2021", 5, 1, 2021);
}

// The word stands in the second place, which is the day's.
TEST_F(CTimeDateInputTest, AWordBehindASlashIsADay) {
    expectDate("03/JJJ 2021", 1, 3, 2021);
}

TEST_F(CTimeDateInputTest, NoDelimiterFollowsAWord) {
    expectFailure("05.JJJ.2021", badStream(L"is", eof | fail), eof | fail);
    expectFailure("05.JJJ .2021", badStream(L"is", fail), fail, ".2021");
}

TEST_F(CTimeDateInputTest, OrdinaryNamesOfMonthsAreRefused) {
    expectFailure("05.Jan 2021", badMonthName(L"Jan"), 0, " 2021");
    expectFailure("05.January 2021", badMonthName(L"January"), 0, " 2021");
    expectFailure("05.jjj 2021", badMonthName(L"jjj"), 0, " 2021");
    expectFailure("05.JJj 2021", badMonthName(L"JJj"), 0, " 2021");
    expectFailure("05.JAJ 2021", badMonthName(L"JAJ"), 0, " 2021");
    expectFailure("05.XXX 2021", badMonthName(L"XXX"), 0, " 2021");
}

TEST_F(CTimeDateInputTest, DecemberIsRefused) {
    expectFailure("05.DDD 2021", badMonthName(L"DDD"), 0, " 2021");
}

TEST_F(CTimeDateInputTest, ShortWordsAreRefused) {
    expectFailure("05.J 2021", badMonthName(L"J"), 0, " 2021");
    expectFailure("05.JJ 2021", badMonthName(L"JJ"), 0, " 2021");
    expectFailure("05.JJ", badMonthName(L"JJ"), eof);
}

// The number's sign is gone when the word is read.
TEST_F(CTimeDateInputTest, ASignBeforeAWordIsLost) {
    expectDate("05.-JJJ 2021", 5, 1, 2021);
}

TEST_F(CTimeDateInputTest, ANumberThatIsTooLargeIsGoneWhenTheWordIsRead) {
    expectFailure("05.99999999999.2021", badMonthName(L".2021"), eof);
    expectFailure("05.99999999999", badStream(L"is", eof | fail), eof | fail);
    expectFailure("99999999999.03.2021", badStream(L"is", fail), fail, ".03.2021");
}

TEST_F(CTimeDateInputTest, ADateThatIsNoneIsNamedInQuotes) {
    expectFailure("31.02.2021", badDate(L"\"2021/2/31\""), eof);
    expectFailure("2021-02-29 x", badDate(L"\"2021/2/29\""), 0, " x");
    expectFailure("13/05/2021", badDate(L"\"2021/13/5\""), eof);
    expectFailure("05.03.21", badDate(L"\"21/3/5\""), eof);
    expectFailure("05.03.1399", badDate(L"\"1399/3/5\""), eof);
}

TEST_F(CTimeDateInputTest, ATextThatEndsTooEarlyIsTheEndOfTheInput) {
    for (char const* const text : {"", " ", "05", "05 ", "05.", "05. ", "05.03", "05.03 ", "05.03.",
                                   "05.03. ", "05.JJJ", "05.JJJ ", "+", "05.-"})
        expectFailure(text, badStream(L"is", eof | fail), eof | fail);
}

TEST_F(CTimeDateInputTest, AFailureNamesTheLineOfItsStep) {
    auto const read = [](std::string const& text) {
        std::istringstream stream(text);
        CDate::readDate(stream);
    };
    TimeTest::expectLinesInOrder(
        {"x", "05", "05x", "05.", "05.03", "05.03x", "05.03.", "31.02.2021"}, read);
}

TEST_F(CTimeDateInputTest, ATextThatGoesWrongIsABadStream) {
    expectFailure("x", badStream(L"is", fail), fail, "x");
    expectFailure(".03.2021", badStream(L"is", fail), fail, ".03.2021");
    expectFailure("05.03.x", badStream(L"is", fail), fail, "x");
    expectFailure("--5.03.2021", badStream(L"is", fail), fail, "-5.03.2021");
}

TEST_F(CTimeDateInputTest, ALetterBeyondASCIIIsAKeyLikeAnother) {
    std::istringstream narrow("05.\xC3\xA9\xC3\xA9\xC3\xA9 2021");
    EXPECT_EQ(timeFailureOf([&] { CDate::readDate(narrow); }), badMonthName(L"\u00E9\u00E9\u00E9"));
    std::wistringstream wide(L"05.\u00E9\u00E9\u00E9 2021");
    EXPECT_EQ(timeFailureOf([&] { CDate::readDate(wide); }), badMonthName(L"\u00E9\u00E9\u00E9"));
    std::wistringstream delimiter(L"05\u00B703");
    EXPECT_EQ(timeFailureOf([&] { CDate::readDate(delimiter); }), badDelimiter(L"\u00B7"));
}

// The key is what a wide stream makes of the one byte, which may be nothing.
TEST_F(CTimeDateInputTest, AByteBeyondASCIIAsADelimiterIsWidenedAsOnAStream) {
    std::istringstream stream("05\xC2\xB7"
                              "03.2021");
    std::wostringstream widened;
    widened << '\xC2';
    EXPECT_EQ(timeFailureOf([&] { CDate::readDate(stream); }), badDelimiter(widened.str()));
}

TEST_F(CTimeDateInputTest, AWordThatCannotBeQuotedFailsAsAConversion) {
    std::istringstream stream("05.\xE9\xE9\xE9 2021");
    EXPECT_THROW(CDate::readDate(stream), Encoding::TExcEncoding);
    EXPECT_EQ(stream.rdstate(), std::ios_base::goodbit);
}

TEST_F(CTimeDateInputTest, AZeroIsACharacterLikeAnother) {
    expectFailure("05\0"
                  "03.2021"s,
                  badDelimiter(L"\0"s), 0, "03.2021");
    expectFailure("05.03\0"
                  "2021"s,
                  badDelimiter(L"\0"s), 0, "2021");
    expectFailure("\0"
                  "05.03.2021"s,
                  badStream(L"is", fail), fail,
                  "\0"
                  "05.03.2021"s);
    expectFailure("05.\0"
                  "03 2021"s,
                  badMonthName(L"\0"
                               L"03"s),
                  0, " 2021");
    expectDate("05.JJJ\0 2021"s, 5, 1, 2021);
    expectDate("05.03.2021\0"s, 5, 3, 2021, 0, "\0"s);
}

// A wide letter is compared whole: no low byte of another makes a month.
TEST_F(CTimeDateInputTest, AWideLetterIsNoMonthByItsLowByte) {
    std::wistringstream stream(L"05.\u014A\u014A\u014A 2021");
    EXPECT_EQ(timeFailureOf([&] { CDate::readDate(stream); }), badMonthName(L"\u014A\u014A\u014A"));
}

TEST_F(CTimeDateInputTest, AStreamThatHasFailedIsRefusedAtOnce) {
    std::istringstream stream("05.03.2021");
    stream.setstate(std::ios_base::badbit);
    EXPECT_EQ(timeFailureOf([&] { CDate::readDate(stream); }), badStream(L"is", 1));
    stream.clear(std::ios_base::failbit | std::ios_base::eofbit);
    EXPECT_EQ(timeFailureOf([&] { CDate::readDate(stream); }), badStream(L"is", 6));
    stream.clear();
    EXPECT_EQ(fieldsOf(CDate::readDate(stream)), TFields(5, 3, 2021));
}

TEST_F(CTimeDateInputTest, AStreamAtItsEndIsReadInVain) {
    std::istringstream stream("x");
    stream.get();
    stream.peek();
    ASSERT_EQ(stream.rdstate(), std::ios_base::eofbit);
    EXPECT_EQ(timeFailureOf([&] { CDate::readDate(stream); }), badStream(L"is", 6));
}

TEST_F(CTimeDateInputTest, SkippingWhiteSpaceDoesNotDependOnTheStream) {
    std::istringstream stream(" 05 .03.2021");
    stream >> std::noskipws;
    EXPECT_EQ(fieldsOf(CDate::readDate(stream)), TFields(5, 3, 2021));
}

// Fails at the n-th character.
class CBreakingBuffer : public std::streambuf {
  public:
    explicit CBreakingBuffer(std::string text) : text_(std::move(text)) {
        setg(text_.data(), text_.data(), text_.data() + text_.size());
    }

  protected:
    int_type underflow() override { throw std::runtime_error("disk"); }

  private:
    std::string text_;
};

TEST_F(CTimeDateInputTest, ABufferThatBreaksIsABadStream) {
    for (std::string const text : {"05.03.20", "05.03", "05", "", "05.JJJ"}) {
        CBreakingBuffer buffer(text);
        std::istream stream(&buffer);
        CTimeFailure const failure = timeFailureOf([&] { CDate::readDate(stream); });
        EXPECT_EQ(failure.parameters.at(3).second, L"Internal error: bad input stream") << text;
        EXPECT_TRUE(stream.bad());
        EXPECT_FALSE(stream.eof());
    }
}

TEST_F(CTimeDateInputTest, WhatIsReadIsNotLogged) {
    TestSupport::CLogRecorder const recorder;
    TestSupport::CInstalledTarget<Error::TTgtLogger, Error::TSevError> const installed(recorder);
    reading("31.02.2021");
    reading("05.03.2021");
    EXPECT_THROW(CDate(L"31", L"2", L"2021"), Time::TExcTimeDateTime);
    EXPECT_TRUE(recorder.records().empty());
}

// Three texts.

TFields fieldsOfTexts(Strings::string const& day, Strings::string const& month,
                      Strings::string const& year) {
    return fieldsOf(CDate(day, month, year));
}

void expectTextsFail(Strings::string const& day, Strings::string const& month,
                     Strings::string const& year, CTimeFailure const& failure) {
    EXPECT_EQ(timeFailureOf([&] { CDate(day, month, year); }), failure)
        << testing::PrintToString(day) << testing::PrintToString(month)
        << testing::PrintToString(year);
}

CTimeFailure badTexts(Strings::string const& type, Strings::string const& key,
                      Strings::string const& reason, Strings::string const& day,
                      Strings::string const& month, Strings::string const& year) {
    return wrongArgument(type, key, reason, {{"day", day}, {"month", month}, {"year", year}});
}

TEST_F(CTimeDateInputTest, ThreeTextsMakeADate) {
    EXPECT_EQ(fieldsOfTexts(L"5", L"3", L"2021"), TFields(5, 3, 2021));
    EXPECT_EQ(fieldsOfTexts(L" 05", L"\t03", L"\n02021"), TFields(5, 3, 2021));
}

TEST_F(CTimeDateInputTest, WhatFollowsANumberIsIgnored) {
    EXPECT_EQ(fieldsOfTexts(L"12abc", L"3.5", L"2021 x"), TFields(12, 3, 2021));
    EXPECT_EQ(fieldsOfTexts(L"5", L"3 x", L"2021"), TFields(5, 3, 2021));
}

TEST_F(CTimeDateInputTest, TextsKeepTheUncutNumbers) {
    EXPECT_EQ(fieldsOfTexts(L"65541", L"-65533", L"67557"), TFields(65541, -65533, 67557));
}

TEST_F(CTimeDateInputTest, AMonthsTextMayBeAWord) {
    EXPECT_EQ(fieldsOfTexts(L"5", L"JJJ", L"2021"), TFields(5, 1, 2021));
    EXPECT_EQ(fieldsOfTexts(L"5", L" NNN ", L"2021"), TFields(5, 11, 2021));
    EXPECT_EQ(fieldsOfTexts(L"5", L"SSSeptember\n", L"2021"), TFields(5, 9, 2021));
    EXPECT_EQ(fieldsOfTexts(L"5", L"+JJJ", L"2021"), TFields(5, 1, 2021));
}

TEST_F(CTimeDateInputTest, AMonthsTextThatIsNoSuchWordIsRefused) {
    expectTextsFail(L"5", L"Jan", L"2021", badMonthName(L"Jan"));
    expectTextsFail(L"5", L" Mae x", L"2021", badMonthName(L"Mae"));
    expectTextsFail(L"5", L"DDD", L"2021", badMonthName(L"DDD"));
    expectTextsFail(L"5", L"J", L"2021", badMonthName(L"J"));
    expectTextsFail(L"5", L"99999999999x", L"2021", badMonthName(L"x"));
}

TEST_F(CTimeDateInputTest, AWordMustBeAllOfTheMonthsText) {
    expectTextsFail(L"5", L"JJJ x", L"2021",
                    badTexts(L"month", L"JJJ x", L"Invalid month", L"5", L"JJJ x", L"2021"));
    expectTextsFail(L"", L" JJJ 1 2", L"x",
                    badTexts(L"month", L" JJJ 1 2", L"Invalid month", L"", L" JJJ 1 2", L"x"));
}

TEST_F(CTimeDateInputTest, AMonthsTextWithNothingInItIsTheEndOfTheInput) {
    for (wchar_t const* const month : {L"", L" \t", L"+", L"99999999999"})
        expectTextsFail(L"5", month, L"2021", badStream(L"issMonth", 6));
}

TEST_F(CTimeDateInputTest, AZeroInATextIsACharacterLikeAnother) {
    EXPECT_EQ(fieldsOfTexts(L"5\0"
                            L"6"s,
                            L"3\0"s, L"2021\0"s),
              TFields(5, 3, 2021));
    EXPECT_EQ(fieldsOfTexts(L"5",
                            L"JJJ\0"
                            L"1"s,
                            L"2021"),
              TFields(5, 1, 2021));
    expectTextsFail(L"5", L"\0"s, L"2021", badMonthName(L"\0"s));
    expectTextsFail(L"\0"
                    L"5"s,
                    L"3", L"2021",
                    badTexts(L"Date", L"2021/3/0", L"Invalid date",
                             L"\0"
                             L"5"s,
                             L"3", L"2021"));
}

TEST_F(CTimeDateInputTest, AnUnreadNumberCountsAsZero) {
    expectTextsFail(L"", L"3", L"2021",
                    badTexts(L"Date", L"2021/3/0", L"Invalid date", L"", L"3", L"2021"));
    expectTextsFail(L"x5", L"3", L"y",
                    badTexts(L"Date", L"0/3/0", L"Invalid date", L"x5", L"3", L"y"));
}

TEST_F(CTimeDateInputTest, TextsThatAreNoDateAreRefusedWithAllThree) {
    expectTextsFail(L"31", L"2", L"2021",
                    badTexts(L"Date", L"2021/2/31", L"Invalid date", L"31", L"2", L"2021"));
    expectTextsFail(L"29 x", L"FFF", L"2021y",
                    badTexts(L"Date", L"2021/2/29", L"Invalid date", L"29 x", L"FFF", L"2021y"));
    expectTextsFail(L"5", L"3", L"21",
                    badTexts(L"Date", L"21/3/5", L"Invalid date", L"5", L"3", L"21"));
}

} // namespace
