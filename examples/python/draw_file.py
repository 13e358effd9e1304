# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""draw_file.py FILE WHO: one person of a GEDCOM file, drawn with ancestors and descendants to tree.svg."""

import sys

import olvane

try:
    olvane.draw(sys.argv[1], sys.argv[2], view="hourglass").save("tree.svg")
except olvane.FileError as error:
    sys.exit(str(error))
