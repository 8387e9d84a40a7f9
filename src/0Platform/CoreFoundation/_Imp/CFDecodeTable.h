/// The reading direction of a legacy encoding: which units its one- and two-byte codes stand for.
///
/// ASCII bytes stand for themselves in every encoding, so a table begins at byte 80.
#ifndef QORN_0PLATFORM_CFDECODETABLE_H
#define QORN_0PLATFORM_CFDECODETABLE_H

#include <CoreFoundation/CFBase.h>

namespace CFPlatform {

/// A cell holds the one unit that a code stands for. What is no such unit has a mark out of the
/// range of the surrogates, which no code of these encodings stands for.
enum : UInt16 {
    cellUnassigned = 0xD800,
    cellLead = 0xD801,     // the first byte of a code of two
    cellSequence = 0xD802, // sequence 0; the ones up to DFFF are sequences 1, 2 ...
    cellLastMark = 0xDFFF
};

inline bool isCellMark(UInt16 cell) {
    return cell >= cellUnassigned && cell <= cellLastMark;
}

/// The codes of one lead byte: those with the second bytes `first` to `first + count - 1`.
struct DecodeRow {
    UInt16 offset; // of the first one's cell
    UInt8 first;
    UInt8 count;
};

/// Plain data, so that generated tables can be constants in read-only memory.
struct DecodeTable {
    UInt16 const* high;      // cells of the bytes 80 to FF
    DecodeRow const* rows;   // of the bytes 80 to FF; null where no byte leads
    UInt16 const* cells;     // what the rows point into
    UInt16 const* sequences; // sequence i is text[sequences[i]] to text[sequences[i + 1] - 1]
    UniChar const* text;
};

/// Calls visit(code, units, number of units) for each assigned code. A code of two bytes has its
/// first byte in front (hexadecimal 8140).
template <class TVisit>
void forEachCode(DecodeTable const& table, TVisit visit) {
    auto const visitCell = [&](unsigned code, UInt16 cell) {
        if (!isCellMark(cell)) {
            visit(static_cast<UInt16>(code), &cell, CFIndex(1));
        } else if (cell >= cellSequence) {
            UInt16 const* const bounds = table.sequences + (cell - cellSequence);
            visit(static_cast<UInt16>(code), table.text + bounds[0],
                  CFIndex(bounds[1] - bounds[0]));
        }
    };
    for (unsigned byte = 0x80; byte < 0x100; ++byte) {
        UInt16 const cell = table.high[byte - 0x80];
        visitCell(byte, cell);
        if (cell != cellLead)
            continue;
        DecodeRow const& row = table.rows[byte - 0x80];
        for (unsigned i = 0; i < row.count; ++i)
            visitCell(byte << 8 | (row.first + i), table.cells[row.offset + i]);
    }
}

} // namespace CFPlatform

#endif
