// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The engine that lies in this page, and the family that may lie beside it.

import { type Diagnostic, loadOlvane, type Olvane } from "olvane";
import { bytesOfBase64, gunzip } from "./archive";

// What olvane page puts in.
export interface EmbeddedFamily {
    readonly name: string;
    readonly title: string;
    /** The number of a person, from 1; 0 for the page's own choice. */
    readonly focus: number;
    readonly view: string;
    readonly livingHidden: boolean;
    /** On the file that the family was read from; the text in the page is another. Null where nobody told. */
    readonly remarks: readonly Diagnostic[] | null;
    readonly bytes: Uint8Array;
}

export async function startEngine(): Promise<Olvane> {
    const packed = document.getElementById("olvane-engine")?.textContent ?? "";
    return loadOlvane(await gunzip(bytesOfBase64(packed)));
}

export async function embeddedFamily(): Promise<EmbeddedFamily | null> {
    const text = document.getElementById("olvane-family")?.textContent;
    if (!text) return null;
    const told = JSON.parse(text) as Partial<
        Record<"name" | "title" | "focus" | "view" | "livingHidden" | "remarks" | "gzip", unknown>
    >;
    return {
        name: String(told.name ?? "family.ged"),
        title: String(told.title ?? ""),
        focus: Number(told.focus) || 0,
        view: String(told.view ?? ""),
        livingHidden: told.livingHidden === true,
        remarks: Array.isArray(told.remarks) ? (told.remarks as Diagnostic[]) : null,
        bytes: await gunzip(bytesOfBase64(String(told.gzip ?? ""))),
    };
}
