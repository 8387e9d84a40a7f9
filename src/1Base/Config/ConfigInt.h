/// Integers of a fixed width, and arithmetic on them that wraps.
///
///     Config::wrapMul(2147484, 1000);   // -2147483296
#ifndef QORN_1BASE_CONFIGINT_H
#define QORN_1BASE_CONFIGINT_H

#include <cstdint>

namespace Config {

/// @{
/// 32 bits on every platform, and the width of enumerations in the interface.
using Int32 = std::int32_t;
using UInt32 = std::uint32_t;
/// @}

/// @{
/// Sum, difference and product modulo 2^32, as two's complement gives them. Made on unsigned
/// values, since an overflow of signed ones has no defined result.
constexpr Int32 wrapAdd(Int32 left, Int32 right) {
    return static_cast<Int32>(static_cast<UInt32>(left) + static_cast<UInt32>(right));
}

constexpr Int32 wrapSub(Int32 left, Int32 right) {
    return static_cast<Int32>(static_cast<UInt32>(left) - static_cast<UInt32>(right));
}

constexpr Int32 wrapMul(Int32 left, Int32 right) {
    return static_cast<Int32>(static_cast<UInt32>(left) * static_cast<UInt32>(right));
}
/// @}

} // namespace Config

#endif
