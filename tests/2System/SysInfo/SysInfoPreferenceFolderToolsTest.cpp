// The privileged road with the real tools: by a helper with rights for a process without, under
// two writers, and under processes that are killed.

#include "2System/SysInfo/SysInfoPreferenceFolderCases.h"

#include "2System/FileSys/FileSysExc.h"
#include "2System/SysInfo/SysInfoExc.h"

#include "support/TextFailures.h"

#include <spawn.h>
#include <sys/prctl.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <chrono>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <functional>
#include <random>
#include <thread>
#include <vector>

namespace {

using namespace PreferenceTest;

// Runs a tool and waits for it, as a shell would, but without one.
bool runTool(std::string const& tool, TNames arguments) {
    std::vector<char*> argv = {const_cast<char*>(tool.c_str())};
    for (std::string& argument : arguments)
        argv.push_back(argument.data());
    argv.push_back(nullptr);
    pid_t child = 0;
    int status = 0;
    return posix_spawn(&child, tool.c_str(), nullptr, nullptr, argv.data(), environ) == 0 &&
           waitpid(child, &status, 0) == child && WIFEXITED(status) && WEXITSTATUS(status) == 0;
}

// Runs the tools with the rights that the process has.
class COwnRights : public MacOS::CAuthorizationBase {
  public:
    bool isAuthorized() override { return true; }
    bool execute(std::string tool, TNames args) override { return runTool(tool, args); }
};

// A process that keeps the rights of the moment in which it is made, and runs the two tools for
// whoever asks it by the socket.
class CHelper : public MacOS::CAuthorizationBase {
  public:
    CHelper() {
        int ends[2] = {-1, -1};
        EXPECT_EQ(socketpair(AF_UNIX, SOCK_SEQPACKET | SOCK_CLOEXEC, 0, ends), 0);
        std::fflush(nullptr);
        server_ = fork();
        EXPECT_NE(server_, -1);
        if (server_ == 0) {
            close(ends[0]);
            serve_(ends[1]);
        }
        close(ends[1]);
        socket_ = ends[0];
    }
    ~CHelper() override {
        close(socket_);
        int status = 0;
        EXPECT_EQ(waitpid(server_, &status, 0), server_);
        EXPECT_TRUE(WIFEXITED(status) && WEXITSTATUS(status) == 0);
    }
    CHelper(CHelper const&) = delete;
    CHelper& operator=(CHelper const&) = delete;

    bool isAuthorized() override { return true; }

    bool execute(std::string tool, TNames args) override {
        // No argument of a program holds a zero.
        std::string request = tool;
        for (std::string const& argument : args)
            request += '\0' + argument;
        char reply = 0;
        return send(socket_, request.data(), request.size(), MSG_NOSIGNAL) > 0 &&
               recv(socket_, &reply, 1, 0) == 1 && reply == 'y';
    }

  private:
    [[noreturn]] static void serve_(int socket) {
        char request[65536];
        for (;;) {
            ssize_t const size = recv(socket, request, sizeof(request), 0);
            if (size <= 0)
                _exit(size == 0 ? 0 : 1);
            char const reply = run_(std::string(request, static_cast<std::size_t>(size)));
            if (send(socket, &reply, 1, MSG_NOSIGNAL) != 1)
                _exit(2);
        }
    }

    static char run_(std::string const& request) {
        TNames words(1);
        for (char const c : request) {
            if (c == '\0')
                words.emplace_back();
            else
                words.back() += c;
        }
        std::string const tool = words.front();
        words.erase(words.begin());
        bool const isKnown = tool == "/bin/mkdir" || tool == "/bin/mv";
        return isKnown && runTool(tool, words) ? 'y' : 'n';
    }

