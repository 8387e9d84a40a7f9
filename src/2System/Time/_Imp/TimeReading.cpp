#include "2System/Time/_Imp/TimeReading.h"

#include "2System/Time/TimeExc.h"
#include "2System/Time/_Imp/TimeFailures.h"

namespace Time {
namespace Detail {

CDateTime CReading::toDateTime() const {
    if (month < CDate::emJan || month > CDate::emDec)
        ERROR_THROW(TExcTimeDateTime, wrongArgument("month", month, "Invalid month"));
    return CDateTime(day, static_cast<CDate::EMonth>(month), year, hour, minute, second,
                     milliSecond);
}

void moveToLocalZone(CDateTime& dateTime, CTimeZone const& zone) {
    CTimeZone local;
    CDateTime::getCurrentTimeLocal(local);
    Config::Int32 const delta = Config::wrapSub(local.getSeconds(), zone.getSeconds());
    auto const magnitude = static_cast<unsigned int>(delta);
    if (delta > 0)
        dateTime.addSeconds(magnitude);
    else if (delta < 0)
        dateTime.subSeconds(0 - magnitude);
}

void checkNotEmpty(char const* type, std::string const& text) {
    std::string const& s = text;
    if (s.empty())
        ERROR_THROW(TExcTimeDateTime, Error::msgMissingArgument,
                    ERROR_PARAMS(ERROR_PARAM(type), ERROR_PARAM(s)));
}

} // namespace Detail
} // namespace Time
