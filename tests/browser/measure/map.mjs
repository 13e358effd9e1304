// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// How quick the map of a page is, in Chromium that draws in software: node map.mjs PAGE.html [--screenshots DIR]
//
// Prints when the page stands after it was asked for, how long frames are while somebody flies about (each frame pans
// or zooms, from everything to names and back, to random places), and how long searches and the flights behind them
// take; and how many bytes the map has for each person. A frame is the time from one to the next: scripts, drawing and what the browser does beside them.

import { mkdirSync, readFileSync, statSync } from "node:fs";
import { basename, join, resolve } from "node:path";
import { pathToFileURL } from "node:url";
import { gunzipSync } from "node:zlib";
import { chromium } from "playwright-core";

const [file] = process.argv.slice(2);
const folder = process.argv[3] === "--screenshots" ? process.argv[4] : "";
if (!file) throw new Error("usage: node map.mjs PAGE.html [--screenshots DIR]");
const browser = await chromium.launch({
    executablePath: process.env.OLVANE_CHROMIUM ?? "/usr/bin/chromium",
    args: ["--no-sandbox", "--disable-gpu"],
});
const page = await browser.newPage({ viewport: { width: 1280, height: 800 } });
page.on("pageerror", (error) => console.error(String(error)));
page.setDefaultTimeout(120_000);
await page.addInitScript(() => {
    new MutationObserver((_, observer) => {
        if (!document.querySelector("#map canvas")) return;
        observer.disconnect();
        requestAnimationFrame(() => setTimeout(() => (window.openedAfter = performance.now())));
    }).observe(document, { childList: true, subtree: true });
});
await page.goto(pathToFileURL(resolve(file)).href);
await page.waitForFunction(() => window.openedAfter !== undefined);
const size = (statSync(file).size / 1e6).toFixed(1);
console.log(`${basename(file)}: ${size} MB; ${await page.innerText(".title span")}`);
console.log(`  open: ${(await page.evaluate(() => window.openedAfter)).toFixed(0)} ms`);
printBytes(readFileSync(file, "latin1"));
if (folder) mkdirSync(folder, { recursive: true });
const photograph = async (name) =>
    folder && page.screenshot({ path: join(folder, `${basename(file, ".html")}-${name}.png`) });
await page.waitForTimeout(1500);
await photograph("far");

const frames = await page.evaluate(fly, 600);
console.log(
    `  frames: median ${at(frames, 0.5)} ms, 99th percentile ${at(frames, 0.99)} ms, longest ${at(frames, 1)} ms`,
);

const finds = [];
const flights = [];
for (let i = 0; i < 40; ++i) {
    const { find, flight } = await page.evaluate(findAndGo, i);
    finds.push(find);
    if (flight > 0) flights.push(flight);
}
console.log(`  search while typing: median ${at(finds, 0.5)} ms, longest ${at(finds, 1)} ms`);
console.log(`  from the choice to the arrival: median ${at(flights, 0.5)} ms, longest ${at(flights, 1)} ms`);
await photograph("near");
for (let i = 0; i < 6; ++i) await page.click("#map-out");
await page.waitForTimeout(400);
await photograph("middle");
await browser.close();

// The texts and their ends are section 9, the places of each person's texts section 8; see olvane/charts/MapIndex.h.
function printBytes(text) {
    const packed = /id="olvane-map">([^<]*)</.exec(text)[1];
    const map = gunzipSync(Buffer.from(packed, "base64"));
    const persons = map.readUInt32LE(20);
    const sizes = new Map();
    for (let at = 28; at < map.length; at += 8 + 4 * Math.ceil(map.readUInt32LE(at + 4) / 4))
        sizes.set(map.readUInt32LE(at), map.readUInt32LE(at + 4));
    const each = (bytes) => (bytes / persons).toFixed(1);
    const [names, texts] = [sizes.get(8), sizes.get(9)];
    console.log(
        `  bytes a person: ${each(map.length - names - texts)} beside the names, ${each(names + texts)} of names; ${each(packed.length)} as they lie in the page`,
    );
}

// In the page. Wheel and drag by events, as they come from hands; one of them a frame.
function fly(count) {
    const canvas = document.querySelector("#map canvas");
    let seed = 7;
    const random = () => (seed = (seed * 48271) % 2147483647) / 2147483647;
    const gaps = [];
    const wheel = (x, y, deltaY) =>
        canvas.dispatchEvent(
            new WheelEvent("wheel", { clientX: x, clientY: y, deltaY, bubbles: true, cancelable: true }),
        );
    const pointer = (type, x, y) =>
        canvas.dispatchEvent(
            new PointerEvent(type, { pointerId: 1, button: 0, clientX: x, clientY: y, bubbles: true }),
        );
    return new Promise((done) => {
        let last = 0;
        let i = 0;
        let [x, y] = [600, 400];
        const step = (now) => {
            if (last) gaps.push(now - last);
            last = now;
            if (i++ === count) return done(gaps);
            const phase = Math.floor(i / 40) % 4;
            if (i % 40 === 0) [x, y] = [200 + random() * 900, 150 + random() * 550];
            if (phase === 0) wheel(x, y, -170);
            else if (phase === 2) wheel(x, y, 170);
            else {
                if (i % 40 === 0) pointer("pointerdown", x, y);
                pointer("pointermove", (x += (random() - 0.4) * 60), (y += (random() - 0.5) * 40));
                if (i % 40 === 39) pointer("pointerup", x, y);
            }
            requestAnimationFrame(step);
        };
        requestAnimationFrame(step);
    });
}

async function findAndGo(i) {
    const input = document.querySelector("#search");
    const words = [
        "mary",
        "john 18",
        "given" + i * 97,
        "surname" + ((i * 31) % 997),
        "will",
        "given" + i * 41 + " surname" + i,
        "elizabeth",
    ];
    input.focus();
    input.value = words[i % words.length];
    const start = performance.now();
    input.dispatchEvent(new Event("input"));
    const find = performance.now() - start;
    if (!document.querySelector("#found-0")) return { find, flight: 0 };
    performance.clearMeasures("olvane-map-flight");
    const chosen = performance.now();
    input.dispatchEvent(new KeyboardEvent("keydown", { key: "Enter", bubbles: true }));
    while (performance.getEntriesByName("olvane-map-flight").length === 0)
        await new Promise((next) => setTimeout(next, 1));
    return { find, flight: performance.now() - chosen };
}

function at(values, share) {
    const sorted = [...values].sort((a, b) => a - b);
    return (sorted[Math.min(sorted.length - 1, Math.floor(sorted.length * share))] ?? NaN).toFixed(1);
}
