// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

import assert from "node:assert/strict";
import { test } from "node:test";
import { deflateRawSync } from "node:zlib";
import "./rawInflate";
import { Archive, ArchiveError, isArchive, TooLargeError } from "../src/engine/archive";

interface Member {
    readonly name: string;
    readonly text: string;
    readonly packed?: boolean;
}

// As much of an archive as a reader looks at.
function archiveOf(members: readonly Member[]): Uint8Array<ArrayBuffer> {
    const parts: Buffer[] = [];
    const list: Buffer[] = [];
    let at = 0;
    for (const { name, text, packed } of members) {
        const bytes = packed ? deflateRawSync(text) : Buffer.from(text);
        const header = Buffer.alloc(30);
        header.writeUInt32LE(0x04034b50, 0);
        header.writeUInt16LE(name.length, 26);
        const entry = Buffer.alloc(46);
        entry.writeUInt32LE(0x02014b50, 0);
        entry.writeUInt16LE(packed ? 8 : 0, 10);
        entry.writeUInt32LE(bytes.length, 20);
        entry.writeUInt32LE(text.length, 24);
        entry.writeUInt16LE(name.length, 28);
        entry.writeUInt32LE(at, 42);
        parts.push(header, Buffer.from(name), bytes);
        list.push(entry, Buffer.from(name));
        at += 30 + name.length + bytes.length;
    }
    const end = Buffer.alloc(22);
    end.writeUInt32LE(0x06054b50, 0);
    end.writeUInt16LE(members.length, 10);
    end.writeUInt32LE(at, 16);
    return new Uint8Array(Buffer.concat([...parts, ...list, end]));
}

const kMost = 1 << 20;
const textOf = (bytes: Uint8Array) => new TextDecoder().decode(bytes);

test("the family of an archive is gedcom.ged, or else the first that ends in .ged", async () => {
    const named = archiveOf([
        { name: "a.ged", text: "other" },
        { name: "sub/GEDCOM.GED", text: "this one", packed: true },
    ]);
    assert.ok(isArchive(named));
    assert.equal(textOf(await new Archive(named).gedcom(kMost)), "this one");
    const first = archiveOf([
        { name: "notes.txt", text: "no" },
        { name: "b.ged", text: "0 HEAD" },
    ]);
    assert.equal(textOf(await new Archive(first).gedcom(kMost)), "0 HEAD");
});

test("an archive without a family, and bytes that are no archive, are refused", async () => {
    await assert.rejects(new Archive(archiveOf([{ name: "a.txt", text: "" }])).gedcom(kMost), ArchiveError);
    assert.throws(() => new Archive(new Uint8Array(100)), ArchiveError);
    assert.ok(!isArchive(new TextEncoder().encode("0 HEAD")));
});

test("what would unpack to more than is allowed is refused while it unpacks", async () => {
    const bomb = new Archive(archiveOf([{ name: "a.ged", text: "0".repeat(kMost + 1), packed: true }]));
    await assert.rejects(bomb.gedcom(kMost), TooLargeError);
});

test("a damaged member is reported as damaged", async () => {
    const bytes = archiveOf([{ name: "a.ged", text: "0 HEAD\n1 GEDC\n".repeat(20), packed: true }]);
    bytes.fill(0xff, 30 + 5, 30 + 15);
    await assert.rejects(new Archive(bytes).gedcom(kMost), ArchiveError);
});
