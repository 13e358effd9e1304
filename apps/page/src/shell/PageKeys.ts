// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Keys that are pressed outside of the viewer, and those inside it that lead out of it.

import type { OuterKey } from "../ui/pictureKeys";
import type { OlvaneTreeEvents } from "../element/treeTypes";
import type { Navigation } from "./Navigation";
import type { Page } from "./Page";
import type { Panels } from "./Panels";

export class PageKeys {
    constructor(
        private readonly page: Page,
        private readonly panels: Panels,
        private readonly navigation: Navigation,
    ) {
        page.tree.addEventListener("outerkey", (event) => {
            this.act((event as OlvaneTreeEvents["outerkey"]).detail.key);
            event.preventDefault();
        });
        addEventListener("keydown", (event) => {
            if (this.isForPage(event) && this.press(event)) event.preventDefault();
        });
    }

    private act(key: OuterKey): void {
        const { page, panels } = this;
        if (key === "search") panels.focusSearch();
        else if (key === "keys") panels.openKeys();
        else if (key === "back") page.journey.back();
        else if (key === "forward") page.journey.forward();
        else if (key === "switchView") this.navigation.switchView();
        else {
            page.notices.clear();
            page.tree.closeSheets();
        }
    }

    // Those pressed inside the viewer have been acted on by the time they come here.
    private isForPage(event: KeyboardEvent): boolean {
        if (event.defaultPrevented || document.querySelector("dialog[open]")) return false;
        const target = event.target as Element;
        return (
            !event.composedPath().includes(this.page.tree) &&
            !target.matches("input:not([type=checkbox]), select, textarea")
        );
    }

    private press(event: KeyboardEvent): boolean {
        const { tree, maps } = this.page;
        if (!maps.isShown) return tree.family !== null && tree.press(event);
        if (event.key !== "/") return false;
        this.act("search");
        return true;
    }
}
