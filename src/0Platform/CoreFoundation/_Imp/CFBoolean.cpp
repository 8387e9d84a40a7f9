#include "0Platform/CoreFoundation/_Imp/CFObject.h"

#include <CoreFoundation/CFNumber.h>

using namespace CFPlatform;

struct __CFBoolean : Object {
    explicit constexpr __CFBoolean(Boolean truth) : Object(nullptr, constantOwners), value(truth) {}

    Boolean value;
};

namespace {

__CFBoolean trueObject(1);
__CFBoolean falseObject(0);

} // namespace

CFBooleanRef const kCFBooleanTrue = &trueObject;
CFBooleanRef const kCFBooleanFalse = &falseObject;

extern "C" Boolean CFBooleanGetValue(CFBooleanRef boolean) {
    return boolean->value;
}
