#include "2System/Modules/ModulesModuleID.h"

#include "support/ObjectCount.h"
#include "support/PlatformString.h"

#include <limits>

namespace {

using Modules::CModuleID;

// A bundle of the working directory.
class CModulesModuleIDTest : public TestSupport::CObjectCountTest {
  protected:
    void SetUp() override {
        CObjectCountTest::SetUp();
        CFURLRef const url = CFURLCreateWithFileSystemPath(kCFAllocatorDefault,
                                                           TestSupport::CPlatformString(u".").get(),
                                                           kCFURLPOSIXPathStyle, true);
        bundle_ = CFBundleCreate(kCFAllocatorDefault, url);
        CFRelease(url);
    }
    void TearDown() override {
        CFRelease(bundle_);
        CObjectCountTest::TearDown();
    }

    CFBundleRef bundle_ = nullptr;
};

TEST_F(CModulesModuleIDTest, ABundleAloneIsOfTypeZero) {
    CModuleID const id(bundle_);
    EXPECT_EQ(id.getType(), 0);
    EXPECT_EQ(id.getBundle(), bundle_);
}

TEST_F(CModulesModuleIDTest, TypeAndBundleAreKeptAsTheyAre) {
    for (int const type : {0, 1, -1, std::numeric_limits<int>::min()}) {
        CModuleID const id(type, bundle_);
        EXPECT_EQ(id.getType(), type);
        EXPECT_EQ(id.getBundle(), bundle_);
    }
    EXPECT_EQ(CModuleID(1, nullptr).getBundle(), nullptr);
    EXPECT_EQ(CModuleID(nullptr).getType(), 0);
}

TEST_F(CModulesModuleIDTest, TheBundleIsNotOwned) {
    {
        CModuleID const id(bundle_);
        CModuleID copy = id;
        copy = id;
        EXPECT_EQ(CFGetRetainCount(copy.getBundle()), 1);
    }
    EXPECT_EQ(CFGetRetainCount(bundle_), 1);
}

} // namespace
