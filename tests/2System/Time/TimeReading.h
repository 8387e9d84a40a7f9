/// What reading from a text ends in: what was read, or the failure, and how it leaves the stream.
#ifndef QORN_TESTS_TIMEREADING_H
#define QORN_TESTS_TIMEREADING_H

#include "2System/Time/TimeFailure.h"

#include <gtest/gtest.h>

#include <array>
#include <ios>
#include <iterator>
#include <optional>
#include <ostream>
#include <sstream>
#include <string>

namespace TimeTest {

/// Fields as the test names them; none after a failure. The rest is ASCII.
template <std::size_t count>
struct CReading {
    std::optional<std::array<int, count>> fields;
    CTimeFailure failure;
    int state;
    std::string rest;
};

template <std::size_t count>
bool operator==(CReading<count> const& left, CReading<count> const& right) {
    return left.fields == right.fields && left.failure == right.failure &&
           left.state == right.state && left.rest == right.rest;
}

template <std::size_t count>
std::ostream& operator<<(std::ostream& stream, CReading<count> const& reading) {
    return stream << testing::PrintToString(reading.fields) << ' ' << reading.failure << ' '
                  << reading.state << ' ' << testing::PrintToString(reading.rest);
}

/// Reads from `text`, ASCII as well, by `read`, which returns an array of fields.
template <class TCh, class TRead>
auto readingOf(std::string const& text, TRead const& read) {
    std::basic_istringstream<TCh> stream(std::basic_string<TCh>(text.begin(), text.end()));
    using TArray = decltype(read(stream));
    CReading<std::tuple_size_v<TArray>> reading = {};
    reading.failure = timeFailureOf([&] { reading.fields = read(stream); });
    reading.state = static_cast<int>(stream.rdstate());
    stream.clear();
    for (std::istreambuf_iterator<TCh> next(stream), end; next != end; ++next)
        reading.rest += static_cast<char>(*next);
    return reading;
}

/// The same from streams of both widths, which must not differ.
template <class TRead>
auto readingOfBoth(std::string const& text, TRead const& read) {
    auto const narrow = readingOf<char>(text, read);
    EXPECT_EQ(narrow, readingOf<wchar_t>(text, read)) << text;
    return narrow;
}

} // namespace TimeTest

#endif
