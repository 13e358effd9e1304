// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Pictures of a GEDCOM file in JavaScript: boxes, families and their lines as values.

import assert from "node:assert/strict";
import test from "node:test";

import { HostError, LayoutError, PERSON_NOT_FOUND, PICTURE_VIEWS } from "../../bindings/javascript/olvane.mjs";
import { olvane } from "./module.mjs";

// A couple with a child of their own and an adopted one; the husband's parents are divorced.
const family = `0 HEAD
1 GEDC
2 VERS 5.5.1
1 CHAR UTF-8
0 @I1@ INDI
1 SEX M
1 FAMC @F2@
1 FAMS @F1@
0 @I2@ INDI
1 SEX F
1 FAMS @F1@
0 @I3@ INDI
1 FAMC @F1@
0 @I4@ INDI
1 FAMC @F1@
2 PEDI adopted
0 @I5@ INDI
1 SEX M
1 FAMS @F2@
0 @I6@ INDI
1 SEX F
1 FAMS @F2@
0 @F1@ FAM
1 HUSB @I1@
1 WIFE @I2@
1 CHIL @I3@
1 CHIL @I4@
1 MARR
0 @F2@ FAM
1 HUSB @I5@
1 WIFE @I6@
1 CHIL @I1@
1 DIV Y
0 TRLR`;

const file = olvane.readGedcom(new TextEncoder().encode(family), "family.ged");
const idsOf = (picture, places) => places.map((place) => picture.boxes[place].id);

test("a picture says who belongs to which family, and how", () => {
    const picture = file.picture(1);
    assert.equal(picture.view, "family");
    assert.equal(picture.boxes[picture.focus].id, 1);
    const own = picture.families.find(({ number }) => number === 1);
    assert.deepEqual(idsOf(picture, own.parents), [1, 2]);
    assert.deepEqual(idsOf(picture, own.children), [3, 4]);
    assert.deepEqual(own.childKinds, ["birth", "adopted"]);
    assert.equal(own.style, "married");
    const parents = picture.families.find(({ number }) => number === 2);
    assert.equal(parents.style, "divorced");
    assert.deepEqual(new Set(own.lines.map(({ role }) => role)), new Set(["marriage", "drop", "bar", "stem"]));
    assert.deepEqual(
        own.lines
            .filter(({ role }) => role === "stem")
            .map(({ child }) => picture.boxes[child].id)
            .sort(),
        [3, 4],
    );
});

test("the boxes of the engine's views stand where its layout has them", () => {
    for (const view of ["family", "pedigree"]) {
        const records = file.layout(1, { view });
        const boxes = file.picture(1, { view, width: 55, height: 80, gapX: 25, gapY: 30 }).boxes;
        assert.deepEqual(
            boxes.map(({ x, y }) => [x, y]),
            records.map(({ x, y }) => [x, y]),
        );
        const flags = records.map(({ id, hasHiddenRelatives }) => (id > 0 ? hasHiddenRelatives : null));
        assert.deepEqual(
            boxes.map(({ flag }) => flag),
            flags,
        );
    }
});

test("a box of an unknown parent names its child, and can be left out", () => {
    const withThem = file.picture(5, { view: "pedigree", generations: 2 });
    const unknown = withThem.boxes.filter(({ kind }) => kind === "unknownParent");
    const without = file.picture(5, { view: "pedigree", generations: 2, unknownParents: false });
    assert.equal(without.boxes.length, withThem.boxes.length - unknown.length);
    for (const { childOf, id } of unknown) assert.deepEqual([withThem.boxes[childOf].id, id], [5, 0]);
});

test("a chart shows everybody of its kind once, and counts who is hidden", () => {
    const { boxes } = file.picture(5, { view: "descendants", spouses: false, down: 1 });
    assert.deepEqual(boxes.map(({ id }) => id).sort(), [1, 5]);
    const [focus] = boxes.filter(({ id }) => id === 5);
    assert.deepEqual(focus.hidden, { parents: 0, partners: 1, children: 0 });
});

// From the box of the focus.
function placesOf({ boxes }) {
    const { x: left, y: top } = boxes.find(({ id }) => id === 1);
    return new Map(boxes.map(({ id, x, y }) => [id, `${x - left} ${y - top}`]));
}

