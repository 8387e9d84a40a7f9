// An ISO date, read by hand and by a stream.
//
// The first byte chooses the separator and whether the value is moved, the others are the text.

#include "TimeReadFuzz.h"

#include <cstddef>
#include <cstdint>
#include <string>

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size);

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    if (size == 0)
        return 0;
    constexpr char separators[] = {'T', ' ', '-', '\0'};
    char const separator = separators[data[0] % 4];
    bool const toLocal = (data[0] & 4) != 0;
    TimeFuzz::compareRoads(std::string(data + 1, data + size), [=](std::string const& text) {
        return TimeTest::readISO(text, toLocal, separator);
    });
    return 0;
}
