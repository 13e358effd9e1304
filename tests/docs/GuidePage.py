# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""Pages of the guides as the tests read them: their code blocks, by section.

A block's first line says what becomes of it:

    ```c file=examples/c/first_tree.c     quotes that file, and is saved under its name by readers who follow the page
    ```sh                                 is run
    ```text                               is what the block before it prints
"""

from __future__ import annotations

import re
from dataclasses import dataclass
from pathlib import Path

_FENCE = re.compile(r"^```(\w*)(?: file=(\S+))?$")


@dataclass
class Block:
    section: str
    language: str
    file: str | None
    text: str
    line: int  # of the opening fence, from 1
    end: int  # of the closing fence


def blocks_of(page: Path) -> list[Block]:
    lines = page.read_text(encoding="utf-8").splitlines()
    blocks: list[Block] = []
    section = ""
    begin = 0
    for number, line in enumerate(lines, 1):
        fence = _FENCE.match(line)
        if begin:
            if line == "```":
                head = _FENCE.match(lines[begin - 1])
                assert head is not None
                text = "".join(f"{row}\n" for row in lines[begin : number - 1])
                blocks.append(Block(section, head[1], head[2], text, begin, number))
                begin = 0
        elif fence:
            begin = number
        elif line.startswith("```"):
            raise ValueError(f"{page}:{number}: not a form of block that the tests know: {line}")
        elif line.startswith("#"):
            section = line.lstrip("#").strip()
    return blocks


def quoted(file: Path) -> str:
    """A source as a page quotes it: without the lines of the licence."""
    lines = file.read_text(encoding="utf-8").splitlines()
    kept = [line for line in lines if "SPDX-" not in line]
    while kept and not kept[0]:
        kept.pop(0)
    return "".join(f"{line}\n" for line in kept)
