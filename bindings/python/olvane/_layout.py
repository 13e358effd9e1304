# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""One layout: a host's methods become callbacks, the answer becomes records.

An exception can't pass through C, so a callback keeps what the host raised and reports a failure; the call raises it
again when the layout has ended.
"""

from __future__ import annotations

import contextlib
import ctypes
import inspect
import itertools
import operator
import sys
import threading
import weakref
from collections.abc import Callable, Iterable, Iterator
from ctypes import byref, c_int64, c_size_t, c_void_p
from typing import Any, TypeVar

from olvane import _native
from olvane._errors import HostError, LayoutError, Status
from olvane._family import Family
from olvane._host import Host
from olvane._options import Options, View
from olvane._records import Layout, Record

_FAILED = 1
# Persons in one list that a host answers: an endless generator ends there.
MOST_RELATIVES = 1000000

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


class _Answers:
    """What a host answers to C, and the first that it raised, or that a signal raised meanwhile.

    It holds none of its own callbacks, so that the host is released when the call ends, without a collector's help.
    """

    def __init__(self, host: Host) -> None:
        self._host = host
        self._raised: BaseException | None = None
        self._question = ""

    def callbacks(self) -> _native.HostStruct:
        """The eight callbacks, which must outlive the call that uses them."""
        return _native.HostStruct(
            ctypes.sizeof(_native.HostStruct),
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

    def failure(self, raised: BaseException) -> str:
        """The question that failed, and why: "spouses_of(17): ValueError: no row"."""
        where = f"{self._question}: " if self._question else ""
        return f"{where}{type(raised).__name__}: {raised}"

    def take_raised(self) -> BaseException | None:
        """What was kept, which is not kept any longer: its frames hold this object."""
        raised, self._raised = self._raised, None
        return raised

    def _father_of(self, _context: Any, person: int, parent: Any) -> int:
        return self._answer("father_of", (person,), lambda: _set_parent(parent, self._host.father_of(person)))

    def _mother_of(self, _context: Any, person: int, parent: Any) -> int:
        return self._answer("mother_of", (person,), lambda: _set_parent(parent, self._host.mother_of(person)))

    def _spouses_of(self, _context: Any, person: int, spouses: Any) -> int:
        return self._answer("spouses_of", (person,), lambda: _append(spouses, self._host.spouses_of(person)))

    def _children_of(self, _context: Any, person: int, children: Any) -> int:
        return self._answer("children_of", (person,), lambda: _append(children, self._host.children_of(person)))

    def _is_preferred_spouse(self, _context: Any, person: int, spouse: int, preferred: Any) -> int:
        question = (person, spouse)
        return self._answer(
            "is_preferred_spouse", question, lambda: _set_truth(preferred, self._host.is_preferred_spouse(*question))
        )

    def _is_dead(self, _context: Any, person: int, dead: Any) -> int:
        return self._answer("is_dead", (person,), lambda: _set_truth(dead, self._host.is_dead(person)))

    def _date_of(self, _context: Any, person: int, is_birth: int, date: Any) -> int:
        question = (person, is_birth != 0)
        return self._answer("date_of", question, lambda: _set_date(date, self._host.date_of(*question)))

    def _sex_of(self, _context: Any, person: int, sex: Any) -> int:
        return self._answer("sex_of", (person,), lambda: _set_sex(sex, self._host.sex_of(person)))

    def _answer(self, operation: str, asked: tuple[object, ...], question: Callable[[], None]) -> int:
        if self._raised is not None:  # kept where C had no way to report it
            return _FAILED
        try:
            question()
        except BaseException as raised:  # nothing may pass through C; the request raises it again
            self.keep(raised)
            self._question = f"{operation}({', '.join(map(str, asked))})"
            return _FAILED
        return 0


_GREATEST_ID = 2**31 - 1


class _StrayHook:
    """A sys.unraisablehook that keeps what leaves a callback, which ctypes would print and forget.

    The handler of a signal runs between any two steps of a program, so also at a callback's first one, before its try.
    What C makes of such a callback is undefined, but the layout ends with what was kept. All else goes to the hook
    before this one, which is put back when the last layout of all threads has ended.
    """

    # Weak, so that answers whose end a signal's handler has cut off keep nothing in place.
    running: weakref.WeakSet[_Answers] = weakref.WeakSet()
    lock = threading.Lock()

    def __init__(self, before: Callable[[Any], object]) -> None:
        self.before = before

    def __call__(self, unraisable: Any) -> None:
        answers = _answers_left_by(unraisable)
        if answers is None:
            self.before(unraisable)
        else:
            answers.keep(unraisable.exc_value)


def _answers_left_by(unraisable: Any) -> _Answers | None:
    """The answers whose callback an exception left: its outermost frame is theirs."""
    frames = unraisable.exc_traceback
    left = None if frames is None else frames.tb_frame.f_locals.get("self")
    return left if isinstance(left, _Answers) else None


@contextlib.contextmanager
def _watching_for_strays(answers: _Answers) -> Iterator[None]:
    with _StrayHook.lock:
        _StrayHook.running.add(answers)
        if not isinstance(sys.unraisablehook, _StrayHook):
            sys.unraisablehook = _StrayHook(sys.unraisablehook)
    try:
        yield
    finally:
        with _StrayHook.lock:
            _StrayHook.running.discard(answers)
            hook: object = sys.unraisablehook
            if not _StrayHook.running and isinstance(hook, _StrayHook):
                sys.unraisablehook = hook.before


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
    known = [_person_id(person) for person in itertools.islice(people, MOST_RELATIVES + 1)]
    if len(known) > MOST_RELATIVES:
        raise ValueError(f"a host answered more than {MOST_RELATIVES} persons in one list")
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
        self._asked = focus
        self._focus = _focus_number(focus)
        self._ask = _asking(view)
        self._options = _options_struct(options)
        self._layout = c_void_p()
        self._status = Status.OK

    def run(self) -> None:
        callbacks = self._answers.callbacks()
        with _watching_for_strays(self._answers):
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
        return f"layout of person {self._asked!r}: {_message(self._status)}"

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
