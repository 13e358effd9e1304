#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""An interrupted batch ends behind a whole line, in the order asked for.

Usage: interrupt_batch.py PATH/TO/olvane GEDCOMFILE
"""

import fcntl
import os
import signal
import struct
import subprocess
import sys
import termios
import time

F_SETPIPE_SZ = 1031  # Linux; Python 3.10 has it in fcntl


def start(command, file):
    return subprocess.Popen(
        [command, "batch", file, "--focus-from", "-"], stdin=subprocess.PIPE, stdout=subprocess.PIPE
    )


def require_whole_lines(batch, first, text):
    status = batch.wait()
    if status != 130:
        raise SystemExit(f"status {status}, not 130")
    if not text.endswith(b";\n"):
        raise SystemExit(f"ends in the middle of a line: {text[-60:]!r}")
    if any(line != first for line in text.splitlines(keepends=True)):
        raise SystemExit("a line was cut")


def interrupt_at_work(command, file):
    batch = start(command, file)
    # More than a block of focuses, and the stream stays open: the command is at work or waiting, never done.
    batch.stdin.write(b"1\n" * 600)
    batch.stdin.flush()
    first = batch.stdout.readline()
    batch.send_signal(signal.SIGINT)
    batch.stdin.close()
    require_whole_lines(batch, first, first + batch.stdout.read())


def held_bytes(pipe):
    return struct.unpack("i", fcntl.ioctl(pipe, termios.FIONREAD, b"\0" * 4))[0]


def is_asleep(process):
    with open(f"/proc/{process.pid}/stat", encoding="ascii") as file:
        return file.read().rsplit(")", 1)[1].split()[0] == "S"


def wait_until_stuck(process):
    """Until the command waits for its reader: it sleeps, and for a second its pipe has held as much as before."""
    deadline = time.monotonic() + 100
    held, since = 0, time.monotonic()
    while held == 0 or time.monotonic() - since < 1:
        if time.monotonic() > deadline:
            raise SystemExit("the command never came to wait for its reader")
        time.sleep(0.02)
        now = held_bytes(process.stdout)
        if now != held or not is_asleep(process):
            held, since = now, time.monotonic()


def interrupt_before_a_full_pipe(command, file):
    """Nobody reads while the interrupt comes, so that it breaks into a write."""
    batch = start(command, file)
    fcntl.fcntl(batch.stdout.fileno(), F_SETPIPE_SZ, 4096)
    batch.stdin.write(b"1\n" * 600)
    batch.stdin.close()
    wait_until_stuck(batch)
    batch.send_signal(signal.SIGINT)
    time.sleep(0.1)
    if batch.poll() is not None:
        raise SystemExit(f"ended with {batch.returncode} before its line was taken")
    text = batch.stdout.read()
    require_whole_lines(batch, text.split(b"\n", 1)[0] + b"\n", text)


def main():
    command, file = os.path.abspath(sys.argv[1]), sys.argv[2]
    interrupt_at_work(command, file)
    interrupt_before_a_full_pipe(command, file)


if __name__ == "__main__":
    main()
