#include <CoreFoundation/CoreFoundation.h>

#include "support/ObjectCount.h"
#include "support/PlatformString.h"
#include "support/TableFile.h"

#include <array>
#include <string>
#include <vector>

using TestSupport::CPlatformString;

namespace {

using CFStringNormalizeTest = TestSupport::CObjectCountTest;

// The forms in the order of their values, which is the order of the table's columns.
using TForms = std::array<std::u16string, 4>;

std::u16string normalized(std::u16string const& units, CFIndex form) {
    CFMutableStringRef const text =
        CFStringCreateMutableCopy(kCFAllocatorDefault, 0, CPlatformString(units).get());
    CPlatformString const owner(text);
    CFStringNormalize(text, static_cast<CFStringNormalizationForm>(form));
    return owner.units();
}

TForms formsOf(std::vector<std::string> const& fields) {
    TForms forms;
    for (std::size_t i = 0; i < forms.size(); ++i)
        forms[i] = TestSupport::unitsOfHex(fields.at(i));
    return forms;
}

TEST_F(CFStringNormalizeTest, EveryRecordedTextComesOutInItsFourForms) {
    for (std::vector<std::string> const& row : TestSupport::readTable("normalize.tsv")) {
        ASSERT_EQ(row.size(), 7U);
        TForms const recorded = formsOf({row[1], row[2], row[3], row[4]});
        // The framework of an older system may have answered otherwise: that is as good.
        TForms const older =
            row[5] == "=" ? recorded : formsOf(TestSupport::splitText(row[5], ','));
        for (std::size_t form = 0; form < recorded.size(); ++form) {
            std::u16string const actual =
                normalized(TestSupport::unitsOfHex(row[0]), static_cast<CFIndex>(form));
            EXPECT_TRUE(actual == recorded[form] || actual == older[form])
                << row[0] << " in form " << form << " is " << testing::PrintToString(actual);
        }
    }
}

TEST_F(CFStringNormalizeTest, EveryHangulSyllableIsTakenApartAndPutTogether) {
    // The arithmetic of the Unicode Standard, section 3.12.
    for (unsigned lead = 0; lead < 19; ++lead) {
        for (unsigned vowel = 0; vowel < 21; ++vowel) {
            for (unsigned tail = 0; tail < 28; ++tail) {
                std::u16string const syllable(
                    1, static_cast<char16_t>(0xAC00 + (lead * 21 + vowel) * 28 + tail));
                std::u16string letters = {static_cast<char16_t>(0x1100 + lead),
                                          static_cast<char16_t>(0x1161 + vowel)};
                if (tail != 0)
                    letters += static_cast<char16_t>(0x11A7 + tail);
                for (CFIndex const apart : {0, 1})
                    ASSERT_EQ(normalized(syllable, apart), letters);
                for (CFIndex const together : {2, 3}) {
                    ASSERT_EQ(normalized(letters, together), syllable);
                    ASSERT_EQ(normalized(syllable, together), syllable);
                }
            }
        }
    }
}

TEST_F(CFStringNormalizeTest, ASyllableOfTheTextTakesNoFinalLetter) {
    std::u16string const text = u"\u1112\u1161\u11AB\uAC00\u11A8e\u0301\uAC00\u11A8";
    EXPECT_EQ(normalized(text, kCFStringNormalizationFormC),
              u"\uD55C\uAC00\u11A8\u00E9\uAC00\u11A8");
    EXPECT_EQ(normalized(text, kCFStringNormalizationFormKD),
              u"\u1112\u1161\u11AB\u1100\u1161\u11A8e\u0301\u1100\u1161\u11A8");
}

// One that has a final letter already, and a letter that is no syllable.
TEST_F(CFStringNormalizeTest, AFinalLetterBehindOtherLettersStays) {
    std::u16string const text = u"\uAC01\u11A8e\u0301\uFF21\u11A8";
    EXPECT_EQ(normalized(text, kCFStringNormalizationFormC), u"\uAC01\u11A8\u00E9\uFF21\u11A8");
    EXPECT_EQ(normalized(text, kCFStringNormalizationFormD),
              u"\u1100\u1161\u11A8\u11A8e\u0301\uFF21\u11A8");
}

TEST_F(CFStringNormalizeTest, CharactersBeyondUnicode13StayWhateverStandsBesideThem) {
    EXPECT_EQ(normalized(u"e\u0301\uA7F2e\u0301", kCFStringNormalizationFormKC),
              u"\u00E9\uA7F2\u00E9");
    EXPECT_EQ(normalized(u"\u00E9\U0001E030\uFB01", kCFStringNormalizationFormKD),
              u"e\u0301\U0001E030fi");
}

TEST_F(CFStringNormalizeTest, ALongTextIsNormalisedThroughout) {
    std::u16string apart;
    std::u16string together;
    for (int i = 0; i < 5000; ++i) {
        apart += u"xe\u0301";
        together += u"x\u00E9";
    }
    EXPECT_EQ(normalized(apart, kCFStringNormalizationFormC), together);
    EXPECT_EQ(normalized(together, kCFStringNormalizationFormD), apart);
}

TEST_F(CFStringNormalizeTest, ATextMayBeNormalisedAgain) {
    CFMutableStringRef const text =
        CFStringCreateMutableCopy(kCFAllocatorDefault, 0, CPlatformString(u"\u1E9B\u0323").get());
    CPlatformString const owner(text);
    CFStringNormalize(text, kCFStringNormalizationFormC);
    EXPECT_EQ(owner.units(), u"\u1E9B\u0323");
    CFStringNormalize(text, kCFStringNormalizationFormD);
    EXPECT_EQ(owner.units(), u"\u017F\u0323\u0307");
    CFStringNormalize(text, kCFStringNormalizationFormKC);
    EXPECT_EQ(owner.units(), u"\u1E69");
}

TEST_F(CFStringNormalizeTest, ZeroUnitsAndUnpairedSurrogatesPass) {
    std::u16string const units = {u'e', 0x0301, 0, 0xD800, u'e', 0x0301, 0xDC00};
    std::u16string const composed = {0xE9, 0, 0xD800, 0xE9, 0xDC00};
    EXPECT_EQ(normalized(units, kCFStringNormalizationFormC), composed);
}

TEST_F(CFStringNormalizeTest, TheEmptyTextStaysEmpty) {
    for (CFIndex form = 0; form < 4; ++form)
        EXPECT_EQ(normalized(u"", form), u"");
}

} // namespace
