#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""Long work shows on a terminal how far it is, in a line that is gone at the end; in a pipe, and of quick work, nothing.

Usage: progress_on_a_terminal.py PATH/TO/olvane GEDCOMFILE [converts]     converts: it writes PDF
"""

import os
import pty
import select
import signal
import subprocess
import sys
import tempfile
import time

from colours_on_a_terminal import expect, on_terminal, rest_of

CLEAR = b"\r\x1b[K"
PERSONS = 6000
QUICK = 0.5  # seconds, in which nothing is shown


def made_family():
    """Couples whose children marry far away, so that lines cross and the order takes long."""
    lines = ["0 HEAD"]
    for person in range(PERSONS):
        lines += [f"0 @I{person}@ INDI", f"1 NAME N{person} /S/"]
    couples = PERSONS // 2
    for couple in range(couples):
        lines += [f"0 @F{couple}@ FAM", f"1 HUSB @I{2 * couple}@", f"1 WIFE @I{2 * couple + 1}@"]
        row, place = divmod(couple, 100)
        if row + 1 < couples // 100:
            below = 200 * (row + 1)
            lines += [f"1 CHIL @I{below + 2 * place}@", f"1 CHIL @I{below + 2 * ((41 * place + 13) % 100) + 1}@"]
    return "\n".join([*lines, "0 TRLR", ""])


def large_file():
    """Mostly a note, since it is the size that takes long."""
    line = "2 CONT " + 240 * "x" + "\n"
    return "0 HEAD\n0 @I1@ INDI\n1 NAME A\n1 NOTE\n" + 140_000 * line + "0 TRLR\n"


def shown(text):
    """What stood in the line, one after the other."""
    return [part for part in text.split(CLEAR) if part]


def run_time(process):
    """In nanoseconds on processors."""
    with open(f"/proc/{process.pid}/schedstat", encoding="ascii") as file:
        return int(file.read().split()[0])


def on_terminal_slowly(command):
    """As on_terminal; until something is shown the command pauses again and again, so that its work is long on the quickest
    machine."""
    leader, follower = pty.openpty()
    process = subprocess.Popen(command, stdout=subprocess.DEVNULL, stderr=follower)
    os.close(follower)
    is_shown = False
    while not is_shown:
        process.send_signal(signal.SIGSTOP)
        time.sleep(0.02)
        before = run_time(process)
        process.send_signal(signal.SIGCONT)
        while not is_shown and run_time(process) < before + 5_000_000:
            is_shown = bool(select.select([leader], [], [], 0.001)[0])
    return rest_of(leader, process)


def check(command, words):
    text = on_terminal_slowly(command)
    expect(text.startswith(CLEAR) and text.endswith(CLEAR), f"not a line that is removed: {text[-200:]!r}")
    expect(b"\n" not in text, "more than one line")
    for word in words:
        expect(any(word in part for part in shown(text)), f"{word!r} is not in {shown(text)}")
    piped = subprocess.run(command, capture_output=True, check=True)
    expect(not piped.stderr, f"progress in a pipe: {piped.stderr[:200]!r}")


def batch_with_a_pause(olvane, file):
    """What a batch shows whose second focus comes after the time in which nothing is shown."""
    leader, follower = pty.openpty()
    command = [olvane, "batch", file, "--unbuffered", "--focus-from", "-"]
    with subprocess.Popen(command, stdin=subprocess.PIPE, stdout=subprocess.PIPE, stderr=follower) as process:
        os.close(follower)
        process.stdin.write(b"1\n")
        process.stdin.flush()
        # The time counts from the start of the work, which is behind it when there is an answer.
        process.stdout.readline()
        time.sleep(QUICK + 0.1)
        process.stdin.write(b"2\n")
        process.stdin.close()
        text = b""
        try:
            while part := os.read(leader, 4096):
                text += part
        except OSError:  # the other end is closed
            pass
    os.close(leader)
    return text


def shown_of_quick_work(command):
    """Of a run that was as quick as that; None where this machine is too busy for one."""
    for _ in range(50):
        start = time.monotonic()
        text = on_terminal(command)
        if time.monotonic() - start < QUICK:
            return text
    return None


def main():
    olvane, small = sys.argv[1:3]
    converts = "converts" in sys.argv[3:]
    with tempfile.TemporaryDirectory() as folder:
        file = os.path.join(folder, "made.ged")
        with open(file, "w", encoding="utf-8") as made:
            made.write(made_family())
        everybody = ["--view", "everybody", "--effort", "4"]
        check([olvane, "draw", file, "--focus", "1", "-o", "-", *everybody], [b"ordering rows: ", b"drawing"])
        check([olvane, "layout", file, "--focus", "1", "--format", "json", *everybody], [b"%", b"routing lines"])
        large = os.path.join(folder, "large.ged")
        with open(large, "w", encoding="utf-8") as made:
            made.write(large_file())
        check([olvane, "layout", large, "--focus", "1"], [b"reading the file"])
        if converts:
            drawing = [olvane, "draw", file, "--focus", "1", "--view", "everybody", "--effort", "0"]
            check([*drawing, "-o", os.path.join(folder, "made.pdf")], [b"writing the PDF"])
    slow = batch_with_a_pause(olvane, small)
    expect(shown(slow)[-1:] == [b"2"] and slow.endswith(CLEAR), f"no count of a batch: {slow!r}")
    quick = shown_of_quick_work([olvane, "layout", small, "--focus", "1"])
    if quick is None:
        print("on this machine no work is quick")
    expect(not quick, f"progress of quick work: {quick!r}")


if __name__ == "__main__":
    main()
