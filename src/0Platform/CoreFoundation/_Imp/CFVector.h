/// Blocks of like characters, for the fast roads of the codecs: vectors of the compiler (GCC and
/// Clang spell them alike), which become one register wherever registers have 128 bits, and plain
/// code elsewhere. Lane 0 is the one that stands first in memory.
///
/// A road works on a block as if all of it were of its kind, stores it, and only then finds out
/// how many lanes from the front really were; what it stored beyond them is written over next.
#ifndef QORN_0PLATFORM_CFVECTOR_H
#define QORN_0PLATFORM_CFVECTOR_H

#include <CoreFoundation/CFBase.h>

#include <cstdint>
#include <cstring>

namespace CFPlatform {

static_assert(__BYTE_ORDER__ == __ORDER_LITTLE_ENDIAN__, "lanes are also told apart by shifting");

typedef UInt8 Bytes8 __attribute__((vector_size(8)));
typedef UInt16 Units4 __attribute__((vector_size(8)));
typedef UInt16 Units8 __attribute__((vector_size(16)));
typedef UInt32 Words4 __attribute__((vector_size(16)));

/// A value from memory of any alignment.
template <class TValue>
inline TValue load(void const* memory) {
    TValue value;
    std::memcpy(&value, memory, sizeof(value));
    return value;
}

template <class TValue>
inline void store(void* memory, TValue const& value) {
    std::memcpy(memory, &value, sizeof(value));
}

/// Eight bytes as units, four units as words, and the other way round: the half of each of eight
/// words that makes a unit, and the half that does not.
inline Units8 widen(std::uint64_t bytes) {
    return __builtin_convertvector(load<Bytes8>(&bytes), Units8);
}

inline Words4 widenFront(Units8 units) {
    Units8 const words = __builtin_shufflevector(units, Units8{}, 0, 8, 1, 9, 2, 10, 3, 11);
    return reinterpret_cast<Words4>(words);
}

inline Words4 widenBack(Units8 units) {
    Units8 const words = __builtin_shufflevector(units, Units8{}, 4, 12, 5, 13, 6, 14, 7, 15);
    return reinterpret_cast<Words4>(words);
}

inline Units8 lowHalves(Words4 front, Words4 back) {
    return __builtin_shufflevector(reinterpret_cast<Units8>(front), reinterpret_cast<Units8>(back),
                                   0, 2, 4, 6, 8, 10, 12, 14);
}

inline Units8 highHalves(Words4 front, Words4 back) {
    return __builtin_shufflevector(reinterpret_cast<Units8>(front), reinterpret_cast<Units8>(back),
                                   1, 3, 5, 7, 9, 11, 13, 15);
}

/// Marks, all ones, in the lanes that are not zero and that are.
inline Units8 nonZero(Units8 block) {
    return reinterpret_cast<Units8>(block != 0);
}

inline Units8 zero(Units8 block) {
    return reinterpret_cast<Units8>(block == 0);
}

inline Words4 nonZero(Words4 block) {
    return reinterpret_cast<Words4>(block != 0);
}

/// Marks where a unit is half of a surrogate pair, the front half, the back half.
inline Units8 surrogates(Units8 units) {
    return zero((units & 0xF800) ^ 0xD800);
}

inline Units8 highSurrogates(Units8 units) {
    return zero((units & 0xFC00) ^ 0xD800);
}

inline Units8 lowSurrogates(Units8 units) {
    return zero((units & 0xFC00) ^ 0xDC00);
}

/// One byte for each lane, with its top bit set where the lane is not zero.
inline std::uint64_t topBits(Units8 block) {
    auto const marks = __builtin_convertvector(nonZero(block), Bytes8);
    return load<std::uint64_t>(&marks) & 0x8080808080808080U;
}

/// How many of eight bytes stand in front of the first one whose top bit is set.
inline CFIndex clearBytes(std::uint64_t tops) {
    return tops == 0 ? 8 : __builtin_ctzll(tops) / 8;
}

/// How many lanes stand in front of the first one that is not zero.
inline CFIndex clearLanes(Units8 block) {
    return clearBytes(topBits(block));
}

inline CFIndex clearLanes(Words4 block) {
    auto const marks = __builtin_convertvector(nonZero(block), Units4);
    return clearBytes(load<std::uint64_t>(&marks)) / 2;
}

/// The sum of all lanes, which must not be above FFFF.
inline CFIndex sumOf(Units8 block) {
    auto const front = load<std::uint64_t>(&block);
    auto const back = load<std::uint64_t>(reinterpret_cast<char const*>(&block) + 8);
    // The product's highest lane is the sum of all four.
    return static_cast<CFIndex>((front + back) * 0x0001000100010001U >> 48);
}

/// Marks in the last `count` lanes.
inline Units8 lastLanes(CFIndex count) {
    Units8 const fromTheEnd = {8, 7, 6, 5, 4, 3, 2, 1};
    return reinterpret_cast<Units8>(fromTheEnd <= static_cast<UInt16>(count));
}

/// Goes through `count` units block by block: `add` receives where a block begins, and marks for
/// the lanes that count, since the last block begins with units of the one before. Returns how
/// many units are left at the end: none, or all where they are too few for a block.
template <class TAdd>
inline CFIndex forEachBlock(UniChar const* units, CFIndex count, TAdd const& add) {
    if (count < 8)
        return count;
    CFIndex index = 0;
    for (; count - index >= 8; index += 8)
        add(units + index, lastLanes(8));
    if (index < count)
        add(units + count - 8, lastLanes(count - index));
    return 0;
}

/// How many units, four blocks at a time, stand in front of a block of which `mark` leaves a lane
/// that is not zero.
template <class TMark>
inline CFIndex clearFront(UniChar const* units, CFIndex count, TMark const& mark) {
    CFIndex index = 0;
    for (; count - index >= 32; index += 32) {
        auto const marked = [&](CFIndex block) {
            return mark(load<Units8>(units + index + 8 * block));
        };
        if (clearLanes(marked(0) | marked(1) | marked(2) | marked(3)) < 8)
            break;
    }
    return index;
}

/// Surrogate pairs, the high half in front, of code points less 10000.
inline Words4 splitPairs(Words4 beyond) {
    return 0xDC00D800U + (beyond >> 10) + ((beyond & 0x3FF) << 16);
}

/// The code points of surrogate pairs, and what is not zero where a word is no pair.
inline Words4 joinPairs(Words4 pairs) {
    return 0x10000 + ((pairs & 0x3FF) << 10) + (pairs >> 16 & 0x3FF);
}

inline Words4 wrongPairs(Words4 pairs) {
    return (pairs & 0xFC00FC00U) ^ 0xDC00D800U;
}

} // namespace CFPlatform

#endif
