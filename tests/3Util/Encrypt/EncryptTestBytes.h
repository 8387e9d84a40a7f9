/// Bytes as the tests of this module write, compare and draw them.
///
///     EncryptTest::bytesOf("ab 01");                    // {0xAB, 0x01}
///     EncryptTest::hexOf(EncryptTest::bytesOf("AB"));   // "ab"
#ifndef QORN_TESTS_ENCRYPTTESTBYTES_H
#define QORN_TESTS_ENCRYPTTESTBYTES_H

#include "3Util/Encrypt/EncryptTypes.h"

#include <cstddef>
#include <cstdio>
#include <random>
#include <string>
#include <vector>

namespace EncryptTest {

/// The bytes of pairs of hexadecimal digits; blanks between the pairs are passed over.
inline Encrypt::TByteVector bytesOf(std::string const& hex) {
    Encrypt::TByteVector bytes;
    std::string digits;
    for (char const digit : hex) {
        if (digit != ' ')
            digits += digit;
        if (digits.size() == 2) {
            bytes.push_back(static_cast<unsigned char>(std::stoul(digits, nullptr, 16)));
            digits.clear();
        }
    }
    return bytes;
}

/// The bytes of a container as pairs of hexadecimal digits.
template <class TBytes>
std::string hexOf(TBytes const& bytes) {
    std::string hex;
    for (auto const byte : bytes) {
        char digits[3];
        std::snprintf(digits, sizeof(digits), "%02x", static_cast<unsigned char>(byte));
        hex += digits;
    }
    return hex;
}

/// Random bytes and lengths, the same in each run; the seed is printed.
class CRandomBytes {
  public:
    CRandomBytes() : engine_(seed) { std::printf("seed %u\n", seed); }

    /// A number from 0 to `most`.
    std::size_t upTo(std::size_t most) { return engine_() % (most + 1); }

    Encrypt::TByteVector bytes(std::size_t length) {
        Encrypt::TByteVector drawn(length);
        for (unsigned char& byte : drawn)
            byte = static_cast<unsigned char>(engine_());
        return drawn;
    }

    /// The lengths of the parts into which a sequence falls, some of them empty.
    std::vector<std::size_t> parts(std::size_t length, std::size_t longest) {
        std::vector<std::size_t> lengths;
        while (length != 0) {
            lengths.push_back(upTo(longest < length ? longest : length));
            length -= lengths.back();
        }
        return lengths;
    }

  private:
    static constexpr unsigned int seed = 13211994;

    std::mt19937_64 engine_;
};

} // namespace EncryptTest

#endif
