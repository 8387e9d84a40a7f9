// Copying files and trees.

#include "2System/FileSys/FileSysOperations.h"

#include "support/FileFailures.h"
#include "support/FileRoot.h"
#include "support/SystemCalls.h"

#include <gtest/gtest.h>

#include <pthread.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <csignal>
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

using TNames = std::vector<std::string>;

class CCopyFileTest : public TestSupport::CFileRootTest {
  protected:
    void SetUp() override {
        CFileRootTest::SetUp();
        writeFile(path("from"), "new text");
    }

    void copy(std::string const& from, std::string const& to, bool overwrite) const {
        FileSys::copyFile(path(from), path(to), overwrite);
    }

    void expectRefused(std::string const& from, std::string const& to, bool overwrite,
                       int error) const {
        expectFailure(
            failureOf([&] { copy(from, to, overwrite); }), "FileSpec", Error::msgCouldNot,
            couldNot(L"copy", L"file", wide(path(from) + ", " + path(to)), errorText(error)),
            {"doCopyFile", "copyFile"});
    }
};

TEST_F(CCopyFileTest, TheContentAndThePermissionsAreCopied) {
    std::string const content(100000, '\xFF');
    writeFile(path("from"), content);
    chmod(path("from").c_str(), 0750);
    copy("from", "to", false);
    EXPECT_EQ(readFile(path("to")), content);
    struct stat status;
    ASSERT_EQ(stat(path("to").c_str(), &status), 0);
    EXPECT_EQ(status.st_mode & 07777U, 0750U);
    EXPECT_EQ(readFile(path("from")), content);
}

TEST_F(CCopyFileTest, AnEmptyFileIsCopied) {
    writeFile(path("empty"));
    copy("empty", "to", true);
    EXPECT_EQ(readFile(path("to")), "");
}

TEST_F(CCopyFileTest, AFileOntoItselfStays) {
    copy("from", "from", false);
    copy("from", "from", true);
    EXPECT_EQ(readFile(path("from")), "new text");
}

// Equal texts are one file, whether there is one or not.
TEST_F(CCopyFileTest, AMissingFileOntoItselfIsNoFailure) {
    copy("missing", "missing", true);
    EXPECT_EQ(listTree(path()), TNames{"from"});
}

TEST_F(CCopyFileTest, AFileThatIsThereStaysUnlessToldOtherwise) {
    writeFile(path("to"), "old");
    copy("from", "to", false);
    EXPECT_EQ(readFile(path("to")), "old");
    copy("from", "to", true);
    EXPECT_EQ(readFile(path("to")), "new text");
}

TEST_F(CCopyFileTest, AShorterContentLeavesNothingOfALongerOne) {
    writeFile(path("to"), std::string(10000, 'x'));
    copy("from", "to", true);
    EXPECT_EQ(readFile(path("to")), "new text");
}

TEST_F(CCopyFileTest, MissingFoldersAreMade) {
    copy("from", "a/b/to", false);
    EXPECT_EQ(readFile(path("a/b/to")), "new text");
}

TEST_F(CCopyFileTest, ATargetWithoutAFolderGoesIntoTheWorkingFolder) {
    ASSERT_EQ(chdir(path().c_str()), 0);
    CSystemCalls calls;
    FileSys::copyFile(CFileSpec(L"from"), CFileSpec(L"to"), false);
    EXPECT_EQ(calls.count("mkdir"), 0U);
    EXPECT_EQ(listTree(path()), (TNames{"from", "to"}));
}

TEST_F(CCopyFileTest, ALinkToAFileIsCopiedAsTheFile) {
    makeLink("from", path("link"));
    copy("link", "to", false);
    unlink(path("from").c_str());
    EXPECT_EQ(readFile(path("to")), "new text");
}

// The path library by itself would have emptied the file.
TEST_F(CCopyFileTest, AFileOntoItselfUnderAnotherNameIsRefusedAndWhole) {
    makeLink("from", path("link"));
    ASSERT_EQ(link(path("from").c_str(), path("hard").c_str()), 0);
    for (char const* const name : {"link", "hard", "./from"}) {
        expectRefused("from", name, true, EEXIST);
        expectRefused(name, "from", true, EEXIST);
        EXPECT_EQ(readFile(path("from")), "new text") << name;
    }
}

