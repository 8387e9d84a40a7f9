// Made before every static object of the libraries, and so destroyed behind them all.

#include "1Base/Error/StaticObjects/StaticObjects.h"

namespace {

// Touches nothing when it is made: what others make at first use is made behind it, and would be
// gone by now if it were ever destroyed.
class CLast {
  public:
    ~CLast() { StaticObjects::CUser const last("last"); }
};

__attribute__((init_priority(101))) CLast const last;
__attribute__((init_priority(101))) StaticObjects::CUser const early("early");

} // namespace
