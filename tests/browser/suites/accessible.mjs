// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

import assert from "node:assert/strict";
import { describe } from "node:test";
import axe from "axe-core";
import { kTwoAtOnce, visitDarwins, visitEmpty, visitFamily } from "../support/browser.mjs";
import { brokenFamily } from "../support/families.mjs";
import { test } from "../support/reported.mjs";

async function expectNoViolation(visit, state) {
    await visit.page.evaluate(axe.source);
    const found = await visit.page.evaluate(async () => {
        const { violations } = await window.axe.run(document, { resultTypes: ["violations"] });
        return violations.map(
            ({ id, help, nodes }) =>
                `${id}: ${help}: ${nodes
                    .slice(0, 3)
                    .map((node) => node.html.slice(0, 160))
                    .join(" | ")}`,
        );
    });
    assert.deepEqual(found, [], state);
}

describe("accessible", kTwoAtOnce, () => {
    test("axe finds nothing on the title page", async () => {
        for (const colorScheme of ["light", "dark"]) {
            const visit = await visitEmpty({ colorScheme });
            await expectNoViolation(visit, colorScheme);
            await visit.end();
        }
    });

    for (const [state, settings] of [
        ["light", {}],
        ["dark", { colorScheme: "dark" }],
        ["high contrast", { contrast: "more" }],
        ["a phone", { viewport: { width: 360, height: 740 }, hasTouch: true, isMobile: true }],
    ]) {
        test(`axe finds nothing in either view: ${state}`, async () => {
            const visit = await visitDarwins("#person=I1", settings);
            await expectNoViolation(visit, "family");
            await visit.click("#view-pedigree");
            await expectNoViolation(visit, "pedigree");
            await visit.end();
        });
    }

    const kViews = ["near", "ancestors", "descendants", "hourglass", "relatives", "fan", "kinship&to=I12", "everybody"];
    for (const [state, settings, views] of [
        ["on a desktop", {}, kViews],
        [
            "on a phone of 320 px",
            { viewport: { width: 320, height: 640 }, hasTouch: true, isMobile: true },
            ["fan", "kinship&to=I12", "everybody"],
        ],
        ["with forced colours", { forcedColors: "active" }, ["descendants", "fan"]],
    ]) {
        test(`axe finds nothing in charts, and none scrolls sideways: ${state}`, async () => {
            for (const view of views) {
                const visit = await visitDarwins(`#person=I1&view=${view}`, settings);
                await expectNoViolation(visit, view);
                const over = await visit.page.evaluate(() => document.documentElement.scrollWidth - innerWidth);
                assert.ok(over <= 0, `${view}: ${over} px`);
                await visit.end();
            }
        });
    }

    test("from right to left, names, years and dates of the panel begin where all else does", async () => {
        const visit = await visitDarwins();
        await visit.page.evaluate(() => (document.documentElement.dir = "rtl"));
        await visit.still();
        const gaps = await visit.page.evaluate(() => {
            const rightOf = (part) => {
                const range = document.createRange();
                range.selectNodeContents(part);
                return range.getBoundingClientRect().right;
            };
            const name = rightOf(one("#side-panel h2"));
            const header = rightOf(one("#side-panel header .years"));
            const relatives = [...all("#side-panel .relative")].map(
                (one) => rightOf(one.querySelector(".name")) - rightOf(one.querySelector(".years")),
            );
            const dates = [...all("#side-panel dd")].map((one) => {
                const date = one.querySelector(".date");
                return date ? one.getBoundingClientRect().right - rightOf(date) : 0;
            });
            return [name - header, ...relatives, ...dates];
        });
        assert.ok(gaps.length > 5, String(gaps));
        for (const gap of gaps) assert.ok(Math.abs(gap) < 2, String(gaps));
        await visit.end();
    });

    test("with text of twice the size nothing is cut off or lies outside the window", async () => {
        const visit = await visitDarwins("#person=I1", { viewport: { width: 1280, height: 900 } });
        const sizes = () =>
            visit.page.evaluate(() =>
                [".bar h1", "#search", "#side-panel h2", "#side-panel dt", "#legend summary", "#view-family span"].map(
                    (part) => parseFloat(getComputedStyle(one(part)).fontSize),
                ),
            );
        const usual = await sizes();
        await visit.page.evaluate(() => (document.documentElement.style.fontSize = "200%"));
        await visit.still();
        assert.deepEqual(
            await sizes(),
            usual.map((size) => 2 * size),
        );
        const outside = await visit.page.evaluate(() =>
            [...all(".bar button, .bar input, .zoom button, #side-panel h2")]
                .filter((part) => part.offsetParent !== null)
                .map((part) => [part.id || part.tagName, part.getBoundingClientRect()])
                .filter(([, area]) => area.right > innerWidth + 1 || area.left < -1)
                .map(([name]) => name),
        );
        assert.deepEqual(outside, []);
        await visit.end();
    });

    test("axe finds nothing while panels, lists and dialogs are open", async () => {
        const visit = await visitDarwins();
        const { page } = visit;
        await visit.click("#options-button");
        await expectNoViolation(visit, "options");
        await page.keyboard.press("Escape");
        await visit.click("#file-button");
        await expectNoViolation(visit, "file menu");
        await page.click("#keys-button");
        await expectNoViolation(visit, "keys");
        await page.keyboard.press("Escape");
        await page.click("#file-button");
        await page.click("#print-sheets");
        await page.waitForSelector(".sheet-preview img");
        await expectNoViolation(visit, "choice of paper");
        await page.keyboard.press("Escape");
        await page.click("#legend summary");
        await page.fill("#search", "darwin");
        await expectNoViolation(visit, "search and legend");
        await visit.end();
        const broken = await visitFamily(brokenFamily());
        await broken.page.click("#diagnostics-button");
        await expectNoViolation(broken, "diagnostics");
        await broken.end();
    });

    test("the tabulator reaches everything, and back again", async () => {
        const visit = await visitDarwins();
        const { page } = visit;
        const reached = new Set();
        for (let i = 0; i < 60; ++i) {
            await page.keyboard.press("Tab");
            const at = await page.evaluate(() => {
                const element = holder();
                return element.id || element.closest("[data-xref]")?.getAttribute("data-xref") || element.tagName;
            });
            reached.add(at);
        }
        for (const id of [
            "search",
            "view-family",
            "view-pedigree",
            "options-button",
            "file-button",
            "panel-button",
            "zoom-in",
            "fit",
            "I1",
        ]) {
            assert.ok(reached.has(id), `${id} among ${[...reached].join(" ")}`);
        }
        await visit.end();
    });

    test("what has the keys can be seen to have them", async () => {
        const visit = await visitDarwins();
        const { page } = visit;
        await page.keyboard.press("Tab");
        await page.keyboard.press("Tab");
        const outline = await page.evaluate(() => {
            const { outlineStyle, outlineWidth, boxShadow } = getComputedStyle(holder());
            return { outline: outlineStyle !== "none" && parseFloat(outlineWidth) > 0, shadow: boxShadow !== "none" };
        });
        assert.ok(outline.outline || outline.shadow);
        const ring = (xref) =>
            page.evaluate((xref) => {
                const { stroke, opacity, display, visibility } = getComputedStyle(
                    one(`#tree [data-xref="${xref}"] .ring`),
                );
                return [stroke, opacity, display, visibility].join();
            }, xref);
        await visit.stand("I1");
        const before = await ring("I12");
        await visit.press("ArrowUp");
        const at = await visit.keysOn();
        assert.notEqual(await ring(at), before === (await ring(at)) ? before : "", `the box of ${at} shows it`);
        await visit.end();
    });

    test("a change of the focus is announced", async () => {
        const visit = await visitDarwins();
        await visit.open("I12");
        const live = visit.page.locator("#live");
        assert.equal(await live.getAttribute("aria-live"), "polite");
        assert.match(await live.innerText(), /Robert Waring Darwin.*\d+ boxes/);
        await visit.end();
    });
});
