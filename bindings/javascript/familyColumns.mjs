// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Rows as objects, or columns as arrays and typed arrays, on their way into the module's memory.

import { OutOfMemory } from "./errors.mjs";
import { chosenNumber, idNumber, refuse, storedText } from "./familyValues.mjs";
import { CHILD_KINDS, FAMILY_STATES, NAME_KINDS, SEXES } from "./values.mjs";

const encoder = new TextEncoder();

// The fields of each table: the names of those that are numbers, and of those that are texts. Their order is that of
// the module's columns.
const TABLES = {
    persons: {
        numbers: ["id", "father", "mother", "sex", "dead"],
        texts: ["birth", "death", "birthWritten", "deathWritten"],
        choices: { sex: SEXES },
    },
    spouses: { numbers: ["person", "spouse", "preferred"], texts: [] },
    children: { numbers: ["parent", "child"], texts: [] },
    families: {
        numbers: ["number", "partner0", "partner1", "state"],
        texts: ["marriage", "marriageWritten", "marriagePlace"],
        choices: { state: FAMILY_STATES },
    },
    familyChildren: { numbers: ["family", "child", "kind"], texts: [], choices: { kind: CHILD_KINDS } },
    names: { numbers: ["person", "kind"], texts: ["text"], choices: { kind: NAME_KINDS } },
    fields: { numbers: ["person"], texts: ["key", "text"] },
};

const NAME_COLUMNS = {
    name: "full",
    given: "given",
    surname: "surname",
    prefix: "prefix",
    suffix: "suffix",
    nickname: "nickname",
    marriedName: "married",
};

const NUMBER_TYPES = new Map([
    [Int8Array, 0],
    [Uint8Array, 1],
    [Int32Array, 2],
    [Uint32Array, 3],
    [BigInt64Array, 4],
    [Float64Array, 5],
]);
const FLOAT64 = 5;

function columnNumbers() {
    const places = { numbers: new Map(), texts: new Map() };
    for (const [table, { numbers, texts }] of Object.entries(TABLES)) {
        for (const field of numbers) places.numbers.set(`${table}.${field}`, places.numbers.size);
        for (const field of texts) places.texts.set(`${table}.${field}`, places.texts.size);
    }
    return places;
}

const PLACES = columnNumbers();

/** The table's name in errors, as the library writes it. */
function shownTable(table) {
    return table === "familyChildren" ? "family children" : table;
}

/** Rows as columns by their names. */
function asColumns(rows) {
    if (typeof rows[Symbol.iterator] !== "function") return { ...rows };
    const list = Array.isArray(rows) ? rows : Array.from(rows);
    const columns = {};
    for (const row of list) {
        for (const name in row) columns[name] ??= [];
    }
    for (const [name, column] of Object.entries(columns)) {
        for (let i = 0; i < list.length; ++i) column.push(list[i][name]);
    }
    return columns;
}

function place(instance, columns, bytes) {
    const pointer = instance.exports.family_place(columns, bytes) >>> 0;
    if (pointer === 0) throw new OutOfMemory();
    return pointer;
}

function wholeNumbers(table, field, column, names) {
    const read = names === undefined ? idNumber : chosenNumber;
    const numbers = new Float64Array(column.length);
    for (let row = 0; row < column.length; ++row) {
        const value = column[row];
        if (typeof value === "number" && Number.isSafeInteger(value)) {
            numbers[row] = value;
        } else if (typeof value === "boolean" && field !== "id") {
            numbers[row] = value ? 1 : 0;
        } else {
            numbers[row] =
                names === undefined ? read(table, value, field, { row }) : read(table, value, field, names, { row });
        }
    }
    return numbers;
}

