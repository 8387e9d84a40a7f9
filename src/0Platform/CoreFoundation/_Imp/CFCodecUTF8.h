/// UTF-8 (RFC 3629), in three parts.
#ifndef QORN_0PLATFORM_CFCODECUTF8_H
#define QORN_0PLATFORM_CFCODECUTF8_H

#include "0Platform/CoreFoundation/_Imp/CFCodec.h"

namespace CFPlatform {

/// Reading stores up to this many units beyond those that it returns.
constexpr CFIndex unitsBeyondUTF8 = 8;

/// Reads strictly: overlong forms, surrogates, values above 10FFFF and sequences that are cut off
/// fail. A byte order mark is a character like any other. Returns the number of units, or -1.
CFIndex readUTF8(UInt8 const* bytes, CFIndex count, UniChar* units) noexcept;

/// Writes whole characters from the front while there is room, up to the first unpaired surrogate,
/// which UTF-8 can't show. Past the bytes told, what the room holds is undefined.
Encoded writeUTF8(EncodeRequest const& request) noexcept;

/// What writeUTF8 would return with room for all.
Encoded measureUTF8(UniChar const* units, CFIndex count) noexcept;

} // namespace CFPlatform

#endif
