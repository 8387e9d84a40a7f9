// Moving and renaming, within a volume and across.

#include "1Base/Error/ErrorMacros.h"
#include "2System/FileSys/FileSysOperations.h"
#include "2System/FileSys/_Imp/FileSysOperationsImp.h"

#include "2System/FileSys/FileSysStatusHook.h"
#include "support/FileFailures.h"
#include "support/FileRoot.h"
#include "support/LogRecorder.h"
#include "support/SystemCalls.h"

#include <gtest/gtest.h>

#include <sys/mount.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>
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
using TestSupport::makeFolders;
using TestSupport::makeLink;
using TestSupport::readFile;
using TestSupport::wide;
using TestSupport::writeFile;
using TestSupport::wrongFile;

using TNames = std::vector<std::string>;

class CMoveFileTest : public TestSupport::CFileRootTest {
  protected:
    void SetUp() override {
        CFileRootTest::SetUp();
        writeFile(path("from"), "new text");
    }

    void move(std::string const& from, std::string const& to, bool overwrite) const {
        FileSys::moveFile(path(from), path(to), overwrite);
    }

    // The text that names both ends of a move.
    Strings::string bothOf(std::string const& from, std::string const& to) const {
        return wide(path(from) + ", " + path(to));
    }

    void makeTree() const {
        makeFolders(path("tree/sub"));
        writeFile(path("tree/a"), "a");
        writeFile(path("tree/sub/b"), "b");
    }
};

TEST_F(CMoveFileTest, AFileStandsAtItsNewPlaceOnly) {
    move("from", "to", false);
    EXPECT_EQ(listTree(path()), TNames{"to"});
    EXPECT_EQ(readFile(path("to")), "new text");
}

TEST_F(CMoveFileTest, MissingFoldersAreMade) {
    move("from", "a/b/to", false);
    EXPECT_EQ(listTree(path()), (TNames{"a", "a/b", "a/b/to"}));
}

TEST_F(CMoveFileTest, AFileGoesToAFolderUnderItsName) {
    FileSys::moveFileToFolder(path("from"), path("a"), false);
    EXPECT_EQ(readFile(path("a/from")), "new text");
    writeFile(path("from"), "newer");
    expectFailure(failureOf([&] { FileSys::moveFileToFolder(path("from"), path("a"), false); }),
                  "OSFile", Error::msgWrongArgument,
                  wrongFile(wide(path("a/from")), L"already exists"),
                  {"moveFile", "moveFileToFolder"});
    FileSys::moveFileToFolder(path("from"), path("a/"), true);
    EXPECT_EQ(readFile(path("a/from")), "newer");
}

TEST_F(CMoveFileTest, ATargetWithoutAFolderIsMovedIntoTheWorkingFolder) {
    ASSERT_EQ(chdir(path().c_str()), 0);
    FileSys::moveFile(CFileSpec(L"from"), CFileSpec(L"to"), false);
    EXPECT_EQ(listTree(path()), TNames{"to"});
}

// A folder's parent is made whatever its text is, and the empty one can't be made.
TEST_F(CMoveFileTest, AFolderNeedsATargetWithAFolder) {
    makeTree();
    ASSERT_EQ(chdir(path().c_str()), 0);
    expectFailure(failureOf([] { FileSys::moveFile(CFileSpec(L"tree"), CFileSpec(L"to"), false); }),
                  "FileSpec", Error::msgCouldNot,
                  couldNot(L"create", L"folder", L"", errorText(EINVAL)),
                  {"doCreateFolder", "createFolder", "moveFile"});
    EXPECT_EQ(readFile(path("tree/sub/b")), "b");
    FileSys::moveFile(CFileSpec(L"tree"), CFileSpec(L"./to"), false);
    EXPECT_EQ(readFile(path("to/sub/b")), "b");
}

TEST_F(CMoveFileTest, AFolderIsMovedWithAllInIt) {
    makeTree();
    move("tree", "x/y", false);
    EXPECT_EQ(listTree(path()), (TNames{"from", "x", "x/y", "x/y/a", "x/y/sub", "x/y/sub/b"}));
}

TEST_F(CMoveFileTest, AFileOntoItselfStays) {
    move("from", "from", true);
    move("from", "from", false);
    EXPECT_EQ(readFile(path("from")), "new text");
}

