// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The tasks of the page in every browser engine of this machine: node engines/run.mjs [--only ENGINE] [--table]
//
// Each task ends the same in all engines; clicks, keys and seconds are printed as a table.

import assert from "node:assert/strict";
import { mkdirSync, mkdtempSync, readFileSync, rmSync, writeFileSync } from "node:fs";
import { tmpdir } from "node:os";
import { join, resolve } from "node:path";
import { pathToFileURL } from "node:url";
import { gzipSync } from "node:zlib";
import { kEngines } from "./windows.mjs";
import { Walk } from "./Walk.mjs";

const only = optionOf("--only");
const shots = optionOf("--screenshots");
const folder = mkdtempSync(join(tmpdir(), "olvane-engines-"));

function optionOf(name) {
    const at = process.argv.indexOf(name);
    return at < 0 ? null : process.argv[at + 1];
}

function pageWith(file, title) {
    const gedcom = readFileSync(file);
    const block = JSON.stringify({ name: "family.ged", title, focus: 1, view: "family", livingHidden: false, gzip: gzipSync(gedcom).toString("base64") });
    const page = readFileSync(process.env.OLVANE_PAGE, "utf8").replace(
        "<!-- olvane:family -->",
        () => `<script type="application/json" id="olvane-family">${block.replaceAll("<", "\\u003c")}</script>`,
    );
    const path = join(folder, `${title}.html`);
    writeFileSync(path, page);
    return pathToFileURL(path).href;
}

const darwins = pageWith(join(process.env.OLVANE_SOURCES, "samples/darwin-wedgwood.ged"), "darwins");

// What is to be done, in the words of whoever does it; what it gives is the same in every engine.
const kTasks = {
    "read about somebody in sight": async (walk) => {
        await walk.click('#tree [data-xref="I12"] .frame');
        assert.equal(await walk.focus(), "I1");
        return walk.text("#side-panel h2");
    },
    "make them the focus": async (walk) => {
        await walk.click('#tree [data-xref="I12"] .frame', 2);
        await walk.until(() => one("#tree .box.focus").getAttribute("data-xref") === "I12");
        return walk.picture();
    },
    "find somebody by name and go there": async (walk) => {
        await walk.click("#search");
        await walk.type("francis galton 1822");
        await walk.press("Enter");
        await walk.until(() => one("#tree .box.focus").getAttribute("data-xref") !== "I1");
        return walk.focus();
    },
    "walk to the father and make him the focus, by keys": async (walk) => {
        await walk.click('#tree [data-xref="I1"] .frame');
        await walk.press("ArrowUp");
        await walk.press("Enter");
        await walk.until(() => one("#tree .box.focus").getAttribute("data-xref") !== "I1");
        return walk.focus();
    },
    "see all descendants": async (walk) => {
        await walk.click("#views-button");
        await walk.click("#choose-descendants");
        await walk.until(() => location.hash.includes("view=descendants"));
        return walk.picture();
    },
    "see the hourglass": async (walk) => {
        await walk.click("#views-button");
        await walk.click("#choose-hourglass");
        await walk.until(() => location.hash.includes("view=hourglass"));
        return walk.picture();
    },
    "see the pedigree": async (walk) => {
        await walk.click("#view-pedigree");
        await walk.until(() => location.hash.includes("view=pedigree"));
        return walk.picture();
    },
    "go back": async (walk) => {
        await walk.click("#view-pedigree");
        await walk.until(() => location.hash.includes("view=pedigree"));
        await walk.click("#back");
        await walk.until(() => !location.hash.includes("view=pedigree"));
        return walk.picture();
    },
    "print": async (walk) => {
        const sheets = await walk.window.sheets();
        assert.ok(sheets === null || sheets === 1, `${sheets} sheets`);
        return "";
    },
};

async function inEngine(engine) {
    const results = new Map();
    const window = await engine.open();
    try {
        for (const [name, run] of Object.entries(kTasks)) {
            const walk = new Walk(window);
            // Another address each time, so that nothing of the task before is left.
            await walk.begin(`${darwins}?${results.size}#person=I1`);
            const start = performance.now();
            const outcome = await run(walk);
            const seconds = (performance.now() - start) / 1000;
            results.set(name, { outcome, clicks: walk.clicks, keys: walk.keys, seconds });
            if (shots) {
                mkdirSync(resolve(shots), { recursive: true });
                await window.screenshot(resolve(shots, `${engine.name}-${results.size}.png`));
            }
        }
    } finally {
        await window.close();
    }
    return results;
}

const engines = kEngines.filter(({ name }) => !only || name === only);
const missing = engines.filter(({ isHere }) => !isHere).map(({ name }) => name);
if (missing.length > 0) console.log(`not on this machine: ${missing.join(", ")}`);
const found = new Map();
try {
    for (const engine of engines.filter(({ isHere }) => isHere)) found.set(engine.name, await inEngine(engine));
} finally {
    rmSync(folder, { recursive: true, force: true });
}

const names = [...found.keys()];
console.log(`| task | clicks | keys | ${names.map((name) => name + ", s").join(" | ")} |`);
console.log(`| --- | ---: | ---: | ${names.map(() => "---:").join(" | ")} |`);
let failed = 0;
for (const task of Object.keys(kTasks)) {
    const results = names.map((name) => found.get(name).get(task));
    const { clicks, keys } = results[0];
    console.log(`| ${task} | ${clicks} | ${keys} | ${results.map(({ seconds }) => seconds.toFixed(1)).join(" | ")} |`);
    for (const [i, { outcome }] of results.entries()) {
        if (outcome === results[0].outcome) continue;
        console.log(`${task}: ${names[i]} differs from ${names[0]}`);
        ++failed;
    }
}
const passed = Object.keys(kTasks).length - failed;
console.log(`${passed} passed, ${failed} failed`);
process.exitCode = failed > 0 || names.length === 0 ? 1 : 0;
