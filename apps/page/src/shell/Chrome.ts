// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The bar at the top with its two panels, the buttons that float over the picture, the legend, and the
// dialogs. All of it is made again when the language changes.

import type { ShownFact } from "olvane";
import { type UiMessages, uiLanguages } from "../messages/ui";
import { hasGroups, hasUnknownParents, kRelativeNames, kShownFacts, type RelativeName } from "../base/views";
import { kLeastGenerations, kMostGenerations, type ViewState } from "../view/ViewState";
import { checkbox, iconButton, switchRow } from "../base/controls";
import { html, onClick } from "../base/dom";
import { icon } from "../base/icons";
import type { ListedRemark } from "./FileRemarks";
import type { Finding } from "./Finding";
import { Popover } from "./Popover";
import type { PictureSwitches } from "./PictureSwitches";
import { SearchBox } from "./SearchBox";
import { type ViewActions, ViewChooser } from "./ViewChooser";
import { kThemeChoices, type ThemeChoice } from "./theme";

export interface ChromeActions extends ViewActions {
    setKinshipInBoxes(shown: boolean): void;
    // Reads the file again; empty for the file's own word.
    setEncoding(encoding: string): void;
    setTheme(theme: ThemeChoice): void;
    setLanguage(language: string): void;
    back(): void;
    forward(): void;
    openFile(): void;
    // The whole picture, or what of it is in sight.
    saveSvg(inSight: boolean): void;
    copyLink(): void;
    setKept(isKept: boolean): void;
    savePng(inSight: boolean): void;
    print(): void;
    choosePaper(): void;
    togglePanel(): void;
}

export interface ChromeLooks {
    readonly theme: ThemeChoice;
    readonly kinshipInBoxes: boolean;
    /** To choose from where a file's own word on its encoding is wrong. */
    readonly encodings: readonly string[];
}

const kMostDiagnostics = 500; // listed until all are asked for

export class Chrome {
    readonly bar: HTMLElement;
    readonly keys: HTMLDialogElement;
    readonly diagnostics: HTMLDialogElement;
    readonly search: SearchBox;
    private readonly title = html("div", { class: "title" });
    private readonly diagnosticsButton: HTMLButtonElement;
    private readonly buttons: Record<"back" | "forward" | "family" | "pedigree" | "panel", HTMLButtonElement>;
    private readonly switches = new Map<RelativeName, HTMLInputElement>();
    private readonly facts = new Map<ShownFact, HTMLInputElement>();
    private readonly unknownParents: HTMLInputElement;
    private readonly encoding = html("select", { id: "encoding" });
    private readonly encodingRow: HTMLElement;
    private readonly keep: HTMLInputElement;
    private readonly keepRow: HTMLElement;
    private readonly photos: HTMLInputElement;
    private readonly photosRow: HTMLElement;
    private readonly generations = html("output", { id: "generations" });
    private readonly fewer: HTMLButtonElement;
    private readonly more: HTMLButtonElement;
    private readonly options: Popover;
    private readonly files: Popover;
    private readonly views: ViewChooser;
    private shownGenerations = 0;

