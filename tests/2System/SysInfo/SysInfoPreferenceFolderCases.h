/// Stores of preferences in tests: below a root of their own, their values as texts.
#ifndef QORN_TESTS_SYSINFOPREFERENCEFOLDERCASES_H
#define QORN_TESTS_SYSINFOPREFERENCEFOLDERCASES_H

#include "2System/SysInfo/SysInfoPreferenceFolder.h"

#include "support/FileRoot.h"

#include <sched.h>
#include <sys/mount.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cstddef>
#include <cstdio>
#include <functional>
#include <string>
#include <vector>

namespace PreferenceTest {

using SysInfo::CPreferenceFolder;
using SysInfo::CSystemPrefs;
using SysInfo::CSystemPrefsPath;
using SysInfo::TByteVector;
using TestSupport::listTree;
using TestSupport::makeFolders;
using TestSupport::pathExists;
using TestSupport::readFile;
using TestSupport::writeFile;

using TNames = std::vector<std::string>;

inline CSystemPrefsPath at(std::string const& path) {
    return CSystemPrefsPath(path);
}

inline TByteVector bytes(std::string const& text) {
    return TByteVector(text.begin(), text.end());
}

/// A user's store "Acme", whose folder is made, or is left missing.
inline CPreferenceFolder userStore(SysInfo::TAuthorization authorization = nullptr,
                                   bool create = true) {
    return CPreferenceFolder(CSystemPrefs::ekUser, CSystemPrefs::erWrite, at("Acme"), create,
                             authorization);
}

/// The same for all users of the machine.
inline CPreferenceFolder machineStore(SysInfo::TAuthorization authorization = nullptr,
                                      bool create = true) {
    return CPreferenceFolder(CSystemPrefs::ekMachine, CSystemPrefs::erWrite, at("Acme"), create,
                             authorization);
}

/// The value's bytes; "(untouched)" where reading left the caller's value as it was.
inline std::string valueOf(CPreferenceFolder const& store, std::string const& path,
                           std::string const& key) {
    TByteVector value = bytes("(untouched)");
    EXPECT_EQ(&store.getValue(at(path), key, value), &value);
    return std::string(value.begin(), value.end());
}

/// Around the piece of 1024 bytes in which a value is read, and far beyond it. Written one over the
/// other they become longer and shorter.
inline constexpr std::size_t valueSizes[] = {1, 0, 1023, 1024, 10000000, 1025, 2047, 2048, 2049, 0};

/// Every byte value, in an order that shows which piece of it was lost.
inline std::string binaryContent(std::size_t size) {
    std::string content(size, '\0');
    for (std::size_t i = 0; i < size; ++i)
        content[i] = static_cast<char>((i * 31 + i / 256) % 256);
    return content;
}

/// Runs a body beside a volume of 64 KiB that is mounted at `folder`, in a process that alone sees
/// it. What fails in the body fails the test. Skips the test where nothing can be mounted; to be
/// called last in a test.
inline void withSmallVolume(std::string const& folder, std::function<void()> const& body) {
    constexpr int noVolume = 77;
    std::fflush(nullptr);
    pid_t const child = fork();
    ASSERT_NE(child, -1);
    if (child == 0) {
        if (unshare(CLONE_NEWNS) != 0 ||
            mount("none", "/", nullptr, MS_REC | MS_PRIVATE, nullptr) != 0 ||
            mount("none", folder.c_str(), "tmpfs", 0, "size=64k") != 0)
            _exit(noVolume);
        body();
        std::fflush(nullptr);
        _exit(testing::Test::HasFailure() ? 1 : 0);
    }
    int status = 0;
    ASSERT_EQ(waitpid(child, &status, 0), child);
    ASSERT_TRUE(WIFEXITED(status));
    if (WEXITSTATUS(status) == noVolume)
        GTEST_SKIP() << "a small volume can't be mounted here";
    EXPECT_EQ(WEXITSTATUS(status), 0) << "failures in the child process, see above";
}

/// Both preference folders lie below path().
class CPreferenceFolderTest : public TestSupport::CFileRootTest {
  protected:
    void SetUp() override {
        CFileRootTest::SetUp();
        root().environment().set("XDG_CONFIG_HOME", path("user"));
        root().environment().set("XDG_CONFIG_DIRS", path("machine"));
    }

    /// Where the stores' folders lie.
    std::string user(std::string const& name = "") const {
        return path("user/Library/Preferences/Acme" + name);
    }
    std::string machine(std::string const& name = "") const {
        return path("machine/Library/Preferences/Acme" + name);
    }
};

} // namespace PreferenceTest

#endif