TEST_F(CCopyFileTest, AFileToAFolderTakesItsNameAlong) {
    FileSys::copyFileToFolder(path("from"), path("a/b"), false);
    EXPECT_EQ(readFile(path("a/b/from")), "new text");
    writeFile(path("a/b/from"), "old");
    FileSys::copyFileToFolder(path("from"), path("a/b"), false);
    EXPECT_EQ(readFile(path("a/b/from")), "old");
    FileSys::copyFileToFolder(path("from"), path("a/b/"), true);
    EXPECT_EQ(readFile(path("a/b/from")), "new text");
}

TEST_F(CCopyFileTest, AFailureOnTheWayToAFolderSaysSo) {
    EXPECT_EQ(
        failureOf([&] { FileSys::copyFileToFolder(path("missing"), path("a"), false); }).trace,
        (TNames{"doCopyFile", "copyFile", "copyFileToFolder"}));
}

TEST_F(CCopyFileTest, AMissingSourceIsAFailure) {
    expectRefused("missing", "to", true, ENOENT);
    // The target's folder was made before.
    expectRefused("missing", "a/to", false, ENOENT);
    EXPECT_EQ(listTree(path()), (TNames{"a", "from"}));
}

TEST_F(CCopyFileTest, AMissingSourceLeavesTheTarget) {
    writeFile(path("to"), "old");
    expectRefused("missing", "to", true, ENOENT);
    EXPECT_EQ(readFile(path("to")), "old");
}

TEST_F(CCopyFileTest, LinksThatLeadNowhereAreFailures) {
    makeLink("loop", path("loop"));
    makeLink("missing", path("nowhere"));
    expectRefused("loop", "to", false, ELOOP);
    expectRefused("nowhere", "to", false, ENOENT);
}

TEST_F(CCopyFileTest, ADeviceIsNoFile) {
    CFileFailure const failure =
        failureOf([&] { FileSys::copyFile(L"/dev/null", path("to"), false); });
    expectFailure(failure, "FileSpec", Error::msgCouldNot,
                  couldNot(L"copy", L"file", L"/dev/null, " + wide(path("to")), errorText(ENOSYS)),
                  {"doCopyFile", "copyFile"});
    EXPECT_EQ(listTree(path()), TNames{"from"});
}

// Opening it would wait for somebody who writes.
TEST_F(CCopyFileTest, AFifoIsRefusedUnopened) {
    ASSERT_EQ(mkfifo(path("fifo").c_str(), 0600), 0);
    CSystemCalls calls;
    expectRefused("fifo", "to", true, ENOSYS);
    EXPECT_EQ(calls.count("open"), 0U);
}

TEST_F(CCopyFileTest, AFifoInTheTargetsPlaceIsRefusedUnopened) {
    ASSERT_EQ(mkfifo(path("fifo").c_str(), 0600), 0);
    CSystemCalls calls;
    expectRefused("from", "fifo", true, ENOSYS);
    EXPECT_EQ(calls.count("open"), 0U);
    copy("from", "fifo", false);
    EXPECT_EQ(listTree(path()), (TNames{"fifo", "from"}));
}

TEST_F(CCopyFileTest, ADeviceInTheTargetsPlaceIsAFailure) {
    EXPECT_EQ(failureOf([&] { FileSys::copyFile(path("from"), L"/dev/null", true); }).parameters,
              couldNot(L"copy", L"file", wide(path("from")) + L", /dev/null", errorText(ENOSYS)));
    EXPECT_EQ(failureOf([&] { FileSys::copyFile(L"/dev/null", path("from"), true); }).parameters,
              couldNot(L"copy", L"file", L"/dev/null, " + wide(path("from")), errorText(ENOSYS)));
    EXPECT_EQ(readFile(path("from")), "new text");
}

// Whatever can be refused by the system itself keeps the system's reason.
TEST_F(CCopyFileTest, ASocketIsRefusedByTheSystem) {
    ASSERT_EQ(mknod(path("socket").c_str(), S_IFSOCK | 0600, 0), 0);
    expectRefused("socket", "to", false, ENXIO);
    expectRefused("socket", "from", true, ENXIO);
    expectRefused("from", "socket", true, ENXIO);
    EXPECT_EQ(listTree(path()), (TNames{"from", "socket"}));
    EXPECT_EQ(readFile(path("from")), "new text");
}

