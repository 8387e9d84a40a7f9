// Dates and times while the global C++ locale groups digits: what goes through a stream follows it.

#include "2System/Time/TimeDate.h"
#include "2System/Time/TimeTime.h"

#include "2System/Time/TimeDateFields.h"
#include "2System/Time/TimeFailure.h"
#include "2System/Time/TimeLocales.h"
#include "2System/Time/TimeWritten.h"
#include "support/LogRecorder.h"
#include "support/Registry.h"

#include <gtest/gtest.h>

#include <sstream>
#include <string>

namespace {

using TestSupport::TParameters;
using Time::CDate;
using Time::CTime;
using TimeTest::badStream;
using TimeTest::CGroupingLocale;
using TimeTest::expectText;
using TimeTest::fieldsOf;
using TimeTest::TFields;
using TimeTest::timeFailureOf;
using TimeTest::uncheckedDate;
using TimeTest::wrongArgument;

using CTimeLocaleTest = TestSupport::CErrorTest;

TEST_F(CTimeLocaleTest, WrittenNumbersAreGrouped) {
    CGroupingLocale const locale(',', "\3");
    expectText(uncheckedDate(5, 3, 2021), "05.03.2,021");
    expectText(uncheckedDate(5, 3, 10000), "05.03.10,000");
    expectText(CTime(1000, 5, 9, 0), "1,000:05:09");
}

TEST_F(CTimeLocaleTest, GroupsMayHaveAnyLengths) {
    CGroupingLocale const locale('_', "\1\2");
    expectText(uncheckedDate(5, 3, 2021), "05.03.2_02_1");
    expectText(CTime(8, 15, 9, 0), "08:1_5:09");
}

TEST_F(CTimeLocaleTest, AStreamKeepsTheLocaleThatItWasMadeWith) {
    std::ostringstream stream;
    CGroupingLocale const locale(',', "\3");
    stream << CDate(5, CDate::emMar, 2021);
    EXPECT_EQ(stream.str(), "05.03.2021");
}

TEST_F(CTimeLocaleTest, TextsOfFieldsAreGrouped) {
    CGroupingLocale const locale(',', "\3");
    Strings::string text;
    CDate(5, CDate::emMar, 2021).getYear(text);
    EXPECT_EQ(text, L"2,021");
    CTime(-1234, 0, 0, 0).getHour(text);
    EXPECT_EQ(text, L"-1,234");
}

TEST_F(CTimeLocaleTest, AKeyIsPlainWhereLoggedNumbersAreGrouped) {
    CGroupingLocale const locale(',', "\3");
    TestSupport::CLogRecorder const recorder;
    TestSupport::CInstalledTarget<Error::TTgtLogger, Error::TSevError> const installed(recorder);
    EXPECT_EQ(timeFailureOf([] { CDate(31, CDate::emFeb, 2021); }),
              wrongArgument(L"Date", L"2021/2/31", L"Invalid date"));
    ASSERT_EQ(recorder.records().size(), 1U);
    EXPECT_EQ(recorder.records()[0].expanded,
              L"'Time::CDate::CDate()': Invalid date \"2,021/2/31\"!");
}

template <class TCh>
TFields dateOf(std::string const& text) {
    std::basic_istringstream<TCh> stream(std::basic_string<TCh>(text.begin(), text.end()));
    return fieldsOf(CDate::readDate(stream));
}

TEST_F(CTimeLocaleTest, ReadNumbersMayBeGrouped) {
    CGroupingLocale const locale(',', "\3");
    EXPECT_EQ(dateOf<char>("05.03.2,021"), TFields(5, 3, 2021));
    EXPECT_EQ(dateOf<wchar_t>("2,021-03-05"), TFields(5, 3, 2021));
    EXPECT_EQ(dateOf<char>("05.03.2021"), TFields(5, 3, 2021));
    EXPECT_EQ(fieldsOf(CDate(L"5", L"3", L"2,021")), TFields(5, 3, 2021));
    std::wistringstream stream(L"1,000:05");
    EXPECT_EQ(CTime::readTime(stream).getHour(), 1000);
}

TEST_F(CTimeLocaleTest, WrongGroupsAreABadStream) {
    CGroupingLocale const locale(',', "\3");
    EXPECT_EQ(timeFailureOf([] { dateOf<char>("05.03.20,21 x"); }), badStream(L"is", 4));
    EXPECT_EQ(timeFailureOf([] { dateOf<wchar_t>("20,21-03-05"); }), badStream(L"is", 4));
}

// With the dot between groups, a date with dots is one number of wrong groups.
TEST_F(CTimeLocaleTest, ADateWithTheGroupsOwnDelimiterIsNone) {
    CGroupingLocale const locale('.', "\3");
    EXPECT_EQ(timeFailureOf([] { dateOf<char>("05.03.2021"); }), badStream(L"is", 6));
    EXPECT_EQ(dateOf<char>("2021-03-05"), TFields(5, 3, 2021));
}

} // namespace
