// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// How everybody is related to one person.
//
// A relation is a way from the focus: up to a common ancestor and down again, over a couple, or both in turn. All
// ways by blood are found in one pass, nearest first; those over one couple or two are laid on top. Which words a
// way has is the message table's business.

import type { GedcomFamily as Family, Person, Sex } from "olvane";
import { BloodSearch, type Side } from "./kinship/BloodSearch";
import { type LinkKind, type Links, linksOf } from "./kinship/Links";
import type { KinshipWords, Messages, Noun } from "./messages";

/** A way by blood, adoption or fostering: up generations to a common ancestor, down generations from there. */
export interface BloodStep {
    readonly kind: "blood";
    readonly up: number;
    readonly down: number;
    /** Only one of the common couple is shared, and both others are known. */
    readonly half: boolean;
    readonly link: LinkKind;
    /** By which parent the way begins; none on a way that begins downwards. */
    readonly side: Side;
    /** Of the person whom the step leads to. */
    readonly sex: Sex;
}

/** A way from one partner of a couple to the other. */
export interface CoupleStep {
    readonly kind: "couple";
    readonly married: boolean;
    readonly divorced: boolean;
    readonly sex: Sex;
}

export type Step = BloodStep | CoupleStep;

/** The nearest way from the focus to a person. No step: the focus. */
export interface Kinship {
    readonly steps: readonly Step[];
    /** A farther way by blood, told beside a near one over a couple: "wife and first cousin". */
    readonly also: BloodStep | null;
}

/** The relation of everybody within reach of focus; whoever is not in the map has none that is known. */
export function allKinships(
    persons: readonly Person[],
    families: readonly Family[],
    focus: number,
): Map<number, Kinship> {
    return new KinshipSearch(persons, linksOf(persons, families), focus).run();
}

const kSelf: Kinship = { steps: [], also: null };

interface MarriedIn {
    readonly steps: readonly Step[];
    readonly distance: number;
}

class KinshipSearch {
    private readonly found = new Map<number, Kinship>();
    private readonly marriedIn = new Map<number, MarriedIn>();
    private readonly sameWays = new Map<number, Kinship>();
    private readonly blood: BloodSearch;

    constructor(
        private readonly persons: readonly Person[],
        private readonly links: Links,
        private readonly focus: number,
    ) {
        this.blood = new BloodSearch(links);
    }

    // Near relations over a couple come first, since a way found first stays; those by blood follow, and the far
    // ones over couples reach whoever is left.
    run(): Map<number, Kinship> {
        if (this.focus < 1 || this.focus > this.persons.length) return this.found;
        this.found.set(this.focus, kSelf);
        this.blood.run([this.focus]);
        const bySpouses = new BloodSearch(this.links);
        bySpouses.run(this.links.partnersOf(this.focus));

        this.findSpouses();
        this.findNearInLaws(bySpouses);
        this.findStepSiblings();
        this.tellBlood();
        this.findSpousesOfBlood();
        this.findBloodOfSpouses(bySpouses);
        this.findFarInLaws(bySpouses);
        return this.found;
    }

    private findSpouses(): void {
        for (const spouse of this.links.partnersOf(this.focus)) {
            this.offerNear(spouse, [this.couple(this.focus, spouse)], 1);
        }
    }

    // Parents, children and siblings of a spouse; spouses of parents, children and siblings.
    private findNearInLaws(bySpouses: BloodSearch): void {
        for (const relative of this.nearBlood(this.blood)) {
            const step = this.bloodStep(this.blood, relative);
            for (const spouse of this.links.partnersOf(relative)) {
                this.offerNear(spouse, [step, this.couple(relative, spouse)], step.up + step.down + 1);
            }
        }
        for (const relative of this.nearBlood(bySpouses)) {
            const step = this.bloodStep(bySpouses, relative);
            const spouse = bySpouses.sourceOf(relative);
            this.offerNear(relative, [this.couple(this.focus, spouse), step], step.up + step.down + 1);
        }
    }

