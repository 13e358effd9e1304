// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Draws one box. A tall box has the silhouette on top and centred lines below it; a wide one has it at the
// left and lines beside it. Sex is shown by corners and silhouette as well as by colour. Colours come from the
// page's themes.

import type { BranchSize, KinshipPlate, NameParts, Sex, Texts } from "olvane";
import { svg } from "../base/dom";
import type { Box } from "../view/Picture";
import { appendArc, lineClass } from "./arcArt";
import { kSilhouettes } from "../base/silhouettes";

// Of one box, in points.
export interface Extent {
    readonly width: number;
    readonly height: number;
}

// The mark of a branch: with a count where it is folded, else a stroke that folds it. label says what a click does.
export interface BranchMark extends BranchSize {
    readonly isFolded: boolean;
    readonly label: string;
}

// Everything that a box shows and says.
export interface BoxLook {
    readonly person: number; // 0 for an unknown parent
    readonly xref: string;
    readonly sex: Sex;
    readonly name: NameParts;
    // Measures and fits what is written.
    readonly texts: Texts;
    readonly rightToLeft: boolean;
    // The address of a photograph; null for a silhouette.
    readonly photo: string | null;
    // What a program draws in place of everything within the frame.
    readonly inside: SVGElement | null;
    readonly years: string;
    // Birth and death each, for a room that is too narrow for years, and in fewer letters.
    readonly dates: readonly string[];
    readonly shortDates: readonly string[];
    // Further lines below the years.
    readonly details: readonly string[];
    // Of the box, for what is shown beside names and years.
    readonly factHeight: number;
    // How the person is related to the focus, in fewer and fewer letters; empty where it is not known, null where it is
    // not to be shown.
    readonly kinship: readonly string[] | null;
    // Relatives without a box: -1 for none, 0 for an unknown number.
    readonly hidden: number;
    // Marks of branches that are left out.
    readonly folded: readonly BranchMark[];
    // What the mark of further parents says; empty without one.
    readonly further: string;
    readonly kinshipPlace: Box["kinshipPlace"];
    // Numbers of the marks that lead to other boxes.
    readonly marks: readonly number[];
    readonly repeated: boolean;
    readonly isFocus: boolean;
    readonly label: string;
}

const kUsualHeight = 104; // of a tall box without room for a photograph
const kMarkHeight = 17;
const kMarkInside = 4; // by which marks and counts reach into a box, where no text goes
const kInset = 7; // px from the border to any text
const kTwoNameLines = 36; // px that a wide box has for them at least
const kYearsSize = 11;
const kLinePitch = 14;
const kKinSize = 10.5;
const kLeastKinSize = 9.5; // before a word is cut
const kKinPitch = 11; // between two lines of kinship

// Silhouettes of 44 by 40 px are drawn at this scale.
const kFigureScale = 0.56;

// Square corners for men, round ones for women, in between for everybody else.
const kCorners: Record<Sex, number> = { male: 3, female: 16, other: 8 };

export function drawBox(look: BoxLook, sizes: Box): SVGGElement {
    const classes = [
        "box",
        look.person ? look.sex : "missing",
        look.isFocus && "focus",
        look.kinshipPlace === "other" && "focus",
        look.kinshipPlace === "ancestor" && "ancestor",
        look.repeated && "repeated",
        sizes.arc && lineClass(sizes.arc),
    ];
    const box = svg("g", {
        class: classes.filter(Boolean).join(" "),
        "data-person-id": look.person || null,
        "data-xref": look.xref || null,
    });
    if (sizes.arc) {
        appendArc(box, look, sizes, sizes.arc);
        return box;
    }
    appendFrame(box, look, sizes);
    if (look.inside) {
        look.inside.setAttribute("aria-hidden", "true");
        box.append(look.inside);
    } else if (sizes.width > 1.5 * sizes.height) appendWideText(box, look, sizes);
    else appendTallText(box, look, sizes);
    for (const mark of look.folded) box.append(drawBranch(mark, look.texts, sizes));
    if (look.hidden >= 0 && look.folded.length === 0) appendBadge(box, look, sizes);
    if (look.repeated) appendDuplicateMark(box);
    if (look.further) appendFurtherMark(box, look.further);
    if (sizes.plate) box.append(drawPlate(sizes.plate, sizes));
    if (look.marks.length > 0) appendMarks(box, look, sizes);
    return box;
}

