// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What is looked at: the focus, the view and its options. Every state is an address that can be passed on.

import { type Branch, type Fold, type Person, type PictureOptions, Shown, type ShownFact } from "olvane";
import {
    type ChartDirection,
    hasCompact,
    hasDirection,
    hasDown,
    hasUp,
    kDirections,
    kRelativeNames,
    kShownFacts,
    kViewNames,
    type RelativeName,
    type ViewName,
} from "../base/views";

export interface ViewState {
    readonly focus: number;
    readonly view: ViewName;
    // Columns of the pedigree, the focus's own included.
    readonly generations: number;
    // Of the other charts: generations above and below the focus, 0 for all.
    readonly up: number;
    readonly down: number;
    readonly direction: ChartDirection;
    // The other person of the kinship view; 0 for nobody.
    readonly to: number;
    // Whether parents who are not known have boxes, in the engine's two views.
    readonly unknownParents: boolean;
    // A person, and the family whose partners are shown as that person's parents; 0 for the usual ones.
    readonly parentsOf: number;
    readonly parentFamily: number;
    // Whether generations are packed tighter, in the charts.
    readonly compact: boolean;
    // Whether right and left are exchanged; null for what suits the language.
    readonly mirrored: boolean | null;
    // Branches that are left out, in the order in which they were folded.
    readonly folded: readonly Fold[];
    // What boxes and lines say beside names and years.
    readonly show: ReadonlySet<ShownFact>;
    // Whether boxes show photographs.
    readonly photos: boolean;
    // Relatives who are switched off.
    readonly hidden: ReadonlySet<RelativeName>;
}

export const kLeastGenerations = 2;
export const kMostGenerations = 10;
export const kUsualGenerations = 5;
export const kMostDepth = 30; // that can be counted; beyond it, all
const kUsualUp = 4;
const kUsualDown = 3;

/** What is shown where nobody said otherwise; the focus is then chosen from the family. */
export const kUsualState: ViewState = {
    focus: 0,
    view: "family",
    generations: kUsualGenerations,
    up: kUsualUp,
    down: kUsualDown,
    direction: "down",
    to: 0,
    unknownParents: true,
    parentsOf: 0,
    parentFamily: 0,
    compact: false,
    mirrored: null,
    folded: [],
    show: new Set(),
    photos: false,
    hidden: new Set(),
};

// Boxes wide enough for most names, and rows far enough apart for the lines between them to be distinguished from
// another.
const kTall = { width: 118, height: 104, gapX: 22, gapY: 42 };
const kPhotoHeight = 32; // that it adds to a tall box
const kWide = { width: 196, height: 58, gapX: 14, gapY: 36 };
// Room for the lines of ways between rows, and for what the ends of a kinship are to one another.
const kGapInKinship = 57;
const kPedigree = { width: 196, height: 58, gapX: 36, gapY: 14 };

const kFactPitch = 14;
const kLabelRoom = 12; // between boxes side by side, for the year at their marriage line
// Lines that a fact adds to a box; both places have one, and so have both dates where one line has no room for them.
const kFactLines: Readonly<Record<ShownFact, number>> = { dates: 1, places: 2, occupation: 1, marriage: 0 };

/** By how much boxes are higher for the facts in them, in points. */
export function factHeight(show: ReadonlySet<ShownFact>): number {
    return [...show].reduce((height, fact) => height + kFactPitch * kFactLines[fact], 0);
}

/** Of the text at a marriage line, in points. */
export const kLabelSize = 9.5;

/** For whom pictures are made. */
export interface Reader {
    readonly language?: PictureOptions["language"];
    readonly rightToLeft?: boolean;
}

/** What to ask of the module for a state; boxes is the form of its view's boxes, which the module knows. */
export function optionsOf(
    state: ViewState,
    boxes: "tall" | "wide",
    { language = "en", rightToLeft = false }: Reader = {},
): PictureOptions {
    const { view, generations, direction, up, down, to, unknownParents, parentsOf, parentFamily, compact } = state;
    const { folded, mirrored } = state;
    const gap = view === "kinship" ? kGapInKinship : 0;
    const tall = { ...kTall, height: kTall.height + (state.photos ? kPhotoHeight : 0), gapY: gap || kTall.gapY };
    const wide = { ...kWide, gapX: gap || kWide.gapX };
    const sizes = view === "pedigree" ? kPedigree : boxes === "wide" ? wide : tall;
    return {
        ...{ view, generations, direction, up, down, to, unknownParents, parentsOf, parentFamily, compact, language },
        shown: shownBits(state),
        folded,
        mostWays: 0,
        mirrored: mirrored ?? rightToLeft,
        ...sizes,
        height: sizes.height + factHeight(state.show),
        gapX: sizes.gapX + (sizes === tall && state.show.has("marriage") ? kLabelRoom : 0),
    };
}

