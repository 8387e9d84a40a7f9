// The texts of the user's locale: what is asked of the platform, and how the two halves are joined.

#include "1Base/Error/Error.h"
#include "2System/Time/TimeDateTime.h"
#include "2System/Time/TimeOutcome.h"
#include "support/ObjectCount.h"
#include "support/PlatformString.h"
#include "support/TableFile.h"
#include "support/TextFailures.h"

#include <CoreFoundation/CoreFoundation.h>

#include <unicode/uversion.h>

#include <cstdio>
#include <cstdlib>
#include <ctime>
#include <map>
#include <set>
#include <string>
#include <tuple>
#include <vector>

namespace {

using Time::CDate;
using Time::CDateTime;

// What a test watches of the platform's calls, in their order.
std::vector<std::string> calls;
CFAbsoluteTime composedMoment = 0;
bool isTextLost = false;

} // namespace

extern "C" {
CFCalendarRef __real_CFCalendarCreateWithIdentifier(CFAllocatorRef, CFCalendarIdentifier);
CFCalendarRef __wrap_CFCalendarCreateWithIdentifier(CFAllocatorRef allocator,
                                                    CFCalendarIdentifier identifier) {
    calls.push_back(identifier == kCFGregorianCalendar ? "gregorian calendar" : "calendar");
    return __real_CFCalendarCreateWithIdentifier(allocator, identifier);
}

CFDateRef __real_CFDateCreate(CFAllocatorRef, CFAbsoluteTime);
CFDateRef __wrap_CFDateCreate(CFAllocatorRef allocator, CFAbsoluteTime at) {
    calls.push_back("date");
    composedMoment = at;
    return __real_CFDateCreate(allocator, at);
}

CFDateFormatterRef __real_CFDateFormatterCreate(CFAllocatorRef, CFLocaleRef, CFDateFormatterStyle,
                                                CFDateFormatterStyle);
CFDateFormatterRef __wrap_CFDateFormatterCreate(CFAllocatorRef allocator, CFLocaleRef locale,
                                                CFDateFormatterStyle dateStyle,
                                                CFDateFormatterStyle timeStyle) {
    calls.push_back("formatter " + std::to_string(dateStyle) + "/" + std::to_string(timeStyle));
    return __real_CFDateFormatterCreate(allocator, locale, dateStyle, timeStyle);
}

CFStringRef __real_CFDateFormatterCreateStringWithDate(CFAllocatorRef, CFDateFormatterRef,
                                                       CFDateRef);
CFStringRef __wrap_CFDateFormatterCreateStringWithDate(CFAllocatorRef allocator,
                                                       CFDateFormatterRef formatter,
                                                       CFDateRef date) {
    calls.push_back("text");
    return isTextLost ? nullptr
                      : __real_CFDateFormatterCreateStringWithDate(allocator, formatter, date);
}
}

