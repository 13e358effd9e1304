# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""What a layout gives: boxes, and the lines that hang from them."""

from __future__ import annotations

from dataclasses import dataclass
from enum import IntEnum
from typing import NamedTuple


class RecordKind(IntEnum):
    """Whether a record is of a person whom the host knows."""

    PERSON = 0
    MISSING_FATHER = 1  # an add-node: an empty box where the host knows no father
    MISSING_MOTHER = 2


class Segment(NamedTuple):
    """A straight piece of a line, in points."""

    x1: int
    y1: int
    x2: int
    y2: int


@dataclass(frozen=True, slots=True)
class Record:
    """One box. (x, y) is its upper-left corner, in points.

    An add-node has a negative id, and child is the person whose parent is missing; elsewhere it is None. One person may
    stand in several boxes, and segments may repeat.
    """

    id: int
    x: int
    y: int
    has_hidden_relatives: bool
    kind: RecordKind
    child: int | None
    segments: tuple[Segment, ...]
