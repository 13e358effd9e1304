// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

import assert from "node:assert/strict";
import { readFile } from "node:fs/promises";
import { test } from "node:test";

import { olvane } from "./module.mjs";

const darwins = olvane.readGedcom(await readFile(new URL("../../samples/darwin-wedgwood.ged", import.meta.url)));
const idOf = (xref) => darwins.persons.find((person) => person.xref === xref).id;
const [charles, emma] = [idOf("I1"), idOf("I2")];

test("two persons are related by every way, in three languages", () => {
    const { text, ways } = darwins.kinship(charles, emma);
    assert.equal(text, "wife and first cousin");
    assert.equal(darwins.kinship(charles, emma, "de-AT").text, "Ehefrau und Cousine ersten Grades");
    assert.equal(darwins.kinship(charles, emma, "es").text, "esposa y prima hermana");
    assert.equal(darwins.kinship(charles, emma, "fr").text, text, "English where there is no such language");
    assert.deepEqual(
        ways.map(({ sort, text: words, persons }) => [sort, words, persons.length]),
        [
            ["blood", "first cousin", 5],
            ["marriage", "wife", 2],
        ],
    );
    for (const { persons } of ways) {
        assert.equal(persons[0], charles);
        assert.equal(persons.at(-1), emma);
    }
});

test("the words of many persons are those of each, but for how many ways there are", () => {
    const persons = darwins.persons.map(({ id }) => id);
    const words = darwins.kinshipWords(charles, persons, "en");
    assert.equal(words.length, persons.length);
    persons.forEach((person, i) => {
        const whole = darwins.kinship(charles, person).text;
        assert.equal(words[i].text, whole.replaceAll(/; related in \d+ ways/g, ""), `person ${person}`);
        assert.equal(words[i].short === "", whole === "");
        if (whole === "") assert.deepEqual(words[i].shorter, []);
    });
    assert.deepEqual([words[emma - 1].short, words[emma - 1].shorter], ["wife", []]);
    assert.ok(words.some(({ shorter }) => shorter.includes("kin, 5th degree")));
    assert.deepEqual(darwins.kinshipWords(charles, []), []);
});

test("somebody who is not in the file is refused", () => {
    assert.throws(() => darwins.kinship(charles, 100000), RangeError);
    assert.throws(() => darwins.kinshipWords(0, [1]), RangeError);
    assert.throws(() => darwins.kinshipWords(1, [1, 1.5]), RangeError);
});
