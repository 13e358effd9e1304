// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Names and dates of a person as words on the page.

import type { GedcomDate, Person } from "olvane";
import type { DateMark, Messages } from "../messages";

/** The name to show, and a word for one who has none. */
export function nameOf(person: Person, messages: Messages): string {
    return person.shownName || messages.unknownName;
}

/** "12 February 1809", "before 1820", "from 1809 to 1811"; the file's own words where the date was not read. */
export function dateText(date: GedcomDate, messages: Messages): string {
    return textOf(date, date.month, date.day, lastingMarkOf(date), messages);
}

/** "1809–1882", "about 1809 – 1882", "born 1809", "died 1882"; empty where neither year is known. */
export function yearsOf(person: Person, messages: Messages): string {
    const born = yearText(person.birth, messages);
    const died = yearText(person.death, messages);
    if (born === "" || died === "") {
        if (born !== "") return messages.dates.born(born);
        return died === "" ? "" : messages.dates.died(died);
    }
    const isPlain = person.birth?.mark === "exact" && person.death?.mark === "exact";
    return isPlain ? `${born}–${died}` : `${born} – ${died}`;
}

function yearText(date: GedcomDate | null, messages: Messages): string {
    return date && date.year !== 0 ? textOf(date, 0, 0, date.mark, messages) : "";
}

// As dates the beginning and the end of what lasted mean no more than after and before do.
function lastingMarkOf({ mark, period }: GedcomDate): DateMark {
    if (!period) return mark;
    if (mark === "between") return "lasting";
    return mark === "after" ? "since" : mark === "before" ? "until" : mark;
}

// Of the end of a range nothing but the year is known, so a range is one of years.
function textOf(date: GedcomDate, month: number, day: number, mark: DateMark, messages: Messages): string {
    if (date.year === 0) return date.written;
    const { dates } = messages;
    if (date.mark !== "between") return dates.marked(mark, dates.day(date.year, month, day), "");
    if (date.lastYear === 0 || date.lastYear === date.year) return dates.day(date.year, 0, 0);
    return dates.marked(mark, dates.day(date.year, 0, 0), dates.day(date.lastYear, 0, 0));
}

/** "Kew,,,England" is "Kew, England". */
export function placeText(place: string): string {
    const parts = place.split(",").map((part) => part.trim());
    return parts.filter((part) => part !== "").join(", ");
}
