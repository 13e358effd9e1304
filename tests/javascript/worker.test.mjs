// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A file that a worker reads is the file as it is read here. The worker is one of this thread: what it is sent is copied or
// handed over as between threads.

import assert from "node:assert/strict";
import { test } from "node:test";
import { serveReading } from "../../bindings/javascript/reading.mjs";
import { olvane } from "./module.mjs";

// More persons than go over at once, with everything that a row can have.
function gedcom() {
    const lines = [
        "0 HEAD",
        "1 CHAR UTF-8",
        "0 @I0@ INDI",
        `1 NAME ${"Endless ".repeat(200)}/Name/`,
        '1 NAME A\u0001d /\\"/',
    ];
    lines.push("1 BIRT", "2 DATE FROM 1850 TO 1860", "1 FAMC @F0@", "2 PEDI adopted", "1 FAMC @F9@", "2 PEDI birth");
    for (let i = 1; i < 9000; ++i) {
        lines.push(
            `0 @I${i}@ INDI`,
            `1 NAME Zoë${i} /Łuk/`,
            `1 SEX ${i % 2 ? "M" : "F"}`,
            "1 BIRT",
            `2 DATE ABT ${1100 + (i % 800)}`,
        );
        lines.push(`1 FAMS @F${i >> 1}@`, `1 FAMC @F${i >> 2}@`);
    }
    for (let i = 0; i < 4500; ++i)
        lines.push(
            `0 @F${i}@ FAM`,
            `1 HUSB @I${2 * i + 1}@`,
            `1 WIFE @I${2 * i}@`,
            "1 MARR",
            "2 DATE 1850",
            `1 CHIL @I${4 * i}@`,
        );
    return new TextEncoder().encode(lines.join("\n"));
}

function workerOfThisThread() {
    const scope = { close() {} };
    const worker = { terminate() {}, postMessage: (data) => scope.onmessage({ data: structuredClone(data) }) };
    scope.postMessage = (data, transfer = []) => worker.onmessage({ data: structuredClone(data, { transfer }) });
    serveReading(scope);
    return worker;
}

test("what a worker reads is what is read here: persons, families, remarks and pictures", async () => {
    const bytes = gedcom();
    const here = olvane.readGedcom(bytes, "here.ged");
    const parts = [];
    const there = await olvane.readGedcomIn(workerOfThisThread(), bytes, "there.ged", {
        onProgress: (part) => parts.push(part),
    });
    assert.equal(there.persons.length, 9000);
    assert.deepEqual(there.persons, here.persons);
    assert.deepEqual(there.families, here.families);
    assert.deepEqual(there.diagnostics, here.diagnostics);
    assert.equal(there.encoding, here.encoding);
    assert.deepEqual(there.picture(500, { view: "hourglass" }), here.picture(500, { view: "hourglass" }));
    assert.deepEqual(there.search("zoe4711"), here.search("zoe4711"));
    assert.ok(parts.length > 1 && parts.at(-1) > 0.9 && parts.at(-1) <= 1, parts.join());
});

test("rows of a file are as they are written in it", () => {
    const { persons, families } = olvane.readGedcom(gedcom(), "rows.ged");
    const [first, second] = persons;
    assert.deepEqual(first.names, [`${"Endless ".repeat(200)}Name`, 'Ad \\"']);
    assert.ok(first.shownName.length < first.name.length);
    assert.equal(second.shownName, "Zoë1 Łuk");
    assert.deepEqual([first.birth.written, first.birth.period], ["FROM 1850 TO 1860", true]);
    assert.deepEqual(first.parentFamilies, [
        { family: 1, pedigree: "adopted" },
        { family: 10, pedigree: "birth" },
    ]);
    assert.deepEqual([second.sex, second.birth.mark, second.birth.year, second.death], ["male", "about", 1101, null]);
    assert.deepEqual([families[0].wife, families[0].husband, families[0].marriage.year], [1, 2, 1850]);
    assert.deepEqual(
        persons.map(({ id }) => id),
        Array.from({ length: 9000 }, (_, i) => i + 1),
    );
});
