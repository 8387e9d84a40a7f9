#include "0Platform/CoreFoundation/_Imp/CFEncodeTable.h"
#include "0Platform/CoreFoundation/_Imp/CFUnicode.h"

#include <algorithm>
#include <new>

namespace CFPlatform {

EncodeTable::EncodeTable()
    : cells_(static_cast<EncodeCell*>(std::calloc(0x10000, sizeof(EncodeCell)))) {
    if (cells_ == nullptr)
        throw std::bad_alloc();
    for (UInt8 byte = 0; byte < 0x80; ++byte)
        cells_[byte] = cellOfByte(byte);
}

void EncodeTable::add(UInt16 code, UniChar const* text, CFIndex length) {
    if (code < 0x80)
        return;
    EncodeCell const cell = code < 0x100 ? cellOfByte(static_cast<UInt8>(code)) : code;
    if (length > 1) {
        starts_[text[0]].push_back({cell, static_cast<UInt16>(length), text_.size()});
        text_.insert(text_.end(), text, text + length);
    } else if (cells_[text[0]] == encodeMissing) {
        cells_[text[0]] = cell;
    }
}

void EncodeTable::seal() {
    for (auto& [start, candidates] : starts_) {
        std::stable_sort(candidates.begin(), candidates.end(),
                         [](auto const& a, auto const& b) { return a.length > b.length; });
        std::size_t const begin = candidates_.size();
        candidates_.insert(candidates_.end(), candidates.begin(), candidates.end());
        groups_.push_back({start, begin, candidates_.size()});
        // One special unit is enough to have a longer text looked for. The first one is it only
        // where it is missing anyhow: a letter that can bear an accent stays an ordinary one.
        if (specialOf(start).code == encodeMissing) {
            makeSpecial(start).begins = true;
        } else {
            for (Candidate const& candidate : candidates)
                makeSpecial(text_[candidate.text + 1]).continues = true;
        }
    }
    starts_.clear();
}

EncodeTable::Special& EncodeTable::makeSpecial(UniChar unit) {
    EncodeCell& cell = cells_[unit];
    if (cell == encodeMissing || isCode(cell)) {
        specials_.push_back({cell, false, false});
        cell = static_cast<EncodeCell>(specials_.size());
    }
    return specials_[cell - 1U];
}

EncodeTable::Special EncodeTable::specialOf(UniChar unit) const noexcept {
    EncodeCell const cell = cells_[unit];
    if (cell == encodeMissing || isCode(cell))
        return {cell, false, false};
    return specials_[cell - 1U];
}

EncodeMatch EncodeTable::find(UniChar const* units, CFIndex count) const noexcept {
    Special const first = specialOf(units[0]);
    if (first.begins || (count > 1 && specialOf(units[1]).continues)) {
        Candidate const* const longer = findLonger(units, count);
        if (longer != nullptr)
            return {longer->code, longer->length};
    }
    if (first.code == encodeMissing && isPairAt(units, count, 0))
        return {encodeMissing, 2};
    return {first.code, 1};
}

EncodeTable::Candidate const* EncodeTable::findLonger(UniChar const* units,
                                                      CFIndex count) const noexcept {
    auto const group =
        std::lower_bound(groups_.begin(), groups_.end(), units[0],
                         [](Group const& entry, UniChar start) { return entry.start < start; });
    if (group == groups_.end() || group->start != units[0])
        return nullptr;
    for (std::size_t i = group->begin; i < group->end; ++i) {
        Candidate const& candidate = candidates_[i];
        if (candidate.length <= count &&
            std::equal(units, units + candidate.length, text_.data() + candidate.text))
            return &candidate;
    }
    return nullptr;
}

} // namespace CFPlatform
