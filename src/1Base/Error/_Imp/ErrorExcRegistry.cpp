#include "1Base/Error/ErrorExcRegistry.h"

#include "1Base/Error/ErrorExc.h"
#include "1Base/Error/ErrorLogging.h"
#include "1Base/Error/ErrorMacros.h"
#include "1Base/Error/_Imp/ErrorExcRegistryImp.h"

#include <boost/thread/lock_types.hpp>
#include <boost/thread/mutex.hpp>

#include <algorithm>
#include <array>
#include <iostream>

namespace {

TEMPLMETA_TAG_NAME(ExceptionRegistry);

using TLock = boost::unique_lock<boost::mutex>;

// Lists more than its parent lets through: the debug records show once the parent does.
using TLoggerExceptionRegistry =
    Error::CLogger<TemplMeta::CTag<CTag_Name_ExceptionRegistry<char const*>>,
                   TemplMeta::CTypeList<Error::TSevDebug, Error::TStdSeverities>,
                   TemplMeta::CTypeList<Error::TTgtDebugger, Error::TStdTargets>,
                   Error::TLoggerError, TemplMeta::CAnd>;

// Straight to the stream: when an observer fails no logging can be trusted.
void outputFatalMsg(unsigned int line, char const* text) {
    std::cerr << __FILE__ << "(" << line << "): " << text << "\n";
}

class CExceptionRegistry : public Error::CExcRegistry {
  public:
    std::vector<Error::CExcImplementation const*> getExceptions() const override {
        TLock const lock(sMutex_());
        return std::vector<Error::CExcImplementation const*>(exceptions_.begin(),
                                                             exceptions_.begin() + count_);
    }

    void registerObserver(CObserver const* observer) const override {
        TLock const lock(sMutex_());
        ERROR_LOG(TLoggerExceptionRegistry, Error::TTgtLogger, Error::TSevLog,
                  "Registered exception logging observer");
        observers_.push_back(observer);
    }

    void unregisterObserver(CObserver const* observer) const override {
        TLock const lock(sMutex_());
        auto const found = std::find(observers_.begin(), observers_.end(), observer);
        if (found == observers_.end())
            return;
        observers_.erase(found);
        ERROR_LOG(TLoggerExceptionRegistry, Error::TTgtLogger, Error::TSevLog,
                  "Unregistered exception logging observer");
    }

    void addException_(Error::CExcImplementation const* impl, Error::CInfo const& info) override {
        TLock const lock(sMutex_());
        if (count_ == maximum)
            moveDown_(sacrificed);
        exceptions_[count_++] = impl;
        tellObservers_([&](CObserver const& observer) { observer.exceptionAdded(impl, info); });
    }

    bool removeException_(Error::CExcImplementation const* impl) override {
        TLock const lock(sMutex_());
        auto const last = exceptions_.begin() + count_;
        auto const found = std::find(exceptions_.begin(), last, impl);
        if (found == last)
            return false;
        moveDown_(static_cast<unsigned int>(found - exceptions_.begin()));
        tellObservers_([&](CObserver const& observer) { observer.exceptionRemoved(impl); });
        return true;
    }

    Error::CExcImplementation const* begin() const override { return exceptions_.front(); }
    Error::CExcImplementation const* end() const override { return exceptions_[count_]; }

  private:
    // One slot stays free, so that end() has one to show.
    static constexpr unsigned int maximum = 127;
    // The oldest 64 stay however many come: they are the likelier causes.
    static constexpr unsigned int sacrificed = 64;

    // The first lock where logging's is held as well.
    static boost::mutex& sMutex_() {
        static boost::mutex& mutex = *new boost::mutex;
        return mutex;
    }

    void moveDown_(unsigned int index) {
        std::copy(exceptions_.begin() + index + 1, exceptions_.begin() + count_,
                  exceptions_.begin() + index);
        --count_;
    }

    // No observer's failure reaches the exception that is coming or going.
    template <class TTell>
    void tellObservers_(TTell const& tell) const {
        try {
            for (CObserver const* const observer : observers_) {
                try {
                    tell(*observer);
                } catch (...) {
                    outputFatalMsg(__LINE__, "Uncaught exception. Output to observer canceled.\n");
                }
            }
        } catch (...) {
            outputFatalMsg(__LINE__,
                           "Uncaught exception. Output to all remaining observers canceled.\n");
        }
    }

    std::array<Error::CExcImplementation const*, maximum + 1> exceptions_ = {};
    unsigned int count_ = 0;
    mutable std::vector<CObserver const*> observers_;
};

} // namespace

namespace Error {
namespace Detail {

CExcRegistry* exceptionRegistry() {
    // Never destroyed: static objects of others may raise while the process ends.
    static CExcRegistry* const sExcRegistry_ = new CExceptionRegistry;
    return sExcRegistry_;
}

namespace {

// Made before anything can call in from outside, so that no failure has to do it.
[[maybe_unused]] CExcRegistry* const madeAtStart = exceptionRegistry();

} // namespace

} // namespace Detail
} // namespace Error
