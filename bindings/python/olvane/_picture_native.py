# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""A picture as ctypes sees it, and its way into dataclasses."""

from __future__ import annotations

import ctypes
from ctypes import POINTER, byref, c_char_p, c_int, c_int32, c_int64, c_size_t, c_void_p
from typing import Any

from olvane import _native
from olvane._errors import LayoutError, Status
from olvane._family import ChildKind, FamilyState
from olvane._picture import (
    BRANCHES,
    SIDES,
    FoldedBranch,
    LineRole,
    MarkKind,
    Picture,
    PictureArc,
    PictureBox,
    PictureFamily,
    PictureLine,
    PictureMark,
    PictureWay,
    WayKind,
)
from olvane._picture_structs import ArraysStruct, OptionsStruct

_NO_PLACE = -1
_UNKNOWN_PARENT = 1


def _place(number: int) -> int | None:
    return None if number == _NO_PLACE else number


def _text(text: bytes | None) -> str:
    return (text or b"").decode("utf-8")


class PictureHandle:
    """A picture that the library holds until nobody needs it any more. A copy of a Picture has none."""

    __slots__ = ("pointer",)

    def __init__(self, pointer: c_void_p) -> None:
        self.pointer = pointer

    def __del__(self) -> None:
        free(self.pointer)

    def __reduce__(self) -> tuple[Any, tuple[()]]:
        return _nothing, ()


def _nothing() -> None:
    return None


def picture_of(made: c_void_p, view: str, handle: PictureHandle | None = None) -> Picture:
    """All of a picture that the library holds."""
    arrays = ArraysStruct(struct_size=ctypes.sizeof(ArraysStruct))
    status = _read(made, byref(arrays))
    if status != Status.OK:
        raise LayoutError(Status(status), f"the picture cannot be read: {Status(status).name}", "", [])
    is_round = arrays.arc_count > 0
    return Picture(
        focus=arrays.focus,
        boxes=tuple(_box(arrays.boxes[i], arrays.arcs[i] if is_round else None) for i in range(arrays.box_count)),
        families=tuple(_family(arrays, arrays.families[i]) for i in range(arrays.family_count)),
        marks=tuple(_mark(arrays.marks[i]) for i in range(arrays.mark_count)),
        view=view,
        other=_place(arrays.other),
        focus_is=_text(arrays.focus_is),
        other_is=_text(arrays.other_is),
        ways=tuple(_way(arrays, arrays.ways[i]) for i in range(arrays.way_count)),
        rings=tuple(arrays.ring_radii[i] for i in range(arrays.ring_radius_count)),
        middle=(arrays.middle_x, arrays.middle_y) if is_round else None,
        folded=tuple(_folded(arrays.folded[i]) for i in range(arrays.folded_count)),
        _handle=handle,
    )


def failure_of(made: c_void_p) -> str:
    """What went wrong in making a picture; the empty text where nothing is stated."""
    text = c_char_p()
    return _text(text.value) if made and _failure(made, byref(text)) == Status.OK else ""


def _box(box: Any, arc: Any) -> PictureBox:
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
        further_parents=box.further_parents,
        living=box.living != 0,
        arc=None if arc is None else PictureArc(arc.ring, arc.start, arc.end, _place(arc.line)),
    )


def _folded(folded: Any) -> FoldedBranch:
    return FoldedBranch(folded.box, BRANCHES[folded.branch], SIDES[folded.side], folded.count)


def _way(arrays: Any, way: Any) -> PictureWay:
    first_ancestor = way.first_box + way.box_count
    pieces = (arrays.way_pieces[i] for i in range(way.first_piece, way.first_piece + way.piece_count))
    return PictureWay(
        kind=WayKind(way.kind),
        boxes=tuple(arrays.way_boxes[i] for i in range(way.first_box, first_ancestor)),
        ancestors=tuple(arrays.way_boxes[i] for i in range(first_ancestor, first_ancestor + way.ancestor_count)),
        words=_text(way.words),
        lines=tuple((piece.x1, piece.y1, piece.x2, piece.y2) for piece in pieces),
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


def _declared(name: str, result: Any, *arguments: Any) -> Any:
    function = getattr(_native.library, name)
    function.argtypes = arguments
    function.restype = result
    return function


_CHOICES = POINTER(OptionsStruct)
options_default = _declared("olvane_picture_options_default", c_int, c_int32, _CHOICES)
of_family = _declared("olvane_picture_of_family", c_int, c_void_p, c_int64, _CHOICES, POINTER(c_void_p))
of_file = _declared("olvane_picture_of_file", c_int, c_void_p, c_int64, _CHOICES, POINTER(c_void_p))
of_host = _declared("olvane_picture_of_host", c_int, POINTER(_native.HostStruct), c_int64, _CHOICES, POINTER(c_void_p))
free = _declared("olvane_picture_free", None, c_void_p)
_read = _declared("olvane_picture_read", c_int, c_void_p, POINTER(ArraysStruct))
_failure = _declared("olvane_picture_failure", c_int, c_void_p, POINTER(c_char_p))
