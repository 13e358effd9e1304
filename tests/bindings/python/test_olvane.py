# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""The Python package gives what the C library gives, and raises what a host raised."""

from __future__ import annotations

import copy
import ctypes
import dataclasses
import gc
import itertools
import os
import pickle
import signal
import subprocess
import sys
import threading
import unittest
import weakref
from collections.abc import Callable
from pathlib import Path
from typing import Any
from unittest import mock

import olvane
from case_host import CaseHost, cases_in
from olvane import _answers, _layout, _native


class Family:
    """A host over parents alone: spouses and children follow from them. Women have even ids."""

    def __init__(self, parents: dict[int, tuple[int, int]]) -> None:
        self.parents = parents

    def father_of(self, person: int) -> int | None:
        return self.parents.get(person, (None, None))[0]

    def mother_of(self, person: int) -> int | None:
        return self.parents.get(person, (None, None))[1]

    def spouses_of(self, person: int) -> list[int]:
        couples = dict.fromkeys(self.parents.values())
        return [b if a == person else a for a, b in couples if person in (a, b)]

    def children_of(self, person: int) -> list[int]:
        return [child for child, parents in self.parents.items() if person in parents]

    def is_preferred_spouse(self, person: int, spouse: int) -> bool:
        return self.spouses_of(person)[0] == spouse

    def is_dead(self, person: int) -> bool:
        return person > 10

    def date_of(self, person: int, is_birth: bool) -> str:
        return "1850" if is_birth else ""

    def sex_of(self, person: int) -> int:
        return 0 if person % 2 else 1


METHODS = [name for name in vars(olvane.Host) if name.endswith("_of") or name.startswith("is_")]
THREE_GENERATIONS = {5: (17, 42), 6: (17, 42), 17: (3, 4), 19: (3, 4), 3: (1, 2)}


class Layouts(unittest.TestCase):
    def test_records_stand_where_the_text_says(self) -> None:
        host = Family(THREE_GENERATIONS)
        records = olvane.layout(host, 17)
        written = "".join(written_record(record) for record in records)
        self.assertEqual(olvane.layout_text(host, 17), written)
        self.assertGreater(len(records), 10)

    def test_lone_person_has_two_unknown_parents(self) -> None:
        focus, father, mother = olvane.layout(Family({}), 17)
        self.assertEqual(
            (17, 27, 0, False, None), (focus.id, focus.x, focus.y, focus.has_hidden_relatives, focus.child)
        )
        self.assertEqual((-1, olvane.RecordKind.MISSING_FATHER, 17), (father.id, father.kind, father.child))
        self.assertEqual((-2, olvane.RecordKind.MISSING_MOTHER, 17), (mother.id, mother.kind, mother.child))

    def test_segments_are_numbers(self) -> None:
        couple = olvane.layout(Family({5: (17, 42)}), 17)[0]
        self.assertIn(olvane.Segment(82, 40, 107, 40), couple.segments)

    def test_a_pedigree_has_as_many_columns_as_asked_for(self) -> None:
        columns = []
        for generations in (1, 2, 3):
            options = olvane.Options(generations=generations)
            boxes = olvane.layout(Family(THREE_GENERATIONS), 19, olvane.View.PEDIGREE, options)
            columns.append(len({box.x for box in boxes}))
        self.assertEqual([1, 2, 3], columns)

    def test_options_leave_out_whom_they_name(self) -> None:
        whole = olvane.layout(Family(THREE_GENERATIONS), 17)
        shown = olvane.Shown.ALL & ~olvane.Shown.SIBLINGS
        alone = olvane.layout(Family(THREE_GENERATIONS), 17, options=olvane.Options(shown=shown))
        self.assertIn(19, {record.id for record in whole})
        self.assertNotIn(19, {record.id for record in alone})

    def test_sizes_move_the_boxes(self) -> None:
        options = olvane.Options(sizes=olvane.Sizes(node_height=40.0, vert_padding=10.0))
        rows = {record.y for record in olvane.layout(Family({5: (17, 42)}), 17, options=options)}
        self.assertEqual({-50, 0, 50}, rows)

    def test_defaults_are_those_of_the_library(self) -> None:
        native = _native.OptionsStruct()
        self.assertEqual(0, _native.library.olvane_options_default(ctypes.byref(native)))
        chosen = olvane.Options()
        self.assertEqual(native.shown, chosen.shown)
        self.assertEqual(native.generations, chosen.generations)
        self.assertEqual(native.flag_depth, chosen.flag_depth)
        for size in dataclasses.fields(olvane.Sizes):
            self.assertEqual(getattr(native.sizes, size.name), getattr(chosen.sizes, size.name), size.name)

    def test_lists_may_be_any_iterable(self) -> None:
        class Lazy(Family):
            def children_of(self, person: int):  # type: ignore[no-untyped-def]
                yield from super().children_of(person)

        self.assertEqual(
            olvane.layout_text(Family(THREE_GENERATIONS), 17), olvane.layout_text(Lazy(THREE_GENERATIONS), 17)
        )

    def test_dates_may_hold_any_character(self) -> None:
        class Dated(Family):
            def date_of(self, person: int, is_birth: bool) -> str:
                return "一八五〇年"

        self.assertEqual(
            olvane.layout_text(Family(THREE_GENERATIONS), 17), olvane.layout_text(Dated(THREE_GENERATIONS), 17)
        )

    def test_threads_do_not_disturb_each_other(self) -> None:
        families = [Family({}), Family(THREE_GENERATIONS)]
        expected = [olvane.layout_text(family, 17) for family in families]
        wrong: list[str] = []

        def run(family: Family, text: str) -> None:
            wrong.extend(found for _ in range(30) if (found := olvane.layout_text(family, 17)) != text)

        threads = [threading.Thread(target=run, args=pair) for pair in zip(families, expected)]
        for thread in threads:
            thread.start()
        for thread in threads:
            thread.join()
        self.assertEqual([], wrong)


