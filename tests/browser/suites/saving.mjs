// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

import assert from "node:assert/strict";
import { execFileSync } from "node:child_process";
import { mkdtempSync, readFileSync, rmSync, writeFileSync } from "node:fs";
import { tmpdir } from "node:os";
import { join } from "node:path";
import { describe } from "node:test";
import { kTwoAtOnce, visitDarwins, visitFamily } from "../support/browser.mjs";
import { gedcom, kFactFamily } from "../support/families.mjs";
import { becomes } from "../support/patience.mjs";
import { test } from "../support/reported.mjs";

async function save(visit, button) {
    await visit.click("#file-button");
    const [download] = await Promise.all([visit.page.waitForEvent("download"), visit.page.click(button)]);
    return { name: download.suggestedFilename(), bytes: readFileSync(await download.path()) };
}

// The browser's own parser judges the file; nothing of the page is there.
async function parsed(visit, text) {
    return visit.page.evaluate((text) => {
        const document = new DOMParser().parseFromString(text, "image/svg+xml");
        const error = document.querySelector("parsererror")?.textContent ?? null;
        const boxes = [...document.querySelectorAll("g[role=img]")].map(
            (box) => box.querySelector("title").textContent,
        );
        const texts = [...document.querySelectorAll("text")].map((line) => line.textContent);
        const attributes = [...document.querySelectorAll("*")].flatMap((element) => element.getAttributeNames());
        const size = ["width", "height"].map((name) => Number(document.documentElement.getAttribute(name)));
        return { error, boxes, texts, attributes: [...new Set(attributes)], size };
    }, text);
}

