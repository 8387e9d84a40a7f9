/// What the standard forms of dates have in common in how they write a zone.
#ifndef QORN_2SYSTEM_TIMEZONETEXT_H
#define QORN_2SYSTEM_TIMEZONETEXT_H

#include "1Base/Error/ErrorMacros.h"
#include "2System/Time/TimeTime.h"

namespace Time {
namespace Detail {

/// Puts "Z" or the sign. True where the offset has to follow.
template <class TText>
bool putZoneType(TText& text, CTimeZone const& zone) {
    switch (zone.type) {
    case CTimeZone::etzNone:
        return false;
    case CTimeZone::etzUTC:
        text.put('Z');
        return false;
    case CTimeZone::etzMinus:
        text.put('-');
        return true;
    case CTimeZone::etzPlus:
        text.put('+');
        return true;
    }
    ERROR_ASSERT_TEXT(false, "!\"Unknown time zone type\"");
    return false;
}

/// Puts hours or minutes of the offset. The sign stands already, and a local zone behind UTC
/// carries it in these as well.
template <class TText>
void putZoneNumber(TText& text, Config::Int32 number) {
    text.putNumber(number < 0 ? Config::wrapSub(0, number) : number, 2, '0');
}

} // namespace Detail
} // namespace Time

#endif
