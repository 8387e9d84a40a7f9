// The two Western encodings whose bytes from A0 on are the code points themselves: ISO 8859-1, of
// which that is true of 80 to 9F as well, and Windows code page 1252.

#include "0Platform/CoreFoundation/_Imp/CFCodecTableMaker.h"

#include <array>
#include <cstddef>

namespace CFPlatform {
namespace {

using HighCells = std::array<UInt16, 0x80>;

constexpr HighCells makeISOLatin1() {
    HighCells cells{};
    for (std::size_t i = 0; i < cells.size(); ++i)
        cells[i] = static_cast<UInt16>(0x80 + i);
    return cells;
}

constexpr UInt16 none = cellUnassigned;

constexpr HighCells makeWindowsLatin1() {
    constexpr UInt16 own[0x20] = {0x20AC, none,   0x201A, 0x0192, 0x201E, 0x2026, 0x2020, 0x2021,
                                  0x02C6, 0x2030, 0x0160, 0x2039, 0x0152, none,   0x017D, none,
                                  none,   0x2018, 0x2019, 0x201C, 0x201D, 0x2022, 0x2013, 0x2014,
                                  0x02DC, 0x2122, 0x0161, 0x203A, 0x0153, none,   0x017E, 0x0178};
    HighCells cells = makeISOLatin1();
    for (std::size_t i = 0; i < 0x20; ++i)
        cells[i] = own[i];
    return cells;
}

constexpr HighCells highISOLatin1 = makeISOLatin1();
constexpr HighCells highWindowsLatin1 = makeWindowsLatin1();

} // namespace

DecodeTable const tableISOLatin1 = {highISOLatin1.data(), nullptr, nullptr, nullptr, nullptr};
DecodeTable const tableWindowsLatin1 = {highWindowsLatin1.data(), nullptr, nullptr, nullptr,
                                        nullptr};

} // namespace CFPlatform
