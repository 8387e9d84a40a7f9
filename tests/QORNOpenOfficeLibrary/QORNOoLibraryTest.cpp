// The native methods in front of a recorded Java machine and a recorded platform.

#include "QORNOpenOfficeLibrary/BridgeFixture.h"

#include <climits>

namespace {

using namespace std::string_literals;
using BridgeTest::CRecorder;
using BridgeTest::TCalls;
using BridgeTest::TFolders;
using BridgeTest::TTexts;

TFolders const folders = {u"/home/ada", u"/home/ada/Desktop", u"/home/ada/Documents", u"/tmp",
                          u"/srv/office"};
TTexts const texts = {L"/home/ada", L"/home/ada/Desktop", L"/home/ada/Documents", L"/tmp",
                      L"/srv/office"};

class CQORNOoLibraryTest : public BridgeTest::CBridgeTest {
  protected:
    jint version() { return Java_veltra_1qorn_QORN_1OoLibrary_getLibraryVersion(env_, receiver_); }
    jint start() {
        return Java_veltra_1qorn_QORN_1OoLibrary_startSuppressingDialogs(env_, receiver_);
    }
    jint stop() {
        return Java_veltra_1qorn_QORN_1OoLibrary_stopSuppressingDialogs(env_, receiver_);
    }

    /// The text that a folder of these units becomes.
    std::wstring textOf(std::u16string const& units) {
        std::size_t const before = getPaths().size();
        initialize({units, u"", u"", u"", u""});
        return BridgeTest::textsFrom(before).front();
    }

