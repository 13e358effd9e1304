// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The golden cases as JavaScript sees them: a case file is a family, which answers as a host, and one request.

import { readdirSync, readFileSync } from "node:fs";
import { join } from "node:path";

import { Shown } from "../../bindings/javascript/olvane.mjs";

const RELATIVES = {
    ACTV_Fam_ShowAuntsUncles: Shown.auntsUncles,
    ACTV_Fam_ShowCousins: Shown.cousins,
    ACTV_Fam_ShowSiblings: Shown.siblings,
    ACTV_Fam_ShowSiblingSpouses: Shown.siblingSpouses,
    ACTV_Fam_ShowNeicesNephews: Shown.niecesNephews,
    ACTV_Fam_ShowGrandchildren: Shown.grandchildren,
    ACTV_Fam_ShowGreatGrandparents: Shown.greatGrandparents,
    ACTV_Fam_ShowSpousesOfChildren: Shown.spousesOfChildren,
};

const SIZES = ["nodeWidth", "nodeHeight", "horzPadding", "vertPadding", "spouseLineStep", "lineInset"];

/** A host that answers from a case and writes down each question in the words of layout-case --trace. */
export class CaseHost {
    calls = [];

    constructor(lines) {
        this.lines = lines;
    }
    fatherOf(person) {
        this.calls.push(`call fatherForPersonWithID ${person}`);
        return this.#number("father", person, null);
    }
    motherOf(person) {
        this.calls.push(`call motherForPersonWithID ${person}`);
        return this.#number("mother", person, null);
    }
    spousesOf(person) {
        this.calls.push(`call spousesForPersonWithID ${person}`);
        return this.#list("spouses", person);
    }
    childrenOf(person) {
        this.calls.push(`call childrenForPersonWithID ${person}`);
        return this.#list("children", person);
    }
    isPreferredSpouse(person, spouse) {
        this.calls.push(`call isPreferredSpouse ${person} ${spouse}`);
        return this.#number("preferred", person, null) === spouse;
    }
    isDead(person) {
        this.calls.push(`call isPersonDead ${person}`);
        return this.#number("dead", person, 0) !== 0;
    }
    dateOf(person, isBirth) {
        this.calls.push(`call dateForPersonWithID ${person} ${Number(isBirth)}`);
        return this.#answer(isBirth ? "birth" : "date", person);
    }
    sexOf(person) {
        this.calls.push(`call sexOfPersonWithID ${person}`);
        return this.#number("sex", person, 0);
    }

    #answer(what, person) {
        return this.lines.get(`${what} ${person}`);
    }
    #number(what, person, otherwise) {
        const answer = this.#answer(what, person);
        return answer === undefined ? otherwise : Number(answer);
    }
    #list(what, person) {
        return (this.#answer(what, person) ?? "").split(" ").filter(Boolean).map(Number);
    }
}

function optionsFrom(lines) {
    const options = { shown: Shown.all };
    const [view, generations, flagDepth] = (lines.get("view") ?? "family").split(" ");
    options.view = view;
    if (view === "pedigree") Object.assign(options, { generations: Number(generations), flagDepth: Number(flagDepth) });
    if (lines.has("size")) {
        const sizes = lines.get("size").split(" ").map(Number);
        options.sizes = Object.fromEntries(SIZES.map((name, i) => [name, sizes[i]]));
    }
    for (const [name, bit] of Object.entries(RELATIVES)) {
        if (lines.get(`option ${name}`) === "0") options.shown &= ~bit;
    }
    return options;
}

// By "focus", "view" and "size", else by the directive and what it is about: "father 17" to "3".
function linesOf(text) {
    const lines = new Map();
    for (const line of text.split("\n")) {
        if (line === "" || line.startsWith("#")) continue;
        const words = line.split(" ");
        const key = ["focus", "view", "size", "adapter"].includes(words[0]) ? 1 : 2;
        lines.set(words.slice(0, key).join(" "), words.slice(key).join(" "));
    }
    return lines;
}

// Not what hosts of JavaScript can't ask for: a bare adapter, a chosen failure, other options, ids out of range.
function canBeAsked(lines) {
    if (lines.get("adapter") === "bare") return false;
    return [...lines].every(([key, value]) => {
        if (key.startsWith("throw ")) return false;
        if (key.startsWith("option ")) return Object.hasOwn(RELATIVES, key.slice("option ".length));
        if (!/^(focus|father|mother|spouses|children)\b/.test(key)) return true;
        return value.split(" ").every((id) => id === "" || (Number(id) >= 1 && Number(id) < 2 ** 31));
    });
}

/** All golden cases that a host can ask for: { file, lines, focus, options }. */
export function casesIn(golden) {
    const files = ["family", "pedigree"].flatMap((view) =>
        readdirSync(join(golden, view)).map((name) => join(golden, view, name)),
    );
    return files
        .filter((file) => file.endsWith(".case"))
        .map((file) => ({ file, lines: linesOf(readFileSync(file, "utf8")) }))
        .filter(({ lines }) => canBeAsked(lines))
        .map(({ file, lines }) => ({ file, lines, focus: Number(lines.get("focus")), options: optionsFrom(lines) }));
}
