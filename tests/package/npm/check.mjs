// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The packages for npm as programs use them: installed from their archives, built by each bundler, and opened in a
// real browser or run in Node.
//
//     node check.mjs --packages DIR [--quick] [--work DIR]
//
// DIR holds olvane-VERSION.tgz and olvane-tree-VERSION.tgz. --quick takes the system's Node and one bundler alone.

import assert from "node:assert/strict";
import { execFileSync, spawn } from "node:child_process";
import { cpSync, existsSync, mkdirSync, mkdtempSync, readdirSync, readFileSync, rmSync, writeFileSync } from "node:fs";
import { createServer } from "node:http";
import { createRequire } from "node:module";
import { arch, platform, tmpdir } from "node:os";
import { extname, join, resolve } from "node:path";
import { parseArgs } from "node:util";

const { values } = parseArgs({
    options: { packages: { type: "string" }, quick: { type: "boolean" }, work: { type: "string" } },
});
const work = values.work ? resolve(values.work) : mkdtempSync(join(tmpdir(), "olvane-npm-"));
mkdirSync(work, { recursive: true });
const archives = readdirSync(values.packages)
    .filter((name) => name.endsWith(".tgz"))
    .map((name) => resolve(values.packages, name));

// Programs of Node that npm itself has, beside the one that runs this.
const kNodes = values.quick ? [] : [18, 20];
const kTools = values.quick
    ? ["esbuild@0.28", "playwright-core@1.58"]
    : [
          "esbuild@0.28",
          "playwright-core@1.58",
          "vite@7",
          "react@19",
          "react-dom@19",
          "webpack@5",
          "webpack-cli@6",
          "rollup@4",
          "@rollup/plugin-node-resolve@16",
          ...kNodes.map((version) => `node${version}@npm:node-${platform()}-${arch()}@${version}`),
          "publint@0.3",
          "@arethetypeswrong/cli@0.18",
      ];

const kFamily =
    "0 HEAD\n1 GEDC\n2 VERS 5.5.1\n1 CHAR UTF-8\n0 @I1@ INDI\n1 NAME Ada /Berg/\n1 FAMC @F1@\n0 @I2@ INDI\n1 SEX M\n1 FAMS @F1@\n0 @I3@ INDI\n1 SEX F\n1 FAMS @F1@\n0 @F1@ FAM\n1 HUSB @I2@\n1 WIFE @I3@\n1 CHIL @I1@\n0 TRLR\n";
const kUse = `const olvane = await loadOlvane();
const file = olvane.readGedcom(new TextEncoder().encode(${JSON.stringify(kFamily)}), "family.ged");
const boxes = file.picture(1, { view: "ancestors" }).boxes.length;`;

function run(command, args, cwd = work) {
    return execFileSync(command, args, { cwd, encoding: "utf8", stdio: ["ignore", "pipe", "pipe"] });
}
function write(path, text) {
    mkdirSync(join(work, path, ".."), { recursive: true });
    writeFileSync(join(work, path), text);
}
const bin = (name) => join(work, "node_modules/.bin", name);

write("package.json", JSON.stringify({ private: true, type: "module" }));
run("npm", ["install", "--no-audit", "--no-fund", "--loglevel=error", ...archives, ...kTools]);

// A page that says in its title what it found: 3, the boxes of a child and its parents.
const kPage = (script) => `<!doctype html><meta charset="utf-8"><title>waiting</title>${script}`;
const kReport = `${kUse}\ndocument.title = String(boxes);`;
const kMain = (from) =>
    `import { loadOlvane } from "${from}";\n(async () => { ${kReport} })().catch((error) => (document.title = String(error)));\n`;
const kWorker = `import { loadOlvane } from "olvane";\nonmessage = async () => { try { ${kUse} postMessage(boxes); } catch (error) { postMessage(String(error)); } };\n`;
const kWorkerPage = `const worker = new Worker(new URL("./worker.js", import.meta.url), { type: "module" });\nworker.onmessage = ({ data }) => (document.title = String(data));\nworker.postMessage(0);\n`;

const kTypes = {
    ".html": "text/html",
    ".js": "text/javascript",
    ".mjs": "text/javascript",
    ".wasm": "application/wasm",
    ".ged": "text/plain",
};
// What docs/guide/web-page.md says that a policy needs.
const kStrictPolicy =
    "default-src 'none'; script-src 'self' 'wasm-unsafe-eval'; connect-src 'self'; img-src data: blob:";
