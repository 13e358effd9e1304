#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""A long name costs no more than four times its size in memory, in every command and form, in one line or in many,
in any letters and encoding.

Usage: memory_of_a_long_name.py PATH/TO/olvane

Its size is that of the name in the file, or as UTF-8 where that is longer. The name has 6 MB, and what the command takes
with a short name is not counted; with OLVANE_LONG_NAMES set it has 100 MB, everything counts, and the figures are
printed. Skipped for a command built with a sanitizer, whose memory is its own.
"""

import os
import pathlib
import subprocess
import sys
import tempfile

IS_LONG = bool(os.environ.get("OLVANE_LONG_NAMES"))
SIZE = 100_000_000 if IS_LONG else 6_000_000
MOST = 4
COMMANDS = [
    ["people", "FILE"],
    ["people", "FILE", "berg"],
    ["people", "FILE", "--format", "tsv"],
    ["people", "FILE", "--format", "json"],
    ["check", "FILE"],
    ["check", "FILE", "--format", "tsv"],
    ["check", "FILE", "--format", "json"],
    ["check", "FILE", "--all"],
    ["kin", "FILE", "1", "2"],
    ["kin", "FILE", "1", "2", "--format", "json"],
    ["layout", "FILE", "--focus", "1"],
    ["layout", "FILE", "--focus", "1", "--format", "json"],
    ["layout", "FILE", "--focus", "1", "--format", "json1"],
    ["layout", "FILE", "--focus", "1", "--format", "json", "--hide-living"],
    ["layout", "FILE", "--focus", "1", "--view", "everybody"],
    ["batch", "FILE"],
    ["batch", "FILE", "--view", "near"],
    ["draw", "FILE", "--focus", "1", "-o", "OUT.svg"],
    ["draw", "FILE", "--focus", "1", "--hide-living", "-o", "OUT.svg"],
    ["draw", "FILE", "--focus", "1", "--show", "dates,places,occupation,marriage", "-o", "OUT.svg"],
    ["draw", "FILE", "--focus", "1", "--view", "everybody", "-o", "OUT.svg"],
    ["draw", "FILE", "--focus", "1", "--view", "kinship", "--to", "2", "-o", "OUT.svg"],
    ["draw", "FILE", "--focus", "1", "-o", "OUT.pdf"],
    ["draw", "FILE", "--focus", "1", "-o", "OUT.png"],
    ["draw", "FILE", "--focus", "1", "--fit", "A4", "-o", "OUT.pdf"],
    ["judge", "OUT.json"],
    ["page", "FILE", "-o", "OUT.html"],
    ["page", "FILE", "--hide-living", "-o", "OUT.html"],
]
# Letter, encoding of the file and its name in the header, and whether the name stands in one line or in many.
FAMILIES = [
    ("a", "utf-8", "UTF-8", False),
    ("a", "utf-8", "UTF-8", True),
    ("\u00e9", "utf-8", "UTF-8", False),
    ("\u00e9", "utf-8", "UTF-8", True),
    ("\u00e9", "latin-1", "ISO-8859-1", False),
    ("\u00e9", "utf-16", "UNICODE", False),
    ("a ", "utf-8", "UTF-8", False),
]
if not IS_LONG:
    FAMILIES = [FAMILIES[0], FAMILIES[3], FAMILIES[5]]


def write_family(path, letter, encoding, label, in_pieces, size):
    letters = size // max(len(letter.encode(encoding.replace("utf-16", "utf-16-le"))), len(letter.encode()))
    with path.open("w", encoding=encoding) as file:
        file.write(f"0 HEAD\n1 CHAR {label}\n0 @I1@ INDI\n1 NAME ")
        if in_pieces:
            file.write("A\n")
            for _ in range(letters // 200):
                file.write(f"2 CONC {letter * 200}\n")
        else:
            # Piece by piece: what this process once had in memory counts for its children too.
            for _ in range(letters // 1000):
                file.write(letter * 1000)
            file.write(" /Berg/\n")
        file.write(
            "1 FAMS @F1@\n0 @I2@ INDI\n1 NAME Ada /Berg/\n1 FAMS @F1@\n"
            "0 @F1@ FAM\n1 HUSB @I1@\n1 WIFE @I2@\n0 TRLR\n"
        )


def most_memory(command):
    """The exit status, the messages, and the greatest number of bytes in memory."""
    with tempfile.TemporaryFile("w+") as messages:
        process = subprocess.Popen(command, stdout=subprocess.DEVNULL, stderr=messages)
        _, status, usage = os.wait4(process.pid, 0)
        messages.seek(0)
        return os.waitstatus_to_exitcode(status), messages.read(), usage.ru_maxrss * 1024


def words_of(command, file, out):
    return [word.replace("FILE", str(file)).replace("OUT", str(out)) for word in command]


def write_picture(olvane, file, out):
    with open(f"{out}.json", "wb") as picture:
        command = words_of(["layout", "FILE", "--focus", "1", "--format", "json"], file, out)
        subprocess.run([olvane, *command], stdout=picture, check=True)


def is_sanitized(olvane):
    # By another process: what this one once had in memory counts for its children too.
    return subprocess.run(["grep", "-qaE", "__[at]san_init", olvane], check=False).returncode == 0


def main():
    olvane = sys.argv[1]
    if is_sanitized(olvane):
        print("skipped: the command was built with a sanitizer")
        return 77
    too_much = []
    with tempfile.TemporaryDirectory() as folder:
        file, short_file, out = (pathlib.Path(folder) / name for name in ("family.ged", "short.ged", "out"))
        for family in FAMILIES:
            write_family(file, *family, SIZE)
            write_family(short_file, *family, 2000)
            for command in COMMANDS:
                if command[0] == "judge":
                    write_picture(olvane, file, out)
                size = pathlib.Path(f"{out}.json").stat().st_size if command[0] == "judge" else SIZE
                status, messages, memory = most_memory([olvane, *words_of(command, file, out)])
                if status == 2 and "built without" in messages:
                    continue
                if not IS_LONG:
                    if command[0] == "judge":
                        write_picture(olvane, short_file, out)
                    memory -= most_memory([olvane, *words_of(command, short_file, out)])[2]
                kind = f"{family}: {' '.join(command)}"
                print(f"{memory / size:5.2f} times its size: {kind}", flush=True)
                if memory > MOST * size or status not in (0, 1):
                    too_much.append(f"{memory / size:.2f} times: {kind}: exit {status} {messages[:200]}")
    assert not too_much, "\n".join(too_much)
    return 0


sys.exit(main())
