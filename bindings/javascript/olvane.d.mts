// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
/// <reference lib="esnext.disposable" />

/**
 * Family trees in JavaScript: which relatives of a person are shown, and where each box and line stands.
 *
 * A family is handed over once, as rows or columns. One call is one whole layout:
 *
 *     const olvane = await loadOlvane();
 *     const family = olvane.family({ persons: [{ id: 17 }, { id: 42 }, { id: 5, father: 17, mother: 42 }] });
 *     for (const record of family.layout(17)) drawBox(record.id, record.x, record.y);
 *
 * Data that lie elsewhere are reached through a host: any object with the eight methods of Host, as the first argument
 * of olvane.layout. It is asked many times, and so takes longer.
 *
 * Units are points; x grows right, y grows down, and (x, y) is the upper-left corner of a box. The size of a box
 * is that of the options, 55 by 80 unless stated otherwise.
 */

/** The answer for a parent whom the host does not know; null and undefined say the same. */
export const PERSON_NOT_FOUND: number;

/**
 * What a host answers. Ids are the host's own, whole numbers of 1 to 2147483647; any other number ends the layout with
 * HostError. So does an answer of another type, such as a promise, since every answer is due at once, and so does a
 * method that throws. The methods are asked many times for the same person, since no answer is kept, and must agree
 * with themselves within one layout.
 */
export interface Host {
    fatherOf(person: number): number | null | undefined;
    motherOf(person: number): number | null | undefined;
    /** In the order of drawing. */
    spousesOf(person: number): Iterable<number>;
    childrenOf(person: number): Iterable<number>;
    /** Whether spouse is the preferred one of person. */
    isPreferredSpouse(person: number, spouse: number): boolean;
    isDead(person: number): boolean;
    /**
     * The date of birth, asked of children, or another date, asked of spouses: in any form, empty or null where it
     * is not known.
     */
    dateOf(person: number, isBirth: boolean): string | null | undefined;
    /** 0 is male; any other whole number counts as female. */
    sexOf(person: number): number;
}

/** Relatives that a family view shows: bits to be added up. */
export const Shown: {
    readonly auntsUncles: 0x01;
    /** Needs aunts and uncles. */
    readonly cousins: 0x02;
    readonly siblings: 0x04;
    readonly siblingSpouses: 0x08;
    readonly niecesNephews: 0x10;
    readonly grandchildren: 0x20;
    readonly greatGrandparents: 0x40;
    readonly spousesOfChildren: 0x80;
    readonly all: 0xff;
};

/** The sizes of the drawing, in points. All are finite. */
export interface Sizes {
    /** Of one person's box; 55. */
    nodeWidth: number;
    /** Of one person's box; 80. */
    nodeHeight: number;
    /** Gap between boxes of a row; 25. */
    horzPadding: number;
    /** Gap between generations; 30. */
    vertPadding: number;
    /** Between the stacked lines of one person's marriages; 10. */
    spouseLineStep: number;
    /** Of a marriage line from a box's left edge, read by the pedigree alone; 0. */
    lineInset: number;
}

/**
 * What is undefined is as if it were not given. A name that is none of these and a value of another type are a
 * TypeError, a number out of its range is a RangeError.
 */
export interface Options {
    /** family: relatives above, beside and below. pedigree: ancestors, lying sideways. */
    view?: "family" | "pedigree" | undefined;
    sizes?: { readonly [Name in keyof Sizes]?: number | undefined } | undefined;
    /** Family view: bits of Shown; all of them if not given. */
    shown?: number | undefined;
    /** Pedigree: columns, the focus's own included: 1 to 1,000; 5. A full ancestry of n is 2 ** n - 1 boxes. */
    generations?: number | undefined;
    /** Pedigree: generations, the focus's own included, in which partners off the chart raise the flag: 0 or more; 4. */
    flagDepth?: number | undefined;
}

/** A straight piece of a line, in points. */
export interface Segment {
    readonly x1: number;
    readonly y1: number;
    readonly x2: number;
    readonly y2: number;
}

interface BoxOfALayout {
    readonly id: number;
    readonly x: number;
    readonly y: number;
    readonly hasHiddenRelatives: boolean;
    readonly segments: readonly Segment[];
}

/** The box of a person. One person may stand in several boxes, and segments may repeat. */
export interface PersonRecord extends BoxOfALayout {
    readonly kind: "person";
    readonly child: null;
}

/** An unknown parent: an empty box, of a negative id, where no parent is known. */
export interface UnknownParentRecord extends BoxOfALayout {
    readonly kind: "missingFather" | "missingMother";
    /** The person whose parent is unknown. */
    readonly child: number;
}

/** One box, and the lines that hang from it; kind says which. */
export type LayoutRecord = PersonRecord | UnknownParentRecord;

/** A layout that did not come to its end. text and records are what was laid out before, often nothing. */
export class LayoutError extends Error {
    readonly status:
        "invalidPerson" | "hostFailed" | "layoutFailed" | "outOfMemory" | "nestedCall" | "invalidId" | "tooLarge";
    readonly text: string;
    readonly records: readonly LayoutRecord[];
}

/** A method of the host threw. What it threw is the cause. */
export class HostError extends LayoutError {
    readonly cause: unknown;
}

export const PICTURE_VIEWS: readonly [
    "family",
    "pedigree",
    "near",
    "ancestors",
    "descendants",
    "hourglass",
    "relatives",
    "fan",
    "kinship",
    "everybody",
];
export type PictureView = (typeof PICTURE_VIEWS)[number];

/** Where later generations can stand, seen from earlier ones. */
export const DIRECTIONS: readonly ["down", "up", "left", "right"];

/**
 * What to draw. What is undefined is as if it were not given; a name that is none of these and a value of another
 * type are a TypeError, a number out of its range is a RangeError. A view ignores options that it has no use for.
 */
