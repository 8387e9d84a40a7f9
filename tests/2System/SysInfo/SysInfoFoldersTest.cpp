// The well-known folders, under a home and variables of the test's own.

#include "2System/SysInfo/SysInfoFolders.h"

#include "1Base/BaseMacOS/BaseMacOS.h"
#include "2System/FileSys/FileSysTempFile.h"
#include "support/FileFailures.h"
#include "support/FileRoot.h"
#include "support/SystemCalls.h"

#include <gtest/gtest.h>

#include <unistd.h>

#include <cerrno>
#include <cstdlib>
#include <string>
#include <type_traits>
#include <utility>
#include <vector>

// What was asked of MacOS::getSpecialFolder, by its numbers.
static std::vector<std::pair<int, int>> asked;

Strings::string realFolder(MacOS::TSystemFolderType type,
                           MacOS::TSystemFolderDomain domain) __asm__("__real_" SPECIAL_FOLDER);
Strings::string wrapFolder(MacOS::TSystemFolderType type,
                           MacOS::TSystemFolderDomain domain) __asm__("__wrap_" SPECIAL_FOLDER);

Strings::string wrapFolder(MacOS::TSystemFolderType type, MacOS::TSystemFolderDomain domain) {
    asked.emplace_back(type, domain);
    return realFolder(type, domain);
}

