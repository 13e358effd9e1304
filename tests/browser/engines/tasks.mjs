// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What is to be done, in the words of the person who does it, by mouse, finger or keys. What a task returns is the same in every engine.

import assert from "node:assert/strict";
import { archiveOf } from "../support/archive.mjs";
import { gedcom, lineOf } from "../support/families.mjs";

const kLarge = lineOf(20_000);
const kPixel = "iVBORw0KGgoAAAANSUhEUgAAAAEAAAABCAYAAAAfFcSJAAAADUlEQVR42mNk+M9QDwADhgGAWjR9awAAAABJRU5ErkJggg==";
const kArchive = archiveOf([
    [
        "gedcom.ged",
        Buffer.from(
            gedcom(
                "0 @I1@ INDI",
                "1 NAME Ada /Frame/",
                "1 OBJE",
                "2 FILE portrait.png",
                "3 FORM png",
                "2 TITL Her portrait",
            ),
        ),
    ],
    ["portrait.png", Buffer.from(kPixel, "base64")],
]).toString("base64");

async function fatherOfFocus(walk) {
    const xref = await walk.window.evaluate(() => {
        const { family, state } = document.querySelector("olvane-tree");
        return family.person(family.person(state.focus).father).xref;
    });
    return { xref, keys: ["ArrowUp"] };
}

// On a phone the panel is a sheet that is drawn up.
async function drawPanel(walk) {
    if (walk.constructor.name === "touch") await walk.act(".handle");
}

function seeing(view) {
    return async (walk) => {
        await walk.act("#views-button");
        await walk.act(`#choose-${view}`);
        await walk.until((view) => location.hash.includes(`view=${view}`), view);
        return walk.picture();
    };
}

// What the page hands to the browser's downloads: its name, and its text or its kind.
async function saved(walk, button, choice) {
    await walk.window.evaluate(() => {
        window.saved = null;
        HTMLAnchorElement.prototype.click = function () {
            const { download, href } = this;
            void fetch(href)
                .then((answer) => answer.blob())
                .then(async (blob) => {
                    window.saved = [download, blob.type, blob.type.includes("svg") ? await blob.text() : ""].join("\n");
                })
                .catch((error) => (window.saved = download + "\n" + String(error.name)));
        };
    });
    await walk.act("#file-button");
    if (choice) await walk.check(choice);
    await walk.act(button);
    await walk.until(() => window.saved !== null);
    return walk.window.evaluate(() => window.saved.split("\n")[0]);
}

