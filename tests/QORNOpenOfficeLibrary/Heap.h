/// Watches the operators new and delete of the test program, and lets one allocation fail.
#ifndef QORN_TESTS_QORNOPENOFFICELIBRARY_HEAP_H
#define QORN_TESTS_QORNOPENOFFICELIBRARY_HEAP_H

#include <string>
#include <vector>

namespace BridgeTest {

/// While one lives, the test's own work is neither watched nor made to fail.
class CHeapPause {
  public:
    CHeapPause();
    ~CHeapPause();
    CHeapPause(CHeapPause const&) = delete;
    CHeapPause& operator=(CHeapPause const&) = delete;
};

/// Finds the blocks that hold given wide texts. While it lives, giving back such a block appends
/// "free" and the text's number, from 1, to the recorded calls. One at a time.
class CHeapWatch {
  public:
    /// The texts must be longer than any block that is too small to be watched: 128 elements.
    explicit CHeapWatch(std::vector<std::wstring> texts);
    ~CHeapWatch();
    CHeapWatch(CHeapWatch const&) = delete;
    CHeapWatch& operator=(CHeapWatch const&) = delete;

    /// The number of live blocks that begin with the text.
    long blocksWith(int number) const;
};

/// Makes the `countdown`-th allocation from now on raise std::bad_alloc. One at a time.
class CAllocationFailure {
  public:
    explicit CAllocationFailure(long countdown);
    ~CAllocationFailure();
    CAllocationFailure(CAllocationFailure const&) = delete;
    CAllocationFailure& operator=(CAllocationFailure const&) = delete;

    /// Whether it came to that.
    bool struck() const;
};

} // namespace BridgeTest

#endif
