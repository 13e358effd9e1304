#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""Data that make a layout grow without measure end in one line, and odd data that do not are laid out.

Usage: limit_of_a_layout.py PATH/TO/olvane
"""

import pathlib
import subprocess
import sys
import tempfile


def gedcom(persons, couples):
    """Persons are numbers, women the even ones; couples are (husband, wife, children)."""
    as_partner = {person: [] for person in persons}
    as_child = {person: [] for person in persons}
    for number, (husband, wife, children) in enumerate(couples):
        for partner in {husband, wife}:
            as_partner[partner].append(number)
        for child in children:
            as_child[child].append(number)
    lines = ["0 HEAD", "1 CHAR UTF-8"]
    for person in persons:
        lines += [f"0 @I{person}@ INDI", f"1 SEX {'F' if person % 2 == 0 else 'M'}"]
        lines += [f"1 FAMS @F{number}@" for number in as_partner[person]]
        lines += [f"1 FAMC @F{number}@" for number in as_child[person]]
    for number, (husband, wife, children) in enumerate(couples):
        lines += [f"0 @F{number}@ FAM", f"1 HUSB @I{husband}@", f"1 WIFE @I{wife}@"]
        lines += [f"1 CHIL @I{child}@" for child in children]
    return "\n".join([*lines, "0 TRLR", ""])


def everybody_with_everybody(count):
    persons = range(1, count + 1)
    return gedcom(persons, [(man, wife, persons) for man in persons[::2] for wife in persons[1::2]])


def man_with_wives(count):
    wives = range(2, 2 * count + 1, 2)
    return gedcom([1, *wives], [(1, wife, []) for wife in wives])


def lay_out(command, text, *options):
    with tempfile.TemporaryDirectory() as folder:
        file = pathlib.Path(folder) / "family.ged"
        file.write_text(text, encoding="utf-8")
        return subprocess.run([command, "layout", file, "--focus", "I1", *options], capture_output=True, text=True,
                              timeout=100, check=False)


def require_refusal(done):
    if done.returncode != 2 or done.stdout or "more than 5 million relatives are asked for" not in done.stderr:
        raise SystemExit(f"not refused in words: status {done.returncode}, {len(done.stdout)} bytes, {done.stderr[:300]}")


def require_records(done, fewest):
    records = done.stdout.count(";")
    if done.returncode != 0 or records < fewest:
        raise SystemExit(f"status {done.returncode}, {records} records, not {fewest}: {done.stderr[:300]}")


def main():
    command = sys.argv[1]
    require_refusal(lay_out(command, everybody_with_everybody(100)))
    require_records(lay_out(command, everybody_with_everybody(16)), 500)
    require_records(lay_out(command, man_with_wives(1000)), 1001)
    own_parents = gedcom([1, 2], [(1, 2, [1, 2])])
    require_records(lay_out(command, own_parents), 5)
    require_records(lay_out(command, own_parents, "--view", "pedigree", "--generations", "12"), 4095)


main()
