// Temporary files and folders, and their owner.

#include "2System/FileSys/FileSysTempFile.h"

#include "support/FileFailures.h"
#include "support/FileRoot.h"
#include "support/LogRecorder.h"
#include "support/SystemCalls.h"

#include <gtest/gtest.h>

#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <string>
#include <tuple>
#include <vector>

namespace {

using FileSys::CFileSpec;
using FileSys::CTempFile;
using TestSupport::CFileFailure;
using TestSupport::CSystemCalls;
using TestSupport::expectFailure;
using TestSupport::failureOf;
using TestSupport::listTree;
using TestSupport::makeFolders;
using TestSupport::pathExists;
using TestSupport::wide;
using TestSupport::writeFile;

using TNames = std::vector<std::string>;

std::string textOf(CFileSpec const& spec) {
    return spec.getFullName<std::string>(false);
}

// Whether `text` is `start` and six characters of those that unique names are made of.
testing::AssertionResult isUnique(std::string const& text, std::string const& start) {
    bool const fits = text.size() == start.size() + 6 &&
                      text.compare(0, start.size(), start) == 0 &&
                      text.find_first_not_of("0123456789ABCDEFGHIJKLMNOPQRSTUVWXYZ"
                                             "abcdefghijklmnopqrstuvwxyz",
                                             start.size()) == std::string::npos &&
                      text.substr(start.size()) != "XXXXXX";
    return (fits ? testing::AssertionSuccess() : testing::AssertionFailure())
           << text << " against " << start;
}

struct stat statusOf(std::string const& path) {
    struct stat status = {};
    EXPECT_EQ(lstat(path.c_str(), &status), 0) << path;
    return status;
}

class CTemporaryTest : public TestSupport::CFileRootTest {
  protected:
    std::string const& temporary() const { return temporary_; }

    void setTemporary(std::string const& folder) {
        root().environment().set("TMPDIR", folder);
        temporary_ = folder;
    }

    static std::string makeFile(std::string const& hint) {
        return textOf(FileSys::createTempFile(hint));
    }
    static std::string makeFolder(std::string const& hint) {
        return textOf(FileSys::createTempFolder(hint));
    }

