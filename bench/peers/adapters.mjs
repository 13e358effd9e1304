// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// One adapter for each peer. load() returns
//
//     input(persons)   a function that gives one layout's input, in the peer's own form; made again where the peer
//                      writes into it, and never timed
//     layout(input)    the layout alone, nothing drawn; the timed part
//     shown(result)    the ids of the persons that it placed, as texts; a person placed twice is listed twice
//
// Boxes are 55 x 80 points with gaps of 25 and 30, as in the family view. Genealogy libraries get persons; graph
// libraries get persons and a small node for each union, which is how families are drawn with them.

import { spawnSync } from 'node:child_process';
import { readFileSync, writeFileSync } from 'node:fs';
import Module, { createRequire } from 'node:module';
import { tmpdir } from 'node:os';
import { join } from 'node:path';
import { pathToFileURL } from 'node:url';

import { unionsOf } from './families.mjs';
import { HEIGHT, topolaOptions, WIDTH } from './topolaBoxes.mjs';

const GAP_X = 25;
const GAP_Y = 30;
const FOCUS = 1;

const installed = process.env.OLVANE_PEERS;
if (!installed) throw new Error('OLVANE_PEERS must name the folder that the peers are installed in');
const require = createRequire(join(installed, 'package.json'));
const pathOf = (file) => join(installed, 'node_modules', file);

const known = (...ids) => ids.filter((id) => id !== 0);
const freshCopies = (value) => {
  const text = JSON.stringify(value);
  return () => JSON.parse(text);
};

function siblingsOf(person, persons) {
  const siblings = new Set();
  for (const parent of known(person.father, person.mother)) {
    for (const child of persons[parent - 1].children) if (child !== person.id) siblings.add(child);
  }
  return [...siblings];
}

// --- Genealogy libraries.

// Its modules import each other without file extensions, so compare bundles them first.
async function relativesTree() {
  const calcTree = require(join(installed, 'relatives-tree.cjs')).default;
  const node = (person, persons) => {
    const sharesBoth = (id) => persons[id - 1].father === person.father && persons[id - 1].mother === person.mother;
    return {
      id: String(person.id),
      gender: person.sex === 'M' ? 'male' : 'female',
      parents: known(person.father, person.mother).map((id) => ({ id: String(id), type: 'blood' })),
      siblings: siblingsOf(person, persons).map((id) => ({ id: String(id), type: sharesBoth(id) ? 'blood' : 'half' })),
      spouses: person.spouses.map((id) => ({ id: String(id), type: 'married' })),
      children: person.children.map((id) => ({ id: String(id), type: 'blood' })),
    };
  };
  return {
    input(persons) {
      const nodes = persons.map((person) => node(person, persons));
      return () => nodes;
    },
    layout: (nodes) => calcTree(nodes, { rootId: String(FOCUS) }),
    shown: (tree) => tree.nodes.map(({ id }) => id),
  };
}

// The chart of all relatives; for a pedigree the chart of ancestors, which is quicker there. Both up to where they
// begin to write into a page.
async function topola(shape) {
  const library = require('topola');
  const { JsonDataProvider, AncestorChart, RelativesChart } = library;
  const { layOutDescendants } = require('topola/dist/descendant-chart.js');
  const { getAncestorsTree } = require('topola/dist/ancestor-chart.js');
  const { ChartUtil, getChartInfo } = require('topola/dist/chart-util.js');
  const optionsFor = (data) => topolaOptions(library, data, `I${FOCUS}`);
  const layOutAncestors = (options) => {
    const ancestors = new AncestorChart(options).createHierarchy();
    return new ChartUtil(options).layOutChart(ancestors, { flipVertically: true });
  };
  const layOutRelatives = (options) => {
    const chart = new RelativesChart(options);
    const below = layOutDescendants(chart.options);
    const above = getAncestorsTree({ ...chart.options, idGenerator: undefined });
    const nodes = below.concat(chart.layOutAncestorDescendants(above, below[0]));
    getChartInfo(nodes);
    return nodes;
  };
  const family = ({ id, father, mother, children }) => ({
    id: `F${id}`,
    husb: father ? `I${father}` : undefined,
    wife: mother ? `I${mother}` : undefined,
    children: children.map((child) => `I${child}`),
  });
  const person = ({ id, sex }, unions) => ({
    id: `I${id}`,
    sex,
    famc: unions.childOf.get(id),
    fams: unions.parentIn.get(id) ?? [],
  });
  return {
    input(persons) {
      const fams = unionsOf(persons).map(family);
      const unions = { childOf: new Map(), parentIn: new Map() };
      for (const { id, husb, wife, children } of fams) {
        for (const child of children) unions.childOf.set(Number(child.slice(1)), id);
        for (const parent of [husb, wife].filter(Boolean)) {
          const number = Number(parent.slice(1));
          unions.parentIn.set(number, [...(unions.parentIn.get(number) ?? []), id]);
        }
      }
      const data = new JsonDataProvider({ indis: persons.map((one) => person(one, unions)), fams });
      return () => data;
    },
    layout: (data) => (shape === 'ped' ? layOutAncestors : layOutRelatives)(optionsFor(data)),
    // What draws the links of its nodes.
    tools() {
      const options = optionsFor(new JsonDataProvider({ indis: [{ id: `I${FOCUS}` }], fams: [] }));
      return { util: new ChartUtil(options), renderer: options.renderer };
    },
    shown: (nodes) =>
      nodes
        .flatMap(({ data }) => [data.indi, data.spouse])
        .filter(Boolean)
        .map(({ id }) => id),
  };
}

