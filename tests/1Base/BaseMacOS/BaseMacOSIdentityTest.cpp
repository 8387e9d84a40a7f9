#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxIdentity.h"

#include "1Base/BaseMacOS/BaseMacOSSystemCalls.h"
#include "support/FileRoot.h"

#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <string>

namespace {

using MacOS::Native::CFileIdentity;
using MacOS::Native::findMovedFile;
using MacOS::Native::identityOf;

constexpr std::size_t enough = 1000;

class CBaseMacOSIdentityTest : public TestSupport::CFileRootTest {
  protected:
    // Makes a file and tells what it is.
    CFileIdentity made(std::string const& name) {
        TestSupport::writeFile(path(name));
        return identityOf(path(name)).value_or(CFileIdentity());
    }

    // Gives whatever has this name another device.
    void moveToOtherDevice(std::string const& name) {
        system_.onStatx = [name](std::string const& path, struct statx& status) {
            if (path.substr(path.rfind('/') + 1) == name)
                status.stx_dev_minor ^= 1U;
        };
    }

    TestSupport::CSystemCalls system_;
};

TEST_F(CBaseMacOSIdentityTest, TheIdentityStaysWithTheFile) {
    CFileIdentity const before = made("a");
    ASSERT_EQ(rename(path("a").c_str(), path("b").c_str()), 0);
    std::optional<CFileIdentity> const after = identityOf(path("b"));
    ASSERT_TRUE(after);
    EXPECT_EQ(after->device, before.device);
    EXPECT_EQ(after->inode, before.inode);
    EXPECT_EQ(after->birth, before.birth);
    EXPECT_FALSE(identityOf(path("a")));
    EXPECT_NE(made("c").inode, before.inode);
}

TEST_F(CBaseMacOSIdentityTest, UpperLevelsComeFirst) {
    TestSupport::makeFolders(path("a/b"));
    CFileIdentity const wanted = made("z");
    ASSERT_EQ(link(path("z").c_str(), path("a/b/deep").c_str()), 0);
    EXPECT_EQ(findMovedFile(wanted, path("gone"), enough), path("z"));
    EXPECT_EQ(findMovedFile(wanted, path("a/gone"), enough), path("a/b/deep"));
}

TEST_F(CBaseMacOSIdentityTest, TheSearchEndsAtItsLimit) {
    TestSupport::makeFolders(path("a/b"));
    TestSupport::makeFolders(path("c/d"));
    CFileIdentity const wanted = made("c/d/target");
    // "b"; then "a" and "c", "d", and the target. What lies in "a" is not seen again.
    EXPECT_EQ(findMovedFile(wanted, path("a/gone"), 4), "");
    EXPECT_EQ(findMovedFile(wanted, path("a/gone"), 5), path("c/d/target"));
    EXPECT_EQ(findMovedFile(wanted, path("c/d/gone"), 0), "");
    EXPECT_EQ(findMovedFile(wanted, path("c/d/gone"), 1), path("c/d/target"));
}

TEST_F(CBaseMacOSIdentityTest, TheSearchDoesNotGoDownToAnotherDevice) {
    TestSupport::makeFolders(path("volume"));
    CFileIdentity const wanted = made("volume/target");
    EXPECT_EQ(findMovedFile(wanted, path("gone"), enough), path("volume/target"));
    moveToOtherDevice("volume");
    EXPECT_EQ(findMovedFile(wanted, path("gone"), enough), "");
}

TEST_F(CBaseMacOSIdentityTest, TheSearchDoesNotGoUpToAnotherDevice) {
    TestSupport::makeFolders(path("volume/a/b"));
    CFileIdentity const wanted = made("volume/target");
    EXPECT_EQ(findMovedFile(wanted, path("volume/a/b/gone"), enough), path("volume/target"));
    moveToOtherDevice("volume");
    EXPECT_EQ(findMovedFile(wanted, path("volume/a/b/gone"), enough), "");
}

TEST_F(CBaseMacOSIdentityTest, ALinkedFolderIsNotEntered) {
    TestSupport::makeFolders(path("a/b"));
    TestSupport::makeFolders(path("c"));
    TestSupport::makeLink(path("c"), path("a/b/link"));
    CFileIdentity const wanted = made("c/target");
    // "link" alone is in "b"; "b" in "a"; "a" and "c" above.
    EXPECT_EQ(findMovedFile(wanted, path("a/b/gone"), 2), "");
    EXPECT_EQ(findMovedFile(wanted, path("a/b/gone"), enough), path("c/target"));
}

TEST_F(CBaseMacOSIdentityTest, AMissingFolderIsSearchedFromTheNearestAbove) {
    TestSupport::makeFolders(path("a"));
    CFileIdentity const wanted = made("a/target");
    EXPECT_EQ(findMovedFile(wanted, path("a/x/y/z/gone"), 1), path("a/target"));
    TestSupport::writeFile(path("file"));
    EXPECT_EQ(findMovedFile(wanted, path("file/x/gone"), enough), path("a/target"));
}

TEST_F(CBaseMacOSIdentityTest, TheFirstLinkThatIsFoundEndsTheSearch) {
    CFileIdentity const wanted = made("a");
    for (char const* const folder : {"1", "2", "3", "4"}) {
        TestSupport::makeFolders(path(folder));
        ASSERT_EQ(link(path("a").c_str(), path(std::string(folder) + "/link").c_str()), 0);
    }
    ASSERT_EQ(unlink(path("a").c_str()), 0);
    // The folders, and the link in one of them.
    std::string const found = findMovedFile(wanted, path("gone"), 5);
    EXPECT_EQ(found.substr(found.rfind('/') + 1), "link");
    ASSERT_TRUE(identityOf(found));
    EXPECT_EQ(identityOf(found)->inode, wanted.inode);
    EXPECT_EQ(findMovedFile(wanted, path("gone"), 4), "");
}

TEST_F(CBaseMacOSIdentityTest, WhereTheBirthTimeIsLostTheDeviceCounts) {
    CFileIdentity wanted = made("target");
    wanted.birth = 1;
    system_.onStatx = [](std::string const&, struct statx& status) {
        status.stx_mask &= ~unsigned{STATX_BTIME};
    };
    EXPECT_EQ(findMovedFile(wanted, path("gone"), 1), path("target"));
    wanted.device ^= 1U;
    EXPECT_EQ(findMovedFile(wanted, path("gone"), 1), "");
}

TEST_F(CBaseMacOSIdentityTest, WhatVanishesDuringTheSearchIsNotFound) {
    CFileIdentity const wanted = made("target");
    EXPECT_EQ(findMovedFile(wanted, path("gone"), 1), path("target"));
    // The folder at the beginning, the folder when its turn comes, and the file.
    for (unsigned nth = 1; nth <= 3; ++nth) {
        system_.fail("statx", ENOENT, nth);
        EXPECT_EQ(findMovedFile(wanted, path("gone"), 1), "") << nth;
    }
    EXPECT_EQ(findMovedFile(wanted, path("gone"), 1), path("target"));
}

TEST_F(CBaseMacOSIdentityTest, AboveTheRootNothingIsSearched) {
    CFileIdentity const wanted = made("target");
    system_.fail("opendir", EACCES);
    EXPECT_EQ(findMovedFile(wanted, "/gone", enough), "");
}

} // namespace
