// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A file is never taken for more than text, and the page can reach nothing.

import assert from "node:assert/strict";
import { readFileSync } from "node:fs";
import { describe } from "node:test";
import { kTwoAtOnce, visitEmpty, visitFamily } from "../support/browser.mjs";
import { hostileFamily } from "../support/families.mjs";
import { test } from "../support/reported.mjs";

const kHostile = hostileFamily();

describe("hostile", kTwoAtOnce, () => {
    test("markup, scripts and styles in a file are shown as text and do nothing", async () => {
        const visit = await visitEmpty();
        const { page } = visit;
        const elementsBefore = await page.$$eval(
            "script, style, link, iframe, object, img, base, form",
            (all) => all.length,
        );
        await visit.drop("<img src=x onerror=window.wasRun=9>.ged", kHostile.text);
        await visit.untilFamily();
        await visit.click("#fit");
        assert.equal((await visit.shown()).length, kHostile.names.length);
        for (let n = 0; n < kHostile.names.length; ++n) {
            await visit.stand(`R${n}`);
            assert.equal(await page.locator("#side-panel header h2").count(), 1);
        }
        await visit.fit();
        await visit.box("R1").hover({ force: true });
        await page.waitForSelector(".tooltip", { state: "visible" });
        await page.fill("#search", "script");
        const after = await page.evaluate(() => ({
            elements: all("script, style, link, iframe, object, img, base, form").length,
            handlers: [...all("*")].filter((one) => one.getAttributeNames().some((name) => name.startsWith("on")))
                .length,
            links: [...all("[href]")].filter((link) => !/^(#|blob:|data:,$)/.test(link.getAttribute("href"))).length,
            wasRun: window.wasRun ?? null,
            title: document.title,
        }));
        assert.deepEqual(after, {
            elements: elementsBefore,
            handlers: 0,
            links: 0,
            wasRun: null,
            title: "<img src=x onerror=window.wasRun=9>",
        });
        await visit.end();
    });

    test("a name is shown as it stands, sign for sign", async () => {
        const visit = await visitFamily(kHostile.text, { title: "</script><script>window.wasRun=10</script>" });
        await visit.fit();
        await visit.stand("R2");
        assert.equal(await visit.page.innerText("#side-panel h2"), "<img src=x onerror=window.wasRun=3>");
        assert.match(await visit.label("R8"), /^&lt;b&gt; &amp; &#x3c;i&#x3e; <b>bold/);
        await visit.stand("R8");
        assert.match(
            await visit.page.innerText("#side-panel .facts"),
            /Occupation\s+&lt;b&gt; &amp; &#x3c;i&#x3e; <b>bold<\/b>/,
        );
        assert.equal(await visit.page.evaluate(() => window.wasRun ?? null), null);
        await visit.end();
    });

    test("a name that is endless bursts neither box nor bar nor panel", async () => {
        const visit = await visitFamily(kHostile.text);
        const { page } = visit;
        await visit.fit();
        await visit.stand("R18");
        await visit.still();
        const widths = await page.evaluate(() => ({
            page: document.documentElement.scrollWidth - innerWidth,
            panel: one("#side-panel").scrollWidth - one("#side-panel").clientWidth,
            box: Math.max(...[...all('#tree [data-xref="R18"] text')].map((line) => line.getBBox().width)),
            frame: one('#tree [data-xref="R18"] .frame').getBBox().width,
        }));
        assert.ok(widths.page <= 0 && widths.panel <= 0, JSON.stringify(widths));
        assert.ok(widths.box <= widths.frame, JSON.stringify(widths));
        await visit.end();
    });

    test("a saved picture of hostile names is sound, and holds them as text", async () => {
        const visit = await visitFamily(kHostile.text);
        await visit.click("#file-button");
        const [download] = await Promise.all([visit.page.waitForEvent("download"), visit.page.click("#save-svg")]);
        assert.doesNotMatch(download.suggestedFilename(), /[\\/<>:"|?*]/);
        const text = readFileSync(await download.path(), "utf8");
        const judged = await visit.page.evaluate((text) => {
            const file = new DOMParser().parseFromString(text, "image/svg+xml");
            const kinds = new Set([...file.querySelectorAll("*")].map((element) => element.tagName));
            return { error: file.querySelector("parsererror") !== null, kinds: [...kinds].sort() };
        }, text);
        assert.deepEqual(judged, {
            error: false,
            kinds: ["circle", "defs", "g", "path", "rect", "svg", "text", "title", "use"],
        });
        await visit.end();
    });

    test("the page's own policy lets nothing out, whatever code asks", async () => {
        const visit = await visitEmpty();
        const { page } = visit;
        const policy = await page.locator('meta[http-equiv="Content-Security-Policy"]').getAttribute("content");
        assert.match(policy, /default-src 'none'/);
        assert.doesNotMatch(policy, /'unsafe-eval'|'unsafe-inline'|https?:|\*/);
        const outcome = await page.evaluate(async () => {
            const fails = async (attempt) => {
                try {
                    await attempt();
                    return false;
                } catch {
                    return true;
                }
            };
            const image = () =>
                new Promise((done, failed) => {
                    const picture = new Image();
                    picture.onload = done;
                    picture.onerror = failed;
                    picture.src = "http://127.0.0.1:9/a.png";
                });
            const inline = document.createElement("script");
            inline.textContent = "window.wasRun = 11";
            document.head.append(inline);
            const handler = document.createElement("div");
            handler.setAttribute("onclick", "window.wasRun = 12");
            handler.click();
            return {
                fetch: await fails(() => fetch("http://127.0.0.1:9/")),
                image: await fails(image),
                eval: await fails(() => (0, eval)("1")),
                wasRun: window.wasRun ?? null,
            };
        });
        assert.deepEqual(outcome, { fetch: true, image: true, eval: true, wasRun: null });
        assert.ok(
            visit.troubles.every((trouble) => /Content Security Policy/.test(trouble)),
            visit.troubles.join("\n"),
        );
        assert.deepEqual(
            visit.requests.filter((url) => !url.startsWith("http://127.0.0.1:9/")),
            [],
        );
        await visit.context.close();
    });
});
