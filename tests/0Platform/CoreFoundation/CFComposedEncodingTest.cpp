// The file system's form, kCFStringEncodingMacHFS: UTF-16 in canonical composition.

#include "support/LegacyEncodings.h"
#include "support/ObjectCount.h"
#include "support/PlatformString.h"

#include <unicode/unorm2.h>

#include <cstring>
#include <iostream>
#include <random>

namespace {

using namespace TestSupport;
using namespace std::string_literals;
using CFComposedEncodingTest = CObjectCountTest;

constexpr CFStringEncoding composed = kCFStringEncodingMacHFS;

std::string bytesOf(std::u16string const& units) {
    return std::string(reinterpret_cast<char const*>(units.data()), units.size() * 2);
}

std::u16string unitsOf(std::string const& bytes) {
    std::u16string units(bytes.size() / 2, u'\0');
    bytes.copy(reinterpret_cast<char*>(units.data()), units.size() * 2);
    return units;
}

// The whole text at once, by ICU.
std::u16string normalized(std::u16string const& text) {
    UErrorCode status = U_ZERO_ERROR;
    UNormalizer2 const* const normalizer = unorm2_getNFCInstance(&status);
    std::u16string result(text.size() * 3, u'\0');
    int32_t const length =
        unorm2_normalize(normalizer, text.data(), static_cast<int32_t>(text.size()), result.data(),
                         static_cast<int32_t>(result.size()), &status);
    EXPECT_TRUE(U_SUCCESS(status));
    result.resize(static_cast<std::size_t>(length));
    return result;
}

// The whole text in passes of `limit` bytes.
std::u16string encodeInPasses(std::u16string const& text, CFIndex limit) {
    std::string bytes;
    for (CFIndex done = 0; done < static_cast<CFIndex>(text.size());) {
        CEncoded const pass = encodeWithin(limit, text, composed, done);
        EXPECT_GT(pass.units, 0) << hexOf(text) << " by " << limit;
        if (pass.units == 0)
            break;
        bytes += pass.bytes;
        done += pass.units;
    }
    return unitsOf(bytes);
}

// Letters, marks in any order, Hangul in parts, characters that grow or shrink, surrogates.
std::u16string drawText(std::mt19937& random) {
    constexpr char16_t const* parts[] = {
        u"a",      u"e",          u"\u0301",     u"\u0323",
        u"\u0302", u"\u0344",     u"\u1100",     u"\u1161",
        u"\u11A8", u"\uAC00",     u"\u212B",     u"\uFB2C",
        u"\u0958", u"\U0001D160", u"\U0001D165", u"\U000110A5\U000110BA",
        u"z"};
    std::u16string text;
    for (std::size_t left = random() % 40; left > 0; --left) {
        if (random() % 20 == 0)
            text += static_cast<char16_t>(0xD800 + random() % 0x800);
        else if (random() % 10 == 0)
            text.append(random() % 30, u'n');
        else
            text += parts[random() % std::size(parts)];
    }
    return text;
}

TEST_F(CFComposedEncodingTest, TextIsComposedWhenItIsWritten) {
    EXPECT_EQ(encode(u"cafe\u0301!", composed), (CEncoded{6, bytesOf(u"caf\u00E9!")}));
    EXPECT_EQ(encode(u"\u212B\u1112\u1161\u11AB", composed),
              (CEncoded{4, bytesOf(u"\u00C5\uD55C")}));
    EXPECT_EQ(measure(u"cafe\u0301!", composed), 10);
}

TEST_F(CFComposedEncodingTest, TextIsComposedWhenItIsRead) {
    EXPECT_EQ(decode(bytesOf(u"cafe\u0301!"), composed), u"caf\u00E9!");
    EXPECT_EQ(decode(bytesOf(u"\u212B\u1112\u1161\u11AB"), composed), u"\u00C5\uD55C");
}

TEST_F(CFComposedEncodingTest, SomeTextGrows) {
    EXPECT_EQ(decode(bytesOf(u"\uFB2C\uFB2C"), composed), u"\u05E9\u05BC\u05C1\u05E9\u05BC\u05C1");
    EXPECT_EQ(encode(u"\uFB2C", composed), (CEncoded{1, bytesOf(u"\u05E9\u05BC\u05C1")}));
}

TEST_F(CFComposedEncodingTest, UnitsPassAsInUTF16) {
    std::u16string const text = u"\uFEFFa\0b\xD83D"
                                u"c\xDE00\xFFFE\U0001F600"s;
    EXPECT_EQ(encode(text, composed).bytes, bytesOf(text));
    EXPECT_EQ(decode(bytesOf(text), composed), text);
    EXPECT_EQ(decode(bytesOf(text) + "x", composed), text);
    EXPECT_EQ(decode("x", composed), u"");
    EXPECT_EQ(decode("", composed), u"");
}

TEST_F(CFComposedEncodingTest, BytesNeedNoAlignment) {
    std::string const bytes = "x" + bytesOf(u"e\u0301");
    CPlatformString const text(CFStringCreateWithBytes(
        kCFAllocatorDefault, reinterpret_cast<UInt8 const*>(bytes.data()) + 1, 4, composed, false));
    EXPECT_EQ(text.units(), u"\u00E9");
}

TEST_F(CFComposedEncodingTest, ABufferHoldsWholeCharacters) {
    EXPECT_EQ(encodeWithin(1, u"e\u0301", composed), (CEncoded{0, ""}));
    EXPECT_EQ(encodeWithin(3, u"e\u0301z", composed), (CEncoded{2, bytesOf(u"\u00E9")}));
    EXPECT_EQ(encodeWithin(3, u"\U0001F600", composed), (CEncoded{0, ""}));
    EXPECT_EQ(encodeWithin(5, u"a\U0001F600", composed), (CEncoded{1, bytesOf(u"a")}));
    // What does not compose stays together all the same.
    EXPECT_EQ(encodeWithin(3, u"x\u0301", composed), (CEncoded{0, ""}));
    EXPECT_EQ(encodeWithin(4, u"x\u0301", composed), (CEncoded{2, bytesOf(u"x\u0301")}));
}

TEST_F(CFComposedEncodingTest, RandomTextIsComposedAsIfItWereDoneAtOnce) {
    constexpr unsigned seed = 20150825;
    std::cout << "seed " << seed << "\n";
    std::mt19937 random(seed);
    for (int round = 0; round < 5000; ++round) {
        std::u16string const text = drawText(random);
        std::u16string const expected = normalized(text);
        ASSERT_EQ(decode(bytesOf(text), composed), expected) << hexOf(text);
        ASSERT_EQ(encode(text, composed),
                  (CEncoded{static_cast<CFIndex>(text.size()), bytesOf(expected)}))
            << hexOf(text);
        ASSERT_EQ(measure(text, composed), static_cast<CFIndex>(expected.size() * 2));
        ASSERT_EQ(encodeInPasses(text, 256 + static_cast<CFIndex>(random() % 40)), expected)
            << hexOf(text);
    }
}

// A base may bear more marks than a buffer holds. The writer gets on, and measuring and reading
// agree.
TEST_F(CFComposedEncodingTest, EndlessMarksDoNotStopThePasses) {
    std::u16string text = u"e";
    for (int i = 0; i < 20000; ++i)
        text += i % 2 == 0 ? u'\u0301' : u'\u0323';
    std::u16string const result = encodeInPasses(text, 8192);
    EXPECT_EQ(static_cast<CFIndex>(result.size() * 2), measure(text, composed));
    EXPECT_EQ(decode(bytesOf(text), composed), result);
    // Composed as far as can be: e with dot below takes up one mark.
    EXPECT_EQ(result.size(), text.size() - 1);
    EXPECT_EQ(result[0], u'\u1EB9');
}

} // namespace
