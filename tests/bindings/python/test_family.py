# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""A family handed over once: every form of rows, what is refused, edits against a plain model, and layouts."""

from __future__ import annotations

import array
import copy
import pickle
import random
import resource
import sqlite3
import threading
import unittest
from typing import Any

import olvane
from plain_family import PlainFamily, PlainHost

ROWS: list[dict[str, Any]] = [
    {"id": 1, "father": None, "mother": None, "sex": "m", "birth": "1850", "name": "Karl"},
    {"id": 2, "father": None, "mother": None, "sex": "F", "birth": "1852", "name": "Åsa"},
    {"id": 3, "father": 1, "mother": 2, "sex": 0, "birth": None, "name": None},
]


def refusal(*arguments: Any, **more: Any) -> olvane.FamilyError:
    try:
        olvane.Family(*arguments, **more)
    except olvane.FamilyError as error:
        return error
    raise AssertionError("nothing was refused")


class Rows(unittest.TestCase):
    def assert_is_the_family(self, family: olvane.Family) -> None:
        self.assertEqual([1, 2, 3], family.ids)
        self.assertEqual((1, 2), (family.person(3).father, family.person(3).mother))
        self.assertEqual(([0, 1, 0]), [family.person(id).sex for id in family.ids])
        self.assertEqual("1852", family.person(2).birth)
        self.assertEqual((3,), family.person(1).children)

    def test_dicts(self) -> None:
        family = olvane.Family(ROWS)
        self.assert_is_the_family(family)
        self.assertEqual([(olvane.NameKind.FULL, "Åsa")], family.names(2))
        self.assertEqual([], family.names(3))

    def test_tuples(self) -> None:
        order = ("id", "father", "mother", "sex", "dead", "birth")
        self.assert_is_the_family(olvane.Family([tuple(row.get(name) for name in order) for row in ROWS]))

    def test_columns(self) -> None:
        self.assert_is_the_family(olvane.Family({name: [row[name] for row in ROWS] for name in ROWS[0]}))

    def test_generators(self) -> None:
        self.assert_is_the_family(olvane.Family(row for row in ROWS))

    def test_buffers_of_every_type(self) -> None:
        for code in "iIqQlLd":
            ids = array.array(code, [1, 2, 3])
            fathers = memoryview(array.array(code, [0, 0, 1])).toreadonly()
            sexes = array.array("b", [0, 1, 0])
            columns = {"id": ids, "father": fathers, "mother": [0, 0, 2], "sex": sexes, "birth": ["", "1852", ""]}
            self.assert_is_the_family(olvane.Family(columns))

    def test_cursors(self) -> None:
        connection = sqlite3.connect(":memory:")
        self.addCleanup(connection.close)
        connection.execute("CREATE TABLE p (id, father, mother, sex, birth, name)")
        connection.executemany("INSERT INTO p VALUES (:id, :father, :mother, :sex, :birth, :name)", ROWS)
        connection.execute("CREATE TABLE couple (he, she, state, day)")
        connection.execute("INSERT INTO couple VALUES (1, 2, 'divorced', 1870)")
        persons = connection.execute("SELECT id AS ID, father, mother, sex, birth, name FROM p ORDER BY id")
        couples = connection.execute("SELECT he AS partner0, she AS partner1, state, day AS marriage FROM couple")
        family = olvane.Family(persons, families=couples)
        self.assert_is_the_family(family)
        self.assertEqual((2,), family.person(1).spouses)
        self.assertEqual(olvane.FamilyState.DIVORCED, family.family(1).state)
        self.assertEqual("1870", family.family(1).marriage)

    def test_columns_that_are_no_fields_of_a_person_are_kept_for_labels(self) -> None:
        family = olvane.Family([{"id": 1, "job": "smith", "surname": "Berg"}, {"id": 2, "job": None}])
        self.assertEqual({"job": "smith"}, family.fields(1))
        self.assertEqual([(olvane.NameKind.SURNAME, "Berg")], family.names(1))
        self.assertEqual({}, family.fields(2))

    def test_rows_of_every_list(self) -> None:
        family = olvane.Family(
            [{"id": 1}, {"id": 2}, {"id": 3}],
            spouses=[(1, 3, 0), (1, 2, 1)],
            children=[(2, 1)],
            families=[{"number": 8, "partner1": 2}],
            family_children=[(8, 3, "adopted")],
            names=[(3, "nickname", "Kalle")],
            fields=[(3, "note", "x")],
        )
        self.assertEqual(((3, 2), 2), (family.person(1).spouses, family.person(1).preferred))
        self.assertEqual((1,), family.person(2).children)
        self.assertEqual((), family.person(3).children)
        self.assertEqual(((3, olvane.ChildKind.ADOPTED),), family.family(8).children)
        self.assertEqual([(olvane.NameKind.NICKNAME, "Kalle")], family.names(3))
        self.assertEqual({"note": "x"}, family.fields(3))

    def test_an_empty_family_grows_by_edits(self) -> None:
        family = olvane.Family()
        family.add_person(2**31 - 1, sex="f")
        self.assertEqual([2**31 - 1], family.ids)


