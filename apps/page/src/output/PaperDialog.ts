// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Asks for the paper to print on, one sheet or several that make a poster, and shows how the picture lies on them.

import type { PaperOptions, PaperSheets } from "olvane";
import { iconButton } from "../base/controls";
import { html, onClick } from "../base/dom";
import type { UiMessages } from "../messages/ui";
import type { ViewState } from "../view/ViewState";
import { svgBlob } from "./saving";

const kPapers = ["A4", "A3", "A2", "A1", "A0", "letter"] as const;
const kMostOneWay = 10; // sheets

/** What is often printed: a view, and the paper for it. */
const kPurposes = {
    grandparents: { paper: "A4", rows: 1, columns: 1, shows: { view: "hourglass", up: 2, down: 0 } },
    ancestors: { paper: "A3", rows: 1, columns: 1, shows: { view: "ancestors", up: 0 } },
    descendants: { paper: "A3", rows: 1, columns: 2, shows: { view: "descendants", down: 0 } },
    everybody: { paper: "A0", rows: 1, columns: 1, shows: { view: "everybody" } },
} as const;
export type Purpose = keyof typeof kPurposes;

export class PaperDialog {
    readonly element: HTMLDialogElement;
    private readonly purpose = html("select", { id: "purpose" });
    private readonly paper = html("select", { id: "paper" });
    private readonly rows = html("select", { id: "sheet-rows" });
    private readonly columns = html("select", { id: "sheet-columns" });
    private readonly preview = html("div", { class: "sheet-preview", "aria-hidden": "true" });
    private readonly message = html("p", { id: "sheet-message", role: "status" });
    private readonly print = html("button", { id: "print-now", type: "button", class: "plain" });
    private addresses: string[] = [];
    private shown: PaperSheets | null = null;

    // sheetsOf gives what is shown on that paper, or null before any family is open; look shows another view.
    constructor(
        private readonly ui: UiMessages,
        private readonly sheetsOf: (paper: PaperOptions) => PaperSheets | null,
        private readonly look: (wanted: Partial<ViewState>) => void,
    ) {
        const close = iconButton("print-dialog-close", "close", ui.close, () => this.element.close());
        const choice = (label: string, select: HTMLSelectElement) =>
            html("label", { class: "row" }, html("span", {}, label), select);
        this.element = html(
            "dialog",
            { id: "print-dialog", "aria-labelledby": "print-dialog-title" },
            html("div", { class: "dialog-head" }, html("h2", { id: "print-dialog-title" }, ui.paper.title), close),
            choice(ui.paper.purpose, this.purpose),
            choice(ui.paper.paper, this.paper),
            choice(ui.paper.rows, this.rows),
            choice(ui.paper.columns, this.columns),
            this.preview,
            this.message,
            this.print,
        );
        this.purpose.append(html("option", { value: "" }, ui.paper.shown));
        for (const value of Object.keys(kPurposes) as Purpose[])
            this.purpose.append(html("option", { value }, ui.paper.purposes[value]));
        this.purpose.addEventListener("change", () => this.choosePurpose());
        for (const value of kPapers) {
            this.paper.append(html("option", { value }, value === "letter" ? ui.paper.letter : value));
        }
        for (const select of [this.rows, this.columns]) {
            for (let i = 1; i <= kMostOneWay; ++i) select.append(html("option", { value: i }, String(i)));
        }
        for (const select of [this.paper, this.rows, this.columns])
            select.addEventListener("change", () => this.show());
        this.print.textContent = ui.paper.print;
        onClick(this.print, () => window.print());
        this.element.addEventListener("close", () => this.empty());
    }

    /** What is to be printed while the dialog is open; null else. */
    get sheets(): PaperSheets | null {
        return this.element.open ? this.shown : null;
    }

    open(): void {
        this.purpose.value = "";
        this.element.showModal();
        this.show();
    }

    private choosePurpose(): void {
        const chosen = kPurposes[this.purpose.value as Purpose] as (typeof kPurposes)[Purpose] | undefined;
        if (!chosen) return;
        this.paper.value = chosen.paper;
        this.rows.value = String(chosen.rows);
        this.columns.value = String(chosen.columns);
        this.look(chosen.shows);
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