  private:
    // The plain methods touch nothing of Java's.
    JNIEnv* const env_ = nullptr;
};

/// The calls of one initializeLibrary: Java's units go back before the next string is touched, one
/// platform string is converted after the other, and the first to be made is the first to go.
TCalls expectedCalls() {
    TCalls calls;
    for (std::string const number : {"1", "2", "3", "4", "5"}) {
        calls.push_back("GetStringChars " + number);
        calls.push_back("GetStringLength " + number);
        calls.push_back("CFStringCreateWithCharacters " + number);
        calls.push_back("ReleaseStringChars " + number);
    }
    for (std::string const number : {"1", "2", "3", "4", "5"}) {
        calls.push_back("CFStringGetCharactersPtr " + number);
        calls.push_back("CFStringCreateWithBytes hub " + number);
        calls.push_back("CFStringGetBytes hub " + number);
        calls.push_back("CFStringGetBytes hub " + number);
        calls.push_back("CFRelease hub " + number);
    }
    for (std::string const number : {"1", "2", "3", "4", "5"})
        calls.push_back("CFRelease " + number);
    return calls;
}

TEST_F(CQORNOoLibraryTest, ACallRunsStrictlyInOrder) {
    EXPECT_EQ(initialize(folders), 0);
    EXPECT_EQ(recorder_.calls(), expectedCalls());
}

TEST_F(CQORNOoLibraryTest, TheFoldersReachTheListInTheOrderOfTheArguments) {
    initialize(folders);
    EXPECT_EQ(newPaths(), texts);
}

TEST_F(CQORNOoLibraryTest, StringsWithoutUnitsToShowAreReadInOrderToo) {
    recorder_.setHook([](std::string const& call) {
        return call.compare(0, 25, "CFStringGetCharactersPtr ") == 0;
    });
    initialize(folders);
    TCalls expected;
    for (std::string const number : {"1", "2", "3", "4", "5"})
        for (std::string const& string : {number, "hub " + number})
            expected.insert(expected.end(), 2, "CFStringGetBytes " + string);
    EXPECT_EQ(recorder_.callsOf("CFStringGetBytes "), expected);
    EXPECT_EQ(newPaths(), texts);
}

TEST_F(CQORNOoLibraryTest, PlatformStringsAreMadeOfTheUnitsThatJavaGave) {
    initialize(folders);
    auto const& creations = recorder_.creations();
    ASSERT_EQ(creations.size(), 5u);
    ASSERT_EQ(java_.unitsGiven().size(), 5u);
    for (std::size_t index = 0; index < 5; ++index) {
        SCOPED_TRACE(index);
        EXPECT_EQ(creations[index].allocator, kCFAllocatorDefault);
        EXPECT_EQ(creations[index].units, java_.unitsGiven()[index]);
        EXPECT_EQ(creations[index].length, static_cast<CFIndex>(folders[index].size()));
    }
}

TEST_F(CQORNOoLibraryTest, ALengthIsWidenedWithItsSign) {
    for (jsize const length : {-1, -77, INT_MIN}) {
        beginAgain();
        java_.setLength(length);
        initialize(folders);
        for (auto const& creation : recorder_.creations())
            EXPECT_EQ(creation.length, static_cast<CFIndex>(length));
        EXPECT_EQ(recorder_.creations().size(), 5u);
    }
}

TEST_F(CQORNOoLibraryTest, OneStringInFivePlacesIsTakenFiveTimes) {
    jstring const folder = java_.makeString(u"/home/ada");
    EXPECT_EQ(initialize({folder, folder, folder, folder, folder}, 0), 0);
    EXPECT_EQ(newPaths(), TTexts(5, L"/home/ada"));
    EXPECT_EQ(recorder_.callsOf("GetStringChars"), TCalls(5, "GetStringChars 1"));
    EXPECT_EQ(recorder_.callsOf("ReleaseStringChars"), TCalls(5, "ReleaseStringChars 1"));
}

TEST_F(CQORNOoLibraryTest, EveryFlagDoesTheSame) {
    TTexts expected;
    for (jint const flag : {0, 1, -1, 256, 0x10000, INT_MIN, INT_MAX}) {
        SCOPED_TRACE(flag);
        beginAgain();
        EXPECT_EQ(initialize(folders, flag), 0);
        EXPECT_EQ(recorder_.calls(), expectedCalls());
        expected.insert(expected.end(), texts.begin(), texts.end());
        EXPECT_EQ(newPaths(), expected);
    }
}

TEST_F(CQORNOoLibraryTest, AnEmptyStringKeepsItsPlace) {
    initialize({u"", u"/a", u"", u"/b", u""});
    EXPECT_EQ(newPaths(), (TTexts{L"", L"/a", L"", L"/b", L""}));
    EXPECT_TRUE((getPaths().end() - 5)->empty());
    EXPECT_EQ(recorder_.creations()[0].length, 0);
}

TEST_F(CQORNOoLibraryTest, FiveEmptyStringsAreFiveEntries) {
    EXPECT_EQ(initialize({}), 0);
    EXPECT_EQ(newPaths(), TTexts(5));
}

TEST_F(CQORNOoLibraryTest, ASecondCallAppendsFiveMore) {
    initialize(folders);
    initialize(folders);
    TTexts const paths = newPaths();
    ASSERT_EQ(paths.size(), 10u);
    EXPECT_EQ(TTexts(paths.begin(), paths.begin() + 5), texts);
    EXPECT_EQ(TTexts(paths.begin() + 5, paths.end()), texts);
}

TEST_F(CQORNOoLibraryTest, NothingIsSortedMergedOrLookedUp) {
    initialize({u"/z", u"/a", u"/z", u"no/such//folder/", u"/a/../a"});
    EXPECT_EQ(newPaths(), (TTexts{L"/z", L"/a", L"/z", L"no/such//folder/", L"/a/../a"}));
}

TEST_F(CQORNOoLibraryTest, TheListIsAlwaysTheSameObject) {
    auto const* const list = &getPaths();
    initialize(folders);
    EXPECT_EQ(&getPaths(), list);
}

TEST_F(CQORNOoLibraryTest, TheVersionIsThreeBeforeAndAfter) {
    EXPECT_EQ(version(), 3);
    initialize(folders);
    EXPECT_EQ(version(), 3);
}

TEST_F(CQORNOoLibraryTest, SuppressionAnswersZeroInAnyOrder) {
    for (int round = 0; round < 2; ++round) {
        EXPECT_EQ(stop(), 0);
        EXPECT_EQ(stop(), 0);
        EXPECT_EQ(start(), 0);
        EXPECT_EQ(start(), 0);
        EXPECT_EQ(stop(), 0);
        initialize(folders);
    }
}

TEST_F(CQORNOoLibraryTest, ThePlainMethodsTouchNothing) {
    version();
    start();
    stop();
    EXPECT_EQ(recorder_.calls(), TCalls());
    EXPECT_EQ(newPaths(), TTexts());
}

TEST_F(CQORNOoLibraryTest, ASurrogatePairIsOneElement) {
    EXPECT_EQ(textOf(u"/\U0001F600/\U00010000\U0010FFFF"), L"/\U0001F600/\U00010000\U0010FFFF");
}

TEST_F(CQORNOoLibraryTest, AnUnpairedSurrogateIsAQuestionMark) {
    EXPECT_EQ(textOf(u"\xD83D"), L"?");
    EXPECT_EQ(textOf(u"\xDE00"), L"?");
    EXPECT_EQ(textOf(u"a\xD83D"), L"a?");
    EXPECT_EQ(textOf(u"\xDE00z"), L"?z");
    EXPECT_EQ(textOf(u"a\xD83Dz"), L"a?z");
    EXPECT_EQ(textOf(u"a\xDE00\xD83Dz"), L"a??z") << "a pair in the wrong order is none";
    EXPECT_EQ(textOf(u"\xD83D\xD83D\xDE00"), L"?\U0001F600");
    EXPECT_EQ(textOf(u"\xD83D\xDE00\xDE00"), L"\U0001F600?");
}

TEST_F(CQORNOoLibraryTest, ANulIsACharacterLikeAnyOther) {
    EXPECT_EQ(textOf(u"a\0b"s), L"a\0b"s);
    EXPECT_EQ(textOf(u"\0"s), L"\0"s);
    EXPECT_EQ(textOf(u"\0\0/\0"s), L"\0\0/\0"s);
}

TEST_F(CQORNOoLibraryTest, TextIsNeitherNormalisedNorFreedOfMarks) {
    EXPECT_EQ(textOf(u"\uFEFFe\u0301\u00E9\uFFFE\uFFFF"), L"\uFEFFe\u0301\u00E9\uFFFE\uFFFF");
}

TEST_F(CQORNOoLibraryTest, ATextOfManyPassesComesWhole) {
    std::u16string units;
    std::wstring text;
    for (int count = 0; count < 20000; ++count) {
        units += u"a\u00E9\U0001F600";
        text += L"a\u00E9\U0001F600";
    }
    EXPECT_EQ(textOf(units), text);
}

using CFakeJavaDeathTest = CQORNOoLibraryTest;

TEST_F(CFakeJavaDeathTest, AnyOtherFunctionOfJavaEndsTheProgram) {
    // A sanitizer already objects to the type of the function that would say so, and names it.
    char const* const message = "of the JNI function table|failLoudly";
    jstring const text = java_.makeString(u"/home/ada");
    EXPECT_DEATH(java_.GetStringUTFChars(text, nullptr), message);
    EXPECT_DEATH(java_.ExceptionCheck(), message);
}

} // namespace
