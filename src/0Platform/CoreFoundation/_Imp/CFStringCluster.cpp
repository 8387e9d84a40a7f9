#include "0Platform/CoreFoundation/_Imp/CFStringCluster.h"

#include <unicode/uchar.h>
#include <unicode/unorm2.h>
#include <unicode/ustring.h>
#include <unicode/utf16.h>

#include <algorithm>
#include <cstdlib>
#include <cstring>

namespace CFPlatform {
namespace {

// The scripts before this code point are Latin, Greek and Cyrillic: only their letters lose marks.
constexpr UInt32 firstKeptBase = 0x0510;

// The first mark of all, and bounds around the characters whose decomposition begins before
// `firstKeptBase`; outside of them no property has to be looked up.
constexpr UInt32 firstMark = 0x0300;
constexpr UInt32 firstComposed = 0x00C0;
constexpr UInt32 lastComposed = 0x2FFF;

// The longest canonical decomposition and the longest case folding of one character, in units.
constexpr int32_t mappingCapacity = 8;

// Bounds around the characters whose case folding is longer than one character.
bool mayFoldToSeveral(UInt32 codePoint) {
    return codePoint >= 0xDF &&
           (codePoint <= 0x587 || (codePoint >= 0x1E96 && codePoint <= 0x1FFC) ||
            (codePoint >= 0xFB00 && codePoint <= 0xFB17));
}

// Writes the full canonical decomposition and returns its length; 0 without one.
int32_t decompose(UInt32 codePoint, UChar (&units)[mappingCapacity]) {
    UErrorCode status = U_ZERO_ERROR;
    UNormalizer2 const* const normalizer = unorm2_getNFDInstance(&status);
    if (U_FAILURE(status))
        return 0;
    int32_t const length = unorm2_getDecomposition(normalizer, static_cast<UChar32>(codePoint),
                                                   units, mappingCapacity, &status);
    return U_SUCCESS(status) && length > 0 ? length : 0;
}

// The Latin, Greek or Cyrillic letter that a composed character is built on; other characters are
// their own base (Hangul, kana, Hebrew and Arabic stay composed).
UInt32 baseOf(UInt32 codePoint) {
    if (codePoint < firstComposed || codePoint > lastComposed)
        return codePoint;
    UChar units[mappingCapacity];
    int32_t const length = decompose(codePoint, units);
    return length > 0 && units[0] < firstKeptBase ? units[0] : codePoint;
}

} // namespace

bool isMark(UInt32 codePoint) noexcept {
    return codePoint >= firstMark &&
           u_getIntPropertyValue(static_cast<UChar32>(codePoint), UCHAR_GRAPHEME_CLUSTER_BREAK) ==
               U_GCB_EXTEND;
}

bool FoldedCluster::fold(UInt32 character, UnitSpan const& text, CFIndex index,
                         Folding folding) noexcept {
    count_ = 0;
    next_ = 0;
    taken_ = unitCount(character);
    if (folding == Folding::caseOnly) {
        appendCaseFolded(character);
    } else {
        UInt32 const base = baseOf(character);
        appendCaseFolded(base);
        collectMarks(base, text, index + taken_);
    }
    if (count_ == 1 && values_[0] == character && taken_ == unitCount(character))
        count_ = 0;
    return count_ != 0;
}

void FoldedCluster::append(UInt32 value) noexcept {
    if (count_ == capacity_) {
        capacity_ *= 2;
        UInt32* const old = values_ == inline_ ? nullptr : values_;
        // NOLINTNEXTLINE(clang-analyzer-optin.portability.UnixAPI): the capacity is never 0
        void* const memory = std::realloc(old, static_cast<std::size_t>(capacity_) * sizeof(value));
        if (memory == nullptr)
            std::abort();
        values_ = static_cast<UInt32*>(memory);
        if (old == nullptr)
            std::memcpy(values_, inline_, sizeof(inline_));
    }
    values_[count_++] = value;
}

// Full, locale-free case folding (CaseFolding.txt of the Unicode character database, C and F).
void FoldedCluster::appendCaseFolded(UInt32 base) noexcept {
    if (!mayFoldToSeveral(base)) {
        append(static_cast<UInt32>(u_foldCase(static_cast<UChar32>(base), U_FOLD_CASE_DEFAULT)));
        return;
    }
    // All these characters and their foldings are single units.
    UChar const source = static_cast<UChar>(base);
    UChar folded[mappingCapacity];
    UErrorCode status = U_ZERO_ERROR;
    int32_t const length =
        u_strFoldCase(folded, mappingCapacity, &source, 1, U_FOLD_CASE_DEFAULT, &status);
    for (int32_t i = 0; i < length; ++i)
        append(folded[i]);
}

void FoldedCluster::appendDecomposed(UInt32 mark) noexcept {
    UChar units[mappingCapacity];
    int32_t const length = decompose(mark, units);
    if (length == 0)
        append(mark);
    for (int32_t i = 0; i < length;) {
        UChar32 codePoint;
        U16_NEXT(units, i, length, codePoint);
        append(static_cast<UInt32>(codePoint));
    }
}

// Takes the marks from `index` on: a Latin, Greek or Cyrillic base swallows them, any other keeps
// them in canonical order.
void FoldedCluster::collectMarks(UInt32 base, UnitSpan const& text, CFIndex index) noexcept {
    CFIndex const firstKept = count_;
    CFIndex const first = index;
    while (index < text.count) {
        UInt32 const mark = codePointAt(text, index);
        if (!isMark(mark))
            break;
        if (base >= firstKeptBase)
            appendDecomposed(mark);
        index += unitCount(mark);
    }
    taken_ += index - first;
    sortMarks(firstKept);
}

void FoldedCluster::sortMarks(CFIndex first) noexcept {
    auto const before = [](UInt32 a, UInt32 b) {
        return u_getCombiningClass(static_cast<UChar32>(a)) <
               u_getCombiningClass(static_cast<UChar32>(b));
    };
    if (!std::is_sorted(values_ + first, values_ + count_, before))
        std::stable_sort(values_ + first, values_ + count_, before);
}

} // namespace CFPlatform
