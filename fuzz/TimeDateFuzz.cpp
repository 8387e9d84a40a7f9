// Dates in free notation: the input is the text. What must hold: see TimeFreeText.h.

#include "TimeFreeText.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <string>

namespace {

std::string written(std::array<int, 3> const& fields) {
    return TimeFuzz::written(
        Time::CDate(fields[0], static_cast<Time::CDate::EMonth>(fields[1]), fields[2]));
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size);

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    TimeFuzz::checkText<3>(std::string(data, data + size), TimeTest::scanDate,
                           TimeTest::readDateFields, written, 3);
    return 0;
}
