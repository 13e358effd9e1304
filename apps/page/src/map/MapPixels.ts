// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Draws boxes and lines of a map straight into pixels: all of them are level or upright, so each is a few runs of one
// colour, and a browser that draws in software is not asked for a hundred thousand paths. What is too small to
// be distinguished is not drawn one by one: of boxes within a column of pixels the first, of many lines the longest of each
// block. So the work grows with the window, not with the family.

import { type FamilyMap, lowerBound } from "./FamilyMap";
import type { Lines } from "./mapBytes";

// screen = world * (sx, sy) + (ox, oy), in device px; the world is in quarters of a point.
export interface Frame {
    readonly sx: number;
    readonly sy: number;
    readonly ox: number; // whole
    readonly oy: number; // whole
    readonly width: number;
    readonly height: number;
    readonly dpr: number;
}

/** As the pixels have them: 0xAABBGGRR. */
export interface PixelColours {
    readonly page: number;
    readonly line: number;
    readonly fills: readonly number[]; // by sex
    readonly edges: readonly number[];
    readonly surnames: readonly number[]; // of branches from afar
    readonly kin: number;
}

const kBlocks = [8, 64, 512]; // lines of which the longest stands for all
const kMostLines = 12000; // drawn in a frame
const kFar = 3; // px of a box below which colours are those of surnames
const kNear = 60; // px of a box from which on lines have dashes and gaps
const kGap = 4; // quarters of a point beside an upright, less than to its neighbour
const kEdged = 8; // px of a box from which on it has an edge
const kDashed = 3; // the role of lines to children that are none by birth
const kDivorcedLine = 1;
const kJoined = 4; // of the flags
const kDivorced = 8;

export class MapPixels {
    private image = new ImageData(1, 1);
    private pixels = new Uint32Array(1);
    private readonly longest: { bars: Uint32Array[]; uprights: Uint32Array[] };
    private isNear = false;
    private readonly furthest: Int32Array; // of each block of 64 bars, the greatest x2

    constructor(private readonly map: FamilyMap) {
        const { bars, uprights, barStart, uprightStart } = map.arrays;
        this.longest = { bars: longestOf(bars, barStart), uprights: longestOf(uprights, uprightStart) };
        this.furthest = new Int32Array(Math.ceil(bars.high.length / 64)).fill(-(2 ** 31));
        bars.high.forEach((x2, i) => (this.furthest[i >> 6] = Math.max(this.furthest[i >> 6]!, x2)));
    }

    /** kin are persons who stand out. */
    draw(frame: Frame, colours: PixelColours, kin: ReadonlySet<number>): ImageData {
        const { width, height } = frame;
        if (this.image.width !== width || this.image.height !== height) {
            this.image = new ImageData(width, height);
            this.pixels = new Uint32Array(this.image.data.buffer);
        }
        this.pixels.fill(colours.page);
        this.drawLines(frame, colours);
        this.drawRows(frame, colours, kin);
        return this.image;
    }

    // --- lines ---

    private drawLines(frame: Frame, colours: PixelColours): void {
        const { arrays } = this.map;
        const { bandTop, bandBottom, barStart, uprightStart } = arrays;
        const [left, right] = [-frame.ox / frame.sx, (frame.width - frame.ox) / frame.sx];
        const [top, bottom] = [-frame.oy / frame.sy, (frame.height - frame.oy) / frame.sy];
        const seen: { band: number; first: number; end: number; from: number; to: number }[] = [];
        let total = 0;
        for (let band = 0; band < bandTop.length; ++band) {
            if (bandBottom[band]! < top || bandTop[band]! > bottom) continue;
            const [first, end] = [uprightStart[band]!, uprightStart[band + 1]!];
            const from = lowerBound(arrays.uprights.at, left, first, end);
            const to = lowerBound(arrays.uprights.at, right, from, end);
            const lastBar = lowerBound(arrays.bars.low, right, barStart[band]!, barStart[band + 1]!);
            total += to - from + lastBar - lowerBound(arrays.bars.low, left, barStart[band]!, lastBar);
            seen.push({ band, first: from, end: to, from: barStart[band]!, to: lastBar });
        }
        const fitting = kBlocks.findIndex((size) => total <= kMostLines * size);
        const level = total <= kMostLines ? -1 : fitting < 0 ? kBlocks.length - 1 : fitting;
        const boxPx = arrays.boxWidth * frame.sx;
        const paint = mixed(colours.page, colours.line, Math.min(1, Math.max(0.3, boxPx / (24 * frame.dpr))));
        this.isNear = boxPx > kNear * frame.dpr;
        const thick = this.thickness(frame);
        for (const { from, to } of seen)
            this.each("bars", level, from, to, left, (i) => this.bar(frame, i, paint, thick));
        // Bars pass below uprights, with a gap, so that no crossing looks like a corner.
        for (const { first, end } of seen)
            this.each("uprights", level, first, end, -Infinity, (i) =>
                this.upright(frame, i, paint, thick, colours.page),
            );
    }

