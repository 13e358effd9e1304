// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Values of a family, checked one by one before the module sees them; what is refused says where it stands.

import { FamilyError } from "./errors.mjs";
import { described } from "./values.mjs";

function placeOf(table, row, id) {
    if (row !== null) return `${table} row ${row}`;
    if (id === null) return table;
    return `${table.startsWith("famil") ? "family" : "person"} ${String(id)}`;
}

export function refuse(table, row, id, field, reason) {
    const message = `${placeOf(table, row, id)}, field ${field}: ${reason}`;
    throw new FamilyError(message, { table, row, id, field });
}

/** A whole number that the module can take; 0 for null and undefined. */
export function idNumber(table, value, field, { row = null, id = null }) {
    if (value === null || value === undefined) return 0;
    if (Number.isSafeInteger(value)) return value;
    const isLarge = typeof value === "bigint" || Number.isInteger(value);
    if (isLarge && value >= 1 && value <= 2147483647) return Number(value);
    const kind = isLarge ? "a whole number of 1 to 2147483647" : "a whole number";
    return refuse(table, row, id, field, `${described(value)} is not ${kind}`);
}

/** A choice as its number, or by its name among names, where its first letter will do for a sex. */
export function chosenNumber(table, value, field, names, { row = null, id = null }) {
    if (Number.isInteger(value)) return value;
    if (value === null || value === undefined) return names.indexOf("unknown");
    const name = typeof value === "string" ? value.trim().toLowerCase() : null;
    const place = names.findIndex((known) => known === name || (field === "sex" && known[0] === name));
    if (place >= 0) return place;
    return refuse(table, row, id, field, `${described(value)} is none of ${names.join(", ")}`);
}

/** A text; empty for null and undefined, and what String makes of a number. */
export function storedText(table, value, field, { row = null, id = null }) {
    if (value === null || value === undefined) return "";
    const text = typeof value === "string" ? value : textOf(table, value, field, { row, id });
    const zero = text.indexOf("\0");
    if (zero >= 0) refuse(table, row, id, field, `the text has a zero byte at character ${zero}`);
    return text;
}

function textOf(table, value, field, { row, id }) {
    if (typeof value === "number" || typeof value === "bigint") return String(value);
    if (value instanceof Date) return value.toISOString().slice(0, 10);
    return refuse(table, row, id, field, `${described(value)} is not a text`);
}