class Refusals(unittest.TestCase):
    def test_ids_that_would_be_another_person(self) -> None:
        for id in (2**32 + 4, 2**53 + 1, 10**40, 2**64 + 4, 0, -1, 2**31):
            error = refusal([{"id": 1}, {"id": id}])
            self.assertEqual(("persons", 1, "id"), (error.table, error.row, error.field))
            self.assertIn("whole number of 1 to 2147483647", str(error))

    def test_values_of_the_wrong_type_are_shown(self) -> None:
        self.assertEqual("persons row 0, field id: '4' is not a whole number", str(refusal([{"id": "4"}])))
        error = refusal([{"id": 1, "sex": "Q"}])
        self.assertEqual((0, "sex"), (error.row, error.field))
        error = refusal({"id": [1, 2], "father": [0, 1.5]})
        self.assertEqual("persons row 1, field father: 1.5 is not a whole number", str(error))

    def test_texts_that_cannot_be_stored(self) -> None:
        error = refusal([{"id": 1, "birth": "a"}, {"id": 2, "birth": "a\0b"}])
        self.assertEqual((1, "birth"), (error.row, error.field))
        error = refusal([{"id": 1, "birth": "\ud800"}])
        self.assertEqual((0, "birth"), (error.row, error.field))

    def test_fields_that_do_not_exist(self) -> None:
        self.assertEqual("kin", refusal([{"id": 1}], spouses=[{"person": 1, "spouse": 1, "kin": 1}]).field)
        with self.assertRaises(olvane.FamilyError):
            olvane.Family().add_person(1, fathr=2)

    def test_names_and_fields_that_stand_in_two_places(self) -> None:
        for table, person, own in (
            ("names", {"id": 1, "nickname": "Kalle"}, {"names": [(1, "nickname", "Karl")]}),
            ("fields", {"id": 1, "job": "smith"}, {"fields": [(1, "job", "baker")]}),
        ):
            with self.assertRaisesRegex(ValueError, f"^{table} stand in the rows of persons and in rows of their own"):
                olvane.Family([person], **own)

    def test_rows_of_another_length(self) -> None:
        self.assertEqual(1, refusal([(1, 0, 0), (2, 0)]).row)

    def test_an_edit_that_is_refused_changes_nothing(self) -> None:
        family = olvane.Family(ROWS)
        for attempt in (
            lambda: family.add_person(3),
            lambda: family.set_person(3, father=9),
            lambda: family.set_children(1, [2, 2]),
            lambda: family.set_spouses(1, [2], preferred=3),
            lambda: family.set_names(1, [("full", "a"), ("full", "\0")]),
            lambda: family.set_field(1, "", "x"),
            lambda: family.add_family(1, partner0=2**32 + 1),
            lambda: family.remove_person(2**32 + 1),
            lambda: family.remove_family(1),
        ):
            before = [family.person(id) for id in family.ids]
            with self.assertRaises(olvane.FamilyError) as caught:
                attempt()
            self.assertIsNone(caught.exception.row)
            self.assertEqual(before, [family.person(id) for id in family.ids])

    def test_an_error_can_be_sent(self) -> None:
        error = refusal([{"id": 0}])
        again = pickle.loads(pickle.dumps(error))
        self.assertEqual((str(error), 0, "id"), (str(again), again.row, again.field))

    def test_a_focus_who_is_not_there(self) -> None:
        for focus in (4, 2**32 + 1, 0):
            with self.assertRaises(olvane.LayoutError) as caught:
                olvane.layout(olvane.Family(ROWS), focus)
            self.assertEqual(olvane.Status.INVALID_PERSON, caught.exception.status)
            self.assertEqual(f"layout of person {focus}: the family has no person {focus}", str(caught.exception))


