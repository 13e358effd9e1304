// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What a JavaScript host loads; olvane.d.mts tells what everything means.

import { Family } from "./family.mjs";
import { readGedcom } from "./gedcom.mjs";
import { Instance } from "./instance.mjs";
import { runLayout } from "./layout.mjs";

export { FamilyError, GedcomError, HostError, LayoutError } from "./errors.mjs";
export { Family } from "./family.mjs";
export { GedcomFile } from "./gedcom.mjs";
export { PERSON_NOT_FOUND, Shown } from "./values.mjs";

export class Olvane {
    #instance;

    constructor(instance) {
        this.#instance = instance;
        this.version = instance.text(instance.exports.version());
    }

    family(rows = {}) {
        return new Family(this.#instance, rows);
    }

    layout(host, focus, options = undefined) {
        if (host instanceof Family) return host.layout(focus, options);
        return this.#run(host, focus, options).records;
    }

    layoutText(host, focus, options = undefined) {
        if (host instanceof Family) return host.layoutText(focus, options);
        return this.#run(host, focus, options).text;
    }

    readGedcom(bytes, name = "family.ged", options = {}) {
        return readGedcom(this.#instance, bytes, name, options);
    }

    #run(host, focus, options) {
        const { exports } = this.#instance;
        return runLayout(this.#instance, host, focus, options, (view, person) => exports.layout_host(view, person));
    }
}

// Node reads files otherwise than a browser; the name stands apart so that no bundler looks for it.
async function moduleBesideThisFile() {
    const place = new URL("olvane.wasm", import.meta.url);
    if (place.protocol !== "file:") return (await fetch(place)).arrayBuffer();
    const files = "node:fs/promises";
    return (await import(files)).readFile(place);
}

export async function loadOlvane(module) {
    return new Olvane(await Instance.of(module ?? (await moduleBesideThisFile())));
}
