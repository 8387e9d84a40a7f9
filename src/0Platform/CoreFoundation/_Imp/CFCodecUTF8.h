/// UTF-8 (RFC 3629), in three parts.
#ifndef QORN_0PLATFORM_CFCODECUTF8_H
#define QORN_0PLATFORM_CFCODECUTF8_H

#include "0Platform/CoreFoundation/_Imp/CFCodec.h"

namespace CFPlatform {

/// Reading stores up to this many units beyond those that it returns.
constexpr CFIndex unitsBeyondUTF8 = 16;

/// Reads strictly: overlong forms, surrogates, values above 10FFFF and sequences that are cut off
/// fail. A byte order mark is a character like any other. Returns the number of units, or -1.
CFIndex readUTF8(UInt8 const* bytes, CFIndex count, UniChar* units) noexcept;

} // namespace CFPlatform

#endif