// Of the Darwins, with Charles as the focus.
export const kTasks = {
    "read about somebody in sight": async (walk) => {
        const { xref, keys } = await fatherOfFocus(walk);
        const focus = await walk.focus();
        await walk.select(xref, keys);
        assert.equal(await walk.focus(), focus);
        const name = await walk.text("#side-panel h2");
        assert.match(name, /^Robert Waring/);
        return name;
    },
    "make them the focus": async (walk) => {
        const { xref, keys } = await fatherOfFocus(walk);
        await walk.open(xref, keys);
        await walk.until((xref) => one("#tree .box.focus")?.getAttribute("data-xref") === xref, xref);
        return walk.picture();
    },
    "find somebody by name and year, and go there": async (walk) => {
        await walk.search("francis galton 1822");
        await walk.until(() => one("#tree .box.focus")?.getAttribute("data-xref") !== "I1");
        return walk.text("#side-panel h2");
    },
    "see how two are related": async (walk) => {
        const { xref, keys } = await fatherOfFocus(walk);
        await walk.select(xref, keys);
        await drawPanel(walk);
        await walk.act("#how-related");
        await walk.until(() => location.hash.includes("view=kinship"));
        return walk.picture();
    },
    "list every way between the two": async (walk) => {
        const { xref, keys } = await fatherOfFocus(walk);
        await walk.select(xref, keys);
        await drawPanel(walk);
        await walk.act("#ways summary");
        await walk.until(() => one("#ways a") !== null);
        return walk.text("#ways");
    },
    "see all descendants": seeing("descendants"),
    "fold the descendants of somebody": async (walk) => {
        await seeing("descendants")(walk);
        if (walk.constructor.name === "keyboard") {
            await walk.press("Escape");
            await walk.select("", []);
            await walk.press("d");
        } else {
            await walk.act("#views-button"); // closes the list of views, which may lie over the box
            await walk.act('#tree .box.focus .fold[role][data-branch="down"]');
        }
        await walk.until(() => location.hash.includes("fold="));
        return walk.picture();
    },
    "see all ancestors": seeing("ancestors"),
    "see the hourglass": seeing("hourglass"),
    "see the fan": seeing("fan"),
    "see everybody": seeing("everybody"),
    "see the map": async (walk) => {
        await walk.act("#views-button");
        await walk.act("#choose-map");
        await walk.until(() => location.hash.includes("map=") && one("#map canvas") !== null);
        return walk.text("#map-place");
    },
    "see two generations of descendants more": async (walk) => {
        await walk.act("#views-button");
        await walk.act("#choose-descendants");
        await walk.until(() => location.hash.includes("view=descendants"));
        await walk.choose("#depth-down", "2");
        await walk.until(() => location.hash.includes("down=2"));
        return walk.picture();
    },
    "see on a poster how large its names are": async (walk) => {
        await walk.act("#file-button");
        await walk.act("#print-sheets");
        await walk.until(() => one("#print-dialog").open);
        await walk.choose("#sheet-rows", "2");
        await walk.choose("#sheet-columns", "3");
        await walk.until(() => all(".sheet-preview img").length > 1);
        return walk.text("#sheet-message");
    },
    "exchange right and left": async (walk) => {
        await walk.act("#views-button");
        await walk.check("#mirrored");
        await walk.until(() => location.hash.includes("mirror=yes"));
        return walk.picture();
    },
    "save as SVG what is in sight": (walk) => saved(walk, "#save-svg", "#save-in-sight"),
    "save the picture as SVG": (walk) => saved(walk, "#save-svg"),
    "save the picture as PNG": (walk) => saved(walk, "#save-png"),
    "copy a link to what is seen": async (walk) => {
        await walk.window.evaluate(() => {
            const keep = (text) => Promise.resolve((window.copied = text));
            Object.defineProperty(navigator, "clipboard", { value: { writeText: keep }, configurable: true });
        });
        await walk.act("#file-button");
        await walk.act("#copy-link");
        await walk.until(() => window.copied !== undefined);
        return walk.window.evaluate(() => window.copied.replace(/^[^#]*|sight=[^&]*/g, ""));
    },
    "read the page in Spanish": async (walk) => {
        await walk.act("#options-button");
        await walk.choose("#language", "es");
        await walk.until(() => document.documentElement.lang === "es");
        return walk.text("#side-panel .kinship");
    },
    "go back": async (walk) => {
        await walk.act("#views-button");
        await walk.act("#choose-descendants");
        await walk.until(() => location.hash.includes("view=descendants"));
        if (walk.constructor.name === "keyboard") await walk.press("Escape");
        await walk.act("#back");
        await walk.until(() => !location.hash.includes("view=descendants"));
        return walk.picture();
    },
};

// Of a file with notes, sources and names.
export const kDetailTasks = {
    "read the sources of a fact": async (walk) => {
        await walk.until(() => one("#side-panel .sources summary") !== null);
        await drawPanel(walk);
        await walk.act("#side-panel .sources summary");
        await walk.until(() => one("#side-panel .sources").open);
        return walk.text("#side-panel section.facts");
    },
};

// Of an archive with photographs.
export const kMediaTasks = {
    "look at a photograph, and close it": async (walk) => {
        await walk.window.evaluate((archive) => {
            const transfer = new DataTransfer();
            transfer.items.add(new File([Uint8Array.from(atob(archive), (one) => one.charCodeAt(0))], "frame.gdz"));
            document.body.dispatchEvent(
                new DragEvent("drop", { dataTransfer: transfer, bubbles: true, cancelable: true }),
            );
        }, kArchive);
        await walk.until(() => one("#side-panel .photograph img")?.complete === true);
        await drawPanel(walk);
        await walk.act("#side-panel .photograph");
        await walk.until(() => one(".enlarged")?.open === true);
        const title = await walk.text(".enlarged p");
        await walk.act(".enlarged button");
        await walk.until(() => !one(".enlarged")?.open);
        return title;
    },
};

// Of a file in which somebody died before birth.
export const kRemarkTasks = {
    "read the remarks, and go to the person of one": async (walk) => {
        await walk.act("#diagnostics-button");
        await walk.act("#diagnostics .to-person");
        await walk.until(() => !one("#diagnostics").open);
        assert.equal(await walk.focus(), "I2");
        return walk.text("#side-panel h2");
    },
};

// What takes no hand, or more than one.
export const kHandless = {
    "see everybody as a map, and follow kin by keys": async (walk) => {
        await walk.click("#views-button");
        await walk.click("#choose-map");
        await walk.until(() => location.hash.startsWith("#map=") && one("#map-card h2") !== null);
        await walk.window.evaluate(() => one("#map canvas").focus());
        const before = await walk.text("#map-card h2");
        await walk.press("ArrowUp");
        const parent = await walk.text("#map-card h2");
        assert.notEqual(parent, before);
        await walk.press("ArrowDown");
        assert.equal(await walk.text("#map-card h2"), before);
        // What is drawn is not the page's colour alone.
        const colours = await walk.window.evaluate(() => {
            const { width, height } = one("#map canvas");
            const { data } = one("#map canvas").getContext("2d").getImageData(0, 0, width, height);
            const seen = new Set();
            for (let at = 0; at < data.length; at += 4) seen.add((data[at] << 16) | (data[at + 1] << 8) | data[at + 2]);
            return seen.size;
        });
        assert.ok(colours > 3, `${colours} colours`);
        return `${before}, ${parent}`;
    },
    "find somebody on the map and go to their family": async (walk) => {
        await walk.click("#views-button");
        await walk.click("#choose-map");
        await walk.until(() => location.hash.startsWith("#map="));
        await walk.click("#search");
        await walk.type("josiah 1730");
        await walk.press("Enter");
        await walk.until(() => /Josiah/.test(one("#map-card h2")?.textContent));
        await walk.window.evaluate(() => one("#map canvas").focus());
        await walk.press("Enter");
        await walk.until(() => /Josiah/.test(one("#side-panel h2")?.textContent));
        return walk.focus();
    },
    "print on one sheet": async (walk) => {
        const sheets = await walk.window.sheets();
        assert.ok(sheets === null || sheets === 1, `${sheets} sheets`);
        return "";
    },
    "open a file of 20,000 persons and wait for its picture": async (walk) => {
        await walk.window.evaluate((text) => {
            const transfer = new DataTransfer();
            transfer.items.add(new File([text], "long.ged"));
            document.body.dispatchEvent(
                new DragEvent("drop", { dataTransfer: transfer, bubbles: true, cancelable: true }),
            );
        }, kLarge);
        await walk.until(() => document.title === "long");
        return walk.text(".bar .title");
    },
};
