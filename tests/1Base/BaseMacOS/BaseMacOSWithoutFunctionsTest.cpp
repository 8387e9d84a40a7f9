// Libraries that are loaded at run time, but lack a function. They are asked for their functions
// once in a process, so each case has a process of its own.

#include "1Base/BaseMacOS/BaseMacOS.h"

#include "support/ObjectCount.h"

#include <cstdlib>
#include <cstring>

namespace {

char const* missing = nullptr;

// Whatever a library is called for. The callers have its types.
__attribute__((no_sanitize("undefined"))) void endTheProcess() {
    std::_Exit(2);
}

void* functionOf(char const* name) {
    if (missing != nullptr && std::strcmp(name, missing) == 0)
        return nullptr;
    return reinterpret_cast<void*>(endTheProcess);
}

class CBaseMacOSWithoutFunctionsTest : public TestSupport::CObjectCountTest,
                                       public testing::WithParamInterface<char const*> {};

using CBaseMacOSMailDeathTest = CBaseMacOSWithoutFunctionsTest;
using CBaseMacOSKeysDeathTest = CBaseMacOSWithoutFunctionsTest;

TEST_P(CBaseMacOSMailDeathTest, WithoutAFunctionOfTheBusNoneIsCalled) {
    auto const ask = [] {
        missing = GetParam();
        std::exit(MacOS::getUserEmailAddress().empty() ? 0 : 1);
    };
    EXPECT_EXIT(ask(), testing::ExitedWithCode(0), "");
}

INSTANTIATE_TEST_SUITE_P(, CBaseMacOSMailDeathTest,
                         testing::Values("sd_bus_open_system", "sd_bus_close_unref",
                                         "sd_bus_is_ready", "sd_bus_process", "sd_bus_wait",
                                         "sd_bus_set_method_call_timeout", "sd_bus_call_method",
                                         "sd_bus_message_read", "sd_bus_message_unref",
                                         "sd_bus_get_property_string"));

TEST_P(CBaseMacOSKeysDeathTest, WithoutAFunctionOfTheDisplayNoneIsCalled) {
    auto const ask = [] {
        missing = GetParam();
        std::exit(MacOS::isShiftPressed() ? 1 : 0);
    };
    EXPECT_EXIT(ask(), testing::ExitedWithCode(0), "");
}

INSTANTIATE_TEST_SUITE_P(, CBaseMacOSKeysDeathTest,
                         testing::Values("XOpenDisplay", "XCloseDisplay", "XQueryKeymap",
                                         "XkbKeycodeToKeysym"));

// The library is there, and all else in it.
TEST(CBaseMacOSAllFunctionsDeathTest, WithEachFunctionTheFirstIsCalled) {
    EXPECT_EXIT(MacOS::getUserEmailAddress(), testing::ExitedWithCode(2), "");
    EXPECT_EXIT(MacOS::isShiftPressed(), testing::ExitedWithCode(2), "");
}

} // namespace

extern "C" {
void* __real_dlsym(void* library, char const* name);
void* __wrap_dlopen(char const* name, int mode);
void* __wrap_dlsym(void* library, char const* name);

void* __wrap_dlopen(char const*, int) {
    return &missing;
}

// A sanitizer's run-time library calls it before its own checks can run.
__attribute__((no_sanitize("address", "undefined"))) void* __wrap_dlsym(void* library,
                                                                        char const* name) {
    return library == &missing ? functionOf(name) : __real_dlsym(library, name);
}
}
