# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""Every view as values: what olvane.picture returns is what the command prints, of files, tables and hosts."""

import copy
import json
import os
import pathlib
import subprocess
import tempfile
import unittest
import xml.etree.ElementTree
from collections.abc import Iterable
from typing import Any, get_args

import olvane

COMMAND = os.environ["OLVANE_COMMAND"]
SAMPLE = pathlib.Path(os.environ["OLVANE_SAMPLE"])
VIEWS: tuple[olvane.DrawView, ...] = get_args(olvane.DrawView)

# A man with two wives, an adopted child and an unmarried couple, the last of them born in 1990.
FIXTURES = pathlib.Path(__file__).parents[2] / "fixtures"
AWKWARD = b"""0 HEAD
1 GEDC
2 VERS 5.5.1
1 CHAR UTF-8
0 @I1@ INDI
1 NAME Abe /Oak/
1 SEX M
1 BIRT
2 DATE 1850
1 FAMS @F1@
1 FAMS @F2@
0 @I2@ INDI
1 NAME Bea /Elm/
1 SEX F
1 FAMS @F1@
0 @I3@ INDI
1 NAME Cat /Ash/
1 SEX F
1 FAMS @F2@
0 @I4@ INDI
1 NAME Dan /Oak/
1 SEX M
1 FAMC @F1@
2 PEDI adopted
1 FAMS @F3@
0 @I5@ INDI
1 NAME Eve /Oak/
1 SEX F
1 FAMC @F2@
1 FAMS @F3@
0 @I6@ INDI
1 NAME Fay /Oak/
1 BIRT
2 DATE 1990
1 FAMC @F3@
0 @F1@ FAM
1 HUSB @I1@
1 WIFE @I2@
1 CHIL @I4@
1 DIV Y
0 @F2@ FAM
1 HUSB @I1@
1 WIFE @I3@
1 CHIL @I5@
0 @F3@ FAM
1 HUSB @I4@
1 WIFE @I5@
1 CHIL @I6@
0 TRLR
"""


def printed(path: str | os.PathLike[str], focus: int, *options: str) -> Any:
    """What "olvane layout" prints, without what the file says of persons and families."""
    arguments = [COMMAND, "layout", os.fspath(path), "--format", "json", "--focus", str(focus), *options]
    made = json.loads(subprocess.run(arguments, check=True, capture_output=True).stdout)
    for box in made["boxes"]:
        box.pop("person", None)
    for family in made["families"]:
        family.pop("xref", None)
        family.pop("label", None)
    return made


def box_json(box: olvane.PictureBox, is_engine_view: bool) -> dict[str, Any]:
    made: dict[str, Any] = {"id": box.id or 0, "kind": "person" if box.id is not None else "unknownParent"}
    if box.arc is None:
        made |= {"x": box.x, "y": box.y, "width": box.width, "height": box.height}
    else:
        made |= {"ring": box.arc.ring, "from": box.arc.start, "to": box.arc.end}
        made |= {} if box.arc.line is None else {"line": box.arc.line}
    if box.id is None:
        return made | {"sex": ("male", "female", "unknown")[box.sex], "childOf": box.child_of}
    counts = {"parents": box.hidden_parents, "partners": box.hidden_partners, "children": box.hidden_children}
    made |= {"repeat": box.repeat, "hidden": counts}
    made |= {"furtherParents": box.further_parents} if box.further_parents else {}
    return made | ({"flag": box.flag} if is_engine_view else {})


def line_json(line: olvane.PictureLine) -> dict[str, Any]:
    ends = {"x1": line.x1, "y1": line.y1, "x2": line.x2, "y2": line.y2}
    return {"role": line.role.name.lower(), **ends, "child": line.child, "bridges": list(line.bridges)}


def family_json(family: olvane.PictureFamily) -> dict[str, Any]:
    return {
        **({} if family.number is None else {"number": family.number}),
        "parents": list(family.parents),
        "children": list(family.children),
        "childKinds": [kind.name.lower() for kind in family.child_kinds],
        "style": family.state.name.lower(),
        "lines": [line_json(line) for line in family.lines],
    }


