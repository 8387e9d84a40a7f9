// MD5 as RFC 1321 has it.

#include "3Util/Encrypt/EncryptMd5.h"

#include <boost/endian/conversion.hpp>

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstring>
#include <iterator>
#include <new>

namespace Encrypt {
namespace {

constexpr std::size_t blockBytes = 64;

struct MD5_CTX {
    std::uint32_t state[4];
    std::uint64_t count; // of bits
    unsigned char buffer[blockBytes];
};

static_assert(sizeof(MD5_CTX) == 88, "the context fills the creator's room");

constexpr std::uint32_t rotate(std::uint32_t value, unsigned int bits) {
    return value << bits | value >> (32 - bits);
}

// Each step waits for the one before, so what counts is the way from its `b` to the next. A sum of
// what is known earlier is kept together: compilers would regroup it and add the constant last.
inline std::uint32_t keepTogether(std::uint32_t sum) {
#ifdef __GNUC__
    __asm__("" : "+r"(sum));
#endif
    return sum;
}

// The four auxiliary functions, added to a sum; `x` is known last. G's two halves share no bit, so
// that they may be added one by one.
struct F {
    static std::uint32_t add(std::uint32_t sum, std::uint32_t x, std::uint32_t y, std::uint32_t z) {
        return sum + (z ^ (x & (y ^ z)));
    }
};

struct G {
    static std::uint32_t add(std::uint32_t sum, std::uint32_t x, std::uint32_t y, std::uint32_t z) {
        return keepTogether(sum + (y & ~z)) + (x & z);
    }
};

struct H {
    static std::uint32_t add(std::uint32_t sum, std::uint32_t x, std::uint32_t y, std::uint32_t z) {
        return sum + (x ^ (y ^ z));
    }
};

struct I {
    static std::uint32_t add(std::uint32_t sum, std::uint32_t x, std::uint32_t y, std::uint32_t z) {
        return sum + (y ^ (x | ~z));
    }
};

template <class TFunction, unsigned int bits>
inline void step(std::uint32_t& a, std::uint32_t b, std::uint32_t c, std::uint32_t d,
                 std::uint32_t word, std::uint32_t constant) {
    a = b + rotate(TFunction::add(keepTogether(a + word + constant), b, c, d), bits);
}

// Four steps of a round: words k, k + stride, ... (mod 16), with the round's four rotations.
template <class TFunction, unsigned int s1, unsigned int s2, unsigned int s3, unsigned int s4>
inline void fourSteps(std::uint32_t (&v)[4], std::uint32_t const (&x)[16], std::size_t k,
                      std::size_t stride, std::uint32_t const* constants) {
    step<TFunction, s1>(v[0], v[1], v[2], v[3], x[k & 15], constants[0]);
    step<TFunction, s2>(v[3], v[0], v[1], v[2], x[(k + stride) & 15], constants[1]);
    step<TFunction, s3>(v[2], v[3], v[0], v[1], x[(k + 2 * stride) & 15], constants[2]);
    step<TFunction, s4>(v[1], v[2], v[3], v[0], x[(k + 3 * stride) & 15], constants[3]);
}

// floor(2^32 * abs(sin(i + 1))).
constexpr std::uint32_t sines[64] = {
    0xd76aa478, 0xe8c7b756, 0x242070db, 0xc1bdceee, 0xf57c0faf, 0x4787c62a, 0xa8304613, 0xfd469501,
    0x698098d8, 0x8b44f7af, 0xffff5bb1, 0x895cd7be, 0x6b901122, 0xfd987193, 0xa679438e, 0x49b40821,
    0xf61e2562, 0xc040b340, 0x265e5a51, 0xe9b6c7aa, 0xd62f105d, 0x02441453, 0xd8a1e681, 0xe7d3fbc8,
    0x21e1cde6, 0xc33707d6, 0xf4d50d87, 0x455a14ed, 0xa9e3e905, 0xfcefa3f8, 0x676f02d9, 0x8d2a4c8a,
    0xfffa3942, 0x8771f681, 0x6d9d6122, 0xfde5380c, 0xa4beea44, 0x4bdecfa9, 0xf6bb4b60, 0xbebfbc70,
    0x289b7ec6, 0xeaa127fa, 0xd4ef3085, 0x04881d05, 0xd9d4d039, 0xe6db99e5, 0x1fa27cf8, 0xc4ac5665,
    0xf4292244, 0x432aff97, 0xab9423a7, 0xfc93a039, 0x655b59c3, 0x8f0ccc92, 0xffeff47d, 0x85845dd1,
    0x6fa87e4f, 0xfe2ce6e0, 0xa3014314, 0x4e0811a1, 0xf7537e82, 0xbd3af235, 0x2ad7d2bb, 0xeb86d391};

// All blocks at once: between two of them the state stays out of memory.
void MD5Transform(std::uint32_t (&state)[4], unsigned char const* block, unsigned long blocks) {
    std::uint32_t sum[4] = {state[0], state[1], state[2], state[3]};
    for (; blocks != 0; --blocks, block += blockBytes) {
        std::uint32_t x[16];
        for (std::size_t i = 0; i < 16; ++i)
            x[i] = boost::endian::load_little_u32(block + 4 * i);
        std::uint32_t v[4] = {sum[0], sum[1], sum[2], sum[3]};
        for (std::size_t i = 0; i < 4; ++i)
            fourSteps<F, 7, 12, 17, 22>(v, x, 4 * i, 1, sines + 4 * i);
        for (std::size_t i = 0; i < 4; ++i)
            fourSteps<G, 5, 9, 14, 20>(v, x, 1 + 20 * i, 5, sines + 16 + 4 * i);
        for (std::size_t i = 0; i < 4; ++i)
            fourSteps<H, 4, 11, 16, 23>(v, x, 5 + 12 * i, 3, sines + 32 + 4 * i);
        for (std::size_t i = 0; i < 4; ++i)
            fourSteps<I, 6, 10, 15, 21>(v, x, 28 * i, 7, sines + 48 + 4 * i);
        for (std::size_t i = 0; i < 4; ++i)
            sum[i] += v[i];
    }
    std::copy(std::begin(sum), std::end(sum), state);
}

void MD5Init(MD5_CTX& context) {
    context.state[0] = 0x67452301;
    context.state[1] = 0xefcdab89;
    context.state[2] = 0x98badcfe;
    context.state[3] = 0x10325476;
}

void MD5Update(MD5_CTX& context, unsigned char const* data, unsigned long length) {
    std::size_t const held = static_cast<std::size_t>(context.count / 8 % blockBytes);
    context.count += static_cast<std::uint64_t>(length) * 8;
    if (held != 0) {
        std::size_t const wanted = std::min<std::size_t>(blockBytes - held, length);
        std::memcpy(context.buffer + held, data, wanted);
        if (held + wanted < blockBytes)
            return;
        MD5Transform(context.state, context.buffer, 1);
        data += wanted;
        length -= wanted;
    }
    unsigned long const rest = length % blockBytes;
    MD5Transform(context.state, data, length / blockBytes);
    if (rest != 0)
        std::memcpy(context.buffer, data + (length - rest), rest);
}

void MD5Final(TMd5Digest& digest, MD5_CTX& context) {
    static constexpr unsigned char padding[blockBytes] = {0x80};
    unsigned char bits[8];
    boost::endian::store_little_u64(bits, context.count);
    std::size_t const held = static_cast<std::size_t>(context.count / 8 % blockBytes);
    MD5Update(context, padding, (held < 56 ? 56 : 120) - held);
    MD5Update(context, bits, sizeof(bits));
    for (std::size_t i = 0; i < 4; ++i)
        boost::endian::store_little_u32(digest.data() + 4 * i, context.state[i]);
}

MD5_CTX& contextOf(boost::array<unsigned char, 88>& room) {
    return *std::launder(reinterpret_cast<MD5_CTX*>(room.data()));
}

} // namespace

CMd5Creator::CMd5Creator(TMd5Digest& digest) : digest_(digest) {
    static_assert(alignof(MD5_CTX) <= 8, "the creator's room is aligned for the context");
    MD5Init(*new (context_.data()) MD5_CTX());
}

CMd5Creator::~CMd5Creator() {
    MD5Final(digest_, contextOf(context_));
}

void CMd5Creator::process(unsigned char const* data, unsigned long length) {
    if (length != 0)
        MD5Update(contextOf(context_), data, length);
}

void CMd5Creator::process(char const* text) {
    process(reinterpret_cast<unsigned char const*>(text),
            static_cast<unsigned long>(std::strlen(text) + 1));
}

void CMd5Creator::process(TByteVector const& data) {
    process(data.data(), static_cast<unsigned long>(data.size()));
}

void CMd5Creator::process(std::string const& text) {
    process(reinterpret_cast<unsigned char const*>(text.data()),
            static_cast<unsigned long>(text.size()));
}

} // namespace Encrypt