function fillNumbers(instance, columns, table, field, column) {
    const isKnown = NUMBER_TYPES.has(column.constructor);
    const names = TABLES[table].choices?.[field];
    const numbers = isKnown ? column : wholeNumbers(shownTable(table), field, column, names);
    const bytes = new Uint8Array(numbers.buffer, numbers.byteOffset, numbers.byteLength);
    const pointer = place(instance, columns, bytes.length);
    new Uint8Array(instance.exports.memory.buffer).set(bytes, pointer);
    const type = isKnown ? NUMBER_TYPES.get(column.constructor) : FLOAT64;
    instance.exports.family_numbers(columns, PLACES.numbers.get(`${table}.${field}`), type, pointer, numbers.length);
}

// Joined, texts are encoded at once; a character of JavaScript takes three bytes at most.
function fillTexts(instance, columns, table, field, column) {
    const texts = new Array(column.length);
    for (let row = 0; row < column.length; ++row) {
        texts[row] = storedText(shownTable(table), column[row], field, { row });
    }
    const joined = `${texts.join("\0")}\0`;
    const pointer = place(instance, columns, joined.length * 3);
    const room = new Uint8Array(instance.exports.memory.buffer, pointer, joined.length * 3);
    encoder.encodeInto(joined, room);
    const outcome = instance.exports.family_texts(
        columns,
        PLACES.texts.get(`${table}.${field}`),
        pointer,
        column.length,
    );
    if (outcome !== 0) throw new OutOfMemory();
}

// Columns of persons that are none of their fields are names, or fields for labels under the name of the column.
function splitPersons(columns) {
    const names = { person: [], kind: [], text: [] };
    const fields = { person: [], key: [], text: [] };
    const known = [...TABLES.persons.numbers, ...TABLES.persons.texts];
    const persons = {};
    for (const [name, column] of Object.entries(columns)) {
        if (known.includes(name)) {
            persons[name] = column;
            continue;
        }
        const kind = NAME_COLUMNS[name];
        const target = kind === undefined ? fields : names;
        for (let i = 0; i < column.length; ++i) {
            if (column[i] === null || column[i] === undefined || column[i] === "") continue;
            target.person.push(columns.id?.[i] ?? 0);
            target.text.push(column[i]);
            if (kind === undefined) fields.key.push(name);
            else names.kind.push(kind);
        }
    }
    return { persons, names, fields };
}

function withPersonsNames(rows) {
    const { persons, names, fields } = splitPersons(asColumns(rows.persons));
    const all = { ...rows, persons };
    for (const [table, made] of Object.entries({ names, fields })) {
        if (made.person.length === 0) continue;
        if (all[table] !== undefined) {
            throw new TypeError(`${table} stand in the rows of persons and in rows of their own: give one of them`);
        }
        all[table] = made;
    }
    return all;
}

/** One function for each column of the rows, which puts it into the module. */
export function columnsOf(rows) {
    const fills = [];
    const all = rows.persons === undefined ? rows : withPersonsNames(rows);
    for (const [table, given] of Object.entries(all)) {
        if (given === undefined || given === null) continue;
        const known = TABLES[table];
        if (known === undefined) {
            throw new TypeError(`there are no rows ${table}, but ${Object.keys(TABLES).join(", ")}`);
        }
        const columns = asColumns(given);
        const isEmpty = Object.keys(columns).length === 0;
        if (isEmpty) for (const field of known.numbers.slice(0, 2)) columns[field] = [];
        if (table === "families" && columns.number === undefined) {
            const length = Object.values(columns)[0].length;
            columns.number = Int32Array.from({ length }, (_, i) => i + 1);
        }
        for (const [field, column] of Object.entries(columns)) {
            if (column === undefined) continue;
            if (known.numbers.includes(field)) {
                fills.push((instance, made) => fillNumbers(instance, made, table, field, column));
            } else if (known.texts.includes(field)) {
                fills.push((instance, made) => fillTexts(instance, made, table, field, column));
            } else {
                refuse(shownTable(table), null, null, field, "there is no such field");
            }
        }
    }
    return fills;
}
