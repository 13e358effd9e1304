// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The photographs that came with a family: inside the page, or in the archive that was dropped. What a file links to
// elsewhere is never fetched.

import { html } from "../base/dom";
import type { Archive } from "./archive";

const kMostBytes = 32 * 2 ** 20; // of one photograph, unpacked
const kCopySide = 480; // px that the copy of a photograph has at most: 4 cm on paper, at 300 an inch

export class Photographs {
    static readonly none = new Photographs(() => null);
    private readonly found = new Map<string, Promise<string | null> | string | null>();
    private readonly made: string[] = [];
    // Of each photograph of an archive, by its address.
    private readonly copies = new Map<string, string>();

    private constructor(
        private readonly find: (file: string) => Promise<Uint8Array<ArrayBuffer> | null> | string | null,
    ) {}

    /** JPEG in base 64, by the name that the family's text has for the file. */
    static embedded(photos: Readonly<Record<string, unknown>>): Photographs {
        if (Object.keys(photos).length === 0) return Photographs.none;
        return new Photographs((file) =>
            Object.hasOwn(photos, file) ? `data:image/jpeg;base64,${String(photos[file])}` : null,
        );
    }

    /** memberOf is the module's archiveMember. */
    static inArchive(archive: Archive, memberOf: (file: string) => string | null): Photographs {
        return new Photographs((file) => {
            const name = memberOf(file);
            return name === null || !archive.has(name) ? null : archive.bytesOf(name, kMostBytes).catch(() => null);
        });
    }

    /** The address of a photograph, null where there is none, or a promise of either while it is unpacked. */
    urlOf(file: string): Promise<string | null> | string | null {
        const known = this.found.get(file);
        if (known !== undefined) return known;
        const answer = this.find(file);
        const url = answer instanceof Promise ? answer.then((bytes) => this.keep(file, bytes)) : answer;
        this.found.set(file, url);
        return url;
    }

    /** A photograph as a data address, for a drawing that is saved or printed; null while it is unpacked. */
    dataOf(url: string): string | null {
        return url.startsWith("data:") ? url : (this.copies.get(url) ?? null);
    }

    close(): void {
        for (const url of this.made) URL.revokeObjectURL(url);
        this.made.length = 0;
        this.copies.clear();
        this.found.clear();
    }

    private async keep(file: string, bytes: Uint8Array<ArrayBuffer> | null): Promise<string | null> {
        const type = bytes && typeOf(bytes);
        const blob = type ? new Blob([bytes], { type }) : null;
        const url = blob && URL.createObjectURL(blob);
        if (url) {
            this.made.push(url);
            const copy = await smallCopy(blob).catch(() => null);
            if (copy) this.copies.set(url, copy);
        }
        this.found.set(file, url);
        return url;
    }
}

// A JPEG on white as a data address.
async function smallCopy(photograph: Blob): Promise<string> {
    const image = await createImageBitmap(photograph);
    const part = Math.min(1, kCopySide / Math.max(image.width, image.height));
    const canvas = html("canvas", { width: Math.ceil(image.width * part), height: Math.ceil(image.height * part) });
    const pen = canvas.getContext("2d")!;
    pen.fillStyle = "#fff";
    pen.fillRect(0, 0, canvas.width, canvas.height);
    pen.drawImage(image, 0, 0, canvas.width, canvas.height);
    return canvas.toDataURL("image/jpeg", 0.85);
}

// By the first bytes: a drawing with scripts in it, or anything else, is no photograph.
function typeOf(bytes: Uint8Array): string | null {
    const begins = (at: number, ...values: number[]) => values.every((value, i) => bytes[at + i] === value);
    if (begins(0, 0xff, 0xd8, 0xff)) return "image/jpeg";
    if (begins(0, 0x89, 0x50, 0x4e, 0x47)) return "image/png";
    if (begins(0, 0x47, 0x49, 0x46, 0x38)) return "image/gif";
    if (begins(0, 0x52, 0x49, 0x46, 0x46) && begins(8, 0x57, 0x45, 0x42, 0x50)) return "image/webp";
    return null;
}
