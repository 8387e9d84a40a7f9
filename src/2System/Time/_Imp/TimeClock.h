/// Where the present moment comes from, replaceable so that a failing clock can be tried.
#ifndef QORN_2SYSTEM_TIMECLOCK_H
#define QORN_2SYSTEM_TIMECLOCK_H

#include <ctime>

namespace Time {
namespace Detail {

/// The three calls behind the queries of the present moment; their meaning is that of the POSIX
/// functions of the same names.
struct CClock {
    std::time_t (*time)(std::time_t*);
    std::tm* (*gmtime)(std::time_t const*, std::tm*);
    std::tm* (*localtime)(std::time_t const*, std::tm*);
};

CClock const& getClock();

/// Puts another clock in place, returning the one before. Not for use while another thread asks
/// for the moment.
CClock setClock(CClock const& clock);

} // namespace Detail
} // namespace Time

#endif
