// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

import assert from "node:assert/strict";
import { readFileSync } from "node:fs";
import { describe, test } from "node:test";
import { kTwoAtOnce, visitDarwins } from "../support/browser.mjs";

async function save(visit, button) {
    await visit.click("#file-button");
    const [download] = await Promise.all([visit.page.waitForEvent("download"), visit.page.click(button)]);
    return { name: download.suggestedFilename(), bytes: readFileSync(await download.path()) };
}

// The browser's own parser judges the file; nothing of the page is there.
async function parsed(visit, text) {
    return visit.page.evaluate((text) => {
        const document = new DOMParser().parseFromString(text, "image/svg+xml");
        const error = document.querySelector("parsererror")?.textContent ?? null;
        const boxes = [...document.querySelectorAll("g[aria-label]")].map((box) => box.getAttribute("aria-label"));
        const texts = [...document.querySelectorAll("text")].map((line) => line.textContent);
        const attributes = [...document.querySelectorAll("*")].flatMap((element) => element.getAttributeNames());
        const size = ["width", "height"].map((name) => Number(document.documentElement.getAttribute(name)));
        const unseen = [...document.querySelectorAll("rect, path")].filter((shape) => !shape.hasAttribute("fill") && !shape.hasAttribute("stroke"));
        return { error, boxes, texts, attributes: [...new Set(attributes)], size, unseen: unseen.length };
    }, text);
}

describe("saving", kTwoAtOnce, () => {
    test("an SVG holds every box of the picture, in sight or not, and stands by itself", async () => {
        const visit = await visitDarwins();
        await visit.click("#fit");
        const labels = await visit.labels();
        for (let i = 0; i < 6; ++i) await visit.click("#zoom-in");
        const { name, bytes } = await save(visit, "#save-svg");
        assert.equal(name, "darwin-wedgwood - Charles Robert Darwin.svg");
        const file = await parsed(visit, bytes.toString("utf8"));
        assert.equal(file.error, null);
        assert.deepEqual(file.boxes.sort(), labels);
        assert.ok(file.texts.some((text) => /Darwin/.test(text)));
        assert.equal(file.unseen, 0);
        assert.ok(!file.attributes.some((attribute) => /^(on|class|style|href|tabindex|data-)/.test(attribute)), file.attributes.join());
        await visit.end();
    });

    test("a PNG has twice the size of the drawing", async () => {
        const visit = await visitDarwins("#person=I1&view=pedigree&generations=3");
        const { size } = await parsed(visit, (await save(visit, "#save-svg")).bytes.toString("utf8"));
        const { name, bytes } = await save(visit, "#save-png");
        assert.match(name, /\.png$/);
        assert.equal(bytes.subarray(1, 4).toString("latin1"), "PNG");
        assert.deepEqual([bytes.readUInt32BE(16), bytes.readUInt32BE(20)], size.map((side) => Math.floor(2 * side)));
        assert.ok(bytes.length > 10_000, "there is something in it");
        await visit.end();
    });

    test("the whole picture is printed on one sheet, in the colours of paper", async () => {
        const visit = await visitDarwins("#person=I1", { colorScheme: "dark" });
        const { page } = visit;
        const pdf = await page.pdf({ preferCSSPageSize: true });
        assert.equal((pdf.toString("latin1").match(/\/Type\s*\/Page\b/g) ?? []).length, 1);
        // What the browser is given to print.
        await page.emulateMedia({ media: "print" });
        const printed = await page.evaluate(() => {
            dispatchEvent(new Event("beforeprint"));
            const sheet = one("#print-sheet");
            const shown = [...all(".bar, .stage, #side-panel")].filter((part) => part.getClientRects().length > 0);
            const answer = {
                boxes: sheet.querySelectorAll("g[aria-label]").length,
                paper: sheet.querySelector("svg > rect").getAttribute("fill"),
                others: shown.length,
            };
            dispatchEvent(new Event("afterprint"));
            return { ...answer, left: sheet.childElementCount };
        });
        assert.ok(printed.boxes > 60, String(printed.boxes));
        assert.match(printed.paper, /^(rgb\(255, 255, 255\)|#fff(fff)?|white|none)$/);
        assert.equal(printed.others, 0);
        assert.equal(printed.left, 0);
        await visit.end();
    });
});
