# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""Rows in the forms in which programs have them, as columns; and values that are checked one by one."""

from __future__ import annotations

import operator
from collections.abc import Iterable, Mapping, Sequence
from typing import Any, Union

Rows = Union[Mapping[str, Any], Iterable[Mapping[str, Any]], Iterable[Sequence[Any]], Any]


class FamilyError(ValueError):
    """What a table of a family refuses; nothing has changed then.

    table is the list of rows ("persons", "spouses", ...), row counts from 0 in it and is None for an edit and for a
    whole column, id is the person or family of an edit, and field is the column.
    """

    def __init__(self, message: str, *, table: str, row: int | None, id: int | None, field: str) -> None:
        super().__init__(message)
        self.table = table
        self.row = row
        self.id = id
        self.field = field

    def __reduce__(self) -> tuple[Any, ...]:
        return _remade, (self.args[0], self.table, self.row, self.id, self.field)


def _remade(message: str, table: str, row: int | None, id: int | None, field: str) -> FamilyError:
    return FamilyError(message, table=table, row=row, id=id, field=field)


def refused(table: str, row: int | None, id: int | None, field: str, reason: str) -> FamilyError:
    """The error, in the words that the library itself uses."""
    if row is not None:
        place = f"{table} row {row}"
    elif id is not None:
        place = f"{'family' if table in ('families', 'family children') else 'person'} {id}"
    else:
        place = table
    return FamilyError(f"{place}, field {field}: {reason}", table=table, row=row, id=id, field=field)


def rows_from(table: str, given: Rows | None, known: tuple[str, ...]) -> dict[str, Sequence[Any]] | None:
    """The rows as columns by their names; None where there are none."""
    if given is None:
        return None
    if isinstance(given, Mapping):
        return dict(given)
    cursor: Any = given
    description = getattr(cursor, "description", None)
    if description is not None:
        return _transposed(table, cursor.fetchall(), [column[0].lower() for column in description])
    rows: Sequence[Any] = given if isinstance(given, Sequence) else list(given)
    if not rows:
        return {known[0]: ()}
    if isinstance(rows[0], Mapping):
        return _of_dicts(rows)
    return _transposed(table, rows, list(known))


def _of_dicts(rows: Sequence[Mapping[str, Any]]) -> dict[str, Sequence[Any]]:
    first = rows[0]
    try:
        columns: dict[str, Sequence[Any]] = {name: [row[name] for row in rows] for name in first}
        if all(len(row) == len(first) for row in rows):
            return columns
    except KeyError:
        pass
    names = dict.fromkeys(name for row in rows for name in row)
    return {name: [row.get(name) for row in rows] for name in names}


def _transposed(table: str, rows: Sequence[Sequence[Any]], names: list[str]) -> dict[str, Sequence[Any]]:
    if not rows:
        return {name: () for name in names}
    width = len(rows[0])
    if width > len(names):
        raise refused(table, 0, None, names[-1], f"the row has {width} values, and there are {len(names)} fields")
    for row, values in enumerate(rows):
        if len(values) != width:
            reason = f"the row has {len(values)} values, and the first one has {width}"
            raise refused(table, row, None, names[min(len(values), width) - 1], reason)
    return dict(zip(names, zip(*rows)))


def number(table: str, value: object, field: str, *, row: int | None = None, id: int | None = None) -> int:
    """A whole number of 64 bits; 0 for None."""
    if value is None:
        return 0
    try:
        whole = operator.index(value)  # type: ignore[arg-type]
    except TypeError:
        raise refused(table, row, id, field, f"{value!r} is not a whole number") from None
    if not -(2**63) <= whole < 2**63:
        shown = str(whole) if abs(whole) < 10**30 else f"a number of {len(str(abs(whole)))} digits"
        raise refused(table, row, id, field, f"{shown} is not a whole number of 1 to 2147483647")
    return whole


def choice(
    table: str,
    value: object,
    field: str,
    choices: Mapping[str, int],
    *,
    row: int | None = None,
    id: int | None = None,
) -> int:
    """A choice as its number, or by its name."""
    if value is None:
        return choices.get("unknown", 0)
    if isinstance(value, str):
        known = choices.get(value.strip().lower())
        if known is None:
            raise refused(table, row, id, field, f"{value!r} is none of {', '.join(filter(None, choices))}")
        return known
    whole = number(table, value, field, row=row, id=id)
    if not -(2**31) <= whole < 2**31:
        raise refused(table, row, id, field, f"{whole} is not a choice")
    return whole


def encoded(table: str, value: object, field: str, *, row: int | None = None, id: int | None = None) -> bytes:
    """A text in UTF-8; None is the empty one."""
    text = value if isinstance(value, str) else "" if value is None else str(value)
    if "\0" in text:
        raise refused(table, row, id, field, f"the text has a zero byte at character {text.index(chr(0))}")
    try:
        return text.encode("utf-8")
    except UnicodeEncodeError as error:
        raise refused(table, row, id, field, f"the text is not valid Unicode at character {error.start}") from None
