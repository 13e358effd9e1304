// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The engine with the WebAssembly inside: one file, which loads nothing from anywhere.

import { loadOlvane as loadFrom } from "../olvane.mjs";
import { unpackModule } from "./unpack.mjs";

export * from "../olvane.mjs";

export async function loadOlvane(module) {
    // The build puts the packed module here.
    return loadFrom(module ?? unpackModule(kPackedModule));
}