test("a family has a place for the year of its marriage, where one is asked for", () => {
    const labelled = file.picture(1, { labelSize: 5 }).families;
    const marriageOf = ({ lines }) => lines.filter(({ role }) => role === "marriage");
    assert.ok(labelled.some(({ label }) => label !== null));
    for (const family of labelled) {
        const on = marriageOf(family).filter(({ x1, y1, x2, y2 }) => {
            const { x, y } = family.label;
            return x >= Math.min(x1, x2) && x <= Math.max(x1, x2) && y >= Math.min(y1, y2) && y <= Math.max(y1, y2);
        });
        assert.equal(on.length > 0, marriageOf(family).length > 0);
    }
    for (const { label } of labelled) {
        if (label === null) continue;
        assert.equal(label.side, "above");
        assert.deepEqual([label.textX, label.textY], [label.x, label.y - 2]);
    }
    for (const { label } of file.picture(1).families) assert.equal(label, null);
    for (const { label } of file.picture(1, { view: "fan", labelSize: 5 }).families) assert.equal(label, null);
    assert.throws(() => file.picture(1, { labelSize: -1 }), RangeError);
});

test("what a screen draws of lines is there where it is asked for, with its styles in words", () => {
    assert.equal(file.picture(1).art, null);
    const picture = file.picture(1, { paths: true, language: "de" });
    const { styles, lines, cells } = picture.art;
    assert.deepEqual(
        styles.map(({ name }) => name),
        ["plain", "divorced", "adopted"],
    );
    assert.deepEqual(
        styles.map(({ dashes, meaning }) => [dashes !== "", meaning]),
        [
            [false, ""],
            [true, "geschieden"],
            [true, "adoptiert"],
        ],
    );
    assert.equal(lines.length, picture.families.length);
    picture.families.forEach((family, i) => {
        const names = lines[i].map(({ style }) => style.name);
        const ofChildren = family.childKinds.includes("adopted") ? ["adopted"] : [];
        assert.deepEqual(names, ["plain", ...(family.style === "divorced" ? ["divorced"] : ofChildren)]);
        // Each piece once, where no line crosses another.
        const pieces = lines[i].flatMap(({ data }) => data.match(/M[^M]+/g));
        assert.equal(pieces.length, family.lines.length);
        const [marriage] = family.lines.filter(({ role }) => role === "marriage");
        const [left, right] = [marriage.x1, marriage.x2].sort((a, b) => a - b);
        assert.ok(pieces.includes(`M${left} ${marriage.y1}H${right}`), pieces.join(" "));
    });
    assert.deepEqual(cells, []);
    assert.throws(() => file.picture(1, { paths: 1 }), TypeError);
});

test("a fan's cells have their outlines and colours, and a place for each line of text", () => {
    const { art, arcs, rings } = file.picture(3, { view: "fan", paths: true });
    const [middleX, middleY] = [rings.middleX, rings.middleY].map((value) => Math.round(10 * value) / 10);
    assert.equal(art.cells.length, arcs.length);
    arcs.forEach(({ ring, from, to, line }, i) => {
        const { colour, outline } = art.cells[i];
        assert.equal(colour === null, line === null && !arcs.some((other) => other.line === i));
        const radius = rings.radii[ring + 1];
        assert.ok(outline.includes(`A${radius} ${radius} 0 `), outline);
        if (from !== 0 || to - from >= 360) return;
        assert.ok(outline.startsWith(`M${middleX} ${middleY - radius}A`), outline);
    });
    const cell = { from: -45, to: 45, inner: 100, outer: 160, isCentre: false };
    const lines = olvane.texts.placeInCell({ given: "Anna", surname: "Berg" }, ["* 1800"], cell);
    assert.deepEqual(
        lines.map(({ text, isName }) => [text, isName]),
        [
            ["Anna", true],
            ["Berg", true],
            ["* 1800", false],
        ],
    );
    for (const { x, y, turn, size, baseline } of lines) {
        assert.ok(x === 0 && y < -100 && y > -160 && turn === 0, `${x} ${y} ${turn}`);
        assert.ok(baseline > 0.3 * size && baseline < 0.4 * size);
    }
    assert.deepEqual(olvane.texts.placeInCell({ given: "Anna", surname: "" }, [], { ...cell, to: -44.5 }), []);
});