TEST_F(CMoveFileTest, AMissingSourceIsAFailureAndLeavesTheTarget) {
    writeFile(path("to"), "old");
    expectFailure(failureOf([&] { move("missing", "to", true); }), "OSFile",
                  Error::msgWrongArgument, wrongFile(wide(path("missing")), L"does not exist"),
                  {"moveFile"});
    EXPECT_EQ(readFile(path("to")), "old");
}

TEST_F(CMoveFileTest, AMissingSourceIsAFailureOntoItselfToo) {
    expectFailure(failureOf([&] { move("missing", "missing", true); }), "OSFile",
                  Error::msgWrongArgument, wrongFile(wide(path("missing")), L"does not exist"),
                  {"moveFile"});
    EXPECT_EQ(failureOf([] { FileSys::moveFile(CFileSpec(), CFileSpec(), true); }).message,
              L"Argument file  is wrong: does not exist");
}

TEST_F(CMoveFileTest, ALinkThatLeadsNowhereDoesNotExist) {
    makeLink("missing", path("nowhere"));
    makeLink("loop", path("loop"));
    for (char const* const name : {"nowhere", "loop"})
        EXPECT_EQ(failureOf([&] { move(name, "to", true); }).parameters,
                  wrongFile(wide(path(name)), L"does not exist"));
    EXPECT_EQ(listTree(path()), (TNames{"from", "loop", "nowhere"}));
}

TEST_F(CMoveFileTest, AFileThatIsThereIsAFailureUnlessToldOtherwise) {
    writeFile(path("to"), "old");
    expectFailure(failureOf([&] { move("from", "to", false); }), "OSFile", Error::msgWrongArgument,
                  wrongFile(wide(path("to")), L"already exists"), {"moveFile"});
    EXPECT_EQ(readFile(path("to")), "old");
    EXPECT_EQ(readFile(path("from")), "new text");
    move("from", "to", true);
    EXPECT_EQ(readFile(path("to")), "new text");
}

TEST_F(CMoveFileTest, ATreeInTheTargetsPlaceIsDeletedFirst) {
    makeTree();
    move("from", "tree", true);
    EXPECT_EQ(listTree(path()), TNames{"tree"});
    EXPECT_EQ(readFile(path("tree")), "new text");
}

TEST_F(CMoveFileTest, AHandlerForFileSpecificationsTakesTheSpecialChainToo) {
    try {
        move("missing", "to", false);
        FAIL();
    } catch (FileSys::TExcFileSpec const& exc) {
        EXPECT_STREQ(exc.getExcName(), "OSFile");
        EXPECT_NE(dynamic_cast<FileSys::TExcFileSys const*>(&exc), nullptr);
        EXPECT_NE(dynamic_cast<TExcSystem const*>(&exc), nullptr);
    }
}

TEST_F(CMoveFileTest, AFifoIsMovedWithoutBeingOpened) {
    ASSERT_EQ(mkfifo(path("fifo").c_str(), 0600), 0);
    move("fifo", "to", false);
    EXPECT_EQ(listTree(path()), (TNames{"from", "to"}));
}

TEST_F(CMoveFileTest, ALinkIsMovedAsTheLink) {
    makeFolders(path("a"));
    makeLink("from", path("link"));
    move("link", "other", false);
    char target[8] = {};
    EXPECT_EQ(readlink(path("other").c_str(), target, sizeof(target)), 4);
    EXPECT_STREQ(target, "from");
}

// The texts differ, so that the source goes as the target: for good.
TEST_F(CMoveFileTest, AFileOntoItselfUnderAnotherTextFailsAndIsLost) {
    EXPECT_EQ(failureOf([&] { move("from", "./from", true); }).parameters,
              couldNot(L"move", L"file", bothOf("from", "./from"), errorText(ENOENT)));
    EXPECT_TRUE(listTree(path()).empty());
}

// What a failure leaves behind, step by step.

