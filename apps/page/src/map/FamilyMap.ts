// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Everybody on a map: names, kin and places of persons, who are numbered from 0 in the order of rows and places.

import { kChildMask, type MapArrays, type MapError, readMap } from "./mapBytes";
import { mirroredMap } from "./mirroredMap";

const kSurnameLast = 16; // of the flags
const kSexes = ["male", "female", "other"] as const;
export const kNobody = -1;

/** Kin in the groups in which they are listed. */
export interface Kin {
    readonly parents: readonly number[];
    readonly partners: readonly number[];
    readonly children: readonly number[];
    readonly siblings: readonly number[];
}

export interface Rect {
    readonly left: number;
    readonly top: number;
    readonly right: number;
    readonly bottom: number;
}

// Lists of unions by person.
interface UnionLists {
    readonly start: Uint32Array;
    readonly unions: Uint32Array;
}

export class FamilyMap {
    readonly arrays: MapArrays;
    readonly count: number;
    /** Of all boxes, in points; left to right and top to bottom. */
    readonly area: Rect;
    private readonly personOf: Uint32Array; // by number
    private readonly asPartner: UnionLists;
    private readonly asChild: UnionLists;
    private readonly decoder = new TextDecoder();

    /** Of bytes, which then are of no other use, or of arrays. Throws MapError; see there. */
    constructor(source: Uint8Array<ArrayBuffer> | MapArrays) {
        const arrays = source instanceof Uint8Array ? readMap(source) : source;
        this.arrays = arrays;
        this.count = arrays.x.length;
        this.personOf = new Uint32Array(this.count + 1);
        arrays.numbers.forEach((number, person) => (this.personOf[number] = person));
        const { partners, childStarts, children } = arrays;
        this.asPartner = listsOf(this.count, (add) => {
            for (let i = 0; i < partners.length; ++i) {
                const isSecondTime = i % 2 === 1 && partners[i] === partners[i - 1];
                if (partners[i]! >= 0 && !isSecondTime) add(partners[i]!, i >> 1);
            }
        });
        this.asChild = listsOf(this.count, (add) => {
            for (let u = 0; u + 1 < childStarts.length; ++u)
                for (let i = childStarts[u]!; i < childStarts[u + 1]!; ++i) add(children[i]! & kChildMask, u);
        });
        this.area = this.measured();
    }

    /** With right and left exchanged, and persons numbered again. */
    mirrored(): FamilyMap {
        return new FamilyMap(mirroredMap(this.arrays));
    }

    /** Of somebody by their place in the data, from 1; kNobody for a number that is not there. */
    person(number: number): number {
        return Number.isInteger(number) && number >= 1 && number <= this.count ? this.personOf[number]! : kNobody;
    }

    number(person: number): number {
        return this.arrays.numbers[person]!;
    }

    text(place: number): string {
        const { stringEnds, stringBytes } = this.arrays;
        return this.decoder.decode(stringBytes.subarray(place === 0 ? 0 : stringEnds[place - 1]!, stringEnds[place]!));
    }

    surname(person: number): string {
        return this.text(this.arrays.surnames[person]!);
    }

    /** The name in the two lines that a box has. */
    nameLines(person: number): [string, string] {
        const first = this.text(this.arrays.names[person]!);
        return (this.arrays.flags[person]! & kSurnameLast) !== 0 ? [first, this.surname(person)] : [first, ""];
    }

    name(person: number): string {
        return this.nameLines(person).join(" ").trim();
    }

    sex(person: number): (typeof kSexes)[number] {
        return kSexes[this.arrays.flags[person]! & 3]!;
    }

    /** 0 where it is not known. */
    birth(person: number): number {
        return this.arrays.births[person]!;
    }

    death(person: number): number {
        return this.arrays.deaths[person]!;
    }

    row(person: number): number {
        return lastNotAbove(this.arrays.rowStart, person, this.arrays.rowY.length);
    }

    /** The box of a person, in points. */
    box(person: number): Rect {
        const { x, rowY, boxWidth, boxHeight } = this.arrays;
        const [left, top] = [x[person]! / 4, rowY[this.row(person)]! / 4];
        return { left, top, right: left + boxWidth / 4, bottom: top + boxHeight / 4 };
    }