async function familyChart() {
  const { calculateTree } = await import(pathToFileURL(pathOf('family-chart/dist/family-chart.esm.js')));
  const options = {
    main_id: String(FOCUS),
    node_separation: WIDTH + GAP_X,
    level_separation: HEIGHT + GAP_Y,
    single_parent_empty_card: false,
    show_siblings_of_main: true,
  };
  const entry = ({ id, sex, father, mother, spouses, children }) => ({
    id: String(id),
    data: { gender: sex },
    rels: { parents: known(father, mother).map(String), spouses: spouses.map(String), children: children.map(String) },
  });
  return {
    input: (persons) => freshCopies(persons.map(entry)),
    layout: (entries) => calculateTree(entries, options),
    shown: (tree) => tree.data.map(({ data }) => data.id),
  };
}

// It keeps two lists of what it has placed from call to call, and gets slower with every layout. So the modules that
// hold them are loaded again before each layout, not timed, and so run not yet compiled; the others stay warm.
async function entitreeFlex() {
  const holdsLists = /entitree-flex.dist.(index|layoutFromMap|drillChildren|drillParents)\.js$/;
  return entitreeFlexWith(() => {
    for (const file of Object.keys(require.cache)) if (holdsLists.test(file)) delete require.cache[file];
    return require('entitree-flex').layoutFromMap;
  });
}

// The same with those lists emptied by a line of ours instead: not what is published, but what it could be.
async function entitreeFlexRepaired() {
  const forgetters = [];
  for (const [file, list] of [
    ['drillChildren', 'descendantsContour'],
    ['drillParents', 'parentsContour'],
  ]) {
    const path = pathOf(`entitree-flex/dist/${file}.js`);
    const module = new Module(path);
    module.filename = path;
    module._compile(`${readFileSync(path, 'utf8')}\nexports.forget = () => { ${list}.length = 0; };`, path);
    module.loaded = true;
    require.cache[path] = module;
    forgetters.push(module.exports.forget);
  }
  const { layoutFromMap } = require('entitree-flex');
  return entitreeFlexWith(() => {
    for (const forget of forgetters) forget();
    return layoutFromMap;
  });
}

function entitreeFlexWith(freshLayout) {
  const settings = {
    nodeWidth: WIDTH,
    nodeHeight: HEIGHT,
    firstDegreeSpacing: GAP_X,
    secondDegreeSpacing: GAP_X,
    nextAfterSpacing: GAP_X,
    nextBeforeSpacing: GAP_X,
    sourceTargetSpacing: GAP_Y,
  };
  // Spouses stand beside the focus and its descendants, siblings beside the focus.
  const descendantsOf = (id, persons, found = new Set()) => {
    if (!found.has(id)) {
      found.add(id);
      for (const child of persons[id - 1].children) descendantsOf(child, persons, found);
    }
    return found;
  };
  const node = (person, persons, below) => ({
    id: person.id,
    parents: known(person.father, person.mother),
    spouses: below.has(person.id) ? person.spouses : [],
    children: person.children,
    siblings: person.id === FOCUS ? siblingsOf(person, persons) : [],
  });
  return {
    input(persons) {
      const below = descendantsOf(FOCUS, persons);
      const copies = freshCopies(Object.fromEntries(persons.map((one) => [one.id, node(one, persons, below)])));
      return () => ({ nodes: copies(), layOut: freshLayout() });
    },
    layout: ({ nodes, layOut }) => layOut(FOCUS, nodes, settings),
    shown: (tree) => tree.nodes.map(({ id }) => String(id)),
  };
}

