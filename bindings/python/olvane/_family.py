# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""A family as a table that the library holds itself: handed over once, changed row by row, laid out without callbacks."""

from __future__ import annotations

import ctypes
from collections.abc import Iterable, Mapping, Sequence
from ctypes import byref, c_int32, c_int64, c_size_t, c_uint32, c_void_p
from dataclasses import dataclass
from enum import IntEnum
from typing import Any

from olvane import _family_native as _table
from olvane import _native
from olvane._columns import FamilyError, Rows, choice, encoded, number, rows_from
from olvane._errors import Status

_FAMILY_CHOICES = {"married": 0, "divorced": 1, "unmarried": 2, "unknown": 3}
_SEXES = {"m": 0, "male": 0, "f": 1, "female": 1, "u": 2, "x": 2, "other": 2, "unknown": 2, "": 2}
_KINDS = {"birth": 0, "adopted": 1, "foster": 2, "step": 3, "sealing": 4, "unknown": 5}


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


_NAME_KINDS = {kind.name.lower(): int(kind) for kind in NameKind}
_NAME_COLUMNS = {"name": 0, "given": 1, "surname": 2, "prefix": 3, "suffix": 4, "nickname": 5, "married_name": 6}


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


class Family:
    """Persons, spouses, children, families, names and fields.

    Each argument is rows in one of these forms:

    - a mapping of columns: ``{"id": ids, "father": fathers}``, each a sequence, or a buffer of numbers (array.array,
      numpy) that is read where it lies;
    - dicts, one for each row;
    - tuples, in the order of the fields below;
    - a DB-API cursor on which a query was run: its column names are the fields.

    ==================  ==========================================================================================
    persons             id, father, mother, sex, dead, birth, death, birth_written, death_written; then names by
                        their kind (name, given, surname, prefix, suffix, nickname, married_name); every other
                        column is a field for labels under its own name
    spouses             person, spouse, preferred: one row for each of the two lists that a couple stands in
    children            parent, child
    families            number, partner0, partner1, state, marriage, marriage_written, marriage_place; families
                        without a number count from 1
    family_children     family, child, kind
    names               person, kind, text
    fields              person, key, text
    ==================  ==========================================================================================

    Where no spouses are given, they follow from the families; where no children are, they follow from the families and
    from father and mother. Ids are whole numbers of 1 to 2147483647, and None or 0 is nobody. sex is 0, "m" or "male";
    1, "f" or "female"; or 2 for unknown. A date is text that sorts, or anything whose str does.

    Everything that is wrong is refused with FamilyError, which names the row and the field, before anything changes.
    Copies share their rows until one is changed. Threads may read one family at once; to change it, nobody else may
    use it.
    """

    __slots__ = ("_pointer", "__weakref__")

    def __init__(
        self,
        persons: Rows | None = None,
        *,
        spouses: Rows | None = None,
        children: Rows | None = None,
        families: Rows | None = None,
        family_children: Rows | None = None,
        names: Rows | None = None,
        fields: Rows | None = None,
    ) -> None:
        self._pointer: int | None = None
        columns = _Columns()
        columns.persons(persons)
        columns.rows("spouses", spouses, ("person", "spouse", "preferred"))
        columns.rows("children", children, ("parent", "child"))
        columns.families(families)
        columns.rows("family_children", family_children, ("family", "child", "kind"), {"kind": _KINDS})
        columns.names_and_fields(names, fields)
        made = c_void_p()
        error = _table.ErrorStruct()
        _raise(_native.library.olvane_family_create(byref(columns.struct), byref(made), byref(error)), error)
        self._pointer = made.value

    def __del__(self) -> None:
        if getattr(self, "_pointer", None) is not None:
            _native.library.olvane_family_free(self._pointer)
            self._pointer = None

    def copy(self) -> Family:
        """A copy for undo: made at once, whatever the size, and changed on its own."""
        made = c_void_p()
        _raise(_native.library.olvane_family_copy(self._pointer, byref(made)))
        return Family._of(made)

    __copy__ = copy

    @classmethod
    def _of(cls, made: c_void_p) -> Family:
        """Of a table that the library made, which now belongs to the Family."""
        other = cls.__new__(cls)
        other._pointer = made.value
        return other

    def __deepcopy__(self, memo: dict[int, Any]) -> Family:
        return self.copy()

    def __len__(self) -> int:
        return int(_native.library.olvane_family_person_count(self._pointer))

    def __contains__(self, person: object) -> bool:
        if not isinstance(person, int) or not 1 <= person < 2**31:
            return False
        return bool(_native.library.olvane_family_person(self._pointer, person, byref(_table.PersonStruct())) == 0)

    @property
    def ids(self) -> list[int]:
        """The ids of all persons, in the order in which they were added."""
        room = (c_uint32 * len(self))()
        _raise(_native.library.olvane_family_person_ids(self._pointer, room, len(room)))
        return list(room)

    @property
    def family_numbers(self) -> list[int]:
        """The numbers of all families, in the order in which they were added."""
        room = (c_uint32 * int(_native.library.olvane_family_family_count(self._pointer)))()
        _raise(_native.library.olvane_family_family_numbers(self._pointer, room, len(room)))
        return list(room)

    @property
    def memory_bytes(self) -> int:
        """Bytes that the table takes, those included that it shares with copies."""
        return int(_native.library.olvane_family_memory_bytes(self._pointer))

    def person(self, person: int) -> Person:
        """The person of that id. Raises KeyError for one who is not there."""
        struct = self._person(person)
        return Person(
            id=struct.id,
            father=struct.father or None,
            mother=struct.mother or None,
            sex=struct.sex,
            dead=struct.dead != 0,
            birth=_text(struct.birth),
            death=_text(struct.death),
            birth_written=_text(struct.birth_written),
            death_written=_text(struct.death_written),
            spouses=tuple(struct.spouses[: struct.spouse_count]) if struct.spouse_count else (),
            preferred=struct.preferred or None,
            children=tuple(struct.children[: struct.child_count]) if struct.child_count else (),
        )

    def names(self, person: int) -> list[tuple[NameKind, str]]:
        """The parts of the person's names in their order."""
        self._person(person)
        kind, text = c_int32(), _table.TextStruct()
        found: list[tuple[NameKind, str]] = []
        read = _native.library.olvane_family_name_at
        while read(self._pointer, person, len(found), byref(kind), byref(text)) == 0:
            found.append((NameKind(kind.value), _text(text)))
        return found

    def fields(self, person: int) -> dict[str, str]:
        """The person's fields for labels."""
        self._person(person)
        key, text = _table.TextStruct(), _table.TextStruct()
        found: dict[str, str] = {}
        read = _native.library.olvane_family_field_at
        while read(self._pointer, person, len(found), byref(key), byref(text)) == 0:
            found[_text(key)] = _text(text)
        return found

    def family(self, number: int) -> FamilyRow:
        """The family of that number. Raises KeyError for one that is not there."""
        partners, state = (c_int64(), c_int64()), c_int32()
        texts = [_table.TextStruct() for _ in range(3)]
        status = _native.library.olvane_family_family(
            self._pointer, _id(number), *map(byref, partners), byref(state), *map(byref, texts)
        )
        if status != Status.OK:
            raise KeyError(number)
        count = c_size_t()
        read = _native.library.olvane_family_family_children
        _raise(read(self._pointer, number, None, 0, byref(count)))
        children = (_table.FamilyChildStruct * count.value)()
        _raise(read(self._pointer, number, children, len(children), byref(count)))
        return FamilyRow(
            number,
            partners[0].value or None,
            partners[1].value or None,
            FamilyState(state.value),
            _text(texts[0]),
            _text(texts[1]),
            _text(texts[2]),
            tuple((child.child, ChildKind(child.kind)) for child in children),
        )

    def add_person(self, id: int, **row: Any) -> None:
        """A new person, with the fields of a row of persons. Parents get it at the end of their children."""
        self._change("add_person", byref(_person_row(id, row)))

    def set_person(self, id: int, **row: Any) -> None:
        """In place of the person of that id; a field that is not given gets its default. Lists of children follow."""
        self._change("set_person", byref(_person_row(id, row)))

    def remove_person(self, id: int) -> None:
        """With everything that names the person. Looks at every row."""
        self._change("remove_person", number("persons", id, "id"))

    def set_spouses(self, person: int, spouses: Sequence[int], preferred: int | None = None) -> None:
        """The list of spouses and nothing else; preferred is one of them."""
        ids = [number("spouses", spouse, "spouse", id=person) for spouse in spouses]
        chosen = number("spouses", preferred, "preferred", id=person)
        self._change("set_spouses", number("spouses", person, "id"), (c_int64 * len(ids))(*ids), len(ids), chosen)

    def set_children(self, person: int, children: Sequence[int]) -> None:
        """The list of children and nothing else."""
        ids = [number("children", child, "child", id=person) for child in children]
        self._change("set_children", number("children", person, "id"), (c_int64 * len(ids))(*ids), len(ids))

    def set_names(self, person: int, names: Iterable[tuple[NameKind | str, str]]) -> None:
        """In place of the names that the person has."""
        parts = [
            _table.NamePartStruct(
                choice("names", kind, "kind", _NAME_KINDS, id=person), encoded("names", text, "text", id=person)
            )
            for kind, text in names
        ]
        struct = (_table.NamePartStruct * len(parts))(*parts)
        self._change("set_names", number("names", person, "id"), struct, len(parts))

    def set_field(self, person: int, key: str, text: str) -> None:
        """In place of the text under that key; an empty text removes the field."""
        self._change(
            "set_field",
            number("fields", person, "id"),
            encoded("fields", key, "key", id=person),
            encoded("fields", text, "text", id=person),
        )

    def add_family(
        self, number: int, *, children: Iterable[int | tuple[int, ChildKind | str]] = (), **row: Any
    ) -> None:
        """A new family, with the fields of a row of families. Partners and children enter each other's lists."""
        struct, kept = _family_row(number, row), _family_children(number, children)
        self._change("add_family", byref(struct), kept, len(kept))

    def set_family(
        self, number: int, *, children: Iterable[int | tuple[int, ChildKind | str]] = (), **row: Any
    ) -> None:
        """In place of the family of that number. Partners whom no family joins any longer are separated."""
        struct, kept = _family_row(number, row), _family_children(number, children)
        self._change("set_family", byref(struct), kept, len(kept))

    def remove_family(self, family: int) -> None:
        """Partners whom no other family joins are no longer each other's spouses. Lists of children stay."""
        self._change("remove_family", number("families", family, "number"))

    def _person(self, person: int) -> _table.PersonStruct:
        struct = _table.PersonStruct()
        if _native.library.olvane_family_person(self._pointer, _id(person), byref(struct)) != Status.OK:
            raise KeyError(person)
        return struct

    def _change(self, edit: str, *arguments: Any) -> None:
        error = _table.ErrorStruct()
        change = getattr(_native.library, f"olvane_family_{edit}")
        _raise(change(self._pointer, *arguments, byref(error)), error)


