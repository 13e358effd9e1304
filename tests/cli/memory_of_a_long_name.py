#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""A name of 100 MB costs no more than four times its size in memory, in one line or in many, in any letters.

Usage: memory_of_a_long_name.py PATH/TO/olvane

Prints what each command takes. Skipped unless OLVANE_LONG_NAMES is set: it takes minutes.
"""

import os
import pathlib
import subprocess
import sys
import tempfile

SIZE = 100_000_000
MOST = 4
COMMANDS = [
    ["people", "FILE"],
    ["people", "FILE", "berg"],
    ["check", "FILE"],
    ["kin", "FILE", "1", "2"],
    ["layout", "FILE", "--focus", "1"],
    ["draw", "FILE", "--focus", "1", "-o", "OUT.svg"],
    ["draw", "FILE", "--focus", "1", "--show", "dates,places,occupation,marriage", "-o", "OUT.svg"],
    ["draw", "FILE", "--focus", "1", "--view", "everybody", "-o", "OUT.svg"],
    ["draw", "FILE", "--focus", "1", "-o", "OUT.pdf"],
    ["page", "FILE", "-o", "OUT.html"],
]


def write_family(path, letter, in_pieces):
    letters = SIZE // len(letter.encode())
    with path.open("w", encoding="utf-8") as file:
        file.write("0 HEAD\n1 CHAR UTF-8\n0 @I1@ INDI\n1 NAME ")
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
            "1 FAMS @F1@\n0 @I2@ INDI\n1 NAME Ada /Lund/\n1 FAMS @F1@\n"
            "0 @F1@ FAM\n1 HUSB @I1@\n1 WIFE @I2@\n0 TRLR\n"
        )


def most_memory(command):
    """The exit status, the messages, and the greatest number of bytes in memory."""
    with tempfile.TemporaryFile("w+") as messages:
        process = subprocess.Popen(command, stdout=subprocess.DEVNULL, stderr=messages)
        _, status, usage = os.wait4(process.pid, 0)
        messages.seek(0)
        return os.waitstatus_to_exitcode(status), messages.read(), usage.ru_maxrss * 1024


def main():
    olvane = sys.argv[1]
    if not os.environ.get("OLVANE_LONG_NAMES"):
        print("skipped: OLVANE_LONG_NAMES is not set")
        return 77
    too_much = []
    with tempfile.TemporaryDirectory() as folder:
        work = pathlib.Path(folder)
        for letter in ("a", "é"):
            for in_pieces in (False, True):
                write_family(work / "family.ged", letter, in_pieces)
                for command in COMMANDS:
                    words = [
                        word.replace("FILE", str(work / "family.ged")).replace("OUT", str(work / "out"))
                        for word in command
                    ]
                    status, messages, memory = most_memory([olvane, *words])
                    if status == 2 and "built without" in messages:
                        continue
                    kind = f"{letter}, {'CONC' if in_pieces else 'one line'}: {' '.join(command)}"
                    print(f"{memory / SIZE:5.2f} times its size: {kind}", flush=True)
                    if memory > MOST * SIZE or status not in (0, 1):
                        too_much.append(f"{kind}: exit {status} {messages[:200]}")
    assert not too_much, too_much
    return 0


sys.exit(main())
