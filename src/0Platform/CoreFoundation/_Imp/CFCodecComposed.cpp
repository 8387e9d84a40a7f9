// The file system's form: UTF-16 in host order, brought into canonical composition (Unicode
// Standard Annex #15) whichever way it goes.

#include "0Platform/CoreFoundation/_Imp/CFCodec.h"
#include "0Platform/CoreFoundation/_Imp/CFUnicode.h"

#include <unicode/unorm2.h>

#include <algorithm>
#include <cstring>
#include <limits>

namespace CFPlatform {
namespace {

// A longer run without a place where composition may begin anew is composed in parts of this many
// units, so that no part outgrows a writer's buffer however many marks a base bears.
constexpr CFIndex longestCluster = 1024;

// The most units that one unit turns into.
constexpr CFIndex growth = 3;

// What the text at a place turns into.
struct Piece {
    UniChar const* units;
    CFIndex length;
    CFIndex source;   // the units of the text that it stands for
    bool isDivisible; // its characters are the text's own, one for one
};

UChar const* toUChars(UniChar const* units) {
    return reinterpret_cast<UChar const*>(units);
}

class Composer {
  public:
    explicit Composer(UNormalizer2 const* normalizer) : normalizer_(normalizer) {}

    // The next piece of a text that is not empty: all that needs no change, or else one cluster.
    Piece next(UniChar const* units, CFIndex count) {
        CFIndex const composed = spanComposed(units, count);
        if (composed > 0)
            return {units, composed, composed, true};
        CFIndex const source = clusterLength(units, count);
        UErrorCode status = U_ZERO_ERROR;
        int32_t const length =
            unorm2_normalize(normalizer_, toUChars(units), static_cast<int32_t>(source), cluster_,
                             longestCluster * growth, &status);
        if (U_FAILURE(status))
            return {units, source, source, true};
        return {reinterpret_cast<UniChar const*>(cluster_), length, source, false};
    }

  private:
    CFIndex spanComposed(UniChar const* units, CFIndex count) const {
        int32_t const window =
            static_cast<int32_t>(std::min<CFIndex>(count, std::numeric_limits<int32_t>::max()));
        UErrorCode status = U_ZERO_ERROR;
        int32_t const length =
            unorm2_spanQuickCheckYes(normalizer_, toUChars(units), window, &status);
        return U_SUCCESS(status) ? length : 0;
    }

    // The units up to the next character that never takes part in what is before it.
    CFIndex clusterLength(UniChar const* units, CFIndex count) const {
        CFIndex length = isPairAt(units, count, 0) ? 2 : 1;
        while (length < count) {
            bool const pair = isPairAt(units, count, length);
            CFIndex const next = length + (pair ? 2 : 1);
            UInt32 const codePoint =
                pair ? joinPair(units[length], units[length + 1]) : units[length];
            if (next > longestCluster ||
                unorm2_hasBoundaryBefore(normalizer_, static_cast<UChar32>(codePoint)))
                break;
            length = next;
        }
        return length;
    }

    UNormalizer2 const* normalizer_;
    UChar cluster_[longestCluster * growth];
};

class CodecComposed final : public Codec {
  public:
    explicit CodecComposed(UNormalizer2 const* normalizer) : normalizer_(normalizer) {}

    CFIndex maximumUnits(UInt8 const*, CFIndex count) const noexcept override {
        return count / 2 * growth;
    }

    CFIndex decode(UInt8 const* bytes, CFIndex count, UniChar* units) const noexcept override {
        CFIndex const length = count / 2;
        if (length == 0)
            return 0;
        // The text is put behind the place of the result, which can't overtake it: of the room of
        // three units for each, what is composed needs three at most.
        UniChar* const source = units + length * (growth - 1);
        std::memcpy(source, bytes, static_cast<std::size_t>(length) * 2);
        Composer composer(normalizer_);
        UniChar* out = units;
        for (CFIndex done = 0; done < length;) {
            Piece const piece = composer.next(source + done, length - done);
            std::memmove(out, piece.units, static_cast<std::size_t>(piece.length) * 2);
            out += piece.length;
            done += piece.source;
        }
        return out - units;
    }

    Encoded encode(EncodeRequest const& request) const noexcept override {
        Composer composer(normalizer_);
        Encoded done = {0, 0};
        while (done.units < request.count) {
            Piece piece = composer.next(request.units + done.units, request.count - done.units);
            bool const isCut = request.buffer != nullptr && !fit(piece, request.room - done.bytes);
            if (request.buffer != nullptr && piece.length > 0)
                std::memcpy(request.buffer + done.bytes, piece.units,
                            static_cast<std::size_t>(piece.length) * 2);
            done.units += piece.source;
            done.bytes += piece.length * 2;
            if (isCut)
                break;
        }
        return done;
    }

  private:
    // Shortens a piece to the whole characters that fit. False where it had to.
    static bool fit(Piece& piece, CFIndex room) {
        CFIndex length = std::max(room, CFIndex(0)) / 2;
        if (piece.length <= length)
            return true;
        if (!piece.isDivisible)
            length = 0;
        if (length > 0 && isPairAt(piece.units, piece.length, length - 1))
            --length;
        piece.length = length;
        piece.source = length;
        return false;
    }

    UNormalizer2 const* normalizer_;
};

CodecComposed const* makeCodec() {
    UErrorCode status = U_ZERO_ERROR;
    UNormalizer2 const* const normalizer = unorm2_getNFCInstance(&status);
    if (U_FAILURE(status))
        return nullptr;
    static CodecComposed const codec(normalizer);
    return &codec;
}

} // namespace

Codec const* codecComposed() noexcept {
    static Codec const* const codec = makeCodec();
    return codec;
}

} // namespace CFPlatform
