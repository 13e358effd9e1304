// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Facts, details, names and sheets of an open file, as objects of the arrays that the module writes.

import { MARKS } from "./rows.mjs";

function dateFrom(values) {
    if (values === 0) return null;
    const [written, year, month, day, mark, lastYear, shown, period] = values;
    return { written, year, month, day, mark: MARKS[mark], lastYear, shown, period: period !== 0 };
}

export function factFrom([tag, value, date, place]) {
    return { tag, value, date: dateFrom(date), place };
}

function citationFrom([title, author, publication, page, text, quality]) {
    return { title, author, publication, page, text, quality: quality < 0 ? null : quality };
}

function mediumFrom([title, file, format]) {
    return { title, file, format };
}

/** 0 stands for no details at all. */
export function detailsFrom(row) {
    const [type, cause, age, husbandAge, wifeAge, agency, address, notes, citations, media, links] =
        row === 0 ? ["", "", "", "", "", "", "", [], [], [], []] : row;
    return {
        type,
        cause,
        age,
        husbandAge,
        wifeAge,
        agency,
        address,
        notes,
        citations: citations.map(citationFrom),
        media: media.map(mediumFrom),
        links,
    };
}

export function detailedFactFrom([tag, value, date, place, details]) {
    return { tag, value, date: dateFrom(date), place, details: detailsFrom(details) };
}

export function detailedNameFrom([text, type, nickname, details]) {
    return { text, type, nickname, details: detailsFrom(details) };
}

export function labelFrom([given, surname, surnameFirst, birth, death, details, lines, shortLines, life]) {
    return { given, surname, surnameFirst: surnameFirst !== 0, birth, death, details, lines, shortLines, life };
}

/** Lengths and sizes come in thousandths; finished makes of the SVG of a sheet what is handed out. */
export function sheetsFrom([width, height, scale, smallestName, smallestText, cutBoxes, sheets], finished) {
    return {
        width: width / 1000,
        height: height / 1000,
        scale: scale / 1000,
        smallestName: smallestName / 1000,
        smallestText: smallestText / 1000,
        cutBoxes,
        sheets: sheets.map(([row, column, svg]) => ({ row, column, svg: finished(svg) })),
    };
}
