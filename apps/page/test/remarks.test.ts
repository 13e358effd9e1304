// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

import assert from "node:assert/strict";
import { describe, test } from "node:test";
import { translatorOf } from "../src/messages/remarks";
import { germanRemarks } from "../src/messages/remarks.de";

const inGerman = translatorOf(germanRemarks);

describe("remarks of the reader", () => {
    test("a sentence is said in the other language, and what it quotes stays", () => {
        assert.equal(inGerman("left out"), "weggelassen");
        assert.equal(inGerman("a pointer to no record (I9)"), "ein Verweis, zu dem es keinen Datensatz gibt (I9)");
        assert.equal(inGerman("a date that cannot be read (left out (1))"), "ein Datum, das sich nicht lesen lässt (left out (1))");
    });

    test("numbers find their places", () => {
        assert.equal(inGerman("level jumps from 1 to 4"), "die Ebene springt von 1 auf 4");
        assert.equal(inGerman("read as level 2"), "gelesen als Ebene 2");
        assert.equal(inGerman("read as windows-1252"), "gelesen als windows-1252");
        assert.equal(
            inGerman("read as windows-1252; it looks like windows-1251: choose that encoding"),
            "gelesen als windows-1252; er sieht nach windows-1251 aus: wählen Sie diese Zeichenkodierung",
        );
        assert.equal(inGerman("3 bytes that are no character in UTF-8 (Ren?)"), "3 Bytes, die in UTF-8 kein Zeichen sind (Ren?)");
    });

    test("a kind that is only counted is named in the other language, too", () => {
        assert.equal(inGerman("12 more of: unreadable date"), "12 weitere dieser Art: unlesbares Datum");
        assert.equal(inGerman("empty line, the first of 7"), "leere Zeile, die erste von 7");
    });

    test("a file that is refused keeps its name, whatever that is", () => {
        assert.equal(inGerman("a (1).ged: is empty"), "a (1).ged: ist leer");
        assert.equal(inGerman("$&{}.ged: is empty"), "$&{}.ged: ist leer");
    });

    test("a sentence that is not in the table stays", () => {
        assert.equal(inGerman("constructor"), "constructor");
        assert.equal(inGerman("something new (here)"), "something new (here)");
        assert.equal(inGerman(""), "");
    });

    test("each answer has as many places as its sentence", () => {
        const places = (text: string) => text.split("{}").length;
        for (const [sentence, answer] of Object.entries(germanRemarks)) assert.equal(places(answer), places(sentence), sentence);
    });
});
