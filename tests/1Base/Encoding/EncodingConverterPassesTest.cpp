// How a conversion reads the platform's string: in passes of at most 8192 bytes, each into a buffer
// of its own, and none that ends inside a character.

#include "1Base/Encoding/Encoding.h"

#include "support/ObjectCount.h"
#include "support/PlatformCalls.h"
#include "support/TextKinds.h"

#include <algorithm>
#include <cstddef>
#include <cstdlib>
#include <new>
#include <string>
#include <vector>

namespace {

// The heap's blocks while they are watched, in the order of their allocation.
struct CBlock {
    void* memory;
    std::size_t size;
    bool live;
};

constexpr std::size_t mostBlocks = 4096;
CBlock blocks[mostBlocks];
std::size_t blockCount = 0;
bool watching = false;

void* allocate(std::size_t size) {
    void* const memory = std::malloc(size == 0 ? 1 : size);
    if (memory == nullptr)
        throw std::bad_alloc();
    if (watching && blockCount < mostBlocks)
        blocks[blockCount++] = {memory, size, true};
    return memory;
}

void release(void* memory) {
    for (std::size_t i = blockCount; i > 0; --i) {
        if (blocks[i - 1].memory == memory) {
            blocks[i - 1].live = false;
            break;
        }
    }
    std::free(memory);
}

} // namespace

void* operator new(std::size_t size) {
    return allocate(size);
}

void* operator new[](std::size_t size) {
    return allocate(size);
}

void operator delete(void* memory) noexcept {
    release(memory);
}

void operator delete[](void* memory) noexcept {
    release(memory);
}

void operator delete(void* memory, std::size_t) noexcept {
    release(memory);
}

void operator delete[](void* memory, std::size_t) noexcept {
    release(memory);
}

