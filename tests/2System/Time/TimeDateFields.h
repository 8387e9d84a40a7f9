/// Dates by their fields alone, to make any and to compare.
#ifndef QORN_TESTS_TIMEDATEFIELDS_H
#define QORN_TESTS_TIMEDATEFIELDS_H

#include "2System/Time/TimeDate.h"

#include <cstdint>
#include <ctime>
#include <tuple>

namespace TimeTest {

/// Day, month and year.
using TFields = std::tuple<std::int64_t, std::int64_t, std::int64_t>;

inline TFields fieldsOf(Time::CDate const& date) {
    return {date.getDay(), date.getMonth(), date.getYear()};
}

inline Time::CDate::EMonth monthOf(std::int64_t month) {
    return static_cast<Time::CDate::EMonth>(month);
}

/// A date that nothing tests, with any fields: the other zeros of a std::tm wrap.
inline Time::CDate uncheckedDate(std::int64_t day, std::int64_t month, std::int64_t year) {
    std::tm time = {};
    time.tm_mday = static_cast<int>(day);
    time.tm_mon = static_cast<int>(static_cast<std::uint32_t>(month) - 1U);
    time.tm_year = static_cast<int>(static_cast<std::uint32_t>(year) - 1900U);
    return Time::CDate(time);
}

} // namespace TimeTest

#endif
