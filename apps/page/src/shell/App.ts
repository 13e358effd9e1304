// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The page around the viewer. Families come in by Opening, Navigation leads from picture to picture, and Panels are what
// stands around them. Everything about the picture itself is the viewer's.

import type { Olvane } from "olvane";
import type { ChromeActions } from "./Chrome";
import { Navigation } from "./Navigation";
import { Opening } from "./Opening";
import { Page } from "./Page";
import { PageKeys } from "./PageKeys";
import { Panels } from "./Panels";

export class App {
    readonly opening: Opening;
    private readonly page: Page;
    private readonly panels: Panels;
    private readonly navigation: Navigation;

    constructor(root: HTMLElement, engine: Olvane) {
        this.page = new Page(engine, {
            arriveAt: (address) => this.navigation.arriveAt(address),
            openPerson: (number) => this.navigation.leaveMap({ focus: number }),
        });
        this.panels = new Panels(root, this.page, this.actions(), (files) => void this.opening.openDropped(files));
        this.navigation = new Navigation(this.page, this.panels, () => this.opening.openEmbedded(this.page.unread!));
        this.opening = new Opening(this.page, this.panels, this.navigation);
        new PageKeys(this.page, this.panels, this.navigation);
        this.panels.rebuild();
    }

    // What the bar asks for, and who does it.
    private actions(): ChromeActions {
        return {
            openFile: () => this.panels.chooseFile(),
            setEncoding: (encoding) => this.opening.setEncoding(encoding),
            setKept: (isKept) => void this.opening.setKept(isKept),

            setView: (view) => this.navigation.setView(view),
            setMap: () => this.navigation.setMap(),
            setMirrored: (isMirrored) => this.navigation.setMirrored(isMirrored),
            back: () => this.page.journey.back(),
            forward: () => this.page.journey.forward(),
            copyLink: () => void this.navigation.copyLink(),

            setLanguage: (language) => this.panels.setLanguage(language),
            setTheme: (theme) => this.panels.setTheme(theme),
            setKinshipInBoxes: (shown) => this.panels.setKinshipInBoxes(shown),
            togglePanel: () => this.panels.toggleSide(),

            saveSvg: (inSight) => this.panels.output.saveSvg(this.page.ui, inSight),
            savePng: (inSight) => void this.panels.output.savePng(this.page.ui, inSight),
            choosePaper: () => this.panels.output.choosePaper(),
            print: () => window.print(),
        };
    }
}
