#include <CoreFoundation/CoreFoundation.h>

#include "support/ObjectCount.h"
#include "support/PlatformString.h"
#include "support/TableFile.h"

#include <unicode/ustring.h>

#include <cstdlib>
#include <string>
#include <vector>

using TestSupport::CPlatformString;

namespace {

using CFStringCaseTest = TestSupport::CObjectCountTest;

using TMapping = void (*)(CFMutableStringRef string, CFLocaleRef locale);

// "-" stands for no locale at all. Each test runs in a process of its own, so the environment is
// its to change.
std::u16string mapped(TMapping map, std::string const& localeName, std::u16string const& units) {
    CFLocaleRef locale = nullptr;
    if (localeName != "-") {
        setenv("LC_ALL", (localeName + ".UTF-8").c_str(), 1);
        locale = CFLocaleCopyCurrent();
    }
    CFMutableStringRef const text =
        CFStringCreateMutableCopy(kCFAllocatorDefault, 0, CPlatformString(units).get());
    CPlatformString const owner(text);
    map(text, locale);
    if (locale != nullptr)
        CFRelease(locale);
    return owner.units();
}

std::u16string upper(std::string const& locale, std::u16string const& units) {
    return mapped(CFStringUppercase, locale, units);
}

std::u16string lower(std::string const& locale, std::u16string const& units) {
    return mapped(CFStringLowercase, locale, units);
}

// No row deviates: where we keep the accents of Greek capitals under other languages than Greek,
// an older framework did so too, and its answer stands beside.
TEST_F(CFStringCaseTest, EveryRecordedTextIsMappedAsRecorded) {
    std::vector<std::vector<std::string>> const rows = TestSupport::readTable("case.tsv");
    EXPECT_GT(rows.size(), 500U);
    for (std::vector<std::string> const& row : rows) {
        ASSERT_GE(row.size(), 5U) << row[0];
        ASSERT_TRUE(row[0] == "U" || row[0] == "L") << row[0];
        TMapping const map = row[0] == "U" ? CFStringUppercase : CFStringLowercase;
        std::u16string const actual = mapped(map, row[1], TestSupport::unitsOfHex(row[2]));
        std::u16string const recorded = TestSupport::unitsOfHex(row[3]);
        std::u16string const older = row[4] == "=" ? recorded : TestSupport::unitsOfHex(row[4]);
        EXPECT_TRUE(actual == recorded || actual == older)
            << row[0] << " " << row[1] << " " << row[2] << " is " << testing::PrintToString(actual);
    }
}

TEST_F(CFStringCaseTest, ATextOfAnyLengthGrows) {
    for (std::size_t const length : {1U, 7U, 8U, 4096U, 300000U}) {
        EXPECT_EQ(upper("-", std::u16string(length, u'\u00DF')), std::u16string(2 * length, u'S'));
        std::u16string expected;
        for (std::size_t i = 0; i < length; ++i)
            expected += u"i\u0307";
        EXPECT_EQ(lower("-", std::u16string(length, u'\u0130')), expected);
    }
}

TEST_F(CFStringCaseTest, ATextOfAnyLengthShrinks) {
    std::u16string dotted;
    for (int i = 0; i < 5000; ++i)
        dotted += u"I\u0307";
    EXPECT_EQ(lower("tr_TR", dotted), std::u16string(5000, u'i'));
}

TEST_F(CFStringCaseTest, ZerosAndUnpairedSurrogatesStay) {
    std::u16string const text(u"a\0\xDC00z\xD800", 5);
    EXPECT_EQ(upper("-", text), std::u16string(u"A\0\xDC00Z\xD800", 5));
    EXPECT_EQ(lower("tr", upper("tr", text)), text);
}

// Alone, no character depends on neighbours: then all that the framework and ICU give is the same.
TEST_F(CFStringCaseTest, EveryCodePointAloneIsMappedByICU) {
    for (char32_t c = 0; c <= 0x10FFFF; ++c) {
        std::u16string const text = TestSupport::unitsOfCodePoint(c);
        std::u16string expected(8, u'\0');
        UErrorCode status = U_ZERO_ERROR;
        expected.resize(static_cast<std::size_t>(u_strToUpper(
            expected.data(), 8, text.data(), static_cast<int32_t>(text.size()), "", &status)));
        ASSERT_EQ(upper("-", text), expected) << static_cast<unsigned long>(c);
        expected.resize(8);
        expected.resize(static_cast<std::size_t>(u_strToLower(
            expected.data(), 8, text.data(), static_cast<int32_t>(text.size()), "", &status)));
        ASSERT_EQ(lower("-", text), expected) << static_cast<unsigned long>(c);
    }
}

TEST_F(CFStringCaseTest, ASigmaIsFinalBehindALetterAtTheEndOfAWord) {
    for (char const* const locale : {"-", "el_GR", "tr_TR", "lt_LT"}) {
        EXPECT_EQ(lower(locale, u"\u03A3"), u"\u03C3") << locale;
        EXPECT_EQ(lower(locale, u"\u0391\u03A3"), u"\u03B1\u03C2") << locale;
        EXPECT_EQ(lower(locale, u"\u0391\u03A3 \u0391"), u"\u03B1\u03C2 \u03B1") << locale;
        EXPECT_EQ(lower(locale, u"\u03A3\u0391"), u"\u03C3\u03B1") << locale;
        // Marks, apostrophes and soft hyphens stand within a word; a full stop ends it.
        EXPECT_EQ(lower(locale, u"\u0391\u03A3'\u0391\u2019\u03A3'"),
                  u"\u03B1\u03C3'\u03B1\u2019\u03C2'")
            << locale;
        EXPECT_EQ(lower(locale, u"\u0391\u0301\u03A3\u0301\u00AD\u0391"),
                  u"\u03B1\u0301\u03C3\u0301\u00AD\u03B1")
            << locale;
        EXPECT_EQ(lower(locale, u"\u0391\u03A3.\u0391"), u"\u03B1\u03C2.\u03B1") << locale;
        // Letters beyond the first 65,536 characters count as letters, on both sides.
        EXPECT_EQ(lower(locale, u"\U00010400\u03A3"), u"\U00010428\u03C2") << locale;
        EXPECT_EQ(lower(locale, u"\u0391\u03A3\U00010400"), u"\u03B1\u03C3\U00010428") << locale;
    }
}

TEST_F(CFStringCaseTest, TurkishAndAzeriTellDottedFromDotlessI) {
    for (char const* const locale : {"tr_TR", "tr", "az_AZ"}) {
        EXPECT_EQ(upper(locale, u"\u0131i"), u"I\u0130") << locale;
        EXPECT_EQ(lower(locale, u"I\u0130"), u"\u0131i") << locale;
        EXPECT_EQ(lower(locale, u"I\u0307x"), u"ix") << locale;
        // A dot behind another mark belongs to no I here.
        EXPECT_EQ(lower(locale, u"I\u0323\u0307"), u"\u0131\u0323\u0307") << locale;
    }
    EXPECT_EQ(upper("-", u"\u0131i"), u"II");
    EXPECT_EQ(lower("-", u"I\u0130"), u"ii\u0307");
}

TEST_F(CFStringCaseTest, LithuanianKeepsTheDotUnderAccents) {
    EXPECT_EQ(lower("lt_LT", u"\u00CD"), u"i\u0307\u0301");
    EXPECT_EQ(lower("lt_LT", u"I"), u"i");
    EXPECT_EQ(upper("lt_LT", u"i\u0307\u0300"), u"I\u0300");
    EXPECT_EQ(lower("-", u"\u00CD"), u"\u00ED");
}

TEST_F(CFStringCaseTest, GreekCapitalsLoseTheTonos) {
    EXPECT_EQ(upper("el_GR", u"\u03AC\u03AD\u03AE\u03AF\u03CC\u03CD\u03CE"),
              u"\u0391\u0395\u0397\u0399\u039F\u03A5\u03A9");
    EXPECT_EQ(upper("el", u"\u0386\u1F71"), u"\u0391\u0391");
    EXPECT_EQ(upper("el_GR", u"\u0390\u03B0"), u"\u0399\u0308\u03A5\u0308");
    EXPECT_EQ(upper("el_GR", u"\u03BF\u03B4\u03CC\u03C2 stra\u00DFe"),
              u"\u039F\u0394\u039F\u03A3 STRASSE");
    // Two vowels in a row get no dialytika that was not there.
    EXPECT_EQ(upper("el_GR", u"\u039C\u03AC\u03B9\u03BF\u03C2"), u"\u039C\u0391\u0399\u039F\u03A3");
    // Lower case keeps it, and so do other languages.
    EXPECT_EQ(lower("el_GR", u"\u0386"), u"\u03AC");
    EXPECT_EQ(upper("-", u"\u03AC"), u"\u0386");
}

TEST_F(CFStringCaseTest, OtherGreekAccentsAreMappedAsElsewhere) {
    for (char16_t const letter : {u'\u1F04', u'\u1FB2', u'\u1FB4', u'\u1FB6', u'\u0385', u'\u03CA'})
        EXPECT_EQ(upper("el_GR", std::u16string(1, letter)), upper("-", std::u16string(1, letter)));
    EXPECT_EQ(upper("el_GR", u"\u03B1\u0301\u03B9"), u"\u0391\u0301\u0399");
}

TEST_F(CFStringCaseTest, LettersOfOtherScriptsKeepTheirAccentsInGreek) {
    EXPECT_EQ(upper("el_GR", u"\u1E3F\u03AC\u0453\u03AC"), u"\u1E3E\u0391\u0403\u0391");
}

TEST_F(CFStringCaseTest, DutchMapsLikeTheRootLocale) {
    EXPECT_EQ(upper("nl_NL", u"ijsland \u0133"), u"IJSLAND \u0132");
    EXPECT_EQ(lower("nl_NL", u"IJsland \u0132"), u"ijsland \u0133");
}

} // namespace
