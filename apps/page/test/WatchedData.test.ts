// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A program's own family, watched for changes.

import assert from "node:assert/strict";
import { test } from "node:test";
import type { FamilyData } from "../src/element/treeTypes";
import { WatchedData } from "../src/element/WatchedData";

class Family extends EventTarget implements FamilyData {
    constructor(private readonly text: string) {
        super();
    }

    gedcom(): string {
        return this.text;
    }

    change(): void {
        this.dispatchEvent(new Event("change"));
    }
}

const settled = () => new Promise((done) => setTimeout(done));

test("however many changes are made in a row, one refresh follows", async () => {
    let count = 0;
    const watched = new WatchedData(() => ++count);
    const family = new Family("0 HEAD");
    watched.data = family;
    await settled();
    assert.equal(count, 1);
    for (let i = 0; i < 5; ++i) family.change();
    assert.equal(count, 1);
    await settled();
    assert.equal(count, 2);
});

test("data that were replaced are not watched any more", async () => {
    let count = 0;
    const watched = new WatchedData(() => ++count);
    const [first, second] = [new Family("first"), new Family("second")];
    watched.data = first;
    watched.data = second;
    await settled();
    assert.equal(new TextDecoder().decode(watched.bytes()!), "second");
    count = 0;
    first.change();
    await settled();
    assert.equal(count, 0);
    watched.data = null;
    assert.equal(watched.bytes(), null);
});
