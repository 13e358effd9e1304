// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Runs all suites in one process with one browser: node run.mjs [--screenshots DIR] [--only WORD]

import { after } from "node:test";
import { closeBrowser } from "./support/browser.mjs";
import { suitesInOrder } from "./support/disturbance.mjs";

const kSuites = [
    "opening",
    "walking",
    "searching",
    "options",
    "folding",
    "saving",
    "hostile",
    "looks",
    "accessible",
    "living",
    "details",
    "sharing",
    "large",
    "spoken",
    "languages",
    "map",
    "element",
    "speed",
];

const only = optionOf("--only");
for (const suite of suitesInOrder(kSuites)) {
    if (!only || suite.startsWith(only)) await import(`./suites/${suite}.mjs`);
}
after(closeBrowser);

function optionOf(name) {
    const at = process.argv.indexOf(name);
    return at < 0 ? null : process.argv[at + 1];
}