namespace {

// Each test runs in a process of its own, so the environment is its to change.
void setLocale(std::string const& name) {
    setenv("LC_ALL", name.c_str(), 1);
}

void setZone(std::string const& name) {
    setenv("TZ", name.c_str(), 1);
}

class CTimeDateTimeLocaleTest : public TestSupport::CObjectCountTest {
  protected:
    void SetUp() override {
        CObjectCountTest::SetUp();
        // An empty LC_ALL leaves it to these.
        for (char const* const variable : {"LC_TIME", "LANG"})
            unsetenv(variable);
        setLocale("en_GB");
        setZone("UTC");
        calls.clear();
    }
};

CDateTime const sample(5, CDate::emMar, 2021, 8, 5, 9, 999);

std::string formatted(CDateTime::EFormat dateFormat, CDateTime::EFormat timeFormat,
                      CDateTime const& value = sample) {
    return TimeTest::narrow(value.format(dateFormat, timeFormat, L" @ "));
}

// A row of recorded answers.
struct CRow {
    std::string locale, zone, moment;
    CDateTime::EFormat dateFormat, timeFormat;
    CDateTime value;
    std::string text;
};

CDateTime valueOf(std::string const& moment) {
    std::tm time = {};
    EXPECT_EQ(std::sscanf(moment.c_str(), "%d-%d-%d %d:%d:%d", &time.tm_year, &time.tm_mon,
                          &time.tm_mday, &time.tm_hour, &time.tm_min, &time.tm_sec),
              6);
    time.tm_year -= 1900;
    time.tm_mon -= 1;
    return CDateTime(time);
}

bool isRecordedIcu() {
    UVersionInfo version;
    u_getVersion(version);
    return version[0] == 72;
}

// What the platform says of one half.
std::u16string platformText(CRow const& row) {
    CFCalendarRef const calendar =
        CFCalendarCreateWithIdentifier(kCFAllocatorDefault, kCFGregorianCalendar);
    CFAbsoluteTime at = 0;
    CFCalendarComposeAbsoluteTime(
        calendar, &at, "yMdHms", row.value.getYear(), static_cast<int>(row.value.getMonth()),
        row.value.getDay(), row.value.getHour(), row.value.getMinute(), row.value.getSecond());
    CFDateRef const date = CFDateCreate(kCFAllocatorDefault, at);
    CFLocaleRef const locale = CFLocaleCopyCurrent();
    CFDateFormatterRef const formatter = CFDateFormatterCreate(
        kCFAllocatorDefault, locale, static_cast<CFDateFormatterStyle>(row.dateFormat),
        static_cast<CFDateFormatterStyle>(row.timeFormat));
    TestSupport::CPlatformString const text(
        CFDateFormatterCreateStringWithDate(kCFAllocatorDefault, formatter, date));
    for (CFTypeRef const object :
         {CFTypeRef(calendar), CFTypeRef(date), CFTypeRef(locale), CFTypeRef(formatter)})
        CFRelease(object);
    return text.units();
}

// The recorded answers; where another ICU is at hand, the texts that the platform gives with it.
std::vector<CRow> readRows() {
    std::vector<CRow> rows;
    for (std::vector<std::string> const& columns : TestSupport::readTable("dates.tsv")) {
        CRow row = {columns.at(0),
                    columns.at(1),
                    columns.at(4),
                    static_cast<CDateTime::EFormat>(std::stoi(columns.at(2))),
                    static_cast<CDateTime::EFormat>(std::stoi(columns.at(3))),
                    valueOf(columns.at(4)),
                    ""};
        setLocale(row.locale);
        setZone(row.zone);
        std::u16string const units =
            isRecordedIcu() ? TestSupport::unitsOfHex(columns.at(6)) : platformText(row);
        row.text = Encoding::convert<std::string>(Strings::stringUTF16(units.begin(), units.end()));
        rows.push_back(row);
    }
    return rows;
}

TEST_F(CTimeDateTimeLocaleTest, EachHalfIsThePlatforms) {
    std::vector<CRow> const rows = readRows();
    ASSERT_EQ(rows.size(), 629U);
    for (CRow const& row : rows) {
        setLocale(row.locale);
        setZone(row.zone);
        EXPECT_EQ(formatted(row.dateFormat, row.timeFormat, row.value), row.text)
            << row.locale << " " << row.zone << " " << row.moment;
    }
}

TEST_F(CTimeDateTimeLocaleTest, TheHalvesAreJoinedInEveryLocale) {
    std::map<std::tuple<std::string, std::string, std::string>, std::vector<CRow>> dates;
    std::vector<CRow> const rows = readRows();
    for (CRow const& row : rows)
        if (row.dateFormat != CDateTime::efNone)
            dates[{row.locale, row.zone, row.moment}].push_back(row);
    std::set<std::string> locales;
    for (CRow const& time : rows) {
        if (time.timeFormat == CDateTime::efNone)
            continue;
        setLocale(time.locale);
        setZone(time.zone);
        for (CRow const& date : dates[{time.locale, time.zone, time.moment}]) {
            locales.insert(time.locale);
            EXPECT_EQ(formatted(date.dateFormat, time.timeFormat, time.value),
                      date.text + " @ " + time.text)
                << time.locale << " " << time.zone << " " << time.moment;
        }
    }
    EXPECT_EQ(locales.size(), 25U);
}

TEST_F(CTimeDateTimeLocaleTest, ASeparatorStandsBetweenTwoTextsOnly) {
    EXPECT_EQ(sample.format(CDateTime::efNone, CDateTime::efNone, L", "), L"");
    EXPECT_EQ(sample.format(CDateTime::efShort, CDateTime::efNone, L", "), L"05/03/2021");
    EXPECT_EQ(sample.format(CDateTime::efNone, CDateTime::efShort, L", "), L"08:05");
    EXPECT_EQ(sample.format(CDateTime::efShort, CDateTime::efShort, L", "), L"05/03/2021, 08:05");
    EXPECT_EQ(sample.format(CDateTime::efShort, CDateTime::efShort, L""), L"05/03/202108:05");
}

TEST_F(CTimeDateTimeLocaleTest, BothTextsAreAskedForInEveryStyle) {
    for (int dateFormat = -1; dateFormat <= 5; ++dateFormat) {
        for (int timeFormat = -1; timeFormat <= 5; ++timeFormat) {
            calls.clear();
            formatted(static_cast<CDateTime::EFormat>(dateFormat),
                      static_cast<CDateTime::EFormat>(timeFormat));
            auto const style = [](int format) {
                return std::to_string(format >= 1 && format <= 4 ? format : 0);
            };
            EXPECT_EQ(calls, (std::vector<std::string>{"gregorian calendar", "date",
                                                       "formatter " + style(dateFormat) + "/0",
                                                       "formatter 0/" + style(timeFormat), "text",
                                                       "text"}));
        }
    }
}

TEST_F(CTimeDateTimeLocaleTest, AnUnknownStyleIsNone) {
    auto const unknown = static_cast<CDateTime::EFormat>(5);
    EXPECT_EQ(formatted(unknown, unknown), "");
    EXPECT_EQ(formatted(unknown, CDateTime::efShort), "08:05");
    EXPECT_EQ(formatted(CDateTime::efShort, unknown), "05/03/2021");
}

TEST_F(CTimeDateTimeLocaleTest, TheMomentIsComposedWithoutMilliSeconds) {
    setZone("America/New_York");
    EXPECT_EQ(formatted(CDateTime::efNone, CDateTime::efMedium), "08:05:09");
    EXPECT_EQ(composedMoment, 636642309.0);
}

TEST_F(CTimeDateTimeLocaleTest, ALostTextFailsAnAssertion) {
    isTextLost = true;
    EXPECT_EQ(TestSupport::failedCheckOf([] { formatted(CDateTime::efShort, CDateTime::efShort); }),
              "ref");
    isTextLost = false;
}

} // namespace