    constructor(
        private readonly ui: UiMessages,
        private readonly actions: ChromeActions,
        private readonly pictureSwitches: PictureSwitches,
        private readonly finding: Finding,
        looks: ChromeLooks,
    ) {
        this.search = new SearchBox(finding, ui);
        this.buttons = {
            back: iconButton("back", "back", ui.back, () => actions.back()),
            forward: iconButton("forward", "forward", ui.forward, () => actions.forward()),
            family: this.viewButton("family", ui.views.family),
            pedigree: this.viewButton("pedigree", ui.views.pedigree),
            panel: iconButton("panel-button", "panel", ui.panel.toggle, () => actions.togglePanel()),
        };
        this.fewer = iconButton("generations-fewer", "minus", ui.fewer, () =>
            pictureSwitches.setGenerations(this.shownGenerations - 1),
        );
        this.more = iconButton("generations-more", "plus", ui.more, () =>
            pictureSwitches.setGenerations(this.shownGenerations + 1),
        );
        this.keys = this.keyDialog();
        this.diagnostics = html("dialog", { id: "diagnostics", "aria-labelledby": "diagnostics-title" });
        this.diagnosticsButton = iconButton("diagnostics-button", "warning", "", () => this.openDiagnostics());
        this.diagnosticsButton.hidden = true;
        this.views = new ViewChooser(ui, actions, pictureSwitches);
        this.unknownParents = checkbox("unknown-parents", (checked) => pictureSwitches.setUnknownParents(checked));
        this.encoding.append(html("option", { value: "" }, ui.encodingAuto));
        for (const name of looks.encodings) this.encoding.append(html("option", { value: name }, name));
        this.encoding.addEventListener("change", () => actions.setEncoding(this.encoding.value));
        this.keep = checkbox("keep-file", (checked) => actions.setKept(checked));
        this.keepRow = html(
            "label",
            { class: "switch", hidden: true },
            this.keep,
            html("span", {}, ui.keep.label, html("small", {}, ui.keep.hint)),
        );
        this.photos = checkbox("photos-in-boxes", (checked) => pictureSwitches.setPhotos(checked));
        this.photosRow = html(
            "label",
            { class: "switch", hidden: true },
            this.photos,
            html("span", {}, ui.photosInBoxes),
        );
        this.encodingRow = html("label", { class: "row" }, html("span", {}, ui.encoding), this.encoding);
        this.options = new Popover(
            iconButton("options-button", "options", ui.options, () => {}),
            this.optionsPanel(looks),
        );
        this.files = new Popover(
            iconButton("file-button", "file", ui.file, () => {}),
            this.filePanel(),
        );
        this.bar = this.barElement();
    }

    // encoding is the one that was chosen, null where the bytes of the file are not at hand.
    showEncoding(encoding: string | null): void {
        this.encodingRow.hidden = encoding === null;
        this.encoding.value = encoding ?? "";
    }

    // null where no file can be kept.
    showKept(isKept: boolean | null): void {
        this.keepRow.hidden = isKept === null;
        this.keep.checked = isKept === true;
    }

    showPhotos(areThere: boolean): void {
        this.photosRow.hidden = !areThere;
    }

    showFamily(title: string, persons: string): void {
        this.title.replaceChildren(html("h1", { dir: "auto" }, title), html("span", {}, persons));
    }

