# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""Persons and families as rows: the words and numbers of their fields, and the way of one row into a struct of C."""

from __future__ import annotations

import ctypes
from collections.abc import Iterable, Mapping
from dataclasses import dataclass
from enum import IntEnum
from typing import Any

from olvane import _family_native as _table
from olvane import _native
from olvane._columns import FamilyError, choice, encoded, number
from olvane._errors import Status

FAMILY_CHOICES = {"married": 0, "divorced": 1, "unmarried": 2, "unknown": 3}
SEXES = {"m": 0, "male": 0, "f": 1, "female": 1, "u": 2, "x": 2, "other": 2, "unknown": 2, "": 2}
CHILD_KINDS = {"birth": 0, "adopted": 1, "foster": 2, "step": 3, "sealing": 4, "unknown": 5}


class NameKind(IntEnum):
    """What a part of a name is. FULL begins the next name of a person who has several."""

    FULL = 0
    GIVEN = 1
    SURNAME = 2
    PREFIX = 3
    SUFFIX = 4
    NICKNAME = 5
    MARRIED = 6
    OTHER = 7


class FamilyState(IntEnum):
    """What is known of the partners of a family."""

    MARRIED = 0
    DIVORCED = 1
    UNMARRIED = 2
    UNKNOWN = 3


class ChildKind(IntEnum):
    """How a child came to a family."""

    BIRTH = 0
    ADOPTED = 1
    FOSTER = 2
    STEP = 3
    SEALING = 4
    UNKNOWN = 5


NAME_KINDS = {kind.name.lower(): int(kind) for kind in NameKind}
NAME_COLUMNS = {"name": 0, "given": 1, "surname": 2, "prefix": 3, "suffix": 4, "nickname": 5, "married_name": 6}


@dataclass(frozen=True, slots=True)
class Person:
    """A person as the table has it. Relatives are ids; None stands for nobody."""

    id: int
    father: int | None
    mother: int | None
    sex: int
    dead: bool
    birth: str
    death: str
    birth_written: str
    death_written: str
    spouses: tuple[int, ...]
    preferred: int | None
    children: tuple[int, ...]


@dataclass(frozen=True, slots=True)
class FamilyRow:
    """A couple or a lone parent as the table has it, with the children that they have together."""

    number: int
    partner0: int | None
    partner1: int | None
    state: FamilyState
    marriage: str
    marriage_written: str
    marriage_place: str
    children: tuple[tuple[int, ChildKind], ...]


def id_or_nobody(person: object) -> int:
    return person if isinstance(person, int) and 1 <= person < 2**31 else 0


def text_of(struct: _table.TextStruct) -> str:
    return ctypes.string_at(struct.bytes, struct.length).decode("utf-8") if struct.length else ""


def raise_status(status: int, error: _table.ErrorStruct | None = None) -> None:
    if status == Status.OK:
        return
    if status == Status.OUT_OF_MEMORY:
        raise MemoryError
    if status == Status.REFUSED and error is not None:
        row = None if error.row == _table.NO_ROW else error.row
        raise FamilyError(
            error.message.decode("utf-8", "replace"),
            table=_table.TABLES[error.table],
            row=row,
            id=error.id or None,
            field=error.field.decode("utf-8", "replace"),
        )
    raise ValueError(_native.library.olvane_status_text(status).decode("utf-8"))


def person_row(id: int, row: Mapping[str, Any]) -> _table.PersonRowStruct:
    refuse_unknown("persons", id, row, _table.PERSON_FIELDS)
    struct = _table.PersonRowStruct(id=number("persons", id, "id"), sex=2)
    for name in ("father", "mother"):
        setattr(struct, name, number("persons", row.get(name), name, id=id))
    struct.sex = choice("persons", row.get("sex", 2), "sex", SEXES, id=id)
    struct.dead = 1 if row.get("dead") else 0
    for name in ("birth", "death", "birth_written", "death_written"):
        setattr(struct, name, encoded("persons", row.get(name), name, id=id))
    return struct


def family_row(family: int, row: Mapping[str, Any]) -> _table.FamilyRowStruct:
    refuse_unknown("families", family, row, _table.FAMILY_FIELDS)
    struct = _table.FamilyRowStruct(number=number("families", family, "number"))
    for name in ("partner0", "partner1"):
        setattr(struct, name, number("families", row.get(name), name, id=family))
    struct.state = choice("families", row.get("state", 3), "state", FAMILY_CHOICES, id=family)
    for name in ("marriage", "marriage_written", "marriage_place"):
        setattr(struct, name, encoded("families", row.get(name), name, id=family))
    return struct


def family_children_of(family: int, children: Iterable[int | tuple[int, ChildKind | str]]) -> Any:
    structs = []
    for entry in children:
        child, kind = entry if isinstance(entry, tuple) else (entry, 0)
        structs.append(
            _table.FamilyChildStruct(
                number("family children", child, "child", id=family),
                choice("family children", kind, "kind", CHILD_KINDS, id=family),
            )
        )
    return (_table.FamilyChildStruct * len(structs))(*structs)


def refuse_unknown(table: str, id: int, row: Mapping[str, Any], known: tuple[str, ...]) -> None:
    for name in row:
        if name not in known:
            raise FamilyError(
                f"{table}, field {name}: there is no such field", table=table, row=None, id=id, field=name
            )
