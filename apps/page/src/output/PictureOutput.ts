// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The ways out of the page: the picture as SVG or PNG in the colours of the screen, and on paper in its own.

import type { UiMessages } from "../messages/ui";
import type { Notices } from "../ui/Notices";
import { type Looks, wholePicture, type WholePicture } from "./pictureSvg";
import { PrintSheet } from "./printing";
import { pngOf, saveFile, svgBlob } from "./saving";

export interface Subject extends Looks {
    // Of a file, without its ending.
    readonly name: string;
}

export class PictureOutput {
    readonly sheet = new PrintSheet(() => this.whole("print"));

    // subject gives what is to be seen at the time, or null before any family is open.
    constructor(
        private readonly subject: () => Subject | null,
        private readonly notices: Notices,
    ) {}

    saveSvg(ui: UiMessages): void {
        const whole = this.whole(screenTheme());
        if (!whole) return;
        const name = this.subject()!.name + ".svg";
        saveFile(name, svgBlob(whole));
        this.notices.show(ui.saved(name));
    }

    async savePng(ui: UiMessages): Promise<void> {
        const whole = this.whole(screenTheme());
        if (!whole) return;
        const name = this.subject()!.name + ".png";
        try {
            const { blob, part } = await pngOf(whole);
            saveFile(name, blob);
            this.notices.show(part < 1 ? ui.savedSmaller(name, Math.round(part * 100)) : ui.saved(name));
        } catch {
            this.notices.fail(ui.pictureFailed, []);
        }
    }

    private whole(theme: string): WholePicture | null {
        const subject = this.subject();
        return subject && wholePicture(subject, theme);
    }
}

function screenTheme(): string {
    return document.documentElement.dataset["theme"] ?? "light";
}
