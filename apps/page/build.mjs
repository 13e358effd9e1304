// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Builds the page: one HTML file that holds its code, its looks and the engine, and may load nothing else.
//
//     node build.mjs --wasm olvane.wasm --out page.html [--element olvane-tree.mjs]
//
// With --element, the viewer alone is built as well, as one module for other sites.

import { createHash } from "node:crypto";
import { readFile, writeFile } from "node:fs/promises";
import { fileURLToPath } from "node:url";
import { parseArgs } from "node:util";
import { gzipSync } from "node:zlib";
import { build, transform } from "esbuild";

const here = (path) => fileURLToPath(new URL(path, import.meta.url));

const { values } = parseArgs({
    options: { wasm: { type: "string" }, out: { type: "string" }, element: { type: "string" } },
});
if (!values.wasm || !values.out) throw new Error("usage: node build.mjs --wasm OLVANE.WASM --out PAGE.HTML");

const kBinding = process.env.OLVANE_JAVASCRIPT ?? here("../../bindings/javascript");
const { lettersOf, packedLzma, packedModule } = await import(`${kBinding}/package/packing.mjs`);
const { splitModule } = await import(`${kBinding}/package/moduleStreams.mjs`);

// One script with all that it imports. settings are esbuild's.
async function bundled(entry, settings) {
    const { outputFiles } = await build({
        entryPoints: [here(entry)],
        bundle: true,
        minify: true,
        write: false,
        target: ["es2022"],
        charset: "utf8",
        legalComments: "none",
        // The viewer's style sheets are text in the script; those of the page around it stand in its head.
        plugins: [styleText],
        ...settings,
        // The engine lies in the script's own file, not beside it.
        define: { "import.meta.url": '"data:,"', ...settings.define },
        alias: {
            olvane: `${kBinding}/olvane.mjs`,
            "olvane-unpack": `${kBinding}/package/unpack.mjs`,
            // The page moves things by itself, so most of what zooming could do beside that stays out.
            "d3-transition": here("src/scene/noTransition.ts"),
            "d3-interpolate": here("src/scene/noInterpolation.ts"),
        },
    });
    return outputFiles[0].text.trim();
}

// What would end the element early may stand in a script only as an escape.
async function bundledScript(entry) {
    const plugins = [styleText, withoutTables];
    const script = await bundled(entry, { format: "iife", define: { kReadingScript }, plugins });
    return script.replaceAll("</script", "<\\/script");
}

async function writeElement(path, engine) {
    const banner = "// SPDX-FileCopyrightText: The Olvane developers\n// SPDX-License-Identifier: MIT\n";
    const script = await bundled("src/element/package.ts", {
        format: "esm",
        define: { kPackedModule: JSON.stringify(packedModule(engine)), kReadingScript },
    });
    await writeFile(path, banner + script + "\n");
    const packed = gzipSync(script, { level: 9 }).length;
    console.log(`${path}: ${script.length} characters, ${packed} bytes packed`);
}

async function minifiedStyle(...paths) {
    const texts = await Promise.all(paths.map((path) => readFile(path, "utf8")));
    const { code } = await transform(texts.join("\n"), { loader: "css", minify: true });
    return code.trim();
}

const styleText = {
    name: "style-text",
    setup(bundle) {
        bundle.onLoad({ filter: /\.css$/ }, async ({ path }) => ({
            contents: await minifiedStyle(path),
            loader: "text",
        }));
    },
};

// Families of a program's own are for sites; the page reads files.
const withoutTables = {
    name: "without-tables",
    setup(bundle) {
        bundle.onResolve({ filter: /^\.\/family\.mjs$/ }, () => ({ path: here("src/engine/noFamily.ts") }));
    },
};

const kPageStyles = ["colours", "controls", "shell", "map"].map((name) => here(`src/styles/${name}.css`));

const hashOf = (text) => "'sha256-" + createHash("sha256").update(text).digest("base64") + "'";

// No network at all: what is not listed is refused.
function policyOf(start, script, style) {
    return [
        "default-src 'none'",
        `script-src ${hashOf(start)} ${hashOf(script)} 'wasm-unsafe-eval'`,
        `style-src ${hashOf(style)}`,
        "img-src data: blob:",
        // Large files are read in a worker, and maps are laid out in one.
        "worker-src blob:",
        "connect-src 'none'",
        "base-uri 'none'",
        "form-action 'none'",
    ].join("; ");
}

// The worker's script is a text in the page's.
const kReadingScript = JSON.stringify(await bundled(`${kBinding}/readingWorker.mjs`, { format: "iife" }));

const [start, script, style] = await Promise.all([
    bundledScript("src/start.ts"),
    bundledScript("src/main.ts"),
    minifiedStyle(...kPageStyles),
]);
const engine = await readFile(values.wasm);
// All in one, since what is packed together is packed better.
const whole = [style, script, splitModule(engine)].map((part) => Buffer.from(part));
const parts = {
    policy: policyOf(start, script, style),
    styleSize: whole[0].length,
    scriptSize: whole[1].length,
    parts: lettersOf(packedLzma(Buffer.concat(whole))),
    start,
};
// Whose work is inside, for readers of the page's source. Two hyphens would be odd in a comment.
parts.notices = (await readFile(here("notices.txt"), "utf8")).trimEnd().replace(/-{2,}/g, "==");
const template = await readFile(here("src/page.html"), "utf8");
const page = template.replace(/\{\{(\w+)\}\}/g, (_, name) => parts[name]);
await writeFile(values.out, page);
console.log(
    `${values.out}: ${page.length} characters (packed ${parts.parts.length}: style ${whole[0].length}, ` +
        `script ${whole[1].length}, engine ${engine.length} bytes)`,
);
if (values.element) await writeElement(values.element, engine);
