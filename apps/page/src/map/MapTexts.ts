// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Writes over the pixels of a map: names in boxes that have room for them, and from afar the names of branches and the
// years of rows. Of two labels that would overlap, the one of more persons stands.

import { type FamilyMap, lowerBound } from "./FamilyMap";
import type { Frame } from "./MapPixels";
import { kPersonLabel } from "./mapBytes";

export interface TextColours {
    readonly text: string;
    readonly quiet: string;
    readonly plate: string; // behind labels
    readonly edge: string;
    readonly font: string; // families of fonts
}

const kNamedBox = 54; // px of a box from which on names are in it
const kMostLabels = 48;
const kYearGap = 30; // px between the years of rows
const kYearRoom = 50; // px at the edge that are theirs
const kMostCached = 6000;

export class MapTexts {
    private readonly fitted = new Map<string, string>();
    private font = "";

    constructor(
        private readonly map: FamilyMap,
        private readonly context: CanvasRenderingContext2D,
        private readonly yearsOf: (person: number) => string,
        private readonly unknownName: string,
    ) {}

    draw(frame: Frame, colours: TextColours): void {
        const { context } = this;
        context.textBaseline = "alphabetic";
        if ((this.map.arrays.boxWidth * frame.sx) / frame.dpr >= kNamedBox) this.names(frame, colours);
        else this.labels(frame, colours);
        this.years(frame, colours);
    }

    // --- near ---

    private names(frame: Frame, colours: TextColours): void {
        const { x, rowY, rowStart, boxWidth, boxHeight } = this.map.arrays;
        const [left, right] = [-frame.ox / frame.sx - boxWidth, (frame.width - frame.ox) / frame.sx];
        for (let row = 0; row < rowY.length; ++row) {
            const top = Math.round(rowY[row]! * frame.sy) + frame.oy;
            const height = Math.round(boxHeight * frame.sy);
            if (top + height < 0 || top > frame.height) continue;
            const first = lowerBound(x, left, rowStart[row]!, rowStart[row + 1]!);
            const end = lowerBound(x, right, first, rowStart[row + 1]!);
            for (let p = first; p < end; ++p) {
                const px = Math.round(x[p]! * frame.sx) + frame.ox;
                this.box(frame, colours, p, px, top, Math.round(boxWidth * frame.sx), height);
            }
        }
    }

    private box(
        frame: Frame,
        colours: TextColours,
        p: number,
        left: number,
        top: number,
        width: number,
        height: number,
    ): void {
        const { context } = this;
        const [first, second] = this.map.nameLines(p);
        const lines = [first || this.unknownName, second, this.yearsOf(p)].filter((line) => line !== "");
        const size = Math.max(8, Math.min(30, Math.round(height / frame.dpr / 4)));
        const lineHeight = size * 1.22 * frame.dpr;
        const count = Math.min(lines.length, Math.max(1, Math.floor(height / lineHeight)));
        const room = width - 8 * frame.dpr;
        let y = top + (height - (count - 1) * lineHeight) / 2 + size * 0.36 * frame.dpr;
        context.textAlign = "center";
        lines.slice(0, count).forEach((line, i) => {
            const isYears = i > 0 && i === lines.length - 1;
            this.setFont(
                `${isYears ? 400 : 600} ${Math.round((isYears ? size - 1 : size) * frame.dpr)}px ${colours.font}`,
            );
            context.fillStyle = isYears ? colours.quiet : colours.text;
            context.fillText(this.fitting(line, room), left + width / 2, y);
            y += lineHeight;
        });
        const marks = this.map.marks(p);
        if (marks.length > 0) this.mark(frame, colours, marks.join(", "), left + width, top);
    }

    private mark(frame: Frame, colours: TextColours, text: string, right: number, top: number): void {
        this.setFont(`700 ${Math.round(10.5 * frame.dpr)}px ${colours.font}`);
        this.plate(colours, text, right - 10 * frame.dpr, top + 3 * frame.dpr, 11 * frame.dpr);
    }

    // --- far ---

