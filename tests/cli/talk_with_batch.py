#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""A program that asks for one layout, waits for it, and then asks for the next, is answered each time.

Usage: talk_with_batch.py PATH/TO/olvane GEDCOMFILE
"""

import select
import subprocess
import sys


def main():
    command, file = sys.argv[1:3]
    process = subprocess.Popen(
        [command, "batch", file, "--focus-from", "-", "--unbuffered"],
        stdin=subprocess.PIPE,
        stdout=subprocess.PIPE,
        stderr=subprocess.DEVNULL,
        bufsize=0,
    )
    for question, start in (
        (b"3\n", b"3\t3:"),
        (b"\n", b"\t\n"),
        (b"@I1@\n", b"1\t1:"),
        (b"Nobody\tHere\n", b"Nobody\\tHere\t\n"),
        (b"2\n", b"2\t2:"),
    ):
        process.stdin.write(question)
        ready, _, _ = select.select([process.stdout], [], [], 300)
        if not ready:
            process.kill()
            raise SystemExit(f"no answer to {question!r}")
        answer = process.stdout.readline()
        if not answer.startswith(start) or not answer.endswith(b"\n"):
            process.kill()
            raise SystemExit(f"{question!r} was answered by {answer!r}")
    process.stdin.close()
    rest = process.stdout.read()
    if rest or process.wait(timeout=300) != 1:
        raise SystemExit(f"at the end: {rest!r}, status {process.returncode}")


if __name__ == "__main__":
    main()
