#include "2System/SysInfo/SysInfoSystem.h"

#include "2System/MacOS/MacOSTempCFString.h"
#include "2System/SysInfo/SysInfoExc.h"

#include "support/FileRoot.h"
#include "support/InfoPlist.h"
#include "support/MessageParameters.h"
#include "support/TextFailures.h"

#include <CoreFoundation/CoreFoundation.h>

#include <string>
#include <vector>

using Strings::string;
using TestSupport::TInfo;

// What the system's services answer, and what they were asked.
static std::vector<std::string> asked;
static string answer;
static bool yes = false;

static string answerTo(std::string const& question) {
    asked.push_back(question);
    return answer;
}

static bool sayTo(std::string const& question) {
    asked.push_back(question);
    return yes;
}

string fullOrLoginName(bool login) __asm__("__wrap_" USER_NAME);
string fullOrLoginName(bool login) {
    return answerTo(login ? "login name" : "full name");
}

string machineName() __asm__("__wrap_" MACHINE_NAME);
string machineName() {
    return answerTo("machine");
}

string emailAddress() __asm__("__wrap_" EMAIL_ADDRESS);
string emailAddress() {
    return answerTo("e-mail");
}

bool metricSystem() __asm__("__wrap__ZN5MacOS16usesMetricSystemEv");
bool metricSystem() {
    return sayTo("metric");
}

bool cmdPressed() __asm__("__wrap__ZN5MacOS12isCmdPressedEv");
bool cmdPressed() {
    return sayTo("command key");
}

namespace {

using TAsked = std::vector<std::string>;

class CSysInfoSystemTest : public TestSupport::CFileRootTest {
  protected:
    void SetUp() override {
        CFileRootTest::SetUp();
        asked.clear();
    }
};

TEST_F(CSysInfoSystemTest, TheUserGoesByTheFullName) {
    answer = L"Ada L\u00F6velace";
    EXPECT_EQ(SysInfo::GetCurrentUserName(), answer);
    answer = L"";
    EXPECT_EQ(SysInfo::GetCurrentUserName(), L"");
    EXPECT_EQ(asked, (TAsked{"full name", "full name"}));
}

TEST_F(CSysInfoSystemTest, TheEMailAddressIsAskedForEachTime) {
    answer = L"ada@example.org";
    EXPECT_EQ(SysInfo::GetEmailAddress(), answer);
    answer = L"";
    EXPECT_EQ(SysInfo::GetEmailAddress(), L"");
    EXPECT_EQ(asked, (TAsked{"e-mail", "e-mail"}));
}

TEST_F(CSysInfoSystemTest, TheMachinesNameIsAskedForOnce) {
    answer = L"first";
    EXPECT_EQ(SysInfo::GetMachineName(), L"first");
    answer = L"second";
    EXPECT_EQ(SysInfo::GetMachineName(), L"first");
    EXPECT_EQ(asked, TAsked{"machine"});
    EXPECT_EQ(SysInfo::GetMachineName_(), L"second");
    EXPECT_EQ(SysInfo::GetMachineName(), L"first");
}

TEST_F(CSysInfoSystemTest, AnEmptyNameOfTheMachineIsKeptAsWell) {
    answer = L"";
    EXPECT_EQ(SysInfo::GetMachineName(), L"");
    answer = L"second";
    EXPECT_EQ(SysInfo::GetMachineName(), L"");
}

TEST_F(CSysInfoSystemTest, TheMachinesNameThatIsNotKeptFillsNoCache) {
    answer = L"first";
    EXPECT_EQ(SysInfo::GetMachineName_(), L"first");
    answer = L"second";
    EXPECT_EQ(SysInfo::GetMachineName(), L"second");
}

TEST_F(CSysInfoSystemTest, TheMeasurementSystemIsTheSystems) {
    yes = true;
    EXPECT_TRUE(SysInfo::UseMetricMeasurementSystem());
    yes = false;
    EXPECT_FALSE(SysInfo::UseMetricMeasurementSystem());
    EXPECT_EQ(asked, (TAsked{"metric", "metric"}));
}

TEST_F(CSysInfoSystemTest, OnlyTheCommandKeyIsEverDown) {
    yes = true;
    EXPECT_TRUE(SysInfo::GetPressedKeyState(SysInfo::pksCommand));
    yes = false;
    EXPECT_FALSE(SysInfo::GetPressedKeyState(SysInfo::pksCommand));
    EXPECT_EQ(asked, (TAsked{"command key", "command key"}));
    yes = true;
    for (int const value : {1, 2, -1, 256})
        EXPECT_FALSE(SysInfo::GetPressedKeyState(SysInfo::PressedKeyState(value))) << value;
    EXPECT_EQ(asked.size(), 2U);
}

TEST_F(CSysInfoSystemTest, NothingAroundTheSystemIsLookedFor) {
    EXPECT_FALSE(SysInfo::isContainerized());
    EXPECT_FALSE(SysInfo::isVirtualized());
}

// Modules.

// A bundle folder of the test, and the bundle.
class CModule {
  public:
    CModule(std::string const& folder, TInfo const& info, std::string const& executable = "") {
        TestSupport::makeFolders(folder + "/Contents/Linux");
        TestSupport::writeFile(folder + "/Contents/Info.plist", TestSupport::xmlInfo(info));
        if (!executable.empty())
            TestSupport::writeFile(folder + "/Contents/Linux/" + executable);
        MacOS::CTempCFString const path{std::string(folder)};
        CFURLRef const url = CFURLCreateWithFileSystemPath(kCFAllocatorDefault, path.get(),
                                                           kCFURLPOSIXPathStyle, true);
        bundle_ = CFBundleCreate(kCFAllocatorDefault, url);
        CFRelease(url);
    }
    ~CModule() { CFRelease(bundle_); }

