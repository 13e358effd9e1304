// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What a language must say about relatives, dates and facts. All grammar stands in the tables: whoever asks knows
// no case, gender or order of words.

import type { GedcomDate, Sex } from "olvane";
import type { BloodStep, CoupleStep } from "./kinship";
import { english } from "./messages/en";
import { german } from "./messages/de";

export { english, german };

/** A relative's word in the forms that longer words are made of. */
export interface Noun {
    /** "uncle", "Onkel" */
    readonly plain: string;
    /** As one of several, behind "wife": "of an uncle", "eines Onkels". */
    readonly ofOne: string;
    /** As the one to whom another relative belongs: "uncle's", "des Onkels". */
    readonly owner: string;
}

export type NounBySex = Readonly<Record<Sex, Noun>>;

export interface KinshipWords {
    readonly self: string;
    relative(way: BloodStep): Noun;
    /** With the parent by whom the way begins: "uncle (mother's brother)", "Onkel mütterlicherseits". */
    relativeOnSide(way: BloodStep): string;
    spouse(couple: CoupleStep): Noun;
    readonly parentInLaw: NounBySex;
    readonly childInLaw: NounBySex;
    readonly siblingInLaw: NounBySex;
    readonly stepparent: NounBySex;
    readonly stepchild: NounBySex;
    readonly stepsibling: NounBySex;
    /** "wife's cousin", "Cousin der Ehefrau" */
    owned(owner: Noun, relative: Noun): Noun;
    /** "wife of a first cousin", "Ehefrau eines Cousins ersten Grades" */
    coupledWith(spouse: Noun, relative: Noun): Noun;
    /** "sister-in-law (husband's sister)" */
    explained(word: string, how: string): string;
    /** "wife and first cousin" */
    both(near: string, far: string): string;
}

/** Of a date, or of a time that lasted. */
export type DateMark = GedcomDate["mark"] | "since" | "until" | "lasting";

/** Dates that were read; months count from 1, and years before Christ are negative. */
export interface DateWords {
    /** "12 February 1809", "February 1809", "1809"; 0 for a month or day that is not given. */
    day(year: number, month: number, day: number): string;
    /** Puts the mark of a date before its text: "about 1809", "between 1809 and 1811", "until 1811". */
    marked(mark: DateMark, first: string, last: string): string;
    /** "born about 1809" */
    born(date: string): string;
    died(date: string): string;
}

export interface Messages {
    /** As in the lang attribute: "en", "de". */
    readonly language: string;
    readonly unknownName: string;
    readonly kinship: KinshipWords;
    readonly dates: DateWords;
    /** By GEDCOM tag. */
    readonly facts: Readonly<Record<string, string>>;
}

/** The table for a language tag such as "de-AT"; English for a language that has none. */
export function messagesFor(languageTag: string): Messages {
    const language = languageTag.toLowerCase().split(/[-_]/)[0];
    return [english, german].find((messages) => messages.language === language) ?? english;
}

/** The name of a fact; the tag itself where the table has none. */
export function factLabel(tag: string, messages: Messages): string {
    return Object.hasOwn(messages.facts, tag) ? messages.facts[tag]! : tag;
}
