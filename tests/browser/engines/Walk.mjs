// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// What a person does on the page, in any engine, with every click and key counted.

const kPatience = 90_000; // ms; what takes longer hangs

export class Walk {
    clicks = 0;
    keys = 0;

    constructor(window) {
        this.window = window;
    }

    /** Gives the page its helpers, after it was loaded. */
    async begin(address) {
        await this.window.goto(address);
        await this.window.evaluate(() => {
            const viewer = () => document.querySelector("olvane-tree")?.shadowRoot;
            window.one = (selector) => document.querySelector(selector) ?? viewer()?.querySelector(selector) ?? null;
            window.all = (selector) =>
                [document, viewer()].flatMap((tree) => [...(tree?.querySelectorAll(selector) ?? [])]);
        });
        await this.until(() => one("#tree .box.focus") !== null);
        await this.still();
    }

    async until(run, ...values) {
        for (const end = Date.now() + kPatience; Date.now() < end;) {
            if (await this.window.evaluate(run, ...values)) return;
            await new Promise((next) => setTimeout(next, 50));
        }
        throw new Error(`${this.window.name}: waited in vain for ${run}`);
    }

    /** Until nothing in the picture moves. */
    async still() {
        await this.window.evaluate(async () => {
            const look = () =>
                [
                    one("#tree .world")?.getAttribute("transform"),
                    ...all("#tree .boxes > g").map((box) => box.getAttribute("transform")),
                ].join();
            let last = look();
            for (let calm = 0; calm < 4;) {
                await new Promise((next) => setTimeout(next, 40));
                const now = look();
                calm = now === last ? calm + 1 : 0;
                last = now;
            }
        });
    }

    /** The middle of the first of them that is drawn, brought into sight. */
    async placeOf(selector) {
        const place = await this.window.evaluate((selector) => {
            const part = all(selector).find((one) => one.getClientRects().length > 0);
            if (part && !part.closest("#tree")) part.scrollIntoView({ block: "nearest" });
            const area = part?.getBoundingClientRect();
            return area ? { x: area.left + area.width / 2, y: area.top + area.height / 2 } : null;
        }, selector);
        if (!place) throw new Error(`${this.window.name}: there is no ${selector}`);
        return place;
    }

    async click(selector, times = 1) {
        const place = await this.placeOf(selector);
        this.clicks += times;
        await this.window.clickAt(place, times);
        await this.still();
    }

    async type(text) {
        this.keys += text.length;
        await this.window.type(text);
    }

    async press(key) {
        this.keys += 1;
        await this.window.press(key);
        await this.still();
    }

    text(selector) {
        return this.window.evaluate((selector) => one(selector)?.textContent ?? "", selector);
    }

    focus() {
        return this.window.evaluate(() => one("#tree .box.focus")?.getAttribute("data-xref") ?? "");
    }

    /** All boxes and lines of the picture, in sight or not, for a comparison between engines. */
    picture() {
        return this.window.evaluate(() => {
            const { picture } = document.querySelector("olvane-tree").viewer;
            const boxes = picture.boxes.map(({ key, x, y, width, height }) => [key, x, y, width, height].join(" "));
            const lines = picture.families.flatMap(({ family }) =>
                family.lines.map(({ x1, y1, x2, y2 }) => [x1, y1, x2, y2].join(" ")),
            );
            return [...boxes, ...lines].join("\n");
        });
    }
}
