// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// One Chromium for all tests, and the files that they open in it.

import { mkdirSync, mkdtempSync, readFileSync, rmSync, writeFileSync } from "node:fs";
import { tmpdir } from "node:os";
import { join, resolve } from "node:path";
import { pathToFileURL } from "node:url";
import { gzipSync } from "node:zlib";
import { chromium } from "playwright-core";
import { disturb } from "./disturbance.mjs";
import { kPatience } from "./patience.mjs";
import { reportOn } from "./reported.mjs";
import { Visit } from "./Visit.mjs";

const kArguments = [
    "--no-sandbox",
    "--disable-gpu",
    "--disable-quic",
    "--no-first-run",
    "--disable-background-networking",
    "--disable-component-update",
    "--disable-sync",
];
const kWindow = { width: 1280, height: 800 };

const folder = mkdtempSync(join(tmpdir(), "olvane-browser-"));
const template = readFileSync(process.env.OLVANE_PAGE, "utf8");
let launched = null;
let families = 0;

/** Tests of one suite wait for the browser most of their time, so two of them run at once. */
export const kTwoAtOnce = { concurrency: 2 };

export async function closeBrowser() {
    await (await launched)?.close();
    rmSync(folder, { recursive: true, force: true });
}

export function sample(name) {
    return readFileSync(join(process.env.OLVANE_SOURCES, "samples", name));
}

// A real GEDCOM file, or null where they are not at hand.
export function realFile(name) {
    const real = process.env.OLVANE_GEDCOM_DIR;
    return real ? readFileSync(join(real, name)) : null;
}

export function fileFor(name, content) {
    const path = join(folder, name);
    writeFileSync(path, content);
    return path;
}

/** The module that a page holds. */
export async function engineIn(page) {
    const unpack = `${process.env.OLVANE_SOURCES}/bindings/javascript/package/unpack.mjs`;
    const { bytesOfLetters, joinModule, unpackLzma } = await import(unpack);
    const [, style, script, letters] = /id="olvane-parts" data-style="(\d+)" data-script="(\d+)">([^<]*)</.exec(page);
    return joinModule(unpackLzma(bytesOfLetters(letters)).subarray(Number(style) + Number(script)));
}

/** The page without a family. settings are those of a browser context. */
export async function visitEmpty(settings = {}, hash = "") {
    return visitFile(process.env.OLVANE_PAGE, settings, hash);
}

/** The page with a family in it, as the olvane command writes it. stated: name, title, focus, address. */
export async function visitFamily(gedcom, stated = {}, settings = {}, hash = "") {
    const block = JSON.stringify({
        name: "family.ged",
        title: "Family",
        focus: "",
        livingHidden: false,
        gzip: gzipSync(gedcom).toString("base64"),
        ...stated,
    }).replaceAll("<", "\\u003c");
    const page = template.replace(
        "<!-- olvane:family -->",
        () => `<script type="application/json" id="olvane-family">${block}</script>`,
    );
    const visit = await visitFile(fileFor(`family-${++families}.html`, page), settings, hash);
    await visit.untilFamily();
    return visit;
}

export async function visitDarwins(hash = "#person=I1", settings = {}) {
    return visitFamily(
        sample("darwin-wedgwood.ged"),
        { name: "darwin-wedgwood.ged", title: "Darwin and Wedgwood" },
        settings,
        hash,
    );
}

export async function visitFile(path, settings = {}, hash = "") {
    return Visit.begin(await newContext(settings), pathToFileURL(path).href + hash);
}

// Movements are switched off unless a test is about them, which makes the others quick and certain.
export async function newContext(settings = {}) {
    launched ??= chromium.launch({
        executablePath: process.env.OLVANE_CHROMIUM ?? "/usr/bin/chromium",
        args: kArguments,
    });
    const browser = await launched;
    const context = await browser.newContext({
        viewport: kWindow,
        locale: "en-GB",
        reducedMotion: "reduce",
        acceptDownloads: true,
        ...settings,
    });
    context.setDefaultTimeout(kPatience);
    reportOn(context);
    await disturb(context);
    return context;
}

/** Keeps a picture of the window when the run asks for it. */
export async function photograph(visit, name) {
    const at = process.argv.indexOf("--screenshots");
    if (at < 0) return;
    const place = resolve(process.env.OLVANE_START ?? ".", process.argv[at + 1]);
    mkdirSync(place, { recursive: true });
    await visit.dismiss();
    await visit.still();
    await visit.page.screenshot({ path: join(place, `page-${name}.png`) });
}
