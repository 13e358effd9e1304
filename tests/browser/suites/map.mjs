// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Everybody as a map: what the command puts into a page, and what people do with it.

import assert from "node:assert/strict";
import { execFileSync } from "node:child_process";
import { readFileSync } from "node:fs";
import { describe } from "node:test";
import { gunzipSync, gzipSync } from "node:zlib";
import axe from "axe-core";
import { engineIn, fileFor, kTwoAtOnce, photograph, sample, visitEmpty, visitFile } from "../support/browser.mjs";
import { livingFamily } from "../support/families.mjs";
import { becomes } from "../support/patience.mjs";
import { test } from "../support/reported.mjs";

const command = process.env.OLVANE_COMMAND;
const kMap = /<script type="application\/octet-stream" id="olvane-map">([A-Za-z0-9+/=]*)<\/script>/;
let pages = 0;

// A page that the command writes with a map. Gives its text and its path.
function mapPage(gedcom, ...options) {
    const name = `map-${++pages}`;
    const input = fileFor(name + ".ged", gedcom);
    const path = fileFor(name + ".html", "");
    execFileSync(command, ["page", "--map", input, "-o", path, ...options], { maxBuffer: 1 << 28 });
    return { path, text: readFileSync(path, "utf8") };
}

const darwins = () => mapPage(sample("darwin-wedgwood.ged"), "--focus", "I1");
const mapBytes = (text) => gunzipSync(Buffer.from(kMap.exec(text)[1], "base64"));
const chosen = (visit) => visit.page.textContent("#map-card h2");

function cornerOf(visit) {
    return visit.page.evaluate(() => [
        ...document.querySelector("#map canvas").getContext("2d").getImageData(2, 2, 1, 1).data,
    ]);
}

async function visitMap(path, settings = {}, hash = "") {
    const visit = await visitFile(path, settings, hash);
    await visit.page.waitForSelector("#map canvas");
    await visit.page.waitForFunction(() => location.hash.startsWith("#map="));
    // A canvas is black before it is drawn, and no colour of ours is.
    await becomes(async () => (await cornerOf(visit)).slice(0, 3).some((part) => part > 0), true);
    return visit;
}

// A number of persons in couples, each with two children who marry into other couples.
function madeFamily(couples) {
    const lines = ["0 HEAD", "1 GEDC", "2 VERS 5.5.1", "1 CHAR UTF-8"];
    for (let f = 1; f <= couples; ++f) {
        const child = (husband) => f > 1 && husband === (f % 2 === 0);
        for (const [id, sex] of [
            [2 * f - 1, "M"],
            [2 * f, "F"],
        ]) {
            lines.push(
                `0 @I${id}@ INDI`,
                `1 NAME Given${id % 61} /Surname${f % 17}/`,
                `1 SEX ${sex}`,
                `1 FAMS @F${f}@`,
            );
            lines.push("1 BIRT", `2 DATE ${1500 + 25 * Math.floor(Math.log2(f))}`);
            if (child(sex === "M")) lines.push(`1 FAMC @F${f >> 1}@`);
        }
        lines.push(`0 @F${f}@ FAM`, `1 HUSB @I${2 * f - 1}@`, `1 WIFE @I${2 * f}@`);
        for (const g of [2 * f, 2 * f + 1])
            if (g <= couples) lines.push(`1 CHIL @I${g % 2 === 0 ? 2 * g - 1 : 2 * g}@`);
    }
    return [...lines, "0 TRLR"].join("\n");
}