  private:
    std::string temporary_ = root().temporary();
};

using CGetTempPathNameTest = CTemporaryTest;

TEST_F(CGetTempPathNameTest, TheVariableIsTheFolderAsItStands) {
    for (char const* const folder : {"/tmp/a b/", "relative", "", "/missing/caf\u00E9"}) {
        setTemporary(folder);
        EXPECT_EQ(textOf(FileSys::getTempPathName()), folder);
    }
}

TEST_F(CGetTempPathNameTest, WithoutTheVariableTheSystemsFolderIs) {
    root().environment().unset("TMPDIR");
    EXPECT_EQ(FileSys::getTempPathName(), CFileSpec(L"/tmp/"));
}

TEST_F(CGetTempPathNameTest, AVariableThatIsNoTextIsAFailure) {
    setTemporary("/tmp/\xFF");
    EXPECT_EQ(failureOf([] { FileSys::getTempPathName(); }).name, "Encoding");
}

using CCreateTempFileTest = CTemporaryTest;

TEST_F(CCreateTempFileTest, WithoutAHintTheFileLiesInTheTemporaryFolder) {
    std::string const file = makeFile("");
    EXPECT_TRUE(isUnique(file, temporary() + "/"));
    struct stat const status = statusOf(file);
    EXPECT_TRUE(S_ISREG(status.st_mode));
    EXPECT_EQ(status.st_mode & 07777U, 0644U);
    EXPECT_EQ(status.st_size, 0);
}

TEST_F(CCreateTempFileTest, AFolderAsAHintHoldsTheFile) {
    EXPECT_TRUE(isUnique(makeFile(path()), path() + "/"));
    EXPECT_TRUE(isUnique(makeFile(path() + "/"), path() + "//"));
}

TEST_F(CCreateTempFileTest, ANameAsAHintGivesItsFolderAndNothingOfItself) {
    EXPECT_TRUE(isUnique(makeFile(path("name.txt")), path() + "/"));
    writeFile(path("there"));
    EXPECT_TRUE(isUnique(makeFile(path("there")), path() + "/"));
    EXPECT_EQ(listTree(path()).size(), 3U);
}

TEST_F(CCreateTempFileTest, AHintWhoseFolderIsMissingGivesTheTemporaryFolder) {
    writeFile(path("file"));
    for (std::string const& hint : {path("missing/name.txt"), path("file/name"),
                                    std::string("bare name"), std::string("missing/")})
        EXPECT_TRUE(isUnique(makeFile(hint), temporary() + "/")) << hint;
    EXPECT_EQ(listTree(path()), TNames{"file"});
}

TEST_F(CCreateTempFileTest, ARelativeHintIsTakenFromTheWorkingFolder) {
    makeFolders(path("sub"));
    ASSERT_EQ(chdir(path().c_str()), 0);
    EXPECT_TRUE(isUnique(makeFile("sub"), "sub/"));
    EXPECT_TRUE(isUnique(makeFile("sub/name"), "sub/"));
    EXPECT_EQ(listTree(path("sub")).size(), 2U);
}

TEST_F(CCreateTempFileTest, TheMaskHasNoSayInThePermissions) {
    for (mode_t const mask : {0U, 022U, 077U, 0777U}) {
        mode_t const before = umask(mask);
        std::string const file = makeFile("");
        umask(before);
        EXPECT_EQ(statusOf(file).st_mode & 07777U, 0644U) << mask;
    }
}

TEST_F(CCreateTempFileTest, AFailureToOpenThePermissionsIsIgnored) {
    CSystemCalls calls;
    calls.fail("fchmod", EPERM);
    EXPECT_EQ(statusOf(makeFile("")).st_mode & 07777U, 0600U);
}

TEST_F(CCreateTempFileTest, NoDescriptorIsLeftOpen) {
    int const next = dup(0);
    close(next);
    makeFile("");
    int const after = dup(0);
    close(after);
    EXPECT_EQ(after, next);
}

TEST_F(CCreateTempFileTest, AnyTemporaryFolderWillDo) {
    ASSERT_EQ(chdir(path().c_str()), 0);
    makeFolders(path("with blanks/caf\u00E9 \U0001F600"));
    for (std::string const& folder :
         {path("with blanks/caf\u00E9 \U0001F600"), path("with blanks/"),
          std::string("with blanks"), std::string(".")}) {
        setTemporary(folder);
        std::string const file = makeFile("");
        EXPECT_TRUE(isUnique(file, folder + "/"));
        EXPECT_TRUE(pathExists(file));
    }
}

// The failure of a call: which, with what argument, from where. The argument is what the call has
// left of it, which may be the last name that was tried.
void expectRefused(CFileFailure const& failure, std::string const& function,
                   std::string const& pattern, std::string const& inner, std::string const& outer) {
    ASSERT_EQ(failure.parameters.size(), 3U);
    Strings::string const args = failure.parameters[2].second;
    std::string const mark = "XXXXXX";
    bool const isWhole = pattern.size() > mark.size() &&
                         pattern.compare(pattern.size() - mark.size(), mark.size(), mark) == 0;
    std::size_t const fixed = wide(pattern).size() - (isWhole ? mark.size() : 0);
    EXPECT_EQ(args.size(), wide(pattern).size());
    EXPECT_EQ(args.substr(0, fixed), wide(pattern).substr(0, fixed));
    expectFailure(failure, "OSFile", Error::msgOSCallArgs,
                  {{"function", wide(function)}, {"error", L"unknown error"}, {"args", args}},
                  {inner, outer});
    EXPECT_EQ(failure.message,
              L"Error in OS call " + wide(function) + L"(" + args + L"): unknown error");
}

void expectFileRefused(std::string const& hint, std::string const& pattern) {
    expectRefused(failureOf([&] { FileSys::createTempFile(hint); }), "mkstemp", pattern,
                  "doCreateTempFile", "createTempFile");
}

TEST_F(CCreateTempFileTest, AMissingTemporaryFolderIsAFailure) {
    for (char const* const folder : {"/missing", "/missing/", "missing \u00E9"}) {
        setTemporary(folder);
        expectFileRefused("", std::string(folder) + "/XXXXXX");
    }
}

TEST_F(CCreateTempFileTest, AFileAsTheTemporaryFolderIsAFailure) {
    writeFile(path("file"));
    setTemporary(path("file"));
    expectFileRefused("", path("file") + "/XXXXXX");
}

// An empty variable is a folder like any other: its files would lie in the root.
TEST_F(CCreateTempFileTest, AnEmptyTemporaryFolderIsTheRoot) {
    setTemporary("");
    CSystemCalls calls;
    calls.fail("mkstemp", EACCES);
    std::string asked;
    calls.observe([&](std::string const& function, std::string const& name) {
        if (function == "mkstemp")
            asked = name;
    });
    expectFileRefused("", "/XXXXXX");
    EXPECT_EQ(asked, "/XXXXXX");
}

TEST_F(CCreateTempFileTest, AFailedCallIsStillFollowedByTheOther) {
    CSystemCalls calls;
    calls.fail("mkstemp", EMFILE);
    expectFileRefused(path(), path() + "/XXXXXX");
    EXPECT_EQ(calls.count("mkstemp"), 1U);
    EXPECT_EQ(calls.count("fchmod"), 1U);
    EXPECT_TRUE(listTree(path()).empty());
}

TEST_F(CCreateTempFileTest, AnOrdinaryUserIsRefused) {
    chmod(path().c_str(), 0555);
    runAsOrdinaryUser([&] { expectFileRefused(path(), path() + "/XXXXXX"); });
    EXPECT_TRUE(listTree(path()).empty());
}

TEST_F(CCreateTempFileTest, AnOverlongPathIsCut) {
    setTemporary("/" + std::string(2000, 'x'));
    expectFileRefused("", temporary().substr(0, 1024));
    setTemporary(std::string(1017, 'x'));
    expectFileRefused("", temporary() + "/XXXXXX");
    setTemporary(std::string(1018, 'x'));
    expectFileRefused("", temporary() + "/XXXXX");
}

TEST_F(CCreateTempFileTest, ACutWithinACharacterIsShownWithoutIt) {
    // One, two and three bytes of a character of four lie before the limit.
    for (std::size_t const before : {1023U, 1022U, 1021U}) {
        setTemporary(std::string(before, 'x') + "\U0001F600");
        expectFileRefused("", std::string(before, 'x'));
    }
    setTemporary(std::string(1020, 'x') + "\U0001F600" + "y");
    expectFileRefused("", std::string(1020, 'x') + "\U0001F600");
}

using CCreateTempFolderTest = CTemporaryTest;

void expectFolderRefused(std::string const& hint, std::string const& pattern) {
    expectRefused(failureOf([&] { FileSys::createTempFolder(hint); }), "mkdtemp", pattern,
                  "doCreateTempFolder", "createTempFolder");
}

TEST_F(CCreateTempFolderTest, TheHintsNameBeginsTheFolders) {
    std::string const folder = makeFolder(path("name \u00E9"));
    EXPECT_TRUE(isUnique(folder, path("name \u00E9-")));
    EXPECT_TRUE(S_ISDIR(statusOf(folder).st_mode));
    EXPECT_EQ(statusOf(folder).st_mode & 07777U, 0700U);
}

TEST_F(CCreateTempFolderTest, AHintThatIsThereIsANameLikeAnyOther) {
    makeFolders(path("there"));
    EXPECT_TRUE(isUnique(makeFolder(path("there")), path("there-")));
    // With a separator at its end it is the folder, and the name is empty.
    EXPECT_TRUE(isUnique(makeFolder(path("there/")), path("there-")));
}

TEST_F(CCreateTempFolderTest, AHintWhoseFolderIsMissingGivesTheTemporaryFolder) {
    EXPECT_TRUE(isUnique(makeFolder(path("missing/name")), temporary() + "/name-"));
    EXPECT_TRUE(isUnique(makeFolder("bare name"), temporary() + "/bare name-"));
}

TEST_F(CCreateTempFolderTest, WithoutAHintItIsASiblingOfTheTemporaryFolder) {
    makeFolders(path("tmp"));
    setTemporary(path("tmp"));
    EXPECT_TRUE(isUnique(makeFolder(""), path("tmp-")));
    setTemporary(path("tmp/"));
    EXPECT_TRUE(isUnique(makeFolder(""), path("tmp/-")));
    EXPECT_EQ(listTree(path()).size(), 3U);
}

TEST_F(CCreateTempFolderTest, TheSeamHasOneSeparator) {
    setTemporary(temporary() + "/");
    EXPECT_TRUE(isUnique(makeFolder("name"), temporary() + "name-"));
}

TEST_F(CCreateTempFolderTest, FailuresAreThoseOfTheCall) {
    setTemporary("/missing");
    expectFolderRefused("name", "/missing/name-XXXXXX");
}

TEST_F(CCreateTempFolderTest, AnOverlongPathIsCut) {
    setTemporary("/" + std::string(2000, 'x'));
    expectFolderRefused("name", temporary().substr(0, 1024));
}

// What is left of an overlong path can happen to end as a path of a unique name does.
TEST_F(CCreateTempFolderTest, WhatACutLeavesCanBeAPathOfItsOwn) {
    std::string deep = path();
    while (deep.size() < 800)
        deep += "/" + std::string(99, 'd');
    deep += "/" + std::string(1024 - deep.size() - 1 - 9, 'e');
    makeFolders(deep);
    ASSERT_EQ(deep.size(), 1015U);
    EXPECT_TRUE(isUnique(makeFolder(deep + "/nnXXXXXX tail"), deep + "/nn"));
    EXPECT_EQ(listTree(deep).size(), 1U);
}

TEST_F(CCreateTempFolderTest, AFailureOfTheSystemPasses) {
    CSystemCalls calls;
    calls.fail("mkdtemp", ENOSPC);
    expectFolderRefused(path("name"), path("name-XXXXXX"));
    EXPECT_EQ(calls.count("mkdtemp"), 1U);
    EXPECT_TRUE(listTree(path()).empty());
}

TEST_F(CCreateTempFolderTest, AnOrdinaryUserIsRefused) {
    chmod(path().c_str(), 0555);
    runAsOrdinaryUser([&] { expectFolderRefused(path("name"), path("name-XXXXXX")); });
    EXPECT_TRUE(listTree(path()).empty());
}

class COwnerTest : public CTemporaryTest {
  protected:
    void SetUp() override {
        CTemporaryTest::SetUp();
        writeFile(path("file"));
    }

