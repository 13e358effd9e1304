// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// GEDCOM files in JavaScript.

import assert from "node:assert/strict";
import { readFile } from "node:fs/promises";
import test from "node:test";

import { GedcomError, Olvane } from "../../bindings/javascript/olvane.mjs";
import { leaveRoomOf, olvane, openInstance } from "./module.mjs";

const bytesOf = (text) => new TextEncoder().encode(text);
const samples = new URL("../../samples/", import.meta.url);

const couple = `0 HEAD
1 GEDC
2 VERS 5.5.1
1 CHAR UTF-8
0 @I1@ INDI
1 NAME Johann /"Grüber"\\
2 NICK Hans
1 NAME /Li/ Wei
1 SEX M
1 BIRT
2 DATE ABT 1819
2 PLAC Bern
1 OCCU Baker
1 FAMS @F1@
0 @I2@ INDI
1 NAME Anna
1 SEX F
1 DEAT Y
1 FAMS @F1@
0 @I3@ INDI
1 FAMC @F1@
2 PEDI adopted
0 @F1@ FAM
1 HUSB @I1@
1 WIFE @I2@
1 CHIL @I3@
1 MARR
2 DATE BET 1840 AND 1842
1 DIV Y
0 TRLR
`;

test("persons, families and facts are given as the file has them", () => {
    const file = olvane.readGedcom(bytesOf(couple), "couple.ged");
    assert.deepEqual(
        { name: file.name, encoding: file.encoding, version: file.version, diagnostics: file.diagnostics },
        { name: "couple.ged", encoding: "UTF-8", version: "5.5.1", diagnostics: [] },
    );
    assert.deepEqual(file.persons[0], {
        id: 1,
        xref: "I1",
        name: 'Johann "Grüber"\\',
        given: "Johann",
        surname: '"Grüber"\\',
        names: ['Johann "Grüber"\\', "Li Wei"],
        sex: "male",
        dead: false,
        birth: {
            written: "ABT 1819",
            year: 1819,
            month: 0,
            day: 0,
            mark: "about",
            lastYear: 0,
            shown: "~1819",
            period: false,
        },
        death: null,
        father: 0,
        mother: 0,
        spouses: [2],
        children: [3],
        parentFamilies: [],
        coupleFamilies: [1],
        surnameFirst: false,
        shownName: 'Johann "Grüber"\\',
    });
    assert.deepEqual(file.persons[2].parentFamilies, [{ family: 1, pedigree: "adopted" }]);
    assert.equal(file.persons[2].sex, "other");
    assert.equal(file.persons[1].dead, true);
    const [family] = file.families;
    assert.deepEqual(
        [family.husband, family.wife, family.children, family.married, family.divorced, family.marriage.lastYear],
        [1, 2, [3], true, true, 1842],
    );
    assert.deepEqual(
        file.factsOfPerson(1).map(({ tag, value, place }) => [tag, value, place]),
        [
            ["BIRT", "", "Bern"],
            ["OCCU", "Baker", ""],
        ],
    );
    assert.deepEqual(
        file.factsOfFamily(1).map(({ tag, date }) => [tag, date?.written ?? null]),
        [
            ["MARR", "BET 1840 AND 1842"],
            ["DIV", null],
        ],
    );
    file.close();
});

test("a file is laid out as a host that gives the same answers", async () => {
    const file = olvane.readGedcom(await readFile(new URL("darwin-wedgwood.ged", samples)));
    const person = (id) => file.persons[id - 1];
    const host = {
        fatherOf: (id) => person(id).father || null,
        motherOf: (id) => person(id).mother || null,
        spousesOf: (id) => person(id).spouses,
        childrenOf: (id) => person(id).children,
        isPreferredSpouse: (id, spouse) => person(id).spouses[0] === spouse,
        isDead: (id) => person(id).dead,
        dateOf(id, isBirth) {
            const date = isBirth ? person(id).birth : person(id).death;
            if (date === null || date.year === 0) return "";
            const pieces = [String(date.year).padStart(4, "0"), date.month, date.day].filter((piece) => piece !== 0);
            return pieces.map((piece) => String(piece).padStart(2, "0")).join("-");
        },
        sexOf: (id) => ["male", "female", "other"].indexOf(person(id).sex),
    };
    let compared = 0;
    for (const { id } of file.persons) {
        if (file.layoutText(id) === olvane.layoutText(host, id)) ++compared;
    }
    // Dates that are not exact sort otherwise than this host writes them.
    assert.ok(compared > file.persons.length * 0.9, `${compared} of ${file.persons.length}`);
    assert.ok(file.layout(1, { view: "pedigree" }).length > 0);
});