TEST_F(CMoveFileTest, WhereTheTargetCannotBeDeletedTheSourceIsWhole) {
    makeTree();
    CSystemCalls calls;
    calls.fail("unlinkat", EBUSY, 2);
    expectFailure(failureOf([&] { move("from", "tree", true); }), "FileSpec", Error::msgCouldNot,
                  couldNot(L"delete", L"file or folder", wide(path("tree")), errorText(EBUSY)),
                  {"doDeleteFile", "deleteFile", "moveFile"});
    EXPECT_EQ(readFile(path("from")), "new text");
    // One of the tree's three entries went before the failure.
    EXPECT_EQ(listTree(path()).size(), 4U);
    EXPECT_EQ(calls.count("rename"), 0U);
}

TEST_F(CMoveFileTest, WhereTheFolderCannotBeMadeTheFoldersSoFarStay) {
    CSystemCalls calls;
    calls.fail("mkdir", ENOSPC, 2);
    expectFailure(failureOf([&] { move("from", "a/b/to", true); }), "FileSpec", Error::msgCouldNot,
                  couldNot(L"create", L"folder", wide(path("a/b")), errorText(ENOSPC)),
                  {"doCreateFolder", "createFolder", "moveFile"});
    EXPECT_EQ(listTree(path()), (TNames{"a", "from"}));
    EXPECT_EQ(readFile(path("from")), "new text");
}

TEST_F(CMoveFileTest, WhereTheFolderCannotBeMadeTheTargetIsGone) {
    makeFolders(path("a"));
    writeFile(path("a/to"), "old");
    CSystemCalls calls;
    calls.fail("mkdir", EROFS);
    // The folder vanishes with the old target.
    calls.observe([&](std::string const& function, std::string const& name) {
        if (function == "statx" && name == path("a"))
            rmdir(name.c_str());
    });
    EXPECT_EQ(failureOf([&] { move("from", "a/to", true); }).parameters,
              couldNot(L"create", L"folder", wide(path("a")), errorText(EROFS)));
    EXPECT_EQ(listTree(path()), TNames{"from"});
    EXPECT_EQ(readFile(path("from")), "new text");
}

TEST_F(CMoveFileTest, WhereTheRenameFailsTheTargetIsGoneAndTheSourceWhole) {
    writeFile(path("to"), "old");
    CSystemCalls calls;
    calls.fail("rename", EIO);
    expectFailure(failureOf([&] { move("from", "to", true); }), "FileSpec", Error::msgCouldNot,
                  couldNot(L"move", L"file", bothOf("from", "to"), errorText(EIO)),
                  {"doMoveFile", "moveFile"});
    EXPECT_EQ(listTree(path()), TNames{"from"});
    EXPECT_EQ(readFile(path("from")), "new text");
}

TEST_F(CMoveFileTest, AFolderIntoItselfIsAFailure) {
    makeTree();
    EXPECT_EQ(failureOf([&] { move("tree", "tree/sub/to", false); }).parameters,
              couldNot(L"move", L"file", bothOf("tree", "tree/sub/to"), errorText(EINVAL)));
    EXPECT_EQ(listTree(path("tree")), (TNames{"a", "sub", "sub/b"}));
}

TEST_F(CMoveFileTest, AFolderThatIsAskedToReplaceWhatItLiesInIsLostWithIt) {
    makeTree();
    EXPECT_EQ(failureOf([&] { move("tree/sub", "tree", true); }).parameters,
              couldNot(L"move", L"file", bothOf("tree/sub", "tree"), errorText(ENOENT)));
    EXPECT_EQ(listTree(path()), TNames{"from"});
}

TEST_F(CMoveFileTest, AFileInTheFoldersPlaceIsAFailure) {
    writeFile(path("file"), "text");
    EXPECT_EQ(failureOf([&] { move("from", "file/sub/to", true); }).parameters,
              couldNot(L"create", L"folder", wide(path("file/sub")),
                       TestSupport::reasonOfNoFolder(path("file/sub"))));
    EXPECT_EQ(readFile(path("from")), "new text");
    EXPECT_EQ(readFile(path("file")), "text");
}

TEST_F(CMoveFileTest, ANameThatIsTooLongIsAFailure) {
    std::string const name(256, 'n');
    EXPECT_EQ(failureOf([&] { move("from", name, true); }).parameters,
              couldNot(L"move", L"file", bothOf("from", name), errorText(ENAMETOOLONG)));
    EXPECT_EQ(listTree(path()), TNames{"from"});
}

