#include "0Platform/CoreFoundation/_Imp/CFObject.h"

#include <cstdlib>

extern "C" void* CFObjectAllocate_(std::size_t bytes) {
    return std::malloc(bytes);
}

extern "C" void CFObjectFree_(void* object) {
    std::free(object);
}
