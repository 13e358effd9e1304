# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""What a host can choose."""

from __future__ import annotations

import ctypes
import math
import operator
from dataclasses import dataclass, field, fields
from enum import Enum, IntFlag


class View(Enum):
    """FAMILY: relatives above, beside and below. PEDIGREE: ancestors, lying sideways."""

    FAMILY = "family"
    PEDIGREE = "pedigree"


class Shown(IntFlag):
    """Relatives that a family view shows."""

    AUNTS_UNCLES = 0x01
    COUSINS = 0x02  # needs aunts and uncles
    SIBLINGS = 0x04
    SIBLING_SPOUSES = 0x08
    NIECES_NEPHEWS = 0x10
    GRANDCHILDREN = 0x20
    GREAT_GRANDPARENTS = 0x40
    SPOUSES_OF_CHILDREN = 0x80
    ALL = 0xFF


@dataclass(frozen=True)
class Sizes:
    """The sizes of the drawing, in points.

    Raises TypeError for a size that is no number, and ValueError for one that is not finite in single precision.
    """

    node_width: float = 55.0
    node_height: float = 80.0
    horz_padding: float = 25.0  # gap between boxes of a row
    vert_padding: float = 30.0  # gap between generations
    spouse_line_step: float = 10.0  # between the stacked lines of one person's marriages
    line_inset: float = 0.0  # of a marriage line from a box's left edge; read by the pedigree alone

    def __post_init__(self) -> None:
        for size in fields(self):
            _check_size(size.name, getattr(self, size.name))


@dataclass(frozen=True)
class Options:
    """Choices of one layout.

    shown is read by the family view. generations, 1 to 1000, counts a pedigree's columns, the focus's own included; a
    full ancestry of n columns is 2**n - 1 boxes. flag_depth, 0 or more, counts the generations of a pedigree, the
    focus's own included, in which a parent's partners who are off the chart raise the flag.

    Raises TypeError for a choice of another type, and ValueError for a number out of its range.
    """

    sizes: Sizes = field(default_factory=Sizes)
    shown: Shown = Shown.ALL
    generations: int = 5
    flag_depth: int = 4

    def __post_init__(self) -> None:
        if not isinstance(self.sizes, Sizes):
            raise TypeError(f"sizes is {self.sizes!r}, and takes Sizes")
        _check_whole("shown", self.shown, 0, Shown.ALL.value)
        _check_whole("generations", self.generations, 1, 1000)
        _check_whole("flag_depth", self.flag_depth, 0, 2**31 - 1)


def _check_size(name: str, size: float) -> None:
    try:
        single = ctypes.c_float(size).value
    except TypeError:
        raise TypeError(f"{name} is {size!r}, and takes a number") from None
    except OverflowError:
        single = math.inf
    if not math.isfinite(single):
        raise ValueError(f"{name} is {size!r}, and takes a finite number of single precision")


def _check_whole(name: str, value: int, least: int, most: int) -> None:
    try:
        whole = operator.index(value)
    except TypeError:
        raise TypeError(f"{name} is {value!r}, and takes a whole number") from None
    if not least <= whole <= most:
        raise ValueError(f"{name} is {whole}, and takes a whole number of {least} to {most}")
