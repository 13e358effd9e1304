// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A host is asked what the engine asks, word for word, and what it answers comes to the engine as it was said.

import assert from "node:assert/strict";
import { execFileSync } from "node:child_process";
import test from "node:test";

import { CaseHost, casesIn } from "./cases.mjs";
import { olvane, openInstance } from "./module.mjs";

function linesOfEngine(cases) {
    const files = cases.map(({ file }) => file);
    const printed = execFileSync(process.env.OLVANE_LAYOUT_CASE, ["--trace", ...files], { maxBuffer: 2 ** 28 });
    return printed
        .toString()
        .split(/^case .*\n/m)
        .slice(1);
}

function textOrWhatIsLeft(host, focus, options) {
    try {
        return olvane.layoutText(host, focus, options);
    } catch (error) {
        if (error.status === "layoutFailed" || error.status === "invalidPerson") return error.text;
        throw error;
    }
}

test("a host is asked the engine's questions, and gets the engine's text", () => {
    const cases = casesIn(process.env.OLVANE_GOLDEN);
    const expected = linesOfEngine(cases);
    assert.equal(expected.length, cases.length);
    cases.forEach(({ file, lines, focus, options }, i) => {
        const host = new CaseHost(lines);
        const text = textOrWhatIsLeft(host, focus, options);
        assert.equal([`text ${text}`, ...host.calls, ""].join("\n"), expected[i], file);
    });
    assert.ok(cases.length > 100);
});

// The module's imports, and its instance, whose exports may be changed.
async function openedModule() {
    const instantiate = WebAssembly.instantiate;
    let imports = null;
    WebAssembly.instantiate = (module, given) => instantiate(module, (imports = given));
    const instance = await openInstance();
    WebAssembly.instantiate = instantiate;
    return { instance, questions: imports.olvane };
}

const { instance, questions } = await openedModule();

/** The number that an answer leaves in the module's memory, where 77 lay before. */
function numberAfter(host, ask) {
    const pointer = instance.exports.malloc(4);
    instance.numbers(pointer, 1)[0] = 77;
    const { result, thrown } = instance.askingHost(host, () => ask(pointer));
    const number = instance.numbers(pointer, 1)[0];
    instance.exports.free(pointer);
    if (thrown !== null) throw thrown[0];
    assert.equal(result, 0);
    return number;
}

test("whether a spouse is preferred is said of the right person", () => {
    const host = { isPreferredSpouse: (person, spouse) => person === 1 && spouse === 2 };
    const preferred = (person, spouse) =>
        numberAfter(host, (pointer) => questions.is_preferred_spouse(person, spouse, pointer));
    assert.equal(preferred(1, 2), 1);
    assert.equal(preferred(2, 1), 0);
});

test("who is dead is said as it is", () => {
    const isDead = (answer) => numberAfter({ isDead: () => answer }, (pointer) => questions.is_dead(5, pointer));
    for (const yes of [true, 1, "yes", 2 ** 32]) assert.equal(isDead(yes), 1);
    for (const no of [false, 0, "", null, undefined]) assert.equal(isDead(no), 0);
});

test("every number but 0 is a woman's", () => {
    const sexOf = (answer) => numberAfter({ sexOf: () => answer }, (pointer) => questions.sex_of(5, pointer));
    for (const man of [0, -0]) assert.equal(sexOf(man), 0);
    for (const woman of [1, 2, -1, 2 ** 31, 2 ** 32]) assert.equal(sexOf(woman), 1);
});

test("an answer counts although the memory grew while it was found", () => {
    const isDead = () => {
        instance.exports.memory.grow(1);
        return true;
    };
    assert.equal(
        numberAfter({ isDead }, (pointer) => questions.is_dead(5, pointer)),
        1,
    );
});

test("dates come to the engine, and are asked for by their kind", () => {
    const { set_date: setDate } = instance.exports;
    const asked = [];
    const takeDate = (date, character) => asked.push(String.fromCodePoint(character)) && 0;
    instance.exports = { ...instance.exports, set_date: takeDate };
    const host = { dateOf: (person, isBirth) => (isBirth ? `born ${person}` : `met ${person}`) };
    instance.askingHost(host, () => questions.date_of(5, 1, 0));
    instance.askingHost(host, () => questions.date_of(6, 0, 0));
    for (const date of ["一八五〇年", "", null, "𝟏𝟖", undefined]) {
        instance.askingHost({ dateOf: () => date }, () => questions.date_of(7, 1, 0));
    }
    instance.exports = { ...instance.exports, set_date: setDate };
    // No more than the first character goes over, and nothing of an empty date.
    assert.deepEqual(asked, ["b", "m", "一", "𝟏"]);
});
