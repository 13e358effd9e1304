#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""The result of one test out of a run of all.

    read_result.py RESULTS.xml TITLE [--prefix]     0 passed, 1 failed or not run, 77 skipped
    read_result.py RESULTS.xml --all LIST           1 where a test ran that LIST, made by list-tests.mjs, does not name

RESULTS.xml is what node's reporter "junit" writes. With --prefix every test counts whose title begins so.
"""

import sys
import xml.etree.ElementTree as ElementTree


def results(path: str) -> list[ElementTree.Element]:
    return list(ElementTree.parse(path).getroot().iter("testcase"))


def is_of(case: ElementTree.Element, title: str, prefix: bool) -> bool:
    name = case.get("name", "")
    return name.startswith(title) if prefix else name == title


def status_of(path: str, title: str, prefix: bool) -> int:
    found = [case for case in results(path) if is_of(case, title, prefix)]
    if not found:
        skipped = [case.get("name") for case in results(path) if case.find("skipped") is not None]
        print(f"{title!r} was not run; skipped: {skipped}")
        return 77 if skipped else 1
    failures = [part for case in found for part in case.findall("failure")]
    for part in failures:
        print(part.get("message"), part.text)
    if failures:
        return 1
    print(f"{len(found)} passed in {sum(float(case.get('time', 0)) for case in found):.2f} s")
    return 77 if all(case.find("skipped") is not None for case in found) else 0


def unlisted(path: str, listing: str) -> int:
    with open(listing, encoding="utf-8") as file:
        known = [line.rstrip("\n").split("\t") for line in file]
    lost = [
        case.get("name")
        for case in results(path)
        if case.find("skipped") is None and not any(is_of(case, title, kind == "prefix") for _, title, kind in known)
    ]
    print(f"not listed: {lost}" if lost else f"{len(results(path))} tests ran, all listed")
    return 1 if lost or not results(path) else 0


def main() -> None:
    path, title, *rest = sys.argv[1:]
    sys.exit(unlisted(path, rest[0]) if title == "--all" else status_of(path, title, "--prefix" in rest))


main()
