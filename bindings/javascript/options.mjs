// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What a caller asks for, checked before the module hears of it. A wrong type is a TypeError and a number out of
// its range a RangeError; either names the option and what it takes.

import { Shown, described } from "./values.mjs";

const VIEWS = { family: 0, pedigree: 1 };

const SIZES = {
    nodeWidth: 55,
    nodeHeight: 80,
    horzPadding: 25,
    vertPadding: 30,
    spouseLineStep: 10,
    lineInset: 0,
};

const WHOLE_NUMBERS = {
    shown: { usual: Shown.all, least: 0, most: Shown.all },
    generations: { usual: 5, least: 1, most: 1000 },
    flagDepth: { usual: 4, least: 0, most: 2 ** 31 - 1 },
};

const OPTIONS = ["view", "sizes", ...Object.keys(WHOLE_NUMBERS)];

function checkObject(name, value) {
    if (typeof value === "object" && value !== null) return;
    throw new TypeError(`${name} is ${described(value)}, and takes an object`);
}

function checkNames(kind, given, known) {
    for (const name of Object.keys(given)) {
        if (known.includes(name)) continue;
        const place = Object.hasOwn(SIZES, name) ? `; ${name} is one of the sizes` : "";
        throw new TypeError(`there is no ${kind} ${name}, but ${known.join(", ")}${place}`);
    }
}

function checkNumber(name, value) {
    if (typeof value !== "number") throw new TypeError(`${name} is ${described(value)}, and takes a number`);
}

function viewNumber(view = "family") {
    if (typeof view === "string" && Object.hasOwn(VIEWS, view)) return VIEWS[view];
    throw new TypeError(`there is no view ${described(view)}, but "family" and "pedigree"`);
}

// The module reckons with single precision, in which a large number may be infinite.
function sizeNumber(name, size = SIZES[name]) {
    checkNumber(`sizes.${name}`, size);
    if (Number.isFinite(Math.fround(size))) return size;
    throw new RangeError(`sizes.${name} is ${size}, and takes a finite number of single precision`);
}

function sizeNumbers(sizes = {}) {
    checkObject("sizes", sizes);
    const names = Object.keys(SIZES);
    checkNames("size", sizes, names);
    return names.map((name) => sizeNumber(name, sizes[name]));
}

function wholeNumber(name, value = WHOLE_NUMBERS[name].usual) {
    checkNumber(name, value);
    const { least, most } = WHOLE_NUMBERS[name];
    if (Number.isInteger(value) && value >= least && value <= most) return value;
    throw new RangeError(`${name} is ${value}, and takes a whole number of ${least} to ${most}`);
}

/** The view's number, and all the others in the order of set_options. */
export function optionNumbers(options) {
    checkObject("options", options);
    checkNames("option", options, OPTIONS);
    const whole = Object.keys(WHOLE_NUMBERS).map((name) => wholeNumber(name, options[name]));
    return { view: viewNumber(options.view), numbers: [...sizeNumbers(options.sizes), ...whole] };
}

/** The focus, or 0, which is nobody, for what is a number but no person's. */
export function focusNumber(focus) {
    checkNumber("the focus", focus);
    return Number.isSafeInteger(focus) ? focus : 0;
}
