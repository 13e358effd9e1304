// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A GEDCOM file that the module has read. Persons and families come over once, as rows; facts when they are asked for.

import { GedcomError, LayoutError } from "./errors.mjs";
import { detailedFactFrom, detailedNameFrom, detailsFrom, factFrom, labelFrom, sheetsFrom } from "./gedcomValues.mjs";
import { Instance } from "./instance.mjs";
import { refuseNested, runLayout } from "./layout.mjs";
import { focusNumber } from "./options.mjs";
import { BRANCHES, readPicture, SIDES } from "./picture.mjs";
import {
    drawingNumbers,
    factBits,
    laterSideFrom,
    paperNumbers,
    partText,
    photoText,
    pictureNumbers,
    usualBoxesFrom,
    withPhotos,
} from "./pictureOptions.mjs";
import { openFile } from "./reading.mjs";
import { diagnosticFrom, remarkFrom } from "./remarks.mjs";
import { appendPart, partsOf } from "./rows.mjs";
import { searchWith } from "./search.mjs";
import { Texts } from "./texts.mjs";

// Persons that a search's index takes in between two looks at the clock: a fifth of a millisecond.
const INDEXED_AT_ONCE = 50;

// Closes what nobody holds any more and nobody closed.
const unclosed = new FinalizationRegistry(({ instance, file }) => instance.exports.gedcom_close(file));

function tablesOf(instance, file) {
    const tables = { persons: [], families: [] };
    for (const part of partsOf(instance, file)) appendPart(tables, part);
    return tables;
}

export class GedcomFile {
    #instance;
    #file;
    #token = {};

