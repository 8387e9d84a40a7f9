/// The string object. An immutable string and its units are one allocation; a mutable one points
/// to units of its own that may grow.
#ifndef QORN_0PLATFORM_CFSTRINGOBJECT_H
#define QORN_0PLATFORM_CFSTRINGOBJECT_H

#include "0Platform/CoreFoundation/_Imp/CFObject.h"

#include <CoreFoundation/CFString.h>

struct __CFString : CFPlatform::Object {
    constexpr __CFString(TFinalize finalizer, UniChar* storage, CFIndex count, CFIndex owners = 1)
        : Object(finalizer, owners), units(storage), length(count) {}

    UniChar* units;
    CFIndex length;
};

namespace CFPlatform {

/// An immutable string with room for `capacity` units and the length 0; null without memory.
__CFString* createString(CFIndex capacity);

/// Gives a mutable string `count` new units that `units`, from malloc, holds; ownership passes.
void replaceUnits(__CFString& string, UniChar* units, CFIndex count);

/// Room for `count` units from malloc; ends the process without memory, since the operations that
/// change a string have no way to report it.
UniChar* allocateUnits(CFIndex count);

} // namespace CFPlatform

#endif