MARKS = ("samePerson", "parentsElsewhere", "partnersElsewhere")


def picture_json(picture: olvane.Picture) -> dict[str, Any]:
    """The values in format 2, as its description has it."""
    is_engine_view = picture.view in ("family", "pedigree")
    made: dict[str, Any] = {
        "format": 2,
        "view": picture.view,
        "focus": picture.boxes[picture.focus].id,
        "boxes": [box_json(box, is_engine_view) for box in picture.boxes],
        "families": [family_json(family) for family in picture.families],
        "marks": [
            {"kind": MARKS[mark.kind], "boxes": list(mark.boxes), "number": mark.number} for mark in picture.marks
        ],
    }
    if picture.folded:
        made["folded"] = [
            {"box": one.box, "branch": one.branch, "side": one.side, "count": one.count} for one in picture.folded
        ]
    if picture.middle is not None:
        made |= {"rings": list(picture.rings), "middleX": picture.middle[0], "middleY": picture.middle[1]}
    if picture.view == "kinship":
        other = 0 if picture.other is None else picture.boxes[picture.other].id
        made |= {"other": other, "focusIs": picture.focus_is, "otherIs": picture.other_is}
        made["ways"] = [
            {
                "kind": way.kind.name.lower(),
                "boxes": list(way.boxes),
                "ancestors": list(way.ancestors),
                "words": way.words,
                "lines": [list(piece) for piece in way.lines],
            }
            for way in picture.ways
        ]
    return made


def differences(expected: Any, found: Any, where: str = "", near: float = 0.00051) -> list[str]:
    """Where two values of JSON differ; numbers are written with three decimals at most."""
    if isinstance(expected, dict) and isinstance(found, dict) and expected.keys() == found.keys():
        return [each for name in expected for each in differences(expected[name], found[name], f"{where}.{name}", near)]
    if isinstance(expected, list) and isinstance(found, list) and len(expected) == len(found):
        pairs = enumerate(zip(expected, found))
        return [each for i, (one, other) in pairs for each in differences(one, other, f"{where}[{i}]", near)]
    if isinstance(expected, int | float) and isinstance(found, int | float):
        return [] if abs(expected - found) <= near else [f"{where}: {expected} and {found}"]
    return [] if expected == found else [f"{where}: {expected!r} and {found!r}"]


def places(picture: olvane.Picture) -> set[tuple[int | None, float, float, int | None]]:
    """Where everybody stands, and whose child an unknown parent has."""
    owners = [None if box.child_of is None else picture.boxes[box.child_of].id for box in picture.boxes]
    return {(box.id, box.x, box.y, owner) for box, owner in zip(picture.boxes, owners)}


