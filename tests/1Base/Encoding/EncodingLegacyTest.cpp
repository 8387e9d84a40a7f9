// Bytes in the encodings of the table, through the conversions.

#include "1Base/Encoding/Encoding.h"

#include "support/ObjectCount.h"
#include "support/PlatformCalls.h"
#include "support/TextFailures.h"
#include "support/TextKinds.h"

#include <cstdlib>
#include <string>
#include <string_view>

namespace {

using namespace std::string_view_literals;
using Encoding::ESysEncoding;
using Strings::stringUTF16;
using TestSupport::bytesOf;
using TestSupport::CConversionFailure;
using TestSupport::conversionFailureOf;
using TestSupport::utf16Of;
using TBytes = std::basic_string<unsigned char>;
using CEncodingLegacyTest = TestSupport::CObjectCountTest;

stringUTF16 read(TBytes const& bytes, unsigned int encoding) {
    return Encoding::CConverter<stringUTF16, TBytes>::convert(bytes,
                                                              static_cast<ESysEncoding>(encoding));
}

TBytes write(stringUTF16 const& text, unsigned int encoding) {
    return Encoding::CConverter<TBytes, stringUTF16>::convert(text,
                                                              static_cast<ESysEncoding>(encoding));
}

template <class TString>
TString repeated(TString const& text, std::size_t times) {
    TString result;
    for (std::size_t i = 0; i < times; ++i)
        result += text;
    return result;
}

struct CSample {
    unsigned int encoding;
    char16_t const* text;
    std::string_view bytes;
};

// A character of each encoding that is served under its number.
constexpr CSample samples[] = {
    {1, u"\u00E9", "\x8E"sv},      {2, u"\u65E5", "\x93\xFA"sv},    {3, u"\u4E2D", "\xD6\xD0"sv},
    {4, u"\u4E2D", "\xA4\xA4"sv},  {5, u"\uAC00", "\xB0\xA1"sv},    {6, u"\u0627", "\xC7"sv},
    {7, u"\u05D0", "\xE0"sv},      {8, u"\u0391", "\xB0"sv},        {9, u"\u0410", "\x80"sv},
    {23, u"\u0E01", "\xA1"sv},     {33, u"\u20AC", "\x80"sv},       {34, u"\u65E5", "\x93\xFA"sv},
    {35, u"\u554A", "\xB0\xA1"sv}, {36, u"\u4E2D", "\xA4\xA4"sv},   {37, u"\uAC00", "\xB0\xA1"sv},
    {38, u"\uFE8D", "\xC7"sv},     {39, u"\u05D0", "\x80"sv},       {41, u"\u65E5", "\x93\xFA"sv},
    {42, u"\u554A", "\xB0\xA1"sv}, {43, u"\u4E2D", "\xA4\xA4"sv},   {44, u"\uAC00", "\xB0\xA1"sv},
    {45, u"\uAC00", "\x88\x61"sv}, {46, u"\u65E5", "\x93\xFA"sv},   {47, u"\u554A", "\xB0\xA1"sv},
    {48, u"\u4E2D", "\xA4\xA4"sv}, {49, u"\uAC00", "\xB0\xA1"sv},   {50, u"\uFE8D", "\xC7"sv},
    {51, u"\u05D0", "\x80"sv},     {52, u"\u00E9", "\xE9"sv},       {53, u"\u00E9", "\xC3\xA9"sv},
    {54, u"\u00E9", "\xE9\0"sv},   {55, u"\u00E9", "\xE9\0\0\0"sv}, {56, u"\u00E9", "\xE9\0"sv},
};

// The letter x in an encoding.
std::string letterIn(unsigned int encoding) {
    std::size_t const width = encoding == 55 ? 4 : encoding == 54 || encoding == 56 ? 2 : 1;
    return "x" + std::string(width - 1, '\0');
}

TEST_F(CEncodingLegacyTest, EachEncodingReadsAndWritesItsCharacter) {
    for (CSample const& sample : samples) {
        TBytes const bytes = bytesOf(std::string(sample.bytes));
        EXPECT_EQ(read(bytes, sample.encoding), utf16Of(sample.text)) << sample.encoding;
        EXPECT_EQ(write(utf16Of(sample.text), sample.encoding), bytes) << sample.encoding;
    }
}

TEST_F(CEncodingLegacyTest, WhatAnEncodingLacksIsOneQuestionMarkACharacter) {
    for (CSample const& sample : samples) {
        if (sample.encoding >= 53)
            continue;
        EXPECT_EQ(write(utf16Of(u"a\u12A0\U0001F600b\xD83D"), sample.encoding), bytesOf("a??b?"))
            << sample.encoding;
    }
}

TEST_F(CEncodingLegacyTest, NoCharacterIsSplitWhereAPassEnds) {
    for (CSample const& sample : samples) {
        std::string const code(sample.bytes);
        std::string const letter = letterIn(sample.encoding);
        for (std::size_t before = 8187; before <= 8194; ++before) {
            stringUTF16 const text =
                stringUTF16(before, 'x') + repeated(utf16Of(sample.text), 9000) + utf16Of(u"z");
            TBytes const bytes = write(text, sample.encoding);
            TBytes const head = bytesOf(repeated(letter, before) + repeated(code, 9000));
            ASSERT_EQ(bytes.substr(0, head.size()), head) << sample.encoding << " " << before;
            ASSERT_EQ(bytes.size(), head.size() + letter.size());
            ASSERT_EQ(read(bytes, sample.encoding), text) << sample.encoding << " " << before;
        }
    }
}

TEST_F(CEncodingLegacyTest, ATextOfSeveralUnitsIsNotSplitWhereAPassEnds) {
    for (std::size_t before = 8187; before <= 8194; ++before) {
        stringUTF16 const letters(before, 'x');
        std::string const head(before, 'x');
        // Mac Roman composes; Mac Korean has a code for the three units together.
        EXPECT_EQ(write(letters + utf16Of(u"e\u0301z"), 1), bytesOf(head + "\x8Ez"));
        EXPECT_EQ(write(letters + utf16Of(u"1\u20DE\uF87Cz"), 5), bytesOf(head + "\xA2\xE6z"));
        EXPECT_EQ(read(bytesOf(head + "\xA2\xE6z"), 5), letters + utf16Of(u"1\u20DE\uF87Cz"));
    }
}

TEST_F(CEncodingLegacyTest, BytesOfAnEncodingThatThePlatformHasNoValueForAreUTF16) {
    for (unsigned int const encoding : {10U, 27U, 30U, 32U, 40U, 57U, 0xFFFFFFFFU}) {
        EXPECT_EQ(read(bytesOf(std::string("A\0\xE9\0", 4)), encoding), utf16Of(u"A\u00E9"))
            << encoding;
        EXPECT_EQ(write(utf16Of(u"A\u4E2D"), encoding), bytesOf(std::string("A\0\x2D\x4E", 4)))
            << encoding;
    }
}

TEST_F(CEncodingLegacyTest, TheCurrentEncodingFollowsTheSystem) {
    setenv("LC_ALL", "ko_KR.JOHAB", 1);
    EXPECT_EQ(write(utf16Of(u"\uAC00"), 0), bytesOf("\x88\x61"));
    setenv("LC_ALL", "ko_KR.CP949", 1);
    EXPECT_EQ(write(utf16Of(u"\uAC00"), 0), bytesOf("\xB0\xA1"));
    setenv("LC_ALL", "C", 1);
    EXPECT_EQ(write(utf16Of(u"\u00E9"), 0), bytesOf("\x8E"));
    EXPECT_EQ(read(bytesOf("\x8E"), 0), utf16Of(u"\u00E9"));
}

TEST_F(CEncodingLegacyTest, TheFileSystemsFormIsComposedInBothDirections) {
    EXPECT_EQ(write(utf16Of(u"e\u0301"), 56), bytesOf(std::string("\xE9\0", 2)));
    EXPECT_EQ(read(bytesOf(std::string("e\0\x01\x03", 4)), 56), utf16Of(u"\u00E9"));
}

struct CMalformed {
    unsigned int encoding;
    char const* name;
    char const* bytes;
};

TEST_F(CEncodingLegacyTest, MalformedBytesFailUnderTheNameThatTheCallerGave) {
    constexpr CMalformed malformed[] = {
        {2, "MacJapanese", "a\x81"},
        {3, "MacSimplifiedChinese", "a\xA1"},
        {4, "MacTraditionalChinese", "a\xA1"},
        {5, "MacKorean", "a\xA1"},
        {23, "MacThai", "\x90"},
        {33, "WinAnsi", "\x81"},
        {34, "WinJapanese", "a\x81"},
        {35, "WinSimplifiedChinese", "a\x81"},
        {36, "WinTraditionalChinese", "a\x81"},
        {37, "WinKorean", "a\x81"},
        {38, "WinArabic", "\x9C"},
        {41, "WinShiftJIS", "\xFD"},
        {42, "WinPRC", "\x81\xFF"},
        {43, "WinBig5", "\x81\x20"},
        {44, "WinWansung", "\x81\x40"},
        {45, "WinJohab", "a\x88"},
        {46, "UNIXJapanese", "a\x81"},
        {53, "UTF8", "a\xC3"},
    };
    for (CMalformed const& item : malformed) {
        CConversionFailure const expected = {
            "CFStringCreateWithBytes",
            std::string("Could not create string with encoding ") + item.name, item.encoding};
        EXPECT_EQ(conversionFailureOf([&] { read(bytesOf(item.bytes), item.encoding); }), expected);
    }
}

struct CNotServed {
    unsigned int encoding;
    char const* name;
};

constexpr CNotServed notServed[] = {
    {11, "MacDevanagari"}, {12, "MacGurmukhi"},  {13, "MacGujarati"}, {14, "MacOriya"},
    {15, "MacBengali"},    {16, "MacTamil"},     {17, "MacTelugu"},   {18, "MacKannada"},
    {19, "MacMalayalam"},  {20, "MacSinhalese"}, {21, "MacBurmese"},  {22, "MacKhmer"},
    {24, "MacLaotian"},    {25, "MacGeorgian"},  {26, "MacArmenian"}, {28, "MacTibetan"},
    {29, "MacMongolian"},  {31, "MacVietnamese"}};

TEST_F(CEncodingLegacyTest, BytesInAnEncodingThatIsNotServedFail) {
    for (CNotServed const& item : notServed) {
        CConversionFailure const expected = {
            "CFStringCreateWithBytes",
            std::string("Could not create string with encoding ") + item.name, item.encoding};
        EXPECT_EQ(conversionFailureOf([&] { read(bytesOf("A"), item.encoding); }), expected);
        EXPECT_EQ(read(TBytes(), item.encoding), stringUTF16());
    }
}

TEST_F(CEncodingLegacyTest, TextForAnEncodingThatIsNotServedFailsAndLeavesItsString) {
    for (CNotServed const& item : notServed) {
        CConversionFailure const expected = {
            "CFStringGetBytes", std::string("Could not get string with encoding ") + item.name,
            item.encoding};
        TestSupport::CPlatformCalls calls;
        EXPECT_EQ(conversionFailureOf([&] { write(utf16Of(u"A"), item.encoding); }), expected);
        ASSERT_EQ(calls.of("CFStringCreateWithBytes").size(), 1U);
        EXPECT_TRUE(calls.of("CFRelease").empty());
        CFRelease(calls.of("CFStringCreateWithBytes")[0].object);
        EXPECT_EQ(write(stringUTF16(), item.encoding), TBytes());
    }
}

} // namespace
