# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""Family trees: which relatives of a person are shown, and where each box and line stands.

A :class:`Family` is handed over once, as rows or columns or by two queries. One call is one whole layout::

    family = olvane.Family(cursor.execute("SELECT id, father, mother, sex, birth FROM person"))
    for record in olvane.layout(family, 17):
        draw_box(record.id, record.x, record.y)

A GEDCOM file is drawn in one call, and a notebook shows the picture::

    olvane.draw("family.ged", "Charles Darwin", view="hourglass")

The same views come as values, for a drawing of one's own, and so does how two persons are related::

    picture = olvane.picture("family.ged", "Charles Darwin", "descendants", down=3)
    print(olvane.kin("family.ged", "Charles Darwin", "Emma Wedgwood").words["en"])

A host that keeps its data elsewhere is any object with the eight methods of :class:`Host`, in the family's place. It is
asked many times, and so takes many times longer.

Units are points; x grows right, y grows down, and (x, y) is the upper-left corner of a box. The size of a box is that
of the options, 55 by 80 unless stated otherwise.

Layouts may run on several threads at once, if their hosts may be asked so; a host is asked on the thread that called.
"""

from olvane._charts import picture
from olvane._errors import HostError, LayoutError, Status
from olvane._family import ChildKind, Family, FamilyError, FamilyRow, FamilyState, NameKind, Person
from olvane._file import DrawView, File, FileError, Remark, draw
from olvane._host import Host
from olvane._judge import Judgement, judge
from olvane._kinship import Kinship, KinWay, MarriageWay, kin
from olvane._layout import MOST_RELATIVES, family_layout, layout, layout_text, version
from olvane._options import Options, Shown, Sizes, View
from olvane._picture import (
    FoldedBranch,
    LineRole,
    MarkKind,
    Picture,
    PictureArc,
    PictureBox,
    PictureFamily,
    PictureLine,
    PictureMark,
    PictureWay,
    WayKind,
)
from olvane._records import Layout, Record, RecordKind, Segment
from olvane._svg import Svg

__all__ = [
    "ChildKind",
    "DrawView",
    "Family",
    "FamilyError",
    "FamilyRow",
    "FamilyState",
    "File",
    "FileError",
    "FoldedBranch",
    "Host",
    "HostError",
    "Judgement",
    "Kinship",
    "KinWay",
    "Layout",
    "LayoutError",
    "LineRole",
    "MarkKind",
    "MarriageWay",
    "MOST_RELATIVES",
    "NameKind",
    "Options",
    "Person",
    "Picture",
    "PictureArc",
    "PictureBox",
    "PictureFamily",
    "PictureLine",
    "PictureMark",
    "PictureWay",
    "Record",
    "RecordKind",
    "Remark",
    "Segment",
    "Shown",
    "Sizes",
    "Status",
    "Svg",
    "View",
    "WayKind",
    "draw",
    "family_layout",
    "judge",
    "kin",
    "layout",
    "layout_text",
    "picture",
    "version",
]

__version__ = version()
