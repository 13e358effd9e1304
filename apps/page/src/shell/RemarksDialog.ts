// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The dialog that lists what the reader found in the file, with links to the persons, and the button that opens it. Of very
// many remarks the first are listed until all are asked for.

import { iconButton } from "../base/controls";
import { html, onClick } from "../base/dom";
import type { UiMessages } from "../messages/ui";
import { dialogHead } from "./dialogHead";
import type { ListedRemark } from "./FileRemarks";
import type { Finding } from "./Finding";

const kMostListed = 500;

export class RemarksDialog {
    readonly element: HTMLDialogElement;
    readonly button: HTMLButtonElement;

    constructor(
        private readonly ui: UiMessages,
        private readonly finding: Finding,
    ) {
        this.element = html("dialog", { id: "diagnostics", "aria-labelledby": "diagnostics-title" });
        this.button = iconButton("diagnostics-button", "warning", "", () => this.open());
        this.button.hidden = true;
    }

    show(found: readonly ListedRemark[], persons: number): void {
        const { ui } = this;
        const label = ui.diagnostics.button(found.length);
        this.button.hidden = found.length === 0;
        this.button.setAttribute("aria-label", label);
        this.button.title = label;
        this.element.replaceChildren(
            dialogHead("diagnostics-title", ui.diagnostics.title, this.element, ui),
            html("p", { class: "quiet" }, ui.diagnostics.summary(persons, found.length)),
            this.remarkList(found, label),
        );
    }

    // When the dialog is closed, the keys are on the button that opens it again.
    open(): void {
        this.button.focus();
        this.element.showModal();
    }

    private remarkList(found: readonly ListedRemark[], label: string): HTMLElement {
        const list = html("ul", { class: "diagnostics", tabindex: 0, "aria-label": label });
        const append = (some: readonly ListedRemark[]) => list.append(...some.map((one) => this.remarkItem(one)));
        append(found.slice(0, kMostListed));
        if (found.length <= kMostListed) return list;
        const all = html("button", { type: "button", class: "plain" }, this.ui.diagnostics.showAll(found.length));
        const last = html("li", {}, all);
        onClick(all, () => {
            last.remove();
            append(found.slice(kMostListed));
            (list.children[kMostListed] as HTMLElement).querySelector("button")?.focus();
        });
        list.append(last);
        return list;
    }

    private remarkItem({ line, severity, persons, text, hint }: ListedRemark): HTMLLIElement {
        const { diagnostics } = this.ui;
        return html(
            "li",
            { class: severity },
            html("span", { class: "severity" }, diagnostics.severities[severity]),
            line > 0 && html("span", { class: "line" }, diagnostics.line(line)),
            html("span", { class: "message", dir: "auto" }, text),
            Boolean(hint) && html("span", { class: "hint", dir: "auto" }, hint),
            ...persons.map((person) => this.personButton(person)),
        );
    }

    // Leads to a person whom a remark is about.
    private personButton(id: number): HTMLElement | null {
        const person = this.finding.person(id);
        if (!person) return null;
        const button = html(
            "button",
            { type: "button", class: "plain to-person", "data-person-id": id, dir: "auto" },
            this.finding.nameOf(person),
        );
        onClick(button, () => {
            this.element.close();
            this.finding.choose(person);
        });
        return button;
    }
}
