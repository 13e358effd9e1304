// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A family in the module's memory: columns go in as bytes, edits as numbers and texts, and layouts ask nobody.

import { FamilyError, LayoutError, OutOfMemory } from "./errors.mjs";
import { columnsOf } from "./familyColumns.mjs";
import { chosenNumber, idNumber, refuse, storedText } from "./familyValues.mjs";
import { refuseNested } from "./layout.mjs";
import { focusNumber, optionNumbers } from "./options.mjs";
import { readPicture, usePictureOptions } from "./picture.mjs";
import { pictureNumbers } from "./pictureOptions.mjs";
import { searchWith } from "./search.mjs";
import { CHILD_KINDS, FAMILY_STATES, NAME_KINDS, SEXES, STATUSES, recordsFrom } from "./values.mjs";

const EDITS = [
    "addPerson",
    "setPerson",
    "removePerson",
    "setSpouses",
    "setChildren",
    "setNames",
    "setField",
    "addFamily",
    "setFamily",
    "removeFamily",
];
const PERSON_FIELDS = ["id", "father", "mother", "sex", "dead", "birth", "death", "birthWritten", "deathWritten"];
const FAMILY_FIELDS = [
    "number",
    "partner0",
    "partner1",
    "state",
    "marriage",
    "marriageWritten",
    "marriagePlace",
    "children",
];
const OUT_OF_MEMORY = 2;

// Frees what nobody holds any more and nobody closed.
const unclosed = new FinalizationRegistry(({ instance, pointer }) => instance.exports.family_free(pointer));

function thrown(instance, outcome) {
    if (outcome === OUT_OF_MEMORY) return new OutOfMemory();
    const [message, table, row, id, field] = JSON.parse(instance.text(instance.exports.last_family_text()));
    return new FamilyError(message, { table, row: row < 0 ? null : row, id: id === 0 ? null : id, field });
}

function create(instance, rows) {
    const { exports } = instance;
    const columns = exports.family_columns();
    if (columns === 0) throw new OutOfMemory();
    try {
        for (const fill of columnsOf(rows)) fill(instance, columns);
        return instance.withBytes(new Uint8Array(4), (out) => {
            const outcome = exports.family_create(columns, out);
            if (outcome !== 0) throw thrown(instance, outcome);
            return instance.numbers(out, 1)[0] >>> 0;
        });
    } finally {
        exports.family_columns_free(columns);
    }
}

function checkFields(table, id, row, known) {
    for (const name of Object.keys(row)) {
        if (!known.includes(name)) refuse(table, null, id, name, "there is no such field");
    }
}

function pairsFrom(run, names) {
    const pairs = [];
    for (let i = 0; i < run.length; i += 2) pairs.push([names === null ? run[i] : names[run[i]], run[i + 1]]);
    return pairs;
}

export class Family extends EventTarget {
    #instance;
    #pointer;
    #token = {};