TEST_F(CMoveFileTest, AnOrdinaryUserIsRefused) {
    makeFolders(path("open"));
    chmod(path("open").c_str(), 0777);
    chmod(path().c_str(), 0555);
    runAsOrdinaryUser([&] {
        EXPECT_EQ(failureOf([&] { move("from", "open/to", false); }).parameters,
                  couldNot(L"move", L"file", bothOf("from", "open/to"), errorText(EACCES)));
    });
    EXPECT_EQ(listTree(path()), (TNames{"from", "open"}));
}

// Across volumes, as the system reports it.

class CMoveAcrossVolumesTest : public CMoveFileTest {
  protected:
    void SetUp() override {
        CMoveFileTest::SetUp();
        calls_.fail("rename", EXDEV);
    }

    CSystemCalls& calls() { return calls_; }

  private:
    CSystemCalls calls_;
};

TEST_F(CMoveAcrossVolumesTest, AFileIsCopiedAndDeleted) {
    chmod(path("from").c_str(), 0640);
    move("from", "a/to", false);
    EXPECT_EQ(listTree(path()), (TNames{"a", "a/to"}));
    EXPECT_EQ(readFile(path("a/to")), "new text");
    struct stat status;
    ASSERT_EQ(stat(path("a/to").c_str(), &status), 0);
    EXPECT_EQ(status.st_mode & 07777U, 0640U);
}

TEST_F(CMoveAcrossVolumesTest, AFolderIsRefusedAndWhole) {
    makeTree();
    expectFailure(failureOf([&] { move("tree", "to", false); }), "FileSpec", Error::msgCouldNot,
                  couldNot(L"copy", L"file", bothOf("tree", "to"), errorText(ENOSYS)),
                  {"doCopyFile", "doMoveFile", "moveFile"});
    EXPECT_EQ(listTree(path()), (TNames{"from", "tree", "tree/a", "tree/sub", "tree/sub/b"}));
}

TEST_F(CMoveAcrossVolumesTest, AFailedCopyLeavesTheSourceWhole) {
    writeFile(path("to"), "old");
    calls().fail("open", EMFILE);
    expectFailure(failureOf([&] { move("from", "to", true); }), "FileSpec", Error::msgCouldNot,
                  couldNot(L"copy", L"file", bothOf("from", "to"), errorText(EMFILE)),
                  {"doCopyFile", "doMoveFile", "moveFile"});
    EXPECT_EQ(listTree(path()), TNames{"from"});
    EXPECT_EQ(readFile(path("from")), "new text");
}

TEST_F(CMoveAcrossVolumesTest, ACopyThatEndsHalfWayLeavesTheSourceWhole) {
    std::string const content(300000, 'c');
    writeFile(path("from"), content);
    calls().fail("copy_file_range", ENOSYS);
    calls().fail("sendfile", ENOSYS);
    calls().fail("write", ENOSPC, 2);
    EXPECT_EQ(failureOf([&] { move("from", "to", true); }).parameters,
              couldNot(L"copy", L"file", bothOf("from", "to"), errorText(ENOSPC)));
    EXPECT_EQ(readFile(path("from")), content);
    EXPECT_LT(readFile(path("to")).size(), content.size());
}

TEST_F(CMoveAcrossVolumesTest, AFailedDeleteLeavesBothAndSaysSo) {
    calls().fail("unlinkat", EBUSY);
    expectFailure(failureOf([&] { move("from", "to", false); }), "FileSpec", Error::msgCouldNot,
                  couldNot(L"delete", L"file or folder", wide(path("from")), errorText(EBUSY)),
                  {"doDeleteFile", "deleteFile", "doMoveFile", "moveFile"});
    EXPECT_EQ(readFile(path("from")), "new text");
    EXPECT_EQ(readFile(path("to")), "new text");
}

// And as it is, on two volumes.

class CMoveToOtherVolumeTest : public CMoveFileTest {
  protected:
    void moveTo(TestSupport::CSecondVolume const& volume, std::string const& name,
                bool overwrite) const {
        FileSys::moveFile(path("from"), volume.path(name), overwrite);
    }
};

