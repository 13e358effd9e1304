// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Fits names into boxes. A name takes the largest of a few sizes in which no word is cut; before anything is
// cut, given names in the middle become initials. Widths are measured and remembered.

export const kFontFamily =
    "system-ui, -apple-system, 'Segoe UI', Roboto, 'Noto Sans', 'DejaVu Sans', sans-serif";

const kNameSizes = [13, 12, 11]; // px
const kUsualLines = 2; // a third one costs a size
const kMostRemembered = 20000;
const kEllipsis = "\u2026";

const widths = new Map<string, number>();
let pen: CanvasRenderingContext2D | null = null;

export interface FittedName {
    readonly lines: readonly string[];
    readonly size: number; // px
}

// In px. weight is that of CSS.
export function textWidth(text: string, size: number, weight: number): number {
    const key = size + "/" + weight + "/" + text;
    const known = widths.get(key);
    if (known !== undefined) return known;
    pen ??= document.createElement("canvas").getContext("2d");
    if (!pen) return text.length * size * 0.6;
    pen.font = `${weight} ${size}px ${kFontFamily}`;
    const width = pen.measureText(text).width;
    if (widths.size > kMostRemembered) widths.clear();
    widths.set(key, width);
    return width;
}

// parts are given name and surname in the order of reading; either may be empty.
export function fitName(parts: readonly string[], width: number, mostLines: number): FittedName {
    const words = parts.map(wordsOf).filter((part) => part.length > 0);
    for (const size of kNameSizes) {
        const lines = wrapWhole(
            words,
            size,
            width,
            size === kNameSizes[0] ? Math.min(kUsualLines, mostLines) : mostLines,
        );
        if (lines) return { lines, size };
    }
    const short = words.map(abbreviated);
    for (const size of kNameSizes.slice(1)) {
        const lines = wrapWhole(short, size, width, mostLines);
        if (lines) return { lines, size };
    }
    const size = kNameSizes.at(-1)!;
    return { lines: cutLines(short.flat(), size, width, mostLines), size };
}

// One line, with an ellipsis where it had to be cut.
export function fitLine(text: string, size: number, weight: number, width: number): string {
    if (textWidth(text, size, weight) <= width) return text;
    const letters = [...text];
    let low = 0;
    let high = letters.length;
    while (low < high) {
        const middle = (low + high + 1) >> 1;
        if (textWidth(letters.slice(0, middle).join("").trimEnd() + kEllipsis, size, weight) <= width)
            low = middle;
        else high = middle - 1;
    }
    return letters.slice(0, low).join("").trimEnd() + kEllipsis;
}

function wordsOf(text: string): string[] {
    return text.split(/\s+/u).filter((word) => word !== "");
}

// A line break between given name and surname if there is room for it, else wherever words allow.
function wrapWhole(parts: string[][], size: number, width: number, mostLines: number): string[] | null {
    if (parts.flat().some((word) => textWidth(word, size, 600) > width)) return null;
    const apart = parts.flatMap((part) => wrap(part, size, width));
    if (apart.length <= mostLines) return apart;
    const together = wrap(parts.flat(), size, width);
    return together.length <= mostLines ? together : null;
}

function wrap(words: readonly string[], size: number, width: number): string[] {
    const lines: string[] = [];
    for (const word of words) {
        const last = lines.at(-1);
        if (last !== undefined && textWidth(last + " " + word, size, 600) <= width)
            lines[lines.length - 1] = last + " " + word;
        else lines.push(word);
    }
    return lines;
}

// The first word stays; the others of more than two become initials.
function abbreviated(words: readonly string[]): string[] {
    if (words.length < 2) return [...words];
    return words.map((word, i) => (i === 0 || !/^\p{Lu}\p{Ll}{2,}/u.test(word) ? word : [...word][0] + "."));
}

function cutLines(words: readonly string[], size: number, width: number, mostLines: number): string[] {
    const lines = wrap(words, size, width);
    const rest = lines.slice(mostLines - 1).join(" ");
    const kept = rest ? [...lines.slice(0, mostLines - 1), rest] : lines;
    return kept.map((line) => fitLine(line, size, 600, width));
}
