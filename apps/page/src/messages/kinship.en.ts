// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// English words for relatives.

import type { Sex } from "olvane";
import type { BloodStep, CoupleStep } from "../kinship";
import type { KinshipWords, Noun, NounBySex } from "../messages";

type WordBySex = Readonly<Record<Sex, string>>;

const kParent: WordBySex = { male: "father", female: "mother", other: "parent" };
const kChild: WordBySex = { male: "son", female: "daughter", other: "child" };
const kSibling: WordBySex = { male: "brother", female: "sister", other: "sibling" };
const kParentsSibling: WordBySex = { male: "uncle", female: "aunt", other: "aunt or uncle" };
const kSiblingsChild: WordBySex = { male: "nephew", female: "niece", other: "niece or nephew" };
const kSpouse: WordBySex = { male: "husband", female: "wife", other: "spouse" };

const kOrdinals = ["first", "second", "third", "fourth", "fifth", "sixth", "seventh", "eighth", "ninth", "tenth"];
const kTimes = ["", "once", "twice", "three times", "four times", "five times", "six times", "seven times"];
// More greats than this are counted.
const kGreatsInWords = 3;

function noun(plain: string): Noun {
    const article = /^([aeiou]|8|11th|18th)/.test(plain) ? "an" : "a";
    return { plain, ofOne: `of ${article} ${plain}`, owner: `${plain}'s` };
}

function nouns(words: WordBySex, prefix = "", suffix = ""): NounBySex {
    const of = (sex: Sex): Noun => noun(prefix + words[sex] + suffix);
    return { male: of("male"), female: of("female"), other: of("other") };
}

// 1st, 2nd, 3rd, 4th, 11th, 21st
function numeral(n: number): string {
    const lastTwo = n % 100;
    const ending = lastTwo >= 11 && lastTwo <= 13 ? "th" : (["th", "st", "nd", "rd"][n % 10] ?? "th");
    return `${n}${ending}`;
}

function greats(count: number, word: string): string {
    return count <= kGreatsInWords ? "great-".repeat(count) + word : `${numeral(count)} great-${word}`;
}

function cousin(way: BloodStep): string {
    const degree = Math.min(way.up, way.down) - 1;
    const removed = Math.abs(way.up - way.down);
    const word = `${kOrdinals[degree - 1] ?? numeral(degree)} cousin`;
    return removed === 0 ? word : `${word} ${kTimes[removed] ?? `${removed} times`} removed`;
}

function wholeWord(way: BloodStep): string {
    const { up, down, sex } = way;
    if (up === 1 && down === 0) return kParent[sex];
    if (up === 0 && down === 1) return kChild[sex];
    if (up === 1 && down === 1) return kSibling[sex];
    if (down === 0) return greats(up - 2, `grand${kParent[sex]}`);
    if (up === 0) return greats(down - 2, `grand${kChild[sex]}`);
    if (down === 1) return greats(up - 2, kParentsSibling[sex]);
    if (up === 1) return greats(down - 2, kSiblingsChild[sex]);
    return cousin(way);
}

function manner(way: BloodStep): string {
    if (way.link === "foster") return "foster ";
    if (way.link === "adopted") return way.up === 0 ? "adopted " : "adoptive ";
    return way.half ? "half " : "";
}

function relative(way: BloodStep): Noun {
    return noun(manner(way) + wholeWord(way));
}

// Exactly for grandparents, uncles and aunts; beyond them the side says enough.
function sideOf(way: BloodStep): string {
    if (way.side === "none" || way.up < 2 || way.down > 1) return "";
    const side = way.side === "father" ? "father's" : "mother's";
    if (way.up > 2 || way.link !== "birth") return `${side} side`;
    return `${side} ${relative({ ...way, up: 1 }).plain}`;
}

export const englishKinship: KinshipWords = {
    self: "the person in focus",
    relative,
    relativeOnSide(way: BloodStep): string {
        const side = sideOf(way);
        return side === "" ? relative(way).plain : this.explained(relative(way).plain, side);
    },
    spouse(couple: CoupleStep): Noun {
        if (couple.divorced) return noun(`former ${kSpouse[couple.sex]}`);
        return noun(couple.married ? kSpouse[couple.sex] : "partner");
    },
    parentInLaw: nouns(kParent, "", "-in-law"),
    childInLaw: nouns(kChild, "", "-in-law"),
    siblingInLaw: nouns(kSibling, "", "-in-law"),
    stepparent: nouns(kParent, "step"),
    stepchild: nouns(kChild, "step"),
    stepsibling: nouns(kSibling, "step"),
    owned(owner: Noun, relative: Noun): Noun {
        const plain = `${owner.owner} ${relative.plain}`;
        return { plain, ofOne: `of ${plain}`, owner: `${plain}'s` };
    },
    coupledWith(spouse: Noun, relative: Noun): Noun {
        return noun(`${spouse.plain} ${relative.ofOne}`);
    },
    explained: (word: string, how: string): string => `${word} (${how})`,
    both: (near: string, far: string): string => `${near} and ${far}`,
};
