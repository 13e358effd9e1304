// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A WebAssembly module as streams: all opcodes behind one another, all numbers of locals, all offsets and so on. Like lies
// beside like, so that LZMA makes a twelfth less of them than of the module. What is not the code of functions stays whole.
//
// One walk over the code serves both ways: it moves each part between the module and the stream of its kind, and learns from
// opcodes what follows. The sizes of the code and of each function are left out, since the code shows where it ends.

const KINDS = [
    ...["sections", "data", "functions", "opcodes", "blocks", "labels", "calls", "types", "locals", "globals"],
    ...["alignments", "offsets", "int32", "int64", "floats", "others"],
];
const [SECTIONS, DATA, FUNCTIONS, OPCODES, BLOCKS, LABELS, CALLS, TYPES, LOCALS, GLOBALS] = KINDS.keys();
const [ALIGNMENTS, OFFSETS, INT32, INT64, FLOATS, OTHERS] = [...KINDS.keys()].slice(GLOBALS + 1);

const CODE_SECTION = 10;
const DATA_SECTION = 11;
const HEADER = 8; // bytes: magic and version

const TRY = 0x06;
const BRANCH_TABLE = 0x0e;
const END = 0x0b;
const DELEGATE = 0x18;
const FIRST_ACCESS = 0x28;
const LAST_ACCESS = 0x3e;
const FLOAT32 = 0x43;
const FLOAT64 = 0x44;
const FIRST_PLAIN = 0x45; // from here on, opcodes stand alone
const LAST_PLAIN = 0xc4;
const PREFIX = 0xfc;

// By opcode: the kinds of the numbers that follow it.
const NUMBERS = {
    ...Object.fromEntries([0x02, 0x03, 0x04, TRY].map((opcode) => [opcode, [BLOCKS]])),
    ...Object.fromEntries([0x07, 0x08].map((opcode) => [opcode, [OTHERS]])),
    ...Object.fromEntries([0x09, 0x0c, 0x0d, DELEGATE].map((opcode) => [opcode, [LABELS]])),
    ...Object.fromEntries([0x00, 0x01, 0x05, END, 0x0f, 0x19, 0x1a, 0x1b].map((opcode) => [opcode, []])),
    ...Object.fromEntries([0x20, 0x21, 0x22].map((opcode) => [opcode, [LOCALS]])),
    ...Object.fromEntries([0x23, 0x24].map((opcode) => [opcode, [GLOBALS]])),
    ...Object.fromEntries([0x3f, 0x40].map((opcode) => [opcode, [OTHERS]])),
    ...{ 0x10: [CALLS], 0x11: [TYPES, OTHERS], 0x41: [INT32], 0x42: [INT64] },
};
// The same for what follows the prefix: conversions without traps, and memory that is filled and copied as a whole.
const PREFIXED = [[], [], [], [], [], [], [], [], [OTHERS, OTHERS], [OTHERS], [OTHERS, OTHERS], [OTHERS]];

// The usual alignment of each access to memory, as the logarithm of bytes.
const ALIGNED = [2, 3, 2, 3, 0, 0, 1, 1, 0, 0, 1, 1, 2, 2, 2, 3, 2, 3, 0, 1, 0, 1, 2];

function moveInstruction(parts, opcode) {
    if (opcode >= FIRST_ACCESS && opcode <= LAST_ACCESS) {
        parts.byte(ALIGNMENTS, ALIGNED[opcode - FIRST_ACCESS]);
        parts.number(OFFSETS);
    } else if (opcode === BRANCH_TABLE) {
        for (let left = parts.number(LABELS); left >= 0; --left) parts.number(LABELS);
    } else if (opcode === FLOAT32 || opcode === FLOAT64) {
        for (let i = 0; i < (opcode === FLOAT32 ? 4 : 8); ++i) parts.byte(FLOATS);
    } else if (opcode < FIRST_PLAIN || opcode > LAST_PLAIN) {
        const kinds = opcode === PREFIX ? PREFIXED[parts.number(OPCODES)] : NUMBERS[opcode];
        if (kinds === undefined) throw new Error(`the module has the opcode ${opcode}, which streams do not know`);
        for (const kind of kinds) parts.number(kind);
    }
}

