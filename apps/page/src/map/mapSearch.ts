// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Finds persons of a map by the beginnings of words of their names, in any order, and by years. Each text is folded
// to small letters without accents once, however many bear it.

import type { FamilyMap } from "./FamilyMap";

const kMarks = /\p{M}/gu;
const kBetweenWords = /[^\p{L}\p{N}]+/u;
const kWhole = 2; // how a text fits a word: 1 where it begins one of its own

export class MapSearch {
    private folded: string[] = []; // by text, with a space before each word and behind the last
    private foldedCount = 0;

    constructor(private readonly map: FamilyMap) {}

    /** Folds for so many ms; whether all is done. A search does what is left. */
    prepare(time = Infinity): boolean {
        const count = this.map.arrays.stringEnds.length;
        const end = performance.now() + time;
        while (this.foldedCount < count && (this.foldedCount % 500 !== 0 || performance.now() < end))
            this.folded.push(` ${wordsOf(this.map.text(this.foldedCount++)).join(" ")} `);
        return this.foldedCount === count;
    }

    /** Persons, those with each word whole first; at most so many. */
    find(text: string, limit: number): number[] {
        this.prepare();
        const words = wordsOf(text);
        if (words.length === 0) return [];
        const fits = words.map((word) => this.fitting(word));
        const whole: number[] = [];
        const begun: number[] = [];
        const { names, surnames, births, deaths } = this.map.arrays;
        for (let person = 0; person < this.map.count && whole.length < limit; ++person) {
            let least = kWhole;
            for (const { year, texts } of fits) {
                const isYear = year !== 0 && (births[person] === year || deaths[person] === year);
                const fit = isYear ? kWhole : Math.max(texts[names[person]!]!, texts[surnames[person]!]!);
                least = Math.min(least, fit);
                if (least === 0) break;
            }
            if (least === kWhole) whole.push(person);
            else if (least > 0 && begun.length < limit) begun.push(person);
        }
        return whole.concat(begun).slice(0, limit);
    }

    private fitting(word: string): { year: number; texts: Uint8Array } {
        const texts = new Uint8Array(this.folded.length);
        const start = " " + word;
        const all = start + " ";
        this.folded.forEach((text, place) => {
            if (text.includes(start)) texts[place] = text.includes(all) ? kWhole : 1;
        });
        return { year: Number(word) || 0, texts };
    }
}

function wordsOf(text: string): string[] {
    const plain = text.normalize("NFKD").replace(kMarks, "").toLowerCase();
    return plain.split(kBetweenWords).filter((word) => word !== "");
}
