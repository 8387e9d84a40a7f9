#include "2System/MacOS/MacOS.h"

#include "support/ObjectCount.h"

namespace {

using CMacOSCFStringConverterTest = TestSupport::CObjectCountTest;

TEST_F(CMacOSCFStringConverterTest, AWideTextComesBackUnchanged) {
    Strings::string const text = L"caf\u00E9 \U0001F600";
    MacOS::CTempCFString const temp(text);
    EXPECT_EQ(MacOS::GetStringFromCFString(temp.get()), text);
}

} // namespace
