// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A window on the page, and what a person does in it.

import assert from "node:assert/strict";
import { becomes } from "./patience.mjs";

const kShortLived = 5000; // ms; what goes away by itself after this or more

/** In the page: what a selector finds in it and in the viewer's own tree, and what has the keys in either. */
function lookInside() {
    const viewer = () => document.querySelector("olvane-tree")?.shadowRoot;
    window.one = (selector) => document.querySelector(selector) ?? viewer()?.querySelector(selector) ?? null;
    window.all = (selector) => [document, viewer()].flatMap((tree) => [...(tree?.querySelectorAll(selector) ?? [])]);
    window.under = (x, y) => {
        const outer = document.elementFromPoint(x, y);
        return outer?.shadowRoot?.elementFromPoint(x, y) ?? outer;
    };
    window.holder = () => document.activeElement?.shadowRoot?.activeElement ?? document.activeElement;
}

/** In the page: how many clicks and steps of its history have come, and messages that stay until a slow test has read them. */
function countEvents(shortLived) {
    window.counts = { click: 0, popstate: 0 };
    for (const kind of Object.keys(window.counts)) addEventListener(kind, () => ++window.counts[kind], true);
    const later = window.setTimeout.bind(window);
    window.setTimeout = (run, time = 0, ...parts) => later(run, time >= shortLived ? 1000 * time : time, ...parts);
}

export class Visit {
    /** Addresses that the page asked for, but for the page itself. */
    requests = [];
    /** Errors of scripts, refusals by the security policy, and dialogs. */
    troubles = [];

    static async begin(context, address) {
        const visit = new Visit();
        visit.context = context;
        visit.page = await context.newPage();
        await visit.page.addInitScript(lookInside);
        await visit.page.addInitScript(countEvents, kShortLived);
        visit.watch(address);
        await visit.page.goto(address);
        await visit.untilStarted();
        return visit;
    }

    /** Until the page is ready for whatever is done with it. */
    async untilStarted() {
        await this.page.waitForSelector("#welcome, #tree:visible, #map canvas, .fatal");
    }

    async reload() {
        await this.page.reload();
        await this.untilStarted();
    }

    /** Every test ends with this: whatever was done, nothing was fetched and nothing broke. */
    async end() {
        await this.context.close();
        assert.deepEqual(this.requests, [], "requests");
        assert.deepEqual(this.troubles, [], "troubles");
    }