class Views(unittest.TestCase):
    def expect_as_printed(self, path: pathlib.Path, focuses: Iterable[int], other: int) -> None:
        file = olvane.File(path)
        for focus in focuses:
            for view in VIEWS:
                to = ("--to", str(other)) if view == "kinship" else ()
                expected = printed(path, focus, "--view", view, *to)
                picture = olvane.picture(file, focus, view, to=other)
                with self.subTest(focus=focus, view=view):
                    self.assertEqual([], differences(expected, picture_json(picture))[:5])

    def test_ofAFileAreWhatTheCommandPrints(self) -> None:
        self.expect_as_printed(SAMPLE, (1, 12, 40, 77), 52)

    def test_ofAwkwardFamiliesAreWhatTheCommandPrints(self) -> None:
        with tempfile.TemporaryDirectory() as folder:
            path = pathlib.Path(folder, "awkward.ged")
            path.write_bytes(AWKWARD)
            self.expect_as_printed(path, range(1, 7), 3)

    @unittest.skipUnless("OLVANE_GEDCOM_DIR" in os.environ, "OLVANE_GEDCOM_DIR names no folder of real files")
    def test_ofARealFamilyAreWhatTheCommandPrints(self) -> None:
        files = sorted(pathlib.Path(os.environ["OLVANE_GEDCOM_DIR"]).rglob("royal92.ged"))
        if not files:
            self.skipTest("royal92.ged is not there")
        self.expect_as_printed(files[0], (1, 52, 1500, 2700), 113)

    def test_takeTheOptionsOfTheCommand(self) -> None:
        cases: list[tuple[olvane.DrawView, dict[str, Any], list[str]]] = [
            ("ancestors", {"up": 2, "siblings": True, "compact": True}, ["--up=2", "--siblings", "--compact"]),
            ("descendants", {"down": 2, "spouses": False}, ["--down=2", "--no-spouses"]),
            ("hourglass", {"up": 1, "down": 1, "direction": "up"}, ["--up=1", "--down=1", "--direction=up"]),
            ("relatives", {"up": 1, "down": 1, "direction": "left"}, ["--up=1", "--down=1", "--direction=left"]),
            ("relatives", {"folded": [("I1", "down"), (5, "up")]}, ["--fold=I1:down,I5:up"]),
            ("hourglass", {"direction": "right", "mirrored": True}, ["--direction=right", "--mirror"]),
            ("family", {"mirrored": True}, ["--mirror"]),
            ("fan", {"fan_of": "descendants", "fan_angle": 180.5}, ["--of=descendants", "--angle=180.5"]),
            ("kinship", {"to": "I2", "by": "blood", "most_ways": 1}, ["--to=2", "--by=blood", "--ways=1"]),
            ("kinship", {"to": 2, "language": "de"}, ["--to=2", "--language=de"]),
            ("everybody", {"marks": "all", "effort": 2}, ["--marks=all", "--effort=2"]),
            ("everybody", {"marks": 1, "effort": 0, "all_parts": True}, ["--marks=1", "--effort=0", "--all-parts"]),
        ]
        for view, options, arguments in cases:
            with self.subTest(view=view, options=options):
                picture = olvane.picture(SAMPLE, "I1", view, **options)
                expected = printed(SAMPLE, 1, "--view", view, *arguments)
                self.assertEqual([], differences(expected, picture_json(picture))[:5])
                self.assertNotEqual(picture, olvane.picture(SAMPLE, "I1", view, to=2))

    def test_ofATableAndOfAHostAreThoseOfTheFile(self) -> None:
        file = olvane.File(AWKWARD)
        family = file.family()
        for view in VIEWS:
            with self.subTest(view=view):
                expected = olvane.picture(file, 6, view, to=2)
                self.assertEqual(expected, olvane.picture(family, 6, view, to=2))
                asked = olvane.picture(Asked(family), 6, view, to=2)
                self.assertEqual(places(expected), places(asked))

    def test_haveBoxesOfTheirOwnSizes(self) -> None:
        file = olvane.File(SAMPLE)
        for view in ("near", "ancestors", "descendants", "hourglass", "relatives", "everybody"):
            with self.subTest(view=view):
                boxes = olvane.picture(file, 1, view, box_sizes={"I1": (120, 40.5), 2**31 - 1: (7, 7)}).boxes
                self.assertEqual(
                    [(120, 40.5) if box.id == 1 else (55, 80) for box in boxes],
                    [(box.width, box.height) for box in boxes],
                )
        for size in ((-1, 40), (40, float("nan")), (2e6, 40)):
            with self.assertRaises(ValueError):
                olvane.picture(file, 1, "near", box_sizes={1: size})
        with self.assertRaises(TypeError):
            olvane.picture(file, 1, "near", box_sizes={1: ("wide", 40)})  # type: ignore[dict-item]
        with self.assertRaises(ValueError):
            olvane.picture(file, 1, "everybody", aspect=-1)
        wide = olvane.picture(file, 1, "everybody", aspect=0.2)
        self.assertLess(max(box.x for box in wide.boxes), max(b.x for b in olvane.picture(file, 1, "everybody").boxes))

    def test_haveBoxesOfTheSizeThatIsAskedFor(self) -> None:
        options = olvane.Options(sizes=olvane.Sizes(node_width=90, node_height=30, horz_padding=5, vert_padding=60))
        for view in VIEWS:
            if view != "fan":
                picture = olvane.picture(AWKWARD, 6, view, options, to=2)
                self.assertEqual({(90, 30)}, {(box.width, box.height) for box in picture.boxes}, view)

    def test_ofEverybodyKeepThePlacesOfAnEarlierOne(self) -> None:
        rows = {1: (0, 0), 2: (0, 0), 4: (1, 2), 5: (1, 2), 6: (0, 0), 7: (4, 6)}
        parents = [{"id": person, "father": father, "mother": mother} for person, (father, mother) in rows.items()]
        before = olvane.picture(olvane.Family(parents), 7, "everybody")
        grown = olvane.Family([{"id": 9, "father": 1, "mother": 2}, *parents])
        again = olvane.picture(grown, 7, "everybody")
        kept = olvane.picture(grown, 7, "everybody", earlier=before)
        column = {box.id: box.x - before.boxes[before.focus].x for box in before.boxes}
        moved = [b.id for b in kept.boxes if b.id in column and b.x - kept.boxes[kept.focus].x != column[b.id]]
        self.assertEqual([5], moved)  # makes room beside its new sibling
        self.assertNotEqual(again.boxes, kept.boxes)
        self.assertEqual(again.boxes, olvane.picture(grown, 7, "everybody", earlier=copy.deepcopy(before)).boxes)
        self.assertEqual(before, copy.deepcopy(before))
        with self.assertRaisesRegex(TypeError, "takes a Picture"):
            olvane.picture(grown, 7, "everybody", earlier="before")  # type: ignore[arg-type]

    def test_areShownByANotebook(self) -> None:
        for view in VIEWS:
            drawn = olvane.picture(AWKWARD, 6, view, to=2)._repr_svg_()
            shown = {element.text for element in xml.etree.ElementTree.fromstring(drawn).iter() if element.text}
            self.assertIn("6", shown, view)


