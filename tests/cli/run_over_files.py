#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""Every command over every file, and over mutated copies: none crashes, hangs, changes its input or leaves a part behind.

Each command ends with status 0, 1 or 2, outputs that exist are whole, and with status 2 there is a message. A mutation
changes, removes, repeats or swaps bytes and lines of a file, always the same ones for the same seed.

Usage: run_over_files.py PATH/TO/olvane FOLDER [MUTATED [SEED]]
FOLDER "-" is OLVANE_GEDCOM_DIR; status 77 where that is not set. MUTATED copies are made of all files together, 0 by default;
a copy runs one of the commands, in turn. With a plus sign before MUTATED the files themselves are left out.
"""

import concurrent.futures
import os
import pathlib
import random
import subprocess
import sys
import tempfile

# A picture to be judged with the relations of a file.
PICTURE = """{"format": 2, "view": "made", "focus": 1, "boxes": [{"id": 1, "width": 10, "height": 10},
{"id": 2, "x": 50, "width": 10, "height": 10}]}"""

MOST_BYTES = 200000  # of a file that is mutated

TIME_LIMIT = 1000  # seconds, for one command on one file


def commands_for(file, number):
    """Some of them in turn for a mutated copy, all of them for number None."""
    all_commands = [
        ["people", file, "--format", "json"],
        ["people", file, "--format", "tsv"],
        ["people", file, "a"],
        ["check", file],
        ["check", file, "--focus", "1"],
        ["batch", file],
        ["layout", file, "--focus", "1", "--format", "json", "--hide-living"],
        ["layout", file, "--focus", "2", "--view", "pedigree"],
        ["layout", file, "--focus", "1", "--view", "relatives"],
        ["batch", file, "--view", "hourglass"],
        ["check", file, "--all", "--view", "near"],
        ["layout", file, "--focus", "1", "--view", "everybody"],
        ["layout", file, "--focus", "1", "--view", "fan"],
        ["layout", file, "--focus", "1", "--view", "kinship", "--to", "3"],
        ["kin", file, "1", "2", "--format", "json"],
        ["draw", file, "--focus", "1", "-o", "out.svg"],
        ["draw", file, "--focus", "1", "-o", file],
        ["draw", file, "--focus", "1", "--fit", "A4", "--sheets", "1x3", "-o", "sheets.svg", "--hide-living"],
        ["page", file, "-o", "out.html", "--hide-living"],
        ["page", file, "-o", file],
        ["people", file, "--encoding", "windows-1251"],
        ["draw", "io.svg", "--focus", "1", "-o", "io.svg"],
        ["page", "io.html", "-o", "io.html"],
        ["draw", file, "--focus", "2", "-o", "out.png"],
        ["draw", file, "--focus", "3", "-o", "out.pdf"],
        ["kin", file, "2", "3"],
        ["judge", file],
        ["judge", "picture.json", "--family", file],
    ]
    return all_commands if number is None else [all_commands[number % len(all_commands)]]


def mutated(data, chance):
    lines = data.split(b"\n")
    for _ in range(chance.randint(1, 6)):
        at = chance.randrange(len(lines))
        other = chance.randrange(len(lines))
        kind = chance.randrange(8)
        if kind == 0:
            del lines[at : at + chance.randint(1, 20)]
        elif kind == 1:
            lines[at:at] = lines[other : other + chance.randint(1, 20)]
        elif kind == 2:
            lines[at], lines[other] = lines[other], lines[at]
        elif kind == 3:
            line = bytearray(lines[at])
            for _ in range(chance.randint(1, 4)):
                line.insert(chance.randint(0, len(line)), chance.randrange(256))
            lines[at] = bytes(line)
        elif kind == 4:
            lines[at] = lines[at].replace(b"FAMC", b"FAMS").replace(b"HUSB", b"CHIL").replace(b"INDI", b"FAM")
        elif kind == 5:
            lines[at] = lines[at] * chance.choice((2, 3, 100))
        elif kind == 6:
            lines[at] = lines[at][: chance.randint(0, len(lines[at]))]
        else:
            lines[at] = bytes([chance.choice(b"0123456789")]) + lines[at][1:]
        if not lines:
            lines = [b""]
    return b"\n".join(lines)


def faults(command, data, name, number):
    found = []
    with tempfile.TemporaryDirectory() as folder:
        path = pathlib.Path(folder) / name
        inputs = [path, pathlib.Path(folder) / "io.svg", pathlib.Path(folder) / "io.html"]
        for one in inputs:
            one.write_bytes(data)
        (pathlib.Path(folder) / "picture.json").write_text(PICTURE, encoding="utf-8")
        for words in commands_for(name, number):
            asked = f"{name} {number}: olvane {' '.join(words)}"
            try:
                result = subprocess.run([command, *words], cwd=folder, capture_output=True, timeout=TIME_LIMIT)
            except subprocess.TimeoutExpired:
                found.append(f"{asked}: no end after {TIME_LIMIT} s")
                continue
            # A sanitizer ends a command with status 1, which means something else elsewhere.
            if b"Sanitizer" in result.stderr or b": runtime error: " in result.stderr:
                found.append(f"{asked}: {result.stderr[:2000].decode(errors='replace')}")
            if result.returncode not in (0, 1, 2):
                found.append(f"{asked}: status {result.returncode}: {result.stderr[-500:]!r}")
            if (
                result.returncode == 2
                and not result.stderr.startswith(b"olvane: ")
                and b"\nolvane: " not in result.stderr
            ):
                found.append(f"{asked}: no message: {result.stderr!r}")
            for one in inputs:
                if one.read_bytes() != data:
                    found.append(f"{asked}: {one.name} has changed")
                    one.write_bytes(data)
            found += [f"{asked}: {part} was left" for part in os.listdir(folder) if part.endswith(".part")]
    return found


def main():
    command = os.path.abspath(sys.argv[1])
    folder = os.environ.get("OLVANE_GEDCOM_DIR") if sys.argv[2] == "-" else sys.argv[2]
    if not folder:
        print("OLVANE_GEDCOM_DIR names no folder of GEDCOM files")
        raise SystemExit(77)
    copies = int(sys.argv[3]) if len(sys.argv) > 3 else 0
    only_copies = len(sys.argv) > 3 and sys.argv[3].startswith("+")
    seed = int(sys.argv[4]) if len(sys.argv) > 4 else 1
    paths = sorted(p for p in pathlib.Path(folder).rglob("*") if p.suffix in (".ged", ".gdz"))
    files = [(p.name, p.read_bytes()) for p in paths]
    # Nothing but copies where the number of copies begins with a plus sign.
    work = [] if only_copies else [(name, data, None) for name, data in files]
    chance = random.Random(seed)
    small = [(name, data) for name, data in files if len(data) < MOST_BYTES]
    work += [(name, (data, chance.random()), i) for i in range(copies) for name, data in [chance.choice(small)]]

    def look(item):
        name, data, number = item
        if number is not None:
            data = mutated(data[0], random.Random(data[1]))
        return faults(command, data, name, number)

    with concurrent.futures.ThreadPoolExecutor(os.cpu_count()) as pool:
        found = [fault for some in pool.map(look, work) for fault in some]
    print(f"{len(files)} files and {copies} mutated copies")
    if found:
        raise SystemExit("\n".join(found[:40]))


if __name__ == "__main__":
    main()
