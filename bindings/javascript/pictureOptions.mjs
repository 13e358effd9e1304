// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What a caller asks of a picture, checked before the module hears of it, as options.mjs does for layouts.

import { BRANCHES } from "./picture.mjs";
import { DIRECTIONS, FACTS, PICTURE_VIEWS, Shown, described } from "./values.mjs";

const FANS = ["ancestors", "descendants"];
const WAYS = ["blood", "marriage", "both"];

const LANGUAGES = ["en", "de", "es"];
const PARENTS = ["birth", "adoptive", "allInOrder"];

const MOST = 2 ** 31 - 1;
const LARGEST_SIZE = 1_000_000;

/** In the order of set_picture_options. */
const OPTIONS = {
    view: { words: PICTURE_VIEWS, usual: "family" },
    shown: { least: 0, most: Shown.all, usual: Shown.all },
    generations: { least: 1, most: 1000, usual: 5 },
    to: { least: 0, most: MOST, usual: 0 },
    up: { least: 0, most: MOST, usual: 0 },
    down: { least: 0, most: MOST, usual: 0 },
    direction: { words: DIRECTIONS, usual: "down" },
    spouses: { flag: true, usual: true },
    siblings: { flag: true, usual: false },
    compact: { flag: true, usual: false },
    fan: { words: FANS, usual: "ancestors" },
    angle: { least: 90, most: 360, usual: 360 },
    ways: { words: WAYS, usual: "both" },
    mostWays: { least: 0, most: MOST, usual: 8 },
    language: { words: LANGUAGES, usual: "en" },
    marks: { least: -1, most: MOST, usual: 0 },
    effort: { least: 0, most: 100, usual: 1 },
    allParts: { flag: true, usual: false },
    unknownParents: { flag: true, usual: true },
    parents: { words: PARENTS, usual: "birth" },
    parentsOf: { least: 0, most: MOST, usual: 0 },
    parentFamily: { least: 0, most: MOST, usual: 0 },
    width: { size: true, usual: 55 },
    height: { size: true, usual: 80 },
    gapX: { size: true, usual: 25 },
    gapY: { size: true, usual: 30 },
    aspect: { size: true, usual: 0 },
    keepPlaces: { flag: true, usual: false },
    labelSize: { size: true, usual: 0 },
    mirrored: { flag: true, usual: false },
    folded: { folds: true, usual: [] },
    boxSizes: { boxes: true, usual: [] },
};

function wordNumber(name, value, words) {
    const number = words.indexOf(value);
    if (number >= 0) return number;
    throw new TypeError(`${name} is ${described(value)}, and takes one of ${words.join(", ")}`);
}

function flagNumber(name, value) {
    if (typeof value === "boolean") return value ? 1 : 0;
    throw new TypeError(`${name} is ${described(value)}, and takes true or false`);
}

function plainNumber(name, value, { least, most, size }) {
    if (typeof value !== "number") throw new TypeError(`${name} is ${described(value)}, and takes a number`);
    if (size) {
        if (Number.isFinite(Math.fround(value)) && value >= 0) return value;
        throw new RangeError(`${name} is ${value}, and takes a finite number of 0 or more`);
    }
    if (Number.isInteger(value) && value >= least && value <= most) return value;
    throw new RangeError(`${name} is ${value}, and takes a whole number of ${least} to ${most}`);
}

/** How many folds there are, then the person and the branch of each. */
function foldNumbers(folds) {
    const numbers = [...folds].flatMap(({ person, branch }) => [
        plainNumber("folded", person, { least: 1, most: MOST }),
        wordNumber("folded", branch, BRANCHES),
    ]);
    return [numbers.length / 2, ...numbers];
}

/** How many boxes have a size of their own, then the person, the width and the height of each. */
function boxNumbers(boxes) {
    const length = (value) => {
        const points = plainNumber("boxSizes", value, { size: true });
        if (points <= LARGEST_SIZE) return points;
        throw new RangeError(`boxSizes is ${value}, and takes a number of 0 to ${LARGEST_SIZE}`);
    };
    const numbers = [...boxes].flatMap(({ person, width, height }) => [
        plainNumber("boxSizes", person, { least: 1, most: MOST }),
        length(width),
        length(height),
    ]);
    return [numbers.length / 3, ...numbers];
}

function numberOf(name, value, option) {
    if (option.boxes) return boxNumbers(value);
    if (option.folds) return foldNumbers(value);
    if (option.words) return wordNumber(name, value, option.words);
    return option.flag ? flagNumber(name, value) : plainNumber(name, value, option);
}

const THEMES = ["light", "dark", "print"];
const BOXES = ["usual", "tall", "wide"];

/** Facts beside names and years, as bits. */
export function factBits(show) {
    return [...show].reduce((bits, fact) => bits | (1 << wordNumber("show", fact, FACTS)), 0);
}

/** The form of boxes where nobody chose, by what usual_boxes says. */
export function usualBoxesFrom({ exports }, view, direction) {
    const numbers = [wordNumber("view", view, PICTURE_VIEWS), wordNumber("direction", direction, DIRECTIONS)];
    return BOXES[exports.usual_boxes(...numbers)];
}

/** What a caller asks of a drawing, as the module's numbers. */
export function drawingNumbers({ theme = "light", boxes = "usual", show = [], title = "", ...rest }) {
    const unknown = Object.keys(rest)[0];
    if (unknown !== undefined) throw new TypeError(`there is no option ${unknown}, but theme, boxes, show, title`);
    return {
        theme: wordNumber("theme", theme, THEMES),
        boxes: wordNumber("boxes", boxes, BOXES),
        facts: factBits(show),
        title: String(title),
    };
}

/** Boxes by their index, as the module reads them; empty for all of the picture. */
export function partText(part = []) {
    return [...part].map((index) => plainNumber("part", index, { least: 0, most: MOST })).join(" ");
}

/** A paper and its sheets, with the command's meaning. */
export function paperNumbers({ paper = "A4", rows = 1, columns = 1, scale = 0, ...rest }) {
    const unknown = Object.keys(rest)[0];
    if (unknown !== undefined) throw new TypeError(`there is no option ${unknown}, but paper, rows, columns, scale`);
    for (const [name, value] of Object.entries({ rows, columns })) plainNumber(name, value, { least: 1, most: 100 });
    if (scale !== 0 && !(scale >= 0.01 && scale <= 100)) {
        throw new RangeError(`scale is ${described(scale)}, and takes 0 or a number of 0.01 to 100`);
    }
    return { paper: String(paper), rows, columns, scale };
}

/** All options as numbers, in the order of set_picture_options. */
export function pictureNumbers(options) {
    if (typeof options !== "object" || options === null) {
        throw new TypeError(`options is ${described(options)}, and takes an object`);
    }
    for (const name of Object.keys(options)) {
        if (!Object.hasOwn(OPTIONS, name)) {
            throw new TypeError(`there is no option ${name}, but ${Object.keys(OPTIONS).join(", ")}`);
        }
    }
    return Object.entries(OPTIONS).flatMap(([name, option]) => numberOf(name, options[name] ?? option.usual, option));
}
