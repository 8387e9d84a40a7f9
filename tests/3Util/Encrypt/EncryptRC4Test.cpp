// RC4 by its published vectors, and what a key stream promises.

#include "3Util/Encrypt/EncryptRC4.h"

#include "3Util/Encrypt/EncryptRC4Vectors.h"
#include "3Util/Encrypt/EncryptTestBytes.h"

#include <gtest/gtest.h>

#include <cstddef>
#include <string>

namespace {

using Encrypt::CRC4;
using Encrypt::rc4;
using Encrypt::TByteVector;
using EncryptTest::bytesOf;
using EncryptTest::hexOf;

std::string const streamKey = "Key";

TByteVector streamOf(TByteVector const& key, std::size_t length) {
    TByteVector zeros(length);
    return CRC4(key).process(zeros);
}

// The algorithm as it is published, byte by byte.
TByteVector slowStreamOf(TByteVector const& key, std::size_t length) {
    unsigned char s[256];
    for (unsigned int i = 0; i < 256; ++i)
        s[i] = static_cast<unsigned char>(i);
    unsigned int j = 0;
    for (unsigned int i = 0; i < 256; ++i) {
        j = (j + s[i] + key[i % key.size()]) % 256;
        std::swap(s[i], s[j]);
    }
    TByteVector stream;
    unsigned int y = 0;
    for (unsigned int x = 1; stream.size() < length; x = (x + 1) % 256) {
        y = (y + s[x]) % 256;
        std::swap(s[x], s[y]);
        stream.push_back(s[(s[x] + s[y]) % 256]);
    }
    return stream;
}

TEST(EncryptRC4Test, GivesTheStreamsOfRFC6229) {
    for (EncryptTest::CRC4Vector const& vector : EncryptTest::rc4Vectors) {
        TByteVector const stream = streamOf(bytesOf(vector.key), 4112);
        for (std::size_t i = 0; i < std::size(EncryptTest::rc4Offsets); ++i) {
            auto const begin =
                stream.begin() + static_cast<std::ptrdiff_t>(EncryptTest::rc4Offsets[i]);
            EXPECT_EQ(hexOf(TByteVector(begin, begin + 16)), vector.streams[i])
                << vector.key << " at " << EncryptTest::rc4Offsets[i];
        }
    }
}

TEST(EncryptRC4Test, GivesTheBestKnownSamples) {
    EXPECT_EQ(hexOf(rc4("Key", std::string("Plaintext"))), "bbf316e8d940af0ad3");
    EXPECT_EQ(hexOf(rc4("Wiki", std::string("pedia"))), "1021bf0420");
    EXPECT_EQ(hexOf(rc4("Secret", std::string("Attack at dawn"))), "45a01f645fc35b383552544b9bf5");
}

TEST(EncryptRC4Test, TakesKeysOfEveryLength) {
    EncryptTest::CRandomBytes random;
    std::size_t const lengths[] = {1, 2, 3, 5, 16, 255, 256, 257, 300};
    for (std::size_t const length : lengths) {
        TByteVector const key = random.bytes(length);
        EXPECT_EQ(streamOf(key, 1000), slowStreamOf(key, 1000)) << length;
    }
}

TEST(EncryptRC4Test, LooksAtTheFirst256BytesOfAKey) {
    TByteVector key = EncryptTest::CRandomBytes().bytes(300);
    TByteVector const stream = streamOf(key, 100);
    key[256] ^= 1;
    EXPECT_EQ(streamOf(key, 100), stream);
    key[255] ^= 1;
    EXPECT_NE(streamOf(key, 100), stream);
}

TEST(EncryptRC4Test, TakesAKeyInThreeForms) {
    TByteVector const key = bytesOf("4B 65 79 00 FF");
    std::string const text(key.begin(), key.end());
    TByteVector pointed(40);
    TByteVector spelled(40);
    CRC4(key.data(), key.size()).process(pointed);
    CRC4(text).process(spelled);
    EXPECT_EQ(pointed, streamOf(key, 40));
    EXPECT_EQ(spelled, streamOf(key, 40));
}

TEST(EncryptRC4Test, ChangesDataInPlaceAndReturnsIt) {
    TByteVector bytes = bytesOf("50 6C 61 69 6E 74 65 78 74");
    unsigned char* const begin = bytes.data();
    EXPECT_EQ(CRC4(streamKey).process(bytes.data(), bytes.size()), begin);
    EXPECT_EQ(hexOf(bytes), "bbf316e8d940af0ad3");

    TByteVector again = bytesOf("50 6C 61 69 6E 74 65 78 74");
    EXPECT_EQ(&CRC4(streamKey).process(again), &again);
    EXPECT_EQ(again, bytes);

    std::string text = "Plaintext";
    EXPECT_EQ(&CRC4(streamKey).process(text), &text);
    EXPECT_EQ(hexOf(text), hexOf(bytes));
}

TEST(EncryptRC4Test, LeavesTheNeighboursOfTheDataAlone) {
    for (std::size_t length = 0; length <= 40; ++length) {
        TByteVector bytes(length + 2, 0x55);
        CRC4(streamKey).process(bytes.data() + 1, length);
        EXPECT_EQ(bytes.front(), 0x55) << length;
        EXPECT_EQ(bytes.back(), 0x55) << length;
    }
}

TEST(EncryptRC4Test, GoesOnWithTheStreamAcrossCalls) {
    TByteVector const expected = streamOf(bytesOf("4B 65 79"), 201);
    for (std::size_t first = 0; first <= expected.size(); ++first) {
        TByteVector bytes(expected.size());
        CRC4 const cipher(streamKey);
        cipher.process(bytes.data(), first);
        cipher.process(bytes.data() + first, bytes.size() - first);
        EXPECT_EQ(bytes, expected) << first;
    }
}

TEST(EncryptRC4Test, GoesOnWithTheStreamAcrossKindsOfData) {
    CRC4 const cipher(streamKey);
    std::string text(3, '\0');
    TByteVector bytes(5);
    unsigned char plain[4] = {};
    std::string stream = hexOf(cipher.process(text));
    stream += hexOf(cipher.process(bytes));
    stream += hexOf(TByteVector(cipher.process(plain, 4), plain + 4));
    EXPECT_EQ(stream, hexOf(streamOf(bytesOf("4B 65 79"), 12)));
}

TEST(EncryptRC4Test, DoesNotAdvanceForNoBytes) {
    CRC4 const cipher(streamKey);
    TByteVector noBytes;
    std::string noText;
    EXPECT_EQ(cipher.process(nullptr, 0), nullptr);
    EXPECT_TRUE(cipher.process(noBytes).empty());
    EXPECT_TRUE(cipher.process(noText).empty());
    std::string text = "Plaintext";
    EXPECT_EQ(hexOf(cipher.process(text)), "bbf316e8d940af0ad3");
}

TEST(EncryptRC4Test, GivesTheTextBackWithANewObject) {
    std::string const text = "caf\xC3\xA9\0 au lait";
    std::string const secret = rc4(streamKey, text);
    EXPECT_NE(secret, text);
    EXPECT_EQ(rc4(streamKey, secret), text);
}

TEST(EncryptRC4Test, ChangesAVectorInPlaceAndATextOnACopy) {
    TByteVector bytes = bytesOf("50 6C 61 69 6E 74 65 78 74");
    EXPECT_EQ(&rc4(streamKey, bytes), &bytes);
    EXPECT_EQ(hexOf(bytes), "bbf316e8d940af0ad3");

    std::string const text = "Plaintext";
    EXPECT_EQ(hexOf(rc4(streamKey, text)), "bbf316e8d940af0ad3");
    EXPECT_EQ(text, "Plaintext");

    TByteVector noBytes;
    EXPECT_TRUE(rc4(streamKey, noBytes).empty());
    EXPECT_TRUE(rc4(streamKey, std::string()).empty());
}

TEST(EncryptRC4Test, ChangesDataAtEveryAlignment) {
    TByteVector const stream = streamOf(bytesOf("4B 65 79"), 100);
    for (std::size_t shift = 0; shift < 16; ++shift) {
        TByteVector bytes(shift + stream.size());
        CRC4(streamKey).process(bytes.data() + shift, stream.size());
        EXPECT_EQ(TByteVector(bytes.begin() + static_cast<std::ptrdiff_t>(shift), bytes.end()),
                  stream)
            << shift;
    }
}

} // namespace
