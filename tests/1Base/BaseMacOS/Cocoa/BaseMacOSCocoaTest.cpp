// The source for Cocoa, run with GNUstep and held against what else is known of the same answers.

#include "1Base/BaseMacOS/BaseMacOS.h"
#include "1Base/BaseMacOS/Cocoa/BaseMacOSCocoaNative.h"
#include "1Base/BaseMacOS/Cocoa/BaseMacOSCocoaSystem.h"
#include "support/FileRoot.h"

#include <pwd.h>
#include <unistd.h>

#include <random>
#include <string>
#include <utility>
#include <vector>

namespace {

namespace Cocoa = MacOS::NativeCocoa;
namespace Linux = MacOS::Native;

using TCalls = std::vector<std::string>;

class BaseMacOSCocoaTest : public TestSupport::CFileRootTest {
  protected:
    TestSupport::CCocoaSystem system;
};

passwd const& user() {
    return *getpwuid(geteuid());
}

// A byte order mark at the beginning is no part of a text to GNUstep.
TEST_F(BaseMacOSCocoaTest, BothSidesEscapeTheSame) {
    constexpr unsigned mark = 0xFEFF;
    std::mt19937 random(20210305);
    std::uniform_int_distribution<int> length(0, 40);
    std::uniform_int_distribution<unsigned> kind(0, 3);
    unsigned const limits[] = {0x7F, 0x7FF, 0xFFFF, 0x10FFFF};
    for (int i = 0; i < 20000; ++i) {
        Strings::string text;
        for (int rest = length(random); rest > 0; --rest) {
            std::uniform_int_distribution<unsigned> code(1, limits[kind(random)]);
            auto const character = code(random);
            bool const isRead = character != mark || !text.empty();
            if (isRead && (character < 0xD800 || character > 0xDFFF))
                text += static_cast<wchar_t>(character);
        }
        auto const source = Encoding::convert<std::string>(text);
        ASSERT_EQ(Cocoa::addingPercentEscapes(source), Linux::addingPercentEscapes(source))
            << source;
    }
}

TEST_F(BaseMacOSCocoaTest, EveryCharacterOfASCIIIsEscapedTheSame) {
    for (char code = 1; code > 0; ++code)
        EXPECT_EQ(Cocoa::addingPercentEscapes(std::string(1, code)),
                  Linux::addingPercentEscapes(std::string(1, code)))
            << int{code};
    EXPECT_EQ(Cocoa::addingPercentEscapes("a b/c"), "a%20b%2Fc");
    EXPECT_EQ(Cocoa::addingPercentEscapes("\xC3\xA4"), "%C3%A4");
}

TEST_F(BaseMacOSCocoaTest, WhatIsNotUTF8GivesNothing) {
    EXPECT_EQ(Cocoa::addingPercentEscapes("\xFF"), "");
}

TEST_F(BaseMacOSCocoaTest, ATextEndsAtAZero) {
    EXPECT_EQ(Cocoa::addingPercentEscapes(std::string("a\0b", 3)), "a");
}

TEST_F(BaseMacOSCocoaTest, TheUserIsTheEffectiveOne) {
    EXPECT_EQ(Cocoa::getUserName(true), user().pw_name);
    EXPECT_EQ(Cocoa::getUserName(true), Linux::getUserName(true));
}

// A user whose full name differs from the login name: this one, or one that root can become.
passwd const* userWithAName() {
    auto const hasName = [](passwd const& entry) {
        std::string const name = entry.pw_gecos;
        return !name.empty() && name != entry.pw_name && name.find_first_of(",&") == name.npos;
    };
    if (geteuid() != 0)
        return hasName(user()) ? &user() : nullptr;
    setpwent();
    passwd const* entry = getpwent();
    while (entry != nullptr && !hasName(*entry))
        entry = getpwent();
    endpwent();
    return entry;
}

TEST_F(BaseMacOSCocoaTest, TheFullNameIsAnotherOne) {
    passwd const* const entry = userWithAName();
    if (entry == nullptr)
        GTEST_SKIP() << "no user with a full name of its own";
    std::string const login = entry->pw_name;
    std::string const fullName = entry->pw_gecos;
    uid_t const before = geteuid();
    ASSERT_EQ(seteuid(entry->pw_uid), 0);
    EXPECT_EQ(Cocoa::getUserName(true), login);
    EXPECT_EQ(Cocoa::getUserName(false), fullName);
    EXPECT_EQ(Cocoa::getUserName(false), Linux::getUserName(false));
    ASSERT_EQ(seteuid(before), 0);
}

TEST_F(BaseMacOSCocoaTest, TheMachineIsNamedByTheSystemsConfiguration) {
    system.computerName = "Ada\xE2\x80\x99s Mac";
    EXPECT_EQ(Cocoa::getMachineName(), "Ada\xE2\x80\x99s Mac");
    EXPECT_FALSE(system.sawStore);
    system.computerName.reset();
    EXPECT_EQ(Cocoa::getMachineName(), "");
}

TEST_F(BaseMacOSCocoaTest, TheModelIsTheKernelsValue) {
    system.model = std::string("MacPro7,1\0", 10);
    EXPECT_EQ(Cocoa::getModelIdentifier(), "MacPro7,1");
    EXPECT_EQ(system.calls, (TCalls{"hw.model", "hw.model"}));
}

TEST_F(BaseMacOSCocoaTest, TheModelEndsAtTheFirstZero) {
    system.model = "MacPro7,1";
    EXPECT_EQ(Cocoa::getModelIdentifier(), "MacPro7,1");
    system.model = std::string("Mac\0Pro", 7);
    EXPECT_EQ(Cocoa::getModelIdentifier(), "Mac");
}

TEST_F(BaseMacOSCocoaTest, WithoutAValueThereIsNoModel) {
    EXPECT_EQ(Cocoa::getModelIdentifier(), "");
    EXPECT_EQ(system.calls, TCalls{"hw.model"});
    system.model = "MacPro7,1";
    system.modelResult = -1;
    EXPECT_EQ(Cocoa::getModelIdentifier(), "");
}

TEST_F(BaseMacOSCocoaTest, TheFirstAddressOfTheUsersCardCounts) {
    system.addresses = {"ada@example.org", "lovelace@example.org"};
    EXPECT_EQ(Cocoa::getUserEmailAddress(), "ada@example.org");
    system.addresses->clear();
    EXPECT_EQ(Cocoa::getUserEmailAddress(), "");
    system.addresses.reset();
    EXPECT_EQ(Cocoa::getUserEmailAddress(), "");
    system.hasCard = false;
    EXPECT_EQ(Cocoa::getUserEmailAddress(), "");
}

TEST_F(BaseMacOSCocoaTest, TheHiddenFlagIsSetAndCleared) {
    std::string const file = path("Gr\xC3\xBC\xC3\x9F"
                                  "e %41.txt");
    TestSupport::writeFile(file);
    EXPECT_TRUE(Cocoa::setHiddenAttribute(file, true));
    EXPECT_EQ(system.hiddenPath, file);
    EXPECT_EQ(system.hiddenKey, "NSURLIsHiddenKey");
    EXPECT_EQ(system.hiddenValue, "1");
    EXPECT_TRUE(Cocoa::setHiddenAttribute(file, false));
    EXPECT_EQ(system.hiddenValue, "0");
    EXPECT_FALSE(Cocoa::setHiddenAttribute(path("missing"), true));
}

class BaseMacOSCocoaBookmarkTest : public BaseMacOSCocoaTest {
  protected:
    BaseMacOSCocoaBookmarkTest() { TestSupport::writeFile(source); }

