// UTF-8 (RFC 3629), read strictly: overlong forms, surrogates, values above 10FFFF and sequences
// that are cut off fail. One leading byte order mark is removed.

#include "0Platform/CoreFoundation/_Imp/CFCodec.h"
#include "0Platform/CoreFoundation/_Imp/CFUnicode.h"

#include <cstdint>
#include <cstring>

namespace CFPlatform {
namespace {

constexpr CFIndex asciiBlock = 16;
// Up to here a unit for each byte is cheaper than counting first.
constexpr CFIndex uncountedBytes = 512;

bool isContinuation(UInt8 byte) {
    return (byte & 0xC0) == 0x80;
}

bool isAsciiBlock(UInt8 const* bytes) {
    std::uint64_t low;
    std::uint64_t high;
    std::memcpy(&low, bytes, 8);
    std::memcpy(&high, bytes + 8, 8);
    return ((low | high) & 0x8080808080808080U) == 0;
}

void widenAsciiBlock(UInt8 const* bytes, UniChar* units) {
    for (CFIndex i = 0; i < asciiBlock; ++i)
        units[i] = bytes[i];
}

// Reads the sequence at `bytes`. Returns its length, or 0 where it is malformed.
CFIndex readSequence(UInt8 const* bytes, UInt8 const* end, UInt32& codePoint) {
    UInt8 const lead = bytes[0];
    CFIndex const left = end - bytes;
    if (lead < 0x80) {
        codePoint = lead;
        return 1;
    }
    if (lead < 0xC2)
        return 0;
    if (lead < 0xE0) {
        if (left < 2 || !isContinuation(bytes[1]))
            return 0;
        codePoint = (lead & 0x1FU) << 6 | (bytes[1] & 0x3FU);
        return 2;
    }
    if (lead < 0xF0) {
        if (left < 3 || !isContinuation(bytes[1]) || !isContinuation(bytes[2]))
            return 0;
        codePoint = (lead & 0x0FU) << 12 | (bytes[1] & 0x3FU) << 6 | (bytes[2] & 0x3FU);
        return codePoint < 0x800U || isSurrogate(codePoint) ? 0 : 3;
    }
    if (lead > 0xF4 || left < 4 || !isContinuation(bytes[1]) || !isContinuation(bytes[2]) ||
        !isContinuation(bytes[3]))
        return 0;
    codePoint = (lead & 0x07U) << 18 | (bytes[1] & 0x3FU) << 12 | (bytes[2] & 0x3FU) << 6 |
                (bytes[3] & 0x3FU);
    return codePoint < 0x10000U || codePoint > 0x10FFFFU ? 0 : 4;
}

CFIndex sequenceLength(UInt32 codePoint) {
    return codePoint < 0x80U ? 1 : codePoint < 0x800U ? 2 : codePoint < 0x10000U ? 3 : 4;
}

void writeSequence(UInt8* bytes, UInt32 codePoint, CFIndex length) {
    static constexpr UInt8 leads[] = {0, 0, 0xC0, 0xE0, 0xF0};
    for (CFIndex i = length - 1; i > 0; --i, codePoint >>= 6)
        bytes[i] = static_cast<UInt8>(0x80U | (codePoint & 0x3FU));
    bytes[0] = static_cast<UInt8>(leads[length] | codePoint);
}

class CodecUTF8 final : public Codec {
  public:
    CFIndex maximumUnits(UInt8 const* bytes, CFIndex count) const noexcept override {
        if (count <= uncountedBytes)
            return count;
        CFIndex units = 0;
        for (CFIndex i = 0; i < count; ++i)
            units += static_cast<CFIndex>(!isContinuation(bytes[i])) +
                     static_cast<CFIndex>(bytes[i] >= 0xF0);
        return units;
    }

    CFIndex decode(UInt8 const* bytes, CFIndex count, UniChar* units) const noexcept override {
        UInt8 const* const end = bytes + count;
        UniChar* out = units;
        if (count >= 3 && std::memcmp(bytes, "\xEF\xBB\xBF", 3) == 0)
            bytes += 3;
        while (bytes != end) {
            if (end - bytes >= asciiBlock && isAsciiBlock(bytes)) {
                widenAsciiBlock(bytes, out);
                bytes += asciiBlock;
                out += asciiBlock;
                continue;
            }
            UInt32 codePoint;
            CFIndex const length = readSequence(bytes, end, codePoint);
            if (length == 0)
                return -1;
            out += putCodePoint(out, codePoint);
            bytes += length;
        }
        return out - units;
    }

    // The loss byte has no say: what UTF-8 can't show is only an unpaired surrogate, and there the
    // conversion stops.
    Encoded encode(EncodeRequest const& request) const noexcept override {
        Encoded done = {0, 0};
        while (done.units < request.count) {
            UniChar const* const units = request.units + done.units;
            bool const pair = isPairAt(request.units, request.count, done.units);
            UInt32 const codePoint = pair ? joinPair(units[0], units[1]) : units[0];
            CFIndex const length = sequenceLength(codePoint);
            if (!pair && isSurrogate(codePoint))
                break;
            if (request.buffer != nullptr) {
                if (length > request.room - done.bytes)
                    break;
                writeSequence(request.buffer + done.bytes, codePoint, length);
            }
            done.units += pair ? 2 : 1;
            done.bytes += length;
        }
        return done;
    }
};

} // namespace

Codec const& codecUTF8() noexcept {
    static CodecUTF8 const codec;
    return codec;
}

} // namespace CFPlatform
