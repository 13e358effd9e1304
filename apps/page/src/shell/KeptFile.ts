// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The file that a reader asked this site to keep in the browser, so that it opens again without being dropped. Never of a
// page that lies on disk: every other page on that disk could read it.

const kDatabase = "olvane";
const kStore = "files";
const kKey = "kept";

export interface KeptBytes {
    readonly name: string;
    readonly bytes: ArrayBuffer;
}

/** Whether a file may be kept at all. */
export function canKeep(): boolean {
    return /^https?:$/.test(location.protocol) && typeof indexedDB !== "undefined";
}

/** Null where none is kept, or the browser lets none be read; what is kept stays in either case. */
export function keptFile(): Promise<KeptBytes | null> {
    if (!canKeep()) return Promise.resolve(null);
    return within<KeptBytes | undefined>("readonly", (store) => store.get(kKey)).then(
        (found) => found ?? null,
        () => null,
    );
}

/** Done when the file is stored. False where the browser keeps nothing, in a private window or where space is short. */
export function keepFile(file: KeptBytes): Promise<boolean> {
    return within("readwrite", (store) => store.put(file, kKey)).then(
        () => true,
        () => false,
    );
}

/** Removes it with the database that it lies in, once other windows have read what they are reading. False where the browser refuses. */
export function removeKeptFile(): Promise<boolean> {
    return new Promise<boolean>((done, failed) => {
        const request = indexedDB.deleteDatabase(kDatabase);
        request.onsuccess = () => done(true);
        request.onerror = () => failed(request.error);
    }).catch(() => false);
}

function within<Result>(mode: IDBTransactionMode, ask: (store: IDBObjectStore) => IDBRequest): Promise<Result> {
    return new Promise((done, failed) => {
        const opening = indexedDB.open(kDatabase, 1);
        opening.onupgradeneeded = () => {
            // A look leaves no empty database behind, which nobody asked for.
            if (mode === "readonly") opening.transaction?.abort();
            else opening.result.createObjectStore(kStore);
        };
        opening.onerror = () => failed(opening.error);
        opening.onsuccess = () => {
            const database = opening.result;
            try {
                const transaction = database.transaction(kStore, mode);
                const request = ask(transaction.objectStore(kStore));
                transaction.oncomplete = () => (database.close(), done(request.result as Result));
                transaction.onerror = transaction.onabort = () => (database.close(), failed(transaction.error));
            } catch (error) {
                database.close();
                failed(error);
            }
        };
    });
}
