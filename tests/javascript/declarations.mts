// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Never runs: a program in TypeScript must be able to say all this, and must not be able to say what is expected to
// be an error.

import {
    FamilyError,
    GedcomError,
    HostError,
    LayoutError,
    loadOlvane,
    PERSON_NOT_FOUND,
    Shown,
} from "../../bindings/javascript/olvane.mjs";
import type { Host, LayoutRecord, Options } from "../../bindings/javascript/olvane.mjs";

class Family implements Host {
    fatherOf(person: number): number | null {
        return person === 1 ? 2 : null;
    }
    motherOf(): number {
        return PERSON_NOT_FOUND;
    }
    *spousesOf(): Iterable<number> {}
    childrenOf(person: number): number[] {
        return person === 2 ? [1] : [];
    }
    isPreferredSpouse(): boolean {
        return false;
    }
    isDead(): boolean {
        return true;
    }
    dateOf(_person: number, isBirth: boolean): string {
        return isBirth ? "1809" : "";
    }
    sexOf(): number {
        return 0;
    }
}

const options: Options = { view: "pedigree", generations: 6, flagDepth: 2, sizes: { nodeWidth: 120 } };
const olvane = await loadOlvane(new Uint8Array());
const usual: Options = { view: undefined, shown: undefined, sizes: { nodeWidth: undefined } };
const records: LayoutRecord[] = olvane.layout(new Family(), 1, options);
const texts: string[] = [olvane.version, olvane.layoutText(new Family(), 1, { shown: Shown.all & ~Shown.cousins })];
const unknown: Host["dateOf"] = () => null;
texts.push(olvane.layoutText(new Family(), 1, usual), unknown(1, true) ?? "");
try {
    const file = olvane.readGedcom(new Uint8Array(), "x.ged");
    for (const person of file.persons) texts.push(person.name, person.birth?.shown ?? "", person.sex);
    for (const fact of file.factsOfPerson(1)) texts.push(fact.tag, fact.place, fact.date?.mark ?? "exact");
    file.close();
} catch (error) {
    if (error instanceof HostError) throw error.cause;
    if (error instanceof LayoutError) texts.push(error.status, error.text, String(error.records.length));
    if (error instanceof GedcomError) texts.push(error.message);
}

const table = olvane.family({
    persons: [
        { id: 1, sex: "m", occupation: "smith" },
        { id: 2n, birth: 1880 },
        { id: 3, father: 1, mother: null },
    ],
    families: { number: [1], partner0: new Int32Array([1]), state: ["married"] },
    spouses: [{ person: 1, spouse: 2, preferred: true }],
});
try {
    table.addPerson({ id: 4, mother: 2 });
    table.addFamily({ number: 2, partner0: 1, children: [3, { child: 4, kind: "adopted" }] });
    texts.push(table.person(3).birth, table.family(2).state, olvane.layoutText(table, 1));
} catch (error) {
    if (error instanceof FamilyError) texts.push(error.table, error.field, String(error.row));
}
// What a record is decides whether it has a child.
for (const record of table.copy().layout(1)) {
    if (record.kind === "person") texts.push(String(record.id));
    else texts.push(record.child.toFixed());
}
{
    using closed = olvane.family();
    texts.push(String(closed.size));
}

// @ts-expect-error: a family is made by olvane
new (await import("../../bindings/javascript/olvane.mjs")).Family();
// @ts-expect-error: a kind of child is one of six
table.addFamily({ number: 3, children: [{ child: 1, kind: "own" }] });
// @ts-expect-error: a record is not the host's to change
records[0]!.x = 1;
// @ts-expect-error: there are two views
olvane.layout(new Family(), 1, { view: "fan" });
// @ts-expect-error: a width is one of the sizes
olvane.layout(new Family(), 1, { nodeWidth: 105 });
// @ts-expect-error: an answer is due at once
const late: Host["isDead"] = async () => true;
late(1);
// @ts-expect-error: a host answers all eight questions
olvane.layout({ fatherOf: () => null }, 1);
