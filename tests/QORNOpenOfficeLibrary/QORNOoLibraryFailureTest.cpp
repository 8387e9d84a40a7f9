// What is left when a call of initializeLibrary does not come to its end.

#include "QORNOpenOfficeLibrary/BridgeFixture.h"
#include "QORNOpenOfficeLibrary/Heap.h"

#include <algorithm>
#include <new>
#include <set>

namespace {

using BridgeTest::failAt;
using BridgeTest::TCalls;
using BridgeTest::TFolders;
using BridgeTest::TTexts;

TFolders const folders = {u"/home/ada", u"/home/ada/Desktop", u"/home/ada/Documents",
                          u"/tmp/of/ada", u"/srv/office/of/ada"};
TTexts const texts = {L"/home/ada", L"/home/ada/Desktop", L"/home/ada/Documents", L"/tmp/of/ada",
                      L"/srv/office/of/ada"};

class CQORNOoLibraryFailureTest : public BridgeTest::CBridgeTest {
  protected:
    /// Expects that a call fails, that it releases no folder and appends none, and that `left`
    /// strings stay behind, which go only then.
    void expectFailure(BridgeTest::THook hook, long left) {
        beginAgain();
        recorder_.setHook(std::move(hook));
        EXPECT_ANY_THROW(initialize(folders));
        EXPECT_EQ(foldersReleased(), TCalls());
        EXPECT_EQ(newPaths(), TTexts());
        EXPECT_EQ(recorder_.releaseLeft(), left);
    }

    /// Calls with the given allocation failing; whether it came to that, and out of the call.
    bool raisesBadAlloc(long allocation) {
        auto const strings = makeStrings(folders);
        BridgeTest::CAllocationFailure const failure(allocation);
        try {
            initialize(strings, 1);
        } catch (std::bad_alloc const&) {
            EXPECT_TRUE(failure.struck());
            return true;
        }
        EXPECT_FALSE(failure.struck());
        return false;
    }

    TCalls foldersReleased() const {
        TCalls released = recorder_.callsOf("CFRelease ");
        released.erase(std::remove_if(released.begin(), released.end(),
                                      [](std::string const& call) {
                                          return call.find("hub") != std::string::npos;
                                      }),
                       released.end());
        return released;
    }

    std::array<std::string, 5> const numbers_ = {"1", "2", "3", "4", "5"};
};

TEST_F(CQORNOoLibraryFailureTest, AFolderThatCouldNotBeMadeFailsWhenItIsRead) {
    for (std::string const& number : numbers_) {
        SCOPED_TRACE(number);
        expectFailure(failAt("CFStringCreateWithCharacters " + number), 4);
        EXPECT_EQ(recorder_.creations().size(), 5u) << "the result is not tested when it is made";
        EXPECT_EQ(recorder_.callsOf("CFStringGetCharactersPtr").size(), std::stoul(number) - 1)
            << "those before it are converted";
    }
}

TEST_F(CQORNOoLibraryFailureTest, AConversionThatCannotBeginLeavesTheFiveStrings) {
    for (std::string const& number : numbers_) {
        SCOPED_TRACE(number);
        expectFailure(failAt("CFStringCreateWithBytes hub " + number), 5);
    }
}

TEST_F(CQORNOoLibraryFailureTest, AConversionThatCannotBeReadLeavesItsOwnStringToo) {
    for (std::string const& number : numbers_)
        for (int const occurrence : {1, 2}) {
            SCOPED_TRACE(number + (occurrence == 1 ? " measuring" : " reading"));
            expectFailure(failAt("CFStringGetBytes hub " + number, occurrence), 6);
        }
}

TEST_F(CQORNOoLibraryFailureTest, AFailureLeavesEarlierEntriesAsTheyAre) {
    initialize(folders);
    beginAgain();
    recorder_.setHook(failAt("CFStringCreateWithBytes hub 5"));
    EXPECT_ANY_THROW(initialize(folders));
    EXPECT_EQ(newPaths(), texts);
    EXPECT_EQ(recorder_.releaseLeft(), 5);
    beginAgain();
    EXPECT_EQ(initialize(folders), 0);
    EXPECT_EQ(newPaths().size(), 10u);
}

struct XInjected {
    std::string call;
};

TEST_F(CQORNOoLibraryFailureTest, AnExceptionPassesAsItIs) {
    for (std::string const& number : numbers_) {
        SCOPED_TRACE(number);
        beginAgain();
        recorder_.setHook([&number](std::string const& call) {
            if (call == "CFStringGetCharactersPtr " + number)
                throw XInjected{call};
            return false;
        });
        try {
            initialize(folders);
            ADD_FAILURE() << "the exception was held back";
        } catch (XInjected const& exception) {
            EXPECT_EQ(exception.call, "CFStringGetCharactersPtr " + number);
        }
        EXPECT_EQ(foldersReleased(), TCalls());
        EXPECT_EQ(newPaths(), TTexts());
        EXPECT_EQ(recorder_.releaseLeft(), 5);
    }
}

TEST_F(CQORNOoLibraryFailureTest, WhereMemoryRunsOutWhatWasAppendedStays) {
    // The list grows in doubling steps: from here on it has room, and only its copies allocate.
    for (int call = 0; call < 120; ++call)
        initialize(folders);
    std::set<std::size_t> appended;
    bool struck = true;
    for (long allocation = 1; struck; ++allocation) {
        SCOPED_TRACE(allocation);
        beginAgain();
        std::size_t const before = getPaths().size();
        struck = raisesBadAlloc(allocation);
        TTexts const paths = BridgeTest::textsFrom(before);
        EXPECT_EQ(paths, TTexts(texts.begin(), texts.begin() + static_cast<long>(paths.size())));
        EXPECT_EQ(foldersReleased().size(), struck ? 0u : 5u);
        EXPECT_EQ(recorder_.releaseLeft() >= 5, struck);
        appended.insert(paths.size());
    }
    EXPECT_EQ(appended, (std::set<std::size_t>{0, 1, 2, 3, 4, 5}));
}

} // namespace
