// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// One layout, made ready for drawing: boxes and line pieces with a grid over each, and what a walk from box
// to box must know. Units are points, which the page draws as CSS pixels when not zoomed; (x, y) is an
// upper-left corner.

import type { LayoutRecord, Segment, Sizes } from "olvane";
import { type Rectangle, SpatialGrid } from "../base/SpatialGrid";
import type { ViewName } from "../base/views";

export interface Box {
    readonly index: number;
    // Names the box across pictures: the same person again, or the same missing parent.
    readonly key: string;
    // 0 where a parent is not known.
    readonly person: number;
    // The person whose parent is not known; else 0.
    readonly child: number;
    readonly kind: LayoutRecord["kind"];
    readonly x: number;
    readonly y: number;
    readonly hasHiddenRelatives: boolean;
}

// Boxes wide enough for most names, and rows far enough apart for the lines between them to be told from
// another.
export const kFamilySizes: Sizes = {
    nodeWidth: 118,
    nodeHeight: 104,
    horzPadding: 22,
    vertPadding: 42,
    spouseLineStep: 9,
    lineInset: 0,
};

export const kPedigreeSizes: Sizes = {
    nodeWidth: 196,
    nodeHeight: 58,
    horzPadding: 36,
    vertPadding: 14,
    spouseLineStep: 9,
    lineInset: 18,
};

export function sizesOf(view: ViewName): Sizes {
    return view === "family" ? kFamilySizes : kPedigreeSizes;
}

export class Picture {
    readonly boxes: readonly Box[];
    // Each piece once, however many records tell it.
    readonly segments: readonly Segment[];
    readonly sizes: Sizes;
    readonly bounds: Rectangle;
    readonly focusBox: Box;
    private readonly boxGrid: SpatialGrid;
    private readonly lineGrid: SpatialGrid;
    private readonly byPerson = new Map<number, Box[]>();
    private readonly byKey = new Map<string, Box>();

    // records is not empty, and the first one is the focus's.
    constructor(
        readonly view: ViewName,
        readonly focus: number,
        records: readonly LayoutRecord[],
    ) {
        this.sizes = sizesOf(view);
        this.boxes = records.map((record, index) => this.boxOf(record, index));
        this.segments = distinctSegments(records);
        this.boxGrid = new SpatialGrid(this.boxes.map((box) => this.areaOf(box)));
        this.lineGrid = new SpatialGrid(this.segments.map(areaOfSegment));
        this.bounds = boundsOf([
            ...this.boxes.map((box) => this.areaOf(box)),
            ...this.segments.map(areaOfSegment),
        ]);
        this.focusBox = this.byPerson.get(focus)?.[0] ?? this.boxes[0]!;
    }

    areaOf(box: Box): Rectangle {
        return {
            left: box.x,
            top: box.y,
            right: box.x + this.sizes.nodeWidth,
            bottom: box.y + this.sizes.nodeHeight,
        };
    }

    boxesWithin(window: Rectangle): Box[] {
        return this.boxGrid.within(window).map((index) => this.boxes[index]!);
    }

    segmentsWithin(window: Rectangle): Segment[] {
        return this.lineGrid.within(window).map((index) => this.segments[index]!);
    }

    // All the boxes of one person, in the order of the layout.
    boxesOf(person: number): readonly Box[] {
        return this.byPerson.get(person) ?? [];
    }

    boxOfKey(key: string): Box | undefined {
        return this.byKey.get(key);
    }

    shows(person: number): boolean {
        return this.byPerson.has(person);
    }

    private boxOf(record: LayoutRecord, index: number): Box {
        const person = record.kind === "person" ? record.id : 0;
        const child = record.child ?? 0;
        const base = person ? String(person) : record.kind + child;
        let key = base;
        for (let copy = 1; this.byKey.has(key); ++copy) key = base + "#" + copy;
        const { kind, x, y, hasHiddenRelatives } = record;
        const box: Box = { index, key, person, child, kind, x, y, hasHiddenRelatives };
        this.byKey.set(key, box);
        const copies = this.byPerson.get(person);
        if (copies) copies.push(box);
        else if (person) this.byPerson.set(person, [box]);
        return box;
    }
}

function distinctSegments(records: readonly LayoutRecord[]): Segment[] {
    const distinct = new Map<string, Segment>();
    for (const record of records) {
        for (const segment of record.segments) {
            const { x1, y1, x2, y2 } = segment;
            if (x1 === x2 && y1 === y2) continue;
            const forward = x1 < x2 || (x1 === x2 && y1 < y2);
            distinct.set(forward ? `${x1},${y1},${x2},${y2}` : `${x2},${y2},${x1},${y1}`, segment);
        }
    }
    return [...distinct.values()];
}

function areaOfSegment({ x1, y1, x2, y2 }: Segment): Rectangle {
    return {
        left: Math.min(x1, x2),
        top: Math.min(y1, y2),
        right: Math.max(x1, x2),
        bottom: Math.max(y1, y2),
    };
}

function boundsOf(areas: readonly Rectangle[]): Rectangle {
    const bounds = { left: Infinity, top: Infinity, right: -Infinity, bottom: -Infinity };
    for (const area of areas) {
        bounds.left = Math.min(bounds.left, area.left);
        bounds.top = Math.min(bounds.top, area.top);
        bounds.right = Math.max(bounds.right, area.right);
        bounds.bottom = Math.max(bounds.bottom, area.bottom);
    }
    return bounds;
}
