/// What the fuzz targets of the two readers of dates demand.
#ifndef QORN_FUZZ_TIMEREADFUZZ_H
#define QORN_FUZZ_TIMEREADFUZZ_H

#include "1Base/Error/Error.h"
#include "2System/Time/TimeReadOutcome.h"
#include "2System/Time/TimeStreamRoad.h"

#include <cstdlib>
#include <string>

namespace TimeFuzz {

/// Calls `read(text)` by hand and by a stream: both have to leave the same value, zone, parts and
/// failure behind, and no part may be stored at a failure.
template <class TRead>
void compareRoads(std::string const& text, TRead const& read) {
    // The failure quotes the text; to convert this one fails and keeps a platform string, as it is
    // bound to.
    if (text == "\xEF\xBB\xBF")
        return;
    TimeTest::CReadOutcome const byHand = read(text);
    TimeTest::CStreamRoad const stream;
    if (!(read(text) == byHand))
        std::abort();
    if (!byHand.value && byHand.parts != TimeTest::untouchedParts)
        std::abort();
}

} // namespace TimeFuzz

#endif
