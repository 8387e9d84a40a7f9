#!/usr/bin/env python3
"""Writes CFLegacyTables.cpp, the tables of the encodings that ICU lacks, from legacy_tables.tsv.

    generate_legacy_tables.py                    writes the file beside this script
    generate_legacy_tables.py --check FILE       compares FILE with what would be written
    generate_legacy_tables.py --sizes            prints the bytes that each table takes

The source has a line for each code: the encoding's number, a name, the bytes and the UTF-16 units
in hexadecimal. ASCII bytes stand for themselves in every encoding, so their lines are left out,
whatever they say.
"""

import argparse
import collections
import pathlib
import sys

FOLDER = pathlib.Path(__file__).resolve().parent

# What the source's second column calls the encodings, and what the code calls them.
TABLES = {
    "MacJapanese": "MacJapanese",
    "MacChineseSimp": "MacChineseSimp",
    "MacChineseTrad": "MacChineseTrad",
    "MacKorean": "MacKorean",
    "MacArabic": "MacArabic",
    "MacHebrew": "MacHebrew",
    "MacThai": "MacThai",
    "johab": "WindowsKoreanJohab",
}

# The marks of CFDecodeTable.h.
UNASSIGNED = 0xD800
LEAD = 0xD801
FIRST_SEQUENCE = 0xD802
LAST_MARK = 0xDFFF

HEADING = """\
// Written by generate_legacy_tables.py from legacy_tables.tsv: change those, not this file.
// clang-format off

#include "0Platform/CoreFoundation/_Imp/Tables/CFLegacyTables.h"

namespace CFPlatform {
namespace {
"""

FOOTING = """
} // namespace CFPlatform
"""


def read_source(path):
    """The codes of each encoding: {name: {bytes: (unit, ...)}}."""
    tables = collections.OrderedDict((name, {}) for name in TABLES)
    for number, line in enumerate(path.read_text(encoding="utf-8").splitlines(), 1):
        if line.startswith("#"):
            continue
        _, name, code, text = line.split("\t")
        code = bytes.fromhex(code)
        units = tuple(int(text[i:i + 4], 16) for i in range(0, len(text), 4))
        check(path, number, code, units)
        if code in tables[name]:
            sys.exit(f"{path}:{number}: the code {code.hex()} stands here twice")
        if code[0] >= 0x80:
            tables[name][code] = units
    return tables


def check(path, number, code, units):
    """Holds a line against what the tables' form and the encoder rely on."""
    fits = (
        1 <= len(code) <= 2
        and (len(code) == 1 or code[0] >= 0x80)
        and units
        and not any(UNASSIGNED <= unit <= LAST_MARK for unit in units)
        and (len(units) == 1 or units[0] >= 0x100 or units[1] >= 0x100)
    )
    if not fits:
        sys.exit(f"{path}:{number}: no table can hold this code")


class Table:
    """One encoding in the form of CFDecodeTable.h."""

    def __init__(self, codes):
        self.bounds = [0]
        self.text = []
        self.cells = []
        self.rows = []
        self.high = []
        for byte in range(0x80, 0x100):
            trails = [code[1] for code in codes if len(code) == 2 and code[0] == byte]
            if trails:
                self.high.append(LEAD)
                self.add_row(codes, byte, min(trails), max(trails))
            else:
                self.high.append(self.cell(codes.get(bytes([byte]))))
                self.rows.append((0, 0, 0))
        if not self.cells:
            self.rows = []
        if FIRST_SEQUENCE + len(self.bounds) - 1 > LAST_MARK or len(self.cells) > 0xFFFF:
            sys.exit("a table outgrows its form")

    def add_row(self, codes, lead, first, last):
        self.rows.append((len(self.cells), first, last - first + 1))
        for trail in range(first, last + 1):
            self.cells.append(self.cell(codes.get(bytes([lead, trail]))))

    def cell(self, units):
        if units is None:
            return UNASSIGNED
        if len(units) == 1:
            return units[0]
        self.text.extend(units)
        self.bounds.append(len(self.text))
        return FIRST_SEQUENCE + len(self.bounds) - 2

    def size(self):
        return 2 * (len(self.high) + len(self.cells) + len(self.bounds) + len(self.text)) + 4 * len(
            self.rows
        )


def array(kind, name, items, per_line):
    lines = [
        "    " + ", ".join(items[i:i + per_line]) for i in range(0, len(items), per_line)
    ]
    return f"\nconstexpr {kind} {name}[] = {{\n" + ",\n".join(lines) + "};\n"


def hexadecimal(values):
    return [f"0x{value:04X}" for value in values]


def definition(name, table):
    """The arrays of one table, and the line that ties them together."""
    out = array("UInt16", f"high{name}", hexadecimal(table.high), 12)
    members = [f"high{name}", "nullptr", "nullptr", "nullptr", "nullptr"]
    if table.cells:
        rows = [f"{{{offset}, 0x{first:02X}, {count}}}" for offset, first, count in table.rows]
        out += array("DecodeRow", f"rows{name}", rows, 5)
        out += array("UInt16", f"cells{name}", hexadecimal(table.cells), 12)
        members[1:3] = [f"rows{name}", f"cells{name}"]
    if table.text:
        out += array("UInt16", f"sequences{name}", [str(bound) for bound in table.bounds], 12)
        out += array("UniChar", f"text{name}", hexadecimal(table.text), 12)
        members[3:5] = [f"sequences{name}", f"text{name}"]
    return out, f"DecodeTable const table{name} = {{{', '.join(members)}}};\n"


def generate(tables):
    arrays = []
    objects = []
    for name, table in tables.items():
        array_text, object_text = definition(name, table)
        arrays.append(array_text)
        objects.append(object_text)
    return HEADING + "".join(arrays) + "\n} // namespace\n\n" + "".join(objects) + FOOTING


def main():
    parser = argparse.ArgumentParser(description=__doc__.splitlines()[0])
    group = parser.add_mutually_exclusive_group()
    group.add_argument("--check", metavar="FILE", type=pathlib.Path)
    group.add_argument("--sizes", action="store_true")
    arguments = parser.parse_args()

    source = read_source(FOLDER / "legacy_tables.tsv")
    tables = {TABLES[name]: Table(codes) for name, codes in source.items()}
    if arguments.sizes:
        for name, table in tables.items():
            print(f"{name:20} {table.size():7}")
        print(f"{'together':20} {sum(table.size() for table in tables.values()):7}")
        return 0
    text = generate(tables)
    if arguments.check is None:
        (FOLDER / "CFLegacyTables.cpp").write_text(text, encoding="utf-8")
        return 0
    if arguments.check.read_text(encoding="utf-8") == text:
        return 0
    print(f"{arguments.check} is not what {pathlib.Path(__file__).name} writes", file=sys.stderr)
    return 1


if __name__ == "__main__":
    sys.exit(main())
