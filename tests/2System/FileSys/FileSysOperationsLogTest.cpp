// What paths and operations log. All of it is at SevDebug, which their loggers filter, so that this
// program is built from their sources with every log call let through.

#include "2System/FileSys/FileSysOperations.h"
#include "2System/FileSys/FileSysTempFile.h"
#include "2System/FileSys/_Imp/FileSysOperationsImp.h"

#include "2System/FileSys/FileSysStatusHook.h"
#include "support/EveryLogCall.h"
#include "support/FileFailures.h"
#include "support/FileRoot.h"
#include "support/LogRecorder.h"
#include "support/SystemCalls.h"

#include <gtest/gtest.h>

#include <cerrno>
#include <string>
#include <tuple>
#include <vector>

namespace {

using FileSys::CFileSpec;
using TestSupport::CLogRecord;
using TestSupport::TParameters;
using TestSupport::wide;
using TestSupport::writeFile;

class CFileLogTest : public TestSupport::CFileRootTest {
  protected:
    void SetUp() override {
        CFileRootTest::SetUp();
        writeFile(path("from"), "text");
        recorder_.clear();
    }

    std::vector<CLogRecord> const& records() const { return recorder_.records(); }

    // The one line of a call.
    CLogRecord line() const {
        EXPECT_EQ(records().size(), 1U);
        return records().empty() ? CLogRecord() : records()[0];
    }

    static void expectLine(CLogRecord const& record, std::string const& function,
                           Strings::string const& text, TParameters parameters,
                           Strings::string const& expanded, std::string const& target = "TgtLogger",
                           std::string const& tag = "FileSys") {
        EXPECT_EQ(record.tag, tag);
        EXPECT_EQ(record.severity, "SevDebug");
        EXPECT_EQ(record.target, target);
        EXPECT_EQ(TestSupport::functionNameOf(std::get<2>(record.place)), function);
        parameters.emplace_back("__msg__", text);
        EXPECT_EQ(record.parameters, parameters);
        EXPECT_EQ(record.expanded, expanded);
    }

