// Times of day in free notation: the input is the text. What must hold: see TimeFreeText.h. The
// milliseconds are not written.

#include "TimeFreeText.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <string>

namespace {

std::string written(std::array<int, 4> const& fields) {
    return TimeFuzz::written(Time::CTime(fields[0], fields[1], fields[2], fields[3]));
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size);

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    TimeFuzz::checkText<4>(std::string(data, data + size), TimeTest::scanTime,
                           TimeTest::readTimeFields, written, 3);
    return 0;
}
