// A system that lacks the libraries which are loaded at run time.

#include "1Base/BaseMacOS/BaseMacOS.h"

#include "support/ObjectCount.h"

#include <string>
#include <vector>

namespace {

using CBaseMacOSWithoutLibrariesTest = TestSupport::CObjectCountTest;

std::vector<std::string> librariesAskedFor;

TEST_F(CBaseMacOSWithoutLibrariesTest, NoAddressIsKnown) {
    EXPECT_EQ(MacOS::getUserEmailAddress(), L"");
    EXPECT_EQ(MacOS::getUserEmailAddress(), L"");
    EXPECT_EQ(librariesAskedFor, std::vector<std::string>{"libsystemd.so.0"});
}

TEST_F(CBaseMacOSWithoutLibrariesTest, NoKeyIsPressed) {
    librariesAskedFor.clear();
    EXPECT_FALSE(MacOS::isShiftPressed());
    EXPECT_FALSE(MacOS::isControlPressed());
    EXPECT_FALSE(MacOS::isOptionPressed());
    EXPECT_FALSE(MacOS::isCmdPressed());
    EXPECT_FALSE(MacOS::isAlphaLockPressed());
    EXPECT_EQ(librariesAskedFor, std::vector<std::string>{"libX11.so.6"});
}

} // namespace

extern "C" void* __wrap_dlopen(char const* name, int) {
    librariesAskedFor.emplace_back(name);
    return nullptr;
}
