// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Makes the packages for npm, ready to install without a compiler:
//
//     node pack.mjs --wasm olvane.wasm --element olvane-tree.mjs --version 1.2.3 --out DIR
//
// DIR/olvane is the engine with reader, families, pictures and charts, as modules for import and for require, with
// the WebAssembly beside them or inside them; DIR/olvane-tree is the viewer element. esbuild must be found from DIR
// or from where this is run.

import { execFileSync } from "node:child_process";
import { copyFile, mkdir, readFile, writeFile } from "node:fs/promises";
import { createRequire } from "node:module";
import { dirname, join, resolve } from "node:path";
import { fileURLToPath } from "node:url";
import { parseArgs } from "node:util";
import { packedModule } from "./packing.mjs";

const here = (path) => fileURLToPath(new URL(path, import.meta.url));
const text = { type: "string" };
const { values } = parseArgs({ options: { wasm: text, element: text, version: text, out: text } });
for (const name of ["wasm", "element", "version", "out"]) {
    if (!values[name]) throw new Error(`--${name} is missing; see the head of this file`);
}
const { build } = createRequire(join(process.cwd(), "package.json"))("esbuild");

const kBanner = "// SPDX-FileCopyrightText: The Olvane developers\n// SPDX-License-Identifier: MIT\n";
// What a module for require has instead of import.meta.
const kUrlOfFile =
    'const olvaneUrl = typeof document === "undefined" ? require("node:url").pathToFileURL(__filename).href : document.baseURI;';

async function bundle(entry, file, { format, define = {}, banner = "", globalName }) {
    await build({
        // The bundler writes where each part came from; that depends on no folder of this machine.
        absWorkingDir: dirname(resolve(entry)),
        entryPoints: [resolve(entry)],
        outfile: resolve(file),
        bundle: true,
        format,
        globalName,
        platform: format === "cjs" ? "node" : "neutral",
        external: ["node:*"],
        target: ["es2022"],
        charset: "utf8",
        legalComments: "none",
        logLevel: "warning",
        banner: { js: kBanner + banner },
        define,
    });
}

const kPackedModule = JSON.stringify(packedModule(await readFile(values.wasm)));

async function writePackage(folder, content) {
    await writeFile(join(folder, "package.json"), JSON.stringify(content, null, 4) + "\n");
    await copyFile(here("../../../LICENSE"), join(folder, "LICENSE"));
}

// The licences of what is inside.
function writeContents(folder, name, parts) {
    execFileSync(here("../../../scripts/write-contents"), [
        join(folder, "contents.spdx.json"),
        name,
        values.version,
        ...parts,
    ]);
}

const kEngineParts = ["boost", "unicode-data", "emscripten-runtime"];

function entries(name) {
    return {
        import: { types: `./${name}.d.mts`, default: `./${name}.mjs` },
        require: { types: `./${name}.d.cts`, default: `./${name}.cjs` },
    };
}

async function packEngine() {
    const folder = join(values.out, "olvane");
    await mkdir(folder, { recursive: true });
    const types = await readFile(here("../olvane.d.mts"), "utf8");
    for (const [name, entry] of [
        ["olvane", here("../olvane.mjs")],
        ["inline", here("inline.mjs")],
    ]) {
        const define = name === "inline" ? { kPackedModule, "import.meta.url": '"data:,"' } : {};
        await bundle(entry, join(folder, `${name}.mjs`), { format: "esm", define });
        const forRequire = name === "inline" ? {} : { "import.meta.url": "olvaneUrl" };
        await bundle(entry, join(folder, `${name}.cjs`), {
            format: "cjs",
            define: { ...define, ...forRequire },
            banner: name === "inline" ? "" : kUrlOfFile,
        });
        for (const ending of ["d.mts", "d.cts"]) await writeFile(join(folder, `${name}.${ending}`), types);
    }
    await bundle(here("inline.mjs"), join(folder, "olvane.iife.js"), {
        format: "iife",
        globalName: "olvane",
        define: { kPackedModule, "import.meta.url": '"data:,"' },
    });
    // For what does not read "exports".
    await mkdir(join(folder, "inline"), { recursive: true });
    const stub = { main: "../inline.cjs", module: "../inline.mjs", types: "../inline.d.cts" };
    await writeFile(join(folder, "inline/package.json"), JSON.stringify(stub) + "\n");
    await copyFile(values.wasm, join(folder, "olvane.wasm"));
    await copyFile(here("README.olvane.md"), join(folder, "README.md"));
    writeContents(folder, "olvane", kEngineParts);
    await writePackage(folder, {
        name: "olvane",
        version: values.version,
        description: "Family trees: layouts, charts, kinship and GEDCOM, as WebAssembly",
        keywords: ["family tree", "genealogy", "gedcom", "layout", "chart"],
        license: "MIT",
        type: "module",
        main: "./olvane.cjs",
        module: "./olvane.mjs",
        types: "./olvane.d.cts",
        unpkg: "./olvane.iife.js",
        sideEffects: false,
        exports: {
            ".": entries("olvane"),
            "./inline": entries("inline"),
            "./olvane.wasm": "./olvane.wasm",
            "./package.json": "./package.json",
        },
        files: [
            "*.mjs",
            "*.cjs",
            "*.js",
            "*.d.mts",
            "*.d.cts",
            "inline",
            "olvane.wasm",
            "contents.spdx.json",
            "notices.txt",
        ],
        engines: { node: ">=18" },
    });
}

async function packElement() {
    const folder = join(values.out, "olvane-tree");
    await mkdir(folder, { recursive: true });
    await copyFile(values.element, join(folder, "olvane-tree.mjs"));
    await bundle(values.element, join(folder, "olvane-tree.cjs"), { format: "cjs" });
    const types = await readFile(here("olvane-tree.d.mts"), "utf8");
    await writeFile(join(folder, "olvane-tree.d.mts"), types);
    await writeFile(join(folder, "olvane-tree.d.cts"), types.replace("./olvane.mjs", "./olvane.cjs"));
    for (const ending of ["d.mts", "d.cts"]) await copyFile(here("../olvane.d.mts"), join(folder, `olvane.${ending}`));
    await copyFile(here("../../../apps/page/src/element/custom-elements.json"), join(folder, "custom-elements.json"));
    await copyFile(here("README.olvane-tree.md"), join(folder, "README.md"));
    await bundle(values.element, join(folder, "olvane-tree.iife.js"), { format: "iife", globalName: "olvaneTree" });
    writeContents(folder, "olvane-tree", [
        "olvane",
        ...kEngineParts,
        "d3-selection",
        "d3-zoom",
        "d3-drag",
        "d3-dispatch",
    ]);
    await writePackage(folder, {
        name: "olvane-tree",
        version: values.version,
        description: "A family tree to explore, as a custom element",
        keywords: ["family tree", "genealogy", "gedcom", "web component", "custom element"],
        license: "MIT",
        type: "module",
        main: "./olvane-tree.cjs",
        module: "./olvane-tree.mjs",
        types: "./olvane-tree.d.cts",
        unpkg: "./olvane-tree.iife.js",
        // Importing it defines the element.
        sideEffects: true,
        customElements: "./custom-elements.json",
        exports: {
            ".": entries("olvane-tree"),
            "./custom-elements.json": "./custom-elements.json",
            "./package.json": "./package.json",
        },
        files: [
            "*.mjs",
            "*.cjs",
            "*.js",
            "*.d.mts",
            "*.d.cts",
            "custom-elements.json",
            "contents.spdx.json",
            "notices.txt",
        ],
    });
}

await packEngine();
await packElement();
