#include "1Base/Streams/StreamsBuffer.h"
#include "1Base/Strings/StringsKinds.h"

#include <gtest/gtest.h>

#include <ios>
#include <iterator>
#include <limits>
#include <string>
#include <vector>

namespace {

int initialisations = 0;

} // namespace

// Counts how often a stream is initialised. One library's function takes the buffer too, the
// other's leaves the second argument alone.
void realInitialise(std::ios_base* stream, void* buffer) __asm__("__real_" INITIALISE);
void wrapInitialise(std::ios_base* stream, void* buffer) __asm__("__wrap_" INITIALISE);
void wrapInitialise(std::ios_base* stream, void* buffer) {
    ++initialisations;
    realInitialise(stream, buffer);
}

namespace {

using TBuffer = Streams::basic_isbufbuf<wchar_t>;
using TStream = Streams::basic_isbufstream<wchar_t>;

constexpr auto beg = std::ios_base::beg;
constexpr auto cur = std::ios_base::cur;
constexpr auto end = std::ios_base::end;
constexpr std::streamoff farthest = std::numeric_limits<std::streamoff>::max();
constexpr std::streamoff farthestBack = std::numeric_limits<std::streamoff>::min();
constexpr auto eof = std::char_traits<wchar_t>::eof();

std::wstring readAll(std::wstreambuf& buffer) {
    return std::wstring(std::istreambuf_iterator<wchar_t>(&buffer), {});
}

struct CSeek {
    std::streamoff from;
    std::streamoff offset;
    std::ios_base::seekdir direction;
    std::streamoff expected;
};

// In a buffer of ten characters.
CSeek const seeks[] = {
    {3, 0, beg, 0},
    {3, 4, beg, 4},
    {3, 10, beg, 10},
    {3, 11, beg, 10},
    {3, 1000, beg, 10},
    {3, -1, beg, 0},
    {3, farthest, beg, 10},
    {3, farthestBack, beg, 0},
    {3, 0, cur, 3},
    {3, 2, cur, 5},
    {3, -2, cur, 1},
    {3, -3, cur, 0},
    {3, -4, cur, 0},
    {3, 7, cur, 10},
    {3, 8, cur, 10},
    {10, farthest, cur, 10},
    {10, farthestBack, cur, 0},
    {0, farthest, cur, 10},
    {0, farthestBack, cur, 0},
    // From the end the offset counts backward.
    {3, 0, end, 10},
    {3, 1, end, 9},
    {3, 2, end, 8},
    {3, 10, end, 0},
    {3, 11, end, 0},
    {3, -5, end, 10},
    {3, farthest, end, 0},
    {3, farthestBack, end, 10},
};

TEST(CStreamsBufferTest, StartsClosed) {
    TBuffer buffer;
    EXPECT_FALSE(buffer.is_open());
    EXPECT_EQ(buffer.sgetc(), eof);
    EXPECT_EQ(buffer.pubseekoff(0, beg), -1);
}

TEST(CStreamsBufferTest, ReadsItsCharactersAndEndsBehindTheLast) {
    wchar_t text[] = {L'a', L'\0', L'\x1F600', L'd', L'x'};
    TBuffer buffer;
    EXPECT_EQ(&buffer.open(text, 4), &buffer);
    EXPECT_TRUE(buffer.is_open());
    EXPECT_EQ(readAll(buffer), std::wstring(text, 4));
    EXPECT_EQ(buffer.sgetc(), eof);
    EXPECT_TRUE(buffer.is_open());
}

TEST(CStreamsBufferTest, AnEmptyBufferIsOpenAndAtItsEnd) {
    wchar_t none = 0;
    TBuffer buffer;
    buffer.open(&none, 0);
    EXPECT_TRUE(buffer.is_open());
    EXPECT_EQ(buffer.sgetc(), eof);
    EXPECT_EQ(buffer.pubseekoff(5, beg), 0);
}

TEST(CStreamsBufferTest, ANullBufferIsNoneWhateverItsCount) {
    TBuffer buffer;
    buffer.open(nullptr, 5);
    EXPECT_FALSE(buffer.is_open());
    EXPECT_EQ(buffer.sgetc(), eof);
    EXPECT_EQ(buffer.pubseekoff(0, beg), -1);
    EXPECT_EQ(buffer.pubseekoff(0, end), -1);
    EXPECT_EQ(buffer.pubseekpos(0), -1);
}

TEST(CStreamsBufferTest, ANullBufferLeavesAnEmptyGetAreaOfItsOwn) {
    struct CRevealing : TBuffer {
        bool isEmptyAndSet() const {
            return eback() != nullptr && gptr() == eback() && egptr() == eback();
        }
    };
    CRevealing buffer;
    EXPECT_FALSE(buffer.isEmptyAndSet());
    buffer.open(nullptr, 5);
    EXPECT_TRUE(buffer.isEmptyAndSet());
    buffer.close();
    EXPECT_FALSE(buffer.isEmptyAndSet());
}

TEST(CStreamsBufferTest, ANullBufferTakesThePlaceOfTheOneBefore) {
    wchar_t text[] = L"abc";
    TBuffer buffer;
    buffer.open(text, 3).open(nullptr, 3);
    EXPECT_FALSE(buffer.is_open());
    EXPECT_EQ(buffer.sgetc(), eof);
}

TEST(CStreamsBufferTest, AClosedBufferReadsAndSeeksNothing) {
    wchar_t text[] = L"abc";
    TBuffer buffer;
    buffer.open(text, 3);
    EXPECT_EQ(&buffer.close(), &buffer);
    EXPECT_FALSE(buffer.is_open());
    EXPECT_EQ(buffer.sgetc(), eof);
    EXPECT_EQ(buffer.pubseekoff(0, cur), -1);
    EXPECT_EQ(buffer.pubseekpos(1), -1);
}

TEST(CStreamsBufferTest, ASecondOpenStartsTheNewBuffer) {
    wchar_t first[] = L"abc";
    wchar_t second[] = L"wxyz";
    TBuffer buffer;
    buffer.open(first, 3);
    buffer.sbumpc();
    buffer.open(second, 4);
    EXPECT_EQ(readAll(buffer), L"wxyz");
    EXPECT_EQ(buffer.pubseekoff(0, end), 4);
}

TEST(CStreamsBufferTest, SeeksAreClampedToTheBuffer) {
    wchar_t text[] = L"0123456789";
    TBuffer buffer;
    buffer.open(text, 10);
    for (CSeek const& seek : seeks) {
        SCOPED_TRACE(testing::Message() << seek.offset << " in direction " << seek.direction);
        buffer.pubseekpos(seek.from);
        EXPECT_EQ(buffer.pubseekoff(seek.offset, seek.direction), seek.expected);
        EXPECT_EQ(readAll(buffer), std::wstring(text + seek.expected));
    }
}

TEST(CStreamsBufferTest, AnUnknownDirectionMovesNothing) {
    wchar_t text[] = L"0123456789";
    TBuffer buffer;
    buffer.open(text, 10);
    buffer.pubseekpos(3);
    EXPECT_EQ(buffer.pubseekoff(5, static_cast<std::ios_base::seekdir>(3)), -1);
    EXPECT_EQ(buffer.sgetc(), L'3');
}

TEST(CStreamsBufferTest, TheModeOfASeekIsNotLookedAt) {
    wchar_t text[] = L"0123456789";
    TBuffer buffer;
    buffer.open(text, 10);
    EXPECT_EQ(buffer.pubseekoff(4, beg, std::ios_base::out), 4);
    EXPECT_EQ(buffer.pubseekoff(5, beg, std::ios_base::openmode()), 5);
    EXPECT_EQ(buffer.pubseekpos(6, std::ios_base::out), 6);
}

TEST(CStreamsBufferTest, APositionCountsFromTheStart) {
    wchar_t text[] = L"0123456789";
    TBuffer buffer;
    buffer.open(text, 10);
    EXPECT_EQ(buffer.pubseekpos(7), 7);
    EXPECT_EQ(buffer.sgetc(), L'7');
    EXPECT_EQ(buffer.pubseekpos(99), 10);
    EXPECT_EQ(buffer.pubseekpos(-99), 0);
}

TEST(CStreamsBufferTest, APositionGoesThroughTheVirtualOffset) {
    struct CRecorder : TBuffer {
        pos_type seekoff(off_type offset, std::ios_base::seekdir direction,
                         std::ios_base::openmode mode) override {
            offsets.push_back(offset);
            EXPECT_EQ(direction, beg);
            EXPECT_EQ(mode, std::ios_base::out);
            return 42;
        }
        std::vector<off_type> offsets;
    };
    CRecorder recorder;
    EXPECT_EQ(recorder.pubseekpos(3, std::ios_base::out), 42);
    EXPECT_EQ(recorder.offsets, std::vector<TBuffer::off_type>{3});
}

TEST(CStreamsBufferTest, NothingCanBeWritten) {
    wchar_t text[] = L"abc";
    TBuffer buffer;
    buffer.open(text, 3);
    EXPECT_EQ(buffer.sputc(L'x'), eof);
    buffer.sbumpc();
    EXPECT_EQ(buffer.sputbackc(L'x'), eof);
    EXPECT_EQ(std::wstring(text), L"abc");
    EXPECT_EQ(buffer.sputbackc(L'a'), L'a');
    EXPECT_EQ(readAll(buffer), L"abc");
}

TEST(CStreamsBufferTest, AStreamReadsWhereTheTextLies) {
    Strings::string text = L"12 345 rest";
    TStream stream(text.data(), text.size());
    text[3] = L'9';
    int first = 0;
    int second = 0;
    stream >> first >> second;
    EXPECT_EQ(first, 12);
    EXPECT_EQ(second, 945);
    EXPECT_TRUE(stream.good());
}

TEST(CStreamsBufferTest, AStreamBeginsWithItsBufferInGoodState) {
    TStream const stream(L"abc", 3);
    EXPECT_EQ(stream.rdstate(), std::ios_base::goodbit);
    EXPECT_EQ(stream.exceptions(), std::ios_base::goodbit);
    auto const* const buffer = dynamic_cast<TBuffer const*>(stream.rdbuf());
    ASSERT_NE(buffer, nullptr);
    EXPECT_TRUE(buffer->is_open());
}

TEST(CStreamsBufferTest, AStreamIsInitialisedOnce) {
    // With traits of its own the whole stream is compiled here, where the call can be counted.
    struct CTraits : std::char_traits<char> {};
    initialisations = 0;
    Streams::basic_isbufstream<char, CTraits> const stream("abc", 3);
    EXPECT_EQ(initialisations, 1);
}

TEST(CStreamsBufferTest, AStreamOverNothingEndsAtOnce) {
    TStream stream(L"", 0);
    EXPECT_TRUE(stream.good());
    EXPECT_EQ(stream.get(), eof);
    EXPECT_TRUE(stream.eof());
}

TEST(CStreamsBufferTest, AStreamOverANullBufferEndsAtOnce) {
    TStream stream(nullptr, 0);
    EXPECT_TRUE(stream.good());
    EXPECT_EQ(stream.get(), eof);
    EXPECT_TRUE(stream.eof());
}

TEST(CStreamsBufferTest, AStreamSeeksBackwardFromTheEnd) {
    Strings::string const text = L"0123456789";
    TStream stream(text.data(), text.size());
    stream.seekg(2, end);
    EXPECT_EQ(stream.tellg(), 8);
    Strings::string rest;
    stream >> rest;
    EXPECT_EQ(rest, L"89");
    stream.clear();
    stream.seekg(-5, end);
    EXPECT_EQ(stream.tellg(), 10);
    stream.seekg(1000);
    EXPECT_EQ(stream.tellg(), 10);
    EXPECT_FALSE(stream.fail());
}

TEST(CStreamsBufferTest, OtherCharactersAreReadInTheSameWay) {
    std::string const text = "7 and more";
    Streams::basic_isbufstream<char> stream(text.data(), text.size());
    int number = 0;
    stream >> number;
    EXPECT_EQ(number, 7);
    stream.seekg(4, end);
    EXPECT_EQ(stream.get(), 'm');
}

} // namespace
