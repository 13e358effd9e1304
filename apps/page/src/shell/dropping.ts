// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Takes files that are dropped anywhere on the page, or chosen in the browser's own dialog.

import { html } from "../base/dom";

export function fileInput(take: (file: File) => void): HTMLInputElement {
    const input = html("input", {
        id: "file-input",
        type: "file",
        accept: ".ged,.gdz,.gedcom,.zip",
        "aria-hidden": "true",
        tabindex: -1,
    });
    input.addEventListener("change", () => {
        const file = input.files?.[0];
        // The same file may be chosen again after it was repaired.
        input.value = "";
        if (file) take(file);
    });
    return input;
}

/**
 * While the page is starting, keeps the browser from leaving it for a file that is dropped. The function that is returned
 * ends that, and returns what was dropped last.
 */
export function holdDrops(): () => readonly File[] {
    let held: readonly File[] = [];
    const end = new AbortController();
    const { signal } = end;
    addEventListener("dragover", (event) => event.preventDefault(), { signal });
    addEventListener(
        "drop",
        (event) => {
            event.preventDefault();
            held = [...(event.dataTransfer?.files ?? [])];
        },
        { signal },
    );
    return () => {
        end.abort();
        return held;
    };
}

export function takeDrops(cover: HTMLElement, take: (files: readonly File[]) => void): void {
    const holdsFiles = (event: DragEvent) => event.dataTransfer?.types.includes("Files") ?? false;
    addEventListener("dragover", (event) => {
        if (!holdsFiles(event)) return;
        event.preventDefault();
        event.dataTransfer!.dropEffect = "copy";
        cover.hidden = false;
    });
    addEventListener("dragleave", (event) => {
        if (event.relatedTarget === null) cover.hidden = true;
    });
    addEventListener("drop", (event) => {
        cover.hidden = true;
        const files = [...(event.dataTransfer?.files ?? [])];
        if (files.length === 0) return;
        event.preventDefault();
        take(files);
    });
}
