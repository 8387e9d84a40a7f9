#include "QORNOpenOfficeLibrary/Heap.h"
#include "QORNOpenOfficeLibrary/Recorder.h"

#include <algorithm>
#include <array>
#include <cstdlib>
#include <cstring>
#include <new>
#include <utility>

namespace BridgeTest {
namespace {

struct TBlock {
    void* memory;
    std::size_t size;
};

// The operators can't keep their books on the heap.
std::array<TBlock, 1024> blocks;
std::size_t blockCount = 0;

std::vector<std::wstring> watched;
int pauses = 0;
long allocationsLeft = 0;

bool isWatching() {
    return pauses == 0 && !watched.empty();
}

bool holds(TBlock const& block, std::wstring const& text) {
    std::size_t const bytes = text.size() * sizeof(wchar_t);
    return block.size >= bytes && std::memcmp(block.memory, text.data(), bytes) == 0;
}

void addBlock(void* memory, std::size_t size) {
    if (!isWatching() || size < 128 * sizeof(wchar_t))
        return;
    if (blockCount == blocks.size())
        std::abort();
    blocks[blockCount++] = {memory, size};
}

void removeBlock(void* memory) {
    if (!isWatching())
        return;
    auto* const end = blocks.data() + blockCount;
    auto* const block = std::find_if(blocks.data(), end, [memory](TBlock const& candidate) {
        return candidate.memory == memory;
    });
    if (block == end)
        return;
    CHeapPause const pause;
    for (std::size_t index = 0; index < watched.size(); ++index)
        if (holds(*block, watched[index]))
            CRecorder::get().add("free " + std::to_string(index + 1));
    *block = blocks[--blockCount];
}

bool strikes() {
    return pauses == 0 && allocationsLeft > 0 && --allocationsLeft == 0;
}

} // namespace

CHeapPause::CHeapPause() {
    ++pauses;
}

CHeapPause::~CHeapPause() {
    --pauses;
}

CHeapWatch::CHeapWatch(std::vector<std::wstring> texts) {
    watched = std::move(texts);
}

CHeapWatch::~CHeapWatch() {
    watched.clear();
    blockCount = 0;
}

long CHeapWatch::blocksWith(int number) const {
    std::wstring const& text = watched[static_cast<std::size_t>(number - 1)];
    return std::count_if(blocks.data(), blocks.data() + blockCount,
                         [&text](TBlock const& block) { return holds(block, text); });
}

CAllocationFailure::CAllocationFailure(long countdown) {
    allocationsLeft = countdown;
}

CAllocationFailure::~CAllocationFailure() {
    allocationsLeft = 0;
}

bool CAllocationFailure::struck() const {
    return allocationsLeft == 0;
}

} // namespace BridgeTest

void* operator new(std::size_t size) {
    void* const memory =
        BridgeTest::strikes() ? nullptr : std::malloc(std::max<std::size_t>(size, 1));
    if (memory == nullptr)
        throw std::bad_alloc();
    BridgeTest::addBlock(memory, size);
    return memory;
}

void operator delete(void* memory) noexcept {
    BridgeTest::removeBlock(memory);
    std::free(memory);
}

void operator delete(void* memory, std::size_t) noexcept {
    operator delete(memory);
}
