// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Unpacks what packing.mjs packed: letters to bytes, and bytes to what they were. Browsers unpack gzip themselves, but LZMA
// makes a module a quarter smaller, and these letters are less than base64's.

import { joinModule } from "./moduleStreams.mjs";

export { joinModule };

// Printable letters of ASCII without those that could end a string or begin a tag.
export const LETTERS = Array.from({ length: 94 }, (_, i) => String.fromCharCode(33 + i))
    .filter((letter) => !'"<\\'.includes(letter))
    .join("");

/** The bytes that letters stand for: basE91 as J. Henke published it, with the letters above. */
export function bytesOfLetters(letters) {
    const values = new Uint8Array(128);
    for (let i = 0; i < LETTERS.length; ++i) values[LETTERS.charCodeAt(i)] = i;
    const bytes = new Uint8Array(letters.length);
    let size = 0;
    let queue = 0;
    let queued = 0; // bits
    for (let i = 0; i + 1 < letters.length; i += 2) {
        const pair = values[letters.charCodeAt(i)] + 91 * values[letters.charCodeAt(i + 1)];
        queue |= pair << queued;
        for (queued += (pair & 8191) > 88 ? 13 : 14; queued > 7; queued -= 8) {
            bytes[size++] = queue;
            queue >>>= 8;
        }
    }
    if (letters.length % 2 !== 0) bytes[size++] = queue | (values[letters.charCodeAt(letters.length - 1)] << queued);
    return bytes.subarray(0, size);
}

const STATES = 12;
const POSITIONS = 16; // of a byte among its neighbours that the model distinguishes, at most
const HEADER = 13; // bytes: the model's parameters, the dictionary's size, the size of what is packed

// Where each kind of probability begins.
const IS_MATCH = 0;
const IS_REPEAT = IS_MATCH + STATES * POSITIONS;
const IS_REPEAT_0 = IS_REPEAT + STATES;
const IS_REPEAT_1 = IS_REPEAT_0 + STATES;
const IS_REPEAT_2 = IS_REPEAT_1 + STATES;
const IS_LONG_REPEAT_0 = IS_REPEAT_2 + STATES;
const SLOTS = IS_LONG_REPEAT_0 + STATES * POSITIONS;
const DISTANCES = SLOTS + 4 * 64;
const ALIGNMENT = DISTANCES + 128;
const LENGTHS = ALIGNMENT + 16;
const SIZE_OF_LENGTHS = 2 + 2 * 8 * POSITIONS + 256;
const LITERALS = LENGTHS + 2 * SIZE_OF_LENGTHS;

// Reads bits whose probabilities adapt. Numbers have 32 bits without a sign, which a typed array holds without a detour.
class Bits {
    #bytes;
    #at = HEADER + 5;
    #range = new Uint32Array([0xffffffff, 0]); // and the code in it
    #probabilities;

    constructor(bytes, literals) {
        this.#bytes = bytes;
        for (let i = 1; i < 5; ++i) this.#range[1] = (this.#range[1] << 8) | bytes[HEADER + i];
        this.#probabilities = new Uint16Array(LITERALS + literals).fill(1024);
    }

    bit(index) {
        const range = this.#range;
        if (range[0] < 0x1000000) this.#shift();
        const probability = this.#probabilities[index];
        const bound = Math.imul(range[0] >>> 11, probability) >>> 0;
        if (range[1] < bound) {
            range[0] = bound;
            this.#probabilities[index] = probability + ((2048 - probability) >> 5);
            return 0;
        }
        range[0] -= bound;
        range[1] -= bound;
        this.#probabilities[index] = probability - (probability >> 5);
        return 1;
    }