  private:
    TestSupport::CLogRecorder recorder_;
    TestSupport::CInstalledTarget<Error::TTgtLogger, Error::TSevDebug> const logger_{recorder_};
    TestSupport::CInstalledTarget<Error::TTgtDebugger, Error::TSevDebug> const debugger_{recorder_};
};

TEST_F(CFileLogTest, ARefusedCopy) {
    writeFile(path("to"), "old");
    FileSys::copyFile(path("from"), path("to"), false);
    expectLine(line(), "doCopyFile", L"Copied file \"@(to)\" already exists.",
               {{"to", wide(path("to"))}},
               L"Copied file \"" + wide(path("to")) + L"\" already exists.");
}

TEST_F(CFileLogTest, ACopyThatIsMadeSaysNothing) {
    FileSys::copyFile(path("from"), path("a/to"), false);
    FileSys::copyFile(path("from"), path("a/to"), true);
    FileSys::copyFile(path("from"), path("from"), false);
    FileSys::createFolder(path("b"));
    FileSys::deleteFile(path("a"), true);
    EXPECT_TRUE(records().empty());
}

TEST_F(CFileLogTest, AMove) {
    FileSys::moveFile(path("from"), path("to"), false);
    expectLine(line(), "doMoveFile", L"Moved file \"@(from)\" to \"@(to)\".",
               {{"from", wide(path("from"))}, {"to", wide(path("to"))}},
               L"Moved file \"" + wide(path("from")) + L"\" to \"" + wide(path("to")) + L"\".");
}

TEST_F(CFileLogTest, AMoveAcrossVolumes) {
    TestSupport::CSystemCalls calls;
    calls.fail("rename", EXDEV);
    FileSys::moveFile(path("from"), path("to"), false);
    EXPECT_EQ(line().expanded,
              L"Moved file \"" + wide(path("from")) + L"\" to \"" + wide(path("to")) + L"\".");
}

TEST_F(CFileLogTest, AMoveThatFailsSaysNothing) {
    TestSupport::CSystemCalls calls;
    calls.fail("rename", EIO);
    EXPECT_THROW(FileSys::moveFile(path("from"), path("to"), false), FileSys::TExcFileSpec);
    EXPECT_TRUE(records().empty());
}

TEST_F(CFileLogTest, AMoveThatBecomesACopy) {
    askInstead = [] { ERROR_THROW(FileSys::Detail::TExcOSFile, Error::msgAccessConflict); };
    FileSys::moveFile(path("from"), path("x/to"), false);
    CLogRecord const record = line();
    ASSERT_EQ(record.parameters.size(), 4U);
    Strings::string const failure = record.parameters[2].second;
    EXPECT_EQ(failure.find(L"'OSFile': "), 0U);
    EXPECT_NE(failure.find(L": [SevError] \"Access conflict\" "), Strings::string::npos);
    // With its trace, at whose end a blank stands.
    EXPECT_NE(failure.find(L"doCreateFolder"), Strings::string::npos);
    EXPECT_EQ(failure.back(), L' ');
    expectLine(record, "moveOrCopy",
               L"Cannot move \"@(from)\" to \"@(to)\": (@(oss.str())). Trying to copy and delete.",
               {{"from", wide(path("from"))}, {"to", wide(path("x/to"))}, {"oss.str()", failure}},
               L"Cannot move \"" + wide(path("from")) + L"\" to \"" + wide(path("x/to")) +
                   L"\": (" + failure + L"). Trying to copy and delete.");
    EXPECT_EQ(TestSupport::listTree(path()), (std::vector<std::string>{"x", "x/to"}));
}

TEST_F(CFileLogTest, ARenameSpeaksToTheDebugger) {
    writeFile(path("a.txt"));
    FileSys::setFileType(path("a.txt"), L"pdf");
    ASSERT_EQ(records().size(), 2U);
    EXPECT_EQ(records()[0].expanded,
              L"Moved file \"" + wide(path("a.txt")) + L"\" to \"" + wide(path("a.pdf")) + L"\".");
    expectLine(records()[1], "doRenameFile", L"Renamed file: \"@(oldName)\" to \"@(newName)\".",
               {{"oldName", wide(path("a.txt"))}, {"newName", L"a.pdf"}},
               L"Renamed file: \"" + wide(path("a.txt")) + L"\" to \"a.pdf\".", "TgtDebugger");
}

TEST_F(CFileLogTest, ARenameToTheSameNameSaysNothing) {
    writeFile(path("a.txt"));
    FileSys::setFileType(path("a.txt"), L"txt");
    EXPECT_TRUE(records().empty());
}

TEST_F(CFileLogTest, TheTemporaryFolder) {
    FileSys::getTempPathName();
    expectLine(line(), "doGetTempPathName", L"doGetTempPathName: \"@(tmpdir)\".",
               {{"tmpdir", wide(root().temporary())}},
               L"doGetTempPathName: \"" + wide(root().temporary()) + L"\".");
}

TEST_F(CFileLogTest, ATemporaryFile) {
    Strings::string const file = FileSys::createTempFile(path("name")).getFullName(false);
    ASSERT_EQ(records().size(), 2U);
    expectLine(records()[0], "doCreateTempFile", L"creating tmp file \"@(fs.getFullName())\".",
               {{"fs.getFullName()", wide(path("name"))}},
               L"creating tmp file \"" + wide(path("name")) + L"\".");
    // The blank at the end belongs to the text.
    expectLine(records()[1], "doCreateTempFile", L"doCreateTempFile: \"@(strtmpfile)\" ",
               {{"strtmpfile", file}}, L"doCreateTempFile: \"" + file + L"\" ");
}

TEST_F(CFileLogTest, ATemporaryFileInTheTemporaryFolder) {
    FileSys::createTempFile(CFileSpec());
    ASSERT_EQ(records().size(), 3U);
    EXPECT_EQ(records()[0].expanded, L"creating tmp file \"\".");
    EXPECT_EQ(records()[1].expanded, L"doGetTempPathName: \"" + wide(root().temporary()) + L"\".");
}

// The temporary folder by its own name is the last that is asked.
TEST_F(CFileLogTest, WhetherAPathIsTemporary) {
    for (std::string const& folder : {root().temporary(), "/private" + root().temporary()})
        EXPECT_TRUE(CFileSpec(folder + "/file").isTemporary());
    EXPECT_FALSE(CFileSpec().isTemporary());
    EXPECT_TRUE(records().empty());
    EXPECT_FALSE(CFileSpec(L"/elsewhere").isTemporary());
    EXPECT_EQ(line().expanded, L"doGetTempPathName: \"" + wide(root().temporary()) + L"\".");
}

// Placeholder and parameter differ in their names.
TEST_F(CFileLogTest, ATemporaryFolderIsNotNamed) {
    Strings::string const folder = FileSys::createTempFolder(path("name")).getFullName(false);
    expectLine(line(), "doCreateTempFolder", L"doCreateTempFolder: \"@(strtmpfile)\" ",
               {{"strtmpfolder", folder}}, L"doCreateTempFolder: \"@(strtmpfile)\" ");
}

TEST_F(CFileLogTest, ATemporaryFileThatFailsIsStillAnnounced) {
    TestSupport::CSystemCalls calls;
    calls.fail("mkstemp", EACCES);
    calls.fail("mkdtemp", EACCES);
    EXPECT_THROW(FileSys::createTempFile(path()), FileSys::TExcFileSysOp);
    EXPECT_EQ(line().expanded, L"creating tmp file \"" + wide(path()) + L"\".");
    EXPECT_THROW(FileSys::createTempFolder(path("name")), FileSys::TExcFileSysOp);
    EXPECT_EQ(records().size(), 1U);
}

// The lines of a path that is made absolute: each is its text alone, with the path beside it.
class CAbsolutePathLogTest : public CFileLogTest {
  protected:
    static void expectPath(CLogRecord const& record, Strings::string const& text,
                           std::string const& name, Strings::string const& path) {
        expectLine(record, "convertRelativeToAbsolutePath", text, {{name, path}}, text, "TgtLogger",
                   "FileInfo");
    }

