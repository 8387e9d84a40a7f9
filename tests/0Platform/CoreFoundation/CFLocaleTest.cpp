#include <CoreFoundation/CoreFoundation.h>

#include "support/ObjectCount.h"
#include "support/PlatformString.h"

#include <cstdlib>
#include <string>

using TestSupport::CPlatformString;

namespace {

// Each test runs in a process of its own, so the environment is its to change.
class CFLocaleTest : public TestSupport::CObjectCountTest {
  protected:
    void SetUp() override {
        TestSupport::CObjectCountTest::SetUp();
        for (char const* const variable : {"LC_ALL", "LC_CTYPE", "LC_TIME", "LANG"})
            unsetenv(variable);
    }

    // What the current locale makes of a dotted and a dotless i shows which language it is.
    static std::u16string upperI() {
        CFLocaleRef const locale = CFLocaleCopyCurrent();
        CFMutableStringRef const text =
            CFStringCreateMutableCopy(kCFAllocatorDefault, 0, CPlatformString(u"i").get());
        CPlatformString const owner(text);
        CFStringUppercase(text, locale);
        CFRelease(locale);
        return owner.units();
    }

    static std::u16string upperIUnder(std::string const& name) {
        setenv("LC_ALL", name.c_str(), 1);
        return upperI();
    }
};

constexpr char16_t const* turkish = u"\u0130";
constexpr char16_t const* others = u"I";

TEST_F(CFLocaleTest, WithoutAnyVariableItIsTheRootLocale) {
    EXPECT_EQ(upperI(), others);
}

TEST_F(CFLocaleTest, EachVariableNamesTheLocale) {
    for (char const* const variable : {"LC_ALL", "LC_CTYPE", "LANG"}) {
        setenv(variable, "tr_TR", 1);
        EXPECT_EQ(upperI(), turkish) << variable;
        unsetenv(variable);
        EXPECT_EQ(upperI(), others) << variable;
    }
}

TEST_F(CFLocaleTest, TheFirstVariableThatIsSetCounts) {
    setenv("LANG", "tr_TR", 1);
    setenv("LC_CTYPE", "en_US", 1);
    EXPECT_EQ(upperI(), others);
    setenv("LC_ALL", "az_AZ", 1);
    EXPECT_EQ(upperI(), turkish);
    setenv("LC_ALL", "C", 1);
    EXPECT_EQ(upperI(), others);
}

TEST_F(CFLocaleTest, TheCategoryOfDatesDoesNotCountInCaseConversion) {
    setenv("LC_TIME", "tr_TR", 1);
    EXPECT_EQ(upperI(), others);
    setenv("LANG", "tr_TR", 1);
    setenv("LC_TIME", "en_US", 1);
    EXPECT_EQ(upperI(), turkish);
}

TEST_F(CFLocaleTest, AnEmptyVariableCountsAsUnset) {
    setenv("LC_ALL", "", 1);
    setenv("LC_CTYPE", "", 1);
    EXPECT_EQ(upperI(), others);
    setenv("LANG", "tr_TR", 1);
    EXPECT_EQ(upperI(), turkish);
}

TEST_F(CFLocaleTest, CodesetAndModifierAreLeftOut) {
    for (char const* const name : {"tr", "tr_TR", "tr_TR.UTF-8", "tr_TR@x", "tr_TR.UTF-8@x",
                                   "tr.UTF-8", "tr@euro", "az_AZ.ISO-8859-9@latin"})
        EXPECT_EQ(upperIUnder(name), turkish) << name;
    for (char const* const name : {"en_TR.UTF-8", "en_US@tr", "de_DE.tr_TR"})
        EXPECT_EQ(upperIUnder(name), others) << name;
}

TEST_F(CFLocaleTest, ATerritoryMayBeANumber) {
    EXPECT_EQ(upperIUnder("tr_792"), turkish);
    EXPECT_EQ(upperIUnder("az_Latn_031"), turkish);
}

TEST_F(CFLocaleTest, WhatIsNoLocalesNameIsTheRootLocale) {
    for (char const* const name :
         {"C", "C.UTF-8", "POSIX", "turkish", "t", "_TR", "tr-TR", "tr TR", "/tr_TR",
          "tr_T\xC3\x9C", "tr_T{", "1tr", "xx_YY", ".UTF-8", "@tr"})
        EXPECT_EQ(upperIUnder(name), others) << name;
}

TEST_F(CFLocaleTest, ANameBeyondAllMeasureIsTheRootLocale) {
    EXPECT_EQ(upperIUnder("tr_" + std::string(60, 'T')), turkish);
    EXPECT_EQ(upperIUnder("tr_" + std::string(61, 'T')), others);
    EXPECT_EQ(upperIUnder("tr_" + std::string(100000, 'T')), others);
    EXPECT_EQ(upperIUnder("tr_TR." + std::string(100000, 'x')), turkish);
}

TEST_F(CFLocaleTest, EachCallReadsTheEnvironmentAnew) {
    setenv("LANG", "tr_TR", 1);
    EXPECT_EQ(upperI(), turkish);
    setenv("LANG", "en_US", 1);
    EXPECT_EQ(upperI(), others);
}

TEST_F(CFLocaleTest, TheLocaleKeepsWhatItReadAndBelongsToItsCaller) {
    setenv("LANG", "tr_TR", 1);
    CFLocaleRef const locale = CFLocaleCopyCurrent();
    unsetenv("LANG");
    ASSERT_NE(locale, nullptr);
    EXPECT_EQ(CFGetRetainCount(locale), 1);
    CFMutableStringRef const text =
        CFStringCreateMutableCopy(kCFAllocatorDefault, 0, CPlatformString(u"i").get());
    CFStringUppercase(text, locale);
    EXPECT_EQ(CPlatformString::unitsOf(text), turkish);
    CFRelease(text);
    long const before = TestSupport::liveObjects();
    CFRelease(locale);
    EXPECT_EQ(TestSupport::liveObjects(), before - 1);
}

} // namespace