/** What an option of a picture takes, for programs that offer the options to a user. */
export interface PictureOptionInfo {
    readonly name: keyof PictureOptions;
    readonly kind: "word" | "flag" | "whole" | "number" | "person" | "list";
    /** Of numbers: the least and the greatest. */
    readonly least: number;
    readonly most: number;
    /** What it is where nobody said otherwise. */
    readonly usual: string | boolean | number | readonly [];
    /** All that it takes, of kind word; else empty. */
    readonly words: readonly string[];
    /** The views that it changes; the others ignore it. */
    readonly views: readonly PictureView[];
}

export interface PictureOptions {
    /** family if not given. */
    view?: PictureView | undefined;
    /** Family view and near: bits of Shown; all of them if not given. */
    shown?: number | undefined;
    /** Pedigree: columns, the focus's own included: 1 to 1,000; 5. */
    generations?: number | undefined;
    /** Kinship: the other person. */
    to?: number | undefined;
    /** Generations of ancestors above the focus; 0 for all. */
    up?: number | undefined;
    /** Generations of descendants below the focus; 0 for all. */
    down?: number | undefined;
    /** Where later generations stand, seen from earlier ones; down. */
    direction?: (typeof DIRECTIONS)[number] | undefined;
    /** Descendants with their spouses; true. */
    spouses?: boolean | undefined;
    /** Ancestors with their siblings; false. */
    siblings?: boolean | undefined;
    /** Generations packed tighter, where the boxes allow it; false. */
    compact?: boolean | undefined;
    /** Whom a fan shows; ancestors. */
    fan?: "ancestors" | "descendants" | undefined;
    /** Of a fan, in degrees: 90 to 360; 360. */
    angle?: number | undefined;
    /** Kinship: which ways are drawn; both. */
    ways?: "blood" | "marriage" | "both" | undefined;
    /** Kinship: how many ways are drawn, the nearest first, and 0 for all; 8. */
    mostWays?: number | undefined;
    /** Kinship: of its words; English. */
    language?: "en" | "de" | "es" | undefined;
    /** Everybody: how many second parent links become marks, -1 for all of them; 0. */
    marks?: number | undefined;
    /** Everybody: steps of work, 0 to 100; 1. */
    effort?: number | undefined;
    /** Everybody: those as well who are not connected with the focus; false. */
    allParts?: boolean | undefined;
    /** Every view: right and left exchanged; false. */
    mirrored?: boolean | undefined;
    /** Near, ancestors, descendants, hourglass, relatives: branches that are left out; none. */
    folded?: Iterable<Fold> | undefined;
    /**
     * Near, ancestors, descendants, hourglass, relatives, kinship, everybody: persons whose boxes are not of the usual size;
     * none. Who is not in the family is passed over, and the last of two sizes for one person counts.
     */
    boxSizes?: Iterable<BoxSize> | undefined;
    /**
     * Everybody, near, ancestors, descendants, hourglass, relatives: width by height of the paper that wide generations
     * are folded for; 0 for no paper.
     */
    aspect?: number | undefined;
    /**
     * Everybody: keep the places of the last picture of everybody that was made with this option of this file, or of
     * the one before it (GedcomFile.takePlacesOf); false.
     */
    keepPlaces?: boolean | undefined;
    /** Of a text at the lines of marriages, in points: families then have a place for it; 0 for none. */
    labelSize?: number | undefined;
    /** Of a file: whether the picture has what a screen draws of lines and cells; false. */
    paths?: boolean | undefined;
    /** Family and pedigree: whether unknown parents have boxes; true. */
    unknownParents?: boolean | undefined;
    /** Whose parents come first where somebody is a child of several families: those by birth, if not given. */
    parents?: "birth" | "adoptive" | "allInOrder" | undefined;
    /** One person, and the family whose partners are that person's parents whatever parents says; 0 for nobody. */
    parentsOf?: number | undefined;
    parentFamily?: number | undefined;
    /** Of a box, in points: 55 by 80. */
    width?: number | undefined;
    height?: number | undefined;
    /** Between neighbours of a generation, and between generations, in points: 25 and 30. */
    gapX?: number | undefined;
    gapY?: number | undefined;
}

export type DrawingTheme = "light" | "dark" | "print";

/** What boxes and lines say beside names and years: whole dates, places, the first occupation, the year of a marriage. */
export const FACTS: readonly ["dates", "places", "occupation", "marriage"];
export type ShownFact = (typeof FACTS)[number];

/** What the box of a person says. A text is empty where nothing is known. */
export interface PersonLabel {
    /** The parts of the name, or what stands in its place as given. */
    readonly given: string;
    readonly surname: string;
    readonly surnameFirst: boolean;
    /** A year, or the whole date. */
    readonly birth: string;
    readonly death: string;
    /** Further lines: the places of birth and death, an occupation. */
    readonly details: readonly string[];
    /** The lines of birth and death: "* 1809", "† 1882"; a cross alone for a death without a date. */
    readonly lines: readonly string[];
    /** The same lines, for where one has no room: years in the place of dates. */
    readonly shortLines: readonly string[];
    /** Birth and death for a sentence: "1809–1882", "born 12 Feb 1809, died 1882". */
    readonly life: string;
}

/** How a picture is drawn as SVG. */
export interface DrawingOptions {
    /** light if not given. */
    readonly theme?: DrawingTheme | undefined;
    /** The form of the boxes; usual is what suits the view: wide ones where generations stand side by side. */
    readonly boxes?: "usual" | "tall" | "wide" | undefined;
    /** What boxes and lines say beside names and years. */
    readonly show?: Iterable<ShownFact> | undefined;
    /** Stands above the picture. Empty for none: the picture is then called after its view and focus. */
    readonly title?: string | undefined;
    /**
     * Photographs in boxes, by the number of the person: addresses of images. A file that is to be seen elsewhere holds them as
     * data. Names have their usual size then, on paper too.
     */
    readonly photos?: Iterable<readonly [number, string]> | undefined;
    /** Of `svg` alone: boxes by their index; the drawing ends around them. All of the picture if not given. */
    readonly part?: Iterable<number> | undefined;
}