    pid_t server_ = -1;
    int socket_ = -1;
};

class CHelpedPreferenceTest : public CPreferenceFolderTest {
  protected:
    void SetUp() override {
        CPreferenceFolderTest::SetUp();
        if (geteuid() != 0)
            GTEST_SKIP() << "only root can give a helper more rights than it has itself";
        // Nobody else may change a thing in there, or put something else in its place.
        makeFolders(path("machine"));
        chmod(path().c_str(), 0755);
    }
};

TEST_F(CHelpedPreferenceTest, AProcessWithoutRightsWritesByTheHelpersTools) {
    CHelper helper;
    runAsOrdinaryUser([&] {
        EXPECT_THROW(machineStore(), FileSys::TExcFileSpec);
        CPreferenceFolder plain = machineStore(nullptr, false);
        EXPECT_THROW(plain.setValue(at(""), "key", bytes("value")), FileSys::TExcFileSpec);

        CPreferenceFolder store = machineStore(&helper);
        EXPECT_TRUE(pathExists(machine()));
        EXPECT_THROW(plain.setValue(at(""), "key", bytes("value")), SysInfo::TExcPreferenceFolder);
        for (std::size_t const size : valueSizes) {
            std::string const value = binaryContent(size);
            store.setValue(at("Window/a 'b' \xC3\xA9"), "the \"key\"", bytes(value));
            EXPECT_TRUE(valueOf(store, "Window/a 'b' \xC3\xA9", "the \"key\"") == value) << size;
        }
        store.setValue(at(""), "-f", bytes("value"));
        EXPECT_EQ(store.getValues(), TNames{"-f"});
        EXPECT_EQ(listTree(std::getenv("TMPDIR")), TNames());
    });
    struct stat status;
    ASSERT_EQ(stat(machine("/Window").c_str(), &status), 0);
    EXPECT_EQ(status.st_uid, 0U);
    ASSERT_EQ(stat(machine("/-f").c_str(), &status), 0);
    EXPECT_EQ(status.st_mode & 07777U, 0666U);
}

TEST_F(CHelpedPreferenceTest, DeletingDoesNotUseTheHelper) {
    CHelper helper;
    runAsOrdinaryUser([&] {
        CPreferenceFolder store = machineStore(&helper);
        store.setValue(at(""), "key", bytes("value"));
        EXPECT_THROW(store.deleteValue(at(""), "key"), SysInfo::TExcPreferenceFolder);
        store.deleteKey(at("key"));
        EXPECT_EQ(valueOf(store, "", "key"), "value");
    });
}

TEST_F(CHelpedPreferenceTest, AMoveThatTheToolRefusesFailsACheck) {
    CHelper helper;
    writeFile(path("machine/Library"), "in the way of every folder");
    runAsOrdinaryUser([&] {
        // mkdir's failure is silent, so that the check is the first to speak.
        CPreferenceFolder store = machineStore(&helper);
        EXPECT_EQ(
            TestSupport::failedCheckOf([&] { store.setValue(at(""), "key", bytes("value")); }),
            "auth->execute( Encoding::convert<Strings::stringUTF8,std::string>(\"/bin/mv\"), "
            "args)");
        EXPECT_EQ(listTree(std::getenv("TMPDIR")), TNames{"ZLT_CPreferenceFolder_tmp.dat"});
    });
}

// Moving to a folder is moving into it.
TEST_F(CPreferenceFolderTest, AValueThatIsAFolderTakesTheTemporaryFileIn) {
    COwnRights rights;
    CPreferenceFolder store = machineStore(&rights);
    makeFolders(machine("/key"));
    store.setValue(at(""), "key", bytes("value"));
    EXPECT_EQ(listTree(machine()), (TNames{"key", "key/ZLT_CPreferenceFolder_tmp.dat"}));
    EXPECT_EQ(valueOf(store, "", "key"), "");
}

TEST_F(CPreferenceFolderTest, ATemporaryFolderOnAnotherVolumeWillDo) {
    TestSupport::CSecondVolume const volume(path());
    if (!volume.isThere())
        GTEST_SKIP() << volume.reason();
    root().environment().set("TMPDIR", volume.path());
    COwnRights rights;
    CPreferenceFolder store = machineStore(&rights);
    std::string const content = binaryContent(100000);
    store.setValue(at(""), "key", bytes(content));
    EXPECT_TRUE(valueOf(store, "", "key") == content);
    EXPECT_EQ(listTree(volume.path()), TNames());
    struct stat status;
    ASSERT_EQ(stat(machine("/key").c_str(), &status), 0);
    EXPECT_EQ(status.st_mode & 07777U, 0666U);
}

TEST_F(CPreferenceFolderTest, AFullTemporaryFolderStoresTheValueShortAndTellsNobody) {
    withSmallVolume(root().temporary(), [this] {
        COwnRights rights;
        CPreferenceFolder store = machineStore(&rights);
        store.setValue(at(""), "key", bytes("old"));
        std::string const tooMuch = binaryContent(100000);
        store.setValue(at(""), "key", bytes(tooMuch));
        EXPECT_EQ(readFile(machine("/key")), tooMuch.substr(0, 65536));
    });
}

TEST_F(CPreferenceFolderTest, AMoveToAFullDiskFailsACheckAndLeavesTheTemporaryFile) {
    makeFolders(machine());
    withSmallVolume(machine(), [this] {
        COwnRights rights;
        CPreferenceFolder store = machineStore(&rights);
        EXPECT_THROW(store.setValue(at(""), "key", bytes(binaryContent(100000))),
                     Error::TExcErrorAssert);
        EXPECT_EQ(readFile(root().temporary() + "/ZLT_CPreferenceFolder_tmp.dat"),
                  binaryContent(100000));
    });
}

// Runs a body in a process of a group of its own and returns at once.
pid_t start(std::function<void()> const& body) {
    std::fflush(nullptr);
    pid_t const child = fork();
    EXPECT_NE(child, -1);
    if (child == 0) {
        setpgid(0, 0);
        body();
        std::fflush(nullptr);
        _exit(testing::Test::HasFailure() ? 1 : 0);
    }
    setpgid(child, child);
    return child;
}

// Two contents of different lengths, both beyond what a stream buffers.
std::string firstValue() {
    return std::string(9000, 'a');
}
std::string secondValue() {
    return std::string(30000, 'b');
}

// Nothing reserves a temporary name, so each writer has a temporary folder of its own.
TEST_F(CPreferenceFolderTest, AReaderOfTwoWritersSeesWholeValuesOnly) {
    constexpr int rounds = 1500;
    COwnRights rights;
    CPreferenceFolder store = machineStore(&rights);
    auto const write = [&](std::string const& value, std::string const& temporary) {
        setenv("TMPDIR", temporary.c_str(), 1);
        for (int i = 0; i < rounds; ++i)
            store.setValue(at(""), "key", bytes(value));
    };
    makeFolders(path("first"));
    makeFolders(path("second"));
    store.setValue(at(""), "key", bytes(firstValue()));
    pid_t const writers[] = {start([&] { write(firstValue(), path("first")); }),
                             start([&] { write(secondValue(), path("second")); })};

    long firsts = 0;
    long seconds = 0;
    for (std::size_t ended = 0; ended < 2;) {
        std::string const value = valueOf(store, "", "key");
        if (value == firstValue())
            ++firsts;
        else if (value == secondValue())
            ++seconds;
        else
            ADD_FAILURE() << "a value of " << value.size() << " bytes";
        int status = 0;
        if (waitpid(writers[ended], &status, WNOHANG) == writers[ended]) {
            EXPECT_TRUE(WIFEXITED(status) && WEXITSTATUS(status) == 0);
            ++ended;
        }
    }
    std::printf("%d writes, %ld reads\n", 2 * rounds, firsts + seconds);
    EXPECT_GT(firsts, 0);
    EXPECT_GT(seconds, 0);
    EXPECT_EQ(store.getValues(), TNames{"key"});
    EXPECT_EQ(listTree(path("first")), TNames());
    EXPECT_EQ(listTree(path("second")), TNames());
}

class CKilledWriterTest : public CPreferenceFolderTest {
  protected:
    // How long an undisturbed write takes, in microseconds.
    long duration(CPreferenceFolder& store) {
        std::vector<long> durations;
        for (int i = 0; i < 9; ++i) {
            auto const begin = std::chrono::steady_clock::now();
            waitpid(start([&] { store.setValue(at(""), "key", bytes("?")); }), nullptr, 0);
            durations.push_back(
                static_cast<long>(std::chrono::duration_cast<std::chrono::microseconds>(
                                      std::chrono::steady_clock::now() - begin)
                                      .count()));
        }
        std::sort(durations.begin(), durations.end());
        return durations[durations.size() / 2];
    }

