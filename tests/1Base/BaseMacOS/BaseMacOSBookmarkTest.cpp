#include "1Base/BaseMacOS/BaseMacOS.h"

#include "1Base/BaseMacOS/BaseMacOSSystemCalls.h"
#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxIdentity.h"
#include "1Base/Encoding/EncodingConverter.h"
#include "support/FileRoot.h"
#include "support/TextFailures.h"

#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>
#include <string>
#include <vector>

namespace {

using MacOS::Native::identityOf;
using TestSupport::CSystemCalls;
using TestSupport::listTree;
using TestSupport::makeFolders;
using TestSupport::makeLink;
using TestSupport::pathExists;
using TestSupport::readFile;
using TestSupport::removeTree;
using TestSupport::writeFile;

using TNames = std::vector<std::string>;

bool create(std::string const& source, std::string const& bookmark) {
    return MacOS::createBookmarkFile(Encoding::convert<Strings::string>(source),
                                     Encoding::convert<Strings::string>(bookmark));
}

// What a failed call leaves in the result.
std::string const nothing = "(untouched)";

std::string resolve(std::string const& bookmark) {
    Strings::string result = Encoding::convert<Strings::string>(nothing);
    bool const done =
        MacOS::resolveBookmarkFile(Encoding::convert<Strings::string>(bookmark), result);
    std::string const path = Encoding::convert<std::string>(result);
    EXPECT_EQ(done, path != nothing);
    return path;
}

void rename(std::string const& from, std::string const& to) {
    ASSERT_EQ(std::rename(from.c_str(), to.c_str()), 0) << from << " to " << to;
}

std::string entryOf(std::string const& text, std::string const& key) {
    std::size_t const begin = text.find("\n" + key + "=");
    if (begin == std::string::npos)
        return "(missing)";
    std::size_t const value = begin + key.size() + 2;
    return text.substr(value, text.find('\n', value) - value);
}

// Gives an entry another value, or none with its line.
void setEntry(std::string const& bookmark, std::string const& key, std::string const& value) {
    std::string text = readFile(bookmark);
    std::size_t const begin = text.find("\n" + key + "=") + 1;
    ASSERT_NE(begin, 0U) << key;
    text.erase(begin, text.find('\n', begin) + 1 - begin);
    writeFile(bookmark, value.empty() ? text : text + key + "=" + value + "\n");
}

class CBaseMacOSBookmarkTest : public TestSupport::CFileRootTest {
  protected:
    // A file "file" with a bookmark "mark" beside it.
    void SetUp() override {
        CFileRootTest::SetUp();
        writeFile(path("file"), "text");
        ASSERT_TRUE(create(path("file"), path("mark")));
    }

