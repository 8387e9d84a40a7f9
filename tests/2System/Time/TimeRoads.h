/// Sends dates by the two roads that they may take: by hand, or by a stream.
#ifndef QORN_TESTS_TIMEROADS_H
#define QORN_TESTS_TIMEROADS_H

#include "1Base/StdUtil/StdUtilLocales.h"

#include <gtest/gtest.h>

#include <locale>

namespace TimeTest {

/// While it lives, the global locale has a facet of its own that does what the classic one does:
/// the stream's texts are the same, but nothing goes by hand.
class CStreamRoad {
  private:
    StdUtilTest::CGlobalLocale const global_{new std::numpunct<char>};
};

/// Runs `check` on both roads.
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
