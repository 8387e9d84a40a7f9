// Creating, deleting, attributes, and trying to open.

#include "2System/FileSys/FileSysOperations.h"

#include "1Base/Error/ErrorExcChains.h"
#include "support/FileFailures.h"
#include "support/FileRoot.h"
#include "support/SystemCalls.h"

#include <gtest/gtest.h>

#include <sys/stat.h>
#include <sys/xattr.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>
#include <ios>
#include <string>
#include <vector>

namespace {

using FileSys::CFileSpec;
using TestSupport::CFileFailure;
using TestSupport::couldNot;
using TestSupport::CSystemCalls;
using TestSupport::errorText;
using TestSupport::expectFailure;
using TestSupport::failureOf;
using TestSupport::listTree;
using TestSupport::pathExists;
using TestSupport::readFile;
using TestSupport::wide;
using TestSupport::writeFile;

using TNames = std::vector<std::string>;

mode_t modeOf(std::string const& path) {
    struct stat status;
    return stat(path.c_str(), &status) == 0 ? status.st_mode & 07777U : 0;
}

// What the path library's own exception has become on its way through a guarded block.
void expectPassedOn(CFileFailure const& failure, TNames const& trace) {
    EXPECT_EQ(failure.name, "StdLibException");
    EXPECT_FALSE(failure.isFileSpec);
    EXPECT_EQ(failure.trace, trace);
    ASSERT_EQ(failure.parameters.size(), 2U);
    EXPECT_EQ(failure.parameters[1].first, "CStdLibExceptionType");
    EXPECT_NE(failure.parameters[1].second.find(L"filesystem_error"), Strings::string::npos);
}

class CCreateFolderTest : public TestSupport::CFileRootTest {
  protected:
    void expectRefused(std::string const& folder, Strings::string const& reason) const {
        expectFailure(failureOf([&] { FileSys::createFolder(folder); }), "FileSpec",
                      Error::msgCouldNot, couldNot(L"create", L"folder", wide(folder), reason),
                      {"doCreateFolder", "createFolder"});
    }

    // Where something else is in the way, the path library has its own idea of the reason.
    void expectRefused(std::string const& name) const {
        Strings::string const reason = TestSupport::reasonOfNoFolder(path(name));
        EXPECT_FALSE(reason.empty());
        expectRefused(path(name), reason);
    }
};

TEST_F(CCreateFolderTest, TheFolderComesWithItsParents) {
    FileSys::createFolder(path("a/b\u00E9/c d"));
    EXPECT_EQ(listTree(path()), (TNames{"a", "a/b\u00E9", "a/b\u00E9/c d"}));
}

TEST_F(CCreateFolderTest, AFolderThatIsThereStaysAsItIs) {
    writeFile(path("file"), "text");
    FileSys::createFolder(path());
    EXPECT_EQ(listTree(path()), TNames{"file"});
}

TEST_F(CCreateFolderTest, ALinkToAFolderIsAFolder) {
    TestSupport::makeFolders(path("real"));
    TestSupport::makeLink("real", path("link"));
    FileSys::createFolder(path("link/inner"));
    EXPECT_EQ(listTree(path("real")), TNames{"inner"});
}

TEST_F(CCreateFolderTest, AFileInThePlaceOfTheFolderIsAFailure) {
    writeFile(path("file"), "text");
    expectRefused("file");
    EXPECT_EQ(readFile(path("file")), "text");
}

TEST_F(CCreateFolderTest, AFileInThePlaceOfAParentIsAFailure) {
    writeFile(path("file"), "text");
    expectRefused("file/inner");
    EXPECT_EQ(readFile(path("file")), "text");
}

TEST_F(CCreateFolderTest, TheEmptySpecificationIsNoFolder) {
    expectRefused("", errorText(EINVAL));
}

TEST_F(CCreateFolderTest, TheTextNamesTheFolderAndTheReason) {
    CSystemCalls calls;
    calls.fail("mkdir", EROFS);
    EXPECT_EQ(failureOf([&] { FileSys::createFolder(path("new")); }).message,
              L"Could not create folder " + wide(path("new")) + L": " + errorText(EROFS));
}

TEST_F(CCreateFolderTest, FoldersMadeBeforeAFailureStay) {
    CSystemCalls calls;
    calls.fail("mkdir", ENOSPC, 2);
    expectRefused(path("a/b"), errorText(ENOSPC));
    EXPECT_EQ(listTree(path()), TNames{"a"});
}

TEST_F(CCreateFolderTest, AFolderThatVanishesAtOnceFailsWithoutAReason) {
    CSystemCalls calls;
    // The library looks at the folder before it makes it, and the operation once more behind it.
    calls.observe([&](std::string const& function, std::string const& name) {
        if (function == "statx" && name == path("new") && pathExists(name))
            rmdir(name.c_str());
    });
    expectFailure(failureOf([&] { FileSys::createFolder(path("new")); }), "FileSpec",
                  Error::msgCouldNot, couldNot(L"create", L"folder", wide(path("new")), L""),
                  {"doCreateFolder", "createFolder"});
}

TEST_F(CCreateFolderTest, APathThatCannotBeAskedAboutFailsByThat) {
    expectPassedOn(failureOf([&] { FileSys::createFolder(path(std::string(300, 'n'))); }),
                   {"createFolder"});
}

TEST_F(CCreateFolderTest, AnOrdinaryUserIsRefused) {
    chmod(path().c_str(), 0555);
    runAsOrdinaryUser([&] { expectRefused(path("new"), errorText(EACCES)); });
    EXPECT_TRUE(listTree(path()).empty());
}

class CDeleteFileTest : public TestSupport::CFileRootTest {
  protected:
    void expectRefused(bool recursive, int error) const {
        expectFailure(
            failureOf([&] { FileSys::deleteFile(path("folder"), recursive); }), "FileSpec",
            Error::msgCouldNot,
            couldNot(L"delete", L"file or folder", wide(path("folder")), errorText(error)),
            {"doDeleteFile", "deleteFile"});
    }

