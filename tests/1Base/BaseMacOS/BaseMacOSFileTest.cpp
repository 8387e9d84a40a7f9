#include "1Base/BaseMacOS/_Imp/BaseMacOSLinuxFile.h"

#include "1Base/BaseMacOS/BaseMacOSSystemCalls.h"
#include "support/FileRoot.h"

#include <unistd.h>

#include <cerrno>
#include <optional>
#include <string>
#include <vector>

namespace {

using MacOS::Native::readTextFile;
using MacOS::Native::writeTextFile;
using TestSupport::readFile;
using TestSupport::writeFile;

class CBaseMacOSFileTest : public TestSupport::CFileRootTest {
  protected:
    TestSupport::CSystemCalls system_;
};

TEST_F(CBaseMacOSFileTest, WhatASignalInterruptsGoesOn) {
    system_.fail("write", EINTR);
    EXPECT_EQ(writeTextFile(path("file"), "text"), 0);
    EXPECT_EQ(readFile(path("file")), "text");
    system_.fail("read", EINTR);
    EXPECT_EQ(readTextFile(path("file")), "text");
}

TEST_F(CBaseMacOSFileTest, AFileThatFailsHasNoText) {
    writeFile(path("file"), "text");
    for (std::string const function : {"open", "fstat", "read"}) {
        system_.fail(function, EIO);
        EXPECT_EQ(readTextFile(path("file")), std::nullopt) << function;
    }
    EXPECT_EQ(readTextFile(path("file")), "text");
}

TEST_F(CBaseMacOSFileTest, WithoutRandomNumbersTheProcessNamesTheScratchFile) {
    writeFile(path("file"), "old");
    std::string const scratch = ".qorn-" + std::to_string(getpid());
    std::vector<std::string> renamed;
    system_.onRename = [&](std::string const& from, std::string const&) {
        renamed.push_back(from);
    };
    system_.fail("getrandom", EAGAIN);
    EXPECT_EQ(writeTextFile(path("file"), "new"), 0);
    EXPECT_EQ(readFile(path("file")), "new");
    EXPECT_EQ(renamed, std::vector<std::string>{path(scratch)});
}

TEST_F(CBaseMacOSFileTest, AScratchFileOfAnothersIsLeftAlone) {
    writeFile(path("file"), "old");
    std::string const scratch = ".qorn-" + std::to_string(getpid());
    writeFile(path(scratch), "another's");
    system_.fail("getrandom", EAGAIN);
    EXPECT_EQ(writeTextFile(path("file"), "new"), EEXIST);
    EXPECT_EQ(readFile(path("file")), "old");
    EXPECT_EQ(readFile(path(scratch)), "another's");
}

} // namespace
