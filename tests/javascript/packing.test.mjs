// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What a page holds as letters comes out of them as it went in.

import assert from "node:assert/strict";
import { execFileSync } from "node:child_process";
import { readFileSync } from "node:fs";
import { test } from "node:test";
import { lettersOf, packedLzma } from "../../bindings/javascript/package/packing.mjs";
import { bytesOfLetters, unpackLzma } from "../../bindings/javascript/package/unpack.mjs";

// The same bytes in every run: a generator of numbers as C's standard shows one.
function madeBytes(count, seed, most = 256) {
    let number = seed;
    return Uint8Array.from({ length: count }, () => {
        number = (Math.imul(number, 1103515245) + 12345) >>> 0;
        return (number >>> 16) % most;
    });
}

test("bytes come out of letters for every length and every byte", () => {
    for (let length = 0; length < 300; ++length) {
        for (const most of [1, 2, 256]) {
            const bytes = madeBytes(length, length + 1, most);
            assert.deepEqual(new Uint8Array(bytesOfLetters(lettersOf(bytes))), bytes, `${length} bytes below ${most}`);
        }
        const full = new Uint8Array(length).fill(255);
        assert.deepEqual(new Uint8Array(bytesOfLetters(lettersOf(full))), full, `${length} bytes of 255`);
    }
});

test("letters end neither a string nor a script, and are a quarter more than the bytes at most", () => {
    const bytes = madeBytes(100_000, 7);
    const letters = lettersOf(bytes);
    assert.match(letters, /^[!-~]*$/);
    assert.doesNotMatch(letters, /["<\\]/);
    assert.ok(letters.length < 1.235 * bytes.length, `${letters.length} letters`);
});

test("nothing comes out of nothing", () => {
    assert.equal(unpackLzma(packedLzma(new Uint8Array(0))).length, 0);
});

test("what is packed comes out as it was, whether it repeats near, far or not at all", () => {
    const noise = madeBytes(70_000, 3);
    const far = new Uint8Array([...noise, ...noise.subarray(0, 20_000), ...noise.subarray(10, 40)]);
    const runs = Uint8Array.from({ length: 60_000 }, (_, i) => (i % 4096 < 4000 ? 0 : i));
    const records = Uint8Array.from({ length: 40_000 }, (_, i) => [i >> 8, i & 255, 7, 7, 7, i & 3, 1, 0][i % 8]);
    const text = new TextEncoder().encode("1 NAME Zoë /Ŋala/\n2 GIVN Zoë\n".repeat(500));
    const code = readFileSync(process.env.OLVANE_WASM);
    for (const [name, bytes] of Object.entries({ noise, far, runs, records, text, code })) {
        const packed = packedLzma(bytes);
        assert.ok(Buffer.from(bytes).equals(Buffer.from(unpackLzma(packed))), name);
    }
});

test("a packed file with other parameters of the model is read as well", () => {
    const bytes = Buffer.from(new Int32Array(5000).map((_, i) => 3 * i).buffer);
    for (const model of ["lc=0,lp=2,pb=2", "lc=4,lp=0,pb=4", "lc=1,lp=3,pb=1"]) {
        const packed = execFileSync("xz", ["--format=lzma", `--lzma1=${model}`, "--stdout"], { input: bytes });
        packed.writeBigUInt64LE(BigInt(bytes.length), 5);
        assert.ok(bytes.equals(Buffer.from(unpackLzma(packed))), model);
    }
});