test("letters of other encodings come out composed", () => {
    const bytes = bytesOf("0 HEAD\n1 GEDC\n2 VERS 5.5.1\n1 CHAR ANSEL\n0 @I1@ INDI\n1 NAME Gr?uber\n0 TRLR\n");
    bytes[bytes.indexOf("?".charCodeAt(0))] = 0xe8; // the dots of an umlaut, before their letter
    assert.equal(olvane.readGedcom(bytes).persons[0].name, "Grüber");
});

test("encodings are read by the platform's tables", () => {
    const named = (encoding, name) => {
        const head = `0 HEAD\n1 GEDC\n2 VERS 5.5.1\n1 CHAR ${encoding}\n0 @I1@ INDI\n1 NAME `;
        return new Uint8Array([...bytesOf(head), ...name, ...bytesOf("\n0 TRLR\n")]);
    };
    const nameIn = (encoding, name, options) =>
        olvane.readGedcom(named(encoding, name), "a.ged", options).persons[0].name;
    assert.equal(nameIn("KOI8-R", [0xe9, 0xd7, 0xc1, 0xce]), "Иван");
    assert.equal(nameIn("windows-1253", [0xc1, 0xed, 0xed, 0xe1]), "Αννα");
    assert.equal(nameIn("Shift_JIS", [0x8e, 0x52, 0x93, 0x63]), "山田");
    assert.equal(nameIn("ANSI", [0xc8, 0xe2, 0xe0, 0xed], { encoding: "cp1251" }), "Иван");
    assert.equal(nameIn("IBM852", [0x9d]), "Ł");
    assert.throws(() => nameIn("ANSI", [0x41], { encoding: "KLINGON" }), /KLINGON/);
});

test("trouble in a file is reported by its line, and the rest is read", () => {
    const file = olvane.readGedcom(bytesOf("0 HEAD\n0 @I1@ INDI\n1 NAME A\n1 FAMS @F9@\n0 @I2@ INDI\n"), "bad.ged");
    assert.equal(file.persons.length, 2);
    assert.deepEqual(
        file.diagnostics.map(({ line, severity }) => [line, severity]),
        [
            [4, "error"],
            [5, "warning"],
        ],
    );
});

test("what is no GEDCOM file is refused with a reason", () => {
    assert.throws(
        () => olvane.readGedcom(bytesOf("hello"), "letter.txt"),
        (error) => {
            assert.ok(error instanceof GedcomError);
            assert.match(error.message, /^letter\.txt: /);
            return true;
        },
    );
    assert.throws(() => olvane.readGedcom(new Uint8Array(), "empty.ged"), { message: "empty.ged: is empty" });
    assert.throws(() => olvane.readGedcom(bytesOf("PK\u0003\u0004"), "a.gdz"), GedcomError);
});

test("a closed file gives no more answers", () => {
    const file = olvane.readGedcom(bytesOf(couple));
    file.close();
    file.close();
    assert.throws(() => file.layout(1), GedcomError);
    assert.throws(() => file.factsOfPerson(1), GedcomError);
    assert.equal(file.persons.length, 3);
});

test("a person outside the file is refused", () => {
    const file = olvane.readGedcom(bytesOf(couple));
    assert.throws(() => file.layout(4), { name: "LayoutError", status: "invalidPerson" });
    assert.throws(() => file.layout(0), { name: "LayoutError", status: "invalidPerson" });
    assert.throws(() => file.layout(1.5), { name: "LayoutError", status: "invalidPerson" });
    for (const focus of [1n, Symbol("1"), "1"]) assert.throws(() => file.layout(focus), TypeError);
    assert.throws(() => file.layout(1, null), TypeError);
    assert.ok(file.layout(1).length > 0, "the next request is unaffected");
    assert.throws(() => file.factsOfPerson(4), GedcomError);
    assert.throws(() => file.factsOfFamily(2), GedcomError);
});