// Draws a box again in its element, which may have the keyboard focus.
export function repaintBox(box: SVGGElement, look: BoxLook, sizes: Box): void {
    const fresh = drawBox(look, sizes);
    const handle = handleOf(box);
    handle.setAttribute("aria-label", look.label);
    while (handle.nextSibling) handle.nextSibling.remove();
    const last = handleOf(fresh);
    while (last.nextSibling) box.append(last.nextSibling);
}

// What takes the keys and is read out: the frame. The texts beside it are for the eye alone.
export function handleOf(box: SVGGElement): SVGElement {
    return box.querySelector<SVGElement>(":scope > .frame")!;
}

function appendFrame(box: SVGGElement, look: BoxLook, { width: nodeWidth, height: nodeHeight }: Extent): void {
    const rx = kCorners[look.sex];
    box.append(
        svg("rect", {
            class: "ring",
            x: -5,
            y: -5,
            width: nodeWidth + 10,
            height: nodeHeight + 10,
            rx: rx + 5,
        }),
        svg("rect", {
            class: "frame",
            width: nodeWidth,
            height: nodeHeight,
            rx,
            role: look.person ? "button" : "img",
            tabindex: -1,
            "aria-label": look.label,
            "aria-current": look.isFocus && "true",
        }),
    );
}

function appendTallText(box: SVGGElement, look: BoxLook, { width: nodeWidth, height: nodeHeight }: Extent): void {
    const middle = nodeWidth / 2;
    const room = nodeWidth - 2 * kInset;
    const lastLine = nodeHeight - 8;
    const facts = factLines(look, room);
    const kin = kinLines(look, room);
    const kinHeight = look.kinship === null ? 0 : kLinePitch + kKinPitch * Math.max(0, kin.lines.length - 1);
    const firstFact = lastLine - kinHeight - kLinePitch * Math.max(0, facts.length - 1);
    const bottom = facts.length > 0 || look.kinship !== null ? firstFact - kYearsSize - 1 : nodeHeight - 6;
    // What a box is higher than usual, but for facts, is for the photograph.
    const fullHeight = 22 + Math.max(0, nodeHeight - kUsualHeight - look.factHeight);
    const nameBelow = (figureHeight: number) =>
        look.texts.fitName(look.name, { width: room, height: bottom - 9 - figureHeight, gap: 1, lines: 3 });
    // A second line of kinship takes its room from the figure where the name would lose words.
    const smallHeight = fullHeight - kKinPitch;
    const lettersBelow = (figureHeight: number) => nameBelow(figureHeight).lines.join("").replaceAll(" ", "");
    const isCrowded = kin.lines.length > 1 && lettersBelow(fullHeight) !== lettersBelow(smallHeight);
    const figureHeight = isCrowded ? smallHeight : fullHeight;
    const name = nameBelow(figureHeight);
    const top = 9 + figureHeight;
    const pitch = name.size + (name.lines.length > 2 ? 1 : 2);
    const firstY = top + (bottom - top - name.lines.length * pitch) / 2 + name.size - 1;

    box.append(figure(look, middle, 7, figureHeight));
    name.lines.forEach((line, i) =>
        box.append(text("name", middle, firstY + i * pitch, line, look.rightToLeft, name.size)),
    );
    facts.forEach((line, i) => box.append(text("years", middle, firstFact + i * kLinePitch, line)));
    kin.lines.forEach((line, i) =>
        box.append(kinText(middle, lastLine - kKinPitch * (kin.lines.length - 1 - i), line, kin.size)),
    );
}

