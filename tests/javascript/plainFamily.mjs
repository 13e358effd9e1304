// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A family as plain objects, edited by the rules that the table states; and a host that answers from it.

const without = (list, id) => list.filter((one) => one !== id);
const isSamePair = (a, b) => (a[0] === b[0] && a[1] === b[1]) || (a[0] === b[1] && a[1] === b[0]);

export class PlainFamily {
    persons = new Map();
    families = new Map();

    copy() {
        const other = new PlainFamily();
        other.persons = structuredClone(this.persons);
        other.families = structuredClone(this.families);
        return other;
    }

    putPerson(row) {
        const kept = { spouses: [], preferred: 0, children: [], fields: {}, names: [], father: 0, mother: 0 };
        const person = this.persons.get(row.id) ?? kept;
        const before = [person.father, person.mother];
        this.persons.set(row.id, Object.assign(person, row));
        for (const parent of before) {
            if (parent === 0 || parent === row.father || parent === row.mother) continue;
            const listed = this.persons.get(parent);
            listed.children = without(listed.children, row.id);
        }
        for (const parent of [row.father, row.mother]) {
            if (parent === 0 || before.includes(parent)) continue;
            const { children } = this.persons.get(parent);
            if (!children.includes(row.id)) children.push(row.id);
        }
    }

    removePerson(id) {
        this.persons.delete(id);
        for (const person of this.persons.values()) {
            for (const field of ["father", "mother", "preferred"]) if (person[field] === id) person[field] = 0;
            person.spouses = without(person.spouses, id);
            person.children = without(person.children, id);
        }
        for (const [number, family] of this.families) {
            if (!family.partners.includes(id) && !family.children.some(({ child }) => child === id)) continue;
            family.partners = family.partners.map((one) => (one === id ? 0 : one));
            family.children = family.children.filter(({ child }) => child !== id);
            if (family.partners.every((one) => one === 0) && family.children.length === 0) this.families.delete(number);
        }
    }

    putFamily(number, partners, state, children) {
        const old = this.families.get(number);
        if (old !== undefined && !isSamePair(old.partners, partners)) this.#separate(number);
        this.families.set(number, { partners, state, children });
        const [a, b] = partners;
        if (a !== 0 && b !== 0) {
            this.#addSpouse(a, b);
            if (a !== b) this.#addSpouse(b, a);
        }
        for (const partner of new Set(partners)) {
            if (partner === 0) continue;
            const listed = this.persons.get(partner).children;
            for (const { child } of children) if (!listed.includes(child)) listed.push(child);
        }
    }

    removeFamily(number) {
        this.#separate(number);
        this.families.delete(number);
    }

    #addSpouse(one, other) {
        const person = this.persons.get(one);
        if (person.spouses.length === 0) person.preferred = other;
        if (!person.spouses.includes(other)) person.spouses.push(other);
    }

    #separate(number) {
        const { partners } = this.families.get(number);
        const others = [...this.families].filter(([key]) => key !== number);
        if (partners.includes(0) || others.some(([, family]) => isSamePair(family.partners, partners))) return;
        for (const [one, other] of [partners, [...partners].reverse()]) {
            const person = this.persons.get(one);
            person.spouses = without(person.spouses, other);
            if (person.preferred === other) person.preferred = 0;
        }
    }
}

export class PlainHost {
    constructor(family) {
        this.persons = family.persons;
    }
    fatherOf(person) {
        return this.persons.get(person).father || null;
    }
    motherOf(person) {
        return this.persons.get(person).mother || null;
    }
    spousesOf(person) {
        return this.persons.get(person).spouses;
    }
    childrenOf(person) {
        return this.persons.get(person).children;
    }
    isPreferredSpouse(person, spouse) {
        return this.persons.get(person).preferred === spouse;
    }
    isDead(person) {
        return this.persons.get(person).dead;
    }
    dateOf(person, isBirth) {
        return isBirth ? this.persons.get(person).birth : this.persons.get(person).death;
    }
    sexOf(person) {
        return ["male", "female", "unknown"].indexOf(this.persons.get(person).sex);
    }
}
