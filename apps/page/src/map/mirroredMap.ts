// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A map with right and left exchanged, in the same form: persons are numbered again, so that each row and each band still goes
// from left to right.

import { kChildMask, kPersonLabel, type Lines, type MapArrays } from "./mapBytes";

const kJoined = 4 | 8; // of the flags: a line to the next person, and whether it is of a divorced couple

export function mirroredMap(map: MapArrays): MapArrays {
    const { rowStart, x, boxWidth } = map;
    const count = x.length;
    const now = new Int32Array(count); // the new number of each person
    for (let row = 0; row + 1 < rowStart.length; ++row)
        for (let p = rowStart[row]!, end = rowStart[row + 1]!, q = end - 1; p < end; ++p, --q) now[p] = q;
    return {
        ...map,
        x: moved(x, now, (place) => -place - boxWidth),
        numbers: moved(map.numbers, now),
        births: moved(map.births, now),
        deaths: moved(map.deaths, now),
        names: moved(map.names, now),
        surnames: moved(map.surnames, now),
        flags: mirroredFlags(map.flags, now),
        partners: map.partners.map((person) => (person < 0 ? person : now[person]!)),
        children: map.children.map((child) => ((child & ~kChildMask) | now[child & kChildMask]!) >>> 0),
        bars: mirroredLines(map.bars, map.barStart, true),
        uprights: mirroredLines(map.uprights, map.uprightStart, false),
        marks: mirroredMarks(map.marks, now),
        labels: mirroredLabels(map.labels, now),
    };
}

type Numbers = Int32Array | Uint32Array | Int16Array | Uint8Array;

function moved<List extends Numbers>(list: List, now: Int32Array, change = (value: number) => value): List {
    const to = list.slice() as List;
    for (let p = 0; p < list.length; ++p) to[now[p]!] = change(list[p]!);
    return to;
}

// The left partner of a couple becomes the right one.
function mirroredFlags(flags: Uint8Array, now: Int32Array): Uint8Array {
    const to = moved(flags, now, (flag) => flag & ~kJoined);
    for (let p = 0; p + 1 < flags.length; ++p) if ((flags[p]! & kJoined) !== 0) to[now[p + 1]!]! |= flags[p]! & kJoined;
    return to;
}

// Bars from low to high, and in the order of their lower ends; uprights in that of their places.
function mirroredLines(lines: Lines, starts: Uint32Array, areBars: boolean): Lines {
    const order = new Uint32Array(lines.low.length);
    for (let band = 0; band + 1 < starts.length; ++band) {
        const [begin, end] = [starts[band]!, starts[band + 1]!];
        for (let i = begin; i < end; ++i) order[i] = begin + end - 1 - i;
        if (areBars) order.subarray(begin, end).sort((a, b) => lines.high[b]! - lines.high[a]! || b - a);
    }
    const taken = (list: Int32Array, sign: number) => Int32Array.from(order, (i) => sign * list[i]!);
    return {
        low: areBars ? taken(lines.high, -1) : taken(lines.low, 1),
        high: areBars ? taken(lines.low, -1) : taken(lines.high, 1),
        at: taken(lines.at, areBars ? 1 : -1),
        roles: Uint8Array.from(order, (i) => lines.roles[i]!),
    };
}

// A person and a number each, in the order of persons.
function mirroredMarks(marks: Uint32Array, now: Int32Array): Uint32Array {
    const pairs = Array.from({ length: marks.length / 2 }, (_, i) => [now[marks[2 * i]!]!, marks[2 * i + 1]!] as const);
    return Uint32Array.from(pairs.sort(([a], [b]) => a - b).flat());
}

// x, y, text and weight each; a text below zero is a person's name.
function mirroredLabels(labels: Int32Array, now: Int32Array): Int32Array {
    const to = labels.slice();
    for (let i = 0; i < labels.length; i += 4) {
        to[i] = -labels[i]!;
        if (labels[i + 2]! < 0) to[i + 2] = (now[(labels[i + 2]! + kPersonLabel) | 0]! - kPersonLabel) | 0;
    }
    return to;
}
