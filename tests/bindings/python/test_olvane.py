# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""The Python package gives what the C library gives, and raises what a host raised."""

from __future__ import annotations

import ctypes
import dataclasses
import gc
import subprocess
import sys
import threading
import unittest
import weakref

import olvane
from olvane import _native


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
        self.assertEqual((17, 27, 0, False, None), (focus.id, focus.x, focus.y, focus.has_hidden_relatives, focus.child))
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
            def children_of(self, person: int):  # type: ignore[no-untyped-def, override]
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
        for method in (name for name in vars(olvane.Host) if name.endswith("_of") or name.startswith("is_")):
            with self.subTest(method):
                host = Family(THREE_GENERATIONS)
                reason = ValueError("the data base is closed")
                setattr(host, method, raiser(reason))
                with self.assertRaises(olvane.HostError) as caught:
                    olvane.layout(host, 17)
                self.assertIs(reason, caught.exception.__cause__)
                self.assertEqual(olvane.Status.HOST_FAILED, caught.exception.status)
                self.assertIn("the data base is closed", str(caught.exception))

    def test_an_answer_of_the_wrong_type_is_the_hosts_failure(self) -> None:
        host = Family({})
        setattr(host, "sex_of", lambda person: "male")
        with self.assertRaises(olvane.HostError) as caught:
            olvane.layout(host, 17)
        self.assertIsInstance(caught.exception.__cause__, ValueError)

    def test_an_interrupt_passes_as_it_is(self) -> None:
        host = Family({})
        setattr(host, "sex_of", raiser(KeyboardInterrupt()))
        with self.assertRaises(KeyboardInterrupt):
            olvane.layout(host, 17)

    def test_a_focus_below_1_is_no_person(self) -> None:
        for focus in (0, -17, 1 << 32):
            with self.assertRaises(olvane.LayoutError) as caught:
                olvane.layout(Family({}), focus)
            self.assertEqual(olvane.Status.INVALID_PERSON, caught.exception.status)
            self.assertEqual(("", []), (caught.exception.text, caught.exception.records))

    def test_data_without_a_picture_leave_whole_records(self) -> None:
        host = Family({5: (17, 42)})
        setattr(host, "children_of", lambda person: [5, -9] if person == 17 else [])
        with self.assertRaises(olvane.LayoutError) as caught:
            olvane.layout(host, 17)
        self.assertEqual(olvane.Status.LAYOUT_FAILED, caught.exception.status)
        self.assertEqual(caught.exception.text.count(";"), len(caught.exception.records))

    def test_options_out_of_their_range_are_refused(self) -> None:
        with self.assertRaises(olvane.LayoutError) as caught:
            olvane.layout(Family({}), 17, options=olvane.Options(generations=0))
        self.assertEqual(olvane.Status.INVALID_ARGUMENT, caught.exception.status)

    def test_a_layout_within_a_layout_is_refused(self) -> None:
        host = Family({})
        setattr(host, "sex_of", lambda person: len(olvane.layout(Family({}), person)))
        with self.assertRaises(olvane.HostError) as caught:
            olvane.layout(host, 17)
        cause = caught.exception.__cause__
        self.assertIsInstance(cause, olvane.LayoutError)
        self.assertEqual(olvane.Status.NESTED_CALL, getattr(cause, "status"))

    def test_statuses_are_those_of_the_library(self) -> None:
        texts = {_native.library.olvane_status_text(status) for status in olvane.Status}
        self.assertEqual(len(olvane.Status), len(texts))

    def test_an_absent_library_is_an_import_error(self) -> None:
        command = "import os; os.environ['OLVANE_LIBRARY'] = '/absent/lib.so'; import olvane"
        run = subprocess.run([sys.executable, "-c", command], capture_output=True, text=True, check=False)
        self.assertIn("ImportError: the layout library can't be loaded", run.stderr)


class Memory(unittest.TestCase):
    def test_a_host_is_let_go_after_its_layout(self) -> None:
        host = Family({})
        olvane.layout(host, 17)
        alive = weakref.ref(host)
        del host
        gc.collect()
        self.assertIsNone(alive())


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
