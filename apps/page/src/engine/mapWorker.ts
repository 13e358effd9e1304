// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Lays out maps beside the page, so that it can be used meanwhile: the page's own script runs in a worker once more,
// with an engine and a family of its own, and ends with the map.

import { loadOlvane } from "olvane";

/** A GEDCOM text as the page has read it. */
export interface MapSource {
    readonly bytes: Uint8Array;
    readonly name: string;
    readonly encoding: string;
}

interface Order extends MapSource {
    readonly engine: Uint8Array<ArrayBuffer>; // the module
}

// What the page's parts want to be there when they are loaded, though no worker has it.
const kPrelude = "self.HTMLElement=class{};self.matchMedia=()=>({addEventListener(){}});";

export const isWorker = typeof document === "undefined";

/** In a worker: answers the one message with the bytes of the map, or with the reason why there is none. */
export function serveMap(): void {
    addEventListener("message", (event: MessageEvent<Order>) => {
        void mapOf(event.data).then(
            (map) => postMessage(map, { transfer: [map.buffer] }),
            (error: unknown) => postMessage(String(error)),
        );
    });
}

async function mapOf({ engine, bytes, name, encoding }: Order): Promise<Uint8Array<ArrayBuffer>> {
    const olvane = await loadOlvane(engine);
    return olvane.readGedcom(bytes, name, { encoding }).mapIndex();
}

/** In the page. Rejects where there can be no worker, or the map is refused. */
export function mapInWorker(source: MapSource): Promise<Uint8Array<ArrayBuffer>> {
    const { script, engine } = self.olvanePage;
    const address = URL.createObjectURL(new Blob([kPrelude, script], { type: "text/javascript" }));
    const worker = new Worker(address);
    const answer = new Promise<Uint8Array<ArrayBuffer>>((resolve, reject) => {
        worker.onmessage = ({ data }: MessageEvent<Uint8Array<ArrayBuffer> | string>) =>
            typeof data === "string" ? reject(new Error(data)) : resolve(data);
        worker.onerror = (event) => reject(new Error(event.message));
        worker.postMessage({ engine, ...source } satisfies Order);
    });
    return answer.finally(() => {
        worker.terminate();
        URL.revokeObjectURL(address);
    });
}
