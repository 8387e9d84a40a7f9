/// One encoding's two directions. A codec has no state: all its functions may run on any thread.
#ifndef QORN_0PLATFORM_CFCODEC_H
#define QORN_0PLATFORM_CFCODEC_H

#include <CoreFoundation/CFString.h>

namespace CFPlatform {

/// How far an encoder came: units read, and bytes written (or counted).
struct Encoded {
    CFIndex units;
    CFIndex bytes;
};

/// What an encoder works on and where it writes.
struct EncodeRequest {
    UniChar const* units;
    CFIndex count;
    UInt8 lossByte; // 0: stop at a character that the encoding lacks
    UInt8* buffer;  // null: count only, and `room` does not hold
    CFIndex room;
};

class Codec {
  public:
    /// A bound on the units that these bytes decode to, cheap rather than exact.
    virtual CFIndex maximumUnits(UInt8 const* bytes, CFIndex count) const noexcept = 0;

    /// Decodes all bytes into `units`, which has room for maximumUnits. Returns the number of
    /// units, or -1 where the bytes are malformed.
    virtual CFIndex decode(UInt8 const* bytes, CFIndex count, UniChar* units) const noexcept = 0;

    /// Encodes whole characters from the front while they fit.
    virtual Encoded encode(EncodeRequest const& request) const noexcept = 0;

  protected:
    // Codecs are static objects that are never destroyed, so the destructor stays trivial.
    ~Codec() = default;
};

/// The codec behind a platform value; null where the encoding is not served. A legacy encoding's
/// tables are read or built at its first use, on whichever thread that is.
Codec const* findCodec(CFStringEncoding encoding) noexcept;

Codec const& codecUTF8() noexcept;
Codec const& codecUTF16() noexcept;
Codec const& codecUTF32() noexcept;

/// UTF-16 in canonical composition; null where ICU's data is missing.
Codec const* codecComposed() noexcept;

/// The codec of an encoding of one or two bytes a character.
Codec const* findLegacyCodec(CFStringEncoding encoding) noexcept;

} // namespace CFPlatform

#endif
