// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A large file is read beside the page: with its progress, without holding the page up, and until somebody ends it.

import assert from "node:assert/strict";
import { describe, test } from "node:test";
import { fileFor, photograph, visitEmpty } from "../support/browser.mjs";
import { lineOf } from "../support/families.mjs";

const kFile = fileFor("long.ged", lineOf(60_000));

describe("large", () => {
    test("a large file is read in a worker: progress is shown and the page goes on", async () => {
        const visit = await visitEmpty();
        await visit.page.evaluate(() => {
            window.seen = [];
            setInterval(() => {
                const bar = document.querySelector("#reading:not([hidden]) progress");
                if (bar?.hasAttribute("value")) window.seen.push(bar.value);
            }, 10);
        });
        await visit.page.setInputFiles("#file-input", kFile);
        await visit.page.waitForSelector("#reading:not([hidden])");
        await photograph(visit, "reading");
        await visit.untilFamily();
        await visit.page.waitForSelector("#reading", { state: "hidden" });
        const seen = await visit.page.evaluate(() => window.seen);
        // A page that is held up looks at nothing meanwhile.
        assert.ok(
            seen.length > 0 && seen.every((part, i) => part > 0 && part <= 1 && (i === 0 || part >= seen[i - 1])),
            seen.join(),
        );
        assert.equal(await visit.page.locator(".bar .title span").innerText(), "60,000 persons");
        await visit.goTo("Given500 Line");
        assert.equal(await visit.focus(), "I500");
        await visit.end();
    });

    test("reading is ended by a button, and the page is as before", async () => {
        const visit = await visitEmpty();
        await visit.page.setInputFiles("#file-input", kFile);
        await visit.page.click("#reading-cancel");
        await visit.page.waitForSelector("#reading", { state: "hidden" });
        await visit.page.waitForTimeout(300);
        assert.ok(await visit.page.isVisible("#welcome"));
        assert.equal(await visit.page.locator("#notices .notice").count(), 0);
        await visit.drop("small.ged", "0 HEAD\n0 @A@ INDI\n1 NAME Ada /Only/\n0 TRLR\n");
        await visit.untilFamily();
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
