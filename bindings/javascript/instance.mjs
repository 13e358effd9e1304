// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The WebAssembly module at work: its memory as texts and numbers, and what it imports. A host's error can't pass
// through the module, so a question keeps what the host threw and reports a failure; the layout throws it on.

import { OutOfMemory } from "./errors.mjs";
import { PERSON_NOT_FOUND, described } from "./values.mjs";

const utf8 = { decoder: new TextDecoder(), encoder: new TextEncoder() };

// Undefined for a label that this JavaScript does not know. Bytes that are no character become U+FFFD.
function decoderOf(label) {
    try {
        return new TextDecoder(label, { ignoreBOM: true });
    } catch {
        return undefined;
    }
}

const PAGE = 65536; // bytes
const GREATEST_ID = 2 ** 31 - 1;
// Persons in one list that a host answers: an endless iterator ends there.
const MOST_RELATIVES = 1000000;

function wholeId(id) {
    if (Number.isInteger(id) && id >= 1 && id <= GREATEST_ID) return id;
    const Kind = typeof id === "number" ? RangeError : TypeError;
    throw new Kind(`a host answered ${described(id)} where an id is a whole number of 1 to ${GREATEST_ID}`);
}

function parentId(answer) {
    const unknown = answer === null || answer === undefined || answer === PERSON_NOT_FOUND;
    return unknown ? Infinity : wholeId(answer);
}

function sexNumber(answer) {
    if (Number.isInteger(answer)) return answer === 0 ? 0 : 1;
    throw new TypeError(`a host answered ${described(answer)} where a sex is a whole number`);
}

// Any answer is true or not, but what only promises one.
function truthNumber(answer) {
    if (typeof answer?.then !== "function") return answer ? 1 : 0;
    throw new TypeError("a host answered a promise where yes or no is due at once");
}

function dateText(answer) {
    if (typeof answer === "string") return answer;
    if (answer === null || answer === undefined) return "";
    throw new TypeError(`a host answered ${described(answer)} where a date is a string`);
}