    // Children of a parent's spouse.
    private findStepSiblings(): void {
        for (const parent of this.nearBlood(this.blood)) {
            if (this.blood.downTo(parent) !== 0) continue;
            const up = this.bloodStep(this.blood, parent);
            for (const spouse of this.links.partnersOf(parent)) {
                for (const child of this.links.childrenOf(spouse)) {
                    const down = oneDown(this.links.sexOf(child), this.links.kindOf(child, spouse));
                    this.offerNear(child, [up, this.couple(parent, spouse), down], 3);
                }
            }
        }
    }

    private tellBlood(): void {
        for (const relative of this.blood.reached()) {
            if (relative === this.focus) continue;
            const near = this.marriedIn.get(relative);
            if (near) this.found.set(relative, { steps: near.steps, also: this.bloodStep(this.blood, relative) });
            else this.found.set(relative, this.sharedWay(relative));
        }
        for (const [person, near] of this.marriedIn) this.offer(person, near.steps);
    }

    private findSpousesOfBlood(): void {
        for (const relative of this.blood.reached()) {
            for (const spouse of this.links.partnersOf(relative)) {
                if (this.found.has(spouse)) continue;
                this.offer(spouse, [this.bloodStep(this.blood, relative), this.couple(relative, spouse)]);
            }
        }
    }

    private findBloodOfSpouses(bySpouses: BloodSearch): void {
        for (const relative of bySpouses.reached()) {
            if (this.found.has(relative)) continue;
            const spouse = bySpouses.sourceOf(relative);
            this.offer(relative, [this.couple(this.focus, spouse), this.bloodStep(bySpouses, relative)]);
        }
    }

    // Other spouses of a spouse, spouses of a spouse's near relatives, and parents of a child's or sibling's spouse.
    private findFarInLaws(bySpouses: BloodSearch): void {
        for (const spouse of this.links.partnersOf(this.focus)) {
            const first = this.couple(this.focus, spouse);
            for (const other of this.links.partnersOf(spouse)) this.offer(other, [first, this.couple(spouse, other)]);
        }
        for (const relative of this.nearBlood(bySpouses)) {
            const first = this.couple(this.focus, bySpouses.sourceOf(relative));
            const second = this.bloodStep(bySpouses, relative);
            for (const spouse of this.links.partnersOf(relative)) {
                this.offer(spouse, [first, second, this.couple(relative, spouse)]);
            }
        }
        for (const relative of this.nearBlood(this.blood)) {
            if (this.blood.downTo(relative) === 0) continue;
            const first = this.bloodStep(this.blood, relative);
            for (const spouse of this.links.partnersOf(relative)) {
                for (const parent of this.links.parentsOf(spouse)) {
                    const up = oneUp(this.links.sexOf(parent), this.links.kindOf(spouse, parent));
                    this.offer(parent, [first, this.couple(relative, spouse), up]);
                }
            }
        }
    }

    private *nearBlood(search: BloodSearch): Iterable<number> {
        for (const relative of search.reached()) {
            const distance = search.upTo(relative) + search.downTo(relative);
            if (distance > 2) return;
            if (isNear(search.upTo(relative), search.downTo(relative))) yield relative;
        }
    }

    private offer(person: number, steps: readonly Step[]): void {
        if (!this.found.has(person)) this.found.set(person, { steps, also: null });
    }

    private offerNear(person: number, steps: readonly Step[], distance: number): void {
        if (person === this.focus || this.blood.distanceTo(person) <= distance) return;
        const known = this.marriedIn.get(person);
        if (!known || known.distance > distance) this.marriedIn.set(person, { steps, distance });
    }

    private bloodStep(search: BloodSearch, person: number): BloodStep {
        return {
            kind: "blood",
            up: search.upTo(person),
            down: search.downTo(person),
            half: search.isHalf(person),
            link: search.linkTo(person),
            side: search.sideOf(person),
            sex: this.links.sexOf(person),
        };
    }

    // Many cousins are related alike: they share one record.
    private sharedWay(person: number): Kinship {
        const sex = this.links.sexOf(person);
        const key = this.blood.wayNumber(person) * 3 + (sex === "male" ? 0 : sex === "female" ? 1 : 2);
        let kinship = this.sameWays.get(key);
        if (!kinship) {
            kinship = { steps: [this.bloodStep(this.blood, person)], also: null };
            this.sameWays.set(key, kinship);
        }
        return kinship;
    }

