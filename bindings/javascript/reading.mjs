// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Reads a file into a module's memory: here, or in a worker that hands the memory over. It is all that such a worker needs.

import { GedcomError } from "./errors.mjs";
import { Instance } from "./instance.mjs";
import { partsOf } from "./rows.mjs";

/** The module's pointer to the open file. Throws GedcomError. */
export function openFile(instance, bytes, name, encoding) {
    const { exports } = instance;
    const file = instance.withText(name, (namePointer) =>
        instance.withText(encoding, (encodingPointer) =>
            instance.withBytes(bytes, (pointer, length) =>
                exports.gedcom_open(pointer, length, namePointer, encodingPointer),
            ),
        ),
    );
    if (file === 0) throw new GedcomError(instance.text(exports.last_text()));
    return file;
}

// What WebKit has not compiled when a worker ends stays interpreted in all others, at a tenth of the speed.
const AFTERLIFE = 10000; // ms

/** What a worker does for readGedcomIn: reads one file, hands over its memory, and ends a while later. */
export function serveReading(scope) {
    scope.onmessage = async ({ data: { module, bytes, name, encoding } }) => {
        try {
            const instance = await Instance.of(module);
            instance.onProgress = (part) => scope.postMessage({ part });
            const file = openFile(instance, bytes, name, encoding);
            // The page makes persons of each part while the next is written.
            for (const rows of partsOf(instance, file))
                scope.postMessage({ rows }, [rows.numbers.buffer, rows.texts.buffer]);
            instance.exports.gedcom_prepare(file);
            const memory = instance.memoryCopy();
            scope.postMessage({ file, memory }, [memory.buffer]);
            setTimeout(() => scope.close(), AFTERLIFE);
        } catch (error) {
            scope.postMessage({ refused: error instanceof GedcomError, message: String(error.message) });
        }
    };
}
