// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The page's set of colours as pixels and texts of a map need them.

import { html } from "../base/dom";
import type { PixelColours } from "./MapPixels";
import type { TextColours } from "./MapTexts";

export interface MapColours extends PixelColours {
    readonly texts: TextColours;
    readonly current: string;
}

const kHues = 12;

export function mapColours(element: HTMLElement): MapColours {
    const style = getComputedStyle(element);
    // A canvas knows the names of the system's colours, but not which set of them the page has.
    const probe = html("span");
    probe.style.setProperty("forced-color-adjust", "none");
    element.append(probe);
    const context = new OffscreenCanvas(1, 1).getContext("2d", { willReadFrequently: true })!;
    const pixel = (colour: string): number => {
        context.fillStyle = colour;
        context.fillRect(0, 0, 1, 1);
        return new Uint32Array(context.getImageData(0, 0, 1, 1).data.buffer)[0]!;
    };
    const named = (name: string): string => {
        probe.style.color = `var(${name}, #888)`;
        return getComputedStyle(probe).color;
    };
    const isDark = style.colorScheme.includes("dark");
    const light = isDark ? 68 : 42;
    const colours = {
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
    probe.remove();
    return colours;
}
