// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The parts that opening, navigation and panels share, and what is open in the page.

import type { Olvane } from "olvane";
import { recall } from "../base/dom";
import type { OlvaneTree } from "../element/OlvaneTree";
import type { EmbeddedFamily } from "../engine/engine";
import { Messages } from "../messages";
import { type UiMessages, uiMessagesFor } from "../messages/ui";
import { Notices } from "../ui/Notices";
import { FileOpening } from "./FileOpening";
import type { FileRemarks } from "./FileRemarks";
import { FirstHint } from "./FirstHint";
import { Journey } from "./Journey";
import { MapHost, type MapPage } from "./MapHost";
import { PictureSwitches } from "./PictureSwitches";

export interface PageSteps {
    /** The browser's history leads to an address. */
    arriveAt(address: string): void;
    openPerson: MapPage["openPerson"];
}

export class Page {
    readonly tree = document.createElement("olvane-tree") as OlvaneTree;
    readonly switches = new PictureSwitches(this.tree);
    readonly notices = new Notices();
    readonly firstHint = new FirstHint();
    readonly files: FileOpening;
    readonly journey: Journey;
    readonly maps: MapHost;

    ui: UiMessages;
    fileName = "";
    encoding = ""; // that was chosen; empty for the file's own word
    isKept = false; // the open file, in the browser
    remarks: FileRemarks | null = null;
    unread: EmbeddedFamily | null = null; // the family beside an embedded map, read when somebody leaves the map

    constructor(
        private readonly engine: Olvane,
        steps: PageSteps,
    ) {
        const language = recall("language") ?? navigator.language;
        this.ui = uiMessagesFor(language);
        this.tree.setAttribute("language", language);
        this.files = new FileOpening(engine);
        // In a frame, steps do not fill the history of the page around it, unless "?history" asks for that.
        this.journey = new Journey(
            (address) => steps.arriveAt(address),
            window.self !== window.top && !new URLSearchParams(location.search).has("history"),
        );
        this.maps = new MapHost(
            {
                openPerson: (number) => steps.openPerson(number),
                mapSettled: (address) => this.journey.replace(address),
            },
            engine.texts,
        );
    }

    /** In the language of the page, of a family or of a map. */
    get messages(): Messages {
        return new Messages(this.ui.language, () => this.engine.texts);
    }

    /** Of the family that is open, or of the map while there is nothing else. */
    get personCount(): number {
        return this.tree.family?.persons.length ?? this.maps.count;
    }
}
