/// What every object of this platform begins with, and where its memory comes from.
#ifndef QORN_0PLATFORM_CFOBJECT_H
#define QORN_0PLATFORM_CFOBJECT_H

#include <CoreFoundation/CFBase.h>

#include <atomic>
#include <cstddef>
#include <limits>

extern "C" {
/// The only two functions that take and give back an object's memory, in a unit of their own:
/// tests put counting versions in their place at link time and so see each object that is left.
void* CFObjectAllocate_(std::size_t bytes);
void CFObjectFree_(void* object);
}

namespace CFPlatform {

/// The head of an object. `finalize` frees what the object owns besides its own memory.
struct Object {
    using TFinalize = void (*)(Object& object);

    constexpr explicit Object(TFinalize finalizer, CFIndex owners = 1) noexcept
        : references(owners), finalize(finalizer) {}

    std::atomic<CFIndex> references;
    TFinalize finalize;
};

/// The owners of a constant: so many that no release is the last one.
constexpr CFIndex constantOwners = std::numeric_limits<CFIndex>::max() / 2;

} // namespace CFPlatform

#endif