function appendWideText(box: SVGGElement, look: BoxLook, { width: nodeWidth, height: nodeHeight }: Extent): void {
    const left = look.photo ? 54 : 40;
    const right = nodeWidth - kInset;
    const room = right - left;
    const facts = factLines(look, room);
    const joined = joinedFacts(look, facts, room);
    const kin = joined ? { lines: [], size: kKinSize } : kinLines(look, room);
    const kinHeight = kin.lines.length > 0 ? kLinePitch + kKinPitch * (kin.lines.length - 1) : 0;
    const lower = facts.length * kLinePitch + kinHeight;
    const nameHeight = nodeHeight - 8 - lower;
    const name = look.texts.fitName(look.name, {
        width: room,
        height: nameHeight,
        gap: 2,
        lines: nameHeight < kTwoNameLines ? 1 : 2,
    });
    const pitch = name.size + 2;
    const height = name.lines.length * pitch + lower;
    const firstY = (nodeHeight - height) / 2 + name.size - 1;
    // In the other direction a line begins at the right edge of its room.
    const x = look.rightToLeft ? right : left;

    const figureHeight = look.photo ? nodeHeight - 12 : 22;
    box.append(figure(look, look.photo ? 28 : 21, (nodeHeight - figureHeight) / 2, figureHeight));
    name.lines.forEach((line, i) => box.append(text("name", x, firstY + i * pitch, line, look.rightToLeft, name.size)));
    const firstFact = firstY + name.lines.length * pitch;
    (joined ? [joined] : facts).forEach((line, i) => box.append(text("years", left, firstFact + i * kLinePitch, line)));
    const firstKin = firstFact + facts.length * kLinePitch;
    kin.lines.forEach((line, i) => box.append(kinText(left, firstKin + i * kKinPitch, line, kin.size)));
    box.classList.add("wide");
}

// Years and kinship in one line if they fit and nothing else is shown; empty where they do not.
function joinedFacts({ kinship, factHeight, texts }: BoxLook, facts: readonly string[], room: number): string {
    if (factHeight > 0 || facts.length !== 1 || !kinship?.[0]) return "";
    const joined = facts[0] + " \u00b7 " + kinship[0];
    return texts.width(joined, kYearsSize) <= room ? joined : "";
}

interface SizedLines {
    readonly lines: readonly string[];
    readonly size: number;
}

// The fullest wording of a kinship that has room, in one line or in two; the last ones have room in every box.
function kinLines({ kinship, texts }: BoxLook, room: number): SizedLines {
    for (const wording of kinship ?? []) {
        const size = [kKinSize, kLeastKinSize].find((size) => texts.width(wording, size) <= room);
        if (size) return { lines: [wording], size };
        const { lines, whole } = texts.fitLines(wording, kLeastKinSize, room, 2);
        if (whole) return { lines, size: kLeastKinSize };
    }
    return { lines: [], size: kKinSize };
}

// Years or dates, then the details.
function factLines({ years, dates, shortDates, details, texts }: BoxLook, room: number): string[] {
    const hasRoom = (line: string) => texts.width(line, kYearsSize) <= room;
    const life = hasRoom(years) ? [years] : dates.map((line, i) => (hasRoom(line) ? line : shortDates[i]!));
    const lines = [...life, ...details].filter(Boolean);
    return lines.map((line) => texts.fitLine(line, kYearsSize, room));
}

// x is its middle, y its upper edge.
function figure(look: BoxLook, x: number, y: number, height: number): SVGElement {
    if (look.photo) {
        const width = Math.min(height, 44);
        return svg("image", {
            class: "portrait",
            href: look.photo,
            x: x - width / 2,
            y,
            width,
            height,
            preserveAspectRatio: "xMidYMid slice",
        });
    }
    if (!look.person) return text("unknown", x, y + height / 2 + 8, "?");
    const scale = (kFigureScale * Math.min(height, 44)) / 22;
    return svg("path", {
        class: "figure",
        d: kSilhouettes[look.sex],
        transform: `translate(${x - 22 * scale} ${y + (height - 40 * scale) / 2}) scale(${scale})`,
    });
}

function kinText(x: number, y: number, line: string, size: number): SVGTextElement {
    return text("kin", x, y, line, false, size);
}

