// Text into bytes: ISO Latin 1, where the caller names no encoding.

#include "1Base/Encoding/Encoding.h"

#include "support/ObjectCount.h"
#include "support/TextKinds.h"

#include <cstddef>
#include <string>

namespace {

using CEncodingLatin1Test = TestSupport::CObjectCountTest;

using Encoding::convert;
using Strings::stringUTF16;
using TBytes = std::basic_string<unsigned char>;
using TestSupport::bytesOf;
using TestSupport::utf16Of;

TEST_F(CEncodingLatin1Test, EveryByteIsTheCharacterOfItsNumber) {
    TBytes bytes;
    stringUTF16 units;
    Strings::string wide;
    for (unsigned code = 0; code <= 0xFF; ++code) {
        bytes += static_cast<unsigned char>(code);
        units += static_cast<short>(code);
        wide += static_cast<wchar_t>(code);
    }
    EXPECT_EQ(convert<stringUTF16>(bytes), units);
    EXPECT_EQ(convert<TBytes>(units), bytes);
    EXPECT_EQ(convert<TBytes>(wide), bytes);
    EXPECT_EQ((Encoding::CConverter<stringUTF16, TBytes>::convert(bytes, Encoding::eseISO8859_1)),
              units);
    EXPECT_EQ((Encoding::CConverter<TBytes, stringUTF16>::convert(units, Encoding::eseISO8859_1)),
              bytes);
}

TEST_F(CEncodingLatin1Test, ACharacterThatIsLackingIsAQuestionMark) {
    EXPECT_EQ(convert<TBytes>(Strings::string(L"a\u4E16b")), bytesOf("a?b"));
    EXPECT_EQ(convert<TBytes>(Strings::string(L"\u0100")), bytesOf("?"));
    EXPECT_EQ(convert<TBytes>(Strings::string(L"\u20AC\u0416")), bytesOf("??"));
    EXPECT_EQ(convert<TBytes>(L"caf\u00E9 \u0928"), bytesOf("caf\xE9 ?"));
    EXPECT_EQ(convert<TBytes>(utf16Of(U"\u4E16")), bytesOf("?"));
}

TEST_F(CEncodingLatin1Test, ASupplementaryCharacterIsOneQuestionMark) {
    EXPECT_EQ(convert<TBytes>(Strings::string(L"a\U0001F600b")), bytesOf("a?b"));
    EXPECT_EQ(convert<TBytes>(Strings::string(L"\U0001F600\U0001F601")), bytesOf("??"));
}

TEST_F(CEncodingLatin1Test, ACharacterThatIsNotShownIsLackingToo) {
    EXPECT_EQ(convert<TBytes>(Strings::string(L"\uFEFFa\u200Bb")), bytesOf("?a?b"));
}

TEST_F(CEncodingLatin1Test, AMarkIsComposedWithItsBaseWhereThatExists) {
    EXPECT_EQ(convert<TBytes>(Strings::string(L"cafe\u0301.")), bytesOf("caf\xE9."));
    EXPECT_EQ(convert<TBytes>(Strings::string(L"x\u0301y")), bytesOf("x?y"));
}

TEST_F(CEncodingLatin1Test, ATextLongerThanAPassComesOutWhole) {
    for (std::size_t before = 8186; before <= 8196; ++before) {
        Strings::string const front(before, L'x');
        std::string const bytes(before, 'x');
        EXPECT_EQ(convert<TBytes>(front + L"\U0001F600\u00E9\u4E16z"), bytesOf(bytes + "?\xE9?z"));
        EXPECT_EQ(convert<TBytes>(front + L"e\u0301z"), bytesOf(bytes + "\xE9z"));
    }
}

} // namespace
