#include "0Platform/CoreFoundation/_Imp/CFObject.h"

#include <cstdlib>

using CFPlatform::Object;

CFAllocatorRef const kCFAllocatorDefault = nullptr;
double kCFCoreFoundationVersionNumber = 1674.102;

namespace {

// An object is born mutable: constness belongs to the reference, the count to the object.
Object& objectOf(CFTypeRef reference) {
    if (reference == nullptr)
        std::abort();
    return *static_cast<Object*>(const_cast<void*>(reference));
}

} // namespace

extern "C" CFTypeRef CFRetain(CFTypeRef object) {
    objectOf(object).references.fetch_add(1, std::memory_order_relaxed);
    return object;
}

extern "C" void CFRelease(CFTypeRef object) {
    Object& shared = objectOf(object);
    // A sole owner needs no locked instruction: nobody else can reach the count.
    if (shared.references.load(std::memory_order_acquire) != 1 &&
        shared.references.fetch_sub(1, std::memory_order_acq_rel) != 1)
        return;
    shared.finalize(shared);
    CFObjectFree_(&shared);
}

extern "C" CFIndex CFGetRetainCount(CFTypeRef object) {
    return objectOf(object).references.load(std::memory_order_relaxed);
}