namespace {

using FileSys::CFileSpec;
using TestSupport::CFileFailure;
using TestSupport::CSystemCalls;
using TestSupport::errorText;
using TestSupport::failureOf;
using TestSupport::listTree;
using TestSupport::wide;

using TNames = std::vector<std::string>;

// Names and signatures.
using TFolder = Strings::string();
static_assert(std::is_same_v<decltype(SysInfo::getUserDocumentFolder), TFolder>);
static_assert(std::is_same_v<decltype(SysInfo::getSharedUserDataFolder), TFolder>);
static_assert(std::is_same_v<decltype(SysInfo::getUserDesktopFolder), TFolder>);
static_assert(std::is_same_v<decltype(SysInfo::getUserLibraryFolder), TFolder>);
static_assert(std::is_same_v<decltype(SysInfo::getSystemLibraryFolder), TFolder>);
static_assert(std::is_same_v<decltype(SysInfo::getProgramsFolder), TFolder>);
static_assert(std::is_same_v<decltype(SysInfo::getSystemFontFolder), TFolder>);
static_assert(std::is_same_v<decltype(SysInfo::getAllUsersFontFolder), TFolder>);
static_assert(std::is_same_v<decltype(SysInfo::getUserFontFolder), TFolder>);
static_assert(std::is_same_v<decltype(SysInfo::getSystemApplicationSupportFolder), TFolder>);
static_assert(std::is_same_v<decltype(SysInfo::getUserApplicationSupportFolder), TFolder>);
static_assert(std::is_same_v<decltype(SysInfo::getSystemTemporaryItemsFolder_), TFolder>);
static_assert(std::is_same_v<decltype(SysInfo::getSystemTemporaryItemsFolder), TFolder>);
static_assert(std::is_same_v<decltype(SysInfo::getUserTemporaryItemsFolder), TFolder>);
static_assert(
    std::is_same_v<decltype(SysInfo::setSystemTemporaryItemsFolder), bool(Strings::string const&)>);
static_assert(std::is_same_v<decltype(SysInfo::getUserPreferenceFolder), CFileSpec()>);
static_assert(std::is_same_v<decltype(SysInfo::getSystemPreferenceFolder), CFileSpec()>);

class CSysInfoFoldersTest : public TestSupport::CFileRootTest {
  protected:
    void set(std::string const& name, std::string const& value) {
        root().environment().set(name, value);
    }
};

// Several of them are one folder on this system, and differ on others.
TEST_F(CSysInfoFoldersTest, EachAsksForItsKindAndDomain) {
    root().environment().unset("TMPDIR");
    std::pair<TFolder*, std::pair<int, int>> const rows[] = {
        {SysInfo::getUserDocumentFolder, {1, 1}},
        {SysInfo::getSharedUserDataFolder, {2, 0}},
        {SysInfo::getUserDesktopFolder, {3, 1}},
        {SysInfo::getUserLibraryFolder, {4, 1}},
        {SysInfo::getSystemLibraryFolder, {4, 0}},
        {SysInfo::getProgramsFolder, {5, 0}},
        {SysInfo::getSystemFontFolder, {6, 2}},
        {SysInfo::getAllUsersFontFolder, {6, 0}},
        {SysInfo::getUserFontFolder, {6, 1}},
        {SysInfo::getSystemTemporaryItemsFolder_, {7, 0}},
        {SysInfo::getSystemTemporaryItemsFolder, {7, 0}},
        {SysInfo::getUserTemporaryItemsFolder, {7, 0}},
        {SysInfo::getSystemApplicationSupportFolder, {8, 0}},
        {SysInfo::getUserApplicationSupportFolder, {8, 1}}};
    std::vector<std::pair<int, int>> expected;
    asked.clear();
    for (auto const& [function, kindAndDomain] : rows) {
        function();
        expected.push_back(kindAndDomain);
    }
    SysInfo::getUserPreferenceFolder();
    SysInfo::getSystemPreferenceFolder();
    expected.insert(expected.end(), {{0, 1}, {0, 0}});
    EXPECT_EQ(asked, expected);
}

TEST_F(CSysInfoFoldersTest, DocumentsAndDesktopLieInTheUsersHome) {
    EXPECT_EQ(SysInfo::getUserDocumentFolder(), wide(root().home()) + L"/Documents");
    EXPECT_EQ(SysInfo::getUserDesktopFolder(), wide(root().home()) + L"/Desktop");
}

TEST_F(CSysInfoFoldersTest, TheUsersOwnChoiceOfFoldersCounts) {
    TestSupport::makeFolders(root().home() + "/.config");
    TestSupport::writeFile(root().home() + "/.config/user-dirs.dirs",
                           "XDG_DOCUMENTS_DIR=\"$HOME/Dokumente\"\n"
                           "XDG_DESKTOP_DIR=\"/srv/desk\"\n");
    EXPECT_EQ(SysInfo::getUserDocumentFolder(), wide(root().home()) + L"/Dokumente");
    EXPECT_EQ(SysInfo::getUserDesktopFolder(), L"/srv/desk");
}

TEST_F(CSysInfoFoldersTest, TheUsersDataLieInTheDataFolder) {
    set("XDG_DATA_HOME", "/data \u00E9");
    EXPECT_EQ(SysInfo::getUserLibraryFolder(), L"/data \u00E9");
    EXPECT_EQ(SysInfo::getUserApplicationSupportFolder(), L"/data \u00E9");
    EXPECT_EQ(SysInfo::getUserFontFolder(), L"/data \u00E9/fonts");
}

TEST_F(CSysInfoFoldersTest, ARelativeOrEmptyDataFolderIsPassedOver) {
    for (char const* const value : {"relative", ""}) {
        set("XDG_DATA_HOME", value);
        EXPECT_EQ(SysInfo::getUserLibraryFolder(), wide(root().home()) + L"/.local/share");
    }
}

TEST_F(CSysInfoFoldersTest, WhatIsSharedHasAFixedPlace) {
    EXPECT_EQ(SysInfo::getSharedUserDataFolder(), L"/srv/Shared");
    EXPECT_EQ(SysInfo::getSystemLibraryFolder(), L"/usr/local/share");
    EXPECT_EQ(SysInfo::getSystemApplicationSupportFolder(), L"/usr/local/share");
    EXPECT_EQ(SysInfo::getProgramsFolder(), L"/usr/local/bin");
    EXPECT_EQ(SysInfo::getSystemFontFolder(), L"/usr/share/fonts");
    EXPECT_EQ(SysInfo::getAllUsersFontFolder(), L"/usr/local/share/fonts");
}

TEST_F(CSysInfoFoldersTest, PreferencesLieInTheConfigurationFolders) {
    set("XDG_CONFIG_HOME", "/config");
    set("XDG_CONFIG_DIRS", "relative:/first:/second");
    EXPECT_EQ(SysInfo::getUserPreferenceFolder(), CFileSpec(L"/config/Library/Preferences"));
    EXPECT_EQ(SysInfo::getSystemPreferenceFolder(), CFileSpec(L"/first/Library/Preferences"));
}

class CTemporaryItemsTest : public CSysInfoFoldersTest {
  protected:
    static void expectFolder(Strings::string const& folder) {
        EXPECT_EQ(SysInfo::getSystemTemporaryItemsFolder_(), folder);
        EXPECT_EQ(SysInfo::getSystemTemporaryItemsFolder(), folder);
        EXPECT_EQ(SysInfo::getUserTemporaryItemsFolder(), folder);
    }

    bool setFolder(std::string const& name) const {
        return SysInfo::setSystemTemporaryItemsFolder(wide(path(name)));
    }

