// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The page before any family is open, and the invitation that covers it while a file is dragged over it.

import { type UiMessages, uiLanguages } from "../messages/ui";
import { html, onClick, svg } from "../base/dom";
import { icon } from "../base/icons";

export class Welcome {
    readonly element: HTMLElement;

    constructor(ui: UiMessages, choose: () => void, chooseLanguage: (language: string) => void) {
        const { welcome } = ui;
        const button = html("button", { id: "choose-file", type: "button", class: "main" }, welcome.choose);
        onClick(button, choose);
        this.element = html(
            "main",
            { id: "welcome" },
            html(
                "div",
                { id: "drop-zone" },
                emblem(),
                html("h1", {}, welcome.title),
                html("p", {}, welcome.text),
                html("p", { class: "drop" }, welcome.drop),
                button,
                html("p", { class: "quiet" }, welcome.kinds),
            ),
            html("p", { class: "privacy" }, icon("lock"), html("span", {}, welcome.privacy)),
            languageChooser(ui, chooseLanguage),
        );
    }
}

function languageChooser(ui: UiMessages, choose: (language: string) => void): HTMLElement {
    const select = html("select", { id: "language", "aria-label": ui.languageLabel });
    for (const { language, languageName } of uiLanguages) {
        select.append(html("option", { value: language, selected: language === ui.language }, languageName));
    }
    select.addEventListener("change", () => choose(select.value));
    return select;
}

// A small family: two parents, the one in the middle, and two children.
function emblem(): SVGSVGElement {
    const box = (x: number, y: number, className: string, rx: number) =>
        svg("rect", { x, y, width: 34, height: 26, rx, class: className });
    return svg(
        "svg",
        { class: "emblem", viewBox: "0 0 160 132", "aria-hidden": "true" },
        svg("path", { class: "emblem-line", d: "M63 23h34M80 23v30M80 79v15M37 104V94h86v10" }),
        box(29, 10, "male", 2),
        box(97, 10, "female", 11),
        box(63, 53, "centre", 6),
        box(20, 104, "female", 11),
        box(106, 104, "male", 2),
    );
}
