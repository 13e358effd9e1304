// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Links that show somebody else the same, files that stay in the browser when asked, and good manners in a frame.

import assert from "node:assert/strict";
import { readFileSync } from "node:fs";
import { createServer } from "node:http";
import { after, before, describe } from "node:test";
import {
    kTwoAtOnce,
    newContext,
    photograph,
    sample,
    visitDarwins,
    visitEmpty,
    visitFamily,
} from "../support/browser.mjs";
import { Visit } from "../support/Visit.mjs";
import { test } from "../support/reported.mjs";

const kPhone = { viewport: { width: 390, height: 844 }, hasTouch: true, isMobile: true };
const kFrame =
    '<!doctype html><body style="height: 4000px; margin: 0"><iframe src="page.html" style="width: 900px; height: 600px"></iframe>';

let server = null;
let address = "";
before(async () => {
    const page = readFileSync(process.env.OLVANE_PAGE);
    server = createServer((request, response) => {
        response.setHeader("content-type", "text/html");
        response.end(request.url.startsWith("/frame") ? kFrame : page);
    });
    await new Promise((done) => server.listen(0, "127.0.0.1", done));
    address = `http://127.0.0.1:${server.address().port}`;
});
after(() => server?.close());

// A page of the site, with a file that was dropped on it.
async function visitSite() {
    const context = await newContext();
    const visit = await Visit.begin(context, address + "/page.html");
    await visit.drop("darwin-wedgwood.ged", sample("darwin-wedgwood.ged"));
    await visit.untilFamily();
    return { context, visit };
}

async function copiedLink(visit) {
    await visit.page.evaluate(() => {
        navigator.clipboard.writeText = (text) => Promise.resolve((window.copied = text)).then(() => {});
    });
    await visit.page.click("#file-button");
    await visit.click("#copy-link");
    return visit.page.evaluate(() => window.copied);
}

async function seen(visit) {
    return visit.page.evaluate(() => {
        const tree = document.querySelector("olvane-tree");
        const { zoom, x, y } = tree.sight;
        const { hidden, ...state } = tree.state;
        return {
            state: { ...state, hidden: [...hidden] },
            selected: tree.selected.xref,
            sight: [zoom.toFixed(2), Math.round(x / 5), Math.round(y / 5)],
            language: document.documentElement.lang,
            theme: document.documentElement.dataset.theme,
            panel: one("#side-panel h2").textContent,
        };
    });
}

