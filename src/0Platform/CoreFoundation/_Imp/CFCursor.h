/// How far a decoder or an encoder has come.
#ifndef QORN_0PLATFORM_CFCURSOR_H
#define QORN_0PLATFORM_CFCURSOR_H

#include "0Platform/CoreFoundation/_Imp/CFCodec.h"

namespace CFPlatform {

/// From bytes into units, which have room for all.
class DecodeCursor {
  public:
    DecodeCursor(UInt8 const* source, CFIndex count, UniChar* target)
        : bytes(source), end(source + count), units(target), target_(target) {}

    bool has(CFIndex byteCount) const { return end - bytes >= byteCount; }

    void advance(CFIndex byteCount, CFIndex unitCount) {
        bytes += byteCount;
        units += unitCount;
    }

    CFIndex written() const { return units - target_; }

    UInt8 const* bytes;
    UInt8 const* const end;
    UniChar* units;

  private:
    UniChar* const target_;
};

/// From units into the room of a request.
class EncodeCursor {
  public:
    explicit EncodeCursor(EncodeRequest const& request)
        : units(request.units),
          end(request.units + request.count),
          bytes(request.buffer),
          request_(request) {}

    CFIndex room() const { return request_.buffer + request_.room - bytes; }

    bool has(CFIndex unitCount, CFIndex byteCount) const {
        return end - units >= unitCount && room() >= byteCount;
    }

    void advance(CFIndex unitCount, CFIndex byteCount) {
        units += unitCount;
        bytes += byteCount;
    }

    Encoded done() const { return {units - request_.units, bytes - request_.buffer}; }

    UniChar const* units;
    UniChar const* const end;
    UInt8* bytes;

  private:
    EncodeRequest const request_;
};

} // namespace CFPlatform

#endif
