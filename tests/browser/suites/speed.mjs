// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Figures are printed; what is asserted is far above them, since test machines are busy, and counts what this machine
// computes meanwhile as slowly as that.

import assert from "node:assert/strict";
import { readFileSync, statSync } from "node:fs";
import { describe } from "node:test";
import { engineIn, photograph, realFile, sample, visitEmpty, visitFamily } from "../support/browser.mjs";
import { cousins } from "../support/families.mjs";
import { gzipSync } from "node:zlib";
import { test } from "../support/reported.mjs";

const kPatience = 8;
const kReference = 10; // ms that the computation of slowness() takes on a machine at rest
const kRounds = 3;

// How many times slower than a machine at rest the page computes just now; at least 1.
async function slowness(visit) {
    const time = await visit.page.evaluate(() => {
        let best = Infinity;
        for (let round = 0; round < 5; ++round) {
            const start = performance.now();
            let state = 1;
            for (let i = 0; i < 4_000_000; ++i) state = (Math.imul(state ^ (state >>> 15), 48271) + 1) | 0;
            if (state !== 0) best = Math.min(best, performance.now() - start);
        }
        return best;
    });
    return Math.max(1, time / kReference);
}

// Fails where the least of several times in ms is more than a bound on a machine at rest, with patience.
function assertWithin(times, bound, slow) {
    const least = Math.min(...times);
    assert.ok(least < bound * kPatience * slow, `${times} ms on a machine ${slow.toFixed(1)} times slower`);
}

// A name, one letter of it wrong, words reversed, from the middle, a place, years, an xref, a letter, nobody, and on.
const kTyped = [
    ...["george", "victorai", "hanover victoria", "anove", "windsor castle", "1819", "1819-1825", "I17", "a", "zzzqqq"],
    ...[
        "george 18",
        "mary of teck",
        "saxe coburg",
        "edward albert",
        "berlin 1850",
        "countess",
        "I2969",
        "b",
        "qqqq xx",
    ],
];

// The time that scripts take in the main thread for a click on a box, until the picture is drawn; ms.
async function refocusTime(visit, xref) {
    const session = await visit.context.newCDPSession(visit.page);
    await session.send("Performance.enable");
    const scripts = async () => {
        const { metrics } = await session.send("Performance.getMetrics");
        return 1000 * metrics.find((metric) => metric.name === "ScriptDuration").value;
    };
    const before = await scripts();
    await visit.page.evaluate((xref) => {
        const box = one(`#tree [data-xref="${xref}"]`);
        for (const detail of [1, 2])
            box.dispatchEvent(new MouseEvent("click", { bubbles: true, composed: true, detail }));
    }, xref);
    await visit.page.evaluate(() => new Promise((drawn) => requestAnimationFrame(() => requestAnimationFrame(drawn))));
    return (await scripts()) - before;
}

// From the drop of a file until its picture stands; ms.
async function openingTime(visit, file) {
    await visit.page.evaluate(() => {
        addEventListener("drop", () => (window.droppedAt = performance.now()), true);
        new MutationObserver(() => {
            if (one("#tree .box.focus")) window.readyAt ??= performance.now();
        }).observe(document.body, { childList: true, subtree: true });
    });
    await visit.drop("royal92.ged", file);
    await visit.untilFamily();
    return visit.page.evaluate(() => window.readyAt - window.droppedAt);
}

