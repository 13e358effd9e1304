# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""The columns of a whole family as C takes them, gathered from rows in any of the forms that a Family takes."""

from __future__ import annotations

from collections.abc import Mapping, Sequence
from typing import Any

from olvane import _family_native as _table
from olvane._columns import Rows, rows_from
from olvane._family_rows import CHILD_KINDS, FAMILY_CHOICES, NAME_COLUMNS, NAME_KINDS, SEXES, refuse_unknown


class Columns:
    """The columns of a family as C takes them, with all that they refer to."""

    def __init__(self) -> None:
        self.struct = _table.ColumnsStruct()
        self._buffers: list[object] = []
        self._names: list[tuple[Sequence[Any], int, list[Any]]] = []
        self._fields: list[tuple[Sequence[Any], str, list[Any]]] = []
        self._person_ids: Sequence[Any] = ()

    def persons(self, given: Rows | None) -> None:
        rows = rows_from("persons", given, _table.PERSON_FIELDS)
        if rows is None:
            return
        self._fill("persons", rows, _table.PERSON_FIELDS, {"sex": SEXES})
        self._person_ids = rows.get("id", ())
        for name, column in rows.items():
            if name in NAME_COLUMNS:
                self._names.append((self._person_ids, NAME_COLUMNS[name], list(column)))
            elif name not in _table.PERSON_FIELDS:
                self._fields.append((self._person_ids, name, list(column)))

    def families(self, given: Rows | None) -> None:
        rows = rows_from("families", given, _table.FAMILY_FIELDS)
        if rows is None:
            return
        if "number" not in rows and rows:
            count = len(next(iter(rows.values())))
            rows = {**rows, "number": range(1, count + 1)}
        refuse_unknown("families", 0, rows, _table.FAMILY_FIELDS)
        self._fill("families", rows, _table.FAMILY_FIELDS, {"state": FAMILY_CHOICES})

    def rows(
        self,
        table: str,
        given: Rows | None,
        known: tuple[str, ...],
        choices: Mapping[str, Mapping[str, int]] | None = None,
    ) -> None:
        rows = rows_from(table.replace("_", " "), given, known)
        if rows is None:
            return
        refuse_unknown(table.replace("_", " "), 0, rows, known)
        self._fill(table, {name: rows.get(name, ()) for name in known[:2]} | dict(rows), known, choices or {})

    def names_and_fields(self, names: Rows | None, fields: Rows | None) -> None:
        """Names and fields of their own rows, or else those that stood in the rows of persons."""
        self._own_rows("names", ("person", "kind", "text"), names, self._names, {"kind": NAME_KINDS})
        self._own_rows("fields", ("person", "key", "text"), fields, self._fields, {})

    def _own_rows(
        self,
        table: str,
        known: tuple[str, str, str],
        given: Rows | None,
        beside: Sequence[tuple[Sequence[Any], Any, list[Any]]],
        choices: Mapping[str, Mapping[str, int]],
    ) -> None:
        gathered: dict[str, list[Any]] = {name: [] for name in known}
        persons, kinds, texts = gathered.values()
        for owners, kind, column in beside:
            for owner, text in zip(owners, column):
                if text is not None and text != "":
                    persons.append(owner)
                    kinds.append(kind)
                    texts.append(text)
        own = rows_from(table, given, known)
        if own is not None:
            refuse_unknown(table, 0, own, known)
            if texts:
                raise ValueError(f"{table} stand in the rows of persons and in rows of their own: give one of them")
            self._fill(table, own, known, choices)
        elif texts:
            self._fill(table, gathered, known, {})

    def _fill(
        self,
        table: str,
        rows: Mapping[str, Sequence[Any]],
        known: tuple[str, ...],
        choices: Mapping[str, Mapping[str, int]],
    ) -> None:
        group = getattr(self.struct, table)
        for name in known:
            if name not in rows:
                continue
            label = table.replace("_", " ")
            filled: tuple[object, object]
            if name in _table.TEXT_FIELDS:
                filled = _table.text_column(label, rows[name], name)
            else:
                filled = _table.number_column(label, rows[name], name, choices.get(name))
            setattr(group, name, filled[0])
            self._buffers.append(filled[1])
