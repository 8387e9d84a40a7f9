/// Bytes as this module handles them.
#ifndef QORN_3UTIL_ENCRYPTTYPES_H
#define QORN_3UTIL_ENCRYPTTYPES_H

#include <vector>

namespace Encrypt {

/// Bytes without a meaning of their own.
using TByteVector = std::vector<unsigned char>;

} // namespace Encrypt

#endif
