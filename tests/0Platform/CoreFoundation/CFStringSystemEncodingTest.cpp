#include <CoreFoundation/CFStringEncodingExt.h>

#include <gtest/gtest.h>

#include <cstdlib>

namespace {

// Starts without any of the variables. The process is the test's own.
class CFStringSystemEncodingTest : public testing::Test {
  protected:
    CFStringSystemEncodingTest() {
        for (char const* const name : {"LC_ALL", "LC_CTYPE", "LANG"})
            unsetenv(name);
    }

    static CFStringEncoding encodingOf(char const* locale) {
        setenv("LC_ALL", locale, 1);
        return CFStringGetSystemEncoding();
    }
};

TEST_F(CFStringSystemEncodingTest, ACodesetThatIsServedIsTheEncoding) {
    EXPECT_EQ(encodingOf("de_DE.ISO-8859-1"), kCFStringEncodingISOLatin1);
    EXPECT_EQ(encodingOf("en_US.CP1252"), kCFStringEncodingWindowsLatin1);
    EXPECT_EQ(encodingOf("ja_JP.SJIS"), CFStringEncoding{kCFStringEncodingDOSJapanese});
    EXPECT_EQ(encodingOf("ja_JP.Shift_JIS"), CFStringEncoding{kCFStringEncodingDOSJapanese});
    EXPECT_EQ(encodingOf("ja_JP.CP932"), CFStringEncoding{kCFStringEncodingDOSJapanese});
    EXPECT_EQ(encodingOf("zh_CN.GBK"), CFStringEncoding{kCFStringEncodingDOSChineseSimplif});
    EXPECT_EQ(encodingOf("zh_CN.GB2312"), CFStringEncoding{kCFStringEncodingDOSChineseSimplif});
    EXPECT_EQ(encodingOf("zh_TW.Big5"), CFStringEncoding{kCFStringEncodingDOSChineseTrad});
    EXPECT_EQ(encodingOf("ko_KR.eucKR"), CFStringEncoding{kCFStringEncodingDOSKorean});
    EXPECT_EQ(encodingOf("ko_KR.CP949"), CFStringEncoding{kCFStringEncodingDOSKorean});
    EXPECT_EQ(encodingOf("ko_KR.JOHAB"), CFStringEncoding{kCFStringEncodingWindowsKoreanJohab});
    EXPECT_EQ(encodingOf("he_IL.IBM862"), CFStringEncoding{kCFStringEncodingDOSHebrew});
    EXPECT_EQ(encodingOf("ar_EG.IBM864"), CFStringEncoding{kCFStringEncodingDOSArabic});
    EXPECT_EQ(encodingOf("ru_RU.MAC-CYRILLIC"), CFStringEncoding{kCFStringEncodingMacCyrillic});
}

TEST_F(CFStringSystemEncodingTest, ACodesetMayBeSpelledInManyWays) {
    for (char const* const locale : {"de_DE.iso88591", "de_DE.ISO8859-1", "de.iso-8859-1",
                                     "de_DE.ISO_8859-1@euro", "de_DE.{iso}8859~1", "x.LATIN1"})
        EXPECT_EQ(encodingOf(locale), kCFStringEncodingISOLatin1) << locale;
}

TEST_F(CFStringSystemEncodingTest, AnyOtherCodesetLeavesMacRoman) {
    for (char const* const locale :
         {"C", "POSIX", "de_DE", "de_DE.", "de_DE@euro", "de_DE.UTF-8", "C.UTF-8", "ja_JP.eucJP",
          "zh_CN.GB18030", "zh_HK.BIG5-HKSCS", "th_TH.TIS-620", "de_DE.ISO-8859-15",
          "de_DE.ISO-8859-10", "de_DE.8859-1x", "iso88591", "de_DE.macintosh"})
        EXPECT_EQ(encodingOf(locale), kCFStringEncodingMacRoman) << locale;
}

TEST_F(CFStringSystemEncodingTest, TheFirstVariableThatIsNotEmptyCounts) {
    EXPECT_EQ(CFStringGetSystemEncoding(), kCFStringEncodingMacRoman);
    setenv("LANG", "de_DE.ISO-8859-1", 1);
    EXPECT_EQ(CFStringGetSystemEncoding(), kCFStringEncodingISOLatin1);
    setenv("LC_CTYPE", "en_US.CP1252", 1);
    EXPECT_EQ(CFStringGetSystemEncoding(), kCFStringEncodingWindowsLatin1);
    setenv("LC_ALL", "C", 1);
    EXPECT_EQ(CFStringGetSystemEncoding(), kCFStringEncodingMacRoman);
    setenv("LC_ALL", "", 1);
    EXPECT_EQ(CFStringGetSystemEncoding(), kCFStringEncodingWindowsLatin1);
    setenv("LC_CTYPE", "", 1);
    EXPECT_EQ(CFStringGetSystemEncoding(), kCFStringEncodingISOLatin1);
}

} // namespace