describe("saving", kTwoAtOnce, () => {
    test("an SVG holds every box of the picture, in sight or not, and stands by itself", async () => {
        const visit = await visitDarwins();
        await visit.click("#fit");
        const labels = await visit.labels();
        for (let i = 0; i < 6; ++i) await visit.click("#zoom-in");
        const { name, bytes } = await save(visit, "#save-svg");
        assert.equal(name, "darwin-wedgwood - Charles Robert Darwin.svg");
        const file = await parsed(visit, bytes.toString("utf8"));
        assert.equal(file.error, null);
        assert.equal(file.boxes.length, labels.length);
        assert.ok(
            file.boxes.some((title) => /^Charles Robert Darwin, 1809–1882/.test(title)),
            file.boxes.join(),
        );
        assert.ok(file.texts.some((text) => /Darwin/.test(text)));
        assert.ok(
            !file.attributes.some((attribute) => /^(on|class|style|tabindex|data-)/.test(attribute)),
            file.attributes.join(),
        );
        await visit.end();
    });

    const command = process.env.OLVANE_COMMAND;
    const reason = command ? false : "no olvane command was given";
    test("an SVG has the bytes that the command draws", { skip: reason }, async () => {
        const sample = join(process.env.OLVANE_SOURCES, "samples/darwin-wedgwood.ged");
        const pictures = [
            ["", {}, []],
            ["&view=pedigree&generations=4", {}, ["--view", "pedigree", "--generations", "4"]],
            ["&view=ancestors&up=3&direction=left", {}, ["--view", "ancestors", "--up", "3", "--direction", "left"]],
            ["&show=dates,places,occupation,marriage", {}, ["--show", "dates,places,occupation,marriage"]],
            ["&view=pedigree&show=dates,marriage", {}, ["--view", "pedigree", "--show", "dates,marriage"]],
            ["&view=descendants&compact=yes&down=2", {}, ["--view", "descendants", "--compact", "--down", "2"]],
            [
                "&view=descendants&down=2",
                { colorScheme: "dark" },
                ["--view", "descendants", "--down", "2", "--theme", "dark"],
            ],
            ["", { locale: "de-DE" }, ["--language", "de"]],
            ["&view=fan&up=3", { locale: "es-ES" }, ["--view", "fan", "--up", "3", "--language", "es"]],
        ];
        for (const [address, settings, extra] of pictures) {
            const visit = await visitDarwins("#person=I1" + address, settings);
            const { bytes } = await save(visit, "#save-svg");
            const unknown = /ancestors|descendants|fan/.test(address) ? [] : ["--unknown-parents"];
            const drawn = execFileSync(command, ["draw", sample, "--focus", "I1", "-o", "-", ...unknown, ...extra]);
            assert.equal(bytes.toString("utf8"), drawn.toString("utf8"), address);
            await visit.end();
        }
    });

    test("an SVG says what boxes and lines say, in the bytes that the command draws", { skip: reason }, async () => {
        const folder = mkdtempSync(join(tmpdir(), "facts-"));
        const path = join(folder, "family.ged");
        writeFileSync(path, kFactFamily);
        const visit = await visitFamily(kFactFamily, { focus: 1 });
        await visit.click("#options-button");
        for (const fact of ["marriage", "places", "occupation", "dates"]) await visit.click(`#fact-${fact}`);
        await visit.page.keyboard.press("Escape");
        const { bytes } = await save(visit, "#save-svg");
        const show = ["--show", "dates,places,occupation,marriage", "--unknown-parents"];
        const drawn = execFileSync(command, ["draw", path, "--focus", "I1", "-o", "-", ...show]);
        assert.equal(bytes.toString("utf8"), drawn.toString("utf8"));
        for (const said of ["12 Feb 1809", "Bath", "Baker", "1839"]) assert.ok(bytes.includes(said), said);
        rmSync(folder, { recursive: true });
        await visit.end();
    });

    test("a life has the same words in box, panel, search, saved file and command", { skip: reason }, async () => {
        const lines = ["0 @I1@ INDI", "1 NAME Ann /Berg/", "1 BIRT", "2 DATE ABT 3 MAR 1809"];
        const family = gedcom(...lines, "1 DEAT", "2 DATE BEF 1882", "2 PLAC Kew,,,England");
        const folder = mkdtempSync(join(tmpdir(), "dates-"));
        const path = join(folder, "family.ged");
        writeFileSync(path, family);
        const languages = {
            en: [
                "about 3 Mar 1809",
                "before 1882",
                "born about 3 Mar 1809, died before 1882",
                "about 1809 – before 1882",
            ],
            de: [
                "um den 3. März 1809",
                "vor 1882",
                "geboren um den 3. März 1809, gestorben vor 1882",
                "um 1809 – vor 1882",
            ],
            es: [
                "hacia el 3 mar 1809",
                "antes de 1882",
                "nac. hacia el 3 mar 1809, m. antes de 1882",
                "hacia 1809 – antes de 1882",
            ],
        };
        for (const [language, [birth, death, life, years]] of Object.entries(languages)) {
            const stated = { focus: 1, address: "view=near&show=dates,places" };
            const visit = await visitFamily(family, stated, { locale: language });
            const textsOf = (selector) =>
                visit.page.locator(selector).evaluateAll((all) => all.map((one) => one.textContent));
            const shown = await textsOf("#tree .box .years");
            assert.equal(shown[1], `† ${death}`);
            assert.equal(shown[2], "† Kew, England");
            assert.deepEqual(await textsOf("#side-panel .date"), [birth, death]);
            assert.deepEqual(await textsOf("#side-panel .place"), ["Kew, England"]);
            assert.deepEqual(await textsOf("#side-panel header .years"), [years]);
            await visit.page.fill("#search", "ann");
            assert.deepEqual(await textsOf("#search-list .years"), [years]);
            await visit.page.press("#search", "Escape");
            assert.ok((await visit.label("I1")).includes(life));
            const { bytes } = await save(visit, "#save-svg");
            const file = await parsed(visit, bytes.toString("utf8"));
            assert.ok(file.boxes[0].startsWith(`Ann Berg, ${life}, † Kew, England`), file.boxes[0]);
            assert.ok(file.texts.includes(`† ${death}`), file.texts.join());
            const drawn = execFileSync(command, [
                ...["draw", path, "--focus", "I1", "--view", "near", "--show", "dates,places"],
                ...["--language", language, "-o", "-"],
            ]);
            assert.equal(bytes.toString("utf8"), drawn.toString("utf8"));
            await visit.end();
        }
        rmSync(folder, { recursive: true });
    });

    test("a PNG has twice the size of the drawing", async () => {
        const visit = await visitDarwins("#person=I1&view=pedigree&generations=3");
        const { size } = await parsed(visit, (await save(visit, "#save-svg")).bytes.toString("utf8"));
        const { name, bytes } = await save(visit, "#save-png");
        assert.match(name, /\.png$/);
        assert.equal(bytes.subarray(1, 4).toString("latin1"), "PNG");
        assert.deepEqual(
            [bytes.readUInt32BE(16), bytes.readUInt32BE(20)],
            size.map((side) => Math.floor(2 * side)),
        );
        assert.ok(bytes.length > 10_000, "there is something in it");
        await visit.end();
    });

    test("what is in sight is saved alone, as SVG and as PNG", async () => {
        const visit = await visitDarwins("#person=I1");
        await visit.click("#home");
        for (let i = 0; i < 4; ++i) await visit.click("#zoom-in");
        // A box is in sight when a piece of it lies within the window.
        const seen = await visit.page.evaluate(() => {
            const window = one("#tree").getBoundingClientRect();
            const isSeen = (frame) => {
                const { left, right, top, bottom } = frame.getBoundingClientRect();
                return right > window.left && left < window.right && bottom > window.top && top < window.bottom;
            };
            const frames = [...all("#tree .boxes > g[data-xref] .frame")].filter(isSeen);
            return frames.map((frame) => frame.getAttribute("aria-label").split(",")[0]);
        });
        const whole = await parsed(visit, (await save(visit, "#save-svg")).bytes.toString("utf8"));
        await visit.click("#file-button");
        await visit.click("#save-in-sight");
        await visit.page.keyboard.press("Escape");
        const part = await parsed(visit, (await save(visit, "#save-svg")).bytes.toString("utf8"));
        assert.equal(part.error, null);
        assert.ok(seen.length > 1, seen.join());
        for (const name of seen)
            assert.ok(
                part.boxes.some((title) => title.startsWith(name)),
                `${name}: ${part.boxes}`,
            );
        assert.ok(part.boxes.length < whole.boxes.length / 4, `${part.boxes.length} of ${whole.boxes.length}`);
        assert.ok(
            part.size.every((side, i) => side < whole.size[i]),
            `${part.size} of ${whole.size}`,
        );
        const { bytes } = await save(visit, "#save-png");
        assert.deepEqual(
            [bytes.readUInt32BE(16), bytes.readUInt32BE(20)],
            part.size.map((side) => 2 * side),
        );
        await visit.end();
    });

    test("sheets have a scale as the command has it, and are saved as PNG at a resolution in pixels an inch", async () => {
        const visit = await visitDarwins("#person=I1&view=descendants&down=1");
        const { page } = visit;
        const message = () => page.evaluate(() => one("#sheet-message").textContent);
        await visit.click("#file-button");
        await visit.click("#print-sheets");
        assert.match(await message(), /, scale 0\.\d+\.( |$)/);
        const scale = async (value) => {
            await page.fill("#sheet-scale", value);
            await page.press("#sheet-scale", "Tab");
        };
        await scale("0.02");
        assert.match(await message(), /^1 sheet, .*Too small to read/);
        await scale("1");
        const sheets = Number(/^(\d+) sheets/.exec(await message())[1]);
        assert.ok(sheets > 1, await message());
        assert.ok(!/Too small/.test(await message()));
        assert.ok(await page.isDisabled("#sheet-rows"));
        await page.selectOption("#sheet-dpi", "96");
        const downloads = [];
        page.on("download", (download) => downloads.push(download));
        await page.click("#sheets-png");
        await becomes(() => downloads.length >= sheets, true);
        assert.deepEqual(
            downloads.map((one) => one.suggestedFilename()),
            Array.from({ length: sheets }, (_, i) => `darwin-wedgwood - Charles Robert Darwin-${i + 1}.png`),
        );
        const bytes = readFileSync(await downloads[0].path());
        // A4 at 96 pixels an inch, upright or across.
        assert.deepEqual([bytes.readUInt32BE(16), bytes.readUInt32BE(20)].sort(), [1122, 793]);
        await scale("100");
        assert.match(await message(), /more than 1,000 sheets/);
        assert.ok(await page.isDisabled("#print-now"));
        await scale("");
        assert.match(await message(), /^1 sheet, /);
        await visit.end();
    });

    test("the whole picture is printed on one sheet, in the colours of paper", async () => {
        const visit = await visitDarwins("#person=I1", { colorScheme: "dark" });
        const { page } = visit;
        const pdf = await page.pdf({ preferCSSPageSize: true });
        assert.equal((pdf.toString("latin1").match(/\/Type\s*\/Page\b/g) ?? []).length, 1);
        // What the browser is given to print.
        await page.emulateMedia({ media: "print" });
        const printed = await page.evaluate(() => {
            dispatchEvent(new Event("beforeprint"));
            const sheet = one("#print-sheet");
            const shown = [...all(".bar, .stage, #side-panel")].filter((part) => part.getClientRects().length > 0);
            const answer = {
                boxes: sheet.querySelectorAll("svg g[role=img]").length,
                paper: sheet.querySelector("svg > rect").getAttribute("fill"),
                others: shown.length,
            };
            dispatchEvent(new Event("afterprint"));
            return { ...answer, left: sheet.childElementCount };
        });
        assert.ok(printed.boxes > 60, String(printed.boxes));
        assert.match(printed.paper, /^(rgb\(255, 255, 255\)|#fff(fff)?|white|none)$/);
        assert.equal(printed.others, 0);
        assert.equal(printed.left, 0);
        await visit.end();
    });

    test("a poster is shown before it is printed, and each of its sheets is a page", async () => {
        const visit = await visitDarwins("#person=I1", { colorScheme: "dark" });
        const { page } = visit;
        const pagesOf = (pdf) => pdf.toString("latin1").match(/\/Type\s*\/Page\b/g)?.length ?? 0;
        const shownSheets = () => page.evaluate(() => all(".sheet-preview img").length);
        const message = () => page.evaluate(() => one("#sheet-message").textContent);
        const pointsOf = (text) => Number(/names of at least ([0-9.]+) points/.exec(text)[1]);
        await visit.click("#file-button");
        await visit.click("#print-sheets");
        assert.equal(await shownSheets(), 1);
        const small = pointsOf(await message());
        await page.selectOption("#sheet-rows", "2");
        await page.selectOption("#sheet-columns", "3");
        const sheets = await shownSheets();
        assert.ok(sheets > 1 && sheets <= 6, String(sheets));
        assert.match(await message(), new RegExp(`^${sheets} sheets, `));
        assert.ok(pointsOf(await message()) > 1.5 * small, `${small}, then ${await message()}`);
        const pdf = await page.pdf({ preferCSSPageSize: true });
        assert.equal(pagesOf(pdf), sheets);
        // A4 in points, upright or across.
        assert.match(pdf.toString("latin1"), /\/MediaBox \[0 0 (59[45][.0-9]* 84[12]|84[12][.0-9]* 59[45])/);
        await page.selectOption("#purpose", "grandparents");
        assert.match(await visit.hash(), /view=hourglass/);
        assert.match(await visit.hash(), /up=2/);
        assert.deepEqual(
            await page.evaluate(() => ["paper", "sheet-rows", "sheet-columns"].map((id) => one("#" + id).value)),
            ["A4", "1", "1"],
        );
        assert.match(await message(), /^1 sheet, /);
        await page.selectOption("#purpose", "everybody");
        assert.match(await visit.hash(), /view=everybody/);
        assert.equal(await page.inputValue("#paper"), "A0");
        await visit.click("#print-dialog-close");
        assert.equal(pagesOf(await page.pdf({ preferCSSPageSize: true })), 1);
        await visit.end();
    });
});