function shownBits(state: ViewState): number {
    return kRelativeNames.reduce((bits, name) => (state.hidden.has(name) ? bits : bits | Shown[name]), 0);
}

export function sameState(a: ViewState, b: ViewState): boolean {
    const same = (
        [
            "focus",
            "view",
            "generations",
            "up",
            "down",
            "direction",
            "to",
            "unknownParents",
            "compact",
            "mirrored",
            "photos",
            "parentFamily",
            "parentsOf",
        ] as const
    ).every((name) => a[name] === b[name]);
    const sameFolds = String(a.folded.map(foldName)) === String(b.folded.map(foldName));
    return same && sameFolds && sameSet(a.hidden, b.hidden) && sameSet(a.show, b.show);
}

function foldName({ person, branch }: Fold): string {
    return `${person}.${branch}`;
}

/** With a branch folded, or unfolded where it was. */
export function withFold(state: ViewState, person: number, branch: Branch): readonly Fold[] {
    const others = state.folded.filter((fold) => fold.person !== person || fold.branch !== branch);
    return others.length < state.folded.length ? others : [...others, { person, branch }];
}

function sameSet<Name>(a: ReadonlySet<Name>, b: ReadonlySet<Name>): boolean {
    return a.size === b.size && [...a].every((name) => b.has(name));
}

// "#person=I17&view=pedigree&generations=6&hide=cousins,siblings"; what has its usual value is left out.
export function addressOf(state: ViewState, persons: readonly Person[]): string {
    const parts = new URLSearchParams();
    const person = persons[state.focus - 1];
    if (person?.xref) parts.set("person", person.xref);
    else parts.set("number", String(state.focus));
    const { view } = state;
    if (view !== "family") parts.set("view", view);
    if (state.generations !== kUsualGenerations) parts.set("generations", String(state.generations));
    if (hasUp(view) && state.up !== kUsualUp) parts.set("up", String(state.up));
    if (hasDown(view) && state.down !== kUsualDown) parts.set("down", String(state.down));
    if (hasDirection(view) && state.direction !== "down") parts.set("direction", state.direction);
    if (view === "kinship" && state.to) parts.set("to", persons[state.to - 1]?.xref || String(state.to));
    if (hasCompact(view) && state.compact) parts.set("compact", "yes");
    if (state.mirrored !== null) parts.set("mirror", state.mirrored ? "yes" : "no");
    if (state.folded.length > 0) parts.set("fold", state.folded.map((fold) => foldWord(fold, persons)).join(","));
    if (state.show.size > 0) parts.set("show", kShownFacts.filter((fact) => state.show.has(fact)).join(","));
    if (state.photos) parts.set("photos", "boxes");
    const hide = [...state.hidden, ...(state.unknownParents ? [] : [kUnknownParents])];
    if (state.parentFamily) parts.set("parents", `${state.parentsOf}.${state.parentFamily}`);
    if (hide.length > 0) parts.set("hide", hide.join(","));
    return "#" + parts.toString().replaceAll("%2C", ",");
}

// What "hide" names beside the groups of relatives.
const kUnknownParents = "unknownParents";
const kParts = [
    "person",
    "number",
    "view",
    "generations",
    "up",
    "down",
    "direction",
    "to",
    "compact",
    "mirror",
    "fold",
    "show",
    "photos",
    "hide",
    "parents",
];

