// The direct road of integers against the stream, which stays the judge: the same text, the same
// value, the same failure, whichever locale is the global one.

#include "1Base/StdUtil/StdUtilStreamCast.h"

#include "1Base/StdUtil/StdUtilCastFailure.h"
#include "1Base/StdUtil/StdUtilLocales.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <limits>
#include <optional>
#include <random>
#include <sstream>
#include <string>
#include <typeinfo>

namespace {

using namespace StdUtilTest;

constexpr int rounds = 150000;

constexpr unsigned int seed = 20240229;

template <class TNumber>
std::wstring write(TNumber number) {
    std::wostringstream stream;
    stream << number;
    return stream.str();
}

template <class TNumber>
std::optional<TNumber> read(std::wstring const& text) {
    std::wistringstream stream(text);
    TNumber number = 0;
    stream >> number;
    if (stream.fail())
        return std::nullopt;
    return number;
}

template <class TNumber>
std::optional<TNumber> cast(std::wstring const& text) {
    try {
        return StdUtil::stream_cast<TNumber>(text);
    } catch (CCastFailure const&) {
        return std::nullopt;
    }
}

// The code points of a text, since a failed comparison would not show most of these texts.
std::string codesOf(std::wstring const& text) {
    std::ostringstream codes;
    for (wchar_t const character : text)
        codes << std::hex << static_cast<unsigned int>(character) << ' ';
    return codes.str();
}

class CRandom {
  public:
    CRandom() : engine_(seed) {}

    std::size_t below(std::size_t bound) { return engine_() % bound; }

    // Numbers of every magnitude, the ends of the type and their neighbours.
    template <class TNumber>
    TNumber number() {
        using TLimits = std::numeric_limits<TNumber>;
        if (below(16) == 0)
            return static_cast<TNumber>(TLimits::min() + static_cast<TNumber>(below(4)));
        if (below(16) == 0)
            return static_cast<TNumber>(TLimits::max() - static_cast<TNumber>(below(4)));
        unsigned long const magnitude = engine_() >> below(64);
        return static_cast<TNumber>(below(2) == 0 ? magnitude : 0 - magnitude);
    }

    // A text near the grammar of numbers: blanks, signs, leading zeros, digits around the limits of
    // the types, and a rest; each part may be missing, doubled or hurt.
    std::wstring text() {
        static wchar_t const* const blanks[] = {L"",  L"",   L" ",      L"\t\n",  L"\v\f\r",
                                                L"x", L"\b", L"\u00A0", L"\u3000"};
        static wchar_t const* const signs[] = {L"",  L"",   L"",   L"-", L"-",
                                               L"+", L"--", L"+-", L"- "};
        static wchar_t const* const zeros[] = {
            L"", L"", L"", L"0", L"00", L"0x", L"0000000000000000000000"};
        static wchar_t const* const limits[] = {L"127",
                                                L"128",
                                                L"255",
                                                L"256",
                                                L"32767",
                                                L"32768",
                                                L"32769",
                                                L"65535",
                                                L"65536",
                                                L"2147483647",
                                                L"2147483648",
                                                L"2147483649",
                                                L"4294967295",
                                                L"4294967296",
                                                L"9223372036854775807",
                                                L"9223372036854775808",
                                                L"9223372036854775809",
                                                L"18446744073709551599",
                                                L"18446744073709551600",
                                                L"18446744073709551609",
                                                L"18446744073709551610",
                                                L"18446744073709551615",
                                                L"18446744073709551616",
                                                L"99999999999999999999999"};
        std::wstring result = pick(blanks);
        result += pick(signs);
        result += pick(zeros);
        if (below(3) == 0)
            result += pick(limits);
        else
            result += digits();
        if (below(3) == 0)
            result += noise();
        if (below(4) == 0 && !result.empty())
            result[below(result.size())] = noise();
        return result;
    }

  private:
    template <std::size_t count>
    wchar_t const* pick(wchar_t const* const (&choices)[count]) {
        return choices[below(count)];
    }

    std::wstring digits() {
        std::wstring result;
        for (std::size_t length = below(below(4) == 0 ? 24 : 8); length > 0; --length) {
            result.push_back(static_cast<wchar_t>(L'0' + below(10)));
            if (below(8) == 0)
                result.push_back(L'.');
        }
        return result;
    }

    wchar_t noise() {
        static wchar_t const characters[] = {L'\0',
                                             L' ',
                                             L'+',
                                             L'-',
                                             L'.',
                                             L',',
                                             L'/',
                                             L':',
                                             L'0',
                                             L'9',
                                             L'a',
                                             L'e',
                                             L'x',
                                             L'X',
                                             L'\x7F',
                                             L'\x85',
                                             L'\xA0',
                                             L'\u0660',
                                             L'\u0669',
                                             L'\u2003',
                                             L'\u2212',
                                             L'\u3000',
                                             L'\uFF11',
                                             L'\U0001D7CE',
                                             static_cast<wchar_t>(0x80000000),
                                             static_cast<wchar_t>(-1)};
        return characters[below(sizeof(characters) / sizeof(*characters))];
    }