TEST_F(CCopyFileTest, AFolderInTheTargetsPlaceIsAFailure) {
    makeFolders(path("to/inner"));
    expectRefused("from", "to", true, EISDIR);
    EXPECT_EQ(listTree(path()), (TNames{"from", "to", "to/inner"}));
}

TEST_F(CCopyFileTest, AFileInTheTargetsFoldersPlaceIsAFailure) {
    writeFile(path("file"), "text");
    CFileFailure const failure = failureOf([&] { copy("from", "file/inner/to", true); });
    EXPECT_EQ(failure.parameters, couldNot(L"create", L"folder", wide(path("file/inner")),
                                           TestSupport::reasonOfNoFolder(path("file/inner"))));
    EXPECT_EQ(failure.trace, (TNames{"doCreateFolder", "createFolder", "copyFile"}));
    EXPECT_EQ(readFile(path("file")), "text");
}

TEST_F(CCopyFileTest, ANameThatIsTooLongIsAFailure) {
    expectRefused("from", std::string(256, 'n'), false, ENAMETOOLONG);
    EXPECT_EQ(listTree(path()), TNames{"from"});
}

TEST_F(CCopyFileTest, FailuresOfTheSystemAreTheReason) {
    writeFile(path("to"), "old");
    CSystemCalls calls;
    calls.fail("open", EMFILE, 1);
    expectRefused("from", "to", true, EMFILE);
    calls.fail("open", EACCES, 2);
    expectRefused("from", "to", true, EACCES);
    EXPECT_EQ(readFile(path("to")), "old");
    EXPECT_EQ(readFile(path("from")), "new text");
}

// The kernel's own files have a file system of their own.
TEST_F(CCopyFileTest, AFileOfAnotherDeviceReplacesWhatIsThere) {
    std::string const kernels = "/proc/sys/kernel/ostype";
    if (!TestSupport::pathExists(kernels))
        GTEST_SKIP() << "there is no " << kernels;
    writeFile(path("to"), "old");
    FileSys::copyFile(kernels, path("to"), true);
    EXPECT_EQ(readFile(path("to")), readFile(kernels));
}

// The kernel copies where it can; what it can't is read and written.
TEST_F(CCopyFileTest, TheContentArrivesOnEveryRoad) {
    std::string content(300000, 'c');
    content.back() = 'z';
    writeFile(path("from"), content);
    CSystemCalls calls;
    copy("from", "first", false);
    EXPECT_GT(calls.count("copy_file_range") + calls.count("sendfile"), 0U);
    EXPECT_EQ(calls.count("write"), 0U);
    calls.fail("copy_file_range", ENOSYS);
    copy("from", "second", false);
    EXPECT_GT(calls.count("sendfile"), 0U);
    calls.fail("sendfile", ENOSYS);
    copy("from", "third", false);
    EXPECT_GT(calls.count("write"), 0U);
    for (char const* const name : {"first", "second", "third"})
        EXPECT_EQ(readFile(path(name)), content) << name;
}

TEST_F(CCopyFileTest, AFailedWriteIsTheReason) {
    for (char const* const function : {"read", "write"}) {
        CSystemCalls calls;
        calls.fail("copy_file_range", ENOSYS);
        calls.fail("sendfile", ENOSYS);
        calls.fail(function, EIO);
        expectRefused("from", "to", true, EIO);
        EXPECT_EQ(calls.count(function), 1U);
        EXPECT_EQ(readFile(path("from")), "new text");
    }
}

TEST_F(CCopyFileTest, AFailureOfTheKernelsCopyIsTheReason) {
    std::string const content(300000, 'c');
    writeFile(path("from"), content);
    CSystemCalls calls;
    for (char const* const function : {"copy_file_range", "sendfile", "write"})
        calls.fail(function, ENOSPC);
    expectRefused("from", "to", true, ENOSPC);
    EXPECT_EQ(readFile(path("from")), content);
}

