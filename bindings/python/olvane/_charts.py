# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""The picture of any view in one call: of a host that is asked, of a family, or of a file."""

from __future__ import annotations

import os
from collections.abc import Callable, Iterable, Mapping
from ctypes import byref, c_void_p
from typing import Any, Literal, get_args

from olvane import _picture_native as _native_picture
from olvane._answers import Answers, message_of, watching_for_strays
from olvane._errors import HostError, LayoutError, Status
from olvane._family import Family
from olvane._file import DrawView, File
from olvane._host import Host
from olvane._layout import _focus_number, _options_struct
from olvane._options import Options, View
from olvane._picture import BRANCHES, Branch, Picture
from olvane._picture_options import choice, option_value, real, whole
from olvane._picture_options import options as options_of_c
from olvane._picture_structs import BoxSize, Fold, OptionsStruct

_VIEWS: tuple[DrawView, ...] = get_args(DrawView)
_LAST_YEAR = 9999


def picture(
    source: Host | Family | File | str | os.PathLike[str] | bytes,
    focus: int | str,
    view: View | DrawView = View.FAMILY,
    options: Options | None = None,
    *,
    unknown_parents: bool = True,
    up: int = 0,
    down: int = 0,
    direction: Literal["down", "up", "left", "right"] = "down",
    spouses: bool = True,
    siblings: bool = False,
    compact: bool = False,
    fan_of: Literal["ancestors", "descendants"] = "ancestors",
    fan_angle: float = 360,
    to: int | str = 0,
    by: Literal["blood", "marriage", "both"] = "both",
    most_ways: int = 8,
    language: Literal["en", "de", "es"] = "en",
    marks: int | Literal["all"] = 0,
    effort: int = 1,
    all_parts: bool = False,
    hide_living: bool = False,
    year: int = 0,
    earlier: Picture | None = None,
    mirrored: bool = False,
    folded: Iterable[tuple[int | str, Branch]] = (),
    box_sizes: Mapping[int | str, tuple[float, float]] | None = None,
    aspect: float = 0,
) -> Picture:
    """The picture of any view around a person, as values: boxes, families with their lines, marks and ways.

    source is a Family, a Host that is asked as far as the view reaches, a File, or the path or the bytes of one; persons of
    a file may be named by a text, as :func:`olvane.draw` says. options has the size of the boxes, the gaps of every view,
    who is shown (family, near) and the generations of a pedigree. What a view has no use for is ignored, but must be in
    its range:

    - up, down: generations of ancestors and of descendants, 0 for all; direction: where later generations stand.
    - spouses: of descendants; siblings: of ancestors; compact: trees packed tighter.
    - fan_of, fan_angle: whom a fan shows, and how far it reaches, in degrees, 90 to 360.
    - to, by, most_ways (0 for all), language: the other person of a kinship, its ways and its words.
    - marks ("all" for all), effort (0 to 100), all_parts: of everybody.
    - earlier: an earlier picture of everybody, in the same direction; who is in both, by id, stays where it has them
      as far as the change allows. A copy of a picture keeps nothing.
    - unknown_parents: family and pedigree; boxes for parents who are not known.
    - hide_living, year: of a file; everyone who may be living is hidden in the year, 0 for the present one, and
      their boxes say living.
    - mirrored: right and left exchanged; folded: branches that are left out of near, ancestors, descendants, hourglass and
      relatives: a person with "up" (ancestors), "down" (descendants) or "beside" (partners and, of the focus and its
      ancestors, siblings with theirs).
    - box_sizes: persons of near, ancestors, descendants, hourglass, relatives, kinship and everybody whose boxes have a
      width and height of their own, in points, as they stand on paper; who is not in the family is passed over.
    - aspect: of these but kinship, width by height of the paper that wide generations are folded for, 0 for none.

    Raises HostError and LayoutError as :func:`layout` does, FileError for a file that cannot be read and for a text that
    means nobody or several persons, and TypeError or ValueError for an option that is not allowed.
    """
    if isinstance(source, str | bytes | os.PathLike):
        source = File(source)
    name = _view_name(view)
    chosen = OptionsStruct()
    _native_picture.options_default(_VIEWS.index(name), byref(chosen))
    if options is not None:
        chosen.layout = _options_struct(options)
    for field, value in (
        ("unknown_parents", unknown_parents),
        ("up", up),
        ("down", down),
        ("direction", direction),
        ("spouses", spouses),
        ("siblings", siblings),
        ("compact", compact),
        ("fan_of", fan_of),
        ("fan_angle", fan_angle),
        ("most_ways", most_ways),
        ("language", language),
        ("effort", effort),
        ("all_parts", all_parts),
        ("mirrored", mirrored),
        ("aspect", aspect),
    ):
        setattr(chosen, field, option_value(field, value))
    chosen.ways = option_value("ways", by, "by")
    chosen.marks = -1 if marks == "all" else whole("marks", marks, 0, int(options_of_c()["marks"].most))
    chosen.hide_living = 1 if hide_living else 0
    chosen.year = whole("year", year, 0, _LAST_YEAR)
    if hide_living and not isinstance(source, File):
        raise ValueError("hide_living is of a file: a host and a Family say nothing of the years of a life")
    chosen.other = _number(source, to)
    folds = [Fold(_number(source, person), choice("folded", branch, BRANCHES)) for person, branch in folded]
    chosen.folds = (Fold * len(folds))(*folds)
    chosen.fold_count = len(folds)
    largest = options_of_c()["layout.sizes.node_width"].most
    boxes = [
        BoxSize(_number(source, person), real("width", width, 0, largest), real("height", height, 0, largest))
        for person, (width, height) in (box_sizes or {}).items()
    ]
    chosen.box_sizes = (BoxSize * len(boxes))(*boxes)
    chosen.box_size_count = len(boxes)
    if earlier is not None and not isinstance(earlier, Picture):
        raise TypeError(f"earlier is {earlier!r}, and takes a Picture")
    handle = None if earlier is None else earlier._handle
    if isinstance(handle, _native_picture.PictureHandle):
        chosen.earlier = handle.pointer
    return _made(source, _number(source, focus), name, chosen)


