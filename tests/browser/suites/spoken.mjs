// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Five tasks as a screen reader speaks them. The texts stand in golden/ to be read by people: each should make sense to
// somebody who has never seen the picture. Run with OLVANE_RECORD=1 to write them again, read them, and commit them.

import assert from "node:assert/strict";
import { existsSync, readFileSync, writeFileSync } from "node:fs";
import { join } from "node:path";
import { describe } from "node:test";
import { kTwoAtOnce, visitDarwins, visitFamily } from "../support/browser.mjs";
import { detailedFamily } from "../support/families.mjs";
import { announced, spoken } from "../support/spoken.mjs";
import { test } from "../support/reported.mjs";

function compare(name, lines) {
    const path = join(process.env.OLVANE_SOURCES, "tests/browser/golden", name + ".txt");
    const text = lines.join("\n") + "\n";
    if (process.env.OLVANE_RECORD) writeFileSync(path, text);
    assert.ok(existsSync(path), `${path} is missing; OLVANE_RECORD=1 writes it`);
    assert.equal(text, readFileSync(path, "utf8"));
}

async function live(visit) {
    return visit.page.evaluate(() => one("#live").textContent.replace(/[\u2066-\u2069]/g, ""));
}

describe("spoken", kTwoAtOnce, () => {
    test("reading about a person", async () => {
        const visit = await visitFamily(detailedFamily(), {}, {}, "#person=I1");
        await visit.page.evaluate(() => all("#side-panel details").forEach((one) => (one.open = true)));
        compare("reading-about-a-person", await spoken(visit, "#side-panel"));
        await visit.end();
    });

    test("walking through a family by keys", async () => {
        const visit = await visitDarwins();
        const lines = [];
        await visit.stand("I1");
        lines.push(
            `The picture: ${await visit.page.evaluate(() => `${one("#tree").getAttribute("aria-label")}. ${one("#tree-hint").textContent}`)}`,
        );
        lines.push(`At first: ${await announced(visit)}`);
        for (const key of ["ArrowUp", "ArrowLeft", "ArrowDown", "ArrowRight"]) {
            await visit.press(key);
            lines.push(`${key}: ${await announced(visit)}`);
        }
        await visit.press("Enter");
        lines.push(`Enter: ${await live(visit)}`, `Now: ${await announced(visit)}`);
        compare("walking-by-keys", lines);
        await visit.end();
    });

    test("finding a person", async () => {
        const visit = await visitDarwins();
        await visit.page.fill("#search", "emma wedgwood");
        await visit.page.waitForSelector("[role=option]");
        const lines = ["Typed: emma wedgwood", ...(await spoken(visit, "[role=listbox]"))];
        await visit.press("Enter");
        lines.push(`Enter: ${await live(visit)}`, `Now: ${await announced(visit)}`);
        compare("finding-a-person", lines);
        await visit.end();
    });

    test("seeing how two are related", async () => {
        const visit = await visitDarwins("#person=I1&view=kinship&to=I12");
        const lines = [`The picture: ${await visit.page.evaluate(() => one("#tree").getAttribute("aria-label"))}`];
        await visit.fit();
        for (const label of await visit.labels()) lines.push(`box: ${label}`);
        compare("seeing-how-two-are-related", lines);
        await visit.end();
    });

    test("choosing another view", async () => {
        const visit = await visitDarwins();
        await visit.page.click("#views-button");
        const lines = await spoken(visit, "#views-panel");
        await visit.click("#choose-descendants");
        lines.push(`Then: ${await live(visit)}`);
        compare("choosing-a-view", lines);
        await visit.end();
    });
});
