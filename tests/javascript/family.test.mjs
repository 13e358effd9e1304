// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A family handed over once: every form of rows, what is refused, edits against a plain model, and layouts.

import assert from "node:assert/strict";
import test from "node:test";

import { FamilyError, LayoutError, Olvane } from "../../bindings/javascript/olvane.mjs";
import { olvane, openInstance } from "./module.mjs";
import { PlainFamily, PlainHost } from "./plainFamily.mjs";

const rows = [
    { id: 1, sex: "m", birth: "1850", name: "Karl" },
    { id: 2, sex: "Female", birth: 1852, name: "Åsa", job: "smith" },
    { id: 3, father: 1, mother: 2n, sex: 0, name: null },
];

function refusal(given) {
    try {
        olvane.family(given);
    } catch (error) {
        assert.ok(error instanceof FamilyError, error);
        return error;
    }
    return assert.fail("nothing was refused");
}

function assertIsTheFamily(family) {
    assert.deepEqual(family.ids, [1, 2, 3]);
    assert.equal(family.size, 3);
    assert.deepEqual([family.person(3).father, family.person(3).mother], [1, 2]);
    assert.deepEqual(
        family.ids.map((id) => family.person(id).sex),
        ["male", "female", "male"],
    );
    assert.equal(family.person(2).birth, "1852");
    assert.deepEqual(family.person(1).children, [3]);
}

test("rows may be objects, of an array or made one after the other", () => {
    assertIsTheFamily(olvane.family({ persons: rows }));
    assertIsTheFamily(olvane.family({ persons: rows.values() }));
});

test("rows may be columns", () => {
    const persons = {
        id: new Int32Array([1, 2, 3]),
        father: new Float64Array([0, 0, 1]),
        mother: [null, undefined, 2],
        sex: new Uint8Array([0, 1, 0]),
        birth: ["1850", "1852", null],
    };
    assertIsTheFamily(olvane.family({ persons }));
    assertIsTheFamily(olvane.family({ persons: { ...persons, id: new BigInt64Array([1n, 2n, 3n]) } }));
    assertIsTheFamily(olvane.family({ persons: { ...persons, id: new Uint32Array([9, 1, 2, 3]).subarray(1) } }));
});

test("columns of persons that are no fields become names and labels", () => {
    const family = olvane.family({ persons: rows });
    assert.deepEqual(family.person(2).names, [{ kind: "full", text: "Åsa" }]);
    assert.deepEqual(family.person(2).fields, { job: "smith" });
    assert.deepEqual(family.person(3).names, []);
});

test("every list has rows of its own", () => {
    const family = olvane.family({
        persons: [{ id: 1 }, { id: 2 }, { id: 3 }],
        spouses: [
            { person: 1, spouse: 3, preferred: false },
            { person: 1, spouse: 2, preferred: true },
        ],
        children: [{ parent: 2, child: 1 }],
        families: [{ number: 8, partner1: 2, state: "divorced", marriagePlace: "Ulm" }],
        familyChildren: [{ family: 8, child: 3, kind: "adopted" }],
        names: [{ person: 3, kind: "nickname", text: "Kalle" }],
        fields: [{ person: 3, key: "note", text: "x" }],
    });
    assert.deepEqual(family.person(1).spouses, [3, 2]);
    assert.equal(family.person(1).preferred, 2);
    assert.deepEqual(family.person(2).children, [1]);
    assert.deepEqual(family.family(8), {
        number: 8,
        partner0: 0,
        partner1: 2,
        state: "divorced",
        marriage: "",
        marriageWritten: "",
        marriagePlace: "Ulm",
        children: [{ child: 3, kind: "adopted" }],
    });
    assert.deepEqual(family.person(3).names, [{ kind: "nickname", text: "Kalle" }]);
    assert.deepEqual(family.person(3).fields, { note: "x" });
});

