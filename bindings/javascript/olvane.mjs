// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What a JavaScript host loads; olvane.d.mts says what everything means.

import { Family } from "./family.mjs";
import { readGedcom, readGedcomIn } from "./gedcom.mjs";
import { diagnosticWords } from "./remarks.mjs";
import { Instance } from "./instance.mjs";
import { runLayout, runPicture } from "./layout.mjs";
import { pictureOptionsFrom } from "./pictureOptions.mjs";
import { Texts } from "./texts.mjs";

export { FamilyError, GedcomError, HostError, LayoutError } from "./errors.mjs";
export { Family } from "./family.mjs";
export { GedcomFile } from "./gedcom.mjs";
export { serveReading } from "./reading.mjs";
export { DIRECTIONS, FACTS, PERSON_NOT_FOUND, PICTURE_VIEWS, Shown } from "./values.mjs";

export class Olvane {
    #instance;

    constructor(instance) {
        this.#instance = instance;
        this.texts = new Texts(instance);
        this.version = instance.text(instance.exports.version());
    }

    get encodings() {
        return this.#names("encoding_names");
    }

    get papers() {
        return this.#names("paper_names");
    }

    get pictureOptions() {
        return pictureOptionsFrom(this.#instance);
    }

    family(rows = {}) {
        return new Family(this.#instance, rows);
    }

    layout(host, focus, options = undefined) {
        if (host instanceof Family) return host.layout(focus, options);
        return this.#run(host, focus, options, "records").records;
    }

    layoutText(host, focus, options = undefined) {
        if (host instanceof Family) return host.layoutText(focus, options);
        return this.#run(host, focus, options, "text").text;
    }

    picture(host, focus, options = {}) {
        return host instanceof Family ? host.picture(focus, options) : runPicture(this.#instance, host, focus, options);
    }

    diagnosticWords(diagnostic, language = "en") {
        return diagnosticWords(this.#instance, diagnostic, language);
    }

    archiveMember(file) {
        const instance = this.#instance;
        return instance.withText(file, (pointer) => {
            const member = instance.exports.archive_member(pointer);
            return member === 0 ? null : instance.text(member);
        });
    }

    readGedcom(bytes, name = "family.ged", options = {}) {
        return readGedcom(this.#instance, bytes, name, options);
    }

    readGedcomIn(worker, bytes, name = "family.ged", options = {}) {
        return readGedcomIn(worker, this.#instance, bytes, name, options);
    }

    #names(list) {
        return this.#instance.text(this.#instance.exports[list]()).split("\n");
    }

    #run(host, focus, options, wanted) {
        const { exports } = this.#instance;
        const ask = (view, person) => exports.layout_host(view, person);
        return runLayout(this.#instance, host, focus, options, ask, wanted);
    }
}

// Node reads files otherwise than a browser; bundlers leave its module alone.
async function moduleBesideThisFile() {
    const place = new URL("olvane.wasm", import.meta.url);
    if (place.protocol === "file:") {
        const files = "node:fs/promises";
        return (await import(/* webpackIgnore: true */ /* @vite-ignore */ files)).readFile(place);
    }
    const response = await fetch(place);
    if (!response.ok) throw new Error(`${place.href}: ${response.status} ${response.statusText}`.trimEnd());
    const bytes = await response.arrayBuffer();
    checkMagic(new Uint8Array(bytes, 0, Math.min(4, bytes.byteLength)), place.href);
    return bytes;
}

// A server that answers everything with its start page answers this, too.
function checkMagic(bytes, address) {
    if ([0x00, 0x61, 0x73, 0x6d].every((byte, i) => bytes[i] === byte)) return;
    throw new Error(`${address}: what came is no WebAssembly module`);
}

export async function loadOlvane(module) {
    return new Olvane(await Instance.of(module ?? (await moduleBesideThisFile())));
}
