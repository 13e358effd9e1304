// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// node kin.mjs OLVANE.WASM FILE...: how long searches take in the module, as bench_search prints it for the library, and
// what it takes to say how everybody in the family views of 80 persons is related to the focus. A time is the least of
// five.

import { readFile } from 'node:fs/promises';

import { loadOlvane } from '../bindings/javascript/olvane.mjs';

const kRounds = 5;
const kShown = 30;
const kSearches = [
  'a',
  'surname1',
  'victoria',
  'albert of',
  'surname1 given2',
  'urnam',
  'victorai',
  'given20x',
  '1819',
  '1819-1825',
  'I17',
  '17',
  'nobodyatall',
  'of saxe co',
  'elisabeth 18',
];

const [module, ...paths] = process.argv.slice(2);
if (paths.length === 0) throw new Error('usage: node kin.mjs OLVANE.WASM FILE...');
const olvane = await loadOlvane(await readFile(module));

function milliseconds(work) {
  const start = performance.now();
  const answer = work();
  return [performance.now() - start, answer];
}

function row(...cells) {
  console.log(
    cells.map((cell) => (typeof cell === 'number' && !Number.isInteger(cell) ? cell.toFixed(3) : cell)).join('\t'),
  );
}

function measureSearch(path, file) {
  const [made] = milliseconds(() => file.search('a', kShown));
  row(path, `${file.persons.length} persons`, 'first search, with the index', made, 'ms');
  let worst = 0;
  for (const text of kSearches) {
    let least = Infinity;
    let found = [];
    for (let round = 0; round < kRounds; ++round) {
      const [took, hits] = milliseconds(() => file.search(text, kShown));
      [least, found] = [Math.min(least, took), hits];
    }
    worst = Math.max(worst, least);
    row('', text, `${found.length} found`, least, 'ms');
  }
  row('', 'worst', '', worst, 'ms');
}

function measureKinship(path, file) {
  const times = [];
  const step = Math.max(1, Math.floor(file.persons.length / 80));
  for (let focus = 1; focus <= file.persons.length; focus += step) {
    const persons = [...new Set(file.picture(focus).boxes.map(({ id }) => id))].filter((id) => id > 0);
    let least = Infinity;
    for (let round = 0; round < kRounds; ++round)
      least = Math.min(least, milliseconds(() => file.kinshipWords(focus, persons))[0]);
    times.push([least, persons.length]);
  }
  times.sort(([one], [other]) => one - other);
  row(path, 'kinship of all boxes', 'median', times[times.length >> 1][0], 'ms');
  row('', '', 'worst', times.at(-1)[0], 'ms', `${times.at(-1)[1]} persons`);
}

for (const path of paths) {
  const file = olvane.readGedcom(await readFile(path), path);
  measureSearch(path, file);
  measureKinship(path, file);
  file.close();
}
