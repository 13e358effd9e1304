// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Which set of colours the page has. The sets themselves are in styles/colours.css, under the same names.

import { recall, remember } from "../base/dom";

export const kThemeChoices = ["auto", "light", "dark", "contrast"] as const;
export type ThemeChoice = (typeof kThemeChoices)[number];

const kDark = "(prefers-color-scheme: dark)";
const kContrast = "(prefers-contrast: more)";

export class Theme {
    choice: ThemeChoice;

    // The viewer has the colours of the page.
    constructor(private readonly viewer: HTMLElement) {
        const known = recall("theme");
        this.choice = kThemeChoices.find((choice) => choice === known) ?? "auto";
        for (const query of [kDark, kContrast]) matchMedia(query).addEventListener("change", () => this.apply());
        this.apply();
    }

    choose(choice: ThemeChoice): void {
        remember("theme", choice);
        this.show(choice);
    }

    /** For this time alone, as a link wants it. */
    show(choice: ThemeChoice): void {
        this.choice = choice;
        this.apply();
    }

    private apply(): void {
        const theme = this.choice === "auto" ? systemTheme() : this.choice;
        for (const element of [document.documentElement, this.viewer]) element.dataset["theme"] = theme;
    }
}

function systemTheme(): string {
    if (matchMedia(kContrast).matches) return "contrast";
    return matchMedia(kDark).matches ? "dark" : "light";
}
