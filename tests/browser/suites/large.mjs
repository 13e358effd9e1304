// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A large file is read beside the page: with its progress, without holding the page up, and until somebody ends it.

import assert from "node:assert/strict";
import { readFileSync } from "node:fs";
import { describe } from "node:test";
import { fileFor, visitEmpty } from "../support/browser.mjs";
import { lineOf } from "../support/families.mjs";
import { test } from "../support/reported.mjs";

const kSmall = "0 HEAD\n0 @A@ INDI\n1 NAME Ada /Only/\n0 TRLR\n";
const kFile = fileFor("long.ged", lineOf(60_000));

// Calls what make returns for a small file, in the page, each time that the progress of a file has changed.
async function whileReading(visit, make) {
    await visit.page.evaluate(`void (window.look = (${make})(${JSON.stringify(kSmall)}))`);
    await visit.page.evaluate(() => {
        new MutationObserver(() => {
            const bar = one("#reading:not([hidden]) progress");
            if (bar?.hasAttribute("value")) window.look(bar);
        }).observe(one("#reading"), { subtree: true, attributeFilter: ["value"] });
        window.titles = [];
        new MutationObserver(() => window.titles.push(document.title)).observe(document.head, {
            subtree: true,
            childList: true,
            characterData: true,
        });
    });
}

describe("large", () => {
    test("a large file is read in a worker: progress is shown and the page goes on", async () => {
        const visit = await visitEmpty();
        // Looked at each time that the page has done something: one that is held up does nothing until all is read.
        await whileReading(visit, () => {
            window.seen = [];
            return (bar) => void window.seen.push(bar.value);
        });
        await visit.page.setInputFiles("#file-input", kFile);
        await visit.untilFamily();
        await visit.page.waitForSelector("#reading", { state: "hidden" });
        const seen = await visit.page.evaluate(() => window.seen);
        assert.ok(
            seen.length > 2 && seen.every((part, i) => part > 0 && part <= 1 && (i === 0 || part >= seen[i - 1])),
            seen.join(),
        );
        assert.equal(await visit.page.locator(".bar .title span").innerText(), "60,000 persons");
        await visit.goTo("Given500 Line");
        assert.equal(await visit.focus(), "I500");
        await visit.end();
    });

    test("reading is ended by a button, and the page is as before", async () => {
        const visit = await visitEmpty();
        // In the middle, however quick the machine is.
        await whileReading(visit, () => () => one("#reading-cancel").click());
        await visit.page.setInputFiles("#file-input", kFile);
        await visit.page.waitForFunction(() => counts.click > 0);
        await visit.page.waitForSelector("#reading", { state: "hidden" });
        assert.ok(await visit.page.isVisible("#welcome"));
        assert.equal(await visit.page.locator("#notices .notice").count(), 0);
        await visit.drop("small.ged", kSmall);
        await visit.untilFamily();
        assert.equal(await visit.page.title(), "small");
        await visit.end();
    });

    test("a file that is dropped while another is read takes its place, and the other one comes no more", async () => {
        const visit = await visitEmpty();
        await whileReading(visit, (small) => {
            let isDropped = false;
            return () => {
                if (isDropped) return;
                isDropped = true;
                const dataTransfer = new DataTransfer();
                dataTransfer.items.add(new File([small], "small.ged"));
                document.body.dispatchEvent(new DragEvent("drop", { bubbles: true, cancelable: true, dataTransfer }));
            };
        });
        await visit.page.setInputFiles("#file-input", kFile);
        await visit.page.waitForFunction(() => document.title === "small");
        await visit.page.waitForSelector("#reading", { state: "hidden" });
        // By the time that as large a file has been read, the first one would have come.
        await visit.page.setInputFiles("#file-input", fileFor("later.ged", readFileSync(kFile)));
        await visit.page.waitForFunction(() => document.title === "later");
        assert.deepEqual(await visit.page.evaluate(() => titles), ["small", "later"]);
        await visit.end();
    });

    test("a large file that is none is refused in words", async () => {
        const visit = await visitEmpty();
        await visit.page.setInputFiles("#file-input", fileFor("none.ged", "no family here\n".repeat(200_000)));
        await visit.page.waitForSelector("#notices .failed");
        assert.match(await visit.page.innerText("#notices .failed"), /could not be read as a family file/);
        assert.ok(await visit.page.isVisible("#welcome"));
        await visit.end();
    });
});