    void makeTree() const {
        TestSupport::makeFolders(path("folder/sub"));
        writeFile(path("folder/a"), "a");
        writeFile(path("folder/sub/b"), "b");
    }

    TNames const wholeTree_{"folder", "folder/a", "folder/sub", "folder/sub/b"};
};

TEST_F(CDeleteFileTest, AFileGoesInEitherForm) {
    for (bool const recursive : {false, true}) {
        writeFile(path("file"));
        FileSys::deleteFile(path("file"), recursive);
        EXPECT_TRUE(listTree(path()).empty());
    }
}

TEST_F(CDeleteFileTest, AnEmptyFolderGoesInEitherForm) {
    for (bool const recursive : {false, true}) {
        TestSupport::makeFolders(path("folder"));
        FileSys::deleteFile(path("folder"), recursive);
        EXPECT_TRUE(listTree(path()).empty());
    }
}

TEST_F(CDeleteFileTest, AMissingPathIsNoFailure) {
    FileSys::deleteFile(path("missing"), false);
    FileSys::deleteFile(path("missing/deeper"), true);
    FileSys::deleteFile(CFileSpec(), true);
    EXPECT_TRUE(listTree(path()).empty());
}

TEST_F(CDeleteFileTest, AFolderWithAllInItGoesOnlyWhenAskedTo) {
    makeTree();
    expectRefused(false, ENOTEMPTY);
    EXPECT_EQ(listTree(path()), wholeTree_);
    FileSys::deleteFile(path("folder"), true);
    EXPECT_TRUE(listTree(path()).empty());
}

TEST_F(CDeleteFileTest, ALinkGoesAndItsTargetStays) {
    makeTree();
    TestSupport::makeLink("folder", path("link"));
    FileSys::deleteFile(path("link"), true);
    EXPECT_EQ(listTree(path()), wholeTree_);
}

TEST_F(CDeleteFileTest, LinksWithinATreeAreNotFollowed) {
    makeTree();
    writeFile(path("kept"), "kept");
    TestSupport::makeFolders(path("other"));
    writeFile(path("other/kept"), "kept");
    TestSupport::makeLink("../kept", path("folder/file link"));
    TestSupport::makeLink("../other", path("folder/folder link"));
    FileSys::deleteFile(path("folder"), true);
    EXPECT_EQ(listTree(path()), (TNames{"kept", "other", "other/kept"}));
}

// Such a link does not exist, by the question that comes first.
TEST_F(CDeleteFileTest, ALinkThatLeadsNowhereStays) {
    TestSupport::makeLink("missing", path("nowhere"));
    TestSupport::makeLink("loop", path("loop"));
    FileSys::deleteFile(path("nowhere"), true);
    FileSys::deleteFile(path("loop"), false);
    EXPECT_EQ(listTree(path()), (TNames{"loop", "nowhere"}));
}

TEST_F(CDeleteFileTest, AFifoGoesWithoutBeingOpened) {
    ASSERT_EQ(mkfifo(path("fifo").c_str(), 0600), 0);
    FileSys::deleteFile(path("fifo"), true);
    EXPECT_TRUE(listTree(path()).empty());
}

TEST_F(CDeleteFileTest, AFailureOfTheSystemIsTheReason) {
    makeTree();
    CSystemCalls calls;
    calls.fail("unlinkat", EBUSY);
    expectRefused(true, EBUSY);
    expectRefused(false, EBUSY);
    EXPECT_EQ(listTree(path()), wholeTree_);
}

TEST_F(CDeleteFileTest, AFolderThatCannotBeListedStays) {
    makeTree();
    for (char const* const function : {"openat", "fdopendir", "readdir"}) {
        CSystemCalls calls;
        calls.fail(function, EIO);
        expectRefused(true, EIO);
        EXPECT_GE(calls.count(function), 1U);
        EXPECT_EQ(listTree(path()), wholeTree_) << function;
    }
}

TEST_F(CDeleteFileTest, WhatComesBackAtOnceFailsWithoutAReason) {
    makeTree();
    CSystemCalls calls;
    calls.observe([&](std::string const& function, std::string const& name) {
        if (function == "statx" && name == path("folder"))
            TestSupport::makeFolders(name);
    });
    expectFailure(failureOf([&] { FileSys::deleteFile(path("folder"), true); }), "FileSpec",
                  Error::msgCouldNot,
                  couldNot(L"delete", L"file or folder", wide(path("folder")), L""),
                  {"doDeleteFile", "deleteFile"});
}

TEST_F(CDeleteFileTest, AFailureCountsThoughTheFileIsGone) {
    writeFile(path("file"));
    CSystemCalls calls;
    calls.fail("unlinkat", EIO);
    calls.observe([&](std::string const& function, std::string const& name) {
        if (function == "unlinkat")
            std::remove(name.c_str());
    });
    expectFailure(failureOf([&] { FileSys::deleteFile(path("file"), false); }), "FileSpec",
                  Error::msgCouldNot,
                  couldNot(L"delete", L"file or folder", wide(path("file")), errorText(EIO)),
                  {"doDeleteFile", "deleteFile"});
    EXPECT_FALSE(pathExists(path("file")));
}

TEST_F(CDeleteFileTest, APathThatCannotBeAskedAboutBehindItFailsByThat) {
    writeFile(path("file"));
    CSystemCalls calls;
    calls.observe([&](std::string const& function, std::string const&) {
        if (function == "unlinkat")
            calls.fail("statx", EIO);
    });
    expectPassedOn(failureOf([&] { FileSys::deleteFile(path("file"), false); }), {"deleteFile"});
    EXPECT_FALSE(pathExists(path("file")));
}

TEST_F(CDeleteFileTest, AnOrdinaryUserIsRefused) {
    makeTree();
    for (char const* const folder : {"folder/sub", "folder", ""})
        chmod(path(folder).c_str(), 0555);
    runAsOrdinaryUser([&] { expectRefused(true, EACCES); });
    EXPECT_EQ(listTree(path()), wholeTree_);
}

class CFileAttributesTest : public TestSupport::CFileRootTest {
  protected:
    void SetUp() override {
        CFileRootTest::SetUp();
        writeFile(path("file"));
    }
};

TEST_F(CFileAttributesTest, OnlyTheOwnersWriteBitChanges) {
    for (mode_t const mode : {0644U, 0666U, 0755U, 0070U, 0400U, 0U}) {
        ASSERT_EQ(chmod(path("file").c_str(), mode), 0);
        FileSys::setFileAttributes(path("file"), false, true);
        EXPECT_EQ(modeOf(path("file")), mode & ~0200U);
        FileSys::setFileAttributes(path("file"), false, false);
        EXPECT_EQ(modeOf(path("file")), mode | 0200U);
    }
}

TEST_F(CFileAttributesTest, HidingHasNoSayInThePermissions) {
    ASSERT_EQ(chmod(path("file").c_str(), 0604), 0);
    FileSys::setFileAttributes(path("file"), true, false);
    EXPECT_EQ(modeOf(path("file")), 0604U);
    FileSys::setFileAttributes(path("file"), true, true);
    EXPECT_EQ(modeOf(path("file")), 0404U);
    EXPECT_EQ(listTree(path()), TNames{"file"});
}

bool isHidden(std::string const& path) {
    return getxattr(path.c_str(), "user.hidden", nullptr, 0) > 0;
}

// The flag can be changed as long as the file can be written, and it comes before the permission.
TEST_F(CFileAttributesTest, TheFlagComesFirstAndItsRefusalIsNoFailure) {
    if (setxattr(path("file").c_str(), "user.qorn-probe", "1", 1, 0) != 0)
        GTEST_SKIP() << "the file system holds no extended attributes";
    runAsOrdinaryUser([&] {
        std::string const own = path("own");
        writeFile(own);
        FileSys::setFileAttributes(own, false, false);
        EXPECT_FALSE(isHidden(own));
        FileSys::setFileAttributes(own, true, true);
        EXPECT_TRUE(isHidden(own));
        EXPECT_EQ(modeOf(own) & 0200U, 0U);
        FileSys::setFileAttributes(own, false, false);
        EXPECT_TRUE(isHidden(own)) << "it could not be written yet";
        EXPECT_EQ(modeOf(own) & 0200U, 0200U);
        FileSys::setFileAttributes(own, false, false);
        EXPECT_FALSE(isHidden(own));
    });
}

TEST_F(CFileAttributesTest, AMissingFileFailsByItsPermissions) {
    expectPassedOn(failureOf([&] { FileSys::setFileAttributes(path("missing"), false, true); }),
                   {"setFileAttributes"});
}

TEST_F(CFileAttributesTest, AFailureOfTheSystemPasses) {
    CSystemCalls calls;
    calls.fail("chmod", EPERM);
    expectPassedOn(failureOf([&] { FileSys::setFileAttributes(path("file"), true, true); }),
                   {"setFileAttributes"});
    EXPECT_EQ(calls.count("chmod"), 1U);
}

using CCanOpenTest = TestSupport::CFileRootTest;

unsigned int modeBits(std::ios_base::openmode mode) {
    return static_cast<unsigned int>(mode);
}

constexpr std::ios_base::openmode in = std::ios_base::in;
constexpr std::ios_base::openmode out = std::ios_base::out;

TEST_F(CCanOpenTest, AFileThatIsThereStays) {
    writeFile(path("file"), "text");
    for (std::ios_base::openmode const mode : {in, in | out, out | std::ios_base::app}) {
        EXPECT_TRUE(FileSys::canOpen(path("file"), modeBits(mode)));
        EXPECT_EQ(readFile(path("file")), "text");
    }
}

TEST_F(CCanOpenTest, AModeThatTruncatesHasTruncated) {
    for (std::ios_base::openmode const mode : {out, out | std::ios_base::trunc}) {
        writeFile(path("file"), "text");
        EXPECT_TRUE(FileSys::canOpen(path("file"), modeBits(mode)));
        EXPECT_EQ(readFile(path("file")), "");
    }
}

TEST_F(CCanOpenTest, AFileThatTheAttemptMadeGoesAgain) {
    for (std::ios_base::openmode const mode :
         {out, out | std::ios_base::app, in | out | std::ios_base::trunc}) {
        EXPECT_TRUE(FileSys::canOpen(path("new"), modeBits(mode)));
        EXPECT_TRUE(listTree(path()).empty());
    }
}

// The attempt makes what the link leads to; what is removed is what was asked about.
TEST_F(CCanOpenTest, ALinkThatLedNowhereGoesAndItsTargetStays) {
    TestSupport::makeLink("target", path("link"));
    EXPECT_FALSE(FileSys::canOpen(path("link"), modeBits(in)));
    EXPECT_EQ(listTree(path()), TNames{"link"});
    EXPECT_TRUE(FileSys::canOpen(path("link"), modeBits(out)));
    EXPECT_EQ(listTree(path()), TNames{"target"});
}

TEST_F(CCanOpenTest, WhatCannotBeOpenedIsFalse) {
    EXPECT_FALSE(FileSys::canOpen(path("missing"), modeBits(in)));
    EXPECT_FALSE(FileSys::canOpen(path("missing"), modeBits(in | out)));
    EXPECT_FALSE(FileSys::canOpen(path("missing/file"), modeBits(out)));
    EXPECT_FALSE(FileSys::canOpen(path(), modeBits(out)));
    EXPECT_FALSE(FileSys::canOpen(CFileSpec(), modeBits(in)));
    EXPECT_TRUE(listTree(path()).empty());
}

TEST_F(CCanOpenTest, AModeThatNoStreamKnowsIsFalse) {
    writeFile(path("file"), "text");
    EXPECT_FALSE(FileSys::canOpen(path("file"), 0));
    EXPECT_FALSE(FileSys::canOpen(path("file"), modeBits(in | std::ios_base::trunc)));
    EXPECT_EQ(readFile(path("file")), "text");
}

TEST_F(CCanOpenTest, AFileThatCannotBeRemovedAgainIsAFailure) {
    CSystemCalls calls;
    calls.fail("unlinkat", EBUSY);
    expectFailure(failureOf([&] { FileSys::canOpen(path("new"), modeBits(out)); }), "FileSpec",
                  Error::msgCouldNot,
                  couldNot(L"delete", L"file or folder", wide(path("new")), errorText(EBUSY)),
                  {"doDeleteFile", "deleteFile", "canOpen"});
    EXPECT_EQ(listTree(path()), TNames{"new"});
}

TEST_F(CCanOpenTest, AnOrdinaryUserIsRefused) {
    writeFile(path("file"), "text");
    chmod(path("file").c_str(), 0444);
    chmod(path().c_str(), 0555);
    runAsOrdinaryUser([&] {
        EXPECT_TRUE(FileSys::canOpen(path("file"), modeBits(in)));
        EXPECT_FALSE(FileSys::canOpen(path("file"), modeBits(out)));
        EXPECT_FALSE(FileSys::canOpen(path("new"), modeBits(out)));
    });
    EXPECT_EQ(readFile(path("file")), "text");
}

using CCanReadTest = TestSupport::CFileRootTest;

TEST_F(CCanReadTest, FilesAndFoldersThatAreThere) {
    writeFile(path("file"));
    EXPECT_TRUE(FileSys::canRead(path("file")));
    EXPECT_TRUE(FileSys::canRead(path()));
    EXPECT_FALSE(FileSys::canRead(path("missing")));
    EXPECT_FALSE(FileSys::canRead(CFileSpec()));
}

TEST_F(CCanReadTest, TheSystemDecides) {
    writeFile(path("file"));
    CSystemCalls calls;
    calls.fail("access", EACCES);
    EXPECT_FALSE(FileSys::canRead(path("file")));
    EXPECT_FALSE(FileSys::canRead(path("missing")));
    EXPECT_EQ(calls.count("access"), 1U);
}

TEST_F(CCanReadTest, WritingAloneIsNotEnough) {
    writeFile(path("file"));
    chmod(path("file").c_str(), 0222);
    runAsOrdinaryUser([&] { EXPECT_FALSE(FileSys::canRead(path("file"))); });
}

} // namespace
