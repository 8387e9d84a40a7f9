#include "1Base/Error/ErrorLogging.h"

#include <algorithm>
#include <iterator>
#include <utility>

namespace Error {
namespace {

// The text comes last, and each target has a message of its own: expanding it rewrites it.
template <class TText>
void writeToTargets(Detail::TLogTargetList const& list, char const* file, unsigned int line,
                    char const* func, char const* date, char const* time, char const* tag,
                    char const* target, char const* severity, TText const& text,
                    Strings::CParameterList<wchar_t>&& params) {
    params.add(Strings::buildNamedParameter("__msg__", text));
    auto const write = [&](CLogTarget const& each, CMessage const& message) {
        each.write(file, line, func, date, time, tag, target, severity, message);
    };
    auto const last = std::prev(list.end());
    for (auto each = list.begin(); each != last; ++each)
        write(**each, CMessage(msgPlainMessage, params));
    write(**last, CMessage(msgPlainMessage, std::move(params)));
}

} // namespace

boost::mutex& CLogSingleton::mutex_() {
    // Never destroyed: static objects of others may log while the process ends.
    static boost::mutex& mutex = *new boost::mutex;
    return mutex;
}

void CLogSingleton::write_(Detail::TLogTargetList const& list, char const* file, unsigned int line,
                           char const* func, char const* date, char const* time, char const* tag,
                           char const* target, char const* severity, char const* text,
                           Strings::CParameterList<wchar_t>&& params) {
    writeToTargets(list, file, line, func, date, time, tag, target, severity, text,
                   std::move(params));
}

void CLogSingleton::write_(Detail::TLogTargetList const& list, char const* file, unsigned int line,
                           char const* func, char const* date, char const* time, char const* tag,
                           char const* target, char const* severity, wchar_t const* text,
                           Strings::CParameterList<wchar_t>&& params) {
    writeToTargets(list, file, line, func, date, time, tag, target, severity, text,
                   std::move(params));
}

void CLogSingleton::addTarget_(Detail::TLogTargetList& list, CLogTarget const* target) {
    boost::unique_lock<boost::mutex> const lock(mutex_());
    list.push_back(target);
}

bool CLogSingleton::removeTarget_(Detail::TLogTargetList& list, CLogTarget const* target) {
    boost::unique_lock<boost::mutex> const lock(mutex_());
    auto const found = std::find(list.begin(), list.end(), target);
    if (found == list.end())
        return false;
    list.erase(found);
    return true;
}

} // namespace Error
