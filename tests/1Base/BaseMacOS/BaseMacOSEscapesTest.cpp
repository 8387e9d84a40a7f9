#include "1Base/BaseMacOS/BaseMacOS.h"

#include "support/ObjectCount.h"
#include "support/TextFailures.h"

#include <string>

namespace {

using CBaseMacOSEscapesTest = TestSupport::CObjectCountTest;

using MacOS::addingPercentEscapes;

TEST_F(CBaseMacOSEscapesTest, BlanksAndSeparatorsAreEscaped) {
    EXPECT_EQ(addingPercentEscapes(L"a b/c"), L"a%20b%2Fc");
    EXPECT_EQ(addingPercentEscapes(L""), L"");
    EXPECT_EQ(addingPercentEscapes(L"key=a&b"), L"key%3Da%26b");
}

TEST_F(CBaseMacOSEscapesTest, OnlyTheUnreservedCharactersOfASCIIStay) {
    Strings::string const unreserved =
        L"ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789-._~";
    EXPECT_EQ(addingPercentEscapes(unreserved), unreserved);

    constexpr wchar_t digits[] = L"0123456789ABCDEF";
    for (int code = 1; code < 128; ++code) {
        Strings::string const character(1, static_cast<wchar_t>(code));
        if (unreserved.find(character) != Strings::string::npos)
            continue;
        Strings::string const expected{L'%', digits[code / 16], digits[code % 16]};
        EXPECT_EQ(addingPercentEscapes(character), expected) << code;
    }
}

#ifndef __APPLE__
// On macOS it ends the text.
TEST_F(CBaseMacOSEscapesTest, AZeroIsEscapedLikeAnyOther) {
    EXPECT_EQ(addingPercentEscapes(Strings::string(L"a\0b", 3)), L"a%00b");
}
#endif

TEST_F(CBaseMacOSEscapesTest, EachByteOfACharacterBecomesAGroup) {
    EXPECT_EQ(addingPercentEscapes(L"\u00E4"), L"%C3%A4");
    EXPECT_EQ(addingPercentEscapes(L"\u20AC"), L"%E2%82%AC");
    EXPECT_EQ(addingPercentEscapes(L"\U0001F600"), L"%F0%9F%98%80");
    EXPECT_EQ(addingPercentEscapes(L"x\u00E4y"), L"x%C3%A4y");
}

TEST_F(CBaseMacOSEscapesTest, AnEscapeIsEscapedAgain) {
    EXPECT_EQ(addingPercentEscapes(L"100%"), L"100%25");
    EXPECT_EQ(addingPercentEscapes(addingPercentEscapes(L"/")), L"%252F");
}

TEST_F(CBaseMacOSEscapesTest, WhatIsNoTextRaisesTheConversionFailure) {
    Strings::string const surrogate(1, static_cast<wchar_t>(0xD800));
    EXPECT_EQ(TestSupport::conversionFailureOf([&] { addingPercentEscapes(surrogate); }).function,
              "CFStringCreateWithBytes");
}

} // namespace
