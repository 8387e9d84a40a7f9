#include "support/FileRoot.h"

#include <fts.h>
#include <grp.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <fstream>
#include <iterator>

// Not every system declares it.
extern char** environ;

namespace TestSupport {
namespace {

std::string errorText() {
    return std::strerror(errno);
}

class CTreeWalk {
  public:
    explicit CTreeWalk(std::string const& path) : path_(path) {
        char* paths[] = {path_.data(), nullptr};
        walk_ = fts_open(paths, FTS_PHYSICAL, nullptr);
    }
    ~CTreeWalk() {
        if (walk_ != nullptr)
            fts_close(walk_);
    }

    CTreeWalk(CTreeWalk const&) = delete;
    CTreeWalk& operator=(CTreeWalk const&) = delete;

    FTSENT* next() { return walk_ == nullptr ? nullptr : fts_read(walk_); }

  private:
    std::string path_;
    FTS* walk_ = nullptr;
};

std::string parentOf(std::string const& path) {
    return path.substr(0, path.rfind('/'));
}

bool isWritableFolder(std::string const& path) {
    struct stat status;
    return stat(path.c_str(), &status) == 0 && S_ISDIR(status.st_mode) &&
           access(path.c_str(), W_OK | X_OK) == 0;
}

// TMPDIR may be missing, empty, relative, closed or no folder at all.
std::string temporaryBase() {
    char const* const variable = std::getenv("TMPDIR");
    char* const real =
        variable == nullptr || *variable == '\0' ? nullptr : realpath(variable, nullptr);
    std::string const base = real == nullptr ? "/tmp" : real;
    std::free(real);
    return isWritableFolder(base) ? base : "/tmp";
}

// A new folder that other users may enter; empty where there is none.
std::string makeUniqueFolder(std::string const& base) {
    std::string path = base + "/qorn-test-XXXXXX";
    if (mkdtemp(path.data()) == nullptr)
        return std::string();
    chmod(path.c_str(), 0755);
    return path;
}

std::vector<std::string> xdgVariables() {
    std::vector<std::string> names;
    for (char** entry = environ; *entry != nullptr; ++entry) {
        if (std::strncmp(*entry, "XDG_", 4) == 0)
            names.emplace_back(*entry, std::strcspn(*entry, "="));
    }
    return names;
}

constexpr int exitPassed = 0;
constexpr int exitFailed = 1;
constexpr int exitSkipped = 77;
constexpr uid_t nobody = 65534;

bool dropRights() {
    if (geteuid() != 0)
        return true;
    return setgroups(0, nullptr) == 0 && setgid(nobody) == 0 && setuid(nobody) == 0;
}

int runDropped(std::string const& folder, std::function<void()> const& body) {
    if (!dropRights() || access(folder.c_str(), R_OK | X_OK) != 0)
        return exitSkipped;
    try {
        body();
    } catch (...) {
        ADD_FAILURE() << "an exception left the body";
    }
    return testing::Test::HasFailure() ? exitFailed : exitPassed;
}

} // namespace

void writeFile(std::string const& path, std::string const& content) {
    std::ofstream file(path, std::ios::binary | std::ios::trunc);
    file << content << std::flush;
    EXPECT_TRUE(file.good()) << path << ": " << errorText();
}

std::string readFile(std::string const& path) {
    std::ifstream file(path, std::ios::binary);
    EXPECT_TRUE(file.is_open()) << path << ": " << errorText();
    return std::string(std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>());
}

void makeFolders(std::string const& path) {
    if (path.empty() || mkdir(path.c_str(), 0777) == 0 || errno == EEXIST)
        return;
    if (errno == ENOENT) {
        makeFolders(parentOf(path));
        if (mkdir(path.c_str(), 0777) == 0)
            return;
    }
    ADD_FAILURE() << path << ": " << errorText();
}

void makeLink(std::string const& target, std::string const& link) {
    EXPECT_EQ(symlink(target.c_str(), link.c_str()), 0) << link << ": " << errorText();
}

bool pathExists(std::string const& path) {
    struct stat status;
    return lstat(path.c_str(), &status) == 0;
}

std::vector<std::string> listTree(std::string const& folder) {
    std::vector<std::string> entries;
    CTreeWalk walk(folder);
    while (FTSENT const* const entry = walk.next()) {
        if (entry->fts_level > 0 && entry->fts_info != FTS_DP)
            entries.push_back(std::string(entry->fts_path).substr(folder.size() + 1));
    }
    std::sort(entries.begin(), entries.end());
    return entries;
}

void removeTree(std::string const& path) {
    CTreeWalk walk(path);
    while (FTSENT const* const entry = walk.next()) {
        if (entry->fts_info == FTS_D)
            chmod(entry->fts_accpath, 0700);
        else if (entry->fts_info == FTS_DP || entry->fts_info == FTS_DNR)
            rmdir(entry->fts_accpath);
        else
            unlink(entry->fts_accpath);
    }
}

CEnvironment::~CEnvironment() {
    for (auto const& [name, value] : before_) {
        if (value)
            setenv(name.c_str(), value->c_str(), 1);
        else
            unsetenv(name.c_str());
    }
}

void CEnvironment::keep_(std::string const& name) {
    char const* const value = std::getenv(name.c_str());
    before_.emplace(name, value == nullptr ? std::nullopt : std::optional<std::string>(value));
}

void CEnvironment::set(std::string const& name, std::string const& value) {
    keep_(name);
    setenv(name.c_str(), value.c_str(), 1);
}

void CEnvironment::unset(std::string const& name) {
    keep_(name);
    unsetenv(name.c_str());
}

CFileRoot::CFileRoot() : root_(makeUniqueFolder(temporaryBase())) {
    if (root_.empty()) {
        ADD_FAILURE() << temporaryBase() << ": " << errorText();
        return;
    }
    for (std::string const& folder : {path(), home(), temporary()}) {
        makeFolders(folder);
        // For the child of another user, whatever the mask says.
        chmod(folder.c_str(), 0777);
    }
    pointEnvironment_();
}

CFileRoot::~CFileRoot() {
    if (root_.empty())
        return;
    removeTree(root_);
    EXPECT_FALSE(pathExists(root_)) << root_;
}

void CFileRoot::pointEnvironment_() {
    for (std::string const& name : xdgVariables())
        environment_.unset(name);
    environment_.set("HOME", home());
    environment_.set("TMPDIR", temporary());
    environment_.set("XDG_CONFIG_HOME", home() + "/.config");
    environment_.set("XDG_DATA_HOME", home() + "/.local/share");
    environment_.set("XDG_STATE_HOME", home() + "/.local/state");
    environment_.set("XDG_CACHE_HOME", home() + "/.cache");
    environment_.set("XDG_CONFIG_DIRS", root_ + "/etc/xdg");
    environment_.set("XDG_DATA_DIRS", root_ + "/usr/share");
    environment_.set("XDG_RUNTIME_DIR", root_ + "/run");
}

void runAsOrdinaryUser(std::string const& folder, std::function<void()> const& body) {
    // What is buffered would be written twice.
    std::fflush(nullptr);
    pid_t const child = fork();
    ASSERT_NE(child, -1) << errorText();
    if (child == 0) {
        int const result = runDropped(folder, body);
        std::fflush(nullptr);
        // The parent does the rest: the child must not take the files down.
        _exit(result);
    }
    int status = 0;
    ASSERT_EQ(waitpid(child, &status, 0), child) << errorText();
    ASSERT_TRUE(WIFEXITED(status)) << "the child ended by signal " << WTERMSIG(status);
    if (WEXITSTATUS(status) == exitSkipped)
        GTEST_SKIP() << "no other user can enter " << folder;
    EXPECT_EQ(WEXITSTATUS(status), exitPassed) << "failures in the child process, see above";
}

CSecondVolume::CSecondVolume(std::string const& folder) : path_(makeUniqueFolder("/dev/shm")) {
    if (path_.empty()) {
        reason_ = "/dev/shm: " + errorText();
        return;
    }
    std::string const probe = folder + "/qorn-volume-probe";
    writeFile(probe);
    if (std::rename(probe.c_str(), path("probe").c_str()) == 0)
        reason_ = "/dev/shm is on the same volume as " + folder;
    else if (errno != EXDEV)
        reason_ = "/dev/shm: " + errorText();
    removeTree(probe);
    removeTree(path("probe"));
}

CSecondVolume::~CSecondVolume() {
    if (!path_.empty())
        removeTree(path_);
}

} // namespace TestSupport
