#include "3Util/Encrypt/EncryptRC4.h"

#include <boost/endian/conversion.hpp>

#include <cstdint>
#include <utility>

namespace Encrypt {

struct CRC4::rc4_key {
    unsigned char s[256];
    unsigned char x = 0;
    unsigned char y = 0;

    rc4_key(unsigned char const* key, unsigned long length);
};

CRC4::rc4_key::rc4_key(unsigned char const* key, unsigned long length) {
    for (unsigned int i = 0; i < 256; ++i)
        s[i] = static_cast<unsigned char>(i);
    unsigned char j = 0;
    unsigned long k = 0;
    for (unsigned int i = 0; i < 256; ++i) {
        j = static_cast<unsigned char>(key[k] + j + s[i]);
        std::swap(s[i], s[j]);
        // The division would take most of the time, and is needed at the key's end alone.
        ++k;
        if (k >= length)
            k %= length;
    }
}

CRC4::CRC4(unsigned char const* key, unsigned long length)
    : key_(std::make_unique<rc4_key>(key, length)) {}

CRC4::CRC4(TByteVector const& key) : CRC4(key.data(), static_cast<unsigned long>(key.size())) {}

CRC4::CRC4(std::string const& key)
    : CRC4(reinterpret_cast<unsigned char const*>(key.data()),
           static_cast<unsigned long>(key.size())) {}

CRC4::~CRC4() = default;

unsigned char* CRC4::process(unsigned char* data, unsigned long length) const {
    unsigned char(&s)[256] = key_->s;
    unsigned char x = key_->x;
    unsigned char y = key_->y;
    auto const nextByte = [&s, &x, &y] {
        unsigned char const sx = s[++x];
        y = static_cast<unsigned char>(y + sx);
        unsigned char const sy = s[y];
        s[x] = sy;
        s[y] = sx;
        return s[static_cast<unsigned char>(sx + sy)];
    };
    auto const nextWord = [&nextByte] {
        std::uint64_t word = 0;
        for (unsigned int shift = 0; shift < 64; shift += 8)
            word |= static_cast<std::uint64_t>(nextByte()) << shift;
        return word;
    };

    unsigned char* rest = data;
    for (; length >= 8; length -= 8, rest += 8)
        boost::endian::store_little_u64(rest, boost::endian::load_little_u64(rest) ^ nextWord());
    for (; length != 0; --length, ++rest)
        *rest = static_cast<unsigned char>(*rest ^ nextByte());

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