test("the usual boxes are wide in the pedigree and where a chart lies sideways", () => {
    assert.equal(file.usualBoxes(), "tall");
    for (const direction of ["left", "right", "up", "down"]) {
        const sideways = direction === "left" || direction === "right" ? "wide" : "tall";
        for (const view of PICTURE_VIEWS) {
            const usual = { family: "tall", fan: "tall", pedigree: "wide" }[view] ?? sideways;
            assert.equal(file.usualBoxes(view, direction), usual, `${view} ${direction}`);
        }
    }
    assert.throws(() => file.usualBoxes("tower"), /takes one of family/);
    assert.equal(file.laterSide(), "bottom");
    assert.equal(file.laterSide("pedigree", "up"), "left");
    assert.equal(file.laterSide("pedigree", "down", true), "right");
    assert.equal(file.laterSide("ancestors", "up"), "top");
    assert.throws(() => file.laterSide("near", "down", 1), /mirrored is 1, and takes true or false/);
    assert.throws(() => file.usualBoxes("near", "north"), /takes one of down/);
});

test("everybody keeps the places of the picture before, where that is asked for", () => {
    const larger = family
        .replace("1 CHIL @I4@\n", "1 CHIL @I7@\n1 CHIL @I4@\n")
        .replace("0 @F1@ FAM", "0 @I7@ INDI\n1 FAMC @F1@\n0 @F1@ FAM");
    const grown = olvane.readGedcom(new TextEncoder().encode(larger), "larger.ged");
    const options = { view: "everybody", keepPlaces: true };
    assert.equal(grown.takePlacesOf(file), false);
    const before = placesOf(file.picture(1, options));
    assert.equal(grown.takePlacesOf(file), true);
    const after = placesOf(grown.picture(1, options));
    assert.equal(after.size, 7);
    const moved = (places) => [...before].filter(([id, place]) => places.get(id) !== place).length;
    // Its siblings make room for the new child; without places kept, their grandparents move as well.
    assert.equal(moved(after), 2);
    assert.equal(moved(placesOf(grown.picture(1, { view: "everybody" }))), 4);
    assert.throws(() => file.picture(1, { view: "everybody", aspect: Number.NaN }), RangeError);
});

test("persons of a later version of a file keep their places by xref, whatever their numbers", () => {
    const first = family
        .replace("1 CHIL @I4@\n", "1 CHIL @I7@\n1 CHIL @I4@\n")
        .replace("0 @I1@ INDI", "0 @I7@ INDI\n1 FAMC @F1@\n0 @I1@ INDI");
    const grown = olvane.readGedcom(new TextEncoder().encode(first), "larger.ged");
    assert.deepEqual([grown.persons[0].xref, grown.persons[1].xref], ["I7", "I1"]);
    const options = { view: "everybody", keepPlaces: true };
    const before = file.picture(1, options).boxes;
    grown.takePlacesOf(file);
    const { boxes } = grown.picture(2, options);
    const relative = (box, focus) => `${box.x - focus.x} ${box.y - focus.y}`;
    const moved = before.filter((box, i) => relative(box, before[0]) !== relative(boxes[i + 1], boxes[1]));
    assert.equal(moved.length, 2);
});

test("boxes have sizes of their own", () => {
    const boxSizes = [
        { person: 1, width: 120, height: 40.5 },
        { person: 99, width: 7, height: 7 },
    ];
    for (const view of ["near", "ancestors", "descendants", "hourglass", "relatives", "everybody"]) {
        for (const { id, width, height } of file.picture(1, { view, boxSizes }).boxes) {
            assert.deepEqual([width, height], id === 1 ? [120, 40.5] : [55, 80]);
        }
    }
    for (const size of [
        { width: -1, height: 4 },
        { width: 4, height: NaN },
        { width: 2e6, height: 4 },
    ]) {
        assert.throws(() => file.picture(1, { view: "near", boxSizes: [{ person: 1, ...size }] }), RangeError);
    }
    assert.throws(() => file.picture(1, { view: "near", boxSizes: [{ person: 1, width: "4", height: 4 }] }), TypeError);
});