class Judgements(unittest.TestCase):
    def test_areThoseOfTheCommand(self) -> None:
        file = olvane.File(SAMPLE)
        for view in VIEWS:
            with self.subTest(view=view):
                picture = olvane.picture(file, 40, view, to=52)
                found = olvane.judge(picture, file)
                to = ["--to=52"] if view == "kinship" else []
                drawn = subprocess.run(
                    [COMMAND, "layout", str(SAMPLE), "--focus=40", "--format=json", f"--view={view}", *to],
                    check=True,
                    capture_output=True,
                ).stdout
                arguments = [COMMAND, "judge", "-", "--format=json", f"--family={SAMPLE}"]
                judged = json.loads(subprocess.run(arguments, input=drawn, capture_output=True).stdout)["pictures"][0]
                self.assertEqual(judged["trouble"], found.trouble)
                counted = {camel_case(name): getattr(found, name) for name in found.__slots__}
                # The extent of a round chart comes from radii that are printed with three decimals.
                self.assertEqual([], differences(judged["counts"], counted, near=0.005))

    def test_knowWhatAPictureDoesNotExpressWhereAFamilySaysSo(self) -> None:
        parents = [{"id": 1, "father": 2, "mother": 3}, {"id": 2}, {"id": 3}]
        picture = olvane.picture(olvane.Family(parents), 1, "ancestors")
        self.assertIsNone(olvane.judge(picture).untold)
        self.assertEqual(0, olvane.judge(picture, olvane.Family(parents)).untold)
        more = [{"id": 1, "father": 2, "mother": 3}, {"id": 2, "father": 3}, {"id": 3}]
        self.assertEqual(1, olvane.judge(picture, olvane.Family(more)).untold)
        self.assertTrue(olvane.judge(picture, olvane.Family(more)).trouble)

    def test_ofACopyAreRefused(self) -> None:
        picture = olvane.picture(AWKWARD, 6, "near")
        with self.assertRaisesRegex(ValueError, "not a copy of it"):
            olvane.judge(copy.deepcopy(picture))


def camel_case(name: str) -> str:
    first, *others = name.split("_")
    return first + "".join(other.capitalize() for other in others)