const server = createServer((request, response) => {
    const path = join(work, decodeURIComponent(new URL(request.url, "http://localhost").pathname));
    if (!path.startsWith(work) || !existsSync(path)) return response.writeHead(404).end();
    const policy = path.includes("/strict/") ? { "content-security-policy": kStrictPolicy } : {};
    const type = { "content-type": kTypes[extname(path)] ?? "application/octet-stream" };
    response.writeHead(200, { ...type, ...policy }).end(readFileSync(path));
});
await new Promise((done) => server.listen(0, "127.0.0.1", done));
const address = `http://127.0.0.1:${server.address().port}`;
const { chromium } = createRequire(join(work, "package.json"))("playwright-core");
const browser = await chromium.launch({
    executablePath: process.env.OLVANE_CHROMIUM ?? "/usr/bin/chromium",
    args: ["--no-sandbox", "--disable-gpu"],
});

async function titleOf(url) {
    const page = await browser.newPage();
    try {
        await page.goto(url);
        await page.waitForFunction(() => document.title !== "waiting", undefined, { timeout: 20_000 });
        return await page.title();
    } finally {
        await page.close();
    }
}

// The packages in one program of Node, which is of that version where one is stated.
function nodeWays(name, node, version) {
    const prints = (file, program) => {
        write(file, program);
        if (version) assert.match(run(node, ["--version"]), new RegExp(`^v${version}\\.`));
        return run(node, [file]).trim();
    };
    const required = (from) =>
        `const { loadOlvane } = require("${from}");\n(async () => { ${kUse} console.log(boxes); })();`;
    return {
        [`${name}, import`]: () =>
            prints("node.mjs", `import { loadOlvane } from "olvane";\n${kUse}\nconsole.log(boxes);`),
        [`${name}, import of the inline one`]: () =>
            prints("inline.mjs", `import { loadOlvane } from "olvane/inline";\n${kUse}\nconsole.log(boxes);`),
        [`${name}, require`]: () => prints("node.cjs", required("olvane")),
        [`${name}, require of the inline one`]: () => prints("inline.cjs", required("olvane/inline")),
    };
}

