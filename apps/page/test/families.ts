// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Families for tests, as short texts.
//
//     Robert + Susannah: Charles.m Caroline.f      a married couple and its children
//     Oscar ~ Ida: Max.m                           never married;  | instead: divorced;  ? names nobody
//     Paul + Grete: Karl.m(adopted)                a child by another link
//
// A partner on the left is male and one on the right female, unless a mark says else: .m .f .x

import type { GedcomFamily as Family, GedcomDate, ParentFamily, Person, Sex } from "olvane";

type Open<T> = { -readonly [Key in keyof T]: T[Key] extends readonly (infer E)[] ? E[] : T[Key] };

const kSexes: Readonly<Record<string, Sex>> = { m: "male", f: "female", x: "other" };

export function person(id: number, name: string, more: Partial<Person> = {}): Person {
    return {
        id,
        xref: `I${id}`,
        name,
        given: "",
        surname: "",
        names: [name],
        sex: "other",
        dead: false,
        birth: null,
        death: null,
        father: 0,
        mother: 0,
        spouses: [],
        children: [],
        parentFamilies: [],
        coupleFamilies: [],
        ...more,
    };
}

export function date(year: number, more: Partial<GedcomDate> = {}): GedcomDate {
    return { written: String(year), year, month: 0, day: 0, mark: "exact", lastYear: 0, shown: String(year), ...more };
}

export class Tree {
    readonly persons: Open<Person>[] = [];
    readonly families: Open<Family>[] = [];

    constructor(...lines: string[]) {
        for (const line of lines) this.addFamily(line);
    }

    id(name: string): number {
        const found = this.persons.find((one) => one.name === name);
        if (!found) throw new Error(`nobody is called ${name}`);
        return found.id;
    }

    sexOf(name: string): Sex {
        return this.persons[this.id(name) - 1]!.sex;
    }

    private addFamily(line: string): void {
        const parts = /^(\S+) ([+~|]) (\S+?)(?::(.*))?$/.exec(line);
        if (!parts) throw new Error(`not a family: ${line}`);
        const [, left, sign, right, children] = parts;
        const husband = this.partner(left!, "male");
        const wife = this.partner(right!, "female");
        const id = this.families.length + 1;
        const family: Open<Family> = {
            id,
            husband: husband?.id ?? 0,
            wife: wife?.id ?? 0,
            children: [],
            married: sign !== "~",
            divorced: sign === "|",
            marriage: null,
        };
        this.families.push(family);
        husband?.coupleFamilies.push(id);
        wife?.coupleFamilies.push(id);
        if (husband && wife) {
            husband.spouses.push(wife.id);
            wife.spouses.push(husband.id);
        }
        for (const word of (children ?? "").split(" ").filter((text) => text !== "")) this.addChild(family, word);
    }

    private addChild(family: Open<Family>, text: string): void {
        const [, word, link] = /^([^(]+)(?:\((.*)\))?$/.exec(text)!;
        const child = this.named(word!, "other");
        const pedigree = (link ?? "notGiven") as ParentFamily["pedigree"];
        child.parentFamilies.push({ family: family.id, pedigree });
        if (!link || child.father + child.mother === 0) {
            child.father = family.husband;
            child.mother = family.wife;
        }
        family.children.push(child.id);
        for (const parent of [family.husband, family.wife]) {
            if (parent > 0) this.persons[parent - 1]!.children.push(child.id);
        }
    }

    private partner(text: string, sex: Sex): Open<Person> | null {
        return text === "?" ? null : this.named(text, sex);
    }

    private named(text: string, sex: Sex): Open<Person> {
        const [name, mark] = text.split(".");
        const known = this.persons.find((one) => one.name === name);
        if (known) return known;
        const added = person(this.persons.length + 1, name!, { sex: mark ? kSexes[mark]! : sex }) as Open<Person>;
        this.persons.push(added);
        return added;
    }
}