    void SetUp() override {
        CPreferenceFolderTest::SetUp();
        // A writer that is killed leaves its tool to this process, which waits for it.
        ASSERT_EQ(prctl(PR_SET_CHILD_SUBREAPER, 1), 0);
    }

    // Kills the writer with its tool, and waits until both have gone.
    static void killGroup(pid_t leader) {
        kill(-leader, SIGKILL);
        while (waitpid(-leader, nullptr, 0) > 0)
            continue;
    }
};

TEST_F(CKilledWriterTest, AWriterThatIsKilledLeavesTheOldValueOrTheNewOne) {
    constexpr int rounds = 500;
    constexpr unsigned int seed = 20210429;
    RecordProperty("seed", static_cast<int>(seed));
    std::mt19937 random(seed);
    COwnRights rights;
    CPreferenceFolder store = machineStore(&rights);
    long const longest = 3 * duration(store) / 2;
    std::uniform_int_distribution<long> delay(0, longest);

    store.setValue(at(""), "key", bytes(firstValue()));
    std::string before = firstValue();
    int kept = 0;
    for (int i = 0; i < rounds; ++i) {
        std::string const after = before == firstValue() ? secondValue() : firstValue();
        pid_t const writer = start([&] { store.setValue(at(""), "key", bytes(after)); });
        std::this_thread::sleep_for(std::chrono::microseconds(delay(random)));
        killGroup(writer);

        std::string const value = valueOf(store, "", "key");
        ASSERT_TRUE(value == before || value == after) << "a value of " << value.size() << " bytes";
        kept += value == before ? 1 : 0;
        before = value;
        for (std::string const& name : listTree(root().temporary()))
            TestSupport::removeTree(root().temporary() + "/" + name);
    }
    std::printf("seed %u: %d of %d writers were killed before the move\n", seed, kept, rounds);
    EXPECT_GT(kept, 0);
    EXPECT_LT(kept, rounds);
    EXPECT_EQ(store.getValues(), TNames{"key"});
}

} // namespace
