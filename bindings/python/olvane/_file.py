# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""GEDCOM files, and drawings as SVG."""

from __future__ import annotations

import ctypes
import json
import operator
import os
import zipfile
from collections.abc import Callable
from ctypes import POINTER, byref, c_char_p, c_int, c_int32, c_int64, c_size_t, c_uint32, c_void_p
from dataclasses import dataclass
from typing import Any, Literal, NoReturn

from olvane import _native
from olvane._errors import Status
from olvane._family import Family
from olvane._layout import _options_struct, _text_of, _view_number
from olvane._options import Options, View
from olvane._svg import Svg

DrawView = Literal[
    "family",
    "pedigree",
    "near",
    "ancestors",
    "descendants",
    "hourglass",
    "relatives",
    "fan",
    "kinship",
    "everybody",
]

_READ_FACTS = 1
_GREATEST_ID = 2**31 - 1


class FileError(ValueError):
    """A file that cannot be read, a person who is not in it, or an option that is not known; status says which."""

    def __init__(self, status: Status, message: str) -> None:
        super().__init__(message)
        self.status = status

    # Another process gets a pickled one.
    def __reduce__(self) -> tuple[Any, ...]:
        return type(self), (self.status, str(self))


@dataclass(frozen=True, slots=True)
class Remark:
    """Something odd in the data. person and family are None where it is about none."""

    kind: str
    person: int | None
    family: int | None
    text: str


class File:
    """A GEDCOM file, read once: from a path, or from its bytes.

    Persons are numbered from 1 in the order of the file; where one is named by a text, it is the number, the file's own
    identifier ("I17"), or a name that means one person. facts reads places and occupations as well, which drawings with
    places or occupation need. Any number of threads may ask one file.
    """

    def __init__(self, source: str | os.PathLike[str] | bytes, *, facts: bool = False, name: str = "file") -> None:
        self._pointer = c_void_p()
        flags = _READ_FACTS if facts else 0
        if not isinstance(source, bytes) and zipfile.is_zipfile(source):
            source, name = _unpacked(source), str(source)
        if isinstance(source, bytes):
            self._open(_read, source, len(source), name.encode("utf-8"), flags)
        else:
            self._open(_open, os.fsencode(source), flags)

    def _open(self, call: Any, *arguments: object) -> None:
        failure = c_void_p()
        status = call(*arguments, byref(self._pointer), byref(failure))
        text = _taken(failure)
        if status != Status.OK:
            raise FileError(Status(status), text or _status_text(status))

    def __del__(self) -> None:
        if getattr(self, "_pointer", None):
            _free(self._pointer)

    def __reduce__(self) -> NoReturn:
        """What is pickled would be an address in this process."""
        raise TypeError(
            "a File cannot be pickled or copied: hand its path or bytes to the other process, which reads it"
        )

    def __len__(self) -> int:
        """How many persons there are."""
        return int(_count(self._pointer))

    def __repr__(self) -> str:
        return f"<olvane.File of {len(self)} persons>"

    def find(self, who: str) -> int:
        """The number of the person whom a text means. Raises FileError for nobody and for several."""
        person, failure = c_int64(), c_void_p()
        status = _find(self._pointer, who.encode("utf-8"), byref(person), byref(failure))
        text = _taken(failure)
        if status != Status.OK:
            raise FileError(Status(status), text)
        return person.value

    def family(self) -> Family:
        """The file as a table, with names and dates."""
        made = c_void_p()
        status = _family(self._pointer, byref(made))
        if status != Status.OK:
            raise FileError(Status(status), _status_text(status))
        return Family._of(made)

    def layout_text(self, focus: int, view: View = View.FAMILY, options: Options | None = None) -> str:
        """The result text of a layout, as :func:`olvane.layout_text` makes it of the table."""
        layout = c_void_p()
        chosen = None if options is None else byref(_options_struct(options))
        try:
            status = _layout(self._pointer, _view_number(view), _person_number(focus), chosen, byref(layout))
            if status != Status.OK:
                is_missing = status == Status.INVALID_PERSON
                reason = f"the file has no person {focus}" if is_missing else _status_text(status)
                raise FileError(Status(status), f"layout of person {focus}: {reason}")
            return _text_of(layout)
        finally:
            _native.library.olvane_layout_free(layout)

    def draw(self, focus: int | str, view: DrawView = "family", **options: Any) -> Svg:
        """One person, drawn. The options are those of :func:`olvane.draw`."""
        person = self.find(focus) if isinstance(focus, str) else _person_number(focus)
        to = options.pop("to", 0)
        chosen = _draw_options(view, to=self.find(to) if isinstance(to, str) else to, **options)
        return Svg(_answer(lambda result: _draw(self._pointer, person, byref(chosen), result)))

    def kinship(self, a: int, b: int) -> dict[str, Any]:
        """How two persons are related: words, degree, coefficient, and the ways."""
        return dict(json.loads(self.kinship_json(a, b)))

    def kinship_json(self, a: int, b: int) -> str:
        return _answer(lambda result: _kinship(self._pointer, _person_number(a), _person_number(b), result))

    def remarks(self) -> list[Remark]:
        """What may be odd in the data."""
        return [Remark(**remark) for remark in json.loads(self.remarks_json())]

    def remarks_json(self) -> str:
        return _answer(lambda result: _remarks(self._pointer, result))


def _unpacked(archive: str | os.PathLike[str]) -> bytes:
    """The file in an archive (.gdz), as the library itself takes it where it was built with libzip."""
    with zipfile.ZipFile(archive) as parts:
        if "gedcom.ged" not in parts.namelist():
            raise FileError(Status.UNREADABLE, f"{archive}: is an archive without a gedcom.ged")
        return parts.read("gedcom.ged")


