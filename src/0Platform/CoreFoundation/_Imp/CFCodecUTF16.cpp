// UTF-16 in host order: units pass as they are, unpaired surrogates and byte order marks included.

#include "0Platform/CoreFoundation/_Imp/CFCodec.h"
#include "0Platform/CoreFoundation/_Imp/CFUnicode.h"

#include <algorithm>
#include <cstring>

namespace CFPlatform {
namespace {

class CodecUTF16 final : public Codec {
  public:
    CFIndex maximumUnits(UInt8 const*, CFIndex count) const noexcept override { return count / 2; }

    CFIndex decode(UInt8 const* bytes, CFIndex count, UniChar* units) const noexcept override {
        CFIndex const length = count / 2;
        if (length > 0)
            std::memcpy(units, bytes, static_cast<std::size_t>(length) * 2);
        return length;
    }

    Encoded encode(EncodeRequest const& request) const noexcept override {
        CFIndex length = request.count;
        if (request.buffer != nullptr) {
            length = std::min(length, request.room / 2);
            if (length > 0 && isPairAt(request.units, request.count, length - 1))
                --length;
            if (length > 0)
                std::memcpy(request.buffer, request.units, static_cast<std::size_t>(length) * 2);
        }
        return {length, length * 2};
    }
};

} // namespace

Codec const& codecUTF16() noexcept {
    static CodecUTF16 const codec;
    return codec;
}

} // namespace CFPlatform