TEST_F(CCopyFileTest, AFileBeyondTheLimitIsAFailureOnARealDisk) {
    writeFile(path("large"), std::string(100000, 'x'));
    struct rlimit before;
    ASSERT_EQ(getrlimit(RLIMIT_FSIZE, &before), 0);
    struct rlimit limit = before;
    limit.rlim_cur = 50000;
    auto const handler = std::signal(SIGXFSZ, SIG_IGN);
    ASSERT_EQ(setrlimit(RLIMIT_FSIZE, &limit), 0);
    CFileFailure const failure = failureOf([&] { copy("large", "to", false); });
    setrlimit(RLIMIT_FSIZE, &before);
    std::signal(SIGXFSZ, handler);
    EXPECT_EQ(
        failure.parameters,
        couldNot(L"copy", L"file", wide(path("large") + ", " + path("to")), errorText(EFBIG)));
    EXPECT_EQ(readFile(path("large")).size(), 100000U);
    EXPECT_LE(readFile(path("to")).size(), 50000U);
}

TEST_F(CCopyFileTest, AnOrdinaryUserIsRefused) {
    chmod(path("from").c_str(), 0400);
    writeFile(path("readable"), "text");
    makeFolders(path("closed"));
    chmod(path("closed").c_str(), 0555);
    if (geteuid() != 0)
        chmod(path("from").c_str(), 0);
    runAsOrdinaryUser([&] {
        expectRefused("from", "to", false, EACCES);
        expectRefused("readable", "closed/to", false, EACCES);
    });
    EXPECT_TRUE(listTree(path("closed")).empty());
}

class CCopyFolderTest : public CCopyFileTest {
  protected:
    void SetUp() override {
        CCopyFileTest::SetUp();
        makeFolders(path("tree/sub/deep"));
        makeFolders(path("tree/empty"));
        writeFile(path("tree/b"), "b");
        writeFile(path("tree/a\u00E9"), "a");
        writeFile(path("tree/sub/c"), "c");
        writeFile(path("tree/sub/deep/d"), "d");
    }

    TNames const tree_{"a\u00E9", "b", "empty", "sub", "sub/c", "sub/deep", "sub/deep/d"};
};

TEST_F(CCopyFolderTest, ATreeIsCopiedWithAllInIt) {
    copy("tree", "x/y", false);
    EXPECT_EQ(listTree(path("x/y")), tree_);
    EXPECT_EQ(readFile(path("x/y/sub/deep/d")), "d");
    EXPECT_EQ(listTree(path("tree")), tree_);
}

TEST_F(CCopyFolderTest, ATreeIsCopiedIntoOneThatIsThere) {
    makeFolders(path("to/sub"));
    writeFile(path("to/b"), "old");
    writeFile(path("to/sub/kept"), "kept");
    copy("tree", "to", false);
    EXPECT_EQ(readFile(path("to/b")), "old");
    EXPECT_EQ(readFile(path("to/sub/c")), "c");
    copy("tree", "to", true);
    EXPECT_EQ(readFile(path("to/b")), "b");
    EXPECT_EQ(readFile(path("to/sub/kept")), "kept");
}

TEST_F(CCopyFolderTest, ATreeGoesIntoAFolderUnderItsName) {
    FileSys::copyFileToFolder(path("tree"), path("x"), false);
    EXPECT_EQ(listTree(path("x/tree")), tree_);
}

TEST_F(CCopyFolderTest, LinksAreFollowed) {
    makeLink("../from", path("tree/link"));
    makeLink("sub", path("tree/folder link"));
    copy("tree", "to", false);
    struct stat status;
    ASSERT_EQ(lstat(path("to/folder link").c_str(), &status), 0);
    EXPECT_TRUE(S_ISDIR(status.st_mode));
    ASSERT_EQ(lstat(path("to/link").c_str(), &status), 0);
    EXPECT_TRUE(S_ISREG(status.st_mode));
    EXPECT_EQ(listTree(path("to/folder link")), (TNames{"c", "deep", "deep/d"}));
    EXPECT_EQ(readFile(path("to/link")), "new text");
}

