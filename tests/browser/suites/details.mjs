// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Everything that the file knows: notes, sources, addresses, names and photographs, from the file to the panel.

import assert from "node:assert/strict";
import { execFileSync, spawnSync } from "node:child_process";
import { mkdirSync, readFileSync, symlinkSync, writeFileSync } from "node:fs";
import { join } from "node:path";
import { describe } from "node:test";
import { gunzipSync } from "node:zlib";
import {
    fileFor,
    kTwoAtOnce,
    newContext,
    photograph,
    visitEmpty,
    visitFamily,
    visitFile,
} from "../support/browser.mjs";
import { detailedFamily, kDetailWords, livingFamily } from "../support/families.mjs";
import { archiveOf } from "../support/archive.mjs";
import { test } from "../support/reported.mjs";

const command = process.env.OLVANE_COMMAND;
const kPhone = { viewport: { width: 390, height: 844 }, hasTouch: true, isMobile: true };

/** A JPEG of two colours, made by the browser: red on the left, blue on the right. */
async function jpeg(width, height) {
    const context = await newContext();
    const page = await context.newPage();
    const base64 = await page.evaluate(
        ([width, height]) => {
            const canvas = Object.assign(document.createElement("canvas"), { width, height });
            const paint = canvas.getContext("2d");
            for (const [colour, x] of [
                ["red", 0],
                ["blue", width / 2],
            ]) {
                paint.fillStyle = colour;
                paint.fillRect(x, 0, width / 2, height);
            }
            return canvas.toDataURL("image/jpeg").split(",")[1];
        },
        [width, height],
    );
    await context.close();
    return Buffer.from(base64, "base64");
}

/** With a note of the camera that it was held on its side, and a word that must not come along. */
function heldSideways(bytes) {
    const tiff = Buffer.from("4d4d002a00000008000101120003000000010006000000000000", "hex");
    const body = Buffer.concat([Buffer.from("Exif\0\0"), tiff, Buffer.from("Geheimort")]);
    const head = Buffer.from([0xff, 0xe1, (body.length + 2) >> 8, (body.length + 2) & 255]);
    return Buffer.concat([bytes.subarray(0, 2), head, body, bytes.subarray(2)]);
}

function blockOf(page) {
    return JSON.parse(
        /<script type="application\/json" id="olvane-family">([^]*?)<\/script>/.exec(readFileSync(page, "utf8"))[1],
    );
}

function folderFor(name) {
    const folder = fileFor(name, "") + ".d";
    mkdirSync(folder, { recursive: true });
    return folder;
}

async function unfold(visit) {
    await visit.page.evaluate(() => all("#side-panel details").forEach((one) => (one.open = true)));
}

