// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A card beside the box under the mouse, with what a box has no room for. It says nothing that the side panel
// and the labels for screen readers do not say too.

import { html } from "../base/dom";

const kDelay = 350; // ms
const kGap = 10; // px

export interface Card {
    readonly name: string;
    readonly lines: readonly string[];
}

export class Tooltip {
    readonly element = html("div", { class: "tooltip", "aria-hidden": "true", hidden: true });
    private timer = 0;

    show(target: Element, card: Card): void {
        this.hide();
        this.timer = window.setTimeout(() => {
            if (!target.isConnected) return;
            const lines = card.lines.filter((line) => line !== "");
            this.element.replaceChildren(
                html("strong", { dir: "auto" }, card.name),
                ...lines.map((line) => html("span", {}, line)),
            );
            this.element.hidden = false;
            this.place(target.getBoundingClientRect());
        }, kDelay);
    }

    hide(): void {
        clearTimeout(this.timer);
        this.element.hidden = true;
    }

    private place(target: DOMRect): void {
        const { element } = this;
        const { offsetWidth, offsetHeight } = element;
        const below = target.bottom + kGap;
        const top = below + offsetHeight < innerHeight ? below : target.top - kGap - offsetHeight;
        const left = Math.min(
            innerWidth - offsetWidth - kGap,
            Math.max(kGap, target.left + target.width / 2 - offsetWidth / 2),
        );
        element.style.left = `${left}px`;
        element.style.top = `${Math.max(kGap, top)}px`;
    }
}
