// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Charles Darwin (I1), his wife and cousin Emma Wedgwood (I2), his parents Robert (I12) and Susannah (I55), his
// grandfather Erasmus (I5), his sister Caroline (I34), his son Francis (I116).

import assert from "node:assert/strict";
import { describe } from "node:test";
import { kTwoAtOnce, photograph, visitDarwins } from "../support/browser.mjs";
import { becomes } from "../support/patience.mjs";
import { test } from "../support/reported.mjs";

describe("walking", kTwoAtOnce, () => {
    test("a click selects: the panel is about the person, and the picture stays", async () => {
        const visit = await visitDarwins();
        await visit.fit();
        const before = await visit.placing();
        await visit.box("I34").click();
        await visit.still();
        assert.equal(await visit.focus(), "I1");
        await visit.assertPlacedAs(before);
        assert.equal(await visit.page.innerText("#side-panel h2"), "Caroline Sarah Darwin");
        assert.doesNotMatch(await visit.hash(), /person=I34/);
        await visit.click("#make-focus");
        assert.equal(await visit.focus(), "I34");
        await visit.end();
    });

    test("a double click on a person makes them the focus, of the picture, the address and the panel", async () => {
        const visit = await visitDarwins();
        assert.equal(await visit.focus(), "I1");
        await visit.fit();
        await visit.open("I34");
        assert.equal(await visit.focus(), "I34");
        assert.match(await visit.hash(), /person=I34/);
        assert.equal(await visit.page.innerText("#side-panel h2"), "Caroline Sarah Darwin");
        assert.equal(await visit.handle("I34").getAttribute("aria-current"), "true");
        assert.match(await visit.page.locator("#tree").getAttribute("aria-label"), /Caroline Sarah Darwin/);
        assert.match(await visit.page.locator("#live").innerText(), /Caroline Sarah Darwin/);
        await visit.end();
    });

    test("arrow keys lead to parents, children and neighbours, and Enter makes a person the focus", async () => {
        const visit = await visitDarwins();
        await visit.stand("I1");
        await visit.press("ArrowUp");
        assert.ok(["I12", "I55"].includes(await visit.keysOn()));
        await visit.press("ArrowDown");
        const below = await visit.label(await visit.keysOn());
        assert.match(below, /Darwin/);
        await visit.stand("I1");
        await visit.press("ArrowDown");
        const child = await visit.keysOn();
        assert.ok(
            ["I107", "I109", "I110", "I111", "I113", "I115", "I116", "I120", "I123", "I125"].includes(child),
            child,
        );
        await visit.press("ArrowRight");
        const neighbour = await visit.keysOn();
        assert.notEqual(neighbour, child);
        await visit.press("ArrowLeft");
        assert.equal(await visit.keysOn(), child);
        await visit.press("Enter");
        assert.equal(await visit.focus(), child);
        assert.equal(await visit.keysOn(), child, "the keys stay on the new focus");
        await visit.press("Home");
        assert.equal(await visit.keysOn(), child);
        await visit.end();
    });

    test("from one end of a row, the arrow passes every box of it in order", async () => {
        const visit = await visitDarwins("#person=I116");
        await visit.stand("I116");
        let last = 0;
        const seen = new Set();
        for (let steps = 0; steps < 40; ++steps) {
            const before = await visit.keysOn();
            await visit.page.keyboard.press("ArrowRight");
            const now = await visit.keysOn();
            if (now === before) break;
            assert.ok(!seen.has(now), `${now} twice`);
            seen.add(now);
            const places = await visit.places();
            const x = Number(/ (-?\d+),/.exec(places.find((place) => place.startsWith(now + " ")))[1]);
            assert.ok(x > last, `${now} lies to the right`);
            last = x;
        }
        assert.ok(seen.size >= 3);
        await visit.end();
    });

    test("hovering over a person or a line lights up the lines of the families, and no others", async () => {
        const visit = await visitDarwins("#person=I1");
        const { page } = visit;
        const lit = () => page.evaluate(() => all("#tree .family-lines.lit").map((group) => group.dataset.family));
        const ofSelected = await lit();
        assert.ok(ofSelected.length >= 2, "those of the focus to begin with: with the parents, and with the wife");
        const areOthersLit = (known) => {
            const now = all("#tree .family-lines.lit").map((group) => group.dataset.family);
            return now.length > 0 && now.join() !== known;
        };
        // Greetings may lie over lines.
        await visit.dismiss();
        await visit.box("I12").hover({ force: true });
        await page.waitForFunction(areOthersLit, ofSelected.join());
        const ofHer = await lit();
        // In the middle of a line that belongs to another family than any of these.
        const other = await page.evaluate(
            (known) => {
                for (const line of all("#tree .family-lines > .line")) {
                    const family = line.parentElement.dataset.family;
                    if (known.includes(family)) continue;
                    const { x, y } = line
                        .getPointAtLength(line.getTotalLength() / 2)
                        .matrixTransform(line.getScreenCTM());
                    const root = one("#tree").getRootNode();
                    if (root.elementFromPoint(x, y) === line) return { family, x, y };
                }
                return null;
            },
            [...ofSelected, ...ofHer],
        );
        assert.ok(other, "a line of another family is in sight");
        await page.mouse.move(other.x, other.y);
        await becomes(lit, [other.family]);
        await page.mouse.move(3, 3);
        await becomes(lit, ofSelected);
        await visit.end();
    });

    test("boxes glide, and arrive where a picture without a glide has them", async () => {
        const still = await visitDarwins("#person=I12");
        const wanted = await still.places();
        await still.end();

        const visit = await visitDarwins("#person=I1", { reducedMotion: "no-preference" });
        // The page is given a clock and frames of its own, so that a busy machine changes nothing.
        const glide = await visit.page.evaluate(() => {
            const own = { requestAnimationFrame, cancelAnimationFrame, now: performance.now };
            let time = performance.now();
            let frames = new Map();
            performance.now = () => time;
            window.requestAnimationFrame = (run) => (
                frames.set((frames.last = (frames.last ?? 0) + 1), run),
                frames.last
            );
            window.cancelAnimationFrame = (frame) => frames.delete(frame);
            const drawFrame = () => {
                const due = frames;
                frames = new Map();
                frames.last = due.last;
                time += 16;
                for (const run of due.values()) run(time);
            };
            const placeOf = (xref) => {
                const { left, top } = one(`#tree .boxes > [data-xref="${xref}"] .frame`).getBoundingClientRect();
                return [left, top];
            };
            const farApart = (one, other) => Math.hypot(one[0] - other[0], one[1] - other[1]);
            const before = placeOf("I12");
            for (const detail of [1, 2])
                one('#tree [data-xref="I12"] .frame').dispatchEvent(
                    new MouseEvent("click", { bubbles: true, composed: true, detail }),
                );
            const start = placeOf("I12");
            const mother = [placeOf("I55")];
            for (const began = time; time - began < 900;) {
                drawFrame();
                mother.push(placeOf("I55"));
            }
            const steps = mother
                .slice(1)
                .map((place, i) => farApart(place, mother[i]))
                .filter((step) => step > 0.5);
            const { requestAnimationFrame: frame, cancelAnimationFrame: cancel, now } = own;
            Object.assign(window, { requestAnimationFrame: frame, cancelAnimationFrame: cancel });
            performance.now = now;
            return { jump: farApart(before, start), steps: steps.length, way: farApart(mother[0], mother.at(-1)) };
        });
        assert.ok(glide.jump < 5, "the clicked box begins where it stood");
        assert.ok(glide.way > 50 && glide.steps >= 3, JSON.stringify(glide));
        await visit.still();
        // What is in sight differs with the camera; the places of what both show do not.
        const arrived = await visit.places();
        const both = arrived.filter((place) => wanted.includes(place));
        const names = (places) => new Set(places.map((place) => place.replace(/ \S+$/, "")));
        const common = [...names(arrived)].filter((name) => names(wanted).has(name));
        assert.ok(common.length > 20);
        assert.equal(names(both).size, common.length);
        await visit.end();
    });

    test("back and forward lead along the way, by our buttons and by the browser's", async () => {
        const visit = await visitDarwins();
        assert.ok(await visit.page.isDisabled("#back"));
        await visit.fit();
        await visit.open("I34");
        await visit.click("#view-pedigree");
        assert.equal(await visit.page.locator("#view-pedigree").getAttribute("aria-pressed"), "true");
        await visit.step(() => visit.page.click("#back"));
        assert.equal(await visit.page.locator("#view-family").getAttribute("aria-pressed"), "true");
        assert.equal(await visit.focus(), "I34");
        await visit.step(() => visit.page.goBack());
        assert.equal(await visit.focus(), "I1");
        assert.ok(await visit.page.isDisabled("#back"));
        await visit.step(() => visit.page.click("#forward"));
        assert.equal(await visit.focus(), "I34");
        await visit.step(() => visit.page.goForward());
        assert.match(await visit.hash(), /view=pedigree/);
        assert.ok(await visit.page.isDisabled("#forward"));
        await visit.end();
    });

    test("a link leads to a person, a view and its options", async () => {
        const visit = await visitDarwins("#person=I90&view=pedigree&generations=3");
        assert.equal(await visit.focus(), "I90");
        const columns = new Set((await visit.places()).map((place) => / (-?\d+),/.exec(place)[1]));
        assert.equal(columns.size, 3);
        await visit.follow("#person=I1&hide=cousins,siblings");
        assert.equal(await visit.focus(), "I1");
        assert.ok(!(await visit.shows("I35")), "no sister");
        await visit.end();
    });

    test("in the pedigree, parents stand to the right of their child", async () => {
        const visit = await visitDarwins();
        await visit.click("#view-pedigree");
        const [focus, father, mother] = await Promise.all(["I1", "I12", "I55"].map((xref) => visit.middleOf(xref)));
        assert.ok(father.x > focus.x && mother.x > focus.x);
        assert.ok(father.y < focus.y && mother.y > focus.y);
        await photograph(visit, "pedigree");
        await visit.end();
    });

    test("the panel lists facts and kinship, and its relatives are links", async () => {
        const visit = await visitDarwins();
        const { page } = visit;
        assert.match(await page.innerText("#side-panel"), /Birth\s+12 Feb 1809/);
        assert.match(await page.innerText("#side-panel"), /Death\s+19 Apr 1882/);
        await page.click('#side-panel a[data-person-id="2"]');
        await visit.still();
        assert.equal(await visit.focus(), "I1", "reading about a relative loses no place");
        assert.equal(await page.innerText("#side-panel h2"), "Emma Wedgwood");
        await visit.click("#make-focus");
        assert.equal(await visit.focus(), "I2");
        await visit.fit();
        await visit.stand("I1");
        assert.match(await page.innerText("#side-panel .kinship"), /husband and first cousin/);
        const words = [];
        for (const xref of ["I36", "I34", "I58", "I113"]) {
            await visit.stand(xref);
            words.push(await page.innerText("#side-panel .kinship"));
        }
        assert.match(words[0], /Emma Wedgwood.*: brother-in-law \(husband's brother\) and first cousin/);
        assert.match(words[1], /: sister-in-law .* and first cousin/);
        assert.match(words[2], /: father$/);
        assert.match(words[3], /: son$/);
        await visit.end();
    });

    test("a person chosen in the panel has the keys, too", async () => {
        const visit = await visitDarwins();
        await visit.page.focus('#side-panel a[href*="person=I12"]');
        await visit.press("Enter");
        assert.equal(await visit.focus(), "I1");
        assert.equal(await visit.keysOn(), "I12");
        await visit.press("Enter");
        assert.equal(await visit.focus(), "I12");
        await visit.end();
    });

    test("a button that has come to its end hands the keys to the other", async () => {
        const visit = await visitDarwins();
        const holder = () => visit.page.evaluate(() => holder().id);
        await visit.goTo("Emma Wedgwood 1808");
        await visit.page.focus("#back");
        await visit.press("Enter");
        await visit.page.waitForFunction(() => one("#back").disabled);
        assert.equal(await holder(), "forward");
        await visit.click("#view-pedigree");
        await visit.click("#options-button");
        await visit.page.focus("#generations-fewer");
        for (let i = 0; i < 3; ++i) await visit.press("Enter");
        assert.equal(await visit.page.innerText("#generations"), "2");
        assert.equal(await holder(), "generations-more");
        await visit.end();
    });

    test("Alt and the arrows go back and forward", async () => {
        const visit = await visitDarwins();
        await visit.goTo("Emma Wedgwood 1808");
        await visit.press("Alt+ArrowLeft");
        await visit.page.waitForFunction(() => one("#tree .box.focus")?.getAttribute("data-xref") === "I1");
        await visit.press("Alt+ArrowRight");
        await visit.page.waitForFunction(() => one("#tree .box.focus")?.getAttribute("data-xref") === "I2");
        await visit.end();
    });

    test("in the pedigree exactly those who have relatives out of the picture have a mark", async () => {
        const visit = await visitDarwins("#person=I1&view=pedigree&generations=3");
        await visit.fit();
        const marked = await visit.page.$$eval("#tree .box:has(.badge)", (boxes) =>
            boxes.map((box) => [box.dataset.xref, box.querySelector(".badge text").textContent]),
        );
        const counts = Object.fromEntries(marked);
        assert.deepEqual(counts, {
            // Children and their spouses' children; Emma's parents are not Charles's.
            ...{ I2: "+2", I107: "+1", I111: "+1", I113: "+5", I116: "+5", I120: "+2", I123: "+4" },
            // The father has five more children; the mother the same five.
            ...{ I12: "+5", I55: "+5" },
            // In the last column parents are out of the picture, too.
            ...{ I5: "+17", I6: "+6", I52: "+9", I54: "+8" },
        });
        await visit.end();
    });

    test("each box is read out with name, years and kinship", async () => {
        const visit = await visitDarwins();
        await visit.fit();
        assert.match(await visit.label("I2"), /^Emma Wedgwood, 1808–1896, wife and first cousin/);
        assert.match(await visit.label("I5"), /^Erasmus Darwin, 1731–1802, grandfather \(father's father\)/);
        assert.match(await visit.label("I24"), /half uncle \(father's half brother\)/);
        assert.equal(await visit.handle("I2").getAttribute("role"), "button");
        await visit.end();
    });

    test("who has relatives out of the picture has a mark, and a double click leads to them", async () => {
        const visit = await visitDarwins("#person=I1&hide=cousins,greatGrandparents");
        const marked = await visit.page.$$eval("#tree .box:has(.badge)", (boxes) =>
            boxes.map((box) => box.getAttribute("data-xref")),
        );
        assert.ok(marked.includes("I5"), "Erasmus has parents who are not shown");
        assert.match(await visit.label("I5"), /more relatives? not shown/);
        assert.ok(!(await visit.shows("I3")));
        await visit.open("I5");
        assert.ok(await visit.shows("I3"), "his father");
        await visit.end();
    });

    test("an unknown parent has a place that is named", async () => {
        const visit = await visitDarwins("#person=I17&view=pedigree");
        const labels = await visit.labels();
        assert.ok(labels.includes("Unknown mother of Elizabeth Collier"), labels.join());
        await visit.end();
    });

    test("the picture is moved and zoomed by hand, wheel, keys and buttons", async () => {
        const visit = await visitDarwins();
        const { page } = visit;
        await visit.dismiss();
        const before = await visit.placing();
        await page.mouse.move(300, 600);
        await visit.wheel(-240);
        const near = await visit.placing();
        assert.ok(near.k > before.k);
        await page.mouse.move(420, 640);
        await page.mouse.down();
        await page.mouse.move(500, 600, { steps: 4 });
        await page.mouse.up();
        const moved = await visit.placing();
        assert.ok(
            Math.abs(moved.x - near.x - 80) < 2 && Math.abs(moved.y - near.y + 40) < 2,
            JSON.stringify([near, moved]),
        );
        assert.equal(await visit.focus(), "I1", "a drag is no click");
        await visit.click("#zoom-out");
        assert.ok((await visit.placing()).k < moved.k);
        await visit.click("#fit");
        const sizes = await page.evaluate(() => {
            const tree = one("#tree").getBoundingClientRect();
            const boxes = [...all("#tree .frame")].map((box) => box.getBoundingClientRect());
            return boxes.every(
                (box) =>
                    box.left >= tree.left &&
                    box.right <= tree.right &&
                    box.top >= tree.top &&
                    box.bottom <= tree.bottom,
            );
        });
        assert.ok(sizes, "everything is in sight");
        await visit.stand("I1");
        const fitted = await visit.placing();
        await visit.press("+");
        assert.ok((await visit.placing()).k > fitted.k);
        await visit.press("Shift+ArrowLeft");
        await visit.press("0");
        assert.ok(Math.abs((await visit.placing()).k - fitted.k) < 0.001);
        await visit.end();
    });

    test("the way back to the focus leads near enough to read it", async () => {
        const visit = await visitDarwins();
        await visit.fit();
        const far = await visit.placing();
        await visit.click("#home");
        assert.ok((await visit.placing()).k > 2 * far.k);
        assert.equal(await visit.keysOn(), "I1");
        const { x, y } = await visit.middleOf("I1");
        assert.ok(x > 0 && x < 940 && y > 56 && y < 800, `${x} ${y}`);
        await visit.end();
    });

    test("a window of another size has the same in its middle", async () => {
        const visit = await visitDarwins();
        const middle = async () => {
            const stage = await visit.page.locator("#tree").boundingBox();
            const focus = await visit.middleOf("I1");
            return [focus.x - stage.x - stage.width / 2, focus.y - stage.y - stage.height / 2];
        };
        const [x, y] = await middle();
        for (const size of [
            { width: 1100, height: 500 },
            { width: 500, height: 900 },
            { width: 1280, height: 800 },
        ]) {
            await visit.resize(size);
            const [newX, newY] = await middle();
            assert.ok(Math.abs(newX - x) < 2 && Math.abs(newY - y) < 2, `${size.width}: ${newX - x}, ${newY - y}`);
        }
        await visit.end();
    });

    test("quick clicks on a zoom button add up", async () => {
        const visit = await visitDarwins("#person=I1", { reducedMotion: "no-preference" });
        const before = await visit.placing();
        await visit.page.evaluate(() => {
            for (let i = 0; i < 3; ++i) one("#zoom-in").click();
        });
        await visit.still();
        assert.ok(Math.abs((await visit.placing()).k / before.k - 1.35 ** 3) < 0.01);
        await visit.end();
    });

    test("the picture in small leads to its far ends, and is gone while everything is in sight", async () => {
        const visit = await visitDarwins();
        const { page } = visit;
        await visit.dismiss();
        const before = await visit.placing();
        const { x, y, width, height } = await page.locator(".overview svg").boundingBox();
        await page.mouse.click(x + width - 4, y + height / 2);
        await visit.still();
        const after = await visit.placing();
        assert.ok(after.x < before.x - 500, "the right end has come into sight");
        assert.equal(after.k, before.k);
        await visit.fit();
        assert.ok(!(await page.isVisible(".overview")));
        await visit.end();
    });

    test("two fingers pinch", async () => {
        const visit = await visitDarwins("#person=I1", { hasTouch: true });
        const session = await visit.context.newCDPSession(visit.page);
        const touch = (type, ...xs) =>
            session.send("Input.dispatchTouchEvent", { type, touchPoints: xs.map((x, id) => ({ x, y: 400, id })) });
        const before = await visit.placing();
        await touch("touchStart", 300, 400);
        for (const spread of [20, 40, 60, 80]) await touch("touchMove", 300 - spread, 400 + spread);
        await touch("touchEnd");
        await becomes(async () => (await visit.placing()).k > before.k * 1.5, true);
        await visit.end();
    });
});