    showState(state: ViewState, canGoBack: boolean, canGoForward: boolean): void {
        const { back, forward, family, pedigree } = this.buttons;
        enable([back, canGoBack], [forward, canGoForward]);
        this.views.show(state);
        family.setAttribute("aria-pressed", String(state.view === "family"));
        pedigree.setAttribute("aria-pressed", String(state.view === "pedigree"));
        this.unknownParents.checked = state.unknownParents;
        for (const [fact, input] of this.facts) input.checked = state.show.has(fact);
        this.photos.checked = state.photos;
        this.unknownParents.disabled = !hasUnknownParents(state.view);
        for (const [name, input] of this.switches) input.checked = !state.hidden.has(name);
        // Cousins are children of aunts and uncles, and so on: no switch without the one that it hangs from. The
        // pedigree has none of them, and the family view has its generations by the switches.
        const isFamily = hasGroups(state.view);
        const { hidden } = state;
        for (const name of this.switches.keys()) this.disable(name, !isFamily);
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

    // While the map is shown, no view of the tree is.
    showMap(shown: boolean, isMirrored: boolean): void {
        this.views.showMap(shown, isMirrored);
        if (shown)
            for (const view of ["family", "pedigree"] as const)
                this.buttons[view].setAttribute("aria-pressed", "false");
    }

    showPanelState(open: boolean): void {
        this.buttons.panel.setAttribute("aria-pressed", String(open));
    }

    showDiagnostics(found: readonly ListedRemark[], persons: number): void {
        const { ui } = this;
        const label = ui.diagnostics.button(found.length);
        this.diagnosticsButton.hidden = found.length === 0;
        this.diagnosticsButton.setAttribute("aria-label", label);
        this.diagnosticsButton.title = label;
        this.diagnostics.replaceChildren(
            this.dialogHead("diagnostics-title", ui.diagnostics.title, this.diagnostics),
            html("p", { class: "quiet" }, ui.diagnostics.summary(persons, found.length)),
            this.remarkList(found, label),
        );
    }

    private remarkList(found: readonly ListedRemark[], label: string): HTMLElement {
        const list = html("ul", { class: "diagnostics", tabindex: 0, "aria-label": label });
        const append = (some: readonly ListedRemark[]) => list.append(...some.map((one) => this.remarkItem(one)));
        append(found.slice(0, kMostDiagnostics));
        if (found.length <= kMostDiagnostics) return list;
        const all = html("button", { type: "button", class: "plain" }, this.ui.diagnostics.showAll(found.length));
        const last = html("li", {}, all);
        onClick(all, () => {
            last.remove();
            append(found.slice(kMostDiagnostics));
            (list.children[kMostDiagnostics] as HTMLElement).querySelector("button")?.focus();
        });
        list.append(last);
        return list;
    }

    // When the dialog is closed, the keys are on the button that opens it again.
    openDiagnostics(): void {
        this.diagnosticsButton.focus();
        this.diagnostics.showModal();
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
            this.diagnostics.close();
            this.finding.choose(person);
        });
        return button;
    }

    private barElement(): HTMLElement {
        const { ui, buttons } = this;
        const group = (className: string, label: string, ...children: HTMLElement[]) =>
            html("div", { class: className, role: "group", "aria-label": label }, ...children);
        return html(
            "header",
            { class: "bar" },
            this.title,
            this.search.element,
            group("segments", ui.views.label, buttons.family, buttons.pedigree),
            this.views.popover.element,
            group("buttons travel", ui.back + ", " + ui.forward, buttons.back, buttons.forward),
            html(
                "div",
                { class: "buttons" },
                this.diagnosticsButton,
                this.options.element,
                this.files.element,
                buttons.panel,
            ),
        );
    }

    private optionsPanel(looks: ChromeLooks): HTMLElement {
        const { ui, actions, pictureSwitches } = this;
        const relatives = html("fieldset", {}, html("legend", {}, ui.relatives));
        for (const name of kRelativeNames) {
            const input = checkbox("show-" + name, (checked) => pictureSwitches.setRelative(name, checked));
            this.switches.set(name, input);
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

    private filePanel(): HTMLElement {
        const { ui, actions } = this;
        const item = (id: string, label: string, action: () => void) => {
            const button = html("button", { id, type: "button", class: "item" }, label);
            onClick(button, () => {
                this.files.close();
                this.files.button.focus();
                action();
            });
            return button;
        };
        const inSight = checkbox("save-in-sight", () => {});
        return html(
            "div",
            { id: "file-panel", class: "sheet", role: "region", "aria-label": ui.file },
            item("copy-link", ui.copyLink, () => actions.copyLink()),
            switchRow(inSight, ui.inSight),
            item("save-svg", ui.saveSvg, () => actions.saveSvg(inSight.checked)),
            item("save-png", ui.savePng, () => actions.savePng(inSight.checked)),
            item("print", ui.print, () => actions.print()),
            item("print-sheets", ui.paper.title, () => actions.choosePaper()),
            item("open-file", ui.openFile, () => actions.openFile()),
            this.encodingRow,
            this.keepRow,
            item("keys-button", ui.keys, () => this.keys.showModal()),
        );
    }

    private keyDialog(): HTMLDialogElement {
        const { ui } = this;
        const dialog = html("dialog", { id: "keys", "aria-labelledby": "keys-title" });
        const list = html("dl", { class: "keys" });
        for (const [key, meaning] of ui.keyList)
            list.append(html("div", {}, html("dt", {}, html("kbd", {}, key)), html("dd", {}, meaning)));
        dialog.append(this.dialogHead("keys-title", ui.keys, dialog), list);
        return dialog;
    }

    private dialogHead(id: string, title: string, dialog: HTMLDialogElement): HTMLElement {
        const close = iconButton(id + "-close", "close", this.ui.close, () => dialog.close());
        return html("div", { class: "dialog-head" }, html("h2", { id }, title), close);
    }

    private viewButton(view: "family" | "pedigree", label: string): HTMLButtonElement {
        const button = html(
            "button",
            { id: "view-" + view, type: "button", "aria-pressed": "false", "aria-label": label },
            icon(view),
            html("span", {}, label),
        );
        onClick(button, () => this.actions.setView(view));
        return button;
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
        const input = this.switches.get(name);
        if (input) input.disabled = disabled;
    }
}

type Enabling = readonly [button: HTMLButtonElement, enabled: boolean];

// Of two that lead opposite ways. A button that has come to its end hands the keys to the other.
function enable(one: Enabling, other: Enabling): void {
    const holder = document.activeElement;
    for (const [button, enabled] of [one, other]) button.disabled = !enabled;
    if (holder === one[0] && !one[1]) other[0].focus();
    else if (holder === other[0] && !other[1]) one[0].focus();
}
