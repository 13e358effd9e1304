#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""Runs one case file against the olvane command; the form is described in README.md.

Usage: run_case.py PATH/TO/olvane CASEFILE
"""

import os
import re
import shutil
import subprocess
import sys
import tempfile


class Step:
    def __init__(self, command):
        self.command = command
        self.status = 0
        self.streams = {">": [], "!": []}
        self.exists = []
        self.absent = []


def read_steps(path):
    steps = []
    with open(path, encoding="utf-8") as file:
        for line in file:
            line = line.rstrip("\n")
            if line.startswith("$ "):
                steps.append(Step(line[2:]))
            elif line[:1] in (">", "!"):
                steps[-1].streams[line[0]].append(line[1:])
            elif line.startswith("status "):
                steps[-1].status = int(line.split()[1])
            elif line.startswith(("exists ", "absent ")):
                getattr(steps[-1], line[:6]).append(line[7:])
            elif line.strip() and not line.startswith("#"):
                raise SystemExit(f"{path}: not understood: {line}")
    if not steps:
        raise SystemExit(f"{path}: no command")
    return steps


def fits(wanted, line):
    if wanted.startswith("~ "):
        return re.search(wanted[2:], line) is not None
    return wanted == " " + line or (wanted == "" and line == "")


def complaint_about(name, wanted, text):
    lines = text.splitlines()
    open_end = "*" in wanted
    wanted = [w for w in wanted if w != "*"]
    if open_end:
        missing = [w for w in wanted if not any(fits(w, line) for line in lines)]
        return f"{name} lacks {missing}" if missing else None
    if len(lines) != len(wanted):
        return f"{name} has {len(lines)} lines, not {len(wanted)}"
    for w, line in zip(wanted, lines):
        if not fits(w, line):
            return f"{name}: wanted {w!r}, found {line!r}"
    return None


def complaints_about(step, result, folder):
    found = []
    if result.returncode != step.status:
        found.append(f"status {result.returncode}, not {step.status}")
    found.append(complaint_about("standard output", step.streams[">"], result.stdout.decode("utf-8", "replace")))
    found.append(complaint_about("standard error", step.streams["!"], result.stderr.decode("utf-8", "replace")))
    found += [f"{name} is missing" for name in step.exists if not os.path.exists(os.path.join(folder, name))]
    found += [f"{name} was left" for name in step.absent if os.path.lexists(os.path.join(folder, name))]
    return [f for f in found if f]


def run_step(step, folder, environment):
    return subprocess.run(["bash", "-c", step.command], cwd=folder, env=environment, capture_output=True, timeout=600)


def main():
    command, case = os.path.abspath(sys.argv[1]), sys.argv[2]
    here = os.path.dirname(os.path.abspath(__file__))
    environment = dict(
        os.environ,
        PATH=os.path.dirname(command) + os.pathsep + os.environ["PATH"],
        CASE_FOLDER=here,
        CLI_FOLDER=os.path.join(here, "../../apps/cli"),
    )
    with tempfile.TemporaryDirectory() as parent:
        folder = os.path.join(parent, "run")
        shutil.copytree(os.path.join(here, "data"), folder)
        for step in read_steps(case):
            result = run_step(step, folder, environment)
            complaints = complaints_about(step, result, folder)
            if complaints:
                print(
                    f"$ {step.command}\n{result.stdout.decode('utf-8', 'replace')}"
                    f"{result.stderr.decode('utf-8', 'replace')}"
                )
                raise SystemExit("\n".join(complaints))


if __name__ == "__main__":
    main()
