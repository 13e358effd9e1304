// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// How long a file of 100,000 persons takes from the drop until its picture stands, in every engine of this machine, and where
// that time goes: node engines/opening.mjs [--only ENGINE] [--rounds N] [--wait MS] [--persons N]
//
// Each round opens the page in a browser of its own, waits as long as --wait states, and drops the file twice. Beside the seconds
// stands how long the browser ran on processors, which says more on a machine that others use as well.

import { readdirSync, readFileSync } from "node:fs";
import { pathToFileURL } from "node:url";
import { kEngines } from "./windows.mjs";

const only = optionOf("--only", "");
const rounds = Number(optionOf("--rounds", "3"));
const wait = Number(optionOf("--wait", "10000"));
const persons = Number(optionOf("--persons", "100000"));

function optionOf(name, otherwise) {
    const at = process.argv.indexOf(name);
    return at < 0 ? otherwise : process.argv[at + 1];
}

// Seconds that a process and its children have run on processors.
function processorTime(root) {
    const children = new Map();
    const times = new Map();
    for (const pid of readdirSync("/proc").filter((name) => /^\d+$/.test(name))) {
        try {
            const fields = readFileSync(`/proc/${pid}/stat`, "latin1")
                .replace(/^.*\) /s, "")
                .split(" ");
            children.set(fields[1], [...(children.get(fields[1]) ?? []), pid]);
            times.set(pid, (Number(fields[11]) + Number(fields[12])) / 100);
        } catch {
            // It has ended.
        }
    }
    const of = (pid) => (children.get(pid) ?? []).reduce((sum, child) => sum + of(child), times.get(pid) ?? 0);
    return of(String(root));
}

// In the page, before a file comes: keeps when which message of the worker arrives.
function listen() {
    window.seen = { parts: [] };
    const { get, set } = Object.getOwnPropertyDescriptor(Worker.prototype, "onmessage");
    Object.defineProperty(Worker.prototype, "onmessage", {
        get,
        set(answer) {
            set.call(this, (event) => {
                const { part, memory } = event.data;
                if (part !== undefined) window.seen.parts.push([part, performance.now()]);
                if (memory !== undefined) window.seen.answered = performance.now();
                return answer.call(this, event);
            });
        },
    });
}

// The family of bench/make_gedcom; drops it and waits for its picture.
async function open(persons, name) {
    const months = ["JAN", "FEB", "MAR", "APR", "MAY", "JUN", "JUL", "AUG", "SEP", "OCT", "NOV", "DEC"];
    const families = Math.floor((persons + 1) / 2);
    const lines = ["0 HEAD", "1 SOUR bench", "1 GEDC", "2 VERS 5.5.1", "2 FORM LINEAGE-LINKED", "1 CHAR UTF-8"];
    for (let person = 1; person <= persons; ++person) {
        const family = (person + 1) >> 1;
        const isHusband = person % 2 === 1;
        const year = 1400 + 25 * (31 - Math.clz32(family)) + (person % 20);
        lines.push(`0 @I${person}@ INDI`, `1 NAME Given${person % 4001} /Surname${person % 997}/`);
        lines.push(`1 SEX ${isHusband ? "M" : "F"}`, "1 BIRT");
        lines.push(`2 DATE ${1 + (person % 28)} ${months[person % 12]} ${year}`);
        lines.push(`2 PLAC Town ${person % 311}, County, Country`, "1 DEAT", `2 DATE ${year + 60}`);
        lines.push(`1 FAMS @F${family}@`);
        if (family > 1 && isHusband === (family % 2 === 0)) lines.push(`1 FAMC @F${family >> 1}@`);
    }
    for (let family = 1; family <= families; ++family) {
        lines.push(`0 @F${family}@ FAM`, `1 HUSB @I${2 * family - 1}@`, `1 WIFE @I${2 * family}@`);
        for (const child of [2 * (2 * family) - 1, 2 * (2 * family + 1)])
            if (child <= persons) lines.push(`1 CHIL @I${child}@`);
    }
    lines.push("0 TRLR", "");
    const transfer = new DataTransfer();
    transfer.items.add(new File([lines.join("\n")], `${name}.ged`));
    lines.length = 0;
    await new Promise((next) => setTimeout(next, 200));
    window.seen.parts.length = 0;
    const start = performance.now();
    document.body.dispatchEvent(new DragEvent("drop", { dataTransfer: transfer, bubbles: true, cancelable: true }));
    while (document.title !== name) await new Promise((next) => setTimeout(next, 5));
    await new Promise((next) => requestAnimationFrame(() => setTimeout(next)));
    const end = performance.now();
    const { parts, answered } = window.seen;
    const opened = performance.getEntriesByName("olvane-open").at(-1);
    return {
        all: end - start,
        "until the worker has it": parts[0]?.[1] - start,
        read: parts.at(-1)?.[1] - parts[0]?.[1],
        "rows and memory": answered - parts.at(-1)?.[1],
        "memory in the page": opened.startTime - answered,
        "first picture": opened.duration,
        drawn: end - opened.startTime - opened.duration,
    };
}

for (const engine of kEngines.filter(({ name, isHere }) => isHere && (!only || name === only))) {
    for (let round = 0; round < rounds; ++round) {
        const window = await engine.open();
        try {
            await window.goto(pathToFileURL(process.env.OLVANE_PAGE).href);
            await window.evaluate(listen);
            await new Promise((next) => setTimeout(next, wait));
            for (const name of ["first", "second"]) {
                const before = processorTime(window.process.pid);
                const times = await window.evaluate(open, persons, name);
                times.processors = 1000 * (processorTime(window.process.pid) - before);
                const parts = Object.entries(times).map(([what, time]) => `${what} ${(time / 1000).toFixed(2)}`);
                console.log(`${engine.name}, ${name}: ${parts.join(", ")} s`);
            }
        } finally {
            await window.close();
        }
    }
}
