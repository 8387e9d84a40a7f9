#include "1Base/BaseMacOS/BaseMacOS.h"

#include "1Base/BaseMacOS/BaseMacOSSystemCalls.h"
#include "1Base/Encoding/EncodingConverter.h"
#include "support/FileRoot.h"

#include <sys/stat.h>
#include <sys/xattr.h>
#include <unistd.h>

#include <cerrno>
#include <string>

namespace {

using CBaseMacOSHiddenTest = TestSupport::CFileRootTest;

bool setHidden(std::string const& path, bool hidden) {
    return MacOS::setHiddenAttribute(Encoding::convert<Strings::string>(path), hidden);
}

// The flag's bytes; empty where it is not set.
std::string flagOf(std::string const& path) {
    char value[16] = {};
    ssize_t const size = lgetxattr(path.c_str(), "user.hidden", value, sizeof value);
    return size < 0 ? "" : std::string(value, static_cast<std::size_t>(size));
}

bool holdsAttributes(std::string const& path) {
    return lsetxattr(path.c_str(), "user.qorn-probe", "1", 1, 0) == 0;
}

#define SKIP_WITHOUT_ATTRIBUTES(path)                                                              \
    if (!holdsAttributes(path))                                                                    \
    GTEST_SKIP() << "the file system holds no extended attributes"

TEST_F(CBaseMacOSHiddenTest, TheFlagIsSetAndCleared) {
    std::string const file = path("caf\xC3\xA9 %41");
    TestSupport::writeFile(file, "text");
    SKIP_WITHOUT_ATTRIBUTES(file);
    EXPECT_TRUE(setHidden(file, true));
    EXPECT_EQ(flagOf(file), "1");
    EXPECT_TRUE(setHidden(file, true));
    EXPECT_TRUE(setHidden(file, false));
    EXPECT_EQ(flagOf(file), "");
    EXPECT_TRUE(setHidden(file, false));
    EXPECT_EQ(TestSupport::readFile(file), "text");
}

TEST_F(CBaseMacOSHiddenTest, AFolderHasTheFlagToo) {
    SKIP_WITHOUT_ATTRIBUTES(path());
    EXPECT_TRUE(setHidden(path(), true));
    EXPECT_EQ(flagOf(path()), "1");
    EXPECT_TRUE(setHidden(path() + "/", false));
    EXPECT_EQ(flagOf(path()), "");
}

TEST_F(CBaseMacOSHiddenTest, AMissingFileIsAFailure) {
    EXPECT_FALSE(setHidden(path("none"), true));
    EXPECT_FALSE(setHidden(path("none"), false));
    EXPECT_FALSE(setHidden("", true));
    TestSupport::writeFile(path("file"));
    EXPECT_FALSE(setHidden(path("file/none"), true));
    EXPECT_FALSE(TestSupport::pathExists(path("none")));
}

// The flag is the link's own, and links hold none.
TEST_F(CBaseMacOSHiddenTest, ALinksTargetIsLeftAlone) {
    TestSupport::writeFile(path("file"));
    TestSupport::makeLink("file", path("link"));
    TestSupport::makeLink("none", path("dangling"));
    EXPECT_TRUE(setHidden(path("link"), true));
    EXPECT_TRUE(setHidden(path("dangling"), true));
    EXPECT_EQ(flagOf(path("file")), "");
    EXPECT_FALSE(TestSupport::pathExists(path("none")));
}

TEST_F(CBaseMacOSHiddenTest, APipeHoldsNoFlagAndSucceeds) {
    ASSERT_EQ(mkfifo(path("pipe").c_str(), 0600), 0);
    EXPECT_TRUE(setHidden(path("pipe"), true));
    EXPECT_TRUE(setHidden(path("pipe"), false));
}

TEST_F(CBaseMacOSHiddenTest, AFileSystemWithoutAttributesSucceeds) {
    TestSupport::writeFile(path("file"));
    TestSupport::CSystemCalls system;
    system.fail("lsetxattr", ENOTSUP);
    EXPECT_TRUE(setHidden(path("file"), true));
    EXPECT_EQ(flagOf(path("file")), "");
    system.fail("lremovexattr", ENOTSUP);
    EXPECT_TRUE(setHidden(path("file"), false));
}

TEST_F(CBaseMacOSHiddenTest, AnyOtherRefusalIsAFailure) {
    TestSupport::writeFile(path("file"));
    TestSupport::CSystemCalls system;
    for (int const error : {EACCES, EPERM, EROFS, ENOSPC, EIO}) {
        system.fail("lsetxattr", error);
        EXPECT_FALSE(setHidden(path("file"), true)) << error;
        system.fail("lremovexattr", error);
        EXPECT_FALSE(setHidden(path("file"), false)) << error;
    }
}

TEST_F(CBaseMacOSHiddenTest, AFileThatMayNotBeChangedIsAFailure) {
    TestSupport::writeFile(path("file"));
    SKIP_WITHOUT_ATTRIBUTES(path("file"));
    chmod(path("file").c_str(), 0444);
    runAsOrdinaryUser([this] {
        EXPECT_FALSE(setHidden(path("file"), true));
        EXPECT_FALSE(setHidden(path("file"), false));
    });
    EXPECT_EQ(flagOf(path("file")), "");
}

} // namespace
