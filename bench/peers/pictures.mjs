// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Peers' layouts as pictures for "olvane judge": node pictures.mjs FOLDER FILE.json...
//
// Each FILE is a picture of ours of somebody's near family, FOCUS.json. Its persons and their links are given to every peer,
// and the peer's layout is written to FOLDER/PEER/FOCUS.json in the same form, with the ids of the file. Boxes are 55 x 80
// points. Lines are those that the peer itself draws or would draw: topola's and family-chart's by their own functions,
// relatives-tree's connectors, elkjs's and dot's orthogonal edges, which meet in a point for each union. OLVANE_PEERS names
// the folder that the peers are installed in.

import { spawnSync } from 'node:child_process';
import { mkdirSync, readFileSync, writeFileSync } from 'node:fs';
import { basename, join } from 'node:path';

import { adapters } from './adapters.mjs';
import { unionsOf } from './families.mjs';

const WIDTH = 55;
const HEIGHT = 80;
const CELL_X = 80;
const CELL_Y = 110;

// --- From our picture to persons, numbered from 1 on with the focus first.

function familyFrom(picture) {
  const shown = picture.boxes.filter(({ kind }) => kind === 'person');
  const focus = shown.find(({ id }) => id === picture.focus);
  const boxes = [focus, ...shown.filter((box) => box !== focus)];
  const numbers = new Map(boxes.map(({ id }, i) => [id, i + 1]));
  const persons = boxes.map(({ person }, i) => ({
    id: i + 1,
    sex: person?.sex === 'female' ? 'F' : 'M',
    father: 0,
    mother: 0,
    spouses: [],
    children: [],
  }));
  const personAt = (place) => persons[numbers.get(picture.boxes[place].id) - 1];
  const elsewhere = picture.marks
    .filter(({ kind }) => kind !== 'samePerson')
    .map(({ kind, boxes: [first, ...rest] }) =>
      kind === 'parentsElsewhere' ? { parents: rest, children: [first] } : { parents: [first, ...rest], children: [] },
    );
  for (const family of [...picture.families, ...elsewhere]) {
    const parents = family.parents.map(personAt).filter(Boolean);
    const children = family.children.map(personAt).filter(Boolean);
    if (parents.length === 2) {
      for (const [one, other] of [parents, [...parents].reverse()])
        if (!one.spouses.includes(other.id)) one.spouses.push(other.id);
    }
    for (const child of children) {
      for (const parent of parents) {
        const slot = parent.sex === 'F' ? 'mother' : 'father';
        if (child[slot] === 0 && !parent.children.includes(child.id)) {
          child[slot] = parent.id;
          parent.children.push(child.id);
        }
      }
    }
  }
  return { persons, idOf: (number) => boxes[Number(number) - 1].id };
}

// --- A picture in the making: boxes by their middle, families by their parents' boxes, lines as runs of points.

class Drawing {
  boxes = [];
  families = new Map();

  addBox(number, x, y) {
    this.boxes.push({ number, x: x - WIDTH / 2, y: y - HEIGHT / 2 });
    return this.boxes.length - 1;
  }
  family(parents) {
    const key = [...parents].sort((a, b) => a - b).join();
    if (!this.families.has(key)) this.families.set(key, { parents: [...parents], children: [], lines: [] });
    return this.families.get(key);
  }
  addChild(parents, child) {
    const { children } = this.family(parents);
    if (!children.includes(child)) children.push(child);
  }
  addRun(parents, points) {
    const { lines } = this.family(parents);
    for (let i = 1; i < points.length; ++i) {
      const [[x1, y1], [x2, y2]] = [points[i - 1], points[i]];
      if (x1 !== x2 || y1 !== y2) lines.push({ role: 'link', x1, y1, x2, y2 });
    }
  }
  boxOf(number) {
    return this.boxes.findIndex((box) => box.number === Number(number));
  }
  json(view, idOf) {
    const boxes = this.boxes.map(({ number, x, y }) => ({
      id: idOf(number),
      kind: 'person',
      x,
      y,
      width: WIDTH,
      height: HEIGHT,
    }));
    const families = [...this.families.values()].map((family) => ({
      ...family,
      childKinds: family.children.map(() => 'birth'),
      style: 'married',
    }));
    return JSON.stringify({ format: 2, view, focus: idOf(1), boxes, families, marks: [] });
  }
}

// --- Each peer's layout as a drawing.

const numberOf = (xref) => Number(xref.slice(1));