class Drawings(unittest.TestCase):
    def test_areThoseOfTheCommand(self) -> None:
        for view in VIEWS:
            for focus in (1, 40):
                to = ["--to=52"] if view == "kinship" else []
                with self.subTest(view=view, focus=focus):
                    drawn = olvane.draw(SAMPLE, focus, view, to=52)
                    self.assertEqual(self.drawn_by_command(focus, f"--view={view}", *to), drawn)

    def test_ofPedigreesOfAnyWidthFlagAsTheCommandDoes(self) -> None:
        for generations in (2, 3, 8):
            for focus in (1, 40, 77):
                drawn = olvane.draw(SAMPLE, focus, "pedigree", generations=generations)
                expected = self.drawn_by_command(focus, "--view=pedigree", f"--generations={generations}")
                self.assertEqual(expected, drawn, (generations, focus))

    @staticmethod
    def drawn_by_command(focus: int, *options: str) -> str:
        arguments = [COMMAND, "draw", str(SAMPLE), "--focus", str(focus), "-o", "-", *options]
        return subprocess.run(arguments, check=True, capture_output=True).stdout.decode("utf-8")


class Asked:
    """A host that answers out of a table."""

    def __init__(self, family: olvane.Family) -> None:
        self.family = family

    def father_of(self, person: int) -> int | None:
        return self.family.person(person).father

    def mother_of(self, person: int) -> int | None:
        return self.family.person(person).mother

    def spouses_of(self, person: int) -> Iterable[int]:
        return self.family.person(person).spouses

    def children_of(self, person: int) -> Iterable[int]:
        return self.family.person(person).children

    def is_preferred_spouse(self, person: int, spouse: int) -> bool:
        return self.family.person(person).preferred == spouse

    def is_dead(self, person: int) -> bool:
        return self.family.person(person).dead

    def date_of(self, person: int, is_birth: bool) -> str | None:
        known = self.family.person(person)
        return known.birth if is_birth else known.death

    def sex_of(self, person: int) -> int:
        return self.family.person(person).sex


class Living(unittest.TestCase):
    def test_areHiddenAsTheCommandHidesThem(self) -> None:
        with tempfile.TemporaryDirectory() as folder:
            path = pathlib.Path(folder, "awkward.ged")
            path.write_bytes(AWKWARD)
            for view in VIEWS:
                to = ["--to=1"] if view == "kinship" else []
                arguments = [COMMAND, "draw", str(path), "--focus=6", f"--view={view}", *to, "-o-", "--hide-living"]
                expected = subprocess.run([*arguments, "--year=2020"], check=True, capture_output=True).stdout
                drawn = olvane.draw(path, 6, view, to=1, hide_living=True, year=2020)
                self.assertEqual(expected.decode("utf-8"), drawn, view)
                self.assertNotIn("Fay", drawn)
                self.assertEqual(view != "descendants", "Abe" in drawn)
                picture = olvane.picture(path, 6, view, to=1, hide_living=True, year=2020)
                shown = printed(path, 6, f"--view={view}", *to, "--hide-living", "--year=2020")
                self.assertEqual([], differences(shown, picture_json(picture))[:5], view)
                living = {box.id for box in picture.boxes if box.living}
                self.assertIn(6, living)
                self.assertNotIn(1, living)

    def test_areShownLaterThanALongestLife(self) -> None:
        self.assertIn("Fay", olvane.draw(AWKWARD, 6, hide_living=True, year=2200))
        picture = olvane.picture(AWKWARD, 6, hide_living=True, year=2200)
        self.assertFalse(any(box.living for box in picture.boxes))

    def test_ofATableAreNotKnown(self) -> None:
        family = olvane.File(AWKWARD).family()
        with self.assertRaisesRegex(ValueError, "hide_living is of a file"):
            olvane.picture(family, 6, hide_living=True)
        with self.assertRaisesRegex(olvane.FileError, "hide_living is '1', and takes 0 where a table is drawn"):
            olvane.draw(family, 6, hide_living=True)


