// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// German words for relatives. A cousin of a parent is an "Onkel zweiten Grades", a cousin's child a "Neffe
// zweiten Grades", and only whoever is of one's own generation a cousin.

import type { Sex } from "olvane";
import type { BloodStep, CoupleStep } from "../kinship";
import type { KinshipWords, Noun, NounBySex } from "../messages";

type Gender = "masculine" | "feminine" | "neuter";

// A word, its genitive, and what decides the article.
interface Word {
    readonly word: string;
    readonly genitive: string;
    readonly gender: Gender;
}

type WordBySex = Readonly<Record<Sex, Word>>;

function masculine(word: string, genitive = `${word}s`): Word {
    return { word, genitive, gender: "masculine" };
}

function feminine(word: string): Word {
    return { word, genitive: word, gender: "feminine" };
}

function neuter(word: string, genitive = `${word}s`): Word {
    return { word, genitive, gender: "neuter" };
}

const kParent: WordBySex = { male: masculine("Vater"), female: feminine("Mutter"), other: masculine("Elternteil") };
const kChild: WordBySex = {
    male: masculine("Sohn", "Sohnes"),
    female: feminine("Tochter"),
    other: neuter("Kind", "Kindes"),
};
const kGrandchild: WordBySex = {
    male: masculine("Enkel"),
    female: feminine("Enkelin"),
    other: neuter("Enkelkind", "Enkelkindes"),
};
const kSibling: WordBySex = {
    male: masculine("Bruder"),
    female: feminine("Schwester"),
    other: neuter("Geschwister"),
};
const kParentsSibling: WordBySex = {
    male: masculine("Onkel"),
    female: feminine("Tante"),
    other: masculine("Onkel/Tante", "Onkels/Tante"),
};
const kSiblingsChild: WordBySex = {
    male: masculine("Neffe", "Neffen"),
    female: feminine("Nichte"),
    other: masculine("Neffe/Nichte", "Neffen/Nichte"),
};
const kCousin: WordBySex = {
    male: masculine("Cousin"),
    female: feminine("Cousine"),
    other: masculine("Cousin/Cousine", "Cousins/Cousine"),
};
const kInLaw: WordBySex = {
    male: masculine("Schwager"),
    female: feminine("Schwägerin"),
    other: masculine("Schwager/Schwägerin", "Schwagers/Schwägerin"),
};
const kSpouse: WordBySex = {
    male: masculine("Ehemann", "Ehemannes"),
    female: feminine("Ehefrau"),
    other: masculine("Ehepartner"),
};
const kFormerSpouse: WordBySex = {
    male: masculine("früherer Ehemann", "früheren Ehemannes"),
    female: { word: "frühere Ehefrau", genitive: "früheren Ehefrau", gender: "feminine" },
    other: masculine("früherer Ehepartner", "früheren Ehepartners"),
};
const kPartner: WordBySex = {
    male: masculine("Partner"),
    female: feminine("Partnerin"),
    other: masculine("Partner"),
};

const kOfOne: Readonly<Record<Gender, string>> = { masculine: "eines", feminine: "einer", neuter: "eines" };
const kOfThe: Readonly<Record<Gender, string>> = { masculine: "des", feminine: "der", neuter: "des" };

const kOrdinals = ["ersten", "zweiten", "dritten", "vierten", "fünften", "sechsten", "siebten", "achten", "neunten"];
// More of them than this are counted.
const kUrsInWords = 3;

function noun(word: Word): Noun {
    // Behind "einer", an adjective has the form it has behind "der".
    return {
        plain: word.word,
        ofOne: `${kOfOne[word.gender]} ${word.genitive}`,
        owner: `${kOfThe[word.gender]} ${word.genitive}`,
    };
}

// "Halb" before "Onkel/Tante" is "Halbonkel/Halbtante", and before "4×Urgroßonkel" "4×Halburgroßonkel".
function compound(prefix: string, word: Word): Word {
    if (prefix === "") return word;
    const join = (part: string): string => {
        const [, count, head, tail] = /^(\d+×)?(.)(.*)$/u.exec(part)!;
        return (count ?? "") + prefix + head!.toLowerCase() + tail;
    };
    const all = (words: string): string => words.split("/").map(join).join("/");
    return { ...word, word: all(word.word), genitive: all(word.genitive) };
}

