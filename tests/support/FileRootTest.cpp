// The place of file tests is itself tested: what it leaves behind, other tests would meet.

#include "support/FileRoot.h"

#include <gtest/gtest.h>

#include <sys/stat.h>
#include <unistd.h>

#include <cstdlib>
#include <string>
#include <vector>

namespace {

using TestSupport::CEnvironment;
using TestSupport::CFileRoot;
using TestSupport::listTree;
using TestSupport::makeFolders;
using TestSupport::makeLink;
using TestSupport::pathExists;
using TestSupport::writeFile;

using TNames = std::vector<std::string>;

std::string variable(char const* name) {
    char const* const value = std::getenv(name);
    return value == nullptr ? "unset" : value;
}

TEST(FileRootTest, TheRootIsEmptyAndGoesAtTheEnd) {
    std::string path;
    {
        CFileRoot const root;
        path = root.path();
        EXPECT_EQ(listTree(path), TNames());
        makeFolders(root.path("a/b"));
        writeFile(root.path("a/b/c"), "text");
        makeLink("/", root.path("link"));
        EXPECT_EQ(listTree(path), (TNames{"a", "a/b", "a/b/c", "link"}));
        EXPECT_EQ(TestSupport::readFile(root.path("a/b/c")), "text");
    }
    EXPECT_FALSE(pathExists(path));
    EXPECT_FALSE(pathExists(path.substr(0, path.rfind('/'))));
}

TEST(FileRootTest, ClosedFoldersGoAsWell) {
    std::string path;
    {
        CFileRoot const root;
        path = root.path();
        TestSupport::runAsOrdinaryUser(path, [&] {
            makeFolders(root.path("closed/inside"));
            writeFile(root.path("closed/inside/file"));
            ASSERT_EQ(chmod(root.path("closed/inside").c_str(), 0), 0);
            ASSERT_EQ(chmod(root.path("closed").c_str(), 0), 0);
            TestSupport::removeTree(root.path("closed"));
            EXPECT_FALSE(pathExists(root.path("closed")));
        });
    }
    EXPECT_FALSE(pathExists(path));
}

TEST(FileRootTest, TheEnvironmentLeadsIntoTheRootAndComesBack) {
    CEnvironment outer;
    outer.set("HOME", "/before");
    outer.set("XDG_CONFIG_HOME", "/before/config");
    outer.set("XDG_MUSIC_DIR", "/before/music");
    outer.unset("XDG_DATA_HOME");
    outer.unset("TMPDIR");
    {
        CFileRoot const root;
        EXPECT_EQ(variable("HOME"), root.home());
        EXPECT_EQ(variable("TMPDIR"), root.temporary());
        EXPECT_EQ(variable("XDG_CONFIG_HOME"), root.home() + "/.config");
        EXPECT_EQ(variable("XDG_MUSIC_DIR"), "unset");
        EXPECT_TRUE(pathExists(root.home()) && pathExists(root.temporary()));
    }
    EXPECT_EQ(variable("HOME"), "/before");
    EXPECT_EQ(variable("XDG_CONFIG_HOME"), "/before/config");
    EXPECT_EQ(variable("XDG_MUSIC_DIR"), "/before/music");
    EXPECT_EQ(variable("XDG_DATA_HOME"), "unset");
    EXPECT_EQ(variable("TMPDIR"), "unset");
}

TEST(FileRootTest, AnyTemporaryFolderWillDo) {
    CFileRoot const outer;
    CEnvironment environment;
    for (std::string const name : {"with blanks", "f\xC3\xB6lder"}) {
        makeFolders(outer.path(name));
        environment.set("TMPDIR", outer.path(name) + "/");
        CFileRoot const root;
        EXPECT_EQ(root.path().compare(0, outer.path(name).size(), outer.path(name)), 0)
            << root.path();
    }
    writeFile(outer.path("file"));
    for (std::string const& folder : {std::string(), outer.path("missing"), outer.path("file")}) {
        environment.set("TMPDIR", folder);
        CFileRoot const root;
        EXPECT_EQ(root.path().compare(0, 5, "/tmp/"), 0) << root.path();
    }
    ASSERT_EQ(chdir(outer.path().c_str()), 0);
    environment.set("TMPDIR", "with blanks");
    {
        CFileRoot const root;
        EXPECT_EQ(root.path().compare(0, outer.path().size(), outer.path()), 0) << root.path();
    }
    ASSERT_EQ(chdir("/"), 0);
}

// Ends the process with 3 where the running test has failed.
[[noreturn]] void runAndExit(std::string const& folder, void (*body)()) {
    TestSupport::runAsOrdinaryUser(folder, body);
    _exit(testing::Test::HasFailure() ? 3 : 0);
}

TEST(FileRootTest, WhatFailsForAnOrdinaryUserFailsTheTest) {
    CFileRoot const root;
    testing::ExitedWithCode const failed(3);
    EXPECT_EXIT(runAndExit(root.path(), [] { ADD_FAILURE() << "on purpose"; }), failed, "");
    EXPECT_EXIT(runAndExit(root.path(), [] { throw 1; }), failed, "");
    testing::ExitedWithCode const passed(0);
    EXPECT_EXIT(runAndExit(root.path(), [] { EXPECT_NE(geteuid(), 0U); }), passed, "");
}

TEST(FileRootTest, ASecondVolumeIsAnotherDevice) {
    CFileRoot const root;
    TestSupport::CSecondVolume const volume(root.path());
    if (!volume.isThere())
        GTEST_SKIP() << volume.reason();
    struct stat here;
    struct stat there;
    ASSERT_EQ(stat(root.path().c_str(), &here), 0);
    ASSERT_EQ(stat(volume.path().c_str(), &there), 0);
    EXPECT_NE(here.st_dev, there.st_dev);
    EXPECT_EQ(listTree(volume.path()), TNames());
    EXPECT_EQ(listTree(root.path()), TNames());
}

TEST(FileRootTest, TheSameVolumeIsNoSecondOne) {
    CEnvironment environment;
    environment.set("TMPDIR", "/dev/shm");
    CFileRoot const root;
    if (root.path().compare(0, 9, "/dev/shm/") != 0)
        GTEST_SKIP() << "there is no /dev/shm";
    TestSupport::CSecondVolume const volume(root.path());
    EXPECT_FALSE(volume.isThere());
    EXPECT_EQ(volume.reason(), "/dev/shm is on the same volume as " + root.path());
}

} // namespace
