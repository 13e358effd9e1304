# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""A plain drawing of boxes and lines, for a look at a layout: its boxes are labelled with ids."""

from __future__ import annotations

import os
from collections.abc import Iterable, Sequence
from html import escape

_MARGIN = 10


class Svg(str):
    """A drawing as the text of an SVG file. A notebook shows the picture."""

    def _repr_svg_(self) -> str:
        return str(self)

    def save(self, path: str | os.PathLike[str]) -> None:
        with open(path, "w", encoding="utf-8", newline="") as file:
            file.write(self)


def _number(value: float) -> str:
    return f"{value:.3f}".rstrip("0").rstrip(".")


def plain_drawing(
    boxes: Iterable[tuple[float, float, float, float, str]], lines: Iterable[tuple[float, float, float, float]]
) -> Svg:
    """Boxes as x, y, width, height and label, over lines as x1, y1, x2, y2."""
    boxes, lines = list(boxes), list(lines)
    if not boxes:
        return Svg('<svg xmlns="http://www.w3.org/2000/svg" viewBox="0 0 1 1"/>')
    left, right = _reach([(x, x + width) for x, _, width, _, _ in boxes], [(x1, x2) for x1, _, x2, _ in lines])
    top, bottom = _reach([(y, y + height) for _, y, _, height, _ in boxes], [(y1, y2) for _, y1, _, y2 in lines])
    size = f"{_number(right - left)} {_number(bottom - top)}"
    parts = [
        f'<svg xmlns="http://www.w3.org/2000/svg" viewBox="{_number(left)} {_number(top)} {size}"'
        ' font-family="sans-serif" font-size="10" text-anchor="middle">'
    ]
    path = "".join(f"M{_number(x1)} {_number(y1)}L{_number(x2)} {_number(y2)}" for x1, y1, x2, y2 in lines)
    parts.append(f'<path d="{path}" fill="none" stroke="#666"/>')
    for x, y, width, height, label in boxes:
        at = f'x="{_number(x)}" y="{_number(y)}" width="{_number(width)}" height="{_number(height)}"'
        dashes = "" if label else ' stroke-dasharray="3 3"'
        parts.append(f'<rect {at} rx="4" fill="#fff" stroke="#333"{dashes}/>')
        if label:
            middle = f'x="{_number(x + width / 2)}" y="{_number(y + height / 2 + 4)}"'
            parts.append(f"<text {middle}>{escape(label)}</text>")
    return Svg("\n".join([*parts, "</svg>", ""]))


def _reach(*spans: Sequence[tuple[float, float]]) -> tuple[float, float]:
    ends = [end for span in spans for pair in span for end in pair]
    return min(ends) - _MARGIN, max(ends) + _MARGIN
