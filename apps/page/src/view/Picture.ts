// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// One picture, ready for the screen: the module's values with a grid over boxes and families, and what a walk from
// box to box must know. Units are points, which the page draws as CSS pixels when not zoomed; (x, y) is an
// upper-left corner.

import type {
    FanCell,
    FoldedBranch,
    GedcomFile,
    KinshipPlate,
    LinePath,
    LineStyle,
    PictureBox,
    PictureFamily,
    PictureMark,
    Picture as PictureValues,
    Sex,
} from "olvane";
import { type Rectangle, SpatialGrid } from "../base/SpatialGrid";
import type { ViewName } from "../base/views";

export interface Box {
    readonly index: number;
    // Names the box across pictures: the same person again, or the same unknown parent.
    readonly key: string;
    // 0 where a parent is not known.
    readonly person: number;
    // The person whose parent is not known; else 0.
    readonly child: number;
    readonly sex: Sex;
    readonly x: number;
    readonly y: number;
    readonly width: number;
    readonly height: number;
    // The engine's own flag, in its two views.
    readonly flag: boolean | null;
    // How many relatives have no box.
    readonly hidden: PictureBox["hidden"];
    // Numbers of the marks that stand at the box.
    readonly marks: readonly number[];
    // How many families of parents the person has beside those that are shown.
    readonly furtherParents: number;
    // In a picture of kinship: what the person at one end is to the one at the other; else empty.
    readonly caption: string;
    // Of the caption; null without one.
    readonly plate: KinshipPlate | null;
    // In a picture of kinship: at the end beside the focus, or at the top of a way.
    readonly kinshipPlace: "other" | "ancestor" | null;
    // Branches of the person that are left out.
    readonly folded: readonly FoldedBranch[];
    // Its piece of a ring, in a round chart.
    readonly arc: BoxArc | null;
}

export type LaterSide = ReturnType<GedcomFile["laterSide"]>;

/** A piece of a ring; the middle of the chart in points. */
export interface BoxArc extends FanCell {
    readonly middleX: number;
    readonly middleY: number;
    // The data of a path, not seen from the box.
    readonly outline: string;
    // Of its line of descent, by number; null near the middle.
    readonly colour: number | null;
}

/** A family as the scene draws it: its lines as paths, and the rectangle that they fill. */
export interface FamilyLines {
    readonly index: number;
    readonly family: PictureFamily;
    readonly paths: readonly LinePath[];
    readonly area: Rectangle;
}

export class Picture {
    readonly boxes: readonly Box[];
    readonly families: readonly FamilyLines[];
    readonly marks: readonly PictureMark[];
    readonly kinship: PictureValues["kinship"];
    // How lines are drawn that stand for more than a birth or a marriage.
    readonly lineStyles: readonly LineStyle[];
    readonly bounds: Rectangle;
    readonly focusBox: Box;
    private readonly boxGrid: SpatialGrid;
    private readonly lineGrid: SpatialGrid;
    private readonly byPerson = new Map<number, Box[]>();
    private readonly byKey = new Map<string, Box>();
    private readonly familiesByBox = new Map<number, FamilyLines[]>();

    // values has at least one box.
    constructor(
        readonly view: ViewName,
        // Where children stand, seen from their parents.
        readonly laterSide: LaterSide,
        readonly focus: number,
        values: PictureValues,
    ) {
        const numbers = markNumbers(values.marks);
        this.boxes = values.boxes.map((box, i) => this.boxOf(box, values, numbers, arcOf(values, i)));
        this.marks = values.marks;
        this.kinship = values.kinship;
        this.lineStyles = values.art?.styles.filter(({ meaning }) => meaning) ?? [];
        this.families = values.families.map((family, index) =>
            this.linesOf(family, index, values.art?.lines[index] ?? []),
        );
        const drawn = this.families.filter(({ family }) => family.lines.length > 0);
        this.boxGrid = new SpatialGrid(this.boxes.map(areaOf));
        this.lineGrid = new SpatialGrid(this.families.map(({ area }) => area));
        const plates = (values.kinship?.plates ?? []).map(areaOf);
        this.bounds = boundsOf([...this.boxes.map(areaOf), ...plates, ...drawn.map(({ area }) => area)]);
        this.focusBox = this.boxes[values.focus] ?? this.byPerson.get(focus)?.[0] ?? this.boxes[0]!;
    }