test("ids that would be another person are refused with their row and field", () => {
    for (const id of [2 ** 32 + 4, 2 ** 53 + 2, 10 ** 40, 2n ** 64n + 4n, 0, -1, 2 ** 31]) {
        const error = refusal({ persons: [{ id: 1 }, { id }] });
        assert.deepEqual([error.table, error.row, error.field], ["persons", 1, "id"], error.message);
        assert.match(error.message, /whole number/);
    }
});

test("what is refused says where it stands", () => {
    const message = (given) => refusal(given).message;
    assert.equal(message({ persons: [{ id: "4" }] }), 'persons row 0, field id: "4" is not a whole number');
    assert.equal(
        message({ persons: [{ id: 1, father: 9 }] }),
        "persons row 0, field father: 9 is not the id of a person",
    );
    assert.match(message({ persons: [{ id: 1, sex: "q" }] }), /^persons row 0, field sex: "q" is none of male, /);
    assert.match(message({ persons: [{ id: 1 }, { id: 2, birth: "a\0b" }] }), /^persons row 1, field birth: /);
    assert.match(message({ persons: [{ id: 1, birth: {} }] }), /^persons row 0, field birth: .* is not a text$/);
    assert.match(message({ persons: rows, spouses: [{ person: 1, spouse: 2, kin: 3 }] }), /field kin/);
    assert.equal(
        message({ persons: { id: [1, 2], father: [0] } }),
        "persons, field father: the column has 1 rows, and id has 2",
    );
});

test("an edit that is refused changes nothing", () => {
    const family = olvane.family({ persons: rows });
    const attempts = [
        () => family.addPerson({ id: 3 }),
        () => family.addPerson({ id: 4, fathr: 1 }),
        () => family.setPerson({ id: 3, father: 9 }),
        () => family.setChildren(1, [2, 2]),
        () => family.setSpouses(1, [2], 3),
        () => family.setNames(1, [{ text: "a" }, { text: "\0" }]),
        () => family.setField(1, "", "x"),
        () => family.addFamily({ number: 1, partner0: 2 ** 32 + 1 }),
        () => family.removePerson(2 ** 32 + 1),
        () => family.removeFamily(1),
    ];
    for (const attempt of attempts) {
        const before = family.ids.map((id) => family.person(id));
        assert.throws(attempt, (error) => error instanceof FamilyError && error.row === null);
        assert.deepEqual(
            family.ids.map((id) => family.person(id)),
            before,
        );
    }
});

test("a focus who is not there is named", () => {
    const family = olvane.family({ persons: rows });
    for (const focus of [4, 2 ** 32 + 1, 0]) {
        assert.throws(
            () => family.layout(focus),
            (error) =>
                error instanceof LayoutError &&
                error.status === "invalidPerson" &&
                error.message === `layout of person ${focus}: the family has no person ${focus}`,
        );
    }
    assert.throws(() => family.person(4), RangeError);
});

test("records say what the text says, with and without options", () => {
    const family = olvane.family({ persons: rows });
    for (const options of [undefined, { view: "pedigree", generations: 3 }, { shown: 0 }, {}, undefined]) {
        const text = family
            .layout(3, options)
            .map((record) => {
                const lines = record.segments.map(({ x1, y1, x2, y2 }) => `${x1},${y1},${x2},${y2}|`).join("");
                const flag = record.hasHiddenRelatives ? 1 : 0;
                const behind =
                    record.kind === "person" ? "" : `:${record.kind === "missingFather" ? "M" : "F"}:${record.child}`;
                return `${record.id}:${record.x}:${record.y}:${flag}:${lines}${behind};`;
            })
            .join("");
        assert.equal(text, family.layoutText(3, options));
        assert.equal(text, olvane.layoutText(family, 3, options));
    }
});

// The same numbers on every machine: D. H. Lehmer's generator with the multiplier 48271.
class Dice {
    #state = 20031;
    below(most) {
        this.#state = (this.#state * 48271) % 2147483647;
        return this.#state % most;
    }
    pick(list) {
        return list[this.below(list.length)];
    }
    some(list) {
        const found = [];
        for (const one of list) if (found.length < 4 && this.below(6) === 0) found.push(one);
        return found;
    }
}

