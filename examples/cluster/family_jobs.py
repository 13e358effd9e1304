#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""Jobs on many families: one line asks, one line answers, on whatever engine the lines are spread.

    family_jobs.py [--families FOLDER|DATABASE] <jobs >answers          the pipe form

A job is KIND, FAMILY and IDS, with tabs between. KIND is layout, picture, kinship or remarks. FAMILY is the name of a file
in FOLDER without its .ged, or the id of a row of the table family(id, gedcom) of a PostgreSQL database, whose name begins
with postgresql://. IDS is a person, FIRST-LAST or "all"; of a kinship they are the persons whose relation to person 1 is
asked; remarks are of the whole family and take a dash.

An answer has the job's KIND and FAMILY, the person, and the answer as one line of JSON. What cannot be answered - a family
that is missing or cannot be read, a person who is not in it, a line that is no job - is an answer whose KIND is failed, with
the reason as a JSON text, and the other jobs go on. A database that is gone ends the run. The same jobs give the same bytes on
every engine. A family is read once while jobs of it follow each other.
"""

from __future__ import annotations

import functools
import json
import pathlib
import sys
from collections.abc import Iterable, Iterator

import olvane

KINDS = ("layout", "picture", "kinship", "remarks")


def _bytes_of(families: str, family: str) -> bytes:
    if not families.startswith("postgresql://"):
        return pathlib.Path(families, f"{family}.ged").read_bytes()
    row = None
    if family.isdecimal() and len(family) < 10:
        with _connection(families).cursor() as cursor:
            cursor.execute("SELECT gedcom FROM family WHERE id = %s", (int(family),))
            row = cursor.fetchone()
    if row is None:
        raise FileNotFoundError
    return bytes(row[0])


@functools.cache
def _connection(database: str):  # type: ignore[no-untyped-def]  # psycopg2 has no types
    import psycopg2

    connection = psycopg2.connect(database)
    connection.autocommit = True
    return connection


# No more than one: memory stays flat, however many families there are.
@functools.lru_cache(maxsize=1)
def _opened(families: str, family: str) -> olvane.File:
    return olvane.File(_bytes_of(families, family), name=family)


def _persons(file: olvane.File, ids: str) -> Iterable[int]:
    if ids == "all":
        return range(1, len(file) + 1)
    first, _, last = ids.partition("-")
    if not first.isdecimal() or not (last or first).isdecimal():
        raise ValueError(f"the persons of a job are {ids!r}, and not a number, FIRST-LAST or all")
    return range(int(first), int(last or first) + 1)


def _answer(file: olvane.File, kind: str, person: int) -> str:
    if kind == "layout":
        return json.dumps(file.layout_text(person))
    if kind == "picture":
        return json.dumps(file.draw(person))
    if kind == "kinship":
        return file.kinship_json(1, person).rstrip("\n")
    raise ValueError(f"the kind of a job is {kind!r}, and not one of {', '.join(KINDS)}")


def answers(families: str, job: str) -> Iterator[str]:
    """The lines that answer one job."""
    family: str = "-"
    person: int | str = "-"
    try:
        fields = job.rstrip("\n").split("\t")
        if len(fields) != 3:
            raise ValueError(f"a job has three fields with tabs between, and not {len(fields)}: {job.rstrip()!r}")
        kind, family, ids = fields
        file = _opened(families, family)
        if kind == "remarks":
            yield f"remarks\t{family}\t-\t{json.dumps(json.loads(file.remarks_json()))}\n"
            return
        for person in _persons(file, ids):
            yield f"{kind}\t{family}\t{person}\t{_answer(file, kind, person)}\n"
    except FileNotFoundError:
        yield f"failed\t{family}\t-\t{json.dumps(f'there is no family {family}')}\n"
    except ValueError as error:
        yield f"failed\t{family}\t{person}\t{json.dumps(str(error))}\n"


def main() -> None:
    families = sys.argv[2] if sys.argv[1:2] == ["--families"] else "."
    for job in sys.stdin:
        for line in answers(families, job):
            sys.stdout.write(line)
        # A program may wait for the answer before the next question.
        sys.stdout.flush()


if __name__ == "__main__":
    main()
