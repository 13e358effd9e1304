// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A host in JavaScript is asked, laid out and receives what went wrong.

import assert from "node:assert/strict";
import test from "node:test";

import { runLayout } from "../../bindings/javascript/layout.mjs";
import { HostError, LayoutError, Olvane, PERSON_NOT_FOUND, Shown } from "../../bindings/javascript/olvane.mjs";
import { henry, leaveRoomOf, olvane, openInstance, TableHost } from "./module.mjs";

const SIZES = {
    nodeWidth: undefined,
    nodeHeight: undefined,
    horzPadding: undefined,
    vertPadding: undefined,
    spouseLineStep: undefined,
    lineInset: undefined,
};

const hostOf = (changes) => Object.assign(new TableHost(henry), changes);

// The layout ends with a HostError whose cause is a TypeError with these words.
function assertAnswerIsRefused(changes, words) {
    assert.throws(
        () => olvane.layout(hostOf(changes), 1),
        (error) => error instanceof HostError && error.cause instanceof TypeError && words.test(error.cause.message),
    );
}

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
    const text = olvane
        .layout(host, 1)
        .map((record) => {
            const lines = record.segments.map(({ x1, y1, x2, y2 }) => `${x1},${y1},${x2},${y2}|`).join("");
            const flag = record.hasHiddenRelatives ? 1 : 0;
            const behind =
                record.kind === "person" ? "" : `:${record.kind === "missingFather" ? "M" : "F"}:${record.child}`;
            return `${record.id}:${record.x}:${record.y}:${flag}:${lines}${behind};`;
        })
        .join("");
    assert.equal(text, olvane.layoutText(host, 1));
    assert.match(text, /^1:27:0:0:82,40,107,40\|/);
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
    test(`a failure of ${question} is reported`, () => {
        const thrown = { not: "an Error" };
        const failing = hostOf({
            [question]() {
                throw thrown;
            },
        });
        assert.throws(
            () => olvane.layout(failing, 1),
            (error) => error instanceof HostError && error.cause === thrown,
        );
    });
}

test("an answered id that is not 1 to 2147483647 is refused by its value", () => {
    const refusals = [
        [1.5, "RangeError", "1.5"],
        [NaN, "RangeError", "NaN"],
        [0, "RangeError", "0"],
        [-5, "RangeError", "-5"],
        [2 ** 31, "RangeError", "2147483648"],
        [2 ** 32 + 4, "RangeError", "4294967300"],
        [2 ** 53 + 2, "RangeError", "9007199254740994"],
        ["2", "TypeError", '"2"'],
        [2n, "TypeError", "2n"],
        [10n ** 40n, "TypeError", `1${"0".repeat(40)}n`],
        [2n ** 64n + 4n, "TypeError", "18446744073709551620n"],
        [Promise.resolve(2), "TypeError", "a promise"],
    ];
    for (const [id, name, shown] of refusals) {
        for (const answers of [{ childrenOf: () => [id] }, { spousesOf: () => [id] }, { fatherOf: () => id }]) {
            assert.throws(
                () => olvane.layout(hostOf(answers), 1),
                (error) =>
                    error instanceof HostError &&
                    error.cause.name === name &&
                    error.cause.message === `a host answered ${shown} where an id is a whole number of 1 to 2147483647`,
            );
        }
    }
    assert.throws(() => olvane.layout(hostOf({ childrenOf: () => null }), 1), { name: "HostError" });
});

test("a focus that is nobody is refused", () => {
    for (const focus of [0, -1, 1.5, 2 ** 31, 2 ** 32 + 1, 2 ** 53, Infinity, NaN]) {
        assert.throws(() => olvane.layout(new TableHost(henry), focus), {
            name: "LayoutError",
            status: "invalidPerson",
            message: `layout of person ${focus}: The id of the focus is not that of a person: ids are 1 to 2147483647.`,
        });
    }
});

test("a focus that is no number is refused, and the next request is answered", () => {
    const host = new TableHost(henry);
    const plain = olvane.layoutText(host, 1);
    for (const focus of [1n, Symbol("1"), "1", null, undefined, {}]) {
        const message = /^the focus is .*, and takes a number$/;
        assert.throws(() => olvane.layout(host, focus), { name: "TypeError", message });
        assert.equal(olvane.layoutText(host, 1), plain);
    }
});

