#include "0Platform/CoreFoundation/CFDateSupport.h"
#include "0Platform/CoreFoundation/CFDateTwin.h"

#include "support/PlatformString.h"

#include <unicode/uloc.h>

#include <cstdio>
#include <limits>
#include <string>

namespace {

using namespace TestSupport;

constexpr CFDateFormatterStyle none = kCFDateFormatterNoStyle;
constexpr CFDateFormatterStyle shortStyle = kCFDateFormatterShortStyle;
constexpr CFDateFormatterStyle mediumStyle = kCFDateFormatterMediumStyle;
constexpr CFDateFormatterStyle longStyle = kCFDateFormatterLongStyle;
constexpr CFDateFormatterStyle fullStyle = kCFDateFormatterFullStyle;
constexpr CFDateFormatterStyle styles[] = {none, shortStyle, mediumStyle, longStyle, fullStyle};

constexpr CLocalTime sample = {2021, 3, 5, 8, 5, 9};

class CFDateFormatterTest : public CDateTest {
  protected:
    void SetUp() override {
        CDateTest::SetUp();
        setZone("UTC");
    }

    static std::u16string dateText(CLocalTime const& time, CFDateFormatterStyle style) {
        return textOf(composed(time), style, none);
    }

    static std::u16string timeText(CLocalTime const& time, CFDateFormatterStyle style) {
        return textOf(composed(time), none, style);
    }

    static std::u16string textBy(CFDateFormatterRef formatter, CFAbsoluteTime at) {
        CFDateRef const date = CFDateCreate(kCFAllocatorDefault, at);
        CPlatformString const text(
            CFDateFormatterCreateStringWithDate(kCFAllocatorDefault, formatter, date));
        CFRelease(date);
        return text.units();
    }

