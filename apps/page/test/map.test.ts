// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The reader of maps, over maps that the C++ library wrote and whatever becomes of them on their way.

import assert from "node:assert/strict";
import { readdirSync, readFileSync } from "node:fs";
import { join } from "node:path";
import { test } from "node:test";
import { FamilyMap } from "../src/map/FamilyMap";
import { MapError } from "../src/map/mapBytes";
import { MapSearch } from "../src/map/mapSearch";

const folder = process.env["OLVANE_MAPS"] ?? "";
const skip = folder === "" ? "OLVANE_MAPS is not set" : false;

function bytesOf(name: string): Uint8Array<ArrayBuffer> {
    return new Uint8Array(readFileSync(join(folder, name)));
}

function withChecksum(bytes: Uint8Array<ArrayBuffer>): Uint8Array<ArrayBuffer> {
    const view = new DataView(bytes.buffer);
    let sum = 2166136261;
    for (let at = 20; at + 4 <= bytes.length; at += 4) sum = Math.imul(sum ^ view.getUint32(at, true), 16777619);
    view.setUint32(16, sum >>> 0, true);
    return bytes;
}

// What a page asks of a map, of everybody.
function walk(map: FamilyMap): void {
    for (let person = 0; person < map.count; ++person) {
        assert.equal(map.person(map.number(person)), person);
        const { left, top, right, bottom } = map.box(person);
        assert.ok(left <= right && top <= bottom);
        for (const others of Object.values(map.kin(person)) as number[][])
            for (const other of others) assert.ok(other >= 0 && other < map.count && other !== person);
        map.name(person);
        map.marks(person);
    }
}

function refusal(bytes: Uint8Array<ArrayBuffer>): MapError | null {
    try {
        walk(new FamilyMap(bytes));
        return null;
    } catch (error) {
        if (error instanceof MapError) return error;
        throw error;
    }
}

test("maps of the library are read, and each person is found at the middle of their box", { skip }, () => {
    for (const name of readdirSync(folder)) {
        if (name === "ends-early") continue;
        const map = new FamilyMap(bytesOf(name));
        walk(map);
        for (let person = 0; person < map.count; ++person) {
            const { left, top, right, bottom } = map.box(person);
            assert.equal(map.personAt((left + right) / 2, (top + bottom) / 2), person);
            assert.notEqual(map.personAt(left - 1, top), person);
            assert.notEqual(map.personAt(left, top - 1), person);
        }
    }
});

test("parents have their children, and partners one another", { skip }, () => {
    const map = new FamilyMap(bytesOf("generations"));
    let links = 0;
    for (let person = 0; person < map.count; ++person) {
        const { parents, partners, siblings } = map.kin(person);
        for (const parent of parents) assert.ok(map.kin(parent).children.includes(person));
        for (const partner of partners) assert.ok(map.kin(partner).partners.includes(person));
        for (const sibling of siblings) assert.ok(map.kin(sibling).siblings.includes(person));
        links += parents.length;
    }
    assert.ok(links > 10, String(links));
});

test("a map that ends early says how much of it there is", { skip }, () => {
    const whole = bytesOf("family");
    for (let size = 28; size < whole.length; ++size) {
        const error = refusal(whole.slice(0, size));
        assert.deepEqual([error?.kind, error?.have, error?.wanted], ["cut", size, whole.length]);
    }
    for (let size = 0; size < 28; ++size) assert.equal(refusal(whole.slice(0, size))?.kind, "noMap");
});

test("a map of which any byte was changed is refused", { skip }, () => {
    const whole = bytesOf("generations");
    for (let at = 0; at < whole.length; ++at) {
        const changed = whole.slice();
        changed[at]! ^= 0x21;
        assert.notEqual(refusal(changed), null, `byte ${at}`);
    }
});

