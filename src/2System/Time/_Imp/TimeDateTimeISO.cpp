#include "2System/Time/TimeDateTime.h"

#include "2System/Time/_Imp/TimeText.h"
#include "2System/Time/_Imp/TimeZoneText.h"

namespace Time {
namespace {

template <class TText>
void putColumn(TText& text, char before, Config::Int32 number) {
    text.put(before);
    text.putNumber(number, 2, '0');
}

} // namespace

Strings::string CDateTime::getAsISOdate(CTimeZone const& zone) const {
    return Detail::makeText<wchar_t>([this, &zone](auto& text) {
        text.putNumber(getYear(), 4, ' ');
        putColumn(text, '-', getMonth());
        putColumn(text, '-', getDay());
        putColumn(text, 'T', getHour());
        putColumn(text, ':', getMinute());
        putColumn(text, ':', getSecond());
        if (Detail::putZoneType(text, zone)) {
            Detail::putZoneNumber(text, zone.hours);
            text.put(':');
            Detail::putZoneNumber(text, zone.minutes);
        }
    });
}

} // namespace Time
