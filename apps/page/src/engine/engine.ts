// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The engine that lies in this page, and the family that may lie beside it.

import { loadOlvane, type Olvane } from "olvane";
import { bytesOfBase64, gunzip } from "./archive";

// What olvane page puts in.
export interface EmbeddedFamily {
    readonly name: string;
    readonly title: string;
    readonly focus: string;
    readonly view: string;
    readonly livingHidden: boolean;
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
        Record<"name" | "title" | "focus" | "view" | "gzip", unknown>
    > & { livingHidden?: unknown };
    return {
        name: String(told.name ?? "family.ged"),
        title: String(told.title ?? ""),
        focus: String(told.focus ?? ""),
        view: String(told.view ?? ""),
        livingHidden: told.livingHidden === true,
        bytes: await gunzip(bytesOfBase64(String(told.gzip ?? ""))),
    };
}