TEST_F(CCopyFolderTest, WhatIsNoFileAndNoFolderIsLeftOut) {
    ASSERT_EQ(mkfifo(path("tree/fifo").c_str(), 0600), 0);
    makeLink("missing", path("tree/nowhere"));
    makeLink("loop", path("tree/loop"));
    copy("tree", "to", false);
    EXPECT_EQ(listTree(path("to")), tree_);
}

TEST_F(CCopyFolderTest, AFailureStopsTheCopyWhereItStands) {
    // In the order of the copy: the files of a folder, then its sub folders.
    makeFolders(path("to/sub/c"));
    CFileFailure const failure = failureOf([&] { copy("tree", "to", true); });
    EXPECT_EQ(failure.parameters,
              couldNot(L"copy", L"file", wide(path("tree/sub/c") + ", " + path("to/sub/c")),
                       errorText(EISDIR)));
    EXPECT_EQ(failure.trace, (TNames{"doCopyFile", "copyFile", "doCopyFolder", "copyFile",
                                     "doCopyFolder", "copyFile"}));
    EXPECT_EQ(listTree(path("to")), (TNames{"a\u00E9", "b", "empty", "sub", "sub/c"}));
    EXPECT_EQ(listTree(path("tree")), tree_);
}

TEST_F(CCopyFolderTest, AFileInTheFoldersPlaceIsAFailure) {
    writeFile(path("to"), "old");
    EXPECT_EQ(failureOf([&] { copy("tree", "to", true); }).trace,
              (TNames{"doCreateFolder", "createFolder", "copyFile"}));
    EXPECT_EQ(readFile(path("to")), "old");
}

TEST_F(CCopyFolderTest, AnEntryThatVanishesOnTheWayIsAFailure) {
    CSystemCalls calls;
    calls.observe([&](std::string const& function, std::string const& name) {
        if (function == "open" && name == path("tree/a\u00E9"))
            unlink(path("tree/b").c_str());
    });
    CFileFailure const failure = failureOf([&] { copy("tree", "to", true); });
    EXPECT_EQ(
        failure.parameters,
        couldNot(L"copy", L"file", wide(path("tree/b") + ", " + path("to/b")), errorText(ENOENT)));
    EXPECT_EQ(listTree(path("to")), TNames{"a\u00E9"});
}

// The copy is an entry of its own source, so that it goes on into itself until the path is too
// long.
TEST_F(CCopyFolderTest, AFolderIntoItselfEndsInAFailure) {
    std::string const name(200, 'n');
    EXPECT_FALSE(failureOf([&] { copy("tree", "tree/" + name, false); }).name.empty());
    EXPECT_EQ(readFile(path("tree/sub/deep/d")), "d");
    EXPECT_EQ(readFile(path("tree/" + name + "/b")), "b");
}

void* copyOnSmallStack(void* paths) {
    auto const* const ends = static_cast<std::pair<std::string, std::string>*>(paths);
    FileSys::copyFile(ends->first, ends->second, false);
    return nullptr;
}

// Half as deep as a path can be, on half the stack that a host gives its threads.
TEST_F(CCopyFolderTest, ADeepTreeIsCopiedOnASmallStack) {
#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__)
    GTEST_SKIP() << "a sanitizer's frames are larger";
#elif defined(__has_feature)
#    if __has_feature(address_sanitizer) || __has_feature(thread_sanitizer)
    GTEST_SKIP() << "a sanitizer's frames are larger";
#    endif
#endif
    std::string deep = path("deep");
    while (deep.size() < 3900)
        deep += "/ddd";
    makeFolders(deep);
    writeFile(deep + "/f", "f");
    std::pair<std::string, std::string> ends(path("deep"), path("copy"));
    pthread_attr_t attributes;
    pthread_attr_init(&attributes);
    ASSERT_EQ(pthread_attr_setstacksize(&attributes, 1U << 19U), 0);
    pthread_t thread;
    ASSERT_EQ(pthread_create(&thread, &attributes, copyOnSmallStack, &ends), 0);
    pthread_join(thread, nullptr);
    pthread_attr_destroy(&attributes);
    EXPECT_EQ(readFile(path("copy") + deep.substr(path("deep").size()) + "/f"), "f");
}

} // namespace
