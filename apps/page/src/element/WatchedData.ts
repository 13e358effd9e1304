// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A family of the program's own, watched for changes. However many changes are made in a row, one refresh follows.

import type { FamilyData } from "./treeTypes";

export class WatchedData {
    private source: FamilyData | null = null;
    private willRefresh = false;

    /** refresh is called soon after data was set and after each change. */
    constructor(private readonly refresh: () => void) {}

    get data(): FamilyData | null {
        return this.source;
    }

    set data(data: FamilyData | null) {
        this.source?.removeEventListener("change", this.changed);
        this.source = data;
        data?.addEventListener("change", this.changed);
        this.changed();
    }

    /** The bytes of its GEDCOM file as they are now; null without data. */
    bytes(): Uint8Array | null {
        return this.source ? new TextEncoder().encode(this.source.gedcom()) : null;
    }

    private readonly changed = (): void => {
        if (this.willRefresh) return;
        this.willRefresh = true;
        queueMicrotask(() => {
            this.willRefresh = false;
            this.refresh();
        });
    };
}
