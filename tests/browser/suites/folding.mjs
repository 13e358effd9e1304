// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Branches that fold and unfold in place; pictures with right and left exchanged; ways in words.

import assert from "node:assert/strict";
import { execFileSync } from "node:child_process";
import { join } from "node:path";
import { describe } from "node:test";
import { kTwoAtOnce, photograph, visitDarwins } from "../support/browser.mjs";
import { test } from "../support/reported.mjs";

const kPhone = { viewport: { width: 390, height: 844 }, hasTouch: true, isMobile: true };

// Erasmus Darwin's descendants, with those of his grandson Charles, I1.
const kDescendants = "#person=I5&view=descendants&down=4";

const control = (xref, branch) => `#tree [data-xref="${xref}"] .fold[role][data-branch="${branch}"]`;
const numberIn = (text) => Number(/(\d+)$/.exec(text)?.[1]);

async function fold(visit, xref, branch) {
    const label = await visit.page.getAttribute(control(xref, branch), "aria-label");
    await visit.page.click(control(xref, branch));
    await visit.still();
    return label;
}

describe("folding", kTwoAtOnce, () => {
    test("a branch folds at its box, with a count, and unfolds to the same picture", async () => {
        const visit = await visitDarwins(kDescendants);
        await visit.fit();
        const before = await visit.places();
        await visit.handle("I1").click();
        await visit.still();
        const where = await visit.middleOf("I1");
        const label = await fold(visit, "I1", "down");
        assert.match(label, /^Fold the descendants of Charles Robert Darwin: \d+$/);
        const after = await visit.places();
        const hidden = before.length - after.length;
        assert.equal(hidden, numberIn(label));
        assert.ok(hidden > 5);
        // It stays where it was, and is read out with what is folded.
        const now = await visit.middleOf("I1");
        assert.ok(Math.hypot(now.x - where.x, now.y - where.y) < 2, JSON.stringify([where, now]));
        assert.match(await visit.label("I1"), new RegExp(`descendants folded: ${hidden}`));
        assert.match(await visit.hash(), /fold=I1\.down/);
        await photograph(visit, "folded");
        assert.match(await fold(visit, "I1", "down"), /^Unfold the descendants of Charles Robert Darwin: \d+$/);
        assert.deepEqual(await visit.places(), before);
        assert.ok(!(await visit.hash()).includes("fold="));
        await visit.end();
    });

    test("keys fold, and stay on the box; Tab leads to what folds", async () => {
        const visit = await visitDarwins("#person=I1&view=hourglass&up=2&down=1");
        await visit.fit();
        await visit.stand("I1");
        const all = (await visit.shown()).length;
        await visit.press("u");
        assert.ok((await visit.shown()).length < all);
        assert.equal(await visit.keysOn(), "I1");
        await visit.press("u");
        assert.equal((await visit.shown()).length, all);
        await visit.press("Tab");
        const folds = () => visit.page.evaluate(() => holder().getAttribute("aria-label"));
        assert.match(await folds(), /^Fold the ancestors of Charles Robert Darwin/);
        await visit.press("Enter");
        assert.ok((await visit.shown()).length < all);
        assert.match(await visit.hash(), /fold=I1\.up/);
        await visit.end();
    });

    test("a link keeps what is folded, and a finger unfolds it", async () => {
        const visit = await visitDarwins(kDescendants + "&fold=I1.down,I7.nobody,I999.up", kPhone);
        const folded = (await visit.shown()).length;
        await visit.fit();
        await visit.tap('#tree [data-xref="I1"] .fold');
        assert.ok((await visit.shown()).length > folded);
        await visit.end();
    });

    test("the engine's own views and round charts have nothing to fold", async () => {
        for (const view of ["family", "pedigree", "fan", "everybody"]) {
            const visit = await visitDarwins(`#person=I1&view=${view}&fold=I1.up`);
            assert.equal(await visit.page.locator("#tree .fold").count(), 0, view);
            await visit.end();
        }
    });

    test("a picture is mirrored by a switch, and arrow keys follow what is seen", async () => {
        const visit = await visitDarwins("#person=I1&view=ancestors&direction=right&up=2");
        const father = async () => (await visit.middleOf("I12")).x - (await visit.middleOf("I1")).x;
        assert.ok((await father()) < 0);
        await visit.click("#views-button");
        await visit.click("#mirrored");
        await visit.page.keyboard.press("Escape");
        await visit.still();
        assert.ok((await father()) > 0);
        assert.match(await visit.hash(), /mirror=yes/);
        await photograph(visit, "mirrored");
        await visit.stand("I1");
        await visit.press("ArrowRight");
        assert.equal(await visit.keysOn(), "I12");
        await visit.end();
    });

    test("pictures are mirrored where texts run from right to left", async () => {
        const visit = await visitDarwins("#person=I1");
        const spouse = async () => (await visit.middleOf("I2")).x - (await visit.middleOf("I1")).x;
        assert.ok((await spouse()) > 0);
        await visit.page.evaluate(() => {
            const tree = document.querySelector("olvane-tree");
            tree.setAttribute("dir", "rtl");
            tree.show({ unknownParents: false });
        });
        await visit.still();
        assert.ok((await spouse()) < 0);
        await photograph(visit, "right-to-left");
        await visit.end();
    });

    const command = process.env.OLVANE_COMMAND;
    test("folded and mirrored pictures are saved as the command draws them", { skip: !command }, async () => {
        const sample = join(process.env.OLVANE_SOURCES, "samples/darwin-wedgwood.ged");
        const cases = [
            [
                "I5&view=descendants&fold=I1.down&mirror=yes",
                ["--view", "descendants", "--fold", "I1:down", "--down", "3"],
            ],
            ["I1&view=pedigree&mirror=yes&hide=unknownParents", ["--view", "pedigree"]],
        ];
        for (const [address, extra] of cases) {
            const visit = await visitDarwins("#person=" + address);
            const svg = await visit.page.evaluate(() => document.querySelector("olvane-tree").drawing("light"));
            const drawn = execFileSync(command, [
                "draw",
                sample,
                "--focus",
                address.slice(0, 2),
                "-o",
                "-",
                "--mirror",
                ...extra,
            ]);
            assert.equal(svg, drawn.toString("utf8"), address);
            await visit.end();
        }
    });

    test("in another language the words of a kinship change with all else, and the picture stays", async () => {
        const visit = await visitDarwins("#person=I1&view=kinship&to=I12");
        const captions = () => visit.page.locator("#tree .caption text").allTextContents();
        assert.deepEqual((await captions()).sort(), ["father", "son"]);
        const before = await visit.placing();
        await visit.click("#options-button");
        await visit.page.selectOption("#language", "de");
        await visit.still();
        assert.deepEqual((await captions()).sort(), ["Sohn", "Vater"]);
        assert.equal(await visit.page.locator(".corner .ways li").first().innerText(), "Vater");
        await visit.assertPlacedAs(before);
        await visit.end();
    });

    test("on a phone the picture of a kinship is not hidden by the panel that led to it", async () => {
        const visit = await visitDarwins("#person=I1", kPhone);
        await visit.tap('#tree [data-xref="I12"] .frame');
        await visit.tap("#side-panel .handle");
        await visit.tap("#how-related");
        assert.match(await visit.hash(), /view=kinship/);
        assert.equal(await visit.page.locator("#side-panel.drawn").count(), 0);
        await visit.end();
    });

    test("every way between two persons is listed in words, each a link to the picture of them", async () => {
        const visit = await visitDarwins("#person=I1");
        await visit.handle("I2").click();
        await visit.click("#ways summary");
        const ways = visit.page.locator("#ways a");
        const texts = await ways.allInnerTexts();
        assert.ok(texts.length > 1, texts.join("\n"));
        assert.match(texts.join("\n"), /first cousin[^]*Charles Robert Darwin \u2013 .*Wedgwood/);
        assert.match(await ways.first().getAttribute("href"), /person=I1&view=kinship.*to=I2/);
        await photograph(visit, "ways");
        await ways.first().click();
        await visit.still();
        assert.match(await visit.hash(), /view=kinship/);
        const drawn = await visit.page.locator(".corner .ways li").count();
        assert.equal(drawn, texts.length);
        await visit.end();
    });
});
