#include <CoreFoundation/CoreFoundation.h>

#include "support/ObjectCount.h"
#include "support/PlatformString.h"
#include "support/TableFile.h"

#include <array>
#include <atomic>
#include <iterator>
#include <string>
#include <thread>
#include <vector>

using TestSupport::CPlatformString;

namespace {

using CFStringCompareTest = TestSupport::CObjectCountTest;

constexpr CFStringCompareFlags ignoringCase = 1;
constexpr CFStringCompareFlags naturally = 193;

int compared(std::u16string const& a, std::u16string const& b, CFStringCompareFlags options) {
    CPlatformString const first(a);
    CPlatformString const second(b);
    CFRange const whole = CFRangeMake(0, static_cast<CFIndex>(a.size()));
    return static_cast<int>(CFStringCompareWithOptions(first.get(), second.get(), whole, options));
}

// Ignoring case there and back, then naturally there and back.
using TAnswers = std::array<int, 4>;

TAnswers answersOf(std::u16string const& a, std::u16string const& b) {
    return {compared(a, b, ignoringCase), compared(b, a, ignoringCase), compared(a, b, naturally),
            compared(b, a, naturally)};
}

TAnswers answersOf(std::vector<std::string> const& fields) {
    TAnswers answers;
    for (std::size_t i = 0; i < answers.size(); ++i)
        answers[i] = std::stoi(fields.at(i));
    return answers;
}

// A recorded pair that is answered otherwise here, on purpose.
struct CDeviation {
    char16_t const* first;
    char16_t const* second;
    TAnswers ours;
    char const* reason;
};

constexpr char const* longNumber =
    "the framework's numbers wrap at 64 bits, ours are compared by their true value";
constexpr char const* newerCase =
    "U+2C2F and U+2C5F became a pair in Unicode 14, which the recorded framework does not know";

constexpr char16_t const* max64 = u"18446744073709551615";
constexpr char16_t const* max64Plus1 = u"18446744073709551616";
constexpr char16_t const* max64Plus2 = u"18446744073709551617";
constexpr char16_t const* twentyNines = u"99999999999999999999";
constexpr char16_t const* tenTo20 = u"100000000000000000000";
constexpr char16_t const* maxSigned64 = u"9223372036854775807";
constexpr char16_t const* maxSigned64Plus1 = u"9223372036854775808";
constexpr char16_t const* twoTo128 = u"340282366920938463463374607431768211456";
constexpr char16_t const* paddedOne = u"000000000000000000000000000001";

CDeviation const deviations[] = {
    {max64, max64Plus1, {-1, 1, -1, 1}, longNumber},
    {max64, max64Plus2, {-1, 1, -1, 1}, longNumber},
    {max64, twentyNines, {-1, 1, -1, 1}, longNumber},
    {max64, tenTo20, {1, -1, -1, 1}, longNumber},
    {max64, twoTo128, {-1, 1, -1, 1}, longNumber},
    {max64Plus1, u"1", {1, -1, 1, -1}, longNumber},
    {max64Plus1, twoTo128, {-1, 1, -1, 1}, longNumber},
    {max64Plus1, paddedOne, {1, -1, 1, -1}, longNumber},
    {u"1", twoTo128, {-1, 1, -1, 1}, longNumber},
    {twentyNines, maxSigned64, {1, -1, 1, -1}, longNumber},
    {twentyNines, maxSigned64Plus1, {1, -1, 1, -1}, longNumber},
    {tenTo20, maxSigned64, {-1, 1, 1, -1}, longNumber},
    {tenTo20, maxSigned64Plus1, {-1, 1, 1, -1}, longNumber},
    {tenTo20, twoTo128, {-1, 1, -1, 1}, longNumber},
    {twoTo128, paddedOne, {1, -1, 1, -1}, longNumber},
    {u"\u2C2F", u"\u2C5F", {0, 0, 0, 0}, newerCase},
};

CDeviation const* findDeviation(std::u16string const& a, std::u16string const& b) {
    for (CDeviation const& deviation : deviations) {
        if (a == deviation.first && b == deviation.second)
            return &deviation;
    }
    return nullptr;
}

TEST_F(CFStringCompareTest, EveryRecordedPairComparesAsRecorded) {
    std::size_t deviating = 0;
    std::vector<std::vector<std::string>> const rows = TestSupport::readTable("compare.tsv");
    EXPECT_GT(rows.size(), 500U);
    for (std::vector<std::string> const& row : rows) {
        ASSERT_EQ(row.size(), 10U) << row[0];
        std::string const name = row[0] + " " + row[1] + " " + row[2];
        std::u16string const a = TestSupport::unitsOfHex(row[1]);
        std::u16string const b = TestSupport::unitsOfHex(row[2]);
        TAnswers const recorded = answersOf({row[3], row[4], row[5], row[6]});
        // The framework of an older system may have answered otherwise: that is as good.
        TAnswers const older =
            row[7] == "=" ? recorded : answersOf(TestSupport::splitText(row[7], ','));
        TAnswers const actual = answersOf(a, b);
        if (CDeviation const* const deviation = findDeviation(a, b)) {
            ++deviating;
            EXPECT_EQ(actual, deviation->ours) << name << ": " << deviation->reason;
            EXPECT_NE(actual, recorded) << name << " agrees after all and need not be listed";
        } else {
            EXPECT_TRUE(actual == recorded || actual == older)
                << name << " gives " << testing::PrintToString(actual);
        }
    }
    EXPECT_EQ(deviating, std::size(deviations)) << "a listed pair is not in the table";
}

// What stands before does not matter, but that something does matters to marks. The lengths reach
// every place in a block of eight units.
TEST_F(CFStringCompareTest, AnEqualBeginningOfAnyLengthChangesNothing) {
    for (std::vector<std::string> const& row : TestSupport::readTable("compare.tsv")) {
        std::u16string const a = TestSupport::unitsOfHex(row[1]);
        std::u16string const b = TestSupport::unitsOfHex(row[2]);
        TAnswers const alone = answersOf(a, b);
        TAnswers const behindOne = answersOf(u"x" + a, u"X" + b);
        EXPECT_EQ(behindOne[0], alone[0]) << row[1] << " " << row[2];
        EXPECT_EQ(behindOne[1], alone[1]) << row[1] << " " << row[2];
        for (std::size_t length = 2; length <= 18; ++length)
            ASSERT_EQ(answersOf(std::u16string(length, u'x') + a, std::u16string(length, u'X') + b),
                      behindOne)
                << row[1] << " " << row[2] << " behind " << length;
    }
}

TEST_F(CFStringCompareTest, OnlyTheRangeOfTheFirstIsCompared) {
    CPlatformString const first(u"xxAbcxx");
    CPlatformString const second(u"aBC");
    for (CFStringCompareFlags const options : {ignoringCase, naturally}) {
        auto const inRange = [&](CFIndex location, CFIndex length) {
            return static_cast<int>(CFStringCompareWithOptions(
                first.get(), second.get(), CFRangeMake(location, length), options));
        };
        EXPECT_EQ(inRange(2, 3), 0);
        EXPECT_EQ(inRange(2, 2), -1);
        EXPECT_EQ(inRange(2, 4), 1);
        EXPECT_EQ(inRange(7, 0), -1);
    }
}

TEST_F(CFStringCompareTest, APairThatTheRangeCutsIsNoCharacter) {
    CPlatformString const first(u"\xD801\xDC00");
    CPlatformString const second(u"\xD801");
    CFRange const half = CFRangeMake(0, 1);
    EXPECT_EQ(CFStringCompareWithOptions(first.get(), second.get(), half, ignoringCase),
              kCFCompareEqualTo);
    EXPECT_EQ(CFStringCompareWithOptions(first.get(), first.get(), half, ignoringCase),
              kCFCompareLessThan);
}

TEST_F(CFStringCompareTest, EveryCodePointIsEqualToItself) {
    for (char32_t c = 0; c <= 0x10FFFF; ++c) {
        std::u16string const text = TestSupport::unitsOfCodePoint(c);
        ASSERT_EQ(compared(text, text, ignoringCase), 0) << static_cast<unsigned long>(c);
        ASSERT_EQ(compared(text, text, naturally), 0) << static_cast<unsigned long>(c);
    }
}

// Where a character is folded in the middle of the other's cluster the framework takes both values
// for equal, whatever they are.
TEST_F(CFStringCompareTest, FoldingAgainstAClustersMiddleCountsAsEqual) {
    EXPECT_EQ(answersOf(u"f\uFB01", u"\uFB01"), (TAnswers{1, 1, 1, 1}));
}

// A folded letter has its mark as one value, which is two units in the other text.
TEST_F(CFStringCompareTest, AMarkBeyondTheFirstPlaneIsComparedWhole) {
    std::u16string const upper = u"\u0531\U0001D165";
    std::u16string const lower = u"\u0561\U0001D165";
    EXPECT_EQ(answersOf(upper, lower), (TAnswers{0, 0, 0, 0}));
    EXPECT_EQ(compared(upper + u"a", lower + u"b", naturally), -1);
}

TEST_F(CFStringCompareTest, MarksAreSkippedOnlyWithinTheFirstText) {
    EXPECT_EQ(answersOf(u"\u00DF\u0301", u"s\u0301s"), (TAnswers{-1, 1, -1, 0}));
}

TEST_F(CFStringCompareTest, NumbersOfAnyLengthCompareByValue) {
    std::u16string const zeros(1000, u'0');
    std::u16string const nines(1000, u'9');
    EXPECT_EQ(compared(u"a" + nines, u"a1" + zeros, naturally), -1);
    EXPECT_EQ(compared(u"a1" + zeros, u"a" + nines, naturally), 1);
    EXPECT_EQ(compared(zeros + u"7", u"7", naturally), 0);
    EXPECT_EQ(compared(zeros, u"0", naturally), 0);
    EXPECT_EQ(compared(zeros + u"x", u"0X", naturally), 0);
    EXPECT_EQ(compared(nines + u"1", nines + u"2", naturally), -1);
}

// Kept marks are sorted, however many they are; these stand behind a letter that is folded. The
// order is that of their combining classes, 27 before 220 before 230.
TEST_F(CFStringCompareTest, ManyMarksBehindALetterAreBroughtIntoOrder) {
    std::u16string sorted;
    std::u16string mixed;
    for (int i = 0; i < 50; ++i)
        mixed += u"\u0301\u0323\u064B";
    for (char16_t const mark : {u'\u064B', u'\u0323', u'\u0301'})
        sorted += std::u16string(50, mark);
    // Capital and small letter of a script whose letters keep their marks.
    EXPECT_EQ(compared(u"\u0531" + mixed, u"\u0561" + sorted, naturally), 0);
    EXPECT_EQ(compared(u"\u0531" + mixed, u"\u0561" + sorted + u"\u0301", naturally), 0);
    EXPECT_EQ(compared(u"\u0531" + mixed, u"\u0561" + sorted + u"a", naturally), -1);
}

TEST_F(CFStringCompareTest, MillionsOfUnitsAreComparedInOneGo) {
    std::u16string const marks(1000000, u'\u0301');
    EXPECT_EQ(compared(u"e" + marks, u"\u00C9", naturally), 0);
    EXPECT_EQ(compared(u"\u0531" + marks, u"\u0561" + marks, naturally), 0);
    EXPECT_EQ(compared(std::u16string(1000000, u'\u00DF'), std::u16string(2000000, u'S'), 1), 0);
}

// The tables of foldings are made by whoever comes first.
TEST_F(CFStringCompareTest, ManyThreadsCompareAtOnce) {
    std::atomic<int> wrong{0};
    std::vector<std::thread> threads;
    for (int i = 0; i < 8; ++i) {
        threads.emplace_back([&wrong] {
            for (int round = 0; round < 200; ++round) {
                wrong +=
                    static_cast<int>(compared(u"\u00C9t\u00E9 9", u"\u00E9T\u00C9 10", 1) != 1);
                wrong += static_cast<int>(compared(u"\u00C9t\u00E9 9", u"ete 10", naturally) != -1);
            }
        });
    }
    for (std::thread& thread : threads)
        thread.join();
    EXPECT_EQ(wrong, 0);
}

} // namespace
