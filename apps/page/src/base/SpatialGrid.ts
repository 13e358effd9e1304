// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Which of many rectangles touch a window. A plane cut into squares; a thing is listed in each square that it
// touches, so a question costs what is in sight and not what is in the picture.

export interface Rectangle {
    readonly left: number;
    readonly top: number;
    readonly right: number;
    readonly bottom: number;
}

const kSquare = 600; // points; a handful of boxes
const kMostSquares = 64; // of one thing or question; what is larger is kept in a list that every question reads

export class SpatialGrid {
    private readonly squares = new Map<string, number[]>();
    private readonly large: number[] = [];

    constructor(private readonly things: readonly Rectangle[]) {
        things.forEach((thing, index) => this.list(thing, index));
    }

    // Indices in rising order, each one once.
    within(window: Rectangle): number[] {
        const touching = (index: number) => touches(this.things[index]!, window);
        if (squareCount(window) > kMostSquares)
            return this.things.flatMap((thing, i) => (touches(thing, window) ? [i] : []));
        const found = new Set<number>(this.large.filter(touching));
        forEachSquare(window, (key) => {
            for (const index of this.squares.get(key) ?? []) if (touching(index)) found.add(index);
        });
        return [...found].sort((a, b) => a - b);
    }

    private list(thing: Rectangle, index: number): void {
        if (squareCount(thing) > kMostSquares) {
            this.large.push(index);
            return;
        }
        forEachSquare(thing, (key) => {
            const square = this.squares.get(key);
            if (square) square.push(index);
            else this.squares.set(key, [index]);
        });
    }
}

export function touches(a: Rectangle, b: Rectangle): boolean {
    return a.left <= b.right && b.left <= a.right && a.top <= b.bottom && b.top <= a.bottom;
}

export function encloses(outer: Rectangle, inner: Rectangle): boolean {
    return (
        outer.left <= inner.left && outer.top <= inner.top && outer.right >= inner.right && outer.bottom >= inner.bottom
    );
}

export function grown(r: Rectangle, dx: number, dy: number): Rectangle {
    return { left: r.left - dx, top: r.top - dy, right: r.right + dx, bottom: r.bottom + dy };
}

function square(v: number): number {
    return Math.floor(v / kSquare);
}

function squareCount(r: Rectangle): number {
    return (square(r.right) - square(r.left) + 1) * (square(r.bottom) - square(r.top) + 1);
}

function forEachSquare(r: Rectangle, visit: (key: string) => void): void {
    for (let column = square(r.left); column <= square(r.right); ++column) {
        for (let row = square(r.top); row <= square(r.bottom); ++row) visit(column + "," + row);
    }
}
