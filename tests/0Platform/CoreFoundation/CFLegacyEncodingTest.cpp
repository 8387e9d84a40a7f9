#include "0Platform/CoreFoundation/CFLegacyTwin.h"
#include "support/ObjectCount.h"

#include <algorithm>
#include <atomic>
#include <iostream>
#include <numeric>
#include <thread>

namespace {

using namespace TestSupport;

// Each legacy encoding in turn, beside its twin.
class CFLegacyEncodingTest : public CObjectCountTest,
                             public testing::WithParamInterface<CLegacyEncoding> {
  protected:
    CFLegacyEncodingTest() { std::cout << "seed " << seed << "\n"; }

    CFStringEncoding encoding() const { return GetParam().value; }

    static constexpr unsigned seed = 20260117;
    std::mt19937 random_{seed};
    CLegacyTwin const twin_{GetParam()};
};

INSTANTIATE_TEST_SUITE_P(All, CFLegacyEncodingTest, testing::ValuesIn(legacyEncodings()),
                         [](auto const& instance) { return instance.param.name; });

std::string joined(std::vector<CEncoded> const& characters) {
    std::string bytes;
    for (CEncoded const& character : characters)
        bytes += character.bytes;
    return bytes;
}

TEST_P(CFLegacyEncodingTest, EachCodeOfOneByteOrTwoIsReadAsByTheTwin) {
    for (unsigned first = 0; first < 0x100; ++first) {
        std::string bytes(1, static_cast<char>(first));
        ASSERT_EQ(decode(bytes, encoding()), twin_.decode(bytes)) << hexOf(bytes);
        bytes += '\0';
        for (unsigned second = 0; second < 0x100; ++second) {
            bytes[1] = static_cast<char>(second);
            ASSERT_EQ(decode(bytes, encoding()), twin_.decode(bytes)) << hexOf(bytes);
        }
    }
}

TEST_P(CFLegacyEncodingTest, EachUnitIsWrittenAsByTheTwin) {
    for (unsigned unit = 0; unit < 0x10000; ++unit) {
        std::u16string const text(1, static_cast<char16_t>(unit));
        ASSERT_EQ(encode(text, encoding()).bytes, joined(twin_.encode(text))) << hexOf(text);
    }
}

// Not always the same code: some are only read, since another one has the same text.
TEST_P(CFLegacyEncodingTest, TheTextOfEachCodeIsWrittenAsACodeOfTheSameText) {
    for (auto const& [bytes, text] : twin_.codes()) {
        CEncoded const encoded = encode(text, encoding());
        ASSERT_EQ(encoded.units, static_cast<CFIndex>(text.size())) << hexOf(bytes);
        ASSERT_EQ(decode(encoded.bytes, encoding()), text) << hexOf(bytes);
    }
}

TEST_P(CFLegacyEncodingTest, AsciiIsAsciiWhereverItStands) {
    auto const isOneHighUnit = [](auto const& code) {
        return code.second.size() == 1 && code.second[0] >= 0x80;
    };
    std::string const high =
        std::find_if(twin_.codes().begin(), twin_.codes().end(), isOneHighUnit)->first;
    for (unsigned byte = 0; byte < 0x80; ++byte) {
        std::string const bytes = high + static_cast<char>(byte) + high;
        std::optional<std::u16string> const text = decode(bytes, encoding());
        ASSERT_TRUE(text) << byte;
        EXPECT_EQ((*text)[1], byte);
        EXPECT_EQ(encode(*text, encoding()).bytes[high.size()], static_cast<char>(byte));
    }
}

TEST_P(CFLegacyEncodingTest, RandomBytesAreReadAsByTheTwin) {
    for (int round = 0; round < 3000; ++round) {
        std::string const bytes = twin_.drawBytes(random_, 60, round % 2 == 0);
        ASSERT_EQ(decode(bytes, encoding()), twin_.decode(bytes)) << hexOf(bytes);
    }
}

TEST_P(CFLegacyEncodingTest, NoiseIsReadAsByTheTwin) {
    for (int round = 0; round < 3000; ++round) {
        std::string bytes(random_() % 70, '\0');
        std::generate(bytes.begin(), bytes.end(), [this] { return static_cast<char>(random_()); });
        ASSERT_EQ(decode(bytes, encoding()), twin_.decode(bytes)) << hexOf(bytes);
    }
}

TEST_P(CFLegacyEncodingTest, RandomTextIsWrittenAsByTheTwin) {
    for (int round = 0; round < 3000; ++round) {
        std::u16string const text = twin_.drawText(random_, 40);
        CEncoded const encoded = encode(text, encoding());
        std::string const expected = joined(twin_.encode(text));
        ASSERT_EQ(encoded.bytes, expected) << hexOf(text);
        ASSERT_EQ(encoded.units, static_cast<CFIndex>(text.size()));
        ASSERT_EQ(measure(text, encoding()), static_cast<CFIndex>(expected.size()));
    }
}

// A buffer holds the whole characters that fit, and the next call goes on behind them.
TEST_P(CFLegacyEncodingTest, EachSmallBufferHoldsWholeCharacters) {
    for (int round = 0; round < 60; ++round) {
        std::u16string const text = twin_.drawText(random_, 8);
        std::vector<CEncoded> const characters = twin_.encode(text);
        CFIndex const whole = static_cast<CFIndex>(joined(characters).size());
        CEncoded expected = {0, ""};
        auto next = characters.begin();
        for (CFIndex limit = 0; limit <= whole + 1; ++limit) {
            for (; next != characters.end() &&
                   static_cast<CFIndex>(expected.bytes.size() + next->bytes.size()) <= limit;
                 ++next) {
                expected.units += next->units;
                expected.bytes += next->bytes;
            }
            ASSERT_EQ(encodeWithin(limit, text, encoding()), expected)
                << hexOf(text) << " within " << limit;
        }
    }
}

TEST_P(CFLegacyEncodingTest, PassesOfAnySizeGiveTheWholeText) {
    for (int round = 0; round < 200; ++round) {
        std::u16string const text = twin_.drawText(random_, 30);
        CFIndex const limit = 2 + static_cast<CFIndex>(random_() % 70);
        std::string bytes;
        for (CFIndex done = 0; done < static_cast<CFIndex>(text.size());) {
            CEncoded const pass = encodeWithin(limit, text, encoding(), done);
            ASSERT_GT(pass.units, 0);
            bytes += pass.bytes;
            done += pass.units;
        }
        ASSERT_EQ(bytes, joined(twin_.encode(text))) << hexOf(text) << " by " << limit;
    }
}

TEST_P(CFLegacyEncodingTest, ALeadByteAtTheVeryEndFails) {
    std::string leads;
    for (auto const& code : twin_.codes()) {
        if (code.first.size() == 2)
            leads += code.first[0];
    }
    leads.erase(std::unique(leads.begin(), leads.end()), leads.end());
    EXPECT_EQ(!leads.empty(), GetParam().hasPairs);
    for (char const lead : leads) {
        for (std::size_t length = 0; length < 40; ++length)
            ASSERT_EQ(decode(std::string(length, 'a') + lead, encoding()), std::nullopt)
                << hexOf(std::string(1, lead)) << " behind " << length;
    }
}

TEST_P(CFLegacyEncodingTest, WithoutALossByteWritingStopsAtTheFirstCharacterThatIsMissing) {
    for (std::size_t length : {0U, 1U, 15U, 16U, 17U, 40U}) {
        std::u16string const before(length, u'a');
        CEncoded const expected = {static_cast<CFIndex>(length), std::string(length, 'a')};
        EXPECT_EQ(encode(before + u"\U0001F600" + before, encoding(), 0), expected);
        EXPECT_EQ(encode(before + u"\u12A0" + before, encoding(), 0), expected);
        EXPECT_EQ(encode(before + u'\xD800' + before, encoding(), 0), expected);
    }
}

TEST_P(CFLegacyEncodingTest, TheLossByteIsTheCallersAndStandsOnceForEachCharacter) {
    EXPECT_EQ(encode(u"a\U0001F600\u12A0b", encoding(), '_'), (CEncoded{5, "a__b"}));
}

TEST_P(CFLegacyEncodingTest, NothingBecomesNothing) {
    EXPECT_EQ(decode("", encoding()), u"");
    EXPECT_EQ(encode(u"", encoding()), (CEncoded{0, ""}));
}

// The first use of an encoding, by several threads at once.
TEST_P(CFLegacyEncodingTest, ThreadsMayShareAnEncoding) {
    std::string const bytes = joined(twin_.encode(twin_.drawText(random_, 200)));
    std::u16string const text = *twin_.decode(bytes);
    std::atomic<int> right{0};
    std::vector<std::thread> threads;
    for (int i = 0; i < 4; ++i) {
        threads.emplace_back([&] {
            for (int round = 0; round < 20; ++round)
                right += decode(bytes, encoding()) == text;
        });
    }
    for (std::thread& thread : threads)
        thread.join();
    EXPECT_EQ(right, 80);
}

using CFLegacyRulesTest = CObjectCountTest;

// Of all lines of the generated tables' source, the one of the yen sign alone is not kept.
TEST_F(CFLegacyRulesTest, EachLineOfTheTablesSourceGoesThereAndBack) {
    EXPECT_EQ(legacyCodes().size(), 55962U);
    for (CLegacyCode const& code : legacyCodes()) {
        SCOPED_TRACE(std::to_string(code.encoding) + " " + hexOf(code.bytes));
        bool const isYen = code.encoding == kCFStringEncodingMacJapanese && code.bytes == "\\";
        ASSERT_EQ(decode(code.bytes, code.encoding), isYen ? u"\\" : code.units);
        // The right-to-left twins of ASCII are only read.
        bool const isAscii = code.units.size() == 1 && code.units[0] < 0x80;
        std::string const bytes = isYen     ? "?"
                                  : isAscii ? std::string(1, static_cast<char>(code.units[0]))
                                            : code.bytes;
        ASSERT_EQ(encode(code.units, code.encoding),
                  (CEncoded{static_cast<CFIndex>(code.units.size()), bytes}));
    }
}

TEST_F(CFLegacyRulesTest, AnEncodingThatIsNotServedFailsForEachText) {
    std::vector<CFStringEncoding> values(0x1000);
    std::iota(values.begin(), values.end(), 0);
    for (CFStringEncoding const unicode : {0x0C000100U, 0x10000100U, 0x18000100U, 0xFFFFFFFFU})
        values.push_back(unicode);
    for (CFStringEncoding const value : values) {
        bool const isServed =
            value == 0x100 || value == 0xFF ||
            std::any_of(legacyEncodings().begin(), legacyEncodings().end(),
                        [value](auto const& legacy) { return legacy.value == value; });
        EXPECT_EQ(decode("A", value).has_value(), isServed) << value;
        EXPECT_EQ(decode("", value).has_value(), isServed) << value;
        EXPECT_EQ(encode(u"A", value).units, isServed ? 1 : 0) << value;
        EXPECT_EQ(encode(u"A", value).bytes.empty(), !isServed) << value;
    }
}

constexpr CFStringEncoding composing[] = {kCFStringEncodingMacRoman, kCFStringEncodingISOLatin1,
                                          kCFStringEncodingWindowsLatin1};

TEST_F(CFLegacyRulesTest, ABaseAndItsMarkAreTheComposedCharacterWhereverTheyStand) {
    for (CFStringEncoding const encoding : composing) {
        std::string const composed = encode(u"\u00E9", encoding).bytes;
        for (std::size_t length = 0; length < 40; ++length) {
            std::u16string const before(length, u'a');
            for (char16_t const* const after : {u"", u"b", u"bbbbbbbbbbbbbbbbbbbbbbbb", u"\u00FC"})
                EXPECT_EQ(encode(before + u"e\u0301" + after, encoding).bytes,
                          std::string(length, 'a') + composed + encode(after, encoding).bytes)
                    << encoding << " " << length;
        }
    }
}

TEST_F(CFLegacyRulesTest, AMarkThatDoesNotComposeIsLostAndItsBaseStays) {
    for (CFStringEncoding const encoding : composing) {
        EXPECT_EQ(encode(u"x\u0301y", encoding), (CEncoded{3, "x?y"}));
        EXPECT_EQ(encode(u"\u4E00\u0301", encoding), (CEncoded{2, "??"}));
        EXPECT_EQ(encode(u"\u0301", encoding), (CEncoded{1, "?"}));
        // A with ogonek exists, but not in these encodings.
        EXPECT_EQ(encode(u"a\u0328", encoding), (CEncoded{2, "a?"}));
        // Only the first of two marks has a composed character here.
        EXPECT_EQ(encode(u"a\u0301\u0302", encoding),
                  (CEncoded{3, encode(u"\u00E1", encoding).bytes + "?"}));
        EXPECT_EQ(encode(u"e\u0301", encoding, 0).units, 2);
        EXPECT_EQ(encode(u"x\u0301", encoding, 0), (CEncoded{1, "x"}));
    }
}

TEST_F(CFLegacyRulesTest, ABaseAndItsMarkAreOneCharacterWithinALimit) {
    EXPECT_EQ(encodeWithin(0, u"e\u0301", kCFStringEncodingMacRoman), (CEncoded{0, ""}));
    EXPECT_EQ(encodeWithin(1, u"e\u0301", kCFStringEncodingMacRoman), (CEncoded{2, "\x8E"}));
    EXPECT_EQ(encodeWithin(1, u"x\u0301", kCFStringEncodingMacRoman), (CEncoded{1, "x"}));
}

TEST_F(CFLegacyRulesTest, OtherEncodingsDoNotCompose) {
    EXPECT_EQ(encode(u"\u03B1\u0301", kCFStringEncodingMacGreek).bytes, "\xE1?");
    EXPECT_EQ(encode(u"\u0438\u0306", kCFStringEncodingMacCyrillic).bytes, "\xE8?");
    EXPECT_EQ(encode(u"\u304B\u3099", kCFStringEncodingDOSJapanese).bytes, "\x82\xA9?");
}

TEST_F(CFLegacyRulesTest, WindowsLatin1HasHolesAndNoC1Controls) {
    for (char const* const hole : {"\x81", "\x8D", "\x8F", "\x90", "\x9D"})
        EXPECT_EQ(decode(hole, kCFStringEncodingWindowsLatin1), std::nullopt);
    for (char16_t control = 0x80; control < 0xA0; ++control)
        EXPECT_EQ(encode(std::u16string(1, control), kCFStringEncodingWindowsLatin1).bytes, "?");
    EXPECT_EQ(encode(u"\u0085", kCFStringEncodingISOLatin1).bytes, "\x85");
}

// The yen sign has no other byte in Mac Japanese than that of the backslash.
TEST_F(CFLegacyRulesTest, TheBackslashOfMacJapaneseIsNoYenSign) {
    EXPECT_EQ(decode("\\", kCFStringEncodingMacJapanese), u"\\");
    EXPECT_EQ(encode(u"\\", kCFStringEncodingMacJapanese).bytes, "\\");
    EXPECT_EQ(encode(u"\u00A5", kCFStringEncodingMacJapanese).bytes, "?");
}

TEST_F(CFLegacyRulesTest, TheLongestTextThatHasACodeIsTaken) {
    CFStringEncoding const korean = kCFStringEncodingMacKorean;
    EXPECT_EQ(encode(u"1\u20DE\uF87C", korean), (CEncoded{3, "\xA2\xE6"}));
    EXPECT_EQ(encode(u"1\u20DE\uF87E", korean), (CEncoded{3, "\xA5\x42?"}));
    EXPECT_EQ(encode(u"1\uF87C", korean), (CEncoded{2, "1?"}));
    EXPECT_EQ(encode(u"\uF862(21)", korean), (CEncoded{5, "\xAA\xF9"}));
    EXPECT_EQ(encode(u"\uF862(21", korean), (CEncoded{4, "?(21"}));
}

} // namespace
