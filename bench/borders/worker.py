# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""worker.py INTERFACE LAYOUTS: serve_borders for Python, of the family that print_family printed on the file LAYOUTS.

python host text, python host typed      eight methods
python table text, python table typed    the table; typed are the records
python table typed lazily               the table; records are made when they are looked at
"""

from __future__ import annotations

import re
import sys
import time

import olvane


class Host:
    def __init__(self, lines: list[str]) -> None:
        self.persons: dict[int, tuple[int, int, int, list[int], list[int]]] = {}
        for line in lines:
            match = re.fullmatch(r"(\d+) ([MF]) (\d+) (\d+) (\d+) \[(.*)\] \[(.*)\]\n?", line)
            assert match
            id, sex, father, mother, _, spouses, children = match.groups()
            self.persons[int(id)] = (
                int(father),
                int(mother),
                0 if sex == "M" else 1,
                [int(word) for word in spouses.split()],
                [int(word) for word in children.split()],
            )

    def father_of(self, person: int) -> int | None:
        return self.persons[person][0] or None

    def mother_of(self, person: int) -> int | None:
        return self.persons[person][1] or None

    def spouses_of(self, person: int) -> list[int]:
        return self.persons[person][3]

    def children_of(self, person: int) -> list[int]:
        return self.persons[person][4]

    def is_preferred_spouse(self, person: int, spouse: int) -> bool:
        return self.persons[person][3][0] == spouse

    def is_dead(self, person: int) -> bool:
        return False

    def date_of(self, person: int, is_birth: bool) -> str:
        return ""

    def sex_of(self, person: int) -> int:
        return self.persons[person][2]

    def table(self) -> olvane.Family:
        return olvane.Family(
            [(id, person[0], person[1], person[2]) for id, person in self.persons.items()],
            spouses=[(id, spouse) for id, person in self.persons.items() for spouse in person[3]],
            children=[(id, child) for id, person in self.persons.items() for child in person[4]],
        )


def main() -> None:
    interface, lines = sys.argv[1:]
    with open(lines, encoding="utf-8") as file:
        host = Host(file.readlines())
    family = host.table() if "table" in interface else host
    lay_out = {"text": olvane.layout_text, "typed": olvane.layout, "lazily": olvane.family_layout}[
        interface.split()[-1]
    ]
    print("ready", flush=True)
    for line in sys.stdin:
        times = []
        for _ in range(int(line)):
            start = time.perf_counter()
            lay_out(family, 1)
            times.append((time.perf_counter() - start) * 1000)
        shown = {record.id for record in olvane.layout(family, 1) if record.id > 0}
        print(" ".join(f"{one:.6f}" for one in times), "|", len(shown), flush=True)


main()
