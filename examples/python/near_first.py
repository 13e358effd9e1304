# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""A family behind a network: those near the focus are asked for in one batch, shown, and then the next ring."""

from collections.abc import Callable, Iterable, Iterator
from typing import NamedTuple

import olvane


class Row(NamedTuple):
    """What a batch brings of a person."""

    id: int
    father: int | None = None
    mother: int | None = None
    spouses: tuple[int, ...] = ()
    children: tuple[int, ...] = ()

    def relatives(self) -> set[int]:
        parents = {parent for parent in (self.father, self.mother) if parent}
        return parents.union(self.spouses, self.children)


def table_of(people: dict[int, Row]) -> olvane.Family:
    """The table of those who are here; relatives who are not are left out until they come."""

    def known(person: int | None) -> int | None:
        return person if person in people else None

    rows = people.values()
    return olvane.Family(
        [{"id": row.id, "father": known(row.father), "mother": known(row.mother)} for row in rows],
        spouses=[{"person": row.id, "spouse": other} for row in rows for other in row.spouses if known(other)],
        children=[{"parent": row.id, "child": child} for row in rows for child in row.children if known(child)],
    )


def near_first(ask: Callable[[list[int]], Iterable[Row]], focus: int, rounds: int = 6) -> Iterator[olvane.Family]:
    """The family of a focus after each of a limited number of rounds; ask gives the rows of one batch, in any order."""
    people: dict[int, Row] = {}
    asked: set[int] = set()
    ring = {focus}
    for _ in range(rounds):
        if not ring:
            return
        asked |= ring
        rows = list(ask(sorted(ring)))
        people.update((row.id, row) for row in rows)
        yield table_of(people)
        ring = {person for row in rows for person in row.relatives()} - asked
