#include "1Base/Strings/StringsCharTraits.h"
#include "1Base/Strings/StringsKinds.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstddef>
#include <initializer_list>
#include <limits>
#include <random>
#include <string>
#include <type_traits>
#include <vector>

namespace {

using Strings::Detail::CIntegerTraits;

// Where a library has traits of its own that it does not warn of, those stay.
#if defined(_LIBCPP_VERSION) && _LIBCPP_VERSION >= 160000
constexpr bool supplied = true;
#else
constexpr bool supplied = false;
#endif
static_assert(std::is_base_of_v<CIntegerTraits<short>, std::char_traits<short>> == supplied);
static_assert(std::is_base_of_v<CIntegerTraits<unsigned char>, std::char_traits<unsigned char>> ==
              supplied);

template <class TElement>
class CCharTraitsTest : public testing::Test {
  protected:
    using TText = std::basic_string<TElement, CIntegerTraits<TElement>>;
    using TLimits = std::numeric_limits<TElement>;

    static TText textOf(std::initializer_list<int> values) {
        TText text;
        for (int const value : values) {
            text.push_back(static_cast<TElement>(value));
        }
        return text;
    }
};

using TElements = testing::Types<short, unsigned short, unsigned char, signed char>;
TYPED_TEST_SUITE(CCharTraitsTest, TElements, );

TYPED_TEST(CCharTraitsTest, HasTheTypesOfTraits) {
    using TTraits = CIntegerTraits<TypeParam>;
    static_assert(std::is_empty_v<TTraits>);
    static_assert(std::is_same_v<typename TTraits::char_type, TypeParam>);
    static_assert(std::is_same_v<typename TTraits::int_type, int>);
    static_assert(std::is_same_v<typename TTraits::off_type, std::char_traits<char>::off_type>);
    static_assert(std::is_same_v<typename TTraits::pos_type, std::char_traits<char>::pos_type>);
    static_assert(std::is_same_v<typename TTraits::state_type, std::char_traits<char>::state_type>);
}

TYPED_TEST(CCharTraitsTest, ServesConstantExpressions) {
    using TTraits = CIntegerTraits<TypeParam>;
    static constexpr TypeParam text[] = {'a', 'b', 'c', 0};
    static constexpr TypeParam other[] = {'a', 'c', 'b', 0};
    static_assert(TTraits::length(text) == 3);
    static_assert(TTraits::compare(text, other, 3) < 0);
    static_assert(TTraits::compare(other, text, 3) > 0);
    static_assert(TTraits::compare(text, other, 1) == 0);
    static_assert(TTraits::compare(text, other, 0) == 0);
    static_assert(TTraits::find(text, 3, TypeParam{'c'}) == text + 2);
    static_assert(TTraits::find(text, 2, TypeParam{'c'}) == nullptr);
    static_assert(TTraits::eq('a', 'a') && !TTraits::eq('a', 'b'));
    static_assert(TTraits::lt('a', 'b') && !TTraits::lt('b', 'a') && !TTraits::lt('a', 'a'));
    static_assert(TTraits::not_eof(TTraits::eof()) != TTraits::eof());
    static_assert(TTraits::not_eof('a') == 'a');
    static_assert(TTraits::eq_int_type(7, 7) && !TTraits::eq_int_type(7, 8));
}

TYPED_TEST(CCharTraitsTest, NoElementIsTheEnd) {
    using TTraits = CIntegerTraits<TypeParam>;
    for (int value = TestFixture::TLimits::min(); value <= TestFixture::TLimits::max(); ++value) {
        auto const element = static_cast<TypeParam>(value);
        int const number = TTraits::to_int_type(element);
        ASSERT_NE(number, TTraits::eof()) << value;
        ASSERT_EQ(TTraits::not_eof(number), number) << value;
        ASSERT_EQ(TTraits::to_char_type(number), element) << value;
    }
    EXPECT_NE(TTraits::not_eof(TTraits::eof()), TTraits::eof());
}

TYPED_TEST(CCharTraitsTest, ElementsCompareByTheirValues) {
    auto const low = this->textOf({TestFixture::TLimits::min()});
    auto const high = this->textOf({TestFixture::TLimits::max()});
    EXPECT_LT(low, high);
    EXPECT_LT(low, this->textOf({'a'}));
    EXPECT_LT(this->textOf({'a'}), high);
    EXPECT_LT(high, high + low);
    EXPECT_EQ(this->textOf({-1}) < this->textOf({'a'}), std::is_signed_v<TypeParam>);
}

TYPED_TEST(CCharTraitsTest, MovesOverItself) {
    auto text = this->textOf({1, 2, 3, 4, 5, 6});
    EXPECT_EQ(CIntegerTraits<TypeParam>::move(&text[2], text.data(), 4), &text[2]);
    EXPECT_EQ(text, this->textOf({1, 2, 1, 2, 3, 4}));
    EXPECT_EQ(CIntegerTraits<TypeParam>::move(text.data(), &text[2], 4), text.data());
    EXPECT_EQ(text, this->textOf({1, 2, 3, 4, 3, 4}));
    EXPECT_EQ(CIntegerTraits<TypeParam>::move(text.data(), text.data(), 6), text.data());
    EXPECT_EQ(text, this->textOf({1, 2, 3, 4, 3, 4}));
}

TYPED_TEST(CCharTraitsTest, CopiesAndFills) {
    auto text = this->textOf({1, 2, 3, 4});
    auto const other = this->textOf({7, 8});
    EXPECT_EQ(CIntegerTraits<TypeParam>::copy(&text[1], other.data(), 2), &text[1]);
    EXPECT_EQ(text, this->textOf({1, 7, 8, 4}));
    EXPECT_EQ(CIntegerTraits<TypeParam>::assign(&text[2], 2, TypeParam{9}), &text[2]);
    EXPECT_EQ(text, this->textOf({1, 7, 9, 9}));
    CIntegerTraits<TypeParam>::assign(text[0], text[3]);
    EXPECT_EQ(text, this->textOf({9, 7, 9, 9}));
}

TYPED_TEST(CCharTraitsTest, AStringOfThemIsLikeAListOfTheValues) {
    unsigned const seed = std::random_device()();
    SCOPED_TRACE("seed " + std::to_string(seed));
    std::mt19937 random(seed);
    std::uniform_int_distribution<int> values(-1, 2);
    std::uniform_int_distribution<std::size_t> sizes(0, 6);
    auto const list = [&] {
        std::vector<TypeParam> result(sizes(random));
        for (TypeParam& element : result) {
            element = static_cast<TypeParam>(values(random));
        }
        return result;
    };
    for (int round = 0; round < 20000; ++round) {
        auto const a = list();
        auto const b = list();
        typename TestFixture::TText const textA(a.begin(), a.end());
        typename TestFixture::TText const textB(b.begin(), b.end());
        ASSERT_EQ(textA < textB, a < b);
        ASSERT_EQ(textA == textB, a == b);
        auto const sought = std::search(a.begin(), a.end(), b.begin(), b.end());
        ASSERT_EQ(textA.find(textB) == TestFixture::TText::npos, sought == a.end() && !b.empty());
        if (sought != a.end()) {
            ASSERT_EQ(textA.find(textB), static_cast<std::size_t>(sought - a.begin()));
        }
        auto both = a;
        both.insert(both.begin() + static_cast<std::ptrdiff_t>(a.size() / 2), b.begin(), b.end());
        auto textBoth = textA;
        textBoth.insert(a.size() / 2, textB);
        ASSERT_TRUE(std::equal(textBoth.begin(), textBoth.end(), both.begin(), both.end()));
    }
}

} // namespace