class RandomEdits {
    dice = new Dice();
    table = olvane.family();
    plain = new PlainFamily();

    edit() {
        const { dice } = this;
        const people = [...this.plain.persons.keys()];
        const kind = people.length < 4 ? 0 : dice.below(8);
        if (kind <= 1 && people.length < 30) return this.#putPerson("addPerson", this.#freeId(), people);
        if (kind <= 2) return this.#putPerson("setPerson", dice.pick(people), people);
        const id = dice.pick(people);
        if (kind === 3) return dice.below(2) === 0 ? this.#removePerson(id) : undefined;
        if (kind === 4) return this.#setLists(id, people);
        if (kind <= 6) return this.#editFamily(people);
        return this.#editTexts(id);
    }

    #freeId() {
        for (;;) {
            const id = this.dice.below(20) === 0 ? 2147483647 - this.dice.below(9) : 1 + this.dice.below(60);
            if (!this.plain.persons.has(id)) return id;
        }
    }

    #putPerson(edit, id, people) {
        const { dice } = this;
        const row = {
            id,
            father: dice.pick([0, ...people]),
            mother: dice.pick([0, ...people]),
            sex: dice.pick(["male", "female", "unknown"]),
            dead: dice.below(2) === 0,
            birth: dice.pick(["", "1850", "é".repeat(300)]),
            death: dice.pick(["", "1900-01-02"]),
        };
        this.table[edit](row);
        this.plain.putPerson(row);
    }

    #removePerson(id) {
        this.table.removePerson(id);
        this.plain.removePerson(id);
    }

    #setLists(id, people) {
        const spouses = this.dice.some(people);
        const preferred = this.dice.pick([0, ...spouses]);
        const children = this.dice.some(people);
        this.table.setSpouses(id, spouses, preferred);
        this.table.setChildren(id, children);
        Object.assign(this.plain.persons.get(id), { spouses, preferred, children });
    }

    #editFamily(people) {
        const { dice } = this;
        const number = 1 + dice.below(8);
        const isThere = this.plain.families.has(number);
        if (isThere && dice.below(3) === 0) {
            this.table.removeFamily(number);
            this.plain.removeFamily(number);
            return;
        }
        const [partner0, partner1] = [dice.pick([0, ...people]), dice.pick([0, ...people])];
        const state = dice.pick(["married", "divorced", "unmarried", "unknown"]);
        const children = dice.some(people).map((child) => ({ child, kind: dice.pick(["birth", "foster"]) }));
        this.table[isThere ? "setFamily" : "addFamily"]({ number, partner0, partner1, state, children });
        this.plain.putFamily(number, [partner0, partner1], state, children);
    }

    #editTexts(id) {
        const person = this.plain.persons.get(id);
        person.names = [{ kind: "full", text: this.dice.pick(["Karl", "Åsa", ""]) }];
        this.table.setNames(id, person.names);
        const [key, text] = [this.dice.pick(["job", "note"]), this.dice.pick(["", "smith", "x".repeat(5000)])];
        this.table.setField(id, key, text);
        if (text === "") delete person.fields[key];
        else person.fields[key] = text;
    }
}

function textOf(host, focus) {
    try {
        return olvane.layoutText(host, focus);
    } catch (error) {
        return `${error.status} ${error.text}`;
    }
}

function assertSame(table, plain) {
    assert.deepEqual([...table.ids].sort(), [...plain.persons.keys()].sort());
    const host = new PlainHost(plain);
    for (const [id, person] of plain.persons) {
        const { birthWritten, deathWritten, ...read } = table.person(id);
        assert.deepEqual([birthWritten, deathWritten], [person.birth, person.death]);
        assert.deepEqual(read, { ...person });
        assert.equal(textOf(table, id), textOf(host, id));
    }
    assert.deepEqual([...table.familyNumbers].sort(), [...plain.families.keys()].sort());
    for (const [number, { partners, state, children }] of plain.families) {
        const read = table.family(number);
        assert.deepEqual([[read.partner0, read.partner1], read.state, read.children], [partners, state, children]);
    }
}

