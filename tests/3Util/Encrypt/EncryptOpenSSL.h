/// MD5 and RC4 of OpenSSL 3, for tests that compare.
///
///     EncryptTest::COpenSSLMd5 md5;
///     md5.process(data, length);
///     Encrypt::TMd5Digest const digest = md5.finish();
#ifndef QORN_TESTS_ENCRYPTOPENSSL_H
#define QORN_TESTS_ENCRYPTOPENSSL_H

#include "3Util/Encrypt/EncryptMd5.h"
#include "3Util/Encrypt/EncryptTypes.h"

#include <openssl/evp.h>
#include <openssl/provider.h>

#include <algorithm>
#include <cstddef>
#include <memory>
#include <stdexcept>

namespace EncryptTest {

/// Calls OpenSSL's function for the end of an object.
template <auto release>
struct CReleased {
    template <class T>
    void operator()(T* object) const {
        release(object);
    }
};

inline void require(bool holds, char const* call) {
    if (!holds)
        throw std::runtime_error(std::string(call) + " failed");
}

class COpenSSLMd5 {
  public:
    COpenSSLMd5() : context_(EVP_MD_CTX_new()) {
        require(EVP_DigestInit_ex(context_.get(), EVP_md5(), nullptr) == 1, "EVP_DigestInit_ex");
    }

    void process(unsigned char const* data, std::size_t length) {
        require(EVP_DigestUpdate(context_.get(), data, length) == 1, "EVP_DigestUpdate");
    }

    Encrypt::TMd5Digest finish() {
        Encrypt::TMd5Digest digest;
        require(EVP_DigestFinal_ex(context_.get(), digest.data(), nullptr) == 1,
                "EVP_DigestFinal_ex");
        return digest;
    }

  private:
    std::unique_ptr<EVP_MD_CTX, CReleased<EVP_MD_CTX_free>> context_;
};

/// RC4 belongs to the legacy provider, which a system may lack.
class COpenSSLLegacy {
  public:
    COpenSSLLegacy()
        : context_(OSSL_LIB_CTX_new()),
          provider_(OSSL_PROVIDER_load(context_.get(), "legacy")),
          rc4_(provider_ ? EVP_CIPHER_fetch(context_.get(), "RC4", nullptr) : nullptr) {}

    bool isAvailable() const { return rc4_ != nullptr; }
    EVP_CIPHER const* rc4() const { return rc4_.get(); }

  private:
    std::unique_ptr<OSSL_LIB_CTX, CReleased<OSSL_LIB_CTX_free>> context_;
    std::unique_ptr<OSSL_PROVIDER, CReleased<OSSL_PROVIDER_unload>> provider_;
    std::unique_ptr<EVP_CIPHER, CReleased<EVP_CIPHER_free>> rc4_;
};

class COpenSSLRC4 {
  public:
    COpenSSLRC4(COpenSSLLegacy const& legacy, Encrypt::TByteVector const& key)
        : context_(EVP_CIPHER_CTX_new()) {
        int const length = static_cast<int>(key.size());
        require(EVP_EncryptInit_ex2(context_.get(), legacy.rc4(), nullptr, nullptr, nullptr) == 1 &&
                    EVP_CIPHER_CTX_set_key_length(context_.get(), length) == 1 &&
                    EVP_EncryptInit_ex2(context_.get(), nullptr, key.data(), nullptr, nullptr) == 1,
                "EVP_EncryptInit_ex2");
    }

    /// In place. One call of OpenSSL takes an int's worth of bytes.
    void process(unsigned char* data, std::size_t length) {
        for (std::size_t done = 0; done < length;) {
            int const step = static_cast<int>(std::min<std::size_t>(length - done, 1U << 30));
            int written = 0;
            require(EVP_EncryptUpdate(context_.get(), data + done, &written, data + done, step) ==
                        1,
                    "EVP_EncryptUpdate");
            done += static_cast<std::size_t>(written);
        }
    }

  private:
    std::unique_ptr<EVP_CIPHER_CTX, CReleased<EVP_CIPHER_CTX_free>> context_;
};

} // namespace EncryptTest

#endif
