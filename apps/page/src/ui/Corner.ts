// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What floats over the lower edge of the picture: the legend, the overview, and the buttons for zooming.

import type { LineStyle } from "olvane";
import { iconButton } from "../base/controls";
import { html, svg } from "../base/dom";
import { icon, silhouette } from "../base/icons";
import type { UiMessages } from "../messages/ui";
import { wayClass } from "../scene/wayLines";
import type { Picture } from "../view/Picture";

export interface CornerActions {
    zoomIn(): void;
    zoomOut(): void;
    fit(): void;
    home(): void;
}

export class Corner {
    readonly element: HTMLElement;
    private readonly legend: HTMLDetailsElement;
    private readonly ways = html("ul", { class: "ways", tabindex: 0, hidden: true });

    constructor(ui: UiMessages, overview: HTMLElement, actions: CornerActions) {
        this.legend = legendOf(ui);
        this.ways.setAttribute("aria-label", ui.waysBetween);
        this.element = html("div", { class: "corner" }, this.ways, this.legend, overview, zoomButtons(ui, actions));
    }

    // What the lines of a picture mean: of each way of a kinship, and in the legend of those that are dashed.
    explain({ kinship, lineStyles }: Picture): void {
        const ways = kinship?.ways ?? [];
        this.ways.hidden = ways.length === 0;
        this.ways.replaceChildren(
            ...ways.map(({ words }, index) => html("li", {}, waySign(index), html("span", {}, words))),
        );
        for (const row of this.legend.querySelectorAll(".of-lines")) row.remove();
        this.legend
            .querySelector("ul")!
            .append(
                ...lineStyles.map((style) =>
                    html("li", { class: "of-lines" }, lineSign(style), html("span", {}, style.meaning)),
                ),
            );
    }

    // The keys move to the legend's heading when they stood inside it.
    closeLegend(): void {
        if (this.legend.contains((this.legend.getRootNode() as Document | ShadowRoot).activeElement))
            this.legend.querySelector("summary")!.focus();
        this.legend.open = false;
    }
}

const kSign = "M0 5H44"; // of a line

function lineSign({ dashes }: LineStyle): SVGElement {
    return svg(
        "svg",
        { class: "line-sign", width: 28, height: 10, "aria-hidden": "true" },
        svg("path", { class: "line", "stroke-dasharray": dashes, d: kSign }),
    );
}

function waySign(index: number): SVGElement {
    return svg(
        "svg",
        { width: 44, height: 10, "aria-hidden": "true" },
        svg("path", { class: "way " + wayClass(index), d: kSign }),
    );
}

function zoomButtons(ui: UiMessages, actions: CornerActions): HTMLElement {
    return html(
        "div",
        { class: "zoom", part: "zoom", role: "group", "aria-label": ui.zoom },
        iconButton("zoom-in", "plus", ui.zoomIn, () => actions.zoomIn()),
        iconButton("zoom-out", "minus", ui.zoomOut, () => actions.zoomOut()),
        iconButton("fit", "fit", ui.fit, () => actions.fit()),
        iconButton("home", "home", ui.home, () => actions.home()),
    );
}

function legendOf(ui: UiMessages): HTMLDetailsElement {
    const items = ui.legendItems;
    const row = (sign: Element, text: string) => html("li", {}, sign, html("span", {}, text));
    const sign = (className: string, content: Element | string = "") =>
        html("span", { class: "sign " + className, "aria-hidden": "true" }, content);
    const list = html(
        "ul",
        { tabindex: 0, "aria-label": ui.legend },
        row(sign("male", silhouette("male")), items.male),
        row(sign("female", silhouette("female")), items.female),
        row(sign("other", silhouette("other")), items.other),
        row(sign("focus"), items.focus),
        row(sign("ancestor"), ui.commonAncestor),
        row(sign("more", "+3"), items.hidden),
        row(sign("missing", "?"), items.missing),
        row(sign("duplicate", icon("duplicates")), items.repeated),
    );
    return html("details", { id: "legend", part: "legend" }, html("summary", {}, ui.legend), list);
}