/** Paper to draw on. */
export interface PaperOptions {
    /** A4 to A0, letter, or WIDTHxHEIGHT in millimetres. A4 if not given. */
    readonly paper?: string | undefined;
    /** The sheets, 1 to 100 each way; the picture is as large as they allow. 1 if not given. */
    readonly rows?: number | undefined;
    readonly columns?: number | undefined;
    /** By the size at 96 px an inch, on as many sheets as that takes; rows and columns do not count then. */
    readonly scale?: number | undefined;
}

/** One sheet of paper, as the text of an SVG file; rows and columns count from 0. */
export interface PaperSheet {
    readonly row: number;
    readonly column: number;
    readonly svg: string;
}

/** A picture on sheets of paper; blank sheets are left out. */
export interface PaperSheets {
    /** Of one sheet as it lies, in millimetres. */
    readonly width: number;
    readonly height: number;
    /** By the size at 96 px an inch. */
    readonly scale: number;
    /** In points on paper; 0 where there is none. */
    readonly smallestName: number;
    readonly smallestText: number;
    /** Boxes that no sheet shows whole. */
    readonly cutBoxes: number;
    readonly sheets: readonly PaperSheet[];
}

/** A name by its parts; either may be empty. */
export interface NameParts {
    readonly given: string;
    readonly surname: string;
    /** Whether it is read with the surname in front. */
    readonly surnameFirst?: boolean | undefined;
}

/** The room for a name, in px: a line needs the size of its letters and the gap, 3; at most 4 lines. */
export interface NameRoom {
    readonly width: number;
    readonly height: number;
    readonly gap?: number | undefined;
    readonly lines?: number | undefined;
    /** To which letters shrink before anything is cut; 10 where none is given. */
    readonly smallest?: number | undefined;
}

/**
 * Measures and fits texts as drawings do: with the advances of one font, which no other one of fontFamilies exceeds,
 * and line breaks by UAX 14 and 29 of Unicode 15. Sizes and widths are px. Of a text of more than 1,000 bytes the
 * beginning is used.
 */
export interface Texts {
    /** What a screen that uses these widths has as its font-family. */
    readonly fontFamilies: string;
    width(text: string, size: number, bold?: boolean): number;
    /** One line, with an ellipsis where it was too long. */
    fitLine(text: string, size: number, width: number, bold?: boolean): string;
    /** In lines as short as the width, broken as names are; whole is false where something had to be cut. */
    fitLines(
        text: string,
        size: number,
        width: number,
        lines: number,
        bold?: boolean,
    ): { readonly lines: readonly string[]; readonly whole: boolean };
    /** In bold letters of at most 13 px, as large as the room allows. */
    fitName(name: NameParts, room: NameRoom): { readonly size: number; readonly lines: readonly string[] };
    /** In a cell of a round chart, straight, in the largest letters for which it has room; empty where nothing can be read. */
    placeInCell(name: NameParts, facts: readonly string[], cell: FanCell): readonly CellLine[];
    /** Whether the first letter that has a direction is of a script that runs from right to left. */
    runsRightToLeft(text: string): boolean;
    /** Of each text the words as searches compare them, small and without accents and apostrophes, with a space between. */
    foldedWords(texts: Iterable<string>): string[];
    /**
     * A date as a file writes it (GedcomDate.written), in words: "12 Feb 1809", "about 1809", "from 1809 to 1811". As
     * written where it cannot be put into words without loss. Languages are those of GedcomFile.kinship.
     */
    dateText(written: string, language?: string): string;
    /** "Kew, England" for "Kew,,,England". */
    placeText(place: string): string;
    /** "1809–1882" or "about 1809 – 1882", "born 1809", "died before 1882"; empty where neither year is known. */
    yearsText(birth: LifeYear | null, death: LifeYear | null, language?: string): string;
    /** What stands in the place of a name that is not known. */
    unnamedText(language?: string): string;
}

/** A piece of a ring around the middle of a round chart: degrees clockwise from the top, and radii in px. */
export interface FanCell {
    readonly from: number;
    readonly to: number;
    readonly inner: number;
    readonly outer: number;
    /** Whether it is the disc in the middle of the chart. */
    readonly isCentre: boolean;
}

/** A line of text, of which (x, y) is the middle, seen from that of the chart, and turned around it by `turn` degrees. */
export interface CellLine {
    readonly text: string;
    readonly isName: boolean;
    readonly rightToLeft: boolean;
    readonly size: number;
    readonly x: number;
    readonly y: number;
    readonly turn: number;
    /** How far the baseline is below y. */
    readonly baseline: number;
}

/** The year of a birth or death. A year of 0 is not known. */
export type LifeYear = Pick<GedcomDate, "year" | "lastYear" | "mark">;

/** A place in one of the lists of a picture. */
export type PictureIndex = number;

/** One box. Units are points; (x, y) is the upper-left corner. */
export interface PictureBox {
    readonly index: PictureIndex;
    /** 0 for an unknown parent. */
    readonly id: number;
    readonly kind: "person" | "unknownParent";
    readonly x: number;
    readonly y: number;
    readonly width: number;
    readonly height: number;
    readonly sex: Sex;
    /** Of an unknown parent: the box whose parent it is. */
    readonly childOf: PictureIndex | null;
    /** 0 for a person with one box; else it counts the person's boxes from 1. */
    readonly repeat: number;
    /** How many relatives have no box. */
    readonly hidden: { readonly parents: number; readonly partners: number; readonly children: number };
    /** Families that the person is a child of, beside the one that comes first, of whose partners none has a box. */
    readonly furtherParents: number;
    /** The engine's own flag, in its two views; else null. */
    readonly flag: boolean | null;
}

