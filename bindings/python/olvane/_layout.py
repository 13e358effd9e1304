# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""One layout: of a host that is asked, or of a family that the library holds. The answer becomes records or text."""

from __future__ import annotations

import ctypes
import operator
from collections.abc import Callable
from ctypes import byref, c_size_t, c_void_p
from typing import Any, TypeVar

from olvane import _native
from olvane._answers import GREATEST_ID, MOST_RELATIVES, Answers, message_of, watching_for_strays
from olvane._errors import HostError, LayoutError, Status
from olvane._family import Family
from olvane._host import Host
from olvane._options import Options, View
from olvane._records import Layout, Record

_Result = TypeVar("_Result")


def layout(host: Host | Family, focus: int, view: View = View.FAMILY, options: Options | None = None) -> list[Record]:
    """Lay out the relatives of a person, one record for each box, in the order of the walk.

    The host is asked; a Family is laid out without a question, and many times faster.

    Raises HostError if a method of the host raised, LayoutError if there is no picture for another reason, and whatever
    is no ordinary exception (KeyboardInterrupt) as it is, whether the host or a signal raised it.
    """
    return _laid_out(_request(host, focus, view, options), _Request.records)


def family_layout(family: Family, focus: int, view: View = View.FAMILY, options: Options | None = None) -> Layout:
    """The layout of a Family as one object, whose records are made when they are looked at."""
    made = _family_laid_out(family, focus, view, options, _records_of)
    if options is not None:
        made._box = (options.sizes.node_width, options.sizes.node_height)
    return made


def layout_text(host: Host | Family, focus: int, view: View = View.FAMILY, options: Options | None = None) -> str:
    """The same layout as one line of text."""
    if isinstance(host, Family):
        return _family_laid_out(host, focus, view, options, _text_of)
    return _laid_out(_request(host, focus, view, options), _Request.text)


def version() -> str:
    """The version of the library that is loaded."""
    return str(_native.library.olvane_version().decode("ascii"))


class _Request:
    """A layout of the C interface, from its question to its end."""

    def __init__(self, host: Host, focus: int, view: View, options: Options | None) -> None:
        self._answers = Answers(host)
        self._asked = focus
        self._focus = _focus_number(focus)
        self._ask = _asking(view)
        self._options = _options_struct(options)
        self._layout = c_void_p()
        self._status = Status.OK

    def run(self) -> None:
        callbacks = self._answers.callbacks()
        with watching_for_strays(self._answers):
            status = self._ask(byref(callbacks), self._focus, byref(self._options), byref(self._layout))
        self._status = Status(status)

    def free(self) -> None:
        _native.library.olvane_layout_free(self._layout)

    def raise_failure(self) -> None:
        raised = self._answers.take_raised()
        try:
            if raised is not None and not isinstance(raised, Exception):
                raise raised
            if raised is not None and self._status != Status.OUT_OF_MEMORY:
                message = self._answers.failure(raised)
                raise HostError(Status.HOST_FAILED, message, self.text(), self.records()) from raised
            if self._status != Status.OK:
                raise LayoutError(self._status, self._reason(), self.text(), self.records())
        finally:
            del raised  # whose frames may hold this one

    def _reason(self) -> str:
        return f"layout of person {self._asked!r}: {message_of(self._status)}"

    def text(self) -> str:
        return _text_of(self._layout)

    def records(self) -> list[Record]:
        return list(_records_of(self._layout))


class _FamilyRequest(_Request):
    """A layout of a family that the library holds."""

    def __init__(self, family: Family, focus: int, view: View, options: Options | None) -> None:
        self._family = family
        self._asked = focus
        self._focus = _focus_number(focus)
        self._view = _view_number(view)
        self._chosen = None if options is None else byref(_options_struct(options))
        self._layout = c_void_p()
        self._status = Status.OK

    def run(self) -> None:
        pointer = self._family._pointer
        status = _native.library.olvane_view(pointer, self._view, self._focus, self._chosen, byref(self._layout))
        self._status = Status(status)

    def raise_failure(self) -> None:
        if self._status != Status.OK:
            raise LayoutError(self._status, self._reason(), self.text(), self.records())

    def _reason(self) -> str:
        if self._status == Status.INVALID_PERSON:
            return f"layout of person {self._asked!r}: the family has no person {self._asked!r}"
        return super()._reason()


def _family_laid_out(
    family: Family, focus: int, view: View, options: Options | None, read: Callable[[c_void_p], _Result]
) -> _Result:
    """A _FamilyRequest in as few steps as there are: a small family is laid out in less time than one takes."""
    layout = c_void_p()
    chosen = None if options is None else _options_struct(options)
    number = _view_number(view)
    try:
        if _native.library.olvane_view(family._pointer, number, _focus_number(focus), chosen, layout) == Status.OK:
            return read(layout)
    finally:
        _native.library.olvane_layout_free(layout)
    request = _FamilyRequest(family, focus, view, options)
    return _laid_out(request, lambda _: read(request._layout))  # which raises


def _text_of(layout: c_void_p) -> str:
    text, length = c_void_p(), c_size_t()
    if layout:
        _native.library.olvane_layout_text(layout, text, length)
    return _native.decoded(text, length)


def _records_of(layout: c_void_p) -> Layout:
    records, count = c_void_p(), c_size_t()
    if layout:
        _native.library.olvane_layout_records(layout, records, count)
    return Layout.copied_from(records.value, count.value)


def _request(host: Host | Family, focus: int, view: View, options: Options | None) -> _Request:
    if isinstance(host, Family):
        return _FamilyRequest(host, focus, view, options)
    return _Request(host, focus, view, options)


def _focus_number(focus: int) -> int:
    """The focus, or 0, which is nobody, for a number that is no person's."""
    whole = operator.index(focus)
    return whole if 1 <= whole <= GREATEST_ID else 0


def _view_number(view: View) -> int:
    if not isinstance(view, View):
        raise TypeError(f"view is {view!r}, and takes a View")
    return 0 if view is View.FAMILY else 1


def _laid_out(request: _Request, read: Callable[[_Request], _Result]) -> _Result:
    try:
        request.run()
        request.raise_failure()
        return read(request)
    finally:
        request.free()


def _asking(view: View) -> Any:
    if view is View.FAMILY:
        return _native.library.olvane_layout_family
    if view is View.PEDIGREE:
        return _native.library.olvane_layout_pedigree
    raise TypeError(f"view is {view!r}, and takes a View")


def _options_struct(options: Options | None) -> _native.OptionsStruct:
    if not isinstance(options, Options | None):
        raise TypeError(f"options is {options!r}, and takes Options")
    options = options or Options()
    sizes = options.sizes
    return _native.OptionsStruct(
        ctypes.sizeof(_native.OptionsStruct),
        _native.SizesStruct(
            sizes.node_width,
            sizes.node_height,
            sizes.horz_padding,
            sizes.vert_padding,
            sizes.spouse_line_step,
            sizes.line_inset,
        ),
        int(options.shown),
        options.generations,
        options.flag_depth,
    )


__all__ = ["MOST_RELATIVES", "family_layout", "layout", "layout_text", "version"]