// A node is a couple: two boxes that touch, joined within; links run from the couple to a child or its spouse.
function fromTopola(nodes, { util, renderer }) {
  const drawing = new Drawing();
  const places = new Map();
  for (const node of nodes) {
    const of = (person, anchor) => {
      if (!person) return [];
      const [dx, dy] = anchor.call(renderer, node.data);
      return [drawing.addBox(numberOf(person.id), node.x + dx, node.y + dy)];
    };
    places.set(node, {
      indi: of(node.data.indi, renderer.getIndiAnchor),
      spouse: of(node.data.spouse, renderer.getSpouseAnchor),
    });
  }
  const parentsAt = (node) => Object.values(places.get(node)).flat();
  for (const node of nodes) {
    const parents = parentsAt(node);
    if (parents.length === 2) {
      const [one, other] = parents.map((place) => drawing.boxes[place]);
      drawing.addRun(parents, [
        [one.x + WIDTH / 2, one.y + HEIGHT / 2],
        [other.x + WIDTH / 2, other.y + HEIGHT / 2],
      ]);
    }
  }
  for (const node of nodes.filter(({ parent, data }) => parent && !data.additionalMarriage)) {
    const flipped = node.parent.data.generation > node.data.generation;
    const [above, below] = flipped ? [node, node.parent] : [node.parent, node];
    const { indi, spouse } = places.get(below);
    const child = (above.id === below.data.spouseParentNodeId ? spouse : indi)[0];
    const numbers = util
      .linkVertical(above, below)
      .match(/-?[\d.]+(e-?\d+)?/g)
      .map(Number);
    const points = numbers.flatMap((x, i) => (i % 2 === 0 ? [[x, numbers[i + 1]]] : []));
    drawing.addChild(parentsAt(above), child);
    drawing.addRun(parentsAt(above), points);
  }
  return drawing;
}

// As its createLinks draws: down from between the parents to half way, across, and on to the child.
function fromFamilyChart({ data }) {
  const drawing = new Drawing();
  const places = new Map(data.map((node) => [node, drawing.addBox(node.data.id, node.x, node.y)]));
  const link = (parents, child, from) => {
    const half = child.y + (from.y - child.y) / 2;
    const at = parents.map((parent) => places.get(parent));
    drawing.addChild(at, places.get(child));
    drawing.addRun(at, [
      [child.x, child.y],
      [child.x, half],
      [from.x, half],
      [from.x, from.y],
    ]);
  };
  for (const node of data) {
    for (const spouse of node.spouses ?? (node.coparent ? [node.coparent] : [])) {
      drawing.addRun(
        [places.get(node), places.get(spouse)],
        [
          [node.x, node.y],
          [spouse.x, spouse.y],
        ],
      );
    }
    if (node.parents) {
      const [one, other = one] = node.parents;
      link([...new Set([one, other])], node, { x: one.x - (one.x - other.x) / 2, y: one.y - (one.y - other.y) / 2 });
    }
    for (const child of node.children ?? []) {
      const other = (node.spouses ?? []).find((spouse) => child.data.rels.parents.includes(spouse.data.id));
      link(other ? [node, other] : [node], child, { x: (other ?? node).sx, y: node.y });
    }
  }
  return drawing;
}

// Its connectors do not say whose they are. One in the middle of a row of boxes joins a couple; one that goes down from there
// belongs to that couple; one that goes down to the middle of a row belongs to the child that stands there, and so does the
// one across on which it hangs.
function fromRelativesTree({ nodes, connectors }, persons) {
  const drawing = new Drawing();
  const placeAt = new Map();
  for (const { id, left, top } of nodes) {
    placeAt.set(
      `${left + 1},${top + 1}`,
      drawing.addBox(Number(id), ((left + 1) * CELL_X) / 2, ((top + 1) * CELL_Y) / 2),
    );
  }
  const at = (x, y) => placeAt.get(`${x},${y}`);
  const isRow = (y) => nodes.some(({ top }) => top + 1 === y);
  const unions = unionsOf(persons);
  const placesOf = (ids) =>
    ids
      .filter((id) => id !== 0)
      .map((id) => drawing.boxOf(id))
      .filter((place) => place >= 0);
  const parentsOf = (place) => {
    const union = unions.find(({ children }) => children.includes(drawing.boxes[place].number));
    return union ? placesOf([union.father, union.mother]) : [];
  };
  const couple = (x, y) => [at(x, y) ?? [at(x - 1, y), at(x + 1, y)]].flat().filter((place) => place !== undefined);
  const owners = connectors.map(([x1, y1, x2, y2]) => {
    if (y1 === y2 && isRow(y1)) return [at(x1, y1), at(x2, y2)].filter((place) => place !== undefined);
    if (x1 === x2 && at(x2, y2) !== undefined && !isRow(y1)) return parentsOf(at(x2, y2));
    if (x1 === x2 && isRow(y1)) return couple(x1, y1);
    const hanging = connectors.find(
      (run) => run[0] === run[2] && run[1] === y1 && run[0] >= x1 && run[0] <= x2 && at(run[2], run[3]) !== undefined,
    );
    return hanging ? parentsOf(at(hanging[2], hanging[3])) : [];
  });
  for (const { father, mother, children } of unions) {
    const parents = placesOf([father, mother]);
    for (const child of placesOf(children)) if (parents.length > 0) drawing.addChild(parents, child);
  }
  connectors.forEach(([x1, y1, x2, y2], i) => {
    const points = [
      [(x1 * CELL_X) / 2, (y1 * CELL_Y) / 2],
      [(x2 * CELL_X) / 2, (y2 * CELL_Y) / 2],
    ];
    if (owners[i].length > 0) drawing.addRun(owners[i], points);
  });
  return drawing;
}

