#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""On a terminal, characters of a file that would command it or reorder its lines are written out; in a pipe they stay.

Usage: safe_on_a_terminal.py PATH/TO/olvane GEDCOMFILE
"""

import os
import pty
import subprocess
import sys

UNSAFE = ("\u202e", "\u2066", "\u2028", "\u009b")


def on_terminal(arguments):
    """What the command writes to a terminal that is its standard output and its standard error."""
    leader, follower = pty.openpty()
    process = subprocess.Popen(arguments, stdout=follower, stderr=follower, env=dict(os.environ, NO_COLOR="1"))
    os.close(follower)
    text = b""
    while True:
        try:
            part = os.read(leader, 4096)
        except OSError:  # the other end is closed
            break
        if not part:
            break
        text += part
    process.wait()
    os.close(leader)
    return text.decode("utf-8")


def expect(condition, what):
    if not condition:
        raise SystemExit(what)


def main():
    command, file = sys.argv[1:3]
    asked = (
        ["people", file],
        ["people", file, "--format", "tsv"],
        ["people", file, "--format", "json"],
        ["check", file],
        ["layout", file, "--focus", "3", "--format", "json"],
        ["batch", file, "--view", "near"],
        ["layout", file, "--focus", "Leftt"],
        ["layout", file, "--focus", "e"],
        ["people", file, "\x1b]0;title\x07"],
    )
    written_out = 0
    for words in asked:
        text = on_terminal([command, *words])
        for character in (*UNSAFE, "\x1b", "\x07"):
            expect(character not in text, f"{words}: {character!r} reaches the terminal: {text!r}")
        written_out += text.count("\\u202E") + text.count("\\u001B")
    expect(written_out >= 5, f"only {written_out} characters were written out")
    piped = subprocess.run([command, "people", file], capture_output=True, check=True).stdout.decode("utf-8")
    expect("\u202e" in piped and "\u2028" in piped, f"changed in a pipe: {piped!r}")


if __name__ == "__main__":
    main()