/** A box of a round chart: a piece of a ring, in degrees clockwise from the top. Ring 0 is the middle. */
export interface PictureArc {
    readonly ring: number;
    readonly from: number;
    readonly to: number;
    /** The box at which its line of descent begins: a grandparent's; null nearer to the middle. */
    readonly line: PictureIndex | null;
}

/** Ring i of a round chart reaches from radii[i] to radii[i + 1] around its middle. */
export interface PictureRings {
    readonly radii: readonly number[];
    readonly middleX: number;
    readonly middleY: number;
}

export interface PictureLine {
    readonly role: "marriage" | "drop" | "bar" | "stem" | "link";
    readonly x1: number;
    readonly y1: number;
    readonly x2: number;
    readonly y2: number;
    /** The child that the piece belongs to alone. */
    readonly child: PictureIndex | null;
    /** Where it jumps over another family's line: x on a horizontal piece, y on a vertical one. */
    readonly bridges: readonly number[];
}

/** A family of which two members are shown, and its lines. */
export interface PictureFamily {
    /** The data's own number of the family; 0 without one. */
    readonly number: number;
    readonly parents: readonly PictureIndex[];
    readonly children: readonly PictureIndex[];
    readonly childKinds: readonly ("birth" | "adopted" | "foster" | "step" | "sealing" | "unknown")[];
    readonly style: "married" | "divorced" | "unmarried" | "unknown";
    readonly lines: readonly PictureLine[];
    /**
     * Where a year stands at the marriage line, so that it covers no year of another marriage: a place on the line, and the
     * side of it. Null without a marriage line, and where no labelSize was asked for.
     */
    readonly label: PictureLabel | null;
}

/** A place on a marriage line, and where the text of the size that was asked for stands. */
export interface PictureLabel {
    readonly x: number;
    readonly y: number;
    readonly side: "above" | "below" | "right";
    /** The middle of the text above and below its line, its beginning to the right. */
    readonly textX: number;
    /** Of its baseline. */
    readonly textY: number;
}

/** What is expressed without a line; the boxes of one number belong together. */
export interface PictureMark {
    readonly kind: "samePerson" | "parentsElsewhere" | "partnersElsewhere";
    readonly number: number;
    readonly boxes: readonly PictureIndex[];
}

/** Ancestors; descendants; or partners and, of the focus and its ancestors, siblings with theirs. */
export type Branch = "up" | "down" | "beside";

/** A branch of a person that is left out: everybody to whom only it leads. */
export interface Fold {
    readonly person: number;
    readonly branch: Branch;
}

/** A person whose box has a size of its own, in points of 0 to 1,000,000, as it stands on paper. */
export interface BoxSize {
    readonly person: number;
    readonly width: number;
    readonly height: number;
}

/** How many persons a branch has for itself, and on which side of the box it stands. */
export interface BranchSize {
    readonly branch: Branch;
    readonly count: number;
    readonly side: "top" | "right" | "bottom" | "left";
}

/** A branch that is left out. */
export interface FoldedBranch extends BranchSize {
    readonly box: PictureIndex;
}

/** How lines are drawn that stand for more than a birth or a marriage. */
export interface LineStyle {
    readonly name: "plain" | "divorced" | "unmarried" | "adopted" | "foster" | "step" | "sealing";
    /** For stroke-dasharray; empty for the plain one, and so its meaning. */
    readonly dashes: string;
    /** For a legend, in the language that was asked for. */
    readonly meaning: string;
}

/** Lines of one style, as the data of an SVG path. */
export interface LinePath {
    readonly style: LineStyle;
    readonly data: string;
}

/** What a screen draws of a picture that shows one px for each point, by the rules of the drawings in files. */
export interface PictureArt {
    /** Those that the lines have. */
    readonly styles: readonly LineStyle[];
    /** Of each family its lines, a path for each style. What crosses another family's line jumps over it. */
    readonly lines: readonly (readonly LinePath[])[];
    /** Of each box of a round chart: one of 12 colours, null where it belongs to no line of descent, and its outline. */
    readonly cells: readonly { readonly colour: number | null; readonly outline: string }[];
}

/** What is drawn, as values. arcs has one entry for each box of a round chart, and is empty otherwise. */
export interface Picture {
    readonly view: PictureView;
    readonly focus: PictureIndex;
    readonly boxes: readonly PictureBox[];
    readonly arcs: readonly PictureArc[];
    /** Of a round chart; else null. */
    readonly rings: PictureRings | null;
    readonly families: readonly PictureFamily[];
    readonly marks: readonly PictureMark[];
    readonly folded: readonly FoldedBranch[];
    /** Of a file, where paths were asked for; else null. */
    readonly art: PictureArt | null;
    /** Of the view of kinship; else null. */
    readonly kinship: PictureKinship | null;
}

/** How the focus and another person are related: by which ways, those by blood first, and in words at both ends. */
export interface PictureKinship {
    readonly other: PictureIndex;
    /** What the focus is to the other person; empty where no way is known. */
    readonly focusIs: string;
    /** What the other person is to the focus. */
    readonly otherIs: string;
    /** Places for both texts, each at its box. */
    readonly plates: readonly KinshipPlate[];
    readonly ways: readonly PictureWay[];
}

/**
 * A plate with what the one person is to the other, for bold letters of 10.5 points and lines of 13: where it covers neither a
 * box, with counts on top and marks below it, nor the other plate. (x, y) is its upper-left corner, in points.
 */
export interface KinshipPlate {
    readonly box: PictureIndex;
    readonly x: number;
    readonly y: number;
    readonly width: number;
    readonly height: number;
    /** The whole text. */
    readonly lines: readonly string[];
}

