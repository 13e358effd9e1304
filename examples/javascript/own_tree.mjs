// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
import "./olvane-tree.mjs";

const persons = [
    // yours: await (await fetch("/persons.json")).json()
    { id: 1, name: "Henry /Berg/", sex: "M", born: "1850", died: "1911", father: 4, mother: 5 },
    { id: 2, name: "Anne /Carl/", sex: "F", born: "1855", died: "1930" },
    { id: 3, name: "Elizabeth /Berg/", sex: "F", born: "1880", father: 1, mother: 2 },
    { id: 4, name: "Edmund /Berg/", sex: "M", died: "1890" },
    { id: 5, name: "Margaret /Dorn/", sex: "F" },
];
const line = (tag, value) => (value ? [`1 ${tag} ${value}`] : []);
const date = (tag, value) => (value ? [`1 ${tag}`, `2 DATE ${value}`] : []);
const person = (tag, id) => (id ? [`1 ${tag} @I${id}@`] : []);
const file = ["0 HEAD", "1 GEDC", "2 VERS 5.5.1", "1 CHAR UTF-8"];
for (const { id, name, sex, born, died, father, mother } of persons) {
    file.push(
        `0 @I${id}@ INDI`,
        ...line("NAME", name),
        ...line("SEX", sex),
        ...date("BIRT", born),
        ...date("DEAT", died),
    );
    if (father || mother) file.push(`1 FAMC @F${father}-${mother}@`);
}
for (const couple of new Set(persons.filter((p) => p.father || p.mother).map((p) => `${p.father}-${p.mother}`))) {
    const children = persons.filter((p) => `${p.father}-${p.mother}` === couple);
    const { father, mother } = children[0];
    file.push(`0 @F${couple}@ FAM`, ...person("HUSB", father), ...person("WIFE", mother));
    for (const { id } of children) file.push(...person("CHIL", id));
}
const bytes = new TextEncoder().encode([...file, "0 TRLR", ""].join("\n"));
await document.querySelector("olvane-tree").open(bytes, "family.ged");