describe("speed", () => {
    test("a family of 1,000 boxes has a new focus within 50 ms of script", async (context) => {
        const visit = await visitFamily(cousins(31, 30), {}, {}, "#person=C3_4");
        const times = [];
        for (const xref of ["C3_5", "C3_4", "C3_5", "C3_4", "C3_5"]) {
            times.push(await refocusTime(visit, xref));
            await visit.still();
        }
        const boxes = Number(/(\d+) boxes/.exec(await visit.page.locator("#live").innerText())[1]);
        context.diagnostic(
            `${boxes} boxes: ${times.map((time) => time.toFixed(0)).join(", ")} ms of script for a new focus`,
        );
        assert.ok(boxes >= 950 && boxes <= 1100, String(boxes));
        assertWithin(times, 50, await slowness(visit));
        await visit.end();
    });

    test("a picture of 10,000 boxes is panned without a wait", async (context) => {
        const visit = await visitFamily(cousins(100, 98), {}, {}, "#person=C3_4");
        const boxes = Number(/(\d+) boxes/.exec(await visit.page.locator("#live").innerText())[1]);
        assert.ok(boxes > 9900, String(boxes));
        const elements = await visit.page.locator("#tree .boxes > g").count();
        assert.ok(elements < 1500, `${elements} elements: only what is in sight`);
        const frames = await visit.page.evaluate(async () => {
            const tree = one("#tree");
            const frames = [];
            const drag = (type, x) =>
                tree.dispatchEvent(
                    new MouseEvent(type, { bubbles: true, view: window, button: 0, clientX: x, clientY: 300 }),
                );
            drag("mousedown", 600);
            for (let i = 0; i < 60; ++i) {
                const start = performance.now();
                window.dispatchEvent(
                    new MouseEvent("mousemove", {
                        bubbles: true,
                        view: window,
                        clientX: 600 - 25 * i,
                        clientY: 300 + 3 * i,
                    }),
                );
                frames.push(performance.now() - start);
                await new Promise((next) => requestAnimationFrame(next));
            }
            window.dispatchEvent(new MouseEvent("mouseup", { bubbles: true, view: window }));
            return frames.sort((a, b) => a - b);
        });
        const median = frames[Math.floor(frames.length / 2)];
        const worst = frames.at(-1);
        context.diagnostic(
            `${boxes} boxes: a step of a drag takes ${median.toFixed(1)} ms, the worst ${worst.toFixed(0)} ms`,
        );
        assertWithin([median], 16, await slowness(visit));
        await visit.click("#fit");
        await photograph(visit, "overview");
        await visit.end();
    });

    test("3,010 persons are ready within half a second of the drop", async (context) => {
        const file = realFile("history/royal92.ged");
        if (!file) return context.skip("OLVANE_GEDCOM_DIR is not set");
        const opened = [];
        let visit = null;
        for (let round = 0; round < kRounds; ++round) {
            await visit?.end();
            visit = await visitEmpty();
            opened.push(await openingTime(visit, file));
        }
        const printed = opened.map((time) => time.toFixed(0)).join(", ");
        context.diagnostic(`royal92.ged: ready ${printed} ms after the drop`);
        assertWithin(opened, 500, await slowness(visit));
        await visit.goTo("Victoria Hanover");
        assert.match(await visit.page.innerText("#side-panel h2"), /Victoria/);
        await photograph(visit, "royal");
        const times = await visit.page.evaluate(async (texts) => {
            const input = one("#search");
            const times = [];
            for (const text of texts) {
                input.value = text;
                const start = performance.now();
                input.dispatchEvent(new Event("input"));
                times.push(performance.now() - start);
                await new Promise((drawn) => requestAnimationFrame(() => setTimeout(drawn)));
            }
            return times;
        }, kTyped);
        const [first, ...others] = times;
        others.sort((one, other) => one - other);
        const median = others[others.length >> 1];
        context.diagnostic(
            `royal92.ged: a letter typed into the search takes ${first.toFixed(1)} ms the first time, then ` +
                `${median.toFixed(1)} ms, ${others.at(-1).toFixed(1)} at most, with all rows of the list`,
        );
        assertWithin([median], 10, await slowness(visit));
        await visit.end();
    });

    test("page, engine and element are small", async (context) => {
        const page = statSync(process.env.OLVANE_PAGE).size;
        const family = gzipSync(sample("darwin-wedgwood.ged")).length * (4 / 3);
        context.diagnostic(
            `the page without a family: ${(page / 1000).toFixed(0)} kB; with 142 persons: ${((page + family) / 1000).toFixed(0)} kB`,
        );
        assert.ok(page < 442_500, `${page} bytes`);
        // Just above what they are, so that they grow no further unseen; 200 kB and 280 kB are the aims.
        const packed = async (bytes) => gzipSync(await bytes, { level: 9 }).length;
        const engine = await packed(engineIn(readFileSync(process.env.OLVANE_PAGE, "utf8")));
        context.diagnostic(`the engine, packed by gzip: ${(engine / 1000).toFixed(0)} kB`);
        assert.ok(engine < 380_500, `${engine} bytes`);
        const element = await packed(readFileSync(process.env.OLVANE_ELEMENT));
        context.diagnostic(`the element, packed by gzip: ${(element / 1000).toFixed(0)} kB`);
        assert.ok(element < 341_500, `${element} bytes`);
    });
});
