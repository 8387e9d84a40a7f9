/// Repacks bytes into groups of fewer than eight bits and back.
///
///     Encrypt::splitBytes({0xAB, 0xCD}, 5);               // 15 0F 06 10
///     Encrypt::mergeBytes({0x15, 0x0F, 0x06, 0x10}, 5);   // AB CD 00
#ifndef QORN_3UTIL_ENCRYPTBYTESPLIT_H
#define QORN_3UTIL_ENCRYPTBYTESPLIT_H

#include "3Util/Encrypt/EncryptTypes.h"

#include <cstddef>

namespace Encrypt {

/// Cuts the bytes, as one string of bits from the highest bit of the first, into groups of
/// `bitsPerGroup` (1 to 8, not tested). Each group becomes a byte that holds it in its low bits;
/// the last one is filled up with zero bits.
TByteVector splitBytes(TByteVector const& bytes, std::size_t bitsPerGroup);

/// The inverse: strings the `bitsPerGroup` low bits of each byte together (1 to 8, not tested; set
/// bits above them have no defined result) and cuts them into bytes. A last byte that the last
/// group only crosses into is filled up with zero bits, so a round trip can gain one zero byte. A
/// last group that lies within one byte without ending it fails the assertion "begin != end".
TByteVector mergeBytes(TByteVector const& groups, std::size_t bitsPerGroup);

} // namespace Encrypt

#endif
