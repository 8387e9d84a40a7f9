#include "0Platform/CoreFoundation/_Imp/CFCodecUTF8.h"
#include "0Platform/CoreFoundation/_Imp/CFCursor.h"
#include "0Platform/CoreFoundation/_Imp/CFUnicode.h"
#include "0Platform/CoreFoundation/_Imp/CFVector.h"

#include <algorithm>

namespace CFPlatform {
namespace {

CFIndex sequenceLength(UInt32 codePoint) {
    return codePoint < 0x80U ? 1 : codePoint < 0x800U ? 2 : codePoint < 0x10000U ? 3 : 4;
}

void writeSequence(UInt8* bytes, UInt32 codePoint, CFIndex length) {
    static constexpr UInt8 leads[] = {0, 0, 0xC0, 0xE0, 0xF0};
    for (CFIndex i = length - 1; i > 0; --i, codePoint >>= 6)
        bytes[i] = static_cast<UInt8>(0x80U | (codePoint & 0x3FU));
    bytes[0] = static_cast<UInt8>(leads[length] | codePoint);
}

class Writer : private EncodeCursor {
  public:
    using EncodeCursor::done;
    using EncodeCursor::EncodeCursor;

    // One character after another, until there is no room for one or an unpaired surrogate comes.
    // Neighbours mostly have the same length, so each length has a road that takes a run of its
    // characters in blocks. A road ends before what is of another length, and before the last few
    // units of the text and bytes of the room.
    void writeAll() {
        for (;;) {
            writeRun();
            if (units == end)
                return;
            bool const pair = isPairAt(units, end - units, 0);
            UInt32 const codePoint = pair ? joinPair(units[0], units[1]) : units[0];
            CFIndex const length = sequenceLength(codePoint);
            if (length > room() || isSurrogate(codePoint))
                return;
            writeSequence(bytes, codePoint, length);
            advance(pair ? 2 : 1, length);
        }
    }

  private:
    void writeRun() {
        if (!has(8, 16))
            return;
        if (units[0] < 0x800)
            writeOnesAndTwos();
        else if (isSurrogate(units[0]))
            writeFours();
        else
            writeThrees();
    }

    void writeOnes() {
        while (has(16, 16)) {
            auto const low = load<Units8>(units);
            auto const high = load<Units8>(units + 8);
            if (clearLanes((low | high) & 0xFF80) < 8)
                return;
            store(bytes, __builtin_convertvector(low, Bytes8));
            store(bytes + 8, __builtin_convertvector(high, Bytes8));
            advance(16, 16);
        }
    }

    // Accented text mixes these two in no order, so which one comes next must not be asked by a
    // branch. Two bytes are stored for each unit, and one or two of them count.
    void writeOnesAndTwos() {
        for (writeOnes(); has(8, 16); writeOnes()) {
            auto const block = load<Units8>(units);
            if (clearLanes(block & 0xF800) < 8)
                return;
            Units8 const twos = nonZero(block & 0xFF80);
            Units8 const sequences =
                (block & ~twos) | ((0x80C0 | block >> 6 | (block & 0x3F) << 8) & twos);
            // Byte by byte, where each sequence ends: its place, and one for each of two bytes
            // up to it, which the product adds up.
            std::uint64_t const ends =
                (topBits(twos) >> 7) * 0x0101010101010101U + 0x0807060504030201U;
            store(bytes, sequences[0]);
            for (int i = 1; i < 8; ++i)
                store(bytes + (ends >> (8 * i - 8) & 0xFF), sequences[i]);
            advance(8, static_cast<CFIndex>(ends >> 56));
        }
    }

