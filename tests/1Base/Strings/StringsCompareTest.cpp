#include "1Base/Strings/StringsCompare.h"
#include "1Base/Encoding/Encoding.h"
#include "1Base/Encoding/EncodingExc.h"

#include "support/ObjectCount.h"
#include "support/PlatformCalls.h"
#include "support/TableFile.h"

#include <cstdlib>
#include <random>
#include <string>
#include <vector>

using Encoding::TExcEncoding;
using Strings::stricmp;
using Strings::strnatcmp;
using TestSupport::CPlatformCall;
using TestSupport::CPlatformCalls;

namespace {

using CStringsCompareTest = TestSupport::CObjectCountTest;

std::string narrowOf(Strings::string const& text) {
    return Encoding::convert<std::string>(text);
}

// Both comparisons in each kind of text; the texts hold no zero.
void expectOrder(Strings::string const& a, Strings::string const& b, int ignoringCase,
                 int naturally) {
    std::string const narrowA = narrowOf(a);
    std::string const narrowB = narrowOf(b);
    EXPECT_EQ(stricmp(a, b), ignoringCase) << narrowA << " " << narrowB;
    EXPECT_EQ(stricmp(a.c_str(), b.c_str()), ignoringCase) << narrowA << " " << narrowB;
    EXPECT_EQ(stricmp(narrowA, narrowB), ignoringCase) << narrowA << " " << narrowB;
    EXPECT_EQ(stricmp(narrowA.c_str(), narrowB.c_str()), ignoringCase) << narrowA << " " << narrowB;
    EXPECT_EQ(strnatcmp(a, b), naturally) << narrowA << " " << narrowB;
    EXPECT_EQ(strnatcmp(a.c_str(), b.c_str()), naturally) << narrowA << " " << narrowB;
    EXPECT_EQ(strnatcmp(narrowA, narrowB), naturally) << narrowA << " " << narrowB;
    EXPECT_EQ(strnatcmp(narrowA.c_str(), narrowB.c_str()), naturally) << narrowA << " " << narrowB;
}

// The same with the texts swapped as well.
void expectOrderBothWays(Strings::string const& a, Strings::string const& b, int ignoringCase,
                         int naturally) {
    expectOrder(a, b, ignoringCase, naturally);
    expectOrder(b, a, -ignoringCase, -naturally);
}

TEST_F(CStringsCompareTest, TheEmptyTextComesFirst) {
    expectOrder(L"", L"", 0, 0);
    expectOrderBothWays(L"", L"a", -1, -1);
    expectOrderBothWays(L"", L"\u00E9", -1, -1);
}

TEST_F(CStringsCompareTest, CaseIsIgnored) {
    expectOrderBothWays(L"ABC", L"abc", 0, 0);
    expectOrderBothWays(L"\u0416\u00C9\u03A3", L"\u0436\u00E9\u03C2", 0, 0);
    expectOrderBothWays(L"STRASSE", L"stra\u00DFe", 0, 0);
    expectOrderBothWays(L"abc", L"ABD", -1, -1);
    // Letters come in lower case, so behind what stands between the cases.
    expectOrderBothWays(L"Zebra", L"_x", 1, 1);
}

TEST_F(CStringsCompareTest, NumbersHaveTheirValueInTheNaturalOrderOnly) {
    expectOrderBothWays(L"a2", L"a10", 1, -1);
    expectOrderBothWays(L"file9", L"file10", 1, -1);
    expectOrderBothWays(L"a1", L"a001", 1, 0);
    expectOrderBothWays(L"v1.2.10", L"v1.2.9", -1, 1);
    expectOrderBothWays(L"18446744073709551615", L"18446744073709551616", -1, -1);
    // Digits outside ASCII are characters like any other.
    expectOrderBothWays(L"x\u0662", L"x10", 1, 1);
}

TEST_F(CStringsCompareTest, AccentsAreIgnoredInTheNaturalOrderOnly) {
    expectOrderBothWays(L"r\u00E9sum\u00E9", L"resume", 1, 0);
    expectOrderBothWays(L"R\u00C9SUM\u00C9", L"resume", 1, 0);
    expectOrderBothWays(L"re\u0301sume\u0301", L"r\u00E9sum\u00E9", -1, 0);
    expectOrderBothWays(L"\u039C\u03AC\u03B9\u03BF\u03C2", L"\u03BC\u03B1\u03B9\u03BF\u03C3", -1,
                        0);
    expectOrderBothWays(L"\u0439", L"\u0438", 1, 0);
    // A stroke through a letter is none.
    expectOrderBothWays(L"\u00F8", L"o", 1, 1);
}

TEST_F(CStringsCompareTest, AZeroIsACharacterOfAStringAndTheEndOfAPointer) {
    std::string const narrow("a\0b", 3);
    std::string const other("A\0c", 3);
    Strings::string const wide(L"a\0b", 3);
    Strings::string const wideOther(L"A\0c", 3);
    EXPECT_EQ(stricmp(narrow, other), -1);
    EXPECT_EQ(stricmp(wide, wideOther), -1);
    EXPECT_EQ(strnatcmp(other, narrow), 1);
    EXPECT_EQ(strnatcmp(wideOther, wide), 1);
    EXPECT_EQ(stricmp(narrow, std::string("a")), 1);
    EXPECT_EQ(stricmp(narrow.c_str(), other.c_str()), 0);
    EXPECT_EQ(strnatcmp(wide.c_str(), wideOther.c_str()), 0);
}

TEST_F(CStringsCompareTest, NoLocaleTakesPart) {
    setenv("LC_ALL", "tr_TR.UTF-8", 1);
    CPlatformCalls const calls;
    expectOrderBothWays(L"TITLE", L"title", 0, 0);
    expectOrderBothWays(L"I", L"\u0131", -1, -1);
    EXPECT_TRUE(calls.of("CFLocaleCopyCurrent").empty());
}

TEST_F(CStringsCompareTest, BothTextsAreConvertedThenComparedThenReleased) {
    std::vector<std::string> expected;
    for (int operand = 0; operand < 2; ++operand)
        for (char const* const call : {"CFStringCreateWithBytes", "CFStringGetLength",
                                       "CFStringGetBytes", "CFStringGetBytes", "CFRelease"})
            expected.emplace_back(call);
    for (char const* const call : {"CFStringCreateWithCharacters", "CFStringCreateWithCharacters",
                                   "CFStringCompareWithOptions", "CFRelease", "CFRelease"})
        expected.emplace_back(call);
    {
        CPlatformCalls const calls;
        stricmp(std::string("A\xC3\xA9"), std::string("\xF0\x9F\x98\x80 b"));
        EXPECT_EQ(calls.names(), expected);
    }
    {
        CPlatformCalls const calls;
        strnatcmp(L"A\u00E9", L"\U0001F600 b");
        EXPECT_EQ(calls.names(), expected);
    }
}

TEST_F(CStringsCompareTest, EmptyTextsMakeOnlyTheStringsToCompare) {
    CPlatformCalls const calls;
    EXPECT_EQ(stricmp("", ""), 0);
    EXPECT_EQ(calls.names(), (std::vector<std::string>{
                                 "CFStringCreateWithCharacters", "CFStringCreateWithCharacters",
                                 "CFStringCompareWithOptions", "CFRelease", "CFRelease"}));
}

// The ASCII text takes the same road as any other.
TEST_F(CStringsCompareTest, ThePlatformComparesTheWholeOfBothTexts) {
    CPlatformCalls const calls;
    stricmp("abcd", "ABC");
    strnatcmp(L"\U0001F600", L"xy");
    std::vector<CPlatformCall> const made = calls.of("CFStringCreateWithCharacters");
    std::vector<CPlatformCall> const comparisons = calls.of("CFStringCompareWithOptions");
    ASSERT_EQ(made.size(), 4U);
    ASSERT_EQ(comparisons.size(), 2U);
    CFIndex const lengths[] = {4, 3, 2, 2};
    for (std::size_t i = 0; i < 4; ++i) {
        EXPECT_EQ(made[i].allocator, kCFAllocatorDefault);
        EXPECT_EQ(made[i].inputCount, lengths[i]);
    }
    for (std::size_t i = 0; i < 2; ++i) {
        EXPECT_EQ(comparisons[i].object, made[2 * i].object);
        EXPECT_EQ(comparisons[i].source, made[2 * i + 1].object);
        EXPECT_EQ(comparisons[i].range.location, 0);
        EXPECT_EQ(comparisons[i].range.length, lengths[2 * i]);
    }
    EXPECT_EQ(comparisons[0].options, 1U);
    EXPECT_EQ(comparisons[1].options, 193U);
}

TEST_F(CStringsCompareTest, InvalidTextOnEitherSideEndsInTheConversionsFailure) {
    for (std::string const& invalid : {std::string("a\xFF"), std::string("\xC3"),
                                       std::string("\xED\xA0\x80"), std::string("\xC0\x80")}) {
        EXPECT_THROW(stricmp(invalid, std::string("a")), TExcEncoding);
        EXPECT_THROW(stricmp(std::string("a"), invalid), TExcEncoding);
        EXPECT_THROW(stricmp(invalid.c_str(), "a"), TExcEncoding);
        EXPECT_THROW(stricmp("a", invalid.c_str()), TExcEncoding);
        EXPECT_THROW(strnatcmp(invalid, std::string("a")), TExcEncoding);
        EXPECT_THROW(strnatcmp(std::string("a"), invalid), TExcEncoding);
        EXPECT_THROW(strnatcmp(invalid.c_str(), "a"), TExcEncoding);
        EXPECT_THROW(strnatcmp("a", invalid.c_str()), TExcEncoding);
    }
    for (Strings::string const& invalid : {Strings::string(1, static_cast<wchar_t>(0xD800)),
                                           Strings::string(1, static_cast<wchar_t>(0x110000))}) {
        EXPECT_THROW(stricmp(invalid, Strings::string(L"a")), TExcEncoding);
        EXPECT_THROW(stricmp(L"a", invalid.c_str()), TExcEncoding);
        EXPECT_THROW(strnatcmp(Strings::string(L"a"), invalid), TExcEncoding);
        EXPECT_THROW(strnatcmp(invalid.c_str(), L"a"), TExcEncoding);
    }
}

// A conversion that the platform lets down in the middle keeps its own string; nothing else is
// left.
TEST_F(CStringsCompareTest, AFailedReadLeavesNoMoreThanItsOwnString) {
    long const before = TestSupport::liveObjects();
    for (int nth = 1; nth <= 4; ++nth) {
        CPlatformCalls calls;
        calls.fail("CFStringGetBytes", nth);
        EXPECT_THROW(stricmp("abc", "def"), TExcEncoding) << nth;
        EXPECT_EQ(TestSupport::liveObjects(), before + 1) << nth;
        CFRelease(calls.of("CFStringGetBytes").back().object);
    }
}

Strings::string wideOf(std::u16string const& units) {
    return Encoding::convert<Strings::string>(Strings::stringUTF16(units.begin(), units.end()));
}

// The platform's own tests name the pairs that are answered otherwise here, and why.
bool isAnsweredAsRecorded(std::vector<std::string> const& row) {
    return row[0] != "digits-huge" && row[1] != "2c2f";
}

TEST_F(CStringsCompareTest, EveryRecordedPairOfTextsComparesAsRecordedInEveryKind) {
    std::size_t unpaired = 0;
    for (std::vector<std::string> const& row : TestSupport::readTable("compare.tsv")) {
        ASSERT_EQ(row.size(), 10U);
        // An unpaired surrogate can be in no text of ours.
        if (row[0].rfind("lone-surr", 0) == 0) {
            ++unpaired;
            continue;
        }
        Strings::string const a = wideOf(TestSupport::unitsOfHex(row[1]));
        Strings::string const b = wideOf(TestSupport::unitsOfHex(row[2]));
        int const ignoringCase = stricmp(a, b);
        int const naturally = strnatcmp(a, b);
        EXPECT_EQ(stricmp(narrowOf(a), narrowOf(b)), ignoringCase) << row[1] << " " << row[2];
        EXPECT_EQ(strnatcmp(narrowOf(a), narrowOf(b)), naturally) << row[1] << " " << row[2];
        if (!isAnsweredAsRecorded(row))
            continue;
        std::vector<std::string> const older =
            row[7] == "=" ? std::vector<std::string>(row.begin() + 3, row.begin() + 7)
                          : TestSupport::splitText(row[7], ',');
        std::string const first = std::to_string(ignoringCase);
        std::string const second = std::to_string(naturally);
        EXPECT_TRUE(first == row[3] || first == older.at(0)) << row[1] << " " << row[2];
        EXPECT_TRUE(second == row[5] || second == older.at(2)) << row[1] << " " << row[2];
    }
    EXPECT_EQ(unpaired, 23U);
}

TEST_F(CStringsCompareTest, RandomTextsAreEqualToThemselvesAndInRange) {
    std::mt19937::result_type const seed = 42;
    SCOPED_TRACE("seed " + std::to_string(seed));
    std::mt19937 random(seed);
    Strings::string const alphabet = L"sS\u00DFfi\uFB01\uFB03eE\u00E9\u0301\u0345\u0628\u064B019 "
                                     L"\u03C3\u03C2\u0130\u0131\u304B\u3099\U00010400\U0001F3FB";
    auto const text = [&] {
        Strings::string result;
        for (std::size_t i = random() % 12; i > 0; --i)
            result += alphabet[random() % alphabet.size()];
        return result;
    };
    for (int i = 0; i < 50000; ++i) {
        Strings::string const a = text();
        Strings::string const b = text();
        ASSERT_EQ(stricmp(a, a), 0) << narrowOf(a);
        ASSERT_EQ(strnatcmp(a, a), 0) << narrowOf(a);
        for (int const result : {stricmp(a, b), strnatcmp(a, b)})
            ASSERT_TRUE(result >= -1 && result <= 1) << narrowOf(a) << " " << narrowOf(b);
    }
}

} // namespace
