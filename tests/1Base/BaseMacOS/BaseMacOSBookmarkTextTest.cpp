#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxBookmarkText.h"

#include <gtest/gtest.h>

#include <optional>
#include <random>
#include <string>

namespace {

using MacOS::Native::CBookmark;
using MacOS::Native::CFileIdentity;
using MacOS::Native::readBookmark;
using MacOS::Native::writeBookmark;

std::optional<CBookmark> readEntries(std::string const& entries) {
    return readBookmark("[Desktop Entry]\nType=Link\n" + entries);
}

std::string pathIn(std::string const& text) {
    std::optional<CBookmark> const bookmark = readBookmark(text);
    return bookmark ? bookmark->path : "(none)";
}

std::string pathOfEntries(std::string const& entries) {
    return pathIn("[Desktop Entry]\nType=Link\n" + entries);
}

TEST(CBaseMacOSBookmarkTextTest, AllIsWritten) {
    EXPECT_EQ(writeBookmark({"/home/ada/a b", "../a b", CFileIdentity{1, 2, 3}}),
              "[Desktop Entry]\n"
              "Type=Link\n"
              "Name=a b\n"
              "URL=file:///home/ada/a%20b\n"
              "X-QORN-Path=/home/ada/a b\n"
              "X-QORN-RelativePath=../a b\n"
              "X-QORN-Device=1\n"
              "X-QORN-Inode=2\n"
              "X-QORN-BirthTime=3\n");
    EXPECT_EQ(writeBookmark({"/", ".", std::nullopt}),
              "[Desktop Entry]\nType=Link\nName=\nURL=file:///\nX-QORN-Path=/\n"
              "X-QORN-RelativePath=.\n");
}

TEST(CBaseMacOSBookmarkTextTest, ValuesAreEscaped) {
    EXPECT_EQ(writeBookmark({"/ \\\n\t\r ", " ", std::nullopt}),
              "[Desktop Entry]\nType=Link\nName=\\s\\\\\\n\\t\\r \n"
              "URL=file:///%20%5C%0A%09%0D%20\nX-QORN-Path=/ \\\\\\n\\t\\r \n"
              "X-QORN-RelativePath=\\s\n");
}

TEST(CBaseMacOSBookmarkTextTest, WhatWasWrittenIsRead) {
    std::minstd_rand random(20210305);
    std::string const alphabet = "/ \\snrt\n\t\r=#[]%\xC3\xA4";
    for (int round = 0; round < 20000; ++round) {
        CBookmark bookmark{"/", "", CFileIdentity{random(), random(), random()}};
        for (std::string* const path : {&bookmark.path, &bookmark.relativePath})
            for (auto length = random() % 12; length > 0; --length)
                *path += alphabet[random() % alphabet.size()];
        std::optional<CBookmark> const read = readBookmark(writeBookmark(bookmark));
        ASSERT_TRUE(read) << "seed 20210305, round " << round;
        EXPECT_EQ(read->path, bookmark.path);
        EXPECT_EQ(read->relativePath, bookmark.relativePath);
        ASSERT_TRUE(read->identity);
        EXPECT_EQ(read->identity->device, bookmark.identity->device);
        EXPECT_EQ(read->identity->inode, bookmark.identity->inode);
        EXPECT_EQ(read->identity->birth, bookmark.identity->birth);
    }
}

TEST(CBaseMacOSBookmarkTextTest, TheFormOfADesktopEntryIsFree) {
    EXPECT_EQ(pathOfEntries("X-QORN-Path=/a"), "/a");
    EXPECT_EQ(pathOfEntries("X-QORN-Path = \t/a b\n"), "/a b");
    EXPECT_EQ(pathOfEntries("X-QORN-Path=/a \n"), "/a ");
    EXPECT_EQ(pathOfEntries("X-QORN-Path=/a\nX-QORN-Path=/b\n"), "/a");
    EXPECT_EQ(pathOfEntries("# X-QORN-Path=/no\n\n  \nIcon\nX-QORN-Path=/a=b\n"), "/a=b");
    EXPECT_EQ(pathIn("\n# first\n[Desktop Entry] \nX-QORN-Path=/a\nType=Link\n[Other]\nType=x"),
              "/a");
}

TEST(CBaseMacOSBookmarkTextTest, WhatMattersMustBeThere) {
    EXPECT_EQ(pathIn(""), "(none)");
    EXPECT_EQ(pathIn("Type=Link\nX-QORN-Path=/a\n"), "(none)");
    EXPECT_EQ(pathIn("[Desktop Entry]\nX-QORN-Path=/a\n"), "(none)");
    EXPECT_EQ(pathIn("[Desktop Entry]\nType=Application\nX-QORN-Path=/a\n"), "(none)");
    EXPECT_EQ(pathIn("[Desktop Entry]\nType=link\nX-QORN-Path=/a\n"), "(none)");
    EXPECT_EQ(pathIn("[Desktop]\nType=Link\nX-QORN-Path=/a\n"), "(none)");
    EXPECT_EQ(pathIn("[Other]\n[Desktop Entry]\nType=Link\nX-QORN-Path=/a\n"), "(none)");
    EXPECT_EQ(pathIn("[Desktop Entry]\nType=Link\n[Other]\nX-QORN-Path=/a\n"), "(none)");
    EXPECT_EQ(pathOfEntries(""), "(none)");
    EXPECT_EQ(pathOfEntries("URL=file:///a\n"), "(none)");
    EXPECT_EQ(pathOfEntries("X-QORN-Path=\n"), "(none)");
    EXPECT_EQ(pathOfEntries("X-QORN-Path=a\n"), "(none)");
    EXPECT_EQ(pathOfEntries("X-QORN-Path=/a\\\n"), "(none)");
    EXPECT_EQ(pathOfEntries("X-QORN-Path=/a\\x\n"), "(none)");
    EXPECT_EQ(pathOfEntries(std::string("X-QORN-Path=/a\0\n", 16)), "(none)");
}

TEST(CBaseMacOSBookmarkTextTest, AMalformedNumberIsAsIfItWereNotThere) {
    std::string const path = "X-QORN-Path=/a\n";
    std::string const device = "X-QORN-Device=18446744073709551615\n";
    for (std::string const number :
         {"", "x", "1x", "-1", "+1", " ", "0x1", "1.5", "18446744073709551616"}) {
        std::optional<CBookmark> const noInode =
            readEntries(path + device + "X-QORN-Inode=" + number + "\n");
        ASSERT_TRUE(noInode) << number;
        EXPECT_FALSE(noInode->identity) << number;
        std::optional<CBookmark> const noBirth =
            readEntries(path + device + "X-QORN-Inode=7\nX-QORN-BirthTime=" + number + "\n");
        ASSERT_TRUE(noBirth && noBirth->identity) << number;
        EXPECT_EQ(noBirth->identity->device, 18446744073709551615U);
        EXPECT_EQ(noBirth->identity->inode, 7U);
        EXPECT_FALSE(noBirth->identity->birth) << number;
    }
}

TEST(CBaseMacOSBookmarkTextTest, AMalformedRelativePathIsAsIfItWereNotThere) {
    std::optional<CBookmark> const bookmark =
        readEntries("X-QORN-Path=/a\nX-QORN-RelativePath=\\x\n");
    ASSERT_TRUE(bookmark);
    EXPECT_EQ(bookmark->relativePath, "");
}

} // namespace
