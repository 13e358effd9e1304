// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// d3-flextree on the trees of ../chart_trees.cpp: node charts.mjs N... prints a line for each number of persons, with
// milliseconds and width. Boxes are 55 x 80 points with gaps of 25 and 30. The time is the processor's, the median of as
// many layouts as there; its tree of nodes is made anew for each, outside the clock. OLVANE_PEERS names the folder of the peers.

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

for (const persons of process.argv.slice(2).map(Number)) {
  const layout = flextree({ nodeSize: () => [80, 110] });
  const data = treeOf(persons);
  const times = [];
  let width = 0;
  for (let round = 0; round < (persons >= 100000 ? 3 : 5); ++round) {
    const tree = layout.hierarchy(data);
    const start = performance.now();
    layout(tree);
    times.push(performance.now() - start);
    let least = Infinity;
    let most = -Infinity;
    tree.each((node) => {
      least = Math.min(least, node.x);
      most = Math.max(most, node.x);
    });
    width = most - least + 55;
  }
  times.sort((a, b) => a - b);
  console.log(persons, times[times.length >> 1].toFixed(1), width.toFixed(1));
}
