#include "0Platform/CoreFoundation/_Imp/CFCodecTable.h"
#include "0Platform/CoreFoundation/_Imp/CFCodecBlock.h"

#include <algorithm>
#include <limits>
#include <utility>

namespace CFPlatform {
namespace {

// Writes a code and returns its length. Of one byte, the first store is written over.
CFIndex writeCode(UInt8* bytes, EncodeCell code) {
    CFIndex const length = codeLength(code);
    bytes[0] = static_cast<UInt8>(code >> 8);
    bytes[length - 1] = static_cast<UInt8>(code);
    return length;
}

// The three roads of a block that is more than ASCII. Each goes through to the end before it looks
// whether every unit had a code, and returns the bytes, or 0 where one had none.

// Where all codes have one byte. There may be nowhere to write.
CFIndex encodeByteBlock(EncodeCell const* cells, UniChar const* units, UInt8* out) {
    UInt8 scratch[blockLength];
    UInt8* const bytes = out == nullptr ? scratch : out;
    EncodeCell all = 0xFFFF;
    for (CFIndex i = 0; i < blockLength; ++i) {
        EncodeCell const cell = cells[units[i]];
        all &= cell;
        bytes[i] = static_cast<UInt8>(cell);
    }
    return isCode(all) ? blockLength : 0;
}

// Where there is room for two bytes each.
CFIndex encodePairBlock(EncodeCell const* cells, UniChar const* units, UInt8* out) {
    EncodeCell all = 0xFFFF;
    UInt8* next = out;
    for (CFIndex i = 0; i < blockLength; ++i) {
        EncodeCell const cell = cells[units[i]];
        all &= cell;
        next += writeCode(next, cell);
    }
    return isCode(all) ? next - out : 0;
}

CFIndex measurePairBlock(EncodeCell const* cells, UniChar const* units) {
    EncodeCell all = 0xFFFF;
    CFIndex bytes = 0;
    for (CFIndex i = 0; i < blockLength; ++i) {
        EncodeCell const cell = cells[units[i]];
        all &= cell;
        bytes += codeLength(cell);
    }
    return isCode(all) ? bytes : 0;
}

} // namespace

TableCodec::TableCodec(DecodeTable const& decoding, EncodeTable&& encoding)
    : decoding_(decoding), encoding_(std::move(encoding)) {
    for (unsigned byte = 0; byte < 0x80; ++byte)
        cells_[byte] = static_cast<UInt16>(byte);
    std::copy(decoding.high, decoding.high + 0x80, cells_ + 0x80);

    unsigned direct = 0x80;
    while (direct < 0x100 && cells_[direct] == direct)
        ++direct;
    if (direct == 0x100)
        directLimit_ = direct;
    forEachCode(decoding, [this](UInt16 code, UniChar const*, CFIndex length) {
        unitsForTwoBytes_ = std::max(unitsForTwoBytes_, code < 0x100 ? 2 * length : length);
    });
}

CFIndex TableCodec::maximumUnits(UInt8 const*, CFIndex count) const noexcept {
    return (count * unitsForTwoBytes_ + 1) / 2;
}

CFIndex TableCodec::decode(UInt8 const* bytes, CFIndex count, UniChar* units) const noexcept {
    UInt8 const* const end = bytes + count;
    UniChar* out = units;
    while (bytes != end) {
        if (end - bytes >= blockLength && decodeBlock(bytes, out)) {
            bytes += blockLength;
            out += blockLength;
            continue;
        }
        // A code of two bytes may reach beyond the block, but not beyond the end.
        UInt8 const* const stop = bytes + std::min(blockLength, CFIndex(end - bytes));
        while (bytes < stop) {
            bytes = decodeCode(bytes, end, out);
            if (bytes == nullptr)
                return -1;
        }
    }
    return out - units;
}

// Reads a block in which each byte is one unit. False where it is not of this kind.
inline bool TableCodec::decodeBlock(UInt8 const* bytes, UniChar* units) const noexcept {
    if (directLimit_ == 0x100 || isAsciiBlock(bytes)) {
        widenBlock(bytes, units);
        return true;
    }
    if (decoding_.rows != nullptr)
        return false;
    bool marked = false;
    for (CFIndex i = 0; i < blockLength; ++i) {
        UInt16 const cell = cells_[bytes[i]];
        marked |= isCellMark(cell);
        units[i] = cell;
    }
    return !marked;
}

// Reads one code and returns where the next one begins, or null where it is malformed.
inline UInt8 const* TableCodec::decodeCode(UInt8 const* bytes, UInt8 const* end,
                                           UniChar*& units) const noexcept {
    UInt16 cell = cells_[*bytes];
    if (cell == cellLead) {
        if (end - bytes < 2)
            return nullptr;
        DecodeRow const row = decoding_.rows[bytes[0] - 0x80];
        unsigned const index = bytes[1] - static_cast<unsigned>(row.first);
        if (index >= row.count)
            return nullptr;
        cell = decoding_.cells[row.offset + index];
        ++bytes;
    }
    if (!isCellMark(cell)) {
        *units++ = cell;
        return bytes + 1;
    }
    units = decodeSequence(cell, units);
    return units == nullptr ? nullptr : bytes + 1;
}

// Writes the sequence behind a mark and returns the end of it, or null where there is none.
UniChar* TableCodec::decodeSequence(UInt16 mark, UniChar* units) const noexcept {
    if (mark < cellSequence)
        return nullptr;
    UInt16 const* const bounds = decoding_.sequences + (mark - cellSequence);
    return std::copy(decoding_.text + bounds[0], decoding_.text + bounds[1], units);
}

Encoded TableCodec::encode(EncodeRequest const& request) const noexcept {
    // With nowhere to write, there is no limit either.
    CFIndex const room =
        request.buffer == nullptr ? std::numeric_limits<CFIndex>::max() : request.room;
    Encoded done = {0, 0};
    CFIndex nextBlock = 0;
    while (done.units < request.count) {
        UniChar const* const units = request.units + done.units;
        CFIndex const left = request.count - done.units;
        UInt8* const out = request.buffer == nullptr ? nullptr : request.buffer + done.bytes;
        if (done.units >= nextBlock && left >= blockLength) {
            CFIndex const bytes = encodeBlock(units, left, out, room - done.bytes);
            if (bytes > 0) {
                done.units += blockLength;
                done.bytes += bytes;
                continue;
            }
            nextBlock = done.units + blockLength;
        }
        EncodeMatch match = encoding_.find(units, left);
        if (match.code == encodeMissing) {
            if (request.lossByte == 0)
                break;
            match.code = cellOfByte(request.lossByte);
        }
        if (codeLength(match.code) > room - done.bytes)
            break;
        if (out != nullptr)
            writeCode(out, match.code);
        done.units += match.units;
        done.bytes += codeLength(match.code);
    }
    return done;
}

// Writes a block in which each unit is a character of its own that the encoding has, or counts its
// bytes if there is nowhere to write. Returns 0 where the block is not of this kind or has no room.
CFIndex TableCodec::encodeBlock(UniChar const* units, CFIndex left, UInt8* out,
                                CFIndex room) const noexcept {
    EncodeCell const* const cells = encoding_.cells();
    // The last unit may belong to a longer text together with the one behind it.
    if (left > blockLength && !isCode(cells[units[blockLength]]))
        return 0;
    if (isBlockBelow(units, directLimit_)) {
        if (room < blockLength)
            return 0;
        if (out != nullptr)
            narrowBlock(units, out);
        return blockLength;
    }
    if (decoding_.rows == nullptr)
        return room < blockLength ? 0 : encodeByteBlock(cells, units, out);
    if (out != nullptr && room >= 2 * blockLength)
        return encodePairBlock(cells, units, out);
    CFIndex const bytes = measurePairBlock(cells, units);
    if (bytes == 0 || bytes > room)
        return 0;
    return out == nullptr ? bytes : encodePairBlock(cells, units, out);
}

} // namespace CFPlatform
