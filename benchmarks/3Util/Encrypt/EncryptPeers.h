/// MD5 and RC4 of the libraries that the benchmark compares, in one form: `digest(bytes)` and
/// `process(key, bytes)`.
#ifndef QORN_BENCHMARKS_ENCRYPTPEERS_H
#define QORN_BENCHMARKS_ENCRYPTPEERS_H

#include "3Util/Encrypt/Encrypt.h"

#ifdef QORN_HAVE_GCRYPT
#    include <gcrypt.h>
#endif
#ifdef QORN_HAVE_NETTLE
#    include <nettle/arcfour.h>
#    include <nettle/md5.h>
#endif
#ifdef QORN_HAVE_OPENSSL
#    include <openssl/evp.h>
#    include <openssl/provider.h>
#endif

namespace EncryptPeers {

using Encrypt::TByteVector;
using Encrypt::TMd5Digest;

struct COurMd5 {
    TMd5Digest digest(TByteVector const& bytes) { return Encrypt::md5(bytes); }
};

struct COurRC4 {
    void process(TByteVector const& key, TByteVector& bytes) { Encrypt::CRC4(key).process(bytes); }
};

#ifdef QORN_HAVE_OPENSSL
// Benchmarks end behind OpenSSL's own clean-up, so what they hold of it is left to the process.
class COpenSSLMd5 {
  public:
    TMd5Digest digest(TByteVector const& bytes) {
        TMd5Digest digest;
        EVP_DigestInit_ex2(context_, digest_, nullptr);
        EVP_DigestUpdate(context_, bytes.data(), bytes.size());
        EVP_DigestFinal_ex(context_, digest.data(), nullptr);
        return digest;
    }

  private:
    EVP_MD* digest_ = EVP_MD_fetch(nullptr, "MD5", nullptr);
    EVP_MD_CTX* context_ = EVP_MD_CTX_new();
};

class COpenSSLRC4 {
  public:
    COpenSSLRC4() {
        OSSL_PROVIDER_try_load(nullptr, "legacy", 1);
        cipher_ = EVP_CIPHER_fetch(nullptr, "RC4", nullptr);
    }

    /// The key has sixteen bytes, which is the cipher's length unless it is told another.
    void process(TByteVector const& key, TByteVector& bytes) {
        int written = 0;
        EVP_EncryptInit_ex2(context_, cipher_, key.data(), nullptr, nullptr);
        EVP_EncryptUpdate(context_, bytes.data(), &written, bytes.data(),
                          static_cast<int>(bytes.size()));
    }

  private:
    EVP_CIPHER* cipher_;
    EVP_CIPHER_CTX* context_ = EVP_CIPHER_CTX_new();
};
#endif

#ifdef QORN_HAVE_NETTLE
struct CNettleMd5 {
    TMd5Digest digest(TByteVector const& bytes) {
        TMd5Digest digest;
        md5_ctx context;
        nettle_md5_init(&context);
        nettle_md5_update(&context, bytes.size(), bytes.data());
        nettle_md5_digest(&context, digest.size(), digest.data());
        return digest;
    }
};

struct CNettleRC4 {
    void process(TByteVector const& key, TByteVector& bytes) {
        arcfour_ctx context;
        nettle_arcfour_set_key(&context, key.size(), key.data());
        nettle_arcfour_crypt(&context, bytes.size(), bytes.data(), bytes.data());
    }
};
#endif

#ifdef QORN_HAVE_GCRYPT
struct CGcryptMd5 {
    CGcryptMd5() { gcry_check_version(nullptr); }

    TMd5Digest digest(TByteVector const& bytes) {
        TMd5Digest digest;
        gcry_md_hash_buffer(GCRY_MD_MD5, digest.data(), bytes.data(), bytes.size());
        return digest;
    }
};

class CGcryptRC4 {
  public:
    CGcryptRC4() {
        gcry_check_version(nullptr);
        gcry_cipher_open(&cipher_, GCRY_CIPHER_ARCFOUR, GCRY_CIPHER_MODE_STREAM, 0);
    }
    CGcryptRC4(CGcryptRC4 const&) = delete;
    CGcryptRC4& operator=(CGcryptRC4 const&) = delete;
    ~CGcryptRC4() { gcry_cipher_close(cipher_); }

    void process(TByteVector const& key, TByteVector& bytes) {
        gcry_cipher_setkey(cipher_, key.data(), key.size());
        gcry_cipher_encrypt(cipher_, bytes.data(), bytes.size(), nullptr, 0);
    }

  private:
    gcry_cipher_hd_t cipher_;
};
#endif

} // namespace EncryptPeers

#endif
