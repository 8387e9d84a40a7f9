#include "1Base/BaseMacOS/BaseMacOS.h"

#include "support/FileRoot.h"
#include "support/ObjectCount.h"

#include <string>

namespace {

using CBaseMacOSLocaleTest = TestSupport::CObjectCountTest;

TEST_F(CBaseMacOSLocaleTest, TheMeasuresAreThoseOfTheEnvironment) {
    TestSupport::CEnvironment environment;
    for (std::string const name : {"LC_ALL", "LC_MEASUREMENT", "LANG"})
        environment.unset(name);
    EXPECT_TRUE(MacOS::usesMetricSystem());
    environment.set("LANG", "en_US.UTF-8");
    EXPECT_FALSE(MacOS::usesMetricSystem());
    environment.set("LC_MEASUREMENT", "en_GB.UTF-8");
    EXPECT_TRUE(MacOS::usesMetricSystem());
    environment.set("LC_ALL", "es_US");
    EXPECT_FALSE(MacOS::usesMetricSystem());
    environment.set("LC_ALL", "de_CH");
    EXPECT_TRUE(MacOS::usesMetricSystem());
}

} // namespace