    constructor(instance, file, name, { persons, families } = tablesOf(instance, file)) {
        this.#instance = instance;
        this.#file = file;
        this.name = name;
        this.texts = new Texts(instance);
        const [encoding, version, diagnostics] = this.#answer("gedcom_head");
        this.encoding = encoding;
        this.version = version;
        this.persons = persons;
        this.families = families;
        this.diagnostics = diagnostics.map(diagnosticFrom);
        unclosed.register(this, { instance, file }, this.#token);
    }

    factsOfPerson(id) {
        return this.#answer("gedcom_person_facts", id).map(factFrom);
    }

    parentFamilyOf(id) {
        return this.#instance.exports.gedcom_parent_family(this.#opened(), this.#person(id));
    }

    siblingsOf(id) {
        return this.#answer("gedcom_siblings", this.#person(id));
    }

    get bestFocus() {
        return this.#instance.exports.gedcom_best_focus(this.#opened()) >>> 0;
    }

    factsOfFamily(id) {
        return this.#answer("gedcom_family_facts", id).map(factFrom);
    }

    labelOfPerson(id, show = [], language = "en") {
        return this.labelsOfPersons([id], show, language)[0];
    }

    labelsOfPersons(persons, show = [], language = "en") {
        const ids = Uint32Array.from(persons);
        const labels = this.#instance.withText(String(language), (code) =>
            this.#instance.withBytes(new Uint8Array(ids.buffer), (list) =>
                this.#answer("gedcom_person_labels", list, ids.length, factBits(show), code),
            ),
        );
        return labels.map(labelFrom);
    }

    labelOfFamily(id, show = [], language = "en") {
        return this.#instance.withText(String(language), (code) =>
            this.#answer("gedcom_family_label", id, factBits(show), code),
        );
    }

    search(text, limit = Infinity) {
        return searchWith(this.#instance, text, limit, (pointer, most) => this.#answer("gedcom_search", pointer, most));
    }

    prepareSearch(milliseconds = Infinity) {
        const { exports } = this.#instance;
        const start = performance.now();
        let state = 0;
        do {
            state = exports.gedcom_prepare_search(this.#opened(), INDEXED_AT_ONCE);
            if (state < 0) throw new GedcomError(this.#instance.text(exports.last_text()));
        } while (state === 0 && performance.now() - start < milliseconds);
        return state === 1;
    }

    detailsOfPerson(id) {
        const [details, facts, names] = this.#answer("gedcom_person_details", id);
        return { ...detailsFrom(details), facts: facts.map(detailedFactFrom), names: names.map(detailedNameFrom) };
    }

    detailsOfFamily(id) {
        const [details, facts] = this.#answer("gedcom_family_details", id);
        return { ...detailsFrom(details), facts: facts.map(detailedFactFrom) };
    }

    remarks(language = "en") {
        const remarks = this.#instance.withText(String(language), (pointer) => this.#answer("gedcom_remarks", pointer));
        return remarks.map(remarkFrom);
    }

    kinship(a, b, language = "en") {
        const [text, ways] = this.#instance.withText(String(language), (pointer) =>
            this.#answer("gedcom_kinship", this.#person(a), this.#person(b), pointer),
        );
        return { text, ways: ways.map(([sort, words, persons]) => ({ sort, text: words, persons })) };
    }

    kinshipWords(focus, persons, language = "en") {
        const ids = Uint32Array.from(persons, (person) => this.#person(person));
        const texts = this.#instance.withText(String(language), (pointer) =>
            this.#instance.withBytes(new Uint8Array(ids.buffer), (list) =>
                this.#answer("gedcom_kinship_words", this.#person(focus), list, ids.length, pointer),
            ),
        );
        return Array.from(ids, (_, i) => ({ text: texts[3 * i], short: texts[3 * i + 1], shorter: texts[3 * i + 2] }));
    }

    layout(focus, options = undefined) {
        return this.#run(focus, options, "records").records;
    }

    layoutText(focus, options = undefined) {
        return this.#run(focus, options, "text").text;
    }

    picture(focus, options = {}) {
        const { exports } = this.#instance;
        const file = this.#opened();
        this.#setPictureOptions(focus, options);
        const answer = exports.gedcom_picture(file, focus);
        return readPicture(this.#instance, options, answer, exports.picture_art()) ?? this.#refuse();
    }

    branches(focus, person, options = {}) {
        const { exports } = this.#instance;
        const file = this.#opened();
        this.#setPictureOptions(focus, options);
        const answer = exports.gedcom_branches(file, focus, this.#person(person));
        if (answer === 0) this.#refuse();
        const numbers = new Int32Array(exports.memory.buffer, answer >>> 0, 6);
        return BRANCHES.map((branch, i) => ({ branch, count: numbers[2 * i], side: SIDES[numbers[2 * i + 1]] }));
    }

    usualBoxes(view = "family", direction = "down") {
        return usualBoxesFrom(this.#instance, view, direction);
    }

    laterSide(view = "family", direction = "down", mirrored = false) {
        return SIDES[laterSideFrom(this.#instance, view, direction, mirrored)];
    }

    takePlacesOf(earlier) {
        return this.#instance.exports.gedcom_take_places(this.#opened(), earlier.#opened()) !== 0;
    }

    mapIndex() {
        const { exports } = this.#instance;
        const map = exports.gedcom_map(this.#opened());
        if (map === 0) this.#refuse();
        try {
            const start = exports.map_bytes(map) >>> 0;
            return new Uint8Array(exports.memory.buffer, start, exports.map_size(map) >>> 0).slice();
        } finally {
            exports.map_free(map);
        }
    }

    #person(id) {
        if (this.persons[id - 1] === undefined) throw new RangeError(`${this.name}: there is no person ${String(id)}`);
        return id;
    }

    svg(focus, options = {}, drawing = {}) {
        const { exports } = this.#instance;
        const file = this.#opened();
        const { part, ...whole } = drawing;
        const { theme, boxes, facts, title, photos } = drawingNumbers(whole);
        const places = partText(part);
        this.#setPictureOptions(focus, options);
        const pointer = this.#instance.withText(title, (text) =>
            this.#instance.withText(photoText(photos), (persons) =>
                this.#instance.withText(places, (shown) =>
                    exports.gedcom_svg(file, focus, theme, boxes, facts, text, persons, shown),
                ),
            ),
        );
        if (pointer === 0) this.#refuse();
        return withPhotos(this.#instance.text(pointer), photos);
    }

    sheets(focus, options = {}, drawing = {}, onPaper = {}) {
        const { exports } = this.#instance;
        const file = this.#opened();
        const { theme, boxes, facts, title, photos } = drawingNumbers(drawing);
        const { paper, rows, columns, scale } = paperNumbers(onPaper);
        this.#setPictureOptions(focus, options);
        const pointer = this.#instance.withText(title, (text) =>
            this.#instance.withText(photoText(photos), (persons) =>
                this.#instance.withText(paper, (name) =>
                    exports.gedcom_sheets(file, focus, theme, boxes, facts, text, persons, name, rows, columns, scale),
                ),
            ),
        );
        if (pointer === 0) this.#refuse();
        return sheetsFrom(JSON.parse(this.#instance.text(pointer)), (svg) => withPhotos(svg, photos));
    }

    #setPictureOptions(focus, options) {
        const { exports } = this.#instance;
        refuseNested(this.#instance, "picture", focus);
        const numbers = pictureNumbers(this.#instance, options);
        for (const person of [focusNumber(focus), options.to || focus]) {
            if (this.persons[person - 1] !== undefined) continue;
            throw new LayoutError("invalidPerson", `${this.name}: there is no person ${person}`, "", []);
        }
        const head = exports.picture_options(numbers.length);
        new Float64Array(exports.memory.buffer, head >>> 0, numbers.length).set(numbers);
    }

    #refuse() {
        const message = this.#instance.text(this.#instance.exports.last_text());
        const status = message === "too large" || message === "too many sheets" ? "tooLarge" : "layoutFailed";
        throw new LayoutError(status, message, "", []);
    }

    close() {
        if (this.#file === 0) return;
        unclosed.unregister(this.#token);
        this.#instance.exports.gedcom_close(this.#file);
        this.#file = 0;
    }

    #run(focus, options, wanted) {
        const file = this.#opened();
        if (this.persons[focusNumber(focus) - 1] === undefined) {
            throw new LayoutError("invalidPerson", `${this.name}: there is no person ${focus}`, "", []);
        }
        try {
            const withText = wanted === "text" ? 1 : 0;
            const ask = (view, person) => this.#instance.exports.gedcom_layout(file, view, person, withText);
            return runLayout(this.#instance, null, focus, options, ask, wanted);
        } catch (error) {
            // A file answers every question; it only ends a layout that asks for too much.
            if (error.status !== "hostFailed") throw error;
            const message = "the layout is too large: it asks for more than a million relatives";
            throw new LayoutError("tooLarge", message, error.text, error.records);
        }
    }

    #answer(question, ...values) {
        const pointer = this.#instance.exports[question](this.#opened(), ...values);
        if (pointer === 0) throw new GedcomError(this.#instance.text(this.#instance.exports.last_text()));
        return JSON.parse(this.#instance.text(pointer));
    }

    #opened() {
        if (this.#file === 0) throw new GedcomError(`${this.name}: the file has been closed`);
        return this.#file;
    }
}

if (Symbol.dispose) GedcomFile.prototype[Symbol.dispose] = GedcomFile.prototype.close;

export function readGedcom(instance, bytes, name, { encoding = "" } = {}) {
    const { exports } = instance;
    const file = openFile(instance, bytes, name, encoding);
    try {
        return new GedcomFile(instance, file, name);
    } catch (error) {
        exports.gedcom_close(file);
        throw error;
    }
}

export function readGedcomIn(worker, { module }, bytes, name, { encoding = "", onProgress, signal } = {}) {
    const tables = { persons: [], families: [] };
    return new Promise((done, failed) => {
        const fail = (error) => {
            worker.terminate();
            failed(error);
        };
        signal?.addEventListener("abort", () => fail(signal.reason), { once: true });
        worker.onerror = (event) => fail(new Error(event.message || "the worker could not be started"));
        worker.onmessage = async ({ data: { part, rows, file, memory, refused, message } }) => {
            if (part !== undefined) return onProgress?.(part);
            if (message !== undefined) return fail(refused ? new GedcomError(message) : new Error(message));
            if (rows !== undefined) return appendPart(tables, rows);
            try {
                done(new GedcomFile(await Instance.withMemory(module, memory), file, name, tables));
            } catch (error) {
                fail(error);
            }
        };
        if (signal?.aborted) fail(signal.reason);
        else worker.postMessage({ module, bytes, name, encoding });
    });
}
