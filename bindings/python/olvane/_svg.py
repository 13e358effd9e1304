# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""A plain drawing of boxes and lines, for a look at a layout: its boxes are labelled with ids."""

from __future__ import annotations

import os
from collections.abc import Iterable, Sequence
from html import escape
from math import cos, pi, sin

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


def round_drawing(
    middle: tuple[float, float], rings: Sequence[float], cells: Iterable[tuple[int, float, float, str]]
) -> Svg:
    """Cells as ring, degrees from and to, clockwise from the top, and label; ring i begins at rings[i]."""
    reach = rings[-1] + _MARGIN
    x, y = middle
    parts = [
        f'<svg xmlns="http://www.w3.org/2000/svg" viewBox="{_number(x - reach)} {_number(y - reach)} '
        f'{_number(2 * reach)} {_number(2 * reach)}" font-family="sans-serif" font-size="10" text-anchor="middle">'
    ]
    for ring, start, end, label in cells:
        inner, outer, turn = rings[ring], rings[ring + 1], (start + end) / 2
        parts.append(f'<path d="{_cell(middle, inner, outer, start, end)}" fill="#fff" stroke="#333"/>')
        at = _point(middle, 0 if ring == 0 else (inner + outer) / 2, turn)
        parts.append(f'<text x="{_number(at[0])}" y="{_number(at[1] + 4)}">{escape(label)}</text>')
    return Svg("\n".join([*parts, "</svg>", ""]))


def _point(middle: tuple[float, float], radius: float, degrees: float) -> tuple[float, float]:
    return middle[0] + radius * sin(degrees * pi / 180), middle[1] - radius * cos(degrees * pi / 180)


def _cell(middle: tuple[float, float], inner: float, outer: float, start: float, end: float) -> str:
    """The outline of a piece of a ring, in arcs of at most a half turn: an arc of a whole one is drawn as none."""
    half = (start + end) / 2

    def arc(radius: float, turns: Sequence[float], sweep: int) -> str:
        ends = [" ".join(map(_number, _point(middle, radius, turn))) for turn in turns]
        return "".join(f"A{_number(radius)} {_number(radius)} 0 0 {sweep} {end}" for end in ends)

    def at(radius: float, turn: float) -> str:
        return " ".join(map(_number, _point(middle, radius, turn)))

    outside = f"M{at(outer, start)}{arc(outer, (half, end), 1)}"
    return outside + (f"L{at(inner, end)}{arc(inner, (half, start), 0)}" if inner > 0 else "") + "Z"


def _reach(*spans: Sequence[tuple[float, float]]) -> tuple[float, float]:
    ends = [end for span in spans for pair in span for end in pair]
    return min(ends) - _MARGIN, max(ends) + _MARGIN
