#include "1Base/Encoding/EncodingUTF8.h"

#include "1Base/Error/ErrorMacros.h"

namespace Encoding {
namespace {

// A lead byte's mask and pattern, its payload, and how many continuation bytes it calls for.
struct CLead {
    unsigned char mask;
    unsigned char pattern;
    unsigned char payload;
    int owed;
};

// Bytes that fit no row (stray continuations, FC to FF) are skipped without a word.
constexpr CLead leads[] = {{0x80, 0x00, 0x7F, 0},
                           {0xE0, 0xC0, 0x1F, 1},
                           {0xF0, 0xE0, 0x0F, 2},
                           {0xF8, 0xF0, 0x07, 3},
                           {0xFC, 0xF8, 0x03, 4}};

// Begins a sequence in `text` and returns the number of continuation bytes owed.
int beginSequence(Strings::stringUTF32& text, unsigned char byte) {
    for (CLead const& lead : leads) {
        if ((byte & lead.mask) == lead.pattern) {
            text.push_back(static_cast<wchar_t>(byte & lead.payload));
            return lead.owed;
        }
    }
    return 0;
}

} // namespace

Strings::stringUTF32 convertUTF8ToUTF32(Strings::stringUTF8 const& source) {
    Strings::stringUTF32 ret;
    ret.reserve(source.size());
    int owed = 0;
    for (char const narrow : source) {
        auto const cutf8 = static_cast<unsigned char>(narrow);
        if (owed == 0) {
            owed = beginSequence(ret, cutf8);
            continue;
        }
        ERROR_ASSERT(!ret.empty());
        ERROR_ASSERT(0x80 == (0xc0 & cutf8));
        ret.back() =
            static_cast<wchar_t>((static_cast<unsigned int>(ret.back()) << 6) | (cutf8 & 0x3FU));
        --owed;
    }
    return ret;
}

} // namespace Encoding