export interface PictureWay {
    readonly kind: "blood" | "legal" | "marriage";
    /** What the other person is to the focus by this way alone. */
    readonly words: string;
    /** From the focus to the other person. */
    readonly boxes: readonly PictureIndex[];
    /** The common ancestors at its top. */
    readonly ancestors: readonly PictureIndex[];
    /** Straight pieces along the lines of families, or beside them where several ways take one line. */
    readonly lines: readonly { readonly x1: number; readonly y1: number; readonly x2: number; readonly y2: number }[];
}

/** A file that is no GEDCOM file. */
export class GedcomError extends Error {}

export type Sex = "male" | "female" | "other";

/** A date as a file gives it. year is 0 where it could not be read; there is no year 0 else, and 44 B.C. is -44. */
export interface GedcomDate {
    readonly written: string;
    readonly year: number;
    /** 1 to 12, and 0 for not given. */
    readonly month: number;
    /** 1 to 31, and 0 for not given. */
    readonly day: number;
    readonly mark: "exact" | "about" | "before" | "after" | "between";
    /** The later year of a range; 0 without one. */
    readonly lastYear: number;
    /** The year in few letters: "1819", "~1819", "<1819", ">1819", "1819-1825", "44 BC". Texts.dateText has whole dates. */
    readonly shown: string;
    /** Says how long something lasted, from, until or between, where the mark alone says after, before or between. */
    readonly period: boolean;
}

/** Something that a file states of a person or a couple. */
export interface Fact {
    /** The file's own tag: BIRT, DEAT, OCCU, RESI, MARR, DIV and so on. */
    readonly tag: string;
    /** What stands behind the tag, or the TYPE below it; often empty. */
    readonly value: string;
    readonly date: GedcomDate | null;
    readonly place: string;
}

/** A source that something is known from. Texts that the file does not give are empty. */
export interface Citation {
    readonly title: string;
    readonly author: string;
    readonly publication: string;
    /** Where in the source. */
    readonly page: string;
    /** What the source says. */
    readonly text: string;
    /** 0 unreliable to 3 primary evidence; null where the file does not say. */
    readonly quality: number | null;
}

/** A picture, recording or document. */
export interface MediaFile {
    readonly title: string;
    /** A path, a name in the archive or an address, as the file has it: nothing was opened. */
    readonly file: string;
    readonly format: string;
}

/** What a file knows beyond names and facts. Shared records are followed; texts that it does not give are empty. */
export interface Details {
    /** What sort of event, in the file's own words. */
    readonly type: string;
    readonly cause: string;
    readonly age: string;
    readonly husbandAge: string;
    readonly wifeAge: string;
    /** Who was responsible: a church, an office. */
    readonly agency: string;
    /** Its lines, joined by line ends. */
    readonly address: string;
    readonly notes: readonly string[];
    readonly citations: readonly Citation[];
    readonly media: readonly MediaFile[];
    /** Addresses as written: check the scheme before one becomes a link. */
    readonly links: readonly string[];
}

export interface DetailedFact extends Fact {
    readonly details: Details;
}

export interface DetailedName {
    readonly text: string;
    /** "married", "aka" and so on, as the file has it; empty where not given. */
    readonly type: string;
    readonly nickname: string;
    readonly details: Details;
}

export interface FamilyDetails extends Details {
    readonly facts: readonly DetailedFact[];
}

export interface PersonDetails extends FamilyDetails {
    /** All names in the order of the file. */
    readonly names: readonly DetailedName[];
}

/** Persons and families count from 1 in the order of the file; 0 is nobody. */
export interface Person {
    readonly id: number;
    /** Without its @; empty if the record has none. */
    readonly xref: string;
    /** The whole name for a person to read; empty where the file gives none. */
    readonly name: string;
    readonly given: string;
    readonly surname: string;
    /** The file writes the surname first, so it is read first. */
    readonly surnameFirst: boolean;
    /** The name as far as anybody reads: one of more than 1,000 bytes of UTF-8 is cut between two characters and ends in an ellipsis. */
    readonly shownName: string;
    /** All the names of the person, the first one included. */
    readonly names: readonly string[];
    readonly sex: Sex;
    readonly dead: boolean;
    readonly birth: GedcomDate | null;
    readonly death: GedcomDate | null;
    readonly father: number;
    readonly mother: number;
    /** The first is the preferred one. */
    readonly spouses: readonly number[];
    readonly children: readonly number[];
    readonly parentFamilies: readonly ParentFamily[];
    /** Families of the person's own, in the order of the file. */
    readonly coupleFamilies: readonly number[];
}

export interface ParentFamily {
    readonly family: number;
    readonly pedigree: "notGiven" | "birth" | "adopted" | "foster" | "sealing" | "other" | "step";
}

/** A family of a GEDCOM file. */
export interface GedcomFamily {
    readonly id: number;
    readonly husband: number;
    readonly wife: number;
    readonly children: readonly number[];
    readonly married: boolean;
    readonly divorced: boolean;
    readonly marriage: GedcomDate | null;
}

/** How a word of a search fits a word of the record; better ones come first. */
export type SearchFit = "whole" | "begins" | "within" | "similar";

/** Why a word of a search has found a person. */
export interface SearchReason {
    readonly foundIn:
        "identifier" | "name" | "nickname" | "marriedName" | "title" | "birth" | "death" | "place" | "other";
    readonly fit: SearchFit;
    /** Of the record, in small letters without accents; of an identifier as it was typed. */
    readonly word: string;
    /** What stands in the record there: "Kew, Surrey, England"; empty for an identifier. */
    readonly text: string;
    /** The word of it that was found, "Surrey"; of a date the whole. */
    readonly written: string;
    /** What the data call it: a tag of GEDCOM, the key of a field; empty for a name. */
    readonly label: string;
    /** The text is a date, for Texts.dateText. */
    readonly isDate: boolean;
}

