#include "1Base/Error/Error.h"
#include "1Base/StdUtil/StdUtilExc.h"
#include "2System/Time/TimeDateTime.h"
#include "2System/Time/TimeOutcome.h"
#include "support/LogRecorder.h"
#include "support/ObjectCount.h"

#include <string>

namespace {

using Time::CDateTime;
using namespace std::string_literals;

using CTimeDateTimeCEFACTTest = TestSupport::CObjectCountTest;

std::string read(std::wstring const& text, int code) {
    return TimeTest::outcomeOf(
        [&] { return CDateTime::readDateTimeFromCEFACTFormatCode(text, code); });
}

std::string invalidCode(std::string const& text) {
    return "TimeDateTime: " + TimeTest::wrongArgument("XML date", text, "Invalid format code");
}

std::string invalidDate(std::string const& key, std::string const& day, std::string const& month,
                        std::string const& year) {
    return "TimeDateTime: " + TimeTest::wrongArgument("Date", key, "Invalid date") + "|day=" + day +
           "|month=" + month + "|year=" + year;
}

struct CFormat {
    int code;
    wchar_t const* text; // 31 December 2021, 12:30:45 as far as it goes
    std::size_t length;
};

constexpr CFormat formats[] = {
    {2, L"311221", 6},          {3, L"123121", 6},
    {4, L"31122021", 8},        {5, L"311220211230", 12},
    {101, L"211231", 6},        {102, L"20211231", 8},
    {201, L"2112311230", 10},   {202, L"211231123045", 12},
    {203, L"202112311230", 12}, {204, L"20211231123045", 14},
};

TEST_F(CTimeDateTimeCEFACTTest, FormatsOfFourDigitYearsAreRead) {
    EXPECT_EQ(read(L"31122021", 4), "2021-12-31 0:0:0.0");
    EXPECT_EQ(read(L"311220211230", 5), "2021-12-31 12:30:0.0");
    EXPECT_EQ(read(L"20211231", 102), "2021-12-31 0:0:0.0");
    EXPECT_EQ(read(L"202112311230", 203), "2021-12-31 12:30:0.0");
    EXPECT_EQ(read(L"20211231123045", 204), "2021-12-31 12:30:45.0");
    EXPECT_EQ(read(L"20210305", 102), "2021-3-5 0:0:0.0");
    EXPECT_EQ(read(L"20210305123045", 204), "2021-3-5 12:30:45.0");
    EXPECT_EQ(read(L"050320211230", 5), "2021-3-5 12:30:0.0");
}

TEST_F(CTimeDateTimeCEFACTTest, YearsOfTwoDigitsAreNoYears) {
    std::string const refused = invalidDate("21/12/31", "31", "12", "21");
    EXPECT_EQ(read(L"311221", 2), refused);
    EXPECT_EQ(read(L"123121", 3), refused);
    EXPECT_EQ(read(L"211231", 101), refused);
    EXPECT_EQ(read(L"2112311230", 201), refused);
    EXPECT_EQ(read(L"211231123045", 202), refused);
    EXPECT_EQ(read(L"210305", 101), invalidDate("21/3/5", "05", "03", "21"));
}

TEST_F(CTimeDateTimeCEFACTTest, EveryFormatHasItsLeastLength) {
    for (CFormat const& format : formats) {
        std::wstring const text(format.text);
        ASSERT_EQ(text.size(), format.length);
        std::wstring const shorter = text.substr(0, text.size() - 1);
        EXPECT_EQ(read(shorter, format.code), invalidCode(TimeTest::narrow(shorter)));
        EXPECT_EQ(read(L"", format.code), invalidCode(""));
        // More than that is passed over.
        EXPECT_EQ(read(text + L"extra", format.code), read(text, format.code));
    }
    EXPECT_EQ(read(L"05032021extra", 4), "2021-3-5 0:0:0.0");
    EXPECT_EQ(read(L"2021030", 102), invalidCode("2021030"));
}

TEST_F(CTimeDateTimeCEFACTTest, OtherCodesAreUnknown) {
    for (int const code : {-1, 0, 1, 6, 100, 103, 200, 205, 999, 65538, -2147483647})
        EXPECT_EQ(read(L"20210305123045", code), invalidCode("20210305123045"));
    EXPECT_EQ(read(L"\0"s, 999), invalidCode("\0"s));
}

TEST_F(CTimeDateTimeCEFACTTest, FieldsAreCutAndReadOneByOne) {
    EXPECT_EQ(read(L"2021 3 5 1 2 3", 204), "2021-3-5 1:2:3.0");
    EXPECT_EQ(read(L"202103051x2x3x", 204), "2021-3-5 1:2:3.0");
    EXPECT_EQ(read(L"20210305996199", 204), "2021-3-5 99:61:99.0");
    EXPECT_EQ(read(L"20210305-1+2-3", 204), "2021-3-5 -1:2:-3.0");
    EXPECT_EQ(read(L"2021x305", 102),
              "TimeDateTime: " + TimeTest::wrongArgument("month", "x3", "Invalid month name"));
    EXPECT_EQ(read(L"2021-305", 102), invalidDate("2021/-3/5", "05", "-3", "2021"));
    EXPECT_EQ(read(L"xxxx0305", 102), invalidDate("0/3/5", "05", "03", "xxxx"));
    EXPECT_EQ(read(L"202103xx", 102), invalidDate("2021/3/0", "xx", "03", "2021"));
    EXPECT_EQ(read(L"20210230", 102), invalidDate("2021/2/30", "30", "02", "2021"));
}

TEST_F(CTimeDateTimeCEFACTTest, AZeroIsACharacterLikeAnother) {
    EXPECT_EQ(read(L"2021035\0"
                   L"1\0"
                   L"2345"s,
                   204),
              "2021-3-5 1:23:45.0");
    EXPECT_EQ(read(L"20210305\0"s, 102), "2021-3-5 0:0:0.0");
    EXPECT_EQ(read(L"2021\0"
                   L"305"s,
                   102),
              "TimeDateTime: " + TimeTest::wrongArgument("month",
                                                         "\0"
                                                         "3"s,
                                                         "Invalid month name"));
    EXPECT_EQ(read(L"2021030\0"s.substr(0, 7), 102), invalidCode("2021030"));
    EXPECT_THROW(CDateTime::readDateTimeFromCEFACTFormatCode(L"20210305\0"
                                                             L"12345"s,
                                                             204),
                 StdUtil::TExcStreamCast);
}

TEST_F(CTimeDateTimeCEFACTTest, ATimeThatIsNoNumberFailsAsACast) {
    for (wchar_t const* const text : {L"20210305xx3045", L"2021030512xx45", L"202103051230xx",
                                      L"20210305  3045", L"20210305- 3045"})
        EXPECT_THROW(CDateTime::readDateTimeFromCEFACTFormatCode(text, 204),
                     StdUtil::TExcStreamCast);
}

TEST_F(CTimeDateTimeCEFACTTest, ABadDateIsFoundBeforeABadTime) {
    EXPECT_EQ(read(L"20210230xxxxxx", 204), invalidDate("2021/2/30", "30", "02", "2021"));
}

TEST_F(CTimeDateTimeCEFACTTest, NothingIsLogged) {
    TestSupport::CLogRecorder const recorder;
    TestSupport::CInstalledTarget<Error::TTgtLogger, Error::TSevError> const installed(recorder);
    read(L"20210230", 102);
    EXPECT_TRUE(recorder.records().empty());
}

} // namespace
