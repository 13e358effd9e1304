// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// d3-flextree on the trees of ../chart_trees.cpp: node charts.mjs N... prints a line for each number of persons, with
// milliseconds, width, and the milliseconds of the layout alone. Boxes are 55 x 80 points with gaps of 25 and 30. The time is
// the processor's, from persons to places, the median of as many layouts as there: its tree of nodes is made in it, as the
// chart makes its own from a graph of persons. OLVANE_PEERS names the folder of the peers.

import { createRequire } from 'node:module';
import { join } from 'node:path';

const require = createRequire(join(process.env.OLVANE_PEERS, 'package.json'));
const { flextree } = require('d3-flextree');

function treeOf(persons) {
  const nodes = [{ children: [] }];
  let random = 1;
  for (let parent = 0; nodes.length < persons; ++parent) {
    random = (Math.imul(random, 1664525) + 1013904223) >>> 0;
    const children = 1 + ((random >>> 16) % 4);
    for (let i = 0; i < children && nodes.length < persons; ++i) {
      const node = { children: [] };
      nodes[parent].children.push(node);
      nodes.push(node);
    }
  }
  return nodes[0];
}

function processorTime() {
  const { user, system } = process.cpuUsage();
  return (user + system) / 1000;
}

function median(times) {
  return times.sort((a, b) => a - b)[times.length >> 1];
}

for (const persons of process.argv.slice(2).map(Number)) {
  const layout = flextree({ nodeSize: () => [80, 110] });
  const data = treeOf(persons);
  const times = [];
  const alone = [];
  let width = 0;
  for (let round = 0; round < (persons >= 100000 ? 3 : 5); ++round) {
    const start = processorTime();
    const tree = layout.hierarchy(data);
    const made = processorTime();
    layout(tree);
    const end = processorTime();
    times.push(end - start);
    alone.push(end - made);
    let least = Infinity;
    let most = -Infinity;
    tree.each((node) => {
      least = Math.min(least, node.x);
      most = Math.max(most, node.x);
    });
    width = most - least + 55;
  }
  console.log(persons, median(times).toFixed(1), width.toFixed(1), median(alone).toFixed(1));
}
