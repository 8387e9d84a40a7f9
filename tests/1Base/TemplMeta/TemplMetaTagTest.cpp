#include "1Base/TemplMeta/TemplMeta.h"

#include <gtest/gtest.h>

#include <string>
#include <type_traits>

namespace {

using TemplMeta::CNil;
using TemplMeta::CTag;

template <class TText>
struct CTag_Name_First {
    static TText get_tag_name() { return "First"; }
};

template <class TText>
struct CTag_Name_Second {
    static TText get_tag_name() { return "Second"; }
};

using TFirst = CTag<CTag_Name_First<char const*>>;
using TSecond = CTag<CTag_Name_Second<char const*>>;

static_assert(std::is_empty_v<CNil> && std::is_trivially_copyable_v<CNil>);
static_assert(std::is_default_constructible_v<CNil> && std::is_copy_constructible_v<CNil>);

static_assert(std::is_empty_v<TFirst> && !std::is_polymorphic_v<TFirst>);
static_assert(std::is_same_v<TFirst, CTag<CTag_Name_First<char const*>>>);
static_assert(!std::is_same_v<TFirst, TSecond>);
// A tag names its class without needing it: an incomplete one will do.
static_assert(std::is_empty_v<CTag<class CTag_Name_Incomplete>>);

std::string describe(CNil) {
    return "end";
}

template <class TName>
std::string describe(CTag<TName>) {
    return TName::get_tag_name();
}

TEST(CTemplMetaTagTest, AFunctionTellsAListsEndFromATag) {
    EXPECT_EQ(describe(CNil()), "end");
    EXPECT_EQ(describe(TFirst()), "First");
    EXPECT_EQ(describe(TSecond()), "Second");
}

} // namespace
