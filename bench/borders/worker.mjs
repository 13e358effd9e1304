// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// node worker.mjs INTERFACE SHAPE SIZE: serve_borders for JavaScript. OLVANE_WASM names the module.
//
//   javascript host text, javascript host typed      eight functions
//   javascript table text, javascript table typed    the table; typed are the records

import { readFile } from 'node:fs/promises';
import { createInterface } from 'node:readline';

import { loadOlvane } from '../../bindings/javascript/olvane.mjs';
import { makeFamily } from '../peers/families.mjs';

const [chosen, shape, size] = process.argv.slice(2);
const olvane = await loadOlvane(await readFile(process.env.OLVANE_WASM));
const persons = makeFamily(shape, Number(size));

class Host {
  fatherOf = (id) => persons[id - 1].father || null;
  motherOf = (id) => persons[id - 1].mother || null;
  spousesOf = (id) => persons[id - 1].spouses;
  childrenOf = (id) => persons[id - 1].children;
  isPreferredSpouse = (id, spouse) => persons[id - 1].spouses[0] === spouse;
  isDead = () => false;
  dateOf = () => '';
  sexOf = (id) => (persons[id - 1].sex === 'M' ? 0 : 1);
}

function table() {
  return olvane.family({
    persons: persons.map(({ id, father, mother, sex }) => ({ id, father, mother, sex })),
    spouses: persons.flatMap(({ id, spouses }) => spouses.map((spouse) => ({ person: id, spouse }))),
    children: persons.flatMap(({ id, children }) => children.map((child) => ({ parent: id, child }))),
  });
}

const family = chosen.includes('table') ? table() : new Host();
const isText = chosen.endsWith('text');
const layOut = isText ? () => olvane.layoutText(family, 1) : () => olvane.layout(family, 1);

function shown() {
  const ids = olvane.layout(family, 1).filter(({ id }) => id > 0);
  return new Set(ids.map(({ id }) => id)).size;
}

console.log('ready');
for await (const line of createInterface({ input: process.stdin })) {
  const times = [];
  for (let i = 0; i < Number(line); i++) {
    const start = process.hrtime.bigint();
    layOut();
    times.push(Number(process.hrtime.bigint() - start) / 1e6);
  }
  console.log(`${times.join(' ')} | ${shown()}`);
}
process.exit(0);
