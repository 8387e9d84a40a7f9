#include "1Base/Encoding/_Imp/EncodingTable.h"
#include "1Base/Encoding/Encoding.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <set>
#include <string>

namespace {

using Encoding::EEncoding;
using Encoding::findEncoding;
using Encoding::getEncodingName;

struct CRow {
    unsigned int number;
    char const* name;
    CFStringEncoding platform;
};

// Number 0 stands apart: its value is the system's.
constexpr CRow rows[] = {
    {1, "MacRoman", 0},
    {2, "MacJapanese", 1},
    {3, "MacSimplifiedChinese", 25},
    {4, "MacTraditionalChinese", 2},
    {5, "MacKorean", 3},
    {6, "MacArabic", 4},
    {7, "MacHebrew", 5},
    {8, "MacGreek", 6},
    {9, "MacRussian", 7},
    {10, "MacRSymbol", 256},
    {11, "MacDevanagari", 9},
    {12, "MacGurmukhi", 10},
    {13, "MacGujarati", 11},
    {14, "MacOriya", 12},
    {15, "MacBengali", 13},
    {16, "MacTamil", 14},
    {17, "MacTelugu", 15},
    {18, "MacKannada", 16},
    {19, "MacMalayalam", 17},
    {20, "MacSinhalese", 18},
    {21, "MacBurmese", 19},
    {22, "MacKhmer", 20},
    {23, "MacThai", 21},
    {24, "MacLaotian", 22},
    {25, "MacGeorgian", 23},
    {26, "MacArmenian", 24},
    {27, "MacMaldivian", 256},
    {28, "MacTibetan", 26},
    {29, "MacMongolian", 27},
    {30, "MacGeez", 256},
    {31, "MacVietnamese", 30},
    {32, "MacSindhi", 256},
    {33, "WinAnsi", 1280},
    {34, "WinJapanese", 1056},
    {35, "WinSimplifiedChinese", 1057},
    {36, "WinTraditionalChinese", 1059},
    {37, "WinKorean", 1058},
    {38, "WinArabic", 1049},
    {39, "WinHebrew", 1047},
    {40, "WinSymbol", 256},
    {41, "WinShiftJIS", 1056},
    {42, "WinPRC", 1057},
    {43, "WinBig5", 1059},
    {44, "WinWansung", 1058},
    {45, "WinJohab", 1296},
    {46, "UNIXJapanese", 1056},
    {47, "UNIXSimplifiedChinese", 1057},
    {48, "UNIXTraditionalChinese", 1059},
    {49, "UNIXKorean", 1058},
    {50, "UNIXArabic", 1049},
    {51, "UNIXHebrew", 1047},
    {52, "ISO8859_1", 513},
    {53, "UTF8", 0x8000100},
    {54, "UTF16", 0x14000100},
    {55, "UTF32", 0x1C000100},
    {56, "UTF16CanonicalComposed", 255},
};

constexpr EEncoding encodingOf(unsigned int number) {
    return static_cast<EEncoding>(number);
}

TEST(CEncodingTableTest, EachNumberHasItsNameAndItsPlatformValue) {
    unsigned int next = 1;
    for (CRow const& row : rows) {
        EXPECT_EQ(row.number, next++);
        EXPECT_EQ(getEncodingName(encodingOf(row.number)), row.name);
        EXPECT_EQ(findEncoding(encodingOf(row.number)), row.platform) << row.name;
    }
    EXPECT_EQ(next, 57U);
    EXPECT_EQ(getEncodingName(encodingOf(0)), "Current");
}

TEST(CEncodingTableTest, TheEnumeratorsHaveTheNumbersOfTheirNames) {
    unsigned int next = 0;
#define QORN_CHECK_NUMBERS(name, platform)                                                         \
    EXPECT_EQ(unsigned{Encoding::ese##name}, next) << #name;                                       \
    EXPECT_EQ(unsigned{Encoding::eenc##name}, next) << #name;                                      \
    EXPECT_EQ(getEncodingName(encodingOf(next)), #name);                                           \
    ++next;
    QORN_ENCODING_LIST(QORN_CHECK_NUMBERS)
#undef QORN_CHECK_NUMBERS
    EXPECT_EQ(next, 57U);
}

TEST(CEncodingTableTest, ANumberBeyondTheTableFallsBack) {
    for (unsigned int const number : {57U, 58U, 100U, 256U, 0x7FFFFFFFU, 0xFFFFFFFFU}) {
        EXPECT_EQ(findEncoding(encodingOf(number)), 256U) << number;
        EXPECT_EQ(getEncodingName(encodingOf(number)), "unknown encoding") << number;
    }
    EXPECT_EQ(findEncoding(encodingOf(57)), findEncoding(encodingOf(10)));
}

TEST(CEncodingTableTest, FamiliesShareValuesAndNotNames) {
    for (auto const& family : {std::set<unsigned int>{34, 41, 46},
                               {35, 42, 47},
                               {36, 43, 48},
                               {37, 44, 49},
                               {38, 50},
                               {39, 51}}) {
        std::set<CFStringEncoding> values;
        std::set<std::string> names;
        for (unsigned int const number : family) {
            values.insert(findEncoding(encodingOf(number)));
            names.insert(getEncodingName(encodingOf(number)));
        }
        EXPECT_EQ(values.size(), 1U);
        EXPECT_EQ(names.size(), family.size());
    }
}

// The process is the test's own, so the environment may change.
TEST(CEncodingTableTest, TheCurrentEncodingIsAskedForEachTime) {
    setenv("LC_ALL", "de_DE.ISO-8859-1", 1);
    EXPECT_EQ(findEncoding(Encoding::eencCurrent), 513U);
    setenv("LC_ALL", "ja_JP.SJIS", 1);
    EXPECT_EQ(findEncoding(Encoding::eencCurrent), 1056U);
    setenv("LC_ALL", "C", 1);
    EXPECT_EQ(findEncoding(Encoding::eencCurrent), 0U);
    EXPECT_EQ(findEncoding(Encoding::eencCurrent), CFStringGetSystemEncoding());
}

} // namespace
