// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// One layout: options go in, the answer is read out and freed, and what went wrong is thrown.

import { HostError, LayoutError } from "./errors.mjs";
import { Shown, STATUSES, recordsFrom } from "./values.mjs";

const VIEWS = { family: 0, pedigree: 1 };

const SIZES = {
    nodeWidth: 55,
    nodeHeight: 80,
    horzPadding: 25,
    vertPadding: 30,
    spouseLineStep: 10,
    lineInset: 0,
};

function viewNumber(view) {
    if (Object.hasOwn(VIEWS, view)) return VIEWS[view];
    throw new TypeError(`there is no view ${JSON.stringify(view)}, but "family" and "pedigree"`);
}

function setOptions(instance, { sizes, shown = Shown.all, generations = 5, flagDepth = 4 }) {
    const all = { ...SIZES, ...sizes };
    instance.exports.set_options(
        all.nodeWidth,
        all.nodeHeight,
        all.horzPadding,
        all.vertPadding,
        all.spouseLineStep,
        all.lineInset,
        shown,
        generations,
        flagDepth,
    );
}

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

/** ask(view number) starts the layout and gives the module's answer; host may be null where none is asked. */
export function runLayout(instance, host, options, ask) {
    const view = viewNumber(options.view ?? "family");
    setOptions(instance, options);
    const { result, thrown } = instance.askingHost(host, () => readAnswer(instance, ask(view)));
    if (STATUSES[result.status] === "ok") return result;
    const status = STATUSES[result.status];
    const message = instance.text(instance.exports.status_text(result.status));
    if (thrown !== null) throw new HostError(status, message, result.text, result.records, { cause: thrown[0] });
    throw new LayoutError(status, message, result.text, result.records);
}
