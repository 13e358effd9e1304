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


def man_with_wives(count, children_of_each=0):
    wives = range(2, 2 * count + 1, 2)
    first = 2 * count + 1
    children = [
        range(first + number * children_of_each, first + (number + 1) * children_of_each) for number in range(count)
    ]
    everybody = [1, *wives, *(child for family in children for child in family)]
    return gedcom(everybody, [(1, wife, children[number]) for number, wife in enumerate(wives)])


def run(command, text, *words):
    """The command on FILE, and the names of the files that lie beside it then."""
    with tempfile.TemporaryDirectory() as folder:
        file = pathlib.Path(folder) / "family.ged"
        file.write_text(text, encoding="utf-8")
        done = subprocess.run(
            [command, *(str(file) if word == "FILE" else word for word in words)],
            capture_output=True,
            text=True,
            cwd=folder,
            timeout=1000,
            check=False,
        )
        return done, sorted(path.name for path in pathlib.Path(folder).iterdir())


def lay_out(command, text, *options):
    return run(command, text, "layout", "FILE", "--focus", "I1", *options)[0]


def require_refusal(done):
    if done.returncode != 2 or done.stdout or "more than 5 million relatives are asked for" not in done.stderr:
        raise SystemExit(
            f"not refused in words: status {done.returncode}, {len(done.stdout)} bytes, {done.stderr[:300]}"
        )


def require_records(done, fewest):
    records = done.stdout.count(";")
    if done.returncode != 0 or records < fewest:
        raise SystemExit(f"status {done.returncode}, {records} records, not {fewest}: {done.stderr[:300]}")


def require_few_sheets(command, text):
    done, files = run(
        command,
        text,
        "draw",
        "FILE",
        "--focus",
        "I1",
        "--view",
        "pedigree",
        "--generations",
        "12",
        "--boxes",
        "tall",
        "--fit",
        "A4",
        "--scale",
        "1",
        "-o",
        "out.svg",
    )
    if (
        done.returncode != 2
        or "the picture would take more than 1000 sheets" not in done.stderr
        or files != ["family.ged"]
    ):
        raise SystemExit(f"thousands of sheets: status {done.returncode}, {len(files)} files, {done.stderr[:300]}")


def main():
    command = sys.argv[1]
    require_refusal(lay_out(command, everybody_with_everybody(100)))
    require_records(lay_out(command, everybody_with_everybody(16)), 500)
    require_records(lay_out(command, man_with_wives(1000)), 1001)
    require_records(lay_out(command, man_with_wives(300, 2)), 901)
    # Five times as many of each take a quarter of a minute, and are refused as well.
    require_refusal(lay_out(command, man_with_wives(2000, 10)))
    own_parents = gedcom([1, 2], [(1, 2, [1, 2])])
    require_records(lay_out(command, own_parents), 5)
    require_records(lay_out(command, own_parents, "--view", "pedigree", "--generations", "12"), 4095)
    require_few_sheets(command, own_parents)


main()
