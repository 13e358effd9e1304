# SPDX-FileCopyrightText: The Olvane developers
# SPDX-License-Identifier: MIT
"""Who is shown, and how big: one family in the family view, in a smaller one, and as a pedigree."""

import first_tree
import olvane

family = first_tree.MyFamily()
everybody = olvane.layout(family, 1)

few = olvane.Options(shown=olvane.Shown.ALL & ~olvane.Shown.SIBLINGS & ~olvane.Shown.GREAT_GRANDPARENTS)
nearest = olvane.layout(family, 3, options=few)

wide = olvane.Sizes(node_width=105, node_height=40, horz_padding=30, vert_padding=14, line_inset=15)
ancestors = olvane.layout(family, 3, olvane.View.PEDIGREE, olvane.Options(sizes=wide, generations=3))

for name, boxes in (("everybody", everybody), ("nearest", nearest), ("ancestors", ancestors)):
    columns = sorted({box.x for box in boxes})
    rows = sorted({box.y for box in boxes})
    print(f"{name}: {len(boxes)} boxes, columns {columns}, rows {rows}")