    private labels(frame: Frame, colours: TextColours): void {
        const { levels, labels } = this.map.arrays;
        const count = levels.length / 2;
        if (count === 0) return;
        const k = (frame.sx * 4) / frame.dpr;
        const level = Math.min(count - 1, Math.max(0, Math.round(-Math.log2(k)) - levels[0]!));
        const end = level + 1 < count ? levels[2 * level + 3]! : labels.length / 4;
        const taken: [number, number, number, number][] = [];
        const { context } = this;
        context.textAlign = "center";
        for (let i = levels[2 * level + 1]!; i < end && taken.length < kMostLabels; ++i) {
            const x = labels[4 * i]! * frame.sx + frame.ox;
            const y = labels[4 * i + 1]! * frame.sy + frame.oy;
            if (x < 0 || y < 0 || x > frame.width || y > frame.height) continue;
            const weight = labels[4 * i + 3]! >>> 0;
            const size = Math.round(Math.min(19, 10 + 1.6 * Math.log10(weight + 1)) * frame.dpr);
            this.setFont(`600 ${size}px ${colours.font}`);
            const text = this.fitting(this.labelText(labels[4 * i + 2]!), 220 * frame.dpr);
            const half = context.measureText(text).width / 2 + 6 * frame.dpr;
            const box: [number, number, number, number] = [x - half, y - size, x + half, y + size];
            if (box[0] < kYearRoom * frame.dpr || box[2] > frame.width || taken.some((other) => overlap(other, box)))
                continue;
            taken.push(box);
            this.plate(colours, text, x, y, size);
        }
    }

    private labelText(text: number): string {
        return text < 0 ? this.map.name((text + kPersonLabel) | 0) || this.unknownName : this.map.text(text);
    }

    private plate(colours: TextColours, text: string, x: number, y: number, size: number): void {
        const { context } = this;
        const half = context.measureText(text).width / 2 + size * 0.3;
        context.textAlign = "center";
        context.fillStyle = colours.plate;
        context.fillRect(x - half, y - size * 0.72, 2 * half, size * 1.44);
        context.fillStyle = colours.text;
        context.fillText(text, x, y + size * 0.36);
    }

    // The middle year of the births in a row, at the window's edge, where rows are far enough apart.
    private years(frame: Frame, colours: TextColours): void {
        const { rowY, rowYear, boxHeight } = this.map.arrays;
        this.setFont(`500 ${Math.round(12 * frame.dpr)}px ${colours.font}`);
        let last = -Infinity;
        let lastYear = 0;
        for (let row = 0; row < rowY.length; ++row) {
            const y = (rowY[row]! + boxHeight / 2) * frame.sy + frame.oy;
            if (rowYear[row] === 0 || rowYear[row]! <= lastYear || y - last < kYearGap * frame.dpr) continue;
            if (y < 0 || y > frame.height) continue;
            [last, lastYear] = [y, rowYear[row]!];
            this.plate({ ...colours, text: colours.quiet }, String(rowYear[row]), 26 * frame.dpr, y, 12 * frame.dpr);
        }
    }

    // --- texts ---

    private setFont(font: string): void {
        if (font === this.font && this.context.font !== "10px sans-serif") return;
        this.font = this.context.font = font;
    }

    // With an ellipsis where there is too little room; most names come again in the next frame.
    private fitting(text: string, room: number): string {
        const key = `${Math.round(room)} ${this.font} ${text}`;
        let fitted = this.fitted.get(key);
        if (fitted !== undefined) return fitted;
        const letters = [...text];
        let count = letters.length;
        fitted = text;
        while (count > 1 && this.context.measureText(fitted).width > room) {
            const share = room / this.context.measureText(fitted).width;
            count = Math.min(count - 1, Math.max(1, Math.floor(count * share)));
            fitted = letters.slice(0, count).join("").trimEnd() + "…";
        }
        if (this.fitted.size > kMostCached) this.fitted.clear();
        this.fitted.set(key, fitted);
        return fitted;
    }
}

type Box = readonly [left: number, top: number, right: number, bottom: number];

function overlap(a: Box, b: Box): boolean {
    return a[0] < b[2] && b[0] < a[2] && a[1] < b[3] && b[1] < a[3];
}
