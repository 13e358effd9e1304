// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// node worker.mjs PEER SHAPE SIZE: serve_layouts for a peer. For each line with a number on its input it lays out that
// many times and answers with a line: the milliseconds of each layout, and behind a bar the persons shown.

import { createInterface } from 'node:readline';

import { adapters } from './adapters.mjs';
import { makeFamily } from './families.mjs';

const [peer, shape, size] = process.argv.slice(2);
const adapter = await adapters[peer](shape);
const nextInput = adapter.input(makeFamily(shape, Number(size)));
let result;

async function millisecondsOfOne() {
  const input = nextInput();
  const start = process.hrtime.bigint();
  result = await adapter.layout(input);
  return Number(process.hrtime.bigint() - start) / 1e6;
}

console.log('ready');
for await (const line of createInterface({ input: process.stdin })) {
  const times = [];
  for (let i = 0; i < Number(line); i++) times.push(await millisecondsOfOne());
  console.log(`${times.join(' ')} | ${new Set(adapter.shown(result)).size}`);
}
process.exit(0);
