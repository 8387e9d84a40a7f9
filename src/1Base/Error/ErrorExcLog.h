/// Logging an exception.
///
///     catch (Error::CException const& exc) {
///         Error::log<TLoggerDemo, Error::TTgtLogger>(exc);
///     }
#ifndef QORN_1BASE_ERROREXCLOG_H
#define QORN_1BASE_ERROREXCLOG_H

#include "1Base/Error/ErrorException.h"
#include "1Base/Error/ErrorLogging.h"

#include <string>

namespace Error {
namespace Detail {

/// The exception's text with its leftover parameters. The exception keeps its own text as it is.
std::string buildLogText(CException const& exc);

} // namespace Detail

/// Logs the exception with its own origin, at SevError whatever its severity. For destructors and
/// other places that must go on.
template <class TLogger, class TTarget>
void log(CException const& exc) {
    COrigin const& origin = exc.getInfo().getOrigin();
    TLogger::template log<TTarget, TSevError, char>(
        origin.getFile(), origin.getLine(), origin.getFunc(), origin.getDate(), origin.getTime(),
        Detail::buildLogText(exc).c_str());
}

} // namespace Error

#endif