    void writeThrees() {
        for (; has(8, 24) && startsRun(0x800); advance(8, 24)) {
            auto const block = load<Units8>(units);
            Words4 const triples[2] = {triplesOf(widenFront(block)), triplesOf(widenBack(block))};
            for (CFIndex i = 0; i < 7; ++i)
                store(bytes + 3 * i, triples[i / 4][i % 4]);
            // A fourth byte here would be one too many.
            store(bytes + 21, static_cast<UInt16>(triples[1][3]));
            bytes[23] = static_cast<UInt8>(triples[1][3] >> 16);
            CFIndex const good = clearLanes(zero(block & 0xF800) | surrogates(block));
            if (good < 8)
                return advance(good, 3 * good);
        }
    }

    static Words4 triplesOf(Words4 words) {
        return 0x8080E0 | words >> 12 | (words & 0xFC0) << 2 | (words & 0x3F) << 16;
    }

    void writeFours() {
        for (; has(8, 16) && startsRun(0xD800); advance(8, 16)) {
            auto const pairs = load<Words4>(units);
            Words4 const words = joinPairs(pairs);
            store(bytes, 0x808080F0U | words >> 18 | (words >> 4 & 0x3F00) |
                             (words << 10 & 0x3F0000) | (words & 0x3F) << 24);
            CFIndex const good = clearLanes(wrongPairs(pairs));
            if (good < 4)
                return advance(2 * good, 4 * good);
        }
    }

    // True where a run goes on: units of `least` or more. The third one is asked as well, since a
    // block costs as much as two single characters.
    bool startsRun(UniChar least) const { return units[0] >= least && units[2] >= least; }
};

// So few units that their count does not overflow 16 bits, and that ASCII behind them is seen soon.
constexpr CFIndex countedAtOnce = 512;

// The bytes of a unit beyond the first. Half of a surrogate pair stands for two bytes.
CFIndex extraBytes(UniChar unit) {
    return (unit >= 0x80) + (unit >= 0x800) - isSurrogate(unit);
}

// The same for a block: taking away a mark adds one.
Units8 extraBytes(Units8 units) {
    return surrogates(units) - nonZero(units & 0xFF80) - nonZero(units & 0xF800);
}

Units8 aboveAscii(Units8 units) {
    return units & 0xFF80;
}

struct Counted {
    CFIndex bytes;
    bool paired; // no low half without a high one in front, nor the other way round
};

// Counts the bytes of at most `countedAtOnce` units, in front of which one more stands.
Counted countBytes(UniChar const* units, CFIndex count) {
    Units8 extra = {};
    Units8 unpaired = {};
    CFIndex const left = forEachBlock(units, count, [&](UniChar const* block, Units8 counting) {
        auto const now = load<Units8>(block);
        extra += extraBytes(now) & counting;
        unpaired |= highSurrogates(load<Units8>(block - 1)) ^ lowSurrogates(now);
    });
    Counted counted = {count + sumOf(extra), clearLanes(unpaired) == 8};
    for (CFIndex i = count - left; i < count; ++i) {
        counted.bytes += extraBytes(units[i]);
        counted.paired &= isHighSurrogate(units[i - 1]) == isLowSurrogate(units[i]);
    }
    return counted;
}

} // namespace

Encoded writeUTF8(EncodeRequest const& request) noexcept {
    Writer writer(request);
    writer.writeAll();
    return writer.done();
}

Encoded measureUTF8(UniChar const* units, CFIndex count) noexcept {
    if (count == 0)
        return {0, 0};
    bool paired = !isLowSurrogate(units[0]) && !isHighSurrogate(units[count - 1]);
    CFIndex bytes = 1 + extraBytes(units[0]);
    for (CFIndex i = 1; i < count;) {
        CFIndex const ascii = clearFront(units + i, count - i, aboveAscii);
        CFIndex const rest = std::min(countedAtOnce, count - i - ascii);
        Counted const counted = countBytes(units + i + ascii, rest);
        bytes += ascii + counted.bytes;
        paired = paired && counted.paired && (ascii == 0 || !isHighSurrogate(units[i - 1]));
        i += ascii + rest;
    }
    return paired ? Encoded{count, bytes} : measureUTF8(units, pairedFront(units, count));
}

} // namespace CFPlatform
