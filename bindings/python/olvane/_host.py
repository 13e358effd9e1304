# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""What a host answers."""

from __future__ import annotations

from collections.abc import Iterable
from typing import Protocol


class Host(Protocol):
    """The eight questions of a layout. Any object with these methods will do; none need derive from this class.

    Ids are the host's own, 1 to 2147483647; any other number ends the layout with :class:`HostError`. So does an answer of
    another type, such as an awaitable, and so does a method that raises. The methods are asked many times for the same
    person, since no answer is kept, and must agree with themselves within one layout.
    """

    def father_of(self, person: int) -> int | None:
        """The id of the father, or None where he is not known."""

    def mother_of(self, person: int) -> int | None:
        """The id of the mother, or None where she is not known."""

    def spouses_of(self, person: int) -> Iterable[int]:
        """The ids of the spouses, in the order of drawing."""

    def children_of(self, person: int) -> Iterable[int]:
        """The ids of the children."""

    def is_preferred_spouse(self, person: int, spouse: int) -> bool:
        """Whether the second is the preferred spouse of the first."""

    def is_dead(self, person: int) -> bool:
        """Whether the person is dead."""

    def date_of(self, person: int, is_birth: bool) -> str | None:
        """The date of birth, asked of children, or another date, asked of spouses.

        In any form, and empty or None where it is not known.
        """

    def sex_of(self, person: int) -> int:
        """0 for male; any other whole number counts as female."""