test("wrong numbers behind a right checksum are refused, or harm nobody", { skip }, () => {
    const counts = { refused: 0, read: 0 };
    for (const name of ["family", "generations", "contradictions", "one-person"]) {
        const whole = bytesOf(name);
        for (let at = 20; at + 4 <= whole.length; at += 4) {
            for (const word of [0, 1, 11, 12, 0x7fffffff, 0x80000000, 0xffffffff]) {
                const changed = whole.slice();
                new DataView(changed.buffer).setUint32(at, word, true);
                if (refusal(withChecksum(changed))) ++counts.refused;
                else ++counts.read;
            }
        }
    }
    assert.ok(counts.refused > 1000 && counts.read > 1000, JSON.stringify(counts));
});

test(
    "a mirrored map has everybody where a mirror shows them, with the same kin, and mirrored twice it is as it was",
    { skip },
    () => {
        const keyed = (map: FamilyMap, person: number) => {
            const numbers = (list: readonly number[]) => list.map((one) => map.number(one)).sort((a, b) => a - b);
            const { parents, partners, children, siblings } = map.kin(person);
            return [
                ...[map.name(person), map.sex(person), map.birth(person), map.death(person)],
                ...[parents, partners, children, siblings].map(numbers),
                map.marks(person).sort((a, b) => a - b),
            ];
        };
        const linesIn = ({ arrays }: FamilyMap, sign: number) => {
            const bars = Array.from(arrays.bars.low, (low, i) =>
                [sign * low, sign * arrays.bars.high[i]!]
                    .sort((a, b) => a - b)
                    .concat(arrays.bars.at[i]!, arrays.bars.roles[i]!),
            );
            const uprights = Array.from(arrays.uprights.low, (low, i) => [
                ...[sign * arrays.uprights.at[i]!, low, arrays.uprights.high[i]!, arrays.uprights.roles[i]!],
            ]);
            return [...bars, ...uprights].map(String).sort();
        };
        for (const name of readdirSync(folder)) {
            if (name === "ends-early") continue;
            const map = new FamilyMap(bytesOf(name));
            const turned = map.mirrored();
            walk(turned);
            for (let number = 1; number <= map.count; ++number) {
                const [p, q] = [map.person(number), turned.person(number)];
                const [here, there] = [map.box(p), turned.box(q)];
                assert.deepEqual([there.left, there.right, there.top], [0 - here.right, 0 - here.left, here.top]);
                assert.equal(turned.personAt((there.left + there.right) / 2, (there.top + there.bottom) / 2), q);
                assert.deepEqual(keyed(turned, q), keyed(map, p));
                // The line of a couple is on the other side.
                const isJoined = ({ arrays }: FamilyMap, person: number) => (arrays.flags[person]! & 4) !== 0;
                if (isJoined(map, p)) assert.ok(isJoined(turned, turned.person(map.number(p + 1))));
            }
            assert.deepEqual(linesIn(turned, -1), linesIn(map, 1));
            const { low } = turned.arrays.bars;
            const { barStart } = turned.arrays;
            for (let band = 0; band + 1 < barStart.length; ++band)
                for (let i = barStart[band]! + 1; i < barStart[band + 1]!; ++i) assert.ok(low[i]! >= low[i - 1]!);
            const again = turned.mirrored().arrays;
            assert.deepEqual(again.x, map.arrays.x);
            assert.deepEqual(again.flags, map.arrays.flags);
            assert.deepEqual(again.labels, map.arrays.labels);
        }
    },
);

test("persons are found by beginnings of words and by years, whole words first", { skip }, () => {
    const map = new FamilyMap(bytesOf("family"));
    const search = new MapSearch(map, (texts) => texts.map((text) => text.toLowerCase()));
    const names = (text: string) =>
        search
            .find(text, 9)
            .map((person) => `${map.name(person)} ${map.birth(person)}`)
            .sort();
    assert.deepEqual(names("ash0 1803"), ["Ann Ash0 1803"]);
    assert.deepEqual(names("1803 AN"), ["Ann Ash0 1803"]);
    assert.deepEqual(names("ash2"), ["Ann Ash2 1802", "Ann Ash2 1805"]);
    assert.equal(search.find("ash", 9).length, 6);
    assert.equal(search.find("ash", 4).length, 4);
    assert.deepEqual(names("sh2"), []);
    assert.deepEqual(names(""), []);
});
