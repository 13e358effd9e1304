// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Starts the engine, then the page, then the family that came with it.

import { html } from "./base/dom";
import { defineOlvaneTree, OlvaneTree } from "./element/OlvaneTree";
import { embeddedFamily, embeddedMap, startEngine } from "./engine/engine";
import { isWorker, serveMap } from "./engine/mapWorker";
import { uiMessagesFor } from "./messages/ui";
import { App } from "./shell/App";
import { holdDrops } from "./shell/dropping";

async function start(): Promise<void> {
    const root = document.getElementById("app")!;
    const dropped = holdDrops();
    const { errors } = uiMessagesFor(navigator.language);
    try {
        defineOlvaneTree();
        const [engine, family] = await Promise.all([startEngine(), embeddedFamily()]);
        OlvaneTree.engine = () => Promise.resolve(engine);
        const app = new App(root, engine);
        const files = dropped();
        if (files.length > 0) await app.opening.openDropped(files);
        else if (family?.hasMap) await app.opening.openMap(family, embeddedMap());
        else if (family) app.opening.openEmbedded(family);
        else await app.opening.openKept();
    } catch (error) {
        const reason = typeof DecompressionStream === "undefined" ? errors.tooNew : errors.engine;
        const detail = error instanceof Error ? error.message : String(error);
        root.replaceChildren(html("p", { class: "fatal", role: "alert" }, reason, html("small", {}, detail)));
    }
}

if (isWorker) serveMap();
else void start();
