# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""Family trees: which relatives of a person are shown, and where each box and line stands.

A host is any object with the eight methods of :class:`Host`. One call is one whole layout::

    for record in olvane.layout(host, 17):
        draw_box(record.id, record.x, record.y)

Units are points; x grows right, y grows down, and (x, y) is the upper-left corner of a box. The size of a box is that
of the options, 55 by 80 unless told otherwise.

Layouts may run on several threads at once, if their hosts may be asked so; a host is asked on the thread that called.
"""

from olvane._errors import HostError, LayoutError, Status
from olvane._host import Host
from olvane._layout import layout, layout_text, version
from olvane._options import Options, Shown, Sizes, View
from olvane._records import Record, RecordKind, Segment

__all__ = [
    "Host",
    "HostError",
    "LayoutError",
    "Options",
    "Record",
    "RecordKind",
    "Segment",
    "Shown",
    "Sizes",
    "Status",
    "View",
    "layout",
    "layout_text",
    "version",
]

__version__ = version()
