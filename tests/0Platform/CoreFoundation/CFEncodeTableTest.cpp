// What the tables of the legacy encodings do with texts and converters that none of the encodings
// served has.

#include "0Platform/CoreFoundation/_Imp/CFEncodeTable.h"
#include "0Platform/CoreFoundation/_Imp/CFCodecTableMaker.h"
#include "0Platform/CoreFoundation/_Imp/CFConverterTable.h"

#include <gtest/gtest.h>

#include <cstddef>
#include <map>
#include <memory>
#include <new>
#include <string>

namespace {

bool isMemoryShort = false;

} // namespace

extern "C" {
void* __real_calloc(std::size_t count, std::size_t bytes);
void* __wrap_calloc(std::size_t count, std::size_t bytes);

void* __wrap_calloc(std::size_t count, std::size_t bytes) {
    return isMemoryShort ? nullptr : __real_calloc(count, bytes);
}
}

namespace {

using namespace CFPlatform;

void expectMatch(EncodeTable const& table, std::u16string const& text, EncodeCell code,
                 CFIndex units) {
    EncodeMatch const match = table.find(reinterpret_cast<UniChar const*>(text.data()),
                                         static_cast<CFIndex>(text.size()));
    EXPECT_EQ(match.code, code) << text.size();
    EXPECT_EQ(match.units, units) << text.size();
}

void add(EncodeTable& table, UInt16 code, std::u16string const& text) {
    table.add(code, reinterpret_cast<UniChar const*>(text.data()),
              static_cast<CFIndex>(text.size()));
}

TEST(CFEncodeTableTest, WithoutMemoryThereIsNoTable) {
    isMemoryShort = true;
    EXPECT_THROW(EncodeTable(), std::bad_alloc);
    isMemoryShort = false;
    EXPECT_NO_THROW(EncodeTable());
}

TEST(CFEncodeTableTest, TheSecondUnitOfATextMayHaveACodeOfItsOwn) {
    EncodeTable table;
    add(table, 0x90, u"\u0105");
    add(table, 0x91, u"\u0301");
    add(table, 0x8140, u"\u0105\u0301");
    table.seal();
    expectMatch(table, u"\u0105\u0301", 0x8140, 2);
    expectMatch(table, u"\u0105", 0x8090, 1);
    expectMatch(table, u"\u0301", 0x8091, 1);
    expectMatch(table, u"\u0301\u0105", 0x8091, 1);
    expectMatch(table, u"\u0105\u0105\u0301", 0x8090, 1);
}

TEST(CFConverterTableTest, AConverterThatICULacksIsNull) {
    EXPECT_EQ(ConverterTable::read("no converter"), nullptr);
    EXPECT_EQ(makeConverterCodec("no converter", Composition::none), nullptr);
}

// GB 18030 writes U+00A4 as A1E8 and U+4E00 as D2BB, and U+0080 and all that is beyond the first
// plane in four bytes.
TEST(CFConverterTableTest, CodesOfMoreThanTwoBytesAreLeftOut) {
    std::unique_ptr<ConverterTable const> const table = ConverterTable::read("gb18030");
    ASSERT_NE(table, nullptr);
    std::map<UniChar, UInt16> codes;
    for (ConverterTable::Character const character : table->characters())
        codes[character.unit] = character.code;
    EXPECT_EQ(codes[0x00A4], 0xA1E8);
    EXPECT_EQ(codes[0x4E00], 0xD2BB);
    EXPECT_EQ(codes.count(0x0080), 0U);
    EXPECT_EQ(codes.count(0xD800), 0U);
}

// In the Hong Kong form of Big5, A440 is U+4E00 and 90A1 is U+20D31, which has two units.
TEST(CFConverterTableTest, ACodeForSeveralUnitsIsUnassigned) {
    std::unique_ptr<ConverterTable const> const table = ConverterTable::read("Big5-HKSCS");
    ASSERT_NE(table, nullptr);
    DecodeTable const decoding = table->decoding();
    auto const cellOf = [&](unsigned lead, unsigned trail) {
        DecodeRow const row = decoding.rows[lead - 0x80];
        return decoding.cells[row.offset + (trail - row.first)];
    };
    EXPECT_EQ(cellOf(0xA4, 0x40), 0x4E00);
    EXPECT_EQ(cellOf(0x90, 0xA1), cellUnassigned);
}

} // namespace
