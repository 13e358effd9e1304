// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
// Who is shown, and how big: one family in the family view, in a smaller one, and as a pedigree.

import { loadOlvane, Shown } from "olvane";

import { myFamily } from "./first_tree.mjs";

const olvane = await loadOlvane();
const everybody = olvane.layout(myFamily, 1);

const nearest = olvane.layout(myFamily, 3, { shown: Shown.all & ~Shown.siblings & ~Shown.greatGrandparents });

const wide = { nodeWidth: 105, nodeHeight: 40, horzPadding: 30, vertPadding: 14, lineInset: 15 };
const ancestors = olvane.layout(myFamily, 3, { view: "pedigree", sizes: wide, generations: 3 });

const different = (numbers) => [...new Set(numbers)].sort((a, b) => a - b).join(", ");
for (const [name, boxes] of Object.entries({ everybody, nearest, ancestors })) {
    const columns = different(boxes.map(({ x }) => x));
    const rows = different(boxes.map(({ y }) => y));
    console.log(`${name}: ${boxes.length} boxes, columns [${columns}], rows [${rows}]`);
}
