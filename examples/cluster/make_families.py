#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""make_families.py FOLDER COUNT PERSONS: made-up families to try a cluster on, the same each time.

Each is a GEDCOM file, 1.ged and so on: couples with one to five children each, generation after generation.
"""

import pathlib
import random
import sys


def family_file(seed: int, persons: int) -> str:
    chance = random.Random(seed)
    lines = ["0 HEAD", "1 GEDC", "2 VERS 5.5.1", "1 CHAR UTF-8"]
    links: dict[int, list[str]] = {1: []}
    born = {1: 1700}
    sex = {1: "M"}
    families: list[tuple[int, int, list[int]]] = []
    growing = [1]
    while len(born) < persons and growing:
        person = growing.pop(0)
        spouse = len(born) + 1
        born[spouse], links[spouse] = born[person] + chance.randint(-5, 5), []
        sex[spouse] = "F" if sex[person] == "M" else "M"
        number = len(families) + 1
        children: list[int] = []
        for _ in range(chance.randint(1, 5)):
            child = len(born) + 1
            if child > persons:
                break
            born[child], links[child] = born[person] + chance.randint(20, 40), [f"1 FAMC @F{number}@"]
            sex[child] = chance.choice("MF")
            children.append(child)
            growing.append(child)
        for partner in (person, spouse):
            links[partner].append(f"1 FAMS @F{number}@")
        husband, wife = (person, spouse) if sex[person] == "M" else (spouse, person)
        families.append((husband, wife, children))
    for person, own in links.items():
        lines += [f"0 @I{person}@ INDI", f"1 NAME Person{person} /Family{seed}/", f"1 SEX {sex[person]}"]
        lines += ["1 BIRT", f"2 DATE {born[person]}", *own]
    for number, (husband, wife, children) in enumerate(families, 1):
        lines += [f"0 @F{number}@ FAM", f"1 HUSB @I{husband}@", f"1 WIFE @I{wife}@"]
        lines += [f"1 CHIL @I{child}@" for child in children]
    return "\n".join([*lines, "0 TRLR", ""])


def main() -> None:
    folder, count, persons = pathlib.Path(sys.argv[1]), int(sys.argv[2]), int(sys.argv[3])
    folder.mkdir(parents=True, exist_ok=True)
    for seed in range(1, count + 1):
        (folder / f"{seed}.ged").write_text(family_file(seed, persons), encoding="utf-8")


if __name__ == "__main__":
    main()
