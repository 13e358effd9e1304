// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The words of a language about persons: names of facts from the page's tables, everything else from the module, which has
// the words of pictures as well.

import type { Person, Texts } from "olvane";
import { english } from "./messages/en";
import { german } from "./messages/de";
import { spanish } from "./messages/es";

/** By GEDCOM tag. */
export type FactNames = Readonly<Record<string, string>>;

/** Every language of names of facts, by its code. */
export const factLanguages: Readonly<Record<string, FactNames>> = { en: english, de: german, es: spanish };

export class Messages {
    /** As in the lang attribute: "en", "de". */
    readonly language: string;

    /**
     * For a language tag such as "de-AT"; English for a language that has no table. The module's texts are asked for where
     * there is somebody to speak of.
     */
    constructor(
        languageTag: string,
        private readonly textsOfModule: () => Texts,
    ) {
        const language = languageTag.toLowerCase().split(/[-_]/)[0]!;
        this.language = Object.hasOwn(factLanguages, language) ? language : "en";
    }

    private get texts(): Texts {
        return this.textsOfModule();
    }

    /** The name to show, and a word for one who has none. */
    nameOf(person: Person): string {
        return person.shownName || this.unknownName;
    }

    get unknownName(): string {
        return this.texts.unnamedText(this.language);
    }

    /** "1809–1882", "about 1809 – 1882", "born 1809"; empty where neither year is known. */
    yearsOf(person: Person): string {
        return this.texts.yearsText(person.birth, person.death, this.language);
    }

    /** "12 Feb 1809" for a date as the file writes it. */
    dateText(written: string): string {
        return this.texts.dateText(written, this.language);
    }

    placeText(place: string): string {
        return this.texts.placeText(place);
    }

    /** The name of a fact; the tag itself where the table has none. */
    factLabel(tag: string): string {
        const facts = factLanguages[this.language]!;
        return Object.hasOwn(facts, tag) ? facts[tag]! : tag;
    }
}