def _number(source: Host | Family | File, person: int | str) -> int:
    if isinstance(person, str):
        if not isinstance(source, File):
            raise TypeError(f"a person of a family is named by an id, not by {person!r}")
        return source.find(person)
    return _focus_number(person)


def _made(source: Host | Family | File, focus: int, view: DrawView, chosen: OptionsStruct) -> Picture:
    if isinstance(source, File | Family):
        call = _native_picture.of_file if isinstance(source, File) else _native_picture.of_family
        pointer = source._pointer
        return _read(lambda made: int(call(pointer, focus, byref(chosen), made)), focus, view)
    answers = Answers(source)
    callbacks = answers.callbacks()

    def ask(made: Any) -> int:
        with watching_for_strays(answers):
            status: int = _native_picture.of_host(byref(callbacks), focus, byref(chosen), made)
        _raise_from_host(answers, status)
        return status

    return _read(ask, focus, view)


def _raise_from_host(answers: Answers, status: int) -> None:
    """Raises what the host raised, as it is or as the cause of a HostError."""
    raised = answers.take_raised()
    try:
        if raised is not None and not isinstance(raised, Exception):
            raise raised
        if raised is not None and status != Status.OUT_OF_MEMORY:
            raise HostError(Status.HOST_FAILED, answers.failure(raised), "", []) from raised
    finally:
        del raised  # whose frames may hold this one


def _read(make: Callable[[Any], int], focus: int, view: DrawView) -> Picture:
    made = c_void_p()
    handle = _native_picture.PictureHandle(made)
    status = make(byref(made))
    if status != Status.OK:
        reason = _native_picture.failure_of(made) or message_of(status)
        raise LayoutError(Status(status), f"{view} of person {focus}: {reason}", "", [])
    return _native_picture.picture_of(made, view, handle)


def _view_name(view: View | DrawView) -> DrawView:
    name = view.value if isinstance(view, View) else view
    for known in _VIEWS:
        if name == known:
            return known
    raise TypeError(f"view is {view!r}, and takes a View or one of {', '.join(_VIEWS)}")