    /** Whose box is there, in points; kNobody between the boxes. */
    personAt(px: number, py: number): number {
        const { x, rowY, rowStart, boxWidth, boxHeight } = this.arrays;
        // Parts of a family stand beside each other, with rows of their own: several may be as high as this.
        for (let row = lastNotAbove(rowY, py * 4, rowY.length); row >= 0 && rowY[row]! + boxHeight >= py * 4; --row) {
            const end = rowStart[row + 1]!;
            const person = lowerBound(x, px * 4 - boxWidth, rowStart[row]!, end);
            if (person < end && x[person]! <= px * 4) return person;
        }
        return kNobody;
    }

    /** Each of them once, in the order of the data; somebody married to themself is not listed. */
    kin(person: number): Kin {
        const { partners, childStarts, children } = this.arrays;
        const found = {
            parents: new Set<number>(),
            partners: new Set<number>(),
            children: new Set<number>(),
            siblings: new Set<number>(),
        };
        const addPartners = (u: number, to: Set<number>) => {
            for (const one of [partners[2 * u]!, partners[2 * u + 1]!]) if (one >= 0 && one !== person) to.add(one);
        };
        const addChildren = (u: number, to: Set<number>) => {
            for (let i = childStarts[u]!; i < childStarts[u + 1]!; ++i) {
                const child = children[i]! & kChildMask;
                if (child !== person) to.add(child);
            }
        };
        for (const u of unionsOf(this.asChild, person)) {
            addPartners(u, found.parents);
            addChildren(u, found.siblings);
        }
        for (const u of unionsOf(this.asPartner, person)) {
            addPartners(u, found.partners);
            addChildren(u, found.children);
        }
        return {
            parents: [...found.parents],
            partners: [...found.partners],
            children: [...found.children],
            siblings: [...found.siblings],
        };
    }

    /** The numbers of the marks at a person's box. */
    marks(person: number): number[] {
        const { marks } = this.arrays;
        const numbers: number[] = [];
        let low = 0;
        for (let high = marks.length / 2; low < high;) {
            const middle = (low + high) >> 1;
            if (marks[2 * middle]! < person) low = middle + 1;
            else high = middle;
        }
        for (; 2 * low < marks.length && marks[2 * low] === person; ++low) numbers.push(marks[2 * low + 1]!);
        return numbers;
    }

    private measured(): Rect {
        const { x, rowY, rowStart, boxWidth, boxHeight } = this.arrays;
        const rows = rowY.length;
        if (rows === 0) return { left: 0, top: 0, right: 1, bottom: 1 };
        let [left, right] = [Infinity, -Infinity];
        for (let row = 0; row < rows; ++row) {
            left = Math.min(left, x[rowStart[row]!]!);
            right = Math.max(right, x[rowStart[row + 1]! - 1]!);
        }
        return {
            left: left / 4,
            top: rowY[0]! / 4,
            right: (right + boxWidth) / 4,
            bottom: (rowY[rows - 1]! + boxHeight) / 4,
        };
    }
}

export type { MapError };

/** The first place from begin to end whose value is not below. */
export function lowerBound(values: ArrayLike<number>, value: number, begin: number, end: number): number {
    while (begin < end) {
        const middle = (begin + end) >> 1;
        if (values[middle]! < value) begin = middle + 1;
        else end = middle;
    }
    return begin;
}

// The last place before end whose value is not above; -1 without one.
function lastNotAbove(values: ArrayLike<number>, value: number, end: number): number {
    let begin = 0;
    while (begin < end) {
        const middle = (begin + end) >> 1;
        if (values[middle]! <= value) begin = middle + 1;
        else end = middle;
    }
    return begin - 1;
}

function listsOf(count: number, forEach: (add: (person: number, union: number) => void) => void): UnionLists {
    const start = new Uint32Array(count + 1);
    forEach((person) => ++start[person + 1]!);
    for (let i = 0; i < count; ++i) start[i + 1]! += start[i]!;
    const unions = new Uint32Array(start[count]!);
    const next = start.slice();
    forEach((person, union) => (unions[next[person]!++] = union));
    return { start, unions };
}

function unionsOf({ start, unions }: UnionLists, person: number): Uint32Array {
    return unions.subarray(start[person]!, start[person + 1]!);
}
