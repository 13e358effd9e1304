// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// A slow and unsteady machine, made on purpose: no test may fail on it. OLVANE_DISTURB holds any of these words:
//
//     cpu=20      the page computes at a twentieth of its speed
//     late=SEED   what arrives on its own (frames, timers, answers of workers, files, storage) comes late at random
//     stall=SEED  page and test stand still at random, for up to three seconds
//     order=SEED  the suites run in another order

const kWords = new Map((process.env.OLVANE_DISTURB ?? "").split(/[ ,]+/).map((word) => word.split("=")));
const kStallShare = 0.01; // of the test's commands
const kMostStall = 3000; // ms

const random = randomFrom(Number(kWords.get("stall") ?? 0));
let pages = 0;

export function suitesInOrder(suites) {
    if (!kWords.has("order")) return suites;
    const next = randomFrom(Number(kWords.get("order")));
    return suites
        .map((suite) => [next(), suite])
        .sort(([one], [other]) => one - other)
        .map(([, suite]) => suite);
}

/** Disturbs what is done in a browser's context, where that is asked for. */
export async function disturb(context) {
    if (kWords.has("stall")) stallCommands(context._connection);
    if (kWords.has("late") || kWords.has("stall")) {
        const seed = Number(kWords.get("late") ?? 0) * 7919 + Number(kWords.get("stall") ?? 0) * 104729 + ++pages;
        await context.addInitScript(disturbPage, { seed, isLate: kWords.has("late"), stalls: kWords.has("stall") });
    }
    if (kWords.has("cpu")) {
        const rate = Number(kWords.get("cpu"));
        const newPage = context.newPage.bind(context);
        context.newPage = async () => {
            const page = await newPage();
            const session = await context.newCDPSession(page);
            await session.send("Emulation.setCPUThrottlingRate", { rate });
            return page;
        };
    }
}

// Each command of the test may wait before it is sent.
function stallCommands(connection) {
    if (connection.isDisturbed) return;
    connection.isDisturbed = true;
    const send = connection.sendMessageToServer.bind(connection);
    connection.sendMessageToServer = async (...parts) => {
        // Playwright's own messages must come in their order.
        if (/^(dispose|updateSubscription|waitForEventInfo)/.test(parts[1])) return send(...parts);
        const time = random() < kStallShare ? kMostStall * random() : random() < 0.1 ? 150 * random() : 0;
        if (time > 0) await new Promise((next) => setTimeout(next, time));
        return send(...parts);
    };
}

function randomFrom(seed) {
    let state = (seed % 2147483646) + 1;
    return () => (state = (state * 48271) % 2147483647) / 2147483647;
}

// Runs in the page before its own scripts.
function disturbPage({ seed, isLate, stalls }) {
    let state = (seed % 2147483646) + 1;
    const random = () => (state = (state * 48271) % 2147483647) / 2147483647;
    for (let i = 0; i < 5; ++i) random();
    const later = window.setTimeout.bind(window);
    const lateBy = () => (random() < 0.6 ? 0 : random() < 0.9 ? 120 * random() : 900 * random());
    const late = () => new Promise((next) => later(next, lateBy()));
    if (stalls) {
        const stall = () => {
            const end = performance.now() + (random() < 0.7 ? 300 : 3000) * random();
            while (performance.now() < end);
            later(stall, 4000 * random());
        };
        later(stall, 4000 * random());
    }
    if (!isLate) return;

    window.setTimeout = (run, time = 0, ...parts) => later(run, time + lateBy(), ...parts);
    const frame = window.requestAnimationFrame.bind(window);
    const cancel = window.cancelAnimationFrame.bind(window);
    const cancelled = new Set();
    let frames = 1e6;
    window.requestAnimationFrame = (run) => {
        const by = random() < 0.9 ? 0 : 300 * random();
        if (by === 0) return frame(run);
        const id = ++frames;
        later(() => cancelled.delete(id) || frame(run), by);
        return id;
    };
    window.cancelAnimationFrame = (id) => (id > 1e6 ? cancelled.add(id) : cancel(id));

    const delayed = (owner, name) => {
        const own = owner[name];
        owner[name] = async function (...parts) {
            await late();
            const result = await own.apply(this, parts);
            await late();
            return result;
        };
    };
    delayed(window, "fetch");
    delayed(Blob.prototype, "arrayBuffer");
    delayed(HTMLImageElement.prototype, "decode");
    const toBlob = HTMLCanvasElement.prototype.toBlob;
    HTMLCanvasElement.prototype.toBlob = function (done, ...parts) {
        toBlob.call(this, (blob) => later(() => done(blob), lateBy()), ...parts);
    };

    // Messages stay in their order.
    const post = Worker.prototype.postMessage;
    Worker.prototype.postMessage = function (...parts) {
        this.before = (this.before ?? Promise.resolve()).then(late).then(() => post.apply(this, parts));
    };
    const delaySetter = (owner, name, applies) => {
        const { get, set } = Object.getOwnPropertyDescriptor(owner, name);
        Object.defineProperty(owner, name, {
            get,
            set(act) {
                const isFor = applies(this) && typeof act === "function";
                set.call(this, isFor ? (event) => later(() => act.call(this, event), lateBy()) : act);
            },
        });
    };
    delaySetter(IDBRequest.prototype, "onsuccess", (request) => request instanceof IDBOpenDBRequest);
    delaySetter(IDBTransaction.prototype, "oncomplete", () => true);
}
