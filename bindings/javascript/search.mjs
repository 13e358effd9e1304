// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Whom a search has found, and why, from the module's JSON.

function reasonFrom([foundIn, fit, word, text, written, label, isDate]) {
    return { foundIn, fit, word, text, written, label, isDate: isDate !== 0 };
}

function hitFrom([person, fit, reasons]) {
    return { person, fit, reasons: reasons.map(reasonFrom) };
}

// Most of what the module's counts hold: everybody.
const EVERYBODY = 2 ** 32 - 1;

/** ask(pointer, limit) asks the module and gives what its JSON says. */
export function searchWith(instance, text, limit, ask) {
    const most = Math.max(0, Math.min(EVERYBODY, Math.trunc(Number(limit)) || 0));
    return instance.withText(String(text), (pointer) => ask(pointer, most)).map(hitFrom);
}
