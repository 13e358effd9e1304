# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""The table of a family as ctypes sees it: structs, calls, and columns on their way to C."""

from __future__ import annotations

import ctypes
from array import array
from collections.abc import Mapping, Sequence
from ctypes import POINTER, c_char, c_char_p, c_int32, c_int64, c_size_t, c_uint32, c_void_p
from typing import Any

from olvane import _native
from olvane._columns import choice, encoded, number

TABLES = ("persons", "spouses", "children", "families", "family children", "names", "fields")
NO_ROW = c_size_t(-1).value
PERSON_FIELDS = (
    "id",
    "father",
    "mother",
    "sex",
    "dead",
    "birth",
    "death",
    "birth_written",
    "death_written",
)
FAMILY_FIELDS = ("number", "partner0", "partner1", "state", "marriage", "marriage_written", "marriage_place")
TEXT_FIELDS = frozenset(
    (
        "birth",
        "death",
        "birth_written",
        "death_written",
        "marriage",
        "marriage_written",
        "marriage_place",
        "key",
        "text",
    )
)


class ErrorStruct(ctypes.Structure):
    """olvane_family_error"""

    _fields_ = [
        ("table", ctypes.c_int),
        ("row", c_size_t),
        ("id", c_int64),
        ("field", c_char * 32),
        ("message", c_char * 224),
    ]


class NumbersStruct(ctypes.Structure):
    """olvane_numbers"""

    _fields_ = [("data", c_void_p), ("count", c_size_t), ("type", c_int32)]


class TextsStruct(ctypes.Structure):
    """olvane_texts"""

    _fields_ = [
        ("texts", c_void_p),
        ("bytes", c_void_p),
        ("starts", c_void_p),
        ("length", c_size_t),
        ("count", c_size_t),
    ]


def _columns(*names: str) -> type[ctypes.Structure]:
    fields = [(name, TextsStruct if name in TEXT_FIELDS else NumbersStruct) for name in names]
    return type("Columns", (ctypes.Structure,), {"_fields_": fields})


class ColumnsStruct(ctypes.Structure):
    """olvane_family_columns"""

    _fields_ = [
        ("persons", _columns(*PERSON_FIELDS)),
        ("spouses", _columns("person", "spouse", "preferred")),
        ("children", _columns("parent", "child")),
        ("families", _columns(*FAMILY_FIELDS)),
        ("family_children", _columns("family", "child", "kind")),
        ("names", _columns("person", "kind", "text")),
        ("fields", _columns("person", "key", "text")),
    ]


class PersonRowStruct(ctypes.Structure):
    """olvane_person_row"""

    _fields_ = [
        ("id", c_int64),
        ("father", c_int64),
        ("mother", c_int64),
        ("sex", c_int32),
        ("dead", c_int32),
        ("birth", c_char_p),
        ("death", c_char_p),
        ("birth_written", c_char_p),
        ("death_written", c_char_p),
    ]


class FamilyRowStruct(ctypes.Structure):
    """olvane_family_row"""

    _fields_ = [
        ("number", c_int64),
        ("partner0", c_int64),
        ("partner1", c_int64),
        ("state", c_int32),
        ("marriage", c_char_p),
        ("marriage_written", c_char_p),
        ("marriage_place", c_char_p),
    ]


class FamilyChildStruct(ctypes.Structure):
    """olvane_family_child"""

    _fields_ = [("child", c_int64), ("kind", c_int32)]


class NamePartStruct(ctypes.Structure):
    """olvane_name_part"""

    _fields_ = [("kind", c_int32), ("text", c_char_p)]


class TextStruct(ctypes.Structure):
    """olvane_text"""

    _fields_ = [("bytes", c_void_p), ("length", c_size_t)]


class PersonStruct(ctypes.Structure):
    """olvane_person"""

    _fields_ = [
        ("id", c_int64),
        ("father", c_int64),
        ("mother", c_int64),
        ("preferred", c_int64),
        ("sex", c_int32),
        ("dead", c_int32),
        ("birth", TextStruct),
        ("death", TextStruct),
        ("birth_written", TextStruct),
        ("death_written", TextStruct),
        ("spouses", POINTER(c_uint32)),
        ("spouse_count", c_size_t),
        ("children", POINTER(c_uint32)),
        ("child_count", c_size_t),
    ]


# The types of numbers that C reads where they lie, by the formats of buffers.
_TYPES = {("b", 1): 0, ("B", 1): 1, ("?", 1): 1, ("i", 4): 2, ("l", 4): 2, ("I", 4): 3, ("L", 4): 3}
_TYPES |= {("q", 8): 4, ("l", 8): 4, ("d", 8): 5}
_INT64 = 4


