// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

import assert from "node:assert/strict";
import { execFileSync, spawnSync } from "node:child_process";
import { deflateRawSync } from "node:zlib";
import { describe } from "node:test";
import { pathToFileURL } from "node:url";
import {
    fileFor,
    kTwoAtOnce,
    newContext,
    photograph,
    sample,
    visitDarwins,
    visitEmpty,
    visitFamily,
    visitFile,
} from "../support/browser.mjs";
import { brokenFamily, gedcom, hugeHousehold } from "../support/families.mjs";
import { test } from "../support/reported.mjs";
import { Visit } from "../support/Visit.mjs";

const kDarwins = sample("darwin-wedgwood.ged");
const command = process.env.OLVANE_COMMAND;

describe("opening", kTwoAtOnce, () => {
    test("without a family the page invites one in", async () => {
        const visit = await visitEmpty();
        assert.ok(await visit.page.isVisible("#drop-zone h1"));
        const chosen = visit.page.waitForEvent("filechooser");
        await visit.page.click("#choose-file");
        await (await chosen).setFiles({ name: "darwin-wedgwood.ged", mimeType: "", buffer: kDarwins });
        await visit.untilFamily();
        assert.match(await visit.page.locator(".bar .title").innerText(), /darwin-wedgwood\s+142 persons/);
        await visit.end();
    });

    test("a dropped file opens, and another one takes its place", async () => {
        const visit = await visitEmpty();
        await photograph(visit, "title");
        await visit.drop("darwin-wedgwood.ged", kDarwins);
        await visit.untilFamily();
        assert.ok((await visit.shown()).length > 20);
        await visit.drop("small.ged", "0 HEAD\n1 GEDC\n2 VERS 5.5.1\n0 @A@ INDI\n1 NAME Ada /Only/\n0 TRLR\n");
        await visit.page.waitForSelector('#tree [data-xref="A"]');
        await visit.still();
        assert.deepEqual(await visit.shown(), ["A"]);
        assert.equal(await visit.page.title(), "small");
        await visit.end();
    });

    test("a file that is dropped while the page is starting opens as soon as it has", async () => {
        const context = await newContext();
        // The engine waits for a word to go on.
        await context.addInitScript(() => {
            const compile = WebAssembly.compile.bind(WebAssembly);
            WebAssembly.compile = async (...parts) => {
                await new Promise((goOn) => (window.goOn = goOn));
                return compile(...parts);
            };
        });
        const opened = context.waitForEvent("page");
        const begun = Visit.begin(context, pathToFileURL(process.env.OLVANE_PAGE).href);
        const page = await opened;
        await page.waitForFunction(() => window.goOn);
        const isTaken = await page.evaluate((text) => {
            const dataTransfer = new DataTransfer();
            dataTransfer.items.add(new File([text], "early.ged"));
            const events = ["dragover", "drop"].map(
                (type) => new DragEvent(type, { bubbles: true, cancelable: true, dataTransfer }),
            );
            for (const event of events) document.body.dispatchEvent(event);
            window.goOn();
            return events.every((event) => event.defaultPrevented);
        }, "0 HEAD\n0 @A@ INDI\n1 NAME Ada /Early/\n0 TRLR\n");
        assert.ok(isTaken, "the browser would leave the page for the file");
        const visit = await begun;
        await visit.untilFamily();
        assert.equal(await visit.page.title(), "early");
        await visit.end();
    });

    test("of several files that are dropped the first opens, and the page says which", async () => {
        const visit = await visitEmpty();
        const other = "0 HEAD\n0 @A@ INDI\n1 NAME Ada /Only/\n0 TRLR\n";
        await visit.dropAll([
            ["darwin-wedgwood.ged", kDarwins],
            ["small.ged", other],
        ]);
        await visit.untilFamily();
        assert.equal(await visit.page.title(), "darwin-wedgwood");
        assert.match(await visit.page.innerText("#notices"), /Of the files .*darwin-wedgwood\.ged.* was opened/);
        await visit.end();
    });

    test("a link to a person of a file that is still to come finds that person in it", async () => {
        const visit = await visitEmpty({}, "#person=I5&view=pedigree");
        await visit.drop("darwin-wedgwood.ged", kDarwins);
        await visit.untilFamily();
        assert.equal(await visit.focus(), "I5");
        assert.equal(await visit.hash(), "#person=I5&view=pedigree");
        await visit.drop(
            "small.ged",
            "0 HEAD\n0 @A@ INDI\n1 NAME Ada /Only/\n0 @I5@ INDI\n1 NAME Ben /Five/\n0 TRLR\n",
        );
        await visit.page.waitForFunction(() => document.title === "small");
        await visit.still();
        assert.equal(await visit.focus(), "A", "the link named a person of the first file");
        await visit.reload();
        await visit.drop("darwin-wedgwood.ged", kDarwins);
        await visit.untilFamily();
        assert.notEqual(await visit.hash(), "#person=A", "the address was that of another file");
        assert.ok(!(await visit.page.isVisible('#notices [role="alert"]')), "nobody followed a link");
        await visit.end();
    });

    test("the way through one family does not lead into the next", async () => {
        const visit = await visitEmpty();
        await visit.drop("darwin-wedgwood.ged", kDarwins);
        await visit.untilFamily();
        await visit.goTo("Emma Wedgwood 1808");
        await visit.goTo("Ralph Vaughan Williams");
        const small =
            "0 HEAD\n0 @I2@ INDI\n1 NAME Ada /Two/\n0 @I90@ INDI\n1 NAME Ben /Ninety/\n0 @I1@ INDI\n1 NAME Cid /One/\n0 TRLR\n";
        await visit.drop("small.ged", small);
        await visit.page.waitForFunction(() => document.title === "small");
        await visit.still();
        assert.equal(await visit.focus(), "I2");
        assert.ok(await visit.page.isDisabled("#back"));
        await visit.step(() => visit.page.goBack());
        assert.equal(await visit.focus(), "I2", "the browser's button led to Emma, who has the same record");
        assert.equal(await visit.hash(), "#person=I2");
        await visit.goTo("Cid");
        await visit.step(() => visit.page.click("#back"));
        assert.equal(await visit.focus(), "I2");
        await visit.step(() => visit.page.click("#forward"));
        assert.equal(await visit.focus(), "I1");
        await visit.end();
    });

    test("a file over the page is invited to fall, and one that leaves is not", async () => {
        const visit = await visitEmpty();
        const drag = (type) =>
            visit.page.evaluate((type) => {
                const dataTransfer = new DataTransfer();
                dataTransfer.items.add(new File(["0 HEAD"], "a.ged"));
                const event = new DragEvent(type, {
                    bubbles: true,
                    cancelable: true,
                    dataTransfer,
                    relatedTarget: null,
                });
                document.body.dispatchEvent(event);
                return event.defaultPrevented;
            }, type);
        assert.ok(await drag("dragover"), "the browser itself would open the file");
        assert.ok(await visit.page.isVisible(".cover"));
        await drag("dragleave");
        assert.ok(!(await visit.page.isVisible(".cover")));
        await visit.end();
    });

    test("an archive is opened for the family file inside", async () => {
        const visit = await visitEmpty();
        await visit.drop("darwin.gdz", archiveOf("gedcom.ged", kDarwins));
        await visit.untilFamily();
        assert.ok((await visit.shown()).length > 20);
        await visit.end();
    });

    test("what is no family file is refused in words, and the page stays as it was", async () => {
        const visit = await visitEmpty();
        await visit.drop("holiday.jpg", Buffer.from([0xff, 0xd8, 0xff, 0xe0, 0, 16, 74, 70, 73, 70]));
        await visit.page.waitForSelector('#notices [role="alert"]');
        assert.match(await visit.page.innerText("#notices"), /holiday\.jpg.*could not be read/);
        assert.ok(await visit.page.isVisible("#choose-file"));
        await visit.drop("empty.ged", "0 HEAD\n0 TRLR\n");
        await visit.page.waitForFunction(() => /empty\.ged/.test(one("#notices").textContent));
        const shown = await visit.page.innerText("#notices");
        assert.match(shown, /holds no person/);
        assert.doesNotMatch(shown, /could not be read|0 HEAD/, "it is GEDCOM, and was read");
        await visit.drop("broken.gdz", Buffer.from("PK\u0003\u0004 not an archive"));
        await visit.page.waitForFunction(() => /archive/i.test(one("#notices").textContent));
        await visit.end();
    });

    test("a file whose encoding is wrong can be read in another, and the picture stays with its person", async () => {
        // In windows-1251, of which the file says nothing.
        const bytes = Buffer.concat([
            Buffer.from("0 HEAD\n1 GEDC\n2 VERS 5.5.1\n1 CHAR ANSI\n0 @I1@ INDI\n1 NAME Ann\n0 @I2@ INDI\n1 NAME "),
            Buffer.from([0xc8, 0xe2, 0xe0, 0xed]),
            Buffer.from("\n0 TRLR\n"),
        ]);
        const visit = await visitEmpty();
        await visit.drop("ivan.ged", bytes);
        await visit.untilFamily();
        await visit.follow("#person=I2");
        assert.notEqual(await visit.page.innerText("#side-panel h2"), "Иван");
        await visit.click("#file-button");
        await visit.page.selectOption("#encoding", "windows-1251");
        await visit.still();
        assert.equal(await visit.focus(), "I2");
        assert.equal(await visit.page.innerText("#side-panel h2"), "Иван");
        await visit.end();
    });

    test("every encoding that a file can be read in can be chosen", async () => {
        const { stderr } = spawnSync(command, ["people", "-", "--encoding", "?"], { encoding: "utf8" });
        const known = /known are (.*); 'olvane/.exec(stderr)[1].split(", ");
        assert.ok(known.length > 40, stderr);
        const visit = await visitEmpty();
        await visit.drop("darwin-wedgwood.ged", kDarwins);
        await visit.untilFamily();
        await visit.click("#file-button");
        const offered = await visit.page.$$eval("#encoding option", (options) => options.map(({ value }) => value));
        assert.deepEqual(
            known.filter((name) => name !== "ASCII" && !offered.includes(name)),
            [],
        );
        await visit.end();
    });

    test("a broken file shows what could be read, and says what could not", async () => {
        const visit = await visitEmpty();
        await visit.drop("broken.ged", brokenFamily());
        await visit.untilFamily();
        assert.deepEqual(await visit.shown(), ["I1", "I2", "I3"]);
        await visit.page.click("#notices .warned .plain");
        assert.ok(await visit.page.isVisible("#diagnostics"));
        await visit.page.keyboard.press("Escape");
        await visit.untilKeysOn("diagnostics-button");
        await visit.page.click("#diagnostics-button");
        assert.ok(await visit.page.isVisible("#diagnostics"));
        const shown = await visit.page.innerText("#diagnostics");
        assert.match(shown, /line 8\b/i);
        assert.match(shown, /line 16\b/i);
        assert.ok((await visit.page.locator("#diagnostics li").count()) >= 4);
        await photograph(visit, "diagnostics");
        await visit.page.keyboard.press("Escape");
        await visit.untilVisible("#diagnostics", false);
        await visit.end();
    });

    test("what is odd in the data leads to its persons, by a click and by a key", async () => {
        const lines = [
            "0 @I1@ INDI",
            "1 NAME Early /Grave/",
            "1 BIRT",
            "2 DATE 1850",
            "1 DEAT",
            "2 DATE 1840",
            "1 FAMS @F1@",
        ];
        lines.push(
            "0 @I2@ INDI",
            "1 NAME Old /Child/",
            "1 BIRT",
            "2 DATE 1800",
            "1 FAMC @F1@",
            "0 @F1@ FAM",
            "1 HUSB @I1@",
            "1 CHIL @I2@",
        );
        const phrase = (sentence, ...parts) => ({ sentence, arguments: parts });
        const kept = {
            line: 4,
            severity: "error",
            kind: "levelJump",
            what: phrase("jumpingLevel", "1", "4"),
            done: [phrase("asOneBelow")],
            quoted: "NAME",
        };
        const visit = await visitFamily(gedcom(...lines), { remarks: [kept] }, { locale: "de" }, "#person=I1");
        await visit.page.click("#diagnostics-button");
        const texts = await visit.page.locator("#diagnostics .message").allTextContents();
        assert.deepEqual(texts, [
            "die Ebene springt von 1 auf 4 (NAME)",
            "Early Grave starb vor der Geburt",
            "Old Child wurde vor dem Elternteil Early Grave geboren",
        ]);
        assert.deepEqual(await visit.page.locator("#diagnostics .severity").allTextContents(), [
            "Fehler",
            "Auffällig",
            "Auffällig",
        ]);
        await photograph(visit, "remarks");
        await visit.page.click("#diagnostics li:last-child .to-person >> nth=0");
        await visit.still();
        assert.ok(!(await visit.page.isVisible("#diagnostics")));
        assert.equal(await visit.focus(), "I2");
        await visit.page.click("#diagnostics-button");
        await visit.page.focus("#diagnostics li:nth-child(2) .to-person");
        await visit.page.keyboard.press("Enter");
        await visit.still();
        assert.equal(await visit.focus(), "I1");
        await visit.end();
    });

    test(
        "a page opens at the person that the command was given, and speaks of the file that it was given",
        { skip: command ? false : "no olvane command was given" },
        async () => {
            const file = fileFor(
                "some.family.ged",
                "0 HEAD\n0 @3@ INDI\n1 NAME Abe /First/\nno line\n0 @2@ INDI\n1 NAME Bea /Second/\n0 @1@ INDI\n1 NAME Cid /Third/\n0 TRLR\n",
            );
            const page = fileFor("named.html", "");
            execFileSync(command, ["page", file, "--focus", "Second", "-o", page], { stdio: "ignore" });
            const visit = await visitFile(page);
            await visit.untilFamily();
            assert.equal(await visit.focus(), "2");
            assert.equal(await visit.page.title(), "Bea Second");
            assert.match(await visit.page.textContent("#diagnostics"), /line 4.*no line/);
            assert.equal(await visit.page.locator("#notices .warned").count(), 0, "nobody here can fix the file");
            await visit.end();
            execFileSync(command, ["page", file, "-o", page], { stdio: "ignore" });
            const plain = await visitFile(page);
            await plain.untilFamily();
            assert.equal(await plain.page.title(), "some.family");
            await plain.end();
        },
    );

    test("a picture that asks for too much is refused in words, and others can be had", async () => {
        const visit = await visitEmpty({}, "#person=MAN");
        await visit.drop("many.ged", hugeHousehold());
        await visit.page.waitForSelector('#notices [role="alert"]');
        assert.match(await visit.page.innerText("#notices"), /more than a million relatives/);
        await visit.goTo("Lone Stranger");
        assert.equal(await visit.focus(), "LONE");
        await visit.end();
    });

    test("an archive that holds more than a page can is refused in words", async () => {
        const visit = await visitEmpty();
        await visit.drop("bomb.gdz", archiveOf("gedcom.ged", Buffer.alloc(129 * 2 ** 20, "0 HEAD\n")));
        await visit.page.waitForSelector('#notices [role="alert"]');
        assert.match(await visit.page.innerText("#notices"), /bomb\.gdz.*larger than 128 MiB/s);
        assert.ok(await visit.page.isVisible("#choose-file"));
        await visit.end();
    });

    test("an address is put right that asks for too much, or has other letters", async () => {
        const visit = await visitDarwins("#person=I1");
        await visit.follow("#person=i5&view=pedigree&generations=99");
        assert.equal(await visit.focus(), "I5");
        assert.equal(await visit.hash(), "#person=I5&view=pedigree&generations=10");
        await visit.end();
    });

    test("the remarks on a broken file are said in the reader's own language", async () => {
        const remarksIn = async (locale) => {
            const visit = await visitEmpty({ locale });
            await visit.drop("broken.ged", brokenFamily());
            await visit.untilFamily();
            const remarks = await visit.page.locator("#diagnostics :is(.message, .hint)").allTextContents();
            await visit.end();
            return remarks;
        };
        const english = await remarksIn("en");
        const german = await remarksIn("de");
        assert.equal(german.length, english.length);
        assert.ok(
            german.includes("keine Zeile mit Ebene und Schlüsselwort (this is no line at all)"),
            german.join("; "),
        );
        assert.deepEqual(
            german.filter((remark) => english.includes(remark)),
            [],
            "still in English",
        );
    });

    test("why a file is refused is said in the reader's own language", async () => {
        const visit = await visitEmpty({ locale: "de" });
        await visit.drop("leer.ged", "");
        await visit.page.waitForSelector('#notices [role="alert"]');
        assert.match(await visit.page.innerText("#notices"), /leer\.ged\u2069 ist leer/);
        await visit.end();
    });

    test("a family in the page opens by itself at the person of the address", async () => {
        const visit = await visitDarwins("#person=I5");
        assert.equal(await visit.focus(), "I5");
        assert.equal(await visit.page.title(), "Darwin and Wedgwood");
        await visit.end();
    });

    test("an address that leads to nobody leads to somebody all the same", async () => {
        for (const hash of [
            "#person=I9999",
            "#nonsense",
            "#person=%E0%A4%A&view=9",
            "#generations=1e9&view=pedigree",
        ]) {
            const visit = await visitDarwins(hash);
            assert.ok(await visit.focus());
            await visit.end();
        }
    });

    test("a link to a person who is not in the file says so, and the address is put right", async () => {
        const visit = await visitDarwins("#person=I9999&view=pedigree");
        const shown = () => visit.page.innerText('#notices [role="alert"]');
        assert.match(await shown(), /I9999.*not in this file/);
        const here = await visit.focus();
        assert.equal(await visit.hash(), `#person=${here}&view=pedigree`);
        await visit.follow("#person=NOBODY");
        assert.match(await visit.page.innerText("#notices"), /NOBODY/);
        assert.equal(await visit.focus(), here);
        assert.equal(await visit.hash(), `#person=${here}`);
        await visit.end();
    });
});

// One file, packed, in a GEDZIP archive. The check sum is left out: the page needs none.
function archiveOf(name, content) {
    const packed = deflateRawSync(content);
    const fields = Buffer.alloc(26);
    fields.writeUInt16LE(20, 0);
    fields.writeUInt16LE(8, 4);
    fields.writeUInt32LE(packed.length, 14);
    fields.writeUInt32LE(content.length, 18);
    fields.writeUInt16LE(name.length, 22);
    const local = Buffer.concat([Buffer.from("PK\u0003\u0004"), fields, Buffer.from(name), packed]);
    const entry = Buffer.concat([Buffer.from("PK\u0001\u0002\u0014\0"), fields, Buffer.alloc(14), Buffer.from(name)]);
    const end = Buffer.alloc(22);
    end.write("PK\u0005\u0006", "latin1");
    end.writeUInt16LE(1, 8);
    end.writeUInt16LE(1, 10);
    end.writeUInt32LE(entry.length, 12);
    end.writeUInt32LE(local.length, 16);
    return Buffer.concat([local, entry, end]);
}
