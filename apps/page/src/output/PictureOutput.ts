// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The ways out of the page: the picture as SVG or PNG in the colours of the screen, and on paper in its own.

import type { DrawingTheme, PaperOptions, PaperSheets } from "olvane";
import type { UiMessages } from "../messages/ui";
import type { Notices } from "../ui/Notices";
import type { ViewState } from "../view/ViewState";
import { PaperDialog } from "./PaperDialog";
import { PrintSheet } from "./printing";
import { pngOf, saveFile, svgBlob } from "./saving";

export interface Subject {
    // Of a file, without its ending.
    readonly name: string;
    readonly title: string;
    // The text of an SVG file.
    drawing(theme: DrawingTheme): string;
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
    rebuild(ui: UiMessages): HTMLDialogElement {
        this.paper?.element.remove();
        this.paper = new PaperDialog(
            ui,
            (paper) => this.subject()?.sheets(paper) ?? null,
            (wanted) => this.subject()?.look(wanted),
        );
        return this.paper.element;
    }

    choosePaper(): void {
        if (this.subject()) this.paper?.open();
    }

    saveSvg(ui: UiMessages): void {
        const subject = this.subject();
        if (!subject) return;
        const name = subject.name + ".svg";
        saveFile(name, svgBlob(subject.drawing(screenTheme())));
        this.notices.show(ui.saved(name));
    }

    async savePng(ui: UiMessages): Promise<void> {
        const subject = this.subject();
        if (!subject) return;
        const name = subject.name + ".png";
        try {
            const { blob, part } = await pngOf(subject.drawing(screenTheme()));
            saveFile(name, blob);
            this.notices.show(part < 1 ? ui.savedSmaller(name, Math.round(part * 100)) : ui.saved(name));
        } catch {
            this.notices.fail(ui.pictureFailed, []);
        }
    }
}

function screenTheme(): DrawingTheme {
    return document.documentElement.dataset["theme"] === "dark" ? "dark" : "light";
}
