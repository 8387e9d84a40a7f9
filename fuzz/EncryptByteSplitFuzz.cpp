// Bytes to groups of bits and back, and any groups to bytes.
//
// The first byte chooses the bits of a group, the others are the bytes or the groups. What must
// hold: groups have no bits above theirs and merge into the bytes that they were split from; any
// groups merge, or fail the one assertion where their number says so; merged ones split into
// themselves.

#include "3Util/Encrypt/EncryptByteSplit.h"

#include "1Base/Error/Error.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstdlib>

namespace {

using Encrypt::TByteVector;

void require(bool holds) {
    if (!holds)
        std::abort();
}

// As many bytes or groups as it takes to hold so many bits.
std::size_t unitsFor(std::size_t total, std::size_t bits) {
    return total / bits + (total % bits != 0 ? 1 : 0);
}

bool isMerged(TByteVector const& groups, std::size_t bits, TByteVector& bytes) {
    try {
        bytes = Encrypt::mergeBytes(groups, bits);
        return true;
    } catch (Error::TExcErrorAssert const&) {
        return false;
    }
}

void checkSplitting(TByteVector const& bytes, std::size_t bits) {
    TByteVector const groups = Encrypt::splitBytes(bytes, bits);
    require(groups.size() == unitsFor(bytes.size() * 8, bits));
    for (unsigned char const group : groups)
        require(group >> bits == 0);

    TByteVector expected = bytes;
    expected.resize(unitsFor(groups.size() * bits, 8));
    require(Encrypt::mergeBytes(groups, bits) == expected);
}

void checkMerging(TByteVector groups, std::size_t bits) {
    std::size_t const inLastByte = groups.size() * bits % 8;
    TByteVector bytes;
    bool const merged = isMerged(groups, bits, bytes);
    require(merged == (inLastByte < bits));
    if (!merged)
        return;
    require(bytes.size() == unitsFor(groups.size() * bits, 8));

    for (unsigned char& group : groups)
        group = static_cast<unsigned char>(group & ((1U << bits) - 1));
    TByteVector const again = Encrypt::splitBytes(Encrypt::mergeBytes(groups, bits), bits);
    auto const filling = again.begin() + static_cast<std::ptrdiff_t>(groups.size());
    require(std::equal(again.begin(), filling, groups.begin()));
    require(std::all_of(filling, again.end(), [](unsigned char group) { return group == 0; }));
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size);

extern "C" int LLVMFuzzerTestOneInput(std::uint8_t const* data, std::size_t size) {
    if (size == 0)
        return 0;
    std::size_t const bits = 1 + data[0] % 8;
    TByteVector const bytes(data + 1, data + size);
    checkSplitting(bytes, bits);
    checkMerging(bytes, bits);
    return 0;
}
