#include "3Util/Encrypt/EncryptByteSplit.h"

#include "1Base/Error/ErrorMacros.h"

#include <boost/endian/conversion.hpp>

#include <cstdint>

namespace Encrypt {
namespace {

constexpr unsigned int bitsPerByte = 8;
constexpr std::size_t bytesPerWord = sizeof(std::uint64_t);

// What is read next and what is written next.
struct CPlace {
    unsigned char const* source;
    unsigned char* target;
};

// Repacks units of `from` bits up to `end` into units of `to` bits, the last of them filled up with
// zero bits.
void repackUnits(CPlace place, unsigned char const* end, std::size_t from, std::size_t to) {
    std::uint32_t const fromMask = (1U << from) - 1;
    std::uint32_t const toMask = (1U << to) - 1;
    std::uint32_t bits = 0;
    std::size_t count = 0;
    for (; place.source != end; ++place.source) {
        bits = bits << from | (*place.source & fromMask);
        count += from;
        while (count >= to) {
            count -= to;
            *place.target++ = static_cast<unsigned char>(bits >> count & toMask);
        }
    }
    if (count != 0)
        *place.target = static_cast<unsigned char>(bits << (to - count) & toMask);
}

// Eight groups make as many bytes as a group has bits, so that a word holds them in both forms: as
// one string of bits, and with a group in each byte. Three steps carry them over, all at once.
// A step parts the fields that lie side by side in each pair of lanes, a field at the low end of
// each lane, or joins them: the halves of the string first, then the quarters, then the groups.
template <unsigned int bits, unsigned int lane>
struct CStep {
    static constexpr unsigned int field = bits * lane / bitsPerByte;
    static constexpr unsigned int gap = lane - field;
    // The lower field of each pair of lanes, and the upper one.
    static constexpr std::uint64_t pairs =
        ~std::uint64_t(0) / (~std::uint64_t(0) >> (64 - 2 * lane));
    static constexpr std::uint64_t lower = pairs * ((std::uint64_t(1) << field) - 1);
    static constexpr std::uint64_t upper = lower << lane;

    static std::uint64_t part(std::uint64_t word) {
        // Where a field moves clear of both, one mask does.
        if constexpr (gap >= field)
            return (word | word << gap) & (lower | upper);
        else
            return (word & lower) | (word << gap & upper);
    }

    static std::uint64_t join(std::uint64_t word) { return (word & lower) | (word & upper) >> gap; }
};

// The bytes of a block stand at the upper end of a word, above these bits.
constexpr unsigned int freeBits(unsigned int bits) {
    return 64 - bits * bitsPerByte;
}

template <unsigned int bits>
struct CSplitBlock {
    static constexpr std::size_t sourceBytes = bits;
    static constexpr std::size_t targetBytes = bytesPerWord;

    static std::uint64_t repack(std::uint64_t word) {
        word >>= freeBits(bits);
        return CStep<bits, 8>::part(CStep<bits, 16>::part(CStep<bits, 32>::part(word)));
    }
};

// For single bits there is a shorter way: each byte of the word gets a copy of them and keeps one.
template <>
std::uint64_t CSplitBlock<1>::repack(std::uint64_t word) {
    std::uint64_t const everyByte = 0x0101010101010101;
    std::uint64_t const kept = (word >> freeBits(1)) * everyByte & 0x8040201008040201;
    // Wherever the kept bit is set, the addition carries it into the highest.
    return (kept + 0x7F * everyByte) >> 7 & everyByte;
}

template <unsigned int bits>
struct CMergeBlock {
    static constexpr std::size_t sourceBytes = bytesPerWord;
    static constexpr std::size_t targetBytes = bits;

    static std::uint64_t repack(std::uint64_t word) {
        word = CStep<bits, 32>::join(CStep<bits, 16>::join(CStep<bits, 8>::join(word)));
        return word << freeBits(bits);
    }
};

template <class TBlock>
CPlace repackBlocks(CPlace place, std::size_t blocks) {
    for (; blocks != 0; --blocks) {
        std::uint64_t const word = boost::endian::load_big_u64(place.source);
        boost::endian::store_big_u64(place.target, TBlock::repack(word));
        place.source += TBlock::sourceBytes;
        place.target += TBlock::targetBytes;
    }
    return place;
}

// Repacks as many blocks as `bytes` bytes hold, on whichever side they are, and tells how far it
// came. The last block still has a whole word of them.
template <template <unsigned int> class TBlock>
CPlace repackBlocks(CPlace place, std::size_t bytes, std::size_t bitsPerGroup) {
    if (bytes < bytesPerWord)
        return place;
    std::size_t const blocks = (bytes - bytesPerWord) / bitsPerGroup + 1;
    switch (bitsPerGroup) {
    case 1:
        return repackBlocks<TBlock<1>>(place, blocks);
    case 2:
        return repackBlocks<TBlock<2>>(place, blocks);
    case 3:
        return repackBlocks<TBlock<3>>(place, blocks);
    case 4:
        return repackBlocks<TBlock<4>>(place, blocks);
    case 5:
        return repackBlocks<TBlock<5>>(place, blocks);
    case 6:
        return repackBlocks<TBlock<6>>(place, blocks);
    case 7:
        return repackBlocks<TBlock<7>>(place, blocks);
    default:
        return place;
    }
}

// How many units of `bits` bits it takes to hold `total` bits.
std::size_t unitsFor(std::size_t total, std::size_t bits) {
    return (total + bits - 1) / bits;
}

} // namespace

TByteVector splitBytes(TByteVector const& bytes, std::size_t bitsPerGroup) {
    if (bitsPerGroup == bitsPerByte)
        return bytes;
    TByteVector groups(unitsFor(bytes.size() * bitsPerByte, bitsPerGroup));
    CPlace place = {bytes.data(), groups.data()};
    place = repackBlocks<CSplitBlock>(place, bytes.size(), bitsPerGroup);
    repackUnits(place, bytes.data() + bytes.size(), bitsPerByte, bitsPerGroup);
    return groups;
}

TByteVector mergeBytes(TByteVector const& groups, std::size_t bitsPerGroup) {
    std::size_t const total = groups.size() * bitsPerGroup;
    // With as many bits in the last byte as the last group has, or more, that group began there:
    // the byte waits for a further group, and there is none.
    ERROR_ASSERT_TEXT(total % bitsPerByte < bitsPerGroup, "begin != end");
    if (bitsPerGroup == bitsPerByte)
        return groups;
    TByteVector bytes(unitsFor(total, bitsPerByte));
    CPlace place = {groups.data(), bytes.data()};
    place = repackBlocks<CMergeBlock>(place, bytes.size(), bitsPerGroup);
    repackUnits(place, groups.data() + groups.size(), bitsPerGroup, bitsPerByte);
    return bytes;
}

} // namespace Encrypt
