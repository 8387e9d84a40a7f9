/// The RC4 stream cipher, for formats that call for it. RC4 protects nothing today: whoever chooses
/// freely takes AES-GCM or ChaCha20-Poly1305 from a cryptographic library.
///
///     std::string const secret = Encrypt::rc4("Key", std::string("Plaintext"));
///     // BB F3 16 E8 D9 40 AF 0A D3; the same call on it gives "Plaintext" back
#ifndef QORN_3UTIL_ENCRYPTRC4_H
#define QORN_3UTIL_ENCRYPTRC4_H

#include "3Util/Encrypt/EncryptTypes.h"

#include <memory>
#include <string>

namespace Encrypt {

/// One key stream. Encryption and decryption are the same operation. The stream goes on across
/// calls: to start over, a new object is needed. Every `process` advances it, although it is
/// declared constant; an object must not be shared between threads while it works.
class CRC4 {
  public:
    /// @{
    /// Sets up the key schedule. The key must not be empty, which is not tested; what follows its
    /// first 256 bytes doesn't count.
    CRC4(unsigned char const* key, unsigned long length);
    explicit CRC4(TByteVector const& key);
    explicit CRC4(std::string const& key);
    /// @}

    CRC4(CRC4 const&) = delete;
    CRC4& operator=(CRC4 const&) = delete;

    ~CRC4();

    /// @{
    /// These change the data in place and return it.
    unsigned char* process(unsigned char* data, unsigned long length) const;
    TByteVector& process(TByteVector& data) const;
    std::string& process(std::string& text) const;
    /// @}

  private:
    struct rc4_key;

    std::unique_ptr<rc4_key> key_;
};

/// Changes `data` in place with a stream of its own, and returns it.
TByteVector& rc4(std::string const& key, TByteVector& data);

/// The result on a copy.
std::string rc4(std::string const& key, std::string const& data);

} // namespace Encrypt

#endif
