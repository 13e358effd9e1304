// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What the page itself says of persons; dates, years and who has no name are put into words by the module.

import assert from "node:assert/strict";
import { test } from "node:test";
import type { Texts } from "olvane";
import { Messages } from "../src/messages";
import { date, person } from "./persons";

// Repeats what it is asked.
const texts = {
    unnamedText: (language: string) => `nobody (${language})`,
    yearsText: (birth: unknown, death: unknown, language: string) => JSON.stringify([birth, death, language]),
    dateText: (written: string, language: string) => `${written} (${language})`,
} as unknown as Texts;
const words = (tag: string): Messages => new Messages(tag, () => texts);

test("names, years and dates are asked of the module in the language of the reader", () => {
    const birth = date(1809);
    assert.equal(words("de").nameOf(person(1, "")), "nobody (de)");
    assert.equal(words("de").nameOf(person(1, "Ada")), "Ada");
    assert.equal(words("es").yearsOf(person(1, "Ada", { birth })), JSON.stringify([birth, null, "es"]));
    assert.equal(words("en").dateText("1809"), "1809 (en)");
});

test("a language tag finds its table, whatever its region, and English else", () => {
    const cases = { "de-AT": "de", DE: "de", "en-GB": "en", fr: "en", "": "en", constructor: "en" };
    for (const [tag, language] of Object.entries(cases)) assert.equal(words(tag).language, language);
});

test("a tag without a name stands for itself", () => {
    assert.equal(words("en").factLabel("OCCU"), "Occupation");
    assert.equal(words("de").factLabel("OCCU"), "Beruf");
    assert.equal(words("en").factLabel("_MILT"), "_MILT");
    assert.equal(words("en").factLabel("constructor"), "constructor");
});
