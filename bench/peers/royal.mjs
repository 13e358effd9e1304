// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What peers take for the charts of a real family: node royal.mjs FILE.ged [STEP]. Of every STEP-th person, 60 unless
// said, topola lays out the ancestors and the descendants, and family-chart three generations up and down; nothing is
// drawn. Prints the median and the slowest in milliseconds, and the most boxes. OLVANE_PEERS names the peers' folder.

import { readFileSync } from 'node:fs';
import { createRequire } from 'node:module';
import { join } from 'node:path';
import { pathToFileURL } from 'node:url';
import { HEIGHT, topolaOptions, WIDTH } from './topolaBoxes.mjs';

const folder = process.env.OLVANE_PEERS;
const require = createRequire(join(folder, 'package.json'));
const topola = require('topola');
const { JsonDataProvider, AncestorChart, DescendantChart } = topola;
const { layOutDescendants } = require('topola/dist/descendant-chart.js');
const { ChartUtil } = require('topola/dist/chart-util.js');
const { calculateTree } = await import(
  pathToFileURL(join(folder, 'node_modules/family-chart/dist/family-chart.esm.js'))
);

function readGedcom(text) {
  const indis = [];
  const fams = [];
  let record;
  for (const line of text.split(/\r?\n/)) {
    const [, level, xref, tag, value] = /^(\d+) (?:@([^@]+)@ )?(\w+) ?@?([^@]*)@?$/.exec(line) ?? [];
    if (level === '0') {
      record = undefined;
      if (tag === 'INDI') indis.push((record = { id: xref, fams: [] }));
      if (tag === 'FAM') fams.push((record = { id: xref, children: [] }));
    } else if (level === '1' && record) {
      if (tag === 'SEX') record.sex = value;
      if (tag === 'FAMC') record.famc ??= value;
      if (tag === 'FAMS') record.fams.push(value);
      if (tag === 'HUSB') record.husb = value;
      if (tag === 'WIFE') record.wife = value;
      if (tag === 'CHIL') record.children.push(value);
    }
  }
  return { indis, fams };
}

const { indis, fams } = readGedcom(readFileSync(process.argv[2], 'latin1'));
const data = new JsonDataProvider({ indis, fams });
const optionsFor = (person) => topolaOptions(topola, data, person);

function topolaAncestors(person) {
  const options = optionsFor(person);
  return new ChartUtil(options).layOutChart(new AncestorChart(options).createHierarchy(), { flipVertically: true });
}

const topolaDescendants = (person) => layOutDescendants(new DescendantChart(optionsFor(person)).options);

const famOf = new Map(fams.map((fam) => [fam.id, fam]));
const entries = indis.map(({ id, sex, famc, fams: own }) => {
  const parents = famOf.get(famc);
  const unions = own.map((fam) => famOf.get(fam)).filter(Boolean);
  return {
    id,
    data: { gender: sex === 'F' ? 'F' : 'M' },
    rels: {
      parents: [parents?.husb, parents?.wife].filter(Boolean),
      spouses: unions.map(({ husb, wife }) => (husb === id ? wife : husb)).filter(Boolean),
      children: unions.flatMap(({ children }) => children),
    },
  };
});

const familyChart = (person, input) =>
  calculateTree(input, {
    main_id: person,
    node_separation: WIDTH + 25,
    level_separation: HEIGHT + 30,
    single_parent_empty_card: false,
    show_siblings_of_main: true,
    ancestry_depth: 3,
    progeny_depth: 3,
  }).data;

function measure(name, layOut, input = () => undefined) {
  const times = [];
  let most = 0;
  const step = Number(process.argv[3] ?? 60);
  for (let i = 0; i < indis.length; i += step) {
    let least = Infinity;
    for (let round = 0; round < 2 && !(least > 200 && least < Infinity); ++round) {
      const copy = input();
      const start = process.cpuUsage();
      const nodes = layOut(indis[i].id, copy);
      const { user, system } = process.cpuUsage(start);
      least = Math.min(least, (user + system) / 1000);
      most = Math.max(most, nodes.length);
    }
    times.push(least);
  }
  times.sort((a, b) => a - b);
  console.log(
    `| ${name} | ${times.length} | ${times[times.length >> 1].toFixed(2)} | ${times.at(-1).toFixed(1)} | ${most} |`,
  );
}

console.log('| chart | persons | median ms | slowest ms | most boxes |\n| --- | ---: | ---: | ---: | ---: |');
measure('topola, ancestors', topolaAncestors);
measure('topola, descendants', topolaDescendants);
const text = JSON.stringify(entries);
measure('family-chart, 3 up 3 down', familyChart, () => JSON.parse(text));
