#include "0Platform/CoreFoundation/_Imp/CFStringEqualUnits.h"

#include <algorithm>

namespace CFPlatform {
namespace {

constexpr CFIndex blockSize = 8;

// Latin, Greek, Cyrillic and Armenian: the scripts with case that texts are mostly written in.
constexpr UInt32 tableSize = 0x0600;

// What the first units fold to when no mark follows. A unit whose folding is longer, and a mark,
// which is not folded but skipped, stand for themselves and so are equal to nothing else.
class FoldTable {
  public:
    explicit FoldTable(Folding folding) noexcept {
        for (UInt32 unit = 0; unit < tableSize; ++unit) {
            isMark_[unit] = isMark(unit);
            units_[unit] = isMark_[unit] && folding == Folding::caseAndAccents
                               ? static_cast<UniChar>(unit)
                               : foldedUnit(static_cast<UniChar>(lowerAscii(unit)), folding);
        }
    }

    UniChar operator[](UniChar unit) const { return unit < tableSize ? units_[unit] : unit; }

    // Units beyond the table count as marks until they are looked up.
    bool mayBeMark(UniChar unit) const { return unit >= tableSize || isMark_[unit]; }

    static FoldTable const& ofCase() noexcept {
        static FoldTable const table(Folding::caseOnly);
        return table;
    }

    static FoldTable const& ofCaseAndAccents() noexcept {
        static FoldTable const table(Folding::caseAndAccents);
        return table;
    }

  private:
    static UniChar foldedUnit(UniChar unit, Folding folding) noexcept {
        FoldedCluster cluster;
        if (!cluster.fold(unit, {&unit, 1}, 0, folding))
            return unit;
        UInt32 const value = cluster.value();
        cluster.step();
        return cluster.isPending() ? unit : static_cast<UniChar>(value);
    }

    UniChar units_[tableSize];
    bool isMark_[tableSize];
};

// The following work on one block each, in 16-bit arithmetic, so that they become vector code.

UniChar lowerUnit(UniChar unit) {
    bool const isUpper = static_cast<UniChar>(unit - 'A') <= 'Z' - 'A';
    return static_cast<UniChar>(unit | isUpper << 5);
}

bool isBlockEqual(UniChar const* first, UniChar const* second) {
    UniChar different = 0;
    for (CFIndex i = 0; i < blockSize; ++i)
        different = static_cast<UniChar>(different | (lowerUnit(first[i]) ^ lowerUnit(second[i])));
    return different == 0;
}

bool hasDigit(UniChar const* units) {
    UniChar found = 0;
    for (CFIndex i = 0; i < blockSize; ++i)
        found = static_cast<UniChar>(found | (static_cast<UniChar>(units[i] - '0') <= 9));
    return found != 0;
}

bool isBlockCaseEqual(FoldTable const& table, UniChar const* first, UniChar const* second) {
    int different = 0;
    for (CFIndex i = 0; i < blockSize; ++i)
        different |= table[first[i]] ^ table[second[i]];
    return different == 0;
}

CFIndex countCaseEqual(UniChar const* first, UniChar const* second, CFIndex count) {
    FoldTable const& table = FoldTable::ofCase();
    CFIndex i = 0;
    while (count - i >= blockSize &&
           (isBlockEqual(first + i, second + i) || isBlockCaseEqual(table, first + i, second + i)))
        i += blockSize;
    while (i < count && table[first[i]] == table[second[i]])
        ++i;
    return i;
}

// True where both units are stepped over alone. Units that only fold to the same take the marks
// behind them along, so there must be none, on neither side.
bool isNaturallyEqual(FoldTable const& table, UniChar const* first, UniChar const* second) {
    if (table[first[0]] != table[second[0]] || isDigit(first[0]))
        return false;
    return lowerUnit(first[0]) == lowerUnit(second[0]) ||
           !(table.mayBeMark(first[1]) || table.mayBeMark(second[1]));
}

// Leaves the last unit, behind which there is nothing to look at.
CFIndex countNaturallyEqual(UniChar const* first, UniChar const* second, CFIndex count) {
    FoldTable const& table = FoldTable::ofCaseAndAccents();
    CFIndex i = 0;
    while (count - i >= blockSize && isBlockEqual(first + i, second + i) && !hasDigit(first + i))
        i += blockSize;
    while (i + 1 < count && isNaturallyEqual(table, first + i, second + i))
        ++i;
    return i;
}

} // namespace

CFIndex countEqualUnits(UnitSpan const& first, UnitSpan const& second, Folding folding) noexcept {
    CFIndex const count = std::min(first.count, second.count);
    return folding == Folding::caseOnly ? countCaseEqual(first.units, second.units, count)
                                        : countNaturallyEqual(first.units, second.units, count);
}

} // namespace CFPlatform