test("a sex that is no whole number is refused", () => {
    for (const sex of ["F", "1", null, undefined, NaN, 0.5, 1n, true, Promise.resolve(1)]) {
        assertAnswerIsRefused({ sexOf: () => sex }, /where a sex is a whole number/);
    }
});

test("a promise is no answer", () => {
    for (const question of Object.getOwnPropertyNames(TableHost.prototype).filter((name) => name !== "constructor")) {
        assertAnswerIsRefused({ [question]: () => Promise.resolve(1) }, /promise|iterable/i);
    }
});

test("a date that is no string is refused", () => {
    for (const date of [1850, new Date(0), {}, ["1850"]]) {
        assertAnswerIsRefused({ dateOf: () => date }, /where a date is a string/);
    }
    for (const unknown of [null, undefined]) {
        const text = olvane.layoutText(hostOf({ dateOf: () => unknown }), 1);
        assert.equal(text, olvane.layoutText(new TableHost(henry), 1));
    }
});

test("options out of their range are refused", () => {
    const host = new TableHost(henry);
    const ranges = [
        ["generations", [0, -1, 1001, 2.9, 2 ** 32 + 3, NaN, Infinity], "a whole number of 1 to 1000"],
        ["flagDepth", [-1, 0.5, 2 ** 31, 2 ** 32], "a whole number of 0 to 2147483647"],
        ["shown", [-1, ~Shown.siblings, 256, 2 ** 32, 0.5, NaN], "a whole number of 0 to 255"],
    ];
    for (const [name, values, takes] of ranges) {
        for (const value of values) {
            const message = `${name} is ${value}, and takes ${takes}`;
            assert.throws(() => olvane.layout(host, 1, { [name]: value }), { name: "RangeError", message });
        }
    }
    for (const size of Object.keys(SIZES)) {
        for (const value of [Infinity, -Infinity, NaN, 1e39]) {
            const message = `sizes.${size} is ${value}, and takes a finite number of single precision`;
            assert.throws(() => olvane.layout(host, 1, { sizes: { [size]: value } }), { name: "RangeError", message });
        }
    }
});

test("options at the ends of their ranges are taken", () => {
    const host = new TableHost(henry);
    for (const options of [
        { shown: 0, flagDepth: 0, generations: 1 },
        { shown: Shown.all, flagDepth: 2 ** 31 - 1, generations: 1000 },
    ]) {
        assert.ok(olvane.layout(host, 1, options).length > 0);
    }
    assert.equal(olvane.layout(host, 3, { view: "pedigree", flagDepth: 0, generations: 1 }).length, 1);
});

test("options of another type are refused by their names", () => {
    const host = new TableHost(henry);
    const refused = (options, message) =>
        assert.throws(() => olvane.layout(host, 1, options), { name: "TypeError", message }, message);
    refused(null, "options is null, and takes an object");
    refused("pedigree", 'options is "pedigree", and takes an object');
    refused({ view: "fan" }, 'there is no view "fan", but "family" and "pedigree"');
    refused({ view: null }, 'there is no view null, but "family" and "pedigree"');
    refused({ view: 1n }, 'there is no view 1n, but "family" and "pedigree"');
    refused({ shown: "x" }, 'shown is "x", and takes a number');
    refused({ shown: null }, "shown is null, and takes a number");
    refused({ generations: 5n }, "generations is 5n, and takes a number");
    refused({ sizes: null }, "sizes is null, and takes an object");
    refused({ sizes: { nodeWidth: "55" } }, 'sizes.nodeWidth is "55", and takes a number');
    refused({ sizes: { width: 55 } }, `there is no size width, but ${Object.keys(SIZES).join(", ")}`);
    const known = "there is no option %, but view, sizes, shown, generations, flagDepth";
    refused({ generation: 3 }, known.replace("%", "generation"));
    refused({ nodeWidth: 105 }, `${known.replace("%", "nodeWidth")}; nodeWidth is one of the sizes`);
});

