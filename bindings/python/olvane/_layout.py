# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""One layout: a host's methods become callbacks, the answer becomes records.

An exception can't pass through C, so a callback keeps what the host raised and reports a failure; the call raises it
again when the layout has ended.
"""

from __future__ import annotations

import ctypes
from collections.abc import Callable, Iterable
from ctypes import byref, c_char_p, c_int64, c_size_t, c_void_p
from typing import Any

from olvane import _native
from olvane._errors import HostError, LayoutError, Status
from olvane._host import Host
from olvane._options import Options, View
from olvane._records import Record, RecordKind, Segment

_FAILED = 1


def layout(host: Host, focus: int, view: View = View.FAMILY, options: Options | None = None) -> list[Record]:
    """Lay out the relatives of a person, one record for each box, in the order of the walk.

    Raises HostError if a method of the host raised, LayoutError if there is no picture for another reason, and whatever
    is no ordinary exception (KeyboardInterrupt) as the host raised it.
    """
    with _Request(host, focus, view, options) as request:
        return request.records()


def layout_text(host: Host, focus: int, view: View = View.FAMILY, options: Options | None = None) -> str:
    """The same layout as one line of text."""
    with _Request(host, focus, view, options) as request:
        return request.text()


def version() -> str:
    """The version of the library that is loaded."""
    return str(_native.library.olvane_version().decode("ascii"))


class _Callbacks:
    """A host behind eight C callbacks, and what it raised.

    The callbacks live as long as this object, which must outlive the call that uses them.
    """

    def __init__(self, host: Host) -> None:
        self.raised: BaseException | None = None
        self._host = host
        self.struct = _native.HostStruct(
            None,
            _native.ParentCallback(self._father_of),
            _native.ParentCallback(self._mother_of),
            _native.ListCallback(self._spouses_of),
            _native.ListCallback(self._children_of),
            _native.PreferredCallback(self._is_preferred_spouse),
            _native.DeadCallback(self._is_dead),
            _native.DateCallback(self._date_of),
            _native.SexCallback(self._sex_of),
        )

    def _father_of(self, _context: Any, person: int, parent: Any) -> int:
        return self._answer(lambda: _set_parent(parent, self._host.father_of(person)))

    def _mother_of(self, _context: Any, person: int, parent: Any) -> int:
        return self._answer(lambda: _set_parent(parent, self._host.mother_of(person)))

    def _spouses_of(self, _context: Any, person: int, spouses: Any) -> int:
        return self._answer(lambda: _append(spouses, self._host.spouses_of(person)))

    def _children_of(self, _context: Any, person: int, children: Any) -> int:
        return self._answer(lambda: _append(children, self._host.children_of(person)))

    def _is_preferred_spouse(self, _context: Any, person: int, spouse: int, preferred: Any) -> int:
        return self._answer(lambda: _set(preferred, bool(self._host.is_preferred_spouse(person, spouse))))

    def _is_dead(self, _context: Any, person: int, dead: Any) -> int:
        return self._answer(lambda: _set(dead, bool(self._host.is_dead(person))))

    def _date_of(self, _context: Any, person: int, is_birth: int, date: Any) -> int:
        return self._answer(lambda: _set_date(date, self._host.date_of(person, is_birth != 0)))

    def _sex_of(self, _context: Any, person: int, sex: Any) -> int:
        return self._answer(lambda: _set(sex, self._host.sex_of(person)))

    def _answer(self, question: Callable[[], None]) -> int:
        try:
            question()
        except BaseException as raised:  # nothing may pass through C; the request raises it again
            self.raised = raised
            return _FAILED
        return 0


def _set(slot: Any, value: int) -> None:
    slot[0] = int(value)


def _set_parent(slot: Any, parent: int | None) -> None:
    if parent is not None:
        slot[0] = parent


def _append(ids: Any, people: Iterable[int]) -> None:
    known = list(people)
    _check(_native.library.olvane_person_list_append(ids, (c_int64 * len(known))(*known), len(known)))


def _set_date(date: Any, text: str) -> None:
    _check(_native.library.olvane_date_set(date, text.encode("utf-8")))


def _check(status: int) -> None:
    if status != Status.OK:
        raise LayoutError(Status(status), _message(status), "", [])


def _message(status: int) -> str:
    return str(_native.library.olvane_status_text(status).decode("utf-8"))


class _Request:
    """A layout of the C interface, freed at the end of a with statement."""

    def __init__(self, host: Host, focus: int, view: View, options: Options | None) -> None:
        self._callbacks = _Callbacks(host)
        self._layout = c_void_p()
        ask = {
            View.FAMILY: _native.library.olvane_layout_family,
            View.PEDIGREE: _native.library.olvane_layout_pedigree,
        }[view]
        chosen = _options_struct(options or Options())
        self._status = Status(ask(byref(self._callbacks.struct), focus, byref(chosen), byref(self._layout)))

    def __enter__(self) -> _Request:
        try:
            self._raise_failure()
        except BaseException:
            self._free()
            raise
        return self

    def __exit__(self, *_unused: object) -> None:
        self._free()

    def _free(self) -> None:
        _native.library.olvane_layout_free(self._layout)
        self._layout = c_void_p()

    def _raise_failure(self) -> None:
        raised = self._callbacks.raised
        if raised is not None and not isinstance(raised, Exception):
            raise raised
        if self._status == Status.HOST_FAILED:
            raise HostError(self._status, f"{type(raised).__name__}: {raised}", self.text(), self.records()) from raised
        if self._status != Status.OK:
            raise LayoutError(self._status, _message(self._status), self.text(), self.records())

    def text(self) -> str:
        text = c_char_p()
        if self._layout:
            _native.library.olvane_layout_text(self._layout, byref(text), None)
        return (text.value or b"").decode("ascii")

    def records(self) -> list[Record]:
        records = ctypes.POINTER(_native.RecordStruct)()
        count = c_size_t()
        if self._layout:
            _native.library.olvane_layout_records(self._layout, byref(records), byref(count))
        return [_record(records[i]) for i in range(count.value)]


def _options_struct(options: Options) -> _native.OptionsStruct:
    sizes = options.sizes
    return _native.OptionsStruct(
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


def _record(struct: _native.RecordStruct) -> Record:
    kind = RecordKind(struct.kind)
    return Record(
        id=struct.id,
        x=struct.x,
        y=struct.y,
        has_hidden_relatives=struct.has_hidden_relatives != 0,
        kind=kind,
        child=None if kind is RecordKind.PERSON else struct.child,
        segments=tuple(_segment(struct.segments[i]) for i in range(struct.segment_count)),
    )


def _segment(struct: _native.SegmentStruct) -> Segment:
    return Segment(struct.x1, struct.y1, struct.x2, struct.y2)
