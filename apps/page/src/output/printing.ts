// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Puts the whole picture on one sheet of paper under its title, lying or standing as suits it, in colours made
// for paper; or on the sheets that were chosen, each on a page of its own.

import type { PaperSheets } from "olvane";
import { html } from "../base/dom";
import { drawingElement } from "./saving";

// What is to be printed: the title, and the text of an SVG file.
export interface Printed {
    readonly title: string;
    readonly drawing: string;
}

export class PrintSheet {
    readonly element = html("div", { id: "print-sheet", "aria-hidden": "true" });
    private pageRule: CSSStyleSheet | null = null;

    // Asked whenever the browser is about to print: sheets for those that were chosen, null where none were; draw
    // for the picture, null when there is none.
    constructor(sheets: () => PaperSheets | null, draw: () => Printed | null) {
        addEventListener("beforeprint", () => {
            this.empty();
            const chosen = sheets();
            if (chosen) this.fillSheets(chosen);
            else this.fill(draw());
        });
        addEventListener("afterprint", () => this.empty());
    }

    private fill(printed: Printed | null): void {
        if (!printed) return;
        const { svg, width, height } = drawingElement(printed.drawing);
        svg.setAttribute("width", "100%");
        svg.setAttribute("height", "100%");
        this.element.append(html("p", { dir: "auto" }, printed.title), svg);
        this.setPage(`size: ${width > height ? "landscape" : "portrait"}; margin: 10mm;`);
    }

    // The margins are part of each sheet.
    private fillSheets({ width, height, sheets }: PaperSheets): void {
        this.element.classList.add("sheets");
        for (const { svg } of sheets) {
            const page = html("div", { class: "page" }, drawingElement(svg).svg);
            // A page that is as high as the paper makes a blank one after it in some browsers.
            page.style.height = `${height - 0.5}mm`;
            this.element.append(page);
        }
        this.setPage(`size: ${width}mm ${height}mm; margin: 0;`);
    }

    private setPage(rules: string): void {
        this.pageRule = new CSSStyleSheet();
        this.pageRule.insertRule(`@page { ${rules} }`);
        document.adoptedStyleSheets = [...document.adoptedStyleSheets, this.pageRule];
    }

    private empty(): void {
        this.element.replaceChildren();
        this.element.classList.remove("sheets");
        document.adoptedStyleSheets = document.adoptedStyleSheets.filter((sheet) => sheet !== this.pageRule);
    }
}
