// The functions and their kinds of text, pinned at compile time: adding, dropping or renaming one
// is a decision.

#include "1Base/Strings/Strings.h"

#include <gtest/gtest.h>

#include <type_traits>
#include <utility>

namespace {

template <class TText>
using TComparison = int (*)(TText, TText);

template <class TText>
using TInPlace = TText& (*)(TText&);

constexpr TComparison<char const*> stricmpNarrow = &Strings::stricmp;
constexpr TComparison<wchar_t const*> stricmpWide = &Strings::stricmp;
constexpr TComparison<std::string const&> stricmpUTF8 = &Strings::stricmp;
constexpr TComparison<Strings::string const&> stricmpUTF32 = &Strings::stricmp;

constexpr TComparison<char const*> strnatcmpNarrow = &Strings::strnatcmp;
constexpr TComparison<wchar_t const*> strnatcmpWide = &Strings::strnatcmp;
constexpr TComparison<std::string const&> strnatcmpUTF8 = &Strings::strnatcmp;
constexpr TComparison<Strings::string const&> strnatcmpUTF32 = &Strings::strnatcmp;

constexpr TInPlace<std::string> toUpperUTF8 = &Strings::toUpper;
constexpr TInPlace<Strings::string> toUpperUTF32 = &Strings::toUpper;
constexpr TInPlace<std::string> toLowerUTF8 = &Strings::toLower;
constexpr TInPlace<Strings::string> toLowerUTF32 = &Strings::toLower;

constexpr Strings::string (*toLowerValue)(Strings::string const&) = &Strings::toLower;

#define QORN_RESULT_OF(function)                                                                   \
    template <class TEnabled, class... TArguments>                                                 \
    struct CResultOf_##function {                                                                  \
        using TResult = void;                                                                      \
    };                                                                                             \
    template <class... TArguments>                                                                 \
    struct CResultOf_##function<                                                                   \
        std::void_t<decltype(Strings::function(std::declval<TArguments>()...))>, TArguments...> {  \
        using TResult = decltype(Strings::function(std::declval<TArguments>()...));                \
    };                                                                                             \
    /* What a call with these arguments returns; void where it does not compile. */                \
    template <class... TArguments>                                                                 \
    using TResultOf_##function = typename CResultOf_##function<void, TArguments...>::TResult;

QORN_RESULT_OF(stricmp)
QORN_RESULT_OF(strnatcmp)
QORN_RESULT_OF(toLower)
QORN_RESULT_OF(toUpper)
#undef QORN_RESULT_OF

// A variable picks the form that changes it; what is constant or temporary has a value form only in
// wide lower case.
static_assert(std::is_same_v<TResultOf_toLower<Strings::string&>, Strings::string&>);
static_assert(std::is_same_v<TResultOf_toLower<Strings::string const&>, Strings::string>);
static_assert(std::is_same_v<TResultOf_toLower<Strings::string>, Strings::string>);
static_assert(std::is_same_v<TResultOf_toLower<wchar_t const*>, Strings::string>);
static_assert(std::is_same_v<TResultOf_toLower<std::string&>, std::string&>);
static_assert(std::is_void_v<TResultOf_toLower<std::string const&>>);
static_assert(std::is_void_v<TResultOf_toLower<std::string>>);
static_assert(std::is_void_v<TResultOf_toLower<char const*>>);

static_assert(std::is_same_v<TResultOf_toUpper<Strings::string&>, Strings::string&>);
static_assert(std::is_same_v<TResultOf_toUpper<std::string&>, std::string&>);
static_assert(std::is_void_v<TResultOf_toUpper<Strings::string const&>>);
static_assert(std::is_void_v<TResultOf_toUpper<Strings::string>>);
static_assert(std::is_void_v<TResultOf_toUpper<std::string const&>>);
static_assert(std::is_void_v<TResultOf_toUpper<std::string>>);
static_assert(std::is_void_v<TResultOf_toUpper<char const*>>);
static_assert(std::is_void_v<TResultOf_toUpper<wchar_t const*>>);

// Both texts are of one kind.
template <class TFirst, class TSecond>
constexpr bool isRefused = std::is_void_v<TResultOf_stricmp<TFirst, TSecond>>&&
    std::is_void_v<TResultOf_strnatcmp<TFirst, TSecond>>;

static_assert(isRefused<char const*, wchar_t const*>);
static_assert(isRefused<std::string const&, Strings::string const&>);
static_assert(isRefused<Strings::string const&, char const*>);
static_assert(isRefused<Strings::stringUTF16 const&, Strings::stringUTF16 const&>);
static_assert(!isRefused<char const*, char const*>);
static_assert(!isRefused<wchar_t const*, wchar_t const*>);

TEST(CStringsOverloadsTest, EachFormIsAFunctionOfItsOwn) {
    EXPECT_EQ(stricmpNarrow("a", "B"), -1);
    EXPECT_EQ(stricmpWide(L"a", L"B"), -1);
    EXPECT_EQ(stricmpUTF8("a", "B"), -1);
    EXPECT_EQ(stricmpUTF32(L"a", L"B"), -1);
    EXPECT_EQ(strnatcmpNarrow("9", "10"), -1);
    EXPECT_EQ(strnatcmpWide(L"9", L"10"), -1);
    EXPECT_EQ(strnatcmpUTF8("9", "10"), -1);
    EXPECT_EQ(strnatcmpUTF32(L"9", L"10"), -1);

    std::string narrow = "aB";
    Strings::string wide = L"aB";
    EXPECT_EQ(toUpperUTF8(narrow), "AB");
    EXPECT_EQ(toUpperUTF32(wide), L"AB");
    EXPECT_EQ(toLowerUTF8(narrow), "ab");
    EXPECT_EQ(toLowerValue(wide), L"ab");
    EXPECT_EQ(wide, L"AB");
    EXPECT_EQ(toLowerUTF32(wide), L"ab");
}

} // namespace