namespace {

using CEncodingConverterPassesTest = TestSupport::CObjectCountTest;

using Encoding::convert;
using Strings::stringUTF16;
using TBytes = std::basic_string<unsigned char>;
using TestSupport::CPlatformCall;
using TestSupport::CPlatformCalls;

constexpr CFIndex passBytes = 8192;

// A character for each length in UTF-8; the last one is two units of UTF-16.
std::u32string const characters = U"a\u00E9\u4E16\U0001F600";

// The passes among the calls: the readings into a buffer.
std::vector<CPlatformCall> passesOf(CPlatformCalls const& calls) {
    std::vector<CPlatformCall> passes;
    for (CPlatformCall const& call : calls.of("CFStringGetBytes")) {
        if (call.buffer != nullptr)
            passes.push_back(call);
    }
    return passes;
}

// The readings of one direction walk through the whole text without a gap.
void expectWholeWalk(std::vector<CPlatformCall> const& passes, CFIndex length) {
    CFIndex position = 0;
    for (CPlatformCall const& pass : passes) {
        ASSERT_EQ(pass.range.location, position);
        ASSERT_EQ(pass.range.length, length - position);
        ASSERT_GT(pass.result, 0);
        position += pass.result;
    }
    ASSERT_EQ(position, length);
}

// Every pass ends between two characters and within its limit.
void expectWholeCharacters(std::vector<CPlatformCall> const& passes, stringUTF16 const& units) {
    for (CPlatformCall const& pass : passes) {
        ASSERT_LE(pass.room, passBytes);
        ASSERT_LE(pass.used, pass.room);
        auto const end = static_cast<std::size_t>(pass.range.location + pass.result);
        if (end < units.size()) {
            ASSERT_NE(static_cast<unsigned short>(units[end]) & 0xFC00, 0xDC00);
        }
        if (pass.encoding == kCFStringEncodingUTF8) {
            ASSERT_TRUE(TestSupport::naiveFromUTF8(pass.written).has_value());
        }
    }
}

template <class TTarget, class TSource>
void expectConverted(TSource const& source, TTarget const& expected, stringUTF16 const& units) {
    CPlatformCalls const calls;
    TTarget const actual = convert<TTarget>(source);
    ASSERT_TRUE(actual == expected) << "size " << expected.size();
    std::vector<CPlatformCall> const passes = passesOf(calls);
    expectWholeWalk(passes, static_cast<CFIndex>(units.size()));
    expectWholeCharacters(passes, units);
}

// Both directions between UTF-16 and every other kind.
void expectEveryKind(std::u32string const& text) {
    stringUTF16 const units = TestSupport::utf16Of(text);
    expectConverted(units, TestSupport::utf8Of(text), units);
    expectConverted(units, TestSupport::wideOf(text), units);
    expectConverted(TestSupport::utf8Of(text), units, units);
    expectConverted(TestSupport::wideOf(text), units, units);
}

// Texts in which `character` stands at each offset around the place where `unitsPerPass` filler
// characters would fill the nth pass.
void expectBorder(std::size_t fillersPerPass, std::size_t nth) {
    std::size_t const border = fillersPerPass * nth;
    for (char32_t const character : characters) {
        for (std::size_t before = border - 9; before <= border + 5; ++before) {
            std::u32string const text =
                std::u32string(before, U'x') + std::u32string(4, character) + U"yz";
            ASSERT_NO_FATAL_FAILURE(expectEveryKind(text))
                << std::hex << +character << " behind " << std::dec << before;
        }
    }
}

TEST_F(CEncodingConverterPassesTest, NoCharacterIsSplitAtABorderOfUTF8) {
    expectBorder(8192, 1);
    expectBorder(8192, 2);
}

TEST_F(CEncodingConverterPassesTest, NoCharacterIsSplitAtABorderOfUTF16) {
    expectBorder(4096, 1);
    expectBorder(4096, 3);
}

TEST_F(CEncodingConverterPassesTest, NoCharacterIsSplitAtABorderOfUTF32) {
    expectBorder(2048, 1);
    expectBorder(2048, 5);
}

TEST_F(CEncodingConverterPassesTest, TextsOfOneLengthOfCharacterFillEveryPass) {
    for (char32_t const character : characters) {
        for (std::size_t before = 0; before < 5; ++before)
            ASSERT_NO_FATAL_FAILURE(
                expectEveryKind(std::u32string(before, U'x') + std::u32string(9000, character)));
    }
}

TEST_F(CEncodingConverterPassesTest, NarrowAndWideTextComeThroughEveryBorder) {
    for (char32_t const character : characters) {
        for (std::size_t before = 8180; before <= 8196; ++before) {
            std::u32string const text = std::u32string(before, U'x') + character + U"yz";
            ASSERT_EQ(convert<Strings::string>(TestSupport::utf8Of(text)),
                      TestSupport::wideOf(text));
            ASSERT_EQ(convert<std::string>(TestSupport::wideOf(text)), TestSupport::utf8Of(text));
        }
    }
}

TEST_F(CEncodingConverterPassesTest, BytesInANamedEncodingArePassedTheSameWay) {
    for (std::size_t before = 8185; before <= 8193; ++before) {
        std::u32string const text = std::u32string(before, U'x') + U"\U0001F600\u4E16z";
        stringUTF16 const units = TestSupport::utf16Of(text);
        TBytes const bytes = TestSupport::bytesOf(TestSupport::utf8Of(text));
        CPlatformCalls const calls;
        ASSERT_EQ((Encoding::CConverter<TBytes, stringUTF16>::convert(units, Encoding::eseUTF8)),
                  bytes);
        expectWholeWalk(passesOf(calls), static_cast<CFIndex>(units.size()));
        expectWholeCharacters(passesOf(calls), units);
        ASSERT_EQ((Encoding::CConverter<stringUTF16, TBytes>::convert(bytes, Encoding::eseUTF8)),
                  units);
    }
}

TEST_F(CEncodingConverterPassesTest, AnUnpairedHighSurrogateMayEndAPassOfUTF32) {
    for (std::size_t before = 2045; before <= 2050; ++before) {
        std::u16string const units = std::u16string(before, u'x') + u"\xD800" + u"\U0001F600z";
        Strings::string const expected = Strings::string(before, L'x') + L"?\U0001F600z";
        ASSERT_EQ(convert<Strings::string>(TestSupport::utf16Of(units)), expected);
    }
}

TEST_F(CEncodingConverterPassesTest, TheBufferHasTheMeasuredSizeUpTo8192Bytes) {
    for (std::size_t const size : {1U, 100U, 8190U, 8191U, 8192U, 8193U, 100000U}) {
        stringUTF16 const units(size, short{'x'});
        CPlatformCalls const calls;
        convert<std::string>(units);
        std::vector<CPlatformCall> const readings = calls.of("CFStringGetBytes");
        ASSERT_EQ(readings.size(), 1 + (size + 8191) / 8192);
        EXPECT_EQ(readings[0].buffer, nullptr);
        EXPECT_EQ(readings[0].used, static_cast<CFIndex>(size));
        EXPECT_EQ(readings[0].range.length, static_cast<CFIndex>(size));
        for (std::size_t i = 1; i < readings.size(); ++i)
            EXPECT_EQ(readings[i].room, std::min(static_cast<CFIndex>(size), passBytes));
    }
}

TEST_F(CEncodingConverterPassesTest, EveryPassReadsTheSameEncodingWithTheSameLossByte) {
    stringUTF16 const units(20000, short{'x'});
    CPlatformCalls const calls;
    convert<Strings::string>(units);
    CFTypeRef const text = calls.all().front().object;
    for (CPlatformCall const& reading : calls.of("CFStringGetBytes")) {
        EXPECT_EQ(reading.object, text);
        EXPECT_EQ(reading.encoding, 0x1c000100U);
        EXPECT_EQ(reading.lossByte, 63);
        EXPECT_FALSE(reading.external);
    }
    EXPECT_EQ(calls.all().back().function, "CFRelease");
    EXPECT_EQ(calls.of("CFRelease").size(), 1U);
}

// Looks at the heap at each pass of one conversion.
class CBufferWatch {
  public:
    explicit CBufferWatch(CPlatformCalls& calls) {
        calls.observe([this](CPlatformCall const& call) {
            if (call.function == "CFStringGetBytes" && call.buffer != nullptr)
                look(call);
        });
        blockCount = 0;
        watching = true;
    }

