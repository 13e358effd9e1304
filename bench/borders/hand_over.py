# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""hand_over.py PERSONS: how long a family takes from Python into the table, in each form of rows."""

import array
import sys
import time

import olvane

FIELDS = ("id", "father", "mother", "sex", "dead", "birth", "death")


def made(persons):
    rows = []
    for id in range(1, persons + 1):
        couple = (id + 1) // 2
        father = (couple // 2) * 2 - 1 if couple > 1 else None
        dates = f"{1000 + couple % 900}-01-{10 + couple % 18}", f"{1060 + couple % 900}-07-{10 + couple % 18}"
        rows.append((id, father, father and father + 1, 0 if id % 2 else 1, True, *dates))
    return rows


def least_seconds(work):
    seconds = []
    for _ in range(5):
        start = time.perf_counter()
        work()
        seconds.append(time.perf_counter() - start)
    return min(seconds)


def main():
    rows = made(int(sys.argv[1]))
    dicts = [dict(zip(FIELDS, row)) for row in rows]
    columns = {name: list(column) for name, column in zip(FIELDS, zip(*rows))}
    arrays = dict(columns)
    for name in FIELDS[:5]:
        arrays[name] = array.array("q", [int(value or 0) for value in columns[name]])
    for form, given in (("dicts", dicts), ("tuples", rows), ("columns", columns), ("arrays and texts", arrays)):
        print(f"{len(rows)} persons from Python as {form}: {least_seconds(lambda: olvane.Family(given)):.3f} s")


main()
