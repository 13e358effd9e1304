#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""Prints TextPropertyTable.cpp: what breaking and measuring texts has to know of every character.

Usage: make_text_table.py [FOLDER] > ../olvane/picture/TextPropertyTable.cpp

FOLDER holds the Unicode character database as Debian's package unicode-data installs it; by default
/usr/share/unicode. "make_text_table.py --version FOLDER" prints the version of Unicode found there.
"""

import pathlib
import re
import sys

LAST = 0x10FFFF
HANGUL = range(0xAC00, 0xD7A4)

GRAPHEME = [
    "Other",
    "CR",
    "LF",
    "Control",
    "Extend",
    "ZWJ",
    "Regional_Indicator",
    "Prepend",
    "SpacingMark",
    "L",
    "V",
    "T",
    "LV",
    "LVT",
    "ExtPict",
]
LINE = [
    "AL",
    "B2",
    "BA",
    "BB",
    "BK",
    "CB",
    "CL",
    "CM",
    "CP",
    "CPwide",
    "CR",
    "EB",
    "EM",
    "EX",
    "GL",
    "H2",
    "H3",
    "HL",
    "HY",
    "ID",
    "IDpict",
    "IN",
    "IS",
    "JL",
    "JT",
    "JV",
    "LF",
    "NL",
    "NS",
    "NU",
    "OP",
    "OPwide",
    "PO",
    "PR",
    "QU",
    "RI",
    "SP",
    "SY",
    "WJ",
    "ZW",
    "ZWJ",
]
WIDTH = ["usual", "none", "wide", "emoji"]
DIRECTION = ["neutral", "leftToRight", "rightToLeft"]


def lines_of(path):
    return path.read_text(encoding="utf-8").splitlines()


def codes_of(text):
    first, _, last = text.partition("..")
    return range(int(first, 16), int(last or first, 16) + 1)


def property_of(path, usual):
    """The value of every character; what a file leaves out has the value of its @missing lines."""
    values = [usual] * (LAST + 1)
    for line in lines_of(path):
        missing = re.match(r"# @missing: ([0-9A-F]+\.\.[0-9A-F]+); *(\S+)", line)
        fields = [field.strip() for field in line.split("#")[0].split(";")]
        if missing:
            fields = [missing[1], missing[2]]
        if len(fields) >= 2:
            for code in codes_of(fields[0]):
                values[code] = fields[1]
    return values


def set_of(path, name):
    found = set()
    for line in lines_of(path):
        fields = [field.strip() for field in line.split("#")[0].split(";")]
        if len(fields) >= 2 and fields[1] == name:
            found.update(codes_of(fields[0]))
    return found


class Database:
    def __init__(self, folder):
        self.grapheme = property_of(folder / "auxiliary/GraphemeBreakProperty.txt", "Other")
        self.line = property_of(folder / "LineBreak.txt", "XX")
        self.width = property_of(folder / "EastAsianWidth.txt", "N")
        self.category = property_of(folder / "extracted/DerivedGeneralCategory.txt", "Cn")
        self.direction = property_of(folder / "extracted/DerivedBidiClass.txt", "L")
        self.pictographic = set_of(folder / "emoji/emoji-data.txt", "Extended_Pictographic")
        self.emoji = set_of(folder / "emoji/emoji-data.txt", "Emoji_Presentation")
        self.visible = set_of(folder / "PropList.txt", "Prepended_Concatenation_Mark")

    def grapheme_class(self, code):
        return "ExtPict" if code in self.pictographic else self.grapheme[code]

    # LB1, and the classes of LB30 and LB30b that depend on other properties.
    def line_class(self, code):
        value = self.line[code]
        if value in ("AI", "SG", "XX"):
            value = "AL"
        if value == "SA":
            value = "CM" if self.category[code] in ("Mn", "Mc") else "AL"
        if value == "CJ":
            value = "NS"
        if value in ("OP", "CP") and self.width[code] in "FWH":
            value += "wide"
        if code in self.pictographic and self.category[code] == "Cn":
            value = "IDpict"
        return value

    def width_class(self, code):
        if self.category[code] in ("Mn", "Me", "Cf") and code not in self.visible:
            return "none"
        if code in self.emoji:
            return "emoji"
        return "wide" if self.width[code] in ("W", "F") else "usual"

    def direction_class(self, code):
        return {"L": "leftToRight", "R": "rightToLeft", "AL": "rightToLeft"}.get(self.direction[code], "neutral")

    def record(self, code):
        # Syllables differ in a regular way, which the reader of the table computes.
        code = HANGUL.start if code in HANGUL else code
        return (
            GRAPHEME.index(self.grapheme_class(code)),
            LINE.index(self.line_class(code)),
            WIDTH.index(self.width_class(code)),
            DIRECTION.index(self.direction_class(code)),
        )


def runs_of(database):
    """(number of characters, record) for each run of characters with one record."""
    runs = []
    for code in range(LAST + 1):
        record = database.record(code)
        if runs and runs[-1][1] == record:
            runs[-1][0] += 1
        else:
            runs.append([1, record])
    return runs


def packed_length(count):
    bytes_ = []
    while count >= 0x80:
        bytes_.append(count & 0x7F | 0x80)
        count >>= 7
    return bytes_ + [count]


def printed(values, width):
    values = [str(value) for value in values]
    return "\n".join("    " + ", ".join(values[i : i + width]) + "," for i in range(0, len(values), width))


def version_of(folder):
    return re.search(r"EastAsianWidth-(\S+)\.txt", lines_of(folder / "EastAsianWidth.txt")[0])[1]


def main():
    arguments = [argument for argument in sys.argv[1:] if argument != "--version"]
    folder = pathlib.Path(arguments[0] if arguments else "/usr/share/unicode")
    if "--version" in sys.argv[1:]:
        print(version_of(folder))
        return
    runs = runs_of(Database(folder))
    records = sorted({record for _, record in runs})
    numbers = {record: i for i, record in enumerate(records)}
    lengths = [byte for count, _ in runs for byte in packed_length(count)]
    print(
        f"""// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Made by picture/tools/make_text_table.py from Unicode {version_of(folder)}; not edited by hand.

#include <olvane/picture/TextPropertiesInternal.h>

// clang-format off
namespace olvane::picture {{

const TextRecord kTextRecords[] = {{"""
    )
    print("\n".join(f"    {{{g}, {l}, {w}, {d}}}," for g, l, w, d in records))
    print(f"}};\n\nconst std::uint8_t kTextRunLengths[] = {{\n{printed(lengths, 28)}\n}};")
    print(f"\nconst std::uint8_t kTextRunRecords[] = {{\n{printed([numbers[r] for _, r in runs], 28)}\n}};")
    print(f"\nconst std::size_t kTextRunCount = {len(runs)};")
    print("\n}  // namespace olvane::picture\n// clang-format on")


main()
