// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Persons and families of a file on their way out of the module: rows of numbers and of texts, some persons at a time.

import { GedcomError } from "./errors.mjs";

// In a part. A worker writes the next ones while the page reads these.
const ROWS = 4096;

const utf8 = new TextDecoder();
const SEXES = ["male", "female", "other"];
export const MARKS = ["exact", "about", "before", "after", "between"];
const PEDIGREES = ["notGiven", "birth", "adopted", "foster", "sealing", "other", "step"];

/** The rows of a file, part by part: which table, its numbers, and the bytes of its texts. Throws GedcomError. */
export function* partsOf(instance, file) {
    const { exports } = instance;
    for (const table of ["persons", "families"]) {
        const count = exports[table === "persons" ? "gedcom_person_count" : "gedcom_family_count"](file);
        for (let first = 1; first <= count; first += ROWS) {
            const rows = exports[`gedcom_${table}`](file, first, ROWS);
            if (rows === 0) throw new GedcomError(instance.text(exports.last_text()));
            const [numbers, numberCount, texts, textBytes] = new Uint32Array(exports.memory.buffer, rows >>> 0, 4);
            yield {
                table,
                numbers: new Int32Array(exports.memory.buffer, numbers, numberCount).slice(),
                texts: new Uint8Array(exports.memory.buffer, texts, textBytes).slice(),
            };
        }
    }
}

/** Appends the rows of a part to the persons or families. */
export function appendPart(tables, { table, numbers, texts }) {
    const rows = new Reading(numbers, JSON.parse(utf8.decode(texts)));
    const list = tables[table];
    const read = table === "persons" ? personFrom : familyFrom;
    while (!rows.isAtEnd) list.push(read(rows, list.length + 1));
}

// The numbers and texts of rows, each taken in turn.
class Reading {
    #numbers;
    #texts;
    #number = 0;
    #text = 0;

    constructor(numbers, texts) {
        this.#numbers = numbers;
        this.#texts = texts;
    }

    get isAtEnd() {
        return this.#number >= this.#numbers.length;
    }

    number() {
        return this.#numbers[this.#number++];
    }

    truth() {
        return this.#numbers[this.#number++] !== 0;
    }

    text() {
        return this.#texts[this.#text++];
    }

    numbers() {
        const list = [];
        for (let left = this.number(); left > 0; --left) list.push(this.number());
        return list;
    }
}

// The fields of these stand in the order of the rows.
function personFrom(rows, id) {
    const xref = rows.text();
    const names = [];
    for (let left = rows.number(); left > 0; --left) names.push(rows.text());
    const name = names[0] ?? "";
    return {
        id,
        xref,
        name,
        given: rows.text(),
        surname: rows.text(),
        names,
        sex: SEXES[rows.number()],
        dead: rows.truth(),
        birth: dateFrom(rows),
        death: dateFrom(rows),
        father: rows.number(),
        mother: rows.number(),
        spouses: rows.numbers(),
        children: rows.numbers(),
        parentFamilies: parentFamiliesFrom(rows),
        coupleFamilies: rows.numbers(),
        surnameFirst: rows.truth(),
        shownName: rows.truth() ? rows.text() : name,
    };
}

function familyFrom(rows, id) {
    return {
        id,
        husband: rows.number(),
        wife: rows.number(),
        children: rows.numbers(),
        married: rows.truth(),
        divorced: rows.truth(),
        marriage: dateFrom(rows),
    };
}

function dateFrom(rows) {
    if (!rows.truth()) return null;
    return {
        written: rows.text(),
        year: rows.number(),
        month: rows.number(),
        day: rows.number(),
        mark: MARKS[rows.number()],
        lastYear: rows.number(),
        shown: rows.text(),
        period: rows.truth(),
    };
}

function parentFamiliesFrom(rows) {
    const families = [];
    for (let left = rows.number(); left > 0; --left) {
        families.push({ family: rows.number(), pedigree: PEDIGREES[rows.number()] });
    }
    return families;
}