    private couple(one: number, other: number): CoupleStep {
        return { kind: "couple", sex: this.links.sexOf(other), ...this.links.coupleOf(one, other) };
    }
}

function isNear(up: number, down: number): boolean {
    return (up === 1 && down <= 1) || (up === 0 && down === 1);
}

function oneUp(sex: Sex, link: LinkKind): BloodStep {
    return { kind: "blood", up: 1, down: 0, half: false, link, side: "none", sex };
}

function oneDown(sex: Sex, link: LinkKind): BloodStep {
    return { kind: "blood", up: 0, down: 1, half: false, link, side: "none", sex };
}

/** The relation in words, as said of a person of that sex: "half sister", "uncle (mother's brother)". */
export function kinshipText(kinship: Kinship, sex: Sex, messages: Messages): string {
    const words = messages.kinship;
    const last = kinship.steps.at(-1);
    if (!last) return words.self;
    const text = wayText([...kinship.steps.slice(0, -1), { ...last, sex }], words);
    return kinship.also ? words.both(text, words.relativeOnSide({ ...kinship.also, sex })) : text;
}

/** The shortest words that are still right, for where there is little room: "uncle", "wife". */
export function nearKinshipText(kinship: Kinship, sex: Sex, messages: Messages): string {
    const words = messages.kinship;
    const [first, second] = kinship.steps;
    if (!first) return words.self;
    if (!second) return nounOf({ ...first, sex }, words).plain;
    const isSiblings = kinship.steps.some((step) => step.kind === "blood" && step.up === 1 && step.down === 1);
    if (kinship.steps.length === 2 && isSiblings) return words.siblingInLaw[sex].plain;
    return kinshipText({ ...kinship, also: null }, sex, messages);
}

function wayText(steps: readonly Step[], words: KinshipWords): string {
    const [first, second, third] = steps;
    if (steps.length === 1 && first?.kind === "blood") return words.relativeOnSide(first);
    const special = third ? stepSibling(steps, words) : second ? inLawText(first!, second, words) : null;
    return special ?? chain(steps, words).plain;
}

// The words that a language has for the near relatives of a spouse and the spouses of near relatives.
function inLawText(first: Step, second: Step, words: KinshipWords): string | null {
    const how = chain([first, second], words).plain;
    const sex = second.sex;
    if (first.kind === "couple" && second.kind === "blood") {
        if (second.up === 1 && second.down === 0) return words.parentInLaw[sex].plain;
        if (second.up === 0 && second.down === 1) return words.stepchild[sex].plain;
        if (second.up === 1 && second.down === 1) return words.explained(words.siblingInLaw[sex].plain, how);
    }
    if (first.kind === "blood" && second.kind === "couple") {
        if (first.up === 1 && first.down === 0) return words.stepparent[sex].plain;
        if (first.up === 0 && first.down === 1) return words.childInLaw[sex].plain;
        if (first.up === 1 && first.down === 1) return words.explained(words.siblingInLaw[sex].plain, how);
    }
    return null;
}

function stepSibling(steps: readonly Step[], words: KinshipWords): string | null {
    const [first, second, third] = steps;
    const isStep =
        steps.length === 3 &&
        first?.kind === "blood" &&
        first.up === 1 &&
        first.down === 0 &&
        second?.kind === "couple" &&
        third?.kind === "blood" &&
        third.down === 1;
    return isStep ? words.stepsibling[third.sex].plain : null;
}

// "wife's sister's husband"; of a far relative rather "wife of a second cousin".
function chain(steps: readonly Step[], words: KinshipWords): Noun {
    const [first, second] = steps;
    if (steps.length === 2 && first?.kind === "blood" && second?.kind === "couple" && !isNear(first.up, first.down)) {
        return words.coupledWith(words.spouse(second), words.relative(first));
    }
    return steps.map((step) => nounOf(step, words)).reduce((owner, noun) => words.owned(owner, noun));
}

function nounOf(step: Step, words: KinshipWords): Noun {
    return step.kind === "couple" ? words.spouse(step) : words.relative(step);
}
