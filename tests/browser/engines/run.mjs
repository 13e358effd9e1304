// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The tasks of the page in every browser engine of this machine: node engines/run.mjs [--only ENGINE] [--task WORDS]
//
// Each task ends the same in all engines; clicks, keys and seconds are printed as a table.

import { mkdirSync, mkdtempSync, readFileSync, rmSync, writeFileSync } from "node:fs";
import { tmpdir } from "node:os";
import { join, resolve } from "node:path";
import { pathToFileURL } from "node:url";
import { gzipSync } from "node:zlib";
import { detailedFamily, gedcom } from "../support/families.mjs";
import { kHands, Mouse } from "./hands.mjs";
import { kDetailTasks, kHandless, kMediaTasks, kRemarkTasks, kTasks } from "./tasks.mjs";
import { kEngines } from "./windows.mjs";

const only = optionOf("--only");
const shots = optionOf("--screenshots");
const wanted = optionOf("--task");
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

const odd = pageWith(
    gedcom(
        "0 @I1@ INDI",
        "1 NAME Ada /Well/",
        "0 @I2@ INDI",
        "1 NAME Early /Grave/",
        "1 BIRT",
        "2 DATE 1900",
        "1 DEAT",
        "2 DATE 1890",
    ),
    "odd",
);
const kFamilies = [
    [darwins, kTasks],
    [roses, kDetailTasks],
    [odd, kRemarkTasks],
    [odd, kMediaTasks],
];

// Another address each time, so that nothing of the task before is left.
let visits = 0;
async function done(window, Hand, address, run) {
    const walk = new Hand(window);
    await window.resize(Hand.size);
    await walk.begin(`${address}?${++visits}#person=I1`);
    const start = performance.now();
    const outcome = await run(walk);
    return { outcome, clicks: walk.clicks, keys: walk.keys, seconds: (performance.now() - start) / 1000 };
}

// Each task by each hand. What fails is said, and the next begins.
async function inEngine(engine) {
    const results = new Map();
    const window = await engine.open();
    const take = async (task, Hand, address, run) => {
        const name = `${task} | ${Hand.name}`;
        try {
            results.set(name, await done(window, Hand, address, run));
        } catch (error) {
            results.set(name, { failure: error.message.split("\n")[0] });
        }
        if (!shots) return;
        mkdirSync(resolve(shots), { recursive: true });
        await window.screenshot(resolve(shots, `${engine.name}-${results.size}.png`));
    };
    try {
        for (const [address, tasks] of kFamilies) {
            for (const [task, run] of Object.entries(tasks)) {
                if (wanted && !task.includes(wanted)) continue;
                for (const Hand of kHands) await take(task, Hand, address, run);
            }
        }
        for (const [task, run] of Object.entries(kHandless)) {
            if (!wanted || task.includes(wanted)) await take(task, Mouse, darwins, run);
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
console.log(`| task | by | clicks | keys | ${names.map((name) => name + ", s").join(" | ")} |`);
console.log(`| --- | --- | ---: | ---: | ${names.map(() => "---:").join(" | ")} |`);
let failed = 0;
const tasks = [...found.get(names[0]).keys()];
for (const task of tasks) {
    const results = names.map((name) => found.get(name).get(task));
    const first = results.find(({ failure }) => !failure);
    const seconds = results.map((result) => (result.failure ? "fails" : result.seconds.toFixed(1)));
    console.log(`| ${task} | ${first?.clicks ?? 0} | ${first?.keys ?? 0} | ${seconds.join(" | ")} |`);
    for (const [i, { outcome, failure }] of results.entries()) {
        if (!failure && outcome === first.outcome) continue;
        console.log(`${task}, ${names[i]}: ${failure ?? `differs from ${names[0]}`}`);
        ++failed;
    }
}
console.log(`${tasks.length * names.length - failed} passed, ${failed} failed`);
process.exitCode = failed > 0 || names.length === 0 ? 1 : 0;
