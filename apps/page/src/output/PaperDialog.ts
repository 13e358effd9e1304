// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Asks for the paper to print on, one sheet or several that make a poster, and shows how the picture lies on them.

import { LayoutError, type PaperOptions, type PaperSheets } from "olvane";
import { iconButton } from "../base/controls";
import { html, onClick } from "../base/dom";
import type { UiMessages } from "../messages/ui";
import type { ViewState } from "../view/ViewState";
import { svgBlob } from "./saving";

const kMostOneWay = 10; // sheets
const kMostShown = 100; // sheets of a preview
const kReadableName = 4; // points
const kResolutions = [96, 150, 192, 300, 600] as const; // pixels an inch
const kUsualResolution = 192;

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
    private readonly scale = html("input", { id: "sheet-scale", type: "number", min: 0.01, max: 100, step: "any" });
    private readonly dpi = html("select", { id: "sheet-dpi" });
    private readonly preview = html("div", { class: "sheet-preview", "aria-hidden": "true" });
    private readonly message = html("p", { id: "sheet-message", role: "status" });
    private readonly print = html("button", { id: "print-now", type: "button", class: "plain" });
    private readonly png = html("button", { id: "sheets-png", type: "button", class: "plain" });
    private addresses: string[] = [];
    private shown: PaperSheets | null = null;

    // sheetsOf gives what is shown on that paper, or null before any family is open; look shows another view, and
    // save hands the sheets to the browser's downloads as PNG at a resolution in pixels an inch.
    constructor(
        private readonly ui: UiMessages,
        private readonly papers: readonly string[],
        private readonly sheetsOf: (paper: PaperOptions) => PaperSheets | null,
        private readonly look: (wanted: Partial<ViewState>) => void,
        private readonly save: (sheets: PaperSheets, dpi: number) => Promise<void>,
    ) {
        const close = iconButton("print-dialog-close", "close", ui.close, () => this.element.close());
        const choice = (label: string, select: HTMLElement) =>
            html("label", { class: "row" }, html("span", {}, label), select);
        this.element = html(
            "dialog",
            { id: "print-dialog", "aria-labelledby": "print-dialog-title" },
            html("div", { class: "dialog-head" }, html("h2", { id: "print-dialog-title" }, ui.paper.title), close),
            choice(ui.paper.purpose, this.purpose),
            choice(ui.paper.paper, this.paper),
            choice(ui.paper.rows, this.rows),
            choice(ui.paper.columns, this.columns),
            choice(ui.paper.scale, this.scale),
            this.preview,
            this.message,
            choice(ui.paper.dpi, this.dpi),
            html("div", { class: "dialog-foot" }, this.print, this.png),
        );
        this.fillChoices();
        for (const input of [this.paper, this.rows, this.columns, this.scale])
            input.addEventListener("change", () => this.show());
        this.purpose.addEventListener("change", () => this.choosePurpose());
        this.print.textContent = ui.paper.print;
        this.png.textContent = ui.paper.savePng;
        onClick(this.print, () => {
            this.show(); // with the photographs that were unpacked since
            window.print();
        });
        onClick(this.png, () => void this.savePng());
        this.element.addEventListener("close", () => this.empty());
    }

    private fillChoices(): void {
        const { ui } = this;
        this.purpose.append(html("option", { value: "" }, ui.paper.shown));
        for (const value of Object.keys(kPurposes) as Purpose[])
            this.purpose.append(html("option", { value }, ui.paper.purposes[value]));
        for (const value of this.papers) {
            this.paper.append(html("option", { value }, value === "letter" ? ui.paper.letter : value));
        }
        for (const select of [this.rows, this.columns]) {
            for (let i = 1; i <= kMostOneWay; ++i) select.append(html("option", { value: i }, String(i)));
        }
        for (const value of kResolutions) this.dpi.append(html("option", { value }, String(value)));
        this.dpi.value = String(kUsualResolution);
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
        this.scale.value = "";
        this.look(chosen.shows);
        this.show();
    }

    // A scale takes as many sheets as it needs, whatever rows and columns say.
    private show(): void {
        this.empty();
        const scale = this.scale.validity.valid ? Number(this.scale.value) : 0;
        this.rows.disabled = this.columns.disabled = scale > 0;
        try {
            this.shown = this.sheetsOf({
                paper: this.paper.value,
                rows: Number(this.rows.value),
                columns: Number(this.columns.value),
                scale,
            });
        } catch (error) {
            const isTooLarge = error instanceof LayoutError && error.status === "tooLarge";
            this.message.textContent = isTooLarge ? this.ui.paper.tooMany : this.ui.pictureFailed;
        }
        this.print.disabled = this.png.disabled = this.shown === null;
        if (this.shown) this.showSheets(this.shown);
    }

    private async savePng(): Promise<void> {
        if (!this.shown) return;
        this.png.disabled = true;
        await this.save(this.shown, Number(this.dpi.value));
        this.png.disabled = false;
    }

    private showSheets({ width, height, scale, smallestName, cutBoxes, sheets }: PaperSheets): void {
        const columns = Math.max(...sheets.map(({ column }) => column)) + 1;
        const rows = Math.max(...sheets.map(({ row }) => row)) + 1;
        // As wide as the dialog, or as high as a third of the window.
        this.preview.style.gridTemplateColumns = `repeat(${columns}, minmax(0, 1fr))`;
        this.preview.style.maxWidth = `calc(38vh * ${(columns * width) / (rows * height)})`;
        for (const { row, column, svg } of sheets.slice(0, kMostShown)) {
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
        const size = scale.toLocaleString(language, { maximumFractionDigits: 2 });
        const small = smallestName > 0 && smallestName < kReadableName ? " " + paper.tooSmall : "";
        this.message.textContent = paper.names(sheets.length, points, size) + small + cut;
    }

    private empty(): void {
        this.shown = null;
        this.preview.replaceChildren();
        this.message.textContent = "";
        for (const address of this.addresses) URL.revokeObjectURL(address);
        this.addresses = [];
    }
}
