// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

import assert from "node:assert/strict";
import { test } from "node:test";

import { nearFirst } from "../../examples/javascript/near_first.mjs";
import { olvane } from "./module.mjs";

// Twelve generations of couples with two children each, one of whom marries: 3 * n + 1 and so on.
function everybody() {
    const rows = new Map();
    const row = (id) => rows.get(id) ?? rows.set(id, { id, spouses: [], children: [] }).get(id);
    for (let g = 0; g < 12; ++g) {
        const [heir, partner, heirNext, other] = [3 * g + 1, 3 * g + 2, 3 * g + 4, 3 * g + 3];
        row(heir).spouses.push(partner);
        row(partner).spouses.push(heir);
        for (const child of [heirNext, other]) {
            Object.assign(row(child), { father: heir, mother: partner });
            row(heir).children.push(child);
            row(partner).children.push(child);
        }
    }
    return rows;
}

test("aFamilyBehindANetworkComesInRings", async () => {
    const rows = everybody();
    const batches = [];
    const ask = async (ids) => {
        batches.push(ids);
        return ids.map((id) => rows.get(id));
    };
    const shown = [];
    const focus = 19;
    const people = await nearFirst(olvane, ask, focus, (boxes) => shown.push(boxes), 6);

    assert.equal(batches.length, 6);
    assert.deepEqual(batches[0], [focus]);
    assert.equal(new Set(batches.flat()).size, batches.flat().length, "nobody is asked for twice");
    assert.ok(people.size < rows.size, "the farthest are never asked for");
    const persons = (boxes) => boxes.filter(({ kind }) => kind === "person").length;
    assert.equal(persons(shown[0]), 1);
    assert.ok(persons(shown[1]) > 1);

    const whole = [...rows.values()];
    const family = olvane.family({
        persons: whole.map(({ id, father, mother }) => ({ id, father, mother })),
        spouses: whole.flatMap(({ id, spouses }) => spouses.map((spouse) => ({ person: id, spouse }))),
        children: whole.flatMap(({ id, children }) => children.map((child) => ({ parent: id, child }))),
    });
    assert.deepEqual(shown.at(-1), family.layout(focus), "the last picture is that of the whole family");
    family.close();
});

test("whoEndsTheRingsEarlyAsksNoMore", async () => {
    const rows = new Map([[1, { id: 1, father: 2, mother: null, spouses: [], children: [] }]]);
    let rounds = 0;
    await nearFirst(
        olvane,
        async (ids) => ids.filter((id) => rows.has(id)).map((id) => rows.get(id)),
        1,
        () => ++rounds,
    );
    assert.equal(rounds, 2, "the father is asked for once, and does not come");
});
