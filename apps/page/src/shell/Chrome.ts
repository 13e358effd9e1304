// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The bar at the top with its two panels and the dialogs that it opens. All of it is made again when the language changes.

import { iconButton } from "../base/controls";
import { html, onClick } from "../base/dom";
import { icon } from "../base/icons";
import type { UiMessages } from "../messages/ui";
import type { ViewState } from "../view/ViewState";
import { dialogHead } from "./dialogHead";
import { enable } from "./enabling";
import type { ListedRemark } from "./FileRemarks";
import { type FileActions, FilePanel } from "./FilePanel";
import type { Finding } from "./Finding";
import { type OptionActions, type OptionLooks, OptionsPanel } from "./OptionsPanel";
import type { PictureSwitches } from "./PictureSwitches";
import { Popover } from "./Popover";
import { RemarksDialog } from "./RemarksDialog";
import { SearchBox } from "./SearchBox";
import { type ViewActions, ViewChooser } from "./ViewChooser";

export interface ChromeActions extends ViewActions, OptionActions, FileActions {
    back(): void;
    forward(): void;
    togglePanel(): void;
}

export interface ChromeLooks extends OptionLooks {
    /** To choose from where a file's own word on its encoding is wrong. */
    readonly encodings: readonly string[];
}

export class Chrome {
    readonly bar: HTMLElement;
    readonly keys: HTMLDialogElement;
    readonly search: SearchBox;
    private readonly title = html("div", { class: "title" });
    private readonly buttons: Record<"back" | "forward" | "family" | "pedigree" | "panel", HTMLButtonElement>;
    private readonly remarks: RemarksDialog;
    private readonly options: OptionsPanel;
    private readonly optionsPopover: Popover;
    private readonly file: FilePanel;
    private readonly filePopover: Popover;
    private readonly views: ViewChooser;

    constructor(
        private readonly ui: UiMessages,
        private readonly actions: ChromeActions,
        switches: PictureSwitches,
        finding: Finding,
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
        this.keys = this.keyDialog();
        this.remarks = new RemarksDialog(ui, finding);
        this.views = new ViewChooser(ui, actions, switches);
        this.options = new OptionsPanel(ui, actions, switches, looks);
        this.optionsPopover = new Popover(
            iconButton("options-button", "options", ui.options, () => {}),
            this.options.element,
        );
        const fileButton = iconButton("file-button", "file", ui.file, () => {});
        this.file = new FilePanel(ui, actions, {
            chosen: () => this.closeFiles(),
            showKeys: () => this.keys.showModal(),
            encodings: looks.encodings,
        });
        this.filePopover = new Popover(fileButton, this.file.element);
        this.bar = this.barElement();
    }

    get diagnostics(): HTMLDialogElement {
        return this.remarks.element;
    }

    // encoding is the one that was chosen, null where the bytes of the file are not available.
    showEncoding(encoding: string | null): void {
        this.file.showEncoding(encoding);
    }

    // null where no file can be kept.
    showKept(isKept: boolean | null): void {
        this.file.showKept(isKept);
    }

    showPhotos(areThere: boolean): void {
        this.options.showPhotos(areThere);
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
        this.options.show(state);
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
        this.remarks.show(found, persons);
    }

    openDiagnostics(): void {
        this.remarks.open();
    }

    private closeFiles(): void {
        this.filePopover.close();
        this.filePopover.button.focus();
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
                this.remarks.button,
                this.optionsPopover.element,
                this.filePopover.element,
                buttons.panel,
            ),
        );
    }

    private keyDialog(): HTMLDialogElement {
        const { ui } = this;
        const dialog = html("dialog", { id: "keys", "aria-labelledby": "keys-title" });
        const list = html("dl", { class: "keys" });
        for (const [key, meaning] of ui.keyList)
            list.append(html("div", {}, html("dt", {}, html("kbd", {}, key)), html("dd", {}, meaning)));
        dialog.append(dialogHead("keys-title", ui.keys, dialog, ui), list);
        return dialog;
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
}
