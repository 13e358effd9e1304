# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""uses_olvane.py ENVIRONMENT: what an installed package says of itself, and a layout by the library that it carries."""

import importlib.metadata
import json
import pathlib
import sys

import olvane


def main() -> None:
    environment = pathlib.Path(sys.argv[1]).resolve()
    about = importlib.metadata.metadata("olvane")
    assert about["Version"] == olvane.__version__, (about["Version"], olvane.__version__)
    assert about["Requires-Python"] == ">=3.11"
    assert "Typing :: Typed" in about.get_all("Classifier", [])
    files = {str(file) for file in importlib.metadata.files("olvane") or []}
    for needed in ("olvane/py.typed", "olvane/contents.spdx.json", "olvane/notices.txt"):
        assert needed in files, f"{needed} is not among {sorted(files)}"
    licence = [file for file in files if file.endswith("dist-info/LICENSE")]
    assert licence, "there is no licence"

    package = pathlib.Path(olvane.__file__).resolve().parent
    assert environment in package.parents, f"{package} is not in {environment}"
    contents = json.loads((package / "contents.spdx.json").read_text(encoding="utf-8"))
    assert contents["packages"][0]["name"] == "olvane"
    loaded = pathlib.Path("/proc/self/maps").read_text(encoding="utf-8")
    assert str(package / "libolvane_c.so") in loaded, "the library is not the package's own"

    family = olvane.Family([{"id": 1, "father": 2}, {"id": 2}])
    assert {record.id for record in olvane.layout(family, 1) if record.id > 0} == {1, 2}


main()
