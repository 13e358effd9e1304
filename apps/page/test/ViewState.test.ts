// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

import "./viewOptions";
import assert from "node:assert/strict";
import { test } from "node:test";
import {
    addressOf,
    clampDepth,
    clampGenerations,
    factHeight,
    factsIn,
    kUsualState,
    optionsOf,
    readAddress,
    sameState,
    unknownPersonIn,
    type ViewState,
    withFold,
    withNextParents,
} from "../src/view/ViewState";
import { person } from "./persons";

const persons = [
    person(1, "Ada", { xref: "I1", parentFamilies: [{ family: 3, pedigree: "birth" }] }),
    person(2, "Ben", { xref: "" }),
    person(3, "Cy", { xref: "i1" }),
    person(4, "Di", {
        xref: "I4",
        parentFamilies: [
            { family: 1, pedigree: "adopted" },
            { family: 2, pedigree: "birth" },
            { family: 5, pedigree: "foster" },
        ],
    }),
];

const usual: ViewState = { ...kUsualState, focus: 1 };

test("what has its usual value is left out of an address", () => {
    assert.equal(addressOf(usual, persons), "#person=I1");
    assert.equal(addressOf({ ...usual, focus: 2 }, persons), "#number=2");
});

test("an address leads back to the state that it was made of", () => {
    const states: ViewState[] = [
        { ...usual, view: "pedigree", generations: 7 },
        { ...usual, view: "hourglass", up: 0, down: 30, direction: "left", compact: true },
        { ...usual, mirrored: false },
        { ...usual, view: "near", mirrored: true, folded: [{ person: 2, branch: "beside" }] },
        { ...usual, view: "fan", up: 9 },
        { ...usual, view: "kinship", to: 4, direction: "right" },
        { ...usual, hidden: new Set(["cousins", "siblings"]), unknownParents: false, photos: true },
        { ...usual, show: new Set(["marriage", "dates"]), parentsOf: 4, parentFamily: 5 },
        { ...usual, focus: 3, view: "everybody", direction: "up" },
    ];
    for (const state of states) {
        const address = addressOf(state, persons);
        assert.ok(sameState(readAddress(address, persons, usual), state), address);
    }
});

test("folds of an address that name nobody or no branch are passed over", () => {
    const { folded } = readAddress("#view=near&fold=I1.up,I1.aside,nobody.down,2.down", persons, usual);
    assert.deepEqual(folded, [
        { person: 1, branch: "up" },
        { person: 2, branch: "down" },
    ]);
    const state = { ...usual, folded };
    assert.deepEqual(withFold(state, 2, "down"), [{ person: 1, branch: "up" }]);
    assert.deepEqual(withFold(state, 1, "down"), [...folded, { person: 1, branch: "down" }]);
});

test("what a view has no use for is not in its address", () => {
    const full = { ...usual, up: 9, down: 9, direction: "up", compact: true } as const;
    assert.equal(addressOf({ ...full, view: "family" }, persons), "#person=I1");
    assert.equal(addressOf({ ...full, view: "fan" }, persons), "#person=I1&view=fan&up=9");
    assert.equal(
        addressOf({ ...full, view: "everybody" }, persons),
        "#person=I1&view=everybody&direction=up&compact=yes",
    );
    assert.equal(
        addressOf({ ...full, view: "descendants" }, persons),
        "#person=I1&view=descendants&down=9&direction=up&compact=yes",
    );
});

test("what an address names wrongly is as usual, and without any part of ours it changes nothing", () => {
    const read = readAddress("#person=I4&view=tree&generations=99&up=x&direction=aside&show=hats", persons, usual);
    assert.deepEqual(read, { ...usual, focus: 4, generations: 10 });
    const other = { ...usual, view: "fan", up: 2 } as const;
    assert.equal(readAddress("#chapter-2", persons, other), other);
    assert.equal(readAddress("#view=kinship&to=nobody", persons, usual).view, "family");
    assert.deepEqual(readAddress("#parents=4.9", persons, usual), usual);
});