    std::string const source = path("letter \xC3\xA4.odt");
    std::string const bookmark = path("alias");
    std::string result = "as it was";
};

TEST_F(BaseMacOSCocoaBookmarkTest, ABookmarkLeadsToItsTarget) {
    EXPECT_TRUE(Cocoa::createBookmarkFile(source, bookmark));
    EXPECT_TRUE(Cocoa::resolveBookmarkFile(bookmark, result));
    EXPECT_EQ(result, source);
}

TEST_F(BaseMacOSCocoaBookmarkTest, ItIsMadeForAFileAndReadWithoutADialogue) {
    EXPECT_TRUE(Cocoa::createBookmarkFile(source, bookmark));
    EXPECT_EQ(system.calls, (TCalls{"make", "write", "read", "resolve"}));
    EXPECT_EQ(system.creationOptions, 1024u);
    EXPECT_EQ(system.writeOptions, 1024u);
    EXPECT_EQ(system.resolutionOptions, 256u);
    EXPECT_EQ(system.pathStyle, 0);
    EXPECT_FALSE(system.sawKeys);
    EXPECT_FALSE(system.sawBase);
}

TEST_F(BaseMacOSCocoaBookmarkTest, WithoutATargetNothingIsWrittenButTheFileIsRead) {
    EXPECT_FALSE(Cocoa::createBookmarkFile(path("missing"), bookmark));
    EXPECT_EQ(system.calls, (TCalls{"make", "read"}));
    EXPECT_FALSE(TestSupport::pathExists(bookmark));
}

TEST_F(BaseMacOSCocoaBookmarkTest, AFailedWriteIsToldToTheLog) {
    testing::internal::CaptureStderr();
    EXPECT_FALSE(Cocoa::createBookmarkFile(source, path("missing/alias")));
    std::string const log = testing::internal::GetCapturedStderr();
    EXPECT_NE(log.find("error is the folder is missing\n"), std::string::npos) << log;
    EXPECT_EQ(system.calls, (TCalls{"make", "write"}));
}

TEST_F(BaseMacOSCocoaBookmarkTest, NothingElseIsLogged) {
    testing::internal::CaptureStderr();
    EXPECT_TRUE(Cocoa::createBookmarkFile(source, bookmark));
    EXPECT_FALSE(Cocoa::createBookmarkFile(path("missing"), bookmark));
    EXPECT_FALSE(Cocoa::resolveBookmarkFile(path("missing"), result));
    EXPECT_EQ(testing::internal::GetCapturedStderr(), "");
}

TEST_F(BaseMacOSCocoaBookmarkTest, WhatIsNoBookmarkLeavesTheResultAlone) {
    EXPECT_FALSE(Cocoa::resolveBookmarkFile(source, result));
    EXPECT_FALSE(Cocoa::resolveBookmarkFile(path("missing"), result));
    EXPECT_EQ(result, "as it was");
    EXPECT_EQ(system.calls, (TCalls{"read", "read"}));
}

TEST_F(BaseMacOSCocoaBookmarkTest, ALostTargetLeavesTheResultAlone) {
    EXPECT_TRUE(Cocoa::createBookmarkFile(source, bookmark));
    TestSupport::removeTree(source);
    EXPECT_FALSE(Cocoa::resolveBookmarkFile(bookmark, result));
    EXPECT_EQ(result, "as it was");
}

TEST_F(BaseMacOSCocoaBookmarkTest, AURLWithoutAPathGivesAnEmptyOne) {
    EXPECT_TRUE(Cocoa::createBookmarkFile(source, bookmark));
    system.hasPath = false;
    EXPECT_TRUE(Cocoa::resolveBookmarkFile(bookmark, result));
    EXPECT_EQ(result, "");
}

// A folder's kind with the number that Foundation has for it, and what is appended.
struct CKind {
    int type;
    unsigned long directory;
    char const* suffix;
};
constexpr CKind kinds[] = {
    {MacOS::sftPreferences, 5, "/Preferences"},
    {MacOS::sftDocuments, 9, ""},
    {MacOS::sftSharedUserData, 7, "/Shared"},
    {MacOS::sftDesktop, 12, ""},
    {MacOS::sftLibrary, 5, ""},
    {MacOS::sftPrograms, 1, ""},
    {MacOS::sftFonts, 5, "/Fonts"},
    {MacOS::sftApplicationSupport, 14, ""},
};
constexpr std::pair<int, unsigned long> domains[] = {
    {MacOS::sfdLocal, 2}, {MacOS::sfdUser, 1}, {MacOS::sfdSystem, 8}};

TEST_F(BaseMacOSCocoaTest, AFolderIsTheFirstOfItsKindInItsDomain) {
    int found = 0;
    for (CKind const& kind : kinds)
        for (auto const& [domain, mask] : domains) {
            auto const expected = TestSupport::searchPaths(kind.directory, mask);
            std::string path = "as it was";
            EXPECT_EQ(Cocoa::getSpecialFolder(kind.type, domain, path), !expected.empty());
            EXPECT_EQ(path, expected.empty() ? "as it was" : expected.front() + kind.suffix)
                << kind.type << ' ' << domain;
            found += expected.empty() ? 0 : 1;
        }
    EXPECT_EQ(found, 19);
}

TEST_F(BaseMacOSCocoaTest, TheUsersFoldersLieInTheHomeFolder) {
    std::string path;
    EXPECT_TRUE(Cocoa::getSpecialFolder(MacOS::sftDocuments, MacOS::sfdUser, path));
    EXPECT_EQ(path, user().pw_dir + std::string("/Documents"));
    EXPECT_TRUE(Cocoa::getSpecialFolder(MacOS::sftDesktop, MacOS::sfdUser, path));
    EXPECT_EQ(path, user().pw_dir + std::string("/Desktop"));
    EXPECT_TRUE(Cocoa::getSpecialFolder(MacOS::sftPreferences, MacOS::sfdUser, path));
    EXPECT_NE(path.find("Library/Preferences"), std::string::npos) << path;
}

TEST_F(BaseMacOSCocoaTest, TemporaryItemsIgnoreTheDomain) {
    for (auto const& domain : domains) {
        std::string path;
        EXPECT_TRUE(Cocoa::getSpecialFolder(MacOS::sftTemporaryItems, domain.first, path));
        EXPECT_EQ(path, TestSupport::temporaryDirectory());
        EXPECT_TRUE(TestSupport::pathExists(path)) << path;
    }
}

// Foundation reads the locale once: each of these needs a process of its own.
class BaseMacOSCocoaLocaleTest : public BaseMacOSCocoaTest,
                                 public testing::WithParamInterface<char const*> {};

TEST_P(BaseMacOSCocoaLocaleTest, BothSidesMeasureTheSame) {
    root().environment().set("LC_ALL", GetParam());
    bool const isAmerican = GetParam() == std::string("en_US.UTF-8");
    EXPECT_EQ(Cocoa::usesMetricSystem(), !isAmerican);
    EXPECT_EQ(Cocoa::usesMetricSystem(), Linux::usesMetricSystem());
}

INSTANTIATE_TEST_SUITE_P(Locales, BaseMacOSCocoaLocaleTest,
                         testing::Values("en_US.UTF-8", "de_DE.UTF-8", "fr_CA.UTF-8", "ja_JP.UTF-8",
                                         "en_AU.UTF-8"));

TEST_F(BaseMacOSCocoaBookmarkTest, NoCallLeavesAnObject) {
    auto const expectNothingLeft = [](char const* name, auto const& call) {
        EXPECT_EQ(TestSupport::objectsLeftBy(call), 0) << name;
    };
    system.addresses = {"ada@example.org"};
    system.model = "MacPro7,1";
    expectNothingLeft("escapes", [] { Cocoa::addingPercentEscapes("a b"); });
    expectNothingLeft("names", [] { Cocoa::getUserName(true), Cocoa::getUserName(false); });
    expectNothingLeft("machine", [] { Cocoa::getMachineName(), Cocoa::getModelIdentifier(); });
    expectNothingLeft("address", [] { Cocoa::getUserEmailAddress(); });
    expectNothingLeft("metric", [] { Cocoa::usesMetricSystem(); });
    expectNothingLeft("hidden", [&] { Cocoa::setHiddenAttribute(source, true); });
    expectNothingLeft("create", [&] { Cocoa::createBookmarkFile(source, bookmark); });
    expectNothingLeft("resolve", [&] { Cocoa::resolveBookmarkFile(bookmark, result); });
    expectNothingLeft("folder", [&] { Cocoa::getSpecialFolder(0, 1, result); });
}

} // namespace
