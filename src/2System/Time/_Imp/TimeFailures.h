/// What the failures of dates and times have in common.
///
///     ERROR_THROW(TExcTimeDateTime, Detail::wrongArgument("month", 13, "Invalid month"));
///     // 'Argument month 13 is wrong: Invalid month'
#ifndef QORN_2SYSTEM_TIMEFAILURES_H
#define QORN_2SYSTEM_TIMEFAILURES_H

#include "1Base/Error/ErrorMacros.h"
#include "1Base/Error/ErrorMessage.h"
#include "1Base/Strings/StringsKinds.h"
#include "2System/Time/TimeDate.h"

#include <string>

namespace Time {
namespace Detail {

/// The catalogue's message of a value that is refused.
template <class TKey>
Error::CMessage wrongArgument(char const* type, TKey const& key, char const* reason) {
    return Error::CMessage(Error::msgWrongArgument,
                           ERROR_PARAMS(ERROR_PARAM(type), ERROR_PARAM(key), ERROR_PARAM(reason)));
}

/// A date that is none, as a key: "2021/2/31", in plain decimals whatever the locale.
inline Strings::string dateKey(CDate::TDay day, CDate::EMonth month, CDate::TYear year) {
    return std::to_wstring(year) + L'/' + std::to_wstring(Config::Int32(month)) + L'/' +
           std::to_wstring(day);
}

} // namespace Detail
} // namespace Time

#endif