// Edges of one union meet in its point.
function fromGraph(positions, edges, persons) {
  const drawing = new Drawing();
  for (const [name, [x, y]] of positions) if (name.startsWith('p')) drawing.addBox(numberOf(name), x, y);
  const unions = new Map(unionsOf(persons).map((union) => [`u${union.id}`, union]));
  for (const { from, to, points } of edges) {
    const name = from.startsWith('u') ? from : to;
    const { father, mother, children } = unions.get(name);
    const parents = [father, mother].filter((id) => id !== 0).map((id) => drawing.boxOf(id));
    for (const child of children) drawing.addChild(parents, drawing.boxOf(child));
    const [x, y] = positions.get(name);
    const ordered = from === name ? points : [...points].reverse();
    drawing.addRun(parents, [[x, y], [x, ordered[0][1]], ...ordered]);
  }
  return drawing;
}

function fromElk({ children, edges }, persons) {
  const positions = new Map(children.map(({ id, x, y, width, height }) => [id, [x + width / 2, y + height / 2]]));
  const runs = edges.flatMap(({ sources, targets, sections }) =>
    sections.map(({ startPoint, bendPoints = [], endPoint }) => ({
      from: sources[0],
      to: targets[0],
      points: [startPoint, ...bendPoints, endPoint].map(({ x, y }) => [x, y]),
    })),
  );
  return fromGraph(positions, runs, persons);
}

// Its text has inches, upwards; a line is a run of curves, of which every third point lies on it.
function fromDot(text, persons) {
  const words = text.split('\n').map((line) => line.split(' '));
  const point = (x, y) => [Number(x) * 72, -Number(y) * 72];
  const positions = new Map(words.filter(([kind]) => kind === 'node').map(([, name, x, y]) => [name, point(x, y)]));
  const runs = words
    .filter(([kind]) => kind === 'edge')
    .map(([, from, to, count, ...rest]) => {
      const points = Array.from({ length: Number(count) }, (_, i) => point(rest[2 * i], rest[2 * i + 1]));
      return { from, to, points: points.filter((_, i) => i % 3 === 0) };
    });
  return fromGraph(positions, runs, persons);
}

function dotText(file) {
  const text = readFileSync(file, 'utf8').replace('splines=line', 'splines=ortho');
  const run = spawnSync('dot', ['-Tplain'], { input: text, encoding: 'utf8', timeout: 20_000 });
  if (run.status !== 0) throw new Error(`dot: ${run.signal ?? run.status} ${run.stderr}`);
  return run.stdout;
}

const converters = {
  topola: (nodes, _, tools) => fromTopola(nodes, tools),
  'family-chart': fromFamilyChart,
  'relatives-tree': fromRelativesTree,
  elkjs: fromElk,
  dot: fromDot,
};

const [folder, ...files] = process.argv.slice(2);
for (const [peer, convert] of Object.entries(converters)) {
  const adapter = await adapters[peer]('near');
  mkdirSync(join(folder, peer), { recursive: true });
  let failures = 0;
  for (const file of files) {
    const { persons, idOf } = familyFrom(JSON.parse(readFileSync(file, 'utf8')));
    try {
      const input = adapter.input(persons)();
      const result = peer === 'dot' ? dotText(input) : await adapter.layout(input);
      const drawing = convert(result, persons, adapter.tools?.());
      writeFileSync(join(folder, peer, basename(file)), drawing.json(peer, idOf));
    } catch (error) {
      ++failures;
      console.error(`${peer}, ${basename(file)}: ${error.message}`);
    }
  }
  console.error(`${peer}: ${files.length - failures} of ${files.length} families`);
}
