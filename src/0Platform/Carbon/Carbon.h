/// The part of Carbon's C interface that this project calls, for systems that do not bring the
/// framework along.
#ifndef QORN_0PLATFORM_CARBON_H
#define QORN_0PLATFORM_CARBON_H

#include <cstdint>

extern "C" {

/// A moment in fields, by its year as written and its month from 1.
struct DateTimeRec {
    std::int16_t year;
    std::int16_t month;
    std::int16_t day;
    std::int16_t hour;
    std::int16_t minute;
    std::int16_t second;
    std::int16_t dayOfWeek;
};
typedef struct DateTimeRec DateTimeRec;

/// One bit a key code: code k is bit k mod 8 of byte k / 8.
typedef struct {
    std::uint32_t bigEndianValue;
} BigEndianUInt32;
typedef BigEndianUInt32 KeyMap[4];

/// Fills the map with the keys held down at this moment. Nothing is down where there is no display
/// to ask.
void GetKeys(KeyMap theKeys);
}

#endif
