// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Charles Darwin's nearest: each switch with one of those whom it shows.

import assert from "node:assert/strict";
import { describe } from "node:test";
import { kTwoAtOnce, photograph, visitDarwins, visitFamily } from "../support/browser.mjs";
import { gedcom, kFactFamily } from "../support/families.mjs";
import { test } from "../support/reported.mjs";

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
            assert.ok(
                without.every((one) => all.includes(one)),
                name,
            );
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
        await visit.reload();
        await visit.untilFamily();
        assert.equal(await unknown(), 0);
        await visit.end();
    });

    test("boxes and lines say more where it is asked for, and a link keeps that", async () => {
        const visit = await visitFamily(kFactFamily, { focus: 1 });
        const linesOf = (person) =>
            visit.page
                .locator(`#tree [data-xref="${person}"] .years`)
                .evaluateAll((all) => all.map((line) => line.textContent));
        const marriages = () => visit.page.locator("#tree .marriage-label").allTextContents();
        const heightOf = (person) =>
            visit.page
                .locator(`#tree [data-xref="${person}"] .frame`)
                .evaluate((frame) => Number(frame.getAttribute("height")));
        assert.deepEqual(await linesOf("I1"), ["* 1809  \u2020 1882"]);
        assert.deepEqual(await marriages(), []);
        const usual = await heightOf("I1");
        await visit.click("#options-button");
        await visit.click("#fact-dates");
        assert.deepEqual(await linesOf("I1"), ["* 12 Feb 1809", "\u2020 19 Apr 1882"]);
        await visit.click("#fact-places");
        assert.deepEqual((await linesOf("I1")).slice(2), ["* Bath", "\u2020 Hove"]);
        await visit.click("#fact-occupation");
        assert.deepEqual((await linesOf("I1")).slice(4), ["Baker"]);
        assert.deepEqual(await linesOf("I2"), [], "of whom nothing is known");
        assert.equal((await heightOf("I1")) - usual, 4 * 14);
        await visit.click("#fact-marriage");
        assert.deepEqual(await marriages(), ["1839"]);
        assert.match(await visit.label("I1"), /born 12 Feb 1809, died 19 Apr 1882, \* Bath, \u2020 Hove, Baker/);
        assert.match(await visit.hash(), /show=dates,places,occupation,marriage/);
        await photograph(visit, "facts");
        await visit.reload();
        await visit.untilFamily();
        assert.equal((await linesOf("I1")).length, 5);
        assert.deepEqual(await marriages(), ["1839"]);
        await visit.click("#options-button");
        assert.ok(await visit.page.isChecked("#fact-dates"));
        for (const fact of ["dates", "places", "occupation", "marriage"]) await visit.click(`#fact-${fact}`);
        assert.deepEqual(await linesOf("I1"), ["* 1809  \u2020 1882"]);
        assert.equal(await heightOf("I1"), usual);
        assert.ok(!(await visit.hash()).includes("show="));
        await visit.end();
    });

    test("the years of several marriages of one person stand apart", async () => {
        const visit = await visitDarwins("#person=I1&show=marriage");
        await visit.fit();
        const labels = await visit.page.locator("#tree .marriage-label").evaluateAll((all) =>
            all.map((label) => {
                const { left, right, top, bottom } = label.getBoundingClientRect();
                return { year: label.textContent, left, right, top, bottom };
            }),
        );
        assert.ok(labels.length > 10, String(labels.length));
        const overlap = (a, b) => a.left < b.right && b.left < a.right && a.top < b.bottom && b.top < a.bottom;
        const met = labels.flatMap((a, i) => labels.slice(i + 1).flatMap((b) => (overlap(a, b) ? [[a, b]] : [])));
        assert.deepEqual(met, []);
        const frames = await visit.page.locator("#tree .frame").evaluateAll((all) =>
            all.map((frame) => {
                const { left, right, top, bottom } = frame.getBoundingClientRect();
                return { left, right, top, bottom };
            }),
        );
        // A digit is narrower than the room that the browser gives its text, by the stroke around it.
        const inner = ({ left, right, top, bottom }) => {
            const edge = (right - left) / 8;
            return { left: left + edge, right: right - edge, top: top + edge, bottom: bottom - edge };
        };
        const covered = labels.filter((label) => frames.some((frame) => overlap(inner(label), frame)));
        assert.deepEqual(covered, []);
        await visit.end();
    });

    test("generations are packed tighter where a chart can be, and a link keeps that", async () => {
        const visit = await visitDarwins("#person=I5&view=descendants&down=3");
        await visit.fit();
        const loose = await visit.places();
        await visit.click("#views-button");
        await visit.click("#compact");
        assert.match(await visit.hash(), /compact=yes/);
        await visit.page.keyboard.press("Escape");
        await visit.fit();
        assert.notDeepEqual(await visit.places(), loose);
        await visit.follow("#person=I5&view=fan&compact=yes");
        await visit.click("#views-button");
        assert.ok(!(await visit.page.isVisible("#compact")), "a fan cannot be");
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

    test("other parents of an adopted person are shown at a click, and a link keeps them", async () => {
        const visit = await visitFamily(
            gedcom(
                ...["0 @I1@ INDI", "1 NAME Kim //", "1 FAMC @F1@", "1 FAMC @F2@", "2 PEDI adopted"],
                ...["0 @I2@ INDI", "1 NAME Jon //", "1 SEX M", "1 FAMS @F1@"],
                ...["0 @I3@ INDI", "1 NAME Leif //", "1 SEX M", "1 FAMS @F2@"],
                ...["0 @F1@ FAM", "1 HUSB @I2@", "1 CHIL @I1@", "0 @F2@ FAM", "1 HUSB @I3@", "1 CHIL @I1@"],
            ),
            { focus: 1 },
        );
        assert.deepEqual(await allPersons(visit), ["I1", "I2"]);
        await visit.click("#tree .further");
        assert.deepEqual(await allPersons(visit), ["I1", "I3"]);
        assert.match(await visit.hash(), /parents=1\.2/);
        await visit.reload();
        await visit.untilFamily();
        assert.deepEqual(await allPersons(visit), ["I1", "I3"]);
        await visit.click("#tree .further");
        assert.deepEqual(await allPersons(visit), ["I1", "I2"]);
        await visit.end();
    });

    test("each way of a kinship has a line, a place in the legend, and words at both ends", async () => {
        const visit = await visitDarwins("#person=I1&view=kinship&to=I2");
        const words = await visit.page.locator(".corner .ways li").allInnerTexts();
        assert.deepEqual(words, ["first cousin", "wife"]);
        assert.equal(await visit.page.locator("#tree .way").count(), 2);
        const captions = await visit.page.locator("#tree .caption").allTextContents();
        // Broken into lines, which stand without a space between them.
        const wordsAtEnds = captions.map((caption) => caption.replaceAll(" ", "")).sort();
        assert.deepEqual(wordsAtEnds, ["husbandandfirstcousin", "wifeandfirstcousin"]);
        assert.ok((await visit.page.locator("#tree .ancestor").count()) > 0);
        assert.ok((await visit.page.locator("#legend li").allTextContents()).includes("a common ancestor"));
        await photograph(visit, "kinship");
        await visit.follow("#person=I1");
        assert.equal(await visit.page.locator(".corner .ways li").count(), 0);
        await visit.end();
    });

    test("no word of a kinship to twelve generations is cut or leaves its box, in any language", async () => {
        for (const language of ["en", "de", "es"]) {
            for (const direction of ["down", "left"]) {
                const visit = await visitFamily(
                    twelveGenerations(),
                    {},
                    {},
                    `#person=I1&view=relatives&up=12&down=1&direction=${direction}&language=${language}`,
                );
                await visit.fit();
                const words = await visit.page.evaluate(() =>
                    all("#tree .kin").map((text) => {
                        const own = text.getBoundingClientRect();
                        const frame = text.parentElement.querySelector(".frame").getBoundingClientRect();
                        return { text: text.textContent, leaves: own.left < frame.left || own.right > frame.right };
                    }),
                );
                assert.ok(words.length > 30, `${words.length} words`);
                assert.deepEqual(
                    words.filter(({ text, leaves }) => leaves || text.includes("\u2026")),
                    [],
                );
                await visit.end();
            }
        }
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

// A line of couples; each generation has a son who leads on and a daughter who is married.
function twelveGenerations() {
    const lines = [];
    for (let i = 0; i < 13; ++i) {
        const [son, wife, sister, husband] = [1, 2, 3, 4].map((place) => `@I${4 * i + place}@`);
        const [own, parents, hers] = [`@F${2 * i}@`, `@F${2 * i + 2}@`, `@F${2 * i + 1}@`];
        lines.push(`0 ${son} INDI`, `1 NAME Alexander Maximilian ${i} /Hohenlohe-Langenburg/`, "1 SEX M");
        lines.push(`1 BIRT`, `2 DATE ${2000 - 30 * i}`, `1 FAMS ${own}`, `1 FAMC ${parents}`);
        lines.push(`0 ${wife} INDI`, `1 NAME Wilhelmine ${i} /Berg/`, "1 SEX F", `1 FAMS ${own}`);
        lines.push(`0 ${sister} INDI`, `1 NAME Ida ${i} /Hohenlohe-Langenburg/`, "1 SEX F");
        lines.push(`1 FAMC ${parents}`, `1 FAMS ${hers}`);
        lines.push(`0 ${husband} INDI`, `1 NAME Otto ${i} /Holm/`, "1 SEX M", `1 FAMS ${hers}`);
        lines.push(`0 ${hers} FAM`, `1 HUSB ${husband}`, `1 WIFE ${sister}`);
        lines.push(`0 ${own} FAM`, `1 HUSB ${son}`, `1 WIFE ${wife}`);
        if (i > 0) lines.push(`1 CHIL @I${4 * i - 3}@`, `1 CHIL @I${4 * i - 1}@`);
    }
    return gedcom(...lines, "0 @F26@ FAM", "1 CHIL @I49@", "1 CHIL @I51@");
}
