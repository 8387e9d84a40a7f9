// What every system's services promise, held against the real system.

#include "1Base/BaseMacOS/BaseMacOS.h"
#include "1Base/Encoding/EncodingConverter.h"
#include "support/FileRoot.h"

#include <pwd.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cstdio>
#include <string>

namespace {

Strings::string wide(std::string const& text) {
    return Encoding::convert<Strings::string>(text);
}

class BaseMacOSServicesTest : public TestSupport::CFileRootTest {
  protected:
    BaseMacOSServicesTest() { TestSupport::writeFile(target); }

    // Whether the bookmark leads to this very file: its path may have another spelling.
    bool leadsTo(std::string const& file) const {
        Strings::string found;
        if (!MacOS::resolveBookmarkFile(wide(bookmark), found))
            return false;
        struct stat expected;
        struct stat actual;
        return stat(file.c_str(), &expected) == 0 &&
               stat(Encoding::convert<std::string>(found).c_str(), &actual) == 0 &&
               expected.st_dev == actual.st_dev && expected.st_ino == actual.st_ino;
    }

    std::string const target = path("Gr\xC3\xBC\xC3\x9F"
                                    "e 1.odt");
    std::string const bookmark = path("alias");
};

TEST_F(BaseMacOSServicesTest, TheUserIsTheEffectiveOne) {
    EXPECT_EQ(MacOS::getUserName(true), wide(getpwuid(geteuid())->pw_name));
}

TEST_F(BaseMacOSServicesTest, TheHiddenFlagOfAFileCanBeSetAndCleared) {
    EXPECT_TRUE(MacOS::setHiddenAttribute(wide(target), true));
    EXPECT_TRUE(MacOS::setHiddenAttribute(wide(target), false));
    EXPECT_FALSE(MacOS::setHiddenAttribute(wide(path("missing")), true));
}

TEST_F(BaseMacOSServicesTest, ABookmarkLeadsToItsTarget) {
    EXPECT_TRUE(MacOS::createBookmarkFile(wide(target), wide(bookmark)));
    EXPECT_TRUE(leadsTo(target));
}

TEST_F(BaseMacOSServicesTest, ABookmarkLeadsToATargetThatWasRenamed) {
    EXPECT_TRUE(MacOS::createBookmarkFile(wide(target), wide(bookmark)));
    ASSERT_EQ(std::rename(target.c_str(), path("renamed.odt").c_str()), 0);
    EXPECT_TRUE(leadsTo(path("renamed.odt")));
}

TEST_F(BaseMacOSServicesTest, AMissingTargetHasNoBookmark) {
    EXPECT_FALSE(MacOS::createBookmarkFile(wide(path("missing")), wide(bookmark)));
    EXPECT_FALSE(TestSupport::pathExists(bookmark));
}

TEST_F(BaseMacOSServicesTest, WhatIsNoBookmarkLeadsNowhere) {
    Strings::string found = L"as it was";
    EXPECT_FALSE(MacOS::resolveBookmarkFile(wide(target), found));
    EXPECT_FALSE(MacOS::resolveBookmarkFile(wide(path("missing")), found));
    EXPECT_EQ(found, L"as it was");
}

TEST_F(BaseMacOSServicesTest, PreferencesLieBelowALibrary) {
    Strings::string const tail = L"Library/Preferences";
    auto const folder = MacOS::getSpecialFolder(MacOS::sftPreferences, MacOS::sfdUser);
    ASSERT_GT(folder.size(), tail.size());
    EXPECT_EQ(folder.substr(folder.size() - tail.size()), tail);
}

TEST_F(BaseMacOSServicesTest, TemporaryItemsEndInASeparator) {
    auto const folder = MacOS::getSpecialFolder(MacOS::sftTemporaryItems, MacOS::sfdSystem);
    EXPECT_EQ(folder.back(), L'/');
    EXPECT_TRUE(TestSupport::pathExists(Encoding::convert<std::string>(folder)));
    EXPECT_EQ(folder, MacOS::getSpecialFolder(MacOS::sftTemporaryItems, MacOS::sfdUser));
}

} // namespace