class Kin(unittest.TestCase):
    def test_isWhatTheCommandPrints(self) -> None:
        arguments = [COMMAND, "kin", str(SAMPLE), "1", "2", "--format", "json"]
        expected = json.loads(subprocess.run(arguments, check=True, capture_output=True).stdout)
        found = olvane.kin(SAMPLE, "I1", 2)
        self.assertEqual(expected["words"], found.words)
        self.assertEqual((expected["phi"], expected["degree"]), (found.phi, found.degree))
        self.assertEqual([way["persons"] for way in expected["blood"]], [list(way.persons) for way in found.blood])
        self.assertEqual([way["words"] for way in expected["marriage"]], [way.words for way in found.marriage])
        self.assertEqual(1, found.blood_count)

    def test_ofATableIsThatOfTheFile(self) -> None:
        file = olvane.File(AWKWARD)
        found = olvane.kin(file, 6, 2)
        self.assertEqual(found, olvane.kin(file.family(), 6, 2))
        self.assertEqual(
            ("adopted", "adoptive grandmother (father's side)"), (found.legal[0].bond, found.legal[0].words["en"])
        )
        with self.assertRaisesRegex(olvane.FileError, "there is no person 7"):
            olvane.kin(file.family(), 7, 2)


class Wrong(unittest.TestCase):
    def test_optionsAreRefusedByName(self) -> None:
        cases: list[tuple[dict[str, Any], str]] = [
            ({"view": "paper"}, "view is 'paper', and takes a View or one of family, "),
            ({"direction": "north"}, "direction is 'north', and takes one of down, "),
            ({"up": -1}, "up is -1, and takes a whole number of 0 to "),
            ({"fan_angle": 400}, "fan_angle is 400, and takes a number of 90 to 360"),
            ({"by": "law"}, "by is 'law', and takes one of blood, marriage, both"),
            ({"language": "fr"}, "language is 'fr', and takes one of en, de, es"),
            ({"effort": 101}, "effort is 101"),
            ({"year": 10000}, "year is 10000"),
            ({"marks": 1.5}, "marks is 1.5, and takes a whole number"),
        ]
        for options, message in cases:
            with self.assertRaisesRegex((TypeError, ValueError), message):
                olvane.picture(AWKWARD, 1, **options)

    def test_whatIsRefusedIsStatedWithItsNameAndBounds(self) -> None:
        rows = json.loads((FIXTURES / "refusals.json").read_text(encoding="utf-8"))["rows"]
        for row in rows:
            (name,) = row["python"]
            with self.assertRaisesRegex((TypeError, ValueError), f"^{name} is ") as caught:
                olvane.picture(AWKWARD, 1, **row["python"])
            for text in row["states"]:
                self.assertIn(text, str(caught.exception))

    def test_personsWhoAreNotThereAreSaid(self) -> None:
        sources: tuple[olvane.File | olvane.Family, ...] = (olvane.File(AWKWARD), olvane.File(AWKWARD).family())
        for source in sources:
            with self.assertRaisesRegex(olvane.LayoutError, "descendants of person 7: ") as caught:
                olvane.picture(source, 7, "descendants")
            self.assertEqual(olvane.Status.INVALID_PERSON, caught.exception.status)
            with self.assertRaises(olvane.LayoutError):
                olvane.picture(source, 1, "kinship")
        with self.assertRaisesRegex(olvane.FileError, "'Oak' may be any of 4 persons"):
            olvane.picture(AWKWARD, "Oak")
        with self.assertRaisesRegex(TypeError, "named by an id"):
            olvane.picture(olvane.File(AWKWARD).family(), "Oak")

    def test_whatAHostRaisesIsTheCause(self) -> None:
        class Failing(Asked):
            def children_of(self, person: int) -> Iterable[int]:
                raise LookupError("no row")

        host = Failing(olvane.File(AWKWARD).family())
        for view in VIEWS:
            with self.assertRaisesRegex(olvane.HostError, r"children_of\(\d\): LookupError: no row") as caught:
                olvane.picture(host, 1, view, to=2)
            self.assertIsInstance(caught.exception.__cause__, LookupError)


if __name__ == "__main__":
    unittest.main()
