// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Asks for the paper to print on, one sheet or several that make a poster, and shows how the picture lies on them.

import type { PaperOptions, PaperSheets } from "olvane";
import { iconButton } from "../base/controls";
import { html, onClick } from "../base/dom";
import type { UiMessages } from "../messages/ui";
import { svgBlob } from "./saving";

const kPapers = ["A4", "A3", "A2", "A1", "A0", "letter"] as const;
const kMostOneWay = 10; // sheets

export class PaperDialog {
    readonly element: HTMLDialogElement;
    private readonly paper = html("select", { id: "paper" });
    private readonly rows = html("select", { id: "sheet-rows" });
    private readonly columns = html("select", { id: "sheet-columns" });
    private readonly preview = html("div", { class: "sheet-preview", "aria-hidden": "true" });
    private readonly message = html("p", { id: "sheet-message", role: "status" });
    private readonly print = html("button", { id: "print-now", type: "button", class: "plain" });
    private addresses: string[] = [];
    private shown: PaperSheets | null = null;

    // sheetsOf gives what is shown on that paper, or null before any family is open.
    constructor(
        private readonly ui: UiMessages,
        private readonly sheetsOf: (paper: PaperOptions) => PaperSheets | null,
    ) {
        const close = iconButton("print-dialog-close", "close", ui.close, () => this.element.close());
        const choice = (label: string, select: HTMLSelectElement) =>
            html("label", { class: "row" }, html("span", {}, label), select);
        this.element = html(
            "dialog",
            { id: "print-dialog", "aria-labelledby": "print-dialog-title" },
            html("div", { class: "dialog-head" }, html("h2", { id: "print-dialog-title" }, ui.paper.title), close),
            choice(ui.paper.paper, this.paper),
            choice(ui.paper.rows, this.rows),
            choice(ui.paper.columns, this.columns),
            this.preview,
            this.message,
            this.print,
        );
        for (const value of kPapers) {
            this.paper.append(html("option", { value }, value === "letter" ? ui.paper.letter : value));
        }
        for (const select of [this.rows, this.columns]) {
            for (let i = 1; i <= kMostOneWay; ++i) select.append(html("option", { value: i }, String(i)));
        }
        for (const select of [this.paper, this.rows, this.columns])
            select.addEventListener("change", () => this.show());
        this.print.textContent = ui.print;
        onClick(this.print, () => window.print());
        this.element.addEventListener("close", () => this.empty());
    }

    /** What is to be printed while the dialog is open; null else. */
    get sheets(): PaperSheets | null {
        return this.element.open ? this.shown : null;
    }

    open(): void {
        this.element.showModal();
        this.show();
    }

    private show(): void {
        this.empty();
        try {
            this.shown = this.sheetsOf({
                paper: this.paper.value,
                rows: Number(this.rows.value),
                columns: Number(this.columns.value),
            });
        } catch {
            this.message.textContent = this.ui.pictureFailed;
        }
        this.print.disabled = this.shown === null;
        if (this.shown) this.showSheets(this.shown);
    }

    private showSheets({ width, height, smallestName, cutBoxes, sheets }: PaperSheets): void {
        const columns = Math.max(...sheets.map(({ column }) => column)) + 1;
        const rows = Math.max(...sheets.map(({ row }) => row)) + 1;
        // As wide as the dialog, or as high as a third of the window.
        this.preview.style.gridTemplateColumns = `repeat(${columns}, minmax(0, 1fr))`;
        this.preview.style.maxWidth = `calc(38vh * ${(columns * width) / (rows * height)})`;
        for (const { row, column, svg } of sheets) {
            const address = URL.createObjectURL(svgBlob(svg));
            this.addresses.push(address);
            const image = html("img", { src: address, alt: "" });
            image.style.gridArea = `${row + 1} / ${column + 1}`;
            image.style.aspectRatio = `${width} / ${height}`;
            this.preview.append(image);
        }
        const { paper, language } = this.ui;
        const points = smallestName.toLocaleString(language, { maximumFractionDigits: 1 });
        const cut = cutBoxes > 0 ? " " + paper.cut(cutBoxes) : "";
        this.message.textContent = paper.names(sheets.length, points) + cut;
    }

    private empty(): void {
        this.shown = null;
        this.preview.replaceChildren();
        this.message.textContent = "";
        for (const address of this.addresses) URL.revokeObjectURL(address);
        this.addresses = [];
    }
}