test("random edits do what a plain model does, and copies stay as they were", () => {
    const run = new RandomEdits();
    const kept = [];
    for (let step = 0; step < 1500; ++step) {
        run.edit();
        if (step % 100 === 0) {
            assertSame(run.table, run.plain);
            kept.push([run.table.copy(), run.plain.copy()]);
        }
        if (step % 400 === 399) {
            const [table, plain] = run.dice.pick(kept);
            [run.table, run.plain] = [table.copy(), plain.copy()];
        }
    }
    for (const [table, plain] of kept) assertSame(table, plain);
});

test("a hundred thousand layouts leave no memory behind", async () => {
    const instance = await openInstance();
    const family = new Olvane(instance).family({ persons: rows });
    for (let i = 0; i < 1000; ++i) family.layoutText(1);
    const before = instance.exports.memory.buffer.byteLength;
    for (let i = 0; i < 50000; ++i) {
        family.layoutText(1);
        family.layout(1);
    }
    assert.equal(instance.exports.memory.buffer.byteLength, before);
});

test("a family that nobody holds is released, and so is one at the end of its block", async () => {
    const instance = await openInstance();
    const own = new Olvane(instance);
    const persons = { id: Int32Array.from({ length: 100000 }, (_, i) => i + 1) };
    own.family({ persons }).close();
    const before = instance.exports.memory.buffer.byteLength;
    for (let i = 0; i < 60; ++i) {
        own.family({ persons });
        globalThis.gc();
        await new Promise((resolve) => setTimeout(resolve));
    }
    for (let i = 0; i < 20; ++i) own.family({ persons })[Symbol.dispose]();
    assert.ok(instance.exports.memory.buffer.byteLength < before + 40 * 2 ** 20);
});

test("a closed family answers no more, and may be closed again", () => {
    const family = olvane.family({ persons: rows });
    family.close();
    family.close();
    assert.throws(() => family.layout(1), /has been closed/);
});

test("memory that runs out is an error, and the family stays as it was", async () => {
    const instance = await openInstance();
    const family = new Olvane(instance).family({ persons: rows });
    const { leaveRoomOf } = await import("./module.mjs");
    leaveRoomOf(instance, 1024);
    assert.throws(() => family.setField(1, "note", "x".repeat(200000)), RangeError);
    assert.deepEqual(family.ids, [1, 2, 3]);
    assert.equal(family.person(3).father, 1);
});

test("a family is written as a GEDCOM file, which says the same", () => {
    const family = olvane.family({ persons: rows });
    const file = olvane.readGedcom(new TextEncoder().encode(family.gedcom()), "own.ged");
    assert.deepEqual(
        file.persons.map(({ xref, father, mother, birth }) => [xref, father, mother, birth?.written ?? ""]),
        [
            ["1", 0, 0, "1850"],
            ["2", 0, 0, "1852"],
            ["3", 1, 2, ""],
        ],
    );
    assert.equal(file.persons[1].name, "\u00c5sa");
    assert.deepEqual(
        file.factsOfPerson(2).map(({ tag, value }) => [tag, value]),
        [
            ["BIRT", ""],
            ["FACT", "smith"],
        ],
    );
    file.close();
});

test("a family announces each change, and none that is refused", () => {
    const family = olvane.family({ persons: rows });
    let changes = 0;
    family.addEventListener("change", () => ++changes);
    family.setField(1, "job", "baker");
    family.removePerson(3);
    assert.equal(changes, 2);
    assert.throws(() => family.removePerson(3), FamilyError);
    assert.equal(changes, 2);
    assert.equal(family.copy().size, 2);
});