test("a person is named as the file names them, then in any letters, or by number", () => {
    const focusIn = (address: string) => readAddress(address, persons, { ...usual, focus: 2 }).focus;
    assert.equal(focusIn("#person=i1"), 3);
    assert.equal(focusIn("#person=I1"), 1);
    assert.equal(focusIn("#person=@i4@"), 4);
    assert.equal(focusIn("#number=3"), 3);
    assert.equal(focusIn("#number=2.5"), 2);
    assert.equal(focusIn("#person=I99"), 2);
});

test("the person whom a link names in vain is reported", () => {
    assert.equal(unknownPersonIn("#person=I99", persons), "I99");
    assert.equal(unknownPersonIn("#number=77", persons), "77");
    assert.equal(unknownPersonIn("#person=I1&to=X", persons), "X");
    assert.equal(unknownPersonIn("#person=I1&to=4", persons), "");
    assert.equal(unknownPersonIn("#view=fan", persons), "");
});

test("numbers of generations stay within what can be counted", () => {
    assert.deepEqual([0, 2.4, 5, 99, NaN].map(clampGenerations), [2, 2, 5, 10, 5]);
    assert.deepEqual(
        [-1, 0, 4.6, 99, NaN].map((depth) => clampDepth(depth, 3)),
        [0, 0, 5, 30, 3],
    );
});

test("facts are named in any order and kept in that of the switches", () => {
    assert.deepEqual([...factsIn("marriage, dates,hats")], ["dates", "marriage"]);
    assert.deepEqual([...factsIn("")], []);
});

test("boxes are higher by a line for each fact that they show, and wider apart for years of marriages", () => {
    assert.equal(factHeight(new Set(["dates", "places", "occupation", "marriage"])), 4 * 14);
    const plain = optionsOf(usual, "tall");
    const shown = optionsOf({ ...usual, show: new Set(["places", "marriage"]) }, "tall");
    assert.equal(shown.height! - plain.height!, 28);
    assert.equal(shown.gapX! - plain.gapX!, 12);
    assert.equal(optionsOf({ ...usual, photos: true }, "tall").height! - plain.height!, 32);
});

test("boxes have the form that the module names", () => {
    const isWide = (view: ViewState["view"], boxes: "tall" | "wide") => {
        const { width, height } = optionsOf({ ...usual, view }, boxes);
        return width! > 3 * height!;
    };
    assert.ok(isWide("pedigree", "wide") && isWide("descendants", "wide"));
    assert.ok(!isWide("descendants", "tall") && !isWide("family", "tall"));
});

test("a group of relatives that is switched off is a bit that is not set", () => {
    assert.equal(optionsOf(usual, "tall").shown, 0xff);
    assert.equal(
        optionsOf({ ...usual, hidden: new Set(["cousins", "grandchildren"]) }, "tall").shown,
        0xff & ~0x02 & ~0x20,
    );
});

test("several families of parents follow one another, beginning after the usual one", () => {
    const di = persons[3]!;
    const first = withNextParents(di, 2, usual);
    assert.deepEqual(first, { focus: 4, parentsOf: 4, parentFamily: 5 });
    const second = withNextParents(di, 2, { ...usual, ...first });
    assert.equal(second.parentFamily, 1);
    assert.equal(withNextParents(di, 2, { ...usual, ...second }).parentFamily, 2);
});

test("states are the same when all that they say is", () => {
    assert.ok(sameState(usual, { ...usual, hidden: new Set() }));
    assert.ok(!sameState(usual, { ...usual, hidden: new Set(["cousins"]) }));
    assert.ok(!sameState({ ...usual, show: new Set(["dates"]) }, { ...usual, show: new Set(["places"]) }));
    for (const change of [{ up: 1 }, { to: 2 }, { compact: true }, { photos: true }, { direction: "up" }] as const)
        assert.ok(!sameState(usual, { ...usual, ...change }));
});
