// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What a newcomer reads once: a row of its own, where a notice would lie over the picture, until it is dismissed or
// somebody has done something.

import { iconButton } from "../base/controls";
import { html } from "../base/dom";
import type { UiMessages } from "../messages/ui";

export class FirstHint {
    readonly element = html("div", { id: "first-hint", role: "status", hidden: true });

    show(ui: UiMessages): void {
        const dismiss = iconButton("hint-dismiss", "close", ui.errors.dismiss, () => this.hide());
        this.element.replaceChildren(html("p", {}, ui.firstHint), dismiss);
        this.element.hidden = false;
    }

    hide(): void {
        this.element.hidden = true;
        this.element.remove();
    }
}
