// MD5 and RC4 beside OpenSSL's, on random data cut at random.

#include "3Util/Encrypt/Encrypt.h"

#include "3Util/Encrypt/EncryptTestBytes.h"

#include <gtest/gtest.h>

#ifdef QORN_HAVE_OPENSSL
#    include "3Util/Encrypt/EncryptOpenSSL.h"

#    include <cstddef>

namespace {

using Encrypt::TByteVector;

constexpr int rounds = 3000;
constexpr std::size_t longest = 3000;
constexpr std::size_t longestPart = 300;

TEST(EncryptOpenSSLTest, DigestsLikeOpenSSL) {
    EncryptTest::CRandomBytes random;
    for (int round = 0; round < rounds; ++round) {
        TByteVector const bytes = random.bytes(random.upTo(longest));
        EncryptTest::COpenSSLMd5 peer;
        peer.process(bytes.data(), bytes.size());
        Encrypt::TMd5Digest digest;
        {
            Encrypt::CMd5Creator creator(digest);
            unsigned char const* data = bytes.data();
            for (std::size_t const length : random.parts(bytes.size(), longestPart)) {
                creator.process(data, length);
                data += length;
            }
        }
        ASSERT_EQ(EncryptTest::hexOf(digest), EncryptTest::hexOf(peer.finish()))
            << bytes.size() << " bytes in round " << round;
    }
}

TEST(EncryptOpenSSLTest, EncryptsLikeOpenSSL) {
    EncryptTest::COpenSSLLegacy const legacy;
    if (!legacy.isAvailable())
        GTEST_SKIP() << "OpenSSL has no legacy provider here, and RC4 is nowhere else";
    EncryptTest::CRandomBytes random;
    for (int round = 0; round < rounds; ++round) {
        TByteVector const key = random.bytes(1 + random.upTo(299));
        TByteVector bytes = random.bytes(random.upTo(longest));
        TByteVector expected = bytes;
        EncryptTest::COpenSSLRC4(legacy, key).process(expected.data(), expected.size());
        Encrypt::CRC4 const cipher(key);
        unsigned char* data = bytes.data();
        for (std::size_t const length : random.parts(bytes.size(), longestPart)) {
            cipher.process(data, length);
            data += length;
        }
        ASSERT_EQ(bytes, expected)
            << bytes.size() << " bytes with a key of " << key.size() << " in round " << round;
    }
}

} // namespace
#else
TEST(EncryptOpenSSLTest, ComparesWithOpenSSL) {
    GTEST_SKIP() << "built without OpenSSL 3 (libssl-dev)";
}
#endif
