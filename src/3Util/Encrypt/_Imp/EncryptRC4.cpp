#include "3Util/Encrypt/EncryptRC4.h"

#include <cstdint>
#include <utility>

namespace Encrypt {

// The permutation's bytes stand in whole words: the processor reads and writes those faster than
// single bytes.
struct CRC4::rc4_key {
    std::uint32_t s[256];
    std::uint32_t x = 0;
    std::uint32_t y = 0;
};

CRC4::CRC4(unsigned char const* key, unsigned long length) : key_(std::make_unique<rc4_key>()) {
    std::uint32_t(&s)[256] = key_->s;
    for (std::uint32_t i = 0; i < 256; ++i)
        s[i] = i;
    std::uint32_t j = 0;
    unsigned long k = 0;
    for (std::uint32_t i = 0; i < 256; ++i) {
        j = (key[k] + j + s[i]) & 0xFF;
        std::swap(s[i], s[j]);
        k = (k + 1) % length;
    }
}

CRC4::CRC4(TByteVector const& key) : CRC4(key.data(), static_cast<unsigned long>(key.size())) {}

CRC4::CRC4(std::string const& key)
    : CRC4(reinterpret_cast<unsigned char const*>(key.data()),
           static_cast<unsigned long>(key.size())) {}

CRC4::~CRC4() = default;

unsigned char* CRC4::process(unsigned char* data, unsigned long length) const {
    std::uint32_t(&s)[256] = key_->s;
    std::uint32_t x = key_->x;
    std::uint32_t y = key_->y;
    for (unsigned long i = 0; i < length; ++i) {
        x = (x + 1) & 0xFF;
        std::uint32_t const sx = s[x];
        y = (y + sx) & 0xFF;
        std::uint32_t const sy = s[y];
        s[x] = sy;
        s[y] = sx;
        data[i] = static_cast<unsigned char>(data[i] ^ s[(sx + sy) & 0xFF]);
    }
    key_->x = x;
    key_->y = y;
    return data;
}

TByteVector& CRC4::process(TByteVector& data) const {
    process(data.data(), static_cast<unsigned long>(data.size()));
    return data;
}

std::string& CRC4::process(std::string& text) const {
    TByteVector bytes(text.begin(), text.end());
    process(bytes);
    text.assign(bytes.begin(), bytes.end());
    return text;
}

TByteVector& rc4(std::string const& key, TByteVector& data) {
    return CRC4(key).process(data);
}

std::string rc4(std::string const& key, std::string const& data) {
    std::string result(data);
    CRC4(key).process(result);
    return result;
}

} // namespace Encrypt
