// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The rows that the command and the libraries are tried with as well.

import "./viewOptions";
import assert from "node:assert/strict";
import { readFileSync } from "node:fs";
import { join } from "node:path";
import { test } from "node:test";
import {
    hasCompact,
    hasDirection,
    hasDown,
    hasGroups,
    hasUp,
    kRelativeNames,
    kViewNames,
    type RelativeName,
    type ViewName,
} from "../src/base/views";
import { kUsualState, readAddress, sameState, type ViewState } from "../src/view/ViewState";

const folder = process.env["OLVANE_FIXTURES"] ?? "";
const skip = folder === "" ? "OLVANE_FIXTURES is not set" : false;

function fixture(name: string): unknown {
    return JSON.parse(readFileSync(join(folder, name), "utf8"));
}

interface ViewRow {
    readonly name: ViewName;
    readonly command: readonly string[];
    readonly page: readonly string[];
}

interface AddressRow {
    readonly address: string;
    readonly state: Partial<Omit<ViewState, "hidden">> & { readonly hidden?: readonly RelativeName[] };
}

test("the page offers the options of the rows, and none that the command does not take", { skip }, () => {
    const { views } = fixture("views.json") as { views: ViewRow[] };
    const offers = { groups: hasGroups, up: hasUp, down: hasDown, direction: hasDirection, compact: hasCompact };
    for (const { name, command, page } of views) {
        const offered = Object.entries(offers).flatMap(([option, has]) => (has(name) ? [option] : []));
        assert.deepEqual(offered, page, name);
        for (const option of page) assert.ok(option === "groups" || command.includes(option), `${name}: ${option}`);
    }
    assert.deepEqual(
        kViewNames,
        views.map(({ name }) => name),
    );
});

test("every group of relatives has a switch", { skip }, () => {
    const { relatives } = fixture("views.json") as { relatives: Record<string, number> };
    assert.deepEqual([...kRelativeNames].sort(), Object.keys(relatives).sort());
});

test("an address that the command wrote leads to the state of the row", { skip }, () => {
    const { rows } = fixture("addresses.json") as { rows: AddressRow[] };
    const usual = { ...kUsualState, focus: 1 };
    for (const { address, state } of rows) {
        const wanted = { ...usual, ...state, hidden: new Set(state.hidden) };
        assert.ok(sameState(readAddress(`#${address}`, [], usual), wanted), address);
    }
});
