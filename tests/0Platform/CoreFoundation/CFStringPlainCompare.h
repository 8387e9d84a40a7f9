/// The rules of comparison one by one, with a property looked up for every character and nothing
/// stepped over in blocks or by table: the slow twin that the comparison is tested against.
///
///     plainCompare(u"stra\u00DFe", u"STRASSE", false);   // 0
#ifndef QORN_TESTS_CFSTRINGPLAINCOMPARE_H
#define QORN_TESTS_CFSTRINGPLAINCOMPARE_H

#include "support/PlatformString.h"

#include <unicode/uchar.h>
#include <unicode/unorm2.h>
#include <unicode/ustring.h>
#include <unicode/utf16.h>

#include <algorithm>
#include <string>

class CPlainCompare {
  public:
    CPlainCompare(std::u16string const& first, std::u16string const& second, bool natural)
        : a_{first, {}}, b_{second, {}}, natural_(natural) {}

    int run() {
        while (!a_.atEnd() && !b_.atEnd()) {
            int result = 0;
            if (next(result))
                return result;
        }
        if (natural_) {
            skipMarks(a_);
            skipMarks(b_);
        }
        return a_.atEnd() && b_.atEnd() ? 0 : b_.atEnd() ? 1 : -1;
    }

  private:
    struct CSide {
        std::u16string text;
        std::u32string pending;
        std::size_t position = 0;
        std::size_t consumed = 0;

        bool atEnd() const { return position >= text.size(); }
        char32_t unit() const { return pending.empty() ? lower(text[position]) : pending[0]; }
        char32_t character() const { return pending.empty() ? lower(at(position)) : pending[0]; }

        char32_t at(std::size_t index) const {
            UChar32 c = 0;
            U16_GET(text.data(), index, index, text.size(), c);
            return static_cast<char32_t>(c);
        }

        void drop(std::size_t units) {
            if (pending.empty()) {
                position += units;
                return;
            }
            pending.erase(0, 1);
            if (pending.empty())
                position += consumed;
        }
    };

    static char32_t lower(char32_t c) { return c >= U'A' && c <= U'Z' ? c + 32 : c; }
    static bool isDigit(char32_t c) { return c >= U'0' && c <= U'9'; }
    static bool isMark(char32_t c) {
        return u_getIntPropertyValue(static_cast<UChar32>(c), UCHAR_GRAPHEME_CLUSTER_BREAK) ==
               U_GCB_EXTEND;
    }
    static bool isOnMark(CSide const& side) {
        return side.pending.empty() && isMark(side.at(side.position));
    }
    static int order(char32_t a, char32_t b) { return a < b ? -1 : a > b ? 1 : 0; }

    static void skipMarks(CSide& side) {
        while (!side.atEnd() && isOnMark(side))
            side.position += U16_LENGTH(side.at(side.position));
    }

    static std::u32string codePoints(std::u16string const& units) {
        std::u32string text;
        for (std::size_t i = 0; i < units.size();) {
            UChar32 c = 0;
            U16_NEXT(units.data(), i, units.size(), c);
            text += static_cast<char32_t>(c);
        }
        return text;
    }

    static std::u32string decomposed(char32_t c) {
        UErrorCode status = U_ZERO_ERROR;
        std::u16string const source = TestSupport::unitsOfCodePoint(c);
        std::u16string target(32, u'\0');
        int32_t const length =
            unorm2_normalize(unorm2_getNFDInstance(&status), source.data(),
                             static_cast<int32_t>(source.size()), target.data(), 32, &status);
        return codePoints(target.substr(0, static_cast<std::size_t>(length)));
    }

    static std::u32string folded(char32_t c) {
        UErrorCode status = U_ZERO_ERROR;
        std::u16string const source = TestSupport::unitsOfCodePoint(c);
        std::u16string target(32, u'\0');
        int32_t const length =
            u_strFoldCase(target.data(), 32, source.data(), static_cast<int32_t>(source.size()),
                          U_FOLD_CASE_DEFAULT, &status);
        return codePoints(target.substr(0, static_cast<std::size_t>(length)));
    }

    static std::string takeNumber(CSide& side) {
        std::string digits;
        for (; !side.atEnd() && isDigit(side.text[side.position]); ++side.position)
            digits += static_cast<char>(side.text[side.position]);
        return digits.erase(0, digits.find_first_not_of('0'));
    }

    // False where the character stays what it is.
    bool fold(CSide& side) const {
        char32_t const character = side.character();
        char32_t base = character;
        if (natural_ && decomposed(character)[0] < 0x510)
            base = decomposed(character)[0];
        std::u32string cluster = folded(base);
        std::size_t const marks = cluster.size();
        std::size_t const length = U16_LENGTH(character);
        std::size_t end = side.position + length;
        while (natural_ && end < side.text.size() && isMark(side.at(end))) {
            if (base >= 0x510)
                cluster += decomposed(side.at(end));
            end += U16_LENGTH(side.at(end));
        }
        std::stable_sort(cluster.begin() + static_cast<std::ptrdiff_t>(marks), cluster.end(),
                         [](char32_t x, char32_t y) {
                             return u_getCombiningClass(static_cast<UChar32>(x)) <
                                    u_getCombiningClass(static_cast<UChar32>(y));
                         });
        side.consumed = end - side.position;
        if (cluster == std::u32string(1, character) && side.consumed == length)
            return false;
        side.pending = cluster;
        return true;
    }

    // True where `result` decides.
    bool next(int& result) {
        bool const free = a_.pending.empty() && b_.pending.empty();
        if (natural_ && free && isDigit(a_.unit()) && isDigit(b_.unit())) {
            std::string const x = takeNumber(a_);
            std::string const y = takeNumber(b_);
            result = x.size() != y.size() ? (x.size() < y.size() ? -1 : 1)
                     : x < y              ? -1
                     : x > y              ? 1
                                          : 0;
            return result != 0;
        }
        if (a_.unit() == b_.unit()) {
            a_.drop(1);
            b_.drop(1);
            return false;
        }
        return differ(result);
    }

    bool differ(int& result) {
        if (a_.character() != b_.character()) {
            if (natural_ && a_.position > 0 && (isOnMark(a_) || isOnMark(b_))) {
                bool const skipA = isOnMark(a_);
                bool const skipB = isOnMark(b_);
                if (skipA)
                    a_.position += U16_LENGTH(a_.at(a_.position));
                if (skipB)
                    b_.position += U16_LENGTH(b_.at(b_.position));
                return false;
            }
            if (a_.pending.empty() && !fold(a_) && !b_.pending.empty()) {
                result = order(a_.character(), b_.character());
                return true;
            }
            if (b_.pending.empty() && a_.character() != b_.character()) {
                fold(b_);
                result = order(a_.character(), b_.character());
                if (result != 0)
                    return true;
            }
        }
        a_.drop(U16_LENGTH(a_.character()));
        b_.drop(U16_LENGTH(b_.character()));
        while (!a_.pending.empty() && !b_.pending.empty()) {
            result = order(a_.pending[0], b_.pending[0]);
            if (result != 0)
                return true;
            a_.drop(1);
            b_.drop(1);
        }
        return false;
    }

    CSide a_;
    CSide b_;
    bool natural_;
};

inline int plainCompare(std::u16string const& a, std::u16string const& b, bool natural) {
    return CPlainCompare(a, b, natural).run();
}

#endif
