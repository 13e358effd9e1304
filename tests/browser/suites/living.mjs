// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A page written with the living hidden holds nothing of them, in any form.

import assert from "node:assert/strict";
import { execFileSync } from "node:child_process";
import { readFileSync } from "node:fs";
import { describe, test } from "node:test";
import { gunzipSync } from "node:zlib";
import { fileFor, photograph, visitFile } from "../support/browser.mjs";
import { livingFamily } from "../support/families.mjs";

const kSecrets = /Zacharias|Geheimrat|Yolanda|Versteckt|Verborgen|Heimlichtuer|Niemandshausen|1999|2001|2021|13 MAY|14 JUN|15 JUL/i;
const command = process.env.OLVANE_COMMAND;

describe("living", { skip: command ? false : "no olvane command was given" }, () => {
    const written = (...options) => {
        const page = fileFor("living.html", "");
        execFileSync(command, ["page", fileFor("living.ged", livingFamily()), "-o", page, ...options]);
        return page;
    };
    // The page as it is, and everything in it that is packed.
    const contents = (page) => {
        const text = readFileSync(page, "utf8");
        const packed = text.match(/H4sI[A-Za-z0-9+/=]+/g) ?? [];
        return [text, ...packed.map((base64) => gunzipSync(Buffer.from(base64, "base64")).toString("latin1"))];
    };

    test("without the option they are there, so that their absence means something", () => {
        assert.ok(contents(written()).some((content) => kSecrets.test(content)));
    });

    test("with it, neither the file nor the page shows a name, date or place of theirs", async () => {
        const page = written("--hide-living");
        for (const content of contents(page)) assert.equal(kSecrets.exec(content)?.[0], undefined);
        const visit = await visitFile(page);
        await visit.untilFamily();
        assert.equal((await visit.shown()).length, 4);
        assert.match(await visit.label("I1"), /Gottfried Altmann/);
        const markup = await visit.page.content();
        assert.ok(!kSecrets.test(markup.replace(/<script[^]*?<\/script>/g, "")));
        await photograph(visit, "living");
        await visit.end();
    });
});
