/// A log target that keeps what it gets.
///
///     TestSupport::CLogRecorder const recorder;
///     TestSupport::CInstalledTarget<Error::TTgtLogger, Error::TSevWarn> const installed(recorder);
///     ERROR_LOG(TLoggerSystem, Error::TTgtLogger, Error::TSevWarn, "no room");
///     recorder.records().at(0).expanded;   // L"no room"
#ifndef QORN_TESTS_LOGRECORDER_H
#define QORN_TESTS_LOGRECORDER_H

#include "1Base/Error/ErrorLogging.h"

#include "support/MessageParameters.h"
#include "support/Place.h"

#include <string>
#include <vector>

namespace TestSupport {

/// One record, with the message as it came and as it reads once expanded.
struct CLogRecord {
    TPlace place;
    std::string tag;
    std::string target;
    std::string severity;
    Strings::string text;
    TParameters parameters;
    Strings::string expanded;
};

class CLogRecorder : public Error::CLogTarget {
  public:
    std::vector<CLogRecord> const& records() const { return records_; }
    void clear() { records_.clear(); }

    void write(char const* file, unsigned int line, char const* func, char const* date,
               char const* time, char const* tag, char const* target, char const* severity,
               Error::CMessage const& message) const override {
        Strings::string const text = message.getString(false);
        TParameters const parameters = parametersOf(message);
        records_.push_back({TPlace(file, line, func, date, time), tag, target, severity, text,
                            parameters, message.getString(true)});
    }

  private:
    mutable std::vector<CLogRecord> records_;
};

/// Installs a target for one pair while it lives.
template <class TTarget, class TSeverity>
class CInstalledTarget {
  public:
    explicit CInstalledTarget(Error::CLogTarget const& target) : target_(target) {
        Error::CLogSingleton::addTarget<TTarget, TSeverity>(&target_);
    }
    ~CInstalledTarget() { Error::CLogSingleton::removeTarget<TTarget, TSeverity>(&target_); }

    CInstalledTarget(CInstalledTarget const&) = delete;
    CInstalledTarget& operator=(CInstalledTarget const&) = delete;

  private:
    Error::CLogTarget const& target_;
};

} // namespace TestSupport

#endif
