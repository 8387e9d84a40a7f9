#include <CoreFoundation/CoreFoundation.h>

#include "support/ObjectCount.h"

#include <cstdlib>
#include <string>

namespace {

// Each test runs in a process of its own, so the environment is its to change.
class CFLocaleValueTest : public TestSupport::CObjectCountTest {
  protected:
    void SetUp() override {
        TestSupport::CObjectCountTest::SetUp();
        for (char const* const variable :
             {"LC_ALL", "LC_CTYPE", "LC_MEASUREMENT", "LC_TIME", "LANG"})
            unsetenv(variable);
    }

    static CFTypeRef valueOf(CFLocaleKey key) {
        CFLocaleRef const locale = CFLocaleCopyCurrent();
        CFTypeRef const value = CFLocaleGetValue(locale, key);
        CFRelease(locale);
        return value;
    }

    static bool isMetric() {
        CFTypeRef const value = valueOf(kCFLocaleUsesMetricSystem);
        EXPECT_TRUE(value == kCFBooleanTrue || value == kCFBooleanFalse);
        return value == kCFBooleanTrue;
    }

    static bool isMetricUnder(std::string const& name) {
        setenv("LC_ALL", name.c_str(), 1);
        return isMetric();
    }
};

TEST_F(CFLocaleValueTest, ABooleanHasItsValue) {
    EXPECT_NE(CFBooleanGetValue(kCFBooleanTrue), 0);
    EXPECT_EQ(CFBooleanGetValue(kCFBooleanFalse), 0);
    CFRelease(CFRetain(kCFBooleanTrue));
    EXPECT_NE(CFBooleanGetValue(kCFBooleanTrue), 0);
}

TEST_F(CFLocaleValueTest, OnlyTheUSSystemIsNotMetric) {
    for (std::string const name :
         {"en_US", "es_US", "en_US.UTF-8", "en_US@x", "en_US.ISO-8859-1@y", "en_LR", "haw_US"})
        EXPECT_FALSE(isMetricUnder(name)) << name;
    for (std::string const name : {"de_DE", "en_GB", "en_GB.UTF-8", "en_CA", "my_MM", "ja_JP",
                                   "de_DE@euro", "zh_CN", "en_AU"})
        EXPECT_TRUE(isMetricUnder(name)) << name;
}

TEST_F(CFLocaleValueTest, ALanguageStandsForItsMainTerritory) {
    EXPECT_FALSE(isMetricUnder("en"));
    EXPECT_TRUE(isMetricUnder("de"));
    EXPECT_TRUE(isMetricUnder("my.UTF-8"));
}

TEST_F(CFLocaleValueTest, WithoutALocalesNameItIsMetric) {
    EXPECT_TRUE(isMetric());
    for (std::string const name :
         {"C", "POSIX", "C.UTF-8", "x", "/etc", "_US", "US", ".UTF-8", "english_US", "xx_YY"})
        EXPECT_TRUE(isMetricUnder(name)) << name;
    EXPECT_TRUE(isMetricUnder("en_US" + std::string(100, 'x')));
}

TEST_F(CFLocaleValueTest, TheFirstVariableThatIsSetCounts) {
    setenv("LANG", "en_US", 1);
    EXPECT_FALSE(isMetric());
    setenv("LC_MEASUREMENT", "de_DE", 1);
    EXPECT_TRUE(isMetric());
    setenv("LC_ALL", "en_US", 1);
    EXPECT_FALSE(isMetric());
    setenv("LC_ALL", "", 1);
    EXPECT_TRUE(isMetric());
    setenv("LC_MEASUREMENT", "", 1);
    EXPECT_FALSE(isMetric());
}

TEST_F(CFLocaleValueTest, OtherCategoriesDoNotCount) {
    setenv("LC_CTYPE", "en_US", 1);
    setenv("LC_TIME", "en_US", 1);
    EXPECT_TRUE(isMetric());
}

TEST_F(CFLocaleValueTest, TheLocaleKeepsWhatItWas) {
    setenv("LANG", "en_US", 1);
    CFLocaleRef const locale = CFLocaleCopyCurrent();
    setenv("LANG", "de_DE", 1);
    EXPECT_EQ(CFLocaleGetValue(locale, kCFLocaleUsesMetricSystem), kCFBooleanFalse);
    CFRelease(locale);
}

TEST_F(CFLocaleValueTest, TheRootLocaleIsMetricWhateverTheEnvironmentIs) {
    setenv("LC_ALL", "en_US", 1);
    EXPECT_FALSE(isMetric());
    EXPECT_EQ(CFLocaleGetValue(nullptr, kCFLocaleUsesMetricSystem), kCFBooleanTrue);
}

TEST_F(CFLocaleValueTest, AnotherKeyHasNoValue) {
    EXPECT_EQ(valueOf(kCFGregorianCalendar), nullptr);
}

} // namespace
