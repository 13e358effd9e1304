// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The way through a family in a history that behaves as a browser's: entries with a state and an address, of which those
// ahead are dropped when one is pushed.

import "./viewOptions";
import assert from "node:assert/strict";
import { beforeEach, test } from "node:test";
import { Journey } from "../src/shell/Journey";

interface Entry {
    state: unknown;
    address: string;
}

class FakeHistory {
    entries: Entry[] = [{ state: null, address: "" }];
    at = 0;
    arrived: (event: { state: unknown }) => void = () => {};

    get state(): unknown {
        return this.entries[this.at]!.state;
    }
    pushState(state: unknown, _title: string, address: string): void {
        this.entries.splice(++this.at, Infinity, { state, address });
    }
    replaceState(state: unknown, _title: string, address: string): void {
        this.entries[this.at] = { state, address };
    }
    go(steps: number): void {
        this.at += steps;
        this.arrived({ state: this.state });
    }
    back(): void {
        this.go(-1);
    }
    forward(): void {
        this.go(1);
    }
    // An address typed by hand.
    type(address: string): void {
        this.pushState(null, "", address);
        this.arrived({ state: null });
    }
}

let browser: FakeHistory;
let visited: string[];

function journey(keepsSteps = false): Journey {
    return new Journey((address) => visited.push(address), keepsSteps);
}

beforeEach(() => {
    browser = new FakeHistory();
    visited = [];
    Object.assign(globalThis, {
        history: browser,
        window: { addEventListener: (_name: string, act: FakeHistory["arrived"]) => (browser.arrived = act) },
        location: {
            get hash() {
                return browser.entries[browser.at]!.address;
            },
        },
    });
});

test("steps lead back and forward in the browser's own history", () => {
    const way = journey();
    way.begin("#1", true);
    assert.ok(!way.canGoBack && !way.canGoForward);
    way.add("#2");
    way.add("#3");
    way.back();
    assert.deepEqual([visited, way.canGoBack, way.canGoForward], [["#2"], true, true]);
    way.back();
    assert.deepEqual([way.canGoBack, way.canGoForward], [false, true]);
    way.back();
    assert.deepEqual(visited, ["#2", "#1"]);
    way.forward();
    assert.deepEqual(visited, ["#2", "#1", "#2"]);
});

test("a step from the middle drops what lay ahead", () => {
    const way = journey();
    way.begin("#1", true);
    way.add("#2");
    way.back();
    way.add("#3");
    assert.ok(!way.canGoForward);
    assert.deepEqual(
        browser.entries.map(({ address }) => address),
        ["#1", "#3"],
    );
});

test("an address typed by hand is a step like any other", () => {
    const way = journey();
    way.begin("#1", true);
    browser.type("#person=I7");
    assert.deepEqual(visited, ["#person=I7"]);
    assert.ok(way.canGoBack);
    way.back();
    assert.deepEqual(visited, ["#person=I7", "#1"]);
});

test("the way back does not lead into a family that was open before", () => {
    const way = journey();
    way.begin("#1", true);
    way.add("#2");
    way.begin("#other", false);
    assert.ok(!way.canGoBack);
    browser.back();
    assert.deepEqual(visited, ["#other"]);
});

test("in a frame the steps are kept by the page and its history is left alone", () => {
    const way = journey(true);
    way.begin("#1", true);
    way.add("#2");
    way.add("#3");
    assert.equal(browser.entries.length, 1);
    way.back();
    way.back();
    way.forward();
    assert.deepEqual(visited, ["#2", "#1", "#2"]);
    assert.equal(browser.entries[0]!.address, "#2");
});

test("a corrected address is no step", () => {
    const way = journey();
    way.begin("#1", true);
    way.replace("#1b");
    assert.ok(!way.canGoBack);
    assert.equal(browser.entries[0]!.address, "#1b");
});

test("a page that may keep no history goes on without one", () => {
    browser.replaceState = browser.pushState = () => {
        throw new Error("refused");
    };
    const way = journey();
    way.begin("#1", true);
    way.add("#2");
    assert.ok(way.canGoBack);
});
