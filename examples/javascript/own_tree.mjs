// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
import { sharedEngine } from "./olvane-tree.mjs";

const persons = [
    // yours: await (await fetch("/persons.json")).json()
    { id: 1, given: "Henry", surname: "Berg", sex: "m", birth: "1850", death: "1911", father: 4, mother: 5 },
    { id: 2, given: "Anne", surname: "Carl", sex: "f", birth: "1855", death: "1930" },
    { id: 3, given: "Elizabeth", surname: "Berg", sex: "f", birth: "1880-02-29", father: 1, mother: 2 },
    { id: 4, given: "Edmund", surname: "Berg", sex: "m", death: "1890", occupation: "Baker" },
    { id: 5, given: "Margaret", surname: "Dorn", sex: "f" },
];
const olvane = await sharedEngine();
const family = olvane.family({ persons });
document.querySelector("olvane-tree").data = family;

// What is changed later is drawn at once, and everybody else stays where they are.
document.querySelector("#add").addEventListener("click", () => {
    const id = Math.max(...family.ids) + 1;
    family.addPerson({ id, sex: "f", birth: "1882", father: 1, mother: 2 });
    family.setNames(id, [{ text: "Clara Berg" }]);
});