class Failures(unittest.TestCase):
    def test_what_a_host_raises_is_the_cause(self) -> None:
        for method in METHODS:
            with self.subTest(method):
                host = Family(THREE_GENERATIONS)
                reason = ValueError("the database is closed")
                setattr(host, method, raiser(reason))
                with self.assertRaises(olvane.HostError) as caught:
                    olvane.layout(host, 17)
                self.assertIs(reason, caught.exception.__cause__)
                self.assertEqual(olvane.Status.HOST_FAILED, caught.exception.status)
                self.assertIn("the database is closed", str(caught.exception))

    def test_an_answer_of_the_wrong_type_is_the_hosts_failure(self) -> None:
        host = Family({})
        setattr(host, "sex_of", lambda person: "male")
        with self.assertRaises(olvane.HostError) as caught:
            olvane.layout(host, 17)
        self.assertIsInstance(caught.exception.__cause__, TypeError)

    def test_an_answer_is_due_at_once(self) -> None:
        class Late:
            def __await__(self):  # type: ignore[no-untyped-def]
                yield

        for method in METHODS:
            with self.subTest(method):
                host = Family(THREE_GENERATIONS)
                setattr(host, method, lambda *_arguments: Late())
                with self.assertRaises(olvane.HostError) as caught:
                    olvane.layout(host, 17)
                self.assertIsInstance(caught.exception.__cause__, TypeError)

    def test_a_failure_names_the_question_and_the_person(self) -> None:
        for method, question in (
            ("spouses_of", "spouses_of(17)"),
            ("sex_of", "sex_of(17)"),
            ("date_of", "date_of(42, False)"),
            ("is_preferred_spouse", "is_preferred_spouse(17, 42)"),
        ):
            host = Family(THREE_GENERATIONS)
            setattr(host, method, raiser(ValueError("no row")))
            with self.subTest(method), self.assertRaises(olvane.HostError) as caught:
                olvane.layout(host, 17)
            self.assertEqual(f"{question}: ValueError: no row", str(caught.exception))

    def test_an_endless_list_ends_at_a_limit(self) -> None:
        host = Family({})
        setattr(host, "children_of", lambda _person: itertools.count(2))
        with self.assertRaises(olvane.HostError) as caught:
            olvane.layout(host, 1)
        self.assertEqual(
            f"children_of(1): ValueError: a host answered more than {olvane.MOST_RELATIVES} persons in one list",
            str(caught.exception),
        )

    def test_an_interrupt_passes_as_it_is(self) -> None:
        host = Family({})
        setattr(host, "sex_of", raiser(KeyboardInterrupt()))
        with self.assertRaises(KeyboardInterrupt):
            olvane.layout(host, 17)

    def test_a_focus_that_is_not_1_to_2147483647_is_no_person(self) -> None:
        for focus in (0, -17, 1 << 31, (1 << 32) + 17, (1 << 64) + 17, 10**40):
            with self.assertRaises(olvane.LayoutError) as caught:
                olvane.layout(Family({}), focus)
            self.assertEqual(olvane.Status.INVALID_PERSON, caught.exception.status)
            self.assertEqual(("", []), (caught.exception.text, caught.exception.records))
            self.assertTrue(str(caught.exception).startswith(f"layout of person {focus}: "), str(caught.exception))

    def test_an_answered_id_that_is_not_1_to_2147483647_is_refused_by_its_value(self) -> None:
        for answer in (0, -9, 1 << 31, (1 << 32) + 5, (1 << 53) + 1, (1 << 64) + 5, 10**40):
            for method, answered in (("children_of", [5, answer]), ("spouses_of", [answer]), ("mother_of", answer)):
                host = Family({5: (17, 42)})
                setattr(host, method, lambda person, said=answered: said)
                with self.assertRaises(olvane.HostError) as caught:
                    olvane.layout(host, 17)
                self.assertIsInstance(caught.exception.__cause__, ValueError)
                self.assertIn(f"answered {answer} where an id is 1 to 2147483647", str(caught.exception))

    def test_options_out_of_their_range_are_refused_by_their_names(self) -> None:
        wholes = {
            "generations": ((0, -1, 1001, 2**32 + 5), "1 to 1000"),
            "flag_depth": ((-1, 2**31, 2**32), "0 to 2147483647"),
            "shown": ((-1, 256, 2**32), "0 to 255"),
        }
        for name, (values, takes) in wholes.items():
            for value in values:
                with self.assertRaisesRegex(ValueError, f"^{name} is {value}, and takes a whole number of {takes}$"):
                    olvane.Options(**{name: value})  # type: ignore[arg-type]
        for size in dataclasses.fields(olvane.Sizes):
            for number in (float("inf"), float("nan"), 1e39, 10**400):
                with self.assertRaisesRegex(ValueError, f"^{size.name} is .*, and takes a finite number"):
                    olvane.Sizes(**{size.name: number})

    def test_options_at_the_ends_of_their_ranges_are_taken(self) -> None:
        for options in (
            olvane.Options(shown=olvane.Shown(0), flag_depth=0, generations=1),
            olvane.Options(shown=olvane.Shown.ALL, flag_depth=2**31 - 1, generations=1000),
        ):
            self.assertNotEqual([], olvane.layout(Family(THREE_GENERATIONS), 17, options=options))

    def test_options_of_another_type_are_refused_by_their_names(self) -> None:
        for name, value in (("generations", 2.5), ("flag_depth", "4"), ("shown", None), ("sizes", {"node_width": 1.0})):
            with self.assertRaisesRegex(TypeError, f"^{name} is .*, and takes "):
                olvane.Options(**{name: value})  # type: ignore[arg-type]
        with self.assertRaisesRegex(TypeError, "^node_width is '55', and takes a number$"):
            olvane.Sizes(node_width="55")  # type: ignore[arg-type]
        with self.assertRaisesRegex(TypeError, "^view is 'pedigree', and takes a View$"):
            olvane.layout(Family({}), 17, "pedigree")  # type: ignore[arg-type]
        with self.assertRaisesRegex(TypeError, "^options is {}, and takes Options$"):
            olvane.layout(Family({}), 17, options={})  # type: ignore[arg-type]
        with self.assertRaisesRegex(TypeError, "integer"):
            olvane.layout(Family({}), "17")  # type: ignore[arg-type]

    def test_a_layout_within_a_layout_is_refused(self) -> None:
        table = olvane.Family([{"id": 17}])
        within: list[Callable[[int], object]] = [
            lambda person: olvane.layout(Family({}), person),
            lambda person: olvane.layout_text(table, person),
            lambda person: olvane.picture(Family({}), person, "near"),
            lambda person: olvane.picture(table, person, "near"),
        ]
        for ask in within:
            host = Family({})
            setattr(host, "sex_of", ask)
            for lay_out in (olvane.layout, olvane.picture):
                with self.assertRaises(olvane.HostError) as caught:
                    lay_out(host, 17)
                cause = caught.exception.__cause__
                self.assertIsInstance(cause, olvane.LayoutError)
                self.assertEqual(olvane.Status.NESTED_CALL, getattr(cause, "status"))

    def test_what_finds_no_room_in_the_library_is_no_failure_of_the_host(self) -> None:
        full = olvane.Status.OUT_OF_MEMORY
        with mock.patch.object(_native.library, "olvane_layout_family", return_value=full):
            request = _layout._Request(Family({}), 17, olvane.View.FAMILY, None)
            with mock.patch.object(_native.library, "olvane_person_list_append", return_value=full):
                self.assertNotEqual(0, request._answers.callbacks().spouses_of(None, 17, None))
            with self.assertRaises(olvane.LayoutError) as caught:
                _layout._laid_out(request, _layout._Request.records)
        self.assertIs(olvane.LayoutError, type(caught.exception))
        self.assertEqual(full, caught.exception.status)

    def test_statuses_are_those_of_the_library(self) -> None:
        texts = {_native.library.olvane_status_text(status) for status in olvane.Status}
        self.assertEqual(len(olvane.Status), len(texts))

    def test_an_absent_library_is_an_import_error(self) -> None:
        command = "import os; os.environ['OLVANE_LIBRARY'] = '/absent/lib.so'; import olvane"
        run = subprocess.run([sys.executable, "-c", command], capture_output=True, text=True, check=False)
        self.assertIn("ImportError: the layout library can't be loaded", run.stderr)

    def test_an_error_can_be_copied_and_sent(self) -> None:
        with self.assertRaises(olvane.LayoutError) as caught:
            olvane.layout(Family({}), 0)
        error = caught.exception
        error.add_note("in a test")
        for copied in (copy.copy(error), pickle.loads(pickle.dumps(error))):
            self.assertIs(olvane.LayoutError, type(copied))
            self.assertEqual(str(error), str(copied))
            self.assertEqual(vars(error), vars(copied))

    def test_the_library_is_looked_for_by_the_name_it_has(self) -> None:
        self.assertEqual(os.environ["OLVANE_SONAME"], _native._SONAME)


