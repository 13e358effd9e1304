// SPDX-FileCopyrightText: The Olvane developers
// SPDX-License-Identifier: MIT

type Enabling = readonly [button: HTMLButtonElement, enabled: boolean];

/** Of two that lead opposite ways. A button that has come to its end hands the keys to the other. */
export function enable(one: Enabling, other: Enabling): void {
    const holder = document.activeElement;
    for (const [button, enabled] of [one, other]) button.disabled = !enabled;
    if (holder === one[0] && !one[1]) other[0].focus();
    else if (holder === other[0] && !other[1]) one[0].focus();
}
