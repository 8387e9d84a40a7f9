// Conversions beside an encoder and decoder by strings of binary digits.

#include "1Base/Encoding/Encoding.h"

#include "support/ObjectCount.h"
#include "support/TextFailures.h"
#include "support/TextKinds.h"

#include <algorithm>
#include <cstddef>
#include <cstdio>
#include <optional>
#include <random>
#include <string>

namespace {

using CEncodingConverterRandomTest = TestSupport::CObjectCountTest;

using Encoding::convert;
using Strings::stringUTF16;
using TestSupport::utf16Of;
using TestSupport::utf8Of;
using TestSupport::wideOf;

constexpr unsigned seed = 19991231;

void expectRoundTrips(std::u32string const& text) {
    Strings::string const wide = wideOf(text);
    std::string const utf8 = utf8Of(text);
    stringUTF16 const utf16 = utf16Of(text);
    ASSERT_TRUE(convert<std::string>(wide) == utf8);
    ASSERT_TRUE(convert<Strings::string>(utf8) == wide);
    ASSERT_TRUE(convert<stringUTF16>(wide) == utf16);
    ASSERT_TRUE(convert<Strings::string>(utf16) == wide);
    ASSERT_TRUE(convert<stringUTF16>(utf8) == utf16);
    ASSERT_TRUE(convert<std::string>(utf16) == utf8);
}

// Half of the characters from the short ranges, the others from any plane; never a mark in front,
// which UTF-8 would lose.
char32_t randomCharacter(std::mt19937& random) {
    static constexpr unsigned long limits[] = {0x80, 0x800, 0x10000, 0x110000, 0x110000, 0x110000};
    for (;;) {
        unsigned long const limit = limits[random() % std::size(limits)];
        unsigned long const character = random() % limit;
        if (TestSupport::isScalarValue(character) && character != 0xFEFF)
            return static_cast<char32_t>(character);
    }
}

TEST_F(CEncodingConverterRandomTest, EveryCodePointComesBack) {
    std::u32string text;
    for (unsigned long character = 0; character < 0x110000; ++character) {
        if (TestSupport::isScalarValue(character))
            text += static_cast<char32_t>(character);
    }
    ASSERT_EQ(text.size(), 1112064U);
    expectRoundTrips(text);
}

TEST_F(CEncodingConverterRandomTest, AMillionRandomCodePointsComeBack) {
    std::printf("seed %u\n", seed);
    std::mt19937 random(seed);
    std::size_t done = 0;
    bool planes[17] = {};
    while (done < 1000000) {
        std::size_t const limit = random() % 10 == 0 ? 20000 : 60;
        std::size_t const size = 1 + random() % limit;
        std::u32string text;
        while (text.size() < size) {
            text += randomCharacter(random);
            planes[text.back() >> 16] = true;
        }
        ASSERT_NO_FATAL_FAILURE(expectRoundTrips(text));
        done += size;
    }
    EXPECT_TRUE(std::all_of(std::begin(planes), std::end(planes), [](bool met) { return met; }));
}

TEST_F(CEncodingConverterRandomTest, RandomBytesAreReadOrRefusedAsTheReferenceDoes) {
    std::printf("seed %u\n", seed);
    std::mt19937 random(seed);
    // Bytes at the borders of the rules, so that many texts are nearly right.
    std::string const bytes = "aZ\x7F\x80\x8F\x90\x9F\xA0\xA9\xBF\xC0\xC2\xDF\xE0\xE1\xED\xEE\xF0"
                              "\xF3\xF4\xF5\xFF";
    TestSupport::CConversionFailure const refused = {
        "CFStringCreateWithBytes", "Could not create string with encoding UTF8", 53};
    int read = 0;
    for (int round = 0; round < 20000; ++round) {
        std::string text(random() % 3, 'a');
        for (std::size_t i = 1 + random() % 5; i > 0; --i)
            text += bytes[random() % bytes.size()];
        std::optional<std::u32string> const expected = TestSupport::naiveFromUTF8(text);
        if (expected) {
            ++read;
            ASSERT_EQ(convert<Strings::string>(text), wideOf(*expected));
        } else {
            ASSERT_EQ(TestSupport::conversionFailureOf([&text] { convert<Strings::string>(text); }),
                      refused)
                << testing::PrintToString(text);
        }
    }
    EXPECT_GT(read, 500);
}

TEST_F(CEncodingConverterRandomTest, RandomUnitsAreReadWithOneQuestionMarkForEachLoneSurrogate) {
    std::printf("seed %u\n", seed);
    std::mt19937 random(seed);
    std::u16string const units = {u'a',   0xE9,   0x4E16, 0xD7FF, 0xD800, 0xD83D,
                                  0xDBFF, 0xDC00, 0xDE00, 0xDFFF, 0xE000};
    for (int round = 0; round < 100000; ++round) {
        std::u16string text;
        for (std::size_t i = 1 + random() % 8; i > 0; --i)
            text += units[random() % units.size()];
        Strings::string expected;
        for (std::size_t i = 0; i < text.size();) {
            std::u16string const two = text.substr(i, 2);
            std::optional<std::u32string> const both = TestSupport::naiveFromUTF16(two);
            std::optional<std::u32string> const one = TestSupport::naiveFromUTF16(two.substr(0, 1));
            bool const isPair = two.size() == 2 && both && both->size() == 1;
            expected += static_cast<wchar_t>(isPair ? both->front() : one ? one->front() : U'?');
            i += isPair ? 2 : 1;
        }
        ASSERT_EQ(convert<Strings::string>(utf16Of(text)), expected)
            << testing::PrintToString(text);
    }
}

} // namespace
