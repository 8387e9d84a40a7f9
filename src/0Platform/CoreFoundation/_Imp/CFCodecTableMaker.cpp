#include "0Platform/CoreFoundation/_Imp/CFCodecTableMaker.h"
#include "0Platform/CoreFoundation/_Imp/CFConverterTable.h"

#include <unicode/unorm2.h>

#include <utility>

namespace CFPlatform {
namespace {

// Adds base and mark as a second text for the code of a composed character.
void addComposition(EncodeTable& table, UInt16 code, UniChar composed) {
    UErrorCode status = U_ZERO_ERROR;
    UNormalizer2 const* const normalizer = unorm2_getNFCInstance(&status);
    if (U_FAILURE(status))
        return;
    UChar pair[2];
    int32_t const length = unorm2_getRawDecomposition(normalizer, composed, pair, 2, &status);
    if (U_FAILURE(status) || length != 2 ||
        unorm2_composePair(normalizer, pair[0], pair[1]) != composed)
        return;
    UniChar const text[] = {pair[0], pair[1]};
    table.add(code, text, 2);
}

void addCharacter(EncodeTable& table, UInt16 code, UniChar unit, Composition composition) {
    table.add(code, &unit, 1);
    if (composition == Composition::canonical)
        addComposition(table, code, unit);
}

} // namespace

std::unique_ptr<TableCodec> makeTableCodec(DecodeTable const& table, Composition composition) {
    EncodeTable encoding;
    forEachCode(table, [&](UInt16 code, UniChar const* text, CFIndex length) {
        if (length == 1)
            addCharacter(encoding, code, *text, composition);
        else
            encoding.add(code, text, length);
    });
    encoding.seal();
    return std::make_unique<TableCodec>(table, std::move(encoding));
}

std::unique_ptr<TableCodec> makeConverterCodec(char const* name, Composition composition) {
    std::unique_ptr<ConverterTable const> table = ConverterTable::read(name);
    if (table == nullptr)
        return nullptr;
    EncodeTable encoding;
    for (ConverterTable::Character const character : table->characters())
        addCharacter(encoding, character.code, character.unit, composition);
    encoding.seal();
    auto codec = std::make_unique<TableCodec>(table->decoding(), std::move(encoding));
    // The codec reads on in it for as long as the process lives.
    static_cast<void>(table.release());
    return codec;
}

} // namespace CFPlatform
