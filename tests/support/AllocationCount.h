/// Counts what a test program allocates.
///
/// The program adds support/AllocationCount.cpp to its sources, which puts counting versions in the
/// place of the global operators new and delete.
#ifndef QORN_TESTS_ALLOCATIONCOUNT_H
#define QORN_TESTS_ALLOCATIONCOUNT_H

#include <cstddef>

namespace TestSupport {

/// The number of allocations since the program's start, and their size.
std::size_t allocationsMade();
std::size_t bytesAllocated();

} // namespace TestSupport

#endif
