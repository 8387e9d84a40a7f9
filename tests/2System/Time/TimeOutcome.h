/// What a call on date-times ends in, as one text to compare.
///
///     TimeTest::outcomeOf([] { return Time::CDateTime::getCurrentTimeUTC(); });
///     // "2021-3-5 8:5:9.0"
///     TimeTest::outcomeOf([] { return read("D2021"); });
///     // "TimeDateTime: Argument @(type) @(key) is wrong: @(reason)|type=PDF date|key=D2021|..."
#ifndef QORN_TESTS_TIMEOUTCOME_H
#define QORN_TESTS_TIMEOUTCOME_H

#include "1Base/Encoding/EncodingConverter.h"
#include "1Base/Error/ErrorExc.h"
#include "2System/Time/Time.h"
#include "support/MessageParameters.h"

#include <string>

namespace TimeTest {

inline std::string narrow(Strings::string const& text) {
    return Encoding::convert<std::string>(text);
}

inline std::string show(Strings::string const& text) {
    return narrow(text);
}

inline std::string show(std::string const& text) {
    return text;
}

inline std::string show(Time::CTimeZone const& zone) {
    return std::to_string(zone.type) + " " + std::to_string(zone.hours) + ":" +
           std::to_string(zone.minutes);
}

inline std::string show(Time::CDateTime const& value) {
    return std::to_string(value.getYear()) + "-" + std::to_string(value.getMonth()) + "-" +
           std::to_string(value.getDay()) + " " + std::to_string(value.getHour()) + ":" +
           std::to_string(value.getMinute()) + ":" + std::to_string(value.getSecond()) + "." +
           std::to_string(value.getMilliSecond());
}

/// The tag, the catalogue's text and the parameters in their order.
inline std::string show(Error::CException const& exc) {
    Error::CMessage const& message = exc.getInfo().getMessage();
    std::string text = std::string(exc.getExcName()) + ": " + narrow(message.getString(false));
    for (auto const& [name, value] : TestSupport::parametersOf(message))
        text += "|" + name + "=" + narrow(value);
    return text;
}

template <class TCall>
std::string outcomeOf(TCall const& call) {
    try {
        return show(call());
    } catch (Error::CException const& exc) {
        return show(exc);
    }
}

/// The rest of a failure's text behind its tag.
inline std::string wrongArgument(std::string const& type, std::string const& key,
                                 std::string const& reason) {
    return "Argument @(type) @(key) is wrong: @(reason)|type=" + type + "|key=" + key +
           "|reason=" + reason;
}

/// The failures of a month and of a date ("2021/2/30") that are none.
inline std::string badMonth(std::string const& month) {
    return "TimeDateTime: " + wrongArgument("month", month, "Invalid month");
}

inline std::string badDate(std::string const& date) {
    return "TimeDateTime: " + wrongArgument("Date", date, "Invalid date");
}

} // namespace TimeTest

#endif
