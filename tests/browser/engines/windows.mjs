// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A window in each of three browser engines, with the few acts that the tasks are made of. Chromium and Firefox are
// driven by puppeteer (Firefox over WebDriver BiDi), WebKit's small browser by plain WebDriver.

import { spawn } from "node:child_process";
import { existsSync } from "node:fs";
import { constants, inflateSync } from "node:zlib";
import puppeteer from "puppeteer-core";

const kPatience = 60_000; // ms, for one answer of a driver
const kSize = { width: 1280, height: 800 };
const kElement = "element-6066-11e4-a52e-4f735466cecf";
const kChromium = process.env.OLVANE_CHROMIUM ?? "/usr/bin/chromium";
const kFirefox = "/usr/bin/firefox-esr";
const kWebKitDriver = "/usr/bin/WebKitWebDriver";
const kMiniBrowsers = ["4.1", "4.0"].map((version) => `/usr/lib/x86_64-linux-gnu/webkit2gtk-${version}/MiniBrowser`);

const kKeys = {
    Enter: "\uE007",
    Escape: "\uE00C",
    ArrowUp: "\uE013",
    ArrowDown: "\uE015",
    ArrowLeft: "\uE012",
    ArrowRight: "\uE014",
    Tab: "\uE004",
};

// Pages are objects of their own, which may lie in packed streams.
function sheetsOf(pdf) {
    const text = pdf.toString("latin1");
    const packed = [...text.matchAll(/stream\r?\n([\s\S]*?)endstream/g)].map(([, bytes]) => {
        try {
            return inflateSync(Buffer.from(bytes, "latin1"), { finishFlush: constants.Z_SYNC_FLUSH }).toString(
                "latin1",
            );
        } catch {
            return "";
        }
    });
    return [text, ...packed].join("\n").match(/\/Type\s*\/Page\b(?!s)/g)?.length ?? 0;
}

class PuppeteerWindow {
    static async open(name, settings) {
        const window = new PuppeteerWindow();
        window.name = name;
        window.browser = await puppeteer.launch({ headless: true, defaultViewport: kSize, ...settings });
        window.process = window.browser.process();
        window.page = await window.browser.newPage();
        await window.page.setViewport(kSize);
        return window;
    }

    goto(address) {
        return this.page.goto(address);
    }

    evaluate(run, ...values) {
        return this.page.evaluate(run, ...values);
    }

    async clickAt({ x, y }, times = 1) {
        await this.page.mouse.click(x, y, { count: times });
    }

    async tapAt({ x, y }, times = 1) {
        for (let i = 0; i < times; ++i) await this.page.touchscreen.tap(x, y);
    }

    resize(size) {
        return this.page.setViewport(size);
    }

    async type(text) {
        await this.page.keyboard.type(text);
    }

    async press(key) {
        await this.page.keyboard.press(key);
    }

    screenshot(path) {
        return this.page.screenshot({ path });
    }

    /** How many sheets of paper the page prints on. */
    async sheets() {
        return sheetsOf(Buffer.from(await this.page.pdf({ preferCSSPageSize: true })));
    }

    close() {
        return this.browser.close();
    }
}

class WebDriverWindow {
    static async open(name) {
        const window = new WebDriverWindow();
        window.name = name;
        const port = 4500 + Math.floor(Math.random() * 400);
        window.process = spawn(kWebKitDriver, [`--port=${port}`], { stdio: "ignore" });
        window.base = `http://127.0.0.1:${port}`;
        await window.untilListening();
        const binary = kMiniBrowsers.find((path) => existsSync(path));
        const options = { binary, args: ["--automation"] };
        const { sessionId } = await window.send("POST", "/session", {
            capabilities: { alwaysMatch: { browserName: "MiniBrowser", "webkitgtk:browserOptions": options } },
        });
        window.base += `/session/${sessionId}`;
        await window.send("POST", "/window/rect", { x: 0, y: 0, ...kSize });
        return window;
    }

    async untilListening() {
        for (let tries = 0; tries < 100; ++tries) {
            try {
                await fetch(this.base + "/status");
                return;
            } catch {
                await new Promise((next) => setTimeout(next, 100));
            }
        }
        throw new Error("WebKitWebDriver does not answer");
    }

    async send(method, path, body) {
        const signal = AbortSignal.timeout(kPatience);
        const response = await fetch(this.base + path, { method, body: body && JSON.stringify(body), signal });
        const { value } = await response.json();
        if (value?.error) throw new Error(`${value.error}: ${value.message}`);
        return value;
    }

    goto(address) {
        return this.send("POST", "/url", { url: address });
    }

    async evaluate(run, ...values) {
        const script = `const done = arguments[arguments.length - 1];
            Promise.resolve((${run})(...[].slice.call(arguments, 0, -1))).then((value) => done({ value }), (error) => done({ error: String(error) }));`;
        const answer = await this.send("POST", "/execute/async", { script, args: values });
        if (answer.error) throw new Error(answer.error);
        return answer.value;
    }

    clickAt(place, times = 1) {
        return this.pointer("mouse", place, times);
    }

    tapAt(place, times = 1) {
        return this.pointer("touch", place, times);
    }

    async pointer(pointerType, { x, y }, times) {
        const clicks = Array.from({ length: times }, () => [
            { type: "pointerDown", button: 0 },
            { type: "pointerUp", button: 0 },
        ]).flat();
        const move = { type: "pointerMove", x: Math.round(x), y: Math.round(y), duration: 0 };
        await this.send("POST", "/actions", {
            actions: [{ type: "pointer", id: pointerType, parameters: { pointerType }, actions: [move, ...clicks] }],
        });
    }

    resize(size) {
        return this.send("POST", "/window/rect", { x: 0, y: 0, ...size });
    }

    async type(text) {
        for (const letter of text) await this.press(letter);
    }

    async press(key) {
        const value = kKeys[key] ?? key;
        const actions = [
            { type: "keyDown", value },
            { type: "keyUp", value },
        ];
        await this.send("POST", "/actions", { actions: [{ type: "key", id: "keyboard", actions }] });
    }

    async screenshot(path) {
        const { writeFileSync } = await import("node:fs");
        writeFileSync(path, Buffer.from(await this.send("GET", "/screenshot"), "base64"));
    }

    /** This driver prints nothing. */
    async sheets() {
        return null;
    }

    async close() {
        await this.send("DELETE", "").catch(() => {});
        this.process.kill();
    }
}

const kFlags = [
    "--no-sandbox",
    "--disable-gpu",
    "--disable-quic",
    "--no-first-run",
    "--disable-background-networking",
    "--disable-component-update",
    "--disable-sync",
];

/** What can be had on this machine: a name, and how a window of it is opened. */
export const kEngines = [
    {
        name: "chromium",
        isHere: existsSync(kChromium),
        open: () => PuppeteerWindow.open("chromium", { executablePath: kChromium, args: kFlags }),
    },
    {
        name: "firefox",
        isHere: existsSync(kFirefox),
        open: () =>
            PuppeteerWindow.open("firefox", {
                browser: "firefox",
                executablePath: kFirefox,
                protocol: "webDriverBiDi",
            }),
    },
    {
        name: "webkit",
        isHere: existsSync(kWebKitDriver) && kMiniBrowsers.some((path) => existsSync(path)),
        open: () => WebDriverWindow.open("webkit"),
    },
];
