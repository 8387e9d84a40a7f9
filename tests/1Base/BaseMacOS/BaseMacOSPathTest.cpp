#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxPath.h"

#include "support/FileRoot.h"

#include <filesystem>
#include <random>
#include <string>

namespace {

using CBaseMacOSPathTest = TestSupport::CFileRootTest;

using namespace MacOS::Native;

TEST_F(CBaseMacOSPathTest, APathFallsApartAtItsLastSeparator) {
    EXPECT_EQ(folderOf("/a/b"), "/a");
    EXPECT_EQ(folderOf("/a//b"), "/a");
    EXPECT_EQ(folderOf("/a"), "/");
    EXPECT_EQ(folderOf("/"), "/");
    EXPECT_EQ(folderOf("a"), ".");
    EXPECT_EQ(folderOf("a/b"), "a");
    EXPECT_EQ(folderOf(""), ".");
    EXPECT_EQ(nameOf("/a/b"), "b");
    EXPECT_EQ(nameOf("b"), "b");
    EXPECT_EQ(nameOf("/"), "");
}

TEST_F(CBaseMacOSPathTest, PathsAreJoinedByOneSeparator) {
    EXPECT_EQ(joinPath("/a", "b"), "/a/b");
    EXPECT_EQ(joinPath("/a//", "b"), "/a/b");
    EXPECT_EQ(joinPath("/", "b/c"), "/b/c");
    EXPECT_EQ(joinPath("//", "b"), "/b");
    EXPECT_EQ(withoutEnd("/a/"), "/a");
    EXPECT_EQ(withoutEnd("///"), "/");
    EXPECT_EQ(withoutEnd(""), "");
}

TEST_F(CBaseMacOSPathTest, AnAbsolutePathKeepsItsLinks) {
    TestSupport::makeFolders(path("real/in"));
    TestSupport::makeLink("real/in", path("link"));
    EXPECT_EQ(absolutePath(path("link")), path("link"));
    EXPECT_EQ(absolutePath(path() + "//./link/./"), path("link"));
    EXPECT_EQ(absolutePath(path("link/..")), path("real"));
    EXPECT_EQ(absolutePath(path("none/..")), "");
    EXPECT_EQ(absolutePath("//"), "/");
    EXPECT_EQ(absolutePath(""), "");
}

TEST_F(CBaseMacOSPathTest, ARelativePathNeedsAWorkingFolder) {
    std::filesystem::path const before = std::filesystem::current_path();
    TestSupport::makeFolders(path("gone"));
    std::filesystem::current_path(path("gone"));
    EXPECT_EQ(absolutePath("a"), path("gone/a"));
    EXPECT_EQ(absolutePath("."), path("gone"));
    std::filesystem::remove(path("gone"));
    EXPECT_EQ(absolutePath("a"), "");
    EXPECT_EQ(absolutePath("/a"), "/a");
    std::filesystem::current_path(before);
}

TEST_F(CBaseMacOSPathTest, ARelativePathLeadsBackToItsEnd) {
    EXPECT_EQ(relativePath("/x/a", "/x/b"), "../b");
    EXPECT_EQ(relativePath("/x", "/x/b/c"), "b/c");
    EXPECT_EQ(relativePath("/", "/a"), "a");
    EXPECT_EQ(relativePath("/a/b", "/"), "../..");
    EXPECT_EQ(relativePath("/a", "/a"), ".");
    EXPECT_EQ(relativePath("/ab", "/a"), "../a");
    EXPECT_EQ(followPath("/x/a", "../b"), "/x/b");
    EXPECT_EQ(followPath("/a", "../../../b"), "/b");
    EXPECT_EQ(followPath("/a", "."), "/a");
    EXPECT_EQ(followPath("/a", ".."), "/");

    std::minstd_rand random(20210306);
    auto const randomPath = [&random] {
        std::string path;
        for (auto count = random() % 5; count > 0; --count)
            path += std::string("/") + "abc"[random() % 3];
        return path.empty() ? "/" : path;
    };
    for (int round = 0; round < 5000; ++round) {
        std::string const folder = randomPath();
        std::string const path = randomPath();
        EXPECT_EQ(followPath(folder, relativePath(folder, path)), path)
            << "seed 20210306, round " << round << ", from " << folder;
    }
}

} // namespace
