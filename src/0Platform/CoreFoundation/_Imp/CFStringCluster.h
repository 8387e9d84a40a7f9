/// Folding one character for comparison: the character with the marks behind it becomes a cluster
/// of values that compare in its place.
#ifndef QORN_0PLATFORM_CFSTRINGCLUSTER_H
#define QORN_0PLATFORM_CFSTRINGCLUSTER_H

#include "0Platform/CoreFoundation/_Imp/CFUnicode.h"

#include <CoreFoundation/CFString.h>

#include <cstdlib>

namespace CFPlatform {

/// Units of a text that are looked at, not owned.
struct UnitSpan {
    UniChar const* units;
    CFIndex count;
};

/// What a comparison disregards.
enum class Folding {
    caseOnly,      ///< case
    caseAndAccents ///< case, and the marks of Latin, Greek and Cyrillic letters
};

/// The code point that starts at `index`; an unpaired surrogate is one of its own.
inline UInt32 codePointAt(UnitSpan const& text, CFIndex index) {
    return isPairAt(text.units, text.count, index)
               ? joinPair(text.units[index], text.units[index + 1])
               : text.units[index];
}

inline CFIndex unitCount(UInt32 codePoint) {
    return codePoint < 0x10000U ? 1 : 2;
}

inline bool isDigit(UInt32 value) {
    return value - '0' <= 9;
}

/// A to Z become a to z.
inline UInt32 lowerAscii(UInt32 value) {
    return value - 'A' <= 'Z' - 'A' ? value + ('a' - 'A') : value;
}

/// True for a character that extends the grapheme cluster before it (Unicode Standard Annex #29,
/// Grapheme_Cluster_Break=Extend).
bool isMark(UInt32 codePoint) noexcept;

/// A folded character. It is pending while values of it are left.
class FoldedCluster {
  public:
    // cppcheck-suppress uninitMemberVar ; filling the room would cost more than most foldings
    FoldedCluster() noexcept {}
    ~FoldedCluster() {
        if (values_ != inline_)
            std::free(values_);
    }
    FoldedCluster(FoldedCluster const&) = delete;
    FoldedCluster& operator=(FoldedCluster const&) = delete;

    bool isPending() const { return next_ != count_; }
    UInt32 value() const { return values_[next_]; }
    void step() { ++next_; }

    /// The units that the folded character and the marks collected with it take up.
    CFIndex unitsTaken() const { return taken_; }

    /// Folds `character`, which stands at `index` of `text`; ASCII letters come in lower case.
    /// Returns false, and nothing is pending then, where folding leaves it as it is.
    bool fold(UInt32 character, UnitSpan const& text, CFIndex index, Folding folding) noexcept;

  private:
    void append(UInt32 value) noexcept;
    void appendDecomposed(UInt32 mark) noexcept;
    void appendCaseFolded(UInt32 base) noexcept;
    void collectMarks(UInt32 base, UnitSpan const& text, CFIndex index) noexcept;
    void sortMarks(CFIndex first) noexcept;

    // Room for the longest folding and a handful of marks; more go to the heap.
    static constexpr CFIndex inlineCapacity_ = 16;

    UInt32 inline_[inlineCapacity_];
    UInt32* values_ = inline_;
    CFIndex capacity_ = inlineCapacity_;
    CFIndex count_ = 0;
    CFIndex next_ = 0;
    CFIndex taken_ = 0;
};

} // namespace CFPlatform

#endif
