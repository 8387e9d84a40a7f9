// The native methods in a real Java machine: Java calls them, and the list is read back here.

#include "QORNOpenOfficeLibrary/JavaBridge.h"
#include "support/ObjectCount.h"

#include <CoreFoundation/CoreFoundation.h>

#include <atomic>
#include <climits>
#include <csignal>
#include <sys/resource.h>

namespace {

using namespace std::string_literals;
using BridgeTest::CJavaBridge;
using BridgeTest::edInstance;
using BridgeTest::edStatic;
using BridgeTest::TFolders;
using BridgeTest::TTexts;

std::atomic<bool> nextConversionFails{false};

} // namespace

extern "C" {

CFStringRef __real_CFStringCreateWithBytes(CFAllocatorRef, UInt8 const*, CFIndex, CFStringEncoding,
                                           Boolean);

CFStringRef __wrap_CFStringCreateWithBytes(CFAllocatorRef allocator, UInt8 const* bytes,
                                           CFIndex count, CFStringEncoding encoding,
                                           Boolean external) {
    // Only one: the exception's own texts are converted as well.
    if (nextConversionFails.exchange(false))
        return nullptr;
    return __real_CFStringCreateWithBytes(allocator, bytes, count, encoding, external);
}
}

namespace {

template <class TString>
TString repeat(TString const& text, std::size_t count) {
    TString result;
    result.reserve(text.size() * count);
    for (; count > 0; --count)
        result += text;
    return result;
}

class CQORNOoLibraryJvmTest : public TestSupport::CObjectCountTest {
  protected:
    /// The one Java machine of the process.
    static CJavaBridge& bridge() {
        static CJavaBridge bridge;
        return bridge;
    }

    static void failInJava() {
        rlimit const noCore = {0, 0};
        setrlimit(RLIMIT_CORE, &noCore);
        bridge();
        nextConversionFails = true;
        bridge().initialize({u"/a", u"/b", u"/c", u"/d", u"/e"});
    }

    void expectPaths(TTexts const& expected) const {
        EXPECT_EQ(BridgeTest::textsFrom(before_), expected);
    }

  private:
    std::size_t const before_ = getPaths().size();
};

TEST_F(CQORNOoLibraryJvmTest, ThePlainMethodsAnswerBeforeAndAfter) {
    for (auto const declaration : {edStatic, edInstance}) {
        EXPECT_EQ(bridge().version(declaration), 3);
        EXPECT_EQ(bridge().stop(declaration), 0);
        EXPECT_EQ(bridge().start(declaration), 0);
        EXPECT_EQ(bridge().start(declaration), 0);
        EXPECT_EQ(bridge().stop(declaration), 0);
        bridge().initialize({u"/a", u"/b", u"/c", u"/d", u"/e"}, 1, declaration);
        EXPECT_EQ(bridge().version(declaration), 3);
        EXPECT_EQ(bridge().start(declaration), 0);
        EXPECT_EQ(bridge().stop(declaration), 0);
    }
}

TEST_F(CQORNOoLibraryJvmTest, TwoCallsLeaveTenEntriesWhateverTheFlag) {
    TFolders const folders = {u"/home/ada", u"", u"/caf\u00E9", u"/\u6771\u4EAC", u"/tmp/"};
    TTexts const texts = {L"/home/ada", L"", L"/caf\u00E9", L"/\u6771\u4EAC", L"/tmp/"};
    TTexts expected;
    for (jint const flag : {0, 1, -1, 256, 0x10000, INT_MIN})
        for (auto const declaration : {edStatic, edInstance}) {
            SCOPED_TRACE(flag);
            EXPECT_EQ(bridge().initialize(folders, flag, declaration), 0);
            expected.insert(expected.end(), texts.begin(), texts.end());
            expectPaths(expected);
        }
}

TEST_F(CQORNOoLibraryJvmTest, EveryKindOfStringArrives) {
    bridge().initialize({u"", u"", u"", u"", u""});
    bridge().initialize(
        {u"\U0001F600", u"/\U00010000/\U0010FFFF", u"\uFEFF", u"e\u0301", u"\uFFFE\uFFFF"});
    bridge().initialize(
        {u"a\xD83D", u"\xDE00z", u"\xDE00\xD83D", u"\xD83D\xD83D\xDE00", u"\xDBFF"});
    bridge().initialize({u"\0"s, u"a\0b"s, u"\0\0"s, u"\u6771\0\u4EAC"s, u"\U0001F600\0"s});
    expectPaths({L"",
                 L"",
                 L"",
                 L"",
                 L"",
                 L"\U0001F600",
                 L"/\U00010000/\U0010FFFF",
                 L"\uFEFF",
                 L"e\u0301",
                 L"\uFFFE\uFFFF",
                 L"a?",
                 L"?z",
                 L"??",
                 L"?\U0001F600",
                 L"?",
                 L"\0"s,
                 L"a\0b"s,
                 L"\0\0"s,
                 L"\u6771\0\u4EAC"s,
                 L"\U0001F600\0"s});
}

TEST_F(CQORNOoLibraryJvmTest, AHundredThousandCharactersArriveWhole) {
    constexpr std::size_t count = 100000;
    TFolders const folders = {repeat(u"a"s, count), repeat(u"\u00E9"s, count),
                              repeat(u"\u6771"s, count), repeat(u"\U0001F600"s, count),
                              repeat(u"a\xDE00\U0001F600\xD83D"s, count / 4)};
    TTexts const texts = {repeat(L"a"s, count), repeat(L"\u00E9"s, count),
                          repeat(L"\u6771"s, count), repeat(L"\U0001F600"s, count),
                          repeat(L"a?\U0001F600?"s, count / 4)};
    // EXPECT_EQ would print them.
    std::size_t const before = getPaths().size();
    EXPECT_EQ(bridge().initialize(folders), 0);
    EXPECT_TRUE(BridgeTest::textsFrom(before) == texts);
    EXPECT_EQ(bridge().initializeOnSmallStack(folders), 0);
    EXPECT_TRUE(BridgeTest::textsFrom(before + 5) == texts) << "on a small stack";
}

using CQORNOoLibraryJvmDeathTest = CQORNOoLibraryJvmTest;

// Java's frames have no handler and can't be unwound, so nothing may be caught in front of them.
TEST_F(CQORNOoLibraryJvmDeathTest, AnExceptionEndsTheProcess) {
    GTEST_FLAG_SET(death_test_style, "threadsafe");
    EXPECT_EXIT(failInJava(), testing::KilledBySignal(SIGABRT), "terminat(e called|ing)");
}

} // namespace
