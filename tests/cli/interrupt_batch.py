#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""An interrupted batch ends behind a whole line, in the order asked for.

Usage: interrupt_batch.py PATH/TO/olvane GEDCOMFILE
"""

import signal
import subprocess
import sys


def main():
    command, file = sys.argv[1:3]
    batch = subprocess.Popen([command, "batch", file, "--focus-from", "-"], stdin=subprocess.PIPE,
                             stdout=subprocess.PIPE)
    # More than a block of focuses, and the stream stays open: the command is at work or waiting, never done.
    batch.stdin.write(b"1\n" * 600)
    batch.stdin.flush()
    first = batch.stdout.readline()
    batch.send_signal(signal.SIGINT)
    batch.stdin.close()
    text = first + batch.stdout.read()
    status = batch.wait(timeout=60)
    if status != 130:
        raise SystemExit(f"status {status}, not 130")
    if not text.endswith(b";\n"):
        raise SystemExit(f"ends in the middle of a line: {text[-60:]!r}")
    if any(line != first for line in text.splitlines(keepends=True)):
        raise SystemExit("a line was cut")


if __name__ == "__main__":
    main()