    /** @private olvane.family makes it. */
    constructor(instance, rows, pointer = create(instance, rows)) {
        super();
        this.#instance = instance;
        this.#pointer = pointer;
        unclosed.register(this, { instance, pointer }, this.#token);
    }

    get size() {
        return this.#instance.exports.family_size(this.#opened()) >>> 0;
    }

    get memoryBytes() {
        return this.#instance.exports.family_memory(this.#opened()) >>> 0;
    }

    get ids() {
        return this.#ids(0);
    }

    get familyNumbers() {
        return this.#ids(1);
    }

    has(person) {
        return Number.isSafeInteger(person) && this.#instance.exports.family_has(this.#opened(), person) !== 0;
    }

    person(person) {
        const read = this.#read("family_person", person, "person");
        const [father, mother, sex, dead, birth, death, birthWritten, deathWritten, spouses, preferred, children] =
            read;
        return {
            id: person,
            father,
            mother,
            sex: SEXES[sex],
            dead: dead !== 0,
            birth,
            death,
            birthWritten,
            deathWritten,
            spouses,
            preferred,
            children,
            names: pairsFrom(read[11], NAME_KINDS).map(([kind, text]) => ({ kind, text })),
            fields: Object.fromEntries(pairsFrom(read[12], null)),
        };
    }

    family(number) {
        const read = this.#read("family_family", number, "family");
        const [partner0, partner1, state, marriage, marriageWritten, marriagePlace, run] = read;
        const children = [];
        for (let i = 0; i < run.length; i += 2) children.push({ child: run[i], kind: CHILD_KINDS[run[i + 1]] });
        return {
            number,
            partner0,
            partner1,
            state: FAMILY_STATES[state],
            marriage,
            marriageWritten,
            marriagePlace,
            children,
        };
    }

    addPerson(row) {
        this.#putPerson("addPerson", row);
    }

    setPerson(row) {
        this.#putPerson("setPerson", row);
    }

    removePerson(id) {
        this.#change("removePerson", [idNumber("persons", id, "id", { id })], []);
    }

    setSpouses(id, spouses, preferred = 0) {
        const ids = Array.from(spouses, (spouse) => idNumber("spouses", spouse, "spouse", { id }));
        const chosen = idNumber("spouses", preferred, "preferred", { id });
        this.#change("setSpouses", [idNumber("spouses", id, "id", { id }), chosen, ...ids], []);
    }

    setChildren(id, children) {
        const ids = Array.from(children, (child) => idNumber("children", child, "child", { id }));
        this.#change("setChildren", [idNumber("children", id, "id", { id }), ...ids], []);
    }

    setNames(id, names) {
        const parts = Array.from(names);
        const kinds = parts.map(({ kind }) => chosenNumber("names", kind ?? "full", "kind", NAME_KINDS, { id }));
        const texts = parts.map(({ text }) => storedText("names", text, "text", { id }));
        this.#change("setNames", [idNumber("names", id, "id", { id }), ...kinds], texts);
    }

    setField(id, key, text) {
        const texts = [storedText("fields", key, "key", { id }), storedText("fields", text, "text", { id })];
        this.#change("setField", [idNumber("fields", id, "id", { id })], texts);
    }

    addFamily(row) {
        this.#putFamily("addFamily", row);
    }

    setFamily(row) {
        this.#putFamily("setFamily", row);
    }

    removeFamily(number) {
        this.#change("removeFamily", [idNumber("families", number, "number", { id: number })], []);
    }

    copy() {
        const pointer = this.#instance.exports.family_copy(this.#opened()) >>> 0;
        if (pointer === 0) throw new OutOfMemory();
        return new Family(this.#instance, null, pointer);
    }

    search(text, limit = Infinity) {
        return searchWith(this.#instance, text, limit, (pointer, most) => {
            const json = this.#instance.exports.family_search(this.#opened(), pointer, most);
            if (json === 0) throw new OutOfMemory();
            return JSON.parse(this.#instance.text(json));
        });
    }

    gedcom() {
        const pointer = this.#instance.exports.family_gedcom(this.#opened());
        if (pointer === 0) throw new OutOfMemory();
        return this.#instance.text(pointer);
    }

    layout(focus, options = undefined) {
        return this.#layOut(focus, options, 0).records;
    }

    layoutText(focus, options = undefined) {
        return this.#layOut(focus, options, 1).text;
    }

    picture(focus, options = {}) {
        const { exports } = this.#instance;
        refuseNested(this.#instance, "picture", focus);
        const numbers = pictureNumbers(this.#instance, options);
        usePictureOptions(this.#instance, numbers);
        const answer = exports.family_picture(this.#opened(), focusNumber(focus));
        const picture = readPicture(this.#instance, options, answer);
        if (picture !== null) return picture;
        const isKnown = this.has(focus) && (options.view !== "kinship" || this.has(options.to));
        const why = this.#instance.text(exports.last_text());
        throw new LayoutError(
            isKnown ? "layoutFailed" : "invalidPerson",
            `picture of person ${String(focus)}: ${why}`,
            "",
            [],
        );
    }

    close() {
        if (this.#pointer === 0) return;
        unclosed.unregister(this.#token);
        this.#instance.exports.family_free(this.#pointer);
        this.#pointer = 0;
    }

    #opened() {
        if (this.#pointer === 0) throw new Error("the family has been closed");
        return this.#pointer;
    }

    #ids(ofFamilies) {
        const { exports } = this.#instance;
        const pointer = exports.family_ids(this.#opened(), ofFamilies);
        if (pointer === 0) throw new OutOfMemory();
        return Array.from(this.#instance.numbers(pointer, exports.family_ids_count()));
    }

    #read(question, id, what) {
        const pointer = this.#instance.exports[question](this.#opened(), Number.isSafeInteger(id) ? id : 0);
        if (pointer === 0) throw new RangeError(`there is no ${what} ${String(id)}`);
        return JSON.parse(this.#instance.text(pointer));
    }

    #putPerson(edit, row) {
        const { id } = row;
        checkFields("persons", id, row, PERSON_FIELDS);
        const numbers = [
            idNumber("persons", id, "id", { id }),
            idNumber("persons", row.father, "father", { id }),
            idNumber("persons", row.mother, "mother", { id }),
            chosenNumber("persons", row.sex ?? "unknown", "sex", SEXES, { id }),
            row.dead ? 1 : 0,
        ];
        const texts = PERSON_FIELDS.slice(5).map((field) => storedText("persons", row[field], field, { id }));
        this.#change(edit, numbers, texts);
    }

    #putFamily(edit, row) {
        const id = row.number;
        checkFields("families", id, row, FAMILY_FIELDS);
        const numbers = [
            idNumber("families", id, "number", { id }),
            idNumber("families", row.partner0, "partner0", { id }),
            idNumber("families", row.partner1, "partner1", { id }),
            chosenNumber("families", row.state ?? "unknown", "state", FAMILY_STATES, { id }),
        ];
        for (const entry of row.children ?? []) {
            const { child, kind } = typeof entry === "object" && entry !== null ? entry : { child: entry };
            numbers.push(idNumber("family children", child, "child", { id }));
            numbers.push(chosenNumber("family children", kind ?? "birth", "kind", CHILD_KINDS, { id }));
        }
        const texts = FAMILY_FIELDS.slice(4, 7).map((field) => storedText("families", row[field], field, { id }));
        this.#change(edit, numbers, texts);
    }

    #change(edit, numbers, texts) {
        const instance = this.#instance;
        const pointer = this.#opened();
        const outcome = instance.withBytes(new Uint8Array(Float64Array.from(numbers).buffer), (at) =>
            instance.withText(texts.map((text) => `${text}\0`).join(""), (textsAt) =>
                instance.exports.family_edit(pointer, EDITS.indexOf(edit), at, numbers.length, textsAt),
            ),
        );
        if (outcome !== 0) throw thrown(instance, outcome);
        this.dispatchEvent(new Event("change"));
    }

    #layOut(focus, options, withText) {
        const instance = this.#instance;
        const { exports } = instance;
        const person = focusNumber(focus);
        refuseNested(instance, "layout", focus);
        const view = instance.useOptions(options, optionNumbers);
        const answer = exports.family_layout(this.#opened(), view, person, withText);
        if (answer === 0) throw new LayoutError("outOfMemory", "There is not enough memory.", "", []);
        try {
            const status = STATUSES[exports.answer_status(answer)];
            const isDone = status === "ok";
            const text =
                withText || !isDone
                    ? instance.text(exports.answer_text(answer), exports.answer_text_length(answer))
                    : "";
            const records =
                withText && isDone
                    ? []
                    : recordsFrom(instance.numbers(exports.answer_numbers(answer), exports.answer_count(answer)));
            if (isDone) return { text, records };
            const reason =
                status === "invalidPerson"
                    ? `the family has no person ${String(focus)}`
                    : instance.text(exports.status_text(STATUSES.indexOf(status)));
            throw new LayoutError(status, `layout of person ${String(focus)}: ${reason}`, text, records);
        } finally {
            exports.answer_free(answer);
        }
    }
}

if (Symbol.dispose) Family.prototype[Symbol.dispose] = Family.prototype.close;
