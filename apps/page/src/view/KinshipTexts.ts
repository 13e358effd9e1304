// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What persons are to the focus, in words: asked of the module once for each, or of many in one question.

import type { GedcomFile, KinshipWords } from "olvane";

const kNone: KinshipWords = { text: "", short: "", shorter: [] };
const kAtOnce = 16; // persons asked of between two looks at the clock

export class KinshipTexts {
    private readonly known = new Map<number, KinshipWords>();

    constructor(
        private readonly file: GedcomFile,
        readonly focus: number,
        readonly language: string,
    ) {}

    /** Both texts are empty for the focus and for who is not related. */
    of(person: number): KinshipWords {
        if (person === this.focus) return kNone;
        this.ask([person]);
        return this.known.get(person) ?? kNone;
    }

    /** Asks of as many of the persons as the time, in ms, is enough for. True where all are known. */
    learn(persons: readonly number[], time: number): boolean {
        const end = performance.now() + time;
        const missing = persons.filter((person) => person !== this.focus && !this.known.has(person));
        for (let at = 0; at < missing.length; at += kAtOnce) {
            if (performance.now() > end) return false;
            this.ask(missing.slice(at, at + kAtOnce));
        }
        return true;
    }

    private ask(persons: readonly number[]): void {
        const missing = persons.filter((person) => !this.known.has(person));
        if (missing.length === 0) return;
        const words = this.file.kinshipWords(this.focus, missing, this.language);
        missing.forEach((person, i) => this.known.set(person, words[i] ?? kNone));
    }
}
