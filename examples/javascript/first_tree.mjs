// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT
// A first tree: five persons of the program's own, laid out around Henry and drawn to tree.svg.

import { writeFileSync } from "node:fs";

import { loadOlvane } from "olvane";

// A parent who is not known is left out.
const persons = new Map([
    [1, { name: "Henry", male: true, father: 4, mother: 5 }],
    [2, { name: "Anne", male: false }],
    [3, { name: "Elizabeth", male: false, father: 1, mother: 2 }],
    [4, { name: "Edmund", male: true }],
    [5, { name: "Margaret", male: false }],
]);

export const myFamily = {
    fatherOf: (id) => persons.get(id).father,
    motherOf: (id) => persons.get(id).mother,
    // Everyone who has a child with the person.
    spousesOf(id) {
        const children = this.childrenOf(id).map((child) => persons.get(child));
        return new Set(children.map(({ father, mother }) => (father === id ? mother : father)).filter(Boolean));
    },
    childrenOf: (id) =>
        [...persons].filter(([, { father, mother }]) => father === id || mother === id).map(([child]) => child),
    isPreferredSpouse(id, spouse) {
        return [...this.spousesOf(id)][0] === spouse;
    },
    isDead: () => true,
    dateOf: () => "",
    sexOf: (id) => (persons.get(id).male ? 0 : 1),
};

function draw(boxes) {
    const [width, height] = [55, 80];
    const left = Math.min(0, ...boxes.map(({ x }) => x - 10));
    const top = Math.min(0, ...boxes.map(({ y }) => y - 10));
    const right = Math.max(...boxes.map(({ x }) => x + width + 10));
    const bottom = Math.max(...boxes.map(({ y }) => y + height + 10));
    const lines = boxes.flatMap(({ segments }) =>
        segments.map(({ x1, y1, x2, y2 }) => `<path d="M${x1} ${y1}L${x2} ${y2}" stroke="black"/>\n`),
    );
    const pictures = boxes.map(({ id, x, y, kind }) => {
        const name = kind === "person" ? persons.get(id).name : "?";
        return (
            `<rect x="${x}" y="${y}" width="${width}" height="${height}" fill="white" stroke="black"/>\n` +
            `<text x="${x + 4}" y="${y + 44}" font-size="10">${name}</text>\n`
        );
    });
    const view = `${left} ${top} ${right - left} ${bottom - top}`;
    return `<svg xmlns="http://www.w3.org/2000/svg" viewBox="${view}">\n${lines.join("")}${pictures.join("")}</svg>\n`;
}

const olvane = await loadOlvane();
writeFileSync("tree.svg", draw(olvane.layout(myFamily, 1)));
