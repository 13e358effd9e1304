// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The engine that lies in this page, and the family that may lie beside it.

import { type Diagnostic, loadOlvane, type Olvane } from "olvane";
import { learnOptions } from "../base/views";
import { bytesOfBase64, gunzip } from "./archive";
import { Photographs } from "./photographs";

// What olvane page puts in.
export interface EmbeddedFamily {
    readonly name: string;
    readonly title: string;
    /** The number of a person, from 1; 0 for the page's own choice. */
    readonly focus: number;
    /** What the page opens with, as addressOf writes it; empty for what is usual. */
    readonly address: string;
    readonly livingHidden: boolean;
    /** On the file that the family was read from; the text in the page is another. Null where nobody stored. */
    readonly remarks: readonly Diagnostic[] | null;
    /** Of the GEDCOM text; none where the page has a map alone. */
    readonly bytes: Uint8Array;
    readonly photographs: Photographs;
    /** Whether a map lies at the end of the page. */
    readonly hasMap: boolean;
}

export async function startEngine(): Promise<Olvane> {
    const engine = await loadOlvane(self.olvanePage.engine);
    learnOptions(engine.pictureOptions);
    return engine;
}

export async function embeddedFamily(): Promise<EmbeddedFamily | null> {
    const text = document.getElementById("olvane-family")?.textContent;
    if (!text) return null;
    const stored = JSON.parse(text) as Partial<
        Record<"name" | "title" | "focus" | "address" | "livingHidden" | "remarks" | "gzip" | "photos" | "map", unknown>
    >;
    return {
        name: String(stored.name ?? "family.ged"),
        title: String(stored.title ?? ""),
        focus: Number(stored.focus) || 0,
        address: String(stored.address ?? ""),
        livingHidden: stored.livingHidden === true,
        remarks: Array.isArray(stored.remarks) ? (stored.remarks as Diagnostic[]) : null,
        photographs: Photographs.embedded((stored.photos ?? {}) as Record<string, unknown>),
        bytes: stored.gzip ? await gunzip(bytesOfBase64(String(stored.gzip))) : new Uint8Array(),
        hasMap: stored.map === true,
    };
}

/** What is missing where a page ends before its map does. */
export class CutShortError extends Error {}

/** The bytes of the map at the page's end, which is read last. Throws CutShortError. */
export async function embeddedMap(): Promise<Uint8Array<ArrayBuffer>> {
    if (document.readyState === "loading")
        await new Promise((loaded) => document.addEventListener("DOMContentLoaded", loaded, { once: true }));
    const text = document.getElementById("olvane-map")?.textContent ?? "";
    try {
        return await gunzip(bytesOfBase64(text));
    } catch (error) {
        throw new CutShortError("map", { cause: error });
    }
}