    bool keepsBirthTimes() const { return identityOf(path("file"))->birth.has_value(); }
};

#define SKIP_WITHOUT_BIRTH_TIMES()                                                                 \
    if (!keepsBirthTimes())                                                                        \
    GTEST_SKIP() << "the file system keeps no birth times"

// --- the file

TEST_F(CBaseMacOSBookmarkTest, TheFileIsADesktopEntry) {
    makeFolders(path("a b"));
    makeFolders(path("marks"));
    std::string const target = path("a b/100% \xC3\xA4.txt");
    writeFile(target);
    ASSERT_TRUE(create(target, path("marks/mark")));

    struct stat status;
    ASSERT_EQ(lstat(target.c_str(), &status), 0);
    std::string const text = readFile(path("marks/mark"));
    EXPECT_EQ(text.substr(0, 16), "[Desktop Entry]\n");
    EXPECT_EQ(entryOf(text, "Type"), "Link");
    EXPECT_EQ(entryOf(text, "Name"), "100% \xC3\xA4.txt");
    std::string const url = entryOf(text, "URL");
    EXPECT_EQ(url.substr(0, 8), "file:///");
    std::string const tail = "/a%20b/100%25%20%C3%A4.txt";
    EXPECT_EQ(url.substr(url.size() - tail.size()), tail);
    EXPECT_EQ(entryOf(text, "X-QORN-Path"), target);
    EXPECT_EQ(entryOf(text, "X-QORN-RelativePath"), "../a b/100% \xC3\xA4.txt");
    EXPECT_EQ(entryOf(text, "X-QORN-Device"), std::to_string(status.st_dev));
    EXPECT_EQ(entryOf(text, "X-QORN-Inode"), std::to_string(status.st_ino));
}

TEST_F(CBaseMacOSBookmarkTest, TheFileIsReadableByAllWhomTheMaskAllows) {
    for (mode_t const mask : {022U, 077U, 0U}) {
        mode_t const before = umask(mask);
        EXPECT_TRUE(create(path("file"), path("mark")));
        umask(before);
        struct stat status;
        ASSERT_EQ(stat(path("mark").c_str(), &status), 0);
        EXPECT_EQ(status.st_mode & 07777U, 0666U & ~mask) << mask;
    }
}

TEST_F(CBaseMacOSBookmarkTest, NothingElseIsLeft) {
    EXPECT_EQ(listTree(path()), (TNames{"file", "mark"}));
    EXPECT_TRUE(create(path("file"), path("mark")));
    EXPECT_EQ(listTree(path()), (TNames{"file", "mark"}));
    EXPECT_EQ(readFile(path("file")), "text");
}

TEST_F(CBaseMacOSBookmarkTest, ANameOfFullLengthIsAllowed) {
    std::string const source = path(std::string(255, 's'));
    std::string const bookmark = path(std::string(255, 'b'));
    writeFile(source);
    ASSERT_TRUE(create(source, bookmark));
    EXPECT_EQ(resolve(bookmark), source);
}

// --- where it leads

TEST_F(CBaseMacOSBookmarkTest, ItLeadsToItsTarget) {
    EXPECT_EQ(resolve(path("mark")), path("file"));
}

TEST_F(CBaseMacOSBookmarkTest, AFolderCanBeTheTarget) {
    makeFolders(path("folder/inner"));
    ASSERT_TRUE(create(path("folder/inner"), path("mark")));
    EXPECT_EQ(resolve(path("mark")), path("folder/inner"));
    ASSERT_TRUE(create(path("folder") + "/", path("mark")));
    EXPECT_EQ(resolve(path("mark")), path("folder"));
    rename(path("folder"), path("renamed"));
    EXPECT_EQ(resolve(path("mark")), path("renamed"));
    ASSERT_TRUE(create("/", path("mark")));
    EXPECT_EQ(resolve(path("mark")), "/");
}

TEST_F(CBaseMacOSBookmarkTest, AnyNameIsKept) {
    for (std::string const name :
         {" blank before", "blank behind ", "per%20cent %", "caf\xC3\xA9", "\xF0\x9F\x98\x80",
          "back\\slash \\s\\n", "new\nline", "tab\tand\rreturn", "#", "[Desktop Entry]", "a=b",
          "X-QORN-Path=", "\x01\x7F", "'\"$`;&*?", "-", "..."}) {
        writeFile(path(name));
        ASSERT_TRUE(create(path(name), path("mark"))) << name;
        EXPECT_EQ(resolve(path("mark")), path(name));
        rename(path(name), path("other"));
        EXPECT_EQ(resolve(path("mark")), path("other")) << name;
        makeFolders(path("in"));
        rename(path("other"), path("in/" + name));
        EXPECT_EQ(resolve(path("mark")), path("in/" + name));
        removeTree(path("in"));
    }
}

TEST_F(CBaseMacOSBookmarkTest, ARelativeSourceIsKeptFromTheRootOn) {
    ASSERT_EQ(chdir(path().c_str()), 0);
    makeFolders(path("folder"));
    for (std::string const source : {"file", "./file", ".//file", "folder/../file"}) {
        ASSERT_TRUE(create(source, "mark")) << source;
        ASSERT_EQ(chdir("/"), 0);
        EXPECT_EQ(resolve(path("mark")), path("file")) << source;
        ASSERT_EQ(chdir(path().c_str()), 0);
        EXPECT_EQ(resolve("mark"), path("file")) << source;
    }
    ASSERT_TRUE(create(".", "mark"));
    EXPECT_EQ(resolve("mark"), path());
    ASSERT_EQ(chdir("/"), 0);
}

TEST_F(CBaseMacOSBookmarkTest, ALinkIsATargetOfItsOwn) {
    makeLink("file", path("link"));
    makeLink("none", path("dangling"));
    for (std::string const link : {"link", "dangling"}) {
        ASSERT_TRUE(create(path(link), path("mark")));
        EXPECT_EQ(resolve(path("mark")), path(link));
        rename(path(link), path("other"));
        EXPECT_EQ(resolve(path("mark")), path("other"));
        removeTree(path("other"));
    }
}

TEST_F(CBaseMacOSBookmarkTest, LinksOnTheWayToTheTargetStay) {
    makeFolders(path("real"));
    makeLink("real", path("way"));
    writeFile(path("real/target"));
    ASSERT_TRUE(create(path("way/target"), path("mark")));
    EXPECT_EQ(resolve(path("mark")), path("way/target"));
    rename(path("real/target"), path("real/renamed"));
    EXPECT_EQ(resolve(path("mark")), path("real/renamed"));
}

// --- a target that has moved

TEST_F(CBaseMacOSBookmarkTest, ARenamedTargetIsFound) {
    rename(path("file"), path("renamed"));
    EXPECT_EQ(resolve(path("mark")), path("renamed"));
}

TEST_F(CBaseMacOSBookmarkTest, ATargetIsFoundFurtherDown) {
    makeFolders(path("a/b/c"));
    rename(path("file"), path("a/b/c/renamed"));
    EXPECT_EQ(resolve(path("mark")), path("a/b/c/renamed"));
}

TEST_F(CBaseMacOSBookmarkTest, ATargetIsFoundFurtherUp) {
    makeFolders(path("a/b/c"));
    makeFolders(path("x/y"));
    writeFile(path("a/b/c/target"));
    ASSERT_TRUE(create(path("a/b/c/target"), path("mark")));
    rename(path("a/b/c/target"), path("a/renamed"));
    EXPECT_EQ(resolve(path("mark")), path("a/renamed"));
    rename(path("a/renamed"), path("x/y/target"));
    EXPECT_EQ(resolve(path("mark")), path("x/y/target"));
}

TEST_F(CBaseMacOSBookmarkTest, ATargetIsFoundWhereItsFolderHasMoved) {
    makeFolders(path("a/b"));
    writeFile(path("a/b/target"));
    ASSERT_TRUE(create(path("a/b/target"), path("mark")));
    rename(path("a"), path("c"));
    EXPECT_EQ(resolve(path("mark")), path("c/b/target"));
}

TEST_F(CBaseMacOSBookmarkTest, ATargetOnAnotherVolumeIsLost) {
    TestSupport::CSecondVolume const volume(path());
    if (!volume.isThere())
        GTEST_SKIP() << volume.reason();
    writeFile(volume.path("file"), readFile(path("file")));
    removeTree(path("file"));
    EXPECT_EQ(resolve(path("mark")), nothing);
}

TEST_F(CBaseMacOSBookmarkTest, TheTwoCanMoveToAnotherVolumeTogether) {
    TestSupport::CSecondVolume const volume(path());
    if (!volume.isThere())
        GTEST_SKIP() << volume.reason();
    makeFolders(path("marks"));
    ASSERT_TRUE(create(path("file"), path("marks/mark")));
    makeFolders(volume.path("marks"));
    writeFile(volume.path("file"), readFile(path("file")));
    writeFile(volume.path("marks/mark"), readFile(path("marks/mark")));
    removeTree(path("file"));
    EXPECT_EQ(resolve(volume.path("marks/mark")), volume.path("file"));
}

TEST_F(CBaseMacOSBookmarkTest, TheTwoCanMoveTogether) {
    makeFolders(path("a/files"));
    makeFolders(path("a/marks"));
    writeFile(path("a/files/target"));
    ASSERT_TRUE(create(path("a/files/target"), path("a/marks/mark")));
    rename(path("a"), path("b"));
    EXPECT_EQ(resolve(path("b/marks/mark")), path("b/files/target"));

    // A copy of both leads to the copy once the first target is gone.
    makeFolders(path("c/files"));
    makeFolders(path("c/marks"));
    writeFile(path("c/files/target"));
    writeFile(path("c/marks/mark"), readFile(path("b/marks/mark")));
    removeTree(path("b"));
    EXPECT_EQ(resolve(path("c/marks/mark")), path("c/files/target"));
}

TEST_F(CBaseMacOSBookmarkTest, TheBookmarkAloneCanMove) {
    makeFolders(path("a/b"));
    rename(path("mark"), path("a/b/mark"));
    EXPECT_EQ(resolve(path("a/b/mark")), path("file"));
    rename(path("file"), path("renamed"));
    EXPECT_EQ(resolve(path("a/b/mark")), path("renamed"));
}

TEST_F(CBaseMacOSBookmarkTest, TheRelativePathIsMeasuredBetweenRealFolders) {
    makeFolders(path("deep/er/marks"));
    makeLink("deep/er/marks", path("way"));
    ASSERT_TRUE(create(path("file"), path("way/mark")));
    EXPECT_EQ(entryOf(readFile(path("way/mark")), "X-QORN-RelativePath"), "../../../file");
    setEntry(path("way/mark"), "X-QORN-Path", "/nowhere/file");
    EXPECT_EQ(resolve(path("way/mark")), path("file"));
}

// --- which comes first

TEST_F(CBaseMacOSBookmarkTest, AnotherFileInTheTargetsPlaceIsMeant) {
    rename(path("file"), path("old"));
    writeFile(path("file"), "saved anew");
    EXPECT_EQ(resolve(path("mark")), path("file"));
    removeTree(path("old"));
    removeTree(path("file"));
    writeFile(path("file"));
    EXPECT_EQ(resolve(path("mark")), path("file"));
}

TEST_F(CBaseMacOSBookmarkTest, TheRelativePathComesBeforeTheIdentity) {
    makeFolders(path("a"));
    rename(path("mark"), path("a/mark"));
    writeFile(path("a/file"));
    EXPECT_EQ(resolve(path("a/mark")), path("file"));
    rename(path("file"), path("renamed"));
    EXPECT_EQ(resolve(path("a/mark")), path("a/file"));
    removeTree(path("a/file"));
    EXPECT_EQ(resolve(path("a/mark")), path("renamed"));
}

// --- the identity

TEST_F(CBaseMacOSBookmarkTest, AnotherFileOfTheSameNumberIsNotTheTarget) {
    SKIP_WITHOUT_BIRTH_TIMES();
    rename(path("file"), path("renamed"));
    setEntry(path("mark"), "X-QORN-BirthTime", "1");
    EXPECT_EQ(resolve(path("mark")), nothing);
}

TEST_F(CBaseMacOSBookmarkTest, ADeviceCanGetAnotherNumber) {
    SKIP_WITHOUT_BIRTH_TIMES();
    rename(path("file"), path("renamed"));
    setEntry(path("mark"), "X-QORN-Device", "1");
    EXPECT_EQ(resolve(path("mark")), path("renamed"));
}

TEST_F(CBaseMacOSBookmarkTest, WithoutABirthTimeTheDeviceCounts) {
    CSystemCalls system;
    system.onStatx = [](std::string const&, struct statx& status) {
        status.stx_mask &= ~unsigned{STATX_BTIME};
    };
    ASSERT_TRUE(create(path("file"), path("mark")));
    EXPECT_EQ(entryOf(readFile(path("mark")), "X-QORN-BirthTime"), "(missing)");
    rename(path("file"), path("renamed"));
    EXPECT_EQ(resolve(path("mark")), path("renamed"));
    setEntry(path("mark"), "X-QORN-Device", "1");
    EXPECT_EQ(resolve(path("mark")), nothing);
}

TEST_F(CBaseMacOSBookmarkTest, WithoutAnIdentityThePathsLeadAlone) {
    setEntry(path("mark"), "X-QORN-Inode", "");
    EXPECT_EQ(resolve(path("mark")), path("file"));
    rename(path("file"), path("renamed"));
    EXPECT_EQ(resolve(path("mark")), nothing);
}

TEST_F(CBaseMacOSBookmarkTest, WithoutARelativePathTheIdentityLeads) {
    setEntry(path("mark"), "X-QORN-RelativePath", "");
    EXPECT_EQ(resolve(path("mark")), path("file"));
    rename(path("file"), path("renamed"));
    EXPECT_EQ(resolve(path("mark")), path("renamed"));
}

// --- failures

TEST_F(CBaseMacOSBookmarkTest, ADeletedTargetIsAFailure) {
    removeTree(path("file"));
    EXPECT_EQ(resolve(path("mark")), nothing);
}

TEST_F(CBaseMacOSBookmarkTest, AMissingSourceLeavesNoFile) {
    CSystemCalls const system;
    EXPECT_FALSE(create(path("none"), path("new")));
    EXPECT_FALSE(create("", path("new")));
    EXPECT_FALSE(create(path("file/none"), path("new")));
    EXPECT_FALSE(create(path("none/../file"), path("new")));
    EXPECT_EQ(listTree(path()), (TNames{"file", "mark"}));
    EXPECT_TRUE(system.logged.empty());
}

TEST_F(CBaseMacOSBookmarkTest, AMissingSourceLeavesAnOldBookmarkAlone) {
    std::string const text = readFile(path("mark"));
    EXPECT_FALSE(create(path("none"), path("mark")));
    EXPECT_EQ(readFile(path("mark")), text);
}

TEST_F(CBaseMacOSBookmarkTest, ABookmarkThatCannotBeWrittenIsLogged) {
    makeFolders(path("folder"));
    ASSERT_EQ(chdir(path().c_str()), 0);
    struct CRow {
        std::string bookmark;
        std::string line;
    };
    for (CRow const& row :
         std::vector<CRow>{{path("none/new"), "error is No such file or directory"},
                           {path("file/new"), "error is Not a directory"},
                           {path("folder"), "error is Is a directory"},
                           {"", "error is No such file or directory"},
                           {path(std::string(256, 'n')), "error is File name too long"}}) {
        CSystemCalls const system;
        EXPECT_FALSE(create(path("file"), row.bookmark)) << row.bookmark;
        EXPECT_EQ(system.logged, TNames{row.line});
    }
    ASSERT_EQ(chdir("/"), 0);
    EXPECT_EQ(listTree(path()), (TNames{"file", "folder", "mark"}));
}

TEST_F(CBaseMacOSBookmarkTest, AFailedWriteLeavesAllAsItWas) {
    std::string const text = readFile(path("mark"));
    struct CRow {
        std::string function;
        int error;
        std::string line;
    };
    for (CRow const& row : std::vector<CRow>{{"open", EACCES, "error is Permission denied"},
                                             {"write", ENOSPC, "error is No space left on device"},
                                             {"close", EIO, "error is Input/output error"},
                                             {"rename", EROFS, "error is Read-only file system"}}) {
        for (std::string const bookmark : {"mark", "new"}) {
            CSystemCalls system;
            system.fail(row.function, row.error);
            EXPECT_FALSE(create(path("file"), path(bookmark))) << row.function;
            EXPECT_EQ(system.logged, TNames{row.line});
            EXPECT_EQ(listTree(path()), (TNames{"file", "mark"})) << row.function;
            EXPECT_EQ(readFile(path("mark")), text) << row.function;
        }
    }
}

TEST_F(CBaseMacOSBookmarkTest, TheBookmarkAppearsWhole) {
    CSystemCalls system;
    std::string const before = readFile(path("mark"));
    std::string scratchText;
    system.onRename = [&](std::string const& from, std::string const& to) {
        EXPECT_EQ(to, path("mark"));
        EXPECT_EQ(readFile(to), before);
        scratchText = readFile(from);
    };
    makeFolders(path("other"));
    ASSERT_TRUE(create(path("other"), path("mark")));
    EXPECT_NE(scratchText, before);
    EXPECT_EQ(readFile(path("mark")), scratchText);
}

TEST_F(CBaseMacOSBookmarkTest, AFolderThatMayNotBeWrittenIsAFailure) {
    makeFolders(path("folder"));
    chmod(path("folder").c_str(), 0555);
    runAsOrdinaryUser([this] {
        CSystemCalls const system;
        EXPECT_FALSE(create(path("file"), path("folder/mark")));
        EXPECT_EQ(system.logged, TNames{"error is Permission denied"});
    });
    EXPECT_TRUE(listTree(path("folder")).empty());
}

TEST_F(CBaseMacOSBookmarkTest, ABookmarkThatMayNotBeReadIsAFailure) {
    chmod(path("mark").c_str(), 0);
    runAsOrdinaryUser([this] { EXPECT_EQ(resolve(path("mark")), nothing); });
}

TEST_F(CBaseMacOSBookmarkTest, FoldersThatMayNotBeReadAreSearchedAround) {
    makeFolders(path("closed/a"));
    makeFolders(path("open/a"));
    makeFolders(path("ended"));
    rename(path("file"), path("open/a/renamed"));
    chmod(path("closed").c_str(), 0);
    chmod(path("ended").c_str(), 0111);
    runAsOrdinaryUser([this] { EXPECT_EQ(resolve(path("mark")), path("open/a/renamed")); });
}

// --- what is no bookmark

TEST_F(CBaseMacOSBookmarkTest, AnyOtherFileIsAFailure) {
    std::string const text = readFile(path("mark"));
    for (std::string const& other :
         TNames{"", "text", "\n\n", text.substr(0, text.find("Type=")), "[Other]\n" + text,
                std::string("\0\1\2\xFF\xFE", 5), text + '\0', std::string(100000, 'x'),
                text + std::string(65536, '#'), std::string(65536, '\n') + text}) {
        writeFile(path("other"), other);
        EXPECT_EQ(resolve(path("other")), nothing) << other.substr(0, 40);
    }
    EXPECT_EQ(resolve(path("file")), nothing);
    EXPECT_EQ(resolve(path("none")), nothing);
    EXPECT_EQ(resolve(path("file/none")), nothing);
    EXPECT_EQ(resolve(path()), nothing);
    EXPECT_EQ(resolve(""), nothing);
    EXPECT_EQ(resolve("/dev/zero"), nothing);
}

TEST_F(CBaseMacOSBookmarkTest, APipeIsNotWaitedFor) {
    ASSERT_EQ(mkfifo(path("pipe").c_str(), 0600), 0);
    EXPECT_EQ(resolve(path("pipe")), nothing);
}

TEST_F(CBaseMacOSBookmarkTest, ALinkToABookmarkLeadsOn) {
    makeFolders(path("a"));
    makeLink("../mark", path("a/link"));
    EXPECT_EQ(resolve(path("a/link")), path("file"));
    // Relative to the bookmark itself.
    setEntry(path("mark"), "X-QORN-Path", "/nowhere/file");
    writeFile(path("a/file"));
    EXPECT_EQ(resolve(path("a/link")), path("file"));
}

TEST_F(CBaseMacOSBookmarkTest, ALinkToItsTargetIsNoBookmark) {
    makeLink("file", path("link"));
    makeLink("loop", path("loop"));
    EXPECT_EQ(resolve(path("link")), nothing);
    EXPECT_EQ(resolve(path("loop")), nothing);
}

TEST_F(CBaseMacOSBookmarkTest, ALinkInTheBookmarksPlaceIsReplaced) {
    makeLink("file", path("link"));
    ASSERT_TRUE(create(path("file"), path("link")));
    EXPECT_EQ(readFile(path("file")), "text");
    EXPECT_EQ(resolve(path("link")), path("file"));
}

// --- text

TEST_F(CBaseMacOSBookmarkTest, APathThatIsNotUTF8LeavesTheResult) {
    setEntry(path("mark"), "X-QORN-Path", path() + "/f\xE4");
    writeFile(path("f\xE4"));
    Strings::string result = L"before";
    EXPECT_EQ(TestSupport::conversionFailureOf([&] {
                  MacOS::resolveBookmarkFile(Encoding::convert<Strings::string>(path("mark")),
                                             result);
              }).function,
              "CFStringCreateWithBytes");
    EXPECT_EQ(result, L"before");
}

} // namespace