test("branches are counted, left out and counted again", () => {
    const options = { view: "descendants" };
    const sizesOf = (sizes) => sizes.map(({ branch, count, side }) => `${branch} ${count} ${side}`);
    const whole = file.picture(5, options);
    assert.deepEqual(whole.folded, []);
    assert.deepEqual(sizesOf(file.branches(5, 1, options)), ["up 0 top", "down 2 bottom", "beside 1 right"]);
    const folded = [{ person: 1, branch: "down" }];
    const picture = file.picture(5, { ...options, folded });
    assert.deepEqual(picture.boxes.map(({ id }) => id).sort(), [1, 2, 5, 6]);
    const box = picture.boxes.find(({ id }) => id === 1).index;
    assert.deepEqual(picture.folded, [{ box, count: 2, branch: "down", side: "bottom" }]);
    assert.deepEqual(sizesOf(file.branches(5, 1, { ...options, folded, mirrored: true })), [
        "up 0 top",
        "down 2 bottom",
        "beside 1 left",
    ]);
    assert.throws(() => file.picture(5, { ...options, folded: [{ person: 1, branch: "aside" }] }), TypeError);
    assert.throws(() => file.branches(5, 7, options), RangeError);
});

test("a mirrored picture has right and left exchanged", () => {
    for (const view of ["family", "pedigree", "descendants", "fan", "everybody"]) {
        const [plain, mirrored] = [false, true].map((on) => file.picture(5, { view, mirrored: on }));
        const middles = ({ boxes }) => boxes.map(({ x, width }) => x + width / 2);
        const axis = middles(plain)[0] + middles(mirrored)[0];
        for (const [i, x] of middles(plain).entries())
            assert.ok(Math.abs(x + middles(mirrored)[i] - axis) < 1e-6, view);
    }
});

test("what cannot be asked for is refused by its name", () => {
    assert.throws(() => file.picture(1, { view: "tree" }), /view is "tree", and takes one of family, pedigree/);
    assert.throws(() => file.picture(1, { depth: 3 }), /there is no option depth/);
    assert.throws(() => file.picture(1, { generations: 0 }), RangeError);
    assert.throws(() => file.picture(1, { spouses: 1 }), /takes true or false/);
    assert.throws(() => file.picture(7), LayoutError);
});

test("a picture of kinship has the line of each way, and words at both ends", () => {
    const { kinship, boxes, focus } = file.picture(3, { view: "kinship", to: 5 });
    assert.equal(boxes[kinship.other].id, 5);
    assert.deepEqual([kinship.focusIs, kinship.otherIs], ["grandchild", "grandfather (father's father)"]);
    const [way] = kinship.ways;
    assert.deepEqual([way.kind, way.words], ["blood", "grandfather (father's father)"]);
    assert.deepEqual(
        way.boxes.map((box) => boxes[box].id),
        [3, 1, 5],
    );
    assert.equal(way.boxes[0], focus);
    assert.deepEqual(
        way.ancestors.map((box) => boxes[box].id),
        [5],
    );
    assert.ok(way.lines.length > 0);
    for (const { x1, y1, x2, y2 } of way.lines) assert.ok((x1 === x2) !== (y1 === y2));
    const german = file.picture(3, { view: "kinship", to: 5, language: "de" }).kinship;
    assert.equal(german.focusIs, "Enkelkind");
    assert.equal(file.picture(3).kinship, null);
});

// Person 1 is a child of family 1 by birth, and of family 2 by adoption.
const adopted = olvane.readGedcom(
    new TextEncoder().encode(
        "0 HEAD\n1 CHAR UTF-8\n0 @I1@ INDI\n1 FAMC @F1@\n1 FAMC @F2@\n2 PEDI adopted\n" +
            "0 @I2@ INDI\n1 SEX M\n1 FAMS @F1@\n0 @I3@ INDI\n1 SEX M\n1 FAMS @F2@\n" +
            "0 @F1@ FAM\n1 HUSB @I2@\n1 CHIL @I1@\n0 @F2@ FAM\n1 HUSB @I3@\n1 CHIL @I1@\n0 TRLR",
    ),
    "adopted.ged",
);

