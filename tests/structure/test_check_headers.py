#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT

"""check-headers finds every way in which what is installed, what is listed and what is included may disagree."""

import tempfile
import unittest
from importlib.machinery import SourceFileLoader
from importlib.util import module_from_spec, spec_from_loader
from pathlib import Path

loader = SourceFileLoader("check_headers", str(Path(__file__).resolve().parent / "check-headers"))
checker = module_from_spec(spec_from_loader("check_headers", loader))
loader.exec_module(checker)

LIBRARIES = ("engine", "family", "gedcom", "picture", "charts", "draw")


def findings(changes: dict[str, str]) -> list[str]:
    """Of a tree in which draw has a public header, one in detail/, one in shared/ and an internal one, and changes."""
    files = {f"{library}/{name}": "" for library in LIBRARIES for name in ("README.md", "CMakeLists.txt")}
    files |= {
        "draw/README.md": "## Public headers\n\n- `olvane/draw/Art.h`: begin here\n\n## Else\n",
        "draw/CMakeLists.txt": "target_sources(d PUBLIC FILE_SET HEADERS FILES\n  olvane/draw/Art.h\n  olvane/draw/detail/Ink.h)\n",
        "draw/olvane/draw/Art.h": "#include <olvane/draw/detail/Ink.h>\n",
        "draw/olvane/draw/detail/Ink.h": "",
        "draw/olvane/draw/shared/Brush.h": "",
        "draw/olvane/draw/StrokeInternal.h": "",
    } | changes
    with tempfile.TemporaryDirectory() as folder:
        for name, text in files.items():
            path = Path(folder) / name
            path.parent.mkdir(parents=True, exist_ok=True)
            path.write_text(text, encoding="utf-8")
        return checker.wrong_in(Path(folder))


class CheckHeaders(unittest.TestCase):
    def check(self, expected: str, changes: dict[str, str]) -> None:
        self.assertEqual([expected], findings(changes))

    def test_a_tree_in_order_has_no_findings(self) -> None:
        self.assertEqual([], findings({}))

    def test_every_public_header_is_listed_once(self) -> None:
        line = "- `olvane/draw/Art.h`: begin here\n"
        self.check("draw/README.md: olvane/draw/Art.h is installed, and not listed", {"draw/README.md": line})
        listed = "## Public headers\n" + line
        self.check("draw/README.md: olvane/draw/Art.h is listed twice", {"draw/README.md": listed + line})
        other = listed + "- `olvane/draw/Map.h`: a map\n"
        self.check("draw/README.md: olvane/draw/Map.h is listed, and not installed", {"draw/README.md": other})

    def test_every_header_is_of_one_kind(self) -> None:
        self.check(
            "draw/olvane/draw/Map.h: neither installed nor in shared/ nor an ...Internal.h",
            {"draw/olvane/draw/Map.h": ""},
        )
        self.check("draw/olvane/draw/detail/Ink.h: no public header needs it", {"draw/olvane/draw/Art.h": ""})

    def test_what_is_not_installed_is_in_no_installed_header(self) -> None:
        ink = "#include <olvane/draw/detail/Ink.h>\n"
        for name in ("shared/Brush.h", "StrokeInternal.h"):
            self.check(
                f"draw/olvane/draw/Art.h:2: olvane/draw/{name} is not installed",
                {"draw/olvane/draw/Art.h": f"{ink}#include <olvane/draw/{name}>\n"},
            )

    def test_others_include_public_headers_alone(self) -> None:
        for name in ("detail/Ink.h", "shared/Brush.h", "StrokeInternal.h"):
            for path in ("apps/cli/main.cpp", "bindings/c/c.mm", "docs/guide/draw.md"):
                self.check(
                    f"{path}:1: olvane/draw/{name} is not for others", {path: f'#include "olvane/draw/{name}"\n'}
                )
        self.assertEqual([], findings({"apps/cli/main.cpp": "#include <olvane/draw/Art.h>\n"}))

    def test_other_libraries_include_what_is_shared(self) -> None:
        self.assertEqual([], findings({"charts/a.cpp": "#include <olvane/draw/shared/Brush.h>\n"}))
        self.assertEqual(1, len(findings({"charts/a.cpp": "#include <olvane/draw/detail/Ink.h>\n"})))


if __name__ == "__main__":
    unittest.main()