function counted(count: number, word: Word): Word {
    return { ...word, word: `${count}×${word.word}`, genitive: `${count}×${word.genitive}` };
}

function nouns(prefix: string, words: WordBySex): NounBySex {
    const of = (sex: Sex): Noun => noun(compound(prefix, words[sex]));
    return { male: of("male"), female: of("female"), other: of("other") };
}

// "Ur", "Urur", "Ururur", and then "4×Ur".
function ur(count: number, word: Word): Word {
    if (count <= 0) return word;
    return count <= kUrsInWords ? compound("Ur" + "ur".repeat(count - 1), word) : counted(count, compound("Ur", word));
}

function great(generations: number, word: Word): Word {
    return generations === 0 ? word : ur(generations - 1, compound("Groß", word));
}

function ofDegree(degree: number, word: Word): Word {
    const ending = ` ${kOrdinals[degree - 1] ?? `${degree}.`} Grades`;
    return { ...word, word: word.word + ending, genitive: word.genitive + ending };
}

// The common ancestors' children are siblings, of the first degree; their children cousins of the first degree,
// and so on.
function collateral(way: BloodStep): Word {
    const { up, down, sex, link, half } = way;
    const prefix = manner(link, half);
    const later = Math.abs(up - down);
    const degree = Math.min(up, down);
    if (up === down) {
        if (degree === 3) return compound(prefix, compound("Groß", kCousin[sex]));
        return ofDegree(degree - 1, compound(prefix, kCousin[sex]));
    }
    const word = compound(prefix, great(later - 1, up > down ? kParentsSibling[sex] : kSiblingsChild[sex]));
    return degree === 1 ? word : ofDegree(degree, word);
}

function relativeWord(way: BloodStep): Word {
    const { up, down, sex, link, half } = way;
    if (up > 0 && down > 0 && !(up === 1 && down === 1)) return collateral(way);
    const prefix = manner(link, half);
    if (up === 1 && down === 1) return compound(prefix, kSibling[sex]);
    if (down === 0) return compound(prefix, great(up - 1, kParent[sex]));
    return compound(prefix, down === 1 ? kChild[sex] : ur(down - 2, kGrandchild[sex]));
}

function manner(link: BloodStep["link"], half: boolean): string {
    if (link === "foster") return "Pflege";
    if (link === "adopted") return "Adoptiv";
    return half ? "Halb" : "";
}

const kSides = { father: " väterlicherseits", mother: " mütterlicherseits", none: "" } as const;

export const germanKinship: KinshipWords = {
    self: "die Person im Mittelpunkt",
    relative: (way: BloodStep): Noun => noun(relativeWord(way)),
    relativeOnSide(way: BloodStep): string {
        const saysSide = way.up >= 2 && way.down <= 1;
        return relativeWord(way).word + (saysSide ? kSides[way.side] : "");
    },
    spouse(couple: CoupleStep): Noun {
        if (couple.divorced) return noun(kFormerSpouse[couple.sex]);
        return noun((couple.married ? kSpouse : kPartner)[couple.sex]);
    },
    parentInLaw: nouns("Schwieger", kParent),
    childInLaw: nouns("Schwieger", kChild),
    siblingInLaw: nouns("", kInLaw),
    stepparent: nouns("Stief", kParent),
    stepchild: nouns("Stief", kChild),
    stepsibling: nouns("Stief", kSibling),
    owned(owner: Noun, relative: Noun): Noun {
        return {
            plain: `${relative.plain} ${owner.owner}`,
            ofOne: `${relative.ofOne} ${owner.owner}`,
            owner: `${relative.owner} ${owner.owner}`,
        };
    },
    coupledWith(spouse: Noun, relative: Noun): Noun {
        return {
            plain: `${spouse.plain} ${relative.ofOne}`,
            ofOne: `${spouse.ofOne} ${relative.ofOne}`,
            owner: `${spouse.owner} ${relative.ofOne}`,
        };
    },
    explained: (word: string, how: string): string => `${word} (${how})`,
    both: (near: string, far: string): string => `${near} und ${far}`,
};