/** A person whom a search has found. */
export interface SearchHit {
    readonly person: number;
    /** Of the word that fits least. */
    readonly fit: SearchFit;
    /** One for each word of the search. */
    readonly reasons: readonly SearchReason[];
}

/** How somebody is related to somebody else, in words; both empty where they are not. */
export interface KinshipWords {
    /** Without how many ways there are: "uncle (mother's brother)", "wife and first cousin". */
    readonly text: string;
    /** The nearest way alone, without the side: "uncle", "wife". */
    readonly short: string;
    /**
     * The same in fewer letters, each shorter than the one before, for where short has no room: "3rd great-grandmother",
     * "kin, 5th degree". May be empty.
     */
    readonly shorter: readonly string[];
}

/** How two persons are related. */
export interface Kinship {
    /** What b is to a: "second cousin; related in 3 ways"; empty where they are not related. */
    readonly text: string;
    /** Nearest first, of each sort 50 at most. Of those over marriages, the shortest alone. */
    readonly ways: readonly KinshipWay[];
}

export interface KinshipWay {
    /** "legal" has a link by adoption, fostering or the like. */
    readonly sort: "blood" | "legal" | "marriage";
    readonly text: string;
    /** From a to b. */
    readonly persons: readonly number[];
}

/** A sentence of the reader and what stands in its places: numbers, names of encodings or of kinds. */
export interface DiagnosticPhrase {
    readonly sentence: string;
    readonly arguments: readonly string[];
}

/** Something wrong in a file, without words: Olvane.diagnosticWords has them. */
export interface Diagnostic {
    /** From 1; 0 where no line can be named. */
    readonly line: number;
    readonly severity: "error" | "warning" | "note";
    /** "levelJump", "danglingPointer" and so on. */
    readonly kind: string;
    readonly what: DiagnosticPhrase;
    readonly done: readonly DiagnosticPhrase[];
    /** Of the file; empty where nothing is quoted. */
    readonly quoted: string;
}

/** Something wrong in a file or odd in its data, in words. */
export interface Remark {
    /** "levelJump", "diedBeforeBirth" and so on. */
    readonly kind: string;
    /** "odd" of what the data say. */
    readonly severity: "error" | "warning" | "note" | "odd";
    readonly line: number;
    /** Those concerned, as the text names them. */
    readonly persons: readonly number[];
    readonly text: string;
    /** What was done about it; empty for what is odd. */
    readonly hint: string;
}

/** A GEDCOM file that has been read. Memory outside of JavaScript is held until close. */
export class GedcomFile {
    /** persons[0] is person 1. */
    readonly persons: readonly Person[];
    readonly families: readonly GedcomFamily[];
    readonly diagnostics: readonly Diagnostic[];
    readonly name: string;
    /** How the bytes were read: "UTF-8", "UTF-16LE", "ANSEL", "windows-1252" and so on. */
    readonly encoding: string;
    /** As written: "5.5.1", "7.0"; empty if not given. */
    readonly version: string;
    /** Everything that the file states of a person, in its order. */
    factsOfPerson(id: number): readonly Fact[];
    factsOfFamily(id: number): readonly Fact[];
    /** The one of a person's parentFamilies that father and mother come from; 0 for none. RangeError for nobody. */
    parentFamilyOf(id: number): number;
    /**
     * Everybody with whom a person has one of the first parents in common, each once: the father's children, then those that
     * only the mother has. RangeError for nobody.
     */
    siblingsOf(id: number): readonly number[];
    /** Whom to show first where nobody said: the person with the most relatives near; 0 in a file of nobody. */
    readonly bestFocus: number;
    /** What drawings with these facts say in the box of a person; GedcomError for nobody. */
    labelOfPerson(id: number, show?: Iterable<ShownFact>, language?: string): PersonLabel;
    /** Of many persons in one question, in their order. */
    labelsOfPersons(ids: Iterable<number>, show?: Iterable<ShownFact>, language?: string): PersonLabel[];
    /** What they say at the marriage line of a family; empty for nothing. */
    labelOfFamily(id: number, show?: Iterable<ShownFact>, language?: string): string;
    /**
     * Whom a text may mean, the best first. The words of the text stand in the record in any order: whole, as a beginning or,
     * from three letters on, from the middle; where nobody is found so, with one letter wrong, missing, too many or
     * exchanged. Case, accents and apostrophes do not count. "1819-1825" is any year of birth or death in it. The first search
     * makes an index, or what prepareSearch has left of it.
     */
    search(text: string, limit?: number): SearchHit[];
    /**
     * Makes the index of searches for about that many milliseconds, or all of it. True once it is complete: a program that
     * asks whenever it has nothing else to do has no slow first search. Throws GedcomError where memory runs out.
     */
    prepareSearch(milliseconds?: number): boolean;
    /**
     * Notes, sources, media and links beside facts and names; facts in the order of a life, from birth to burial, and those
     * without a date before death. Throws GedcomError for nobody.
     */
    detailsOfPerson(id: number): PersonDetails;
    detailsOfFamily(id: number): FamilyDetails;
    /** First what was wrong in the file, then what is odd in its data: what a check of the file lists. */
    remarks(language?: string): Remark[];
    /**
     * What b is to a, and every way between them. Languages are "en", "de" and "es", with or without a region; English for
     * others. Throws RangeError for somebody who is not in the file.
     */
    kinship(a: number, b: number, language?: string): Kinship;
    /** What each of the persons is to the focus: many times as fast as kinship of each. */
    kinshipWords(focus: number, persons: Iterable<number>, language?: string): KinshipWords[];
    /** As Olvane.layout, with the file as the host. Asks for a million relatives at most, and else is tooLarge. */
    layout(focus: number, options?: Options): LayoutRecord[];
    layoutText(focus: number, options?: Options): string;
    /** The picture of a view, with its lines. Throws LayoutError, and TypeError and RangeError as the options say. */
    picture(focus: number, options?: PictureOptions): Picture;
    /**
     * The branches up, down and beside of a person in a picture, with how many persons each hides where it is folded, or
     * would hide.
     */
    branches(focus: number, person: number, options?: PictureOptions): readonly BranchSize[];
    /** The form of a view's boxes where nobody chose. Throws TypeError for another word. */
    usualBoxes(view?: PictureView, direction?: NonNullable<PictureOptions["direction"]>): "tall" | "wide";
    /**
     * On which side of its parents' box a child stands in the picture of a view: below in most. Throws TypeError for
     * another word.
     */
    laterSide(
        view?: PictureView,
        direction?: NonNullable<PictureOptions["direction"]>,
        mirrored?: boolean,
    ): "top" | "right" | "bottom" | "left";
    /**
     * This file is a later version of another, which is open still: its next picture with keepPlaces keeps the places of
     * the other's last one, for all persons who have the same xref in both. False where there is no such picture.
     */
    takePlacesOf(earlier: GedcomFile): boolean;
    /**
     * The picture as the text of an SVG file, byte for byte as olvane draw writes it for the same options; the sizes
     * in options are those of the boxes' form instead. Throws as picture does.
     */
    svg(focus: number, options?: PictureOptions, drawing?: DrawingOptions): string;
    /** The same picture on sheets of paper, the same bytes that the command draws with --fit. */
    sheets(focus: number, options?: PictureOptions, drawing?: DrawingOptions, paper?: PaperOptions): PaperSheets;
    /** As that of Olvane. */
    readonly texts: Texts;
    /** Everybody as a map, as bytes; olvane/charts/MapIndex.h of the C++ sources describes their form. */
    mapIndex(): Uint8Array<ArrayBuffer>;
    /**
     * Releases the memory; nothing can be asked afterwards but what was read out before. A file that nobody holds any more
     * is closed in time.
     */
    close(): void;
    [Symbol.dispose](): void;
}

