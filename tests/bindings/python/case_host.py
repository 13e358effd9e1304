# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""The golden cases as Python sees them: a case file is a family, which answers as a host, and one request."""

from __future__ import annotations

from pathlib import Path
from typing import NamedTuple

import olvane

RELATIVES = {
    "ACTV_Fam_ShowAuntsUncles": olvane.Shown.AUNTS_UNCLES,
    "ACTV_Fam_ShowCousins": olvane.Shown.COUSINS,
    "ACTV_Fam_ShowSiblings": olvane.Shown.SIBLINGS,
    "ACTV_Fam_ShowSiblingSpouses": olvane.Shown.SIBLING_SPOUSES,
    "ACTV_Fam_ShowNeicesNephews": olvane.Shown.NIECES_NEPHEWS,
    "ACTV_Fam_ShowGrandchildren": olvane.Shown.GRANDCHILDREN,
    "ACTV_Fam_ShowGreatGrandparents": olvane.Shown.GREAT_GRANDPARENTS,
    "ACTV_Fam_ShowSpousesOfChildren": olvane.Shown.SPOUSES_OF_CHILDREN,
}


class CaseHost:
    """Answers from a case and writes down each question in the words of layout-case --trace."""

    def __init__(self, lines: dict[str, str]) -> None:
        self.calls: list[str] = []
        self._lines = lines

    def father_of(self, person: int) -> int | None:
        self.calls.append(f"call fatherForPersonWithID {person}")
        return self._number("father", person)

    def mother_of(self, person: int) -> int | None:
        self.calls.append(f"call motherForPersonWithID {person}")
        return self._number("mother", person)

    def spouses_of(self, person: int) -> list[int]:
        self.calls.append(f"call spousesForPersonWithID {person}")
        return [int(spouse) for spouse in self._answer("spouses", person).split()]

    def children_of(self, person: int) -> list[int]:
        self.calls.append(f"call childrenForPersonWithID {person}")
        return [int(child) for child in self._answer("children", person).split()]

    def is_preferred_spouse(self, person: int, spouse: int) -> bool:
        self.calls.append(f"call isPreferredSpouse {person} {spouse}")
        return self._number("preferred", person) == spouse

    def is_dead(self, person: int) -> bool:
        self.calls.append(f"call isPersonDead {person}")
        return bool(self._number("dead", person))

    def date_of(self, person: int, is_birth: bool) -> str:
        self.calls.append(f"call dateForPersonWithID {person} {int(is_birth)}")
        return self._answer("birth" if is_birth else "date", person)

    def sex_of(self, person: int) -> int:
        self.calls.append(f"call sexOfPersonWithID {person}")
        return self._number("sex", person) or 0

    def _answer(self, what: str, person: int) -> str:
        return self._lines.get(f"{what} {person}", "")

    def _number(self, what: str, person: int) -> int | None:
        given = self._answer(what, person)
        return int(given) if given else None


class Case(NamedTuple):
    file: Path
    lines: dict[str, str]
    focus: int
    view: olvane.View
    options: olvane.Options


def cases_in(golden: Path) -> list[Case]:
    """All golden cases that a host can ask for."""
    files = sorted(golden.glob("*/*.case"))
    given = [(file, lines_of(file.read_text(encoding="utf-8"))) for file in files]
    return [case_of(file, lines) for file, lines in given if can_be_asked(lines)]


def lines_of(text: str) -> dict[str, str]:
    """By "focus", "view" and "size", else by the directive and what it is about: "father 17" to "3"."""
    lines = {}
    for line in text.split("\n"):
        if line == "" or line.startswith("#"):
            continue
        key = 1 if line.split(" ")[0] in ("focus", "view", "size", "adapter") else 2
        words = line.split(" ", key)
        lines[" ".join(words[:key])] = " ".join(words[key:])
    return lines


def can_be_asked(lines: dict[str, str]) -> bool:
    """Not what hosts of Python can't ask for: a bare adapter, a chosen failure, other options, ids out of range."""
    if lines.get("adapter") == "bare" or not all(1 <= id < 2**31 for id in ids_in(lines)):
        return False
    options = [key.removeprefix("option ") for key in lines if key.startswith("option ")]
    return all(option in RELATIVES for option in options) and not any(key.startswith("throw ") for key in lines)


def ids_in(lines: dict[str, str]) -> list[int]:
    """The focus and all ids that the case answers."""
    relatives = ("focus", "father", "mother", "spouses", "children")
    answers = [value for key, value in lines.items() if key.split(" ")[0] in relatives]
    return [int(id) for answer in answers for id in answer.split()]


def case_of(file: Path, lines: dict[str, str]) -> Case:
    view, *numbers = lines.get("view", "family").split()
    shown = olvane.Shown.ALL
    for option, relatives in RELATIVES.items():
        if lines.get(f"option {option}") == "0":
            shown &= ~relatives
    generations, flag_depth = (int(number) for number in numbers) if numbers else (5, 4)
    sizes = olvane.Sizes(*(float(size) for size in lines["size"].split())) if "size" in lines else olvane.Sizes()
    options = olvane.Options(sizes, shown, generations, flag_depth)
    return Case(file, lines, int(lines["focus"]), olvane.View(view), options)
