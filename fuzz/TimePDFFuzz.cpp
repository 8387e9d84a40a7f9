// A PDF date, read by hand and by a stream.
//
// The first byte chooses whether the value is moved, the others are the text.

#include "TimeReadFuzz.h"

#include <cstddef>
#include <cstdint>
#include <string>

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size);

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    if (size == 0)
        return 0;
    bool const toLocal = (data[0] & 1) != 0;
    TimeFuzz::compareRoads(std::string(data + 1, data + size), [=](std::string const& text) {
        return TimeTest::readPDF(text, toLocal);
    });
    return 0;
}
