/// A place of its own for each test of files.
///
///     using FileSysTest = TestSupport::CFileRootTest;
///     TEST_F(FileSysTest, AFileIsFound) {
///         TestSupport::writeFile(path("letter.txt"), "Dear Ada");
///         EXPECT_TRUE(FileSys::CFileSpec(path("letter.txt")).exists());
///     }
#ifndef QORN_TESTS_FILEROOT_H
#define QORN_TESTS_FILEROOT_H

#include "support/Registry.h"

#include <functional>
#include <map>
#include <optional>
#include <string>
#include <vector>

namespace TestSupport {

/// Writes a file, in the place of one that is there.
void writeFile(std::string const& path, std::string const& content = "");

/// The bytes of a file. Fails the running test where it can't be read.
std::string readFile(std::string const& path);

/// Makes a folder and its missing parents.
void makeFolders(std::string const& path);

/// Makes a symbolic link, which may lead nowhere.
void makeLink(std::string const& target, std::string const& link);

/// Whether something is there; a link that leads nowhere is.
bool pathExists(std::string const& path);

/// What lies below a folder, by its path from there, sorted. Links are not followed.
std::vector<std::string> listTree(std::string const& folder);

/// Removes a file, or a folder with all in it at any depth, also where its permissions forbid it.
void removeTree(std::string const& path);

/// Environment variables that come back as they were.
class CEnvironment {
  public:
    CEnvironment() = default;
    ~CEnvironment();

    CEnvironment(CEnvironment const&) = delete;
    CEnvironment& operator=(CEnvironment const&) = delete;

    void set(std::string const& name, std::string const& value);
    void unset(std::string const& name);

  private:
    void keep_(std::string const& name);

    std::map<std::string, std::optional<std::string>> before_;
};

/// An empty folder below TMPDIR, or below "/tmp" where that can't be written, which goes at the end
/// with all in it. While it lives HOME, TMPDIR and the XDG base folders lie in it as well, beside
/// the empty folder, and all other XDG variables are unset. Fails the running test where it can't
/// be made.
class CFileRoot {
  public:
    CFileRoot();
    ~CFileRoot();

    CFileRoot(CFileRoot const&) = delete;
    CFileRoot& operator=(CFileRoot const&) = delete;

    /// The empty folder: absolute, without links and without a separator at its end.
    std::string path() const { return root_ + "/files"; }

    /// A path below it.
    std::string path(std::string const& name) const { return path() + "/" + name; }

    /// Where HOME and TMPDIR lead. Both exist and are empty.
    std::string home() const { return root_ + "/home"; }
    std::string temporary() const { return root_ + "/tmp"; }

    CEnvironment& environment() { return environment_; }

  private:
    void pointEnvironment_();

    std::string root_;
    CEnvironment environment_;
};

/// Runs a body in a child process that is not root: as it is where this process isn't root either,
/// otherwise as the user "nobody". What fails in the body fails the test. Skips the test where that
/// user can't enter `folder`; to be called last in a test, since it goes on behind a skip.
void runAsOrdinaryUser(std::string const& folder, std::function<void()> const& body);

/// A folder on another volume than that of a given folder, which goes at the end with all in it.
///     CSecondVolume const volume(path());
///     if (!volume.isThere())
///         GTEST_SKIP() << volume.reason();
class CSecondVolume {
  public:
    /// A real rename decides whether the volumes differ.
    explicit CSecondVolume(std::string const& folder);
    ~CSecondVolume();

    CSecondVolume(CSecondVolume const&) = delete;
    CSecondVolume& operator=(CSecondVolume const&) = delete;

    bool isThere() const { return reason_.empty(); }
    std::string const& reason() const { return reason_; }

    std::string const& path() const { return path_; }
    std::string path(std::string const& name) const { return path_ + "/" + name; }

  private:
    std::string path_;
    std::string reason_;
};

/// A test with a file root, which ends with as many live exceptions and platform objects as it
/// began with.
class CFileRootTest : public CErrorTest {
  protected:
    std::string path() const { return root_.path(); }
    std::string path(std::string const& name) const { return root_.path(name); }

    CFileRoot& root() { return root_; }

    void runAsOrdinaryUser(std::function<void()> const& body) const {
        TestSupport::runAsOrdinaryUser(path(), body);
    }

  private:
    CFileRoot root_;
};

} // namespace TestSupport

#endif
