// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Charles Darwin's nearest: each switch with one of those whom it shows.

import assert from "node:assert/strict";
import { describe, test } from "node:test";
import { kTwoAtOnce, photograph, visitDarwins } from "../support/browser.mjs";

// Sister Susan; Henry Parker, husband of sister Marianne; their brother's child does not live in this file, so the
// nieces are Caroline's daughters; uncle John; cousin Hensleigh; great-grandfather Robert; a son's wife; a grandson.
const kSwitches = [
    ["siblings", "I35"],
    ["siblingSpouses", "I33"],
    ["niecesNephews", "I87"],
    ["auntsUncles", "I56"],
    ["cousins", "I81"],
    ["greatGrandparents", "I3"],
    ["spousesOfChildren", "I114"],
    ["grandchildren", "I128"],
];

describe("options", kTwoAtOnce, () => {
    test("each switch takes its relatives out of the picture and back in", async () => {
        const visit = await visitDarwins();
        const all = await allPersons(visit);
        await visit.click("#options-button");
        await photograph(visit, "options");
        for (const [name, person] of kSwitches) {
            assert.ok(await visit.page.isChecked(`#show-${name}`), name);
            assert.ok(all.includes(person), `${person} for ${name}`);
            await visit.click(`#show-${name}`);
            const without = await allPersons(visit);
            assert.ok(!without.includes(person), `${person} without ${name}`);
            assert.ok(without.every((one) => all.includes(one)), name);
            assert.match(await visit.hash(), new RegExp(`hide=${name}`));
            await visit.click(`#show-${name}`);
            assert.deepEqual(await allPersons(visit), all, name);
        }
        await visit.page.keyboard.press("Escape");
        assert.ok(!(await visit.page.isVisible("#options-panel")));
        await visit.end();
    });

    test("boxes of unknown parents are left out where nobody wants them, and a link keeps that", async () => {
        const visit = await visitDarwins("#person=I17&view=pedigree");
        const unknown = () => visit.page.locator("#tree .box.missing").count();
        assert.ok((await unknown()) > 0);
        await visit.click("#options-button");
        await visit.click("#unknown-parents");
        assert.equal(await unknown(), 0);
        assert.match(await visit.hash(), /hide=unknownParents/);
        await visit.page.reload();
        await visit.untilFamily();
        assert.equal(await unknown(), 0);
        await visit.end();
    });

    test("no cousins without their parents", async () => {
        const visit = await visitDarwins();
        await visit.click("#options-button");
        await visit.click("#show-auntsUncles");
        assert.ok(await visit.page.isDisabled("#show-cousins"));
        assert.ok(!(await visit.shows("I81")));
        await visit.end();
    });

    test("what a view does not have cannot be switched", async () => {
        const visit = await visitDarwins();
        await visit.click("#options-button");
        assert.ok(await visit.page.isDisabled("#generations-more"));
        await visit.page.keyboard.press("Escape");
        await visit.click("#view-pedigree");
        await visit.click("#options-button");
        for (const [name] of kSwitches) assert.ok(await visit.page.isDisabled(`#show-${name}`), name);
        assert.ok(await visit.page.isEnabled("#generations-more"));
        await visit.page.keyboard.press("Escape");
        await visit.end();
    });

    test("generations of the pedigree are counted up and down between their bounds", async () => {
        const visit = await visitDarwins("#person=I90&view=pedigree");
        await visit.click("#options-button");
        const columns = async () => {
            await visit.page.keyboard.press("Escape");
            await visit.press("0");
            const count = new Set((await visit.places()).map((place) => / (-?\d+),/.exec(place)[1])).size;
            await visit.click("#options-button");
            return count;
        };
        assert.equal(await columns(), 5);
        await visit.click("#generations-more");
        assert.equal(await columns(), 6);
        for (let i = 0; i < 4; ++i) await visit.click("#generations-fewer");
        assert.equal(await visit.page.innerText("#generations"), "2");
        assert.ok(await visit.page.isDisabled("#generations-fewer"));
        assert.equal(await columns(), 2);
        await visit.end();
    });

    test("kinship stands in the boxes, or not", async () => {
        const visit = await visitDarwins();
        assert.ok((await visit.page.locator("#tree .kin").count()) > 10);
        await visit.click("#options-button");
        await visit.click("#kinship-in-boxes");
        assert.equal(await visit.page.locator("#tree .kin").count(), 0);
        assert.match(await visit.label("I2"), /wife/, "it is still read out");
        await visit.end();
    });
});

// With everything in sight.
async function allPersons(visit) {
    await visit.fit();
    return visit.shown();
}