    ~CBufferWatch() { watching = false; }

    CBufferWatch(CBufferWatch const&) = delete;
    CBufferWatch& operator=(CBufferWatch const&) = delete;

    std::size_t passes() const { return passes_; }

    /// True where the last pass's buffer is free again.
    bool isLastFreed() const { return !blocks[last_ - 1].live; }

  private:
    void look(CPlatformCall const& call) {
        ++passes_;
        std::size_t number = blockCount;
        while (number > 0 && blocks[number - 1].memory != call.buffer)
            --number;
        ASSERT_GT(number, last_) << "not allocated since the pass before";
        EXPECT_TRUE(blocks[number - 1].live);
        EXPECT_EQ(blocks[number - 1].size, static_cast<std::size_t>(call.room));
        EXPECT_LE(call.room, passBytes);
        if (last_ != 0) {
            EXPECT_TRUE(isLastFreed());
        }
        last_ = number;
    }

    std::size_t passes_ = 0;
    std::size_t last_ = 0;
};

template <class TTarget, class TSource>
void expectFreshBuffers(TSource const& source, std::size_t passes) {
    CPlatformCalls calls;
    CBufferWatch const watch(calls);
    convert<TTarget>(source);
    EXPECT_EQ(watch.passes(), passes);
    EXPECT_TRUE(watch.isLastFreed());
}

TEST_F(CEncodingConverterPassesTest, EachPassHasAFreshBufferThatIsFreedBehindIt) {
    std::u32string const text(20000, U'x');
    expectFreshBuffers<std::string>(TestSupport::utf16Of(text), 3);
    expectFreshBuffers<Strings::string>(TestSupport::utf16Of(text), 10);
    expectFreshBuffers<stringUTF16>(TestSupport::utf8Of(text), 5);
    expectFreshBuffers<stringUTF16>(TestSupport::wideOf(text), 5);
    expectFreshBuffers<std::string>(TestSupport::utf16Of(U"x"), 1);
}

} // namespace