test("a layout that grows without measure is ended in words", () => {
    const count = 60;
    const persons = Array.from({ length: count }, (_, i) => i + 1);
    const couples = persons
        .filter((id) => id % 2 === 1)
        .flatMap((man) => persons.filter((id) => id % 2 === 0).map((wife) => [man, wife]));
    const links = (id) =>
        couples
            .map(([man, wife], i) =>
                man === id || wife === id ? `1 FAMS @F${i}@\n1 FAMC @F${i}@\n` : `1 FAMC @F${i}@\n`,
            )
            .join("");
    const text =
        "0 HEAD\n1 CHAR UTF-8\n" +
        persons.map((id) => `0 @I${id}@ INDI\n1 SEX ${id % 2 ? "M" : "F"}\n${links(id)}`).join("") +
        couples
            .map(
                ([man, wife], i) =>
                    `0 @F${i}@ FAM\n1 HUSB @I${man}@\n1 WIFE @I${wife}@\n` +
                    persons.map((id) => `1 CHIL @I${id}@\n`).join(""),
            )
            .join("") +
        "0 TRLR\n";
    const file = olvane.readGedcom(bytesOf(text));
    assert.throws(() => file.layout(1), { name: "LayoutError", status: "tooLarge" });
    file.close();
    assert.ok(olvane.readGedcom(bytesOf(couple)).layout(1).length > 0, "the next request is unaffected");
});

test("what finds no room in the module's memory is not taken for too large", async () => {
    const children = Array.from({ length: 20000 }, (_, i) => i + 2);
    const person = (id, link) => `0 @I${id}@ INDI\n1 ${link} @F1@\n`;
    const gedcom = [
        "0 HEAD\n1 GEDC\n2 VERS 5.5.1\n1 CHAR UTF-8\n",
        person(1, "FAMS"),
        ...children.map((id) => person(id, "FAMC")),
        "0 @F1@ FAM\n1 HUSB @I1@\n",
        ...children.map((id) => `1 CHIL @I${id}@\n`),
        "0 TRLR\n",
    ].join("");
    // At each of these sizes it is another piece of work that finds no room.
    for (const room of [2 ** 6, 2 ** 12, 2 ** 16, 2 ** 20]) {
        const instance = await openInstance();
        const file = new Olvane(instance).readGedcom(bytesOf(gedcom));
        leaveRoomOf(instance, room);
        assert.throws(() => file.layout(1), { name: "LayoutError", status: "outOfMemory" });
    }
});

const detailed = `0 HEAD
1 GEDC
2 VERS 5.5.1
1 CHAR UTF-8
0 @I1@ INDI
1 NAME Anna /Berg/
2 TYPE birth
2 NICK Anni
1 NAME Anna /Tal/
2 TYPE married
2 SOUR @S1@
3 PAGE folio 3
1 RESI
2 DATE 1850
2 ADDR 4 Main Street
3 CONT Bern
2 CAUS work
2 AGE 20
2 SOUR @S1@
3 PAGE 12
3 QUAY 2
1 NOTE @N1@
1 NOTE of her own
1 OBJE
2 FILE anna.jpg
2 TITL Anna at home
2 FORM jpeg
1 WWW https://example.org/anna
1 FAMS @F1@
0 @F1@ FAM
1 WIFE @I1@
1 MARR Y
2 WIFE
3 AGE 22
1 NOTE of the couple
0 @S1@ SOUR
1 TITL Parish book
1 AUTH A priest
0 @N1@ NOTE shared
1 CONT by many
0 TRLR
`;

test("details of a person and a family come with their facts and names", () => {
    const file = olvane.readGedcom(bytesOf(detailed), "detailed.ged");
    const anna = file.detailsOfPerson(1);
    assert.deepEqual(anna.notes, ["shared\nby many", "of her own"]);
    assert.deepEqual(anna.media, [{ title: "Anna at home", file: "anna.jpg", format: "jpeg" }]);
    assert.deepEqual(anna.links, ["https://example.org/anna"]);
    assert.deepEqual(
        anna.names.map(({ text, type, nickname, details }) => [
            text,
            type,
            nickname,
            details.citations.map(({ page }) => page),
        ]),
        [
            ["Anna Berg", "birth", "Anni", []],
            ["Anna Tal", "married", "", ["folio 3"]],
        ],
    );
    const { tag, date, details } = anna.facts[0];
    assert.deepEqual(
        [tag, date.year, details.address, details.cause, details.age],
        ["RESI", 1850, "4 Main Street\nBern", "work", "20"],
    );
    assert.deepEqual(details.citations, [
        { title: "Parish book", author: "A priest", publication: "", page: "12", text: "", quality: 2 },
    ]);
    const couple = file.detailsOfFamily(1);
    assert.deepEqual(
        [couple.notes, couple.facts[0].tag, couple.facts[0].details.wifeAge],
        [["of the couple"], "MARR", "22"],
    );
    assert.throws(() => file.detailsOfPerson(2), GedcomError);
    file.close();
});

