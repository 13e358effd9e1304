// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What a language must say about dates and facts. All grammar stands in the tables: the callers know no case,
// gender or order of words.

import type { GedcomDate } from "olvane";
import { english } from "./messages/en";
import { german } from "./messages/de";
import { spanish } from "./messages/es";

export { english, german, spanish };

/** Every language of dates and facts; relatives have their words in the module. */
export const languages = [english, german, spanish] as const;

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
    readonly dates: DateWords;
    /** By GEDCOM tag. */
    readonly facts: Readonly<Record<string, string>>;
}

/** The table for a language tag such as "de-AT"; English for a language that has none. */
export function messagesFor(languageTag: string): Messages {
    const language = languageTag.toLowerCase().split(/[-_]/)[0];
    return languages.find((messages) => messages.language === language) ?? english;
}

/** The name of a fact; the tag itself where the table has none. */
export function factLabel(tag: string, messages: Messages): string {
    return Object.hasOwn(messages.facts, tag) ? messages.facts[tag]! : tag;
}