function moveFunction(parts) {
    for (let groups = parts.number(FUNCTIONS); groups > 0; --groups) {
        parts.number(FUNCTIONS);
        parts.byte(FUNCTIONS);
    }
    for (let depth = 0; depth >= 0;) {
        const opcode = parts.byte(OPCODES);
        if ((opcode >= 0x02 && opcode <= 0x04) || opcode === TRY) ++depth;
        if (opcode === END || opcode === DELEGATE) --depth;
        moveInstruction(parts, opcode);
    }
}

function moveModule(parts) {
    for (let i = 0; i < HEADER; ++i) parts.byte(SECTIONS);
    while (!parts.isDone()) {
        const id = parts.byte(SECTIONS);
        if (id === CODE_SECTION) {
            parts.sized(() => {
                for (let left = parts.number(FUNCTIONS); left > 0; --left) parts.sized(() => moveFunction(parts));
            });
        } else {
            const kind = id === DATA_SECTION ? DATA : SECTIONS;
            for (let left = parts.number(kind); left > 0; --left) parts.byte(kind);
        }
    }
}

// A number as the format has it: seven bits a byte, the lowest first. Of signed and of long ones only the bytes matter.
function moveNumber(parts, kind) {
    let value = 0;
    for (let shift = 0; ; shift += 7) {
        const byte = parts.byte(kind);
        value |= (byte & 127) << shift;
        if (byte < 128) return value;
    }
}

function bytesOfNumber(value) {
    const bytes = [];
    for (; value > 127; value >>>= 7) bytes.push((value & 127) | 128);
    bytes.push(value);
    return bytes;
}

// Takes a module apart.
class Splitting {
    #module;
    #at = 0;
    #streams = KINDS.map(() => []);

    constructor(module) {
        this.#module = module;
    }

    isDone() {
        return this.#at >= this.#module.length;
    }

    // What is usual is left out of the stream's byte, so that a run of usual ones is a run of zeros.
    byte(kind, usual = 0) {
        const byte = this.#module[this.#at++];
        this.#streams[kind].push(byte ^ usual);
        return byte;
    }

    number(kind) {
        return moveNumber(this, kind);
    }

    sized(move) {
        while (this.#module[this.#at++] > 127);
        move();
    }

    result() {
        const sizes = [this.#module.length, ...this.#streams.map(({ length }) => length)].flatMap(bytesOfNumber);
        return Uint8Array.from([sizes, ...this.#streams].flat());
    }
}

// Puts it together.
class Joining {
    #streams;
    #next; // by kind: the place in streams
    #end; // of the stream of sections, which are what there is to do
    #module;
    #at = 0;

    constructor(streams) {
        let at = 0;
        const number = () => moveNumber({ byte: () => streams[at++] });
        this.#module = new Uint8Array(number());
        const sizes = KINDS.map(number);
        this.#streams = streams;
        this.#next = Uint32Array.from(sizes, (size) => (at += size) - size);
        this.#end = this.#next[SECTIONS] + sizes[SECTIONS];
    }

    isDone() {
        return this.#next[SECTIONS] >= this.#end;
    }

    byte(kind, usual = 0) {
        return (this.#module[this.#at++] = this.#streams[this.#next[kind]++] ^ usual);
    }

    number(kind) {
        return moveNumber(this, kind);
    }

    // The size goes before what it is the size of, which is moved on for it.
    sized(move) {
        const start = this.#at;
        move();
        const size = bytesOfNumber(this.#at - start);
        this.#module.copyWithin(start + size.length, start, this.#at);
        this.#module.set(size, start);
        this.#at += size.length;
    }

    result() {
        return this.#module;
    }
}

function moved(parts) {
    moveModule(parts);
    return parts.result();
}

/** The streams of a module. Throws Error for one with instructions that no compiler of ours makes. */
export function splitModule(module) {
    const streams = moved(new Splitting(module));
    const again = joinModule(streams);
    if (again.length !== module.length || !again.every((byte, i) => byte === module[i])) {
        throw new Error("the module is not written as usual");
    }
    return streams;
}

/** The module that splitModule took apart. */
export function joinModule(streams) {
    return moved(new Joining(streams));
}
