// Raising and logging beside the bare language and a logging library.

#include "1Base/Error/Error.h"

#include "support/Benchmark.h"

#ifdef QORN_HAVE_SPDLOG
#    include <spdlog/sinks/null_sink.h>
#    include <spdlog/spdlog.h>
#endif

#include <boost/thread/lock_types.hpp>
#include <boost/thread/mutex.hpp>

#include <memory>
#include <stdexcept>
#include <string>
#include <thread>

namespace {

using Error::TLoggerError;
using Error::TTgtLogger;

// Exceptions.

constexpr int depth = 6;

[[noreturn]] void raiseOurs(int key) {
    ERROR_THROW(Error::TExcErrorAssert, Error::msgNotFound,
                ERROR_PARAMS(Error::buildNamedParameter("type", "key"), ERROR_PARAM(key)));
}

[[noreturn]] void raiseStandard(int key) {
    throw std::runtime_error("key " + std::to_string(key) + " was not found");
}

// `levels` functions on top of each other, each a guarded block.
template <int levels>
[[gnu::noinline]] void throughBlocks(int key) {
    ERROR_BLOCK_BEGIN
    if constexpr (levels > 1)
        throughBlocks<levels - 1>(key);
    else
        raiseOurs(key);
    ERROR_BLOCK_END
}

// The same without a trace: each only catches and rethrows.
template <int levels>
[[gnu::noinline]] void throughRethrows(int key, void (*raise)(int)) {
    try {
        if constexpr (levels > 1)
            throughRethrows<levels - 1>(key, raise);
        else
            raise(key);
    } catch (...) {
        throw;
    }
}

// Whether the exception was caught as XCaught.
template <class XCaught, class TRaise>
bool isCaught(TRaise const& raise) {
    try {
        raise();
    } catch (XCaught const&) {
        return true;
    }
    return false;
}

void addExceptions() {
    Benchmarks::add("RaiseAndCatch", "ours",
                    [] { return isCaught<Error::CException>([] { raiseOurs(7); }); });
    Benchmarks::add("RaiseAndCatch", "runtime_error",
                    [] { return isCaught<std::exception>([] { raiseStandard(7); }); });
    Benchmarks::add("RaiseThroughSix", "ours",
                    [] { return isCaught<Error::CException>([] { throughBlocks<depth>(7); }); });
    Benchmarks::add("RaiseThroughSix", "rethrow", [] {
        return isCaught<std::exception>([] { throughRethrows<depth>(7, raiseStandard); });
    });
}

// Logging. Each call logs one number.

void addFilteredCall() {
    Benchmarks::add("LogFiltered", "ours", [number = 7] {
        ERROR_LOG(TLoggerError, TTgtLogger, Error::TSevDebug, "number @(number)",
                  ERROR_PARAM(number));
        return number;
    });
    Benchmarks::add("LogFiltered", "nothing", [number = 7] { return number; });
}

// The lock that every passing call takes is a contender of its own.
void addCallWithoutTarget() {
    Benchmarks::add("LogWithoutTarget", "ours", [number = 7] {
        ERROR_LOG(TLoggerError, TTgtLogger, Error::TSevWarn, "number @(number)",
                  ERROR_PARAM(number));
        return number;
    });
    auto const mutex = std::make_shared<boost::mutex>();
    Benchmarks::add("LogWithoutTarget", "lock", [mutex, number = 7] {
        boost::unique_lock<boost::mutex> const lock(*mutex);
        return number;
    });
#ifdef QORN_HAVE_SPDLOG
    auto const logger = std::make_shared<spdlog::logger>("disabled");
    logger->set_level(spdlog::level::err);
    Benchmarks::add("LogWithoutTarget", "spdlog", [logger, number = 7] {
        logger->warn("number {}", number);
        return number;
    });
#endif
}

class CNullTarget : public Error::CLogTarget {
  public:
    void write(char const*, unsigned int, char const*, char const*, char const*, char const*,
               char const*, char const*, Error::CMessage const&) const override {}
};

// A narrow text is decoded on its way, a wide one is taken as it is; the peer formats a narrow one.
void addCallWithOneTarget() {
    static CNullTarget const target;
    Error::CLogSingleton::addTarget<TTgtLogger, Error::TSevError>(&target);
    Benchmarks::add("LogNullTarget/narrow", "ours", [number = 7] {
        ERROR_LOG(TLoggerError, TTgtLogger, Error::TSevError, "number @(number)",
                  ERROR_PARAM(number));
        return number;
    });
    Benchmarks::add("LogNullTarget/wide", "ours", [number = 7] {
        ERROR_LOG(TLoggerError, TTgtLogger, Error::TSevError, L"number @(number)",
                  ERROR_PARAM(number));
        return number;
    });
#ifdef QORN_HAVE_SPDLOG
    auto const logger =
        std::make_shared<spdlog::logger>("null", std::make_shared<spdlog::sinks::null_sink_mt>());
    for (char const* const row : {"LogNullTarget/narrow", "LogNullTarget/wide"})
        Benchmarks::add(row, "spdlog", [logger, number = 7] {
            logger->error("number {}", number);
            return number;
        });
#endif
}

void addBenchmarks() {
    // A host has threads. In a process that never had a second one the C library's locks leave out
    // their atomic operations.
    std::thread([] {}).join();
    addExceptions();
    addFilteredCall();
    addCallWithoutTarget();
    addCallWithOneTarget();
}

Benchmarks::CRegistrar const registrar(addBenchmarks);

} // namespace
