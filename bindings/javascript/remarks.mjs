// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What was wrong or odd in a file: without words as the reader found it, and in the words that the module has for it.

const BETWEEN_PHRASES = "\u001e";
const BETWEEN_ARGUMENTS = "\u001f";

function phraseFrom([sentence, ...parts]) {
    return { sentence, arguments: parts };
}

export function diagnosticFrom([line, severity, kind, what, done, quoted]) {
    return { line, severity, kind, what: phraseFrom(what), done: done.map(phraseFrom), quoted };
}

export function remarkFrom([kind, severity, line, persons, text, hint]) {
    return { kind, severity, line, persons, text, hint };
}

function phraseText(phrase) {
    return [phrase?.sentence, ...(phrase?.arguments ?? [])].join(BETWEEN_ARGUMENTS);
}

/** The words for a diagnostic: what was wrong, and what was done about it; empty where it says nothing that is known. */
export function diagnosticWords(instance, { what, done = [], quoted = "" }, language) {
    const parts = [quoted, phraseText(what), ...done.map(phraseText)].join(BETWEEN_PHRASES);
    const json = instance.withText(parts, (pointer) =>
        instance.withText(String(language), (code) => instance.exports.diagnostic_words(pointer, code)),
    );
    const [text = "", hint = ""] = json === 0 ? [] : JSON.parse(instance.text(json));
    return { text, hint };
}