def draw(
    source: str | os.PathLike[str] | bytes | File | Family,
    focus: int | str,
    view: DrawView = "family",
    *,
    to: int | str = 0,
    up: int = 0,
    down: int = 0,
    generations: int = 0,
    direction: Literal["down", "up", "left", "right"] = "down",
    boxes: Literal["tall", "wide"] | None = None,
    theme: Literal["light", "dark", "print"] = "light",
    title: str = "",
    unknown_parents: bool = False,
    dates: bool = False,
    places: bool = False,
    occupation: bool = False,
    marriage: bool = False,
    hide_living: bool = False,
    year: int = 0,
) -> Svg:
    """Draw one person of a GEDCOM file or of a Family in one call, as "olvane draw" does.

    source is a path, the bytes of a file, a File that is open, or a Family, whose persons are named by their ids alone.
    to is the other person of a kinship; up and down are generations, 0 for all; generations is of a pedigree; places and
    occupation need a File that was read with facts. hide_living, of a file, hides everyone who may be living in the
    year, 0 for the present one. Raises FileError.
    """
    options: dict[str, Any] = {
        "up": up,
        "down": down,
        "generations": generations,
        "direction": direction,
        "boxes": boxes,
        "theme": theme,
        "title": title,
        "unknown_parents": unknown_parents,
        "dates": dates,
        "places": places,
        "occupation": occupation,
        "marriage": marriage,
        "hide_living": hide_living,
        "year": year,
    }
    if isinstance(source, Family):
        chosen = _draw_options(view, to=_person_number(to), **options)
        person, table = _person_number(focus), source._pointer
        return Svg(_answer(lambda result: _draw_family(table, person, byref(chosen), result)))
    file = source if isinstance(source, File) else File(source, facts=places or occupation)
    return file.draw(focus, view, to=to, **options)


class _DrawOptions(ctypes.Structure):
    _fields_ = [
        ("struct_size", c_size_t),
        ("view", c_char_p),
        ("to", c_int64),
        ("up", c_int32),
        ("down", c_int32),
        ("generations", c_int32),
        ("direction", c_char_p),
        ("boxes", c_char_p),
        ("theme", c_char_p),
        ("title", c_char_p),
        ("unknown_parents", c_int32),
        ("dates", c_int32),
        ("places", c_int32),
        ("occupation", c_int32),
        ("marriage", c_int32),
        ("hide_living", c_int32),
        ("year", c_int32),
    ]


_TEXTS = ("view", "direction", "boxes", "theme", "title")


def _draw_options(view: str, **options: Any) -> _DrawOptions:
    options["view"] = view
    known = {name for name, *_ in _DrawOptions._fields_}
    for name in options:
        if name not in known or name == "struct_size":
            raise TypeError(f"there is no option {name!r} of a drawing")
    texts = {name: options[name].encode("utf-8") for name in _TEXTS if options.get(name)}
    numbers = {name: operator.index(value) for name, value in options.items() if name not in _TEXTS}
    return _DrawOptions(ctypes.sizeof(_DrawOptions), **texts, **numbers)


def _person_number(person: object) -> int:
    """The number of a person, or 0, which is nobody."""
    if isinstance(person, str):
        raise TypeError(f"a person of a family is named by an id, not by {person!r}")
    whole = operator.index(person)  # type: ignore[arg-type]
    return whole if 1 <= whole <= _GREATEST_ID else 0


def _status_text(status: int) -> str:
    return str(_native.library.olvane_status_text(status).decode("utf-8"))


def _taken(result: c_void_p) -> str:
    """The text of a result, which is freed."""
    length = c_size_t()
    text = ctypes.string_at(_result_text(result, byref(length)), length.value)
    _result_free(result)
    return text.decode("utf-8", errors="replace")


def _answer(ask: Callable[[Any], Any]) -> str:
    result = c_void_p()
    status = ask(byref(result))
    text = _taken(result)
    if status != Status.OK:
        raise FileError(Status(status), text or _status_text(status))
    return text


def _declared(name: str, result: Any, *arguments: Any) -> Any:
    function = getattr(_native.library, name)
    function.argtypes = arguments
    function.restype = result
    return function


_RESULT = POINTER(c_void_p)
_result_text = _declared("olvane_result_text", c_void_p, c_void_p, POINTER(c_size_t))
_result_free = _declared("olvane_result_free", None, c_void_p)
_open = _declared("olvane_file_open", c_int, c_char_p, c_uint32, POINTER(c_void_p), _RESULT)
_read = _declared("olvane_file_read", c_int, c_char_p, c_size_t, c_char_p, c_uint32, POINTER(c_void_p), _RESULT)
_free = _declared("olvane_file_free", None, c_void_p)
_count = _declared("olvane_file_person_count", c_size_t, c_void_p)
_find = _declared("olvane_file_find", c_int, c_void_p, c_char_p, POINTER(c_int64), _RESULT)
_family = _declared("olvane_file_family", c_int, c_void_p, POINTER(c_void_p))
_layout = _declared(
    "olvane_file_layout", c_int, c_void_p, c_int32, c_int64, POINTER(_native.OptionsStruct), POINTER(c_void_p)
)
_kinship = _declared("olvane_file_kinship", c_int, c_void_p, c_int64, c_int64, _RESULT)
_remarks = _declared("olvane_file_remarks", c_int, c_void_p, _RESULT)
_draw = _declared("olvane_draw", c_int, c_void_p, c_int64, POINTER(_DrawOptions), _RESULT)
_draw_family = _declared("olvane_draw_family", c_int, c_void_p, c_int64, POINTER(_DrawOptions), _RESULT)
