#include "1Base/TemplMeta/TemplMeta.h"

#include <gtest/gtest.h>

#include <string>
#include <type_traits>

namespace Public {
TEMPLMETA_TAG_NAME(Shared);
using TTagShared = TemplMeta::CTag<CTag_Name_Shared<char const*>>;
} // namespace Public

namespace {

using TemplMeta::CAnd;
using TemplMeta::CConcatObjList;
using TemplMeta::CNil;
using TemplMeta::CObjList;
using TemplMeta::CTypeList;
using TemplMeta::listSize;
using TemplMeta::listSizeOf;

TEMPLMETA_TAG_NAME(Shared);
using TTagShared = TemplMeta::CTag<CTag_Name_Shared<char const*>>;

// Tags: a private one may repeat a public one's name and is another type.
static_assert(!std::is_same_v<TTagShared, Public::TTagShared>);
static_assert(std::is_empty_v<CTag_Name_Shared<char const*>>);
static_assert(!std::is_polymorphic_v<CTag_Name_Shared<char const*>>);
static_assert(TemplMeta::getTagName<TTagShared>()[0] == 'S');
static_assert(TemplMeta::getTagName<Public::TTagShared>()[6] == '\0');

// The scheme leaves room for another kind of text.
template <class TText>
struct CTag_Name_Wide {
    static constexpr TText get_tag_name() { return L"Wide"; }
};
static_assert(CTag_Name_Wide<wchar_t const*>::get_tag_name()[0] == L'W');

// Type lists.
using TTypes = CTypeList<char, CTypeList<short, CTypeList<int, CNil>>>;
static_assert(std::is_empty_v<TTypes> && std::is_empty_v<CAnd>);
static_assert(TemplMeta::contains<TTypes, char>);
static_assert(TemplMeta::contains<TTypes, short>);
static_assert(TemplMeta::contains<TTypes, int>);
static_assert(!TemplMeta::contains<TTypes, long>);
static_assert(!TemplMeta::contains<TTypes, char const>);
static_assert(!TemplMeta::contains<TTypes, CNil>);
static_assert(!TemplMeta::contains<CNil, char>);
static_assert(!TemplMeta::contains<CNil, CNil>);
static_assert(TemplMeta::contains<CTypeList<Public::TTagShared, CNil>, Public::TTagShared>);
static_assert(!TemplMeta::contains<CTypeList<Public::TTagShared, CNil>, TTagShared>);

// The end of a list of values takes no room, and nothing but the values does.
static_assert(sizeof(CObjList<int, CNil>) == sizeof(int));
static_assert(sizeof(CObjList<char, CNil>) == 1);
static_assert(sizeof(CObjList<char, CObjList<char, CObjList<char, CNil>>>) == 3);
static_assert(sizeof(CObjList<void*, CObjList<void*, CNil>>) == 2 * sizeof(void*));

using TOne = CObjList<int, CNil>;
using TTwo = CObjList<double, TOne>;
using TSix = CObjList<int, CObjList<int, CObjList<int, CObjList<int, CObjList<int, TOne>>>>>;
static_assert(std::is_trivially_copyable_v<TSix> && sizeof(TSix) == 6 * sizeof(int));
static_assert(std::is_constructible_v<TTwo, double const&, TOne const&>);
static_assert(std::is_constructible_v<TOne, int const&, CNil const&>);
static_assert(!std::is_default_constructible_v<TTwo>);

// Sizes and orders are constants.
static_assert(listSizeOf<CNil> == 0);
static_assert(listSizeOf<TOne> == 1);
static_assert(listSizeOf<TSix> == 6);
static_assert(std::is_same_v<decltype(listSize(CNil())), unsigned long>);

constexpr TTwo two = CConcatObjList<double, int>::concat(2.5, 7);
static_assert(std::is_same_v<CConcatObjList<double, int>::TResult, TTwo>);
static_assert(listSize(two) == 2);
static_assert(two.head() == 2.5 && two.tail().head() == 7);
static_assert(std::is_same_v<decltype(two.tail().tail()), CNil>);

constexpr auto three = CConcatObjList<char, TTwo>::concat('x', two);
static_assert(std::is_same_v<decltype(three), CObjList<char, TTwo> const>);
static_assert(listSize(three) == 3);
static_assert(three.head() == 'x' && three.tail().head() == 2.5 && three.tail().tail().head() == 7);

// The size is a constant where only a reference is at hand.
template <class TList>
constexpr unsigned long capacityFor(TList const&) {
    constexpr unsigned long size = listSizeOf<TList>;
    int const room[size] = {};
    return sizeof(room) / sizeof(room[0]);
}
static_assert(capacityFor(three) == 3);

std::string describe(CNil) {
    return ".";
}

template <class THead, class TTail>
std::string describe(CObjList<THead, TTail> const& list) {
    return std::to_string(list.head()) + " " + describe(list.tail());
}

TEST(CTemplMetaListTest, AWalkEndsAtTheOverloadForTheEnd) {
    auto const list = CConcatObjList<int, CObjList<int, TOne>>::concat(
        1, CConcatObjList<int, TOne>::concat(2, TOne(3, CNil())));
    EXPECT_EQ(describe(list), "1 2 3 .");
}

TEST(CTemplMetaListTest, TheSizeOfAListOnTheStackIsAConstant) {
    TSix const list(1, {2, {3, {4, {5, TOne(6, CNil())}}}});
    int const room[listSize(list)] = {};
    EXPECT_EQ(sizeof(room), 6 * sizeof(int));
}

TEST(CTemplMetaListTest, AListHoldsCopiesOfItsValues) {
    std::string text = "before";
    auto const list = CConcatObjList<std::string, std::string>::concat(text, text);
    auto const copy = list;
    text = "after";
    EXPECT_EQ(list.head(), "before");
    EXPECT_EQ(copy.tail().head(), "before");
    EXPECT_NE(&copy.head(), &list.head());
}

TEST(CTemplMetaListTest, TwoTagsMayShareAText) {
    EXPECT_STREQ(TemplMeta::getTagName<TTagShared>(), "Shared");
    EXPECT_STREQ(TemplMeta::getTagName<Public::TTagShared>(), "Shared");
}

} // namespace
