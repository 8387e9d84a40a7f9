// Comparison of two texts unit by unit. Order is by code point; a difference is folded away where
// it is one of case or, in the natural comparison, of accents and of the form of numbers.
//
// The result is that of the framework to the letter, which no collation order and no normal form
// gives: it is not always antisymmetric (a cluster's position is that of its first unit, so marks
// are skipped on one side only), and where one side folds a character against the middle of the
// other's cluster the two values count as equal. Callers sort by these answers, so the odd ones
// stay.

#include "0Platform/CoreFoundation/_Imp/CFStringCluster.h"
#include "0Platform/CoreFoundation/_Imp/CFStringEqualUnits.h"
#include "0Platform/CoreFoundation/_Imp/CFStringObject.h"

using namespace CFPlatform;

namespace {

template <class TValue>
CFComparisonResult order(TValue first, TValue second) {
    return first == second  ? kCFCompareEqualTo
           : first < second ? kCFCompareLessThan
                            : kCFCompareGreaterThan;
}

// One of the two texts: a position, and the cluster that stands there once it is folded. The
// position moves behind the folded character only when the cluster is used up.
class Side {
  public:
    explicit Side(UnitSpan const& text) : text_(text) {}

    bool isAtEnd() const { return position_ == text_.count; }
    bool isPending() const { return cluster_.isPending(); }
    CFIndex position() const { return position_; }

    // The next value of a pending cluster, or else the next unit.
    UInt32 value() const {
        return isPending() ? cluster_.value() : lowerAscii(text_.units[position_]);
    }

    // The same with surrogate pairs joined.
    UInt32 character() const {
        return isPending() ? cluster_.value() : lowerAscii(codePointAt(text_, position_));
    }

    bool isOnMark() const { return !isPending() && isMark(codePointAt(text_, position_)); }

    // Steps over what value() or character() gave.
    void step(UInt32 given) {
        if (!isPending()) {
            position_ += unitCount(given);
            return;
        }
        cluster_.step();
        if (!isPending())
            position_ += cluster_.unitsTaken();
    }

    // Folds the character at the position; false where that changes nothing.
    bool fold(Folding folding) { return cluster_.fold(character(), text_, position_, folding); }

    void skipMarks() {
        while (!isAtEnd() && isOnMark())
            step(character());
    }

    // The run of digits at the position without its leading zeros; steps behind it.
    UnitSpan takeNumber() {
        while (!isAtEnd() && text_.units[position_] == '0')
            ++position_;
        CFIndex const first = position_;
        while (!isAtEnd() && isDigit(text_.units[position_]))
            ++position_;
        return {text_.units + first, position_ - first};
    }

    // What lies ahead where no cluster is pending.
    UnitSpan rest() const { return {text_.units + position_, text_.count - position_}; }

    void skip(CFIndex units) { position_ += units; }

  private:
    UnitSpan text_;
    CFIndex position_ = 0;
    FoldedCluster cluster_;
};

// Of whatever length: without leading zeros the longer number is the greater.
CFComparisonResult compareNumbers(UnitSpan const& first, UnitSpan const& second) {
    if (first.count != second.count)
        return order(first.count, second.count);
    for (CFIndex i = 0; i < first.count; ++i)
        if (first.units[i] != second.units[i])
            return order(first.units[i], second.units[i]);
    return kCFCompareEqualTo;
}

class Comparison {
  public:
    Comparison(UnitSpan const& first, UnitSpan const& second, Folding folding)
        : first_(first), second_(second), folding_(folding) {}

    CFComparisonResult run() {
        CFComparisonResult result = kCFCompareEqualTo;
        while (result == kCFCompareEqualTo) {
            if (!first_.isPending() && !second_.isPending())
                skipEqualUnits();
            if (first_.isAtEnd() || second_.isAtEnd())
                break;
            result = compareNext();
        }
        return result == kCFCompareEqualTo ? compareRests() : result;
    }

  private:
    bool isNatural() const { return folding_ == Folding::caseAndAccents; }

    void skipEqualUnits() {
        CFIndex const equal = countEqualUnits(first_.rest(), second_.rest(), folding_);
        first_.skip(equal);
        second_.skip(equal);
    }

    CFComparisonResult compareNext() {
        UInt32 const first = first_.value();
        UInt32 const second = second_.value();
        if (isNatural() && isDigit(first) && isDigit(second) && !first_.isPending() &&
            !second_.isPending())
            return compareNumbers(first_.takeNumber(), second_.takeNumber());
        if (first != second)
            return compareDifferent();
        // Surrogates that are equal on both sides are stepped over one by one.
        first_.step(first);
        second_.step(second);
        return kCFCompareEqualTo;
    }

    CFComparisonResult compareDifferent() {
        if (first_.character() != second_.character()) {
            if (skipMarksWithin())
                return kCFCompareEqualTo;
            CFComparisonResult const result = foldDifferent();
            if (result != kCFCompareEqualTo)
                return result;
        }
        first_.step(first_.character());
        second_.step(second_.character());
        return compareClusters();
    }

    // A mark within the first text, or within the second beside it, says nothing.
    bool skipMarksWithin() {
        if (!isNatural() || first_.position() == 0)
            return false;
        bool const isFirst = first_.isOnMark();
        bool const isSecond = second_.isOnMark();
        if (isFirst)
            first_.step(first_.character());
        if (isSecond)
            second_.step(second_.character());
        return isFirst || isSecond;
    }

    CFComparisonResult foldDifferent() {
        bool const isInCluster = second_.isPending();
        if (!first_.isPending() && !first_.fold(folding_) && isInCluster)
            return order(first_.character(), second_.character());
        if (isInCluster || first_.character() == second_.character())
            return kCFCompareEqualTo;
        second_.fold(folding_);
        return order(first_.character(), second_.character());
    }

    // Where both have values left, one is used up in the end.
    CFComparisonResult compareClusters() {
        while (first_.isPending() && second_.isPending()) {
            UInt32 const first = first_.value();
            UInt32 const second = second_.value();
            if (first != second)
                return order(first, second);
            first_.step(first);
            second_.step(second);
        }
        return kCFCompareEqualTo;
    }

    CFComparisonResult compareRests() {
        if (isNatural()) {
            first_.skipMarks();
            second_.skipMarks();
        }
        return order(!first_.isAtEnd(), !second_.isAtEnd());
    }

    Side first_;
    Side second_;
    Folding folding_;
};

} // namespace

extern "C" CFComparisonResult CFStringCompareWithOptions(CFStringRef string1, CFStringRef string2,
                                                         CFRange range,
                                                         CFStringCompareFlags options) {
    Folding const folding = (options & kCFCompareDiacriticInsensitive) != 0
                                ? Folding::caseAndAccents
                                : Folding::caseOnly;
    return Comparison({string1->units + range.location, range.length},
                      {string2->units, string2->length}, folding)
        .run();
}
