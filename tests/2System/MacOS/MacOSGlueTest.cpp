#include "2System/MacOS/MacOSGlue.h"

#include "2System/Time/TimeExc.h"
#include "support/Registry.h"

#include <string>

namespace {

using CMacOSGlueTest = TestSupport::CErrorTest;

using Time::CDate;
using Time::CDateTime;

DateTimeRec recordOf(std::int16_t year, std::int16_t month, std::int16_t day) {
    return {year, month, day, 8, 5, 9, 1};
}

TEST_F(CMacOSGlueTest, ARecordsFieldsBecomeADateTime) {
    CDateTime const moment = MacOS::getTime({2021, 3, 5, 8, 6, 9, 1});
    EXPECT_EQ(moment.getDay(), 5);
    EXPECT_EQ(moment.getMonth(), CDate::emMar);
    EXPECT_EQ(moment.getYear(), 2021);
    EXPECT_EQ(moment.getHour(), 8);
    EXPECT_EQ(moment.getMinute(), 6);
    EXPECT_EQ(moment.getSecond(), 9);
    EXPECT_EQ(moment.getMilliSecond(), 0);
}

TEST_F(CMacOSGlueTest, TheDayOfTheWeekDoesNotCount) {
    for (std::int16_t day = -1; day < 9; ++day)
        EXPECT_EQ(MacOS::getTime({2021, 3, 5, 8, 6, 9, day}),
                  CDateTime(5, CDate::emMar, 2021, 8, 6, 9, 0));
}

TEST_F(CMacOSGlueTest, ADateThatIsNoneIsRefused) {
    for (DateTimeRec const& record :
         {recordOf(2021, 2, 29), recordOf(2021, 13, 1), recordOf(2021, 0, 1), recordOf(2021, 3, 0),
          recordOf(2021, 4, 31), recordOf(2021, -1, 1)})
        EXPECT_THROW(MacOS::getTime(record), Time::TExcTimeDateTime)
            << record.month << ", " << record.day;
    EXPECT_EQ(MacOS::getTime(recordOf(2020, 2, 29)).getDay(), 29);
}

TEST_F(CMacOSGlueTest, ATimeIsTakenAsItIs) {
    CDateTime const moment = MacOS::getTime({2021, 3, 5, 25, 61, -1, 1});
    EXPECT_EQ(moment.getHour(), 25);
    EXPECT_EQ(moment.getMinute(), 61);
    EXPECT_EQ(moment.getSecond(), -1);
}

TEST_F(CMacOSGlueTest, APathIsTheNamesUTF8) {
    EXPECT_EQ(MacOS::convertToPosixPath(FileSys::CFileSpec(L"/home/ada/B\u00FCcher \U0001F600")),
              "/home/ada/B\xC3\xBC"
              "cher \xF0\x9F\x98\x80");
    EXPECT_EQ(MacOS::convertToPosixPath(FileSys::CFileSpec(L"a//b/../c/")), "a//b/../c/");
    EXPECT_EQ(MacOS::convertToPosixPath(FileSys::CFileSpec()), "");
}

} // namespace
