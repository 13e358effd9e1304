// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What the module's numbers stand for.

export const PERSON_NOT_FOUND = Infinity;

/** A value as errors state it, so that nobody takes "4" and 4n for 4. */
export function described(value) {
    if (typeof value === "string") return JSON.stringify(value);
    if (typeof value === "bigint") return `${value}n`;
    return typeof value?.then === "function" ? "a promise" : String(value);
}

export const Shown = Object.freeze({
    auntsUncles: 0x01,
    cousins: 0x02,
    siblings: 0x04,
    siblingSpouses: 0x08,
    niecesNephews: 0x10,
    grandchildren: 0x20,
    greatGrandparents: 0x40,
    spousesOfChildren: 0x80,
    all: 0xff,
});

/** All views, by the numbers that the module has for them, and so the next two lists. */
export const PICTURE_VIEWS = Object.freeze([
    "family",
    "pedigree",
    "near",
    "ancestors",
    "descendants",
    "hourglass",
    "relatives",
    "fan",
    "kinship",
    "everybody",
]);
export const DIRECTIONS = Object.freeze(["down", "up", "left", "right"]);
export const FACTS = Object.freeze(["dates", "places", "occupation", "marriage"]);

export const STATUSES = [
    "ok",
    "invalidArgument",
    "invalidPerson",
    "hostFailed",
    "layoutFailed",
    "outOfMemory",
    "nestedCall",
    "refused",
    "invalidId",
];

export const SEXES = ["male", "female", "unknown"];
export const NAME_KINDS = ["full", "given", "surname", "prefix", "suffix", "nickname", "married", "other"];
export const FAMILY_STATES = ["married", "divorced", "unmarried", "unknown"];
export const CHILD_KINDS = ["birth", "adopted", "foster", "step", "sealing", "unknown"];

const KINDS = ["person", "missingFather", "missingMother"];

const NUMBERS_OF_A_RECORD = 7;
const NUMBERS_OF_A_SEGMENT = 4;

/** The records that a run of numbers holds, in its order. */
export function recordsFrom(numbers) {
    const records = [];
    for (let at = 0; at < numbers.length;) {
        const kind = numbers[at + 4];
        const count = numbers[at + 6];
        const segments = new Array(count);
        let next = at + NUMBERS_OF_A_RECORD;
        for (let i = 0; i < count; ++i, next += NUMBERS_OF_A_SEGMENT) {
            segments[i] = { x1: numbers[next], y1: numbers[next + 1], x2: numbers[next + 2], y2: numbers[next + 3] };
        }
        records.push({
            id: numbers[at],
            x: numbers[at + 1],
            y: numbers[at + 2],
            hasHiddenRelatives: numbers[at + 3] !== 0,
            kind: KINDS[kind],
            child: kind === 0 ? null : numbers[at + 5],
            segments,
        });
        at = next;
    }
    return records;
}
