# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""What makes a picture hard to read, counted."""

from __future__ import annotations

import ctypes
from ctypes import POINTER, byref, c_double, c_int, c_int64, c_size_t, c_void_p
from dataclasses import dataclass, fields
from typing import Any

from olvane import _native
from olvane._errors import Status
from olvane._family import Family
from olvane._file import File
from olvane._picture import Picture
from olvane._picture_native import PictureHandle


@dataclass(frozen=True, slots=True)
class Judgement:
    """What is counted in a picture, and what it measures; docs/judge.md defines each count.

    untold are known relations that nothing expresses, None where nothing was known. Width and height are in points, areas in
    boxes of mean size for each person, line lengths in mean box widths.
    """

    boxes: int
    persons: int
    families: int
    overlaps: int
    hits: int
    crossings: int
    tracks: int
    touches: int
    unjoined: int
    untold: int | None
    couples: int
    side_by_side: int
    repeats: int
    unmarked: int
    slanted: int
    same_person_marks: int
    parents_elsewhere_marks: int
    partners_elsewhere_marks: int
    width: float
    height: float
    area_per_person: float
    aspect: float
    median_line_length: float
    long_line_length: float

    @property
    def trouble(self) -> bool:
        """Whether something is wrong, and not only hard to avoid."""
        wrong = self.overlaps + self.hits + self.tracks + self.touches + self.unjoined + self.unmarked
        return wrong + (self.untold or 0) > 0


_MEASURES = (
    "width",
    "height",
    "area_per_person",
    "aspect",
    "median_line_length",
    "long_line_length",
)


class _Judgement(ctypes.Structure):
    """olvane_judgement, whose fields are those of Judgement in their order."""

    _fields_ = [("struct_size", c_size_t)] + [
        (field.name, c_double if field.name in _MEASURES else c_int64) for field in fields(Judgement)
    ]


def judge(picture: Picture, family: Family | File | None = None) -> Judgement:
    """Count what makes a picture hard to read: boxes that overlap, lines that cross or run through boxes, and so on.

    family says who is related to whom, by the ids of the picture, for relations that the picture does not express. Raises
    ValueError for a copy of a picture, of which the library keeps nothing.
    """
    if not isinstance(picture._handle, PictureHandle):
        raise ValueError("only a picture that olvane.picture returned can be judged, not a copy of it")
    known = family.family() if isinstance(family, File) else family
    found = _Judgement(struct_size=ctypes.sizeof(_Judgement))
    status = _judge(picture._handle.pointer, None if known is None else known._pointer, byref(found))
    if status != Status.OK:
        raise MemoryError("a picture could not be judged")
    values: dict[str, Any] = {field.name: getattr(found, field.name) for field in fields(Judgement)}
    if found.untold < 0:
        values["untold"] = None
    return Judgement(**values)


_judge = _native.library.olvane_picture_judge
_judge.argtypes = (c_void_p, c_void_p, POINTER(_Judgement))
_judge.restype = c_int