    watch(address) {
        const { page, requests, troubles } = this;
        const own = address.replace(/#.*/, "");
        page.on("request", (request) => {
            const url = request.url().replace(/#.*/, "");
            if (url !== own && !url.startsWith("blob:")) requests.push(url.slice(0, 200));
        });
        page.on("websocket", (socket) => requests.push(socket.url()));
        page.on("pageerror", (error) => troubles.push(String(error)));
        page.on("console", (message) => {
            if (message.type() === "error") troubles.push(message.text());
        });
        page.on("dialog", (dialog) => {
            troubles.push("dialog: " + dialog.message());
            void dialog.dismiss();
        });
    }

    async untilFamily() {
        await this.page.waitForSelector("#tree .box.focus");
        await this.still();
    }

    /** Until nothing in the picture has moved or changed its words for a while, and all of them are known. */
    async still() {
        await this.page.evaluate(async () => {
            const look = () => {
                const boxes = [...all("#tree .boxes > g")];
                const ghosts = one("#tree .ghosts")?.childElementCount ?? 0;
                const words = boxes.reduce(
                    (n, box) => n + box.querySelector(".frame").getAttribute("aria-label").length,
                    0,
                );
                const places = boxes.map((box) => box.getAttribute("transform")).join();
                return [one("#tree .world")?.getAttribute("transform"), ghosts, words, places].join("|");
            };
            const areWordsKnown = () =>
                document.querySelector("olvane-tree")?.viewer?.shown.contents?.kinshipKnown ?? true;
            let last = look();
            let since = performance.now();
            for (let frames = 0; frames < 4 || performance.now() - since < 80;) {
                await new Promise((next) => requestAnimationFrame(next));
                const now = look();
                ++frames;
                if (now === last && areWordsKnown()) continue;
                last = now;
                frames = 0;
                since = performance.now();
            }
        });
    }

    /** Closes the short messages that went well, and the greeting. */
    async dismiss() {
        await this.page.$$eval("#notices .message button", (buttons) => buttons.forEach((button) => button.click()));
    }

    /** Hands a file over as the browser's own dialog does. */
    async choose(name, bytes) {
        await this.page.setInputFiles("#file-input", {
            name,
            mimeType: "application/octet-stream",
            buffer: Buffer.from(bytes),
        });
    }

    /** Drags a file over the page and lets it fall. */
    async drop(name, bytes) {
        await this.dropAll([[name, bytes]]);
    }

    async dropAll(files) {
        const data = await this.page.evaluateHandle(
            (files) => {
                const transfer = new DataTransfer();
                for (const [name, base64] of files) {
                    const bytes = Uint8Array.from(atob(base64), (letter) => letter.charCodeAt(0));
                    transfer.items.add(new File([bytes], name));
                }
                return transfer;
            },
            files.map(([name, bytes]) => [name, Buffer.from(bytes).toString("base64")]),
        );
        await this.page.dispatchEvent("body", "dragover", { dataTransfer: data });
        await this.page.dispatchEvent("body", "drop", { dataTransfer: data });
    }

    box(xref) {
        return this.page.locator(`#tree [data-xref="${xref}"]`).first();
    }

    /** What of a box takes the keys and is read out. */
    handle(xref) {
        return this.box(xref).locator(".frame");
    }

    /** Makes a person in sight the focus, as a double click does. */
    async open(xref) {
        await this.box(xref).dblclick();
        await this.still();
    }

    /** Gives the keys to a box, in sight or not. */
    async stand(xref) {
        await this.page.evaluate((xref) => one(`#tree .boxes > [data-xref="${xref}"] .frame`).focus(), xref);
        await this.still();
    }

    /** Labels of all boxes that have elements. */
    async labels() {
        return this.page.$$eval("#tree .boxes .frame", (boxes) =>
            boxes.map((box) => box.getAttribute("aria-label")).sort(),
        );
    }

    /** Records of the persons whose boxes have elements, sorted, each once. */
    async shown() {
        const xrefs = await this.page.$$eval("#tree .boxes > [data-xref]", (boxes) =>
            boxes.map((box) => box.getAttribute("data-xref")),
        );
        return [...new Set(xrefs)].sort();
    }

    async shows(xref) {
        return (await this.box(xref).count()) > 0;
    }

    /** The record of the focus. */
    async focus() {
        return this.page.locator("#tree .box.focus").getAttribute("data-xref");
    }

    async label(xref) {
        return this.handle(xref).getAttribute("aria-label");
    }

    /** The record of the box that has the keys; null if none has. */
    async keysOn() {
        return this.page.evaluate(() => holder()?.closest("[data-box]")?.getAttribute("data-xref") ?? null);
    }

    /** With everything in sight. */
    async fit() {
        await this.page.evaluate(() => one("#fit").click());
        await this.still();
    }

    /** Upper left corners of all boxes, relative to the focus's, by record. Unknown parents go by their label. */
    async places() {
        return this.page.evaluate(() => {
            const placeOf = (box) =>
                /translate\(([-\d.]+) ([-\d.]+)\)/.exec(box.getAttribute("transform")).slice(1).map(Number);
            const boxes = [...all("#tree .boxes > g")];
            const [x0, y0] = placeOf(one("#tree .box.focus"));
            const named = boxes.map((box) => {
                const [x, y] = placeOf(box);
                const name = box.getAttribute("data-xref") ?? box.querySelector(".frame").getAttribute("aria-label");
                return `${name} ${(x - x0).toFixed(0)},${(y - y0).toFixed(0)}`;
            });
            return named.sort();
        });
    }

    async middleOf(xref) {
        return this.page.evaluate((xref) => {
            const frame = one(`#tree .boxes > [data-xref="${xref}"] .frame`);
            const { left, right, top, bottom } = frame.getBoundingClientRect();
            return { x: (left + right) / 2, y: (top + bottom) / 2 };
        }, xref);
    }

    /** Zoom and offset of the picture. */
    async placing() {
        const text = await this.page.locator("#tree .world").getAttribute("transform");
        const [x, y, k] = text.match(/-?[\d.]+/g).map(Number);
        return { x, y, k };
    }

    /** Whether the picture stands where it stood; places are written in hundredths of a pixel, whose last digit may round. */
    async assertPlacedAs(before) {
        const now = await this.placing();
        for (const part of ["x", "y", "k"]) {
            assert.ok(Math.abs(now[part] - before[part]) < 0.011, `${part}: ${before[part]} became ${now[part]}`);
        }
    }

    /** Through the search, as a person would. */
    async goTo(text) {
        await this.page.fill("#search", text);
        await this.page.press("#search", "Enter");
        await this.still();
    }

    async hash() {
        return this.page.evaluate(() => location.hash);
    }

    async click(selector) {
        await this.page.click(selector);
        await this.still();
    }

    /** Does something, and waits until the page has had the event that it brings later: a click or a step of the history. */
    async until(kind, act) {
        const before = await this.page.evaluate((kind) => counts[kind], kind);
        await act();
        await this.page.waitForFunction(([kind, before]) => counts[kind] > before, [kind, before]);
        await this.still();
    }

    /** The browser makes a click of a tap when the finger has long gone. */
    async tap(selector) {
        await this.until("click", () => this.page.tap(selector));
    }

    async tapAt({ x, y }) {
        await this.until("click", () => this.page.touchscreen.tap(x, y));
    }

    /** A step in the browser's history, by whatever leads there. */
    async step(act) {
        await this.until("popstate", act);
    }

    /** Through a link to another place in the page. */
    async follow(hash) {
        await this.step(() => this.page.evaluate((hash) => (location.hash = hash), hash));
    }

    /** Turns the wheel over the picture, and waits until that has zoomed. */
    async wheel(dy) {
        const { k } = await this.placing();
        await this.page.mouse.wheel(0, dy);
        await becomes(async () => (await this.placing()).k !== k, true);
        await this.still();
    }

    /** The page has the window's new size. */
    async resize(size) {
        await this.page.setViewportSize(size);
        await this.page.waitForFunction(({ width, height }) => innerWidth === width && innerHeight === height, size);
        await this.still();
    }

    async untilVisible(selector, isVisible) {
        await this.page.waitForSelector(selector, { state: isVisible ? "visible" : "hidden" });
    }

    /** The id of what has the keys. */
    async untilKeysOn(id) {
        await becomes(() => this.page.evaluate(() => holder().id), id);
    }

    async press(key) {
        await this.page.keyboard.press(key);
        await this.still();
    }
}
