#include "1Base/Encoding/EncodingUTF8.h"

#include "support/NaiveUnicode.h"
#include "support/PlatformCalls.h"
#include "support/TextFailures.h"
#include "support/TextKinds.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstddef>
#include <cstdio>
#include <optional>
#include <random>
#include <string>
#include <vector>

namespace {

using Encoding::convertUTF8ToUTF32;

constexpr char wrongByte[] = "0x80 == (0xc0 & cutf8)";

Strings::string elements(std::vector<unsigned long> const& values) {
    return Strings::string(values.begin(), values.end());
}

std::string failureOf(std::string const& bytes) {
    return TestSupport::failedCheckOf([&bytes] { convertUTF8ToUTF32(bytes); });
}

// The rules by strings of binary digits: what stands in front of a byte's first zero says what it
// is. Nothing where a check fails.
std::optional<std::vector<unsigned long>> naiveLax(std::string const& bytes) {
    std::vector<std::string> values;
    std::size_t owed = 0;
    for (char const byte : bytes) {
        std::string const bits = TestSupport::toBits(static_cast<unsigned char>(byte), 8);
        std::size_t const ones = std::min<std::size_t>(bits.find('0'), 8);
        if (owed > 0) {
            if (ones != 1)
                return std::nullopt;
            values.back() += bits.substr(2);
            --owed;
        } else if (ones == 0) {
            values.push_back(bits);
        } else if (ones >= 2 && ones <= 5) {
            values.push_back(bits.substr(ones));
            owed = ones - 1;
        }
    }
    std::vector<unsigned long> numbers;
    for (std::string const& value : values)
        numbers.push_back(TestSupport::fromBits(value));
    return numbers;
}

TEST(CEncodingUTF8Test, AnEmptyTextStaysEmpty) {
    EXPECT_TRUE(convertUTF8ToUTF32("").empty());
}

TEST(CEncodingUTF8Test, EachLeadByteTakesItsPayloadAndItsContinuations) {
    EXPECT_EQ(convertUTF8ToUTF32("A\x7F"), elements({0x41, 0x7F}));
    EXPECT_EQ(convertUTF8ToUTF32("\xC3\xA9"), elements({0xE9}));
    EXPECT_EQ(convertUTF8ToUTF32("\xE4\xB8\x96"), elements({0x4E16}));
    EXPECT_EQ(convertUTF8ToUTF32("\xF0\x9F\x98\x80"), elements({0x1F600}));
    EXPECT_EQ(convertUTF8ToUTF32("\xF8\x88\x80\x80\x80"), elements({0x200000}));
    EXPECT_EQ(convertUTF8ToUTF32("\xDF\xBF\xEF\xBF\xBF\xF7\xBF\xBF\xBF\xFB\xBF\xBF\xBF\xBF"),
              elements({0x7FF, 0xFFFF, 0x1FFFFF, 0x3FFFFFF}));
}

TEST(CEncodingUTF8Test, AZeroIsACharacter) {
    EXPECT_EQ(convertUTF8ToUTF32(std::string("\0a\0", 3)), elements({0, 'a', 0}));
}

TEST(CEncodingUTF8Test, AByteOrderMarkStays) {
    EXPECT_EQ(convertUTF8ToUTF32("\xEF\xBB\xBF"
                                 "a"),
              elements({0xFEFF, 'a'}));
}

TEST(CEncodingUTF8Test, OverlongFormsAreRead) {
    EXPECT_EQ(convertUTF8ToUTF32("\xC0\x80"), elements({0}));
    EXPECT_EQ(convertUTF8ToUTF32("\xC1\xA1"), elements({'a'}));
    EXPECT_EQ(convertUTF8ToUTF32("\xE0\x80\xAF"), elements({'/'}));
    EXPECT_EQ(convertUTF8ToUTF32("\xF0\x80\x80\xAF"), elements({'/'}));
    EXPECT_EQ(convertUTF8ToUTF32("\xF8\x80\x80\x80\xAF"), elements({'/'}));
}

TEST(CEncodingUTF8Test, EncodedSurrogatesAreRead) {
    EXPECT_EQ(convertUTF8ToUTF32("\xED\xA0\xBD\xED\xB8\x80"), elements({0xD83D, 0xDE00}));
}

TEST(CEncodingUTF8Test, ValuesAboveTheLastCodePointAreRead) {
    EXPECT_EQ(convertUTF8ToUTF32("\xF4\x90\x80\x80"), elements({0x110000}));
    EXPECT_EQ(convertUTF8ToUTF32("\xF5\x80\x80\x80"), elements({0x140000}));
    EXPECT_EQ(convertUTF8ToUTF32("\xF9\xBF\xBF\xBF\xBF"), elements({0x1FFFFFF}));
}

TEST(CEncodingUTF8Test, StrayContinuationsAreDropped) {
    EXPECT_TRUE(convertUTF8ToUTF32("\x80").empty());
    EXPECT_TRUE(convertUTF8ToUTF32("\x80\xBF\xA9").empty());
    EXPECT_EQ(convertUTF8ToUTF32("a\x80"
                                 "b\xC3\xA9\xA9"
                                 "c"),
              elements({'a', 'b', 0xE9, 'c'}));
}

TEST(CEncodingUTF8Test, BytesThatBeginNoSequenceAreDropped) {
    EXPECT_TRUE(convertUTF8ToUTF32("\xFC\xFD\xFE\xFF").empty());
    EXPECT_EQ(convertUTF8ToUTF32("a\xFE"
                                 "b"),
              elements({'a', 'b'}));
    // The continuations of a six-byte form are dropped with it.
    EXPECT_EQ(convertUTF8ToUTF32("\xFC\x84\x80\x80\x80\x80z"), elements({'z'}));
}

TEST(CEncodingUTF8Test, ASequenceThatTheEndCutsOffLeavesWhatItHas) {
    EXPECT_EQ(convertUTF8ToUTF32("\xC3"), elements({0x03}));
    EXPECT_EQ(convertUTF8ToUTF32("a\xE4"), elements({'a', 0x04}));
    EXPECT_EQ(convertUTF8ToUTF32("\xE4\xB8"), elements({0x138}));
    EXPECT_EQ(convertUTF8ToUTF32("\xF0\x9F\x98"), elements({0x7D8}));
    EXPECT_EQ(convertUTF8ToUTF32("\xFB\xBF\xBF\xBF"), elements({0xFFFFF}));
    EXPECT_EQ(convertUTF8ToUTF32("\xF0"), elements({0}));
}

TEST(CEncodingUTF8Test, AWrongByteInsideASequenceFailsACheck) {
    EXPECT_EQ(failureOf("\xE4z"), wrongByte);
    EXPECT_EQ(failureOf("\xE4\xB8z"), wrongByte);
    EXPECT_EQ(failureOf("\xC3\xC3"), wrongByte);
    EXPECT_EQ(failureOf(std::string("\xC3\0", 2)), wrongByte);
    EXPECT_EQ(failureOf("\xF0\x9F\x98\xFF"), wrongByte);
    EXPECT_EQ(failureOf("\xF8\x88\x80\x80z"), wrongByte);
    EXPECT_EQ(failureOf("good so far \xC3z and on"), wrongByte);
}

TEST(CEncodingUTF8Test, ThePlatformHasNoPartInIt) {
    TestSupport::CPlatformCalls const calls;
    convertUTF8ToUTF32("caf\xC3\xA9");
    EXPECT_TRUE(calls.all().empty());
}

TEST(CEncodingUTF8Test, WellFormedTextReadsAsWithConvert) {
    std::u32string text;
    for (unsigned long character = 0; character < 0x110000; ++character) {
        if (TestSupport::isScalarValue(character))
            text += static_cast<char32_t>(character);
    }
    EXPECT_TRUE(convertUTF8ToUTF32(TestSupport::utf8Of(text)) == TestSupport::wideOf(text));
}

void expectAsTheRulesSay(std::string const& bytes) {
    std::optional<std::vector<unsigned long>> const expected = naiveLax(bytes);
    if (expected) {
        ASSERT_EQ(convertUTF8ToUTF32(bytes), elements(*expected)) << testing::PrintToString(bytes);
    } else {
        ASSERT_EQ(failureOf(bytes), wrongByte) << testing::PrintToString(bytes);
    }
}

TEST(CEncodingUTF8Test, EveryPairOfBytesReadsAsTheRulesSay) {
    for (unsigned pair = 0; pair < 0x10000; ++pair)
        ASSERT_NO_FATAL_FAILURE(
            expectAsTheRulesSay({static_cast<char>(pair >> 8), static_cast<char>(pair & 0xFF)}));
}

TEST(CEncodingUTF8Test, RandomBytesReadAsTheRulesSay) {
    unsigned const seed = 20030704;
    std::printf("seed %u\n", seed);
    std::mt19937 random(seed);
    for (int round = 0; round < 400000; ++round) {
        std::string bytes;
        for (std::size_t i = random() % 12; i > 0; --i) {
            // Two in three are continuations, so that sequences come to their end.
            bool const continuation = random() % 3 != 0;
            bytes += static_cast<char>(continuation ? 0x80 + random() % 0x40 : random() % 0x100);
        }
        ASSERT_NO_FATAL_FAILURE(expectAsTheRulesSay(bytes));
    }
}

} // namespace