    areaOf(box: Box): Rectangle {
        return areaOf(box);
    }

    boxesWithin(window: Rectangle): Box[] {
        return this.boxGrid.within(window).map((index) => this.boxes[index]!);
    }

    familiesWithin(window: Rectangle): FamilyLines[] {
        return this.lineGrid.within(window).map((index) => this.families[index]!);
    }

    // The families that a box is a member of.
    familiesOf(box: Box): readonly FamilyLines[] {
        return this.familiesByBox.get(box.index) ?? [];
    }

    // All the boxes of one person, in the order of the picture.
    boxesOf(person: number): readonly Box[] {
        return this.byPerson.get(person) ?? [];
    }

    boxOfKey(key: string): Box | undefined {
        return this.byKey.get(key);
    }

    shows(person: number): boolean {
        return this.byPerson.has(person);
    }

    private boxOf(
        from: PictureBox,
        { boxes: all, focus, kinship, folded }: PictureValues,
        marks: ReadonlyMap<number, number[]>,
        arc: BoxArc | null,
    ): Box {
        const { index, id: person, sex, x, y, width, height, flag, hidden, furtherParents } = from;
        const child = from.childOf === null ? 0 : all[from.childOf]!.id;
        const base = person ? String(person) : `${sex} parent of ${child}`;
        let key = base;
        for (let copy = 1; this.byKey.has(key); ++copy) key = base + "#" + copy;
        const box: Box = {
            ...{ index, key, person, child, sex, x, y, width, height, flag, hidden, furtherParents, arc },
            marks: marks.get(index) ?? [],
            caption: !kinship ? "" : index === kinship.other ? kinship.otherIs : index === focus ? kinship.focusIs : "",
            plate: kinship?.plates.find((plate) => plate.box === index) ?? null,
            kinshipPlace: placeInKinship(index, kinship),
            folded: folded.filter((branch) => branch.box === index),
        };
        this.byKey.set(key, box);
        const copies = this.byPerson.get(person);
        if (copies) copies.push(box);
        else if (person) this.byPerson.set(person, [box]);
        return box;
    }

    private linesOf(family: PictureFamily, index: number, paths: readonly LinePath[]): FamilyLines {
        const area = boundsOf(
            family.lines.map(({ x1, y1, x2, y2 }) => ({
                left: Math.min(x1, x2),
                top: Math.min(y1, y2),
                right: Math.max(x1, x2),
                bottom: Math.max(y1, y2),
            })),
        );
        const lines = { index, family, paths, area };
        for (const box of new Set([...family.parents, ...family.children])) {
            const known = this.familiesByBox.get(box);
            if (known) known.push(lines);
            else this.familiesByBox.set(box, [lines]);
        }
        return lines;
    }
}

function placeInKinship(index: number, kinship: PictureValues["kinship"]): Box["kinshipPlace"] {
    if (!kinship) return null;
    if (index === kinship.other) return "other";
    return kinship.ways.some(({ ancestors }) => ancestors.includes(index)) ? "ancestor" : null;
}

function arcOf({ arcs, rings, art }: PictureValues, index: number): BoxArc | null {
    const arc = arcs[index];
    const cell = art?.cells[index];
    if (!arc || !rings || !cell) return null;
    const { radii, middleX, middleY } = rings;
    return {
        ...cell,
        from: arc.from,
        to: arc.to,
        isCentre: arc.ring === 0,
        inner: radii[arc.ring] ?? 0,
        outer: radii[arc.ring + 1] ?? 0,
        middleX,
        middleY,
    };
}

function markNumbers(marks: readonly PictureMark[]): ReadonlyMap<number, number[]> {
    const numbers = new Map<number, number[]>();
    for (const { boxes, number } of marks) {
        for (const box of boxes) {
            const known = numbers.get(box);
            if (!known) numbers.set(box, [number]);
            else if (!known.includes(number)) known.push(number);
        }
    }
    return numbers;
}

function areaOf(box: Pick<Box, "x" | "y" | "width" | "height">): Rectangle {
    return { left: box.x, top: box.y, right: box.x + box.width, bottom: box.y + box.height };
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
