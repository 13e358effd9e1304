#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT

"""check-terms finds a retired word in prose, in a part of a name and in a file name, and nothing in a longer word."""

import shutil
import subprocess
import tempfile
import unittest
from pathlib import Path

HERE = Path(__file__).resolve().parent


def findings(name: str, text: str) -> list[str]:
    with tempfile.TemporaryDirectory() as folder:
        root = Path(folder)
        (root / "docs").mkdir()
        shutil.copy(HERE.parents[1] / "docs/glossary.md", root / "docs")
        (root / name).write_text(text, encoding="utf-8")
        subprocess.run(["git", "init", "-q", "."], cwd=root, check=True)
        subprocess.run(["git", "add", "-A"], cwd=root, check=True)
        run = subprocess.run([HERE / "check-terms", root], capture_output=True, text=True, check=False)
        lines = run.stdout.splitlines()
        assert run.returncode == (1 if lines else 0), run.stderr
        return lines


class CheckTerms(unittest.TestCase):
    def test_a_word_of_prose_is_found_with_its_line(self) -> None:
        self.assertEqual(1, len(findings("a.md", "One.\nA test tells more.\n")))
        self.assertIn("a.md:2: 'tells'", findings("a.md", "One.\nA test tells more.\n")[0])

    def test_parts_of_names_are_words(self) -> None:
        for name in ("tellTheUser", "listTold", "told_name", "TwinFinder", "given back"):
            self.assertEqual(1, len(findings("a.cpp", f"int {name};\n")), name)

    def test_file_names_count(self) -> None:
        self.assertEqual(1, len(findings("check_options_told.py", "")))

    def test_longer_words_and_names_that_hosts_know_stay(self) -> None:
        self.assertEqual([], findings("a.cpp", "untold intellect isAddNode layoutUnknownChildren busY business\n"))
        self.assertEqual(1, len(findings("a.cpp", "// an add-node\n")))
        self.assertEqual(1, len(findings("a.cpp", "float busX;\n")))


if __name__ == "__main__":
    unittest.main()
