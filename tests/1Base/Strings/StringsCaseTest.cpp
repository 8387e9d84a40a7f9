#include "1Base/Strings/StringsCase.h"
#include "1Base/Encoding/Encoding.h"
#include "1Base/Encoding/EncodingExc.h"

#include "support/ObjectCount.h"
#include "support/PlatformCalls.h"

#include <cstdlib>
#include <string>
#include <vector>

// The platform's release, which the program puts in front of the real one.
extern "C" double __wrap_kCFCoreFoundationVersionNumber;
double __wrap_kCFCoreFoundationVersionNumber = 1674.102;

using Encoding::TExcEncoding;
using TestSupport::CPlatformCall;
using TestSupport::CPlatformCalls;

namespace {

// Each test runs in a process of its own, so the environment and the release are its to change.
class CStringsCaseTest : public TestSupport::CObjectCountTest {
  protected:
    void SetUp() override {
        TestSupport::CObjectCountTest::SetUp();
        setLocale("C");
    }

    static void setLocale(char const* name) { setenv("LC_ALL", name, 1); }
    static void setRelease(double release) { __wrap_kCFCoreFoundationVersionNumber = release; }
};

Strings::string upper(Strings::string text) {
    return Strings::toUpper(text);
}

Strings::string lower(Strings::string text) {
    return Strings::toLower(text);
}

// Both directions in both kinds of text.
void expectCase(Strings::string const& text, Strings::string const& upperText,
                Strings::string const& lowerText) {
    std::string const narrow = Encoding::convert<std::string>(text);
    std::string mapped = narrow;
    EXPECT_EQ(upper(text), upperText) << narrow;
    EXPECT_EQ(Strings::toUpper(mapped), Encoding::convert<std::string>(upperText)) << narrow;
    mapped = narrow;
    EXPECT_EQ(lower(text), lowerText) << narrow;
    EXPECT_EQ(Strings::toLower(mapped), Encoding::convert<std::string>(lowerText)) << narrow;
}

TEST_F(CStringsCaseTest, LettersOfAllScriptsChange) {
    expectCase(L"Hello World 1", L"HELLO WORLD 1", L"hello world 1");
    expectCase(L"\u00C9t\u00E9 \u0416\u0436 \u0531\u0561",
               L"\u00C9T\u00C9 \u0416\u0416 \u0531\u0531",
               L"\u00E9t\u00E9 \u0436\u0436 \u0561\u0561");
    expectCase(L"\U00010400\U00010428", L"\U00010400\U00010400", L"\U00010428\U00010428");
    expectCase(L"\u4E00\U0001F600 -", L"\u4E00\U0001F600 -", L"\u4E00\U0001F600 -");
}

TEST_F(CStringsCaseTest, ATextCanGrow) {
    expectCase(L"stra\u00DFe", L"STRASSE", L"stra\u00DFe");
    expectCase(L"\uFB03", L"FFI", L"\uFB03");
    expectCase(L"\u0130", L"\u0130", L"i\u0307");
}

TEST_F(CStringsCaseTest, TheLastSigmaOfAWordIsFinal) {
    expectCase(L"\u039F\u0394\u039F\u03A3 \u03A3", L"\u039F\u0394\u039F\u03A3 \u03A3",
               L"\u03BF\u03B4\u03BF\u03C2 \u03C3");
}

TEST_F(CStringsCaseTest, TheLanguageIsThatOfTheCurrentLocale) {
    expectCase(L"iI", L"II", L"ii");
    setLocale("tr_TR.UTF-8");
    expectCase(L"iI\u0131\u0130", L"\u0130II\u0130", L"i\u0131\u0131i");
    setLocale("az_AZ");
    expectCase(L"iI", L"\u0130I", L"i\u0131");
    setLocale("lt_LT.UTF-8");
    expectCase(L"\u00CD", L"\u00CD", L"i\u0307\u0301");
    setLocale("el_GR.UTF-8");
    expectCase(L"\u039C\u03AC\u03B9\u03BF\u03C2", L"\u039C\u0391\u0399\u039F\u03A3",
               L"\u03BC\u03AC\u03B9\u03BF\u03C2");
    setLocale("nl_NL.UTF-8");
    expectCase(L"IJsland", L"IJSLAND", L"ijsland");
    setLocale("POSIX");
    expectCase(L"i\u03AC", L"I\u0386", L"i\u03AC");
}

TEST_F(CStringsCaseTest, AnEmptyTextStaysEmptyThroughTheWholePath) {
    CPlatformCalls const calls;
    std::string narrow;
    Strings::string wide;
    EXPECT_EQ(Strings::toUpper(narrow), "");
    EXPECT_EQ(Strings::toLower(narrow), "");
    EXPECT_EQ(Strings::toUpper(wide), L"");
    EXPECT_EQ(Strings::toLower(wide), L"");
    EXPECT_EQ(calls.of("CFLocaleCopyCurrent").size(), 4U);
    EXPECT_EQ(calls.of("CFStringUppercase").size(), 2U);
    EXPECT_EQ(calls.of("CFStringLowercase").size(), 2U);
    EXPECT_EQ(calls.of("CFStringGetCharacters").size(), 4U);
}

TEST_F(CStringsCaseTest, AZeroCutsTheText) {
    std::string narrow("aB\0cD", 5);
    Strings::string wide(L"\u00E9B\0cD", 5);
    EXPECT_EQ(Strings::toUpper(narrow), "AB");
    EXPECT_EQ(Strings::toUpper(wide), L"\u00C9B");
    narrow.assign("\0aB", 3);
    wide.assign(L"\0aB", 3);
    EXPECT_EQ(Strings::toLower(narrow), "");
    Strings::string const constant = wide;
    EXPECT_EQ(Strings::toLower(constant), L"");
    EXPECT_EQ(constant.size(), 3U);
    EXPECT_EQ(Strings::toLower(wide), L"");
}

TEST_F(CStringsCaseTest, AVariableIsChangedInPlaceAndReturned) {
    std::string narrow = "aB";
    EXPECT_EQ(&Strings::toUpper(narrow), &narrow);
    EXPECT_EQ(narrow, "AB");
    EXPECT_EQ(&Strings::toLower(narrow), &narrow);
    EXPECT_EQ(narrow, "ab");
    Strings::string wide = L"aB";
    EXPECT_EQ(&Strings::toUpper(wide), &wide);
    EXPECT_EQ(wide, L"AB");
    EXPECT_EQ(&Strings::toLower(wide), &wide);
    EXPECT_EQ(wide, L"ab");
}

TEST_F(CStringsCaseTest, AConstantIsCopied) {
    Strings::string const constant = L"A\u00C9";
    EXPECT_EQ(Strings::toLower(constant), L"a\u00E9");
    EXPECT_EQ(constant, L"A\u00C9");
    EXPECT_EQ(Strings::toLower(Strings::string(L"ABC")), L"abc");
}

TEST_F(CStringsCaseTest, LocaleFirstThenTheTextThereAndBackThenStringAndLocaleGo) {
    std::vector<std::string> const expected = {
        "CFLocaleCopyCurrent",
        // into UTF-16
        "CFStringCreateWithBytes", "CFStringGetLength", "CFStringGetBytes", "CFStringGetBytes",
        "CFRelease",
        // the string that is changed
        "CFStringCreateWithCharacters", "CFStringCreateMutableCopy", "CFRelease",
        "CFStringUppercase", "CFStringGetLength", "CFStringGetCharacters",
        // out of UTF-16
        "CFStringCreateWithBytes", "CFStringGetLength", "CFStringGetBytes", "CFStringGetBytes",
        "CFRelease",
        // the string, then the locale
        "CFRelease", "CFRelease"};
    CPlatformCalls const calls;
    std::string text = "abc";
    Strings::toUpper(text);
    EXPECT_EQ(calls.names(), expected);

    CFTypeRef const locale = calls.of("CFLocaleCopyCurrent")[0].object;
    CPlatformCall const made = calls.of("CFStringCreateWithCharacters")[0];
    CPlatformCall const copy = calls.of("CFStringCreateMutableCopy")[0];
    std::vector<CPlatformCall> const releases = calls.of("CFRelease");
    EXPECT_EQ(made.allocator, kCFAllocatorDefault);
    EXPECT_EQ(made.inputCount, 3);
    EXPECT_EQ(copy.allocator, kCFAllocatorDefault);
    EXPECT_EQ(copy.source, made.object);
    EXPECT_EQ(copy.capacity, 0);
    EXPECT_EQ(calls.of("CFStringUppercase")[0].object, copy.object);
    EXPECT_EQ(calls.of("CFStringUppercase")[0].locale, locale);
    EXPECT_EQ(calls.of("CFStringGetCharacters")[0].range.location, 0);
    EXPECT_EQ(calls.of("CFStringGetCharacters")[0].range.length, 3);
    ASSERT_EQ(releases.size(), 5U);
    EXPECT_EQ(releases[1].object, made.object);
    EXPECT_EQ(releases[3].object, copy.object);
    EXPECT_EQ(releases[4].object, locale);
}

TEST_F(CStringsCaseTest, LowerCaseTakesTheSameRoad) {
    CPlatformCalls const calls;
    Strings::toLower(Strings::string(L"ABC"));
    std::vector<std::string> const names = calls.names();
    EXPECT_EQ(names.size(), 19U);
    EXPECT_EQ(names.at(0), "CFLocaleCopyCurrent");
    EXPECT_EQ(names.at(9), "CFStringLowercase");
    EXPECT_EQ(calls.of("CFStringLowercase")[0].locale, calls.all()[0].object);
}

TEST_F(CStringsCaseTest, ANullLocaleIsTheRootLocaleAndIsNotReleased) {
    setLocale("tr_TR");
    for (int i = 0; i < 2; ++i) {
        CPlatformCalls calls;
        calls.fail("CFLocaleCopyCurrent");
        Strings::string text = L"iI";
        if (i == 0)
            EXPECT_EQ(Strings::toUpper(text), L"II");
        else
            EXPECT_EQ(Strings::toLower(text), L"ii");
        EXPECT_EQ(calls.of("CFLocaleCopyCurrent").size(), 1U);
        EXPECT_EQ(calls.of("CFRelease").size(), 4U);
    }
}

TEST_F(CStringsCaseTest, AnOldPlatformIsNotAskedForALocale) {
    setRelease(298.999);
    setLocale("tr_TR");
    CPlatformCalls const calls;
    EXPECT_EQ(upper(L"i"), L"I");
    EXPECT_EQ(lower(L"I"), L"i");
    EXPECT_TRUE(calls.of("CFLocaleCopyCurrent").empty());
    EXPECT_EQ(calls.of("CFStringUppercase").at(0).locale, nullptr);
}

TEST_F(CStringsCaseTest, TheFirstReleaseWithLocalesIsAsked) {
    setRelease(299.0);
    setLocale("tr_TR");
    EXPECT_EQ(upper(L"i"), L"\u0130");
}

TEST_F(CStringsCaseTest, WhetherThePlatformHasLocalesIsDecidedOnce) {
    setLocale("tr_TR");
    EXPECT_EQ(upper(L"i"), L"\u0130");
    setRelease(1.0);
    EXPECT_EQ(upper(L"i"), L"\u0130");
}

TEST_F(CStringsCaseTest, AFailedConversionReleasesTheLocaleAndChangesNothing) {
    CPlatformCalls const calls;
    for (std::string const& invalid :
         {std::string("ab\xFF"), std::string("\xC3"), std::string("\xED\xA0\x80")}) {
        std::string text = invalid;
        EXPECT_THROW(Strings::toUpper(text), TExcEncoding);
        EXPECT_EQ(text, invalid);
        EXPECT_THROW(Strings::toLower(text), TExcEncoding);
        EXPECT_EQ(text, invalid);
    }
    Strings::string const invalid = {L'a', static_cast<wchar_t>(0xD800)};
    Strings::string text = invalid;
    EXPECT_THROW(Strings::toUpper(text), TExcEncoding);
    EXPECT_THROW(Strings::toLower(text), TExcEncoding);
    EXPECT_THROW(Strings::toLower(invalid), TExcEncoding);
    EXPECT_EQ(text, invalid);
    EXPECT_EQ(calls.of("CFLocaleCopyCurrent").size(), 9U);
    EXPECT_EQ(calls.of("CFRelease").size(), 9U);
}

// A conversion that the platform lets down in the middle keeps its own string; nothing else is
// left, neither on the way in (1 and 2) nor on the way out.
TEST_F(CStringsCaseTest, AFailedReadLeavesNoMoreThanItsOwnString) {
    long const before = TestSupport::liveObjects();
    for (int nth = 1; nth <= 4; ++nth) {
        CPlatformCalls calls;
        calls.fail("CFStringGetBytes", nth);
        std::string text = "abc";
        EXPECT_THROW(Strings::toUpper(text), TExcEncoding) << nth;
        EXPECT_EQ(text, "abc") << nth;
        EXPECT_EQ(TestSupport::liveObjects(), before + 1) << nth;
        CFRelease(calls.of("CFStringGetBytes").back().object);
    }
}

TEST_F(CStringsCaseTest, AFailureOnTheWayOutLeavesNothing) {
    CPlatformCalls calls;
    calls.fail("CFStringCreateWithBytes", 2);
    Strings::string text = L"abc";
    EXPECT_THROW(Strings::toLower(text), TExcEncoding);
    EXPECT_EQ(text, L"abc");
}

TEST_F(CStringsCaseTest, ALongTextComesOutWhole) {
    Strings::string text;
    Strings::string expected;
    for (int i = 0; i < 20000; ++i) {
        text += L"\u00DF\U00010428";
        expected += L"SS\U00010400";
    }
    EXPECT_EQ(Strings::toUpper(text), expected);
}

} // namespace
