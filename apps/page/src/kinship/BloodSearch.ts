// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// All ways up to an ancestor and down again, nearest first: first all ancestors, generation by generation, then
// everybody below them in the order of distance. An ancestor to whom a loop in the file gives a shorter way down
// takes that; ways only ever become shorter, so the search ends whatever a file says.

import { kLinkKinds, type LinkKind, type Links } from "./Links";

/** none: the way begins downwards, by a parent of unknown sex, or by both parents at once. */
export type Side = "father" | "mother" | "none";

const kUnreached = -1;
const kFatherSide = 1;
const kMotherSide = 2;

// Of several ways that are equally long, the one that climbs less, then the one by birth, then the one of whole
// blood.
interface Way {
    readonly up: number;
    readonly down: number;
    readonly half: number;
    readonly kind: number;
    readonly sides: number;
    readonly source: number;
}

export class BloodSearch {
    private readonly up: Int32Array;
    private readonly down: Int32Array;
    private readonly half: Uint8Array;
    private readonly kind: Uint8Array;
    private readonly sides: Uint8Array;
    private readonly source: Int32Array;
    // Of an ancestor: the child by which the way came up.
    private readonly cameBy: Int32Array;
    // Persons by the length of their way.
    private readonly byDistance: number[][] = [];

    constructor(private readonly links: Links) {
        const size = links.count + 1;
        this.up = new Int32Array(size).fill(kUnreached);
        this.down = new Int32Array(size);
        this.half = new Uint8Array(size);
        this.kind = new Uint8Array(size);
        this.sides = new Uint8Array(size);
        this.source = new Int32Array(size);
        this.cameBy = new Int32Array(size);
    }

    /** Once. Sources count as their own relatives, at no distance. */
    run(sources: readonly number[]): void {
        for (const source of sources) this.reach(source, { up: 0, down: 0, half: 0, kind: 0, sides: 0, source });
        this.climb();
        this.descend();
    }

    /** In the order of distance, sources first; now and then somebody twice. */
    *reached(): Iterable<number> {
        for (const persons of this.byDistance) yield* persons;
    }

    /** Infinite for a person who is not reached. */
    distanceTo(person: number): number {
        const up = this.up[person] ?? kUnreached;
        return up === kUnreached ? Infinity : up + this.down[person]!;
    }

    upTo(person: number): number {
        return this.up[person]!;
    }

    downTo(person: number): number {
        return this.down[person]!;
    }

    isHalf(person: number): boolean {
        return this.half[person] === 1;
    }

    linkTo(person: number): LinkKind {
        return kLinkKinds[this.kind[person]!]!;
    }

    sideOf(person: number): Side {
        const sides = this.sides[person];
        return sides === kFatherSide ? "father" : sides === kMotherSide ? "mother" : "none";
    }

    sourceOf(person: number): number {
        return this.source[person]!;
    }

    /** The same for all persons who are reached in the same way, whatever their sex. */
    wayNumber(person: number): number {
        const manner = (this.sides[person]! * 3 + this.kind[person]!) * 2 + this.half[person]!;
        return (this.up[person]! * (this.links.count + 1) + this.down[person]!) * 24 + manner;
    }

    private climb(): void {
        let generation = [...(this.byDistance[0] ?? [])];
        for (let up = 1; generation.length > 0; ++up) {
            for (const child of generation) {
                for (const parent of this.links.parentsOf(child)) this.climbTo(parent, child, up);
            }
            generation = this.byDistance[up] ?? [];
        }
    }

    private climbTo(parent: number, child: number, up: number): void {
        const sides = up === 1 ? this.sideBegunBy(parent) : this.sides[child]!;
        const kind = Math.max(this.kind[child]!, this.links.kindNumber(child, parent));
        const isNew = this.up[parent] === kUnreached;
        this.reach(parent, { up, down: 0, half: 0, kind, sides, source: this.source[child]! });
        if (isNew) this.cameBy[parent] = child;
    }

    private sideBegunBy(parent: number): number {
        const sex = this.links.sexOf(parent);
        return sex === "male" ? kFatherSide : sex === "female" ? kMotherSide : 0;
    }

    private descend(): void {
        for (let distance = 0; distance < this.byDistance.length; ++distance) {
            for (const parent of this.byDistance[distance] ?? []) {
                for (const child of this.links.childrenOf(parent)) this.descendTo(child, parent);
            }
        }
    }

    private descendTo(child: number, parent: number): void {
        if (this.distanceTo(child) <= this.distanceTo(parent)) return;
        const kind = Math.max(this.kind[parent]!, this.links.kindNumber(child, parent));
        const turns = this.up[parent]! > 0 && this.down[parent] === 0;
        const isHalf = turns && kind === 0 && this.links.areHalfSiblings(child, this.cameBy[parent]!);
        this.reach(child, {
            up: this.up[parent]!,
            down: this.down[parent]! + 1,
            half: turns ? Number(isHalf) : this.half[parent]!,
            kind,
            sides: this.sides[parent]!,
            source: this.source[parent]!,
        });
    }

    private reach(person: number, way: Way): void {
        const distance = way.up + way.down;
        if (distance > this.distanceTo(person)) return;
        if (distance < this.distanceTo(person)) {
            this.keep(person, way);
            (this.byDistance[distance] ??= []).push(person);
            return;
        }
        const order = this.compare(person, way);
        if (order > 0) this.keep(person, way);
        if (order === 0) this.sides[person]! |= way.sides;
    }

    // Above 0 if way is the better one.
    private compare(person: number, way: Way): number {
        return this.up[person]! - way.up || this.kind[person]! - way.kind || this.half[person]! - way.half;
    }

    private keep(person: number, way: Way): void {
        this.up[person] = way.up;
        this.down[person] = way.down;
        this.half[person] = way.half;
        this.kind[person] = way.kind;
        this.sides[person] = way.sides;
        this.source[person] = way.source;
    }
}
