/// What values are written as, on streams of either width.
///
///     TimeTest::expectText(Time::CTime(8, 5, 9, 0), "08:05:09");
#ifndef QORN_TESTS_TIMEWRITTEN_H
#define QORN_TESTS_TIMEWRITTEN_H

#include <gtest/gtest.h>

#include <sstream>
#include <string>

namespace TimeTest {

/// The text on a stream that `prepare` has set up. It is ASCII.
template <class TCh, class TValue, class TPrepare>
std::string textOf(TValue const& value, TPrepare const& prepare) {
    std::basic_ostringstream<TCh> stream;
    prepare(stream);
    stream << value;
    std::basic_string<TCh> const text = stream.str();
    return std::string(text.begin(), text.end());
}

template <class TValue, class TPrepare>
void expectText(TValue const& value, std::string const& text, TPrepare const& prepare) {
    EXPECT_EQ((textOf<char>(value, prepare)), text);
    EXPECT_EQ((textOf<wchar_t>(value, prepare)), text);
}

template <class TValue>
void expectText(TValue const& value, std::string const& text) {
    expectText(value, text, [](auto&) {});
}

} // namespace TimeTest

#endif
