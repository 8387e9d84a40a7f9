/// What the readers of the standard forms of dates have in common.
#ifndef QORN_2SYSTEM_TIMEREADING_H
#define QORN_2SYSTEM_TIMEREADING_H

#include "2System/Time/TimeDateTime.h"

#include <string>

namespace Time {
namespace Detail {

/// The fields of a text. What it leaves out stays as it is here.
struct CReading {
    Config::Int32 year = 0;
    Config::Int32 month = 1;
    Config::Int32 day = 1;
    Config::Int32 hour = 0;
    Config::Int32 minute = 0;
    Config::Int32 second = 0;
    Config::Int32 milliSecond = 0;
    CDateTime::TParts parts = 0;

    void add(int newParts) { parts = static_cast<CDateTime::TParts>(parts | newParts); }

    /// Raises TExcTimeDateTime where month or date are none.
    CDateTime toDateTime() const;
};

/// Moves a value of the zone by the difference to the local offset of this moment, not of the
/// value's own. An offset behind UTC counts with the sign that CTimeZone::getSeconds() gives it.
void moveToLocalZone(CDateTime& dateTime, CTimeZone const& zone);

/// Raises TExcTimeDateTime where there is no text.
void checkNotEmpty(char const* type, std::string const& text);

inline bool isDigit(char character) {
    return character >= '0' && character <= '9';
}

/// Whether `count` digits stand at `next`, which has a zero or any other non-digit behind the last
/// character.
inline bool areDigits(char const* next, int count) {
    for (char const* const end = next + count; next != end; ++next)
        if (!isDigit(*next))
            return false;
    return true;
}

/// The number in the digits at `next`.
inline Config::Int32 numberIn(char const* next, int count) {
    Config::Int32 number = 0;
    for (char const* const end = next + count; next != end; ++next)
        number = 10 * number + (*next - '0');
    return number;
}

} // namespace Detail
} // namespace Time

#endif