describe("map", { ...kTwoAtOnce, skip: command ? false : "no olvane command" }, () => {
    test("a page with a map opens with it, at the person that the command was given", async () => {
        const visit = await visitMap(darwins().path);
        assert.equal(await visit.page.getAttribute("#map canvas", "aria-label"), "Map of 142 persons");
        assert.match(await chosen(visit), /Charles Robert Darwin/);
        assert.match(await visit.hash(), /^#map=-?\d+,-?\d+,[\d.]+&number=1$/);
        await photograph(visit, "map");
        await visit.end();
    });

    test("arrow keys follow kin, and what they lead to is read out", async () => {
        const visit = await visitMap(darwins().path);
        await visit.page.focus("#map canvas");
        await visit.page.keyboard.press("ArrowUp");
        assert.match(await chosen(visit), /Robert Waring Darwin/);
        await visit.page.keyboard.press("ArrowDown");
        assert.match(await chosen(visit), /Charles Robert Darwin/, "down again to the child one came from");
        assert.match(
            await visit.page.textContent("#map [role=status]"),
            /Charles Robert Darwin\. 1809–1882\. Parents: .*Robert Waring/,
        );
        const before = await chosen(visit);
        await visit.page.keyboard.press("ArrowRight");
        await visit.page.keyboard.press("ArrowLeft");
        assert.equal(await chosen(visit), before, "there and back along a row");
        await visit.end();
    });

    test("kin are buttons, which keys reach and which lead on", async () => {
        const visit = await visitMap(darwins().path);
        const partners = visit.page.locator('#map-card ul[aria-label="Partners"] button');
        assert.match(await partners.first().innerText(), /Emma Wedgwood/);
        await partners.first().focus();
        await visit.page.keyboard.press("Enter");
        assert.match(await chosen(visit), /Emma Wedgwood/);
        await visit.end();
    });

    test("somebody found by name, whatever the accents, is flown to", async () => {
        const visit = await visitMap(darwins().path);
        const before = await visit.hash();
        await visit.page.fill("#search", "JÓSIAH 1730");
        await visit.page.press("#search", "Enter");
        assert.match(await chosen(visit), /Josiah/);
        await visit.page.waitForFunction((old) => location.hash !== old, before);
        await visit.page.waitForFunction(() => Number(/,([\d.]+)&/.exec(location.hash)?.[1]) >= 0.8);
        await visit.end();
    });

    test("Enter shows the family of the chosen person, and the way back leads to the map", async () => {
        const visit = await visitMap(darwins().path);
        await visit.page.focus("#map canvas");
        await visit.page.keyboard.press("ArrowUp");
        await visit.page.keyboard.press("Enter");
        await visit.untilFamily();
        assert.equal(await visit.page.isVisible("#map"), false);
        assert.match(await visit.page.innerText("#side-panel h2"), /Robert Waring Darwin/);
        await visit.step(() => visit.page.goBack());
        await visit.page.waitForSelector("#map canvas", { state: "visible" });
        await visit.page.click("#view-pedigree");
        await visit.page.waitForSelector("#map canvas", { state: "hidden" });
        assert.match(await visit.hash(), /view=pedigree/);
        await visit.end();
    });

    test("any family that is open can be seen as a map, and its link leads there again", async () => {
        const visit = await visitEmpty();
        await visit.choose("darwin.ged", sample("darwin-wedgwood.ged"));
        await visit.untilFamily();
        await visit.page.click("#views-button");
        await visit.page.click("#choose-map");
        await visit.page.waitForSelector("#map canvas", { state: "visible" });
        assert.equal(await visit.page.getAttribute("#choose-map", "aria-pressed"), "true");
        assert.match(await visit.hash(), /^#map=/);
        await visit.end();
        const link = "#map=0,0,0.5&number=2";
        const again = await visitMap(darwins().path, {}, link);
        assert.equal(await again.page.evaluate(() => document.querySelector("#map-card h2") !== null), true);
        assert.match(await again.hash(), /,0\.5&number=2$/);
        await again.end();
    });

    test("the map is mirrored by the switch, and the person in the middle stays there", async () => {
        const visit = await visitEmpty();
        await visit.choose("darwin.ged", sample("darwin-wedgwood.ged"));
        await visit.untilFamily();
        await visit.click("#views-button");
        await visit.page.click("#choose-map");
        await visit.page.waitForSelector("#map canvas", { state: "visible" });
        await visit.page.focus("#map canvas");
        await visit.page.keyboard.press("Home");
        await visit.page.waitForFunction(() => Number(/,([\d.]+)&/.exec(location.hash)?.[1]) >= 0.8);
        const placeIn = (hash) => /map=([-\d.]+),([-\d.]+),.*number=(\d+)/.exec(hash).slice(1).map(Number);
        const [x, y, number] = placeIn(await visit.hash());
        const name = await visit.page.textContent("#map-card h2");
        await visit.click("#views-button");
        await visit.page.check("#mirrored");

        await visit.page.waitForFunction(() => location.hash.includes("mirror=yes"));
        const turned = placeIn(await visit.hash());
        assert.ok(Math.abs(turned[0] + x) < 2 && Math.abs(turned[1] - y) < 2, `${turned}, ${[x, y]}`);
        assert.equal(turned[2], number);
        assert.equal(await visit.page.textContent("#map-card h2"), name);
        await photograph(visit, "map-mirrored");
        // The way back leads to the map as it was.
        await visit.page.keyboard.press("Escape");
        await visit.step(() => visit.page.click("#back"));
        await visit.page.waitForFunction(() => !location.hash.includes("mirror=yes"));
        assert.equal(await visit.page.isChecked("#mirrored"), false);
        await visit.end();
    });

    test("browser and command make the same bytes of one family", async () => {
        const { text } = darwins();
        const { loadOlvane } = await import(`${process.env.OLVANE_SOURCES}/bindings/javascript/olvane.mjs`);
        const olvane = await loadOlvane(await engineIn(text));
        const file = olvane.readGedcom(sample("darwin-wedgwood.ged"), "darwin.ged");
        assert.deepEqual(Buffer.from(file.mapIndex()), mapBytes(text));
        file.close();
    });

    test("with the living hidden, nothing of them is in the map", async () => {
        const { path, text } = mapPage(livingFamily(), "--hide-living", "--year", "2026");
        const bytes = mapBytes(text);
        for (const secret of ["Zacharias", "Geheimrat", "Yolanda", "Versteckt"]) {
            assert.equal(bytes.includes(secret), false, secret);
            assert.equal(mapBytes(mapPage(livingFamily()).text).includes(secret), true, secret);
        }
        // Years stand as 16 bits each in sections 5 and 6; 1999 and 2001 are of the living.
        const years = new Int16Array(sectionOf(bytes, 5).buffer.slice(0));
        assert.deepEqual([...years].filter((year) => year !== 0).sort(), [1880, 1885]);
        const visit = await visitMap(path);
        await visit.end();
    });

    test("a page that ends in the middle of its map says so, and shows the family without it", async () => {
        const { text } = darwins();
        const at = text.indexOf('id="olvane-map">') + 900;
        const visit = await visitFile(fileFor(`cut-${++pages}.html`, text.slice(0, at)));
        await visit.untilFamily();
        assert.match(await visit.page.innerText("#notices"), /ends in the middle of its map/);
        await visit.end();
    });

    test("a map that was changed on its way is refused in words", async () => {
        const { text } = darwins();
        const changed = mapBytes(text);
        changed[changed.length - 40] ^= 1;
        const block = text.replace(kMap, (whole, packed) =>
            whole.replace(packed, gzipSync(changed).toString("base64")),
        );
        const visit = await visitFile(fileFor(`changed-${++pages}.html`, block));
        await visit.untilFamily();
        assert.match(await visit.page.innerText("#notices"), /damaged/);
        await visit.end();
    });

    test("a page with the map alone says what it lacks", async () => {
        const { text } = darwins();
        const visit = await visitMap(fileFor(`alone-${++pages}.html`, text.replace(/"gzip":"[^"]*"/, '"gzip":""')));
        await visit.page.focus("#map canvas");
        await visit.page.keyboard.press("Enter");
        await visit.page.waitForSelector("#notices .notice");
        assert.match(await visit.page.innerText("#notices"), /the map alone/);
        assert.equal(await visit.page.isVisible("#map canvas"), true);
        await visit.end();
    });

    test("two fingers apart come nearer, and what lies between them stays there", async () => {
        const visit = await visitMap(darwins().path, { hasTouch: true }, "#map=400,300,0.5");
        const before = await visit.hash();
        await visit.page.evaluate(() => {
            const canvas = document.querySelector("#map canvas");
            const { left, top, width, height } = canvas.getBoundingClientRect();
            const finger = (type, pointerId, dx) =>
                canvas.dispatchEvent(
                    new PointerEvent(type, {
                        pointerId,
                        button: 0,
                        clientX: left + width / 2 + dx,
                        clientY: top + height / 2,
                        bubbles: true,
                    }),
                );
            finger("pointerdown", 1, -50);
            finger("pointerdown", 2, 50);
            finger("pointermove", 1, -100);
            finger("pointermove", 2, 100);
            finger("pointerup", 1, -100);
            finger("pointerup", 2, 100);
        });
        assert.match(before, /,0\.5/);
        await visit.page.waitForFunction(() => !/,0\.5(&|$)/.test(location.hash));
        const [x, y, k] = /map=([^&]*)/
            .exec(await visit.hash())[1]
            .split(",")
            .map(Number);
        assert.ok(Math.abs(x - 400) <= 2 && Math.abs(k - 1) < 0.001, `${x},${y},${k}`);
        await visit.end();
    });

    for (const [state, settings] of [
        ["light", {}],
        ["dark", { colorScheme: "dark" }],
        ["a phone", { viewport: { width: 360, height: 740 }, hasTouch: true, isMobile: true }],
    ]) {
        test(`axe finds nothing on the map: ${state}`, async () => {
            const visit = await visitMap(darwins().path, settings);
            await visit.page.evaluate(axe.source);
            const found = await visit.page.evaluate(async () => {
                const { violations } = await window.axe.run(document, { resultTypes: ["violations"] });
                return violations.map(
                    ({ id, nodes }) =>
                        `${id}: ${nodes
                            .slice(0, 3)
                            .map((node) => node.html.slice(0, 160))
                            .join(" | ")}`,
                );
            });
            assert.deepEqual(found, []);
            if (settings.isMobile) await photograph(visit, "map-phone");
            await visit.end();
        });
    }

    test("lines to adopted children are dashed, and where lines cross one has a gap", async () => {
        const adopted = (pedigree) =>
            [
                "0 HEAD",
                "0 @A@ INDI",
                "1 SEX M",
                "1 FAMS @F@",
                "0 @B@ INDI",
                "1 SEX F",
                "1 FAMS @F@",
                "0 @C@ INDI",
                "1 FAMC @F@",
                `2 PEDI ${pedigree}`,
                "0 @D@ INDI",
                "1 FAMC @F@",
                "0 @F@ FAM",
                "1 HUSB @A@",
                "1 WIFE @B@",
                "1 CHIL @C@",
                "1 CHIL @D@",
                "0 TRLR",
            ].join("\n");
        const pieces = [];
        for (const pedigree of ["birth", "adopted"]) {
            const visit = await visitMap(mapPage(adopted(pedigree)).path, {}, "#map=128,76,2");
            pieces.push(
                await visit.page.evaluate(() => {
                    const canvas = document.querySelector("#map canvas");
                    const { width, height } = canvas;
                    const { data } = canvas.getContext("2d").getImageData(0, 0, width, height);
                    // The most pieces of one colour, but that of the page, that any column between parents and child has.
                    let most = 0;
                    for (let x = width / 2 - 300; x < width / 2 + 300; ++x) {
                        let count = 0;
                        for (let y = Math.floor(height / 2) - 38; y < height / 2 + 38; ++y) {
                            const at = (y * width + x) * 4;
                            if (data[at] < 200 && data[at - 4 * width] > 200) ++count;
                        }
                        most = Math.max(most, count);
                    }
                    return most;
                }),
            );
            await visit.end();
        }
        assert.ok(pieces[0] <= 1 && pieces[1] >= 3, pieces.join());

        // Of four couples, somebody of each marries somebody of every other: that cannot be drawn without a crossing.
        const lines = ["0 HEAD"];
        for (let f = 0; f < 4; ++f) {
            lines.push(
                `0 @H${f}@ INDI`,
                "1 SEX M",
                `0 @W${f}@ INDI`,
                "1 SEX F",
                `0 @F${f}@ FAM`,
                `1 HUSB @H${f}@`,
                `1 WIFE @W${f}@`,
            );
            for (let g = 0; g < 4; ++g) if (g !== f) lines.push(`1 CHIL @C${f}${g}@`);
        }
        for (let f = 0; f < 4; ++f)
            for (let g = 0; g < 4; ++g) if (f !== g) lines.push(`0 @C${f}${g}@ INDI`, `1 SEX ${f < g ? "M" : "F"}`);
        for (let f = 0; f < 4; ++f)
            for (let g = f + 1; g < 4; ++g) lines.push(`0 @P${f}${g}@ FAM`, `1 HUSB @C${f}${g}@`, `1 WIFE @C${g}${f}@`);
        const visit = await visitMap(
            mapPage([...lines, "0 TRLR"].join("\n")).path,
            { viewport: { width: 1900, height: 700 } },
            "#map=800,100,0.8",
        );
        const gaps = await visit.page.evaluate(() => {
            const canvas = document.querySelector("#map canvas");
            const { width, height } = canvas;
            const { data } = canvas.getContext("2d").getImageData(0, 0, width, height);
            const isLine = (x, y) => data[(y * width + x) * 4] < 200;
            const areLine = (from, to, y) =>
                Array.from({ length: to - from }, (_, i) => isLine(from + i, y)).every(Boolean);
            let gaps = 0;
            for (let y = 1; y < height; ++y)
                for (let x = 8; x + 8 < width; ++x)
                    if (
                        isLine(x, y) &&
                        !isLine(x - 1, y) &&
                        !isLine(x + 1, y) &&
                        areLine(x - 7, x - 1, y) &&
                        areLine(x + 2, x + 8, y)
                    )
                        ++gaps;
            return gaps;
        });
        assert.ok(gaps > 0, String(gaps));
        await photograph(visit, "map-crossings");
        await visit.end();
    });

    test("flights over 4,000 persons at random break nothing", async () => {
        const visit = await visitMap(mapPage(madeFamily(2000)).path);
        const times = await visit.page.evaluate(async () => {
            const canvas = document.querySelector("#map canvas");
            let seed = 11;
            const random = () => (seed = (seed * 48271) % 2147483647) / 2147483647;
            const times = [];
            for (let i = 0; i < 200; ++i) {
                const [clientX, clientY] = [1280 * random(), 60 + 700 * random()];
                const deltaY = (random() - 0.5) * 1500;
                canvas.dispatchEvent(new WheelEvent("wheel", { clientX, clientY, deltaY, cancelable: true }));
                const start = performance.now();
                await new Promise((next) => requestAnimationFrame(next));
                times.push(performance.now() - start);
            }
            return times.sort((one, other) => one - other);
        });
        // Some frames of any machine are late for reasons of its own.
        const slow = times[Math.floor(times.length * 0.9)];
        assert.ok(slow < 2000, `${slow} ms`);
        await visit.page.keyboard.press("0");
        await visit.end();
    });

    test("the map has the dark colours, and keeps still where movement is unwelcome", async () => {
        const visit = await visitMap(darwins().path, { colorScheme: "dark", reducedMotion: "reduce" });
        await becomes(() => cornerOf(visit), [0x15, 0x18, 0x1d, 255]);
        await visit.page.focus("#map canvas");
        const places = await visit.page.evaluate(async () => {
            const card = () => document.querySelector("#map-card h2").textContent;
            const before = card();
            document.querySelector("#map canvas").dispatchEvent(new KeyboardEvent("keydown", { key: "ArrowUp" }));
            return [before, card()];
        });
        assert.notEqual(places[0], places[1]);
        await visit.end();
    });
});

function sectionOf(bytes, kind) {
    for (let at = 28; at < bytes.length;) {
        const size = bytes.readUInt32LE(at + 4);
        if (bytes.readUInt32LE(at) === kind) return new Uint8Array(bytes.subarray(at + 8, at + 8 + size));
        at += 8 + 4 * Math.ceil(size / 4);
    }
    throw new Error(`no section ${kind}`);
}