    void expectArguments(Strings::string const& abs, Strings::string const& rel) const {
        ASSERT_GE(records().size(), 2U);
        expectPath(records()[0], L"convertRelativeToAbsolutePath fsAbs", "fsAbs", abs);
        expectPath(records()[1], L"convertRelativeToAbsolutePath fsRel", "fsRel", rel);
    }

    static void join(Strings::string const& abs, Strings::string const& rel) {
        CFileSpec::convertRelativeToAbsolutePath(CFileSpec(abs), CFileSpec(rel));
    }
};

TEST_F(CAbsolutePathLogTest, BothArgumentsAndTheResult) {
    join(L"/a//b/", L"./../c");
    ASSERT_EQ(records().size(), 3U);
    expectArguments(L"/a//b/", L"./../c");
    expectPath(records()[2], L"convertRelativeToAbsolutePath", "fs", L"/a/c");
}

TEST_F(CAbsolutePathLogTest, AnAbsolutePathIsNoResultToSpeakOf) {
    join(L"/a", L"/x");
    EXPECT_EQ(records().size(), 2U);
    expectArguments(L"/a", L"/x");
}

TEST_F(CAbsolutePathLogTest, AFailureLeavesTheArguments) {
    EXPECT_THROW(join(L"a", L"../.."), FileSys::TExcFileSpec);
    EXPECT_EQ(records().size(), 2U);
    expectArguments(L"a", L"../..");
}

} // namespace