def _id(person: object) -> int:
    return person if isinstance(person, int) and 1 <= person < 2**31 else 0


def _text(struct: _table.TextStruct) -> str:
    return ctypes.string_at(struct.bytes, struct.length).decode("utf-8") if struct.length else ""


def _raise(status: int, error: _table.ErrorStruct | None = None) -> None:
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


def _person_row(id: int, row: Mapping[str, Any]) -> _table.PersonRowStruct:
    _refuse_unknown("persons", id, row, _table.PERSON_FIELDS)
    struct = _table.PersonRowStruct(id=number("persons", id, "id"), sex=2)
    for name in ("father", "mother"):
        setattr(struct, name, number("persons", row.get(name), name, id=id))
    struct.sex = choice("persons", row.get("sex", 2), "sex", _SEXES, id=id)
    struct.dead = 1 if row.get("dead") else 0
    for name in ("birth", "death", "birth_written", "death_written"):
        setattr(struct, name, encoded("persons", row.get(name), name, id=id))
    return struct


def _family_row(family: int, row: Mapping[str, Any]) -> _table.FamilyRowStruct:
    _refuse_unknown("families", family, row, _table.FAMILY_FIELDS)
    struct = _table.FamilyRowStruct(number=number("families", family, "number"))
    for name in ("partner0", "partner1"):
        setattr(struct, name, number("families", row.get(name), name, id=family))
    struct.state = choice("families", row.get("state", 3), "state", _FAMILY_CHOICES, id=family)
    for name in ("marriage", "marriage_written", "marriage_place"):
        setattr(struct, name, encoded("families", row.get(name), name, id=family))
    return struct


