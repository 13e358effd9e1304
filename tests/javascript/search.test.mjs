// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The queries that the library's own tests run, over a table and over a file of the same persons.

import assert from "node:assert/strict";
import { readFile } from "node:fs/promises";
import { test } from "node:test";

import { olvane } from "./module.mjs";

const fixture = JSON.parse(await readFile(new URL("../fixtures/search.json", import.meta.url)));

function tableOf(persons) {
    const names = persons.flatMap(({ id, names }) => names.map(([kind, text]) => ({ person: id, kind, text })));
    const fields = persons.flatMap(({ id, xref, fields = [] }) =>
        [["xref", xref], ...fields].map(([key, text]) => ({ person: id, key, text })),
    );
    const spouses = persons.flatMap(({ id, spouses = [] }) => spouses.map((spouse) => ({ person: id, spouse })));
    const rows = persons.map(({ id, sex, birth, birthWritten, death }) => ({
        id,
        sex,
        birth,
        birthWritten: birthWritten ?? birth,
        death,
    }));
    return olvane.family({ persons: rows, names, fields, spouses });
}

function whyOf({ reasons }) {
    return reasons.map(({ foundIn, fit, word }) => `${foundIn} ${fit} ${word}`).join(", ");
}

for (const { text, found, why = [] } of fixture.queries) {
    test(`a table is searched for "${text}"`, () => {
        const hits = tableOf(fixture.persons).search(text);
        assert.deepEqual(
            hits.map(({ person }) => person),
            found,
        );
        assert.deepEqual(hits.slice(0, why.length).map(whyOf), why.slice(0, hits.length));
    });
}

test("an edit is found at once, and what it removed no longer", () => {
    const family = tableOf(fixture.persons);
    assert.equal(family.search("hans").length, 1);
    family.setNames(7, [{ kind: "full", text: "Heinz Grüber" }]);
    assert.equal(family.search("hans").length, 0);
    assert.deepEqual(family.search("heinz")[0].person, 7);
});

const kFile = `0 HEAD
0 @I1@ INDI
1 NAME Charles Robert /Darwin/
1 SEX M
1 BIRT
2 DATE 12 FEB 1809
2 PLAC Shrewsbury, Shropshire, England
1 OCCU Naturalist
1 RESI
2 DATE 1842
2 PLAC Downe, Kent, England
1 FAMS @F1@
0 @I2@ INDI
1 NAME Emma /Wedgwood/
2 NICK Emmy
1 SEX F
1 TITL Mrs
1 FAMS @F1@
0 @I3@ INDI
1 NAME Ellen /Smith/
1 NAME Ellen /O'Hara/
2 TYPE MARRIED
1 SEX F
0 @F1@ FAM
1 HUSB @I1@
1 WIFE @I2@
1 MARR
2 DATE 29 JAN 1839
2 PLAC Maer, Staffordshire
0 TRLR
`;

test("a hit says what stands in the record where each word was found", () => {
    const file = olvane.readGedcom(new TextEncoder().encode(kFile));
    const why = (text) =>
        file.search(text).map(({ person, reasons }) => [person, ...reasons.map((r) => [r.foundIn, r.text, r.label])]);
    assert.deepEqual(why("charles"), [[1, ["name", "Charles Robert Darwin", ""]]]);
    assert.deepEqual(why("emma darwin"), [[2, ["name", "Emma Wedgwood", ""], ["marriedName", "Darwin", ""]]]);
    assert.deepEqual(why("emmy"), [[2, ["nickname", "Emmy", ""]]]);
    assert.deepEqual(why("mrs"), [[2, ["title", "Mrs", "TITL"]]]);
    assert.deepEqual(why("hara"), [[3, ["marriedName", "O'Hara", ""]]]);
    assert.deepEqual(why("1800-1810"), [[1, ["birth", "12 FEB 1809", "BIRT"]]]);
    assert.deepEqual(why("downe"), [[1, ["place", "Downe, Kent, England", "RESI"]]]);
    assert.deepEqual(why("maer"), [
        [1, ["place", "Maer, Staffordshire", "MARR"]],
        [2, ["place", "Maer, Staffordshire", "MARR"]],
    ]);
    assert.deepEqual(why("1842"), [[1, ["other", "1842", "RESI"]]]);
    assert.deepEqual(why("naturalist"), [[1, ["other", "Naturalist", "OCCU"]]]);
    assert.deepEqual(why("naturlist"), [[1, ["other", "Naturalist", "OCCU"]]]);
    assert.deepEqual(why("@I3@"), [[3, ["identifier", "", ""]]]);
});

test("a hit says which word of the record was meant, as it is written there", () => {
    const family = tableOf(fixture.persons);
    const written = (text) => family.search(text)[0].reasons.map((reason) => reason.written);
    assert.deepEqual(written("obrien"), ["O'Brien"]);
    assert.deepEqual(written("brien"), ["Brien"]);
    assert.deepEqual(written("lukasinsk nala"), ["Łukasińska", "Ŋala"]);
    assert.deepEqual(written("thordurr"), ["Þórður"]);
    assert.deepEqual(written("1822"), ["1819-1825"]);
});

test("a limit is kept, and nothing typed is nobody", () => {
    const file = olvane.readGedcom(new TextEncoder().encode(kFile));
    assert.equal(file.search("e", 1).length, 1);
    assert.equal(file.search("e", 0).length, 0);
    assert.equal(file.search("e", -3).length, 0);
    assert.equal(file.search("").length, 0);
    assert.equal(file.search("\u0000").length, 0);
});

test("an index is made a little at a time, and a search does what is left of it", () => {
    const persons = Array.from({ length: 120 }, (_, i) => `0 @I${i + 1}@ INDI\n1 NAME Emma${i} /Darwin/\n`);
    const bytes = new TextEncoder().encode(`0 HEAD\n1 GEDC\n2 VERS 7.0\n${persons.join("")}0 TRLR\n`);
    const slowly = olvane.readGedcom(bytes);
    assert.equal(slowly.prepareSearch(0), false);
    assert.equal(slowly.prepareSearch(0), false);
    assert.equal(slowly.prepareSearch(0), true);
    assert.equal(slowly.prepareSearch(0), true);
    const begun = olvane.readGedcom(bytes);
    assert.equal(begun.prepareSearch(0), false);
    const whole = olvane.readGedcom(bytes);
    assert.equal(whole.prepareSearch(), true);
    for (const text of ["darwin", "emma119", "mma11", "emmma7", "I120", "nobody"]) {
        const expected = olvane.readGedcom(bytes).search(text);
        for (const file of [slowly, begun, whole]) assert.deepEqual(file.search(text), expected, text);
    }
    assert.equal(begun.search("darwin").length, 120);
    whole.close();
    assert.throws(() => whole.prepareSearch(), /closed/);
});

test("words are folded outside of a search as in it", () => {
    const { texts } = olvane;
    const written = ["  Łukasz O’Brien-STRASSE, Straße é", "", "1819", " ,.! ", "two\nlines"];
    const folded = ["lukasz obrien strasse strasse e", "", "1819", "", "two lines"];
    assert.deepEqual(texts.foldedWords(written), folded);
    assert.deepEqual(texts.foldedWords([""]), [""]);
    assert.deepEqual(texts.foldedWords([]), []);
});
