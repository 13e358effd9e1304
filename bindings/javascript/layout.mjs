// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// One layout: options go in, the answer is read out and freed, and what went wrong is thrown.

import { HostError, LayoutError, OutOfMemory } from "./errors.mjs";
import { focusNumber, optionNumbers } from "./options.mjs";
import { readPicture, usePictureOptions } from "./picture.mjs";
import { pictureNumbers } from "./pictureOptions.mjs";
import { STATUSES, described, recordsFrom } from "./values.mjs";

// The answer is read before anything is thrown, since it must be freed; of one that is whole, what is wanted alone.
function readAnswer(instance, answer, wanted) {
    if (answer === 0) return { status: STATUSES.indexOf("outOfMemory"), text: "", records: [] };
    const { exports } = instance;
    try {
        const status = exports.answer_status(answer);
        const wantsAll = status !== 0 || wanted === undefined;
        const text =
            wantsAll || wanted === "text"
                ? instance.text(exports.answer_text(answer), exports.answer_text_length(answer))
                : "";
        const records =
            wantsAll || wanted === "records"
                ? recordsFrom(instance.numbers(exports.answer_numbers(answer), exports.answer_count(answer)))
                : [];
        return { status, text, records };
    } finally {
        exports.answer_free(answer);
    }
}

// A host that could not be asked because memory is short has not failed.
function statusOf(result, thrown) {
    return thrown?.[0] instanceof OutOfMemory ? STATUSES.indexOf("outOfMemory") : result.status;
}

function reasonOf(error) {
    return error instanceof Error ? `${error.name}: ${error.message}` : String(error);
}

/** Throws where a method of a host asks for a layout or a picture while that host's own is being made. */
export function refuseNested(instance, what, focus) {
    if (!instance.isAsking) return;
    const why = instance.text(instance.exports.status_text(STATUSES.indexOf("nestedCall")));
    throw new LayoutError("nestedCall", `${what} of person ${described(focus)}: ${why}`, "", []);
}

/**
 * ask(view number, focus) runs the layout and gives the module's answer; host may be null where none is asked. wanted is
 * "text" or "records"; both without it, and of a layout that failed.
 */
export function runLayout(instance, host, focus, options, ask, wanted = undefined) {
    const person = focusNumber(focus);
    refuseNested(instance, "layout", focus);
    const view = instance.useOptions(options, optionNumbers);
    const { result, thrown } = instance.askingHost(host, () => readAnswer(instance, ask(view, person), wanted));
    const number = statusOf(result, thrown);
    const status = STATUSES[number];
    if (status === "ok") return result;
    const message = instance.text(instance.exports.status_text(number));
    const { text, records } = result;
    if (status !== "hostFailed" || thrown === null) {
        throw new LayoutError(status, `layout of person ${described(focus)}: ${message}`, text, records);
    }
    const [cause, question] = thrown;
    throw new HostError(status, `${question}: ${reasonOf(cause)}`, text, records, { cause });
}

/** The picture of a view of a host that is asked. */
export function runPicture(instance, host, focus, options) {
    const person = focusNumber(focus);
    refuseNested(instance, "picture", focus);
    usePictureOptions(instance, pictureNumbers(instance, options));
    const { exports } = instance;
    const { result, thrown } = instance.askingHost(host, () => {
        const picture = readPicture(instance, options, exports.host_picture(person));
        const why = picture === null ? instance.text(exports.last_text()) : "";
        return { picture, status: exports.picture_status(), why };
    });
    if (result.picture !== null) return result.picture;
    const number = statusOf(result, thrown);
    const status = STATUSES[number] === "ok" ? "tooLarge" : STATUSES[number];
    if (status !== "hostFailed" || thrown === null) {
        const why = result.why || instance.text(exports.status_text(number));
        throw new LayoutError(status, `picture of person ${described(focus)}: ${why}`, "", []);
    }
    const [cause, question] = thrown;
    throw new HostError(status, `${question}: ${reasonOf(cause)}`, "", [], { cause });
}
