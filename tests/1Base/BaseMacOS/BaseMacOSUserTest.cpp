#include "1Base/BaseMacOS/BaseMacOS.h"

#include "1Base/BaseMacOS/BaseMacOSSystemCalls.h"
#include "support/ObjectCount.h"

#include <unistd.h>

#include <string>
#include <vector>

namespace {

using CBaseMacOSUserTest = TestSupport::CObjectCountTest;

using TestSupport::CSystemCalls;
using TestSupport::CUserEntry;

Strings::string fullName(std::string const& gecos) {
    CSystemCalls system;
    system.setUser(CUserEntry{"ada", gecos, "/home/ada"});
    return MacOS::getUserName(false);
}

TEST_F(CBaseMacOSUserTest, TheEffectiveUserIsAsked) {
    CSystemCalls system;
    system.setUser(CUserEntry{"ada", "Ada Lovelace", "/home/ada"});
    EXPECT_EQ(MacOS::getUserName(true), L"ada");
    EXPECT_EQ(MacOS::getUserName(false), L"Ada Lovelace");
    EXPECT_EQ(system.usersAsked, std::vector<unsigned>(2, geteuid()));
}

TEST_F(CBaseMacOSUserTest, TheFullNameEndsAtTheFirstComma) {
    EXPECT_EQ(fullName("Ada Lovelace,Room 1,555,"), L"Ada Lovelace");
    EXPECT_EQ(fullName("Ada,,,"), L"Ada");
    EXPECT_EQ(fullName(",,,"), L"");
    EXPECT_EQ(fullName(""), L"");
}

TEST_F(CBaseMacOSUserTest, AnAmpersandIsTheLoginNameWithACapitalLetter) {
    EXPECT_EQ(fullName("&"), L"Ada");
    EXPECT_EQ(fullName("& Lovelace"), L"Ada Lovelace");
    EXPECT_EQ(fullName("Lady & (&),Room &"), L"Lady Ada (Ada)");
}

TEST_F(CBaseMacOSUserTest, OnlyALetterOfASCIIGetsACapital) {
    CSystemCalls system;
    for (std::string const login : {"_svc", "7up", "{x", "Ada",
                                    "\xC3\xA4"
                                    "da"}) {
        system.setUser(CUserEntry{login, "&", "/"});
        EXPECT_EQ(MacOS::getUserName(false), MacOS::getUserName(true)) << login;
    }
    system.setUser(CUserEntry{"", "&", "/"});
    EXPECT_EQ(MacOS::getUserName(false), L"");
}

TEST_F(CBaseMacOSUserTest, NamesAreReadAsUTF8) {
    EXPECT_EQ(fullName("J\xC3\xBCrgen"), L"J\u00FCrgen");
}

TEST_F(CBaseMacOSUserTest, AnUnknownUserHasNoNames) {
    CSystemCalls system;
    system.setUser(std::nullopt);
    EXPECT_EQ(MacOS::getUserName(true), L"");
    EXPECT_EQ(MacOS::getUserName(false), L"");
}

TEST_F(CBaseMacOSUserTest, ALongEntryGetsTheRoomItNeeds) {
    CSystemCalls system;
    system.setUser(CUserEntry{"ada", "Ada", "/"}, 100000);
    EXPECT_EQ(MacOS::getUserName(true), L"ada");
    system.setUser(CUserEntry{"ada", "Ada", "/"}, std::size_t{1} << 40);
    EXPECT_EQ(MacOS::getUserName(true), L"");
}

} // namespace
