/// For test builds of sources whose log calls the loggers filter: included in front of such a
/// source, it lets every call of ERROR_LOG through to the targets, with the tag of its logger.
#ifndef QORN_TESTS_EVERYLOGCALL_H
#define QORN_TESTS_EVERYLOGCALL_H

#include "1Base/Error/ErrorMacros.h"

namespace TestSupport {

template <class TLogger>
struct CTagOfLogger;

template <class TTag, class... TOthers>
struct CTagOfLogger<Error::CLogger<TTag, TOthers...>> {
    using TType = TTag;
};

template <class TLogger, class TTarget, class TSeverity, class TParams>
void logUnfiltered(char const* file, unsigned int line, char const* func, char const* date,
                   char const* time, char const* text, TParams const& params) {
    Error::CLogSingleton::log<typename CTagOfLogger<TLogger>::TType, TTarget, TSeverity>(
        file, line, func, date, time, text, params);
}

} // namespace TestSupport

#undef ERROR_LOG
#define ERROR_LOG(TLogger, TTarget, TSeverity, ...)                                                \
    (::TestSupport::logUnfiltered<TLogger, TTarget, TSeverity>(ERROR_ORIGIN, __VA_ARGS__))

#endif
