// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Somebody of a map in the form that the rest of the page uses for persons. What a map does not know is empty.

import type { GedcomDate, Person } from "olvane";
import type { FamilyMap } from "./FamilyMap";

export function mapPerson(map: FamilyMap, person: number): Person {
    const name = map.name(person);
    return {
        id: map.number(person),
        xref: "",
        name,
        shownName: name,
        given: map.nameLines(person)[0],
        surname: map.surname(person),
        names: name === "" ? [] : [name],
        sex: map.sex(person),
        dead: map.death(person) !== 0,
        birth: yearAlone(map.birth(person)),
        death: yearAlone(map.death(person)),
        father: 0,
        mother: 0,
        spouses: [],
        children: [],
        parentFamilies: [],
        coupleFamilies: [],
        surnameFirst: false,
    };
}

function yearAlone(year: number): GedcomDate | null {
    if (year === 0) return null;
    const written = String(year);
    return { written, year, month: 0, day: 0, mark: "exact", lastYear: 0, shown: written, period: false };
}
