#include "1Base/StdUtil/StdUtilArray.h"

#include <gtest/gtest.h>

#include <map>
#include <string>
#include <utility>
#include <vector>

namespace {

constexpr int numbers[] = {3, 5, 8};
static_assert(StdUtil::begin(numbers) == &numbers[0]);
static_assert(StdUtil::end(numbers) - StdUtil::begin(numbers) == 3);

TEST(CStdUtilArrayTest, TheBoundsSpanTheArray) {
    EXPECT_EQ(std::vector<int>(StdUtil::begin(numbers), StdUtil::end(numbers)),
              (std::vector<int>{3, 5, 8}));
}

TEST(CStdUtilArrayTest, AMapIsMadeOfAnArrayOfPairs) {
    std::pair<int, wchar_t const*> const texts[] = {{2, L"two"}, {1, L"one"}};
    std::map<int, std::wstring> const map(StdUtil::begin(texts), StdUtil::end(texts));
    EXPECT_EQ(map, (std::map<int, std::wstring>{{1, L"one"}, {2, L"two"}}));
}

TEST(CStdUtilArrayTest, ElementsCanBeChangedThroughTheBounds) {
    int digits[] = {1, 2};
    *StdUtil::begin(digits) = 7;
    *(StdUtil::end(digits) - 1) = 9;
    EXPECT_EQ(digits[0], 7);
    EXPECT_EQ(digits[1], 9);
}

} // namespace
