# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""What a picture holds: boxes, the families that join them, and lines that are routed around all boxes."""

from __future__ import annotations

from collections.abc import Callable
from dataclasses import dataclass, field
from enum import IntEnum
from typing import Literal

from olvane._family import ChildKind, FamilyState
from olvane._svg import Svg, plain_drawing, round_drawing


Branch = Literal["up", "down", "beside"]
Side = Literal["top", "right", "bottom", "left"]
# In the order of the library's numbers.
BRANCHES: tuple[Branch, ...] = ("up", "down", "beside")
SIDES: tuple[Side, ...] = ("top", "right", "bottom", "left")


class LineRole(IntEnum):
    """What a piece of a family's lines is for."""

    MARRIAGE = 0  # from parent to parent
    DROP = 1  # from the parents to the bar
    BAR = 2  # along the children
    STEM = 3  # to one child
    LINK = 4  # where there are no levels


class WayKind(IntEnum):
    """How a way between two persons runs."""

    BLOOD = 0
    LEGAL = 1  # by adoption, fostering or similar
    MARRIAGE = 2


class MarkKind(IntEnum):
    """What is expressed without a line."""

    SAME_PERSON = 0
    PARENTS_ELSEWHERE = 1
    PARTNERS_ELSEWHERE = 2


@dataclass(frozen=True, slots=True)
class PictureArc:
    """A piece of a ring, in degrees clockwise from the top; ring 0 is the middle.

    line is the place of the box at which its line of descent begins.
    """

    ring: int
    start: float
    end: float
    line: int | None


@dataclass(frozen=True, slots=True)
class PictureBox:
    """One box. (x, y) is its upper-left corner, in points.

    id is None for an unknown parent, and child_of is then the place of the box whose parent it is. repeat is 0 for a person
    with one box; else it counts the person's boxes from 1. The hidden counts are relatives without a box, and
    further_parents families that the person is a child of, beside the first, with no parent shown. living is set where
    hide_living was asked for and nothing is to be stated of the person. arc is of round charts, whose boxes have no size.
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
    further_parents: int = 0
    living: bool = False
    arc: PictureArc | None = None


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
class PictureWay:
    """A way between the two persons of a kinship. Its words say what the other person is to the focus by this way alone.

    boxes run from the focus to the other person; ancestors are those at its top. lines are straight pieces as x1, y1, x2,
    y2, along the lines of families.
    """

    kind: WayKind
    boxes: tuple[int, ...]
    ancestors: tuple[int, ...]
    words: str
    lines: tuple[tuple[float, float, float, float], ...]


@dataclass(frozen=True, slots=True)
class FoldedBranch:
    """A branch that is left out: count persons would have boxes with it, on that side of the box."""

    box: int
    branch: Branch
    side: Side
    count: int


@dataclass(frozen=True, slots=True)
class Picture:
    """Boxes in the order of the layout, families with their lines, and marks. focus is the place of the focus's box.

    Of a kinship, other is the place of the other person's box, focus_is and other_is say in words what each is to the other,
    and ways has those by blood first, the nearest first. Of a fan, ring i reaches from rings[i] to rings[i + 1] around
    middle.
    """

    focus: int
    boxes: tuple[PictureBox, ...]
    families: tuple[PictureFamily, ...]
    marks: tuple[PictureMark, ...]
    view: str = "family"
    other: int | None = None
    focus_is: str = ""
    other_is: str = ""
    ways: tuple[PictureWay, ...] = ()
    rings: tuple[float, ...] = ()
    middle: tuple[float, float] | None = None
    folded: tuple[FoldedBranch, ...] = ()
    # What the library keeps of it, for a later picture's places and for olvane.judge.
    _handle: object = field(default=None, repr=False, compare=False)

    def svg(self, label: Callable[[int], str] = str) -> Svg:
        """A plain drawing; label gives the text of a person's box, and is the id by default."""
        texts = ["" if box.id is None else label(box.id) for box in self.boxes]
        if self.middle is not None:
            arcs = [box.arc for box in self.boxes if box.arc is not None]
            return round_drawing(
                self.middle, self.rings, ((arc.ring, arc.start, arc.end, text) for arc, text in zip(arcs, texts))
            )
        return plain_drawing(
            ((box.x, box.y, box.width, box.height, text) for box, text in zip(self.boxes, texts)),
            ((line.x1, line.y1, line.x2, line.y2) for family in self.families for line in family.lines),
        )

    def _repr_svg_(self) -> str:
        return self.svg()
