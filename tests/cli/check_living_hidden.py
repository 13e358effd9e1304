#!/usr/bin/env python3
# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""With --hide-living no output holds a string that occurs with hidden persons alone.

What a file says of whom is read here without the reader of the project: the records as they stand. Whom the command hides
is what its own output shows as "Living". A string is private if it stands in a record of a hidden person, or of a family
with a hidden partner, or in a record that only such records point to, and nowhere else in the file; with names and
nicknames, so is each word of them.

Of files in older encodings the ASCII strings alone are looked for.

Usage: check_living_hidden.py PATH/TO/olvane [FOLDER [YEAR]]
Looks at every .ged of the folder, or of OLVANE_GEDCOM_DIR, that the command can read; status 77 without a folder.
"""

import base64
import concurrent.futures
import gzip
import json
import os
import pathlib
import re
import subprocess
import sys
import tempfile
import zlib

LINE = re.compile(r"^\s*(\d+)\s+(?:(@[^@\s]+@)\s+)?(\w+) ?(.*)$")
SHORTEST = 4  # characters; shorter ones stand in any text by chance


class Record:
    def __init__(self, xref, tag):
        self.xref, self.tag, self.lines = xref, tag, []

    def pointers(self):
        return {value for _, tag, value in self.lines if re.fullmatch(r"@[^@\s#][^@]*@", value)}


def text_of(path):
    data = path.read_bytes()
    for encoding in ("utf-16", "utf-8-sig"):
        if encoding == "utf-16" and data[:2] not in (b"\xff\xfe", b"\xfe\xff"):
            continue
        try:
            return data.decode(encoding)
        except UnicodeDecodeError:
            pass
    return data.decode("ascii", "replace")


def records_of(text):
    records = []
    for line in re.split(r"[\r\n]+", text):
        match = LINE.match(line)
        if not match:
            continue
        level, xref, tag, value = match.groups()
        if level == "0":
            records.append(Record(xref, tag))
        if records:
            records[-1].lines.append((int(level), tag, value.strip()))
    return records


def run(command, *words):
    """What it prints; status 1 is that of a file whose encoding is in doubt."""
    result = subprocess.run([command, *words], capture_output=True, timeout=1200)
    if result.returncode not in (0, 1):
        raise SystemExit(f"olvane {' '.join(words)} ended with {result.returncode}: {result.stderr[-500:]!r}")
    return result.stdout


def unpacked_pdf(data):
    texts = [data]
    for match in re.finditer(rb"stream\r?\n(.*?)endstream", data, re.S):
        try:
            texts.append(zlib.decompress(match.group(1)))
        except zlib.error:
            pass
    return b"\n".join(texts).decode("utf-8", "replace")


def family_of_page(path):
    page = path.read_text(encoding="utf-8")
    block = re.search(r'<script type="application/json" id="olvane-family">([^<]*)</script>', page).group(1)
    family = json.loads(block)
    gedcom = gzip.decompress(base64.b64decode(family.pop("gzip"))).decode("utf-8")
    title = re.search(r"<title>([^<]*)</title>", page).group(1)
    return gedcom, json.dumps(family, ensure_ascii=False) + title


class Outputs:
    """What the command makes of a file with the living hidden: name of the output, and its text."""

    def __init__(self, command, path, year, has_page):
        self.command, self.path, self.hiding = command, str(path), ["--hide-living", "--year", year]
        self.texts = {}
        with tempfile.TemporaryDirectory() as folder:
            self.folder = pathlib.Path(folder)
            listed = subprocess.run([command, "people", self.path], capture_output=True, timeout=1200)
            if listed.returncode not in (0, 1, 2):
                raise SystemExit(f"{path}: olvane people ended with {listed.returncode}")
            self.people = [line.split("\t") for line in listed.stdout.decode().split("\n")[:-1]]
            self.hidden = self.find_hidden()
            if has_page and self.people:
                self.add_page()
            for focus in [p for p in self.people if p[0] in self.hidden][:1] + self.people[:1]:
                self.add_pictures(focus[0])

    def find_hidden(self):
        """The ids of all whom a layout as JSON calls living, in layouts of everybody until each was seen."""
        seen, hidden = set(), set()
        for person in self.people:
            if person[0] in seen:
                continue
            layout = json.loads(
                run(self.command, "layout", self.path, "--focus", person[0], "--format", "json1", *self.hiding)
            )
            for box in layout["boxes"]:
                seen.add(str(box["id"]))
                if box.get("living"):
                    hidden.add(str(box["id"]))
        return hidden

    def add_page(self):
        page = self.folder / "page.html"
        run(self.command, "page", self.path, "-o", str(page), *self.hiding)
        self.texts["page"], self.texts["page data"] = family_of_page(page)

    def add_pictures(self, focus):
        name = f"of {focus}"
        layout = run(self.command, "layout", self.path, "--focus", focus, "--format", "json1", *self.hiding)
        self.texts["json " + name] = layout.decode()
        for view in ("family", "hourglass", "relatives"):
            chart = run(
                self.command, "layout", self.path, "--focus", focus, "--view", view, "--format", "json", *self.hiding
            )
            self.texts[view + " " + name] = chart.decode()
        for ending in (".svg", ".pdf", ".png"):
            picture = self.folder / ("out" + ending)
            words = [
                self.command,
                "draw",
                self.path,
                "--focus",
                focus,
                "-o",
                str(picture),
                "--show",
                "dates,places,occupation,marriage",
                *self.hiding,
            ]
            if subprocess.run(words, capture_output=True, timeout=1200).returncode in (0, 1):
                data = picture.read_bytes()
                self.texts[ending + " " + name] = (
                    unpacked_pdf(data) if ending == ".pdf" else data.decode("utf-8", "replace")
                )


def strings_of(record):
    """Values, and words of names: what could give a person away."""
    strings = set()
    if record.xref:
        strings.add(record.xref)
    for level, tag, value in record.lines:
        if level > 0:
            strings.add(value)
        if tag in ("NAME", "GIVN", "SURN", "NICK", "NPFX", "NSFX", "_MARNM", "FILE"):
            strings |= set(re.findall(r"[^\W\d_]+", value))
    return {s for s in strings if len(s) >= SHORTEST}


def private_records(records, hidden_xrefs):
    private = [r for r in records if r.tag == "INDI" and r.xref in hidden_xrefs]
    for record in records:
        partners = {value for _, tag, value in record.lines if tag in ("HUSB", "WIFE")}
        if record.tag == "FAM" and partners & hidden_xrefs:
            private.append(record)
    while True:  # notes, sources and media that only these point to
        chosen = {id(r) for r in private}
        shown = set().union(*(r.pointers() for r in records if id(r) not in chosen), set())
        own = set().union(*(r.pointers() for r in private), set()) - shown
        more = [r for r in records if r.xref in own and id(r) not in chosen and r.tag not in ("INDI", "FAM")]
        if not more:
            return private
        private += more


def found_in(string, text):
    """As it stands, and, a word, not as a part of a longer one."""
    at = text.find(string)
    while at >= 0:
        before, behind = text[at - 1 : at], text[at + len(string) : at + len(string) + 1]
        if not (before.isalnum() and string[0].isalnum()) and not (behind.isalnum() and string[-1].isalnum()):
            return True
        at = text.find(string, at + 1)
    return False


def leaks(command, path, year, has_page):
    text = text_of(path)
    outputs = Outputs(command, path, year, has_page)
    if not outputs.people:
        return None
    hidden_xrefs = {p[1] for p in outputs.people if p[0] in outputs.hidden}
    records = records_of(text)
    private = private_records(records, hidden_xrefs)
    chosen = {id(r) for r in private}
    public = "\n".join(f"{r.xref} {v}" for r in records if id(r) not in chosen for _, _, v in r.lines)
    # What the command itself says about anybody.
    public += "\nLiving Olvane olvane family LINEAGE-LINKED UTF-8 5.5.1 living"
    secrets = {s for r in private for s in strings_of(r) if s not in public}
    secrets = {s for s in secrets if "\ufffd" not in s and not s.isdigit()}
    found = []
    for name, output in outputs.texts.items():
        found += [f"{path.name}: {s!r} in {name}" for s in sorted(secrets) if found_in(s, output)]
    return found, len(hidden_xrefs), len(secrets), shown_unless_hidden(command, path, outputs, secrets)


def shown_unless_hidden(command, path, outputs, secrets):
    """How many of the strings a picture of somebody hidden holds without the option, so that there was something to
    find."""
    focus = next((p[0] for p in outputs.people if p[0] in outputs.hidden), None)
    if focus is None:
        return 0
    picture = run(command, "draw", str(path), "--focus", focus, "-o", "-").decode()
    return sum(found_in(secret, picture) for secret in secrets)


def main():
    command = os.path.abspath(sys.argv[1])
    folder = pathlib.Path(sys.argv[2] if len(sys.argv) > 2 else os.environ.get("OLVANE_GEDCOM_DIR", ""))
    if len(sys.argv) < 3 and not os.environ.get("OLVANE_GEDCOM_DIR"):
        print("OLVANE_GEDCOM_DIR names no folder of GEDCOM files")
        raise SystemExit(77)
    year = sys.argv[3] if len(sys.argv) > 3 else "2020"
    has_page = subprocess.run([command, "page", "-o", "-"], capture_output=True).returncode == 0
    paths = sorted(folder.rglob("*.ged"))
    found, files, persons, strings, shown = [], 0, 0, 0, 0
    with concurrent.futures.ThreadPoolExecutor(os.cpu_count()) as pool:
        for path, result in zip(paths, pool.map(lambda p: leaks(command, p, year, has_page), paths)):
            if result is None:
                continue
            files, persons, strings, shown = files + 1, persons + result[1], strings + result[2], shown + result[3]
            found += result[0]
    print(
        f"{files} of {len(paths)} files, {persons} hidden persons, {strings} private strings, {shown} of them in "
        f"pictures without the option; {'with' if has_page else 'without'} the page"
    )
    if found:
        raise SystemExit("\n".join(found))
    if shown == 0:
        raise SystemExit("no picture shows a private string without the option; nothing was tested")


if __name__ == "__main__":
    main()
