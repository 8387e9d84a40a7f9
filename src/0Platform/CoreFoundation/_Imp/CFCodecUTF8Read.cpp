#include "0Platform/CoreFoundation/_Imp/CFCodecUTF8.h"
#include "0Platform/CoreFoundation/_Imp/CFCursor.h"
#include "0Platform/CoreFoundation/_Imp/CFUnicode.h"
#include "0Platform/CoreFoundation/_Imp/CFVector.h"

namespace CFPlatform {
namespace {

bool isContinuation(UInt8 byte) {
    return (byte & 0xC0) == 0x80;
}

// Reads the sequence in front. Returns its length, or 0 where it is malformed.
CFIndex readSequence(UInt8 const* bytes, CFIndex left, UInt32& codePoint) {
    UInt8 const lead = bytes[0];
    if (lead < 0x80) {
        codePoint = lead;
        return 1;
    }
    if (lead < 0xC2)
        return 0;
    if (lead < 0xE0) {
        if (left < 2 || !isContinuation(bytes[1]))
            return 0;
        codePoint = (lead & 0x1FU) << 6 | (bytes[1] & 0x3FU);
        return 2;
    }
    if (lead < 0xF0) {
        if (left < 3 || !isContinuation(bytes[1]) || !isContinuation(bytes[2]))
            return 0;
        codePoint = (lead & 0x0FU) << 12 | (bytes[1] & 0x3FU) << 6 | (bytes[2] & 0x3FU);
        return codePoint < 0x800U || isSurrogate(codePoint) ? 0 : 3;
    }
    if (lead > 0xF4 || left < 4 || !isContinuation(bytes[1]) || !isContinuation(bytes[2]) ||
        !isContinuation(bytes[3]))
        return 0;
    codePoint = (lead & 0x07U) << 18 | (bytes[1] & 0x3FU) << 12 | (bytes[2] & 0x3FU) << 6 |
                (bytes[3] & 0x3FU);
    return codePoint < 0x10000U || codePoint > 0x10FFFFU ? 0 : 4;
}

constexpr std::uint64_t everyByte = 0x0101010101010101U;

class Reader : private DecodeCursor {
  public:
    using DecodeCursor::DecodeCursor;
    using DecodeCursor::written;

    // One sequence after another. Neighbours mostly have the same length, so each length has a
    // road that takes a run of its sequences in blocks. A road ends before what is of another
    // length or malformed, and before the last few bytes of the text.
    bool readAll() {
        for (;;) {
            readRun();
            if (bytes == end)
                return true;
            UInt32 codePoint;
            CFIndex const length = readSequence(bytes, end - bytes, codePoint);
            if (length == 0)
                return false;
            advance(length, putCodePoint(units, codePoint));
        }
    }

  private:
    void readRun() {
        if (!has(8))
            return;
        if (bytes[0] < 0xE0)
            readOnesAndTwos();
        else if (bytes[0] < 0xF0)
            readThrees();
        else
            readFours();
    }

    // True where a block of `count` bytes is left and a run goes on: its sequences begin with
    // `lead` or more. The third one is asked as well, since a block costs as much as two single
    // sequences.
    bool startsRun(CFIndex count, CFIndex length, UInt8 lead) const {
        return has(count) && bytes[0] >= lead && bytes[2 * length] >= lead;
    }

    void readOnes() {
        while (has(16)) {
            auto const low = load<std::uint64_t>(bytes);
            auto const high = load<std::uint64_t>(bytes + 8);
            if (((low | high) & 0x8080808080808080U) != 0)
                return;
            store(units, widen(low));
            store(units + 8, widen(high));
            advance(16, 16);
        }
    }

    // Accented text mixes these two in no order, so which one comes next must not be asked by a
    // branch. Each byte gives a unit, with the one before it if it is a continuation, and those of
    // the leads do not count.
    void readOnesAndTwos() {
        for (readOnes(); has(8); readOnes()) {
            auto const eight = load<std::uint64_t>(bytes);
            if (hasLongLead(eight))
                return;
            Units8 const now = widen(eight);
            Units8 const before = widen(eight << 8);
            Units8 const seconds = zero((now & 0xC0) ^ 0x80);
            Units8 const firsts = zero((before & 0xE0) ^ 0xC0);
            Units8 const overlong = zero((before & 0xFE) ^ 0xC0);
            if (clearLanes((seconds ^ firsts) | overlong) < 8)
                return;
            Units8 const joined = (before & 0x1F) << 6 | (now & 0x3F);
            Units8 const block = (now & ~seconds) | (joined & seconds);
            // Byte by byte, how many units stand up to and with this one: the product adds up the
            // bytes that are no lead.
            std::uint64_t const leads = eight >> 7 & eight >> 6 & everyByte;
            std::uint64_t const counts = (leads ^ everyByte) * everyByte;
            store(units, block[0]);
            for (int i = 1; i < 8; ++i)
                store(units + (counts >> (8 * i - 8) & 0xFF), block[i]);
            // A lead at the end is left for the next block.
            advance(8 - static_cast<CFIndex>(leads >> 56), static_cast<CFIndex>(counts >> 56));
        }
    }

    // True where one of eight bytes leads a sequence of more than two.
    static bool hasLongLead(std::uint64_t eight) {
        return (eight & eight << 1 & eight << 2 & 0x8080808080808080U) != 0;
    }

    void readThrees() {
        for (; startsRun(24, 3, 0xE0); advance(24, 8)) {
            auto const at = [this](CFIndex index) { return load<UInt16>(bytes + index); };
            Units8 const front = {at(0), at(3), at(6), at(9), at(12), at(15), at(18), at(21)};
            Units8 const back = {at(1), at(4), at(7), at(10), at(13), at(16), at(19), at(22)};
            Units8 const block = front << 12 | (front >> 2 & 0xFC0) | (back >> 8 & 0x3F);
            store(units, block);
            CFIndex const good =
                clearLanes(((front & 0xC0F0) ^ 0x80E0) | ((back & 0xC000) ^ 0x8000) |
                           zero(block & 0xF800) | surrogates(block));
            if (good < 8)
                return advance(3 * good, good);
        }
    }

    void readFours() {
        for (; startsRun(16, 4, 0xF0); advance(16, 8)) {
            auto const quads = load<Words4>(bytes);
            Words4 const beyond = ((quads & 0x07) << 18 | (quads & 0x3F00) << 4 |
                                   (quads >> 10 & 0xFC0) | (quads >> 24 & 0x3F)) -
                                  0x10000;
            store(units, splitPairs(beyond));
            CFIndex const good = clearLanes(((quads & 0xC0C0C0F8U) ^ 0x808080F0U) | beyond >> 20);
            if (good < 4)
                return advance(4 * good, 2 * good);
        }
    }
};

} // namespace

CFIndex readUTF8(UInt8 const* bytes, CFIndex count, UniChar* units) noexcept {
    Reader reader(bytes, count, units);
    return reader.readAll() ? reader.written() : -1;
}

} // namespace CFPlatform