class Edits(unittest.TestCase):
    def setUp(self) -> None:
        self.random = random.Random(20031)
        self.table = olvane.Family()
        self.plain = PlainFamily()

    def test_random_edits_against_a_plain_model(self) -> None:
        kept: list[tuple[olvane.Family, PlainFamily]] = []
        for step in range(1500):
            self.edit()
            if step % 100 == 0:
                self.assert_same(self.table, self.plain)
                kept.append((self.table.copy(), self.plain.copy()))
            if step % 400 == 399:  # undo
                table, plain = self.random.choice(kept)
                self.table, self.plain = table.copy(), plain.copy()
        for table, plain in kept:
            self.assert_same(table, plain)

    def edit(self) -> None:
        people = list(self.plain.persons)
        pick = self.random.choice
        kind = self.random.randrange(8 if len(people) > 3 else 1)
        if kind <= 1 and len(people) < 30 or len(people) <= 3:
            free = [id for id in range(1, 41) if id not in self.plain.persons] + [2**31 - 1 - len(people)]
            self.put_person(pick(free), self.table.add_person, [*people, 0])
        elif kind <= 2:
            self.put_person(pick(people), self.table.set_person, [*people, 0])
        elif kind == 3 and self.random.random() < 0.4:
            id = pick(people)
            self.table.remove_person(id)
            self.plain.remove_person(id)
        elif kind == 4:
            id, spouses = pick(people), self.some(people)
            preferred = pick([0, *spouses])
            self.table.set_spouses(id, spouses, preferred)
            self.plain.persons[id].spouses, self.plain.persons[id].preferred = spouses, preferred
        elif kind == 5:
            id, children = pick(people), self.some(people)
            self.table.set_children(id, children)
            self.plain.persons[id].children = list(children)
        elif kind == 6:
            self.edit_family(people)
        else:
            self.edit_texts(pick(people))

    def put_person(self, id: int, put: Any, people: list[int]) -> None:
        row = {
            "father": self.random.choice(people),
            "mother": self.random.choice(people),
            "sex": self.random.randrange(3),
            "dead": self.random.random() < 0.5,
            "birth": self.random.choice(["", "1850", "é" * 300]),
            "death": self.random.choice(["", "1900-01-02"]),
        }
        put(id, **row)
        self.plain.put_person(id, **row)

    def some(self, people: list[int]) -> list[int]:
        return self.random.sample(people, self.random.randrange(min(5, len(people))))

    def edit_family(self, people: list[int]) -> None:
        number = self.random.randrange(1, 9)
        if number in self.plain.families and self.random.random() < 0.3:
            self.table.remove_family(number)
            self.plain.remove_family(number)
            return
        partners = (self.random.choice([*people, 0]), self.random.choice([*people, 0]))
        state = self.random.randrange(4)
        children = [(child, self.random.randrange(6)) for child in self.some(people)]
        put = self.table.set_family if number in self.plain.families else self.table.add_family
        put(number, partner0=partners[0], partner1=partners[1], state=state, children=children)
        self.plain.put_family(number, partners, state, children)

    def edit_texts(self, id: int) -> None:
        person = self.plain.persons[id]
        names = [(self.random.randrange(8), self.random.choice(["Karl", "Åsa", ""])) for _ in range(3)]
        self.table.set_names(id, names)
        person.names = names
        key, text = self.random.choice(["job", "note"]), self.random.choice(["", "smith", "x" * 5000])
        self.table.set_field(id, key, text)
        if text:
            person.fields[key] = text
        else:
            person.fields.pop(key, None)

    def assert_same(self, table: olvane.Family, plain: PlainFamily) -> None:
        self.assertEqual(set(table.ids), set(plain.persons))
        host = PlainHost(plain)
        for id, expected in plain.persons.items():
            person = table.person(id)
            self.assertEqual((expected.father or None, expected.mother or None), (person.father, person.mother))
            self.assertEqual((expected.sex, expected.dead), (person.sex, person.dead))
            self.assertEqual((expected.birth, expected.death), (person.birth, person.death))
            self.assertEqual((tuple(expected.spouses), expected.preferred or None), (person.spouses, person.preferred))
            self.assertEqual(tuple(expected.children), person.children)
            self.assertEqual(expected.names, table.names(id))
            self.assertEqual(expected.fields, table.fields(id))
            self.assertEqual(text_of(host, id), text_of(table, id))
        self.assertEqual(set(table.family_numbers), set(plain.families))
        for number, family in plain.families.items():
            row = table.family(number)
            self.assertEqual(family.partners, (row.partner0 or 0, row.partner1 or 0))
            self.assertEqual((family.state, tuple(family.children)), (row.state, row.children))


