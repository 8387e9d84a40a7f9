#include "1Base/Strings/Strings.h"

#include <gtest/gtest.h>

#include <string>
#include <type_traits>

namespace {

using TName = Strings::Detail::CTag_Name_EncUTF16<char const*>;
using TTraits = Strings::Detail::CCharTraits<TemplMeta::CTag<TName>, short>;

static_assert(std::is_same_v<Strings::string, std::basic_string<wchar_t>>);
static_assert(std::is_same_v<Strings::stringUTF32, Strings::string>);
static_assert(std::is_same_v<Strings::stringUTF8, std::string>);
static_assert(std::is_same_v<Strings::stringUTF16, std::basic_string<short, TTraits>>);
static_assert(std::is_same_v<Strings::string::traits_type, std::char_traits<wchar_t>>);

static_assert(sizeof(Strings::string::value_type) == 4);
static_assert(sizeof(Strings::stringUTF8::value_type) == 1);
static_assert(sizeof(Strings::stringUTF16::value_type) == 2);
static_assert(std::is_signed_v<Strings::stringUTF16::value_type>);

static_assert(std::is_base_of_v<std::char_traits<short>, TTraits>);
static_assert(!std::is_same_v<std::char_traits<short>, TTraits>);
static_assert(std::is_empty_v<TTraits>);
static_assert(!std::is_same_v<Strings::stringUTF16, std::basic_string<short>>);
static_assert(!std::is_convertible_v<std::basic_string<short>, Strings::stringUTF16>);
static_assert(!std::is_convertible_v<Strings::stringUTF16, std::basic_string<short>>);

// Another tag is another type.
template <class TText>
struct CTag_Name_Other {
    static TText get_tag_name() { return "Other"; }
};
using TOtherTraits =
    Strings::Detail::CCharTraits<TemplMeta::CTag<CTag_Name_Other<char const*>>, short>;
static_assert(!std::is_same_v<Strings::stringUTF16, std::basic_string<short, TOtherTraits>>);

static_assert(std::is_empty_v<TName>);
static_assert(std::is_same_v<decltype(TName::get_tag_name()), char const*>);

Strings::stringUTF16 unitsOf(std::u16string const& units) {
    return Strings::stringUTF16(units.begin(), units.end());
}

TEST(CStringsKindsTest, TheTagSaysItsName) {
    EXPECT_STREQ(TName::get_tag_name(), "EncUTF16");
}

TEST(CStringsKindsTest, UnitsCompareAsSignedValues) {
    EXPECT_LT(unitsOf(u"\uFFFF"), unitsOf(u"a"));
    EXPECT_LT(unitsOf(u"\u8000"), unitsOf(u"\uFFFF"));
    EXPECT_LT(unitsOf(u"a"), unitsOf(u"ab"));
    EXPECT_EQ(unitsOf(u"\uFFFF"), Strings::stringUTF16(1, short{-1}));
}

TEST(CStringsKindsTest, AZeroUnitIsAUnitLikeAnyOther) {
    Strings::stringUTF16 text(3, short{0});
    text += short{'a'};
    EXPECT_EQ(text.size(), 4U);
    EXPECT_EQ(text.find(short{'a'}), 3U);
    // A pointer alone ends at the first zero unit.
    EXPECT_TRUE(Strings::stringUTF16(text.c_str()).empty());
}

} // namespace