test("whose parents come first is a choice, and who has further ones is marked", () => {
    const shown = (options) => idsShown(adopted.picture(1, options));
    const idsShown = ({ boxes }) =>
        boxes
            .filter(({ id }) => id > 0)
            .map(({ id }) => id)
            .sort();
    assert.deepEqual(shown({}), [1, 2]);
    assert.deepEqual(shown({ parents: "adoptive" }), [1, 3]);
    assert.deepEqual(shown({ parentsOf: 1, parentFamily: 2 }), [1, 3]);
    assert.deepEqual(shown({ parents: "adoptive", parentsOf: 1, parentFamily: 1 }), [1, 2]);
    assert.deepEqual(shown({}), [1, 2]);
    assert.equal(adopted.picture(1).boxes[0].furtherParents, 1);
    assert.equal(adopted.picture(1, { view: "ancestors" }).boxes[0].furtherParents, 0);
});

// Persons 1 and 2 have the children 3 and 5; 3 and 4 have 7.
const parents = { 3: [1, 2], 5: [1, 2], 7: [3, 4] };
const couples = [
    [1, 2, [3, 5]],
    [3, 4, [7]],
];
const personIds = [1, 2, 3, 4, 5, 7];
const families = (id) => couples.filter(([one, other]) => one === id || other === id);
const host = {
    fatherOf: (id) => parents[id]?.[0] ?? PERSON_NOT_FOUND,
    motherOf: (id) => parents[id]?.[1] ?? PERSON_NOT_FOUND,
    spousesOf: (id) => families(id).map(([one, other]) => (one === id ? other : one)),
    childrenOf: (id) => families(id).flatMap(([, , children]) => children),
    isPreferredSpouse: () => true,
    isDead: () => false,
    dateOf: () => "",
    sexOf: (id) => (id % 2 === 0 ? 1 : 0),
};
const table = olvane.family({
    persons: personIds.map((id) => ({
        id,
        father: parents[id]?.[0],
        mother: parents[id]?.[1],
        sex: id % 2 === 0 ? "female" : "male",
    })),
    spouses: couples.flatMap(([one, other]) => [
        { person: one, spouse: other },
        { person: other, spouse: one },
    ]),
    children: couples.flatMap(([one, other, children]) =>
        [one, other].flatMap((parent) => children.map((child) => ({ parent, child }))),
    ),
});
const shownIds = ({ boxes }) =>
    boxes
        .map(({ id }) => id)
        .filter((id) => id > 0)
        .sort();

test("every view is drawn of a family that is handed over, and of a host that is asked", () => {
    for (const view of PICTURE_VIEWS) {
        const options = { view, to: 5 };
        const ofTable = olvane.picture(table, 7, options);
        const ofHost = olvane.picture(host, 7, options);
        assert.equal(ofTable.boxes[ofTable.focus].id, 7, view);
        assert.deepEqual(shownIds(ofTable), shownIds(ofHost), view);
        assert.ok(shownIds(ofTable).length >= (view === "descendants" ? 1 : 3), view);
    }
    assert.equal(table.picture(7, { view: "kinship", to: 5 }).kinship.otherIs, "uncle (father's brother)");
    assert.throws(
        () => table.picture(9, { view: "fan" }),
        (error) => error instanceof LayoutError && error.status === "invalidPerson",
    );
});

test("a failure of a host names the question and the person, in every view", () => {
    const failing = { ...host, childrenOf: (id) => (id === 3 ? assert.fail("no such page") : host.childrenOf(id)) };
    for (const view of ["family", "near", "hourglass", "relatives", "everybody"]) {
        assert.throws(
            () => olvane.picture(failing, 7, { view }),
            (error) =>
                error instanceof HostError &&
                error.status === "hostFailed" &&
                /childrenOf\(3\): .*no such page/.test(error.message),
            view,
        );
    }
    assert.equal(olvane.picture(host, 7, { view: "near" }).boxes.length > 0, true);
});
