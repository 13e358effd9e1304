// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Unpacks what is packed: the page's own parts, and the family file inside a GEDZIP archive.

const kEntry = 0x02014b50; // a file in the list at the archive's end
const kEnd = 0x06054b50;
const kEndSize = 22; // bytes, without a comment
const kMostComment = 0xffff;
const kMostUnpacked = 1 << 30; // bytes; more is taken for an attack

export class ArchiveError extends Error {}

export class TooLargeError extends Error {}

export function bytesOfBase64(text: string): Uint8Array<ArrayBuffer> {
    const { fromBase64 } = Uint8Array as unknown as { fromBase64?: (text: string) => Uint8Array<ArrayBuffer> };
    if (fromBase64) return fromBase64.call(Uint8Array, text);
    const binary = atob(text.trim());
    const bytes = new Uint8Array(binary.length);
    for (let i = 0; i < binary.length; ++i) bytes[i] = binary.charCodeAt(i);
    return bytes;
}

export function gunzip(bytes: Uint8Array<ArrayBuffer>): Promise<Uint8Array<ArrayBuffer>> {
    return inflate(bytes, "gzip");
}

export function isArchive(bytes: Uint8Array): boolean {
    return bytes[0] === 0x50 && bytes[1] === 0x4b && (bytes[2] === 3 || bytes[2] === 5);
}

/** A GEDZIP archive: a GEDCOM file with the media that it links to. */
export class Archive {
    private readonly entries: ReadonlyMap<string, Entry>;

    /** Throws ArchiveError for bytes that are none. */
    constructor(private readonly bytes: Uint8Array<ArrayBuffer>) {
        this.entries = new Map(entriesOf(bytes).map((entry) => [entry.name, entry]));
    }

    /** The GEDCOM file: gedcom.ged, or else the first that ends in .ged. No more bytes than `most` come out of it. */
    async gedcom(most: number): Promise<Uint8Array<ArrayBuffer>> {
        const names = [...this.entries.keys()];
        const name = names.find((one) => /(^|\/)gedcom\.ged$/i.test(one)) ?? names.find((one) => /\.ged$/i.test(one));
        if (name === undefined) throw new ArchiveError("no .ged");
        return this.bytesOf(name, most);
    }

    has(name: string): boolean {
        return this.entries.has(name);
    }

    /** Throws TooLargeError for more bytes than that, ArchiveError for a damaged member. */
    async bytesOf(name: string, most: number): Promise<Uint8Array<ArrayBuffer>> {
        try {
            return await contentOf(this.bytes, this.entries.get(name)!, most);
        } catch (error) {
            if (error instanceof TooLargeError) throw error;
            throw new ArchiveError("damaged", { cause: error });
        }
    }
}

interface Entry {
    readonly name: string;
    readonly method: number; // 0 as it is, 8 deflated
    readonly packedSize: number;
    readonly size: number;
    readonly start: number; // of its own header
}

function entriesOf(archive: Uint8Array): Entry[] {
    const view = new DataView(archive.buffer, archive.byteOffset, archive.byteLength);
    const end = endOf(view);
    const entries: Entry[] = [];
    let at = view.getUint32(end + 16, true);
    for (let left = view.getUint16(end + 10, true); left > 0; --left) {
        if (at + 46 > view.byteLength || view.getUint32(at, true) !== kEntry) throw new ArchiveError("damaged");
        const nameSize = view.getUint16(at + 28, true);
        entries.push({
            name: new TextDecoder().decode(archive.subarray(at + 46, at + 46 + nameSize)),
            method: view.getUint16(at + 10, true),
            packedSize: view.getUint32(at + 20, true),
            size: view.getUint32(at + 24, true),
            start: view.getUint32(at + 42, true),
        });
        at += 46 + nameSize + view.getUint16(at + 30, true) + view.getUint16(at + 32, true);
    }
    return entries;
}

function endOf(view: DataView): number {
    const lowest = Math.max(0, view.byteLength - kEndSize - kMostComment);
    for (let at = view.byteLength - kEndSize; at >= lowest; --at) if (view.getUint32(at, true) === kEnd) return at;
    throw new ArchiveError("no archive");
}

async function contentOf(
    archive: Uint8Array<ArrayBuffer>,
    entry: Entry,
    most: number,
): Promise<Uint8Array<ArrayBuffer>> {
    const view = new DataView(archive.buffer, archive.byteOffset, archive.byteLength);
    const start = entry.start + 30 + view.getUint16(entry.start + 26, true) + view.getUint16(entry.start + 28, true);
    const packed = archive.slice(start, start + entry.packedSize);
    if (packed.length > most) throw new TooLargeError();
    if (entry.method === 0) return packed;
    if (entry.method !== 8) throw new ArchiveError("packed in a way that is not known");
    return inflate(packed, "deflate-raw", most);
}

async function inflate(
    bytes: Uint8Array<ArrayBuffer>,
    format: CompressionFormat,
    most = kMostUnpacked,
): Promise<Uint8Array<ArrayBuffer>> {
    const reader = new Blob([bytes]).stream().pipeThrough(new DecompressionStream(format)).getReader();
    const parts: Uint8Array[] = [];
    let size = 0;
    for (let next = await reader.read(); !next.done; next = await reader.read()) {
        parts.push(next.value);
        size += next.value.length;
        if (size > most) throw new TooLargeError();
    }
    const whole = new Uint8Array(size);
    let at = 0;
    for (const part of parts) {
        whole.set(part, at);
        at += part.length;
    }
    return whole;
}