    std::mt19937_64 engine_;
};

struct CRawTypeNames {
    template <class TType>
    static std::string GetName(int) {
        return typeid(TType).name();
    }
};

template <class TNumber>
class CStdUtilDecimalTest : public testing::Test {
  protected:
    void SetUp() override { std::printf("seed %u\n", seed); }

    void writeAtRandom() {
        for (int round = 0; round < rounds; ++round) {
            auto const number = random_.number<TNumber>();
            ASSERT_EQ(StdUtil::stream_cast<std::wstring>(number), write(number));
        }
    }

    void readAtRandom() {
        int accepted = 0;
        for (int round = 0; round < rounds; ++round) {
            std::wstring const text = random_.text();
            auto const expected = read<TNumber>(text);
            ASSERT_EQ(cast<TNumber>(text), expected) << codesOf(text);
            accepted += expected.has_value();
        }
        // The texts are worth something only while both outcomes are frequent.
        EXPECT_GT(accepted, rounds / 10);
        EXPECT_LT(accepted, rounds - rounds / 10);
    }

    void readBackAtRandom() {
        for (int round = 0; round < rounds; ++round) {
            auto const number = random_.number<TNumber>();
            ASSERT_EQ(cast<TNumber>(StdUtil::stream_cast<std::wstring>(number)), number);
        }
    }

  private:
    CRandom random_;
};

using TNumbers = testing::Types<short, unsigned short, int, unsigned int, long, unsigned long,
                                long long, unsigned long long>;
TYPED_TEST_SUITE(CStdUtilDecimalTest, TNumbers, CRawTypeNames);

TYPED_TEST(CStdUtilDecimalTest, NumbersAreWrittenAsTheStreamWritesThem) {
    this->writeAtRandom();
}

TYPED_TEST(CStdUtilDecimalTest, TextsAreReadAsTheStreamReadsThem) {
    this->readAtRandom();
}

TYPED_TEST(CStdUtilDecimalTest, NumbersComeBackFromTheirTexts) {
    this->readBackAtRandom();
}

TYPED_TEST(CStdUtilDecimalTest, NumbersAreWrittenAsAStreamThatGroupsWritesThem) {
    CGlobalLocale const global(new CGrouping);
    this->writeAtRandom();
}

TYPED_TEST(CStdUtilDecimalTest, TextsAreReadAsAStreamThatGroupsReadsThem) {
    CGlobalLocale const global(new CGrouping);
    this->readAtRandom();
}

TYPED_TEST(CStdUtilDecimalTest, NumbersComeBackFromTheirGroupedTexts) {
    CGlobalLocale const global(new CGrouping);
    this->readBackAtRandom();
}

TYPED_TEST(CStdUtilDecimalTest, TextsAreReadAsAStreamOfOtherWhiteSpaceReadsThem) {
    CGlobalLocale const global(new CBlankX);
    this->readAtRandom();
}

template <class TNumber>
class CStdUtilSmallDecimalTest : public testing::Test {};

using TSmallNumbers = testing::Types<bool, signed char, unsigned char, short, unsigned short>;
TYPED_TEST_SUITE(CStdUtilSmallDecimalTest, TSmallNumbers, CRawTypeNames);

TYPED_TEST(CStdUtilSmallDecimalTest, EveryNumberIsWrittenAsTheStreamWritesIt) {
    using TLimits = std::numeric_limits<TypeParam>;
    for (int number = TLimits::min(); number <= TLimits::max(); ++number) {
        auto const small = static_cast<TypeParam>(number);
        ASSERT_EQ(StdUtil::stream_cast<std::wstring>(small), write(small));
        CGlobalLocale const global(new CGrouping);
        ASSERT_EQ(StdUtil::stream_cast<std::wstring>(small), write(small));
    }
}

TEST(CStdUtilGroupingTest, AGroupingLocaleTakesEffectInBothDirections) {
    CGlobalLocale const global(new CGrouping);
    EXPECT_EQ(StdUtil::stream_cast<std::wstring>(1234567), L"1.234.567");
    EXPECT_EQ(StdUtil::stream_cast<std::wstring>(-1000L), L"-1.000");
    EXPECT_EQ(cast<int>(L"1.234.567"), 1234567);
    EXPECT_EQ(cast<int>(L"1.23.456"), std::nullopt);
}

TEST(CStdUtilGroupingTest, AnOutputFacetOfTheGlobalLocaleIsObeyed) {
    CGlobalLocale const global(new CHidingNumbers);
    EXPECT_EQ(StdUtil::stream_cast<std::wstring>(1234567), L"#");
    EXPECT_EQ(StdUtil::stream_cast<std::wstring>(4294967295U), L"#");
}

TEST(CStdUtilGroupingTest, TheWhiteSpaceOfTheGlobalLocaleIsObeyed) {
    EXPECT_EQ(cast<int>(L"xx7"), std::nullopt);
    EXPECT_EQ(cast<int>(L" 7"), 7);
    CGlobalLocale const global(new CBlankX);
    EXPECT_EQ(cast<int>(L"xx7"), 7);
    EXPECT_EQ(cast<int>(L" 7"), std::nullopt);
}

} // namespace
