// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The panel of the picture's options: which relatives are shown, what boxes say, how many generations a pedigree has, and the
// page's own looks. A switch that hangs from another, or changes nothing in the view, is disabled.

import type { ShownFact } from "olvane";
import { checkbox, iconButton, switchRow } from "../base/controls";
import { html } from "../base/dom";
import { hasGroups, hasUnknownParents, kRelativeNames, kShownFacts, type RelativeName } from "../base/views";
import { type UiMessages, uiLanguages } from "../messages/ui";
import { kLeastGenerations, kMostGenerations, type ViewState } from "../view/ViewState";
import { enable } from "./enabling";
import type { PictureSwitches } from "./PictureSwitches";
import { kThemeChoices, type ThemeChoice } from "./theme";

export interface OptionActions {
    setKinshipInBoxes(shown: boolean): void;
    setTheme(theme: ThemeChoice): void;
    setLanguage(language: string): void;
}

export interface OptionLooks {
    readonly theme: ThemeChoice;
    readonly kinshipInBoxes: boolean;
}

export class OptionsPanel {
    readonly element: HTMLElement;
    private readonly relatives = new Map<RelativeName, HTMLInputElement>();
    private readonly facts = new Map<ShownFact, HTMLInputElement>();
    private readonly unknownParents: HTMLInputElement;
    private readonly photos: HTMLInputElement;
    private readonly photosRow: HTMLElement;
    private readonly generations = html("output", { id: "generations" });
    private readonly fewer: HTMLButtonElement;
    private readonly more: HTMLButtonElement;
    private shownGenerations = 0;

    constructor(
        private readonly ui: UiMessages,
        private readonly actions: OptionActions,
        private readonly switches: PictureSwitches,
        looks: OptionLooks,
    ) {
        this.fewer = iconButton("generations-fewer", "minus", ui.fewer, () =>
            switches.setGenerations(this.shownGenerations - 1),
        );
        this.more = iconButton("generations-more", "plus", ui.more, () =>
            switches.setGenerations(this.shownGenerations + 1),
        );
        this.unknownParents = checkbox("unknown-parents", (checked) => switches.setUnknownParents(checked));
        this.photos = checkbox("photos-in-boxes", (checked) => switches.setPhotos(checked));
        this.photosRow = html(
            "label",
            { class: "switch", hidden: true },
            this.photos,
            html("span", {}, ui.photosInBoxes),
        );
        this.element = this.filled(looks);
    }

    showPhotos(areThere: boolean): void {
        this.photosRow.hidden = !areThere;
    }

    show(state: ViewState): void {
        this.unknownParents.checked = state.unknownParents;
        for (const [fact, input] of this.facts) input.checked = state.show.has(fact);
        this.photos.checked = state.photos;
        this.unknownParents.disabled = !hasUnknownParents(state.view);
        for (const [name, input] of this.relatives) input.checked = !state.hidden.has(name);
        // Cousins are children of aunts and uncles, and so on: no switch without the one that it hangs from. The
        // pedigree has none of them, and the family view has its generations by the switches.
        const isFamily = hasGroups(state.view);
        const { hidden } = state;
        for (const name of this.relatives.keys()) this.disable(name, !isFamily);
        this.disable("cousins", !isFamily || hidden.has("auntsUncles"));
        this.disable("siblingSpouses", !isFamily || hidden.has("siblings"));
        this.disable("niecesNephews", !isFamily || hidden.has("siblings"));
        this.shownGenerations = state.generations;
        this.generations.textContent = String(state.generations);
        enable(
            [this.fewer, state.view === "pedigree" && state.generations > kLeastGenerations],
            [this.more, state.view === "pedigree" && state.generations < kMostGenerations],
        );
    }

    private filled(looks: OptionLooks): HTMLElement {
        const { ui, actions, switches: pictureSwitches } = this;
        const relatives = html("fieldset", {}, html("legend", {}, ui.relatives));
        for (const name of kRelativeNames) {
            const input = checkbox("show-" + name, (checked) => pictureSwitches.setRelative(name, checked));
            this.relatives.set(name, input);
            relatives.append(html("label", { class: "switch" }, input, html("span", {}, ui.relativeNames[name])));
        }
        const facts = html("fieldset", {}, html("legend", {}, ui.shownFacts.label));
        for (const fact of kShownFacts) {
            const input = checkbox("fact-" + fact, (checked) => pictureSwitches.setFact(fact, checked));
            this.facts.set(fact, input);
            facts.append(switchRow(input, ui.shownFacts[fact]));
        }
        const kinship = checkbox("kinship-in-boxes", (checked) => actions.setKinshipInBoxes(checked));
        kinship.checked = looks.kinshipInBoxes;
        const themes = kThemeChoices.map((theme) => [theme, ui.themes[theme]] as const);
        const languages = uiLanguages.map(({ language, languageName }) => [language, languageName] as const);
        const generations = html(
            "div",
            { class: "row", role: "group", "aria-label": ui.generations },
            html("span", {}, ui.generations),
            html("div", { class: "stepper" }, this.fewer, this.generations, this.more),
        );
        return html(
            "div",
            { id: "options-panel", class: "sheet", role: "region", "aria-label": ui.options },
            relatives,
            html("label", { class: "switch" }, this.unknownParents, html("span", {}, ui.unknownParents)),
            generations,
            facts,
            html(
                "fieldset",
                {},
                html("legend", {}, ui.look),
                html("label", { class: "switch" }, kinship, html("span", {}, ui.kinshipInBoxes)),
                this.photosRow,
                this.choice("theme", ui.theme, themes, looks.theme, (theme) => actions.setTheme(theme as ThemeChoice)),
                this.choice("language", ui.languageLabel, languages, ui.language, (language) =>
                    actions.setLanguage(language),
                ),
            ),
        );
    }

    private choice(
        id: string,
        label: string,
        choices: readonly (readonly [string, string])[],
        chosen: string,
        action: (value: string) => void,
    ): HTMLElement {
        const select = html("select", { id });
        for (const [value, text] of choices) select.append(html("option", { value, selected: value === chosen }, text));
        select.addEventListener("change", () => action(select.value));
        return html("label", { class: "row" }, html("span", {}, label), select);
    }

    private disable(name: RelativeName, disabled: boolean): void {
        const input = this.relatives.get(name);
        if (input) input.disabled = disabled;
    }
}
