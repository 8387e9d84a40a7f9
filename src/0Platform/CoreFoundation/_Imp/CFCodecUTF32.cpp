// UTF-32 in host order. Reading is strict, but for bytes behind the last whole element, which are
// ignored; an unpaired surrogate is written as the loss byte.

#include "0Platform/CoreFoundation/_Imp/CFCodec.h"
#include "0Platform/CoreFoundation/_Imp/CFUnicode.h"

#include <algorithm>
#include <cstring>

namespace CFPlatform {
namespace {

constexpr CFIndex blockSize = 16;

UInt32 loadElement(UInt8 const* bytes) {
    UInt32 value;
    std::memcpy(&value, bytes, sizeof(value));
    return value;
}

void storeElement(UInt8* bytes, UInt32 value) {
    std::memcpy(bytes, &value, sizeof(value));
}

// Narrows one block if each element is a single unit and no surrogate.
bool decodeBlock(UInt8 const* bytes, UniChar* units) {
    UInt32 bad = 0;
    for (CFIndex i = 0; i < blockSize; ++i) {
        UInt32 const value = loadElement(bytes + 4 * i);
        bad |= static_cast<UInt32>(value > 0xFFFFU) | static_cast<UInt32>(isSurrogate(value));
        units[i] = static_cast<UniChar>(value);
    }
    return bad == 0;
}

// True where no unit of the block is a surrogate.
bool isPlainBlock(UniChar const* units) {
    UInt32 bad = 0;
    for (CFIndex i = 0; i < blockSize; ++i)
        bad |= static_cast<UInt32>(isSurrogate(units[i]));
    return bad == 0;
}

void encodeBlock(UniChar const* units, UInt8* bytes) {
    for (CFIndex i = 0; i < blockSize; ++i)
        storeElement(bytes + 4 * i, units[i]);
}

class CodecUTF32 final : public Codec {
  public:
    CFIndex maximumUnits(UInt8 const*, CFIndex count) const noexcept override {
        // Two units an element, rounded up to whole blocks, which are stored before they are
        // judged.
        return count / 2 + blockSize;
    }

    CFIndex decode(UInt8 const* bytes, CFIndex count, UniChar* units) const noexcept override {
        if (count > 0 && count < 4)
            return -1;
        UInt8 const* const end = bytes + count / 4 * 4;
        UniChar* out = units;
        while (bytes != end) {
            if (end - bytes >= 4 * blockSize && decodeBlock(bytes, out)) {
                bytes += 4 * blockSize;
                out += blockSize;
                continue;
            }
            UInt8 const* const stop = std::min(end, bytes + 4 * blockSize);
            for (; bytes != stop; bytes += 4) {
                UInt32 const value = loadElement(bytes);
                if (isSurrogate(value) || value > 0x10FFFFU)
                    return -1;
                out += putCodePoint(out, value);
            }
        }
        return out - units;
    }

    Encoded encode(EncodeRequest const& request) const noexcept override {
        CFIndex const limit = request.buffer == nullptr ? request.count : request.room / 4;
        CFIndex unit = 0;
        CFIndex elements = 0;
        while (unit < request.count && elements < limit) {
            UniChar const* const units = request.units + unit;
            if (request.count - unit >= blockSize && limit - elements >= blockSize &&
                isPlainBlock(units)) {
                if (request.buffer != nullptr)
                    encodeBlock(units, request.buffer + 4 * elements);
                unit += blockSize;
                elements += blockSize;
                continue;
            }
            bool const pair = isPairAt(request.units, request.count, unit);
            UInt32 value = pair ? joinPair(units[0], units[1]) : units[0];
            if (!pair && isSurrogate(value)) {
                if (request.lossByte == 0)
                    break;
                value = request.lossByte;
            }
            if (request.buffer != nullptr)
                storeElement(request.buffer + 4 * elements, value);
            unit += pair ? 2 : 1;
            ++elements;
        }
        return {unit, elements * 4};
    }
};

} // namespace

Codec const& codecUTF32() noexcept {
    static CodecUTF32 const codec;
    return codec;
}

} // namespace CFPlatform
