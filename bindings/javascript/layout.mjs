// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// One layout: options go in, the answer is read out and freed, and what went wrong is thrown.

import { HostError, LayoutError, OutOfMemory } from "./errors.mjs";
import { focusNumber, optionNumbers } from "./options.mjs";
import { STATUSES, recordsFrom } from "./values.mjs";

// The answer is read before anything is thrown, since it must be freed.
function readAnswer(instance, answer) {
    if (answer === 0) return { status: STATUSES.indexOf("outOfMemory"), text: "", records: [] };
    const { exports } = instance;
    try {
        return {
            status: exports.answer_status(answer),
            text: instance.text(exports.answer_text(answer)),
            records: recordsFrom(instance.numbers(exports.answer_numbers(answer), exports.answer_count(answer))),
        };
    } finally {
        exports.answer_free(answer);
    }
}

// A host that could not be heard for want of memory has not failed.
function statusOf(result, thrown) {
    return thrown?.[0] instanceof OutOfMemory ? STATUSES.indexOf("outOfMemory") : result.status;
}

/** ask(view number, focus) runs the layout and gives the module's answer; host may be null where none is asked. */
export function runLayout(instance, host, focus, options, ask) {
    const person = focusNumber(focus);
    const view = instance.useOptions(options, optionNumbers);
    const { result, thrown } = instance.askingHost(host, () => readAnswer(instance, ask(view, person)));
    const number = statusOf(result, thrown);
    const status = STATUSES[number];
    if (status === "ok") return result;
    const message = instance.text(instance.exports.status_text(number));
    const { text, records } = result;
    if (status !== "hostFailed" || thrown === null) throw new LayoutError(status, message, text, records);
    throw new HostError(status, message, text, records, { cause: thrown[0] });
}
