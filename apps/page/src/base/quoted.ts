// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

/** A name within a sentence, kept apart from the direction of the text around it. */
export function quoted(text: string): string {
    return "\u2068" + text + "\u2069";
}
