// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

import { iconButton } from "../base/controls";
import { html } from "../base/dom";
import type { UiMessages } from "../messages/ui";

/** The upper edge of a dialog: its title, and what closes it. */
export function dialogHead(id: string, title: string, dialog: HTMLDialogElement, ui: UiMessages): HTMLElement {
    const close = iconButton(id + "-close", "close", ui.close, () => dialog.close());
    return html("div", { class: "dialog-head" }, html("h2", { id }, title), close);
}