// --- Graph libraries.

// Persons are p1, p2, ..., unions u1, u2, ...; edges run from parents to their union and from there to children.
function graphOf(persons) {
  const unions = unionsOf(persons);
  const edges = unions.flatMap(({ id, father, mother, children }) => [
    ...known(father, mother).map((parent) => [`p${parent}`, `u${id}`]),
    ...children.map((child) => [`u${id}`, `p${child}`]),
  ]);
  return { persons: persons.map(({ id }) => `p${id}`), unions: unions.map(({ id }) => `u${id}`), edges };
}

const personNames = (names) => names.filter((name) => name.startsWith('p')).map((name) => name.slice(1));

async function elk() {
  const Elk = require('elkjs');
  const engine = new Elk();
  const layoutOptions = {
    'elk.algorithm': 'layered',
    'elk.direction': 'DOWN',
    'elk.edgeRouting': 'ORTHOGONAL',
    'elk.spacing.nodeNode': String(GAP_X),
    'elk.layered.spacing.nodeNodeBetweenLayers': String(GAP_Y),
  };
  return {
    input(persons) {
      const graph = graphOf(persons);
      const children = [
        ...graph.persons.map((id) => ({ id, width: WIDTH, height: HEIGHT })),
        ...graph.unions.map((id) => ({ id, width: 4, height: 4 })),
      ];
      const edges = graph.edges.map(([from, to], i) => ({ id: `e${i}`, sources: [from], targets: [to] }));
      return freshCopies({ id: 'root', layoutOptions, children, edges });
    },
    layout: (graph) => engine.layout(graph),
    shown: (graph) => personNames(graph.children.map(({ id }) => id)),
  };
}

async function dagre() {
  const { graphlib, layout } = require('@dagrejs/dagre');
  return {
    input(persons) {
      const { persons: names, unions, edges } = graphOf(persons);
      return () => {
        const graph = new graphlib.Graph();
        graph.setGraph({ rankdir: 'TB', nodesep: GAP_X, ranksep: GAP_Y / 2 });
        graph.setDefaultEdgeLabel(() => ({}));
        for (const name of names) graph.setNode(name, { width: WIDTH, height: HEIGHT });
        for (const name of unions) graph.setNode(name, { width: 4, height: 4 });
        for (const [from, to] of edges) graph.setEdge(from, to);
        return graph;
      };
    },
    layout(graph) {
      layout(graph);
      return graph;
    },
    shown: (graph) => personNames(graph.nodes()),
  };
}

// A process for each layout, from a file that is there to the plain text of its result; lines straight, which is
// quickest.
async function dot() {
  const points = (n) => n / 72;
  return {
    input(persons) {
      const { persons: names, unions, edges } = graphOf(persons);
      const file = join(tmpdir(), `olvane-bench-${process.pid}.dot`);
      const header = `digraph family {\nsplines=line; nodesep=${points(GAP_X)}; ranksep=${points(GAP_Y / 2)};\n`;
      const lines = [
        `node [shape=box fixedsize=true label="" width=${points(WIDTH)} height=${points(HEIGHT)}];`,
        'edge [dir=none];',
        ...names.map((name) => `${name};`),
        ...unions.map((name) => `${name} [width=0.05 height=0.05];`),
        ...edges.map(([from, to]) => `${from} -> ${to};`),
      ];
      writeFileSync(file, `${header}${lines.join('\n')}\n}\n`);
      return () => file;
    },
    layout(file) {
      const run = spawnSync('dot', ['-Tplain', file], { encoding: 'utf8', maxBuffer: 1 << 30 });
      if (run.status !== 0) throw new Error(`dot: ${run.signal ?? run.status} ${run.stderr}`);
      return run.stdout;
    },
    shown(text) {
      const nodes = text.split('\n').filter((line) => line.startsWith('node '));
      return personNames(nodes.map((line) => line.split(' ')[1]));
    },
  };
}

export const adapters = {
  'relatives-tree': relativesTree,
  topola,
  'family-chart': familyChart,
  'entitree-flex': entitreeFlex,
  'entitree-flex, repaired': entitreeFlexRepaired,
  elkjs: elk,
  dagre,
  dot,
};
