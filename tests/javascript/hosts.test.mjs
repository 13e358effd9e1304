// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A host in JavaScript is asked, laid out and told what went wrong.

import assert from "node:assert/strict";
import test from "node:test";

import { HostError, LayoutError, PERSON_NOT_FOUND, Shown } from "../../bindings/javascript/olvane.mjs";
import { henry, olvane, TableHost } from "./module.mjs";

const hostOf = (changes) => Object.assign(new TableHost(henry), changes);

test("a childless couple without parents stands side by side", () => {
    const couple = new TableHost({ 1: [0, 0, [2], [], 0], 2: [0, 0, [1], [], 1] });
    const records = olvane.layout(couple, 1);
    const persons = records.filter((record) => record.kind === "person");
    assert.deepEqual(
        persons.map(({ id, y, hasHiddenRelatives, child }) => ({ id, y, hasHiddenRelatives, child })),
        [
            { id: 1, y: 0, hasHiddenRelatives: false, child: null },
            { id: 2, y: 0, hasHiddenRelatives: false, child: null },
        ],
    );
    assert.equal(persons[1].x - persons[0].x, 55 + 25);
});

test("records say what the text says", () => {
    const host = new TableHost(henry);
    const told = olvane
        .layout(host, 1)
        .map((record) => {
            const lines = record.segments.map(({ x1, y1, x2, y2 }) => `${x1},${y1},${x2},${y2}|`).join("");
            const flag = record.hasHiddenRelatives ? 1 : 0;
            const behind = record.kind === "person" ? "" : `:${record.kind === "missingFather" ? "M" : "F"}:${record.child}`;
            return `${record.id}:${record.x}:${record.y}:${flag}:${lines}${behind};`;
        })
        .join("");
    assert.equal(told, olvane.layoutText(host, 1));
    assert.match(told, /^1:27:0:0:82,40,107,40\|/);
});

test("an unknown parent is null, undefined or the constant", () => {
    const expected = olvane.layoutText(new TableHost(henry), 1);
    const host = new TableHost(henry);
    host.fatherOf = (person) => henry[person][0] || PERSON_NOT_FOUND;
    assert.equal(olvane.layoutText(host, 1), expected);
});

test("lists may be any iterable", () => {
    const expected = olvane.layoutText(new TableHost(henry), 1);
    const host = new TableHost(henry);
    host.childrenOf = function* (person) {
        yield* henry[person][3];
    };
    host.spousesOf = (person) => new Set(henry[person][2]);
    assert.equal(olvane.layoutText(host, 1), expected);
});

test("the pedigree has the columns that are asked for", () => {
    const host = new TableHost(henry);
    const columns = (generations) =>
        new Set(olvane.layout(host, 1, { view: "pedigree", generations }).map(({ x }) => x)).size;
    assert.equal(columns(2), columns(1) + 1);
});

test("options leave relatives out and sizes move boxes", () => {
    const siblings = new TableHost({
        1: [3, 0, [], [], 0],
        2: [3, 0, [], [], 1],
        3: [0, 0, [], [1, 2], 0],
    });
    const ids = (options) => olvane.layout(siblings, 1, options).map(({ id }) => id);
    assert.ok(ids({}).includes(2));
    assert.ok(!ids({ shown: Shown.all & ~Shown.siblings }).includes(2));
    const parent = (options) => olvane.layout(siblings, 1, options).find(({ id }) => id === 3);
    assert.equal(parent({}).y, -110);
    assert.equal(parent({ sizes: { nodeHeight: 100, vertPadding: 50 } }).y, -150);
});

test("what a host throws is the cause, and what came before is kept", () => {
    const thrown = new Error("the database is gone");
    let asked = 0;
    const host = hostOf({
        sexOf() {
            if (++asked > 1) throw thrown;
            return 0;
        },
    });
    assert.throws(
        () => olvane.layout(host, 1),
        (error) => {
            assert.ok(error instanceof HostError && error instanceof LayoutError && error instanceof Error);
            assert.equal(error.cause, thrown);
            assert.equal(error.status, "hostFailed");
            assert.equal(typeof error.text, "string");
            assert.ok(Array.isArray(error.records));
            return true;
        },
    );
    assert.match(olvane.layoutText(new TableHost(henry), 1), /^1:27:0:0:/, "the next request is unaffected");
});

for (const question of Object.getOwnPropertyNames(TableHost.prototype).filter((name) => name !== "constructor")) {
    test(`a failure of ${question} is told`, () => {
        const thrown = { not: "an Error" };
        const failing = hostOf({
            [question]() {
                throw thrown;
            },
        });
        try {
            olvane.layout(failing, 1);
        } catch (error) {
            assert.ok(error instanceof HostError);
            assert.equal(error.cause, thrown);
            return;
        }
        // Not every question is asked about every family; these two only where an order hangs on them.
        assert.ok(["isPreferredSpouse", "isDead", "dateOf"].includes(question));
    });
}

test("an id that is no whole number is refused", () => {
    for (const id of [1.5, NaN, "2", 2n, 2 ** 60, {}]) {
        assert.throws(() => olvane.layout(hostOf({ childrenOf: () => [id] }), 1), { name: "HostError" });
    }
    assert.throws(() => olvane.layout(hostOf({ childrenOf: () => null }), 1), { name: "HostError" });
});

test("a focus that is nobody is refused", () => {
    for (const focus of [0, -1, 2 ** 53, Infinity, NaN]) {
        assert.throws(() => olvane.layout(new TableHost(henry), focus), {
            name: "LayoutError",
            status: "invalidPerson",
        });
    }
});

test("options out of their range are refused", () => {
    const host = new TableHost(henry);
    assert.throws(() => olvane.layout(host, 1, { view: "fan" }), TypeError);
    assert.throws(() => olvane.layout(host, 1, { view: "pedigree", generations: 0 }), { status: "invalidArgument" });
    assert.throws(() => olvane.layout(host, 1, { view: "pedigree", generations: 1001 }), {
        status: "invalidArgument",
    });
    assert.throws(() => olvane.layout(host, 1, { sizes: { nodeWidth: Infinity } }), { status: "invalidArgument" });
});

test("a layout inside a layout is refused, and the outer one goes on", () => {
    const plain = olvane.layoutText(new TableHost(henry), 1);
    let inner = null;
    const host = hostOf({
        isDead() {
            return true;
        },
        sexOf(person) {
            try {
                olvane.layout(new TableHost(henry), 1);
            } catch (error) {
                inner = error.status;
            }
            return henry[person][4];
        },
    });
    assert.equal(olvane.layoutText(host, 1), plain);
    assert.equal(inner, "nestedCall");
});

test("a family of a thousand generations is laid out", () => {
    const table = {};
    for (let id = 1; id <= 1000; ++id) table[id] = [id < 1000 ? id + 1 : 0, 0, [], id > 1 ? [id - 1] : [], 0];
    const records = olvane.layout(new TableHost(table), 1, { view: "pedigree", generations: 1000 });
    assert.equal(records.filter(({ kind }) => kind === "person").length, 1000);
});
