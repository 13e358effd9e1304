// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

import "./viewOptions";
import assert from "node:assert/strict";
import { test } from "node:test";
import { linkOf, looksIn, type SharedLooks } from "../src/view/SharedLink";
import { kUsualState, readAddress } from "../src/view/ViewState";
import { person } from "./persons";

const persons = [person(1, "Ada"), person(2, "Ben", { xref: "" }), person(3, "Cy & Co", { xref: "I&3" })];
const state = { ...kUsualState, focus: 1 };
const looks: SharedLooks = {
    selected: 3,
    sight: { zoom: 0.8504, x: -120.4, y: 36.6 },
    language: "de",
    theme: "dark",
    kinship: false,
};

test("a link says what is seen, and reads back as it was made", () => {
    const link = linkOf(state, looks, persons);
    assert.equal(link, "#person=I1&selected=I%263&sight=0.850,-120,37&kinship=no&language=de&theme=dark");
    assert.deepEqual(looksIn(link, persons), { ...looks, sight: { zoom: 0.85, x: -120, y: 37 } });
});

test("a person without an identifier is named by number", () => {
    const link = linkOf({ ...state, to: 2 }, { ...looks, selected: 2 }, persons);
    assert.match(link, /[#&]to=2&selected=2&/);
    assert.equal(looksIn(link, persons).selected, 2);
    assert.equal(readAddress(link, persons, state).to, 2);
});

test("who is in focus needs no word of being selected", () => {
    const link = linkOf(state, { ...looks, selected: 1, sight: null, kinship: true }, persons);
    assert.equal(link, "#person=I1&language=de&theme=dark");
});

test("what a link says wrongly is left out", () => {
    assert.deepEqual(looksIn("#selected=X&sight=0,1,2&kinship=yes", persons), {});
    assert.deepEqual(looksIn("#sight=1,2", persons), {});
    assert.deepEqual(looksIn("#sight=1,2,Infinity", persons), {});
});
