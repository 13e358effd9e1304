#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""Follows the lines of a picture of everybody as a finger does, and compares what they lead to with the file.

Usage: trace_lines.py PATH/TO/olvane FILE.ged [--show N]; a name alone is looked for in OLVANE_GEDCOM_DIR

The lines are taken without what they are said to belong to. Two pieces are one line where an end of one lies on the
other; where they merely cross, the finger goes straight on. What a line touches must be one family of the file, and
every family of the file with two or more members must be found so. The file is read here again, line by line.
"""

import collections
import json
import os
import random
import subprocess
import sys

SLACK = 0.01  # points


def found(name):
    if os.path.dirname(name):
        return name
    for folder, _, names in os.walk(os.environ.get("OLVANE_GEDCOM_DIR", "")):
        if name in names:
            return os.path.join(folder, name)
    print(f"skipped: no {name} in OLVANE_GEDCOM_DIR")
    raise SystemExit(77)


def families_of(path):
    families = {}
    current = None
    with open(path, encoding="latin-1") as file:
        for line in file:
            parts = line.strip().split(" ", 2)
            if len(parts) < 2:
                continue
            if parts[0] == "0":
                isFamily = len(parts) > 2 and parts[2] == "FAM"
                current = (
                    families.setdefault(parts[1].strip("@"), {"parents": [], "children": []}) if isFamily else None
                )
            elif parts[0] == "1" and current is not None and len(parts) > 2:
                if parts[1] in ("HUSB", "WIFE"):
                    current["parents"].append(parts[2].strip("@"))
                elif parts[1] == "CHIL":
                    current["children"].append(parts[2].strip("@"))
    return families


def picture_of(command, path):
    done = subprocess.run(
        [command, "layout", path, "--focus", "1", "--view", "everybody"], capture_output=True, text=True, check=True
    )
    return json.loads(done.stdout)


class Joined:
    def __init__(self, count):
        self.top = list(range(count))

    def of(self, one):
        while self.top[one] != one:
            self.top[one] = self.top[self.top[one]]
            one = self.top[one]
        return one

    def join(self, one, other):
        self.top[self.of(one)] = self.of(other)


def touches_inside(x, y, piece):
    x1, y1, x2, y2 = piece
    return x1 - SLACK <= x <= x2 + SLACK and y1 - SLACK <= y <= y2 + SLACK


def pieces_of(picture):
    pieces = []
    for family in picture["families"]:
        for line in family["lines"]:
            pieces.append(
                (
                    min(line["x1"], line["x2"]),
                    min(line["y1"], line["y2"]),
                    max(line["x1"], line["x2"]),
                    max(line["y1"], line["y2"]),
                )
            )
    return pieces


def cells(x1, y1, x2, y2, size=100):
    for i in range(int(x1 - 1) // size, int(x2 + 1) // size + 1):
        for k in range(int(y1 - 1) // size, int(y2 + 1) // size + 1):
            yield i, k


def trace(picture):
    """For each connected line the places of the boxes that it ends at."""
    pieces = pieces_of(picture)
    near = collections.defaultdict(list)
    for number, piece in enumerate(pieces):
        for cell in cells(*piece):
            near[cell].append(number)
    joined = Joined(len(pieces))
    for number, (x1, y1, x2, y2) in enumerate(pieces):
        for x, y in ((x1, y1), (x2, y2)):
            for other in {o for cell in cells(x, y, x, y) for o in near[cell]}:
                if other != number and touches_inside(x, y, pieces[other]):
                    joined.join(number, other)
    touched = collections.defaultdict(set)
    for place, box in enumerate(picture["boxes"]):
        left, top = box["x"], box["y"]
        right, bottom = left + box["width"], top + box["height"]
        for number in {n for c in cells(left, top, right, bottom) for n in near[c]}:
            x1, y1, x2, y2 = pieces[number]
            for x, y in ((x1, y1), (x2, y2)):
                if left - SLACK <= x <= right + SLACK and top - SLACK <= y <= bottom + SLACK:
                    touched[joined.of(number)].add(place)
    return list(touched.values())


def complaints_about(picture, families):
    xref = [box["person"]["xref"] for box in picture["boxes"]]
    shown = set(xref)
    expected = collections.Counter()
    for family in families.values():
        members = frozenset(family["parents"] + family["children"])
        if len(members) > 1 and members & shown:
            expected[members] += 1
    traced = collections.Counter(frozenset(xref[place] for place in line) for line in trace(picture))
    complaints = [f"a line leads to {sorted(line)}, which is no family" for line in traced if line not in expected]
    complaints += [f"no line leads to {sorted(line)}" for line in expected if line not in traced]
    return complaints, traced


def show(picture, families, traced, count):
    boxes = {box["person"]["xref"]: box["person"] for box in picture["boxes"]}
    for person in random.Random(92).sample(sorted(boxes), count):
        found = {"parents": [], "spouses": [], "children": []}
        for family in families.values():
            members = frozenset(family["parents"] + family["children"])
            if members not in traced:
                continue
            if person in family["children"]:
                found["parents"] += family["parents"]
            if person in family["parents"]:
                found["spouses"] += [other for other in family["parents"] if other != person]
                found["children"] += family["children"]
        print(f"{boxes[person].get('name', person)}: " + ", ".join(f"{len(who)} {what}" for what, who in found.items()))


def main():
    command, path = sys.argv[1], found(sys.argv[2])
    families = families_of(path)
    picture = picture_of(command, path)
    complaints, traced = complaints_about(picture, families)
    for complaint in complaints[:20]:
        print(complaint)
    if complaints or not traced:
        raise SystemExit(f"{len(complaints)} lines lead elsewhere than the file says, of {len(traced)}")
    print(f"{len(picture['boxes'])} persons, {len(traced)} lines, all as the file says")
    if "--show" in sys.argv:
        show(picture, families, traced, int(sys.argv[sys.argv.index("--show") + 1]))


if __name__ == "__main__":
    main()
