// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Prints a line for each test that the given files hold, from their text alone: node list-tests.mjs FILE...
//
//     SUITE <tab> TITLE <tab> prefix or whole
//
// Of a title that is made while the tests run, what stands before its first part counts: prefix.

import { readFileSync } from "node:fs";
import { basename } from "node:path";

const kBeginning = /^( *)(describe|test)\((["`])(.*?)(?<!\\)\3,/;

for (const file of process.argv.slice(2)) {
    let suite = basename(file).replace(/\.(test\.ts|mjs)$/, "");
    const text = readFileSync(file, "utf8").replace(/\b(describe|test)\(\s+/g, "$1(");
    for (const line of text.split("\n")) {
        const found = kBeginning.exec(line);
        if (!found) continue;
        const [, indent, kind, quote, written] = found;
        const title = written.replaceAll(`\\${quote}`, quote);
        if (kind === "describe") suite = title;
        const at = quote === "`" ? title.indexOf("${") : -1;
        const name = kind === "test" && indent === "" ? basename(file).replace(/\.(test\.ts|mjs)$/, "") : suite;
        if (kind === "test")
            console.log(`${name}\t${at < 0 ? title : title.slice(0, at)}\t${at < 0 ? "whole" : "prefix"}`);
    }
}
