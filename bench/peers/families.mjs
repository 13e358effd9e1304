// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The made families for the peers: the same persons, in the same order, as bench/MadeFamily.h makes. "compare" holds
// both generators against each other, person by person, before it times anything.
//
// node families.mjs SHAPE SIZE prints a family, a line for each person, in the form of print_family.

import { fileURLToPath } from 'node:url';

class Family {
  persons = [];

  add(sex, { father = 0, mother = 0, year = 0 }) {
    const id = this.persons.length + 1;
    this.persons.push({ id, sex, father, mother, year, spouses: [], children: [] });
    for (const parent of [father, mother]) if (parent) this.person(parent).children.push(id);
    return id;
  }

  person(id) {
    return this.persons[id - 1];
  }

  marry(one, other) {
    this.person(one).spouses.push(other);
    this.person(other).spouses.push(one);
  }

  addSpouse(id) {
    const { sex, year } = this.person(id);
    const spouse = this.add(sex === 'M' ? 'F' : 'M', { year: year + 1 });
    this.marry(id, spouse);
    return spouse;
  }

  addChild(one, other, place, year) {
    const [father, mother] = this.person(one).sex === 'M' ? [one, other] : [other, one];
    return this.add(place % 2 === 0 ? 'M' : 'F', { father, mother, year });
  }

  // Children of a couple, each with a spouse and children of their own.
  addUnit(one, other, children, grandchildren, year) {
    for (let i = 0; i < children; i++) {
      const child = this.addChild(one, other, i, year + (i % 20));
      const spouse = this.addSpouse(child);
      for (let j = 0; j < grandchildren; j++) this.addChild(child, spouse, j, year + 25 + j);
    }
  }

  addParents(child, year) {
    const father = this.add('M', { year });
    const mother = this.add('F', { year });
    this.marry(father, mother);
    Object.assign(this.person(child), { father, mother });
    for (const parent of [father, mother]) this.person(parent).children.push(child);
    return [father, mother];
  }

  addAncestors(child, generations, year) {
    if (generations === 0) return;
    for (const parent of this.addParents(child, year)) this.addAncestors(parent, generations - 1, year - 30);
  }
}

function descendants(persons) {
  const family = new Family();
  const focus = family.add('M', { year: 1900 });
  family.addUnit(focus, family.addSpouse(focus), Math.round((persons - 2) / 7), 5, 1925);
  return family;
}

function kin(persons) {
  const small = persons <= 30;
  const units = small ? 1 : Math.round((persons - 20) / 20);
  const family = new Family();
  const focus = family.add('M', { year: 1900 });
  const wife = family.addSpouse(focus);
  const [father, mother] = family.addParents(focus, 1870);
  const grandparents = [family.addParents(father, 1840), family.addParents(mother, 1840)];
  for (const grandparent of grandparents.flat()) family.addParents(grandparent, 1810);
  family.addUnit(focus, wife, units, 3, 1925);
  family.addUnit(father, mother, units, 3, 1901);
  for (const [one, other] of grandparents) family.addUnit(one, other, small ? 0 : units, 3, 1871);
  const second = family.add('F', { year: 1875 });
  family.marry(father, second);
  family.addChild(father, second, 1, 1905);
  const former = family.add('M', { year: 1895 });
  family.marry(former, wife);
  family.addChild(former, wife, 0, 1922);
  return family;
}

function ancestors(generations) {
  const family = new Family();
  family.addAncestors(family.add('M', { year: 1990 }), generations, 1960);
  return family;
}

// Focus 1. A person is {id, sex: 'M' or 'F', father, mother, year, spouses, children}; 0 is a parent not known.
export function makeFamily(shape, size) {
  const make = { desc: descendants, ego: kin, ped: ancestors }[shape];
  if (!make) throw new Error(`no such shape: ${shape}`);
  return make(size).persons;
}

// One union for each couple and for each pair of parents: {id, father, mother, children}.
export function unionsOf(persons) {
  const unions = new Map();
  const union = (father, mother) => {
    const key = `${father} ${mother}`;
    if (!unions.has(key)) unions.set(key, { id: unions.size + 1, father, mother, children: [] });
    return unions.get(key);
  };
  for (const { id, sex, spouses } of persons) {
    for (const spouse of spouses) sex === 'M' ? union(id, spouse) : union(spouse, id);
  }
  for (const { id, father, mother } of persons) if (father || mother) union(father, mother).children.push(id);
  return [...unions.values()];
}

function lineOf({ id, sex, father, mother, year, spouses, children }) {
  return `${id} ${sex} ${father} ${mother} ${year} [${spouses.join(' ')}] [${children.join(' ')}]\n`;
}

if (process.argv[1] === fileURLToPath(import.meta.url)) {
  const [shape, size] = process.argv.slice(2);
  process.stdout.write(makeFamily(shape, Number(size)).map(lineOf).join(''));
}
