#include "support/AllocationCount.h"

#include <atomic>
#include <cstdlib>
#include <new>

namespace {

std::atomic<std::size_t> made{0};
std::atomic<std::size_t> bytes{0};

} // namespace

void* operator new(std::size_t size) {
    ++made;
    bytes += size;
    if (void* const memory = std::malloc(size))
        return memory;
    throw std::bad_alloc();
}

void operator delete(void* memory) noexcept {
    std::free(memory);
}

void operator delete(void* memory, std::size_t) noexcept {
    std::free(memory);
}

namespace TestSupport {

std::size_t allocationsMade() {
    return made;
}

std::size_t bytesAllocated() {
    return bytes;
}

} // namespace TestSupport
