// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The worker that reads large files. The page holds all its code in itself, so the worker's is a text in it.

declare const kReadingScript: string;

/** Throws where the browser lets none be started. */
export function readingWorker(): Worker {
    const address = URL.createObjectURL(new Blob([kReadingScript], { type: "text/javascript" }));
    try {
        return new Worker(address);
    } finally {
        // The worker has its script by then.
        setTimeout(() => URL.revokeObjectURL(address), 10_000);
    }
}
