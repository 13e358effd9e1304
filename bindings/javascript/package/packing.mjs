// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Packs bytes for a page or a script that holds them as text. unpack.mjs unpacks them.

import { execFileSync } from "node:child_process";
import { splitModule } from "./moduleStreams.mjs";
import { LETTERS } from "./unpack.mjs";

/** A file in the format .lzma, whose header has the size of what is packed. */
export function packedLzma(bytes) {
    const options = ["--format=lzma", "--lzma1=preset=9e,lc=2,lp=0,pb=0,nice=273", "--stdout"];
    const packed = execFileSync("xz", options, { input: bytes, maxBuffer: 1 << 30 });
    packed.writeBigUInt64LE(BigInt(bytes.length), 5);
    return packed;
}

/** A WebAssembly module as letters, which unpackModule reads. */
export function packedModule(module) {
    return lettersOf(packedLzma(splitModule(module)));
}

/** Bytes as letters that may stand in a script of a page and in a string in double quotes. */
export function lettersOf(bytes) {
    const letters = [];
    let queue = 0;
    let queued = 0; // bits
    const append = (pair) => letters.push(LETTERS[pair % 91], LETTERS[Math.floor(pair / 91)]);
    for (const byte of bytes) {
        queue |= byte << queued;
        queued += 8;
        if (queued <= 13) continue;
        const size = (queue & 8191) > 88 ? 13 : 14;
        append(queue & ((1 << size) - 1));
        queue >>>= size;
        queued -= size;
    }
    if (queued > 0) append(queue);
    if (queued > 0 && queued <= 6 && queue < 91) letters.pop();
    return letters.join("");
}
