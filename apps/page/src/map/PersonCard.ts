// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Who is chosen on the map, with their kin as buttons: what a screen reader has in the place of pixels.

import { html, isolated, onClick } from "../base/dom";
import { iconButton } from "../base/controls";
import { silhouette } from "../base/icons";
import type { UiMessages } from "../messages/ui";
import type { FamilyMap, Kin } from "./FamilyMap";

const kMostListed = 60; // of a group

export interface CardActions {
    go(person: number): void;
    open(person: number): void;
    closeCard(): void;
    nameOf(person: number): string;
    yearsOf(person: number): string;
}

export class PersonCard {
    readonly element: HTMLElement;

    constructor(
        private readonly map: FamilyMap,
        private readonly ui: UiMessages,
        private readonly actions: CardActions,
    ) {
        this.element = html("aside", { id: "map-card", "aria-label": ui.panel.label, hidden: true });
    }

    show(person: number, kin: Kin): void {
        const { ui, actions } = this;
        const years = actions.yearsOf(person);
        const open = html("button", { id: "map-open", type: "button", class: "plain" }, ui.makeFocus);
        onClick(open, () => actions.open(person));
        const groups = this.groups(kin).map(([label, members]) => this.group(label, members));
        this.element.replaceChildren(
            html(
                "header",
                {},
                silhouette(this.map.sex(person)),
                html("div", {}, html("h2", {}, isolated(actions.nameOf(person))), html("p", { class: "years" }, years)),
                iconButton("map-card-close", "close", ui.close, () => actions.closeCard()),
            ),
            ...groups.filter((group) => group !== null),
            open,
        );
        this.element.hidden = false;
    }

    hide(): void {
        this.element.hidden = true;
    }

    /** What is read out on arrival: name, years, and how many of each kind of kin. */
    spoken(person: number, kin: Kin): string {
        const parts = this.groups(kin).filter(([, members]) => members.length > 0);
        const named = parts.map(([label, members]) =>
            members.length <= 2
                ? `${label}: ${members.map((one) => this.actions.nameOf(one)).join(", ")}`
                : `${label}: ${members.length}`,
        );
        return [this.actions.nameOf(person), this.actions.yearsOf(person), ...named]
            .filter((text) => text !== "")
            .join(". ");
    }

    private groups({ parents, partners, children, siblings }: Kin): [string, readonly number[]][] {
        const { panel, map } = this.ui;
        return [
            [panel.parents, parents],
            [map.partners, partners],
            [panel.children, children],
            [panel.siblings, siblings],
        ];
    }

    private group(label: string, members: readonly number[]): HTMLElement | null {
        if (members.length === 0) return null;
        const list = html("ul", { "aria-label": label });
        for (const member of members.slice(0, kMostListed)) {
            const button = html(
                "button",
                { type: "button", class: "item", "data-number": this.map.number(member) },
                isolated(this.actions.nameOf(member)),
                html("span", { class: "years" }, " " + this.actions.yearsOf(member)),
            );
            onClick(button, () => this.actions.go(member));
            list.append(html("li", {}, button));
        }
        if (members.length > kMostListed)
            list.append(html("li", { class: "quiet" }, this.ui.diagnostics.furtherOnes(members.length - kMostListed)));
        return html("section", {}, html("h3", {}, label), list);
    }
}
