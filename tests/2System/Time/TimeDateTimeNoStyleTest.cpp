// A half without a style, on a platform that has a text for it all the same.

#include "2System/Time/TimeDateTime.h"
#include "support/ObjectCount.h"

#include <CoreFoundation/CoreFoundation.h>

#include <gtest/gtest.h>

namespace {

int texts = 0;

} // namespace

// The first text is "1", the second "2".
extern "C" CFStringRef __wrap_CFDateFormatterCreateStringWithDate(CFAllocatorRef allocator,
                                                                  CFDateFormatterRef, CFDateRef) {
    UniChar const digit = static_cast<UniChar>('1' + texts++ % 2);
    return CFStringCreateWithCharacters(allocator, &digit, 1);
}

namespace {

using Time::CDateTime;
using CTimeDateTimeNoStyleTest = TestSupport::CObjectCountTest;

TEST_F(CTimeDateTimeNoStyleTest, ItsTextIsDroppedWithTheSeparator) {
    CDateTime const value(5, Time::CDate::emMar, 2021, 8, 5, 9, 0);
    EXPECT_EQ(value.format(CDateTime::efShort, CDateTime::efFull, L", "), L"1, 2");
    EXPECT_EQ(value.format(CDateTime::efShort, CDateTime::efNone, L", "), L"1");
    EXPECT_EQ(value.format(CDateTime::efNone, CDateTime::efShort, L", "), L"2");
    EXPECT_EQ(value.format(CDateTime::efNone, CDateTime::efNone, L", "), L"");
    EXPECT_EQ(texts, 8);
}

} // namespace
