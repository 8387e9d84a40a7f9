/// MD5 digests (RFC 1321), for formats that call for them. MD5 protects nothing today: whoever
/// chooses freely takes SHA-256 or better from a cryptographic library.
///
///     Encrypt::md5(std::string("abc"));   // 90 01 50 98 3c d2 4f b0 d6 96 3f 7d 28 e1 7f 72
#ifndef QORN_3UTIL_ENCRYPTMD5_H
#define QORN_3UTIL_ENCRYPTMD5_H

#include "3Util/Encrypt/EncryptTypes.h"

#include <boost/array.hpp>

#include <string>

namespace Encrypt {

/// The 16 bytes in the order of RFC 1321.
using TMd5Digest = boost::array<unsigned char, 16>;

/// Digests bytes for the length of a scope: the digest stands in the caller's array only when the
/// creator has been destroyed. For one thread at a time.
///
///     Encrypt::TMd5Digest digest;
///     {
///         Encrypt::CMd5Creator creator(digest);
///         creator.process(header);
///         creator.process(body);
///     }
class CMd5Creator {
  public:
    /// The array must outlive the creator.
    explicit CMd5Creator(TMd5Digest& digest);

    CMd5Creator(CMd5Creator const&) = delete;
    CMd5Creator& operator=(CMd5Creator const&) = delete;

    /// Writes the digest.
    ~CMd5Creator();

    /// Digests the bytes behind those before; `data` may be null for a length of 0.
    void process(unsigned char const* data, unsigned long length);

    /// The text with its terminating zero byte, unlike the same text as a std::string: callers'
    /// formats count on it.
    void process(char const* text);

    /// @{
    /// The content, without a terminator.
    void process(TByteVector const& data);
    void process(std::string const& text);
    /// @}

  private:
    TMd5Digest& digest_;
    // The state of the running digest, laid out by the implementation.
    alignas(8) boost::array<unsigned char, 88> context_;
};

/// The digest of a TByteVector or a std::string, its terminator left out. A literal must be made a
/// std::string: by itself it is digested with its terminating zero.
template <class T>
TMd5Digest md5(T const& data) {
    TMd5Digest digest;
    {
        CMd5Creator creator(digest);
        creator.process(data);
    }
    return digest;
}

} // namespace Encrypt

#endif