def text_of(host: Any, focus: int) -> str:
    """The layout, or what stood there when the data left no picture."""
    try:
        return olvane.layout_text(host, focus)
    except olvane.LayoutError as error:
        return f"{error.status.name} {error.text}"

    def test_deepCopiesAreCopiesAndNothingIsPickled(self) -> None:
        family = olvane.Family([{"id": 1}])
        deep = copy.deepcopy({"family": family})["family"]
        deep.add_person(2)
        self.assertEqual((1, 2), (len(family), len(deep)))
        with self.assertRaisesRegex(TypeError, "a Family cannot be pickled: hand its rows to the other process"):
            pickle.dumps(family)


class Layouts(unittest.TestCase):
    def test_records_are_those_of_the_text(self) -> None:
        family = olvane.Family(ROWS)
        for view in olvane.View:
            text = olvane.layout_text(family, 3, view)
            self.assertEqual(text.count(";"), len(olvane.layout(family, 3, view)))

    def test_records_made_one_by_one_are_those_of_the_list(self) -> None:
        family = olvane.Family(ROWS)
        for focus in family.ids:
            records = olvane.layout(family, focus)
            lazily = olvane.family_layout(family, focus)
            self.assertEqual(records, list(lazily))
            self.assertEqual(records, [lazily[place] for place in range(len(lazily))])
            self.assertEqual((records[-1], records[:2]), (lazily[-1], lazily[:2]))
            self.assertEqual(lazily, olvane.family_layout(family, focus))
            self.assertGreater(sum(len(record.segments) for record in records), 0)
        with self.assertRaises(IndexError):
            lazily[len(lazily)]

    def test_options_count(self) -> None:
        family = olvane.Family(ROWS)
        options = olvane.Options(generations=1)
        self.assertEqual(1, len(olvane.layout(family, 3, olvane.View.PEDIGREE, options)))

    def test_threads_read_one_family(self) -> None:
        family = olvane.Family(ROWS)
        expected = olvane.layout_text(family, 3)
        texts: list[str] = []
        threads = [
            threading.Thread(target=lambda: texts.extend(olvane.layout_text(family, 3) for _ in range(200)))
            for _ in range(4)
        ]
        for thread in threads:
            thread.start()
        for thread in threads:
            thread.join()
        self.assertEqual([expected] * 800, texts)

    def test_a_hundred_thousand_layouts_leave_no_memory_behind(self) -> None:
        family = olvane.Family(ROWS)
        for _ in range(20000):
            olvane.layout_text(family, 1)
        before = resource.getrusage(resource.RUSAGE_SELF).ru_maxrss
        for _ in range(80000):
            olvane.layout_text(family, 1)
        self.assertLess(resource.getrusage(resource.RUSAGE_SELF).ru_maxrss - before, 2048)  # KiB

    def test_copies_are_families_of_their_own(self) -> None:
        family = olvane.Family(ROWS)
        for other in (family.copy(), copy.copy(family), copy.deepcopy(family)):
            other.remove_person(3)
            self.assertNotIn(3, other)
            self.assertIn(3, family)


if __name__ == "__main__":
    unittest.main()
