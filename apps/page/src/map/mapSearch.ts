// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Finds persons of a map by the beginnings of words of their names, in any order, and by years. Each text is folded
// once, however many bear it.

import type { FamilyMap } from "./FamilyMap";

const kAtOnce = 500; // texts
const kWhole = 2; // how a text fits a word: 1 where it begins one of its own

export class MapSearch {
    private folded: string[] = []; // by text, with a space before each word and behind the last

    /** fold gives of each text the words as searches compare them, with a space between. */
    constructor(
        private readonly map: FamilyMap,
        private readonly fold: (texts: readonly string[]) => readonly string[],
    ) {}

    /** Folds for the given time in ms; whether all is done. A search does what is left. */
    prepare(time = Infinity): boolean {
        const count = this.map.arrays.stringEnds.length;
        const end = performance.now() + time;
        while (this.folded.length < count && performance.now() < end) {
            const first = this.folded.length;
            const length = Math.min(kAtOnce, count - first);
            const texts = Array.from({ length }, (_, i) => this.map.text(first + i));
            for (const words of this.fold(texts)) this.folded.push(` ${words} `);
        }
        return this.folded.length === count;
    }

    /** Persons, those with each word whole first; at most `limit`. */
    find(text: string, limit: number): number[] {
        this.prepare();
        const words = (this.fold([text])[0] ?? "").split(" ").filter((word) => word !== "");
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
