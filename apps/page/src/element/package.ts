// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What a site imports: the element, known to the browser at once, with the engine inside. The engine is unpacked
// when the first viewer asks for it.

import { loadOlvane, type Olvane } from "olvane";
import { unpackModule } from "olvane-unpack";
import { learnOptions } from "../base/views";
import { defineOlvaneTree, OlvaneTree } from "./OlvaneTree";

/** Put in by the build: the module, packed and written as letters. */
declare const kPackedModule: string;

let engine: Promise<Olvane> | null = null;

/** The engine that all viewers of the page share. */
export function sharedEngine(): Promise<Olvane> {
    engine ??= started();
    return engine;
}

async function started(): Promise<Olvane> {
    const loaded = await loadOlvane(unpackModule(await Promise.resolve(kPackedModule)));
    learnOptions(loaded.pictureOptions);
    return loaded;
}

OlvaneTree.engine = sharedEngine;
defineOlvaneTree();

export { OlvaneTree };
export type { OlvaneTreeEvents } from "./treeTypes";