/** Whole numbers of 1 to 2147483647; 0, null and undefined are nobody. */
type Id = number | bigint | null | undefined;
type Text = string | number | Date | null | undefined;
export type NameKind = "full" | "given" | "surname" | "prefix" | "suffix" | "nickname" | "married" | "other";
export type FamilyState = "married" | "divorced" | "unmarried" | "unknown";
export type ChildKind = "birth" | "adopted" | "foster" | "step" | "sealing" | "unknown";
type NumbersOf = Int8Array | Uint8Array | Int32Array | Uint32Array | BigInt64Array | Float64Array;

/** Rows as objects; or columns: for each field an array of its values, or a typed array where they are numbers. */
export type FamilyTable<Row> = Iterable<Row> | { readonly [Field in keyof Row]?: readonly Row[Field][] | NumbersOf };

/** Columns beside these become names, by their kind, or fields for labels. */
export interface PersonRow {
    readonly id: Id;
    readonly father?: Id;
    readonly mother?: Id;
    /** 0, "m" or "male"; 1, "f" or "female"; 2 or "unknown", which is the default. */
    readonly sex?: number | string | null | undefined;
    readonly dead?: boolean | number | null | undefined;
    /** In a form that sorts, as "1809-02-12" does. */
    readonly birth?: Text;
    readonly death?: Text;
    /** For people to read; the sorting form by default. */
    readonly birthWritten?: Text;
    readonly deathWritten?: Text;
    readonly [column: string]: unknown;
}

export interface FamilyRow {
    /** From 1 in the order of the rows, where no row has one. */
    readonly number?: Id;
    readonly partner0?: Id;
    readonly partner1?: Id;
    readonly state?: FamilyState | number | null | undefined;
    readonly marriage?: Text;
    readonly marriageWritten?: Text;
    readonly marriagePlace?: Text;
}

export interface FamilyRows {
    readonly persons?: FamilyTable<PersonRow> | undefined;
    /** One row for each of the two lists that a couple stands in. Not given, the lists follow from the families. */
    readonly spouses?: FamilyTable<{ person: Id; spouse: Id; preferred?: boolean | number | null }> | undefined;
    /** Not given, the lists follow from the families, and from father and mother. */
    readonly children?: FamilyTable<{ parent: Id; child: Id }> | undefined;
    readonly families?: FamilyTable<FamilyRow> | undefined;
    readonly familyChildren?: FamilyTable<{ family: Id; child: Id; kind?: ChildKind | number }> | undefined;
    readonly names?: FamilyTable<{ person: Id; kind?: NameKind | number; text: Text }> | undefined;
    readonly fields?: FamilyTable<{ person: Id; key: string; text: Text }> | undefined;
}

/** A person as the table has it. Relatives are ids, and 0 is nobody. */
export interface FamilyPerson {
    readonly id: number;
    readonly father: number;
    readonly mother: number;
    readonly sex: "male" | "female" | "unknown";
    readonly dead: boolean;
    readonly birth: string;
    readonly death: string;
    readonly birthWritten: string;
    readonly deathWritten: string;
    readonly spouses: readonly number[];
    readonly preferred: number;
    readonly children: readonly number[];
    readonly names: readonly { readonly kind: NameKind; readonly text: string }[];
    readonly fields: { readonly [key: string]: string };
}

export interface StoredFamily {
    readonly number: number;
    readonly partner0: number;
    readonly partner1: number;
    readonly state: FamilyState;
    readonly marriage: string;
    readonly marriageWritten: string;
    readonly marriagePlace: string;
    readonly children: readonly { readonly child: number; readonly kind: ChildKind }[];
}

interface NewFamily extends FamilyRow {
    readonly number: Id;
    readonly children?: Iterable<Id | { readonly child: Id; readonly kind?: ChildKind | number }>;
}

