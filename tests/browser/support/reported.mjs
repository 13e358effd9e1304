// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Tests of node's runner whose failure says what was to be seen: each page's address and notices, what it wrote to its
// console, and where a picture of it lies.

import { AsyncLocalStorage } from "node:async_hooks";
import { mkdirSync } from "node:fs";
import { resolve } from "node:path";
import { test as plainTest } from "node:test";

const kMostTime = 900_000; // ms; a test that takes longer hangs
const kMostReporting = 20_000; // ms for each page
const kMostLines = 20; // of a console
const running = new AsyncLocalStorage();
let failures = 0;

export function test(title, ...rest) {
    const run = rest.pop();
    return plainTest(title, ...rest, (context) => running.run([], () => reported(title, () => run(context))));
}

/** Where the test that opens a browser's context fails, its pages are in the report. */
export function reportOn(context) {
    const lines = [];
    context.on("console", (message) => lines.push(`${message.type()}: ${message.text()}`));
    context.on("weberror", (error) => lines.push(`error: ${error.error()}`));
    running.getStore()?.push({ context, lines });
}

async function reported(title, run) {
    let timer = 0;
    const tooLong = new Promise((_, fail) => {
        timer = setTimeout(() => fail(new Error(`not done after ${kMostTime / 1000} s`)), kMostTime);
    });
    try {
        await Promise.race([run(), tooLong]);
    } catch (error) {
        if (error instanceof Error) await add(error, title);
        throw error;
    } finally {
        clearTimeout(timer);
        // What a failed test leaves open would slow down all others.
        await Promise.all(running.getStore().map(({ context }) => context.close().catch(() => {})));
    }
}

async function add(error, title) {
    const report = [""];
    for (const { context, lines } of running.getStore()) {
        for (const page of context.pages()) report.push(...(await reportOf(page, title)));
        if (lines.length > 0) report.push("Console:", ...lines.slice(-kMostLines).map((line) => "    " + line));
    }
    const text = report.join("\n");
    const stack = error.stack ?? "";
    error.message += text;
    error.stack = stack + text;
}

async function reportOf(page, title) {
    const name = title.replace(/[^\p{L}\d]+/gu, "-").slice(0, 80);
    const path = resolve("failures", `${++failures}-${name}.png`);
    mkdirSync("failures", { recursive: true });
    const late = new Promise((done) => setTimeout(() => done("nothing: it does not answer"), kMostReporting).unref());
    const seen = page.evaluate(() => {
        const tree = document.querySelector("olvane-tree");
        const { view, focus } = tree?.state ?? {};
        const outer = document.activeElement;
        const holder = outer?.shadowRoot?.activeElement ?? outer;
        return JSON.stringify({
            title: document.title,
            window: [innerWidth, innerHeight],
            notices: [...document.querySelectorAll(".notice, .fatal")].map((notice) => notice.textContent),
            dialogs: [...document.querySelectorAll("dialog[open]")].map((dialog) => dialog.id),
            tree: tree && !tree.hidden && { view, focus, boxes: tree.shadowRoot?.querySelectorAll(".box").length },
            keys: holder?.id || holder?.getAttribute("aria-label") || holder?.tagName,
        });
    });
    const picture = page.screenshot({ path, timeout: kMostReporting }).then(
        () => `Picture: ${path}`,
        () => "Picture: none could be taken",
    );
    const state = await Promise.race([seen.catch((error) => `nothing: ${error.message}`), late]);
    return [`Page: ${page.url().slice(0, 200)}`, `Seen: ${state}`, await picture];
}
