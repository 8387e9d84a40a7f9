/// Everything that a reader of dates leaves behind.
///
///     TimeTest::CReadOutcome const read = TimeTest::readPDF("D:2021Z", false);
///     show(read);   // "2021-1-1 0:0:0.0 | 0 0:0 | 0x00BF"
#ifndef QORN_TESTS_TIMEREADOUTCOME_H
#define QORN_TESTS_TIMEREADOUTCOME_H

#include "2System/Time/TimeDateTime.h"
#include "2System/Time/TimeOutcome.h"

#include <iomanip>
#include <optional>
#include <ostream>
#include <sstream>
#include <string>
#include <tuple>

namespace TimeTest {

/// What a reader that fails must leave in the place of the parts.
inline constexpr Time::CDateTime::TParts untouchedParts = 0x5555;

struct CReadOutcome {
    std::optional<Time::CDateTime> value; // nothing where the reader raised
    std::string failure;
    Time::CTimeZone zone{Time::CTimeZone::etzPlus, 7, 7};
    Time::CDateTime::TParts parts = untouchedParts;
};

template <class TReader>
CReadOutcome readOutcomeOf(TReader const& reader) {
    CReadOutcome read;
    try {
        read.value = reader(read.zone, &read.parts);
    } catch (Error::CException const& exc) {
        read.failure = show(exc);
    }
    return read;
}

inline CReadOutcome readISO(std::string const& text, bool toLocal, char separator = 'T') {
    return readOutcomeOf([&](Time::CTimeZone& zone, Time::CDateTime::TParts* parts) {
        return Time::CDateTime::readDateTimeFromISO(text, zone, toLocal, separator, parts);
    });
}

inline CReadOutcome readPDF(std::string const& text, bool toLocal) {
    return readOutcomeOf([&](Time::CTimeZone& zone, Time::CDateTime::TParts* parts) {
        return Time::CDateTime::readDateTimeFromPDF(text, zone, toLocal, parts);
    });
}

inline auto fieldsOf(Time::CTimeZone const& zone) {
    return std::make_tuple(zone.type, zone.hours, zone.minutes);
}

inline auto fieldsOf(Time::CDateTime const& value) {
    return std::make_tuple(value.getYear(), value.getMonth(), value.getDay(), value.getHour(),
                           value.getMinute(), value.getSecond(), value.getMilliSecond());
}

inline bool operator==(CReadOutcome const& left, CReadOutcome const& right) {
    bool const isSameValue = left.value && right.value
                                 ? fieldsOf(*left.value) == fieldsOf(*right.value)
                                 : !left.value && !right.value;
    return isSameValue && left.failure == right.failure && left.parts == right.parts &&
           fieldsOf(left.zone) == fieldsOf(right.zone);
}

/// The value, the zone and the parts, or the failure.
inline std::string show(CReadOutcome const& read) {
    if (!read.value)
        return read.failure;
    std::ostringstream shown;
    shown << show(*read.value) << " | " << show(read.zone) << " | 0x" << std::hex << std::uppercase
          << std::setw(4) << std::setfill('0') << read.parts;
    return shown.str();
}

/// The value's part of such a text.
inline std::string valueIn(std::string const& shown) {
    return shown.substr(0, shown.find(" |"));
}

inline std::ostream& operator<<(std::ostream& stream, CReadOutcome const& read) {
    return stream << show(read) << " (" << show(read.zone) << ", " << read.parts << ")";
}

} // namespace TimeTest

#endif
