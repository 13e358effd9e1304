// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What can go wrong, and what is left of the layout then.

export class LayoutError extends Error {
    constructor(status, message, text, records, options) {
        super(message, options);
        this.name = "LayoutError";
        this.status = status;
        this.text = text;
        this.records = records;
    }
}

// Names are texts, since what packs a page shortens those of classes.
export class HostError extends LayoutError {
    constructor(...given) {
        super(...given);
        this.name = "HostError";
    }
}

/** The module's memory has no room for what comes from JavaScript. */
export class OutOfMemory extends RangeError {
    constructor() {
        super("not enough memory");
    }
}

export class GedcomError extends Error {
    constructor(message) {
        super(message);
        this.name = "GedcomError";
    }
}

/** What a family refuses; nothing has changed then. */
export class FamilyError extends Error {
    constructor(message, { table, row, id, field }) {
        super(message);
        this.name = "FamilyError";
        this.table = table;
        this.row = row;
        this.id = id;
        this.field = field;
    }
}
