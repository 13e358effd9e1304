# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""chart_values.py FILE WHO OTHER: two generations of descendants, and how two persons are related."""

import sys

import olvane

try:
    file = olvane.File(sys.argv[1])
    who, other = file.find(sys.argv[2]), file.find(sys.argv[3])
    picture = olvane.picture(file, who, "descendants", down=2)
    for box in picture.boxes:
        print(f"{box.id} at {box.x:g},{box.y:g}")
    kinship = olvane.kin(file, who, other)
    print(kinship.words["en"], len(kinship.blood), kinship.phi)
    for way in olvane.picture(file, who, "kinship", to=other).ways:
        print(way.kind.name, way.words)
except (olvane.FileError, olvane.LayoutError) as error:
    sys.exit(str(error))
