// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

// The way through the family so far, kept in the browser's own history: its buttons, and ours, go back and
// forward.

interface Step {
    readonly olvane: number;
}

export class Journey {
    private step = 0;
    private last = 0;

    // goTo is told an address that the browser went to.
    constructor(private readonly goTo: (address: string) => void) {
        window.addEventListener("popstate", (event) => this.arrived(event.state));
    }

    get canGoBack(): boolean {
        return this.step > 0;
    }

    get canGoForward(): boolean {
        return this.step < this.last;
    }

    // The address that the way begins at; nothing lies before it but what was there before the page was
    // loaded again.
    begin(address: string): void {
        this.step = this.last = stepOf(history.state) ?? 0;
        this.write("replaceState", address);
    }

    add(address: string): void {
        this.last = ++this.step;
        this.write("pushState", address);
    }

    // Corrects the address of the place where we are.
    replace(address: string): void {
        this.write("replaceState", address);
    }

    back(): void {
        if (this.canGoBack) history.back();
    }

    forward(): void {
        if (this.canGoForward) history.forward();
    }

    private write(how: "pushState" | "replaceState", address: string): void {
        try {
            history[how]({ olvane: this.step } satisfies Step, "", address);
        } catch {
            // Some browsers allow no history in a file that lies on disk; all else goes on without it.
        }
    }

    // An address typed by hand has no step of ours and comes behind the one before.
    private arrived(state: unknown): void {
        const step = stepOf(state);
        if (step !== null) this.step = step;
        else {
            this.last = ++this.step;
            this.write("replaceState", location.hash);
        }
        this.goTo(location.hash);
    }
}

function stepOf(state: unknown): number | null {
    const step = (state as Step | null)?.olvane;
    return typeof step === "number" ? step : null;
}
