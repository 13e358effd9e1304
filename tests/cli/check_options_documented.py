#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""Every option of the command stands in its man page and in the completions of each shell.

Usage: check_options_documented.py PATH/TO/olvane APPS_CLI_FOLDER
"""

import pathlib
import re
import subprocess
import sys


def options_of(command, subcommand):
    text = subprocess.run([command, *subcommand, "--help"], capture_output=True, text=True, check=True).stdout
    return set(re.findall(r"(?<![\w-])--[a-z][a-z-]+", text.split("Options:", 1)[1]))


def main():
    command, folder = sys.argv[1], pathlib.Path(sys.argv[2])
    options = options_of(command, [])
    for subcommand in ("people", "layout", "draw", "batch", "check", "kin", "judge", "page"):
        options |= options_of(command, [subcommand])
    if "--focus" not in options or "--version" not in options:
        raise SystemExit(f"the help lists too little: {sorted(options)}")
    man = (folder / "olvane.1").read_text(encoding="utf-8").replace("\\-", "-")
    texts = {"man page": man}
    for name in ("olvane.bash", "_olvane"):
        texts[name] = (folder / "completions" / name).read_text(encoding="utf-8")
    fish = (folder / "completions" / "olvane.fish").read_text(encoding="utf-8")
    texts["olvane.fish"] = " ".join("--" + name for name in re.findall(r"-l ([a-z-]+)", fish))
    missing = [
        f"{name} lacks {option}"
        for name, text in texts.items()
        for option in sorted(options)
        if not re.search(re.escape(option) + r"(?![\w-])", text)
    ]
    if missing:
        raise SystemExit("\n".join(missing))


if __name__ == "__main__":
    main()