describe("details", kTwoAtOnce, () => {
    test("a dropped file's notes, sources, events, names and links stand in the panel, in the order of a life", async () => {
        const visit = await visitEmpty();
        await visit.drop("rose.ged", detailedFamily());
        await visit.untilFamily();
        await visit.goTo("Berta");
        await unfold(visit);
        const text = await visit.page.innerText("#side-panel");
        for (const word of kDetailWords) assert.ok(text.includes(word), word);
        const order = await visit.page.$$eval("#side-panel section.facts dt", (all) =>
            all.map((one) => one.textContent),
        );
        assert.deepEqual(order, ["Name", "Married name", "Birth", "Taufzeuge", "Residence", "Occupation", "Death"]);
        assert.match(text, /Primary evidence/);
        assert.equal(await visit.page.locator("#side-panel .sources").first().getAttribute("open"), "");
        await photograph(visit, "details");
        await visit.end();
    });

    test("links lead to http and https alone and give nothing away", async () => {
        const visit = await visitFamily(detailedFamily());
        await visit.goTo("Berta");
        const links = await visit.page.$$eval("#side-panel a:not(.relative)", (all) =>
            all.map((one) => [one.getAttribute("href"), one.rel, one.target]),
        );
        assert.deepEqual(links, [["https://example.org/berta", "noopener noreferrer", "_blank"]]);
        assert.match(await visit.page.innerText("#side-panel"), /javascript:alert\(1\) <b>fett<\/b>/);
        assert.equal(await visit.page.evaluate(() => window.wasRun ?? null), null);
        await visit.end();
    });

    test("a long note is shortened until it is asked for", async () => {
        const long = "Anfang " + "lang ".repeat(200) + "Ende";
        const visit = await visitFamily(detailedFamily().replace("Rosenholz stand im Zimmer", long));
        await visit.goTo("Berta");
        assert.ok(!(await visit.page.innerText("#side-panel section.further")).includes("Ende"));
        await visit.page.click("#side-panel .note button");
        assert.ok((await visit.page.innerText("#side-panel section.further")).includes("Ende"));
        await visit.end();
    });

    test("photographs of an archive are shown from it; what lies outside, is none or is endless is not", async () => {
        const photo = await jpeg(60, 40);
        const text = detailedFamily().replace(
            "1 OBJE @M1@",
            "1 OBJE @M1@\n1 OBJE\n2 FILE drawing.svg\n2 TITL Zeichnung\n1 OBJE\n2 FILE bomb.png\n2 TITL Bombe",
        );
        const bomb = Buffer.concat([Buffer.from([0x89, 0x50, 0x4e, 0x47]), Buffer.alloc(40 << 20)]);
        const archive = archiveOf([
            ["gedcom.ged", Buffer.from(text)],
            ["portrait.jpg", photo],
            ["outside.jpg", photo],
            [
                "drawing.svg",
                Buffer.from('<svg xmlns="http://www.w3.org/2000/svg"><script>window.wasRun=1</script></svg>'),
            ],
            ["bomb.png", bomb],
        ]);
        const visit = await visitEmpty();
        await visit.drop("rose.gdz", archive);
        await visit.untilFamily();
        await visit.goTo("Berta");
        await visit.page.waitForSelector("#side-panel .photograph img");
        // What is none or is endless is known to be so then.
        await visit.page.evaluate(
            async (names) => {
                const { photographs } = document.querySelector("olvane-tree").family;
                await Promise.all(names.map((name) => photographs.urlOf(name)));
                await Promise.all(all("#side-panel .photograph img").map((image) => image.decode()));
            },
            ["portrait.jpg", "drawing.svg", "bomb.png"],
        );
        const shown = await visit.page.$$eval("#side-panel .photograph img", (all) =>
            all.map((one) => [one.alt, one.naturalWidth, one.src.slice(0, 5)]),
        );
        assert.deepEqual(shown, [["Portraitbild", 60, "blob:"]]);
        const documents = await visit.page.$$eval("#side-panel .document", (all) => all.map((one) => one.textContent));
        assert.deepEqual(documents, ["Von anderswo (jpeg)", "Zeichnung", "Bombe"]);
        await visit.page.click("#side-panel .photograph");
        assert.ok(await visit.page.isVisible("#side-panel dialog img"));
        await photograph(visit, "photograph");
        await visit.page.keyboard.press("Escape");
        await visit.page.waitForSelector("#side-panel dialog", { state: "detached" });
        // A saved picture has a copy of it as data.
        await visit.page.click("#options-button");
        await visit.page.check("#photos-in-boxes");
        await visit.page.waitForSelector("#tree image.portrait");
        const saved = await visit.page.evaluate(() => one("olvane-tree").saveSvg());
        assert.equal(saved.match(/<image href="data:image\/jpeg;base64,[^"]+"/g)?.length, 1);
        await visit.end();
    });

    test("on a phone they are in the sheet, and nothing is wider than the window", async () => {
        const visit = await visitFamily(detailedFamily(), {}, kPhone, "#person=I1");
        await visit.page.click("#side-panel .handle");
        await unfold(visit);
        assert.ok(await visit.page.evaluate(() => document.documentElement.scrollWidth <= innerWidth));
        const wide = await visit.page.evaluate(() => {
            const edge = one(".panel-body").getBoundingClientRect().right;
            return [...all(".panel-body *")]
                .filter((part) => part.getBoundingClientRect().right > edge)
                .map((part) => part.outerHTML.slice(0, 80));
        });
        assert.deepEqual(wide, []);
        await photograph(visit, "details-phone");
        await visit.end();
    });
});

describe("details of olvane page", { skip: command ? false : "no olvane command was given", ...kTwoAtOnce }, () => {
    async function family(name) {
        const folder = folderFor(name);
        const file = join(folder, "rose.ged");
        writeFileSync(file, detailedFamily());
        writeFileSync(join(folder, "portrait.jpg"), heldSideways(await jpeg(600, 400)));
        return { folder, file, page: join(folder, "page.html") };
    }

    test("each of 21 lines of notes, sources, media and names is in the page", async () => {
        const { file, page } = await family("kept");
        execFileSync(command, ["page", file, "-o", page]);
        const text = gunzipSync(Buffer.from(blockOf(page).gzip, "base64")).toString();
        assert.equal(kDetailWords.length, 21);
        for (const word of kDetailWords) assert.ok(text.includes(word), word);
        const visit = await visitFile(page);
        await visit.untilFamily();
        await visit.goTo("Berta");
        await unfold(visit);
        const shown = await visit.page.innerText("#side-panel");
        for (const word of kDetailWords) assert.ok(shown.includes(word), word);
        await visit.end();
    });

    test("notes and media stay out where asked", async () => {
        const { file, page } = await family("left-out");
        execFileSync(command, ["page", file, "-o", page, "--no-notes", "--no-media"]);
        const text = gunzipSync(Buffer.from(blockOf(page).gzip, "base64")).toString();
        assert.match(text, /Fieber/);
        assert.doesNotMatch(text, /Rosenholz|Kirchenbuch|Hochzeitsnotiz|Portraitbild|portrait\.jpg/);
    });

    test("photographs are scaled down, turned as they were taken, and bring nothing of their file along", async () => {
        const { folder, file, page } = await family("photos");
        symlinkSync("/etc/passwd", join(folder, "linked.jpg"));
        const { stderr, status } = spawnSync(command, ["page", file, "-o", page, "--photos", "120"], {
            encoding: "utf8",
        });
        assert.equal(status, 0, stderr);
        assert.match(stderr, /1 photographs are in the page; 1 media files are not.*outside\.jpg/);
        const { photos } = blockOf(page);
        assert.deepEqual(Object.keys(photos), ["portrait.jpg"]);
        assert.ok(!Buffer.from(photos["portrait.jpg"], "base64").includes("Geheimort"));
        const visit = await visitFile(page);
        await visit.untilFamily();
        await visit.goTo("Berta");
        const seen = await visit.page.$eval("#side-panel .photograph img", async (image) => {
            await image.decode();
            const canvas = Object.assign(document.createElement("canvas"), { width: 80, height: 120 });
            const paint = canvas.getContext("2d");
            paint.drawImage(image, 0, 0);
            const colour = (y) => (paint.getImageData(40, y, 1, 1).data[0] > 128 ? "red" : "blue");
            return [image.naturalWidth, image.naturalHeight, colour(10), colour(110)];
        });
        assert.deepEqual(seen, [80, 120, "red", "blue"]);
        await photograph(visit, "photos");
        await visit.page.click("#options-button");
        await visit.page.check("#photos-in-boxes");
        await visit.still();
        assert.equal(await visit.box("I1").locator("image.portrait").count(), 1);
        assert.equal(await visit.box("I2").locator("image.portrait").count(), 0);
        assert.match(await visit.hash(), /photos=boxes/);
        await visit.page.keyboard.press("Escape");
        // On paper and in a saved file as well, each with the photograph inside.
        const imagesOf = (svg) => svg.match(/<image href="data:image\/jpeg;base64,[^"]+"/g)?.length ?? 0;
        const drawn = await visit.page.evaluate(() => {
            const tree = one("olvane-tree");
            return { saved: tree.saveSvg(), sheet: tree.sheets({ paper: "A4" }).sheets[0].svg };
        });
        assert.deepEqual([imagesOf(drawn.saved), imagesOf(drawn.sheet)], [1, 1]);
        await photograph(visit, "photos-in-boxes");
        await visit.end();
    });

    test("with the living hidden, no note, source, title or photograph of theirs is in the page", async () => {
        const folder = folderFor("living-details");
        const [file, page] = [join(folder, "living.ged"), join(folder, "page.html")];
        const secret = [
            "1 NOTE Verraeter",
            "1 SOUR @S9@",
            "1 OBJE @M9@",
            "1 WWW https://verraeter.example",
            "1 ADDR Verraetergasse",
        ];
        const more = [
            "0 @S9@ SOUR",
            "1 TITL Verraeterbuch",
            "0 @M9@ OBJE",
            "1 FILE both.jpg",
            "1 TITL Gruppenbild",
            "0 @M8@ OBJE",
            "1 FILE dead.jpg",
            "1 TITL Grabstein",
            "0 TRLR",
        ];
        const text = livingFamily()
            .replace("1 NAME Zacharias /Geheimrat/", ["1 NAME Zacharias /Geheimrat/", ...secret].join("\n"))
            .replace(
                "1 RESI",
                [
                    "1 OBJE @M9@",
                    "1 OBJE @M8@",
                    "1 NOTE Besucht von Yolanda Versteckt",
                    "1 NOTE Ein alter Mann",
                    "1 RESI",
                ].join("\n"),
            )
            .replace("1 HUSB @I3@", ["1 HUSB @I3@", "1 NOTE Verraeterfest"].join("\n"))
            .replace("0 TRLR", more.join("\n"));
        writeFileSync(file, text);
        const photo = await jpeg(60, 40);
        for (const name of ["both.jpg", "dead.jpg"]) writeFileSync(join(folder, name), photo);
        execFileSync(command, ["page", file, "-o", page, "--photos", "100", "--hide-living"]);
        const block = blockOf(page);
        const carried = gunzipSync(Buffer.from(block.gzip, "base64")).toString();
        assert.match(carried, /Ein alter Mann/);
        assert.match(carried, /Grabstein/);
        assert.doesNotMatch(readFileSync(page, "utf8") + carried, /verraeter|versteckt|yolanda|zacharias/i);
        assert.deepEqual(
            Object.keys(block.photos),
            ["dead.jpg"],
            "a photograph that a living person has too may show them",
        );
    });
});
