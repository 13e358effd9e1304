# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""One layout: a host's methods become callbacks, the answer becomes records.

An exception can't pass through C, so a callback keeps what the host raised and reports a failure; the call raises it
again when the layout has ended.
"""

from __future__ import annotations

import ctypes
import inspect
import operator
import sys
from collections.abc import Callable, Iterable
from ctypes import byref, c_char_p, c_int64, c_size_t, c_void_p
from typing import Any, TypeVar

from olvane import _native
from olvane._errors import HostError, LayoutError, Status
from olvane._family import Family
from olvane._host import Host
from olvane._options import Options, View
from olvane._records import Record, RecordKind, Segment

_FAILED = 1

_Result = TypeVar("_Result")


def layout(host: Host | Family, focus: int, view: View = View.FAMILY, options: Options | None = None) -> list[Record]:
    """Lay out the relatives of a person, one record for each box, in the order of the walk.

    The host is asked; a Family is laid out without a question, and many times faster.

    Raises HostError if a method of the host raised, LayoutError if there is no picture for another reason, and whatever
    is no ordinary exception (KeyboardInterrupt) as it is, whether the host or a signal raised it.
    """
    return _laid_out(_request(host, focus, view, options), _Request.records)


def layout_text(host: Host | Family, focus: int, view: View = View.FAMILY, options: Options | None = None) -> str:
    """The same layout as one line of text."""
    return _laid_out(_request(host, focus, view, options), _Request.text)


def version() -> str:
    """The version of the library that is loaded."""
    return str(_native.library.olvane_version().decode("ascii"))


class _Answers:
    """What a host answers to C, and the first that it raised, or that a signal raised meanwhile.

    It holds none of its own callbacks, so that the host is let go when the call ends, without a collector's help.
    """

    def __init__(self, host: Host) -> None:
        self._host = host
        self._raised: BaseException | None = None

    def callbacks(self) -> _native.HostStruct:
        """The eight callbacks, which must outlive the call that uses them."""
        return _native.HostStruct(
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

    def keep(self, raised: BaseException) -> None:
        if self._raised is None:
            self._raised = raised

    def take_raised(self) -> BaseException | None:
        """What was kept, which is not kept any longer: its frames hold this object."""
        raised, self._raised = self._raised, None
        return raised

    def _father_of(self, _context: Any, person: int, parent: Any) -> int:
        return self._answer(lambda: _set_parent(parent, self._host.father_of(person)))

    def _mother_of(self, _context: Any, person: int, parent: Any) -> int:
        return self._answer(lambda: _set_parent(parent, self._host.mother_of(person)))

    def _spouses_of(self, _context: Any, person: int, spouses: Any) -> int:
        return self._answer(lambda: _append(spouses, self._host.spouses_of(person)))

    def _children_of(self, _context: Any, person: int, children: Any) -> int:
        return self._answer(lambda: _append(children, self._host.children_of(person)))

    def _is_preferred_spouse(self, _context: Any, person: int, spouse: int, preferred: Any) -> int:
        return self._answer(lambda: _set_truth(preferred, self._host.is_preferred_spouse(person, spouse)))

    def _is_dead(self, _context: Any, person: int, dead: Any) -> int:
        return self._answer(lambda: _set_truth(dead, self._host.is_dead(person)))

    def _date_of(self, _context: Any, person: int, is_birth: int, date: Any) -> int:
        return self._answer(lambda: _set_date(date, self._host.date_of(person, is_birth != 0)))

    def _sex_of(self, _context: Any, person: int, sex: Any) -> int:
        return self._answer(lambda: _set_sex(sex, self._host.sex_of(person)))

    def _answer(self, question: Callable[[], None]) -> int:
        if self._raised is not None:  # kept where C could not be told of it
            return _FAILED
        try:
            question()
        except BaseException as raised:  # nothing may pass through C; the request raises it again
            self.keep(raised)
            return _FAILED
        return 0


_GREATEST_ID = 2**31 - 1


class _StrayHook:
    """A sys.unraisablehook that keeps what leaves a callback, which ctypes would print and forget.

    The handler of a signal runs between any two steps of a program, so also at a callback's first one, before its try.
    What C makes of such a callback is undefined, but the layout ends with what was kept. All else goes to the hook
    before this one. It stays in place: another thread may lay out when this one has ended.
    """

    def __init__(self, before: Callable[[Any], object]) -> None:
        self._before = before

    def __call__(self, unraisable: Any) -> None:
        answers = _answers_left_by(unraisable)
        if answers is None:
            self._before(unraisable)
        else:
            answers.keep(unraisable.exc_value)


def _answers_left_by(unraisable: Any) -> _Answers | None:
    """The answers whose callback an exception left: its outermost frame is theirs."""
    frames = unraisable.exc_traceback
    left = None if frames is None else frames.tb_frame.f_locals.get("self")
    return left if isinstance(left, _Answers) else None


def _watch_for_strays() -> None:
    if not isinstance(sys.unraisablehook, _StrayHook):
        sys.unraisablehook = _StrayHook(sys.unraisablehook)


def _set_truth(slot: Any, answer: object) -> None:
    if not isinstance(answer, bool) and inspect.isawaitable(answer):
        raise TypeError("a host answered an awaitable where yes or no is due at once")
    slot[0] = 1 if answer else 0


def _set_sex(slot: Any, sex: int) -> None:
    slot[0] = 0 if operator.index(sex) == 0 else 1


def _person_id(answer: int) -> int:
    """The id of a person. C would take the low bits of any other number, and draw another person."""
    whole = operator.index(answer)
    if not 1 <= whole <= _GREATEST_ID:
        raise ValueError(f"a host answered {answer!r} where an id is 1 to {_GREATEST_ID}")
    return whole


def _set_parent(slot: Any, parent: int | None) -> None:
    if parent is not None:
        slot[0] = _person_id(parent)


def _append(ids: Any, people: Iterable[int]) -> None:
    known = [_person_id(person) for person in people]
    _check(_native.library.olvane_person_list_append(ids, (c_int64 * len(known))(*known), len(known)))


def _set_date(date: Any, text: str | None) -> None:
    if not isinstance(text, str | None):
        raise TypeError(f"a host answered {text!r} where a date is a string")
    _check(_native.library.olvane_date_set(date, (text or "").encode("utf-8")))


def _check(status: int) -> None:
    if status != Status.OK:
        raise LayoutError(Status(status), _message(status), "", [])


def _message(status: int) -> str:
    return str(_native.library.olvane_status_text(status).decode("utf-8"))


class _Request:
    """A layout of the C interface, from its question to its end."""

    def __init__(self, host: Host, focus: int, view: View, options: Options | None) -> None:
        self._answers = _Answers(host)
        self._focus = _focus_number(focus)
        self._ask = _asking(view)
        self._options = _options_struct(options)
        self._layout = c_void_p()
        self._status = Status.OK

    def run(self) -> None:
        _watch_for_strays()
        callbacks = self._answers.callbacks()
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
                message = f"{type(raised).__name__}: {raised}"
                raise HostError(Status.HOST_FAILED, message, self.text(), self.records()) from raised
            if self._status != Status.OK:
                raise LayoutError(self._status, _message(self._status), self.text(), self.records())
        finally:
            del raised  # whose frames may hold this one

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


class _FamilyRequest(_Request):
    """A layout of a family that the library holds."""

    def __init__(self, family: Family, focus: int, view: View, options: Options | None) -> None:
        self._family = family
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
            raise LayoutError(self._status, _message(self._status), self.text(), self.records())


def _request(host: Host | Family, focus: int, view: View, options: Options | None) -> _Request:
    if isinstance(host, Family):
        return _FamilyRequest(host, focus, view, options)
    return _Request(host, focus, view, options)


def _focus_number(focus: int) -> int:
    """The focus, or 0, which is nobody, for a number that is no person's."""
    whole = operator.index(focus)
    return whole if 1 <= whole <= _GREATEST_ID else 0


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
