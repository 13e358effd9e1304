// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// How a family file becomes an open family, and what is said of one that does not.

import { GedcomError, type GedcomFile, type Olvane, type WorkerReadOptions } from "olvane";
import { Archive, ArchiveError, isArchive, TooLargeError } from "../engine/archive";
import type { EmbeddedFamily } from "../engine/engine";
import { Photographs } from "../engine/photographs";
import type { MapSource } from "../engine/mapWorker";
import { readingWorker } from "../engine/readingWorker";
import type { UiMessages } from "../messages/ui";

const kLargeFile = 2 ** 20; // bytes; a smaller one is read in less time than a worker takes to start
const kWarmUpPause = 300; // ms
const kMadeUp = 1000; // persons
const kMostBytes = 128 * 2 ** 20; // of a file

/** A file that was read and has somebody in it. */
export interface OpenedFile {
    readonly file: GedcomFile;
    readonly name: string;
    readonly title: string;
    readonly photographs: Photographs;
}

export class FileOpening {
    constructor(readonly engine: Olvane) {}

    // The file as it was opened, and the GEDCOM text in it.
    private last: {
        readonly bytes: Uint8Array;
        readonly name: string;
        readonly photographs: Photographs;
        readonly whole: Uint8Array<ArrayBuffer>;
    } | null = null;

    private warmUpTimer = 0;
    private warmingUp: Promise<void> | null = null;

    /** What was read last. */
    source: MapSource | null = null;

    /**
     * Browsers compile well only what has run for a while, WebKit slowly and beside the page. A made-up family is read and drawn
     * while nobody waits, so that the first file opens as quickly as later ones.
     */
    warmUp(): void {
        this.warmUpTimer = window.setTimeout(() => {
            this.warmingUp = this.readMadeUp().catch(() => {
                // Where no worker can be started the first file takes its time.
            });
        }, kWarmUpPause);
    }

    private async readMadeUp(): Promise<void> {
        const bytes = new TextEncoder().encode(madeUpGedcom());
        const file = await this.engine.readGedcomIn(readingWorker(), bytes, "");
        file.picture(kMadeUp / 4);
        file.kinshipWords(kMadeUp / 4, [1, 2, kMadeUp / 2]);
        file.close();
    }

    openEmbedded({ bytes, name, title, photographs }: EmbeddedFamily): OpenedFile {
        return this.read(bytes, name, title, photographs);
    }

    /** The file as it was opened; null for a family that lies in the page. */
    get opened(): { readonly name: string; readonly bytes: ArrayBuffer } | null {
        return this.last && { name: this.last.name, bytes: this.last.whole.buffer };
    }

    /** Whether the file that is shown can be read in another encoding: what the page itself holds is UTF-8. */
    get canReadAgain(): boolean {
        return this.last !== null;
    }

    /** The file that was opened last, in another encoding; empty for the one that the file names. */
    readAgain(encoding: string): OpenedFile {
        const { bytes, name, photographs } = this.last!;
        return this.read(bytes, name, "", photographs, encoding);
    }

    // Throws as complaint() knows, and the signal's reason where the reading was ended.
    async openFile(file: File, signal: AbortSignal, onProgress: (part: number) => void): Promise<OpenedFile> {
        if (file.size > kMostBytes) throw new TooLargeError();
        const bytes = new Uint8Array(await file.arrayBuffer());
        const archive = isArchive(bytes) ? new Archive(bytes) : null;
        const gedcom = archive ? await archive.gedcom(kMostBytes) : bytes;
        signal.throwIfAborted();
        if (gedcom.length === 0) throw new EmptyFileError();
        const photographs = archive
            ? Photographs.inArchive(archive, (name) => this.engine.archiveMember(name))
            : Photographs.none;
        const opened =
            gedcom.length < kLargeFile
                ? this.read(gedcom, file.name, "", photographs)
                : await this.readAside(gedcom, file.name, photographs, { signal, onProgress });
        this.last = { bytes: gedcom, name: file.name, photographs, whole: bytes };
        return opened;
    }

    /** What to say of a file that could not be opened: a sentence and details. */
    complaint(name: string, error: unknown, ui: UiMessages): [string, readonly string[]] {
        const { errors } = ui;
        const file = "\u2068" + name + "\u2069";
        if (error instanceof TooLargeError) return [errors.notGedcom(file), [errors.tooLarge]];
        if (error instanceof ArchiveError) return [errors.archive, []];
        if (error instanceof EmptyFileError) return [errors.empty(file), [errors.hint]];
        if (error instanceof NoPersonsError) return [errors.noPersons(file), []];
        return [errors.notGedcom(file), [errors.hint]];
    }

    // In a worker, so that the page goes on; or here, in a browser that starts none.
    private async readAside(
        bytes: Uint8Array,
        name: string,
        photographs: Photographs,
        options: WorkerReadOptions,
    ): Promise<OpenedFile> {
        clearTimeout(this.warmUpTimer);
        // Two workers at once that compile the same code keep each other from it in WebKit.
        await this.warmingUp;
        try {
            const file = await this.engine.readGedcomIn(readingWorker(), bytes, name, options);
            const opened = this.checked(file, name, "", photographs);
            this.source = { bytes, name, encoding: "" };
            return opened;
        } catch (error) {
            if (error instanceof GedcomError || error instanceof NoPersonsError || options.signal?.aborted) throw error;
            return this.read(bytes, name, "", photographs);
        }
    }

    private read(bytes: Uint8Array, name: string, title: string, photographs: Photographs, encoding = ""): OpenedFile {
        const opened = this.checked(this.engine.readGedcom(bytes, name, { encoding }), name, title, photographs);
        this.source = { bytes, name, encoding };
        return opened;
    }

    private checked(file: GedcomFile, name: string, title: string, photographs: Photographs): OpenedFile {
        if (file.persons.length === 0) {
            file.close();
            throw new NoPersonsError();
        }
        return { file, name, photographs, title: title || name.replace(/\.(ged|gdz|gedcom|zip)$/i, "") };
    }
}

// Couples of two who follow each other, each with up to four children.
function madeUpGedcom(): string {
    const lines = ["0 HEAD", "1 CHAR UTF-8"];
    for (let i = 0; i < kMadeUp; ++i) {
        lines.push(`0 @I${i}@ INDI`, `1 NAME Given${i} /Surname${i}/`, `1 SEX ${i % 2 ? "M" : "F"}`);
        lines.push(
            "1 BIRT",
            `2 DATE ${1 + (i % 28)} MAY ${1400 + i}`,
            `2 PLAC Town ${i}`,
            "1 DEAT",
            `2 DATE ABT ${1450 + i}`,
        );
        lines.push(`1 FAMS @F${i >> 1}@`, `1 FAMC @F${i >> 2}@`);
    }
    for (let i = 0; i < kMadeUp / 2; ++i) {
        lines.push(`0 @F${i}@ FAM`, `1 HUSB @I${2 * i + 1}@`, `1 WIFE @I${2 * i}@`);
        for (let child = 4 * i; child < 4 * i + 4; ++child) lines.push(`1 CHIL @I${child}@`);
    }
    return lines.join("\n");
}

class EmptyFileError extends Error {}

// What was read is GEDCOM, with nobody in it.
class NoPersonsError extends Error {}
