// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

import assert from "node:assert/strict";
import { test } from "node:test";
import { english, factLabel, german, messagesFor, spanish } from "../src/messages";
import { dateText, nameOf, yearsOf } from "../src/messages/names";
import { date, person } from "./persons";

test("a date is written as far as it is known", () => {
    const birth = date(1809, { month: 2, day: 12 });
    assert.equal(dateText(birth, english), "12 February 1809");
    assert.equal(dateText(birth, german), "12. Februar 1809");
    assert.equal(dateText(birth, spanish), "12 de febrero de 1809");
    assert.equal(dateText(date(1809, { month: 3, mark: "about" }), spanish), "hacia marzo de 1809");
    assert.equal(dateText(date(1809, { month: 3 }), english), "March 1809");
    assert.equal(dateText(date(1809, { month: 3 }), german), "März 1809");
    assert.equal(dateText(date(1809), german), "1809");
    assert.equal(dateText(date(-44, { month: 3, day: 15 }), english), "15 March 44 BC");
    assert.equal(dateText(date(-44), german), "44 v. Chr.");
});

test("a mark stands before its date", () => {
    const rows = [
        [date(1819, { mark: "about" }), "about 1819", "um 1819"],
        [date(1820, { mark: "before" }), "before 1820", "vor 1820"],
        [date(1820, { mark: "after", month: 5 }), "after May 1820", "nach Mai 1820"],
        [date(1819, { mark: "between", lastYear: 1825 }), "between 1819 and 1825", "zwischen 1819 und 1825"],
        [date(1819, { mark: "between", lastYear: 1819 }), "1819", "1819"],
    ] as const;
    for (const [given, inEnglish, inGerman] of rows) {
        assert.equal(dateText(given, english), inEnglish);
        assert.equal(dateText(given, german), inGerman);
    }
});

test("what lasted has a beginning and an end, and nothing between them", () => {
    const rows = [
        [date(1819, { mark: "between", lastYear: 1825, period: true }), "from 1819 to 1825", "von 1819 bis 1825"],
        [date(1819, { mark: "after", period: true }), "from 1819", "ab 1819"],
        [date(1825, { mark: "before", period: true, month: 6 }), "until June 1825", "bis Juni 1825"],
        [date(1819, { mark: "between", lastYear: 1825 }), "between 1819 and 1825", "zwischen 1819 und 1825"],
    ] as const;
    for (const [given, inEnglish, inGerman] of rows) {
        assert.equal(dateText(given, english), inEnglish);
        assert.equal(dateText(given, german), inGerman);
    }
});

test("a date that was not read is shown as written", () => {
    assert.equal(dateText(date(0, { written: "(shortly after the flood)" }), english), "(shortly after the flood)");
});

test("years stand together, or say which one is known", () => {
    const years = (more: object, messages = english): string => yearsOf(person(1, "A", more), messages);
    const both = { birth: date(1809), death: date(1882) };
    assert.equal(years(both), "1809–1882");
    assert.equal(years({ ...both, birth: date(1809, { mark: "about" }) }), "about 1809 – 1882");
    assert.equal(years({ birth: date(1809, { mark: "about" }) }), "born about 1809");
    assert.equal(years({ birth: date(1809) }, german), "geboren 1809");
    assert.equal(years({ death: date(1882, { mark: "before" }) }), "died before 1882");
    assert.equal(years({ death: date(1882) }, german), "gestorben 1882");
    assert.equal(years({}), "");
    assert.equal(years({ birth: date(0, { written: "?" }), death: date(1882) }), "died 1882");
});

test("a person without a name is called unknown", () => {
    assert.equal(nameOf(person(1, ""), english), "unknown name");
    assert.equal(nameOf(person(1, ""), german), "Name unbekannt");
    assert.equal(nameOf(person(1, "Ada"), german), "Ada");
});

test("a language tag finds its table, whatever its region, and English else", () => {
    assert.equal(messagesFor("de-AT"), german);
    assert.equal(messagesFor("DE"), german);
    assert.equal(messagesFor("en-GB"), english);
    assert.equal(messagesFor("fr"), english);
    assert.equal(messagesFor(""), english);
});

test("each table names the same facts, and a tag without a name stands for itself", () => {
    assert.deepEqual(Object.keys(german.facts).sort(), Object.keys(english.facts).sort());
    assert.equal(factLabel("OCCU", english), "Occupation");
    assert.equal(factLabel("OCCU", german), "Beruf");
    assert.equal(factLabel("_MILT", english), "_MILT");
    assert.equal(factLabel("constructor", english), "constructor");
});
