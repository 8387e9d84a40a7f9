// The bus's library as sd-bus(3) and its kin describe it: a negative number is a failure. Each of
// its functions fails in turn, which no bus can be made to do.

#include "1Base/BaseMacOS/BaseMacOS.h"

#include "support/ObjectCount.h"

#include <chrono>
#include <cstdint>
#include <cstring>
#include <map>
#include <string>
#include <thread>
#include <vector>

namespace {

// What the functions answer, and which were called.
struct CBusState {
    std::map<std::string, int> answers;
    std::vector<std::string> calls;
    int greetings = 0; // the looks at the connection until it is ready
    std::chrono::milliseconds delay{0};
};

CBusState bus;
int connection = 0;

// The caller knows the library's types by names of its own.
#define ANY_CALLER __attribute__((no_sanitize("undefined")))

int answer(std::string const& function) {
    bus.calls.push_back(function);
    auto const found = bus.answers.find(function);
    return found == bus.answers.end() ? 1 : found->second;
}

ANY_CALLER int openSystem(void** opened) {
    *opened = &connection;
    return answer("open_system");
}

ANY_CALLER void* closeUnref(void* closed) {
    EXPECT_EQ(closed, &connection);
    bus.calls.emplace_back("close_unref");
    return nullptr;
}

ANY_CALLER int isReady(void*) {
    return bus.greetings-- > 0 ? 0 : 1;
}

ANY_CALLER int process(void*, void**) {
    return answer("process");
}

ANY_CALLER int waitForMore(void*, std::uint64_t) {
    return answer("wait");
}

ANY_CALLER int setMethodCallTimeout(void*, std::uint64_t microseconds) {
    EXPECT_GT(microseconds, 0U);
    EXPECT_LE(microseconds, 500000U);
    return answer("set_method_call_timeout");
}

ANY_CALLER int callMethod(void*, char const*, char const*, char const*, char const*, void*,
                          void** reply, char const*, ...) {
    *reply = nullptr;
    std::this_thread::sleep_for(bus.delay);
    return answer("call_method");
}

ANY_CALLER int messageRead(void*, char const*, char const** path) {
    *path = "/user";
    return answer("message_read");
}

ANY_CALLER void* messageUnref(void*) {
    return nullptr;
}

ANY_CALLER int getPropertyString(void*, char const*, char const* path, char const*, char const*,
                                 void*, char** value) {
    EXPECT_STREQ(path, "/user");
    *value = strdup("ada@example.org");
    return answer("get_property_string");
}

void* functionOf(std::string const& name) {
    std::map<std::string, void*> const functions = {
        {"sd_bus_open_system", reinterpret_cast<void*>(openSystem)},
        {"sd_bus_close_unref", reinterpret_cast<void*>(closeUnref)},
        {"sd_bus_is_ready", reinterpret_cast<void*>(isReady)},
        {"sd_bus_process", reinterpret_cast<void*>(process)},
        {"sd_bus_wait", reinterpret_cast<void*>(waitForMore)},
        {"sd_bus_set_method_call_timeout", reinterpret_cast<void*>(setMethodCallTimeout)},
        {"sd_bus_call_method", reinterpret_cast<void*>(callMethod)},
        {"sd_bus_message_read", reinterpret_cast<void*>(messageRead)},
        {"sd_bus_message_unref", reinterpret_cast<void*>(messageUnref)},
        {"sd_bus_get_property_string", reinterpret_cast<void*>(getPropertyString)}};
    return functions.at(name);
}

class CBaseMacOSMailFailuresTest : public TestSupport::CObjectCountTest {
  protected:
    void SetUp() override {
        CObjectCountTest::SetUp();
        bus = CBusState();
    }

    static bool wasCalled(std::string const& function) {
        for (std::string const& call : bus.calls)
            if (call == function)
                return true;
        return false;
    }
};

TEST_F(CBaseMacOSMailFailuresTest, WithoutAFailureTheAddressComes) {
    bus.greetings = 3;
    EXPECT_EQ(MacOS::getUserEmailAddress(), L"ada@example.org");
    EXPECT_EQ(bus.calls.back(), "close_unref");
}

TEST_F(CBaseMacOSMailFailuresTest, AConnectionThatFailsIsNotUsed) {
    for (std::string const function : {"open_system", "process", "wait"}) {
        bus = CBusState();
        bus.greetings = 3;
        bus.answers["process"] = 0; // nothing to do but wait
        bus.answers[function] = -1;
        EXPECT_EQ(MacOS::getUserEmailAddress(), L"") << function;
        EXPECT_TRUE(wasCalled(function));
        EXPECT_FALSE(wasCalled("call_method")) << function;
        EXPECT_EQ(bus.calls.back(), "close_unref") << function;
    }
}

TEST_F(CBaseMacOSMailFailuresTest, NothingIsAskedWithoutALimit) {
    bus.answers["set_method_call_timeout"] = -1;
    EXPECT_EQ(MacOS::getUserEmailAddress(), L"");
    EXPECT_FALSE(wasCalled("call_method"));
    EXPECT_FALSE(wasCalled("get_property_string"));
}

TEST_F(CBaseMacOSMailFailuresTest, AfterTheTimeIsUpNothingMoreIsAsked) {
    bus.delay = std::chrono::milliseconds(600);
    EXPECT_EQ(MacOS::getUserEmailAddress(), L"");
    EXPECT_TRUE(wasCalled("call_method"));
    EXPECT_FALSE(wasCalled("get_property_string"));
}

} // namespace

extern "C" {
void* __real_dlsym(void* library, char const* name);
void* __wrap_dlopen(char const* name, int mode);
void* __wrap_dlsym(void* library, char const* name);

void* __wrap_dlopen(char const*, int) {
    return &connection;
}

// A sanitizer's run-time library calls it before its own checks can run.
__attribute__((no_sanitize("address", "undefined"))) void* __wrap_dlsym(void* library,
                                                                        char const* name) {
    return library == &connection ? functionOf(name) : __real_dlsym(library, name);
}
}
