#include "1Base/StdUtil/StdUtilLocale.h"

#include "1Base/StdUtil/StdUtilLocales.h"

#include <gtest/gtest.h>

#include <locale>

namespace {

using namespace StdUtilTest;

TEST(CStdUtilLocaleTest, AProgramBeginsInTheClassicLocale) {
    EXPECT_TRUE(StdUtil::isGlobalLocaleClassic());
}

TEST(CStdUtilLocaleTest, AnyFacetOfItsOwnMakesAnotherLocale) {
    {
        CGlobalLocale const global(new CGrouping);
        EXPECT_FALSE(StdUtil::isGlobalLocaleClassic());
    }
    {
        CGlobalLocale const global(new CHidingNumbers);
        EXPECT_FALSE(StdUtil::isGlobalLocaleClassic());
    }
    {
        CGlobalLocale const global(new CBlankX);
        EXPECT_FALSE(StdUtil::isGlobalLocaleClassic());
    }
    EXPECT_TRUE(StdUtil::isGlobalLocaleClassic());
}

TEST(CStdUtilLocaleTest, TheClassicLocaleMayComeBack) {
    CGlobalLocale const global(new CGrouping);
    std::locale const grouping = std::locale::global(std::locale::classic());
    EXPECT_TRUE(StdUtil::isGlobalLocaleClassic());
    std::locale::global(grouping);
    EXPECT_FALSE(StdUtil::isGlobalLocaleClassic());
}

} // namespace
