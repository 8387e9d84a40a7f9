#include "0Platform/CoreFoundation/_Imp/CFCodecUTF8.h"

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
        return request.buffer == nullptr ? measureUTF8(request.units, request.count)
                                         : writeUTF8(request);
    }
};

} // namespace

Codec const& codecUTF8() noexcept {
    static CodecUTF8 const codec;
    return codec;
}

} // namespace CFPlatform
