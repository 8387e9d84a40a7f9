/// Digests, a stream cipher, and the repacking of bytes.
#ifndef QORN_3UTIL_ENCRYPT_H
#define QORN_3UTIL_ENCRYPT_H

#include "3Util/Encrypt/EncryptByteSplit.h"
#include "3Util/Encrypt/EncryptMd5.h"
#include "3Util/Encrypt/EncryptRC4.h"
#include "3Util/Encrypt/EncryptTypes.h"

#endif
