// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What a page holds as letters comes out of them as it went in.

import assert from "node:assert/strict";
import { execFileSync } from "node:child_process";
import { readFileSync } from "node:fs";
import { test } from "node:test";
import { joinModule, splitModule } from "../../bindings/javascript/package/moduleStreams.mjs";
import { lettersOf, packedLzma, packedModule } from "../../bindings/javascript/package/packing.mjs";
import { bytesOfLetters, unpackLzma, unpackModule } from "../../bindings/javascript/package/unpack.mjs";

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

// A module whose one function has this code.
function moduleWith(code) {
    const body = [0, ...code, 0x0b];
    return Uint8Array.from([
        ...[0, 0x61, 0x73, 0x6d, 1, 0, 0, 0],
        ...[1, 4, 1, 0x60, 0, 0],
        ...[3, 2, 1, 0],
        ...[5, 3, 1, 0, 1],
        ...[10, body.length + 2, 1, body.length, ...body],
        ...[11, 8, 1, 0, 0x41, 0, 0x0b, 2, 7, 7],
    ]);
}

test("a module comes out of its streams as it was, whatever its instructions", () => {
    const bodies = {
        nothing: [],
        floats: [0x43, 1, 2, 3, 4, 0x1a, 0x44, 1, 2, 3, 4, 5, 6, 7, 8, 0x1a],
        longNumbers: [
            0x41, 0x80, 0x80, 0x80, 0x80, 0x78, 0x1a, 0x42, 0xff, 0xff, 0xff, 0xff, 0xff, 0xff, 0xff, 0xff, 0xff, 0,
            0x1a,
        ],
        access: [0x41, 0, 0x28, 2, 0x84, 1, 0x1a, 0x41, 0, 0x29, 0, 8, 0x1a],
        branches: [0x02, 0x40, 0x03, 0x40, 0x41, 0, 0x0e, 2, 0, 1, 1, 0x0b, 0x0b],
        condition: [0x41, 0, 0x04, 0x40, 0x0c, 0, 0x05, 0x01, 0x0b],
        conversion: [0x43, 0, 0, 0, 0, 0xfc, 0, 0x1a],
        copy: [0x41, 0, 0x41, 0, 0x41, 0, 0xfc, 10, 0, 0],
    };
    for (const [name, code] of Object.entries(bodies)) {
        const module = moduleWith(code);
        assert.ok(WebAssembly.validate(module), `${name} is a module`);
        assert.deepEqual(joinModule(splitModule(module)), module, name);
    }
    assert.deepEqual(
        joinModule(splitModule(moduleWith([0x06, 0x40, 0x19, 0x09, 0, 0x0b]))),
        moduleWith([0x06, 0x40, 0x19, 0x09, 0, 0x0b]),
    );
});

test("an instruction that streams do not know is refused, and so is a size that is written long", () => {
    assert.throws(() => splitModule(moduleWith([0xfd, 12])), /opcode 253/);
    const module = [...moduleWith([])];
    const at = module.length - 8 - 2 - 4;
    assert.deepEqual(module.slice(at - 2, at + 4), [10, 4, 1, 2, 0, 0x0b]);
    const long = Uint8Array.from([...module.slice(0, at - 1), 5, 1, 0x82, 0, ...module.slice(at + 2)]);
    assert.throws(() => splitModule(long), /not written as usual/);
});

test("our module packs smaller as streams, and comes out as it was", () => {
    const module = readFileSync(process.env.OLVANE_WASM);
    const letters = packedModule(module);
    assert.ok(module.equals(Buffer.from(unpackModule(letters))));
    assert.ok(letters.length < 0.95 * lettersOf(packedLzma(module)).length, `${letters.length} letters`);
});