    static std::u16string dateTextUnder(std::string const& locale) {
        setLocale(locale);
        return dateText(sample, longStyle);
    }
};

TEST_F(CFDateFormatterTest, EachLocaleHasItsWordsItsCalendarAndItsDigits) {
    struct CText {
        char const* locale;
        char16_t const* text;
    };
    // The Thai years count from 543 BC; the Persian ones begin in spring; Arabic, Persian, Bengali
    // and Nepali have digits of their own. The last is without any variable.
    constexpr CText texts[] = {
        {"en_US", u"March 5, 2021"},
        {"en_GB", u"5 March 2021"},
        {"de_DE", u"5. M\u00E4rz 2021"},
        {"de_AT", u"5. M\u00E4rz 2021"},
        {"fr_FR", u"5 mars 2021"},
        {"pl_PL", u"5 marca 2021"},
        {"el_GR", u"5 \u039C\u03B1\u03C1\u03C4\u03AF\u03BF\u03C5 2021"},
        {"tr_TR", u"5 Mart 2021"},
        {"ja_JP", u"2021\u5E743\u67085\u65E5"},
        {"ko_KR", u"2021\uB144 3\uC6D4 5\uC77C"},
        {"he_IL", u"5 \u05D1\u05DE\u05E8\u05E5 2021"},
        {"th_TH", u"5 \u0E21\u0E35\u0E19\u0E32\u0E04\u0E21 2564"},
        {"fa_IR", u"\u06F1\u06F5 \u0627\u0633\u0641\u0646\u062F \u06F1\u06F3\u06F9\u06F9"},
        {"ar_EG", u"\u0665 \u0645\u0627\u0631\u0633 \u0662\u0660\u0662\u0661"},
        {"bn_BD", u"\u09EB \u09AE\u09BE\u09B0\u09CD\u099A, \u09E8\u09E6\u09E8\u09E7"},
        {"ne_NP", u"\u0968\u0966\u0968\u0967 \u092E\u093E\u0930\u094D\u091A \u096B"},
        {"C", u"March 5, 2021"},
        {"", u"2021 M03 5"}};
    for (CText const& text : texts) {
        std::u16string const answer = dateTextUnder(text.locale);
        std::u16string const expected =
            isRecordedIcu() ? text.text
                            : twinText(text.locale, "UTC", composed(sample), longStyle, none);
        EXPECT_EQ(answer, expected) << text.locale << ": " << readable(answer);
    }
}

TEST_F(CFDateFormatterTest, EachPairOfStylesIsIcusOwn) {
    for (char const* const locale : {"en_US", "de_DE", "th_TH", "fa_IR", "ar_EG", "ja_JP", ""}) {
        setLocale(locale);
        for (char const* const zone :
             {"UTC", "Europe/Dublin", "America/New_York", "Asia/Kolkata", "Pacific/Apia"}) {
            setZone(zone);
            for (int const year : {1400, 1582, 1700, 2021, 10000}) {
                CFAbsoluteTime const at = composed({year, 7, 4, 13, 7, 45});
                for (CFDateFormatterStyle const dateStyle : styles) {
                    for (CFDateFormatterStyle const timeStyle : styles)
                        EXPECT_EQ(textOf(at, dateStyle, timeStyle),
                                  twinText(locale, zone, at, dateStyle, timeStyle))
                            << locale << " " << zone << " " << year << " " << dateStyle << "/"
                            << timeStyle;
                }
            }
        }
    }
}

TEST_F(CFDateFormatterTest, WithoutAnyStyleTheTextIsEmpty) {
    for (char const* const locale : {"en_US", "fa_IR", "C", ""}) {
        setLocale(locale);
        EXPECT_EQ(textOf(0, none, none), u"") << locale;
    }
}

TEST_F(CFDateFormatterTest, AValueThatIsNoStyleIsTheMediumOne) {
    setLocale("en_GB");
    for (long const value : {-1L, 5L, 1000L, std::numeric_limits<long>::max()}) {
        auto const style = static_cast<CFDateFormatterStyle>(value);
        EXPECT_EQ(textOf(0, style, none), u"1 Jan 2001") << value;
        EXPECT_EQ(textOf(0, none, style), u"00:00:00") << value;
    }
}

TEST_F(CFDateFormatterTest, ANullLocaleIsTheRootLocale) {
    setLocale("de_DE");
    CFDateFormatterRef const formatter =
        CFDateFormatterCreate(kCFAllocatorDefault, nullptr, shortStyle, none);
    ASSERT_NE(formatter, nullptr);
    EXPECT_EQ(CFGetRetainCount(formatter), 1);
    EXPECT_EQ(textBy(formatter, 0), u"2001-01-01");
    CFRelease(formatter);
}

TEST_F(CFDateFormatterTest, OneFormatterWritesManyDates) {
    setLocale("en_GB");
    CFLocaleRef const locale = CFLocaleCopyCurrent();
    CFDateFormatterRef const formatter =
        CFDateFormatterCreate(kCFAllocatorDefault, locale, shortStyle, none);
    CFRelease(locale);
    for (int i = 0; i < 3; ++i) {
        EXPECT_EQ(textBy(formatter, 0), u"01/01/2001");
        EXPECT_EQ(textBy(formatter, 86400), u"02/01/2001");
    }
    CFRelease(formatter);
}

TEST_F(CFDateFormatterTest, TheGregorianCalendarHasNoJulianPart) {
    setLocale("en_GB");
    EXPECT_EQ(dateText({1582, 10, 4, 12, 0, 0}, fullStyle), u"Monday, 4 October 1582");
    EXPECT_EQ(dateText({1400, 1, 1, 12, 0, 0}, fullStyle), u"Wednesday, 1 January 1400");
    EXPECT_EQ(dateText({1400, 2, 29, 12, 0, 0}, longStyle), u"1 March 1400");
}

TEST_F(CFDateFormatterTest, CalendarsBuiltOnItKeepTheirs) {
    setLocale("th_TH");
    // The first of March of 1500 is 20 February in the Julian calendar.
    EXPECT_EQ(dateText({1500, 3, 1, 12, 0, 0}, shortStyle), u"20/2/43");
    EXPECT_EQ(dateText({1600, 3, 1, 12, 0, 0}, shortStyle), u"1/3/43");
}

TEST_F(CFDateFormatterTest, YearsOfFiveDigitsAreWrittenWhole) {
    setLocale("de_DE");
    EXPECT_EQ(dateText({10000, 1, 1, 0, 0, 0}, longStyle), u"1. Januar 10000");
}

TEST_F(CFDateFormatterTest, WhatIsComposedInAZoneIsWrittenAsItWas) {
    CRandomNumbers numbers(20211107);
    for (char const* const zone : zonesToTry) {
        setZone(zone);
        for (int i = 0; i < 300; ++i) {
            // No zone here skips or doubles a time in the afternoon of a day before the 28th.
            CLocalTime const time = {numbers.between(1, 9999), numbers.between(1, 12),
                                     numbers.between(1, 27),   numbers.between(12, 23),
                                     numbers.between(0, 59),   numbers.between(0, 59)};
            char expected[40];
            std::snprintf(expected, sizeof(expected), "%d-%02d-%02d %02d:%02d:%02d", time.year,
                          time.month, time.day, time.hour, time.minute, time.second);
            std::u16string const text =
                dateText(time, shortStyle) + u" " + timeText(time, mediumStyle);
            ASSERT_EQ(readable(text), expected) << zone;
        }
    }
}

TEST_F(CFDateFormatterTest, ASkippedTimeIsWrittenAfterTheGapAndADoubledOneAsItIs) {
    for (char const* const zone : {"America/New_York", zoneRule}) {
        setZone(zone);
        EXPECT_EQ(timeText({2021, 3, 14, 2, 30, 0}, shortStyle), u"03:30") << zone;
        EXPECT_EQ(timeText({2021, 11, 7, 1, 30, 0}, shortStyle), u"01:30") << zone;
    }
    setZone("Europe/Dublin");
    EXPECT_EQ(timeText({2021, 3, 28, 1, 30, 0}, shortStyle), u"02:30");
    setZone("Pacific/Apia");
    EXPECT_EQ(dateText({2011, 12, 30, 12, 0, 0}, shortStyle), u"2011-12-31");
}

TEST_F(CFDateFormatterTest, ZonesAreNamedAndRulesByTheirOffset) {
    struct CName {
        char const* zone;
        char16_t const* march;
        char16_t const* july;
    };
    constexpr CName names[] = {{"UTC", u"08:05:09 UTC", u"08:05:09 UTC"},
                               {"", u"08:05:09 UTC", u"08:05:09 UTC"},
                               {"Europe/Dublin", u"08:05:09 GMT", u"08:05:09 GMT+1"},
                               {"America/New_York", u"08:05:09 EST", u"08:05:09 EDT"},
                               {"Asia/Kolkata", u"08:05:09 GMT+5:30", u"08:05:09 GMT+5:30"},
                               {"XYZ-5:45", u"08:05:09 GMT+5:45", u"08:05:09 GMT+5:45"},
                               {zoneRule, u"08:05:09 GMT-5", u"08:05:09 GMT-4"}};
    setLocale("C");
    CLocalTime inJuly = sample;
    inJuly.month = 7;
    for (CName const& name : names) {
        setZone(name.zone);
        EXPECT_EQ(timeText(sample, longStyle), name.march) << name.zone;
        EXPECT_EQ(timeText(inJuly, longStyle), name.july) << name.zone;
    }
}

TEST_F(CFDateFormatterTest, TheZoneAndTheLocaleAreReadWhenTheFormatterIsMade) {
    setLocale("en_GB");
    CFLocaleRef const locale = CFLocaleCopyCurrent();
    setZone("America/New_York");
    CFDateFormatterRef const formatter =
        CFDateFormatterCreate(kCFAllocatorDefault, locale, shortStyle, longStyle);
    setZone("Asia/Kolkata");
    setLocale("de_DE");
    EXPECT_EQ(textBy(formatter, 0), u"31/12/2000, 19:00:00 GMT-5");
    CFRelease(formatter);
    CFRelease(locale);
}

TEST_F(CFDateFormatterTest, DatesGoByTheCategoryOfTime) {
    setLocale(std::nullopt);
    setenv("LANG", "en_GB", 1);
    setenv("LC_CTYPE", "fr_FR", 1);
    EXPECT_EQ(dateText(sample, longStyle), u"5 March 2021");
    setenv("LC_TIME", "de_DE.UTF-8@euro", 1);
    EXPECT_EQ(dateText(sample, longStyle), u"5. M\u00E4rz 2021");
    setenv("LC_ALL", "pl_PL", 1);
    EXPECT_EQ(dateText(sample, longStyle), u"5 marca 2021");
    setenv("LC_ALL", "", 1);
    setenv("LC_TIME", "", 1);
    EXPECT_EQ(dateText(sample, longStyle), u"5 March 2021");
}

TEST_F(CFDateFormatterTest, AModifierChoosesTheScript) {
    EXPECT_EQ(dateTextUnder("sr_RS"), u"5. \u043C\u0430\u0440\u0442 2021.");
    EXPECT_EQ(dateTextUnder("sr_RS.UTF-8@latin"), u"5. mart 2021.");
    EXPECT_EQ(dateTextUnder("uz_UZ"), u"5-mart, 2021");
    EXPECT_EQ(dateTextUnder("uz_UZ@cyrillic"), u"5 \u043C\u0430\u0440\u0442, 2021");
    EXPECT_EQ(dateTextUnder("sr_RS@latinx"), u"5. \u043C\u0430\u0440\u0442 2021.");
}

TEST_F(CFDateFormatterTest, ALanguageWithoutDataIsEnglishWhateverIcusDefaultIs) {
    for (char const* const defaultLocale : {"en_US", "de_DE", "fa_IR"}) {
        UErrorCode status = U_ZERO_ERROR;
        uloc_setDefault(defaultLocale, &status);
        ASSERT_TRUE(U_SUCCESS(status));
        for (char const* const locale : {"C", "C.UTF-8", "POSIX", "xx_YY", "xx", "turkish", "tr-TR",
                                         "t", "/tr_TR", "tr_T\xC3\x9C", "@latin"}) {
            EXPECT_EQ(dateTextUnder(locale), u"March 5, 2021") << defaultLocale << " " << locale;
            EXPECT_EQ(timeText({2021, 3, 5, 15, 0, 0}, shortStyle), u"15:00")
                << defaultLocale << " " << locale;
        }
    }
}

TEST_F(CFDateFormatterTest, ANameBeyondAllMeasureIsNoLocale) {
    EXPECT_EQ(dateTextUnder("de_" + std::string(61, 'T')), u"March 5, 2021");
    EXPECT_EQ(dateTextUnder("de_" + std::string(56, 'T') + "@latin"), u"March 5, 2021");
    EXPECT_EQ(dateTextUnder("de_" + std::string(100000, 'T')), u"March 5, 2021");
    EXPECT_EQ(dateTextUnder("de_DE." + std::string(100000, 'x')), u"5. M\u00E4rz 2021");
}

TEST_F(CFDateFormatterTest, ATimeThatIsNoNumberHasNoText) {
    for (CFDateFormatterStyle const style : styles) {
        CFDateFormatterRef const formatter =
            CFDateFormatterCreate(kCFAllocatorDefault, nullptr, style, none);
        CFDateRef const date =
            CFDateCreate(kCFAllocatorDefault, std::numeric_limits<double>::quiet_NaN());
        EXPECT_EQ(CFDateFormatterCreateStringWithDate(kCFAllocatorDefault, formatter, date),
                  nullptr);
        CFRelease(date);
        CFRelease(formatter);
    }
}

TEST_F(CFDateFormatterTest, ATimeTooFarAwayIsTheLastOneKnown) {
    constexpr double infinity = std::numeric_limits<double>::infinity();
    for (char const* const zone : {"UTC", zoneRule}) {
        setZone(zone);
        EXPECT_EQ(textOf(infinity, shortStyle, none), textOf(1e18, shortStyle, none));
        EXPECT_EQ(textOf(-infinity, shortStyle, none), textOf(-1e18, shortStyle, none));
        EXPECT_EQ(textOf(1e300, shortStyle, none), textOf(1e18, shortStyle, none));
        EXPECT_NE(textOf(1e18, shortStyle, none), textOf(1e14, shortStyle, none));
    }
}

} // namespace
