// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A button that opens a small panel below it. Escape, a click elsewhere and leaving by Tab close it.

import { html, onClick } from "../base/dom";

export class Popover {
    constructor(
        readonly button: HTMLButtonElement,
        readonly panel: HTMLElement,
    ) {
        button.setAttribute("aria-expanded", "false");
        button.setAttribute("aria-controls", panel.id);
        panel.hidden = true;
        onClick(button, () => (panel.hidden ? this.open() : this.close()));
        const whole = html("div", { class: "popover" }, button, panel);
        whole.addEventListener("keydown", (event) => {
            if (event.key !== "Escape" || panel.hidden) return;
            event.stopPropagation();
            this.close();
            button.focus();
        });
        whole.addEventListener("focusout", (event) => {
            if (event.relatedTarget instanceof Node && !whole.contains(event.relatedTarget)) this.close();
        });
        document.addEventListener("pointerdown", (event) => {
            if (!whole.contains(event.target as Node)) this.close();
        });
        this.element = whole;
    }

    readonly element: HTMLElement;

    open(): void {
        this.panel.hidden = false;
        this.button.setAttribute("aria-expanded", "true");
        this.panel.querySelector<HTMLElement>("button, input, select")?.focus();
    }

    close(): void {
        this.panel.hidden = true;
        this.button.setAttribute("aria-expanded", "false");
    }
}
