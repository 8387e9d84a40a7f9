/// Runs a check by the two roads that dates may take: by hand, and by a stream.
///
///     TimeTest::onBothRoads([&] { EXPECT_EQ(value.getAsPDFdate(zone), text); });
#ifndef QORN_TESTS_TIMEROADS_H
#define QORN_TESTS_TIMEROADS_H

#include "2System/Time/TimeStreamRoad.h"

#include <gtest/gtest.h>

namespace TimeTest {

template <class TCheck>
void onBothRoads(TCheck const& check) {
    {
        SCOPED_TRACE("by hand");
        check();
    }
    CStreamRoad const stream;
    SCOPED_TRACE("by a stream");
    check();
}

} // namespace TimeTest

#endif
