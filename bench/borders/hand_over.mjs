// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// node hand_over.mjs PERSONS: how long a family takes from JavaScript into the table, in each form of rows. OLVANE_WASM
// names the module.

import { readFile } from 'node:fs/promises';

import { loadOlvane } from '../../bindings/javascript/olvane.mjs';

const olvane = await loadOlvane(await readFile(process.env.OLVANE_WASM));
const rows = Array.from({ length: Number(process.argv[2]) }, (_, i) => {
  const id = i + 1;
  const couple = (id + 1) >> 1;
  const father = couple > 1 ? (couple >> 1) * 2 - 1 : null;
  return {
    id,
    father,
    mother: father && father + 1,
    sex: id % 2 ? 0 : 1,
    dead: true,
    birth: `${1000 + (couple % 900)}-01-${10 + (couple % 18)}`,
    death: `${1060 + (couple % 900)}-07-${10 + (couple % 18)}`,
  };
});
const columns = Object.fromEntries(Object.keys(rows[0]).map((name) => [name, rows.map((row) => row[name])]));
const typed = { ...columns };
for (const name of ['id', 'father', 'mother']) typed[name] = Int32Array.from(columns[name], (value) => value ?? 0);
for (const name of ['sex', 'dead']) typed[name] = Uint8Array.from(columns[name], Number);

for (const [form, persons] of Object.entries({ objects: rows, columns, 'typed arrays and texts': typed })) {
  let least = Infinity;
  for (let round = 0; round < 7; ++round) {
    const start = performance.now();
    const family = olvane.family({ persons });
    least = Math.min(least, performance.now() - start);
    family.close();
  }
  console.log(`${rows.length} persons from JavaScript as ${form}: ${(least / 1000).toFixed(3)} s`);
}
