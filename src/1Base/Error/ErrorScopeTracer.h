/// Log records for entering and leaving a scope.
///
///     {
///         Error::CScopeTracer<TLoggerDemo, Error::TTgtLogger, Error::TSevLog> const tracer(
///             ERROR_ORIGIN, "convertAll");   // Entering scope 'convertAll'...
///         convert(text);
///     }                                      // Leaving scope 'convertAll'...
#ifndef QORN_1BASE_ERRORSCOPETRACER_H
#define QORN_1BASE_ERRORSCOPETRACER_H

#include "1Base/Error/ErrorInfo.h"
#include "1Base/Error/ErrorLogging.h"
#include "1Base/Error/ErrorParameter.h"

namespace Error {
namespace Detail {

class CScopeTracerBase {
  protected:
    static constexpr char const* enterMsg_ = "Entering scope '@(scope)'...";
    static constexpr char const* leaveMsg_ = "Leaving scope '@(scope)'...";
};

} // namespace Detail

/// Logs when it is made and when it goes. The texts of the origin and `scope` are static. A record
/// that fails on leaving is dropped: a scope ends also while an exception is on its way.
template <class TLogger, class TTarget, class TSeverity>
class CScopeTracer : private Detail::CScopeTracerBase {
  public:
    /// Logs that the scope is entered; what logging raises passes.
    CScopeTracer(char const* file, unsigned int line, char const* func, char const* date,
                 char const* time, char const* scope)
        : origin_(file, line, func, date, time), scope_(scope) {
        log_(enterMsg_);
    }

    CScopeTracer(CScopeTracer const&) = delete;
    CScopeTracer& operator=(CScopeTracer const&) = delete;

    ~CScopeTracer() {
        try {
            log_(leaveMsg_);
        } catch (...) {
        }
    }

  private:
    void log_(char const* text) const {
        TLogger::template log<TTarget, TSeverity>(
            origin_.getFile(), origin_.getLine(), origin_.getFunc(), origin_.getDate(),
            origin_.getTime(), text, buildNamedParameter("scope", scope_));
    }

    COrigin origin_;
    char const* scope_;
};

} // namespace Error

#endif