function text(
    className: string,
    x: number,
    y: number,
    content: string,
    rightToLeft = false,
    size?: number,
): SVGTextElement {
    const line = svg(
        "text",
        { class: className, x, y: Math.round(y * 10) / 10, "font-size": size, "aria-hidden": "true" },
        content,
    );
    if (rightToLeft) line.setAttribute("direction", "rtl");
    return line;
}

// On the upper edge, where no lines go.
function appendBadge(box: SVGGElement, { hidden, texts }: BoxLook, { width: nodeWidth }: Extent): void {
    const label = hidden > 0 ? "+" + hidden : "+";
    const width = Math.max(20, texts.width(label, 10.5, true) + 10);
    const badge = svg("g", {
        class: "badge",
        "aria-hidden": "true",
        transform: `translate(${nodeWidth - width + 8} ${kMarkInside - kMarkHeight})`,
    });
    badge.append(svg("rect", { width, height: kMarkHeight, rx: 8.5 }), svg("text", { x: width / 2, y: 12.3 }, label));
    box.append(badge);
}

// On the lower edge: the same number stands at every box that belongs together.
function appendMarks(box: SVGGElement, { marks, texts }: BoxLook, { height }: Extent): void {
    const label = marks.slice(0, 3).join(" \u00b7 ") + (marks.length > 3 ? " \u2026" : "");
    const width = Math.max(20, texts.width(label, 10.5, true) + 10);
    const badge = svg("g", {
        class: "mark",
        "aria-hidden": "true",
        transform: `translate(-8 ${height - kMarkInside})`,
    });
    badge.append(svg("rect", { width, height: kMarkHeight, rx: 8.5 }), svg("text", { x: width / 2, y: 12.3 }, label));
    box.append(badge);
}

/** On the edge where the branch stands or would stand. */
export function drawBranch(
    { branch, side, count, isFolded, label }: BranchMark,
    texts: Texts,
    box: Extent,
): SVGElement {
    const sign = isFolded ? "+" + count : "\u2212";
    const wide = Math.max(20, texts.width(sign, 10.5, true) + 10);
    const x = side === "left" ? 0 : side === "right" ? box.width : box.width / 2;
    const y = side === "top" ? -4 : side === "bottom" ? box.height + 4 : box.height / 2;
    return svg(
        "g",
        { class: isFolded ? "fold badge" : "fold mark", "data-branch": branch, transform: `translate(${x} ${y})` },
        svg("title", {}, label),
        svg("rect", { class: "reach", x: -wide / 2 - 3, y: -13, width: wide + 6, height: 26 }),
        svg("rect", { x: -wide / 2, y: -8.5, width: wide, height: 17, rx: 8.5 }),
        svg("text", { y: 3.8, "aria-hidden": "true" }, sign),
    );
}

function appendDuplicateMark(box: SVGGElement): void {
    const d = "M-.5 3.5h8v8h-8zM3.5 3.5v-4h8v8h-4";
    box.append(
        svg(
            "g",
            { class: "duplicate", transform: "translate(0 -1)" },
            svg("rect", { x: -5, y: -5, width: 21, height: 21, rx: 6 }),
            svg("path", { d }),
        ),
    );
}

// Two arrows up at the left edge; a click shows other parents of the person.
function appendFurtherMark(box: SVGGElement, title: string): void {
    const mark = svg("g", { class: "further", transform: "translate(-10 26)" });
    mark.append(
        svg("title", {}, title),
        svg("rect", { width: 22, height: 22, rx: 11 }),
        svg("path", { d: "M7.5 16.5v-10m-3 3 3-3 3 3M14.5 16.5v-10m-3 3 3-3 3 3" }),
    );
    box.append(mark);
}

// What the one of a kinship is to the other, at a place outside the box that the module found.
function drawPlate({ x, y, width, height, lines }: KinshipPlate, box: Box): SVGElement {
    const plate = svg("g", { class: "caption", transform: `translate(${x - box.x} ${y - box.y})` });
    plate.append(svg("rect", { width, height, rx: 6 }));
    lines.forEach((line, i) =>
        plate.append(svg("text", { x: width / 2, y: 13 + 13 * i, "aria-hidden": "true" }, line)),
    );
    return plate;
}
