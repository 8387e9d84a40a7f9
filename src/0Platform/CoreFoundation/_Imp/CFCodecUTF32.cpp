// UTF-32 in host order. Reading is strict, but for bytes behind the last whole element, which are
// ignored; an unpaired surrogate is written as the loss byte.
//
// Both directions go one character after another. Neighbours mostly take the same number of units,
// so each number has a road that takes a run of its characters in blocks; a road ends before what
// is of another kind, and before the last few characters.

#include "0Platform/CoreFoundation/_Imp/CFCursor.h"
#include "0Platform/CoreFoundation/_Imp/CFUnicode.h"
#include "0Platform/CoreFoundation/_Imp/CFVector.h"

#include <algorithm>

namespace CFPlatform {
namespace {

// Reading stores up to this many units beyond those that count.
constexpr CFIndex unitsBeyond = 8;

class Reader : private DecodeCursor {
  public:
    using DecodeCursor::DecodeCursor;
    using DecodeCursor::written;

    bool readAll() {
        readOnes();
        for (; bytes != end; readOnes()) {
            auto const element = load<UInt32>(bytes);
            if (element > 0x10FFFFU || isSurrogate(element))
                return false;
            advance(4, putCodePoint(units, element));
            readPairs();
        }
        return true;
    }

  private:
    void readOnes() {
        for (; has(32); advance(32, 8)) {
            auto const front = load<Words4>(bytes);
            auto const back = load<Words4>(bytes + 16);
            Units8 const block = lowHalves(front, back);
            store(units, block);
            CFIndex const good = clearLanes(highHalves(front, back) | surrogates(block));
            if (good < 8)
                return advance(4 * good, good);
        }
    }

    void readPairs() {
        for (; has(16) && load<UInt32>(bytes) > 0xFFFFU; advance(16, 8)) {
            Words4 const beyond = load<Words4>(bytes) - 0x10000;
            store(units, splitPairs(beyond));
            CFIndex const good = clearLanes(beyond >> 20);
            if (good < 4)
                return advance(4 * good, 2 * good);
        }
    }
};

class Writer : private EncodeCursor {
  public:
    using EncodeCursor::done;
    using EncodeCursor::EncodeCursor;

    void writeAll(UInt8 lossByte) {
        writeOnes();
        for (; has(1, 4); writeOnes()) {
            bool const pair = isPairAt(units, end - units, 0);
            UInt32 element = pair ? joinPair(units[0], units[1]) : units[0];
            if (isSurrogate(element)) {
                if (lossByte == 0)
                    return;
                element = lossByte;
            }
            store(bytes, element);
            advance(pair ? 2 : 1, 4);
            writePairs();
        }
    }

  private:
    void writeOnes() {
        for (; has(8, 32); advance(8, 32)) {
            auto const block = load<Units8>(units);
            store(bytes, widenFront(block));
            store(bytes + 16, widenBack(block));
            CFIndex const good = clearLanes(surrogates(block));
            if (good < 8)
                return advance(good, 4 * good);
        }
    }

    void writePairs() {
        for (; has(8, 16) && isHighSurrogate(units[0]); advance(8, 16)) {
            auto const pairs = load<Words4>(units);
            store(bytes, joinPairs(pairs));
            CFIndex const good = clearLanes(wrongPairs(pairs));
            if (good < 4)
                return advance(2 * good, 4 * good);
        }
    }
};

// So few units that their count does not overflow 16 bits, and that plain text behind them is seen
// soon.
constexpr CFIndex countedAtOnce = 512;

// The pairs that end in one of at most `countedAtOnce` units, in front of which one more stands.
CFIndex countPairs(UniChar const* units, CFIndex count) {
    Units8 pairs = {};
    CFIndex const left = forEachBlock(units, count, [&](UniChar const* block, Units8 counting) {
        // Taking away a mark adds one.
        pairs -=
            highSurrogates(load<Units8>(block - 1)) & lowSurrogates(load<Units8>(block)) & counting;
    });
    CFIndex result = sumOf(pairs);
    for (CFIndex i = count - left; i < count; ++i)
        result += isHighSurrogate(units[i - 1]) && isLowSurrogate(units[i]);
    return result;
}

// What writeAll would write with room for all: an element for each unit, but one for a pair.
Encoded measure(UniChar const* units, CFIndex count, UInt8 lossByte) {
    CFIndex const reached = lossByte != 0 ? count : pairedFront(units, count);
    CFIndex elements = reached;
    for (CFIndex i = 1; i < reached;) {
        i += clearFront(units + i, reached - i, surrogates);
        CFIndex const rest = std::min(countedAtOnce, reached - i);
        elements -= countPairs(units + i, rest);
        i += rest;
    }
    return {reached, 4 * elements};
}

class CodecUTF32 final : public Codec {
  public:
    CFIndex maximumUnits(UInt8 const*, CFIndex count) const noexcept override {
        return count / 2 + unitsBeyond;
    }

    CFIndex decode(UInt8 const* bytes, CFIndex count, UniChar* units) const noexcept override {
        if (count > 0 && count < 4)
            return -1;
        Reader reader(bytes, count / 4 * 4, units);
        return reader.readAll() ? reader.written() : -1;
    }

    Encoded encode(EncodeRequest const& request) const noexcept override {
        if (request.buffer == nullptr)
            return measure(request.units, request.count, request.lossByte);
        Writer writer(request);
        writer.writeAll(request.lossByte);
        return writer.done();
    }
};

} // namespace

Codec const& codecUTF32() noexcept {
    static CodecUTF32 const codec;
    return codec;
}

} // namespace CFPlatform
