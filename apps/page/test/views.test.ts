// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Which options the page offers for a view: those that the engine's table says, but for fans, which are of ancestors.

import assert from "node:assert/strict";
import { test } from "node:test";
import { hasCompact, hasDown, hasFolds, hasUp, hasUnknownParents, learnOptions } from "../src/base/views";

test("options follow the engine's table", () => {
    learnOptions([]);
    assert.equal(hasUp("ancestors"), false);
    learnOptions([
        { name: "up", views: ["ancestors", "fan"] },
        { name: "down", views: ["descendants", "fan"] },
        { name: "folded", views: ["near"] },
    ]);
    assert.equal(hasUp("ancestors"), true);
    assert.equal(hasUp("family"), false);
    assert.equal(hasUp("fan"), true);
    assert.equal(hasDown("descendants"), true);
    assert.equal(hasDown("fan"), false);
    assert.equal(hasFolds("near"), true);
    assert.equal(hasCompact("near"), false);
    assert.equal(hasUnknownParents("pedigree"), false);
});
