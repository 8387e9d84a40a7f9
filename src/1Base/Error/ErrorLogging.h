/// Logging that is decided at compile time.
///
///     using TLoggerDemo = Error::CLogger<TTagDemo, Error::TStdSeverities, Error::TStdTargets,
///                                        Error::CGlobalLogger, TemplMeta::CAnd>;
///     ERROR_LOG(TLoggerDemo, Error::TTgtLogger, Error::TSevWarn, "no folder @(key)",
///               ERROR_PARAM(key));
///
/// A call names a target and a severity as types. Each logger up the chain must let the pair
/// through; what one of them filters leaves no code behind. What passes reaches the targets that
/// are installed for just this pair: a target of SevError does not see SevWarn. Nothing is
/// installed by itself, so nothing is written until a host does it.
#ifndef QORN_1BASE_ERRORLOGGING_H
#define QORN_1BASE_ERRORLOGGING_H

#include "1Base/Error/ErrorMessage.h"
#include "1Base/Error/ErrorSeverity.h"
#include "1Base/Strings/StringsParameterList.h"
#include "1Base/TemplMeta/TemplMetaTag.h"
#include "1Base/TemplMeta/TemplMetaTypeList.h"

#include <boost/thread/lock_types.hpp>
#include <boost/thread/mutex.hpp>

#include <utility>
#include <vector>

namespace Error {

/// Where records go. A target runs under the lock of logging, on the thread that logs: it must
/// neither log nor raise an exception of the family. What else it throws passes to the caller.
class CLogTarget {
  public:
    virtual ~CLogTarget() = default;

    /// One record. All texts are static. The message comes unexpanded, made for this target alone:
    /// its text is "@(__msg__)", and its last parameter "__msg__" is the text that was logged.
    virtual void write(char const* file, unsigned int line, char const* func, char const* date,
                       char const* time, char const* tag, char const* target, char const* severity,
                       CMessage const& message) const = 0;
};

namespace Detail {

using TLogTargetList = std::vector<CLogTarget const*>;

/// One list of targets for each pair of target and severity.
template <class TTarget, class TSeverity>
class CTargetListAccessor {
  public:
    static TLogTargetList& doGetTargetList_() {
        // Never destroyed: static objects of others may log while the process ends.
        static TLogTargetList& list = *new TLogTargetList;
        return list;
    }
};

} // namespace Detail

/// The one place at run time: hands records to the targets of their pair.
class CLogSingleton {
  public:
    /// Installs a target for one pair, not owned. A target that is installed twice is called
    /// twice.
    template <class TTarget, class TSeverity>
    static void addTarget(CLogTarget const* target) {
        addTarget_(getTargetList_<TTarget, TSeverity>(), target);
    }

    /// Takes the first equal target of the pair out again and says whether there was one.
    template <class TTarget, class TSeverity>
    static bool removeTarget(CLogTarget const* target) {
        return removeTarget_(getTargetList_<TTarget, TSeverity>(), target);
    }

    /// Locks, and holds the lock until the last target has returned. Where no target is installed
    /// no parameter is turned into text.
    template <class TTag, class TTarget, class TSeverity, class TChar, class TParams>
    static void log(char const* file, unsigned int line, char const* func, char const* date,
                    char const* time, TChar const* text, TParams const& params) {
        boost::unique_lock<boost::mutex> const lock(mutex_());
        Detail::TLogTargetList const& list = getTargetList_<TTarget, TSeverity>();
        if (list.empty())
            return;
        Strings::CParameterList<wchar_t> owned;
        owned.reserve(Strings::parameterCount(params) + 1); // the text joins them
        owned.add(params);
        dolog<TTag, TTarget, TSeverity>(list, file, line, func, date, time, text, std::move(owned));
    }

    /// The targets of one pair. Read and changed under the lock alone.
    template <class TTarget, class TSeverity>
    static Detail::TLogTargetList& getTargetList_() {
        return Detail::CTargetListAccessor<TTarget, TSeverity>::doGetTargetList_();
    }

    /// The lock of logging: the second one where the exception registry's is held as well.
    static boost::mutex& mutex_();

  private:
    template <class TTag, class TTarget, class TSeverity, class TChar>
    static void dolog(Detail::TLogTargetList const& list, char const* file, unsigned int line,
                      char const* func, char const* date, char const* time, TChar const* text,
                      Strings::CParameterList<wchar_t>&& params) {
        if (!list.empty())
            write_(list, file, line, func, date, time, TemplMeta::getTagName<TTag>(),
                   TemplMeta::getTagName<TTarget>(), TemplMeta::getTagName<TSeverity>(), text,
                   std::move(params));
    }

