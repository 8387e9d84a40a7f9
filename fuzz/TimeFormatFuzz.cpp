// A pattern for date-times, filled in by hand and by a stream.
//
// The first four bytes choose the fields of the value, the others are the pattern, a byte a
// character. What must hold: both roads give the same text or failure, and a text has no fewer
// characters than the pattern.

#include "1Base/Error/Error.h"
#include "2System/Time/TimeOutcome.h"
#include "2System/Time/TimeStreamRoad.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <ctime>
#include <string>

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size);

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    if (size < 4)
        return 0;
    // Of one to three digits, with a sign or without.
    auto const field = [data](int index) { return static_cast<std::int8_t>(data[index]); };
    std::tm time = {};
    time.tm_mday = field(0);
    time.tm_year = 8 * field(1);
    time.tm_mon = field(2);
    Time::CTime const day(field(3), field(0), field(1), 8 * field(2));
    Time::CDateTime const value(day, Time::CDate(time));

    std::wstring const pattern(data + 4, data + size);
    auto const outcome = [&] { return TimeTest::outcomeOf([&] { return value.format(pattern); }); };
    std::string const byHand = outcome();
    TimeTest::CStreamRoad const stream;
    if (outcome() != byHand || byHand.size() < pattern.size())
        std::abort();
    return 0;
}
