#include "0Platform/CoreFoundation/_Imp/CFCodec.h"

#include <CoreFoundation/CFStringEncodingExt.h>

namespace CFPlatform {

Codec const* findCodec(CFStringEncoding encoding) noexcept {
    switch (encoding) {
    case kCFStringEncodingUTF8:
        return &codecUTF8();
    case kCFStringEncodingUnicode:
    case kCFStringEncodingUTF16LE:
        return &codecUTF16();
    case kCFStringEncodingUTF32LE:
        return &codecUTF32();
    case kCFStringEncodingMacHFS:
        return codecComposed();
    default:
        return findLegacyCodec(encoding);
    }
}

} // namespace CFPlatform
