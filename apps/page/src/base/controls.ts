// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Buttons and switches as the bar, the viewer and the dialogs have them.

import { html, onClick } from "./dom";
import { icon, type IconName } from "./icons";

export function iconButton(id: string, name: IconName, label: string, action: () => void): HTMLButtonElement {
    const button = html(
        "button",
        { id, type: "button", class: "icon-button", "aria-label": label, title: label },
        icon(name),
    );
    onClick(button, action);
    return button;
}

/** A switch; action hears of each change. */
export function checkbox(id: string, action: (checked: boolean) => void): HTMLInputElement {
    const input = html("input", { id, type: "checkbox", role: "switch" });
    input.addEventListener("change", () => action(input.checked));
    return input;
}

/** A switch with its name beside it. */
export function switchRow(input: HTMLInputElement, name: string): HTMLLabelElement {
    return html("label", { class: "switch" }, input, html("span", {}, name));
}
