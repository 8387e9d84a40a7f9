/// The test of a date against a calendar that tells by its exceptions.
#ifndef QORN_2SYSTEM_TIMEDATEVALID_H
#define QORN_2SYSTEM_TIMEDATEVALID_H

#include "2System/Time/TimeDate.h"

#include <stdexcept>

namespace Time {
namespace Detail {

/// The part of a field that the calendar sees.
inline constexpr unsigned short low16(Config::Int32 value) {
    return static_cast<unsigned short>(value);
}

/// Whether the C library keeps the date as it is. A month outside the list fails an assertion.
bool isKeptByMktime(CDate::TDay day, CDate::EMonth month, CDate::TYear year);

/// Whether `makeDate`, called with the low 16 bits of year, month and day, returns. A
/// std::out_of_range says that they are no date; any other exception leaves it to mktime.
template <class TMakeDate>
bool isMadeBy(TMakeDate const& makeDate, CDate::TDay day, CDate::EMonth month, CDate::TYear year) {
    try {
        makeDate(low16(year), low16(month), low16(day));
        return true;
    } catch (std::out_of_range const&) {
        return false;
    } catch (...) {
        return isKeptByMktime(day, month, year);
    }
}

} // namespace Detail
} // namespace Time

#endif