    std::vector<TestSupport::CLogRecord> const& records() const { return recorder_.records(); }

  private:
    TestSupport::CLogRecorder recorder_;
    TestSupport::CInstalledTarget<Error::TTgtLogger, Error::TSevError> const installed_{recorder_};
};

TEST_F(COwnerTest, TheFileGoesWithItsOwner) {
    {
        CTempFile const owner{CFileSpec(path("file"))};
        EXPECT_EQ(owner.getFileSpec(), CFileSpec(path("file")));
        EXPECT_TRUE(pathExists(path("file")));
    }
    EXPECT_FALSE(pathExists(path("file")));
    EXPECT_TRUE(records().empty());
}

TEST_F(COwnerTest, AFolderGoesWithAllInIt) {
    makeFolders(path("folder/sub"));
    writeFile(path("folder/sub/file"));
    { CTempFile const owner{CFileSpec(path("folder"))}; }
    EXPECT_EQ(listTree(path()), TNames{"file"});
}

TEST_F(COwnerTest, AFileCanGoBefore) {
    CTempFile owner{CFileSpec(path("file"))};
    owner.deleteFile();
    EXPECT_FALSE(pathExists(path("file")));
    EXPECT_TRUE(owner.getFileSpec().empty());
    writeFile(path("file"));
    owner.deleteFile();
    EXPECT_TRUE(pathExists(path("file")));
}

TEST_F(COwnerTest, AReleasedFileStays) {
    {
        CTempFile owner{CFileSpec(path("file"))};
        owner.releaseFile();
        EXPECT_TRUE(owner.getFileSpec().empty());
        owner.deleteFile();
    }
    EXPECT_TRUE(pathExists(path("file")));
}

TEST_F(COwnerTest, AFileThatSomeoneElseRemovedIsNoFailure) {
    {
        CTempFile owner{CFileSpec(path("file"))};
        unlink(path("file").c_str());
        owner.deleteFile();
        EXPECT_TRUE(owner.getFileSpec().empty());
    }
    { CTempFile const owner{CFileSpec(path("file"))}; }
    { CTempFile const owner{CFileSpec()}; }
    EXPECT_TRUE(records().empty());
}

TEST_F(COwnerTest, AFileThatCannotBeDeletedIsStillOwned) {
    CTempFile owner{CFileSpec(path("file"))};
    CSystemCalls calls;
    calls.fail("unlinkat", EBUSY, 1);
    EXPECT_EQ(failureOf([&] { owner.deleteFile(); }).trace,
              (TNames{"doDeleteFile", "deleteFile", "deleteFile"}));
    EXPECT_EQ(owner.getFileSpec(), CFileSpec(path("file")));
    owner.deleteFile();
    EXPECT_FALSE(pathExists(path("file")));
}

TEST_F(COwnerTest, TheEndOfAnOwnerLogsWhatItCannotDelete) {
    {
        CSystemCalls calls;
        calls.fail("unlinkat", EBUSY);
        CTempFile const owner{CFileSpec(path("file"))};
    }
    EXPECT_TRUE(pathExists(path("file")));
    ASSERT_EQ(records().size(), 1U);
    EXPECT_EQ(records()[0].tag, "FileSys");
    EXPECT_EQ(records()[0].target, "TgtLogger");
    EXPECT_EQ(records()[0].severity, "SevError");
    EXPECT_EQ(records()[0].expanded, L"Could not delete file or folder " + wide(path("file")) +
                                         L": " + TestSupport::errorText(EBUSY));
    EXPECT_EQ(TestSupport::functionNameOf(std::get<2>(records()[0].place)), "doDeleteFile");
}

// What the path library raises by itself is of the family by then.
TEST_F(COwnerTest, TheEndOfAnOwnerLogsWhatTheLibraryRaises) {
    CSystemCalls calls;
    calls.observe([&](std::string const& function, std::string const&) {
        if (function == "unlinkat")
            calls.fail("statx", EIO);
    });
    { CTempFile const owner{CFileSpec(path("file"))}; }
    ASSERT_EQ(records().size(), 1U);
    EXPECT_EQ(records()[0].expanded.find(L"Standard library exception of type"), 0U);
}

class CIsTemporaryTest : public CTemporaryTest {
  protected:
    static bool isTemporary(std::string const& text) { return CFileSpec(text).isTemporary(); }
};

TEST_F(CIsTemporaryTest, WhatBeginsWithTheTemporaryFolderIs) {
    setTemporary("/some/tmp");
    EXPECT_TRUE(isTemporary("/some/tmp/file"));
    EXPECT_TRUE(isTemporary("/some/tmp"));
    EXPECT_TRUE(isTemporary("/some/tmpfoo"));
    EXPECT_FALSE(isTemporary("/some/tm"));
    EXPECT_FALSE(isTemporary("/else/some/tmp/file"));
    EXPECT_FALSE(isTemporary("some/tmp/file"));
}

TEST_F(CIsTemporaryTest, TheFolderIsReachedThroughPrivateToo) {
    setTemporary("/some/tmp");
    EXPECT_TRUE(isTemporary("/private/some/tmp/file"));
    EXPECT_FALSE(isTemporary("/private/some/file"));
    EXPECT_FALSE(isTemporary("/private/private/some/tmp"));
}

TEST_F(CIsTemporaryTest, ASeparatorAtTheEndCounts) {
    setTemporary("/some/tmp/");
    EXPECT_TRUE(isTemporary("/some/tmp/file"));
    EXPECT_FALSE(isTemporary("/some/tmp"));
}

TEST_F(CIsTemporaryTest, TheEmptySpecificationNeverIs) {
    EXPECT_FALSE(isTemporary(""));
    setTemporary("");
    EXPECT_FALSE(isTemporary(""));
    // Everything lies below the empty folder.
    EXPECT_TRUE(isTemporary("/anything"));
}

TEST_F(CIsTemporaryTest, NothingIsAskedOfTheDisk) {
    CSystemCalls calls;
    EXPECT_FALSE(isTemporary("/elsewhere"));
    EXPECT_TRUE(calls.counts().empty());
}

TEST_F(CIsTemporaryTest, AVariableThatIsNoTextIsAFailure) {
    setTemporary("\xFF");
    EXPECT_EQ(failureOf([] { isTemporary("/a"); }).name, "Encoding");
    EXPECT_FALSE(isTemporary(""));
}

} // namespace
