// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The panel of what is done with the whole file or picture: saving, printing, opening another, and how the file is read.

import { checkbox, switchRow } from "../base/controls";
import { html, onClick } from "../base/dom";
import type { UiMessages } from "../messages/ui";

export interface FileActions {
    // The whole picture, or what of it is in sight.
    saveSvg(inSight: boolean): void;
    savePng(inSight: boolean): void;
    copyLink(): void;
    print(): void;
    choosePaper(): void;
    openFile(): void;
    // Reads the file again; empty for the file's own word.
    setEncoding(encoding: string): void;
    setKept(isKept: boolean): void;
}

export interface FilePanelSetting {
    /** Something was chosen; it is done next. */
    chosen(): void;
    showKeys(): void;
    /** To choose from where a file's own word on its encoding is wrong. */
    readonly encodings: readonly string[];
}

export class FilePanel {
    readonly element: HTMLElement;
    private readonly encoding = html("select", { id: "encoding" });
    private readonly encodingRow: HTMLElement;
    private readonly keep: HTMLInputElement;
    private readonly keepRow: HTMLElement;

    constructor(
        private readonly ui: UiMessages,
        private readonly actions: FileActions,
        private readonly setting: FilePanelSetting,
    ) {
        this.encoding.append(html("option", { value: "" }, ui.encodingAuto));
        for (const name of setting.encodings) this.encoding.append(html("option", { value: name }, name));
        this.encoding.addEventListener("change", () => actions.setEncoding(this.encoding.value));
        this.encodingRow = html("label", { class: "row" }, html("span", {}, ui.encoding), this.encoding);
        this.keep = checkbox("keep-file", (checked) => actions.setKept(checked));
        this.keepRow = html(
            "label",
            { class: "switch", hidden: true },
            this.keep,
            html("span", {}, ui.keep.label, html("small", {}, ui.keep.hint)),
        );
        this.element = this.filled();
    }

    // encoding is the one that was chosen, null where the bytes of the file are not available.
    showEncoding(encoding: string | null): void {
        this.encodingRow.hidden = encoding === null;
        this.encoding.value = encoding ?? "";
    }

    // null where no file can be kept.
    showKept(isKept: boolean | null): void {
        this.keepRow.hidden = isKept === null;
        this.keep.checked = isKept === true;
    }

    private filled(): HTMLElement {
        const { ui, actions } = this;
        const item = (id: string, label: string, action: () => void) => {
            const button = html("button", { id, type: "button", class: "item" }, label);
            onClick(button, () => {
                this.setting.chosen();
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
            item("keys-button", ui.keys, () => this.setting.showKeys()),
        );
    }
}
