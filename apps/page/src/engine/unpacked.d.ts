// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// bindings/javascript/package/unpack.mjs
declare module "olvane-unpack" {
    export function bytesOfLetters(letters: string): Uint8Array<ArrayBuffer>;
    export function unpackLzma(packed: Uint8Array): Uint8Array<ArrayBuffer>;
    export function joinModule(streams: Uint8Array): Uint8Array<ArrayBuffer>;
    export function unpackModule(letters: string): Uint8Array<ArrayBuffer>;
}

interface Window {
    /** What start.ts unpacked: the text of the page's script, and the module. */
    olvanePage: { readonly script: string; readonly engine: Uint8Array<ArrayBuffer> };
}
