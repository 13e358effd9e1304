// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The engine with the WebAssembly inside: one file, which loads nothing from anywhere.

import { loadOlvane as loadFrom } from "../olvane.mjs";

export * from "../olvane.mjs";

function bytesOf(base64) {
    return Uint8Array.from(atob(base64), (letter) => letter.charCodeAt(0));
}

async function unpacked(bytes) {
    const stream = new Blob([bytes]).stream().pipeThrough(new DecompressionStream("gzip"));
    return new Response(stream).arrayBuffer();
}

export async function loadOlvane(module) {
    // The build puts the packed module here.
    return loadFrom(module ?? (await unpacked(bytesOf(kPackedModule))));
}
