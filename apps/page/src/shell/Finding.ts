// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The search's questions, asked of the family that is open, or of the map while there is nothing else.

import type { Person } from "olvane";
import type { OlvaneTree } from "../element/OlvaneTree";
import type { Messages } from "../messages";
import type { MapHost } from "./MapHost";
import type { SearchSource } from "./SearchBox";
import type { Found } from "./searchReasons";

// An index is made for some ms at a time, which no frame is late for, once the first picture has come to rest.
const kPrepareDelay = 400;
const kPrepareTime = 8;
const kPreparePause = 8;

export class Finding implements SearchSource {
    private timer = 0;

    constructor(
        private readonly tree: OlvaneTree,
        private readonly maps: MapHost,
        private readonly messagesNow: () => Messages,
    ) {}

    get messages(): Messages {
        return this.messagesNow();
    }

    /** Makes the index of the open family beside everything else, so that nobody's first letter waits for it. */
    prepare(): void {
        const { family } = this.tree;
        const start = performance.now();
        const prepare = (): void => {
            if (family !== this.tree.family || !family) return;
            if (family.file.prepareSearch(kPrepareTime)) performance.measure("olvane-index", { start });
            else this.timer = window.setTimeout(prepare, kPreparePause);
        };
        clearTimeout(this.timer);
        this.timer = window.setTimeout(prepare, kPrepareDelay);
    }

    find(text: string, limit: number): readonly Found[] {
        const { family } = this.tree;
        if (!family) return this.maps.find(text, limit);
        return family.file.search(text, limit).map((hit) => ({ person: family.person(hit.person)!, hit }));
    }

    person(id: number): Person | undefined {
        return this.tree.family?.person(id);
    }

    nameOf(person: Person): string {
        return this.messages.nameOf(person);
    }

    kinshipOf(person: Person): string {
        return this.tree.kinshipOf(person);
    }

    choose(person: Person): void {
        if (this.maps.isShown) return this.maps.goTo(person.id);
        this.tree.focusOn(person.id);
        this.tree.takeKeys();
    }
}
