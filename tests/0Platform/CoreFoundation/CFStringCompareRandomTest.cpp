// Comparison against slow twins, on random texts from alphabets in which much is nearly equal.

#include <CoreFoundation/CoreFoundation.h>

#include "0Platform/CoreFoundation/CFStringPlainCompare.h"
#include "support/ObjectCount.h"
#include "support/PlatformString.h"

#include <algorithm>
#include <random>
#include <string>
#include <utility>
#include <vector>

using TestSupport::CPlatformString;

namespace {

constexpr CFStringCompareFlags ignoringCase = 1;
constexpr CFStringCompareFlags naturally = 193;

using TAlphabet = std::vector<std::u16string>;

// The parts of a text between bars.
TAlphabet alphabetOf(std::u16string const& text) {
    TAlphabet parts(1);
    for (char16_t const unit : text) {
        if (unit == u'|')
            parts.emplace_back();
        else
            parts.back() += unit;
    }
    return parts;
}

// Letters that fold to several, to each other or to nothing, marks of every kind, digits, and the
// halves of surrogate pairs.
TAlphabet collidingAlphabet() {
    TAlphabet alphabet = alphabetOf(u"s|S|\u017F|\u00DF|\u1E9E|f|i|I|t|\uFB00|\uFB01|\uFB03|\uFB06|"
                                    u"\u0130|\u0131|e|\u00E9|\u00C9|\u1EBF|z|\u0301|\u0327|\u0345|"
                                    u"\u0307|\u0344|\u064B|\u0651|\u0628|\u0510|\u0511|\u0531|"
                                    u"\u0561|\u0587|\u03B1|\u03AC|\u1FB3|\u1F80|\u03C3|\u03C2|"
                                    u"\u03A3|\u01F0|\u0149|\u304B|\u3099|\u304C|\uAC00|0|1|9|10|"
                                    u"\xD801|\xDC00|\U00010428|\U0001F3FB|\u200D|\u200C|\u13A0|"
                                    u"\uAB70|\u10A0|\U0001E944|\U0001D165| |\u212B|\u00E5|\u1FEF|`|"
                                    u"xxxxxxxx");
    alphabet.emplace_back(1, u'\0');
    return alphabet;
}

class CRandomTexts {
  public:
    CRandomTexts(TAlphabet alphabet, std::mt19937::result_type seed)
        : alphabet_(std::move(alphabet)), random_(seed) {}

    std::size_t below(std::size_t bound) { return random_() % bound; }

    std::u16string letter() { return alphabet_[below(alphabet_.size())]; }

    std::u16string text(std::size_t letters) {
        std::u16string text;
        for (std::size_t i = below(letters + 1); i > 0; --i)
            text += letter();
        return text;
    }

    // A text with a unit put in, taken out or exchanged here and there.
    std::u16string relative(std::u16string text) {
        for (std::size_t changes = below(4); changes > 0; --changes) {
            std::size_t const place = below(text.size() + 1);
            std::size_t const taken = place < text.size() ? below(2) : 0;
            text.replace(place, taken, below(3) == 0 ? std::u16string() : letter());
        }
        return text;
    }

  private:
    TAlphabet alphabet_;
    std::mt19937 random_;
};

class CFStringCompareRandomTest : public TestSupport::CObjectCountTest {
  protected:
    static int compared(std::u16string const& a, std::u16string const& b,
                        CFStringCompareFlags options) {
        CPlatformString const first(a);
        CPlatformString const second(b);
        CFRange const whole = CFRangeMake(0, static_cast<CFIndex>(a.size()));
        return static_cast<int>(
            CFStringCompareWithOptions(first.get(), second.get(), whole, options));
    }

    static std::string described(std::u16string const& a, std::u16string const& b) {
        return testing::PrintToString(a) + " and " + testing::PrintToString(b) + ", seed " +
               std::to_string(seed);
    }

