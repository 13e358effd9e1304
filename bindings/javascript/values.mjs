// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What the module's numbers stand for.

export const PERSON_NOT_FOUND = Infinity;

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

export const STATUSES = [
    "ok",
    "invalidArgument",
    "invalidPerson",
    "hostFailed",
    "layoutFailed",
    "outOfMemory",
    "nestedCall",
];

const KINDS = ["person", "missingFather", "missingMother"];

const NUMBERS_OF_A_RECORD = 7;
const NUMBERS_OF_A_SEGMENT = 4;

function segmentAt(numbers, at) {
    return { x1: numbers[at], y1: numbers[at + 1], x2: numbers[at + 2], y2: numbers[at + 3] };
}

/** The records that a run of numbers tells, in its order. */
export function recordsFrom(numbers) {
    const records = [];
    for (let at = 0; at < numbers.length; ) {
        const [id, x, y, flag, kind, child, count] = numbers.subarray(at, at + NUMBERS_OF_A_RECORD);
        at += NUMBERS_OF_A_RECORD;
        const segments = [];
        for (let i = 0; i < count; ++i, at += NUMBERS_OF_A_SEGMENT) segments.push(segmentAt(numbers, at));
        records.push({
            id,
            x,
            y,
            hasHiddenRelatives: flag !== 0,
            kind: KINDS[kind],
            child: kind === 0 ? null : child,
            segments,
        });
    }
    return records;
}
