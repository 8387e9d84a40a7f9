// Registry and logging under many threads. Meant for the thread sanitizer, and true without it.

#include "1Base/Error/Error.h"

#include "support/LogRecorder.h"
#include "support/Registry.h"

#include <gtest/gtest.h>

#include <atomic>
#include <chrono>
#include <future>
#include <stdexcept>
#include <string>
#include <thread>
#include <vector>

namespace {

using TestSupport::CInstalledTarget;
using TestSupport::CRegisteredObserver;

using CErrorThreadTest = TestSupport::CErrorTest;

constexpr int threadCount = 8;
constexpr int rounds = 200;

// Runs `work` on all threads at once.
template <class TWork>
void runOnThreads(TWork const& work) {
    std::atomic<int> waiting{threadCount};
    std::vector<std::thread> threads;
    for (int i = 0; i < threadCount; ++i)
        threads.emplace_back([&work, &waiting] {
            --waiting;
            while (waiting > 0)
                std::this_thread::yield();
            for (int round = 0; round < rounds; ++round)
                work(round);
        });
    for (std::thread& thread : threads)
        thread.join();
}

// Counts without a lock of its own: the one that it runs under must do.
class CCounter : public Error::CExcRegistry::CObserver, public Error::CLogTarget {
  public:
    void exceptionAdded(Error::CExcImplementation const*, Error::CInfo const&) const override {
        ++added;
    }
    void exceptionRemoved(Error::CExcImplementation const*) const override { ++removed; }
    void write(char const*, unsigned int, char const*, char const*, char const*, char const*,
               char const*, char const*, Error::CMessage const& message) const override {
        ++written;
        characters += message.getString(true).size();
    }

    mutable int added = 0;
    mutable int removed = 0;
    mutable int written = 0;
    mutable std::size_t characters = 0;
};

void raise(int round) {
    ERROR_BLOCK_BEGIN
    ERROR_THROW(Error::TExcErrorAssert, Error::msgNotExpected,
                ERROR_PARAMS(Error::buildNamedParameter("type", "round"),
                             Error::buildNamedParameter("key", round)));
    ERROR_BLOCK_END
}

void raiseAndWrap(int round) {
    try {
        raise(round);
    } catch (Error::CException const& exc) {
        ERROR_THROW(Error::TExcStdLibException, exc);
    }
}

TEST_F(CErrorThreadTest, AllExceptionsOfAllThreadsComeAndGo) {
    CCounter const counter;
    CRegisteredObserver const registered(counter);
    runOnThreads([](int round) {
        EXPECT_THROW(raise(round), Error::TExcErrorAssert);
        EXPECT_THROW(raiseAndWrap(round), Error::TExcStdLibException);
    });
    EXPECT_EQ(counter.added, threadCount * rounds * 3);
    EXPECT_EQ(counter.removed, threadCount * rounds * 3);
}

TEST_F(CErrorThreadTest, AllRecordsOfAllThreadsArriveOneByOne) {
    CCounter const counter;
    CInstalledTarget<Error::TTgtLogger, Error::TSevWarn> const warnings(counter);
    CInstalledTarget<Error::TTgtUser, Error::TSevError> const errors(counter);
    std::string const text = "text";
    runOnThreads([&text](int) {
        ERROR_LOG(Error::TLoggerError, Error::TTgtLogger, Error::TSevWarn, "1@(text)",
                  ERROR_PARAM(text));
        ERROR_LOG(Error::TLoggerError, Error::TTgtUser, Error::TSevError, "@(text)",
                  ERROR_PARAM(text));
        ERROR_LOG(Error::TLoggerError, Error::TTgtLogger, Error::TSevDebug, "filtered");
    });
    EXPECT_EQ(counter.written, threadCount * rounds * 2);
    EXPECT_EQ(counter.characters, static_cast<std::size_t>(threadCount * rounds * 9));
}

TEST_F(CErrorThreadTest, RaisingLoggingAndRegisteringGoOnSideBySide) {
    // Logs under the registry's lock while others log and register.
    Error::CExcLogObserver const logging;
    CCounter const counter;
    CRegisteredObserver const registered1(logging);
    CRegisteredObserver const registered2(counter);
    CInstalledTarget<Error::TTgtLogger, Error::TSevLog> const lines(counter);
    CInstalledTarget<Error::TTgtLogger, Error::TSevFatal> const reports(counter);
    runOnThreads([](int round) {
        CCounter const own;
        CRegisteredObserver const ownRegistered(own);
        CInstalledTarget<Error::TTgtLogger, Error::TSevInfo> const ownInstalled(own);
        EXPECT_THROW(raise(round), Error::TExcErrorAssert);
        EXPECT_THROW(ERROR_ASSERT(round < 0), Error::TExcErrorAssert);
        ERROR_LOG(Error::TLoggerError, Error::TTgtLogger, Error::TSevInfo, "round @(round)",
                  ERROR_PARAM(round));
        EXPECT_LE(TestSupport::liveExceptions().size(), 127U);
    });
    EXPECT_EQ(counter.added, threadCount * rounds * 2);
    EXPECT_EQ(counter.removed, threadCount * rounds * 2);
    // Each round: two lines about observers, four about exceptions, and a report.
    EXPECT_EQ(counter.written, threadCount * rounds * 7);
}

// The order of the locks.

// A target that tries the registry from another thread while it runs, and waits for it as long as
// `patience`.
class CRegistryProbe : public Error::CLogTarget {
  public:
    explicit CRegistryProbe(std::chrono::milliseconds patience) : patience_(patience) {}

