// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Says which words a language lacks: every table is compared with the English one, word by word.

import assert from "node:assert/strict";
import { test } from "node:test";
import { factLanguages } from "../src/messages";
import { uiLanguages } from "../src/messages/ui";

type Table = Readonly<Record<string, unknown>>;

// "panel.facts" and so on; of a list the number of its entries.
function wordsOf(table: Table, prefix = ""): string[] {
    return Object.entries(table).flatMap(([key, value]) => {
        const name = prefix + key;
        if (Array.isArray(value)) return [`${name} (${value.length})`];
        return typeof value === "object" && value !== null ? wordsOf(value as Table, name + ".") : [name];
    });
}

function emptyTexts(table: Table, prefix = ""): string[] {
    return Object.entries(table).flatMap(([key, value]) => {
        if (typeof value === "object" && value !== null) return emptyTexts(value as Table, prefix + key + ".");
        return value === "" ? [prefix + key] : [];
    });
}

function missing(table: object, of: object): string[] {
    const known = new Set(wordsOf(table as Table));
    return wordsOf(of as Table).filter((word) => !known.has(word));
}

test("no language lacks a word of the interface", () => {
    const uiEnglish = uiLanguages.find(({ language }) => language === "en")!;
    for (const ui of uiLanguages) {
        assert.deepEqual(missing(ui, uiEnglish), [], `${ui.languageName} lacks these words`);
        assert.deepEqual(emptyTexts(ui as unknown as Table), [], `${ui.languageName} has no text for these words`);
    }
});

test("no language lacks the name of a fact, and each language of the interface has them", () => {
    for (const [language, facts] of Object.entries(factLanguages)) {
        assert.deepEqual(missing(facts, factLanguages["en"]!), [], `${language} lacks these words`);
        assert.deepEqual(missing(factLanguages["en"]!, facts), [], `English lacks these words of ${language}`);
        assert.deepEqual(emptyTexts(facts), [], `${language} has no text for these words`);
    }
    assert.deepEqual(Object.keys(factLanguages).sort(), uiLanguages.map(({ language }) => language).sort());
});
