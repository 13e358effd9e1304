#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""Writes FontAdvances.cpp: how far each character moves the pen, in hundredths of an em, rounded up.

Usage: make_font_advances.py REGULAR.ttf BOLD.ttf > ../olvane/picture/FontAdvances.cpp

Reads the tables cmap (format 4 or 12), hhea, hmtx and head of a TrueType font. Any sans-serif font that is
at least as wide as the others of the drawing's font list serves: what fits in it fits in the narrower ones.
"""

import struct
import sys

# Blocks that family names are written in; the rest is estimated by the class of the character.
BLOCKS = [
    (0x0020, 0x052F, "Latin, Greek, Cyrillic"),
    (0x0590, 0x06FF, "Hebrew, Arabic"),
    (0x1E00, 0x1FFF, "Latin additional, Greek extended"),
    (0x2010, 0x2044, "punctuation"),
]


def tables_of(font):
    count = struct.unpack(">H", font[4:6])[0]
    tables = {}
    for i in range(count):
        tag, _, offset, length = struct.unpack(">4sIII", font[12 + 16 * i : 28 + 16 * i])
        tables[tag.decode()] = font[offset : offset + length]
    return tables


def glyphs_of(cmap):
    count = struct.unpack(">H", cmap[2:4])[0]
    offsets = [struct.unpack(">HHI", cmap[4 + 8 * i : 12 + 8 * i])[2] for i in range(count)]
    for offset in offsets:
        table = cmap[offset:]
        if struct.unpack(">H", table[:2])[0] == 12:
            return glyphs_of_format_12(table)
    for offset in offsets:
        table = cmap[offset:]
        if struct.unpack(">H", table[:2])[0] == 4:
            return glyphs_of_format_4(table)
    raise SystemExit("no character table that is understood")


def glyphs_of_format_12(table):
    glyphs = {}
    for i in range(struct.unpack(">I", table[12:16])[0]):
        first, last, glyph = struct.unpack(">III", table[16 + 12 * i : 28 + 12 * i])
        glyphs.update({c: glyph + c - first for c in range(first, last + 1)})
    return glyphs


def glyphs_of_format_4(table):
    n = struct.unpack(">H", table[6:8])[0] // 2
    read = lambda at: struct.unpack(">%dH" % n, table[at : at + 2 * n])
    ends, starts, deltas, ranges = read(14), read(16 + 2 * n), read(16 + 4 * n), read(16 + 6 * n)
    glyphs = {}
    for i in range(n):
        for c in range(starts[i], min(ends[i], 0xFFFE) + 1):
            if ranges[i] == 0:
                glyphs[c] = (c + deltas[i]) & 0xFFFF
            else:
                at = 16 + 6 * n + 2 * i + ranges[i] + 2 * (c - starts[i])
                glyphs[c] = struct.unpack(">H", table[at : at + 2])[0]
    return glyphs


def advances_of(path):
    with open(path, "rb") as file:
        tables = tables_of(file.read())
    em = struct.unpack(">H", tables["head"][18:20])[0]
    metrics = struct.unpack(">H", tables["hhea"][34:36])[0]
    advance = [struct.unpack(">H", tables["hmtx"][4 * i : 4 * i + 2])[0] for i in range(metrics)]
    glyphs = glyphs_of(tables["cmap"])
    hundredths = lambda glyph: -(-advance[min(glyph, metrics - 1)] * 100 // em)
    return {c: hundredths(g) for c, g in glyphs.items() if g != 0}


def write_array(name, advances, first, last):
    print(f"constexpr std::uint8_t {name}[] = {{")
    values = [str(min(255, advances.get(c, 0))) for c in range(first, last + 1)]
    for i in range(0, len(values), 24):
        print("    " + ", ".join(values[i : i + 24]) + ",")
    print("};\n")


def main():
    regular, bold = advances_of(sys.argv[1]), advances_of(sys.argv[2])
    print("// SPDX-FileCopyrightText: The Olvane developers\n// SPDX-License-Identifier: MIT\n")
    print(
        "// Written by picture/tools/make_font_advances.py; not edited by hand. Pen advances of DejaVu Sans, regular and"
    )
    print("// bold, in hundredths of an em, rounded up. A character of a block with 0 is not in the font.\n")
    print("// clang-format off\n")
    print("#include <olvane/picture/FontAdvancesInternal.h>\n")
    print("namespace olvane::picture {\n\nnamespace {\n")
    for first, last, _ in BLOCKS:
        write_array(f"kRegular{first:04X}", regular, first, last)
        write_array(f"kBold{first:04X}", bold, first, last)
    print("constexpr FontBlock kBlocks[] = {")
    for first, last, title in BLOCKS:
        print(f"    {{0x{first:04X}, 0x{last:04X}, kRegular{first:04X}, kBold{first:04X}}},  // {title}")
    print("};\n\n}  // namespace\n")
    print("std::span<const FontBlock> fontBlocks() { return kBlocks; }\n")
    print("}  // namespace olvane::picture")


if __name__ == "__main__":
    main()
