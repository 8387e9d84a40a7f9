// Dates as values: how they are made, what they tell, how they compare and what they look like.

#include "2System/Time/TimeDate.h"
#include "1Base/Error/ErrorMacros.h"
#include "2System/Time/TimeDateTime.h"
#include "2System/Time/_Imp/TimeNames.h"

#include "2System/Time/TimeDateFields.h"
#include "2System/Time/TimeFailure.h"
#include "2System/Time/TimeWritten.h"
#include "support/LogRecorder.h"
#include "support/Registry.h"
#include "support/TextFailures.h"

#include <gtest/gtest.h>

#include <array>
#include <climits>
#include <cstring>
#include <iomanip>
#include <sstream>
#include <string>
#include <vector>

namespace {

using TestSupport::CLogRecord;
using TestSupport::failedCheckOf;
using TestSupport::TParameters;
using Time::CDate;
using TimeTest::expectText;
using TimeTest::fieldsOf;
using TimeTest::monthOf;
using TimeTest::TFields;
using TimeTest::timeFailureOf;
using TimeTest::uncheckedDate;
using TimeTest::wrongArgument;

using CTimeDateTest = TestSupport::CErrorTest;

TEST_F(CTimeDateTest, ADateKeepsItsFields) {
    CDate const date(5, CDate::emMar, 2021);
    EXPECT_EQ(date.getDay(), 5);
    EXPECT_EQ(date.getMonth(), CDate::emMar);
    EXPECT_EQ(date.getYear(), 2021);
}

TEST_F(CTimeDateTest, TheFieldsLieInTheirOrder) {
    CDate const date(5, CDate::emMar, 2021);
    std::array<int, 3> fields = {};
    static_assert(sizeof(fields) == sizeof(date));
    std::memcpy(fields.data(), &date, sizeof(date));
    EXPECT_EQ(fields, (std::array<int, 3>{5, 3, 2021}));
}

TEST_F(CTimeDateTest, ADateKeepsWhatItsTestCutsOff) {
    EXPECT_EQ(fieldsOf(CDate(5, CDate::emMar, 67557)), TFields(5, 3, 67557));
    EXPECT_EQ(fieldsOf(CDate(5, monthOf(65539), 2021)), TFields(5, 65539, 2021));
    EXPECT_EQ(fieldsOf(CDate(5 - 65536, CDate::emMar, 2021)), TFields(5 - 65536, 3, 2021));
}

TEST_F(CTimeDateTest, AStructOfTheCLibraryIsNotTested) {
    std::tm time = {};
    time.tm_mday = 5;
    time.tm_mon = 2;
    time.tm_year = 121;
    EXPECT_EQ(fieldsOf(CDate(time)), TFields(5, 3, 2021));
    time.tm_mday = 99;
    time.tm_mon = -1;
    time.tm_year = -1900;
    EXPECT_EQ(fieldsOf(CDate(time)), TFields(99, 0, 0));
    time.tm_mon = INT_MAX;
    time.tm_year = INT_MAX;
    EXPECT_EQ(fieldsOf(CDate(time)), TFields(99, INT_MIN, INT_MIN + 1899));
}

TEST_F(CTimeDateTest, ADateTimeGivesItsDate) {
    Time::CDateTime const dateTime(Time::CTime(8, 5, 9, 123), uncheckedDate(31, 2, 2021));
    EXPECT_EQ(fieldsOf(CDate(dateTime)), TFields(31, 2, 2021));
}

TEST_F(CTimeDateTest, ADateThatIsNoneIsLoggedAndRaised) {
    TestSupport::CLogRecorder const recorder;
    TestSupport::CInstalledTarget<Error::TTgtLogger, Error::TSevError> const installed(recorder);
    EXPECT_EQ(timeFailureOf([] { CDate(31, CDate::emFeb, 2021); }),
              wrongArgument(L"Date", L"2021/2/31", L"Invalid date"));

    ASSERT_EQ(recorder.records().size(), 1U);
    CLogRecord const& record = recorder.records()[0];
    EXPECT_EQ(record.tag, "TimeDateTime");
    EXPECT_EQ(record.target, "TgtLogger");
    EXPECT_EQ(record.severity, "SevError");
    EXPECT_EQ(
        record.parameters,
        (TParameters{
            {"year", L"2021"},
            {"month", L"2"},
            {"day", L"31"},
            {"__msg__", L"'Time::CDate::CDate()': Invalid date \"@(year)/@(month)/@(day)\"!"}}));
    EXPECT_EQ(record.expanded, L"'Time::CDate::CDate()': Invalid date \"2021/2/31\"!");
    EXPECT_NE(std::get<2>(record.place).find("CDate::CDate("), std::string::npos);
}

TEST_F(CTimeDateTest, AValidDateIsNotLogged) {
    TestSupport::CLogRecorder const recorder;
    TestSupport::CInstalledTarget<Error::TTgtLogger, Error::TSevError> const installed(recorder);
    CDate(28, CDate::emFeb, 2021);
    EXPECT_TRUE(recorder.records().empty());
}

TEST_F(CTimeDateTest, AFailureShowsTheUncutFields) {
    EXPECT_EQ(timeFailureOf([] { CDate(-1, monthOf(-2), -2147483647 - 1); }),
              wrongArgument(L"Date", L"-2147483648/-2/-1", L"Invalid date"));
    EXPECT_EQ(timeFailureOf([] { CDate(1, CDate::emJan, 0); }),
              wrongArgument(L"Date", L"0/1/1", L"Invalid date"));
}

template <class TExc>
std::string nameOf() {
    return Error::XExc<TExc>(ERROR_ORIGIN, Error::CMessage(std::string())).getExcName();
}

TEST_F(CTimeDateTest, EachLevelOfTheFailuresHasItsName) {
    EXPECT_EQ(nameOf<Time::TExcTimeDate>(), "TimeDate");
    EXPECT_EQ(nameOf<Time::TExcTimeTime>(), "TimeTime");
    EXPECT_EQ(nameOf<Time::TExcTimeDateTime>(), "TimeDateTime");
    EXPECT_EQ(nameOf<Time::TExcTimeFormatError>(), "TimeFormatError");
}

TEST_F(CTimeDateTest, AFieldReplacesAText) {
    CDate const date = uncheckedDate(5, 3, 2021);
    Strings::string text = L"before";
    date.getDay(text);
    EXPECT_EQ(text, L"5");
    date.getMonth(text);
    EXPECT_EQ(text, L"3");
    date.getYear(text);
    EXPECT_EQ(text, L"2021");

    CDate const odd = uncheckedDate(INT_MIN, 0, INT_MAX);
    odd.getDay(text);
    EXPECT_EQ(text, L"-2147483648");
    odd.getMonth(text);
    EXPECT_EQ(text, L"0");
    odd.getYear(text);
    EXPECT_EQ(text, L"2147483647");
}

TEST_F(CTimeDateTest, WeekdaysHaveEnglishNames) {
    std::vector<std::pair<Strings::string, Strings::string>> const names = {
        {L"Sun", L"Sunday"},   {L"Mon", L"Monday"}, {L"Tue", L"Tuesday"}, {L"Wed", L"Wednesday"},
        {L"Thu", L"Thursday"}, {L"Fri", L"Friday"}, {L"Sat", L"Saturday"}};
    for (int day = CDate::ewdSun; day <= CDate::ewdSat; ++day) {
        auto const weekday = static_cast<CDate::EWeekDay>(day);
        EXPECT_EQ(CDate::getWeekdayNameShort(weekday), names[static_cast<std::size_t>(day)].first);
        EXPECT_EQ(CDate::getWeekdayNameLong(weekday), names[static_cast<std::size_t>(day)].second);
    }
}

TEST_F(CTimeDateTest, MonthsHaveEnglishNames) {
    std::vector<std::pair<Strings::string, Strings::string>> const names = {
        {L"Jan", L"January"},   {L"Feb", L"Febuary"}, {L"Mar", L"March"},    {L"Apr", L"April"},
        {L"May", L"May"},       {L"Jun", L"June"},    {L"Jul", L"July"},     {L"Aug", L"August"},
        {L"Sep", L"September"}, {L"Oct", L"October"}, {L"Nov", L"November"}, {L"Dec", L"December"}};
    for (int month = CDate::emJan; month <= CDate::emDec; ++month) {
        auto const& expected = names[static_cast<std::size_t>(month - 1)];
        EXPECT_EQ(CDate::getMonthNameShort(monthOf(month)), expected.first);
        EXPECT_EQ(CDate::getMonthNameLong(monthOf(month)), expected.second);
    }
}

TEST_F(CTimeDateTest, TheSecondMonthKeepsItsSpelling) {
    EXPECT_EQ(CDate::getMonthNameLong(monthOf(CDate::emJan + 1)), L"Febuary");
}

TEST_F(CTimeDateTest, MayIsOneStringInBothTables) {
    EXPECT_EQ(static_cast<void const*>(Time::Detail::shortMonthName[4]),
              static_cast<void const*>(Time::Detail::longMonthName[4]));
}

TEST_F(CTimeDateTest, ANameOutsideTheListsFailsAnAssertion) {
    for (int const day : {INT_MIN, -1, 7, INT_MAX}) {
        auto const weekday = static_cast<CDate::EWeekDay>(day);
        char const* const text = "ewdSun<=weekday && ewdSat>=weekday";
        EXPECT_EQ(failedCheckOf([&] { CDate::getWeekdayNameShort(weekday); }), text) << day;
        EXPECT_EQ(failedCheckOf([&] { CDate::getWeekdayNameLong(weekday); }), text) << day;
    }
    for (int const month : {INT_MIN, -1, 0, 13, INT_MAX}) {
        char const* const text = "emJan<=month && emDec>=month";
        EXPECT_EQ(failedCheckOf([&] { CDate::getMonthNameShort(monthOf(month)); }), text) << month;
        EXPECT_EQ(failedCheckOf([&] { CDate::getMonthNameLong(monthOf(month)); }), text) << month;
    }
}

TEST_F(CTimeDateTest, DatesCompareByYearThenMonthThenDay) {
    // In ascending order; what nobody tested takes part.
    std::vector<CDate> const dates = {uncheckedDate(31, 12, INT_MIN), uncheckedDate(31, 12, 2020),
                                      uncheckedDate(1, 0, 2021),      uncheckedDate(-1, 1, 2021),
                                      uncheckedDate(2, 1, 2021),      uncheckedDate(31, 1, 2021),
                                      uncheckedDate(1, 2, 2021),      uncheckedDate(1, 1, 2022)};
    for (std::size_t i = 0; i < dates.size(); ++i)
        for (std::size_t j = 0; j < dates.size(); ++j) {
            EXPECT_EQ(dates[i] < dates[j], i < j) << i << ' ' << j;
            EXPECT_EQ(dates[i] > dates[j], i > j) << i << ' ' << j;
            EXPECT_EQ(dates[i] <= dates[j], i <= j) << i << ' ' << j;
            EXPECT_EQ(dates[i] >= dates[j], i >= j) << i << ' ' << j;
            EXPECT_EQ(dates[i] == dates[j], i == j) << i << ' ' << j;
            EXPECT_EQ(dates[i] != dates[j], i != j) << i << ' ' << j;
        }
}

TEST_F(CTimeDateTest, ADateIsWrittenWithDots) {
    std::vector<std::pair<CDate, std::string>> const texts = {
        {CDate(5, CDate::emMar, 2021), "05.03.2021"},
        {CDate(31, CDate::emDec, 1400), "31.12.1400"},
        {CDate(1, CDate::emJan, 10000), "01.01.10000"},
        {uncheckedDate(15, 0, 2023), "15.00.2023"},
        {uncheckedDate(100, 65537, 7), "100.65537.7"},
        {uncheckedDate(-1, -12, -5), "-1.-12.-5"},
        {uncheckedDate(-1, 3, 0), "-1.03.0"}};
    for (auto const& [date, text] : texts)
        expectText(date, text);
}

template <class TCh>
void expectFillAndAdjustmentStay() {
    std::basic_ostringstream<TCh> stream;
    stream << std::left << std::setfill(TCh('*')) << std::setw(9);
    CDate(5, CDate::emMar, 2021).streamTo(stream);
    EXPECT_EQ(stream.fill(), TCh('0'));
    EXPECT_EQ(stream.flags() & std::ios_base::adjustfield, std::ios_base::right);
    EXPECT_EQ(stream.width(), 0);
    stream << TCh(' ') << std::setw(3) << 7;
    std::string const expected = "05.03.2021 007";
    EXPECT_EQ(stream.str(), std::basic_string<TCh>(expected.begin(), expected.end()));
}

TEST_F(CTimeDateTest, FillAndAdjustmentStayOnTheStream) {
    expectFillAndAdjustmentStay<char>();
    expectFillAndAdjustmentStay<wchar_t>();
}

TEST_F(CTimeDateTest, OtherFlagsOfTheStreamArePartOfTheText) {
    expectText(CDate(5, CDate::emMar, 2021), "+5.+3.+2021",
               [](auto& stream) { stream << std::showpos; });
}

TEST_F(CTimeDateTest, AnOutputGivesTheStreamBack) {
    std::ostringstream stream;
    stream << CDate(5, CDate::emMar, 2021) << ' ' << CDate(6, CDate::emMar, 2021);
    EXPECT_EQ(stream.str(), "05.03.2021 06.03.2021");
}

} // namespace
