// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Short messages at the lower edge. What went well goes away by itself; what went wrong stays until
// dismissed.

import { html, onClick } from "../base/dom";
import { icon } from "../base/icons";

const kTime = 6000; // ms
const kMostAtOnce = 3;

export class Notices {
    readonly element = html("div", { id: "notices" });
    private dismissLabel = "";

    setDismissLabel(dismissLabel: string): void {
        this.dismissLabel = dismissLabel;
    }

    show(text: string, subject = ""): void {
        const notice = this.add("message", "status", text, []);
        notice.dataset["subject"] = subject;
        setTimeout(() => notice.remove(), kTime);
    }

    // With a button that leads to more.
    warn(text: string, label: string, action: () => void): void {
        const notice = this.add("warned", "status", text, []);
        const button = html("button", { type: "button", class: "plain" }, label);
        onClick(button, () => {
            notice.remove();
            action();
        });
        notice.lastElementChild!.before(button);
        setTimeout(() => notice.remove(), 2 * kTime);
    }

    // subject names what the message is about, so that it can be taken away when that is over.
    fail(text: string, details: readonly string[], subject = ""): void {
        this.add("failed", "alert", text, details).dataset["subject"] = subject;
    }

    // All of them, or those about one subject.
    clear(subject?: string): void {
        for (const notice of [...this.element.children] as HTMLElement[])
            if (subject === undefined || notice.dataset["subject"] === subject) notice.remove();
    }

    private add(className: string, role: string, text: string, details: readonly string[]): HTMLElement {
        const lines = details.filter((detail) => detail !== "").map((detail) => html("span", { dir: "auto" }, detail));
        const dismiss = html(
            "button",
            { type: "button", class: "icon-button", "aria-label": this.dismissLabel },
            icon("close"),
        );
        const notice = html(
            "div",
            { class: "notice " + className, role },
            html("p", {}, html("strong", {}, text), ...lines),
            dismiss,
        );
        onClick(dismiss, () => notice.remove());
        // The latest one last, where the eye is; those that nobody needs any more make room.
        while (this.element.childElementCount >= kMostAtOnce) this.element.firstElementChild!.remove();
        this.element.append(notice);
        return notice;
    }
}
