// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What panels show and keys do, as far as it needs no page.

import "./stillBrowser";
import assert from "node:assert/strict";
import { test } from "node:test";
import type { DetailedFact, SearchReason } from "olvane";
import { wordsInName } from "../src/shell/searchReasons";
import { ownNameOf, webAddress } from "../src/ui/DetailView";
import { type KeyActions, pictureKey } from "../src/ui/pictureKeys";
import { person } from "./persons";

test("only addresses of the web become links", () => {
    assert.equal(webAddress(" https://example.org/a b "), "https://example.org/a%20b");
    assert.equal(webAddress("http://example.org"), "http://example.org/");
    for (const other of ["javascript:alert(1)", "file:///etc/passwd", "data:text/html,x", "C:\\photos\\a.jpg", ""])
        assert.equal(webAddress(other), null);
});

test("an event that says no more than that there is one goes by its own words", () => {
    const named = (tag: string, type: string, value = "") =>
        ownNameOf({ tag, value, details: { type } } as unknown as DetailedFact);
    assert.equal(named("EVEN", "First flight"), "First flight");
    assert.equal(named("FACT", "", "Left-handed"), "Left-handed");
    assert.equal(named("OCCU", "Trade"), "");
});

test("of the reasons of a search those in the shown name are marked there", () => {
    const reason = (foundIn: SearchReason["foundIn"], written: string) =>
        ({ foundIn, written, word: "", fit: "whole", label: "", text: "" }) as SearchReason;
    const hit = { person: 1, reasons: [reason("name", "Ada"), reason("name", "Byron"), reason("place", "London")] };
    assert.deepEqual(wordsInName({ person: person(1, "Ada Lovelace"), hit }), ["Ada"]);
});

function pressed(key: string, inPicture: boolean, held: Partial<KeyboardEvent> = {}): string[] {
    const done: string[] = [];
    const note =
        (name: string) =>
        (...values: unknown[]) => {
            done.push([name, ...values].join(" "));
            return true;
        };
    const names = ["moveKeys", "panBy", "chooseActive", "nextBox", "home", "zoomIn", "zoomOut", "fit", "outer"];
    const actions = Object.fromEntries(names.map((name) => [name, note(name)])) as unknown as KeyActions;
    const event = { key, altKey: false, ctrlKey: false, metaKey: false, shiftKey: false, ...held } as KeyboardEvent;
    assert.equal(pictureKey(event, inPicture, actions), done.length > 0);
    return done;
}

test("arrows walk, with the shift key they move the picture", () => {
    assert.deepEqual(pressed("ArrowUp", true), ["moveKeys up"]);
    assert.deepEqual(pressed("ArrowLeft", true, { shiftKey: true }), ["panBy 90 0"]);
    assert.deepEqual(pressed("ArrowUp", false), []);
});

test("keys for the whole picture work beside it, those for one box only in it", () => {
    assert.deepEqual(pressed("+", false), ["zoomIn"]);
    assert.deepEqual(pressed("0", false), ["fit"]);
    assert.deepEqual(pressed("Enter", true), ["chooseActive"]);
    assert.deepEqual(pressed("Enter", false), []);
    assert.deepEqual(pressed("V", false), ["outer switchView"]);
});

test("the browser's own keys are left alone, but for the steps of the history", () => {
    assert.deepEqual(pressed("+", true, { ctrlKey: true }), []);
    assert.deepEqual(pressed("0", true, { metaKey: true }), []);
    assert.deepEqual(pressed("ArrowLeft", true, { altKey: true }), ["outer back"]);
    assert.deepEqual(pressed("ArrowRight", false, { altKey: true }), ["outer forward"]);
});
