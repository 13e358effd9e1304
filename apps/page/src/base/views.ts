// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The names of views and of the groups of relatives that can be switched off.

export type ViewName = "family" | "pedigree";

// In the order of the switches. A bit is the engine's own.
export const kRelatives = {
    siblings: 0x04,
    siblingSpouses: 0x08,
    niecesNephews: 0x10,
    auntsUncles: 0x01,
    cousins: 0x02,
    greatGrandparents: 0x40,
    spousesOfChildren: 0x80,
    grandchildren: 0x20,
} as const;

export type RelativeName = keyof typeof kRelatives;
export const kRelativeNames = Object.keys(kRelatives) as RelativeName[];
