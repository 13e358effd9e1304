// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

import assert from "node:assert/strict";
import { describe } from "node:test";
import { kTwoAtOnce, photograph, visitDarwins, visitEmpty, visitFamily } from "../support/browser.mjs";
import { brokenFamily, rightToLeftFamily } from "../support/families.mjs";
import { becomes } from "../support/patience.mjs";
import { test } from "../support/reported.mjs";

const kPhone = { viewport: { width: 360, height: 740 }, hasTouch: true, isMobile: true, deviceScaleFactor: 2 };

// Nothing that can be used lies outside of the window or under something else.
async function unreachable(visit) {
    return visit.page.evaluate(() => {
        const bad = [];
        for (const part of all(".bar button, .bar input, .zoom button, #legend summary")) {
            const { left, right, top, bottom, width } = part.getBoundingClientRect();
            if (width === 0 || part.closest("[hidden]")) continue;
            const over = under((left + right) / 2, (top + bottom) / 2);
            const isOutside = left < 0 || top < 0 || right > innerWidth || bottom > innerHeight;
            if (isOutside || (over !== part && !part.contains(over))) bad.push(part.id || part.outerHTML.slice(0, 80));
        }
        return bad;
    });
}

describe("looks", kTwoAtOnce, () => {
    test("on a window of a desk, everything can be reached", async () => {
        const visit = await visitDarwins();
        assert.deepEqual(await unreachable(visit), []);
        await photograph(visit, "family");
        await visit.end();
    });

    test("on a phone that lies down the legend fits, and can be closed again", async () => {
        const visit = await visitDarwins("#person=I1", { ...kPhone, viewport: { width: 640, height: 360 } });
        await visit.dismiss();
        assert.deepEqual(await unreachable(visit), []);
        await visit.tap("#legend summary");
        await visit.untilVisible("#legend ul", true);
        assert.deepEqual(await unreachable(visit), []);
        await visit.tap("#legend summary");
        await visit.untilVisible("#legend ul", false);
        await visit.tap("#legend summary");
        await visit.page.focus("#legend ul");
        await visit.press("Escape");
        await visit.untilVisible("#legend ul", false);
        assert.equal(await visit.page.evaluate(() => holder().tagName), "SUMMARY");
        await visit.end();
    });

    test("a file to be dropped is asked for only where one can be dropped", async () => {
        for (const [settings, asked] of [
            [{}, true],
            [kPhone, false],
        ]) {
            const visit = await visitEmpty(settings);
            assert.equal(await visit.page.isVisible("#drop-zone .drop"), asked);
            assert.ok(await visit.page.isVisible("#choose-file"));
            await visit.end();
        }
    });

    test("in the system's own colours, what is on differs from what is off", async () => {
        for (const colorScheme of ["light", "dark"]) {
            const visit = await visitDarwins("#person=I1&hide=cousins", { forcedColors: "active", colorScheme });
            const { page } = visit;
            const fill = (selector) =>
                page.evaluate((wanted) => getComputedStyle(one(wanted)).backgroundColor, selector);
            assert.notEqual(await fill("#view-family"), await fill("#view-pedigree"));
            await page.click("#options-button");
            assert.notEqual(await fill("#show-siblings"), await fill("#show-cousins"));
            await page.fill("#search", "emma");
            assert.notEqual(await fill("#found-0"), await fill("#found-1"));
            const [text, paper] = await page.evaluate(() => {
                const styleOf = (selector) => getComputedStyle(one(selector));
                const canvas = document.createElement("div");
                canvas.style.cssText = "color: CanvasText; background: Canvas";
                document.body.append(canvas);
                const { color, backgroundColor } = getComputedStyle(canvas);
                return [styleOf("#tree .name").fill === color, styleOf("#tree").backgroundColor === backgroundColor];
            });
            assert.ok(text && paper, "the picture is drawn in them, too");
            await page.keyboard.press("Escape");
            await page.click("#views-button");
            assert.notEqual(await fill("#choose-family"), await fill("#choose-fan"));
            await visit.end();
        }
    });

    // The colour at a place of a canvas, and what the system's colour of that name is.
    const systemColour = (page, name) =>
        page.evaluate((name) => {
            const probe = document.createElement("div");
            probe.style.cssText = `forced-color-adjust: none; color: ${name}`;
            document.body.append(probe);
            return getComputedStyle(probe).color;
        }, name);

    test("a fan and the map are drawn in the system's own colours, dark or light", async () => {
        for (const colorScheme of ["light", "dark"]) {
            const visit = await visitDarwins("#person=I1&view=fan", { forcedColors: "active", colorScheme });
            const { page } = visit;
            const [canvas, text] = [await systemColour(page, "Canvas"), await systemColour(page, "CanvasText")];
            const cell = await page.evaluate(() => {
                const cells = all("#tree .box[class*=descent-]");
                const styles = cells.map((one) => [one.querySelector(".frame"), one.querySelector("text")]);
                return [
                    ...new Set(
                        styles.map(([frame, text]) => [frame, text].map((one) => getComputedStyle(one).fill).join()),
                    ),
                ];
            });
            assert.deepEqual(cell, [`${canvas},${text}`]);
            await page.click("#views-button");
            await page.click("#choose-map");
            await page.waitForSelector("#map canvas");
            const corner = () =>
                page.evaluate(() => {
                    const { data } = one("#map canvas").getContext("2d").getImageData(2, 2, 1, 1);
                    return `rgb(${data[0]}, ${data[1]}, ${data[2]})`;
                });
            await becomes(corner, canvas);
            await visit.end();
        }
    });

    test("the selected box is marked, however it was selected, in a fan above the cells beside it", async () => {
        for (const [view, father] of [
            ["family", "I12"],
            ["fan", "I12"],
        ]) {
            const visit = await visitDarwins(`#person=I1&view=${view}`);
            const ringOf = (xref) =>
                visit.page.evaluate((xref) => {
                    const box = one(`#tree [data-xref="${xref}"]`);
                    const ring = box.querySelector(".ring");
                    const isAbove = box.querySelector(".frame").compareDocumentPosition(ring) === 4;
                    return [getComputedStyle(ring).stroke, isAbove];
                }, xref);
            assert.equal((await ringOf(father))[0], "none");
            const { x, y } = await visit.middleOf(father);
            await visit.page.mouse.click(x, y);
            await visit.still();
            const [stroke, isAbove] = await ringOf(father);
            assert.notEqual(stroke, "none");
            assert.equal(isAbove, view === "fan");
            assert.equal(await visit.focus(), "I1");
            await photograph(visit, `selected-${view}`);
            await visit.end();
        }
    });

    test("on the narrowest phone the bar has two rows, and a long name leaves room for the years", async () => {
        const long = brokenFamily()
            .replace("Ada", "Ada Augusta Wilhelmina Theodora Philippa")
            .replace("7 DATE far too deep", "1 BIRT\n2 DATE 1815");
        const settings = { ...kPhone, viewport: { width: 320, height: 568 } };
        const visit = await visitFamily(long, { name: "long.ged", focus: "1" }, settings);
        await visit.page.waitForSelector("#diagnostics-button", { state: "visible" });
        const boxOf = (selector) => visit.page.locator(selector).boundingBox();
        assert.ok((await boxOf(".bar")).height < 120);
        const years = await boxOf("#side-panel header .years");
        assert.ok(years.height > 0 && years.y + years.height <= 568);
        await visit.end();
    });

    test("on the narrowest phone every view can be read and chosen, in every language", async () => {
        for (const locale of ["en-GB", "de-DE", "es-ES"]) {
            const visit = await visitDarwins("#person=I1", {
                ...kPhone,
                viewport: { width: 320, height: 568 },
                locale,
            });
            await visit.tap("#views-button");
            const outside = await visit.page.evaluate(() => {
                const panel = one("#views-panel").getBoundingClientRect();
                const parts = all("#views-panel .view, #views-panel .view span");
                return parts
                    .filter((part) => {
                        const { left, right } = part.getBoundingClientRect();
                        return left < panel.left || right > panel.right - 8 || part.scrollWidth > part.clientWidth + 1;
                    })
                    .map((part) => part.textContent);
            });
            assert.deepEqual(outside, [], locale);
            await photograph(visit, `narrow-views-${locale}`);
            await visit.end();
        }
    });

    test("on a phone everything can be reached, and the panel is a sheet", async () => {
        const visit = await visitDarwins("#person=I1", kPhone);
        const { page } = visit;
        assert.equal(await page.evaluate(() => document.documentElement.scrollWidth), 360);
        await visit.dismiss();
        assert.deepEqual(await unreachable(visit), []);
        await photograph(visit, "phone");
        const sheet = () => page.locator("#side-panel .panel-body").boundingBox();
        const down = await sheet();
        assert.ok(down.y > 500, "most of the window is the picture's");
        await visit.tap("#side-panel .handle");
        const up = await sheet();
        assert.ok(up.y < down.y - 100);
        await photograph(visit, "phone-panel");
        await visit.tap("#side-panel .handle");
        const father = await visit.middleOf("I12");
        await visit.tapAt(father);
        assert.equal(await visit.focus(), "I1", "a tap selects");
        assert.equal(await page.innerText("#side-panel h2"), "Robert Waring Darwin");
        await visit.tap("#side-panel .handle");
        await visit.tap("#make-focus");
        assert.equal(await visit.focus(), "I12");
        await visit.end();
    });

    test("the title page fits a phone", async () => {
        const visit = await visitEmpty(kPhone);
        await photograph(visit, "phone-title");
        const { x, y, width, height } = await visit.page.locator("#choose-file").boundingBox();
        assert.ok(x >= 0 && x + width <= 360 && y + height <= 740);
        await visit.end();
    });

    test("themes follow the system or the choice, which is remembered", async () => {
        const visit = await visitDarwins("#person=I1", { colorScheme: "dark" });
        const { page } = visit;
        const hasColours = (theme) =>
            page.waitForFunction((theme) => document.documentElement.dataset.theme === theme, theme);
        const paper = () =>
            page.evaluate(
                () => getComputedStyle(one("#tree")).backgroundColor + getComputedStyle(document.body).backgroundColor,
            );
        await hasColours("dark");
        await visit.stand("I2");
        await photograph(visit, "dark");
        const dark = await paper();
        await page.emulateMedia({ colorScheme: "light" });
        await hasColours("light");
        const light = await paper();
        assert.notEqual(light, dark);
        await visit.click("#options-button");
        await page.selectOption("#theme", "contrast");
        await hasColours("contrast");
        await page.keyboard.press("Escape");
        await photograph(visit, "contrast");
        await visit.reload();
        await visit.untilFamily();
        await hasColours("contrast");
        await visit.end();
    });

    test("German is chosen by the browser's language, or by hand", async () => {
        const visit = await visitDarwins("#person=I1", { locale: "de-AT" });
        const { page } = visit;
        assert.equal(await page.evaluate(() => document.documentElement.lang), "de");
        assert.match(await page.innerText("#side-panel"), /Geburt\s+12\. Feb\. 1809/);
        assert.match(await visit.label("I2"), /^Emma Wedgwood, 1808–1896, Ehefrau und Cousine ersten Grades/);
        assert.match(await visit.label("I5"), /Großvater väterlicherseits/);
        await photograph(visit, "german");
        await visit.click("#options-button");
        await page.selectOption("#language", "en");
        await visit.still();
        assert.equal(await page.evaluate(() => document.documentElement.lang), "en");
        assert.match(await visit.label("I2"), /wife and first cousin/);
        assert.equal(await visit.focus(), "I1", "the picture stays");
        await visit.end();
    });

    test("names from right to left are laid out so", async () => {
        const visit = await visitFamily(rightToLeftFamily(), {}, {}, "#person=I2");
        const { page } = visit;
        const directions = await page.$$eval('#tree [data-xref="I2"] .name', (lines) =>
            lines.map((line) => line.getAttribute("direction")),
        );
        assert.ok(directions.length > 0 && directions.every((direction) => direction === "rtl"));
        assert.ok((await page.locator('#tree [data-xref="I4"] .name[direction=rtl]').count()) === 0);
        const panel = await page.evaluate(() => getComputedStyle(one("#side-panel h2")).direction);
        assert.equal(panel, "rtl");
        const inside = await page.evaluate(() =>
            [...all("#tree .box")].every((box) => {
                const frame = box.querySelector(".frame").getBoundingClientRect();
                return [...box.querySelectorAll("text.name, text.years")].every((line) => {
                    const { left, right } = line.getBoundingClientRect();
                    return left >= frame.left - 1 && right <= frame.right + 1;
                });
            }),
        );
        assert.ok(inside, "every line stays in its box");
        await photograph(visit, "right-to-left");
        await visit.click("#view-pedigree");
        await photograph(visit, "right-to-left-pedigree");
        await visit.end();
    });

    test("who wants no movement sees none", async () => {
        const visit = await visitDarwins("#person=I1", { reducedMotion: "reduce" });
        const middle = await visit.middleOf("I12");
        await visit.page.mouse.click(middle.x, middle.y);
        const at = await visit.placing();
        const places = await visit.places();
        await visit.still();
        await visit.assertPlacedAs(at);
        assert.deepEqual(await visit.places(), places);
        const running = await visit.page.evaluate(
            () => document.getAnimations().filter((one) => one.playState === "running").length,
        );
        assert.equal(running, 0);
        await visit.end();
    });
});
