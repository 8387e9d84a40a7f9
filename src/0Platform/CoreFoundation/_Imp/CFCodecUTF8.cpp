#include "0Platform/CoreFoundation/_Imp/CFCodecUTF8.h"

#include <cstring>

namespace CFPlatform {
namespace {

class CodecUTF8 final : public Codec {
  public:
    // A unit for each byte: counting first would cost more than the room that it saves, which
    // nobody touches.
    CFIndex maximumUnits(UInt8 const*, CFIndex count) const noexcept override {
        return count + unitsBeyondUTF8;
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
