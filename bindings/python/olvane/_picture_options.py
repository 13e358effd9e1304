# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""What the options of a picture take, as the library's own table says: their words, their bounds, their kinds."""

from __future__ import annotations

import ctypes
import operator
from dataclasses import dataclass
from functools import cache

from olvane import _native
from olvane._picture_structs import OptionInfoStruct

_WORD, _FLAG, _WHOLE, _NUMBER = range(4)


@dataclass(frozen=True)
class Option:
    """A field of the options: a word's bounds are its number's, a whole number's are whole."""

    kind: int
    least: float
    most: float
    words: tuple[str, ...]


@cache
def options() -> dict[str, Option]:
    """All of them, by the names of the fields in C."""
    library = _native.library
    library.olvane_picture_option_count.restype = ctypes.c_size_t
    library.olvane_picture_option_word.argtypes = (ctypes.c_size_t, ctypes.c_size_t)
    library.olvane_picture_option_word.restype = ctypes.c_char_p
    library.olvane_picture_option_at.argtypes = (ctypes.c_size_t, ctypes.POINTER(OptionInfoStruct))
    found = {}
    for i in range(library.olvane_picture_option_count()):
        info = OptionInfoStruct(struct_size=ctypes.sizeof(OptionInfoStruct))
        library.olvane_picture_option_at(i, ctypes.byref(info))
        count = int(info.most) + 1 if info.kind == _WORD else 0
        words = tuple(library.olvane_picture_option_word(i, word).decode("ascii") for word in range(count))
        found[info.name.decode("ascii")] = Option(info.kind, info.least, info.most, words)
    return found


def option_value(field: str, given: object, name: str | None = None) -> int | float:
    """The number for the field of C; name is what Python calls the option, where that is something else.

    Raises TypeError for a value of another type, and ValueError for one that the option does not take.
    """
    option = options()[field]
    name = name or field
    if option.kind == _WORD:
        return choice(name, given, option.words)
    if option.kind == _FLAG:
        return 1 if given else 0
    if option.kind == _WHOLE:
        return whole(name, given, int(option.least), int(option.most))
    return real(name, given, option.least, option.most)


def choice(name: str, given: object, allowed: tuple[str, ...]) -> int:
    """The place of a word among those that are allowed."""
    if given not in allowed:
        raise ValueError(f"{name} is {given!r}, and takes one of {', '.join(allowed)}")
    return allowed.index(str(given))


def whole(name: str, given: object, least: int, most: int) -> int:
    """A whole number in its bounds."""
    try:
        number = operator.index(given)  # type: ignore[arg-type]
    except TypeError:
        raise TypeError(f"{name} is {given!r}, and takes a whole number") from None
    if not least <= number <= most:
        raise ValueError(f"{name} is {number}, and takes a whole number of {least} to {most}")
    return number


def real(name: str, given: object, least: float, most: float) -> float:
    """A number in its bounds."""
    if isinstance(given, bool) or not isinstance(given, int | float):
        raise TypeError(f"{name} is {given!r}, and takes a number")
    if not least <= given <= most:
        raise ValueError(f"{name} is {given}, and takes a number of {_plain(least)} to {_plain(most)}")
    return float(given)


def _plain(bound: float) -> str:
    return str(int(bound)) if bound == int(bound) else str(bound)
