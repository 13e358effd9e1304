// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// How far the order of small families is from the fewest crossings that any order has: each problem that
// everybody_order_problems prints is an integer program, solved by HiGHS.
//
//     everybody_order_problems 500 | node exact.mjs
//
// o_a_b: node a stands left of node b of its row; f_a: node a stands the other way round; l_s_t: strand s lies wholly
// left of strand t; c_s_t: they cross, as they do unless one is left of the other.

import { createRequire } from 'node:module';
import { join } from 'node:path';
import { createInterface } from 'node:readline';

const require = createRequire(join(process.env.OLVANE_PEERS ?? '.', 'package.json'));
const highs = await require('highs')();

// [constant, coefficient, variable] of "the one end is not right of the other".
function isLeft([a, i], [b, k]) {
  if (a !== b) return a < b ? [0, 1, `o_${a}_${b}`] : [1, -1, `o_${b}_${a}`];
  if (i === k) return [1, 0, ''];
  return i < k ? [1, -1, `f_${a}`] : [0, 1, `f_${a}`];
}

function programOf({ nodes, strands }) {
  const constraints = [];
  const binaries = new Set();
  const objective = [];
  for (const row of new Set(nodes.map(([r]) => r))) {
    const members = nodes.flatMap(([r], n) => (r === row ? [n] : []));
    for (const a of members) {
      for (const b of members.filter((n) => n > a)) {
        binaries.add(`o_${a}_${b}`);
        for (const c of members.filter((n) => n > b)) {
          constraints.push(
            `o_${a}_${b} + o_${b}_${c} - o_${a}_${c} >= 0`,
            `o_${a}_${b} + o_${b}_${c} - o_${a}_${c} <= 1`,
          );
        }
      }
    }
  }
  nodes.forEach(([, size], n) => size > 1 && binaries.add(`f_${n}`));
  strands.forEach((s, i) => {
    strands.forEach((t, k) => {
      if (k <= i || s.gap !== t.gap) return;
      for (const [one, other, name] of [
        [s, t, `l_${i}_${k}`],
        [t, s, `l_${k}_${i}`],
      ]) {
        binaries.add(name);
        for (const side of ['above', 'below']) {
          for (const e of one[side]) {
            for (const f of other[side]) {
              const [constant, by, variable] = isLeft(e, f);
              if (by !== 0) constraints.push(`${name} ${by > 0 ? '-' : '+'} ${variable} <= ${constant}`);
            }
          }
        }
      }
      constraints.push(`c_${i}_${k} + l_${i}_${k} + l_${k}_${i} >= 1`);
      objective.push(`c_${i}_${k}`);
    });
  });
  if (objective.length === 0) return null;
  return [
    'Minimize',
    ` obj: ${objective.join(' + ')}`,
    'Subject To',
    ...constraints.map((c, i) => ` r${i}: ${c}`),
    'Binary',
    ` ${[...binaries].join(' ')}`,
    'End',
  ].join('\n');
}

let families = 0,
  ours = 0,
  best = 0,
  atBest = 0,
  unsolved = 0;
for await (const line of createInterface({ input: process.stdin })) {
  const problem = JSON.parse(line);
  ++families;
  let fewest = 0;
  if (problem.crossings > 0) {
    const solution = highs.solve(programOf(problem), { time_limit: 30 });
    if (solution.Status !== 'Optimal') {
      ++unsolved;
      continue;
    }
    fewest = Math.round(solution.ObjectiveValue);
  }
  if (problem.crossings < fewest) throw new Error(`${problem.crossings} crossings where ${fewest} are the fewest`);
  ours += problem.crossings;
  best += fewest;
  if (problem.crossings === fewest) ++atBest;
}
console.log(
  `${families} families, ${unsolved} of them not solved in 30 s: ${ours} crossings, ${best} the fewest, ratio ` +
    `${(ours / best).toFixed(3)}; ${atBest} families have the fewest`,
);