    CModule(CModule const&) = delete;
    CModule& operator=(CModule const&) = delete;

    Modules::CModuleID id() const { return Modules::CModuleID(bundle_); }
    Modules::CModuleID idOfType(Config::Int32 type) const {
        return Modules::CModuleID(type, bundle_);
    }

  private:
    CFBundleRef bundle_ = nullptr;
};

TEST_F(CSysInfoSystemTest, AModuleHasTheNameOfItsBundle) {
    CModule const plain(path("One.bundle"), {{"CFBundleName", "Dictionary"}}, "One");
    CModule const wide(path("Two.bundle"), {{"CFBundleName", "W\xC3\xB6rter \xF0\x9F\x98\x80"}});
    EXPECT_EQ(SysInfo::GetModuleName(plain.id()), L"Dictionary");
    EXPECT_EQ(SysInfo::GetModuleName(wide.id()), L"W\u00F6rter \U0001F600");
    EXPECT_EQ(SysInfo::GetModuleName(plain.id()), L"Dictionary");
}

TEST_F(CSysInfoSystemTest, ABundleWithoutANameGoesByItsExecutable) {
    CModule const module(path("One.bundle"), {{"CFBundleExecutable", "w\xC3\xB6rter.so"}},
                         "w\xC3\xB6rter.so");
    EXPECT_EQ(SysInfo::GetModuleName(module.id()), L"w\u00F6rter.so");
}

TEST_F(CSysInfoSystemTest, AnEmptyNameIsAName) {
    CModule const module(path("One.bundle"), {{"CFBundleName", ""}}, "One");
    EXPECT_EQ(SysInfo::GetModuleName(module.id()), L"");
}

TEST_F(CSysInfoSystemTest, WithoutANameAndAnExecutableTheNameIsEmpty) {
    CModule const module(path("One.bundle"), {{"CFBundleVersion", "1"}});
    EXPECT_EQ(SysInfo::GetModuleName(module.id()), L"");
}

TEST_F(CSysInfoSystemTest, AModuleOfAnotherTypeIsNotLookedAt) {
    CModule const module(path("One.bundle"), {{"CFBundleName", "a"}, {"CFBundleVersion", "1"}});
    for (Config::Int32 const type : {1, -1, 2147483647}) {
        EXPECT_EQ(SysInfo::GetModuleName(module.idOfType(type)), L"");
        EXPECT_EQ(SysInfo::GetModuleVersion(module.idOfType(type)), L"");
        EXPECT_EQ(SysInfo::GetModuleName(Modules::CModuleID(type, nullptr)), L"");
        EXPECT_EQ(SysInfo::GetModuleVersion(Modules::CModuleID(type, nullptr)), L"");
    }
    EXPECT_EQ(SysInfo::GetModuleName(module.idOfType(0)), L"a");
    EXPECT_EQ(SysInfo::GetModuleVersion(module.idOfType(0)), L"1");
}

TEST_F(CSysInfoSystemTest, AModuleNeedsItsBundle) {
    Modules::CModuleID const none(nullptr);
    EXPECT_EQ(TestSupport::failedCheckOf([&] { SysInfo::GetModuleName(none); }), "bundle");
    EXPECT_EQ(TestSupport::failedCheckOf([&] { SysInfo::GetModuleVersion(none); }), "bundle");
}

void expectNoVersion(Modules::CModuleID const& id) {
    try {
        string const version = SysInfo::GetModuleVersion(id);
        ADD_FAILURE() << "nothing was raised";
    } catch (SysInfo::TExcSysInfo const& exc) {
        EXPECT_NE(dynamic_cast<SysInfo::TExcSysInfoSystem const*>(&exc), nullptr);
        EXPECT_NE(dynamic_cast<TExcSystem const*>(&exc), nullptr);
        EXPECT_STREQ(exc.getExcName(), "SysInfoSystem");
        EXPECT_EQ(exc.getInfo().getSeverity(), Error::SevError);
        EXPECT_EQ(TestSupport::parametersOf(exc.getInfo().getMessage()),
                  (TestSupport::TParameters{{"process", L"get"},
                                            {"type", L"OS"},
                                            {"key", L"version info"},
                                            {"reason", L"no version info available"}}));
        EXPECT_EQ(exc.getInfo().getMessage().getString(true),
                  L"Could not get OS version info: no version info available");
        EXPECT_EQ(exc.getStackInfo().begin(), exc.getStackInfo().end());
    }
}

TEST_F(CSysInfoSystemTest, ABundleWithoutAVersionFailsUntilSomeModuleHasGivenOne) {
    CModule const without(path("One.bundle"), {{"CFBundleName", "One"}}, "One");
    CModule const with(path("Two.bundle"), {{"CFBundleVersion", "7.1"}}, "Two");
    CModule const later(path("Three.bundle"), {{"CFBundleVersion", "8"}}, "Three");
    expectNoVersion(without.id());
    expectNoVersion(without.id());
    EXPECT_EQ(SysInfo::GetModuleVersion(with.idOfType(1)), L"");
    EXPECT_EQ(SysInfo::GetModuleVersion(with.id()), L"7.1");

    EXPECT_EQ(SysInfo::GetModuleVersion(without.id()), L"7.1");
    EXPECT_EQ(SysInfo::GetModuleVersion(later.id()), L"7.1");
    EXPECT_EQ(SysInfo::GetModuleVersion(later.idOfType(1)), L"7.1");
    EXPECT_EQ(SysInfo::GetModuleVersion(Modules::CModuleID(nullptr)), L"7.1");
}

TEST_F(CSysInfoSystemTest, AnEmptyVersionIsNotKept) {
    CModule const empty(path("One.bundle"), {{"CFBundleVersion", ""}});
    CModule const with(path("Two.bundle"), {{"CFBundleVersion", "7.1"}});
    EXPECT_EQ(SysInfo::GetModuleVersion(empty.id()), L"");
    EXPECT_EQ(SysInfo::GetModuleVersion(with.id()), L"7.1");
}

} // namespace
