// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The ways out of the page: the picture as SVG or PNG in the colours of the screen, and on paper in its own.

import type { DrawingTheme, PaperOptions, PaperSheets } from "olvane";
import type { UiMessages } from "../messages/ui";
import type { Notices } from "../ui/Notices";
import type { ViewState } from "../view/ViewState";
import { PaperDialog } from "./PaperDialog";
import { PrintSheet } from "./printing";
import { drawingElement, pngOf, saveFile, type Size, svgBlob } from "./saving";

const kSharpness = 2; // pixels for a px of the drawing
const kInch = 25.4; // millimetres

export interface Subject {
    // Of a file, without its ending.
    readonly name: string;
    readonly title: string;
    // The text of an SVG file, of the whole picture or of what is in sight.
    drawing(theme: DrawingTheme, inSight?: boolean): string;
    // On paper, in the colours of paper.
    sheets(paper: PaperOptions): PaperSheets | null;
    // Shows another view in its place.
    look(wanted: Partial<ViewState>): void;
}

export class PictureOutput {
    readonly sheet = new PrintSheet(
        () => this.paper?.sheets ?? null,
        () => {
            const subject = this.subject();
            return subject && { title: subject.title, drawing: subject.drawing("print") };
        },
    );
    private paper: PaperDialog | null = null;

    // subject gives what is to be seen at the time, or null before any family is open.
    constructor(
        private readonly subject: () => Subject | null,
        private readonly notices: Notices,
    ) {}

    /** Makes what holds words; the dialog is to stand in the document. */
    rebuild(ui: UiMessages, papers: readonly string[]): HTMLDialogElement {
        this.paper?.element.remove();
        this.paper = new PaperDialog(
            ui,
            papers,
            (paper) => this.subject()?.sheets(paper) ?? null,
            (wanted) => this.subject()?.look(wanted),
            (sheets, dpi) => this.saveSheets(ui, sheets, dpi),
        );
        return this.paper.element;
    }

    choosePaper(): void {
        if (this.subject()) this.paper?.open();
    }

    saveSvg(ui: UiMessages, inSight: boolean): void {
        const subject = this.subject();
        if (!subject) return;
        const name = subject.name + ".svg";
        void this.attempt(ui, () => {
            saveFile(name, svgBlob(subject.drawing(screenTheme(), inSight)));
            this.notices.show(ui.saved(name));
        });
    }

    async savePng(ui: UiMessages, inSight: boolean): Promise<void> {
        const subject = this.subject();
        if (!subject) return;
        await this.attempt(ui, async () => {
            const drawing = subject.drawing(screenTheme(), inSight);
            const { width, height } = drawingElement(drawing);
            await this.saveAsPng(ui, subject.name + ".png", drawing, {
                width: width * kSharpness,
                height: height * kSharpness,
            });
        });
    }

    // Several are numbered, as the command numbers its files.
    private async saveSheets(ui: UiMessages, { width, height, sheets }: PaperSheets, dpi: number): Promise<void> {
        const subject = this.subject();
        if (!subject) return;
        const digits = String(sheets.length).length;
        const pixels = { width: (width / kInch) * dpi, height: (height / kInch) * dpi };
        await this.attempt(ui, async () => {
            for (const [i, { svg }] of sheets.entries()) {
                const number = sheets.length > 1 ? "-" + String(i + 1).padStart(digits, "0") : "";
                await this.saveAsPng(ui, `${subject.name}${number}.png`, svg, pixels);
            }
        });
    }

    private async saveAsPng(ui: UiMessages, name: string, drawing: string, size: Size): Promise<void> {
        const { blob, part } = await pngOf(drawing, size);
        saveFile(name, blob);
        this.notices.show(part < 1 ? ui.savedSmaller(name, Math.round(part * 100)) : ui.saved(name));
    }

    private async attempt(ui: UiMessages, save: () => void | Promise<void>): Promise<void> {
        try {
            await save();
        } catch {
            this.notices.fail(ui.pictureFailed, []);
        }
    }
}

function screenTheme(): DrawingTheme {
    return document.documentElement.dataset["theme"] === "dark" ? "dark" : "light";
}
