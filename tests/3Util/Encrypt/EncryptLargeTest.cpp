// Lengths beyond 32 bits. They want 14 GiB of memory and a minute, so they run by hand:
// EncryptTest --gtest_filter='EncryptLargeTest.*' --gtest_also_run_disabled_tests

#include "3Util/Encrypt/Encrypt.h"

#include "3Util/Encrypt/EncryptOpenSSL.h"
#include "3Util/Encrypt/EncryptTestBytes.h"

#include <gtest/gtest.h>

#include <cstddef>

namespace {

using Encrypt::TByteVector;

constexpr std::size_t large = (std::size_t(1) << 32) + 77;

// No two stretches of 4 GiB look the same.
TByteVector largeBytes() {
    TByteVector bytes(large);
    for (std::size_t i = 0; i < bytes.size(); ++i)
        bytes[i] = static_cast<unsigned char>(i * 0x9E3779B97F4A7C15U >> 56);
    return bytes;
}

// The digest is from `md5sum`.
TEST(EncryptLargeTest, DISABLED_DigestsMoreThan4GiBAtOnce) {
    EXPECT_EQ(EncryptTest::hexOf(Encrypt::md5(largeBytes())), "cc059110b0e3958e56ba12b89c0cde56");
}

TEST(EncryptLargeTest, DISABLED_EncryptsMoreThan4GiBAtOnce) {
    EncryptTest::COpenSSLLegacy const legacy;
    if (!legacy.isAvailable())
        GTEST_SKIP() << "OpenSSL has no legacy provider here, and RC4 is nowhere else";
    TByteVector const key = {'K', 'e', 'y'};
    TByteVector bytes = largeBytes();
    TByteVector expected = bytes;
    EncryptTest::COpenSSLRC4(legacy, key).process(expected.data(), expected.size());
    Encrypt::CRC4(key).process(bytes);
    EXPECT_TRUE(bytes == expected);
}

TEST(EncryptLargeTest, DISABLED_MergesWhatWasSplitOfMoreThan4GiB) {
    TByteVector const bytes = largeBytes();
    TByteVector merged = Encrypt::mergeBytes(Encrypt::splitBytes(bytes, 7), 7);
    ASSERT_EQ(merged.size(), large + 1);
    EXPECT_EQ(merged.back(), 0);
    merged.pop_back();
    EXPECT_TRUE(merged == bytes);
}

} // namespace
