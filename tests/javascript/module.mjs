// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What the tests share: the module, and families small enough to lay out by hand.

import { readFile } from "node:fs/promises";

import { loadOlvane } from "../../bindings/javascript/olvane.mjs";

export const olvane = await loadOlvane(await readFile(process.env.OLVANE_WASM));

/** A host around a table: id to [father, mother, spouses, children, sex], 0 for a parent who is not known. */
export class TableHost {
    constructor(table) {
        this.table = table;
    }
    fatherOf(person) {
        return this.table[person][0] || null;
    }
    motherOf(person) {
        return this.table[person][1] || undefined;
    }
    spousesOf(person) {
        return this.table[person][2];
    }
    childrenOf(person) {
        return this.table[person][3];
    }
    isPreferredSpouse(person, spouse) {
        return this.table[person][2][0] === spouse;
    }
    isDead() {
        return true;
    }
    dateOf() {
        return "";
    }
    sexOf(person) {
        return this.table[person][4];
    }
}

/** Henry, his wife and daughter, and his parents. */
export const henry = {
    1: [4, 5, [2], [3], 0],
    2: [0, 0, [1], [3], 1],
    3: [1, 2, [], [], 1],
    4: [0, 0, [5], [1], 0],
    5: [0, 0, [4], [1], 1],
};