    #shift() {
        this.#range[0] <<= 8;
        this.#range[1] = (this.#range[1] << 8) | this.#bytes[this.#at++];
    }

    /** Bits that are as often 0 as 1. */
    plain(count) {
        const range = this.#range;
        let bits = 0;
        for (let i = 0; i < count; ++i) {
            if (range[0] < 0x1000000) this.#shift();
            range[0] >>>= 1;
            const one = range[1] >= range[0];
            if (one) range[1] -= range[0];
            bits = bits * 2 + (one ? 1 : 0);
        }
        return bits;
    }

    tree(base, count) {
        let node = 1;
        for (let i = 0; i < count; ++i) node = node * 2 + this.bit(base + node);
        return node - (1 << count);
    }

    lowestFirst(base, count) {
        let node = 1;
        let bits = 0;
        for (let i = 0; i < count; ++i) {
            const bit = this.bit(base + node);
            node = node * 2 + bit;
            bits |= bit << i;
        }
        return bits;
    }

    literal(base) {
        let node = 1;
        while (node < 256) node = node * 2 + this.bit(base + node);
        return node;
    }

    /** After a match: the byte that would have followed it is unlikely. */
    literalAfter(base, unlikely) {
        let node = 1;
        let offset = 256;
        while (node < 256) {
            unlikely *= 2;
            const expected = unlikely & offset;
            const bit = this.bit(base + offset + expected + node);
            node = node * 2 + bit;
            offset &= bit === 0 ? ~unlikely : unlikely;
        }
        return node;
    }

    length(base, position) {
        if (this.bit(base) === 0) return 2 + this.tree(base + 2 + 8 * position, 3);
        if (this.bit(base + 1) === 0) return 10 + this.tree(base + 2 + 8 * (POSITIONS + position), 3);
        return 18 + this.tree(base + 2 + 16 * POSITIONS, 8);
    }

    distance(length) {
        const slot = this.tree(SLOTS + 64 * Math.min(length - 2, 3), 6);
        if (slot < 4) return slot;
        const count = (slot >> 1) - 1;
        const high = (2 | (slot & 1)) << count;
        if (slot < 14) return high + this.lowestFirst(DISTANCES + high - slot, count);
        return high + 16 * this.plain(count - 4) + this.lowestFirst(ALIGNMENT, 4);
    }
}

/**
 * What a file in the format .lzma holds, as I. Pavlov's "LZMA specification" has it. Its header has the size of what is
 * packed. Bytes that are no such file give others.
 */
export function unpackLzma(packed) {
    const header = new DataView(packed.buffer, packed.byteOffset, HEADER);
    const size = header.getUint32(5, true);
    const literalBits = packed[0] % 9;
    const literalPositions = (1 << (Math.floor(packed[0] / 9) % 5)) - 1;
    const positions = (1 << Math.floor(packed[0] / 45)) - 1;
    const bits = new Bits(packed, 0x300 * ((literalPositions + 1) << literalBits));
    const bytes = new Uint8Array(size);
    const repeats = [0, 0, 0, 0]; // distances of the last matches, the newest first
    let state = 0;
    let at = 0;
    while (at < size) {
        const position = at & positions;
        if (bits.bit(IS_MATCH + state * POSITIONS + position) === 0) {
            const before = at > 0 ? bytes[at - 1] : 0;
            const context = ((at & literalPositions) << literalBits) + (before >> (8 - literalBits));
            const base = LITERALS + 0x300 * context;
            bytes[at] = state < 7 ? bits.literal(base) : bits.literalAfter(base, bytes[at - repeats[0] - 1]);
            ++at;
            state = state < 4 ? 0 : state < 10 ? state - 3 : state - 6;
            continue;
        }
        let length = 1;
        if (bits.bit(IS_REPEAT + state) === 0) {
            length = bits.length(LENGTHS, position);
            repeats.pop();
            repeats.unshift(bits.distance(length));
            state = state < 7 ? 7 : 10;
        } else {
            const isNewest = bits.bit(IS_REPEAT_0 + state) === 0;
            if (!isNewest) {
                const which = bits.bit(IS_REPEAT_1 + state) === 0 ? 1 : 2 + bits.bit(IS_REPEAT_2 + state);
                repeats.unshift(...repeats.splice(which, 1));
            }
            const isLong = !isNewest || bits.bit(IS_LONG_REPEAT_0 + state * POSITIONS + position) === 1;
            if (isLong) length = bits.length(LENGTHS + SIZE_OF_LENGTHS, position);
            state = isLong ? (state < 7 ? 8 : 11) : state < 7 ? 9 : 11;
        }
        for (const end = Math.min(size, at + length); at < end; ++at) bytes[at] = bytes[at - repeats[0] - 1];
    }
    return bytes;
}

/** The WebAssembly module that packedModule wrote as letters. */
export function unpackModule(letters) {
    return joinModule(unpackLzma(bytesOfLetters(letters)));
}
