#include "2System/SysInfo/_Imp/SysInfoOsRelease.h"

#include "support/FileRoot.h"

#include <string>

namespace {

class CSysInfoOsReleaseTest : public TestSupport::CFileRootTest {
  protected:
    std::string versionIn(std::string const& content) {
        TestSupport::writeFile(path("os-release"), content);
        return SysInfo::readVersionID(path("os-release"));
    }
};

TEST_F(CSysInfoOsReleaseTest, TheVersionStandsOnALineOfItsOwn) {
    EXPECT_EQ(versionIn("NAME=\"Any\"\nVERSION=\"1 (one)\"\nVERSION_ID=12.4\nID=any\n"), "12.4");
    EXPECT_EQ(versionIn("VERSION_ID=12"), "12");
    EXPECT_EQ(versionIn("VERSION_ID=1\nVERSION_ID=2\n"), "2");
}

TEST_F(CSysInfoOsReleaseTest, QuotesAreTheShells) {
    EXPECT_EQ(versionIn("VERSION_ID=\"12.4\"\n"), "12.4");
    EXPECT_EQ(versionIn("VERSION_ID='12.4'\n"), "12.4");
    EXPECT_EQ(versionIn("VERSION_ID=\"12\\$4\"\n"), "12$4");
    EXPECT_EQ(versionIn("VERSION_ID='12\\4'\n"), "12\\4");
    EXPECT_EQ(versionIn("VERSION_ID=\"it's\"\n"), "it's");
    EXPECT_EQ(versionIn("VERSION_ID=12\\\n"), "12\\");
}

TEST_F(CSysInfoOsReleaseTest, WithoutAVersionThereIsNone) {
    EXPECT_EQ(versionIn(""), "");
    EXPECT_EQ(versionIn("VERSION_ID=\n"), "");
    EXPECT_EQ(versionIn("VERSION_ID=\"\"\n"), "");
    EXPECT_EQ(versionIn("#VERSION_ID=12\n VERSION_ID=13\nOLD_VERSION_ID=14\nVERSION_ID_=15\n"), "");
    EXPECT_EQ(SysInfo::readVersionID(path("missing")), "");
    EXPECT_EQ(SysInfo::readVersionID(path()), "");
}

} // namespace
