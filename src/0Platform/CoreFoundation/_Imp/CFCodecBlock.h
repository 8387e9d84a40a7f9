/// Text in blocks of 16 characters, for the stretches in which bytes and units are equal.
#ifndef QORN_0PLATFORM_CFCODECBLOCK_H
#define QORN_0PLATFORM_CFCODECBLOCK_H

#include <CoreFoundation/CFBase.h>

#include <cstdint>
#include <cstring>

namespace CFPlatform {

constexpr CFIndex blockLength = 16;

/// True where each byte of a block is below 80.
inline bool isAsciiBlock(UInt8 const* bytes) {
    std::uint64_t halves[2];
    std::memcpy(halves, bytes, sizeof(halves));
    return ((halves[0] | halves[1]) & 0x8080808080808080U) == 0;
}

/// True where each unit of a block is below `limit`, a power of two.
inline bool isBlockBelow(UniChar const* units, unsigned limit) {
    unsigned bits = 0;
    for (CFIndex i = 0; i < blockLength; ++i)
        bits |= units[i];
    return bits < limit;
}

inline void widenBlock(UInt8 const* bytes, UniChar* units) {
    for (CFIndex i = 0; i < blockLength; ++i)
        units[i] = bytes[i];
}

inline void narrowBlock(UniChar const* units, UInt8* bytes) {
    for (CFIndex i = 0; i < blockLength; ++i)
        bytes[i] = static_cast<UInt8>(units[i]);
}

} // namespace CFPlatform

#endif
