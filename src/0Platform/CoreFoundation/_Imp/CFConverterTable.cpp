#include "0Platform/CoreFoundation/_Imp/CFConverterTable.h"
#include "0Platform/CoreFoundation/_Imp/CFUnicode.h"

#include <unicode/ucnv.h>
#include <unicode/uset.h>

namespace CFPlatform {
namespace {

struct ConverterCloser {
    void operator()(UConverter* converter) const { ucnv_close(converter); }
};
struct SetCloser {
    void operator()(USet* set) const { uset_close(set); }
};
using ConverterOwner = std::unique_ptr<UConverter, ConverterCloser>;
using SetOwner = std::unique_ptr<USet, SetCloser>;

// The second bytes that codes of two bytes have, in any encoding.
constexpr unsigned firstTrail = 0x30;
constexpr unsigned trailCount = 0x100 - firstTrail - 1;

// A converter that stops at what it can't convert, instead of writing a substitute.
ConverterOwner openStrict(char const* name) {
    UErrorCode status = U_ZERO_ERROR;
    ConverterOwner converter(ucnv_open(name, &status));
    if (U_FAILURE(status))
        return nullptr;
    ucnv_setFallback(converter.get(), false);
    ucnv_setToUCallBack(converter.get(), UCNV_TO_U_CALLBACK_STOP, nullptr, nullptr, nullptr,
                        &status);
    ucnv_setFromUCallBack(converter.get(), UCNV_FROM_U_CALLBACK_STOP, nullptr, nullptr, nullptr,
                          &status);
    return U_SUCCESS(status) ? std::move(converter) : nullptr;
}

// The cell of one code of one or two bytes.
UInt16 readCell(UConverter* converter, UInt8 const* bytes, int32_t count) {
    UChar units[4];
    UErrorCode status = U_ZERO_ERROR;
    int32_t const length =
        ucnv_toUChars(converter, units, 4, reinterpret_cast<char const*>(bytes), count, &status);
    if (status == U_TRUNCATED_CHAR_FOUND)
        return cellLead;
    // None of the encodings served has a code for more than one unit.
    if (U_FAILURE(status) || length != 1 || isSurrogate(units[0]))
        return cellUnassigned;
    return units[0];
}

// The code of one character, or 0.
UInt16 readCode(UConverter* converter, UniChar unit) {
    UChar const source = unit;
    char bytes[8];
    UErrorCode status = U_ZERO_ERROR;
    int32_t const length = ucnv_fromUChars(converter, bytes, sizeof(bytes), &source, 1, &status);
    if (U_FAILURE(status) || length < 1 || length > 2)
        return 0;
    unsigned const first = static_cast<UInt8>(bytes[0]);
    return static_cast<UInt16>(length == 1 ? first : first << 8 | static_cast<UInt8>(bytes[1]));
}

std::vector<ConverterTable::Character> readCharacters(UConverter* converter) {
    std::vector<ConverterTable::Character> characters;
    SetOwner const set(uset_openEmpty());
    UErrorCode status = U_ZERO_ERROR;
    // The wider of the two sets: fallbacks of private-use characters count always.
    ucnv_getUnicodeSet(converter, set.get(), UCNV_ROUNDTRIP_AND_FALLBACK_SET, &status);
    int32_t const ranges = U_SUCCESS(status) ? uset_getItemCount(set.get()) : 0;
    for (int32_t i = 0; i < ranges; ++i) {
        UChar32 first = 0;
        UChar32 last = -1;
        uset_getItem(set.get(), i, &first, &last, nullptr, 0, &status);
        for (UChar32 unit = first; unit <= last && unit <= 0xFFFF; ++unit) {
            UInt16 const code = readCode(converter, static_cast<UniChar>(unit));
            if (code != 0)
                characters.push_back({code, static_cast<UniChar>(unit)});
        }
    }
    return characters;
}

} // namespace

std::unique_ptr<ConverterTable const> ConverterTable::read(char const* name) {
    ConverterOwner const converter = openStrict(name);
    if (converter == nullptr)
        return nullptr;
    auto table = std::make_unique<ConverterTable>();
    for (unsigned i = 0; i < 0x80; ++i) {
        UInt8 bytes[2] = {static_cast<UInt8>(0x80 + i), 0};
        table->high_[i] = readCell(converter.get(), bytes, 1);
        if (table->high_[i] != cellLead)
            continue;
        table->hasRows_ = true;
        table->rows_[i] = {static_cast<UInt16>(table->cells_.size()), firstTrail, trailCount};
        for (unsigned trail = firstTrail; trail < firstTrail + trailCount; ++trail) {
            bytes[1] = static_cast<UInt8>(trail);
            table->cells_.push_back(readCell(converter.get(), bytes, 2));
        }
    }
    table->characters_ = readCharacters(converter.get());
    return table;
}

DecodeTable ConverterTable::decoding() const {
    return {high_, hasRows_ ? rows_ : nullptr, cells_.data(), nullptr, nullptr};
}

} // namespace CFPlatform
