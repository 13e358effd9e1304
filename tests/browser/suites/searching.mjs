// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

import assert from "node:assert/strict";
import { describe } from "node:test";
import { kTwoAtOnce, photograph, visitDarwins, visitFamily } from "../support/browser.mjs";
import { gedcom } from "../support/families.mjs";
import { test } from "../support/reported.mjs";

async function found(visit) {
    return visit.page.$$eval("#search-list [role=option] bdi.name", (names) => names.map((name) => name.textContent));
}

describe("searching", kTwoAtOnce, () => {
    test("the index is made before anybody types", async () => {
        const visit = await visitDarwins();
        await visit.page.waitForFunction(() => performance.getEntriesByName("olvane-index").length > 0);
        // One call adds 50 persons of 142.
        assert.ok(await visit.page.evaluate(() => document.querySelector("olvane-tree").family.file.prepareSearch(0)));
        await visit.end();
    });

    test("words in any order find a person, and Enter leads there", async () => {
        const visit = await visitDarwins();
        await visit.page.keyboard.press("/");
        assert.equal(await visit.page.evaluate(() => holder().id), "search");
        await visit.page.keyboard.type("williams ralph");
        assert.deepEqual(await found(visit), ["Ralph Vaughan Williams"]);
        await visit.page.keyboard.press("Enter");
        await visit.still();
        assert.equal(await visit.focus(), "I90");
        assert.ok(!(await visit.page.isVisible("#search-list")));
        await visit.end();
    });

    test("the list says what was found where, and marks it in the name", async () => {
        const visit = await visitDarwins();
        const reasons = () =>
            visit.page.$$eval("#search-list .why", (lines) => [...new Set(lines.map((line) => line.textContent))]);
        const marks = () =>
            visit.page.$$eval("#search-list bdi.name mark", (parts) => [
                ...new Set(parts.map((part) => part.textContent)),
            ]);
        await visit.page.fill("#search", "emma darwin 1808");
        assert.deepEqual(await found(visit), ["Emma Wedgwood"], "a wife is found by her husband's surname");
        assert.deepEqual(await reasons(), ["Married name: Darwin"]);
        assert.deepEqual(await marks(), ["Emma"]);
        await visit.page.fill("#search", "edgwoo emma 1808");
        assert.deepEqual(await found(visit), ["Emma Wedgwood"], "words are found from the middle");
        assert.deepEqual(await reasons(), []);
        await visit.page.fill("#search", "wegdwood emma 1808");
        assert.deepEqual(await found(visit), ["Emma Wedgwood"], "two letters are exchanged");
        assert.deepEqual(await reasons(), ["Similar name: Emma Wedgwood"]);
        await visit.end();
    });

    test("places, titles and facts are found, and named as the record names them", async () => {
        const lines = ["0 @I1@ INDI", "1 NAME Ada /Byron/", "2 NICK Countess", "1 SEX F", "1 BIRT", "2 DATE 1815"];
        lines.push(
            "2 PLAC Marylebone,,London",
            "1 TITL Lady Lovelace",
            "1 OCCU Mathematician",
            "1 CENS",
            "2 DATE 30 MAR 1851",
        );
        const visit = await visitFamily(gedcom(...lines), { name: "ada.ged" });
        const reasonOf = async (text) => {
            await visit.page.fill("#search", text);
            return visit.page.$$eval("#search-list .why", (found) => found.map((line) => line.textContent));
        };
        assert.deepEqual(await reasonOf("london marylebone"), ["Birth: Marylebone, London"]);
        assert.deepEqual(await reasonOf("lovelace"), ["Title: Lady Lovelace"]);
        assert.deepEqual(await reasonOf("matematician"), ["Occupation: Mathematician"]);
        assert.deepEqual(await reasonOf("countess"), ["Nickname: Countess"]);
        assert.deepEqual(await reasonOf("1851"), ["Census: 30 Mar 1851"]);
        assert.deepEqual(await reasonOf("@I1@"), ["Record: I1"]);
        await photograph(visit, "search-reasons");
        await visit.end();
    });

    test("a list that is not the whole says so", async () => {
        const visit = await visitDarwins();
        await visit.page.fill("#search", "darwin");
        assert.equal((await found(visit)).length, 30);
        assert.match(await visit.page.innerText("#search-list li:last-child"), /the first 30; type on/);
        await visit.page.press("#search", "ArrowUp");
        assert.equal(await visit.page.getAttribute("#search", "aria-activedescendant"), "found-29");
        await visit.page.fill("#search", "erasmus darwin 1731");
        assert.doesNotMatch(await visit.page.innerText("#search-list"), /type on/);
        await visit.end();
    });

    test("a year distinguishes persons of one name", async () => {
        const visit = await visitDarwins();
        await visit.page.fill("#search", "erasmus darwin 1731");
        assert.deepEqual(await found(visit), ["Erasmus Darwin"]);
        assert.match(await visit.page.innerText("#search-list .years"), /1731–1802/);
        await visit.end();
    });

    test("the list is walked with the arrows, names kinship, and a click chooses", async () => {
        const visit = await visitDarwins();
        const { page } = visit;
        await page.fill("#search", "emma");
        const names = await found(visit);
        assert.ok(names.length >= 4);
        assert.match(await page.innerText("#search-list"), /wife and first cousin/);
        await photograph(visit, "search");
        const current = () => page.locator("#search").getAttribute("aria-activedescendant");
        const first = await current();
        await page.press("#search", "ArrowDown");
        assert.notEqual(await current(), first);
        await page.press("#search", "ArrowUp");
        assert.equal(await current(), first);
        assert.equal(await page.locator(`#${first}`).getAttribute("aria-selected"), "true");
        await page.locator("#search-list [role=option]", { hasText: "Emma Wedgwood" }).click();
        await visit.still();
        assert.equal(await visit.focus(), "I2");
        await visit.end();
    });

    test("Enter in an emptied field leads to nobody, even after a search", async () => {
        const visit = await visitDarwins();
        await visit.page.fill("#search", "erasmus");
        assert.ok((await found(visit)).length > 0);
        await visit.goTo("");
        assert.equal(await visit.focus(), "I1");
        await visit.page.fill("#search", "emma wedgwood 1808");
        await visit.page.press("#search", "Escape");
        await visit.press("Enter");
        assert.equal(await visit.focus(), "I2", "a list that was closed opens for what stands in the field");
        await visit.end();
    });

    test("keys that compose a word choose nobody", async () => {
        const visit = await visitDarwins();
        await visit.page.fill("#search", "emma");
        await visit.page.evaluate(() => {
            const composing = { key: "Enter", isComposing: true, bubbles: true, cancelable: true };
            one("#search").dispatchEvent(new KeyboardEvent("keydown", composing));
        });
        await visit.still();
        assert.equal(await visit.focus(), "I1");
        assert.equal(await visit.page.inputValue("#search"), "emma");
        await visit.end();
    });

    test("nobody found is said, and Escape closes the list", async () => {
        const visit = await visitDarwins();
        await visit.page.fill("#search", "zzz");
        assert.match(await visit.page.innerText("#search-list"), /Nobody found/);
        await visit.page.press("#search", "Escape");
        assert.ok(!(await visit.page.isVisible("#search-list")));
        assert.equal(await visit.focus(), "I1");
        await visit.end();
    });
});
