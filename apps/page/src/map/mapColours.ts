// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The page's set of colours as pixels and texts of a map need them.

import type { PixelColours } from "./MapPixels";
import type { TextColours } from "./MapTexts";

export interface MapColours extends PixelColours {
    readonly texts: TextColours;
    readonly current: string;
}

const kHues = 12;

export function mapColours(element: HTMLElement): MapColours {
    const style = getComputedStyle(element);
    const context = new OffscreenCanvas(1, 1).getContext("2d", { willReadFrequently: true })!;
    const pixel = (colour: string): number => {
        context.fillStyle = colour;
        context.fillRect(0, 0, 1, 1);
        return new Uint32Array(context.getImageData(0, 0, 1, 1).data.buffer)[0]!;
    };
    const named = (name: string) => style.getPropertyValue(name).trim() || "#888";
    const isDark = style.colorScheme.includes("dark");
    const light = isDark ? 68 : 42;
    return {
        page: pixel(named("--page")),
        line: pixel(named("--line")),
        fills: ["--male", "--female", "--other"].map((name) => pixel(named(name))),
        edges: ["--male-edge", "--female-edge", "--other-edge"].map((name) => pixel(named(name))),
        surnames: Array.from({ length: kHues }, (_, i) => pixel(`hsl(${(i * 360) / kHues} 55% ${light}%)`)),
        kin: pixel(named("--focus")),
        current: named("--accent"),
        texts: {
            text: named("--text"),
            quiet: named("--quiet"),
            plate: named("--raised"),
            edge: named("--edge"),
            font: style.fontFamily,
        },
    };
}
