#include "2System/Time/TimeDateTime.h"

#include "2System/Time/_Imp/TimeText.h"
#include "2System/Time/_Imp/TimeZoneText.h"

namespace Time {

std::string CDateTime::getAsPDFdate() const {
    CTimeZone zone;
    getCurrentTimeLocal(zone);
    return getAsPDFdate(zone);
}

std::string CDateTime::getAsPDFdate(CTimeZone const& zone) const {
    return Detail::makeText<char>([this, &zone](auto& text) {
        text.put('D');
        text.put(':');
        text.putNumber(getYear(), 4, ' ');
        for (Config::Int32 const number :
             {Config::Int32(getMonth()), getDay(), getHour(), getMinute(), getSecond()})
            text.putNumber(number, 2, '0');
        if (Detail::putZoneType(text, zone)) {
            Detail::putZoneNumber(text, zone.hours);
            text.put('\'');
            Detail::putZoneNumber(text, zone.minutes);
            text.put('\'');
        }
    });
}

} // namespace Time
