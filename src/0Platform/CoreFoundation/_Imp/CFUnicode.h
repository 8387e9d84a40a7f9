/// Surrogate arithmetic of UTF-16 (RFC 2781).
#ifndef QORN_0PLATFORM_CFUNICODE_H
#define QORN_0PLATFORM_CFUNICODE_H

#include <CoreFoundation/CFBase.h>

namespace CFPlatform {

inline bool isSurrogate(UInt32 value) {
    return (value & 0xFFFFF800U) == 0xD800U;
}

inline bool isHighSurrogate(UInt32 value) {
    return (value & 0xFFFFFC00U) == 0xD800U;
}

inline bool isLowSurrogate(UInt32 value) {
    return (value & 0xFFFFFC00U) == 0xDC00U;
}

/// True where a surrogate pair starts at `units[index]`.
inline bool isPairAt(UniChar const* units, CFIndex count, CFIndex index) {
    return isHighSurrogate(units[index]) && index + 1 < count && isLowSurrogate(units[index + 1]);
}

/// How many units stand in front of the first unpaired surrogate; all where there is none.
inline CFIndex pairedFront(UniChar const* units, CFIndex count) {
    CFIndex index = 0;
    while (index < count && (isPairAt(units, count, index) || !isSurrogate(units[index])))
        index += isSurrogate(units[index]) ? 2 : 1;
    return index;
}

inline UInt32 joinPair(UniChar high, UniChar low) {
    return 0x10000U + ((high - 0xD800U) << 10) + (low - 0xDC00U);
}

/// Writes a code point as one or two units and returns their number.
inline CFIndex putCodePoint(UniChar* units, UInt32 codePoint) {
    if (codePoint < 0x10000U) {
        units[0] = static_cast<UniChar>(codePoint);
        return 1;
    }
    units[0] = static_cast<UniChar>(0xD7C0U + (codePoint >> 10));
    units[1] = static_cast<UniChar>(0xDC00U + (codePoint & 0x3FFU));
    return 2;
}

} // namespace CFPlatform

#endif
