#include "1Base/BaseMacOS/BaseMacOS.h"

#include "1Base/BaseMacOS/BaseMacOSSystemCalls.h"
#include "1Base/Encoding/EncodingConverter.h"
#include "support/FileRoot.h"
#include "support/TextFailures.h"

#include <string>
#include <vector>

namespace {

using MacOS::TSystemFolderDomain;
using MacOS::TSystemFolderType;
using TestSupport::CSystemCalls;

class CBaseMacOSFoldersTest : public TestSupport::CFileRootTest {
  protected:
    std::string home() { return root().home(); }
    TestSupport::CEnvironment& environment() { return root().environment(); }

    void writeUserDirs(std::string const& text) {
        TestSupport::makeFolders(home() + "/.config");
        TestSupport::writeFile(home() + "/.config/user-dirs.dirs", text);
    }
};

std::string folder(int type, int domain) {
    return Encoding::convert<std::string>(MacOS::getSpecialFolder(
        static_cast<TSystemFolderType>(type), static_cast<TSystemFolderDomain>(domain)));
}

std::string failedCheck(int type, int domain) {
    return TestSupport::failedCheckOf([=] { folder(type, domain); });
}

std::string documents() {
    return folder(MacOS::sftDocuments, MacOS::sfdUser);
}

std::string desktop() {
    return folder(MacOS::sftDesktop, MacOS::sfdUser);
}

std::string preferences(TSystemFolderDomain domain) {
    return folder(MacOS::sftPreferences, domain);
}

// --- the table

TEST_F(CBaseMacOSFoldersTest, EachKindHasItsFolderInEachDomain) {
    for (std::string const variable : {"XDG_CONFIG_HOME", "XDG_CONFIG_DIRS", "XDG_DATA_HOME"})
        environment().unset(variable);

    // By the values 0 (local), 1 (user) and 2 (system) of the domain.
    std::vector<std::vector<std::string>> const expected = {
        {"/etc/xdg/Library/Preferences", home() + "/.config/Library/Preferences",
         "/usr/share/Library/Preferences"},
        {home() + "/Documents", home() + "/Documents", home() + "/Documents"},
        {"/srv/Shared", "/srv/Shared", "/srv/Shared"},
        {home() + "/Desktop", home() + "/Desktop", home() + "/Desktop"},
        {"/usr/local/share", home() + "/.local/share", "/usr/share"},
        {"/usr/local/bin", home() + "/.local/bin", "/usr/bin"},
        {"/usr/local/share/fonts", home() + "/.local/share/fonts", "/usr/share/fonts"},
        {"/tmp/", "/tmp/", "/tmp/"},
        {"/usr/local/share", home() + "/.local/share", "/usr/share"}};
    for (int type = 0; type < 9; ++type)
        for (int domain = 0; domain < 3; ++domain)
            EXPECT_EQ(folder(type, domain),
                      expected[static_cast<std::size_t>(type)][static_cast<std::size_t>(domain)])
                << type << ", " << domain;
}

TEST_F(CBaseMacOSFoldersTest, AnUnknownKindCountsAsDocuments) {
    for (int const type : {9, 10, 100, -1, 0x7FFFFFFF, -0x7FFFFFFF - 1})
        EXPECT_EQ(folder(type, MacOS::sfdUser), documents()) << type;
}

TEST_F(CBaseMacOSFoldersTest, AnUnknownDomainCountsAsLocal) {
    for (int const domain : {3, 8, 100, -1, 0x7FFFFFFF, -0x7FFFFFFF - 1}) {
        EXPECT_EQ(folder(MacOS::sftPreferences, domain), preferences(MacOS::sfdLocal)) << domain;
        EXPECT_EQ(folder(MacOS::sftFonts, domain), "/usr/local/share/fonts") << domain;
    }
}

TEST_F(CBaseMacOSFoldersTest, NothingIsCreated) {
    for (int type = 0; type < 9; ++type)
        folder(type, MacOS::sfdUser);
    EXPECT_TRUE(TestSupport::listTree(home()).empty());
}

TEST_F(CBaseMacOSFoldersTest, TemporaryItemsIgnoreTheVariable) {
    environment().set("TMPDIR", path());
    for (int const domain : {0, 1, 2, 3})
        EXPECT_EQ(folder(MacOS::sftTemporaryItems, domain), "/tmp/");
}

// --- the variables

TEST_F(CBaseMacOSFoldersTest, TheUsersBaseFoldersComeFromTheirVariables) {
    environment().set("XDG_CONFIG_HOME", "/conf");
    environment().set("XDG_DATA_HOME", "/data");
    EXPECT_EQ(preferences(MacOS::sfdUser), "/conf/Library/Preferences");
    EXPECT_EQ(folder(MacOS::sftLibrary, MacOS::sfdUser), "/data");
    EXPECT_EQ(folder(MacOS::sftApplicationSupport, MacOS::sfdUser), "/data");
    EXPECT_EQ(folder(MacOS::sftFonts, MacOS::sfdUser), "/data/fonts");
    EXPECT_EQ(folder(MacOS::sftFonts, MacOS::sfdSystem), "/usr/share/fonts");
}

TEST_F(CBaseMacOSFoldersTest, ARelativeOrEmptyVariableIsIgnored) {
    for (std::string const value : {"", "conf", "./conf", "~/conf", "../conf"}) {
        environment().set("XDG_CONFIG_HOME", value);
        environment().set("XDG_DATA_HOME", value);
        EXPECT_EQ(preferences(MacOS::sfdUser), home() + "/.config/Library/Preferences") << value;
        EXPECT_EQ(folder(MacOS::sftLibrary, MacOS::sfdUser), home() + "/.local/share") << value;
    }
}

TEST_F(CBaseMacOSFoldersTest, SeparatorsAtAVariablesEndAreDropped) {
    environment().set("XDG_CONFIG_HOME", "/conf//");
    environment().set("XDG_CONFIG_DIRS", "/etc/a/:/etc/b");
    environment().set("XDG_DATA_HOME", "/");
    EXPECT_EQ(preferences(MacOS::sfdUser), "/conf/Library/Preferences");
    EXPECT_EQ(preferences(MacOS::sfdLocal), "/etc/a/Library/Preferences");
    EXPECT_EQ(folder(MacOS::sftFonts, MacOS::sfdUser), "/fonts");
}

TEST_F(CBaseMacOSFoldersTest, TheFirstAbsoluteFolderOfTheListHoldsLocalPreferences) {
    struct CRow {
        std::string list;
        std::string expected;
    };
    for (CRow const& row : std::vector<CRow>{{"/etc/a:/etc/b", "/etc/a"},
                                             {"etc/a:/etc/b:/etc/c", "/etc/b"},
                                             {":/etc/b", "/etc/b"},
                                             {"::./x:/etc/b:", "/etc/b"},
                                             {"", "/etc/xdg"},
                                             {":", "/etc/xdg"},
                                             {"a:b", "/etc/xdg"}}) {
        environment().set("XDG_CONFIG_DIRS", row.list);
        EXPECT_EQ(preferences(MacOS::sfdLocal), row.expected + "/Library/Preferences") << row.list;
    }
}

TEST_F(CBaseMacOSFoldersTest, AColonDoesNotPartTheUsersOwnFolder) {
    environment().set("XDG_CONFIG_HOME", "/a:/b");
    EXPECT_EQ(preferences(MacOS::sfdUser), "/a:/b/Library/Preferences");
}

TEST_F(CBaseMacOSFoldersTest, VariablesAreReadAtEachCall) {
    environment().set("XDG_DATA_HOME", "/one");
    EXPECT_EQ(folder(MacOS::sftLibrary, MacOS::sfdUser), "/one");
    environment().set("XDG_DATA_HOME", "/two");
    EXPECT_EQ(folder(MacOS::sftLibrary, MacOS::sfdUser), "/two");
}

TEST_F(CBaseMacOSFoldersTest, NamesBeyondASCIIAreReadAsUTF8) {
    environment().set("XDG_DATA_HOME", "/d\xC3\xA4ta \xF0\x9F\x98\x80");
    EXPECT_EQ(MacOS::getSpecialFolder(MacOS::sftLibrary, MacOS::sfdUser), L"/d\u00E4ta \U0001F600");
}

TEST_F(CBaseMacOSFoldersTest, AFolderThatIsNotUTF8RaisesTheConversionFailure) {
    environment().set("XDG_DATA_HOME", "/d\xE4ta");
    EXPECT_EQ(TestSupport::conversionFailureOf([] {
                  MacOS::getSpecialFolder(MacOS::sftLibrary, MacOS::sfdUser);
              }).function,
              "CFStringCreateWithBytes");
}

// --- the home folder

TEST_F(CBaseMacOSFoldersTest, WithoutAnAbsoluteHomeTheListOfUsersNamesIt) {
    environment().unset("XDG_CONFIG_HOME");
    CSystemCalls system;
    system.setUser(TestSupport::CUserEntry{"ada", "", "/home/ada/"});
    environment().unset("HOME");
    EXPECT_EQ(documents(), "/home/ada/Documents");
    EXPECT_EQ(preferences(MacOS::sfdUser), "/home/ada/.config/Library/Preferences");
    for (std::string const value : {"", "home/ada", "."}) {
        environment().set("HOME", value);
        EXPECT_EQ(desktop(), "/home/ada/Desktop") << value;
    }
}

TEST_F(CBaseMacOSFoldersTest, HomeComesBeforeTheListOfUsers) {
    CSystemCalls system;
    system.setUser(TestSupport::CUserEntry{"ada", "", "/home/ada"});
    environment().set("HOME", "/elsewhere//");
    EXPECT_EQ(documents(), "/elsewhere/Documents");
    environment().set("HOME", "/");
    EXPECT_EQ(documents(), "/Documents");
    EXPECT_TRUE(system.usersAsked.empty());
}

TEST_F(CBaseMacOSFoldersTest, AUserWithoutAHomeHasNoFoldersOfItsOwn) {
    for (std::string const variable : {"HOME", "XDG_CONFIG_HOME", "XDG_DATA_HOME"})
        environment().unset(variable);
    CSystemCalls system;
    system.setUser(std::nullopt);
    for (int type = 0; type < 9; ++type) {
        bool const isShared = type == MacOS::sftSharedUserData || type == MacOS::sftTemporaryItems;
        EXPECT_EQ(failedCheck(type, MacOS::sfdUser), isShared ? "" : "[a count] > 0") << type;
    }
    EXPECT_EQ(failedCheck(MacOS::sftLibrary, MacOS::sfdLocal), "");
    EXPECT_EQ(failedCheck(MacOS::sftPreferences, MacOS::sfdLocal), "");
    EXPECT_EQ(failedCheck(99, 99), "[a count] > 0");

    environment().set("XDG_DATA_HOME", "/data");
    EXPECT_EQ(folder(MacOS::sftLibrary, MacOS::sfdUser), "/data");
}

// --- user-dirs.dirs

TEST_F(CBaseMacOSFoldersTest, DocumentsAndDesktopComeFromTheUsersFile) {
    writeUserDirs("# written by hand\n"
                  "XDG_DESKTOP_DIR=\"$HOME/Schreibtisch\"\n"
                  "\n"
                  "XDG_DOCUMENTS_DIR=\"/data/my papers\"\n");
    EXPECT_EQ(desktop(), home() + "/Schreibtisch");
    EXPECT_EQ(documents(), "/data/my papers");
    EXPECT_EQ(folder(77, MacOS::sfdUser), "/data/my papers");
}

TEST_F(CBaseMacOSFoldersTest, TheUsersFileLiesInTheConfigurationFolder) {
    writeUserDirs("XDG_DESKTOP_DIR=\"/wrong\"\n");
    TestSupport::writeFile(path("user-dirs.dirs"), "XDG_DESKTOP_DIR=\"/right\"");
    environment().set("XDG_CONFIG_HOME", path());
    EXPECT_EQ(desktop(), "/right");
}

TEST_F(CBaseMacOSFoldersTest, EachFormOfAnEntryIsRead) {
    struct CRow {
        std::string entry;
        std::string expected;
    };
    std::string const standard = home() + "/Desktop";
    for (CRow const& row :
         std::vector<CRow>{{"XDG_DESKTOP_DIR=\"$HOME/a\"", home() + "/a"},
                           {"XDG_DESKTOP_DIR=\"$HOME/a/\"", home() + "/a"},
                           {"XDG_DESKTOP_DIR=\"$HOME/\"", home()},
                           {"XDG_DESKTOP_DIR=\"$HOME\"", home()},
                           {"  XDG_DESKTOP_DIR = \"/b\"  ", "/b"},
                           {"\tXDG_DESKTOP_DIR=\"/b\" # why", "/b"},
                           {"XDG_DESKTOP_DIR=\"/b\"\r", "/b"},
                           {"XDG_DESKTOP_DIR=\"/b//\"", "/b"},
                           {"XDG_DESKTOP_DIR=\"/\"", "/"},
                           {"XDG_DESKTOP_DIR=\"/a\\\"b\\\\c\\$d\\`e\"", "/a\"b\\c$d`e"},
                           {"XDG_DESKTOP_DIR=\"/a\\nb\"", "/a\\nb"},
                           {"XDG_DESKTOP_DIR=\"/a#b=c\"", "/a#b=c"},
                           {"XDG_DESKTOP_DIR=\"$HOME/\xC3\x84\"", home() + "/\xC3\x84"},
                           {"XDG_DESKTOP_DIR=\"/a\"\nXDG_DESKTOP_DIR=\"/b\"", "/b"},
                           {"XDG_DESKTOP_DIR=\"/a\"\nXDG_DESKTOP_DIR=b", "/a"},
                           // Malformed, and so as if they were not there.
                           {"", standard},
                           {"XDG_DESKTOP_DIR", standard},
                           {"XDG_DESKTOP_DIR=", standard},
                           {"XDG_DESKTOP_DIR=/b", standard},
                           {"XDG_DESKTOP_DIR='/b'", standard},
                           {"XDG_DESKTOP_DIR=\"\"", standard},
                           {"XDG_DESKTOP_DIR=\"", standard},
                           {"XDG_DESKTOP_DIR=\"/b", standard},
                           {"XDG_DESKTOP_DIR=\"/b\\\"", standard},
                           {"XDG_DESKTOP_DIR=\"/b\\", standard},
                           {"XDG_DESKTOP_DIR=\"/b\"c", standard},
                           {"XDG_DESKTOP_DIR=\"b\"", standard},
                           {"XDG_DESKTOP_DIR=\"$HOMEb\"", standard},
                           {"XDG_DESKTOP_DIR=\"\\$HOME/b\"", standard},
                           {"XDG_DESKTOP_DIR=\"${HOME}/b\"", standard},
                           {"XDG_DESKTOP_DIR=\"~/b\"", standard},
                           {"#XDG_DESKTOP_DIR=\"/b\"", standard},
                           {"XDG_DESKTOP_DIRS=\"/b\"", standard},
                           {"DESKTOP_DIR=\"/b\"", standard},
                           {"xdg_desktop_dir=\"/b\"", standard},
                           {"export XDG_DESKTOP_DIR=\"/b\"", standard}}) {
        writeUserDirs(row.entry);
        EXPECT_EQ(desktop(), row.expected) << row.entry;
    }
}

TEST_F(CBaseMacOSFoldersTest, AUsersFileThatCannotBeReadIsIgnored) {
    TestSupport::makeFolders(home() + "/.config/user-dirs.dirs");
    EXPECT_EQ(desktop(), home() + "/Desktop");
    TestSupport::removeTree(home() + "/.config/user-dirs.dirs");
    writeUserDirs(std::string(70000, '\n') + "XDG_DESKTOP_DIR=\"/b\"\n");
    EXPECT_EQ(desktop(), home() + "/Desktop");
}

TEST_F(CBaseMacOSFoldersTest, AUsersFileOfBytesThatAreNoTextIsReadLineByLine) {
    writeUserDirs(std::string("\0\xFF\x80\n", 4) + "XDG_DESKTOP_DIR=\"/b\"\n");
    EXPECT_EQ(desktop(), "/b");
}

} // namespace
