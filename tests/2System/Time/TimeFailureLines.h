/// The lines that failures name: each step of a reader has its own.
///
///     TimeTest::expectLinesInOrder({"x", "2021x", "2021-x"}, readISO);
#ifndef QORN_TESTS_TIMEFAILURELINES_H
#define QORN_TESTS_TIMEFAILURELINES_H

#include "2System/Time/TimeExc.h"

#include <gtest/gtest.h>

#include <initializer_list>
#include <string>

namespace TimeTest {

/// The line that the failure of `call` names; 0 where it does not fail.
template <class TCall>
unsigned int failureLineOf(TCall const& call) {
    try {
        call();
    } catch (Time::TExcTimeDateTime const& exc) {
        return exc.getInfo().getOrigin().getLine();
    }
    return 0;
}

/// Reads texts that fail each a step later than the one before.
template <class TRead>
void expectLinesInOrder(std::initializer_list<std::string> texts, TRead const& read) {
    unsigned int before = 0;
    for (std::string const& text : texts) {
        unsigned int const line = failureLineOf([&] { read(text); });
        EXPECT_GT(line, before) << testing::PrintToString(text);
        before = line;
    }
}

} // namespace TimeTest

#endif
