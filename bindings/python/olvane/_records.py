# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""What a layout gives: boxes, and the lines that hang from them."""

from __future__ import annotations

import ctypes
import struct
from collections.abc import Callable, Iterable, Iterator, Sequence
from enum import IntEnum
from typing import NamedTuple, overload

from olvane._svg import Svg, plain_drawing


class RecordKind(IntEnum):
    """Whether a record is of a person whom the host knows."""

    PERSON = 0
    MISSING_FATHER = 1  # an unknown parent: an empty box where the host knows no father
    MISSING_MOTHER = 2


class Segment(NamedTuple):
    """A straight piece of a line, in points."""

    x1: int
    y1: int
    x2: int
    y2: int


class Record(NamedTuple):
    """One box. (x, y) is its upper-left corner, in points.

    An unknown parent has a negative id, and child is the person whose parent is unknown; elsewhere it is None. One person may
    stand in several boxes, and segments may repeat.
    """

    id: int
    x: int
    y: int
    has_hidden_relatives: bool
    kind: RecordKind
    child: int | None
    segments: tuple[Segment, ...]


# olvane_record: id, x, y, the flag, the kind, the child, and where its segments are and how many.
_RECORD = struct.Struct("@qiiiiqPN")
_SEGMENT = struct.Struct("@iiii")
_KINDS = tuple(RecordKind)


def _lines_of(records: bytes, places: Iterable[int]) -> Iterator[tuple[int, int]]:
    """Where the segments of each record lie, and how many."""
    for place in places:
        *_, begin, segments = _RECORD.unpack_from(records, place * _RECORD.size)
        yield begin, segments


def _line_ends_of(records: bytes, places: Iterable[int]) -> Iterator[int]:
    for begin, segments in _lines_of(records, places):
        if segments:
            yield begin + segments * _SEGMENT.size


class Layout(Sequence[Record]):
    """A layout as the library gave it, in two runs of bytes: a record is made when it is looked at.

    Equal layouts compare equal. Iterating makes all records; so does list.
    """

    __slots__ = ("_records", "_segments", "_first_segment", "_box")

    def __init__(self, records: bytes, segments: bytes, first_segment: int) -> None:
        self._records = records
        self._segments = segments
        self._first_segment = first_segment  # where they lay, for records say where theirs begin
        self._box = (55.0, 80.0)  # width and height, for a drawing

    @classmethod
    def copied_from(cls, address: int | None, count: int) -> Layout:
        """From count structs of C; all segments lie behind each other in the order of their records."""
        if not address or not count:
            return cls(b"", b"", 0)
        records = ctypes.string_at(address, count * _RECORD.size)
        first = next((place for place, segments in _lines_of(records, range(count)) if segments), 0)
        last = next((end for end in _line_ends_of(records, reversed(range(count)))), first)
        return cls(records, ctypes.string_at(first, last - first) if first else b"", first)

    def __len__(self) -> int:
        return len(self._records) // _RECORD.size

    def __iter__(self) -> Iterator[Record]:
        segments = list(map(Segment._make, _SEGMENT.iter_unpack(self._segments)))
        at = 0
        for id, x, y, flag, kind, child, _, count in _RECORD.iter_unpack(self._records):
            own = tuple(segments[at : at + count])
            at += count
            yield Record(id, x, y, flag != 0, _KINDS[kind], child if kind else None, own)

    @overload
    def __getitem__(self, place: int) -> Record:
        ...

    @overload
    def __getitem__(self, place: slice) -> list[Record]:
        ...

    def __getitem__(self, place: int | slice) -> Record | list[Record]:
        if isinstance(place, slice):
            return list(self)[place]
        at = range(len(self))[place] * _RECORD.size
        id, x, y, flag, kind, child, lines, count = _RECORD.unpack_from(self._records, at)
        begin = lines - self._first_segment if count else 0
        found = _SEGMENT.iter_unpack(self._segments[begin : begin + count * _SEGMENT.size])
        return Record(id, x, y, flag != 0, _KINDS[kind], child if kind else None, tuple(map(Segment._make, found)))

    def __eq__(self, other: object) -> bool:
        if not isinstance(other, Layout):
            return NotImplemented
        return list(self) == list(other)

    def __hash__(self) -> int:
        return hash((len(self), self._segments))

    def svg(self, label: Callable[[int], str] = str) -> Svg:
        """A plain drawing; label gives the text of a person's box, and is the id by default."""
        return plain_drawing(
            ((record.x, record.y, *self._box, label(record.id) if record.id > 0 else "") for record in self),
            (segment for record in self for segment in record.segments),
        )

    def _repr_svg_(self) -> str:
        return self.svg()

    def __repr__(self) -> str:
        return f"Layout({list(self)!r})"
