# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""A host's methods as callbacks of C, and what they raise.

An exception can't pass through C, so a callback keeps what the host raised and reports a failure; the caller of C raises it
again when the call has ended. Nothing else may raise in a callback, but a signal's handler can: see the hook below.
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
from ctypes import c_int64
from typing import Any

from olvane import _native
from olvane._errors import LayoutError, Status
from olvane._host import Host

_FAILED = 1
GREATEST_ID = 2**31 - 1
# Persons in one list that a host answers: an endless generator ends there.
MOST_RELATIVES = 1000000


class Answers:
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


class _StrayHook:
    """A sys.unraisablehook that keeps what leaves a callback, which ctypes would print and forget.

    The handler of a signal runs between any two steps of a program, so also at a callback's first one, before its try.
    What C makes of such a callback is undefined, but the layout ends with what was kept. All else goes to the hook
    before this one, which is put back when the last layout of all threads has ended.
    """

    # Weak, so that answers whose end a signal's handler has cut off keep nothing in place.
    running: weakref.WeakSet[Answers] = weakref.WeakSet()
    lock = threading.Lock()

    def __init__(self, before: Callable[[Any], object]) -> None:
        self.before = before

    def __call__(self, unraisable: Any) -> None:
        answers = _answers_left_by(unraisable)
        if answers is None:
            self.before(unraisable)
        else:
            answers.keep(unraisable.exc_value)


def _answers_left_by(unraisable: Any) -> Answers | None:
    """The answers whose callback an exception left: its outermost frame is theirs."""
    frames = unraisable.exc_traceback
    left = None if frames is None else frames.tb_frame.f_locals.get("self")
    return left if isinstance(left, Answers) else None


@contextlib.contextmanager
def watching_for_strays(answers: Answers) -> Iterator[None]:
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
    if not 1 <= whole <= GREATEST_ID:
        raise ValueError(f"a host answered {answer!r} where an id is 1 to {GREATEST_ID}")
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
        raise LayoutError(Status(status), message_of(status), "", [])


def message_of(status: int) -> str:
    return str(_native.library.olvane_status_text(status).decode("utf-8"))
