# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""A family as plain dicts and lists, edited by the rules that the table states; and a host that answers from it."""

from __future__ import annotations

import copy
from dataclasses import dataclass, field


@dataclass
class PlainPerson:
    father: int = 0
    mother: int = 0
    sex: int = 2
    dead: bool = False
    birth: str = ""
    death: str = ""
    spouses: list[int] = field(default_factory=list)
    preferred: int = 0
    children: list[int] = field(default_factory=list)
    names: list[tuple[int, str]] = field(default_factory=list)
    fields: dict[str, str] = field(default_factory=dict)


@dataclass
class PlainCouple:
    partners: tuple[int, int]
    state: int
    children: list[tuple[int, int]]


class PlainFamily:
    def __init__(self) -> None:
        self.persons: dict[int, PlainPerson] = {}
        self.families: dict[int, PlainCouple] = {}

    def copy(self) -> PlainFamily:
        return copy.deepcopy(self)

    def put_person(self, id: int, father: int, mother: int, sex: int, dead: bool, birth: str, death: str) -> None:
        person = self.persons.setdefault(id, PlainPerson())
        before, after = {person.father, person.mother}, {father, mother}
        person.father, person.mother, person.sex, person.dead = father, mother, sex, dead
        person.birth, person.death = birth, death
        for parent in before - after - {0}:
            self.persons[parent].children = [one for one in self.persons[parent].children if one != id]
        for parent in after - before - {0}:
            if id not in self.persons[parent].children:
                self.persons[parent].children.append(id)

    def remove_person(self, id: int) -> None:
        del self.persons[id]
        for person in self.persons.values():
            person.father = 0 if person.father == id else person.father
            person.mother = 0 if person.mother == id else person.mother
            person.preferred = 0 if person.preferred == id else person.preferred
            person.spouses = [one for one in person.spouses if one != id]
            person.children = [one for one in person.children if one != id]
        for number, family in list(self.families.items()):
            touched = id in family.partners or any(child == id for child, _ in family.children)
            first, second = family.partners
            family.partners = (0 if first == id else first, 0 if second == id else second)
            family.children = [entry for entry in family.children if entry[0] != id]
            if touched and family.partners == (0, 0) and not family.children:
                del self.families[number]

    def put_family(self, number: int, partners: tuple[int, int], state: int, children: list[tuple[int, int]]) -> None:
        old = self.families.get(number)
        if old is not None and sorted(old.partners) != sorted(partners):
            self._separate(number)
        self.families[number] = PlainCouple(partners, state, children)
        first, second = partners
        if first and second:
            for one, other in {(first, second), (second, first)}:
                self._add_spouse(one, other)
        for partner in {first, second} - {0}:
            listed = self.persons[partner].children
            listed += [child for child, _ in children if child not in listed]

    def remove_family(self, number: int) -> None:
        self._separate(number)
        del self.families[number]

    def _add_spouse(self, one: int, other: int) -> None:
        person = self.persons[one]
        if not person.spouses:
            person.preferred = other
        if other not in person.spouses:
            person.spouses.append(other)

    def _separate(self, number: int) -> None:
        first, second = self.families[number].partners
        others = [family for key, family in self.families.items() if key != number]
        if not first or not second or any(sorted(one.partners) == sorted((first, second)) for one in others):
            return
        for one, other in {(first, second), (second, first)}:
            person = self.persons[one]
            person.spouses = [spouse for spouse in person.spouses if spouse != other]
            person.preferred = 0 if person.preferred == other else person.preferred


class PlainHost:
    """The eight questions, answered from a plain family."""

    def __init__(self, family: PlainFamily) -> None:
        self._persons = family.persons

    def father_of(self, person: int) -> int | None:
        return self._persons[person].father or None

    def mother_of(self, person: int) -> int | None:
        return self._persons[person].mother or None

    def spouses_of(self, person: int) -> list[int]:
        return self._persons[person].spouses

    def children_of(self, person: int) -> list[int]:
        return self._persons[person].children

    def is_preferred_spouse(self, person: int, spouse: int) -> bool:
        return self._persons[person].preferred == spouse

    def is_dead(self, person: int) -> bool:
        return self._persons[person].dead

    def date_of(self, person: int, is_birth: bool) -> str:
        return self._persons[person].birth if is_birth else self._persons[person].death

    def sex_of(self, person: int) -> int:
        return self._persons[person].sex
