// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Who is whose parent, child and partner, from both sides of a file at once: a family that names a child counts,
// and so does a person who names a family.

import type { GedcomFamily as Family, Person, Sex } from "olvane";

/** How a child belongs to a parent. A seal or a link of an unknown kind counts as birth. */
export type LinkKind = "birth" | "adopted" | "foster";

export const kLinkKinds: readonly LinkKind[] = ["birth", "adopted", "foster"];

export interface CoupleFacts {
    readonly married: boolean;
    readonly divorced: boolean;
}

// A couple without a marriage counts as unmarried only where the file records the marriage of so many couples:
// many files leave them out, and would turn kings and queens into partners.
const kMarriagesRecorded = 0.8;

/** The links of one file. All lists are in the order of the file; a person who is unknown to it has none. */
export class Links {
    private readonly parents: number[][];
    private readonly kinds: number[][];
    private readonly children: number[][];
    private readonly partners: number[][];
    private readonly couples = new Map<number, CoupleFacts>();
    private readonly sexes: Sex[];
    readonly count: number;

    constructor(persons: readonly Person[], families: readonly Family[]) {
        this.count = persons.length;
        this.parents = lists(this.count);
        this.kinds = lists(this.count);
        this.children = lists(this.count);
        this.partners = lists(this.count);
        this.sexes = persons.map((person) => person.sex);
        for (const person of persons) this.addParentsOf(person, families);
        for (const family of families) this.addFamily(family);
        for (const person of persons) this.addRelativesOf(person);
        this.weighMarriages();
    }

    parentsOf(person: number): readonly number[] {
        return this.parents[person] ?? [];
    }

    childrenOf(person: number): readonly number[] {
        return this.children[person] ?? [];
    }

    partnersOf(person: number): readonly number[] {
        return this.partners[person] ?? [];
    }

    sexOf(person: number): Sex {
        return this.sexes[person - 1] ?? "other";
    }

    /** Of the link from child to parent; 0 is birth, and as kLinkKinds names them. */
    kindNumber(child: number, parent: number): number {
        const at = this.parentsOf(child).indexOf(parent);
        return this.kinds[child]?.[at] ?? 0;
    }

    kindOf(child: number, parent: number): LinkKind {
        return kLinkKinds[this.kindNumber(child, parent)] ?? "birth";
    }

    coupleOf(one: number, other: number): CoupleFacts {
        return this.couples.get(this.coupleKey(one, other)) ?? { married: true, divorced: false };
    }

    /** Whether two children have exactly one parent by birth in common, and another each. */
    areHalfSiblings(one: number, other: number): boolean {
        const parents = this.birthParents(one);
        const others = this.birthParents(other);
        const shared = parents.filter((parent) => others.includes(parent)).length;
        return shared === 1 && parents.length > 1 && others.length > 1;
    }

    private birthParents(child: number): number[] {
        return this.parentsOf(child).filter((_, at) => this.kinds[child]?.[at] === 0);
    }

    private addParentsOf(person: Person, families: readonly Family[]): void {
        for (const link of person.parentFamilies) {
            const family = families[link.family - 1];
            if (!family) continue;
            const kind = link.pedigree === "adopted" ? 1 : link.pedigree === "foster" ? 2 : 0;
            this.addParent(person.id, family.husband, kind);
            this.addParent(person.id, family.wife, kind);
        }
    }

    private addFamily(family: Family): void {
        for (const child of family.children) {
            this.addIfNew(child, family.husband);
            this.addIfNew(child, family.wife);
        }
        if (family.husband === 0 || family.wife === 0 || family.husband === family.wife) return;
        this.addPartners(family.husband, family.wife);
        const key = this.coupleKey(family.husband, family.wife);
        const married = family.married || (this.couples.get(key)?.married ?? false);
        this.couples.set(key, { married, divorced: family.divorced });
    }

    private addRelativesOf(person: Person): void {
        this.addIfNew(person.id, person.father);
        this.addIfNew(person.id, person.mother);
        for (const child of person.children) this.addIfNew(child, person.id);
        for (const spouse of person.spouses) this.addPartners(person.id, spouse);
    }

    // A parent by birth and by adoption is one by birth.
    private addParent(child: number, parent: number, kind: number): void {
        if (!this.has(child) || !this.has(parent)) return;
        const at = this.parents[child]!.indexOf(parent);
        if (at >= 0) {
            this.kinds[child]![at] = Math.min(this.kinds[child]![at]!, kind);
            return;
        }
        this.parents[child]!.push(parent);
        this.kinds[child]!.push(kind);
        this.children[parent]!.push(child);
    }

    private addIfNew(child: number, parent: number): void {
        if (!this.parentsOf(child).includes(parent)) this.addParent(child, parent, 0);
    }

    private addPartners(one: number, other: number): void {
        if (one === other || !this.has(one) || !this.has(other)) return;
        if (!this.partners[one]!.includes(other)) this.partners[one]!.push(other);
        if (!this.partners[other]!.includes(one)) this.partners[other]!.push(one);
    }

    private weighMarriages(): void {
        const recorded = [...this.couples.values()].filter((couple) => couple.married).length;
        if (recorded >= this.couples.size * kMarriagesRecorded) return;
        for (const [key, couple] of this.couples) this.couples.set(key, { ...couple, married: true });
    }

    private has(person: number): boolean {
        return person >= 1 && person <= this.count;
    }

    private coupleKey(one: number, other: number): number {
        return Math.min(one, other) * (this.count + 1) + Math.max(one, other);
    }
}

function lists(count: number): number[][] {
    return Array.from({ length: count + 1 }, () => []);
}

const kKnownLinks = new WeakMap<readonly Person[], Links>();

/** The links of a file, found once for as long as its list of persons lives. */
export function linksOf(persons: readonly Person[], families: readonly Family[]): Links {
    let links = kKnownLinks.get(persons);
    if (!links) {
        links = new Links(persons, families);
        kKnownLinks.set(persons, links);
    }
    return links;
}
