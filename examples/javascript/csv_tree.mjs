// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
import { sharedEngine } from "./olvane-tree.mjs";

// A comma within quotes belongs to the cell; an empty cell is not known.
const cells = (line) => line.match(/(?<=^|,)("[^"]*"|[^,]*)/g).map((cell) => cell.replace(/^"|"$/g, "") || null);
const number = (cell) => cell && Number(cell);

const [header, ...lines] = (await (await fetch("persons.csv")).text()).trim().split(/\r?\n/);
const names = cells(header);
const persons = lines.map((line) => {
    const row = Object.fromEntries(cells(line).map((cell, i) => [names[i], cell]));
    return { ...row, id: number(row.id), father: number(row.father), mother: number(row.mother) };
});
const olvane = await sharedEngine();
document.querySelector("olvane-tree").data = olvane.family({ persons });
