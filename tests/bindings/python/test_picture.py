# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""A picture in Python: boxes, families and lines as dataclasses, of a family and of a host."""

import json
import pathlib
import unittest
from collections.abc import Iterable
from typing import get_args

import olvane


FIXTURES = pathlib.Path(__file__).parents[2] / "fixtures"


class Couple:
    """17 and his wife 42 have a daughter 5."""

    def father_of(self, person: int) -> int | None:
        return 17 if person == 5 else None

    def mother_of(self, person: int) -> int | None:
        return 42 if person == 5 else None

    def spouses_of(self, person: int) -> Iterable[int]:
        return {17: [42], 42: [17]}.get(person, [])

    def children_of(self, person: int) -> Iterable[int]:
        return [5] if person in (17, 42) else []

    def is_preferred_spouse(self, person: int, spouse: int) -> bool:
        return False

    def is_dead(self, person: int) -> bool:
        return False

    def date_of(self, person: int, is_birth: bool) -> str | None:
        return None

    def sex_of(self, person: int) -> int:
        return 0 if person == 17 else 1


def ends(line: olvane.PictureLine) -> set[tuple[float, float]]:
    return {(line.x1, line.y1), (line.x2, line.y2)}


class Names(unittest.TestCase):
    """Those that libraries and other languages are tried with as well."""

    rows = json.loads((FIXTURES / "views.json").read_text(encoding="utf-8"))

    def test_views_have_the_names_of_the_rows(self) -> None:
        self.assertEqual(list(get_args(olvane.DrawView)), [view["name"] for view in self.rows["views"]])

    def test_relatives_have_the_numbers_of_the_rows(self) -> None:
        def bare(name: str) -> str:
            return name.replace("_", "").lower()

        numbers = {bare(shown.name or ""): shown.value for shown in olvane.Shown}
        self.assertEqual(numbers, {bare(name): value for name, value in self.rows["relatives"].items()})


class Pictures(unittest.TestCase):
    def test_boxes_stand_where_the_layout_has_them(self) -> None:
        picture = olvane.picture(Couple(), 17, unknown_parents=False)
        places = {box.id: (box.x, box.y) for box in picture.boxes}
        expected = {record.id: (record.x, record.y) for record in olvane.layout(Couple(), 17) if record.id > 0}
        self.assertEqual(expected, places)
        self.assertEqual(17, picture.boxes[picture.focus].id)
        self.assertEqual({(55.0, 80.0)}, {(box.width, box.height) for box in picture.boxes})

    def test_a_couple_is_a_family_whose_lines_join_its_boxes(self) -> None:
        picture = olvane.picture(Couple(), 17, unknown_parents=False)
        (family,) = picture.families
        ids = [picture.boxes[place].id for place in (*family.parents, *family.children)]
        self.assertEqual([17, 42, 5], ids)
        self.assertEqual((None, olvane.FamilyState.UNKNOWN), (family.number, family.state))
        self.assertEqual(olvane.LineRole.MARRIAGE, family.lines[0].role)
        child = picture.boxes[family.children[0]]
        stems = [line for line in family.lines if line.role == olvane.LineRole.STEM]
        self.assertTrue(any(y == child.y for line in stems for _, y in ends(line)))

    def test_unknown_parents_have_boxes_unless_they_are_left_out(self) -> None:
        picture = olvane.picture(Couple(), 17)
        unknown = [box for box in picture.boxes if box.id is None]
        self.assertEqual([17, 17], [picture.boxes[box.child_of].id for box in unknown if box.child_of is not None])
        self.assertEqual([None], list({box.id for box in unknown}))

    def test_a_family_gives_numbers_states_and_counts(self) -> None:
        parents = [{"id": 1}, {"id": 2, "sex": 1}]
        children = [{"id": 3, "father": 1, "mother": 2}, {"id": 4, "father": 1, "mother": 2, "sex": 1}]
        family = olvane.Family(
            [{"father": None, "mother": None, "sex": 0, **row} for row in parents + children],
            families=[{"number": 7, "partner0": 1, "partner1": 2, "state": 1}],
        )
        picture = olvane.picture(family, 3, olvane.View.PEDIGREE, unknown_parents=False)
        self.assertEqual([1], [box.hidden_children for box in picture.boxes if box.id == 1])
        self.assertEqual([(7, olvane.FamilyState.DIVORCED)], [(each.number, each.state) for each in picture.families])

    def test_what_a_layout_raises_a_picture_raises(self) -> None:
        with self.assertRaises(olvane.LayoutError) as caught:
            olvane.picture(Couple(), 0)
        self.assertEqual(olvane.Status.INVALID_PERSON, caught.exception.status)


if __name__ == "__main__":
    unittest.main()
