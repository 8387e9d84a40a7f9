// The address as an account service on a bus of the test's own gives it.

#include "1Base/BaseMacOS/BaseMacOS.h"

#include "1Base/BaseMacOS/BaseMacOSAccountService.h"
#include "support/FileRoot.h"
#include "support/ServerProgram.h"

#include <sys/socket.h>
#include <sys/un.h>
#include <unistd.h>

#include <chrono>
#include <cstddef>
#include <cstring>
#include <optional>
#include <string>
#include <vector>

namespace {

using TestSupport::CAccountService;
using TestSupport::CServerProgram;

// Far more than the call may wait, and far less than the bus's own limits.
constexpr std::chrono::seconds moment(5);

class CBaseMacOSMailTest : public TestSupport::CFileRootTest {
  protected:
    // Leads the system bus to this address.
    void setBus(std::string const& address) {
        root().environment().set("DBUS_SYSTEM_BUS_ADDRESS", address);
    }

    // The address, which has to come within a moment.
    Strings::string address() {
        auto const begin = std::chrono::steady_clock::now();
        Strings::string const email = MacOS::getUserEmailAddress();
        EXPECT_LT(std::chrono::steady_clock::now() - begin, moment);
        return email;
    }
};

// With a bus of its own.
class CBaseMacOSMailBusTest : public CBaseMacOSMailTest {
  protected:
    void SetUp() override {
        CBaseMacOSMailTest::SetUp();
        bus_.emplace(busCommand());
        if (!bus_->isRunning())
            GTEST_SKIP() << bus_->reason();
        setBus(bus_->line());
    }

    std::string busAddress() const { return bus_->line(); }

  private:
    // A bus that lets everybody do everything. Its address is no path, which could be too long.
    std::vector<std::string> busCommand() {
        TestSupport::writeFile(path("bus.conf"),
                               "<busconfig><listen>unix:abstract=qorn-test-" +
                                   std::to_string(getpid()) +
                                   "</listen><auth>EXTERNAL</auth><policy context=\"default\">"
                                   "<allow send_destination=\"*\"/><allow receive_sender=\"*\"/>"
                                   "<allow own=\"*\"/><allow user=\"*\"/></policy></busconfig>");
        return {"dbus-daemon", "--nofork", "--nosyslog", "--config-file=" + path("bus.conf"),
                "--print-address={}"};
    }

    std::optional<CServerProgram> bus_;
};

TEST_F(CBaseMacOSMailBusTest, TheServiceTellsTheAddressOfTheEffectiveUser) {
    CAccountService service(busAddress());
    ASSERT_TRUE(service.isServing());

    service.setEmail("ada@example.org");
    EXPECT_EQ(address(), L"ada@example.org");
    EXPECT_EQ(service.usersAsked(), std::vector<long>{static_cast<long>(geteuid())});
    service.setEmail("");
    EXPECT_EQ(address(), L"");
    service.setEmail("j\xC3\xBCrgen@example.org");
    EXPECT_EQ(address(), L"j\u00FCrgen@example.org");
}

TEST_F(CBaseMacOSMailBusTest, AServiceThatFailsGivesNoAddress) {
    CAccountService service(busAddress());
    ASSERT_TRUE(service.isServing());

    service.setEmail("ada@example.org");
    for (auto const fault : {CAccountService::efaUnknownUser, CAccountService::efaOtherReply,
                             CAccountService::efaNoProperty, CAccountService::efaOtherProperty,
                             CAccountService::efaSilent, CAccountService::efaSilentProperty}) {
        service.setFault(fault);
        EXPECT_EQ(address(), L"") << fault;
    }
    service.setFault(CAccountService::efaNone);
    EXPECT_EQ(address(), L"ada@example.org");
}

TEST_F(CBaseMacOSMailBusTest, ABusWithoutTheServiceGivesNoAddress) {
    EXPECT_EQ(address(), L"");
}

TEST_F(CBaseMacOSMailTest, ASystemWithoutABusGivesNoAddress) {
    for (std::string const bus :
         {"unix:path=/nowhere", "unix:abstract=qorn-test-nobody", "nonsense", "unix:"}) {
        setBus(bus);
        EXPECT_EQ(address(), L"") << bus;
    }
}

// The kernel connects us, and then nothing is ever said.
TEST_F(CBaseMacOSMailTest, ABusThatIsSilentIsNotWaitedFor) {
    std::string const name = "qorn-test-silent-" + std::to_string(getpid());
    sockaddr_un socketAddress = {};
    socketAddress.sun_family = AF_UNIX;
    std::memcpy(socketAddress.sun_path + 1, name.data(), name.size());
    int const listener = socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0);
    auto const length = static_cast<socklen_t>(offsetof(sockaddr_un, sun_path) + 1 + name.size());
    ASSERT_EQ(bind(listener, reinterpret_cast<sockaddr*>(&socketAddress), length), 0);
    ASSERT_EQ(listen(listener, 5), 0);
    setBus("unix:abstract=" + name);
    EXPECT_EQ(address(), L"");
    close(listener);
}

} // namespace