test("an option that is undefined is as if it were not given", () => {
    const host = new TableHost(henry);
    const options = { view: undefined, shown: undefined, generations: undefined, flagDepth: undefined, sizes: SIZES };
    assert.equal(olvane.layoutText(host, 1, options), olvane.layoutText(host, 1));
    assert.equal(olvane.layoutText(host, 1, { sizes: undefined }), olvane.layoutText(host, 1));
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

test("whatever is asked of the module inside a layout or a picture is refused by its person", () => {
    const table = olvane.family({ persons: [{ id: 1 }] });
    const file = olvane.readGedcom(new TextEncoder().encode("0 HEAD\n0 @I1@ INDI\n1 SEX M\n0 TRLR\n"));
    const asks = [
        ["layout", () => olvane.layout(new TableHost(henry), 1)],
        ["picture", () => olvane.picture(new TableHost(henry), 1, { view: "near" })],
        ["layout", () => table.layoutText(1)],
        ["picture", () => table.picture(1, { view: "near" })],
        ["layout", () => file.layoutText(1)],
        ["picture", () => file.picture(1, { view: "near" })],
        ["picture", () => file.svg(1)],
    ];
    for (const [what, ask] of asks) {
        for (const outer of [olvane.layout, olvane.picture].map((call) => call.bind(olvane))) {
            const host = hostOf({ sexOf: ask });
            assert.throws(
                () => outer(host, 1),
                ({ cause }) => cause.status === "nestedCall" && cause.message.startsWith(`${what} of person 1: `),
            );
        }
        ask();
    }
    file.close();
});

test("a family of a thousand generations is laid out", () => {
    const table = {};
    for (let id = 1; id <= 1000; ++id) table[id] = [id < 1000 ? id + 1 : 0, 0, [], id > 1 ? [id - 1] : [], 0];
    const records = olvane.layout(new TableHost(table), 1, { view: "pedigree", generations: 1000 });
    assert.equal(records.filter(({ kind }) => kind === "person").length, 1000);
});

test("what finds no room in the module's memory is no failure of the host", async () => {
    const instance = await openInstance();
    leaveRoomOf(instance, 2 ** 20);
    const full = new Olvane(instance);
    const plain = olvane.layoutText(new TableHost(henry), 1);
    const endless = {
        *[Symbol.iterator]() {
            for (;;) yield 5;
        },
    };
    for (const changes of [{ spousesOf: () => endless }, { childrenOf: () => endless }]) {
        assert.throws(() => full.layout(hostOf(changes), 1), {
            name: "LayoutError",
            status: "outOfMemory",
            message: "layout of person 1: There is not enough memory.",
        });
        assert.equal(full.layoutText(new TableHost(henry), 1), plain, "the next request is unaffected");
    }
    // Of a date no more than its first character goes over, so a long one takes no memory.
    const dateOf = () => "1850".repeat(1e6);
    assert.equal(full.layoutText(hostOf({ dateOf }), 1), plain);
});

test("a module that broke off answers no more", async () => {
    const instance = await openInstance();
    const cause = new RangeError("Maximum call stack size exceeded");
    const breakOff = () => {
        throw cause;
    };
    const message = "the module broke off in a layout; load it again";
    assert.throws(() => runLayout(instance, new TableHost(henry), 1, {}, breakOff), { message, cause });
    assert.throws(() => new Olvane(instance).layout(new TableHost(henry), 1), { message, cause });
});

test("a failure names the question, the person and the cause", () => {
    const failing = (changes) => {
        try {
            olvane.layout(hostOf(changes), 1);
        } catch (error) {
            assert.ok(error instanceof HostError);
            return error.message;
        }
        return assert.fail("nothing failed");
    };
    const raise = () => {
        throw new Error("no row");
    };
    assert.equal(failing({ sexOf: raise }), "sexOf(1): Error: no row");
    assert.equal(failing({ isPreferredSpouse: raise }), "isPreferredSpouse(1, 2): Error: no row");
    assert.match(failing({ dateOf: raise }), /^dateOf\(\d, (true|false)\): Error: no row$/);
    assert.match(failing({ fatherOf: () => "4" }), /^fatherOf\(\d\): TypeError: .* answered "4" where /);
    assert.match(
        failing({ fatherOf: () => 2 ** 32 + 4 }),
        /^fatherOf\(\d\): RangeError: .* answered 4294967300 where /,
    );
    assert.match(failing({ spousesOf: async () => [] }), /^spousesOf\(\d\): TypeError: .*promise/);
    assert.match(failing({ spousesOf: () => null }), /^spousesOf\(\d\): TypeError: .* answered null where a list/);
});

test("an endless list ends at a limit", () => {
    const spousesOf = function* () {
        for (;;) yield 2;
    };
    assert.throws(
        () => olvane.layout(hostOf({ spousesOf }), 1),
        (error) => error.message === "spousesOf(1): RangeError: a host answered more than 1000000 persons in one list",
    );
});
