#include "0Platform/CoreFoundation/_Imp/CFVector.h"
#include "0Platform/CoreFoundation/_Imp/CFCodecUTF8.h"
#include "0Platform/CoreFoundation/_Imp/CFUnicode.h"

namespace CFPlatform {
namespace {

bool isContinuation(UInt8 byte) {
    return (byte & 0xC0) == 0x80;
}

// Reads the sequence of two or more bytes in front. Returns its length, or 0 where it is malformed.
CFIndex readSequence(UInt8 const* bytes, CFIndex left, UInt32& codePoint) {
    UInt8 const lead = bytes[0];
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

class Reader {
  public:
    Reader(UInt8 const* bytes, CFIndex count, UniChar* units)
        : bytes_(bytes), end_(bytes + count), units_(units) {}

    // One sequence after another. Neighbours mostly have the same length, so each length has a
    // road that takes a run of its sequences in blocks. A road ends before what is of another
    // length or malformed, and before the last few bytes of the text.
    bool readAll() {
        for (;;) {
            readOnes();
            if (bytes_ == end_)
                return true;
            UInt32 codePoint;
            CFIndex const length = readSequence(bytes_, end_ - bytes_, codePoint);
            if (length == 0)
                return false;
            advance(length, putCodePoint(units_, codePoint));
            if (length == 2)
                readTwos();
            else if (length == 3)
                readThrees();
            else
                readFours();
        }
    }

    UniChar* units() const { return units_; }

  private:
    void advance(CFIndex bytes, CFIndex units) {
        bytes_ += bytes;
        units_ += units;
    }

    // True where a block of `bytes` is left and a run goes on: its sequences begin with `lead` or
    // more. The third one is asked as well, since a block costs as much as two single sequences.
    bool startsRun(CFIndex bytes, CFIndex length, UInt8 lead) const {
        return end_ - bytes_ >= bytes && bytes_[0] >= lead && bytes_[2 * length] >= lead;
    }

    void readOnes() {
        while (end_ - bytes_ >= 16 && bytes_[0] < 0x80) {
            store(units_, __builtin_convertvector(load<Bytes8>(bytes_), Units8));
            store(units_ + 8, __builtin_convertvector(load<Bytes8>(bytes_ + 8), Units8));
            auto const low = load<std::uint64_t>(bytes_) & 0x8080808080808080U;
            auto const high = load<std::uint64_t>(bytes_ + 8) & 0x8080808080808080U;
            if ((low | high) != 0) {
                CFIndex const good = low != 0 ? clearBytes(low) : 8 + clearBytes(high);
                advance(good, good);
                return;
            }
            advance(16, 16);
        }
        for (; bytes_ != end_ && bytes_[0] < 0x80; advance(1, 1))
            units_[0] = bytes_[0];
    }

    void readTwos() {
        while (startsRun(16, 2, 0xC0)) {
            auto const pairs = load<Units8>(bytes_);
            Units8 const units = (pairs & 0x1F) << 6 | (pairs >> 8 & 0x3F);
            store(units_, units);
            Units8 const wrong = ((pairs & 0xC0E0) ^ 0x80C0) | zero(units & 0x780);
            CFIndex const good = clearLanes(wrong);
            advance(2 * good, good);
            if (good < 8)
                return;
        }
    }

    void readThrees() {
        while (startsRun(24, 3, 0xE0)) {
            auto const at = [this](CFIndex index) { return load<UInt16>(bytes_ + index); };
            Units8 const front = {at(0), at(3), at(6), at(9), at(12), at(15), at(18), at(21)};
            Units8 const back = {at(1), at(4), at(7), at(10), at(13), at(16), at(19), at(22)};
            Units8 const units = front << 12 | (front >> 2 & 0xFC0) | (back >> 8 & 0x3F);
            store(units_, units);
            Units8 const wrong = ((front & 0xC0F0) ^ 0x80E0) | ((back & 0xC000) ^ 0x8000) |
                                 zero(units & 0xF800) | surrogates(units);
            CFIndex const good = clearLanes(wrong);
            advance(3 * good, good);
            if (good < 8)
                return;
        }
    }

    void readFours() {
        while (startsRun(16, 4, 0xF0)) {
            auto const quads = load<Words4>(bytes_);
            Words4 const beyond = ((quads & 0x07) << 18 | (quads & 0x3F00) << 4 |
                                   (quads >> 10 & 0xFC0) | (quads >> 24 & 0x3F)) -
                                  0x10000;
            store(units_, splitPairs(beyond));
            Words4 const wrong = ((quads & 0xC0C0C0F8U) ^ 0x808080F0U) | beyond >> 20;
            CFIndex const good = clearLanes(wrong);
            advance(4 * good, 2 * good);
            if (good < 4)
                return;
        }
    }

    UInt8 const* bytes_;
    UInt8 const* const end_;
    UniChar* units_;
};

} // namespace

CFIndex readUTF8(UInt8 const* bytes, CFIndex count, UniChar* units) noexcept {
    Reader reader(bytes, count, units);
    return reader.readAll() ? reader.units() - units : -1;
}

} // namespace CFPlatform
