// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Facts in the order of a life, whatever order the file has them in.

import type { Fact } from "olvane";

const kLast = new Set(["DEAT", "BURI", "CREM", "PROB"]);

// Birth, then what has a date, then what has none, then death and what follows it.
function rankOf({ tag, date }: Fact): number {
    if (tag === "BIRT") return 0;
    if (kLast.has(tag)) return 3;
    return date && date.year !== 0 ? 1 : 2;
}

/** Facts of one rank by their dates; of one date, or without one, as in the file. */
export function inLifeOrder<Any extends Fact>(facts: readonly Any[]): Any[] {
    const keyOf = ({ date }: Fact) => (date ? (date.year * 13 + date.month) * 32 + date.day : Infinity);
    return [...facts].sort((a, b) => {
        const byRank = rankOf(a) - rankOf(b);
        if (byRank !== 0 || rankOf(a) === 2) return byRank;
        const [first, second] = [keyOf(a), keyOf(b)];
        return first === second ? 0 : first - second;
    });
}
