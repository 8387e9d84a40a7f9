/// How far two texts are equal unit by unit. Nearly all of a comparison's time goes into stretches
/// that differ in nothing, or in the case or accent of single letters; these are stepped over here
/// in blocks and by table, without folding a character.
#ifndef QORN_0PLATFORM_CFSTRINGEQUALUNITS_H
#define QORN_0PLATFORM_CFSTRINGEQUALUNITS_H

#include "0Platform/CoreFoundation/_Imp/CFStringCluster.h"

namespace CFPlatform {

/// A number of leading units that are equal or fold to the same single unit. Stops at a digit in
/// the natural comparison, and, being quick rather than exact, may stop before the first unit that
/// differs.
CFIndex countEqualUnits(UnitSpan const& first, UnitSpan const& second, Folding folding) noexcept;

} // namespace CFPlatform

#endif
