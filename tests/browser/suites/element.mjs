// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The viewer on somebody else's page: <olvane-tree>, served over http as a site would.

import assert from "node:assert/strict";
import { readFileSync } from "node:fs";
import { createServer } from "node:http";
import { join } from "node:path";
import { after, before, describe } from "node:test";
import { newContext, sample } from "../support/browser.mjs";
import { becomes } from "../support/patience.mjs";
import { test } from "../support/reported.mjs";

const kTypes = { html: "text/html", mjs: "text/javascript", ged: "text/plain" };

let server = null;
let address = "";
const files = new Map();
const asked = []; // the paths, in the order in which they were asked for

before(async () => {
    files.set("/olvane-tree.mjs", readFileSync(process.env.OLVANE_ELEMENT));
    files.set("/family.ged", sample("darwin-wedgwood.ged"));
    files.set("/example.html", readFileSync(join(process.env.OLVANE_SOURCES, "examples/javascript/element.html")));
    server = createServer(async (request, response) => {
        const path = new URL(request.url, "http://localhost").pathname;
        asked.push(path);
        const content = await files.get(path);
        response.writeHead(content ? 200 : 404, { "content-type": kTypes[path.split(".").at(-1)] ?? "text/plain" });
        response.end(content ?? "not here");
    });
    await new Promise((done) => server.listen(0, "127.0.0.1", done));
    address = `http://127.0.0.1:${server.address().port}`;
});
after(() => server?.close());

async function open(path) {
    const context = await newContext();
    const page = await context.newPage();
    const troubles = [];
    page.on("pageerror", (error) => troubles.push(String(error)));
    await page.goto(address + path);
    return { page, end: async () => (await context.close(), assert.deepEqual(troubles, [])) };
}