    void write(char const*, unsigned int, char const*, char const*, char const*, char const*,
               char const*, char const*, Error::CMessage const&) const override {
        other_ = std::async(std::launch::async, [] { TestSupport::liveExceptions(); });
        wasLocked = other_.wait_for(patience_) == std::future_status::timeout;
    }

    void wait() const { other_.wait(); }

    mutable bool wasLocked = false;

  private:
    std::chrono::milliseconds patience_;
    mutable std::future<void> other_;
};

TEST_F(CErrorThreadTest, TheRegistrysLockIsTakenBeforeLoggings) {
    CRegistryProbe const probe(std::chrono::milliseconds(50));
    CCounter const observer;
    CInstalledTarget<Error::TTgtLogger, Error::TSevLog> const installed(probe);
    TestSupport::registry().registerObserver(&observer);
    EXPECT_TRUE(probe.wasLocked);
    probe.wait();
    TestSupport::registry().unregisterObserver(&observer);
    EXPECT_TRUE(probe.wasLocked);
    probe.wait();
}

TEST_F(CErrorThreadTest, LoggingTakesItsOwnLockAlone) {
    CRegistryProbe const probe(std::chrono::minutes(2));
    CInstalledTarget<Error::TTgtLogger, Error::TSevLog> const installed(probe);
    ERROR_LOG(Error::TLoggerError, Error::TTgtLogger, Error::TSevLog, "text");
    EXPECT_FALSE(probe.wasLocked);
    probe.wait();
}

TEST_F(CErrorThreadTest, RaisingTakesTheRegistrysLockAlone) {
    class CLoggingProbe : public Error::CExcRegistry::CObserver {
      public:
        void exceptionAdded(Error::CExcImplementation const*, Error::CInfo const&) const override {
            ERROR_LOG(Error::TLoggerError, Error::TTgtLogger, Error::TSevInfo, "added");
            ++calls;
        }
        void exceptionRemoved(Error::CExcImplementation const*) const override {
            ERROR_LOG(Error::TLoggerError, Error::TTgtLogger, Error::TSevInfo, "removed");
            ++calls;
        }
        mutable int calls = 0;
    };
    CLoggingProbe const probe;
    CRegisteredObserver const registered(probe);
    EXPECT_THROW(raise(1), Error::TExcErrorAssert);
    EXPECT_EQ(probe.calls, 2);
}

} // namespace
