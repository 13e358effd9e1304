// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What is seen while a file is being read: how far that is, and a button that ends it.

import { html, onClick } from "../base/dom";
import type { UiMessages } from "../messages/ui";

export class Reading {
    readonly element = html("div", { id: "reading", hidden: true });
    private readonly bar = html("progress", { max: 1 });
    private controller = new AbortController();

    /**
     * Shows the progress of another file, and ends the reading of the one before: the file that was chosen last counts.
     * The signal is set off when the reader of the page ends it, or chooses another file meanwhile.
     */
    begin(name: string, ui: UiMessages): AbortSignal {
        this.controller.abort(new CancelledError());
        this.controller = new AbortController();
        const text = html(
            "span",
            { id: "reading-name", role: "status" },
            ui.welcome.reading("\u2068" + name + "\u2069"),
        );
        const cancel = html("button", { id: "reading-cancel", type: "button", class: "plain" }, ui.cancel);
        onClick(cancel, () => this.controller.abort(new CancelledError()));
        this.bar.removeAttribute("value");
        this.bar.setAttribute("aria-labelledby", "reading-name");
        this.element.replaceChildren(text, this.bar, cancel);
        this.element.hidden = false;
        return this.controller.signal;
    }

    advance(part: number): void {
        this.bar.value = part;
    }

    /** Of the file whose signal is given; nothing where another one is being read already. */
    end(signal: AbortSignal): void {
        if (signal === this.controller.signal) this.element.hidden = true;
    }

    get isUnderWay(): boolean {
        return !this.element.hidden;
    }
}

/** The reader of the page wanted no more of it. */
export class CancelledError extends Error {}