    // The parameters are used up.
    static void write_(Detail::TLogTargetList const& list, char const* file, unsigned int line,
                       char const* func, char const* date, char const* time, char const* tag,
                       char const* target, char const* severity, char const* text,
                       Strings::CParameterList<wchar_t>&& params);
    static void write_(Detail::TLogTargetList const& list, char const* file, unsigned int line,
                       char const* func, char const* date, char const* time, char const* tag,
                       char const* target, char const* severity, wchar_t const* text,
                       Strings::CParameterList<wchar_t>&& params);

    static void addTarget_(Detail::TLogTargetList& list, CLogTarget const* target);
    static bool removeTarget_(Detail::TLogTargetList& list, CLogTarget const* target);
};

/// The end of each chain of loggers.
class CGlobalLogger {
  public:
    /// Hands the record to the targets of its pair.
    template <class TTag, class TTarget, class TSeverity, class TChar, class TParams>
    static void logFwd_(char const* file, unsigned int line, char const* func, char const* date,
                        char const* time, TChar const* text, TParams const& params) {
        CLogSingleton::log<TTag, TTarget, TSeverity>(file, line, func, date, time, text, params);
    }
};

namespace Detail {

/// Goes on to the parent, or does nothing.
template <bool passes, class TTag, class TTarget, class TSeverity, class TParent, class TParams>
class CFilteredLogger {
  public:
    template <class TChar>
    static void log(char const* file, unsigned int line, char const* func, char const* date,
                    char const* time, TChar const* text, TParams const& params) {
        TParent::template logFwd_<TTag, TTarget, TSeverity>(file, line, func, date, time, text,
                                                            params);
    }
};

template <class TTag, class TTarget, class TSeverity, class TParent, class TParams>
class CFilteredLogger<false, TTag, TTarget, TSeverity, TParent, TParams> {
  public:
    template <class TChar>
    static void log(char const*, unsigned int, char const*, char const*, char const*, TChar const*,
                    TParams const&) {}
};

template <class TTag, class TTarget, class TTargets, class TSeverity, class TSeverities,
          class TParent, class TParams, class TCombine>
class CFilter;

/// Both conditions must hold.
template <class TTag, class TTarget, class TTargets, class TSeverity, class TSeverities,
          class TParent, class TParams>
class CFilter<TTag, TTarget, TTargets, TSeverity, TSeverities, TParent, TParams, TemplMeta::CAnd>
    : public CFilteredLogger<TemplMeta::contains<TTargets, TTarget> &&
                                 TemplMeta::contains<TSeverities, TSeverity>,
                             TTag, TTarget, TSeverity, TParent, TParams> {};

} // namespace Detail

/// A module's logger: its tag, the severities and targets that it lets through, the next logger up,
/// and how the two conditions combine. A child can narrow what its parent lets through, never
/// widen it. TChar is char (UTF-8) or wchar_t; TParams one of the forms of parameters.
template <class TTag, class TSeverities, class TTargets, class TParent, class TCombine>
class CLogger {
  public:
    /// @{
    /// Logs a text with its parameters, or with none, where this logger and all above it let the
    /// pair of target and severity through; otherwise the call is empty.
    template <class TTarget, class TSeverity, class TChar, class TParams>
    static void log(char const* file, unsigned int line, char const* func, char const* date,
                    char const* time, TChar const* text, TParams const& params) {
        logFwd_<TTag, TTarget, TSeverity>(file, line, func, date, time, text, params);
    }

    template <class TTarget, class TSeverity, class TChar>
    static void log(char const* file, unsigned int line, char const* func, char const* date,
                    char const* time, TChar const* text) {
        log<TTarget, TSeverity>(file, line, func, date, time, text, TemplMeta::CNil());
    }
    /// @}

    /// The same for a child, with the tag of the logger that was called first.
    template <class TOrigin, class TTarget, class TSeverity, class TChar, class TParams>
    static void logFwd_(char const* file, unsigned int line, char const* func, char const* date,
                        char const* time, TChar const* text, TParams const& params) {
        Detail::CFilter<TOrigin, TTarget, TTargets, TSeverity, TSeverities, TParent, TParams,
                        TCombine>::log(file, line, func, date, time, text, params);
    }
};

TEMPLMETA_TAG_NAME(Error);

/// The logger of the error module.
using TLoggerError = CLogger<TemplMeta::CTag<CTag_Name_Error<char const*>>, TStdSeverities,
                             TStdTargets, CGlobalLogger, TemplMeta::CAnd>;

} // namespace Error

#endif
