// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A zip archive, written by hand.

import { deflateRawSync } from "node:zlib";

/** Of members as name and bytes, deflated. */
export function archiveOf(members) {
    const parts = [];
    const list = [];
    let at = 0;
    for (const [name, bytes] of members) {
        const packed = deflateRawSync(bytes);
        const shared = Buffer.alloc(26);
        shared.writeUInt16LE(20, 0);
        shared.writeUInt16LE(8, 4);
        shared.writeUInt32LE(checksum(bytes), 10);
        shared.writeUInt32LE(packed.length, 14);
        shared.writeUInt32LE(bytes.length, 18);
        shared.writeUInt16LE(Buffer.byteLength(name), 22);
        const header = Buffer.concat([Buffer.from("PK\x03\x04"), shared, Buffer.from(name)]);
        const entry = Buffer.alloc(46);
        entry.write("PK\x01\x02");
        shared.copy(entry, 6);
        entry.writeUInt32LE(at, 42);
        list.push(entry, Buffer.from(name));
        parts.push(header, packed);
        at += header.length + packed.length;
    }
    const directory = Buffer.concat(list);
    const end = Buffer.alloc(22);
    end.write("PK\x05\x06");
    end.writeUInt16LE(members.length, 8);
    end.writeUInt16LE(members.length, 10);
    end.writeUInt32LE(directory.length, 12);
    end.writeUInt32LE(at, 16);
    return Buffer.concat([...parts, directory, end]);
}

const kTable = Array.from({ length: 256 }, (_, n) => {
    let value = n;
    for (let bit = 0; bit < 8; ++bit) value = value & 1 ? (value >>> 1) ^ 0xedb88320 : value >>> 1;
    return value >>> 0;
});

function checksum(bytes) {
    let value = 0xffffffff;
    for (const byte of bytes) value = (value >>> 8) ^ kTable[(value ^ byte) & 255];
    return (value ^ 0xffffffff) >>> 0;
}