    static constexpr std::mt19937::result_type seed = 20240229;
};

TEST_F(CFStringCompareRandomTest, CollidingTextsCompareAsTheRulesSayOneByOne) {
    CRandomTexts texts(collidingAlphabet(), seed);
    int equal = 0;
    for (int i = 0; i < 200000; ++i) {
        std::u16string const a = texts.text(12);
        std::u16string const b = i % 3 == 0 ? texts.text(12) : texts.relative(a);
        for (CFStringCompareFlags const options : {ignoringCase, naturally}) {
            int const result = compared(a, b, options);
            ASSERT_EQ(result, plainCompare(a, b, options == naturally)) << described(a, b);
            equal += static_cast<int>(result == 0 && a != b);
        }
    }
    EXPECT_GT(equal, 1000) << "the texts hardly collide, so they test little";
}

TEST_F(CFStringCompareRandomTest, EveryPairOfCharactersComparesAsTheRulesSay) {
    for (std::u16string const& a : collidingAlphabet()) {
        for (char32_t c = 0; c < 0x3000; ++c) {
            std::u16string const b(1, static_cast<char16_t>(c));
            for (bool const natural : {false, true}) {
                CFStringCompareFlags const options = natural ? naturally : ignoringCase;
                ASSERT_EQ(compared(a, b, options), plainCompare(a, b, natural)) << described(a, b);
                ASSERT_EQ(compared(u"x" + b, u"x" + a, options),
                          plainCompare(u"x" + b, u"x" + a, natural))
                    << described(b, a);
            }
        }
    }
}

// Every code point against what it folds to, and against its base letter: the tables and bounds
// that spare look-ups hold for all of them.
TEST_F(CFStringCompareRandomTest, EveryCodePointFoldsAsItsPropertiesSay) {
    for (UChar32 c = 0; c <= 0x10FFFF; ++c) {
        std::u16string const text = TestSupport::unitsOfCodePoint(static_cast<char32_t>(c));
        UErrorCode status = U_ZERO_ERROR;
        std::u16string other(8, u'\0');
        other.resize(static_cast<std::size_t>(u_strFoldCase(other.data(), 8, text.data(),
                                                            static_cast<int32_t>(text.size()),
                                                            U_FOLD_CASE_DEFAULT, &status)));
        std::u16string base(8, u'\0');
        base.resize(static_cast<std::size_t>(
            unorm2_normalize(unorm2_getNFDInstance(&status), text.data(),
                             static_cast<int32_t>(text.size()), base.data(), 8, &status)));
        ASSERT_TRUE(U_SUCCESS(status)) << c;
        base.resize(1);
        for (bool const natural : {false, true}) {
            CFStringCompareFlags const options = natural ? naturally : ignoringCase;
            ASSERT_EQ(compared(text, other, options), plainCompare(text, other, natural)) << c;
            ASSERT_EQ(compared(text, base, options), plainCompare(text, base, natural)) << c;
            ASSERT_EQ(compared(base, text, options), plainCompare(base, text, natural)) << c;
        }
    }
}

// A base below U+0510 loses the marks of its case folding. None has such marks that the
// decomposition has not taken away before, so nothing is to be done about them.
TEST_F(CFStringCompareRandomTest, NoLatinGreekOrCyrillicFoldingBringsMarksAlong) {
    for (UChar32 c = 0; c < 0x510; ++c) {
        UErrorCode status = U_ZERO_ERROR;
        UChar const unit = static_cast<UChar>(c);
        UChar decomposed[8];
        UChar folded[8];
        unorm2_normalize(unorm2_getNFDInstance(&status), &unit, 1, decomposed, 8, &status);
        if (decomposed[0] != unit)
            continue;
        int32_t const length = u_strFoldCase(folded, 8, &unit, 1, U_FOLD_CASE_DEFAULT, &status);
        for (int32_t i = 1; i < length; ++i)
            EXPECT_NE(u_getIntPropertyValue(folded[i], UCHAR_GRAPHEME_CLUSTER_BREAK), U_GCB_EXTEND)
                << c;
    }
}

// Where every character folds to one, order is that of the folded code points.
TEST_F(CFStringCompareRandomTest, LettersThatFoldToOneCompareAsICUCompares) {
    CRandomTexts texts(alphabetOf(u"a|A|\u00E9|\u00C9|\u03C3|\u03C2|\u03A3|\u0416|\u0436|\u0531|"
                                  u"\u0561|\u10A0|\u2D00|\uFF21|\uFF41|\u4E00|\uE000|0|_|\u0301"),
                       seed);
    for (int i = 0; i < 200000; ++i) {
        std::u16string const a = texts.text(30);
        std::u16string const b = texts.relative(a);
        UErrorCode status = U_ZERO_ERROR;
        int32_t const expected = u_strCaseCompare(
            a.data(), static_cast<int32_t>(a.size()), b.data(), static_cast<int32_t>(b.size()),
            U_FOLD_CASE_DEFAULT | U_COMPARE_CODE_POINT_ORDER, &status);
        int const result = compared(a, b, ignoringCase);
        ASSERT_EQ(result, expected < 0 ? -1 : expected > 0 ? 1 : 0) << described(a, b);
        ASSERT_EQ(compared(b, a, ignoringCase), -result) << described(a, b);
    }
}

// Unaccented, lower-case form with each number written out to one length: then plain order is the
// natural one.
std::u16string naturalKey(std::u16string const& text) {
    static std::u16string const composed = u"\u00E9\u00C9\u00E8\u00FC\u00DC\u0439\u0419\u03AC";
    static std::u16string const plain = u"eeeuu\u0438\u0438\u03B1";
    std::u16string key;
    for (std::size_t i = 0; i < text.size();) {
        std::size_t const end = std::min(text.find_first_not_of(u"0123456789", i), text.size());
        if (end > i) {
            std::size_t const first = std::min(text.find_first_not_of(u'0', i), end);
            // Whatever stands behind the text must not come before a number.
            key += std::u16string(40 - (end - first), u'0') + text.substr(first, end - first);
            i = end;
            continue;
        }
        std::size_t const index = composed.find(text[i]);
        key += index != composed.npos               ? plain[index]
               : text[i] >= u'A' && text[i] <= u'Z' ? static_cast<char16_t>(text[i] + 32)
                                                    : text[i];
        ++i;
    }
    return key;
}

TEST_F(CFStringCompareRandomTest, NamesWithNumbersCompareByTheirWrittenOutForm) {
    CRandomTexts texts(alphabetOf(u"a|A|b|e|E|\u00E9|\u00C9|\u00E8|\u00FC|\u00DC|u|\u0439|\u0419|"
                                  u"\u0438|\u03AC|\u03B1|-|.| |~|0|0|1|2|9|10"),
                       seed);
    for (int i = 0; i < 200000; ++i) {
        std::u16string const a = texts.text(18);
        std::u16string const b = texts.relative(a);
        int const order = naturalKey(a).compare(naturalKey(b));
        int const result = compared(a, b, naturally);
        ASSERT_EQ(result, order < 0 ? -1 : order > 0 ? 1 : 0) << described(a, b);
        ASSERT_EQ(compared(b, a, naturally), -result) << described(a, b);
    }
}

} // namespace
