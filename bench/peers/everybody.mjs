// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Places a whole family with a graph layouter. Reads the family as JSON on the standard input, as
// `bench_everybody FILE --graph` prints it, and prints the milliseconds of processor time of the layout, then "id x y" for each box.
//
//     node everybody.mjs dot|elkjs|dagre
//
// Persons are boxes of 55 by 80 with gaps of 25 and 30; each union is a small node, from its partners to its children.

import { spawnSync } from 'node:child_process';
import { readFileSync } from 'node:fs';
import { createRequire } from 'node:module';
import { join } from 'node:path';

const { persons, unions } = JSON.parse(readFileSync(0, 'utf8'));
const require = createRequire(join(process.env.OLVANE_PEERS ?? '.', 'package.json'));
const edges = unions.flatMap(({ partners, children }, u) => [
  ...partners.map((p) => [`p${p}`, `u${u}`]),
  ...children.map((c) => [`u${u}`, `p${c}`]),
]);

const msSince = (start) => process.cpuUsage(start).user / 1000;

function dot() {
  const text = [
    'digraph { splines=false nodesep=0.347 ranksep=0.2',
    'node [shape=box fixedsize=true label=""]',
    ...persons.map((p) => `p${p} [width=0.764 height=1.111]`),
    ...unions.map((_, u) => `u${u} [width=0.03 height=0.03]`),
    ...edges.map(([from, to]) => `${from} -> ${to} [dir=none]`),
    '}',
  ].join('\n');
  const { stdout, stderr } = spawnSync('bash', ['-c', 'TIMEFORMAT=%U; time dot -Tplain'], {
    input: text,
    maxBuffer: 2 ** 30,
    encoding: 'utf8',
  });
  const ms = 1000 * Number(stderr.trim().split('\n').at(-1).replace(',', '.'));
  const boxes = stdout
    .split('\n')
    .filter((line) => line.startsWith('node p'))
    .map((line) => {
      const [, name, x, y] = line.split(' ');
      return [name.slice(1), Number(x) * 72, -Number(y) * 72];
    });
  return { ms, boxes };
}

async function elkjs() {
  const ELK = require('elkjs');
  const graph = {
    id: 'root',
    layoutOptions: {
      'elk.algorithm': 'layered',
      'elk.direction': 'DOWN',
      'elk.edgeRouting': 'ORTHOGONAL',
      'elk.spacing.nodeNode': '25',
      'elk.layered.spacing.nodeNodeBetweenLayers': '15',
    },
    children: [
      ...persons.map((p) => ({ id: `p${p}`, width: 55, height: 80 })),
      ...unions.map((_, u) => ({ id: `u${u}`, width: 2, height: 2 })),
    ],
    edges: edges.map(([from, to], i) => ({ id: `e${i}`, sources: [from], targets: [to] })),
  };
  const start = process.cpuUsage();
  const result = await new ELK().layout(graph);
  const ms = msSince(start);
  const boxes = result.children
    .filter(({ id }) => id[0] === 'p')
    .map(({ id, x, y }) => [id.slice(1), x + 27.5, y + 40]);
  return { ms, boxes };
}

function dagre() {
  const { graphlib, layout } = require('@dagrejs/dagre');
  const graph = new graphlib.Graph();
  graph.setGraph({ nodesep: 25, ranksep: 15, rankdir: 'TB' });
  graph.setDefaultEdgeLabel(() => ({}));
  for (const p of persons) graph.setNode(`p${p}`, { width: 55, height: 80 });
  unions.forEach((_, u) => graph.setNode(`u${u}`, { width: 2, height: 2 }));
  for (const [from, to] of edges) graph.setEdge(from, to);
  const start = process.cpuUsage();
  layout(graph);
  const ms = msSince(start);
  return { ms, boxes: persons.map((p) => [p, graph.node(`p${p}`).x, graph.node(`p${p}`).y]) };
}

const { ms, boxes } = await { dot, elkjs, dagre }[process.argv[2]]();
console.log(ms.toFixed(0));
for (const [id, x, y] of boxes) console.log(`${id} ${x - 27.5} ${y - 40}`);