class Questions(unittest.TestCase):
    def test_a_host_is_asked_what_the_engine_asks(self) -> None:
        cases = cases_in(Path(os.environ["OLVANE_GOLDEN"]))
        self.assertGreater(len(cases), 100)
        command = [os.environ["OLVANE_LAYOUT_CASE"], "--trace", *(str(case.file) for case in cases)]
        printed = subprocess.run(command, capture_output=True, text=True, check=True).stdout
        for case in cases:
            host = CaseHost(case.lines)
            try:
                text = olvane.layout_text(host, case.focus, case.view, case.options)
            except olvane.HostError:
                raise
            except olvane.LayoutError as error:
                text = error.text
            lines = [f"case {case.file}", f"text {text}", *host.calls, ""]
            written, printed = printed[: len("\n".join(lines))], printed[len("\n".join(lines)) :]
            self.assertEqual("\n".join(lines), written)
        self.assertEqual("", printed)

    def test_answers_come_to_the_engine_as_they_were_said(self) -> None:
        host = Family({5: (17, 42)})
        callbacks = _answers.Answers(host).callbacks()

        def number(ask: Callable[..., int], *arguments: int) -> int:
            slot = ctypes.c_int(77)
            self.assertEqual(0, ask(None, *arguments, ctypes.pointer(slot)))
            return slot.value

        setattr(host, "is_preferred_spouse", lambda person, spouse: (person, spouse) == (17, 42))
        self.assertEqual(1, number(callbacks.is_preferred_spouse, 17, 42))
        self.assertEqual(0, number(callbacks.is_preferred_spouse, 42, 17))
        for answer in (True, 1, "yes", False, 0, "", None):
            setattr(host, "is_dead", lambda _person: answer)
            self.assertEqual(1 if answer else 0, number(callbacks.is_dead, 17))
        for sex, returned in ((0, 0), (False, 0), (1, 1), (2, 1), (-1, 1), (2**32, 1)):
            setattr(host, "sex_of", lambda _person: sex)
            self.assertEqual(returned, number(callbacks.sex_of, 17))

    def test_a_sex_is_a_whole_number(self) -> None:
        host = Family({})
        for sex in ("F", "1", None, 0.5, float("nan")):
            setattr(host, "sex_of", lambda _person: sex)
            with self.assertRaises(olvane.HostError) as caught:
                olvane.layout(host, 17)
            self.assertIsInstance(caught.exception.__cause__, TypeError)

    def test_dates_come_to_the_engine_and_are_asked_for_by_their_kind(self) -> None:
        host = Family({})
        callbacks = _answers.Answers(host).callbacks()
        setattr(host, "date_of", lambda person, is_birth: f"born {person}" if is_birth is True else "一八五〇年")
        with mock.patch.object(_native.library, "olvane_date_set", return_value=0) as date_set:
            callbacks.date_of(None, 17, 1, None)
            callbacks.date_of(None, 42, 0, None)
            setattr(host, "date_of", lambda *_arguments: None)
            callbacks.date_of(None, 42, 0, None)
        dates = [call.args[1] for call in date_set.call_args_list]
        self.assertEqual([b"born 17", "一八五〇年".encode(), b""], dates)

    def test_a_date_is_a_string(self) -> None:
        host = Family(THREE_GENERATIONS)
        setattr(host, "date_of", lambda *_arguments: 1850)
        with self.assertRaises(olvane.HostError) as caught:
            olvane.layout(host, 17)
        self.assertIn("1850 where a date is a string", str(caught.exception))


