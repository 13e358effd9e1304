// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What the tests share: the module, and families small enough to lay out by hand.

import { readFile } from "node:fs/promises";

import { Instance } from "../../bindings/javascript/instance.mjs";
import { loadOlvane } from "../../bindings/javascript/olvane.mjs";

const bytes = await readFile(process.env.OLVANE_WASM);

export const olvane = await loadOlvane(bytes);

/** A module of its own, for tests that look into it or leave it broken; new Olvane(instance) asks it. */
export function openInstance() {
    return Instance.of(bytes);
}

/** Fills the module's memory, until no block of `size` bytes, a power of 2, is free. */
export function leaveRoomOf(instance, size) {
    for (let piece = 2 ** 30; piece >= size;) {
        if (instance.exports.malloc(piece) === 0) piece /= 2;
    }
}

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
