# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""A family as a table that the library holds itself: handed over once, changed row by row, laid out without callbacks."""

from __future__ import annotations

from collections.abc import Iterable, Sequence
from ctypes import byref, c_int32, c_int64, c_size_t, c_uint32, c_void_p
from typing import Any, NoReturn

from olvane import _family_native as _table
from olvane import _native
from olvane._columns import FamilyError, Rows, choice, encoded, number
from olvane._errors import Status
from olvane._family_columns import Columns
from olvane._family_rows import (
    CHILD_KINDS,
    NAME_KINDS,
    ChildKind,
    FamilyRow,
    FamilyState,
    NameKind,
    Person,
    family_children_of,
    family_row,
    id_or_nobody,
    person_row,
    raise_status,
    text_of,
)


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
        columns = Columns()
        columns.persons(persons)
        columns.rows("spouses", spouses, ("person", "spouse", "preferred"))
        columns.rows("children", children, ("parent", "child"))
        columns.families(families)
        columns.rows("family_children", family_children, ("family", "child", "kind"), {"kind": CHILD_KINDS})
        columns.names_and_fields(names, fields)
        made = c_void_p()
        error = _table.ErrorStruct()
        raise_status(_native.library.olvane_family_create(byref(columns.struct), byref(made), byref(error)), error)
        self._pointer = made.value

    def __del__(self) -> None:
        if getattr(self, "_pointer", None) is not None:
            _native.library.olvane_family_free(self._pointer)
            self._pointer = None

    def copy(self) -> Family:
        """A copy for undo: made at once, whatever the size, and changed on its own."""
        made = c_void_p()
        raise_status(_native.library.olvane_family_copy(self._pointer, byref(made)))
        return Family._of(made)

    __copy__ = copy

    def __reduce__(self) -> NoReturn:
        """What is pickled would be an address in this process."""
        raise TypeError("a Family cannot be pickled: hand its rows to the other process, which makes its own")

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
        raise_status(_native.library.olvane_family_person_ids(self._pointer, room, len(room)))
        return list(room)

    @property
    def family_numbers(self) -> list[int]:
        """The numbers of all families, in the order in which they were added."""
        room = (c_uint32 * int(_native.library.olvane_family_family_count(self._pointer)))()
        raise_status(_native.library.olvane_family_family_numbers(self._pointer, room, len(room)))
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
            birth=text_of(struct.birth),
            death=text_of(struct.death),
            birth_written=text_of(struct.birth_written),
            death_written=text_of(struct.death_written),
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
            found.append((NameKind(kind.value), text_of(text)))
        return found

    def fields(self, person: int) -> dict[str, str]:
        """The person's fields for labels."""
        self._person(person)
        key, text = _table.TextStruct(), _table.TextStruct()
        found: dict[str, str] = {}
        read = _native.library.olvane_family_field_at
        while read(self._pointer, person, len(found), byref(key), byref(text)) == 0:
            found[text_of(key)] = text_of(text)
        return found

    def family(self, number: int) -> FamilyRow:
        """The family of that number. Raises KeyError for one that is not there."""
        partners, state = (c_int64(), c_int64()), c_int32()
        texts = [_table.TextStruct() for _ in range(3)]
        status = _native.library.olvane_family_family(
            self._pointer, id_or_nobody(number), *map(byref, partners), byref(state), *map(byref, texts)
        )
        if status != Status.OK:
            raise KeyError(number)
        count = c_size_t()
        read = _native.library.olvane_family_family_children
        raise_status(read(self._pointer, number, None, 0, byref(count)))
        children = (_table.FamilyChildStruct * count.value)()
        raise_status(read(self._pointer, number, children, len(children), byref(count)))
        return FamilyRow(
            number,
            partners[0].value or None,
            partners[1].value or None,
            FamilyState(state.value),
            text_of(texts[0]),
            text_of(texts[1]),
            text_of(texts[2]),
            tuple((child.child, ChildKind(child.kind)) for child in children),
        )

    def add_person(self, id: int, **row: Any) -> None:
        """A new person, with the fields of a row of persons. Parents get it at the end of their children."""
        self._change("add_person", byref(person_row(id, row)))

    def set_person(self, id: int, **row: Any) -> None:
        """In place of the person of that id; a field that is not given gets its default. Lists of children follow."""
        self._change("set_person", byref(person_row(id, row)))

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
                choice("names", kind, "kind", NAME_KINDS, id=person), encoded("names", text, "text", id=person)
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
        struct, members = family_row(number, row), family_children_of(number, children)
        self._change("add_family", byref(struct), members, len(members))

    def set_family(
        self, number: int, *, children: Iterable[int | tuple[int, ChildKind | str]] = (), **row: Any
    ) -> None:
        """In place of the family of that number. Partners whom no family joins any longer are separated."""
        struct, members = family_row(number, row), family_children_of(number, children)
        self._change("set_family", byref(struct), members, len(members))

    def remove_family(self, family: int) -> None:
        """Partners whom no other family joins are no longer each other's spouses. Lists of children stay."""
        self._change("remove_family", number("families", family, "number"))

    def _person(self, person: int) -> _table.PersonStruct:
        struct = _table.PersonStruct()
        if _native.library.olvane_family_person(self._pointer, id_or_nobody(person), byref(struct)) != Status.OK:
            raise KeyError(person)
        return struct

    def _change(self, edit: str, *arguments: Any) -> None:
        error = _table.ErrorStruct()
        change = getattr(_native.library, f"olvane_family_{edit}")
        raise_status(change(self._pointer, *arguments, byref(error)), error)


__all__ = ["ChildKind", "Family", "FamilyError", "FamilyRow", "FamilyState", "NameKind", "Person"]
