#include "0Platform/CoreFoundation/_Imp/CFCodecUTF8.h"
#include "0Platform/CoreFoundation/_Imp/CFUnicode.h"

#include <algorithm>
#include <cstring>

namespace CFPlatform {
namespace {

// Up to here a unit for each byte is cheaper than counting first.
constexpr CFIndex uncountedBytes = 512;
// Whole blocks, and no more than cannot overflow a count that is itself a byte.
constexpr CFIndex countedAtOnce = 112;

// The units of at most `countedAtOnce` bytes: one for each lead, two for one of four bytes. The
// count is a byte so that the compiler's loop takes sixteen of them at a time.
CFIndex unitsOf(UInt8 const* bytes, CFIndex count) {
    UInt8 units = 0;
    for (CFIndex i = 0; i < count; ++i)
        units = static_cast<UInt8>(units + ((bytes[i] & 0xC0) != 0x80) + (bytes[i] >= 0xF0));
    return units;
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
            return count + unitsBeyondUTF8;
        CFIndex units = unitsBeyondUTF8;
        for (CFIndex i = 0; i < count; i += countedAtOnce)
            units += unitsOf(bytes + i, std::min(countedAtOnce, count - i));
        return units;
    }

    CFIndex decode(UInt8 const* bytes, CFIndex count, UniChar* units) const noexcept override {
        bool const hasMark = count >= 3 && std::memcmp(bytes, "\xEF\xBB\xBF", 3) == 0;
        return hasMark ? readUTF8(bytes + 3, count - 3, units) : readUTF8(bytes, count, units);
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