describe("element", () => {
    test("the example shows a family, and its events reach the page around it", async () => {
        const { page, end } = await open("/example.html");
        await page.waitForSelector("olvane-tree .box.focus");
        assert.equal(await page.locator("olvane-tree .box.focus").getAttribute("data-xref"), "I1");
        await page.locator('olvane-tree [data-xref="I2"]').first().click();
        await page.waitForFunction(() => /is selected/.test(document.querySelector("#about").textContent));
        await end();
    });

    test("the manifest states what the element has: attributes, members, events, parts and properties", async () => {
        const source = (path) => readFileSync(join(process.env.OLVANE_SOURCES, "apps/page/src", path), "utf8");
        const { declarations } = JSON.parse(source("element/custom-elements.json")).modules[0];
        const { attributes, members, events, cssParts, cssProperties } = declarations[0];
        const names = (list) => list.map(({ name }) => name).sort();
        const { page, end } = await open("/example.html");
        await page.waitForSelector("olvane-tree .box.focus");
        const found = await page.evaluate((members) => {
            const Tree = customElements.get("olvane-tree");
            const tree = document.querySelector("olvane-tree");
            const isThere = ({ kind, name, readonly, parameters = [] }) => {
                const own = Object.getOwnPropertyDescriptor(Tree.prototype, name);
                const needed = parameters.filter(({ optional }) => !optional).length;
                if (kind === "method") return typeof own?.value === "function" && own.value.length === needed;
                return Boolean(own?.get) && Boolean(own.set) === !readonly;
            };
            return {
                observed: Tree.observedAttributes,
                lacking: members.filter((one) => !isThere(one)).map(({ name }) => name),
                parts: [...tree.shadowRoot.querySelectorAll("[part]")].map((one) => one.getAttribute("part")),
            };
        }, members);
        // The wheel's rule is read when the wheel is turned.
        assert.deepEqual(names(attributes), [...found.observed, "wheel"].sort());
        assert.deepEqual(found.lacking, []);
        assert.deepEqual(names(cssParts), [...new Set(found.parts)].sort());
        const declared = source("element/treeTypes.ts").split("export interface OlvaneTreeEvents {")[1].split("\n}")[0];
        const sent = [...declared.matchAll(/^ {4}(\w+): CustomEvent/gm)].map(([, name]) => name);
        assert.deepEqual(names(events), [...sent, "error"].sort());
        const styles = source("styles/viewer.css") + source("styles/colours.css") + source("styles/controls.css");
        for (const name of names(cssProperties)) assert.ok(styles.includes(`var(${name})`), name);
        await end();
    });

    test("attributes, methods and events speak of one state", async () => {
        files.set(
            "/one.html",
            '<!doctype html><olvane-tree src="family.ged" focus="I1" style="height: 500px"></olvane-tree><script type="module" src="olvane-tree.mjs"></script>',
        );
        const { page, end } = await open("/one.html");
        await page.waitForSelector("olvane-tree .box.focus");
        const seen = await page.evaluate(async () => {
            const tree = document.querySelector("olvane-tree");
            const events = [];
            tree.addEventListener("focuschange", ({ detail }) =>
                events.push([detail.person.xref, detail.state.view, detail.byUser]),
            );
            tree.setAttribute("focus", "I5");
            tree.setAttribute("view", "pedigree");
            const isShown = tree.show({ focus: 1 });
            tree.select(12);
            return {
                events,
                isShown,
                selected: tree.selected.id,
                view: tree.state.view,
                svg: tree.saveSvg().slice(0, 60),
            };
        });
        assert.deepEqual(seen.events, [
            ["I5", "family", false],
            ["I5", "pedigree", false],
            ["I1", "pedigree", false],
        ]);
        assert.equal(seen.isShown, true);
        assert.equal(seen.selected, 12);
        assert.equal(seen.view, "pedigree");
        assert.match(seen.svg, /^<\?xml/);
        await end();
    });

    test("an attribute has boxes and lines say more, and no more without it", async () => {
        files.set(
            "/facts.html",
            '<!doctype html><olvane-tree src="family.ged" focus="I1" show="dates,marriage" style="height: 500px"></olvane-tree><script type="module" src="olvane-tree.mjs"></script>',
        );
        const { page, end } = await open("/facts.html");
        await page.waitForSelector("olvane-tree .box.focus");
        const years = () => page.locator("olvane-tree .box.focus .years").allTextContents();
        assert.deepEqual(await years(), ["* 12 Feb 1809", "\u2020 19 Apr 1882"]);
        const shown = (change) =>
            page.evaluate((change) => {
                const tree = document.querySelector("olvane-tree");
                if (change === null) tree.removeAttribute("show");
                else tree.setAttribute("show", change);
                return [...tree.state.show];
            }, change);
        assert.deepEqual(await shown("occupation, hats"), ["occupation"]);
        assert.deepEqual(await shown(null), []);
        assert.deepEqual(await years(), ["* 1809  \u2020 1882"]);
        await end();
    });

    test("ten of them on one page know nothing of each other", async () => {
        const trees = Array.from(
            { length: 10 },
            (_, i) => `<olvane-tree src="family.ged" focus="I${i + 1}" style="height: 300px"></olvane-tree>`,
        );
        files.set("/ten.html", `<!doctype html>${trees.join("")}<script type="module" src="olvane-tree.mjs"></script>`);
        const { page, end } = await open("/ten.html");
        await page.waitForFunction(() => [...document.querySelectorAll("olvane-tree")].every((tree) => tree.state));
        const focuses = () => page.$$eval("olvane-tree", (all) => all.map((tree) => tree.state.focus));
        assert.deepEqual(await focuses(), [1, 2, 3, 4, 5, 6, 7, 8, 9, 10]);
        await page.evaluate(() => document.querySelectorAll("olvane-tree")[3].show({ focus: 20 }));
        assert.deepEqual(await focuses(), [1, 2, 3, 20, 5, 6, 7, 8, 9, 10]);
        await end();
    });

    test("what changes in the family is shown while focus, selection and place stay", async () => {
        const { page, end } = await open("/one.html");
        await page.waitForSelector("olvane-tree .box.focus");
        const seen = await page.evaluate(async () => {
            const tree = document.querySelector("olvane-tree");
            tree.show({ focus: 12 });
            tree.select(1);
            tree.zoomBy(0.7);
            const look = () => [
                tree.state.focus,
                tree.selected.xref,
                ...Object.values(tree.sight).map((value) => Math.round(value * 100)),
            ];
            const before = look();
            const text = await (await fetch("family.ged")).text();
            const changed = text.replace(/1 NAME Charles Robert .Darwin./, "1 NAME Charles Renamed /Darwin/");
            await tree.update(new TextEncoder().encode(changed));
            const refused = await tree.update(new TextEncoder().encode("no family")).catch((error) => error.name);
            return { before, after: look(), name: tree.selected.name, isChanged: changed !== text, refused };
        });
        assert.equal(seen.isChanged, true);
        assert.deepEqual(seen.after, seen.before);
        assert.equal(seen.name, "Charles Renamed Darwin");
        assert.match(seen.refused, /Error/);
        await end();
    });

    test("a program's own family is drawn, and each change to it while its picture stays in place", async () => {
        files.set(
            "/own.html",
            `<!doctype html><olvane-tree focus="17" style="height: 500px"></olvane-tree><script type="module">
            import { sharedEngine } from "./olvane-tree.mjs";
            const olvane = await sharedEngine();
            window.family = olvane.family({ persons: [
                { id: 17, sex: "m", given: "Karl", surname: "Berg", birth: "1850-05-03", occupation: "smith" },
                { id: 42, sex: "f", given: "Anna", surname: "Holm" },
                { id: 5, sex: "f", given: "Ida", surname: "Berg", father: 17, mother: 42 },
                { id: 9, sex: "m", given: "Nils", surname: "Berg", father: 17, mother: 42 },
            ] });
            document.querySelector("olvane-tree").data = family;
            </script>`,
        );
        const { page, end } = await open("/own.html");
        await page.waitForSelector("olvane-tree .box.focus");
        await page.evaluate(() => {
            const tree = document.querySelector("olvane-tree");
            tree.zoomBy(1.2);
            tree.select(3);
        });
        // Where boxes stand on the screen, what they say, who is selected; once nothing moves.
        const look = () =>
            page.evaluate(async () => {
                const tree = document.querySelector("olvane-tree");
                const shown = () => {
                    const boxes = [...tree.shadowRoot.querySelectorAll(".boxes > g[data-xref]")];
                    const named = boxes.filter(({ dataset }) => dataset.xref !== "");
                    const areaOf = (box) => box.querySelector(".frame").getBoundingClientRect();
                    const focus = areaOf(tree.shadowRoot.querySelector(".box.focus"));
                    return {
                        place: [focus.x, focus.y, focus.width].map((value) => Math.round(value)),
                        xrefs: named.map(({ dataset }) => dataset.xref).sort(),
                        words: named.map((box) => box.querySelector(".frame").getAttribute("aria-label")).join("; "),
                        selected: tree.selected.xref,
                    };
                };
                let last = "";
                for (let calm = 0; calm < 4;) {
                    await new Promise((next) => setTimeout(next, 60));
                    const now = JSON.stringify(shown());
                    calm = now === last ? calm + 1 : 0;
                    last = now;
                }
                return JSON.parse(last);
            });
        // A change is shown a little later.
        const change = async (run, isShown) => {
            await page.evaluate(run);
            await becomes(async () => isShown(await look()), true);
            return look();
        };
        const first = await look();
        assert.deepEqual(first.xrefs, ["17", "42", "5", "9"]);
        assert.match(first.words, /Karl Berg, born 1850/);
        assert.equal(first.selected, "5");
        const renamed = await change(
            () => window.family.setNames(9, [{ kind: "given", text: "Olof" }]),
            ({ words }) => words.includes("Olof"),
        );
        assert.match(renamed.words, /Olof/);
        assert.doesNotMatch(renamed.words, /Nils/);
        const grown = await change(
            () => {
                window.family.addPerson({ id: 3, sex: "f", father: 17, mother: 42 });
                window.family.setNames(3, [{ text: "Eva Berg" }]);
            },
            ({ words }) => words.includes("Eva Berg"),
        );
        assert.deepEqual(grown.xrefs, ["17", "3", "42", "5", "9"]);
        assert.match(grown.words, /Eva Berg/);
        const smaller = await change(
            () => window.family.removePerson(9),
            ({ xrefs }) => !xrefs.includes("9"),
        );
        assert.deepEqual(smaller.xrefs, ["17", "3", "42", "5"]);
        for (const later of [renamed, grown, smaller]) {
            assert.deepEqual(later.place, first.place);
            assert.equal(later.selected, "5");
        }
        const views = await page.evaluate(() => {
            const tree = document.querySelector("olvane-tree");
            const names = ["family", "pedigree", "near", "ancestors", "descendants", "hourglass", "relatives", "fan"];
            return [...names, "everybody", "kinship"].filter(
                (view) => !tree.show({ view, to: 3 }) || !/Karl/.test(tree.saveSvg()),
            );
        });
        assert.deepEqual(views, []);
        await end();
    });

    test("in the chart of everybody those who are there stay in place when somebody is added", async () => {
        files.set(
            "/everybody.html",
            `<!doctype html><olvane-tree view="everybody" focus="7" style="height: 500px"></olvane-tree><script type="module">
            import { sharedEngine } from "./olvane-tree.mjs";
            window.olvane = await sharedEngine();
            const [a, b] = [{ father: 1, mother: 2 }, { father: 4, mother: 6 }];
            window.persons = [{ id: 1 }, { id: 2 }, { id: 4, ...a }, { id: 5, ...a }, { id: 6 }, { id: 7, ...b }];
            window.grown = [{ id: 9, ...a }, ...persons];
            document.querySelector("olvane-tree").data = olvane.family({ persons });
            </script>`,
        );
        const { page, end } = await open("/everybody.html");
        // How far each box stands from that of the focus, in widths of a box.
        const places = () =>
            page.evaluate(() => {
                const tree = document.querySelector("olvane-tree");
                const frames = [...tree.shadowRoot.querySelectorAll(".boxes > g[data-xref] .frame")];
                const areaOf = (frame) => frame.getBoundingClientRect();
                const focus = areaOf(tree.shadowRoot.querySelector(".box.focus .frame"));
                return frames.map((frame) => [
                    frame.closest("g[data-xref]").dataset.xref,
                    ((areaOf(frame).x - focus.x) / focus.width).toFixed(2),
                ]);
            });
        const shown = (count) =>
            page.waitForFunction(
                (boxes) =>
                    document.querySelector("olvane-tree").shadowRoot.querySelectorAll(".boxes > g").length === boxes,
                count,
            );
        await shown(6);
        const before = new Map(await places());
        await page.evaluate(() =>
            document
                .querySelector("olvane-tree")
                .update(new TextEncoder().encode(olvane.family({ persons: grown }).gedcom())),
        );
        await shown(7);
        const moved = (await places()).filter(([xref, x]) => before.has(xref) && before.get(xref) !== x);
        assert.deepEqual(
            moved.map(([xref]) => xref),
            ["5"],
        ); // makes room beside its new sibling
        await page.evaluate(() =>
            document
                .querySelector("olvane-tree")
                .open(new TextEncoder().encode(olvane.family({ persons: grown }).gedcom())),
        );
        await shown(7);
        const again = (await places()).filter(([xref, x]) => before.has(xref) && before.get(xref) !== x);
        assert.ok(again.length > moved.length, `again ${again.join("; ")}`);
        await end();
    });

    test("a family that loses everybody, or that a program no longer shows, breaks nothing", async () => {
        const { page, end } = await open("/own.html");
        await page.waitForSelector("olvane-tree .box.focus");
        const seen = await page.evaluate(async () => {
            const tree = document.querySelector("olvane-tree");
            const boxes = () => tree.shadowRoot.querySelectorAll(".boxes > g").length;
            const until = async (isSo) => {
                while (!isSo()) await new Promise((next) => setTimeout(next, 10));
            };
            for (const id of window.family.ids) window.family.removePerson(id);
            await until(() => boxes() === 0);
            window.family.addPerson({ id: 8, sex: "f" });
            await until(() => boxes() > 0);
            const again = boxes();
            tree.data = null;
            window.family.addPerson({ id: 9, sex: "f", mother: 8 });
            await new Promise((next) => setTimeout(next, 100));
            return { again, released: boxes() };
        });
        assert.equal(seen.released, seen.again);
        await end();
    });

    test("a program draws boxes itself, and what is read out of them stays", async () => {
        const { page, end } = await open("/one.html");
        await page.waitForSelector("olvane-tree .box.focus");
        const seen = await page.evaluate(() => {
            const tree = document.querySelector("olvane-tree");
            tree.renderBox = (person, { width, height }) => {
                if (person.sex !== "female") return null;
                const text = document.createElementNS("http://www.w3.org/2000/svg", "text");
                text.textContent = `${person.xref} ${width}x${height}`;
                return text;
            };
            const box = (xref) => tree.shadowRoot.querySelector(`[data-xref="${xref}"]`);
            const [his, hers] = [box("I1"), tree.shadowRoot.querySelector(".box.female")];
            return {
                hers: hers.querySelector("text").textContent === `${hers.dataset.xref} 118x104`,
                label: hers.querySelector(".frame").getAttribute("aria-label").length > 5,
                his: his.querySelectorAll(".name").length > 0,
            };
        });
        assert.deepEqual(seen, { hers: true, label: true, his: true });
        await end();
    });

    test("of two files the one that is asked for last is shown, though the other one comes later", async () => {
        let answer = null;
        files.set("/late.ged", new Promise((come) => (answer = come)));
        files.set(
            "/two.html",
            '<!doctype html><olvane-tree src="late.ged" style="height: 500px"></olvane-tree><script type="module" src="olvane-tree.mjs"></script>',
        );
        const { page, end } = await open("/two.html");
        const first = page.evaluate(async () => {
            await customElements.whenDefined("olvane-tree");
            window.failures = [];
            const tree = document.querySelector("olvane-tree");
            tree.addEventListener("error", ({ message }) => failures.push(message));
            const late = tree.load("late.ged").catch((error) => error.name);
            await tree.load("family.ged");
            window.isLoaded = true;
            return late;
        });
        await page.waitForFunction(() => window.isLoaded);
        answer("0 HEAD\n0 @X@ INDI\n1 NAME Ada /Late/\n0 TRLR\n");
        assert.equal(await first, "AbortError");
        const later = await page.evaluate(async () => {
            const tree = document.querySelector("olvane-tree");
            await fetch("late.ged");
            return { length: tree.family.persons.length, failures };
        });
        assert.deepEqual(later, { length: 142, failures: [] });
        await end();
    });

    test("src is asked for once, and again when it changed while the viewer stood in no page", async () => {
        for (const name of ["once", "again"]) files.set(`/${name}.ged`, sample("darwin-wedgwood.ged"));
        files.set(
            "/once.html",
            '<!doctype html><olvane-tree src="once.ged"></olvane-tree><script type="module" src="olvane-tree.mjs"></script>',
        );
        const { page, end } = await open("/once.html");
        await page.waitForFunction(() => document.querySelector("olvane-tree").state);
        await page.evaluate(() => {
            window.tree = document.querySelector("olvane-tree");
            tree.remove();
            document.body.append(tree);
            tree.remove();
            tree.setAttribute("src", "again.ged");
            document.body.append(tree);
        });
        await page.waitForFunction(() => tree.family.file.name === "again.ged");
        assert.deepEqual(
            asked.filter((path) => /once\.ged|again\.ged/.test(path)),
            ["/once.ged", "/again.ged"],
        );
        await end();
    });

    test("a viewer that stands in no page follows no changes, and shows them when it does again", async () => {
        const { page, end } = await open("/own.html");
        await page.waitForFunction(() => document.querySelector("olvane-tree").state);
        const seen = await page.evaluate(async () => {
            const tree = document.querySelector("olvane-tree");
            const shown = () => [...tree.family.persons.map(({ given }) => given)].includes("Olof");
            const written = () => new Promise((next) => setTimeout(next));
            tree.remove();
            let texts = 0;
            const { gedcom } = window.family;
            window.family.gedcom = function () {
                ++texts;
                return gedcom.call(this);
            };
            window.family.setNames(9, [{ kind: "given", text: "Olof" }]);
            await written();
            const away = [texts, shown()];
            document.body.append(tree);
            await written();
            const back = [texts, shown()];
            tree.remove();
            document.body.append(tree);
            await written();
            return { away, back, unchanged: texts };
        });
        assert.deepEqual(seen, { away: [0, false], back: [1, true], unchanged: 1 });
        await end();
    });

    test("viewers that were removed are released, though the family that they showed stays", async () => {
        const { page, end } = await open("/own.html");
        await page.waitForFunction(() => document.querySelector("olvane-tree").state);
        await page.evaluate(async () => {
            window.removed = [];
            for (let count = 0; count < 20; ++count) {
                const tree = document.createElement("olvane-tree");
                const shown = new Promise((done) => tree.addEventListener("focuschange", done, { once: true }));
                tree.data = window.family;
                document.body.append(tree);
                await shown;
                tree.remove();
                window.removed.push(new WeakRef(tree));
            }
        });
        const session = await page.context().newCDPSession(page);
        // The last one may still be in the hands of the browser.
        await becomes(async () => {
            await session.send("HeapProfiler.collectGarbage");
            return page.evaluate(() => window.removed.filter((one) => one.deref()).length <= 1);
        }, true);
        await end();
    });

    test("the colours of the system are back when the attribute for others is gone", async () => {
        const { page, end } = await open("/one.html");
        await page.waitForFunction(() => document.querySelector("olvane-tree").state);
        const themes = await page.evaluate(() => {
            const tree = document.querySelector("olvane-tree");
            const seen = [tree.dataset.theme];
            tree.setAttribute("theme", "dark");
            seen.push(tree.dataset.theme);
            tree.removeAttribute("theme");
            return [...seen, tree.dataset.theme];
        });
        assert.deepEqual(themes, [undefined, "dark", undefined]);
        await end();
    });

    test("the types state every event and method of the manifest", () => {
        const source = (path) => readFileSync(join(process.env.OLVANE_SOURCES, path), "utf8");
        const { declarations } = JSON.parse(source("apps/page/src/element/custom-elements.json")).modules[0];
        const types = source("bindings/javascript/package/olvane-tree.d.mts");
        const [, events] = types.match(/interface OlvaneTreeEventMap \{([^]*?)\n\}/);
        const [, members] = types.match(/declare class OlvaneTree [^{]*\{([^]*?)\n\}/);
        for (const { name } of declarations[0].events) assert.match(events, new RegExp(`^ {4}${name}: `, "m"));
        for (const { kind, name, parameters = [] } of declarations[0].members) {
            const line = members.split("\n").find((line) => new RegExp(`^ {4}(readonly )?${name}[(:]`).test(line));
            assert.ok(line, `${name} is not declared`);
            if (kind !== "method") continue;
            const [, declared] = line.match(/\((.*)\): /);
            const names = declared.split(/, (?=\w+\??:)/).map((one) => one.match(/^\w*/)[0]);
            assert.deepEqual(
                names.filter(Boolean),
                parameters.map((one) => one.name),
                name,
            );
        }
    });

    test("a file that cannot be had leaves the element empty and reports why", async () => {
        files.set(
            "/none.html",
            '<!doctype html><olvane-tree></olvane-tree><script type="module" src="olvane-tree.mjs"></script>',
        );
        const { page, end } = await open("/none.html");
        const reason = await page.evaluate(async () => {
            await customElements.whenDefined("olvane-tree");
            return document
                .querySelector("olvane-tree")
                .load("nowhere.ged")
                .catch((error) => error.message);
        });
        assert.match(reason, /nowhere\.ged: 404/);
        const event = await page.evaluate(async () => {
            const tree = document.querySelector("olvane-tree");
            const failed = new Promise((done) => tree.addEventListener("error", (error) => done(error.message)));
            tree.setAttribute("src", "nowhere.ged");
            return failed;
        });
        assert.match(event, /404/);
        await end();
    });
});