const kWays = {
    "licences, and what is inside"() {
        const others = { olvane: ["boost", "unicode-data", "emscripten-runtime"], "olvane-tree": ["d3-zoom"] };
        for (const [name, parts] of Object.entries(others)) {
            const text = (file) => readFileSync(join(work, "node_modules", name, file), "utf8");
            assert.match(text("LICENSE"), /Permission is hereby granted/);
            const contents = JSON.parse(text("contents.spdx.json"));
            assert.equal(contents.spdxVersion, "SPDX-2.3");
            for (const part of [name, ...parts]) {
                const entry = contents.packages.find((entry) => entry.name === part);
                assert.ok(entry?.licenseDeclared, `${part} is not listed in ${name}`);
            }
            for (const part of parts)
                assert.ok(text("notices.txt").includes(`\n${part} `), `${name} has no notice of ${part}`);
        }
        assert.match(
            readFileSync(join(work, "node_modules/olvane-tree/notices.txt"), "utf8"),
            /Mike Bostock[^]*Permission to use/,
        );
        return "3";
    },
    ...nodeWays("node", "node"),
    ...Object.assign(
        {},
        ...kNodes.map((version) => nodeWays(`node ${version}`, bin(`../node${version}/bin/node`), version)),
    ),
    async esbuild() {
        write("esbuild/main.js", kMain("olvane/inline"));
        run(bin("esbuild"), [
            "esbuild/main.js",
            "--bundle",
            "--format=esm",
            "--outfile=esbuild/out.js",
            "--log-level=error",
        ]);
        write("esbuild/index.html", kPage('<script type="module" src="out.js"></script>'));
        return titleOf(`${address}/esbuild/index.html`);
    },
    async "plain module script"() {
        const map = '<script type="importmap">{"imports": {"olvane": "/node_modules/olvane/olvane.mjs"}}</script>';
        write("plain/index.html", kPage(`${map}<script type="module">${kMain("olvane")}</script>`));
        return titleOf(`${address}/plain/index.html`);
    },
    async "plain script (IIFE)"() {
        const use = `(async () => { const { loadOlvane } = olvane; { ${kUse.replace("const olvane =", "const engine =").replaceAll("olvane.readGedcom", "engine.readGedcom")} document.title = String(boxes); } })()`;
        write(
            "iife/index.html",
            kPage(`<script src="/node_modules/olvane/olvane.iife.js"></script><script>${use}</script>`),
        );
        return titleOf(`${address}/iife/index.html`);
    },
    async "a wrong response for the module is named"() {
        rmSync(join(work, "wrong"), { recursive: true, force: true }); // of an earlier run
        write("wrong/olvane.mjs", readFileSync(join(work, "node_modules/olvane/olvane.mjs"), "utf8"));
        write("wrong/index.html", kPage(`<script type="module">${kMain("./olvane.mjs")}</script>`));
        const missing = await titleOf(`${address}/wrong/index.html`);
        assert.match(missing, /wrong\/olvane\.wasm: 404/);
        write("wrong/olvane.wasm", "<!doctype html>");
        const wrong = await titleOf(`${address}/wrong/index.html`);
        assert.match(wrong, /wrong\/olvane\.wasm: .*no WebAssembly/);
        return "3";
    },
    async "the element, plain"() {
        write("element/family.ged", kFamily);
        write(
            "element/index.html",
            kPage(`<olvane-tree src="family.ged" view="ancestors" style="height: 400px"></olvane-tree>
<script type="module">import "/node_modules/olvane-tree/olvane-tree.mjs";
document.querySelector("olvane-tree").addEventListener("focuschange", ({ detail }) => (document.title = String(detail.boxes)));</script>`),
        );
        return titleOf(`${address}/element/index.html`);
    },
    async "a page of own data, under a strict policy"() {
        for (const name of ["own_tree.html", "own_tree.mjs"]) {
            write(
                `strict/${name}`,
                readFileSync(new URL(`../../../examples/javascript/${name}`, import.meta.url), "utf8"),
            );
        }
        write("strict/olvane-tree.mjs", readFileSync(join(work, "node_modules/olvane-tree/olvane-tree.mjs"), "utf8"));
        const page = await browser.newPage();
        try {
            // The guide's own policy; the height is set without the attribute that the policy refuses.
            await page.addInitScript(() => {
                globalThis.refused = [];
                addEventListener("securitypolicyviolation", (event) =>
                    globalThis.refused.push(event.violatedDirective),
                );
            });
            await page.goto(`${address}/strict/own_tree.html`);
            await page.waitForFunction(() => document.querySelector("olvane-tree").state?.focus, undefined, {
                timeout: 20_000,
            });
            const svg = await page.evaluate(() => document.querySelector("olvane-tree").saveSvg());
            for (const name of ["Henry", "Anne", "Elizabeth", "Edmund", "Margaret"])
                assert.ok(svg.includes(name), `${name} is not drawn`);
            await page.click("#add");
            await page.waitForFunction(() => document.querySelector("olvane-tree").saveSvg().includes("Clara"));
            assert.deepEqual(await page.evaluate(() => globalThis.refused), ["style-src-attr"]);
        } finally {
            await page.close();
        }
        return "3";
    },
    async "a page of a spreadsheet, in twenty lines"() {
        const example = (name) =>
            readFileSync(new URL(`../../../examples/javascript/${name}`, import.meta.url), "utf8");
        const files = { html: example("csv_tree.html"), mjs: example("csv_tree.mjs") };
        const lines = Object.values(files).join("\n").split("\n");
        const written = lines.filter((line) => line.trim() && !/^(\/\/|<!--)/.test(line.trim()));
        assert.ok(written.length <= 20, `${written.length} lines`);
        for (const [ending, text] of Object.entries(files)) write(`strict/csv_tree.${ending}`, text);
        write("strict/persons.csv", example("persons.csv"));
        write("strict/olvane-tree.mjs", readFileSync(join(work, "node_modules/olvane-tree/olvane-tree.mjs"), "utf8"));
        const page = await browser.newPage();
        try {
            await page.goto(`${address}/strict/csv_tree.html`);
            await page.waitForFunction(() => document.querySelector("olvane-tree").state?.focus, undefined, {
                timeout: 20_000,
            });
            const svg = await page.evaluate(() => document.querySelector("olvane-tree").saveSvg());
            for (const name of ["Henry", "Anne", "Elizabeth", "Edmund", "Margaret", "Robin"])
                assert.ok(svg.includes(name), `${name} is not drawn`);
            assert.ok(svg.includes("1850"), "the years are not drawn");
        } finally {
            await page.close();
        }
        return "3";
    },
    ...(values.quick
        ? {}
        : {
              async rollup() {
                  write("rollup/main.js", kMain("olvane/inline"));
                  run(bin("rollup"), [
                      "rollup/main.js",
                      "-p",
                      "@rollup/plugin-node-resolve",
                      "-f",
                      "es",
                      "-o",
                      "rollup/out.js",
                      "--silent",
                  ]);
                  write("rollup/index.html", kPage('<script type="module" src="out.js"></script>'));
                  return titleOf(`${address}/rollup/index.html`);
              },
              async "webpack, without warnings"() {
                  write("webpack/main.js", kMain("olvane"));
                  write(
                      "webpack/webpack.config.cjs",
                      `module.exports = { mode: "production", entry: ${JSON.stringify(join(work, "webpack/main.js"))}, output: { path: ${JSON.stringify(join(work, "webpack/out"))}, filename: "main.js", publicPath: "auto" } };`,
                  );
                  const said = run(bin("webpack"), [
                      "--config",
                      "webpack/webpack.config.cjs",
                      "--no-color",
                      "--stats",
                      "errors-warnings",
                  ]);
                  // The size of the module is what it is; webpack has a hint for all that is larger than 244 KiB.
                  const warnings = said.match(/WARNING in .*/g) ?? [];
                  assert.deepEqual(
                      warnings.filter(
                          (warning) =>
                              !/WARNING in (asset size limit|entrypoint size limit|webpack performance)/.test(warning),
                      ),
                      [],
                  );
                  write("webpack/index.html", kPage('<script src="out/main.js"></script>'));
                  return titleOf(`${address}/webpack/index.html`);
              },
              async "vite build, with a worker"() {
                  write("vite/worker.js", kWorker);
                  write("vite/main.js", kWorkerPage);
                  write("vite/index.html", kPage('<script type="module" src="./main.js"></script>'));
                  write(
                      "vite/vite.config.js",
                      'export default { base: "./", worker: { format: "es" }, build: { outDir: "out" }, optimizeDeps: { exclude: ["olvane"] } };',
                  );
                  run(bin("vite"), ["build", "--logLevel", "error"], join(work, "vite"));
                  return titleOf(`${address}/vite/out/index.html`);
              },
              async "the example in React, built by vite"() {
                  cpSync(new URL("../../../examples/javascript/react", import.meta.url), join(work, "react"), {
                      recursive: true,
                  });
                  run(bin("vite"), ["build", "--logLevel", "error"], join(work, "react"));
                  const page = await browser.newPage();
                  try {
                      await page.goto(`${address}/react/dist/index.html`);
                      await page.locator('olvane-tree [data-xref="3"]').first().click();
                      await page.fill("input", "Ida Renamed");
                      await page.click("text=Rename");
                      await page.waitForFunction(() => /Renamed/.test(document.querySelector("olvane-tree").saveSvg()));
                      await page.selectOption("select", "descendants");
                      return await page.evaluate(() => {
                          const { state, viewer } = document.querySelector("olvane-tree");
                          return state.view === "descendants" ? String(viewer.picture.boxes.length) : state.view;
                      });
                  } finally {
                      await page.close();
                  }
              },
              async "vite dev, with a worker"() {
                  const port = 5300 + Math.floor(Math.random() * 500);
                  const dev = spawn(bin("vite"), ["--port", String(port), "--strictPort", "--logLevel", "error"], {
                      cwd: join(work, "vite"),
                      stdio: "ignore",
                  });
                  try {
                      for (let tries = 0; tries < 100; ++tries) {
                          if (
                              await fetch(`http://localhost:${port}/`).then(
                                  () => true,
                                  () => false,
                              )
                          )
                              break;
                          await new Promise((next) => setTimeout(next, 100));
                      }
                      return await titleOf(`http://localhost:${port}/`);
                  } finally {
                      dev.kill();
                  }
              },
              "publint and the types"() {
                  for (const archive of archives) {
                      run(bin("publint"), [archive, "--strict"]);
                      run(bin("attw"), [archive, "--exclude-entrypoints", "olvane.wasm", "custom-elements.json"]);
                  }
                  return "3";
              },
          }),
};

let passed = 0;
let failed = 0;
for (const [way, take] of Object.entries(kWays)) {
    let found = "";
    try {
        found = await take();
    } catch (error) {
        found = [error.message, error.stdout, error.stderr].filter(Boolean).join("\n");
    }
    if (found === "3") ++passed;
    else ++failed;
    console.log(found === "3" ? `ok      ${way}` : `NOT OK  ${way}: ${found}`);
}
await browser.close();
server.close();
if (!values.work) rmSync(work, { recursive: true, force: true });
console.log(`${passed} passed, ${failed} failed`);
process.exitCode = failed > 0 ? 1 : 0;
