// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

import assert from "node:assert/strict";
import { test } from "node:test";

import { olvane } from "./module.mjs";

const kOdd = `0 HEAD
1 CHAR UTF-8
0 @I1@ INDI
1 NAME Ada /Lund/
1 FAMC @F9@
1 BIRT
2 DATE 1850
1 DEAT
2 DATE 1840
0 TRLR
`;
const file = olvane.readGedcom(new TextEncoder().encode(kOdd), "odd.ged");

test("a diagnostic is data, and has words in each language", () => {
    const [diagnostic] = file.diagnostics;
    assert.deepEqual(diagnostic, {
        line: 5,
        severity: "error",
        kind: "danglingPointer",
        what: { sentence: "noSuchRecord", arguments: [] },
        done: [{ sentence: "leftOut", arguments: [] }],
        quoted: "F9",
    });
    assert.deepEqual(olvane.diagnosticWords(diagnostic), { text: "a pointer to no record (F9)", hint: "left out" });
    assert.deepEqual(olvane.diagnosticWords(diagnostic, "es"), {
        text: "una referencia a ningún registro (F9)",
        hint: "se ha omitido",
    });
    const jump = { what: { sentence: "jumpingLevel", arguments: ["1", "4"] }, done: [], quoted: "" };
    assert.deepEqual(olvane.diagnosticWords(jump, "de"), { text: "die Ebene springt von 1 auf 4", hint: "" });
    assert.deepEqual(olvane.diagnosticWords({ what: { sentence: "x" } }), { text: "", hint: "" });
});

test("remarks are those of the file, then those of its data with their persons", () => {
    assert.deepEqual(
        file.remarks().map(({ kind, severity, line, persons, text }) => [kind, severity, line, persons, text]),
        [
            ["danglingPointer", "error", 5, [], "a pointer to no record (F9)"],
            ["diedBeforeBirth", "odd", 3, [1], "Ada Lund died before being born"],
        ],
    );
    assert.equal(file.remarks("de")[1].text, "Ada Lund starb vor der Geburt");
});
