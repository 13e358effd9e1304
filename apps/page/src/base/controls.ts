// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Buttons as the bar, the viewer and the dialogs have them.

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
