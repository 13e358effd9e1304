// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The texts of the page's own parts, in each language that it speaks.

import type { Branch, ShownFact } from "olvane";
import type { ChartDirection, RelativeName, ViewName } from "../base/views";
import { uiGerman } from "./ui.de";
import { uiEnglish } from "./ui.en";
import { uiSpanish } from "./ui.es";

export interface UiMessages {
    readonly language: string;
    readonly languageName: string;
    readonly welcome: {
        readonly title: string;
        readonly text: string;
        readonly drop: string;
        readonly choose: string;
        readonly kinds: string;
        readonly privacy: string;
        readonly dropNow: string;
        readonly reading: (name: string) => string;
    };
    readonly search: {
        readonly label: string;
        readonly none: string;
        readonly count: (n: number) => string;
        readonly first: (n: number) => string;
        /** Before a name that is written in another way. */
        readonly similar: string;
        /** What a word was found in, where no fact names it. */
        readonly foundIn: Readonly<Record<"identifier" | "name" | "nickname" | "marriedName" | "title", string>>;
    };
    readonly views: { readonly label: string } & Readonly<Record<ViewName, string>>;
    readonly map: {
        readonly name: string;
        readonly label: (persons: number) => string;
        readonly hint: string;
        readonly partners: string;
        /** The page has no records beside the map. */
        readonly alone: string;
        readonly drawing: string;
        readonly cut: (have: number, wanted: number) => string;
        readonly cutShort: string;
        readonly version: string;
        readonly damaged: string;
    };
    readonly depth: { readonly up: string; readonly down: string; readonly all: string };
    readonly direction: string;
    readonly directions: Readonly<Record<ChartDirection, string>>;
    /** Of a numbered mark at a box. */
    readonly commonAncestor: string;
    readonly furtherParents: string;
    readonly waysBetween: string;
    readonly marked: (numbers: string) => string;
    readonly howRelated: string;
    readonly back: string;
    readonly forward: string;
    readonly zoom: string;
    readonly zoomIn: string;
    readonly zoomOut: string;
    readonly fit: string;
    readonly home: string;
    readonly options: string;
    readonly relatives: string;
    readonly relativeNames: Readonly<Record<RelativeName, string>>;
    readonly generations: string;
    readonly fewer: string;
    readonly more: string;
    readonly look: string;
    readonly theme: string;
    readonly themes: {
        readonly auto: string;
        readonly light: string;
        readonly dark: string;
        readonly contrast: string;
    };
    readonly languageLabel: string;
    readonly kinshipInBoxes: string;
    readonly unknownParents: string;
    /** What boxes and lines say beside names and years. */
    readonly shownFacts: Readonly<Record<"label" | ShownFact, string>>;
    /** Generations packed tighter. */
    readonly compact: string;
    readonly mirrored: string;
    // What a branch is called, and what folds it, unfolds it and says that it is folded; n persons are hidden.
    readonly branches: Readonly<Record<Branch, string>>;
    readonly fold: (branch: string, name: string, n: number) => string;
    readonly unfold: (branch: string, name: string, n: number) => string;
    readonly folded: (branch: string, n: number) => string;
    readonly encoding: string;
    readonly encodingAuto: string;
    readonly file: string;
    readonly openFile: string;
    readonly copyLink: string;
    readonly linkCopied: string;
    readonly linkNotCopied: string;
    readonly photosInBoxes: string;
    /** Of a file that stays in the browser. */
    readonly keep: {
        readonly label: string;
        readonly hint: string;
        readonly kept: string;
        readonly removed: string;
        readonly notRemoved: string;
        readonly failed: string;
    };
    readonly saveSvg: string;
    readonly savePng: string;
    readonly print: string;
    // Printing on chosen paper; points is a number as the language writes it.
    readonly paper: {
        readonly title: string;
        readonly paper: string;
        readonly purpose: string;
        readonly shown: string;
        readonly print: string;
        readonly purposes: Readonly<Record<"grandparents" | "ancestors" | "descendants" | "everybody", string>>;
        readonly letter: string;
        readonly rows: string;
        readonly columns: string;
        readonly scale: string;
        readonly dpi: string;
        readonly savePng: string;
        readonly tooSmall: string;
        readonly tooMany: string;
        readonly names: (sheets: number, points: string, scale: string) => string;
        readonly cut: (boxes: number) => string;
    };
    /** A switch: files have the part of the picture that is in sight, and no more. */
    readonly inSight: string;
    readonly saved: (name: string) => string;
    readonly savedSmaller: (name: string, percent: number) => string;
    readonly pictureFailed: string;
    readonly keys: string;
    readonly keyList: readonly (readonly [string, string])[];
    readonly cancel: string;
    readonly close: string;
    readonly legend: string;
    readonly legendItems: {
        readonly male: string;
        readonly female: string;
        readonly other: string;
        readonly focus: string;
        readonly hidden: string;
        readonly missing: string;
        readonly repeated: string;
    };
    readonly treeLabel: (name: string, view: string) => string;
    readonly treeHint: string;
    readonly missingFather: string;
    readonly missingMother: string;
    readonly missingOf: (what: string, child: string) => string;
    readonly hiddenCount: (n: number) => string;
    readonly severalBoxes: (n: number) => string;
    readonly nextBox: string;
    readonly focusNow: (name: string, boxes: number) => string;
    readonly inFocus: string;
    readonly relatedTo: (kinship: string, focus: string) => string;
    readonly notRelated: (focus: string) => string;
    readonly makeFocus: string;
    readonly panel: {
        readonly label: string;
        readonly toggle: string;
        readonly facts: string;
        readonly parents: string;
        readonly siblings: string;
        readonly partners: string;
        readonly children: string;
        readonly otherNames: string;
        readonly allOf: (n: number) => string;
        readonly noFacts: string;
        readonly unknownPartner: string;
    };
    readonly pedigrees: { readonly adopted: string; readonly foster: string; readonly sealing: string };
    /** Of what the file knows beyond dates and places. */
    readonly details: {
        readonly name: string;
        readonly nickname: string;
        /** By the type that GEDCOM has for a name, in small letters. */
        readonly nameTypes: Readonly<Record<string, string>>;
        readonly notes: string;
        readonly cause: string;
        readonly age: string;
        readonly husbandAge: string;
        readonly wifeAge: string;
        readonly agency: string;
        readonly sources: (n: number) => string;
        readonly untitled: string;
        /** How sure a source is, from 0 to 3. */
        readonly qualities: readonly string[];
        readonly readOn: string;
        readonly enlarge: (title: string) => string;
    };
    readonly diagnostics: {
        readonly show: string;
        readonly title: string;
        readonly button: (n: number) => string;
        readonly summary: (persons: number, problems: number) => string;
        readonly line: (n: number) => string;
        readonly severities: Readonly<Record<"error" | "warning" | "note" | "odd", string>>;
        readonly furtherOnes: (n: number) => string;
        readonly showAll: (n: number) => string;
    };
    readonly errors: {
        readonly empty: (name: string) => string;
        readonly notGedcom: (name: string) => string;
        readonly hint: string;
        readonly noPersons: (name: string) => string;
        readonly unknownPerson: (link: string) => string;
        readonly tooLarge: string;
        readonly pictureTooLarge: string;
        readonly tooNew: string;
        readonly archive: string;
        readonly engine: string;
        readonly layout: string;
        readonly dismiss: string;
    };
    readonly firstHint: string;
    readonly livingHidden: string;
    readonly firstOfFiles: (name: string) => string;
    readonly personCount: (n: number) => string;
}

export const uiLanguages: readonly UiMessages[] = [uiEnglish, uiGerman, uiSpanish];

// For a tag such as "de-AT"; English where the language is not spoken.
export function uiMessagesFor(tag: string): UiMessages {
    const language = tag.toLowerCase().split("-")[0];
    return uiLanguages.find((messages) => messages.language === language) ?? uiEnglish;
}
