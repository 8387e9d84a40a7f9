#include "support/ObjectCount.h"

#include <atomic>
#include <cstddef>

namespace {

std::atomic<long> live{0};
std::atomic<long> made{0};

} // namespace

extern "C" {
void* __real_CFObjectAllocate_(std::size_t bytes);
void __real_CFObjectFree_(void* object);

void* __wrap_CFObjectAllocate_(std::size_t bytes) {
    void* const object = __real_CFObjectAllocate_(bytes);
    if (object != nullptr) {
        ++live;
        ++made;
    }
    return object;
}

void __wrap_CFObjectFree_(void* object) {
    --live;
    __real_CFObjectFree_(object);
}
}

namespace TestSupport {

long liveObjects() {
    return live;
}

long objectsMade() {
    return made;
}

} // namespace TestSupport
