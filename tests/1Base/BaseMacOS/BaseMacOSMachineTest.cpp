#include "1Base/BaseMacOS/BaseMacOS.h"

#include "1Base/BaseMacOS/BaseMacOSSystemCalls.h"
#include "support/FileRoot.h"

#include <cerrno>
#include <string>
#include <vector>

namespace {

class CBaseMacOSMachineTest : public TestSupport::CFileRootTest {
  protected:
    CBaseMacOSMachineTest() {
        system_.setHostName("host");
        system_.redirect("/etc/machine-info", path("machine-info"));
        system_.redirect("/sys/class/dmi/id/product_name", path("product"));
        system_.redirect("/sys/firmware/devicetree/base/model", path("model"));
    }

    Strings::string nameFor(std::string const& machineInfo) {
        TestSupport::writeFile(path("machine-info"), machineInfo);
        return MacOS::getMachineName();
    }

    TestSupport::CSystemCalls system_;
};

TEST_F(CBaseMacOSMachineTest, ThePrettyNameComesFirst) {
    EXPECT_EQ(nameFor("# a comment\nICON_NAME=computer\nPRETTY_HOSTNAME=\"Ada's machine\"\n"),
              L"Ada's machine");
    EXPECT_EQ(nameFor("PRETTY_HOSTNAME='two \"words\"'"), L"two \"words\"");
    EXPECT_EQ(nameFor("PRETTY_HOSTNAME=plain\n"), L"plain");
    EXPECT_EQ(nameFor("PRETTY_HOSTNAME=\"a \\\"b\\\" \\\\ \\$c\""), L"a \"b\" \\ $c");
    EXPECT_EQ(nameFor("PRETTY_HOSTNAME=\"B\xC3\xBCro\""), L"B\u00FCro");
    EXPECT_EQ(nameFor("PRETTY_HOSTNAME=one\nPRETTY_HOSTNAME=two\n"), L"two");
}

TEST_F(CBaseMacOSMachineTest, WithoutAPrettyNameItIsTheHosts) {
    EXPECT_EQ(MacOS::getMachineName(), L"host");
    for (std::string const text :
         {"", "PRETTY_HOSTNAME=", "PRETTY_HOSTNAME=\"\"", "#PRETTY_HOSTNAME=a",
          "PRETTY_HOSTNAME=\"open", "PRETTY_HOSTNAME='open", "PRETTY_HOSTNAME=\"a\"b",
          "PRETTY_HOSTNAME='a'b", "PRETTY_HOSTNAMES=a", "HOSTNAME=a"})
        EXPECT_EQ(nameFor(text), L"host") << text;
}

TEST_F(CBaseMacOSMachineTest, ALongHostNameIsCut) {
    system_.setHostName(std::string(300, 'h'));
    EXPECT_EQ(MacOS::getMachineName(), Strings::string(64, L'h'));
}

TEST_F(CBaseMacOSMachineTest, AHostThatTellsNoNameHasNone) {
    system_.fail("gethostname", EPERM);
    EXPECT_EQ(MacOS::getMachineName(), L"");
}

TEST_F(CBaseMacOSMachineTest, TheModelIsTheProductsName) {
    TestSupport::writeFile(path("model"), std::string("Board\0", 6));
    TestSupport::writeFile(path("product"), "  Notebook 3000 \n");
    EXPECT_EQ(MacOS::getModelIdentifier(), L"Notebook 3000");
}

TEST_F(CBaseMacOSMachineTest, WithoutAProductItIsTheDeviceTrees) {
    TestSupport::writeFile(path("model"), std::string("Board 4 B\0rest", 14));
    EXPECT_EQ(MacOS::getModelIdentifier(), L"Board 4 B");
    TestSupport::writeFile(path("product"), " \n");
    EXPECT_EQ(MacOS::getModelIdentifier(), L"Board 4 B");
    TestSupport::writeFile(path("product"), "");
    EXPECT_EQ(MacOS::getModelIdentifier(), L"Board 4 B");
}

TEST_F(CBaseMacOSMachineTest, AMachineThatTellsNoModelHasNone) {
    EXPECT_EQ(MacOS::getModelIdentifier(), L"");
    TestSupport::writeFile(path("model"), std::string(1, '\0'));
    EXPECT_EQ(MacOS::getModelIdentifier(), L"");
}

} // namespace
