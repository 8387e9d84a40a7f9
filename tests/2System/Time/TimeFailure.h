/// What a failure of dates and times says, as one value to compare.
///
///     EXPECT_EQ(timeFailureOf([] { readDate("05 03 2021"); }),
///               wrongArgument(L"delimiter", L"0", L"'.' expected"));
#ifndef QORN_TESTS_TIMEFAILURE_H
#define QORN_TESTS_TIMEFAILURE_H

#include "1Base/Error/ErrorSeverity.h"
#include "2System/Time/TimeExc.h"

#include "support/MessageParameters.h"

#include <gtest/gtest.h>

#include <ostream>
#include <string>

namespace TimeTest {

/// The message as it was raised and as it reads once expanded.
struct CTimeFailure {
    Strings::string text;
    TestSupport::TParameters parameters;
    Strings::string expanded;
};

inline bool operator==(CTimeFailure const& left, CTimeFailure const& right) {
    return left.text == right.text && left.parameters == right.parameters &&
           left.expanded == right.expanded;
}

inline std::ostream& operator<<(std::ostream& stream, CTimeFailure const& failure) {
    return stream << testing::PrintToString(failure.text) << ' '
                  << testing::PrintToString(failure.parameters) << ' '
                  << testing::PrintToString(failure.expanded);
}

/// The failure that `call` raises, which every handler of dates and times sees; empty where it
/// raises none.
template <class TCall>
CTimeFailure timeFailureOf(TCall const& call) {
    try {
        call();
        return {};
    } catch (Error::CException const& exc) {
        EXPECT_STREQ(exc.getExcName(), "TimeDateTime");
        EXPECT_NE(dynamic_cast<Time::TExcTimeDate const*>(&exc), nullptr);
        EXPECT_NE(dynamic_cast<Time::TExcTimeTime const*>(&exc), nullptr);
        EXPECT_NE(dynamic_cast<Time::TExcTimeDateTime const*>(&exc), nullptr);
        EXPECT_EQ(dynamic_cast<Time::TExcTimeFormatError const*>(&exc), nullptr);
        EXPECT_EQ(exc.getInfo().getSeverity(), Error::SevError);
        EXPECT_EQ(exc.getStackInfo().begin(), exc.getStackInfo().end());
        std::string const file = exc.getInfo().getOrigin().getFile();
        EXPECT_NE(file.find("2System/Time/"), std::string::npos) << file;
        Error::CMessage const& message = exc.getInfo().getMessage();
        Strings::string const text = message.getString(false);
        TestSupport::TParameters const parameters = TestSupport::parametersOf(message);
        return {text, parameters, message.getString(true)};
    }
}

/// The failure of a value that is refused, with the parameters that follow the usual three.
inline CTimeFailure wrongArgument(Strings::string const& type, Strings::string const& key,
                                  Strings::string const& reason,
                                  TestSupport::TParameters const& more = {}) {
    TestSupport::TParameters parameters = {{"type", type}, {"key", key}, {"reason", reason}};
    parameters.insert(parameters.end(), more.begin(), more.end());
    return {L"Argument @(type) @(key) is wrong: @(reason)", parameters,
            L"Argument " + type + L" " + key + L" is wrong: " + reason};
}

/// The failure of a stream that can't be read: `state` holds badbit 1, eofbit 2, failbit 4.
inline CTimeFailure badStream(Strings::string const& name, int state) {
    Strings::string const reason =
        (state & 2) != 0 ? L"End of input data" : L"Internal error: bad input stream";
    return {L"Could not @(process) @(type) @(key): @(reason)",
            {{"process", L"read"},
             {"type", L"input stream"},
             {"key", name},
             {"reason", reason},
             {"stream_name", name},
             {"is.rdstate()", std::to_wstring(state)}},
            L"Could not read input stream " + name + L": " + reason};
}

} // namespace TimeTest

#endif
