#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""Messages have colours on a terminal alone; NO_COLOR takes the colours away.

Usage: colours_on_a_terminal.py PATH/TO/olvane GEDCOMFILE
"""

import os
import pty
import subprocess
import sys

COLOUR = b"\x1b[1;31m"


def on_terminal(arguments, **environment):
    """What the command writes to a terminal that is its standard error."""
    leader, follower = pty.openpty()
    clean = {name: value for name, value in os.environ.items() if name != "NO_COLOR"}
    process = subprocess.Popen(arguments, stdout=subprocess.DEVNULL, stderr=follower, env=dict(clean, **environment))
    os.close(follower)
    return rest_of(leader, process)


def rest_of(leader, process):
    """What a process still writes to a terminal until it ends."""
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
    return text


def expect(condition, what):
    if not condition:
        raise SystemExit(what)


def main():
    command, file = sys.argv[1:3]
    wrong = [command, "layout", file, "--focus", "Nobody At All"]
    expect(on_terminal(wrong).startswith(COLOUR + b"olvane: "), "no colour on a terminal")
    expect(b"\x1b" not in on_terminal(wrong, NO_COLOR="1"), "colour in spite of NO_COLOR")
    expect(on_terminal(wrong, NO_COLOR="").startswith(COLOUR), "an empty NO_COLOR takes the colours away")
    piped = subprocess.run(wrong, capture_output=True, check=False).stderr
    expect(piped.startswith(b"olvane: "), f"not plain in a pipe: {piped!r}")


if __name__ == "__main__":
    main()
