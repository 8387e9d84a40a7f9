// An ISO date, read by hand and by a stream.
//
// The first byte chooses the separator and whether the value is moved, the others are the text.
// What must hold: both roads leave the same value, zone, parts and failure behind, and no part is
// stored at a failure.

#include "1Base/Error/Error.h"
#include "2System/Time/TimeReadOutcome.h"
#include "2System/Time/TimeStreamRoad.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string>

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size);

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    if (size == 0)
        return 0;
    constexpr char separators[] = {'T', ' ', '-', '\0'};
    char const separator = separators[data[0] % 4];
    bool const toLocal = (data[0] & 4) != 0;
    std::string const text(data + 1, data + size);

    TimeTest::CReadOutcome const byHand = TimeTest::readISO(text, toLocal, separator);
    TimeTest::CStreamRoad const stream;
    if (!(TimeTest::readISO(text, toLocal, separator) == byHand))
        std::abort();
    if (!byHand.value && byHand.parts != TimeTest::untouchedParts)
        std::abort();
    return 0;
}
