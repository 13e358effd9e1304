// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Bundles each test beside this file and runs them all with node's own runner: node test/run.mjs
// OLVANE_RESULTS may name a file for the results, as the reporter "junit" has them; OLVANE_JAVASCRIPT the folder of the
// JavaScript binding where it is not that of these sources.

import { spawnSync } from "node:child_process";
import { mkdtempSync, readdirSync, rmSync } from "node:fs";
import { tmpdir } from "node:os";
import { dirname, join } from "node:path";
import { fileURLToPath } from "node:url";
import { build } from "esbuild";

const here = dirname(fileURLToPath(import.meta.url));
const binding = process.env.OLVANE_JAVASCRIPT ?? join(here, "../../../bindings/javascript");
const tests = readdirSync(here).filter((name) => name.endsWith(".test.ts"));
const folder = mkdtempSync(join(tmpdir(), "olvane-page-test-"));
try {
    await build({
        entryPoints: tests.map((name) => join(here, name)),
        outdir: folder,
        outExtension: { ".js": ".mjs" },
        bundle: true,
        format: "esm",
        platform: "node",
        alias: { olvane: join(binding, "olvane.mjs") },
        sourcemap: "inline",
        logLevel: "warning",
    });
    const files = tests.map((name) => join(folder, name.replace(/\.ts$/, ".mjs")));
    const reporters = ["--test-reporter=spec", "--test-reporter-destination=stdout"];
    const results = process.env.OLVANE_RESULTS;
    if (results) reporters.push("--test-reporter=junit", `--test-reporter-destination=${results}`);
    const run = spawnSync(process.execPath, ["--enable-source-maps", "--test", ...reporters, ...files], {
        stdio: "inherit",
    });
    process.exitCode = run.status ?? 1;
} finally {
    rmSync(folder, { recursive: true, force: true });
}
