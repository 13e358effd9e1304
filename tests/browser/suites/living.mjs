// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A page written with the living hidden holds nothing of them, in any form.

import assert from "node:assert/strict";
import { execFileSync } from "node:child_process";
import { readFileSync } from "node:fs";
import { describe } from "node:test";
import { gunzipSync } from "node:zlib";
import { fileFor, photograph, visitFile } from "../support/browser.mjs";
import { livingFamily } from "../support/families.mjs";
import { test } from "../support/reported.mjs";

const kSecrets = /Zacharias|Geheimrat|Yolanda|Versteckt|Verborgen|Heimlichtuer|Niemandshausen|13 MAY|14 JUN|15 JUL/i;
// Such numbers may stand in the page's own code; in what is stated of the family they are theirs.
const kYears = /1999|2001|2021/;
const command = process.env.OLVANE_COMMAND;

describe("living", { skip: command ? false : "no olvane command was given" }, () => {
    const written = (...options) => {
        const page = fileFor("living.html", "");
        execFileSync(command, ["page", fileFor("living.ged", livingFamily()), "-o", page, ...options]);
        return page;
    };
    const unpacked = (text) =>
        (text.match(/H4sI[A-Za-z0-9+/=]+/g) ?? []).map((base64) =>
            gunzipSync(Buffer.from(base64, "base64")).toString("latin1"),
        );
    const familyIn = (page) => {
        const block = /<script type="application\/json" id="olvane-family">([^]*?)<\/script>/.exec(
            readFileSync(page, "utf8"),
        )[1];
        const { gzip, ...stated } = JSON.parse(block);
        return JSON.stringify(stated) + unpacked(gzip)[0];
    };

    test("without the option they are there, so that their absence means something", () => {
        assert.match(familyIn(written()), kSecrets);
        assert.match(familyIn(written()), kYears);
    });

    test("with it, neither the file nor the page shows a name, date or place of theirs", async () => {
        const page = written("--hide-living");
        const text = readFileSync(page, "utf8");
        for (const content of [text, ...unpacked(text)]) assert.equal(kSecrets.exec(content)?.[0], undefined);
        assert.doesNotMatch(familyIn(page), kYears);
        const visit = await visitFile(page);
        await visit.untilFamily();
        assert.equal((await visit.shown()).length, 4);
        assert.match(await visit.label("I1"), /Gottfried Altmann/);
        const markup = await visit.page.content();
        const shown = markup.replace(/<script[^]*?<\/script>|<style[^]*?<\/style>/g, "");
        assert.ok(!kSecrets.test(shown) && !/2021/.test(shown));
        await photograph(visit, "living");
        await visit.end();
    });
});
