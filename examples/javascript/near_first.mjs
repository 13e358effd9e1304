// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A family behind a network: those near the focus are asked for in one batch, shown, and then the next ring.

// What the batch brings of a person: { id, father, mother, sex, birth, spouses: [ids], children: [ids] }.
const relativesOf = ({ father, mother, spouses, children }) => [father, mother, ...spouses, ...children];

// The table of those who are here; relatives who are not are left out until they come.
function tableOf(olvane, people) {
    const known = (id) => (people.has(id) ? id : null);
    const lists = (key, one, other) =>
        [...people.values()].flatMap((person) =>
            person[key].filter(known).map((relative) => ({ [one]: person.id, [other]: relative })),
        );
    return olvane.family({
        persons: [...people.values()].map(({ id, father, mother, sex, birth }) => ({
            id,
            father: known(father),
            mother: known(mother),
            sex,
            birth,
        })),
        spouses: lists("spouses", "person", "spouse"),
        children: lists("children", "parent", "child"),
    });
}

/**
 * Shows the family of a focus in a limited number of rounds. ask(ids) promises the rows of one batch, in any order;
 * show(boxes, round) is called after each.
 */
export async function nearFirst(olvane, ask, focus, show, rounds = 6) {
    const people = new Map();
    const asked = new Set();
    let ring = [focus];
    for (let round = 1; round <= rounds && ring.length > 0; ++round) {
        for (const id of ring) asked.add(id);
        const rows = await ask(ring);
        for (const row of rows) people.set(row.id, row);
        const family = tableOf(olvane, people);
        show(family.layout(focus), round);
        family.close();
        ring = [...new Set(rows.flatMap(relativesOf))].filter((id) => id && !asked.has(id));
    }
    return people;
}
