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
import { detailedFamily, lineOf } from "../support/families.mjs";
import { kEngines } from "./windows.mjs";
import { Walk } from "./Walk.mjs";

const only = optionOf("--only");
const shots = optionOf("--screenshots");
const folder = mkdtempSync(join(tmpdir(), "olvane-engines-"));

function optionOf(name) {
    const at = process.argv.indexOf(name);
    return at < 0 ? null : process.argv[at + 1];
}

function pageWith(gedcom, title) {
    const block = JSON.stringify({
        name: "family.ged",
        title,
        focus: 1,
        view: "family",
        livingHidden: false,
        gzip: gzipSync(gedcom).toString("base64"),
    });
    const page = readFileSync(process.env.OLVANE_PAGE, "utf8").replace(
        "<!-- olvane:family -->",
        () => `<script type="application/json" id="olvane-family">${block.replaceAll("<", "\\u003c")}</script>`,
    );
    const path = join(folder, `${title}.html`);
    writeFileSync(path, page);
    return pathToFileURL(path).href;
}

const darwins = pageWith(readFileSync(join(process.env.OLVANE_SOURCES, "samples/darwin-wedgwood.ged")), "darwins");
const roses = pageWith(detailedFamily(), "roses");
const kLarge = lineOf(20_000);

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
    "see how two are related": async (walk) => {
        await walk.click('#tree [data-xref="I12"] .frame');
        await walk.click("#how-related");
        await walk.until(() => location.hash.includes("view=kinship"));
        return walk.picture();
    },
    "see the fan": async (walk) => {
        await walk.click("#views-button");
        await walk.click("#choose-fan");
        await walk.until(() => location.hash.includes("view=fan"));
        return walk.picture();
    },
    "see everybody": async (walk) => {
        await walk.click("#views-button");
        await walk.click("#choose-everybody");
        await walk.until(() => location.hash.includes("view=everybody"));
        return walk.picture();
    },
    "see everybody as a map, and follow kin by keys": async (walk) => {
        await walk.click("#views-button");
        await walk.click("#choose-map");
        await walk.until(() => location.hash.startsWith("#map=") && one("#map-card h2") !== null);
        await walk.window.evaluate(() => one("#map canvas").focus());
        const before = await walk.text("#map-card h2");
        await walk.press("ArrowUp");
        const parent = await walk.text("#map-card h2");
        assert.notEqual(parent, before);
        await walk.press("ArrowDown");
        assert.equal(await walk.text("#map-card h2"), before);
        // What is drawn is not the page's colour alone.
        const colours = await walk.window.evaluate(() => {
            const { width, height } = one("#map canvas");
            const { data } = one("#map canvas").getContext("2d").getImageData(0, 0, width, height);
            const seen = new Set();
            for (let at = 0; at < data.length; at += 4) seen.add((data[at] << 16) | (data[at + 1] << 8) | data[at + 2]);
            return seen.size;
        });
        assert.ok(colours > 3, `${colours} colours`);
        return `${before}, ${parent}`;
    },
    "find somebody on the map and go to their family": async (walk) => {
        await walk.click("#views-button");
        await walk.click("#choose-map");
        await walk.until(() => location.hash.startsWith("#map="));
        await walk.click("#search");
        await walk.type("josiah 1730");
        await walk.press("Enter");
        await walk.until(() => /Josiah/.test(one("#map-card h2")?.textContent));
        await walk.window.evaluate(() => one("#map canvas").focus());
        await walk.press("Enter");
        await walk.until(() => /Josiah/.test(one("#side-panel h2")?.textContent));
        return walk.focus();
    },
    "copy a link to what is seen": async (walk) => {
        await walk.window.evaluate(() => {
            const keep = (text) => Promise.resolve((window.copied = text));
            Object.defineProperty(navigator, "clipboard", { value: { writeText: keep }, configurable: true });
        });
        await walk.click("#file-button");
        await walk.click("#copy-link");
        await walk.until(() => window.copied !== undefined);
        return walk.window.evaluate(() => window.copied.replace(/^[^#]*|sight=[^&]*/g, ""));
    },
    "read the page in German": async (walk) => {
        await walk.click("#options-button");
        await walk.window.evaluate(() => {
            const choice = one("#language");
            choice.value = "de";
            choice.dispatchEvent(new Event("change"));
        });
        await walk.until(() => document.documentElement.lang === "de");
        return walk.text("#side-panel .kinship");
    },
    "go back": async (walk) => {
        await walk.click("#view-pedigree");
        await walk.until(() => location.hash.includes("view=pedigree"));
        await walk.click("#back");
        await walk.until(() => !location.hash.includes("view=pedigree"));
        return walk.picture();
    },
    print: async (walk) => {
        const sheets = await walk.window.sheets();
        assert.ok(sheets === null || sheets === 1, `${sheets} sheets`);
        return "";
    },
};

// Of a file with notes, sources and names.
const kDetailTasks = {
    "read the sources of a fact": async (walk) => {
        await walk.click('#tree [data-xref="I1"] .frame');
        await walk.click("#side-panel .sources summary");
        await walk.until(() => one("#side-panel .sources").open);
        return walk.text("#side-panel section.facts");
    },
    "open a large file and wait for its picture": async (walk) => {
        await walk.window.evaluate((text) => {
            const transfer = new DataTransfer();
            transfer.items.add(new File([text], "long.ged"));
            document.body.dispatchEvent(
                new DragEvent("drop", { dataTransfer: transfer, bubbles: true, cancelable: true }),
            );
        }, kLarge);
        await walk.until(() => document.title === "long");
        return walk.text(".bar .title");
    },
};

async function inEngine(engine) {
    const results = new Map();
    const window = await engine.open();
    try {
        for (const [name, run] of Object.entries({ ...kTasks, ...kDetailTasks })) {
            const walk = new Walk(window);
            // Another address each time, so that nothing of the task before is left.
            await walk.begin(`${name in kTasks ? darwins : roses}?${results.size}#person=I1`);
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
const tasks = Object.keys({ ...kTasks, ...kDetailTasks });
for (const task of tasks) {
    const results = names.map((name) => found.get(name).get(task));
    const { clicks, keys } = results[0];
    console.log(`| ${task} | ${clicks} | ${keys} | ${results.map(({ seconds }) => seconds.toFixed(1)).join(" | ")} |`);
    for (const [i, { outcome }] of results.entries()) {
        if (outcome === results[0].outcome) continue;
        console.log(`${task}: ${names[i]} differs from ${names[0]}`);
        ++failed;
    }
}
const passed = tasks.length - failed;
console.log(`${passed} passed, ${failed} failed`);
process.exitCode = failed > 0 || names.length === 0 ? 1 : 0;