export class Instance {
    static async of(module) {
        const instance = new Instance();
        const compiled = module instanceof WebAssembly.Module ? module : await WebAssembly.compile(module);
        const { exports } = await WebAssembly.instantiate(compiled, instance.#imports(compiled));
        instance.exports = exports;
        instance.module = compiled;
        exports._initialize();
        return instance;
    }

    /** Another instance whose memory is that of one at rest, with everything that is open in it. */
    static async withMemory(module, memory) {
        const instance = await Instance.of(module);
        const grown = instance.exports.memory;
        const missing = memory.length - grown.buffer.byteLength;
        if (missing > 0) grown.grow(Math.ceil(missing / PAGE));
        new Uint8Array(grown.buffer).set(memory);
        return instance;
    }

    /** A copy of the memory, without what was never used at its end. */
    memoryCopy() {
        const words = new Uint32Array(this.exports.memory.buffer);
        let last = words.length - 1;
        while (last > 0 && words[last] === 0) --last;
        return new Uint8Array(this.exports.memory.buffer.slice(0, (last + 1) * 4));
    }

    /** Called with the part of a file that has been read, from 0 to 1. */
    onProgress = null;

    /** The options that the module has, and the view that they ask for; null before the first ones. */
    #options = null;

    /** Gives options to the module, unless it has the usual ones already; the number of their view. */
    useOptions(options, numbersOf) {
        if (options === undefined && this.#options === undefined) return 0;
        const { view, numbers } = numbersOf(options === undefined ? {} : options);
        this.exports.set_options(...numbers);
        this.#options = options === undefined ? undefined : null;
        return view;
    }

    /** The host of the layout that is running, and what it threw. */
    #host = null;
    #thrown = null;
    #broken = null;

    // The module's pointers and counts have 32 bits and no sign, which JavaScript takes for one.
    text(pointer, length = -1) {
        if (length >= 0) {
            return utf8.decoder.decode(new Uint8Array(this.exports.memory.buffer, pointer >>> 0, length));
        }
        const bytes = new Uint8Array(this.exports.memory.buffer);
        const begin = pointer >>> 0;
        return utf8.decoder.decode(bytes.subarray(begin, bytes.indexOf(0, begin)));
    }

    numbers(pointer, count) {
        return new Int32Array(this.exports.memory.buffer, pointer >>> 0, count >>> 0);
    }

    /** Copies bytes in, with a zero behind them, for as long as use runs. */
    withBytes(bytes, use) {
        const pointer = this.exports.malloc(bytes.length + 1) >>> 0;
        if (pointer === 0) throw new OutOfMemory();
        try {
            const memory = new Uint8Array(this.exports.memory.buffer);
            memory.set(bytes, pointer);
            memory[pointer + bytes.length] = 0;
            return use(pointer, bytes.length);
        } finally {
            this.exports.free(pointer);
        }
    }

    withText(text, use) {
        return this.withBytes(utf8.encoder.encode(text), use);
    }

    /**
     * What run gives, and what the host threw meanwhile, with the question at which it did; null if nothing. What breaks out of
     * the module itself, such as a full stack, leaves it in the middle of its work, so it answers no more.
     */
    askingHost(host, run) {
        if (this.#broken !== null) throw this.#broken;
        const outer = { host: this.#host, thrown: this.#thrown };
        this.#host = host;
        this.#thrown = null;
        try {
            return { result: run(), thrown: this.#thrown };
        } catch (error) {
            this.#broken = new Error("the module broke off in a layout; load it again", { cause: error });
            throw this.#broken;
        } finally {
            this.#host = outer.host;
            this.#thrown = outer.thrown;
        }
    }

    /** Whether a host is being asked, so that whatever else is asked is asked by one of its methods. */
    get isAsking() {
        return this.#host !== null;
    }

    #failed(error, failure, operation, ...asked) {
        this.#thrown = [error, `${operation}(${asked.join(", ")})`];
        return failure;
    }

    // A view of the memory, made again where the memory has grown.
    #memory = new Int32Array();

    #store(pointer, number) {
        if (this.#memory.buffer !== this.exports.memory.buffer) {
            this.#memory = new Int32Array(this.exports.memory.buffer);
        }
        this.#memory[pointer >>> 2] = number;
        return 0;
    }

    #appendAll(list, ids) {
        if (typeof ids?.[Symbol.iterator] !== "function") {
            throw new TypeError(`a host answered ${described(ids)} where a list of ids is due at once`);
        }
        let left = MOST_RELATIVES;
        for (const id of ids) {
            if (--left < 0) throw new RangeError(`a host answered more than ${MOST_RELATIVES} persons in one list`);
            if (this.exports.append_person(list, wholeId(id)) !== 0) throw new OutOfMemory();
        }
        return 0;
    }

    // The engine compares no more than the first character of a date, so no more goes over.
    #storeDate(date, text) {
        if (text === "") return 0;
        if (this.exports.set_date(date, text.codePointAt(0)) !== 0) throw new OutOfMemory();
        return 0;
    }

    /** The eight questions. Each keeps what the host threw. */
    #questions() {
        return {
            father_of: (person) => {
                try {
                    return parentId(this.#host.fatherOf(person));
                } catch (error) {
                    return this.#failed(error, NaN, "fatherOf", person);
                }
            },
            mother_of: (person) => {
                try {
                    return parentId(this.#host.motherOf(person));
                } catch (error) {
                    return this.#failed(error, NaN, "motherOf", person);
                }
            },
            spouses_of: (person, list) => {
                try {
                    return this.#appendAll(list, this.#host.spousesOf(person));
                } catch (error) {
                    return this.#failed(error, 1, "spousesOf", person);
                }
            },
            children_of: (person, list) => {
                try {
                    return this.#appendAll(list, this.#host.childrenOf(person));
                } catch (error) {
                    return this.#failed(error, 1, "childrenOf", person);
                }
            },
            is_preferred_spouse: (person, spouse, answer) => {
                try {
                    return this.#store(answer, truthNumber(this.#host.isPreferredSpouse(person, spouse)));
                } catch (error) {
                    return this.#failed(error, 1, "isPreferredSpouse", person, spouse);
                }
            },
            is_dead: (person, answer) => {
                try {
                    return this.#store(answer, truthNumber(this.#host.isDead(person)));
                } catch (error) {
                    return this.#failed(error, 1, "isDead", person);
                }
            },
            date_of: (person, isBirth, date) => {
                try {
                    return this.#storeDate(date, dateText(this.#host.dateOf(person, isBirth !== 0)));
                } catch (error) {
                    return this.#failed(error, 1, "dateOf", person, isBirth !== 0);
                }
            },
            sex_of: (person, answer) => {
                try {
                    return this.#store(answer, sexNumber(this.#host.sexOf(person)));
                } catch (error) {
                    return this.#failed(error, 1, "sexOf", person);
                }
            },
        };
    }

    #imports(module) {
        const imports = {
            olvane: {
                ...this.#questions(),
                reading_progress: (done, all) => this.onProgress?.((done >>> 0) / (all >>> 0)),
                compose: (pointer, length, result) => {
                    const bytes = new Uint8Array(this.exports.memory.buffer, pointer >>> 0, length >>> 0);
                    const text = utf8.decoder.decode(bytes).normalize("NFC");
                    this.withText(text, (made, size) => this.exports.composed_text(result, made, size));
                },
                decode: (label, labelLength, pointer, length, result) => {
                    const memory = this.exports.memory.buffer;
                    const name = utf8.decoder.decode(new Uint8Array(memory, label >>> 0, labelLength >>> 0));
                    const decoder = decoderOf(name);
                    if (decoder === undefined) return 0;
                    const text = decoder.decode(new Uint8Array(memory, pointer >>> 0, length >>> 0));
                    this.withText(text, (made, size) => this.exports.composed_text(result, made, size));
                    return 1;
                },
            },
        };
        // What makes the order in tables of texts unknown to who made a file. Node 18 has no such numbers at hand.
        const getentropy = (pointer, length) => {
            const bytes = new Uint8Array(this.exports.memory.buffer, pointer >>> 0, length >>> 0);
            if (globalThis.crypto) crypto.getRandomValues(bytes);
            else bytes.forEach((_, i) => (bytes[i] = 256 * Math.random()));
            return 0;
        };
        imports.env = { getentropy };
        // The rest is what a C library asks of its system on its way to an end: nothing is printed, nothing opened.
        for (const { module: from, name } of WebAssembly.Module.imports(module)) {
            imports[from] ??= {};
            imports[from][name] ??= () => {
                if (name === "proc_exit" || name === "abort") throw new Error("the module ended itself");
                return 0;
            };
        }
        return imports;
    }
}