TEST_F(CMoveToOtherVolumeTest, AFileArrives) {
    TestSupport::CSecondVolume const volume(path());
    if (!volume.isThere())
        GTEST_SKIP() << volume.reason();
    moveTo(volume, "a/to", false);
    EXPECT_EQ(readFile(volume.path("a/to")), "new text");
    EXPECT_TRUE(listTree(path()).empty());
    FileSys::moveFile(volume.path("a/to"), path("from"), false);
    EXPECT_EQ(readFile(path("from")), "new text");
    EXPECT_EQ(listTree(volume.path()), TNames{"a"});
}

TEST_F(CMoveToOtherVolumeTest, AFolderIsRefusedAndWhole) {
    TestSupport::CSecondVolume const volume(path());
    if (!volume.isThere())
        GTEST_SKIP() << volume.reason();
    makeTree();
    EXPECT_EQ(
        failureOf([&] { FileSys::moveFile(path("tree"), volume.path("to"), false); }).parameters,
        couldNot(L"copy", L"file", wide(path("tree") + ", " + volume.path("to")),
                 errorText(ENOSYS)));
    EXPECT_EQ(listTree(path("tree")), (TNames{"a", "sub", "sub/b"}));
    EXPECT_TRUE(listTree(volume.path()).empty());
}

TEST_F(CMoveToOtherVolumeTest, AFullVolumeLeavesTheSourceWhole) {
    makeFolders(path("small"));
    if (mount("none", path("small").c_str(), "tmpfs", 0, "size=64k") != 0)
        GTEST_SKIP() << "no small volume can be mounted: " << std::strerror(errno);
    std::string const content(300000, 'c');
    writeFile(path("from"), content);
    CFileFailure const failure = failureOf([&] { move("from", "small/to", false); });
    EXPECT_EQ(readFile(path("from")), content);
    EXPECT_LT(readFile(path("small/to")).size(), content.size());
    EXPECT_EQ(umount(path("small").c_str()), 0);
    EXPECT_EQ(failure.parameters,
              couldNot(L"copy", L"file", bothOf("from", "small/to"), errorText(ENOSPC)));
}

// The handler for the special chain, which none of the steps that it guards raises by itself.

class CMoveHandlerTest : public CMoveFileTest {
  protected:
    void SetUp() override {
        CMoveFileTest::SetUp();
        makeTree();
        askInstead = [] {
            char const* const text = "made up";
            ERROR_THROW(FileSys::Detail::TExcOSFile, Error::msgInternalError, ERROR_PARAM(text));
        };
    }
};

TEST_F(CMoveHandlerTest, AMoveThatFailsBySpecialChainBecomesACopy) {
    move("tree", "x/to", false);
    EXPECT_FALSE(askInstead);
    EXPECT_EQ(listTree(path()), (TNames{"from", "x", "x/to", "x/to/a", "x/to/sub", "x/to/sub/b"}));
    EXPECT_EQ(readFile(path("x/to/sub/b")), "b");
}

TEST_F(CMoveHandlerTest, ACopyThatFailsThereLeavesTheSourceWhole) {
    CSystemCalls calls;
    calls.fail("open", EMFILE);
    EXPECT_EQ(failureOf([&] { move("tree", "x/to", false); }).trace,
              (TNames{"doCopyFile", "copyFile", "doCopyFolder", "copyFile", "moveFile"}));
    EXPECT_EQ(listTree(path("tree")), (TNames{"a", "sub", "sub/b"}));
}

TEST_F(CMoveHandlerTest, AnyOtherFailurePasses) {
    askInstead = [] { ERROR_THROW(FileSys::TExcFileSysOp, Error::msgAccessConflict); };
    EXPECT_EQ(failureOf([&] { move("tree", "x/to", false); }).name, "FileSysOp");
    // It stands in a question that only a folder brings which has to be made.
    askInstead = [] { ERROR_THROW(FileSys::TExcFileSpec, Error::msgAccessConflict); };
    EXPECT_EQ(failureOf([&] { move("tree", "y/to", false); }).name, "FileSpec");
    EXPECT_EQ(listTree(path("tree")), (TNames{"a", "sub", "sub/b"}));
}

// Renaming by type.

class CSetFileTypeTest : public TestSupport::CFileRootTest {
  protected:
    void SetUp() override {
        CFileRootTest::SetUp();
        writeFile(path("a.txt"), "text");
    }