    private thickness({ dpr }: Frame): number {
        return this.isNear ? Math.max(1, Math.round(1.4 * dpr)) : 1;
    }

    // Those from begin to end that reach beyond left, or the longest of each block of them.
    private each(
        kind: "bars" | "uprights",
        level: number,
        begin: number,
        end: number,
        left: number,
        draw: (i: number) => void,
    ): void {
        const high = this.map.arrays.bars.high;
        const isBar = kind === "bars";
        if (level < 0) {
            for (let i = begin; i < end; ++i) {
                if (isBar && (i & 63) === 0 && this.furthest[i >> 6]! < left) i += 63;
                else if (!isBar || high[i]! >= left) draw(i);
            }
            return;
        }
        const size = kBlocks[level]!;
        const longest = this.longest[kind][level]!;
        for (let block = Math.ceil(begin / size); block * size < end; ++block) {
            const i = longest[block]!;
            if (i >= begin && i < end && (!isBar || high[i]! >= left)) draw(i);
        }
    }

    private bar(frame: Frame, i: number, paint: number, thick: number): void {
        const { low, high, at, roles } = this.map.arrays.bars;
        const y = Math.round(at[i]! * frame.sy) + frame.oy;
        const x1 = Math.round(low[i]! * frame.sx) + frame.ox;
        const x2 = Math.round(high[i]! * frame.sx) + frame.ox + thick;
        const role = roles[i]!;
        if (this.isNear && (role === kDashed || role === kDivorcedLine))
            this.dashes(frame, x1, x2, y, thick, paint, true);
        else this.rect(frame, x1, y, x2, y + thick, paint);
    }

    private upright(frame: Frame, i: number, paint: number, thick: number, page: number): void {
        const { low, high, at, roles } = this.map.arrays.uprights;
        const x = Math.round(at[i]! * frame.sx) + frame.ox;
        const y1 = Math.round(low[i]! * frame.sy) + frame.oy;
        const y2 = Math.round(high[i]! * frame.sy) + frame.oy + thick;
        if (this.isNear) {
            const gap = Math.max(1, Math.round(frame.sx * kGap));
            this.rect(frame, x - gap, y1 + gap + thick, x + thick + gap, y2 - gap - thick, page);
        }
        if (this.isNear && roles[i] === kDashed) this.dashes(frame, y1, y2, x, thick, paint, false);
        else this.rect(frame, x, y1, x + thick, y2, paint);
    }

    private dashes(
        frame: Frame,
        from: number,
        to: number,
        at: number,
        thick: number,
        paint: number,
        isLevel: boolean,
    ): void {
        const step = 3 * thick;
        const limit = isLevel ? frame.width : frame.height;
        for (
            let one = from < 0 ? from + Math.floor(-from / (2 * step)) * 2 * step : from;
            one < Math.min(to, limit);
            one += 2 * step
        ) {
            const end = Math.min(to, one + step);
            if (isLevel) this.rect(frame, one, at, end, at + thick, paint);
            else this.rect(frame, at, one, at + thick, end, paint);
        }
    }

    // --- boxes ---

    private drawRows(frame: Frame, colours: PixelColours, kin: ReadonlySet<number>): void {
        const { rowY, rowStart, x, boxWidth, boxHeight } = this.map.arrays;
        const [left, right] = [-frame.ox / frame.sx - boxWidth, (frame.width - frame.ox) / frame.sx];
        const rowPx = rowY.length > 1 ? ((rowY[rowY.length - 1]! - rowY[0]!) / (rowY.length - 1)) * frame.sy : 1;
        const thin = Math.min(5 * frame.dpr, Math.max(1, Math.floor(rowPx / 2)));
        const isFar = boxWidth * frame.sx < kFar * frame.dpr;
        for (let row = 0; row < rowY.length; ++row) {
            const top = Math.round(rowY[row]! * frame.sy) + frame.oy;
            const height = Math.max(thin, Math.round(boxHeight * frame.sy));
            if (top + height < 0 || top > frame.height) continue;
            const first = lowerBound(x, left, rowStart[row]!, rowStart[row + 1]!);
            const end = lowerBound(x, right, first, rowStart[row + 1]!);
            if (isFar) this.columns(frame, colours, kin, top, height, first, end);
            else for (let p = first; p < end; ++p) this.box(frame, colours, p, top, height, kin.has(p));
        }
    }

