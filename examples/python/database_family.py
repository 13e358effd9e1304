# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""database_family.py FILE|CONNECTION ID: two queries fill the table of a family, and one of its persons is laid out.

A name that begins with postgresql:// is a PostgreSQL database, read with psycopg2; any other is a file of SQLite.
"""

import sqlite3
import sys
import time

import olvane

PERSONS = "SELECT id, father, mother, sex, dead, birth, death, name FROM person ORDER BY {birth}, id"
COUPLES = (
    "SELECT id AS number, husband AS partner0, wife AS partner1, state, day AS marriage FROM couple ORDER BY {day}, id"
)


def connect(name: str) -> tuple[object, str]:
    """A connection, and how the database is asked that nulls come first."""
    if not name.startswith("postgresql://"):
        return sqlite3.connect(f"file:{name}?mode=ro", uri=True), ""
    import psycopg2

    return psycopg2.connect(name), " NULLS FIRST"


def family_from(connection: object, nulls: str) -> olvane.Family:
    persons, couples = connection.cursor(), connection.cursor()
    persons.execute(PERSONS.format(birth=f"birth{nulls}"))
    couples.execute(COUPLES.format(day=f"day{nulls}"))
    return olvane.Family(persons, families=couples)


def main() -> None:
    name, focus = sys.argv[1:]
    connection, nulls = connect(name)
    start = time.perf_counter()
    family = family_from(connection, nulls)
    filled = time.perf_counter()
    text = olvane.layout_text(family, int(focus))
    done = time.perf_counter()
    print(text)
    print(f"{len(family)} persons in {filled - start:.2f} s, a layout in {done - filled:.4f} s", file=sys.stderr)


if __name__ == "__main__":
    main()
