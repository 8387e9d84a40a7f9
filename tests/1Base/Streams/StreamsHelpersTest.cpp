#include "1Base/Streams/StreamsHelpers.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <iterator>
#include <list>
#include <sstream>
#include <stdexcept>
#include <string>

namespace {

std::string twoDigitsOf(int value) {
    char digits[3];
    std::snprintf(digits, sizeof(digits), "%02x", static_cast<unsigned int>(value));
    return digits;
}

TEST(CStreamsHelpersTest, ASentryPutsTheFlagsBackAndNothingElse) {
    std::ostringstream stream;
    stream.setf(std::ios_base::showpos);
    std::ios_base::fmtflags const before = stream.flags();
    {
        Streams::CSentry const sentry(stream);
        stream.flags(std::ios_base::hex | std::ios_base::boolalpha);
        stream.precision(3);
        stream.width(9);
    }
    EXPECT_EQ(stream.flags(), before);
    EXPECT_EQ(stream.precision(), 3);
    EXPECT_EQ(stream.width(), 9);
}

TEST(CStreamsHelpersTest, ASentryPutsTheFlagsBackWhenAnExceptionPasses) {
    std::ostringstream stream;
    std::ios_base::fmtflags const before = stream.flags();
    EXPECT_THROW(
        {
            Streams::CSentry const sentry(stream);
            stream.flags(std::ios_base::hex);
            throw std::runtime_error("passes");
        },
        std::runtime_error);
    EXPECT_EQ(stream.flags(), before);
}

TEST(CStreamsHelpersTest, AByteIsTwoHexadecimalDigits) {
    for (int value = 0; value < 256; ++value) {
        std::string const expected = twoDigitsOf(value);
        std::ostringstream narrow;
        Streams::writeHex(narrow, static_cast<unsigned char>(value));
        EXPECT_EQ(narrow.str(), expected);
        std::wostringstream wide;
        Streams::writeHex(wide, static_cast<unsigned char>(value));
        EXPECT_EQ(wide.str(), std::wstring(expected.begin(), expected.end()));
    }
}

TEST(CStreamsHelpersTest, AByteLeavesTheFlagsAsTheyWereAndTheFillAtZero) {
    std::ostringstream stream;
    stream.fill('*');
    stream.width(9);
    std::ios_base::fmtflags const before = stream.flags();
    EXPECT_EQ(&Streams::writeHex(stream, 10), &stream);
    EXPECT_EQ(stream.str(), "0a");
    EXPECT_EQ(stream.flags(), before);
    EXPECT_EQ(stream.fill(), '0');
    EXPECT_EQ(stream.width(), 0);
    stream.width(4);
    stream << 10;
    EXPECT_EQ(stream.str(), "0a0010");
}

TEST(CStreamsHelpersTest, AByteIsHexadecimalOnAnOctalStream) {
    std::ostringstream stream;
    stream << std::oct;
    Streams::writeHex(stream, 255) << ' ' << 8;
    EXPECT_EQ(stream.str(), "ff 10");
}

TEST(CStreamsHelpersTest, LettersAreUpperCaseWhereTheStreamSaysSo) {
    std::ostringstream stream;
    stream << std::uppercase;
    Streams::writeHex(stream, 0xAB);
    EXPECT_EQ(stream.str(), "AB");
}

TEST(CStreamsHelpersTest, TheOtherFlagsOfTheStreamTakeEffect) {
    std::ostringstream left;
    left << std::left;
    Streams::writeHex(left, 10);
    EXPECT_EQ(left.str(), "a0");
    std::ostringstream withBase;
    withBase << std::showbase;
    Streams::writeHex(withBase, 10);
    EXPECT_EQ(withBase.str(), "0xa");
}

TEST(CStreamsHelpersTest, ASeparatorStandsBetweenTheBytesOfARange) {
    unsigned char const bytes[] = {10, 0, 255};
    std::ostringstream stream;
    std::ios_base::fmtflags const before = stream.flags();
    EXPECT_EQ(&Streams::writeHex(stream, std::begin(bytes), std::end(bytes), ':'), &stream);
    EXPECT_EQ(stream.str(), "0a:00:ff");
    EXPECT_EQ(stream.flags(), before);
    EXPECT_EQ(stream.fill(), '0');
}

TEST(CStreamsHelpersTest, ASeparatorOfZeroWritesNone) {
    unsigned char const bytes[] = {10, 0, 255};
    std::ostringstream stream;
    Streams::writeHex(stream, std::begin(bytes), std::end(bytes), '\0');
    EXPECT_EQ(stream.str(), "0a00ff");
}

TEST(CStreamsHelpersTest, ASingleByteHasNoSeparator) {
    unsigned char const bytes[] = {7};
    std::ostringstream stream;
    Streams::writeHex(stream, std::begin(bytes), std::end(bytes), ':');
    EXPECT_EQ(stream.str(), "07");
}

TEST(CStreamsHelpersTest, AnEmptyRangeWritesNothingAndKeepsTheFill) {
    unsigned char const bytes[] = {7};
    std::ostringstream stream;
    stream.fill('*');
    EXPECT_EQ(&Streams::writeHex(stream, bytes, bytes, ':'), &stream);
    EXPECT_EQ(stream.str(), "");
    EXPECT_EQ(stream.fill(), '*');
}

TEST(CStreamsHelpersTest, ARangeMayHoldCharactersAndGoToAWideStream) {
    std::list<char> const bytes = {'A', '\xC3'};
    std::wostringstream stream;
    Streams::writeHex(stream, bytes.begin(), bytes.end(), '-');
    EXPECT_EQ(stream.str(), L"41-c3");
}

TEST(CStreamsHelpersTest, ADelimiterIsFoundBehindWhiteSpace) {
    std::wistringstream stream(L" \t\n ,x");
    EXPECT_TRUE(Streams::readDelimiter(stream, L','));
    EXPECT_EQ(stream.get(), L'x');
}

TEST(CStreamsHelpersTest, ADelimiterIsFoundAtOnceAndAtTheVeryEnd) {
    std::istringstream stream(",");
    EXPECT_TRUE(Streams::readDelimiter(stream, ','));
    EXPECT_TRUE(stream.good());
}

TEST(CStreamsHelpersTest, WhiteSpaceIsSkippedWhateverTheStreamSays) {
    std::istringstream stream("  ,");
    stream >> std::noskipws;
    EXPECT_TRUE(Streams::readDelimiter(stream, ','));
}

TEST(CStreamsHelpersTest, AWrongCharacterStaysConsumed) {
    std::wistringstream stream(L" ;,");
    EXPECT_FALSE(Streams::readDelimiter(stream, L','));
    EXPECT_TRUE(stream.good());
    EXPECT_TRUE(Streams::readDelimiter(stream, L','));
}

TEST(CStreamsHelpersTest, AtTheEndThereIsNoDelimiter) {
    std::wistringstream empty(L"");
    EXPECT_FALSE(Streams::readDelimiter(empty, L','));
    EXPECT_TRUE(empty.fail());
    std::wistringstream blank(L"  ");
    EXPECT_FALSE(Streams::readDelimiter(blank, L','));
    EXPECT_TRUE(blank.fail());
}

TEST(CStreamsHelpersTest, AFailedStreamHasNoDelimiterNotEvenZero) {
    std::wistringstream stream(std::wstring(1, L'\0'));
    stream.setstate(std::ios_base::failbit);
    EXPECT_FALSE(Streams::readDelimiter(stream, L'\0'));
    stream.clear(std::ios_base::badbit);
    EXPECT_FALSE(Streams::readDelimiter(stream, L'\0'));
    stream.clear();
    EXPECT_TRUE(Streams::readDelimiter(stream, L'\0'));
}

} // namespace
