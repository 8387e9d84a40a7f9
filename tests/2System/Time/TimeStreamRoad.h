/// Keeps dates from being written and read by hand.
///
///     TimeTest::CStreamRoad const stream;
///     value.getAsPDFdate(zone);   // the same text, by a stream
#ifndef QORN_TESTS_TIMESTREAMROAD_H
#define QORN_TESTS_TIMESTREAMROAD_H

#include "1Base/StdUtil/StdUtilLocales.h"

#include <locale>

namespace TimeTest {

/// While it lives, the global locale has a facet of its own that does what the classic one does.
class CStreamRoad {
  private:
    StdUtilTest::CGlobalLocale const global_{new std::numpunct<char>};
};

} // namespace TimeTest

#endif