test("a name of any length is shown as far as anybody reads, and whole else", () => {
    const nameOf = (name) => olvane.readGedcom(bytesOf(`0 HEAD\n0 @I1@ INDI\n1 NAME ${name}\n0 TRLR\n`)).persons[0];
    const long = nameOf("a".repeat(200_000));
    assert.equal(long.name.length, 200_000);
    assert.equal(long.shownName, "a".repeat(999) + "\u2026");
    // Four bytes each, none of which is cut in two.
    assert.equal(nameOf("a" + "\u{1f9d9}".repeat(600)).shownName, "a" + "\u{1f9d9}".repeat(248) + "\u2026");
    assert.equal(nameOf("a".repeat(1000)).shownName, "a".repeat(1000));
    assert.equal(nameOf("").shownName, "");
});

test("every encoding that is offered reads a file", () => {
    const text = bytesOf("0 HEAD\n0 @I1@ INDI\n1 NAME Ada\n0 TRLR\n");
    const { encodings } = olvane;
    assert.deepEqual(encodings.slice(0, 3), ["UTF-8", "ANSEL", "windows-1252"]);
    assert.ok(encodings.includes("KOI8-R") && encodings.includes("IBM850"));
    // Node knows all that browsers do, but for one.
    for (const encoding of encodings.filter((name) => name !== "ISO-8859-16")) {
        const bytes = encoding.startsWith("UTF-16") ? utf16(text, encoding.endsWith("LE")) : text;
        assert.equal(olvane.readGedcom(bytes, "a.ged", { encoding }).persons[0]?.name, "Ada", encoding);
    }
});

function utf16(ascii, isLittle) {
    return Uint8Array.from(ascii, (byte) => byte).reduce(
        (wide, byte, i) => (wide.set(isLittle ? [byte, 0] : [0, byte], 2 * i), wide),
        new Uint8Array(2 * ascii.length),
    );
}

test("the usual family of parents is that by birth, wherever it stands in the record", () => {
    const links = (...families) =>
        families.map(([xref, pedigree]) => `1 FAMC @${xref}@\n2 PEDI ${pedigree}\n`).join("");
    const text =
        "0 HEAD\n1 GEDC\n2 VERS 5.5.1\n" +
        "0 @I1@ INDI\n1 FAMS @F1@\n1 FAMS @F2@\n" +
        `0 @I2@ INDI\n${links(["F1", "adopted"], ["F2", "birth"])}` +
        `0 @I3@ INDI\n${links(["F2", "foster"], ["F1", "adopted"])}` +
        "0 @F1@ FAM\n1 HUSB @I1@\n1 CHIL @I2@\n1 CHIL @I3@\n" +
        "0 @F2@ FAM\n1 HUSB @I1@\n1 CHIL @I2@\n1 CHIL @I3@\n0 TRLR\n";
    const file = olvane.readGedcom(bytesOf(text), "two.ged");
    assert.deepEqual(
        [1, 2, 3].map((id) => file.parentFamilyOf(id)),
        [0, 2, 2],
    );
    assert.throws(() => file.parentFamilyOf(4), RangeError);
});

test("siblings have a first parent in common, and the focus to begin with has the most relatives near", () => {
    const person = (n, links) => `0 @I${n}@ INDI\n1 NAME N${n} /A/\n${links}`;
    const text =
        "0 HEAD\n1 GEDC\n2 VERS 5.5.1\n" +
        person(1, "1 FAMS @F1@\n1 FAMS @F2@\n") +
        person(2, "1 FAMS @F1@\n") +
        person(3, "1 FAMC @F1@\n") +
        person(4, "1 FAMC @F2@\n") +
        person(5, "1 FAMC @F1@\n") +
        "0 @F1@ FAM\n1 HUSB @I1@\n1 WIFE @I2@\n1 CHIL @I3@\n1 CHIL @I5@\n" +
        "0 @F2@ FAM\n1 HUSB @I1@\n1 CHIL @I4@\n0 TRLR\n";
    const file = olvane.readGedcom(bytesOf(text), "five.ged");
    assert.deepEqual(file.siblingsOf(3), [5, 4]);
    assert.deepEqual(file.siblingsOf(1), []);
    assert.throws(() => file.siblingsOf(6), RangeError);
    assert.equal(file.bestFocus, 3);
});