// Whatever an address does not name, or names wrongly, is as in the state that it is read into.
export function readAddress(address: string, persons: readonly Person[], usual: ViewState): ViewState {
    const parts = new URLSearchParams(address.replace(/^#/, ""));
    if (![...parts.keys()].some((key) => kParts.includes(key))) return usual;
    const hidden = (parts.get("hide") ?? "").split(",");
    const to = personIn(parts.get("to") ?? "", persons);
    const view = kViewNames.find((name) => name === parts.get("view")) ?? "family";
    return {
        focus: focusIn(parts, persons) || usual.focus,
        view: view === "kinship" && !to ? "family" : view,
        generations: clampGenerations(Number(parts.get("generations") ?? kUsualGenerations)),
        up: clampDepth(Number(parts.get("up") ?? kUsualUp), kUsualUp),
        down: clampDepth(Number(parts.get("down") ?? kUsualDown), kUsualDown),
        direction: kDirections.find((name) => name === parts.get("direction")) ?? "down",
        to,
        ...parentsIn(parts.get("parents") ?? "", persons),
        unknownParents: !hidden.includes(kUnknownParents),
        compact: parts.get("compact") === "yes",
        mirrored: parts.get("mirror") === "yes" ? true : parts.get("mirror") === "no" ? false : null,
        folded: foldsIn(parts.get("fold") ?? "", persons),
        show: factsIn(parts.get("show") ?? ""),
        photos: parts.get("photos") === "boxes",
        hidden: new Set(kRelativeNames.filter((name) => hidden.includes(name))),
    };
}

/** "dates,places"; what is no fact is left out. */
export function factsIn(text: string): ReadonlySet<ShownFact> {
    const names = text.split(",").map((name) => name.trim());
    return new Set(kShownFacts.filter((fact) => names.includes(fact)));
}

// The person whom an address names and the file does not hold; empty where there is none.
export function unknownPersonIn(address: string, persons: readonly Person[]): string {
    const parts = new URLSearchParams(address.replace(/^#/, ""));
    if (!focusIn(parts, persons)) return parts.get("person") ?? parts.get("number") ?? "";
    const to = parts.get("to") ?? "";
    return to && !personIn(to, persons) ? to : "";
}

export function clampGenerations(generations: number): number {
    if (!Number.isFinite(generations)) return kUsualGenerations;
    return Math.min(kMostGenerations, Math.max(kLeastGenerations, Math.round(generations)));
}

/** 0 to kMostDepth; 0 is all. */
export function clampDepth(depth: number, usual: number): number {
    if (!Number.isFinite(depth)) return usual;
    return Math.min(kMostDepth, Math.max(0, Math.round(depth)));
}

function focusIn(parts: URLSearchParams, persons: readonly Person[]): number {
    const xref = parts.get("person");
    if (xref) return personOfXref(xref.replaceAll("@", ""), persons)?.id ?? 0;
    const id = Number(parts.get("number"));
    return Number.isInteger(id) && persons[id - 1] ? id : 0;
}

// "7.2": the parents of person 7 are the partners of family 2.
function parentsIn(text: string, persons: readonly Person[]): Pick<ViewState, "parentsOf" | "parentFamily"> {
    const [parentsOf = 0, parentFamily = 0] = text.split(".").map(Number);
    const isKnown = persons[parentsOf - 1]?.parentFamilies.some(({ family }) => family === parentFamily);
    return isKnown ? { parentsOf, parentFamily } : { parentsOf: 0, parentFamily: 0 };
}

const kMostFolds = 200; // of an address
const kBranches: readonly string[] = ["up", "down", "beside"] satisfies readonly Branch[];

// "I7.down"; by number where the xref has a sign of the list.
function foldWord({ person, branch }: Fold, persons: readonly Person[]): string {
    const xref = persons[person - 1]?.xref ?? "";
    return `${xref && !/[.,]/.test(xref) ? xref : person}.${branch}`;
}

function foldsIn(text: string, persons: readonly Person[]): Fold[] {
    return text
        .split(",", kMostFolds)
        .map((word) => word.split("."))
        .map(([who = "", branch = ""]) => ({ person: personIn(who, persons), branch: branch as Branch }))
        .filter(({ person, branch }) => person > 0 && kBranches.includes(branch));
}

/** The state in which the person stands in the middle with the next of several families of parents; usual is the file's. */
export function withNextParents(person: Person, usual: number, state: ViewState): Partial<ViewState> {
    const families = person.parentFamilies.map(({ family }) => family);
    const present = state.parentsOf === person.id ? state.parentFamily : usual;
    const next = families[(families.indexOf(present) + 1) % families.length] ?? 0;
    return { focus: person.id, parentsOf: person.id, parentFamily: next };
}

// By xref or by number.
function personIn(text: string, persons: readonly Person[]): number {
    if (!text) return 0;
    return personOfXref(text.replaceAll("@", ""), persons)?.id ?? persons[Number(text) - 1]?.id ?? 0;
}

// People type an identifier as they like; the file's own letters come first.
function personOfXref(xref: string, persons: readonly Person[]): Person | undefined {
    const capitals = xref.toUpperCase();
    return (
        persons.find((person) => person.xref === xref) ??
        persons.find((person) => person.xref.toUpperCase() === capitals)
    );
}
