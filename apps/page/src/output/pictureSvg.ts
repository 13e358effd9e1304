// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The whole picture as a drawing that stands by itself: colours and fonts as attributes, nothing that only
// the page understands.

import { drawBox, handleOf } from "../scene/boxArt";
import { drawFamily } from "../scene/familyLines";
import type { BoxContents } from "../scene/Scene";
import { kFontFamily } from "../scene/textFit";
import { svg } from "../base/dom";
import type { Picture } from "../view/Picture";

const kMargin = 24; // points
const kLooks = [
    "fill",
    "stroke",
    "stroke-width",
    "stroke-dasharray",
    "font-size",
    "font-weight",
    "text-anchor",
    "opacity",
    "unicode-bidi",
];
const kUsual: Readonly<Record<string, string>> = {
    stroke: "none",
    "stroke-dasharray": "none",
    opacity: "1",
    "text-anchor": "start",
    "unicode-bidi": "normal",
};
const kPageOnly = [
    "tabindex",
    "aria-current",
    "aria-hidden",
    "data-person-id",
    "data-xref",
    "data-box",
    "data-family",
    "class",
];

export interface Looks {
    readonly picture: Picture;
    readonly contents: BoxContents;
    readonly title: string;
    readonly root: ParentNode & Node;
}

export interface WholePicture {
    readonly svg: SVGSVGElement;
    readonly width: number; // points
    readonly height: number;
    readonly title: string;
}

// theme is the name of a set of colours in the style sheet.
// root is the tree of elements that the sheet holds for.
export function wholePicture(
    { picture, contents, title, root }: Looks,
    theme: string,
): WholePicture {
    const { left, top, right, bottom } = picture.bounds;
    const width = right - left + 2 * kMargin;
    const height = bottom - top + 2 * kMargin;
    const drawing = svg("svg", {
        xmlns: "http://www.w3.org/2000/svg",
        width,
        height,
        viewBox: `${left - kMargin} ${top - kMargin} ${width} ${height}`,
        role: "group",
        "aria-label": title,
        "font-family": kFontFamily,
        class: "whole",
    });
    drawing.append(
        svg("title", {}, title),
        svg("rect", { class: "paper", x: left - kMargin, y: top - kMargin, width, height }),
        svg("g", { "stroke-width": 1.6 }, ...picture.families.map(drawFamily)),
    );
    for (const box of picture.boxes) {
        const look = contents.lookOf(box);
        const element = drawBox(look, box);
        element.setAttribute("transform", `translate(${box.x} ${box.y})`);
        element.setAttribute("role", "img");
        element.setAttribute("aria-label", look.label);
        for (const name of ["role", "aria-label"]) handleOf(element).removeAttribute(name);
        if (!look.isFocus) element.querySelector(".ring")?.remove();
        element.prepend(svg("title", {}, look.label));
        drawing.append(element);
    }
    resolveLooks(drawing, theme, root);
    return { svg: drawing, width, height, title };
}

// As a file: with its declaration, and without what XML forbids.
export function svgText(drawing: SVGSVGElement): string {
    const text = new XMLSerializer().serializeToString(drawing);
    return (
        '<?xml version="1.0" encoding="UTF-8"?>\n' +
        text.replace(/[^\t\n\r\u0020-\ud7ff\ud800-\udfff\ue000-\ufffd]/g, "\ufffd") +
        "\n"
    );
}

// Asks the browser once for each kind of element how the style sheet has it look.
function resolveLooks(drawing: SVGSVGElement, theme: string, root: Node): void {
    const host = document.createElement("div");
    host.className = "unseen";
    host.dataset["theme"] = theme;
    host.append(drawing);
    root.appendChild(host);
    const known = new Map<string, readonly (readonly [string, string])[]>();
    const elements = [...drawing.querySelectorAll("rect, path, text, g")];
    for (const element of elements) {
        const kind = kindOf(element);
        let looks = known.get(kind);
        if (!looks) known.set(kind, (looks = looksOf(element)));
        for (const [name, value] of looks) if (!element.hasAttribute(name)) element.setAttribute(name, value);
    }
    for (const element of [drawing, ...elements]) for (const name of kPageOnly) element.removeAttribute(name);
    host.remove();
}

function kindOf(element: Element): string {
    const parents = [element, element.parentElement, element.parentElement?.parentElement];
    return (
        element.tagName +
        parents.map((one) => "/" + (one?.getAttribute("class") ?? "")).join("") +
        element.hasAttribute("font-size")
    );
}

function looksOf(element: Element): (readonly [string, string])[] {
    const isGroup = element.tagName === "g";
    const style = getComputedStyle(element);
    const names = isGroup
        ? ["opacity"]
        : element.tagName === "text"
          ? kLooks
          : kLooks.filter((name) => !/font|anchor|bidi/.test(name));
    return names
        .map((name) => [name, style.getPropertyValue(name)] as const)
        .filter(([name, value]) => value !== "" && value !== kUsual[name])
        .map(([name, value]) => [name, value.replace(/px$/, "")] as const);
}
