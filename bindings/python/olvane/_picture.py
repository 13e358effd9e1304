# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""A layout as a picture: boxes, the families that join them, and lines that are routed around all boxes."""

from __future__ import annotations

import ctypes
from collections.abc import Callable
from ctypes import POINTER, byref, c_double, c_float, c_int, c_int32, c_int64, c_size_t, c_uint32, c_void_p
from dataclasses import dataclass
from enum import IntEnum
from typing import Any

from olvane import _native
from olvane._errors import LayoutError, Status
from olvane._family import ChildKind, Family, FamilyState
from olvane._host import Host
from olvane._layout import _laid_out, _message, _request, _Request
from olvane._options import Options, View
from olvane._svg import Svg, plain_drawing


class LineRole(IntEnum):
    """What a piece of a family's lines is for."""

    MARRIAGE = 0  # from parent to parent
    DROP = 1  # from the parents to the bar
    BAR = 2  # along the children
    STEM = 3  # to one child
    LINK = 4  # where there are no levels


class MarkKind(IntEnum):
    """What is expressed without a line."""

    SAME_PERSON = 0
    PARENTS_ELSEWHERE = 1
    PARTNERS_ELSEWHERE = 2


@dataclass(frozen=True, slots=True)
class PictureBox:
    """One box. (x, y) is its upper-left corner, in points.

    id is None for an unknown parent, and child_of is then the place of the box whose parent it is. repeat is 0 for a person
    with one box; else it counts the person's boxes from 1. The hidden counts are 0 where no Family is laid out.
    """

    id: int | None
    x: float
    y: float
    width: float
    height: float
    sex: int
    child_of: int | None
    repeat: int
    flag: bool
    hidden_parents: int
    hidden_partners: int
    hidden_children: int


@dataclass(frozen=True, slots=True)
class PictureLine:
    """A straight piece, horizontal or vertical.

    child is the place of the box of the child to whom the piece belongs alone. bridges are where it jumps over another
    family's line: the x of each on a horizontal piece, the y on a vertical one.
    """

    x1: float
    y1: float
    x2: float
    y2: float
    role: LineRole
    child: int | None
    bridges: tuple[float, ...]


@dataclass(frozen=True, slots=True)
class PictureFamily:
    """Persons joined by lines, as places of boxes; number is that of the Family, None without one."""

    parents: tuple[int, ...]
    children: tuple[int, ...]
    child_kinds: tuple[ChildKind, ...]
    state: FamilyState
    number: int | None
    lines: tuple[PictureLine, ...]


@dataclass(frozen=True, slots=True)
class PictureMark:
    """What is expressed without a line; marks of one number have one sign."""

    kind: MarkKind
    number: int
    boxes: tuple[int, ...]


@dataclass(frozen=True, slots=True)
class Picture:
    """Boxes in the order of the layout, families with their lines, and marks. focus is the place of the focus's box."""

    focus: int
    boxes: tuple[PictureBox, ...]
    families: tuple[PictureFamily, ...]
    marks: tuple[PictureMark, ...]

    def svg(self, label: Callable[[int], str] = str) -> Svg:
        """A plain drawing; label gives the text of a person's box, and is the id by default."""
        return plain_drawing(
            ((box.x, box.y, box.width, box.height, "" if box.id is None else label(box.id)) for box in self.boxes),
            ((line.x1, line.y1, line.x2, line.y2) for family in self.families for line in family.lines),
        )

    def _repr_svg_(self) -> str:
        return self.svg()


def picture(
    host: Host | Family,
    focus: int,
    view: View = View.FAMILY,
    options: Options | None = None,
    *,
    unknown_parents: bool = True,
) -> Picture:
    """The picture of a layout. Raises what :func:`layout` raises."""
    known = host._pointer if isinstance(host, Family) else None

    def read(request: _Request) -> Picture:
        made = c_void_p()
        status = _create(request._layout, known, 1 if unknown_parents else 0, byref(made))
        try:
            if status != Status.OK:
                raise LayoutError(Status(status), _message(status), "", [])
            return _picture_of(made)
        finally:
            _free(made)

    return _laid_out(_request(host, focus, view, options), read)


_NO_PLACE = -1
_UNKNOWN_PARENT = 1


class _Box(ctypes.Structure):
    _fields_ = [
        ("id", c_int64),
        ("x", c_double),
        ("y", c_double),
        ("width", c_float),
        ("height", c_float),
        ("kind", c_int32),
        ("sex", c_int32),
        ("child_of", c_int32),
        ("repeat", c_int32),
        ("flag", c_int32),
        ("hidden_parents", c_int32),
        ("hidden_partners", c_int32),
        ("hidden_children", c_int32),
        ("further_parents", c_int32),
    ]