    static std::string variable() {
        char const* const value = std::getenv("TMPDIR");
        return value == nullptr ? "unset" : value;
    }
};

TEST_F(CTemporaryItemsTest, TheVariableIsTheFolderAsItStands) {
    for (char const* const folder : {"/some/tmp", "/some/tmp/", "relative", "/a b/caf\u00E9"}) {
        set("TMPDIR", folder);
        expectFolder(wide(folder));
    }
}

TEST_F(CTemporaryItemsTest, AnEmptyVariableIsSet) {
    set("TMPDIR", "");
    expectFolder(L"");
}

TEST_F(CTemporaryItemsTest, WithoutTheVariableTheSystemsFolderIs) {
    root().environment().unset("TMPDIR");
    expectFolder(L"/tmp/");
}

TEST_F(CTemporaryItemsTest, ASetFolderIsMadeWithItsParents) {
    EXPECT_TRUE(setFolder("a/b/caf\u00E9"));
    expectFolder(wide(path("a/b/caf\u00E9")));
    EXPECT_EQ(variable(), path("a/b/caf\u00E9"));
    EXPECT_EQ(listTree(path()), (TNames{"a", "a/b", "a/b/caf\u00E9"}));
    CFileSpec const file = FileSys::createTempFile(CFileSpec());
    EXPECT_EQ(file.getParentFolder(), CFileSpec(path("a/b/caf\u00E9")));
}

TEST_F(CTemporaryItemsTest, AFolderThatIsThereWillDo) {
    EXPECT_TRUE(SysInfo::setSystemTemporaryItemsFolder(wide(path())));
    expectFolder(wide(path()));
    EXPECT_TRUE(listTree(path()).empty());
}

// Its parent is the empty specification, which can't be made; the folder itself can.
TEST_F(CTemporaryItemsTest, ABareNameIsMadeInTheWorkingFolder) {
    ASSERT_EQ(chdir(path().c_str()), 0);
    EXPECT_TRUE(SysInfo::setSystemTemporaryItemsFolder(L"bare"));
    expectFolder(L"bare");
    EXPECT_EQ(listTree(path()), TNames{"bare"});
}

TEST_F(CTemporaryItemsTest, WhereTheVariableCannotBeSetNothingElseIsDone) {
    std::string const before = variable();
    CSystemCalls calls;
    calls.fail("setenv", ENOMEM);
    EXPECT_FALSE(setFolder("new"));
    EXPECT_EQ(calls.count("setenv"), 1U);
    EXPECT_EQ(variable(), before);
    EXPECT_TRUE(listTree(path()).empty());
}

TEST_F(CTemporaryItemsTest, AFailureOfTheParentAloneIsSwallowed) {
    CSystemCalls calls;
    calls.fail("mkdir", EIO, 1);
    EXPECT_TRUE(setFolder("a/b"));
    EXPECT_EQ(listTree(path()), (TNames{"a", "a/b"}));
}

TEST_F(CTemporaryItemsTest, AFailureOfTheFolderPasses) {
    CSystemCalls calls;
    calls.fail("mkdir", EIO, 2);
    CFileFailure const failure = failureOf([&] { setFolder("a/b"); });
    EXPECT_EQ(failure.name, "FileSpec");
    EXPECT_EQ(failure.parameters,
              TestSupport::couldNot(L"create", L"folder", wide(path("a/b")), errorText(EIO)));
    EXPECT_EQ(failure.trace,
              (TNames{"doCreateFolder", "createFolder", "setSystemTemporaryItemsFolder"}));
    // The parent is there, and the variable is set all the same.
    EXPECT_EQ(listTree(path()), TNames{"a"});
    EXPECT_EQ(variable(), path("a/b"));
}

TEST_F(CTemporaryItemsTest, AFileInTheWayIsAFailureOfTheFolder) {
    TestSupport::writeFile(path("file"));
    EXPECT_EQ(failureOf([&] { setFolder("file/a/b"); }).parameters,
              TestSupport::couldNot(L"create", L"folder", wide(path("file/a/b")),
                                    TestSupport::reasonOfNoFolder(path("file/a/b"))));
    EXPECT_EQ(listTree(path()), TNames{"file"});
}

TEST_F(CTemporaryItemsTest, ANameThatIsTooLongIsAFailureOfTheFolder) {
    EXPECT_EQ(failureOf([&] { setFolder(std::string(300, 'n') + "/b"); }).name, "StdLibException");
    EXPECT_TRUE(listTree(path()).empty());
}

TEST_F(CTemporaryItemsTest, TheEmptyTextIsSetAndIsNoFolder) {
    EXPECT_EQ(failureOf([] { SysInfo::setSystemTemporaryItemsFolder(L""); }).name, "FileSpec");
    expectFolder(L"");
}

TEST_F(CTemporaryItemsTest, ATextWithoutANarrowFormIsAFailureAndSetsNothing) {
    std::string const before = variable();
    Strings::string const text{L'/', static_cast<wchar_t>(0x110000)};
    EXPECT_EQ(failureOf([&] { SysInfo::setSystemTemporaryItemsFolder(text); }).name, "Encoding");
    EXPECT_EQ(variable(), before);
}

TEST_F(CTemporaryItemsTest, AVariableThatIsNoTextIsAFailure) {
    set("TMPDIR", "/\xFF");
    EXPECT_EQ(failureOf([] { SysInfo::getSystemTemporaryItemsFolder(); }).name, "Encoding");
}

} // namespace
