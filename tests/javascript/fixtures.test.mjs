// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The module gives what the libraries' own tests expect: names, years, kinship, remarks, texts, and members of archives.

import assert from "node:assert/strict";
import { readFile } from "node:fs/promises";
import { test } from "node:test";

import { DIRECTIONS, FACTS, PICTURE_VIEWS, Shown } from "../../bindings/javascript/olvane.mjs";
import { olvane } from "./module.mjs";

const bytesOf = (name) => readFile(new URL(`../fixtures/${name}`, import.meta.url));
const rowsOf = async (name) => JSON.parse(await bytesOf(name));
const LANGUAGES = ["en", "de", "es"];

const file = olvane.readGedcom(await bytesOf("persons.ged"), "persons.ged");
const persons = await rowsOf("persons.json");
const personOf = (xref) => file.persons.find((person) => person.xref === xref);

test("names and years are those of the rows", () => {
    for (const { xref, name, given, surname, surnameFirst = false, birth, death } of persons.persons) {
        const person = personOf(xref);
        assert.deepEqual(
            [person.name, person.given, person.surname, person.surnameFirst],
            [name, given, surname, surnameFirst],
        );
        assert.deepEqual([person.birth?.shown ?? "", person.death?.shown ?? ""], [birth, death]);
        const label = file.labelOfPerson(person.id);
        assert.deepEqual([label.birth, label.death], [birth, death]);
    }
});

test("a period is distinguished from an uncertain date", () => {
    for (const { date, mark, period } of persons.periods) {
        const text = `0 HEAD\n1 CHAR UTF-8\n0 @I1@ INDI\n1 OCCU Smith\n2 DATE ${date}\n0 TRLR\n`;
        const [fact] = olvane.readGedcom(new TextEncoder().encode(text)).factsOfPerson(1);
        assert.deepEqual([fact.date.mark, fact.date.period], [mark, period], date);
    }
});

test("dates, lives and places have the words of the rows", async () => {
    const { dates, lives, places } = await rowsOf("dates.json");
    const { texts } = olvane;
    const birthOf = (written) => {
        if (written === "") return null;
        const text = `0 HEAD\n1 CHAR UTF-8\n0 @I1@ INDI\n1 BIRT\n2 DATE ${written}\n0 TRLR\n`;
        return olvane.readGedcom(new TextEncoder().encode(text)).persons[0].birth;
    };
    for (const language of LANGUAGES) {
        for (const row of dates) assert.equal(texts.dateText(row.written, language), row[language]);
        for (const { birth, death, years } of lives)
            assert.equal(texts.yearsText(birthOf(birth), birthOf(death), language), years[language]);
    }
    for (const { written, shown } of places) assert.equal(texts.placeText(written), shown);
    assert.deepEqual(
        ["en", "de-AT", "es", "fr"].map((language) => texts.unnamedText(language)),
        ["Name not known", "Name unbekannt", "Nombre desconocido", "Name not known"],
    );
});

test("facts for a reader stand in the order of a life, all others as in the file", async () => {
    const { order } = await rowsOf("dates.json");
    const lines = order.facts.map(([tag, date]) => `1 ${tag}\n${date && `2 DATE ${date}\n`}`);
    const text = `0 HEAD\n1 CHAR UTF-8\n0 @I1@ INDI\n${lines.join("")}0 TRLR\n`;
    const file = olvane.readGedcom(new TextEncoder().encode(text));
    const listed = (facts) => facts.map(({ tag, date }) => [tag, date?.written ?? ""]);
    assert.deepEqual(listed(file.detailsOfPerson(1).facts), order.lived);
    assert.deepEqual(listed(file.factsOfPerson(1)), order.facts);
});

test("kinship has the words of the rows", () => {
    for (const row of persons.kinship) {
        const [from, to] = [personOf(row.from).id, personOf(row.to).id];
        for (const language of LANGUAGES) assert.equal(file.kinship(from, to, language).text, row[language]);
    }
});

test("remarks have the words of the rows", () => {
    for (const language of LANGUAGES) {
        assert.deepEqual(
            file.remarks(language).map(({ kind, text }) => [kind, text]),
            persons.remarks.map((row) => [row.kind, row[language]]),
        );
    }
});

test("texts are shortened, broken and read as in the rows", async () => {
    const { lines, broken, names, fromTheRight, fromTheLeft } = await rowsOf("texts.json");
    for (const { text, size, bold, width, line } of lines)
        assert.equal(olvane.texts.fitLine(text, size, width, bold), line, text);
    for (const { text, size, bold, width, most, ...fitted } of broken)
        assert.deepEqual(olvane.texts.fitLines(text, size, width, most, bold), fitted, text);
    for (const { width, height, size, lines: expected, ...name } of names)
        assert.deepEqual(olvane.texts.fitName(name, { width, height }), { size, lines: expected });
    for (const text of fromTheRight) assert.equal(olvane.texts.runsRightToLeft(text), true, text);
    for (const text of fromTheLeft) assert.equal(olvane.texts.runsRightToLeft(text), false, text);
});

test("a medium stands for the member of the row", async () => {
    for (const { file: name, member } of (await rowsOf("members.json")).rows)
        assert.equal(olvane.archiveMember(name), member, name);
});

test("what an option does not take is stated with its name and bounds", async () => {
    const host = { fatherOf: () => null };
    for (const { javascript, states } of (await rowsOf("refusals.json")).rows)
        assert.throws(
            () => olvane.picture(host, 1, javascript),
            ({ message }) =>
                Object.keys(javascript).every((name) => message.startsWith(`${name} is `)) &&
                states.every((text) => message.includes(text)),
        );
});

test("views, directions, facts and relatives have the names and numbers of the rows", async () => {
    const { views, directions, facts, relatives } = await rowsOf("views.json");
    assert.deepEqual(
        PICTURE_VIEWS,
        views.map(({ name }) => name),
    );
    assert.deepEqual(DIRECTIONS, directions);
    assert.deepEqual(FACTS, facts);
    assert.deepEqual(Shown, { ...relatives, all: 255 });
    const viewsOf = (option) => olvane.pictureOptions.find(({ name }) => name === option).views;
    for (const option of ["up", "down", "direction", "compact"])
        assert.deepEqual(
            viewsOf(option),
            views.filter(({ command }) => command.includes(option)).map(({ name }) => name),
            option,
        );
    assert.deepEqual(
        olvane.pictureOptions.find(({ name }) => name === "view").words,
        views.map(({ name }) => name),
    );
    assert.deepEqual(olvane.pictureOptions.find(({ name }) => name === "direction").words, directions);
});
