// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Every browser that shows the page unpacks "deflate-raw". Node does so from 20.12 on, and Debian 12 has 18: the tests
// give an older one its own zlib, so that they run the code of the page.

import { Duplex } from "node:stream";
import { createGunzip, createInflate, createInflateRaw } from "node:zlib";

function unpacksRaw(): boolean {
    try {
        new DecompressionStream("deflate-raw");
        return true;
    } catch {
        return false;
    }
}

class NodeDecompressionStream {
    readonly readable: ReadableStream<Uint8Array>;
    readonly writable: WritableStream<Uint8Array>;

    constructor(format: CompressionFormat) {
        const unpacker = { "deflate-raw": createInflateRaw, deflate: createInflate, gzip: createGunzip }[format]();
        const streams = Duplex.toWeb(unpacker);
        this.readable = streams.readable as ReadableStream<Uint8Array>;
        this.writable = streams.writable as WritableStream<Uint8Array>;
    }
}

if (!unpacksRaw()) Object.assign(globalThis, { DecompressionStream: NodeDecompressionStream });
