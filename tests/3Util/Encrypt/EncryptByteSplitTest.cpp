// The repacking of bytes beside a slow twin that works on a text of the digits 0 and 1.

#include "3Util/Encrypt/EncryptByteSplit.h"

#include "1Base/Error/Error.h"

#include "3Util/Encrypt/EncryptTestBytes.h"
#include "support/ObjectCount.h"

#include <gtest/gtest.h>

#include <cstddef>
#include <optional>
#include <set>
#include <string>

namespace {

using Encrypt::mergeBytes;
using Encrypt::splitBytes;
using Encrypt::TByteVector;
using EncryptTest::bytesOf;
using EncryptTest::hexOf;

// A failed assertion makes texts.
using CEncryptByteSplitTest = TestSupport::CObjectCountTest;

constexpr std::size_t longest = 200;

// The `bits` low bits of each unit, the highest first.
std::string digitsOf(TByteVector const& units, std::size_t bits) {
    std::string digits;
    for (unsigned char const unit : units) {
        for (std::size_t bit = bits; bit-- > 0;)
            digits += (unit >> bit & 1) != 0 ? '1' : '0';
    }
    return digits;
}

// Cuts the digits into units of `bits`, the last one filled up with zeros.
TByteVector unitsOf(std::string digits, std::size_t bits) {
    TByteVector units;
    while (digits.size() % bits != 0)
        digits += '0';
    for (std::size_t begin = 0; begin < digits.size(); begin += bits)
        units.push_back(
            static_cast<unsigned char>(std::stoul(digits.substr(begin, bits), nullptr, 2)));
    return units;
}

TByteVector slowSplit(TByteVector const& bytes, std::size_t bits) {
    return unitsOf(digitsOf(bytes, 8), bits);
}

// Nothing where the last group lies within one byte that it doesn't end.
std::optional<TByteVector> slowMerge(TByteVector const& groups, std::size_t bits) {
    std::string const digits = digitsOf(groups, bits);
    if (digits.size() % 8 != 0) {
        std::size_t const firstOfLast = digits.size() - bits;
        std::size_t const lastOfLast = digits.size() - 1;
        if (firstOfLast / 8 == lastOfLast / 8)
            return std::nullopt;
    }
    return unitsOf(digits, 8);
}

std::optional<TByteVector> tryMerge(TByteVector const& groups, std::size_t bits) {
    try {
        return mergeBytes(groups, bits);
    } catch (Error::TExcErrorAssert const&) {
        return std::nullopt;
    }
}

TByteVector lowBits(TByteVector groups, std::size_t bits) {
    for (unsigned char& group : groups)
        group = static_cast<unsigned char>(group & ((1U << bits) - 1));
    return groups;
}

TEST_F(CEncryptByteSplitTest, SplitsFromTheHighestBit) {
    EXPECT_EQ(hexOf(splitBytes(bytesOf("AB CD"), 5)), "150f0610");
    EXPECT_EQ(hexOf(splitBytes(bytesOf("FF"), 3)), "070706");
    EXPECT_EQ(hexOf(splitBytes(bytesOf("FF"), 8)), "ff");
    EXPECT_EQ(hexOf(splitBytes(bytesOf("80"), 1)), "0100000000000000");
}

TEST_F(CEncryptByteSplitTest, MergesFromTheHighestBit) {
    EXPECT_EQ(hexOf(mergeBytes(bytesOf("15 0F 06 10"), 5)), "abcd00");
    EXPECT_EQ(hexOf(mergeBytes(bytesOf("01 01"), 4)), "11");
    EXPECT_EQ(hexOf(mergeBytes(bytesOf("01 01"), 5)), "0840");
    EXPECT_EQ(hexOf(mergeBytes(bytesOf("FF 00 80"), 8)), "ff0080");
}

TEST_F(CEncryptByteSplitTest, GivesNothingForNothing) {
    for (std::size_t bits = 1; bits <= 8; ++bits) {
        EXPECT_TRUE(splitBytes(TByteVector(), bits).empty()) << bits;
        EXPECT_TRUE(mergeBytes(TByteVector(), bits).empty()) << bits;
    }
}

TEST_F(CEncryptByteSplitTest, SplitsLikeTheSlowTwin) {
    EncryptTest::CRandomBytes random;
    for (std::size_t bits = 1; bits <= 8; ++bits) {
        for (std::size_t length = 0; length <= longest; ++length) {
            TByteVector const bytes = random.bytes(length);
            ASSERT_EQ(hexOf(splitBytes(bytes, bits)), hexOf(slowSplit(bytes, bits)))
                << length << " bytes by " << bits;
        }
    }
}

TEST_F(CEncryptByteSplitTest, MergesLikeTheSlowTwin) {
    EncryptTest::CRandomBytes random;
    for (std::size_t bits = 1; bits <= 8; ++bits) {
        for (std::size_t length = 0; length <= longest; ++length) {
            TByteVector const groups = lowBits(random.bytes(length), bits);
            ASSERT_EQ(tryMerge(groups, bits), slowMerge(groups, bits))
                << length << " groups of " << bits;
        }
    }
}

TEST_F(CEncryptByteSplitTest, MergesWhatWasSplitWithAZeroByteForTheFilling) {
    EncryptTest::CRandomBytes random;
    for (std::size_t bits = 1; bits <= 8; ++bits) {
        for (std::size_t length = 0; length <= longest; ++length) {
            TByteVector bytes = random.bytes(length);
            TByteVector const groups = splitBytes(bytes, bits);
            // What the last group was filled up with comes back as a byte of its own.
            if (groups.size() * bits > 8 * length)
                bytes.push_back(0);
            ASSERT_EQ(hexOf(mergeBytes(groups, bits)), hexOf(bytes))
                << length << " bytes by " << bits;
        }
    }
}

// Which lengths fail repeats with the groups that fill whole bytes: eight of them at the most.
TEST_F(CEncryptByteSplitTest, RefusesALastGroupThatLiesWithinAByte) {
    std::set<std::size_t> const refused[] = {
        {1, 2, 3, 4, 5, 6, 7}, // 1 bit
        {1, 2, 3, 5, 6, 7},    // 2 bits
        {1, 2, 4, 5, 7},       // 3 bits
        {1, 3, 5, 7},          // 4 bits
        {1, 3, 6},             // 5 bits
        {1, 5},                // 6 bits
        {1},                   // 7 bits
        {},                    // 8 bits
    };
    for (std::size_t bits = 1; bits <= 8; ++bits) {
        for (std::size_t length = 0; length <= longest; ++length) {
            EXPECT_EQ(tryMerge(TByteVector(length), bits).has_value(),
                      refused[bits - 1].count(length % 8) == 0)
                << length << " groups of " << bits;
        }
    }
}

TEST_F(CEncryptByteSplitTest, RefusesByAFailedAssertion) {
    try {
        mergeBytes(bytesOf("01 02 03"), 5);
        FAIL() << "three groups of five bits are merged";
    } catch (Error::CException const& exc) {
        EXPECT_STREQ(exc.getExcName(), "ErrorAssert");
        EXPECT_EQ(exc.getInfo().getSeverity(), Error::SevError);
        std::wstring const text = exc.getInfo().getMessage().getString(true);
        EXPECT_NE(text.find(L"\"begin != end\""), std::wstring::npos);
    }
}

TEST_F(CEncryptByteSplitTest, ReservesWhatItGives) {
    TByteVector const bytes(1001);
    for (std::size_t bits = 1; bits <= 8; ++bits) {
        TByteVector const groups = splitBytes(bytes, bits);
        EXPECT_EQ(groups.capacity(), groups.size()) << bits;
        TByteVector const merged = mergeBytes(groups, bits);
        EXPECT_EQ(merged.capacity(), merged.size()) << bits;
    }
}

TEST_F(CEncryptByteSplitTest, LeavesItsInputAlone) {
    TByteVector const bytes = EncryptTest::CRandomBytes().bytes(96);
    TByteVector const before = bytes;
    for (std::size_t bits = 1; bits <= 8; ++bits) {
        splitBytes(bytes, bits);
        mergeBytes(bytes, bits);
        EXPECT_EQ(bytes, before) << bits;
    }
}

} // namespace