describe("sharing", kTwoAtOnce, () => {
    test("a copied link opens with the view, its options, the selection, the place, the language and the colours", async () => {
        const visit = await visitDarwins("#person=I1&view=hourglass&up=3&down=2&direction=right&to=I12&hide=cousins");
        await visit.page.evaluate(() => document.querySelector("olvane-tree").select(5));
        await visit.page.click("#options-button");
        await visit.page.selectOption("#theme", "dark");
        await visit.page.selectOption("#language", "de");
        await visit.page.keyboard.press("Escape");
        await visit.click("#zoom-in");
        await visit.page.mouse.move(400, 400);
        await visit.wheel(-240);
        const wanted = await seen(visit);
        const link = await copiedLink(visit);
        await visit.end();

        const other = await visitDarwins(new URL(link).hash);
        assert.deepEqual(await seen(other), wanted);
        assert.equal(wanted.language, "de");
        assert.equal(wanted.theme, "dark");
        assert.equal(wanted.state.view, "hourglass");
        assert.notEqual(wanted.state.to, 0);
        assert.doesNotMatch(
            await other.hash(),
            /sight|theme|language/,
            "a step back changes neither language nor zoom",
        );
        await other.reload();
        await other.untilFamily();
        assert.equal((await seen(other)).language, "en", "a link is no setting of the reader's own");
        await other.end();
    });

    test("a page on disk stores nothing of a family and offers to keep nothing", async () => {
        const visit = await visitEmpty();
        await visit.drop("darwin-wedgwood.ged", sample("darwin-wedgwood.ged"));
        await visit.untilFamily();
        await visit.page.click("#file-button");
        assert.ok(!(await visit.page.isVisible("#keep-file")));
        const stored = await visit.page.evaluate(async () => [
            JSON.stringify(localStorage),
            JSON.stringify(sessionStorage),
            (await indexedDB.databases()).length,
        ]);
        assert.doesNotMatch(stored.join(), /darwin|wedgwood|I1\b/i);
        assert.equal(stored[2], 0);
        await visit.end();
    });

    test("on a site a file stays when that is asked for, and goes when it is taken back", async () => {
        const { context, visit } = await visitSite();
        const kept = () => visit.page.evaluate(async () => (await indexedDB.databases()).length);
        assert.equal(await kept(), 0, "nothing is kept unasked");
        await visit.page.click("#file-button");
        await visit.page.check("#keep-file");
        await visit.page.waitForSelector("#notices .notice >> text=This file stays");
        assert.equal(await kept(), 1);
        await photograph(visit, "keep");
        await visit.page.goto(address + "/page.html");
        await visit.untilFamily();
        assert.equal(await visit.page.title(), "darwin-wedgwood");
        await visit.page.click("#file-button");
        assert.ok(await visit.page.isChecked("#keep-file"));
        await visit.page.uncheck("#keep-file");
        await visit.page.waitForSelector("#notices .notice >> text=removed");
        assert.equal(await kept(), 0);
        await visit.page.goto(address + "/page.html");
        await visit.page.waitForSelector("#welcome");
        await context.close();
    });

    test("a file that was kept and at once removed is not kept", async () => {
        const { context, visit } = await visitSite();
        await visit.page.click("#file-button");
        await visit.page.evaluate(() => {
            const box = document.querySelector("#keep-file");
            box.click();
            box.click();
        });
        await visit.page.waitForSelector("#notices .notice >> text=removed");
        assert.ok(!(await visit.page.isChecked("#keep-file")));
        assert.equal(await visit.page.evaluate(async () => (await indexedDB.databases()).length), 0);
        await context.close();
    });

    test("a kept file that the browser cannot read now is there on the next visit", async () => {
        const { context, visit } = await visitSite();
        await visit.page.click("#file-button");
        await visit.page.check("#keep-file");
        await visit.page.waitForSelector("#notices .notice >> text=This file stays");
        const refusing = await context.newPage();
        await refusing.addInitScript(() => {
            IDBObjectStore.prototype.get = () => {
                throw new DOMException("not now", "UnknownError");
            };
        });
        await refusing.goto(address + "/page.html");
        await refusing.waitForSelector("#welcome");
        // Whatever it does about its file is done before this is answered.
        const names = await refusing.evaluate(async () => {
            await new Promise((done) => (indexedDB.open("other").onsuccess = done));
            return (await indexedDB.databases()).map(({ name }) => name);
        });
        assert.ok(names.includes("olvane"), names.join());
        await visit.page.goto(address + "/page.html");
        await visit.untilFamily();
        assert.equal(await visit.page.title(), "darwin-wedgwood");
        await context.close();
    });

    test("in a frame the wheel scrolls the page around it until the picture is used, and steps stay inside", async () => {
        const context = await newContext();
        const page = await context.newPage();
        await page.goto(address + "/frame.html");
        const frame = page.frames()[1];
        await frame.waitForSelector("#file-input", { state: "attached" });
        await frame.setInputFiles("#file-input", {
            name: "d.ged",
            mimeType: "",
            buffer: sample("darwin-wedgwood.ged"),
        });
        await frame.waitForSelector("#tree .box.focus");
        const zoom = () => frame.evaluate(() => document.querySelector("olvane-tree").sight.zoom.toFixed(3));
        const first = await zoom();
        await page.evaluate(() => document.activeElement.blur());
        await page.mouse.move(300, 500);
        await page.mouse.wheel(0, 120);
        // Browsers scroll little by little.
        await page.waitForFunction(() => {
            const rest = scrollY === window.lastScroll ? (window.rest ?? 0) + 1 : 0;
            Object.assign(window, { rest, lastScroll: scrollY });
            return scrollY > 0 && rest > 20;
        });
        assert.equal(await zoom(), first);
        await page.evaluate(() => scrollTo(0, 0));
        await page.mouse.click(250, 350);
        await page.mouse.wheel(0, 120);
        await frame.waitForFunction(
            (first) => document.querySelector("olvane-tree").sight.zoom.toFixed(3) !== first,
            first,
        );
        const steps = await page.evaluate(() => history.length);
        await frame.click("#view-pedigree");
        await frame.click("#view-family");
        await frame.click("#view-pedigree");
        assert.equal(await page.evaluate(() => history.length), steps);
        await frame.click("#back");
        await frame.waitForFunction(() => document.querySelector("olvane-tree").state.view === "family");
        await frame.click("#forward");
        await frame.waitForFunction(() => document.querySelector("olvane-tree").state.view === "pedigree");
        await context.close();
    });

    test("the first hint on a phone lies over nothing, and goes with the first step", async () => {
        const visit = await visitFamily(sample("darwin-wedgwood.ged"), {}, kPhone, "#person=I1");
        const areas = await visit.page.evaluate(() => {
            const area = (part) => {
                const { top, bottom } = one(part).getBoundingClientRect();
                return [top, bottom];
            };
            return { hint: area("#first-hint"), bar: area(".bar"), tree: area("#tree") };
        });
        assert.ok(areas.bar[1] <= areas.hint[0] && areas.hint[1] <= areas.tree[0], JSON.stringify(areas));
        await photograph(visit, "hint-phone");
        await visit.page.evaluate(() => document.querySelector("olvane-tree").focusOn(5));
        await visit.page.waitForSelector("#first-hint", { state: "detached" });
        await visit.end();
    });

    test("a notice of a link that leads to nobody goes when a good link comes", async () => {
        const visit = await visitDarwins("#person=NOBODY");
        await visit.page.waitForSelector("#notices .failed");
        await visit.follow("#person=I5");
        await visit.page.waitForSelector("#notices .failed", { state: "detached" });
        assert.equal(await visit.focus(), "I5");
        await visit.end();
    });
});
