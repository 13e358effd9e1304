# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""What can go wrong, and what is left of the layout then."""

from __future__ import annotations

from enum import IntEnum
from typing import Any

from olvane._records import Record


class Status(IntEnum):
    """Outcomes of a layout; the numbers are those of the C interface."""

    OK = 0
    INVALID_ARGUMENT = 1
    INVALID_PERSON = 2
    HOST_FAILED = 3
    LAYOUT_FAILED = 4
    OUT_OF_MEMORY = 5
    NESTED_CALL = 6
    REFUSED = 7
    INVALID_ID = 8
    UNREADABLE = 9


class LayoutError(Exception):
    """A layout that did not come to its end.

    text and records are what was laid out before the failure, often nothing.
    """

    def __init__(self, status: Status, message: str, text: str, records: list[Record]) -> None:
        super().__init__(message)
        self.status = status
        self.text = text
        self.records = records

    def __reduce__(self) -> tuple[Any, ...]:
        """For copies and for other processes: all but the cause, which no exception takes along."""
        return type(self), (self.status, self.args[0], self.text, self.records), vars(self)


class HostError(LayoutError):
    """A method of the host raised. What it raised is the cause of this error (``__cause__``)."""
