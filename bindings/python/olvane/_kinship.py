# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""How two persons are related, by every way."""

from __future__ import annotations

import json
import os
from ctypes import POINTER, c_int, c_int64, c_void_p
from dataclasses import dataclass
from typing import Any

from olvane._family import Family
from olvane._file import File, _answer, _declared, _person_number


@dataclass(frozen=True, slots=True)
class KinWay:
    """A way over common ancestors: its steps up from one person, and down to the other.

    persons are all on the way, by id. bond is "blood", or "adopted", "foster", "step" or "other" where the way is legal.
    words has what the second person is to the first by this way, by language: "en", "de", "es".
    """

    up: int
    down: int
    half: bool
    bond: str
    ancestors: tuple[int, ...]
    persons: tuple[int, ...]
    words: dict[str, str]


@dataclass(frozen=True, slots=True)
class MarriageWay:
    """A shortest way over marriages, parents and children, and the number of its links."""

    links: int
    persons: tuple[int, ...]
    words: dict[str, str]


@dataclass(frozen=True, slots=True)
class Kinship:
    """How two persons are related; words has what b is to a, by language: "en", "de", "es".

    phi is the coefficient of kinship, and degree the steps of the nearest way by blood. The counts are those of all ways,
    of which the nearest are listed. Numbers that nobody can say are None: reason is then "loop" where an ancestor is their
    own ancestor.
    """

    a: int
    b: int
    words: dict[str, str]
    phi: float | None
    degree: int | None
    reason: str
    blood: tuple[KinWay, ...]
    blood_count: int | None
    legal: tuple[KinWay, ...]
    legal_count: int | None
    marriage: tuple[MarriageWay, ...]
    marriage_count: int | None


def kin(source: Family | File | str | os.PathLike[str] | bytes, a: int | str, b: int | str) -> Kinship:
    """How two persons of a Family or of a file are related. Raises FileError.

    source is a Family, a File, or the path or the bytes of one; persons of a file may be named by a text.
    """
    if isinstance(source, Family):
        table, one, other = source._pointer, _person_number(a), _person_number(b)
        return _kinship_of(json.loads(_answer(lambda result: _of_family(table, one, other, result))))
    file = source if isinstance(source, File) else File(source)
    one, other = (file.find(person) if isinstance(person, str) else person for person in (a, b))
    return _kinship_of(json.loads(file.kinship_json(one, other)))


def _kinship_of(found: dict[str, Any]) -> Kinship:
    return Kinship(
        a=found["a"],
        b=found["b"],
        words=found["words"],
        phi=found["phi"],
        degree=found["degree"],
        reason=found.get("reason", ""),
        blood=tuple(map(_kin_way, found["blood"])),
        blood_count=found["bloodCount"],
        legal=tuple(map(_kin_way, found["legal"])),
        legal_count=found["legalCount"],
        marriage=tuple(MarriageWay(way["links"], tuple(way["persons"]), way["words"]) for way in found["marriage"]),
        marriage_count=found["marriageCount"],
    )


def _kin_way(way: dict[str, Any]) -> KinWay:
    return KinWay(
        up=way["up"],
        down=way["down"],
        half=way["half"],
        bond=way.get("bond", "blood"),
        ancestors=tuple(way["ancestors"]),
        persons=tuple(way["persons"]),
        words=way["words"],
    )


_of_family = _declared("olvane_family_kinship", c_int, c_void_p, c_int64, c_int64, POINTER(c_void_p))
