// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What a caller asks of a picture, checked before the module makes it, as options.mjs does for layouts. The module's table
// says which options there are and what they take.

import { BRANCHES } from "./picture.mjs";
import { DIRECTIONS, FACTS, PICTURE_VIEWS, described } from "./values.mjs";

const MOST = 2 ** 31 - 1;

/** What an option takes, by the numbers that the module has for it. */
const KINDS = ["word", "flag", "whole", "number", "person", "list"];

const tables = new WeakMap();

/** The module's own table of options, asked for once. */
function tableOf(instance) {
    let table = tables.get(instance);
    if (!table) {
        const rows = JSON.parse(instance.text(instance.exports.picture_option_table()));
        table = rows.map(([name, kind, least, most, usual, words, views]) => ({
            ...{ name, kind: KINDS[kind], least, most, usual, words },
            views: PICTURE_VIEWS.filter((_, i) => ((views >> i) & 1) === 1),
        }));
        tables.set(instance, table);
    }
    return table;
}

/** The table for who offers options to a user; usual is what the option takes, as least and most are numbers. */
export function pictureOptionsFrom(instance) {
    return tableOf(instance).map(({ usual, ...option }) => {
        if (option.kind === "list") return { ...option, usual: [] };
        if (option.kind === "word") return { ...option, usual: option.words[usual] };
        return { ...option, usual: option.kind === "flag" ? usual !== 0 : usual };
    });
}

function wordNumber(name, value, words) {
    const number = words.indexOf(value);
    if (number >= 0) return number;
    throw new TypeError(`${name} is ${described(value)}, and takes one of ${words.join(", ")}`);
}

function flagNumber(name, value) {
    if (typeof value === "boolean") return value ? 1 : 0;
    throw new TypeError(`${name} is ${described(value)}, and takes true or false`);
}

function plainNumber(name, value, { kind = "whole", least, most }) {
    if (typeof value !== "number") throw new TypeError(`${name} is ${described(value)}, and takes a number`);
    const isWhole = kind !== "number";
    if ((!isWhole || Number.isInteger(value)) && value >= least && value <= most) return value;
    throw new RangeError(
        `${name} is ${value}, and takes a ${isWhole ? "whole number" : "number"} of ${least} to ${most}`,
    );
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
function boxNumbers(boxes, size) {
    const length = (value) => plainNumber("boxSizes", value, size);
    const numbers = [...boxes].flatMap(({ person, width, height }) => [
        plainNumber("boxSizes", person, { least: 1, most: MOST }),
        length(width),
        length(height),
    ]);
    return [numbers.length / 3, ...numbers];
}

function numberOf(option, value) {
    const { name, kind, words } = option;
    if (kind === "word") return wordNumber(name, value, words);
    return kind === "flag" ? flagNumber(name, value) : plainNumber(name, value, option);
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

/** The number of the side on which children stand in a picture. */
export function laterSideFrom({ exports }, view, direction, mirrored) {
    const numbers = [wordNumber("view", view, PICTURE_VIEWS), wordNumber("direction", direction, DIRECTIONS)];
    return exports.later_side(...numbers, flagNumber("mirrored", mirrored));
}

/** What a caller asks of a drawing, as the module's numbers. */
export function drawingNumbers({ theme = "light", boxes = "usual", show = [], title = "", photos = [], ...rest }) {
    const unknown = Object.keys(rest)[0];
    if (unknown !== undefined)
        throw new TypeError(`there is no option ${unknown}, but theme, boxes, show, title, photos`);
    return {
        theme: wordNumber("theme", theme, THEMES),
        boxes: wordNumber("boxes", boxes, BOXES),
        facts: factBits(show),
        title: String(title),
        photos: new Map(photos),
    };
}

/** The persons with a photograph, as the module reads them. */
export function photoText(photos) {
    const persons = [...photos.keys()].map((id) => plainNumber("photos", id, { least: 1, most: MOST }));
    return persons.length > 0 ? ` ${persons.join(" ")} ` : "";
}

/** A drawing with the addresses of its photographs, which the module knows by number alone. */
export function withPhotos(svg, photos) {
    if (photos.size === 0) return svg;
    return svg.replace(/ href="photo:(\d+)"/g, (_, id) => ` href="${escapedValue(String(photos.get(Number(id))))}"`);
}

function escapedValue(text) {
    return text.replaceAll("&", "&amp;").replaceAll('"', "&quot;").replaceAll("<", "&lt;");
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

/** All options as numbers: in the order of the table, then the two lists. */
export function pictureNumbers(instance, options) {
    if (typeof options !== "object" || options === null) {
        throw new TypeError(`options is ${described(options)}, and takes an object`);
    }
    const table = tableOf(instance);
    const names = table.map(({ name }) => name);
    for (const name of Object.keys(options)) {
        if (!names.includes(name)) throw new TypeError(`there is no option ${name}, but ${names.join(", ")}`);
    }
    const { folded, boxSizes } = options;
    const numbers = table
        .filter(({ kind }) => kind !== "list")
        .map((option) => {
            const value = options[option.name];
            return value === undefined || value === null ? option.usual : numberOf(option, value);
        });
    const width = table.find(({ name }) => name === "width");
    return [...numbers, ...foldNumbers(folded ?? []), ...boxNumbers(boxSizes ?? [], width)];
}