/** What a family refuses: nothing has changed then. */
export class FamilyError extends Error {
    /** "persons", "spouses", "children", "families", "family children", "names" or "fields". */
    readonly table: string;
    /** From 0; null for an edit and for a whole column. */
    readonly row: number | null;
    /** The person or the family of an edit; else null. */
    readonly id: number | null;
    readonly field: string;
}

/**
 * A family that the module holds, made by olvane.family. What is wrong is refused with FamilyError before anything
 * changes. Memory outside of JavaScript is held until close, or until nobody holds the family any more.
 */
export class Family extends EventTarget {
    private constructor();
    readonly size: number;
    readonly memoryBytes: number;
    /** In the order in which they were added. */
    readonly ids: readonly number[];
    readonly familyNumbers: readonly number[];
    has(person: number): boolean;
    /** Throws RangeError for somebody who is not there. */
    person(person: number): FamilyPerson;
    family(number: number): StoredFamily;
    /** Parents get a new person at the end of their children. */
    addPerson(row: PersonRow): void;
    /** In place of the person of that id; a field that is not given gets its default. */
    setPerson(row: PersonRow): void;
    /** With everything that names the person. */
    removePerson(person: number): void;
    /** The list and nothing else; preferred is one of them, or 0. */
    setSpouses(person: number, spouses: Iterable<number>, preferred?: number): void;
    setChildren(person: number, children: Iterable<number>): void;
    setNames(person: number, names: Iterable<{ readonly kind?: NameKind | number; readonly text: string }>): void;
    /** An empty text removes the field. */
    setField(person: number, key: string, text: string): void;
    /** Partners and children enter each other's lists where they are missing. */
    addFamily(row: NewFamily): void;
    setFamily(row: NewFamily): void;
    /** Partners whom no other family joins are no longer each other's spouses. */
    removeFamily(number: number): void;
    /** For undo: made at once, whatever the size, and changed on its own. */
    copy(): Family;
    /**
     * Whom a text may mean, the best first. The words of the text stand in the record in any order: whole, as a beginning or,
     * from three letters on, from the middle; where nobody is found so, with one letter wrong, missing, too many or
     * exchanged. Case, accents and apostrophes do not count. "1819-1825" is any year of birth or death in it. The first search
     * after an edit makes an index.
     */
    search(text: string, limit?: number): SearchHit[];
    /**
     * The family as the text of a GEDCOM file. The person of id 17 has the identifier "17" in it, and family 5 is "F5". Of the
     * fields, occupation, note, birthPlace and deathPlace become what GEDCOM has for them, all others facts of that type.
     */
    gedcom(): string;
    layout(focus: number, options?: Options): LayoutRecord[];
    layoutText(focus: number, options?: Options): string;
    /** The picture of any view, with its lines. Throws LayoutError, and TypeError and RangeError as the options say. */
    picture(focus: number, options?: PictureOptions): Picture;
    /** Releases the memory; nothing can be asked afterwards. */
    close(): void;
    [Symbol.dispose](): void;
}

export interface WorkerReadOptions {
    readonly encoding?: string;
    /** Called with the part that has been read, from 0 to 1. */
    readonly onProgress?: (part: number) => void;
    readonly signal?: AbortSignal;
}

/** Lets a worker read files for Olvane.readGedcomIn. Called in the worker, with its global scope. */
export function serveReading(scope: { onmessage: unknown; postMessage: unknown; close: unknown }): void;

export class Olvane {
    readonly texts: Texts;
    /** "MAJOR.MINOR.PATCH". */
    readonly version: string;
    /** The encodings that readGedcom knows, by the names to show, the usual ones first. */
    readonly encodings: readonly string[];
    /** All options of a picture: their names, what they take, and which views they change. */
    readonly pictureOptions: readonly PictureOptionInfo[];
    /** The papers that have a name, for GedcomFile.sheets. */
    readonly papers: readonly string[];
    /** Takes over a family: none of the rows is looked at again. Throws FamilyError. */
    family(rows?: FamilyRows): Family;
    /** One record for each box, in the order of the walk. Throws LayoutError; TypeError and RangeError as Options say. */
    layout(host: Host | Family, focus: number, options?: Options): LayoutRecord[];
    /** The engine's own line of text. Throws as layout does. */
    layoutText(host: Host | Family, focus: number, options?: Options): string;
    /** The picture of any view, of a host that is asked as far as the view reaches. Throws as layout does. */
    picture(host: Host | Family, focus: number, options?: PictureOptions): Picture;
    /** What was wrong, and what was done about it. Languages are as those of GedcomFile.kinship. */
    diagnosticWords(
        diagnostic: Pick<Diagnostic, "what" | "done" | "quoted">,
        language?: string,
    ): { readonly text: string; readonly hint: string };
    /** The member of a GEDZIP archive that the file of a medium stands for; null for what lies outside the archive. */
    archiveMember(file: string): string | null;
    /**
     * Reads the bytes of a GEDCOM file, 5.5 to 7.0, in any encoding that is known. Where the file's own word on its
     * encoding is wrong, options name another, such as "windows-1251". Throws GedcomError.
     */
    readGedcom(bytes: Uint8Array, name?: string, options?: { readonly encoding?: string }): GedcomFile;
    /**
     * As readGedcom, in a worker that has called serveReading: the page stays free, hears of progress and may end the
     * reading. The worker ends by itself. Rejects with GedcomError for a file that is refused, with the signal's reason
     * where it was ended, and with Error where the worker cannot run.
     */
    readGedcomIn(worker: Worker, bytes: Uint8Array, name?: string, options?: WorkerReadOptions): Promise<GedcomFile>;
}

/**
 * Makes the engine ready. module is the compiled WebAssembly module or its bytes; without it, olvane.wasm is read
 * from beside this file.
 */
export function loadOlvane(module?: WebAssembly.Module | BufferSource): Promise<Olvane>;
