// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Puts the whole picture on one sheet of paper under its title, lying or standing as suits it, in colours made
// for paper.

import { html } from "../base/dom";
import { drawingElement } from "./saving";

// What is to be printed: the title, and the text of an SVG file.
export interface Printed {
    readonly title: string;
    readonly drawing: string;
}

export class PrintSheet {
    readonly element = html("div", { id: "print-sheet", "aria-hidden": "true" });
    private orientation: CSSStyleSheet | null = null;

    // draw makes the picture whenever the browser is about to print, or gives null when there is none.
    constructor(draw: () => Printed | null) {
        addEventListener("beforeprint", () => this.fill(draw()));
        addEventListener("afterprint", () => this.empty());
    }

    private fill(printed: Printed | null): void {
        this.empty();
        if (!printed) return;
        const { svg, width, height } = drawingElement(printed.drawing);
        svg.setAttribute("width", "100%");
        svg.setAttribute("height", "100%");
        this.element.append(html("p", { dir: "auto" }, printed.title), svg);
        this.orientation = new CSSStyleSheet();
        this.orientation.insertRule(`@page { size: ${width > height ? "landscape" : "portrait"}; margin: 10mm; }`);
        document.adoptedStyleSheets = [...document.adoptedStyleSheets, this.orientation];
    }

    private empty(): void {
        this.element.replaceChildren();
        document.adoptedStyleSheets = document.adoptedStyleSheets.filter((sheet) => sheet !== this.orientation);
    }
}
