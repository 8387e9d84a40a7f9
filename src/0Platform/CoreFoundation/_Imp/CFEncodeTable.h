/// The writing direction of a legacy encoding: which code the text at a place is written as.
///
///     EncodeTable table;
///     table.add(0x8E, u"\u00E9", 1);         // a code of one byte for a text of one unit
///     table.add(0x8791, u"\u5927\u20DD", 2); // a code of two bytes for a text of two
///     table.seal();
///     table.find(units, count);              // the code, and how many units it stands for
#ifndef QORN_0PLATFORM_CFENCODETABLE_H
#define QORN_0PLATFORM_CFENCODETABLE_H

#include <CoreFoundation/CFBase.h>

#include <cstddef>
#include <cstdlib>
#include <map>
#include <memory>
#include <vector>

namespace CFPlatform {

/// What a unit is written as. With its highest bit set it is a code: 80 and the byte, or the two
/// bytes of a longer one, the first of which is never 80. Without, the unit needs a closer look: it
/// is missing (0), or it may belong to a text of several units.
using EncodeCell = UInt16;

constexpr EncodeCell encodeMissing = 0;

inline EncodeCell cellOfByte(UInt8 byte) {
    return static_cast<EncodeCell>(0x8000U | byte);
}

inline bool isCode(EncodeCell cell) {
    return (cell & 0x8000U) != 0;
}

/// The number of bytes of a code.
inline CFIndex codeLength(EncodeCell code) {
    return code < 0x8100 ? 1 : 2;
}

/// What a text begins with: a code or encodeMissing, and the units that it stands for.
struct EncodeMatch {
    EncodeCell code;
    CFIndex units;
};

class EncodeTable {
  public:
    /// ASCII alone. Raises std::bad_alloc, as all that builds does.
    EncodeTable();

    /// Adds a text of one or more units. What would have ASCII units stand for other bytes, or
    /// ASCII bytes for other units, is left out, and so is a unit that is in the table already.
    /// Of the first two units of a longer text, one at least is 0100 or above.
    void add(UInt16 code, UniChar const* text, CFIndex length);

    /// Ends the building; without it, texts of several units are not found.
    void seal();

    /// The longest text of the table that `units`, of which there is at least one, begin with. A
    /// character that is missing has two units where it is a surrogate pair.
    EncodeMatch find(UniChar const* units, CFIndex count) const noexcept;

    /// The cells of all units. Where the cells of a unit and of the one behind it are codes, `find`
    /// gives that of the first.
    EncodeCell const* cells() const noexcept { return cells_.get(); }

  private:
    // A unit whose cell is no code but 1 and its index among these.
    struct Special {
        EncodeCell code; // of the unit alone
        bool begins;     // some longer text begins with it, and it is missing alone
        bool continues;  // the second unit of a longer text whose first one has a code alone
    };
    struct Candidate {
        EncodeCell code;
        UInt16 length;
        std::size_t text;
    };
    // The longer texts that begin with the same unit, the longest first.
    struct Group {
        UniChar start;
        std::size_t begin;
        std::size_t end;
    };
    struct Free {
        void operator()(EncodeCell* cells) const { std::free(cells); }
    };

    Special& makeSpecial(UniChar unit);
    Special specialOf(UniChar unit) const noexcept;
    Candidate const* findLonger(UniChar const* units, CFIndex count) const noexcept;

    // One for each of the 10000 units. It is zeroed memory fresh from the system, of which only
    // the pages that hold characters are ever real.
    std::unique_ptr<EncodeCell[], Free> cells_;
    std::vector<Special> specials_;
    std::vector<Group> groups_; // by their starts
    std::vector<Candidate> candidates_;
    std::vector<UniChar> text_;
    std::map<UniChar, std::vector<Candidate>> starts_; // until the building ends
};

} // namespace CFPlatform

#endif
