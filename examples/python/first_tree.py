# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""A first tree: five persons of the program's own, laid out around Henry and drawn to tree.svg."""

from typing import NamedTuple

import olvane


class Person(NamedTuple):
    name: str
    male: bool
    father: int | None = None
    mother: int | None = None


PERSONS = {
    1: Person("Henry", True, 4, 5),
    2: Person("Anne", False),
    3: Person("Elizabeth", False, 1, 2),
    4: Person("Edmund", True),
    5: Person("Margaret", False),
}


class MyFamily:
    def father_of(self, person: int) -> int | None:
        return PERSONS[person].father

    def mother_of(self, person: int) -> int | None:
        return PERSONS[person].mother

    def spouses_of(self, person: int) -> list[int]:
        """Everyone who has a child with the person."""
        parents = [(PERSONS[child].father, PERSONS[child].mother) for child in self.children_of(person)]
        others = [mother if father == person else father for father, mother in parents]
        return list(dict.fromkeys(other for other in others if other is not None))

    def children_of(self, person: int) -> list[int]:
        return [child for child, p in PERSONS.items() if person in (p.father, p.mother)]

    def is_preferred_spouse(self, person: int, spouse: int) -> bool:
        return self.spouses_of(person)[0] == spouse

    def is_dead(self, person: int) -> bool:
        return True

    def date_of(self, person: int, is_birth: bool) -> str:
        return ""

    def sex_of(self, person: int) -> int:
        return 0 if PERSONS[person].male else 1


def draw(boxes: list[olvane.Record]) -> str:
    width, height = 55, 80
    left = min(0, *(box.x - 10 for box in boxes))
    top = min(0, *(box.y - 10 for box in boxes))
    right = max(box.x + width + 10 for box in boxes)
    bottom = max(box.y + height + 10 for box in boxes)
    svg = [f'<svg xmlns="http://www.w3.org/2000/svg" viewBox="{left} {top} {right - left} {bottom - top}">']
    for box in boxes:
        svg += [f'<path d="M{line.x1} {line.y1}L{line.x2} {line.y2}" stroke="black"/>' for line in box.segments]
    for box in boxes:
        name = PERSONS[box.id].name if box.kind is olvane.RecordKind.PERSON else "?"
        svg.append(f'<rect x="{box.x}" y="{box.y}" width="{width}" height="{height}" fill="white" stroke="black"/>')
        svg.append(f'<text x="{box.x + 4}" y="{box.y + 44}" font-size="10">{name}</text>')
    return "\n".join([*svg, "</svg>", ""])


with open("tree.svg", "w", encoding="utf-8") as file:
    file.write(draw(olvane.layout(MyFamily(), 1)))
