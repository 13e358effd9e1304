# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""GEDCOM files and drawings: one call draws, and what is wrong is said."""

import copy
import pathlib
import pickle
import tempfile
import unittest
import xml.etree.ElementTree
import zipfile

import olvane

FAMILY = b"""0 HEAD
1 GEDC
2 VERS 5.5.1
1 CHAR UTF-8
0 @I1@ INDI
1 NAME Ada /Berg/
1 SEX F
1 BIRT
2 DATE 1830
2 PLAC Ulm
1 FAMS @F1@
0 @I2@ INDI
1 NAME Bo /Carl/
1 FAMS @F1@
0 @I3@ INDI
1 NAME Cy /Carl/
1 BIRT
2 DATE 1860
1 DEAT
2 DATE 1850
1 FAMC @F1@
0 @F1@ FAM
1 HUSB @I2@
1 WIFE @I1@
1 CHIL @I3@
0 TRLR
"""


def texts(svg: str) -> set[str]:
    tree = xml.etree.ElementTree.fromstring(svg)
    return {text.strip() for element in tree.iter() for text in [element.text or ""] if text.strip()}


class Files(unittest.TestCase):
    def test_oneCallDrawsAPersonOfAFile(self) -> None:
        with tempfile.TemporaryDirectory() as folder:
            path = pathlib.Path(folder, "family.ged")
            path.write_bytes(FAMILY)
            svg = olvane.draw(path, "Cy Carl", view="hourglass")
            svg.save(path.with_suffix(".svg"))
            self.assertEqual(path.with_suffix(".svg").read_text("utf-8"), svg)
        self.assertTrue({"Cy", "Ada", "Bo"} <= texts(svg))
        self.assertEqual(svg, olvane.draw(FAMILY, 3, view="hourglass"))
        self.assertEqual(svg, olvane.File(FAMILY).draw("I3", "hourglass"))

    def test_anArchiveIsUnpacked(self) -> None:
        with tempfile.TemporaryDirectory() as folder:
            path = pathlib.Path(folder, "family.gdz")
            with zipfile.ZipFile(path, "w") as archive:
                archive.writestr("photo.jpg", b"")
                archive.writestr("gedcom.ged", FAMILY)
            self.assertEqual(olvane.draw(FAMILY, 1), olvane.draw(path, 1))
            with zipfile.ZipFile(path, "w") as archive:
                archive.writestr("photo.jpg", b"")
            with self.assertRaisesRegex(olvane.FileError, "family.gdz: is an archive without a gedcom.ged"):
                olvane.draw(path, 1)

    def test_aNotebookShowsDrawingsPicturesAndLayouts(self) -> None:
        self.assertEqual(str, type(olvane.draw(FAMILY, 1)._repr_svg_()))
        family = olvane.File(FAMILY).family()
        shown = olvane.picture(family, 3)._repr_svg_()
        self.assertEqual({"1", "2", "3"}, texts(shown))
        self.assertEqual({"1", "2", "3"}, texts(olvane.family_layout(family, 3)._repr_svg_()))
        label = {1: "<A>", 2: "B & C", 3: "D"}.__getitem__
        self.assertEqual({"<A>", "B & C", "D"}, texts(olvane.picture(family, 3).svg(label)))

    def test_aLayoutIsShownWithItsOwnBoxes(self) -> None:
        family = olvane.File(FAMILY).family()
        sizes = olvane.Sizes(node_width=70, node_height=90)
        tree = xml.etree.ElementTree.fromstring(
            olvane.family_layout(family, 3, options=olvane.Options(sizes=sizes))._repr_svg_()
        )
        boxes = [element for element in tree.iter() if element.tag.endswith("rect")]
        self.assertEqual({("70", "90")}, {(box.get("width"), box.get("height")) for box in boxes})

    def test_optionsChangeTheDrawing(self) -> None:
        plain = olvane.draw(FAMILY, 1)
        self.assertNotIn("Ulm", plain)
        self.assertIn("* Ulm", texts(olvane.draw(FAMILY, 1, places=True)))
        self.assertIn("The Bergs", texts(olvane.draw(FAMILY, 1, title="The Bergs")))
        self.assertNotEqual(plain, olvane.draw(FAMILY, 1, theme="dark"))
        self.assertIn("Cy", texts(olvane.draw(FAMILY, 1, view="kinship", to="Cy Carl")))

    def test_aFamilyIsDrawnByItsNames(self) -> None:
        family = olvane.Family([{"id": 1, "birth": "1830-05-01"}, {"id": 2, "father": 1}])
        family.set_names(1, [(olvane.NameKind.FULL, "Ada Berg")])
        self.assertTrue(
            {"Ada Berg"} <= texts(olvane.draw(family, 2)) or {"Ada", "Berg"} <= texts(olvane.draw(family, 2))
        )
        with self.assertRaisesRegex(olvane.FileError, "there is no person 3"):
            olvane.draw(family, 3)
        with self.assertRaisesRegex(TypeError, "named by an id"):
            olvane.draw(family, "Ada")

    def test_aFileLaysOutAsItsTable(self) -> None:
        file = olvane.File(FAMILY)
        self.assertEqual(3, len(file))
        for view in olvane.View:
            self.assertEqual(olvane.layout_text(file.family(), 3, view), file.layout_text(3, view))

    def test_kinshipAndRemarks(self) -> None:
        file = olvane.File(FAMILY)
        self.assertEqual("mother", file.kinship(3, 1)["words"]["en"])
        expected = olvane.Remark("diedBeforeBirth", 3, None, "Cy Carl died before being born")
        self.assertEqual([expected], file.remarks())

    def test_anotherProcessGetsTheErrorButNotTheFile(self) -> None:
        file = olvane.File(FAMILY)
        with self.assertRaises(olvane.FileError) as raised:
            file.draw(99)
        again = pickle.loads(pickle.dumps(raised.exception))
        self.assertEqual((olvane.FileError, raised.exception.status), (type(again), again.status))
        self.assertEqual(str(raised.exception), str(again))
        for duplicate in (pickle.dumps, copy.copy, copy.deepcopy):
            with self.assertRaisesRegex(TypeError, "a File cannot be pickled or copied: hand its path or bytes"):
                duplicate(file)

    def test_whatIsWrongIsSaid(self) -> None:
        with self.assertRaisesRegex(olvane.FileError, "no/file.ged: does not exist") as raised:
            olvane.draw("no/file.ged", 1)
        self.assertIs(olvane.Status.UNREADABLE, raised.exception.status)
        with self.assertRaisesRegex(olvane.FileError, "^layout of person 4: the file has no person 4$"):
            olvane.File(FAMILY).layout_text(4)
        with self.assertRaisesRegex(olvane.FileError, "'Carl' may be any of 2 persons"):
            olvane.draw(FAMILY, "Carl")
        with self.assertRaisesRegex(olvane.FileError, "view is 'paper', and takes family"):
            olvane.draw(FAMILY, 1, view="paper")  # type: ignore[arg-type]
        with self.assertRaisesRegex(TypeError, "no option 'colour'"):
            olvane.File(FAMILY).draw(1, colour="red")
        with self.assertRaisesRegex(olvane.FileError, "there is no person 0"):
            olvane.draw(FAMILY, 2**32 + 1)


if __name__ == "__main__":
    unittest.main()
