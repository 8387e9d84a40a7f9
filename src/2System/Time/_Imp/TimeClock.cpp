#include "2System/Time/_Imp/TimeClock.h"

#include <utility>

namespace Time {
namespace Detail {
namespace {

CClock& clockInPlace() {
    static CClock clock = {::time, ::gmtime_r, ::localtime_r};
    return clock;
}

} // namespace

CClock const& getClock() {
    return clockInPlace();
}

CClock setClock(CClock const& clock) {
    return std::exchange(clockInPlace(), clock);
}

} // namespace Detail
} // namespace Time
