#include <CoreFoundation/CoreFoundation.h>

#include "support/ObjectCount.h"
#include "support/PlatformString.h"

#include <string>

using TestSupport::CPlatformString;

namespace {

using CFURLTest = TestSupport::CObjectCountTest;

CFURLRef create(std::u16string const& path, CFURLPathStyle style = kCFURLPOSIXPathStyle,
                bool isDirectory = false) {
    return CFURLCreateWithFileSystemPath(kCFAllocatorDefault, CPlatformString(path).get(), style,
                                         static_cast<Boolean>(isDirectory));
}

std::u16string lastComponentOf(std::u16string const& path, bool isDirectory = false) {
    CFURLRef const url = create(path, kCFURLPOSIXPathStyle, isDirectory);
    CPlatformString const component(CFURLCopyLastPathComponent(url));
    CFRelease(url);
    return component.units();
}

TEST_F(CFURLTest, TheLastComponentStandsBehindTheLastSeparator) {
    EXPECT_EQ(lastComponentOf(u"/usr/lib/libm.so"), u"libm.so");
    EXPECT_EQ(lastComponentOf(u"/usr"), u"usr");
    EXPECT_EQ(lastComponentOf(u"usr"), u"usr");
    EXPECT_EQ(lastComponentOf(u"usr/lib"), u"lib");
    EXPECT_EQ(lastComponentOf(u"/a b/c%20d"), u"c%20d");
    EXPECT_EQ(lastComponentOf(u"/caf\u00E9/\u65E5\u672C \U0001F600"), u"\u65E5\u672C \U0001F600");
}

TEST_F(CFURLTest, SeparatorsAtTheEndDoNotCount) {
    EXPECT_EQ(lastComponentOf(u"/usr/lib/"), u"lib");
    EXPECT_EQ(lastComponentOf(u"/usr/lib///"), u"lib");
    EXPECT_EQ(lastComponentOf(u"lib/"), u"lib");
}

TEST_F(CFURLTest, TheRootIsItsOwnLastComponent) {
    EXPECT_EQ(lastComponentOf(u"/"), u"/");
    EXPECT_EQ(lastComponentOf(u"//"), u"/");
}

TEST_F(CFURLTest, AFoldersPathIsReadLikeAFiles) {
    EXPECT_EQ(lastComponentOf(u"/usr/lib", true), u"lib");
    EXPECT_EQ(lastComponentOf(u"/usr/lib/", true), u"lib");
}

TEST_F(CFURLTest, WhatCanBeNoPathGivesNull) {
    EXPECT_EQ(create(u""), nullptr);
    EXPECT_EQ(create(std::u16string(u"/a\0b", 4)), nullptr);
    EXPECT_EQ(create(std::u16string{u'/', 0xD800}), nullptr);
    EXPECT_EQ(create(std::u16string{u'/', 0xDC00, u'a'}), nullptr);
}

TEST_F(CFURLTest, OnlyPathsOfPosixAreServed) {
    EXPECT_EQ(create(u"/usr", static_cast<CFURLPathStyle>(1)), nullptr);
    EXPECT_EQ(create(u"/usr", static_cast<CFURLPathStyle>(2)), nullptr);
}

TEST_F(CFURLTest, TheCallerOwnsUrlAndComponent) {
    long const before = TestSupport::liveObjects();
    CFURLRef const url = create(u"/usr");
    CFStringRef const component = CFURLCopyLastPathComponent(url);
    EXPECT_EQ(CFGetRetainCount(url), 1);
    EXPECT_EQ(CFGetRetainCount(component), 1);
    EXPECT_EQ(TestSupport::liveObjects(), before + 2);
    CFRelease(url);
    EXPECT_EQ(CPlatformString::unitsOf(component), u"usr");
    CFRelease(component);
}

} // namespace
