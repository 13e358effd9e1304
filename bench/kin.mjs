// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// node kin.mjs OLVANE.WASM FILE...: how long searches take in the module, as bench_search prints it for the library, and
// what it takes to say how everybody in the family views of 80 persons is related to the focus, which --search leaves out. A
// time is the least of nine.

import { readFile } from 'node:fs/promises';

import { loadOlvane } from '../bindings/javascript/olvane.mjs';

const kRounds = 9;
const kShown = 31;

const options = process.argv.slice(2);
const wantsKinship = !options.includes('--search');
const [module, ...paths] = options.filter((option) => option !== '--search');
if (paths.length === 0) throw new Error('usage: node kin.mjs [--search] OLVANE.WASM FILE...');
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

function placeOf(file, id) {
  return file.factsOfPerson(id).find(({ place }) => place !== '')?.place ?? '';
}

function somebody(file) {
  const { persons } = file;
  return persons.find(
    ({ id, sex, birth, given, surname, spouses }) =>
      id >= persons.length >> 1 &&
      sex === 'female' &&
      birth !== null &&
      spouses.length > 0 &&
      persons[spouses[0] - 1].surname !== '' &&
      surname.length > 4 &&
      given !== '' &&
      placeOf(file, id) !== '',
  );
}

function searchesFor(file) {
  const { id, given, surname, spouses, birth, xref } = somebody(file);
  const { year } = birth;
  const place = placeOf(file, id);
  const missing = surname.slice(0, 2) + surname.slice(3);
  const wrong = `${surname.slice(0, 2)}q${surname.slice(3)}`;
  return {
    'whole name': `${given} ${surname}`,
    surname,
    'one letter wrong': wrong,
    'one letter missing, with a given name': `${given} ${missing}`,
    'words reversed': `${surname} ${given}`,
    beginnings: `${given.slice(0, 2)} ${surname.slice(0, 2)}`,
    'middle of a word': surname.slice(1, 4),
    'married name': `${given} ${file.persons[spouses[0] - 1].surname}`,
    place,
    year: String(year),
    'range of years': `${year - 5}-${year + 5}`,
    'name, place and year': `${given} ${surname} ${place} ${year}`,
    xref,
    'one letter': surname.slice(0, 1),
    'five letters': 'a e i o u',
    'nothing found': 'qqzzqq',
    'nothing found of five words': `qqzz kxqw ${wrong} wwxk ${place}`,
  };
}

// The index as a page makes it, for 8 ms at a time: its time, and the longest piece.
function measureIndex(path, file) {
  const [began, pieces] = [performance.now(), []];
  for (let isDone = false; !isDone;) {
    const [took, answer] = milliseconds(() => file.prepareSearch(8));
    [isDone] = [answer, pieces.push(took)];
  }
  row(path, `${file.persons.length} persons`, 'index', performance.now() - began, 'ms');
  row('', '', `${pieces.length} pieces, the longest`, Math.max(...pieces), 'ms');
}

function measureSearch(path, file) {
  measureIndex(path, file);
  const times = [];
  for (const [sort, text] of Object.entries(searchesFor(file))) {
    let least = Infinity;
    let found = [];
    for (let round = 0; round < kRounds; ++round) {
      const [took, hits] = milliseconds(() => file.search(text, kShown));
      [least, found] = [Math.min(least, took), hits];
    }
    times.push(least);
    row('', sort, text, `${found.length} found`, least, 'ms');
  }
  times.sort((one, other) => one - other);
  row('', 'median, worst', times[times.length >> 1], times.at(-1), 'ms');
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
  if (wantsKinship) measureKinship(path, file);
  file.close();
}
