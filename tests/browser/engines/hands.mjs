// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// Three ways to do the same with the page: with a mouse at a desk, with a finger on a phone, and with the keys alone.
// Each click, tap or key is counted.

import { Walk } from "./Walk.mjs";

const kMostTabs = 120;

export class Mouse extends Walk {
    static name = "mouse";
    static size = { width: 1280, height: 800 };

    /** Presses a button. */
    act(selector) {
        return this.click(selector);
    }

    /** Selects the box of a person. keys lead there from the focus. */
    select(xref, _keys) {
        return this.click(`#tree [data-xref="${xref}"] .frame`);
    }

    open(xref, _keys) {
        return this.click(`#tree [data-xref="${xref}"] .frame`, 2);
    }

    /** Sets a switch. */
    check(selector) {
        return this.act(selector);
    }

    async search(text) {
        await this.act("#search");
        await this.type(text);
        await this.act("#search-list [role=option]");
    }

    /** Sets a choice, as from the list that the browser opens, whose entries no driver reaches. */
    async choose(selector, value) {
        this.clicks += 2;
        await this.set(selector, value);
    }

    async set(selector, value) {
        const set = (selector, value) => {
            const choice = one(selector);
            choice.value = value;
            for (const kind of ["input", "change"]) choice.dispatchEvent(new Event(kind, { bubbles: true }));
        };
        await this.window.evaluate(set, selector, value);
        await this.still();
    }
}

export class Finger extends Mouse {
    static name = "touch";
    static size = { width: 390, height: 844 };

    async click(selector, times = 1) {
        const place = await this.placeOf(selector);
        this.clicks += times;
        await this.window.tapAt(place, times);
        await this.still();
    }
}

export class Keyboard extends Walk {
    static name = "keyboard";
    static size = Mouse.size;

    async act(selector) {
        await this.tabTo(selector);
        await this.press("Enter");
    }

    async select(_xref, keys) {
        await this.tabTo("#tree .frame");
        for (const key of keys) await this.press(key);
    }

    async open(xref, keys) {
        await this.select(xref, keys);
        await this.press("Enter");
    }

    async check(selector) {
        await this.tabTo(selector);
        await this.press(" ");
    }

    async search(text) {
        await this.press("/");
        await this.type(text);
        await this.until(() => one("#search-list [role=option]") !== null);
        await this.press("Enter");
    }

    async choose(selector, value) {
        await this.tabTo(selector);
        this.keys += 1;
        await Mouse.prototype.set.call(this, selector, value);
    }

    async tabTo(selector) {
        for (let tabs = 0; tabs < kMostTabs; ++tabs) {
            const isThere = (selector) => {
                const outer = document.activeElement;
                return (outer?.shadowRoot?.activeElement ?? outer)?.matches(selector) ?? false;
            };
            if (await this.window.evaluate(isThere, selector)) return;
            this.keys += 1;
            await this.window.press("Tab");
        }
        throw new Error(`${this.window.name}: the keys do not lead to ${selector}`);
    }
}

export const kHands = [Mouse, Finger, Keyboard];