class _Family(ctypes.Structure):
    _fields_ = [
        ("first_member", c_uint32),
        ("parent_count", c_uint32),
        ("child_count", c_uint32),
        ("first_line", c_uint32),
        ("line_count", c_uint32),
        ("number", c_uint32),
        ("state", c_int32),
    ]


class _Line(ctypes.Structure):
    _fields_ = [
        ("x1", c_double),
        ("y1", c_double),
        ("x2", c_double),
        ("y2", c_double),
        ("role", c_int32),
        ("child", c_int32),
        ("first_bridge", c_uint32),
        ("bridge_count", c_uint32),
    ]


class _Mark(ctypes.Structure):
    _fields_ = [("kind", c_int32), ("number", c_int32), ("boxes", c_int32 * 3)]


class _Arrays(ctypes.Structure):
    _fields_ = [
        ("struct_size", c_size_t),
        ("boxes", POINTER(_Box)),
        ("box_count", c_size_t),
        ("families", POINTER(_Family)),
        ("family_count", c_size_t),
        ("members", POINTER(c_int32)),
        ("child_kinds", POINTER(c_int32)),
        ("member_count", c_size_t),
        ("lines", POINTER(_Line)),
        ("line_count", c_size_t),
        ("bridges", POINTER(c_double)),
        ("bridge_count", c_size_t),
        ("marks", POINTER(_Mark)),
        ("mark_count", c_size_t),
        ("focus", c_int32),
        ("other", c_int32),
        ("arcs", c_void_p),
        ("arc_count", c_size_t),
        ("ring_radii", POINTER(c_double)),
        ("ring_radius_count", c_size_t),
        ("middle_x", c_double),
        ("middle_y", c_double),
        ("ways", c_void_p),
        ("way_count", c_size_t),
        ("way_boxes", POINTER(c_int32)),
        ("way_box_count", c_size_t),
        ("way_pieces", c_void_p),
        ("way_piece_count", c_size_t),
        ("focus_is", ctypes.c_char_p),
        ("other_is", ctypes.c_char_p),
    ]


def _place(number: int) -> int | None:
    return None if number == _NO_PLACE else number


def _picture_of(made: c_void_p) -> Picture:
    arrays = _Arrays(struct_size=ctypes.sizeof(_Arrays))
    status = _read(made, byref(arrays))
    if status != Status.OK:
        raise LayoutError(Status(status), _message(status), "", [])
    return Picture(
        focus=arrays.focus,
        boxes=tuple(_box(arrays.boxes[i]) for i in range(arrays.box_count)),
        families=tuple(_family(arrays, arrays.families[i]) for i in range(arrays.family_count)),
        marks=tuple(_mark(arrays.marks[i]) for i in range(arrays.mark_count)),
    )


def _box(box: Any) -> PictureBox:
    return PictureBox(
        id=None if box.kind == _UNKNOWN_PARENT else box.id,
        x=box.x,
        y=box.y,
        width=box.width,
        height=box.height,
        sex=box.sex,
        child_of=_place(box.child_of),
        repeat=box.repeat,
        flag=box.flag != 0,
        hidden_parents=box.hidden_parents,
        hidden_partners=box.hidden_partners,
        hidden_children=box.hidden_children,
    )


def _family(arrays: Any, family: Any) -> PictureFamily:
    first_child = family.first_member + family.parent_count
    children = range(first_child, first_child + family.child_count)
    return PictureFamily(
        parents=tuple(arrays.members[i] for i in range(family.first_member, first_child)),
        children=tuple(arrays.members[i] for i in children),
        child_kinds=tuple(ChildKind(arrays.child_kinds[i]) for i in children),
        state=FamilyState(family.state),
        number=family.number or None,
        lines=tuple(
            _line(arrays, arrays.lines[i]) for i in range(family.first_line, family.first_line + family.line_count)
        ),
    )


def _line(arrays: Any, line: Any) -> PictureLine:
    bridges = range(line.first_bridge, line.first_bridge + line.bridge_count)
    return PictureLine(
        line.x1,
        line.y1,
        line.x2,
        line.y2,
        LineRole(line.role),
        _place(line.child),
        tuple(arrays.bridges[i] for i in bridges),
    )


def _mark(mark: Any) -> PictureMark:
    return PictureMark(MarkKind(mark.kind), mark.number, tuple(box for box in mark.boxes if box != _NO_PLACE))


_create = _native.library.olvane_picture_create
_create.argtypes = [c_void_p, c_void_p, c_int, POINTER(c_void_p)]
_create.restype = c_int
_read = _native.library.olvane_picture_read
_read.argtypes = [c_void_p, POINTER(_Arrays)]
_read.restype = c_int
_free = _native.library.olvane_picture_free
_free.argtypes = [c_void_p]
_free.restype = None
