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

/// Marks where a unit is half of a surrogate pair.
inline Units8 surrogates(Units8 units) {
    return zero((units & 0xF800) ^ 0xD800);
}

/// How many bytes stand in front of the first one whose top bit is set.
inline CFIndex clearBytes(std::uint64_t bytes) {
    std::uint64_t const tops = bytes & 0x8080808080808080U;
    return tops == 0 ? 8 : __builtin_ctzll(tops) / 8;
}

/// How many lanes stand in front of the first one that is not zero.
inline CFIndex clearLanes(Units8 block) {
    auto const marks = __builtin_convertvector(nonZero(block), Bytes8);
    return clearBytes(load<std::uint64_t>(&marks));
}

inline CFIndex clearLanes(Words4 block) {
    auto const marks = __builtin_convertvector(nonZero(block), Units4);
    return clearBytes(load<std::uint64_t>(&marks)) / 2;
}

/// Surrogate pairs, the high half in front, of code points less 10000.
inline Words4 splitPairs(Words4 beyond) {
    return 0xDC00D800U + (beyond >> 10) + ((beyond & 0x3FF) << 16);
}

} // namespace CFPlatform

#endif