class Interrupted(Exception):
    """What a signal's handler raises where it is an ordinary exception."""


class Signals(unittest.TestCase):
    """A handler of a signal may raise anywhere, also where no callback can guard itself."""

    STEPS = [f"_{method}" for method in METHODS] + ["_answer"]

    def setUp(self) -> None:
        self.printed: list[object] = []
        before = sys.unraisablehook
        sys.unraisablehook = self.printed.append
        self.addCleanup(setattr, sys, "unraisablehook", before)

    def interrupt_at(self, step: str, raised: BaseException, calls: int) -> None:
        """Raises as a handler does at the first step of a callback, here with the given call from now on."""
        left = [calls]

        def trace(frame, event, _argument):  # type: ignore[no-untyped-def]
            if event == "call" and frame.f_code.co_name == step and frame.f_globals is vars(_answers):
                left[0] -= 1
                if left[0] == 0:
                    sys.settrace(None)
                    raise raised

        self.addCleanup(sys.settrace, sys.gettrace())
        sys.settrace(trace)

    def test_an_interrupt_at_the_first_step_of_a_callback_passes_as_it_is(self) -> None:
        for step in self.STEPS:
            for calls in (1, 2, 3):
                with self.subTest(step, calls=calls):
                    interrupt = KeyboardInterrupt()
                    self.interrupt_at(step, interrupt, calls)
                    with self.assertRaises(KeyboardInterrupt) as caught:
                        olvane.layout(Family(THREE_GENERATIONS), 17)
                    self.assertIs(interrupt, caught.exception)
        self.assertEqual([], self.printed)

    def test_an_exception_at_the_first_step_of_a_callback_is_the_cause(self) -> None:
        for step in self.STEPS:
            with self.subTest(step):
                reason = Interrupted()
                self.interrupt_at(step, reason, 1)
                with self.assertRaises(olvane.HostError) as caught:
                    olvane.layout(Family(THREE_GENERATIONS), 17)
                self.assertIs(reason, caught.exception.__cause__)
                self.assertEqual(olvane.Status.HOST_FAILED, caught.exception.status)
        self.assertEqual([], self.printed)

    def test_what_a_signal_raised_counts_whatever_c_made_of_it(self) -> None:
        for status in (olvane.Status.OK, olvane.Status.HOST_FAILED, olvane.Status.LAYOUT_FAILED):
            with self.subTest(status), mock.patch.object(_native.library, "olvane_layout_family", return_value=status):
                request = _layout._Request(Family({}), 17, olvane.View.FAMILY, None)
                reason = Interrupted()
                request._answers.keep(reason)
                with self.assertRaises(olvane.HostError) as caught:
                    _layout._laid_out(request, _layout._Request.records)
                self.assertIs(reason, caught.exception.__cause__)

    def test_nobody_is_asked_any_more_after_a_signal(self) -> None:
        asked: list[int] = []
        host = Family({})
        setattr(host, "is_dead", asked.append)
        answers = _answers.Answers(host)
        answers.keep(Interrupted())
        self.assertNotEqual(0, answers.callbacks().is_dead(None, 17, ctypes.pointer(ctypes.c_int())))
        self.assertEqual([], asked)

    def test_no_signal_is_lost_in_a_large_pedigree(self) -> None:
        fired = 0

        def interrupt(*_arguments: object) -> None:
            nonlocal fired
            fired += 1
            raise Interrupted

        self.addCleanup(signal.signal, signal.SIGALRM, signal.signal(signal.SIGALRM, interrupt))
        self.addCleanup(signal.setitimer, signal.ITIMER_REAL, 0)
        options = olvane.Options(generations=12)
        host = Family({person: (2 * person + 1, 2 * person) for person in range(1, 2**12)})
        setattr(host, "spouses_of", lambda _person: [])
        setattr(host, "children_of", lambda _person: [])
        raised = 0
        for delay in range(100):
            try:
                signal.setitimer(signal.ITIMER_REAL, 0.0005 + delay / 20000)
                olvane.layout_text(host, 1, olvane.View.PEDIGREE, options)
                signal.setitimer(signal.ITIMER_REAL, 0)
            except Interrupted:
                raised += 1
            except olvane.HostError as error:
                self.assertIsInstance(error.__cause__, Interrupted)
                raised += 1
        self.assertEqual(fired, raised)
        self.assertGreater(raised, 20)
        self.assertEqual([], self.printed)

    def test_what_is_no_callbacks_goes_to_the_hook_before(self) -> None:
        class Loud(Family):
            def father_of(self, person: int) -> int | None:
                Failing()
                return super().father_of(person)

        class Failing:
            def __del__(self) -> None:
                raise ValueError("in a finalizer")

        text = olvane.layout_text(Family(THREE_GENERATIONS), 17)
        self.assertEqual(text, olvane.layout_text(Loud(THREE_GENERATIONS), 17))
        self.assertNotEqual([], self.printed)
        self.assertEqual({ValueError}, {getattr(unraisable, "exc_type") for unraisable in self.printed})

    def test_the_hook_is_put_back_after_the_last_layout(self) -> None:
        before = sys.unraisablehook
        during: list[object] = []

        class Watching(Family):
            def sex_of(self, person: int) -> int:
                during.append(sys.unraisablehook)
                return super().sex_of(person)

        olvane.layout(Watching(THREE_GENERATIONS), 17)
        self.assertNotIn(before, during)
        self.assertIs(before, sys.unraisablehook)
        with self.assertRaises(olvane.HostError):
            olvane.layout(object(), 17)  # type: ignore[arg-type]
        self.assertIs(before, sys.unraisablehook)

    def test_a_hook_that_came_meanwhile_stays(self) -> None:
        class Replacing(Family):
            def sex_of(self, person: int) -> int:
                sys.unraisablehook = other
                return super().sex_of(person)

        def other(_unraisable: object) -> None:
            ...

        olvane.layout(Replacing(THREE_GENERATIONS), 17)
        self.assertIs(other, sys.unraisablehook)


