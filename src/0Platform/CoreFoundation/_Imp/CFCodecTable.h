/// The codec of every legacy encoding: two tables, and the loops that walk them.
#ifndef QORN_0PLATFORM_CFCODECTABLE_H
#define QORN_0PLATFORM_CFCODECTABLE_H

#include "0Platform/CoreFoundation/_Imp/CFCodec.h"
#include "0Platform/CoreFoundation/_Imp/CFDecodeTable.h"
#include "0Platform/CoreFoundation/_Imp/CFEncodeTable.h"

namespace CFPlatform {

/// Reading is strict: an unassigned code fails, and so does a lead byte at the very end. Writing
/// takes the longest text that has a code; a character without one, a surrogate pair too, is one
/// loss byte.
class TableCodec final : public Codec {
  public:
    /// `decoding` points to data that is never freed. `encoding` is sealed.
    TableCodec(DecodeTable const& decoding, EncodeTable&& encoding);

    CFIndex maximumUnits(UInt8 const* bytes, CFIndex count) const noexcept override;
    CFIndex decode(UInt8 const* bytes, CFIndex count, UniChar* units) const noexcept override;
    Encoded encode(EncodeRequest const& request) const noexcept override;

  private:
    bool decodeBlock(UInt8 const* bytes, UniChar* units) const noexcept;
    UInt8 const* decodeCode(UInt8 const* bytes, UInt8 const* end, UniChar*& units) const noexcept;
    UniChar* decodeSequence(UInt16 mark, UniChar* units) const noexcept;
    CFIndex encodeBlock(UniChar const* units, CFIndex left, UInt8* out,
                        CFIndex room) const noexcept;

    UInt16 cells_[256]; // of single bytes, ASCII included
    DecodeTable decoding_;
    EncodeTable encoding_;
    unsigned directLimit_ = 0x80;  // bytes and units below it are equal
    CFIndex unitsForTwoBytes_ = 2; // the most that two bytes decode to
};

} // namespace CFPlatform

#endif
