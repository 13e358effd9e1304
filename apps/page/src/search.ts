// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Finding persons by what a user types. Names are cut into words and folded to plain letters once, at the first
// search; all words stand sorted with their persons behind them, so a beginning is a run of words.

import type { Person } from "olvane";

// Letters that stand for themselves in Unicode but are typed as plain ones.
const kPlainLetters: Readonly<Record<string, string>> = {
    ø: "o",
    ł: "l",
    đ: "d",
    ð: "d",
    þ: "th",
    ß: "ss",
    æ: "ae",
    œ: "oe",
    ı: "i",
    ħ: "h",
    ŧ: "t",
    ŋ: "n",
    ĸ: "k",
    ſ: "s",
    ς: "σ",
    ə: "e",
};
const kSpecialLetter = new RegExp(`[${Object.keys(kPlainLetters).join("")}]`, "gu");
const kAsciiOnly = /^[\0-\x7f]*$/;
const kMarks = /\p{M}/gu;
const kApostrophes = /['\u2018\u2019\u02bb\u02bc`]/gu;
const kBetweenWords = /[^\p{L}\p{N}]+/u;

/** Small letters without accents: "Łukasz" is "lukasz". */
export function folded(text: string): string {
    if (kAsciiOnly.test(text)) return text.toLowerCase();
    return text
        .normalize("NFKD")
        .replace(kMarks, "")
        .toLowerCase()
        .replace(kSpecialLetter, (letter) => kPlainLetters[letter] ?? letter);
}

function wordsOf(text: string): string[] {
    return text.split(kBetweenWords).filter((word) => word !== "");
}

/** Search over the persons of one file. */
export class PersonIndex {
    private table: WordTable | null = null;
    private readonly xrefs = new Map<string, Person>();

    constructor(private readonly persons: readonly Person[]) {}

    /**
     * Persons of whom every word of text, in any order, begins a word of a name or a year of birth or death. The
     * person with text as xref, "I17" or "@I17@", comes first, then those with each word whole, then the rest, each
     * in the order of the file. At most limit.
     */
    find(text: string, limit: number): Person[] {
        const table = this.indexed();
        const byXref = this.xrefs.get(text.trim().replace(/^@|@$/g, "").toLowerCase());
        const found = byXref && limit > 0 ? [byXref] : [];
        const words = wordsOf(folded(text).replace(kApostrophes, ""));
        if (words.length === 0) return found;
        for (const at of table.find(words, limit)) {
            const person = this.persons[at]!;
            if (found.length < limit && person !== byXref) found.push(person);
        }
        return found;
    }

    private indexed(): WordTable {
        if (this.table) return this.table;
        for (const person of this.persons) {
            const key = person.xref.toLowerCase();
            if (key !== "" && !this.xrefs.has(key)) this.xrefs.set(key, person);
        }
        this.table = new WordTable(this.persons);
        return this.table;
    }
}

class WordTable {
    private readonly words: string[];
    // Of word i: places[starts[i]] up to places[starts[i + 1]], persons counted from 0.
    private readonly starts: Uint32Array;
    private readonly places: Uint32Array;
    // By person: how many words of the search they match so far, at all and whole.
    private readonly begun: Uint8Array;
    private readonly whole: Uint8Array;

    constructor(persons: readonly Person[]) {
        const byWord = placesByWord(persons);
        this.words = [...byWord.keys()].sort(compareUnits);
        this.starts = new Uint32Array(this.words.length + 1);
        this.words.forEach((word, i) => (this.starts[i + 1] = this.starts[i]! + byWord.get(word)!.length));
        this.places = new Uint32Array(this.starts[this.words.length]!);
        this.words.forEach((word, i) => this.places.set(byWord.get(word)!, this.starts[i]!));
        this.begun = new Uint8Array(persons.length);
        this.whole = new Uint8Array(persons.length);
    }

    /** Persons, counted from 0: first those who match each word whole, at most limit of either kind. */
    find(words: readonly string[], limit: number): number[] {
        const wanted = [...new Set(words)].slice(0, kMostWords);
        this.begun.fill(0);
        this.whole.fill(0);
        wanted.forEach((word, n) => this.mark(word, n));
        return this.collect(wanted.length, limit);
    }

    // Whoever matched all n words before matches n + 1 now.
    private mark(word: string, n: number): void {
        const first = this.firstNotBelow(word);
        for (let i = first; i < this.words.length && this.words[i]!.startsWith(word); ++i) {
            for (let at = this.starts[i]!; at < this.starts[i + 1]!; ++at) {
                const person = this.places[at]!;
                if (this.begun[person] === n) this.begun[person] = n + 1;
                if (this.words[i] === word && this.whole[person] === n) this.whole[person] = n + 1;
            }
        }
    }

    private collect(count: number, limit: number): number[] {
        const whole: number[] = [];
        const begun: number[] = [];
        for (let person = 0; person < this.begun.length && whole.length < limit; ++person) {
            if (this.begun[person] !== count) continue;
            if (this.whole[person] === count) whole.push(person);
            else if (begun.length < limit) begun.push(person);
        }
        return whole.concat(begun);
    }

    private firstNotBelow(word: string): number {
        let low = 0;
        let high = this.words.length;
        while (low < high) {
            const middle = (low + high) >> 1;
            if (this.words[middle]! < word) low = middle + 1;
            else high = middle;
        }
        return low;
    }
}

// What fits the counters; nobody types more.
const kMostWords = 200;

function compareUnits(one: string, other: string): number {
    return one < other ? -1 : one > other ? 1 : 0;
}

// Persons, counted from 0, in the order of the file, each once.
function placesByWord(persons: readonly Person[]): Map<string, number[]> {
    const byWord = new Map<string, number[]>();
    const add = (word: string, at: number): void => {
        const places = byWord.get(word);
        if (!places) byWord.set(word, [at]);
        else if (places[places.length - 1] !== at) places.push(at);
    };
    const pieces = new Map<string, readonly string[]>();
    persons.forEach((person, at) => {
        for (const name of person.names.includes(person.name) ? person.names : [person.name, ...person.names]) {
            for (const piece of name.split(" ")) {
                for (const word of searchWordsOf(piece, pieces)) add(word, at);
            }
        }
        for (const year of yearsOf(person)) add(String(year), at);
    });
    return byWord;
}

// Of one piece between blanks. The same names come again and again, so each is folded once and kept in known. A
// name with an apostrophe is found with and without it, and by what stands behind it.
function searchWordsOf(piece: string, known: Map<string, readonly string[]>): readonly string[] {
    let words = known.get(piece);
    if (!words) {
        const plain = folded(piece);
        words = [...wordsOf(plain), ...wordsOf(plain.replace(kApostrophes, ""))];
        known.set(piece, [...new Set(words)]);
    }
    return words;
}

function yearsOf(person: Person): number[] {
    const years = [person.birth?.year, person.birth?.lastYear, person.death?.year, person.death?.lastYear];
    return years.filter((year): year is number => year !== undefined && year > 0);
}
