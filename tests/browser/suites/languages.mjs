// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The page is read from end to end in each language: every text, label and title in every view, panel, dialog and notice. What
// stands there in English too is a word that nobody translated.

import assert from "node:assert/strict";
import { describe } from "node:test";
import { sample, visitEmpty } from "../support/browser.mjs";
import { test } from "../support/reported.mjs";

const kViews = ["pedigree", "near", "ancestors", "descendants", "hourglass", "relatives", "fan", "everybody", "family"];

// Names of languages and keys, what stands there without scripts, and the name of the page.
const kSameEverywhere =
    /^(Olvane|English|Deutsch|Espa\u00f1ol|This page draws .* needs JavaScript for it\.|Enter|Escape|Alt .*)$/;

function textsOf(visit) {
    return visit.page.evaluate(() => {
        const kLabels = ["aria-label", "title", "alt", "aria-valuetext", "aria-roledescription", "aria-description"];
        return all("*:not(style, script, #encoding *)").flatMap((part) => [
            ...[...part.childNodes].filter((node) => node.nodeType === 3).map((node) => node.data.trim()),
            ...kLabels.map((name) => part.getAttribute(name) ?? ""),
        ]);
    });
}

// Every place of the page, one after the other.
const kPlaces = {
    welcome: async () => {},
    "no family": async (visit) => {
        await visit.choose("odd.ged", "nothing");
        await visit.page.waitForSelector(".notice.failed");
    },
    family: async (visit) => {
        await visit.choose("darwin-wedgwood.ged", sample("darwin-wedgwood.ged"));
        await visit.untilFamily();
    },
    ...Object.fromEntries(
        kViews.map((view) => [
            `the view ${view}`,
            async (visit) => {
                await visit.page.click("#views-button");
                await visit.page.click(`#choose-${view}`);
                await visit.page.keyboard.press("Escape");
            },
        ]),
    ),
    options: (visit) => visit.page.click("#options-button"),
    "saving and paper": async (visit) => {
        await visit.page.click("#file-button");
        await visit.page.click("#save-svg");
        await visit.page.click("#file-button");
        await visit.page.click("#print-sheets");
    },
    "too many sheets": async (visit) => {
        await visit.page.fill("#sheet-scale", "100");
        await visit.page.press("#sheet-scale", "Tab");
    },
    keys: async (visit) => {
        await visit.page.click("#print-dialog-close");
        await visit.page.click("#file-button");
        await visit.page.click("#keys-button");
    },
    search: async (visit) => {
        await visit.page.keyboard.press("Escape");
        await visit.page.fill("#search", "1809 shrewsbury");
        await visit.page.waitForSelector("#search-list li");
    },
    "somebody selected": async (visit) => {
        await visit.page.fill("#search", "");
        await visit.handle("I12").click();
        await visit.page.click("#ways summary");
    },
    kinship: async (visit) => {
        await visit.page.click("#how-related");
        await visit.page.click("#legend summary");
        await visit.still();
    },
    "nobody behind a link": async (visit) => {
        await visit.follow("#person=nobody");
        await visit.page.waitForSelector(".notice.failed");
    },
    map: async (visit) => {
        await visit.page.click("#views-button");
        await visit.page.click("#choose-map");
        await visit.page.waitForSelector("#map canvas");
    },
};

async function read(locale) {
    const visit = await visitEmpty({ locale });
    const found = new Map();
    for (const [place, go] of Object.entries(kPlaces)) {
        await go(visit);
        for (const text of await textsOf(visit)) if (!found.has(text)) found.set(text, place);
    }
    await visit.end();
    return found;
}

describe("languages", () => {
    test("nothing is left in English in German and Spanish, wherever a reader goes", async () => {
        const file = sample("darwin-wedgwood.ged").toString("utf8");
        const data = new Set(file.match(/[\p{L}]+/gu));
        const isData = (text) => (text.match(/[\p{L}]+/gu) ?? []).every((word) => data.has(word));
        const locales = ["de-DE", "es-ES"];
        const [english, ...others] = await Promise.all(["en-GB", ...locales].map(read));
        assert.ok(english.size > 400, String(english.size));
        for (const [i, locale] of locales.entries()) {
            const same = [...others[i]].filter(
                ([text]) => english.has(text) && /\p{L}{3}/u.test(text) && !kSameEverywhere.test(text) && !isData(text),
            );
            const left = same.filter(([text]) => text !== "darwin-wedgwood");
            assert.deepEqual(left, [], locale);
        }
    });
});
