// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A family of the program's own, watched for changes. However many changes are made in a row, one refresh follows.
//
// The family may live longer than the element that shows it, and lists who listens: what it lists is a small record, which
// leads to the element only while that stands in a page. Changes that are made meanwhile are shown when it does again.

import type { FamilyData } from "./treeTypes";

interface Listener {
    /** Null while nobody is to be called. */
    call: (() => void) | null;
    /** A change was made while nobody was called. */
    missed: boolean;
}

// Made out here, where nothing but the record is in sight.
function handlerOf(listener: Listener): () => void {
    return () => {
        if (listener.call) listener.call();
        else listener.missed = true;
    };
}

export class WatchedData {
    private source: FamilyData | null = null;
    private readonly listener: Listener = { call: () => this.changed(), missed: false };
    private readonly handler = handlerOf(this.listener);
    private willRefresh = false;

    /** refresh is called soon after data was set and after each change. */
    constructor(private readonly refresh: () => void) {}

    get data(): FamilyData | null {
        return this.source;
    }

    set data(data: FamilyData | null) {
        this.source?.removeEventListener?.("change", this.handler);
        this.source = data;
        data?.addEventListener?.("change", this.handler);
        this.changed();
    }

    /** Whether changes are followed; those that were made while they were not are one change now. */
    follow(isFollowed: boolean): void {
        this.listener.call = isFollowed ? () => this.changed() : null;
        if (isFollowed && this.listener.missed) this.changed();
        this.listener.missed = false;
    }

    /** The bytes of its GEDCOM file as they are now; null without data. */
    bytes(): Uint8Array | null {
        return this.source ? new TextEncoder().encode(this.source.gedcom()) : null;
    }

    private changed(): void {
        if (this.willRefresh) return;
        this.willRefresh = true;
        queueMicrotask(() => {
            this.willRefresh = false;
            this.refresh();
        });
    }
}
