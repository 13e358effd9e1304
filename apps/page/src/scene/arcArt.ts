// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Draws one box of a round chart: a piece of a ring with the name in it, along the ring where the piece is wide and
// across it where it is narrow. Texts are turned so that none stands on its head.

import { svg } from "../base/dom";
import type { Box, BoxArc } from "../view/Picture";
import type { BoxLook } from "./boxArt";

const kYearsSize = 10;
const kInset = 4; // points on each side of a text
const kLeastRoom = 14; // points; less shows no text at all
const kSmallestName = 8;
const kLines = 12; // colours for lines of descent

const radians = (degrees: number) => (degrees * Math.PI) / 180;

// Clockwise from the top.
function pointAt({ middleX, middleY }: BoxArc, radius: number, degrees: number): [x: number, y: number] {
    return [middleX + radius * Math.sin(radians(degrees)), middleY - radius * Math.cos(radians(degrees))];
}

/** The outline of a piece, with its corner at the box's place. */
export function arcPath(arc: BoxArc, { x, y }: Pick<Box, "x" | "y">): string {
    const at = (radius: number, degrees: number) =>
        pointAt(arc, radius, degrees)
            .map((value, i) => (value - (i === 0 ? x : y)).toFixed(2))
            .join(" ");
    const span = Math.min(359.99, arc.to - arc.from);
    const to = arc.from + span;
    const large = span > 180 ? 1 : 0;
    const outer = `M${at(arc.outer, arc.from)}A${arc.outer} ${arc.outer} 0 ${large} 1 ${at(arc.outer, to)}`;
    if (arc.inner <= 0) return outer + (span > 359 ? "Z" : `L${at(0, 0)}Z`);
    return outer + `L${at(arc.inner, to)}A${arc.inner} ${arc.inner} 0 ${large} 0 ${at(arc.inner, arc.from)}Z`;
}

/** The class of a piece's colour, by its line of descent. */
export function lineClass(arc: BoxArc): string {
    return arc.line < 0 ? "" : "descent-" + (arc.line % kLines);
}

export function appendArc(group: SVGGElement, look: BoxLook, box: Box, arc: BoxArc): void {
    group.append(
        svg("path", {
            class: "frame",
            d: arcPath(arc, box),
            role: look.person ? "button" : "img",
            tabindex: -1,
            "aria-label": look.label,
            "aria-current": look.isFocus && "true",
        }),
        // Upon the frame: half of it would lie under the cells beside it.
        svg("path", { class: "ring", d: arcPath(arc, box) }),
    );
    appendText(group, look, box, arc);
}

function appendText(group: SVGGElement, look: BoxLook, { x, y }: Box, arc: BoxArc): void {
    const middle = (arc.from + arc.to) / 2;
    const radius = arc.inner <= 0 && arc.to - arc.from > 180 ? 0 : (arc.inner + arc.outer) / 2;
    const along = radians(arc.to - arc.from) * Math.max(radius, arc.outer / 2);
    const across = arc.outer - arc.inner;
    const isAcross = radius > 0 && across > along;
    const width = (radius === 0 ? 1.7 * arc.outer : isAcross ? across : along) - 2 * kInset;
    const height = (radius === 0 ? arc.outer : isAcross ? along : across) - 2;
    if (width < kLeastRoom || height < 9) return;
    const { texts } = look;
    const nameHeight = height - (look.years && height >= 26 ? 13 : 0);
    const name = texts.fitName(look.name, { width, height: nameHeight, gap: 1, lines: 3, smallest: kSmallestName });
    const hasYears = look.years !== "" && height >= (name.lines.length + 1) * 13;
    const years = hasYears ? texts.fitLine(look.years, kYearsSize, width) : "";
    const [cx, cy] = pointAt(arc, radius, middle);
    const turn = radius === 0 ? 0 : uprightTurn(isAcross ? middle - 90 : middle);
    const shown = [...name.lines, ...(years ? [years] : [])];
    const pitch = Math.max(years ? 12 : 0, name.size + 1);
    const top = -((shown.length - 1) * pitch) / 2 + 4;
    const holder = svg("g", {
        transform: `translate(${(cx - x).toFixed(1)} ${(cy - y).toFixed(1)}) rotate(${turn.toFixed(1)})`,
    });
    shown.forEach((line, i) =>
        holder.append(
            svg(
                "text",
                {
                    class: i < name.lines.length ? "name" : "years",
                    y: top + i * pitch,
                    "font-size": i < name.lines.length ? name.size : kYearsSize,
                    "aria-hidden": "true",
                    direction: look.rightToLeft && i < name.lines.length ? "rtl" : null,
                },
                line,
            ),
        ),
    );
    group.append(holder);
}

// The same line of text, but never upside down.
function uprightTurn(degrees: number): number {
    const turn = ((degrees % 360) + 360) % 360;
    return turn > 90 && turn < 270 ? turn - 180 : turn;
}
