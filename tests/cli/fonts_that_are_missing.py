#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""Letters that no font shows are never drawn as empty boxes: a PNG or PDF of them is refused by script and package,
an SVG, whose reader may have other fonts, is written with a warning that names both.

Usage: fonts_that_are_missing.py PATH/TO/olvane

Fontconfig is given DejaVu alone, or nothing, so that the other fonts are missing on any machine.
"""

import os
import pathlib
import subprocess
import sys
import tempfile

DEJAVU = pathlib.Path("/usr/share/fonts/truetype/dejavu")
NAMES = {
    "Ada": [],
    "\u0410\u0434\u0430 \u05e9\u05e8\u05d4 \u0645\u062d\u0645\u062f": [],
    "\u0e2a\u0e21\u0e0a\u0e32\u0e22": ["Thai", "fonts-thai-tlwg"],
    "\u6bdb\u6cfd\u4e1c": ["Chinese and Japanese", "fonts-noto-cjk"],
    "\u3072\u3089\u304c\u306a": ["Japanese", "fonts-noto-cjk"],
    "\ud55c\uae00": ["Korean", "fonts-noto-cjk"],
    "\u0930\u093e\u092e": ["Devanagari", "fonts-noto-core"],
    "\U0001f9d9": ["emoji", "fonts-noto-color-emoji"],
    "\u0e2a \u6bdb": ["Thai", "Chinese and Japanese", ", and none shows "],
}


def main():
    olvane = sys.argv[1]
    if not DEJAVU.is_dir():
        print("skipped: fonts-dejavu-core is not installed")
        return 77
    with tempfile.TemporaryDirectory() as folder:
        work = pathlib.Path(folder)
        config = work / "fonts.conf"
        config.write_text(f"<fontconfig><dir>{DEJAVU}</dir><cachedir>{work}/cache</cachedir></fontconfig>")
        environment = {**os.environ, "FONTCONFIG_FILE": str(config)}
        for name, stated in NAMES.items():
            family = work / "family.ged"
            family.write_text(f"0 HEAD\n1 CHAR UTF-8\n0 @I1@ INDI\n1 NAME {name} /Berg/\n0 TRLR\n", encoding="utf-8")
            for form in ("png", "pdf", "svg"):
                out = work / f"out.{form}"
                out.unlink(missing_ok=True)
                done = subprocess.run(
                    [olvane, "draw", str(family), "--focus", "1", "-o", str(out)],
                    env=environment,
                    capture_output=True,
                    text=True,
                    check=False,
                )
                refused = bool(stated) and form != "svg"
                assert done.returncode == (2 if refused else 0), (name, form, done.returncode, done.stderr)
                assert out.exists() != refused, (name, form)
                for part in stated:
                    assert part in done.stderr, (name, form, part, done.stderr)
                assert stated or done.stderr == "", (name, form, done.stderr)
                assert done.stderr.count("\n") == (1 if stated else 0), (name, form, done.stderr)
        svg = (work / "out.svg").read_text(encoding="utf-8")
        for fallback in (
            "Noto Sans CJK SC",
            "Noto Sans Arabic",
            "Noto Sans Hebrew",
            "Noto Sans Thai",
            "Noto Sans Devanagari",
            "Noto Color Emoji",
        ):
            assert fallback in svg, fallback
    return 0


sys.exit(main())