def _family_children(family: int, children: Iterable[int | tuple[int, ChildKind | str]]) -> Any:
    structs = []
    for entry in children:
        child, kind = entry if isinstance(entry, tuple) else (entry, 0)
        structs.append(
            _table.FamilyChildStruct(
                number("family children", child, "child", id=family),
                choice("family children", kind, "kind", _KINDS, id=family),
            )
        )
    return (_table.FamilyChildStruct * len(structs))(*structs)


def _refuse_unknown(table: str, id: int, row: Mapping[str, Any], known: tuple[str, ...]) -> None:
    for name in row:
        if name not in known:
            raise FamilyError(
                f"{table}, field {name}: there is no such field", table=table, row=None, id=id, field=name
            )


class _Columns:
    """The columns of a family as C takes them, with all that they refer to."""

    def __init__(self) -> None:
        self.struct = _table.ColumnsStruct()
        self._kept: list[object] = []
        self._names: list[tuple[Sequence[Any], int, list[Any]]] = []
        self._fields: list[tuple[Sequence[Any], str, list[Any]]] = []
        self._person_ids: Sequence[Any] = ()

    def persons(self, given: Rows | None) -> None:
        rows = rows_from("persons", given, _table.PERSON_FIELDS)
        if rows is None:
            return
        self._fill("persons", rows, _table.PERSON_FIELDS, {"sex": _SEXES})
        self._person_ids = rows.get("id", ())
        for name, column in rows.items():
            if name in _NAME_COLUMNS:
                self._names.append((self._person_ids, _NAME_COLUMNS[name], list(column)))
            elif name not in _table.PERSON_FIELDS:
                self._fields.append((self._person_ids, name, list(column)))

    def families(self, given: Rows | None) -> None:
        rows = rows_from("families", given, _table.FAMILY_FIELDS)
        if rows is None:
            return
        if "number" not in rows and rows:
            count = len(next(iter(rows.values())))
            rows = {**rows, "number": range(1, count + 1)}
        self._refuse_unknown("families", rows, _table.FAMILY_FIELDS)
        self._fill("families", rows, _table.FAMILY_FIELDS, {"state": _FAMILY_CHOICES})

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
        self._refuse_unknown(table.replace("_", " "), rows, known)
        self._fill(table, {name: rows.get(name, ()) for name in known[:2]} | dict(rows), known, choices or {})

    def names_and_fields(self, names: Rows | None, fields: Rows | None) -> None:
        """Names and fields of their own rows, behind those that stood in the rows of persons."""
        persons: list[Any] = []
        kinds: list[Any] = []
        texts: list[Any] = []
        for owners, kind, column in self._names:
            for owner, text in zip(owners, column):
                if text is not None and text != "":
                    persons.append(owner)
                    kinds.append(kind)
                    texts.append(text)
        own = rows_from("names", names, ("person", "kind", "text"))
        if own is None and texts:
            self._fill("names", {"person": persons, "kind": kinds, "text": texts}, ("person", "kind", "text"), {})
        elif own is not None:
            if texts:
                raise ValueError("names stand in the rows of persons and in rows of their own: give one of them")
            self._refuse_unknown("names", own, ("person", "kind", "text"))
            self._fill("names", own, ("person", "kind", "text"), {"kind": _NAME_KINDS})
        self._own_fields(fields)

    def _own_fields(self, fields: Rows | None) -> None:
        persons: list[Any] = []
        keys: list[Any] = []
        texts: list[Any] = []
        for owners, key, column in self._fields:
            for owner, text in zip(owners, column):
                if text is not None and text != "":
                    persons.append(owner)
                    keys.append(key)
                    texts.append(text)
        own = rows_from("fields", fields, ("person", "key", "text"))
        if own is not None:
            self._refuse_unknown("fields", own, ("person", "key", "text"))
            if texts:
                raise ValueError("fields stand in the rows of persons and in rows of their own: give one of them")
            self._fill("fields", own, ("person", "key", "text"), {})
        elif texts:
            self._fill("fields", {"person": persons, "key": keys, "text": texts}, ("person", "key", "text"), {})

    @staticmethod
    def _refuse_unknown(table: str, rows: Mapping[str, Any], known: tuple[str, ...]) -> None:
        _refuse_unknown(table, 0, rows, known)

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
            self._kept.append(filled[1])


__all__ = ["ChildKind", "Family", "FamilyError", "FamilyRow", "FamilyState", "NameKind", "Person"]