    private columns(
        frame: Frame,
        colours: PixelColours,
        kin: ReadonlySet<number>,
        top: number,
        height: number,
        first: number,
        end: number,
    ): void {
        const { x, surnames, boxWidth } = this.map.arrays;
        const width = Math.max(1, Math.round(boxWidth * frame.sx));
        for (let p = first; p < end;) {
            const px = Math.floor(x[p]! * frame.sx) + frame.ox;
            const surname = surnames[p]!;
            const hue = surname === 0 ? colours.line : colours.surnames[surname % colours.surnames.length]!;
            this.rect(frame, px, top, px + width, top + height, kin.has(p) ? colours.kin : hue);
            // Past all who begin in this column of pixels; next door first, as most columns have one or none.
            const next = (px + 1 - frame.ox) / frame.sx;
            if (++p < end && x[p]! < next) p = lowerBound(x, next, p, end);
        }
    }

    private box(frame: Frame, colours: PixelColours, p: number, top: number, height: number, isKin: boolean): void {
        const { x, boxWidth, flags } = this.map.arrays;
        const px = Math.round(x[p]! * frame.sx) + frame.ox;
        const width = Math.max(1, Math.round((x[p]! + boxWidth) * frame.sx) + frame.ox - px);
        const flag = flags[p]!;
        const [fill, edge] = [colours.fills[flag & 3]!, isKin ? colours.kin : colours.edges[flag & 3]!];
        if ((flag & kJoined) !== 0) {
            const y = top + (height >> 1);
            const to = Math.round(x[p + 1]! * frame.sx) + frame.ox;
            const thick = this.thickness(frame);
            if ((flag & kDivorced) !== 0 && this.isNear)
                this.dashes(frame, px + width, to, y, thick, colours.line, true);
            else this.rect(frame, px + width, y, to, y + thick, colours.line);
        }
        if (width < kEdged * frame.dpr)
            return this.rect(frame, px, top, px + width, top + height, isKin ? colours.kin : edge);
        const border = Math.round((isKin ? 2.5 : 1.2) * frame.dpr);
        this.rect(frame, px, top, px + width, top + height, edge);
        this.rect(frame, px + border, top + border, px + width - border, top + height - border, fill);
    }

    private rect({ width, height }: Frame, x1: number, y1: number, x2: number, y2: number, paint: number): void {
        const left = Math.max(0, x1);
        const right = Math.min(width, x2);
        const end = Math.min(height, y2);
        const { pixels } = this;
        if (left >= right) return;
        if (right - left > 12) {
            for (let y = Math.max(0, y1); y < end; ++y) pixels.fill(paint, y * width + left, y * width + right);
            return;
        }
        for (let y = Math.max(0, y1); y < end; ++y)
            for (let i = y * width + left, to = y * width + right; i < to; ++i) pixels[i] = paint;
    }
}

// Of each block of lines, counted over all bands, the longest, for blocks of each size. A block that two bands share
// may stand for the one alone.
function longestOf({ low, high }: Lines, starts: Uint32Array): Uint32Array[] {
    const count = starts[starts.length - 1]!;
    return kBlocks.map((size) => {
        const longest = new Uint32Array(Math.ceil(count / size));
        for (let i = 0; i < count; ++i) {
            const block = Math.floor(i / size);
            const best = longest[block]!;
            if (i % size === 0 || high[i]! - low[i]! > high[best]! - low[best]!) longest[block] = i;
        }
        return longest;
    });
}

/** Of two colours as the pixels have them. */
export function mixed(a: number, b: number, share: number): number {
    const channel = (shift: number) => {
        const [from, to] = [(a >>> shift) & 255, (b >>> shift) & 255];
        return Math.round(from + (to - from) * share) << shift;
    };
    return (channel(0) | channel(8) | channel(16) | 0xff000000) >>> 0;
}