class Memory(unittest.TestCase):
    def setUp(self) -> None:
        gc.collect()
        gc.disable()
        self.addCleanup(gc.enable)

    def test_a_host_is_released_after_its_layout(self) -> None:
        host = Family(THREE_GENERATIONS)
        olvane.layout(host, 17)
        alive = weakref.ref(host)
        del host
        self.assertIsNone(alive())

    def test_a_host_is_released_after_its_failure(self) -> None:
        class Failing(Family):
            reason: type[BaseException] = ValueError

            def sex_of(self, person: int) -> int:
                raise self.reason

        for reason in (ValueError, KeyboardInterrupt):
            with self.subTest(reason):
                host = Failing(THREE_GENERATIONS)
                host.reason = reason
                alive = weakref.ref(host)
                try:
                    olvane.layout(host, 17)
                except (olvane.HostError, KeyboardInterrupt):
                    pass
                del host
                self.assertIsNone(alive())

    def test_every_layout_is_freed_once(self) -> None:
        given: list[int | None] = []
        freed: list[int | None] = []
        free = _native.library.olvane_layout_free

        def noted(ask: Callable[..., int]) -> Callable[..., int]:
            def call(*arguments: Any) -> int:
                status = ask(*arguments)
                given.append(arguments[3]._obj.value)
                return status

            return call

        def noted_free(layout: ctypes.c_void_p) -> None:
            freed.append(layout.value)
            free(layout)

        failing = Family({})
        setattr(failing, "sex_of", raiser(ValueError()))
        with (
            mock.patch.object(_native.library, "olvane_layout_family", noted(_native.library.olvane_layout_family)),
            mock.patch.object(_native.library, "olvane_layout_pedigree", noted(_native.library.olvane_layout_pedigree)),
            mock.patch.object(_native.library, "olvane_layout_free", noted_free),
        ):
            olvane.layout(Family({}), 17)
            olvane.layout_text(Family({}), 17, olvane.View.PEDIGREE)
            for host, focus in ((failing, 17), (Family({}), 0)):
                with self.assertRaises(olvane.LayoutError):
                    olvane.layout(host, focus)
        self.assertEqual(4, len(given))
        self.assertNotIn(None, given)
        self.assertEqual(given, freed)


def raiser(reason: BaseException):  # type: ignore[no-untyped-def]
    def method(*_arguments: object) -> None:
        raise reason

    return method


def written_record(record: olvane.Record) -> str:
    segments = "".join(",".join(map(str, segment)) + "|" for segment in record.segments)
    fields = [record.id, record.x, record.y, int(record.has_hidden_relatives), segments]
    if record.kind is not olvane.RecordKind.PERSON:
        fields += ["M" if record.kind is olvane.RecordKind.MISSING_FATHER else "F", record.child]
    return ":".join(map(str, fields)) + ";"


if __name__ == "__main__":
    unittest.main()
