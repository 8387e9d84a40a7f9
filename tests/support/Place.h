/// Places in the sources as plain values, to compare.
#ifndef QORN_TESTS_PLACE_H
#define QORN_TESTS_PLACE_H

#include "1Base/Error/ErrorInfo.h"

#include <string>
#include <tuple>

namespace TestSupport {

/// File, line, signature, build date and build time.
using TPlace = std::tuple<std::string, unsigned int, std::string, std::string, std::string>;

inline TPlace placeOf(Error::COrigin const& origin) {
    return {origin.getFile(), origin.getLine(), origin.getFunc(), origin.getDate(),
            origin.getTime()};
}

} // namespace TestSupport

#endif
