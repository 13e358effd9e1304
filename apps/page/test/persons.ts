// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Persons and dates for tests.

import type { GedcomDate, Person } from "olvane";

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
        surnameFirst: false,
        shownName: name,
        ...more,
    };
}

export function date(year: number, more: Partial<GedcomDate> = {}): GedcomDate {
    const written = String(year);
    return { written, year, month: 0, day: 0, mark: "exact", lastYear: 0, shown: written, period: false, ...more };
}
