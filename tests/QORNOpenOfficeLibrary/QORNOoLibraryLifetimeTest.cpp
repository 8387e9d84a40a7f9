// When the texts of a call come and go, seen by the blocks of memory that hold them.

#include "QORNOpenOfficeLibrary/BridgeFixture.h"
#include "QORNOpenOfficeLibrary/Heap.h"

namespace {

using BridgeTest::CHeapWatch;
using BridgeTest::TCalls;
using BridgeTest::TFolders;
using BridgeTest::TTexts;

// Long enough to be watched, and short enough that one pass of a conversion holds each whole.
constexpr std::size_t length = 1000;

class CQORNOoLibraryLifetimeTest : public BridgeTest::CBridgeTest {
  protected:
    CQORNOoLibraryLifetimeTest() {
        for (std::size_t index = 0; index < 5; ++index) {
            folders_[index].assign(length, static_cast<char16_t>(u'a' + index));
            texts_.emplace_back(length, static_cast<wchar_t>(L'a' + index));
        }
    }

    /// The last `count` calls before the first folder is released.
    TCalls callsBeforeRelease(std::size_t count) const {
        TCalls calls = recorder_.calls();
        calls.resize(calls.size() - 5);
        return TCalls(calls.end() - static_cast<long>(count), calls.end());
    }

    TFolders folders_;
    TTexts texts_;
};

TEST_F(CQORNOoLibraryLifetimeTest, ATextIsGoneBeforeTheNextStringIsConverted) {
    CHeapWatch const heap(texts_);
    int seen = 0;
    recorder_.setHook([&heap, &seen](std::string const& call) {
        if (call.compare(0, 25, "CFStringGetCharactersPtr ") == 0) {
            int const next = std::stoi(call.substr(25));
            for (int number = 1; number < next; ++number, ++seen)
                EXPECT_EQ(heap.blocksWith(number), 1) << "text " << number << " at " << call;
        }
        return false;
    });
    initialize(folders_);
    EXPECT_EQ(seen, 1 + 2 + 3 + 4);
}

TEST_F(CQORNOoLibraryLifetimeTest, TheListHoldsCopiesAndTheSpecificationsGoInReverse) {
    CHeapWatch const heap(texts_);
    initialize(folders_);
    EXPECT_EQ(callsBeforeRelease(5), (TCalls{"free 5", "free 4", "free 3", "free 2", "free 1"}));
    for (int number = 1; number <= 5; ++number)
        EXPECT_EQ(heap.blocksWith(number), 1) << "text " << number;
}

TEST_F(CQORNOoLibraryLifetimeTest, AnExceptionDestroysWhatWasBuilt) {
    CHeapWatch const heap(texts_);
    recorder_.setHook(BridgeTest::failAt("CFStringCreateWithBytes hub 4"));
    EXPECT_ANY_THROW(initialize(folders_));
    TCalls const& calls = recorder_.calls();
    EXPECT_EQ(TCalls(calls.end() - 3, calls.end()), (TCalls{"free 3", "free 2", "free 1"}));
    for (int number = 1; number <= 5; ++number)
        EXPECT_EQ(heap.blocksWith(number), 0) << "text " << number;
    EXPECT_EQ(recorder_.releaseLeft(), 5);
}

} // namespace
