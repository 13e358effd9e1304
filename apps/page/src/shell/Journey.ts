// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The way through the family so far, kept in the browser's own history: its buttons, and ours, go back and
// forward.

interface Step {
    readonly olvane: number;
    readonly family: number;
}

const kOwnFamily = 0; // that the page itself holds; one opened later has the time of its opening

export class Journey {
    private step = 0;
    private last = 0;
    private first = 0;
    private family = kOwnFamily;
    private address = "";
    private readonly steps: string[] = []; // where the browser's history is not ours to fill

    // goTo receives an address that the browser went to. keepsSteps: they are kept here, since the browser's history
    // belongs to the page around the frame that this one lies in.
    constructor(
        private readonly goTo: (address: string) => void,
        private readonly keepsSteps: boolean,
    ) {
        window.addEventListener("popstate", (event) => this.arrived(event.state));
    }

    get canGoBack(): boolean {
        return this.step > this.first;
    }

    get canGoForward(): boolean {
        return this.step < this.last;
    }

    // The address that the way begins at. Before it lies at most what was there before the page, with a family
    // of its own, was loaded again: the way through another family does not lead into this one.
    begin(address: string, isOwnFamily: boolean): void {
        const here = this.keepsSteps ? null : stepOf(history.state);
        this.family = isOwnFamily ? kOwnFamily : Date.now();
        this.step = this.last = here?.olvane ?? 0;
        this.first = isOwnFamily && here?.family === kOwnFamily ? 0 : this.step;
        this.write("replaceState", address);
    }

    add(address: string): void {
        this.last = ++this.step;
        this.write(this.keepsSteps ? "replaceState" : "pushState", address);
    }

    // Corrects the address of the place where we are.
    replace(address: string): void {
        this.write("replaceState", address);
    }

    back(): void {
        if (!this.canGoBack) return;
        if (this.keepsSteps) this.stepBy(-1);
        else history.back();
    }

    forward(): void {
        if (!this.canGoForward) return;
        if (this.keepsSteps) this.stepBy(1);
        else history.forward();
    }

    private stepBy(count: number): void {
        this.step += count;
        this.write("replaceState", this.steps[this.step]!);
        this.goTo(this.address);
    }

    private write(how: "pushState" | "replaceState", address: string): void {
        this.address = address;
        this.steps[this.step] = address;
        try {
            history[how]({ olvane: this.step, family: this.family } satisfies Step, "", address);
        } catch {
            // Some browsers allow no history in a file that lies on disk; all else goes on without it.
        }
    }

    // An address typed by hand has no step of ours and comes behind the one before. One of a family that was
    // open before names persons of that family, so there everything stays as it is.
    private arrived(state: unknown): void {
        const step = stepOf(state);
        if (step) {
            this.step = step.olvane;
            this.first = Math.min(this.first, this.step);
            this.write("replaceState", step.family === this.family ? location.hash : this.address);
        } else {
            this.last = ++this.step;
            this.write("replaceState", location.hash);
        }
        this.goTo(this.address);
    }
}

function stepOf(state: unknown): Step | null {
    return typeof (state as Step | null)?.olvane === "number" ? (state as Step) : null;
}
