/// What the tests of loading have in common.
#ifndef QORN_TESTS_MODULESCASES_H
#define QORN_TESTS_MODULESCASES_H

#include "2System/Modules/Modules.h"
#include "2System/Modules/ModulesCalls.h"

#include "support/InfoPlist.h"
#include "support/Registry.h"
#include "support/TestLibraries/TestLibraries.h"

#include <string>

namespace ModulesTest {

/// Each test has an empty working directory, and ends with nothing loaded and nothing alive.
class CLoaderTest : public TestSupport::CErrorTest {
  protected:
    void TearDown() override {
        EXPECT_EQ(openHandles(), 0);
        CErrorTest::TearDown();
    }

  private:
    TestSupport::CEmptyFolder const folder_;
};

/// What the library behind the symbol calls itself.
inline std::string libraryName(Modules::CDyLib const& library) {
    return reinterpret_cast<char const* (*)()>(library.getSymbol(L"libraryName"))();
}

} // namespace ModulesTest

#endif