    std::string setType(std::string const& name, wchar_t const* type) const {
        return FileSys::setFileType(path(name), type).getFullName<std::string>(false);
    }
};

TEST_F(CSetFileTypeTest, TheFileGetsTheExtension) {
    EXPECT_EQ(setType("a.txt", L"pdf"), path("a.pdf"));
    EXPECT_EQ(listTree(path()), TNames{"a.pdf"});
    EXPECT_EQ(readFile(path("a.pdf")), "text");
}

TEST_F(CSetFileTypeTest, AFileWithoutOneGetsItToo) {
    writeFile(path("b"));
    EXPECT_EQ(setType("b", L"x"), path("b.x"));
    EXPECT_EQ(listTree(path()), (TNames{"a.txt", "b.x"}));
}

TEST_F(CSetFileTypeTest, AnEmptyTypeRenamesNothing) {
    EXPECT_EQ(setType("a.txt", L""), path("a.txt"));
    EXPECT_EQ(listTree(path()), TNames{"a.txt"});
}

TEST_F(CSetFileTypeTest, TheSameTypeRenamesNothing) {
    CSystemCalls calls;
    EXPECT_EQ(setType("a.txt", L"txt"), path("a.txt"));
    EXPECT_EQ(calls.count("rename"), 0U);
}

TEST_F(CSetFileTypeTest, ABareNameIsRenamedInTheWorkingFolder) {
    ASSERT_EQ(chdir(path().c_str()), 0);
    EXPECT_EQ(FileSys::setFileType(CFileSpec(L"a.txt"), L"pdf").getFullName(false), L"a.pdf");
    EXPECT_EQ(listTree(path()), TNames{"a.pdf"});
}

TEST_F(CSetFileTypeTest, AFileThatIsThereIsNeverOverwritten) {
    writeFile(path("a.pdf"), "old");
    expectFailure(failureOf([&] { setType("a.txt", L"pdf"); }), "OSFile", Error::msgWrongArgument,
                  wrongFile(wide(path("a.pdf")), L"already exists"),
                  {"moveFile", "doRenameFile", "setFileType"});
    EXPECT_EQ(readFile(path("a.pdf")), "old");
    EXPECT_EQ(readFile(path("a.txt")), "text");
}

TEST_F(CSetFileTypeTest, AMissingFileIsAFailure) {
    for (wchar_t const* const type : {L"pdf", L""}) {
        CFileFailure const failure =
            failureOf([&] { FileSys::setFileType(path("missing"), type); });
        expectFailure(
            failure, "FileSpec", Error::msgCouldNot,
            couldNot(L"set file type for", L"file", wide(path("missing")), L"unknown error"),
            {"setFileType"});
        EXPECT_EQ(failure.message, L"Could not set file type for file " + wide(path("missing")) +
                                       L": unknown error");
    }
}

TEST_F(CSetFileTypeTest, AFolderIsAFailure) {
    makeFolders(path("folder"));
    expectFailure(failureOf([&] { setType("folder", L""); }), "FileSpec", Error::msgCouldNot,
                  couldNot(L"set file type for", L"file spec", wide(path("folder")),
                           L"file spec is a folder"),
                  {"setFileType"});
    EXPECT_EQ(listTree(path()), (TNames{"a.txt", "folder"}));
}

TEST_F(CSetFileTypeTest, WhatItHasToSayIsFiltered) {
    TestSupport::CLogRecorder const recorder;
    TestSupport::CInstalledTarget<Error::TTgtLogger, Error::TSevDebug> const logger(recorder);
    TestSupport::CInstalledTarget<Error::TTgtDebugger, Error::TSevDebug> const debugger(recorder);
    setType("a.txt", L"pdf");
    EXPECT_TRUE(recorder.records().empty());
}

TEST_F(CSetFileTypeTest, AFailedRenameLeavesTheFile) {
    CSystemCalls calls;
    calls.fail("rename", EIO);
    EXPECT_EQ(failureOf([&] { setType("a.txt", L"pdf"); }).trace,
              (TNames{"doMoveFile", "moveFile", "doRenameFile", "setFileType"}));
    EXPECT_EQ(listTree(path()), TNames{"a.txt"});
}

} // namespace
