// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The module in WebAssembly and the command, which other compilers made, give the same picture of every view, number by
// number: of the bundled family, and of a larger one where OLVANE_GEDCOM_DIR names a folder of real files.

import assert from "node:assert/strict";
import { execFileSync } from "node:child_process";
import { existsSync, readFileSync } from "node:fs";
import test from "node:test";

import { PICTURE_VIEWS } from "../../bindings/javascript/olvane.mjs";
import { olvane } from "./module.mjs";

const command = process.env.OLVANE_COMMAND;

// As the command writes them: to thousandths, halves away from zero, without a negative zero.
const rounded = (number) => (Math.sign(number) * Math.round(Math.abs(number) * 1000)) / 1000 + 0;

function boxOf(box, arc) {
    const { id, kind, repeat, hidden } = box;
    const place = arc
        ? { ring: arc.ring, from: rounded(arc.from), to: rounded(arc.to) }
        : { x: rounded(box.x), y: rounded(box.y), width: rounded(box.width), height: rounded(box.height) };
    return { id, kind, ...place, ...(kind === "person" ? { repeat, hidden } : {}) };
}

const lineOf = ({ role, x1, y1, x2, y2, child, bridges }) => ({
    ...{ role, x1: rounded(x1), y1: rounded(y1), x2: rounded(x2), y2: rounded(y2), child },
    bridges: bridges.map(rounded),
});

const familyOf = ({ parents, children, childKinds, style, lines }) => ({
    ...{ parents, children, childKinds, style },
    lines: lines.map(lineOf),
});

const wayOf = ({ kind, boxes, ancestors, words, lines }) => ({
    ...{ kind, boxes, ancestors, words },
    lines: lines.map((line) => (Array.isArray(line) ? line : [line.x1, line.y1, line.x2, line.y2]).map(rounded)),
});

function ofModule(picture) {
    return {
        boxes: picture.boxes.map((box, i) => boxOf(box, picture.arcs[i])),
        families: picture.families.map(familyOf),
        marks: picture.marks.map(({ kind, boxes, number }) => ({ kind, boxes, number })),
        ways: (picture.kinship?.ways ?? []).map(wayOf),
    };
}

function ofCommand(picture) {
    return {
        boxes: picture.boxes.map((box) => boxOf(box, "ring" in box ? box : undefined)),
        families: picture.families.map(familyOf),
        marks: picture.marks.map(({ kind, boxes, number }) => ({ kind, boxes, number })),
        ways: (picture.ways ?? []).map(wayOf),
    };
}

function compare(path, focuses, other, views) {
    const file = olvane.readGedcom(readFileSync(path), "family.ged");
    for (const view of views) {
        for (const focus of focuses) {
            const words = [
                "layout",
                path,
                "--focus",
                String(focus),
                "--view",
                view,
                "--format",
                "json",
                "--boxes",
                "tall",
            ];
            if (view === "kinship") words.push("--to", String(other));
            const text = execFileSync(command, words, { encoding: "utf8", maxBuffer: 2 ** 28 });
            const picture = file.picture(focus, { view, to: view === "kinship" ? other : undefined });
            assert.deepEqual(ofModule(picture), ofCommand(JSON.parse(text)), `${view} of ${focus}`);
        }
    }
}

test(
    "every view of the bundled family is the same in WebAssembly and natively",
    { skip: !command && "no command" },
    () => {
        compare(
            new URL("../../samples/darwin-wedgwood.ged", import.meta.url).pathname,
            [1, 2, 17, 60],
            30,
            PICTURE_VIEWS,
        );
    },
);

const royals = `${process.env.OLVANE_GEDCOM_DIR}/history/royal92.ged`;
const reason = !command
    ? "no command"
    : !existsSync(royals) && "OLVANE_GEDCOM_DIR is not set, or has no history/royal92.ged";
test("every view of a large family is the same in WebAssembly and natively", { skip: reason }, () => {
    // Everybody is the same persons for nearly any focus, and takes the longest.
    const others = PICTURE_VIEWS.filter((view) => view !== "everybody");
    compare(royals, [1, 52, 700], 57, others);
    compare(royals, [1], 57, ["everybody"]);
});