def number_column(
    table: str, column: Sequence[Any], field: str, choices: Mapping[str, int] | None
) -> tuple[NumbersStruct, object]:
    """A column, and what must live as long as it is read."""
    view = _numbers_view(column)
    if view is None:
        values = array("q", _whole_numbers(table, column, field, choices))
        address, count = values.buffer_info()
        return NumbersStruct(address or ctypes.addressof(_EMPTY), count, _INT64), values
    number_type = _TYPES[view.format.lstrip("@=<"), view.itemsize]
    if view.readonly or view.nbytes == 0:
        buffer: Any = ctypes.create_string_buffer(view.tobytes(), max(view.nbytes, 1))
    else:
        buffer = (c_char * view.nbytes).from_buffer(view)
    return NumbersStruct(ctypes.addressof(buffer), view.shape[0] if view.shape else 0, number_type), (buffer, view)


_EMPTY = ctypes.create_string_buffer(8)


def _numbers_view(column: object) -> memoryview | None:
    """The buffer of numbers that the column is; None where it has to be read number by number."""
    try:
        view = memoryview(column)  # type: ignore[arg-type]
    except TypeError:
        return None
    known = (view.format.lstrip("@=<"), view.itemsize) in _TYPES
    return view if known and view.ndim == 1 and view.contiguous else None


def _whole_numbers(
    table: str, column: Sequence[Any], field: str, choices: Mapping[str, int] | None
) -> array[int] | list[int]:
    if choices is None:
        try:
            return array("q", column)  # the usual case, at C's speed
        except (TypeError, OverflowError):
            return [number(table, value, field, row=row) for row, value in enumerate(column)]
    return [
        value if type(value) is int else choice(table, value, field, choices, row=row)
        for row, value in enumerate(column)
    ]


def text_column(table: str, column: Sequence[Any], field: str) -> tuple[TextsStruct, object]:
    """A column of texts, all in one run of bytes that zero bytes end."""
    count = len(column)
    try:
        joined = ("\0".join(column) + "\0" if count else "").encode("utf-8")
    except (TypeError, UnicodeEncodeError):
        joined = b"".join(encoded(table, text, field, row=row) + b"\0" for row, text in enumerate(column))
    if joined.count(b"\0") != count:
        for row, text in enumerate(column):
            encoded(table, text, field, row=row)
    buffer = ctypes.create_string_buffer(joined, max(len(joined), 1))
    return TextsStruct(None, ctypes.addressof(buffer), None, len(joined), count), buffer


def _declare(loaded: ctypes.CDLL) -> None:
    pointer = POINTER(c_void_p)
    error = POINTER(ErrorStruct)
    text = POINTER(TextStruct)
    ids = POINTER(c_int64)
    signatures = {
        "create": [POINTER(ColumnsStruct), pointer, error],
        "copy": [c_void_p, pointer],
        "add_person": [c_void_p, POINTER(PersonRowStruct), error],
        "set_person": [c_void_p, POINTER(PersonRowStruct), error],
        "remove_person": [c_void_p, c_int64, error],
        "set_spouses": [c_void_p, c_int64, ids, c_size_t, c_int64, error],
        "set_children": [c_void_p, c_int64, ids, c_size_t, error],
        "set_names": [c_void_p, c_int64, POINTER(NamePartStruct), c_size_t, error],
        "set_field": [c_void_p, c_int64, c_char_p, c_char_p, error],
        "add_family": [c_void_p, POINTER(FamilyRowStruct), POINTER(FamilyChildStruct), c_size_t, error],
        "set_family": [c_void_p, POINTER(FamilyRowStruct), POINTER(FamilyChildStruct), c_size_t, error],
        "remove_family": [c_void_p, c_int64, error],
        "person_ids": [c_void_p, POINTER(c_uint32), c_size_t],
        "family_numbers": [c_void_p, POINTER(c_uint32), c_size_t],
        "person": [c_void_p, c_int64, POINTER(PersonStruct)],
        "name_at": [c_void_p, c_int64, c_size_t, POINTER(c_int32), text],
        "field_at": [c_void_p, c_int64, c_size_t, text, text],
        "family": [c_void_p, c_int64, ids, ids, POINTER(c_int32), text, text, text],
        "family_children": [c_void_p, c_int64, POINTER(FamilyChildStruct), c_size_t, POINTER(c_size_t)],
    }
    for name, arguments in signatures.items():
        function = getattr(loaded, f"olvane_family_{name}")
        function.argtypes = arguments
        function.restype = ctypes.c_int
    for name in ("person_count", "family_count", "memory_bytes"):
        function = getattr(loaded, f"olvane_family_{name}")
        function.argtypes = [c_void_p]
        function.restype = c_size_t
    loaded.olvane_family_free.argtypes = [c_void_p]
    loaded.olvane_family_free.restype = None
    loaded.olvane_view.argtypes = [c_void_p, c_int32, c_int64, POINTER(_native.OptionsStruct), pointer]
    loaded.olvane_view.restype = ctypes.c_int


_declare(_native.library)
